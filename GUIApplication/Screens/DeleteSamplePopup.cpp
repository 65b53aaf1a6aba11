#include "Screens/DeleteSamplePopup.h"

#include "GUIAPI/DataManager.h"
#include "Screens/PopupForm.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/KLabel.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

namespace {
// Icon, title, time and strip stand as one block in the middle of the card.
const QRect kIcon(128, 84, 64, 64);
const QRect kTitle(26, 158, 268, 44);
const QRect kMessage(26, 206, 268, 30);
const QRect kStrip(40, 256, 240, 56);
} // namespace

void Ui::DeleteSamplePopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, true, "labelPanel");
    labelIcon = PopupForm::icon(popup, ":/Assets/delete_icon.png", "labelIcon", kIcon);
    labelHeader = PopupForm::title(popup, "labelHeader", kTitle);
    labelMessage = PopupForm::text(popup, "labelMessage", kMessage);
    labelMessage->setAlignment(Qt::AlignCenter);
    sampleColorStrip = new SampleColorStrip(popup);
    sampleColorStrip->setObjectName("sampleColorStrip");
    sampleColorStrip->setGeometry(kStrip);
    BtnCancel = PopupForm::button(popup, "BtnCancel", PopupForm::LeftButton, Theme::SecondaryButton);
    BtnConfirm = PopupForm::button(popup, "BtnConfirm", PopupForm::RightButton, Theme::DestructiveButton);
    retranslateUi(popup);
}

void Ui::DeleteSamplePopup::retranslateUi(QWidget*)
{
    labelHeader->setText(::DeleteSamplePopup::tr("Delete Sample?"));
    BtnConfirm->setText(::DeleteSamplePopup::tr("Delete"));
    BtnCancel->setText(::DeleteSamplePopup::tr("No"));
}

DeleteSamplePopup::DeleteSamplePopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::DeleteSamplePopup)
{
    setObjectName("DeleteSamplePopup");
    ui->setupUi(this);
    DataManager* data = DataManager::instance();
    ui->sampleColorStrip->setSpacing(1);
    ui->sampleColorStrip->setSampleIndex(int(data->getActiveSample()));
    ui->labelMessage->setText(data->getActiveSampleObject().getTimeStampString(UserParams::getTimeFormat()));
    connect(ui->BtnConfirm, &QPushButton::clicked, this, &DeleteSamplePopup::onConfirmClicked);
    connect(ui->BtnCancel, &QPushButton::clicked, this, &DeleteSamplePopup::onCancelClicked);
}

DeleteSamplePopup::~DeleteSamplePopup()
{
    delete ui;
}

SampleColorStrip* DeleteSamplePopup::colorStrip() const
{
    return ui->sampleColorStrip;
}

QString DeleteSamplePopup::messageText() const
{
    return ui->labelMessage->text();
}

void DeleteSamplePopup::changeEvent(QEvent* event)
{
    PopupPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
}

void DeleteSamplePopup::onConfirmClicked()
{
    playSoundButtonClick();
    emit confirmClicked(this);
}

void DeleteSamplePopup::onCancelClicked()
{
    playSoundButtonClick();
    emit cancelClicked(this);
}
