#include "Screens/JobActionsPopup.h"

#include "ui_JobActionsPopup.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/Theme.h"

#include <QEvent>
#include <QPainter>
#include <QPixmap>
#include <QStringList>
#include <qdrawutil.h>

namespace {

// A second touch while the first one's action runs must not act twice.
const int kButtonDebounceMs = 5000;

// The card of this popup changes its height with the job: the product's
// card picture, its rounded corners kept and its sides stretched.
QPixmap cardOfSize(const QSize& size)
{
    QPixmap card(size);
    card.fill(Qt::transparent);
    QPainter painter(&card);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    const QMargins corners(14, 14, 14, 14);
    qDrawBorderPixmap(&painter, card.rect(), corners,
                      QPixmap(QStringLiteral(":/Assets/modal_overlay_inset_200.png")));
    return card;
}

} // namespace

JobActionsPopup::JobActionsPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::JobActionsPopup)
{
    setObjectName(QStringLiteral("JobActionsPopup"));
    ui->setupUi(this);
    ui->labelBackGround->lower();
    setAttribute(Qt::WA_TranslucentBackground);
    for (XPushButton* button : {ui->BtnDelete, ui->BtnViewEditStart, ui->BtnCancel, ui->BtnCopy, ui->BtnSync})
        button->setDebounceTime(kButtonDebounceMs);
    Theme::styleButton(ui->BtnViewEditStart, Theme::PrimaryButton);
    Theme::styleButton(ui->BtnSync, Theme::PrimaryButton);
    Theme::styleButton(ui->BtnCopy, Theme::SecondaryButton);
    Theme::styleButton(ui->BtnCancel, Theme::SecondaryButton);
    Theme::styleButton(ui->BtnDelete, Theme::DestructiveButton);
    ui->BtnSync->hide();
    fillFromActiveJob();
    ui->labelPopupBackGround->setPixmap(cardOfSize(ui->labelPopupBackGround->size()));
}

JobActionsPopup::~JobActionsPopup()
{
    delete ui;
}

void JobActionsPopup::fillFromActiveJob()
{
    DataManager* data = DataManager::instance();
    const Job job = data->getActiveJobObject();
    ui->labelName->setText(job.getDisplayName());
    QStringList tags;
    for (int state = TAG_STATE_1; state < NUM_TAG_STATES; ++state)
        tags << job.getTagData(TAG_STATES_T(state)).displayName;
    ui->labelTags->setText(tags.join(QLatin1Char(' ')));

    if (job.isJobComplete()) {
        ui->labelCompleted->setText(job.getDateCompletedString());
        const bool canSync = data->getSystemStatus().getWifiState() == WIFI_STATUS_CONNECTED
            && UserParams::instance()->getAllowSync();
        if (canSync) {
            ui->BtnSync->show();
            ui->BtnViewEditStart->setGeometry(30, 186, 260, 36);
            ui->BtnCopy->setGeometry(30, 231, 260, 36);
            ui->BtnSync->setGeometry(30, 276, 260, 36);
            ui->BtnDelete->setGeometry(30, 321, 260, 36);
            ui->BtnCancel->setGeometry(30, 366, 260, 36);
        }
    } else {
        ui->labelCompleted->hide();
        ui->BtnDelete->hide();
        ui->BtnDelete->setEnabled(false);
        ui->BtnViewEditStart->setText(tr("Execute Job"));
        ui->labelPopupBackGround->setGeometry(20, 98, 280, 285);
        ui->labelName->setGeometry(30, 100, 260, 41);
        ui->labelTags->setGeometry(30, 145, 260, 41);
        ui->BtnViewEditStart->setGeometry(30, 214, 260, 48);
        ui->BtnCopy->setGeometry(30, 270, 260, 48);
        ui->BtnCancel->setGeometry(30, 326, 260, 48);
    }
}

void JobActionsPopup::on_BtnDelete_clicked()
{
    playSoundButtonClick();
    emit deleteJob();
}

void JobActionsPopup::on_BtnViewEditStart_clicked()
{
    playSoundButtonClick();
    emit jobViewEditStart();
}

void JobActionsPopup::on_BtnCancel_clicked()
{
    playSoundButtonClick();
    onClosePopup();
}

void JobActionsPopup::on_BtnCopy_clicked()
{
    playSoundButtonClick();
    emit copyJob();
}

void JobActionsPopup::on_BtnSync_clicked()
{
    playSoundButtonClick();
    emit syncJob();
}

void JobActionsPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        // An open job's popup has no delete button and runs the job instead.
        const bool open = !ui->BtnDelete->isEnabled();
        ui->retranslateUi(this);
        if (open)
            ui->BtnViewEditStart->setText(tr("Execute Job"));
    }
    PopupPanel::changeEvent(event);
}
