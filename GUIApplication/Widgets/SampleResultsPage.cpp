#include "Widgets/SampleResultsPage.h"
#include "ui_SampleResultsPage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/ClickableLabel.h"
#include "Widgets/Theme.h"

#include <QEvent>
#include <QFontMetrics>
#include <QPixmap>

namespace {
const int kGap = 7;
}

SampleResultsPage::SampleResultsPage(QWidget* parent)
    : SamplePage(parent)
    , ui(new Ui::SampleResultsPage)
{
    ui->setupUi(this);
    m_debounceTimer.setSingleShot(true);

    DataManager* data = DataManager::instance();
    connect(data, &DataManager::loadCurrentSamplesImagesComplete, this,
            &SampleResultsPage::onLoadCurrentSamplesImagesComplete);
    connect(data, &DataManager::loadCurrentSamplesTexturesAndImagesComplete, this,
            &SampleResultsPage::onLoadCurrentSamplesImagesComplete);
    connect(&m_debounceTimer, &QTimer::timeout, this, &SampleResultsPage::onDebounceTimeout);
    onCreatePage();
}

SampleResultsPage::~SampleResultsPage()
{
    delete ui;
}

void SampleResultsPage::onCreatePage()
{
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const int n = Instrument_Get_Num_Camera_Images();
    const int w = Instrument_Get_Sample_Thumbnail_Width();
    const int h = Instrument_Get_Sample_Thumbnail_Height();

    int x = qMax(0, (ui->labelBackgroundBottom->width() - (n * w + (n - 1) * kGap)) / 2);
    const int y = ui->BtnZoomIn->geometry().bottom() + kGap;
    const QFont captionFont = Theme::font(Theme::FontSmall);
    const int captionHeight = QFontMetrics(captionFont).height();

    for (int i = 0; i < n; ++i) {
        auto* thumbnail = new ClickableLabel(this);
        thumbnail->setObjectName(QStringLiteral("thumbnail%1").arg(i));
        // Pictures come a little larger than the row: scaled to fill, cropped.
        const QImage image = sample.getSampleThumbnail(i);
        if (!image.isNull()) {
            QPixmap pixmap = QPixmap::fromImage(image.scaled(w, h, Qt::KeepAspectRatioByExpanding,
                                                            Qt::SmoothTransformation));
            pixmap = pixmap.copy((pixmap.width() - w) / 2, (pixmap.height() - h) / 2, w, h);
            thumbnail->setPixmap(pixmap);
        }
        thumbnail->setAlignment(Qt::Alignment(132));
        thumbnail->setStyleSheet(QStringLiteral("QLabel { background-color: %1; border: 1px solid %2; }"
                                                "QLabel:disabled { border-color: %3; }")
                                     .arg(Theme::css(Theme::Separator), Theme::css(Theme::Separator),
                                          Theme::css(Theme::GroundLight)));
        thumbnail->setGeometry(x, y, w, h);
        thumbnail->raise();
        thumbnail->show();
        connect(thumbnail, &ClickableLabel::clicked, &m_signalMapper, qOverload<>(&QSignalMapper::map));
        m_signalMapper.setMapping(thumbnail, i);
        thumbnail->setEnabled(false);
        m_thumbnails.append(thumbnail);

        auto* caption = new QLabel(getStringFromList(i, IMAGE_ANGLE_TABLE), this);
        caption->setObjectName(QStringLiteral("thumbnailLabel%1").arg(i));
        caption->setFont(captionFont);
        caption->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
        caption->setStyleSheet(QStringLiteral("color: %1; background: transparent;").arg(Theme::css(Theme::TextSecondary)));
        // Centred under its picture; as wide as the picture and its gap.
        caption->setGeometry(x - kGap / 2, y + h + 2, w + kGap, captionHeight);
        caption->raise();
        caption->show();
        m_thumbnailLabels.append(caption);

        x += w + kGap;
    }

    if (UserParams::getDisplayPreviewImages())
        connect(&m_signalMapper, &QSignalMapper::mappedInt, this,
                &SampleResultsPage::onThumbnailSelected);
    ui->BtnZoomIn->setVisible(UserParams::getDisplayPreviewImages());
    ui->BtnZoomIn->setEnabled(false);
}

void SampleResultsPage::setThumbnailsEnabled(bool enabled)
{
    for (ClickableLabel* thumbnail : m_thumbnails)
        thumbnail->setEnabled(enabled);
}

void SampleResultsPage::onLoadCurrentSamplesImagesComplete()
{
    // The pictures may have come only now: show them.
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const int w = Instrument_Get_Sample_Thumbnail_Width();
    const int h = Instrument_Get_Sample_Thumbnail_Height();
    for (int i = 0; i < m_thumbnails.size(); ++i) {
        if (!m_thumbnails[i]->pixmap(Qt::ReturnByValue).isNull())
            continue;
        const QImage image = sample.getSampleThumbnail(i);
        if (image.isNull())
            continue;
        QPixmap pixmap = QPixmap::fromImage(image.scaled(w, h, Qt::KeepAspectRatioByExpanding,
                                                        Qt::SmoothTransformation));
        m_thumbnails[i]->setPixmap(pixmap.copy((pixmap.width() - w) / 2, (pixmap.height() - h) / 2, w, h));
    }
    setThumbnailsEnabled(true);
    ui->BtnZoomIn->setEnabled(true);
}

void SampleResultsPage::onThumbnailSelected(int index)
{
    playSoundButtonClick();
    setThumbnailsEnabled(false);
    DataManager::instance()->setActiveImage(static_cast<IMAGE_ANGLE_T>(index));
    emit gotoImageViewScreen();
    m_debounceTimer.start(DebounceMs);
}

void SampleResultsPage::onDebounceTimeout()
{
    setThumbnailsEnabled(true);
}

void SampleResultsPage::on_BtnPageRight_clicked()
{
    playSoundButtonClick();
    emit gotoRightPage();
}

void SampleResultsPage::on_BtnZoomIn_clicked()
{
    playSoundButtonClick();
    emit gotoImageViewScreen();
}

void SampleResultsPage::setRightButtonEnabled(bool enabled)
{
    ui->BtnPageRight->setEnabled(enabled);
    ui->BtnPageRight->setVisible(enabled);
}

bool SampleResultsPage::isRightButtonEnabled() const
{
    return ui->BtnPageRight->isEnabled() && !ui->BtnPageRight->isHidden();
}

void SampleResultsPage::changeEvent(QEvent* event)
{
    SamplePage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        for (int i = 0; i < m_thumbnailLabels.size(); ++i)
            m_thumbnailLabels[i]->setText(getStringFromList(i, IMAGE_ANGLE_TABLE));
    }
}
