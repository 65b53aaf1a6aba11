#include "Widgets/SampleListSelectionItem.h"

#include "ui_SampleListSelectionItem.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Sample.h"
#include "Widgets/KLabel.h"
#include "Widgets/SampleColorStrip.h"

#include "Widgets/Theme.h"


namespace {

const int kStripSpacing = 2;
const int kMargin = 16;

} // namespace

SampleListSelectionItem::SampleListSelectionItem(int sampleIndex, QWidget* parent, bool clickable)
    : FlickButton(parent)
    , ui(new Ui::SampleListSelectionItem)
    , m_sampleIndex(sampleIndex)
    , m_clickable(clickable)
{
    ui->setupUi(this);
    ui->labelNumber->setFont(Theme::pixelFont(14, true));
    ui->labelDateTime->setFont(Theme::pixelFont(15));
    setFocusPolicy(Qt::NoFocus);
    setMouseTracking(false);
    // The fields lie over the button; touches must reach the button.
    for (QWidget* child : {static_cast<QWidget*>(ui->labelNumber), static_cast<QWidget*>(ui->labelDateTime),
                           static_cast<QWidget*>(ui->labelStripFrame), static_cast<QWidget*>(ui->sampleColorStrip)})
        child->setAttribute(Qt::WA_TransparentForMouseEvents);
    ui->labelDateTime->setAutoSize(true);
    ui->labelNumber->setAutoSize(true);
    ui->sampleColorStrip->setSpacing(kStripSpacing);
    setClickable(clickable);
    updateFields();
}

SampleListSelectionItem::~SampleListSelectionItem()
{
    delete ui;
}

KLabel* SampleListSelectionItem::numberLabel() const
{
    return ui->labelNumber;
}

KLabel* SampleListSelectionItem::dateTimeLabel() const
{
    return ui->labelDateTime;
}

SampleColorStrip* SampleListSelectionItem::colorStrip() const
{
    return ui->sampleColorStrip;
}

void SampleListSelectionItem::setClickable(bool clickable)
{
    m_clickable = clickable;
    // The backgrounds are scaled to the row, so the size comes first.
    resize(width(), clickable ? ClickableHeight : PlainHeight);
    if (clickable) {
        setBackground(QStringLiteral(":/Assets/cell_85px.png"));
        setPressedBackground(QStringLiteral(":/Assets/cell_85px_hit.png"));
    } else {
        setBackground(QStringLiteral(":/Assets/cell_62px.png"));
        setPressedBackground(QStringLiteral(":/Assets/cell_62px_hit.png"));
    }
    layoutFields();
}

void SampleListSelectionItem::layoutFields()
{
    const bool numbered = !ui->labelNumber->defaultText().isEmpty();
    ui->labelNumber->setVisible(numbered);
    const int textLeft = numbered ? 60 : kMargin;
    const int stripWidth = width() - 2 * kMargin;
    QRect strip;
    if (m_clickable) {
        ui->labelNumber->setGeometry(kMargin, 11, 34, 22);
        ui->labelDateTime->setGeometry(textLeft, 8, width() - kMargin - textLeft, 28);
        strip = QRect(kMargin, 42, stripWidth, 32);
    } else {
        ui->labelNumber->setGeometry(kMargin, 6, 34, 22);
        ui->labelDateTime->setGeometry(textLeft, 4, width() - kMargin - textLeft, 26);
        strip = QRect(kMargin, 33, stripWidth, 20);
    }
    ui->sampleColorStrip->setGeometry(strip);
    // A hairline keeps near-white paint apart from the white row.
    ui->labelStripFrame->setGeometry(strip.adjusted(-1, -1, 1, 1));
}

void SampleListSelectionItem::updateFields()
{
    if (m_sampleIndex < 0)
        return;
    const Sample sample = DataManager::instance()->getASampleObject(static_cast<unsigned int>(m_sampleIndex));
    if (!sample.isValid())
        return;
    ui->labelDateTime->setText(sample.getTimeStampString());
    // The averaged result is no numbered reading.
    ui->labelNumber->setText(unsigned(m_sampleIndex) == AVERAGED_SAMPLE_INDEX ? QString()
                                                                             : QString::number(m_sampleIndex + 1));
    layoutFields();
    ui->sampleColorStrip->setSampleIndex(m_sampleIndex);
}

void SampleListSelectionItem::sendClick()
{
    if (!m_clickable)
        return;
    DataManager::instance()->setActiveSample(unsigned(m_sampleIndex));
    FlickButton::sendClick();
}
