#include "Screens/PowerDownPopup.h"

#include "Commands/SystemOutCommands.h"
#include "Screens/PopupForm.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

void Ui::PowerDownPopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, false, "labelPanel");
    BtnPowerOff = PopupForm::button(popup, "BtnPowerOff", PopupForm::shortCardButton(0),
                                    Theme::DestructiveButton);
    BtnReboot = PopupForm::button(popup, "BtnReboot", PopupForm::shortCardButton(1),
                                  Theme::PrimaryButton);
    BtnCancel = PopupForm::button(popup, "BtnCancel", PopupForm::shortCardButton(2),
                                  Theme::SecondaryButton);
    retranslateUi(popup);
}

void Ui::PowerDownPopup::retranslateUi(QWidget*)
{
    BtnPowerOff->setText(::PowerDownPopup::tr("Power Off"));
    BtnReboot->setText(::PowerDownPopup::tr("Reboot"));
    BtnCancel->setText(::PowerDownPopup::tr("Cancel"));
}

PowerDownPopup::PowerDownPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::PowerDownPopup)
{
    setObjectName("PowerDownPopup");
    ui->setupUi(this);
    connect(ui->BtnPowerOff, &QPushButton::clicked, this, &PowerDownPopup::on_BtnPowerOff_clicked);
    connect(ui->BtnReboot, &QPushButton::clicked, this, &PowerDownPopup::on_BtnReboot_clicked);
    connect(ui->BtnCancel, &QPushButton::clicked, this, &PowerDownPopup::on_BtnCancel_clicked);
}

PowerDownPopup::~PowerDownPopup()
{
    delete ui;
}

void PowerDownPopup::on_BtnPowerOff_clicked()
{
    CmdOut_PowerOffReset(POWER_SHUTDOWN);
}

void PowerDownPopup::on_BtnReboot_clicked()
{
    CmdOut_PowerOffReset(POWER_REBOOT);
}

void PowerDownPopup::on_BtnStandby_clicked()
{
    CmdOut_PowerOffReset(POWER_STANDBY);
}

void PowerDownPopup::on_BtnCancel_clicked()
{
    emit closePopup(this);
}

void PowerDownPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    PopupPanel::changeEvent(event);
}
