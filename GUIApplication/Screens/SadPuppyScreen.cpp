#include "Screens/SadPuppyScreen.h"

#include "GUIAPI/API_SignalMaster.h"
#include "Screens/PopupForm.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

void Ui::SadPuppyScreen::setupUi(QWidget* screen)
{
    labelBackground = PopupForm::dimmer(screen, "labelBackground");
    labelPanel = PopupForm::card(screen, true, "labelPanel");
    labelIcon = PopupForm::icon(screen, ":/Assets/alert_popup_red_icon.png", "labelIcon");
    labelTextTitle = PopupForm::title(screen, "labelTextTitle");
    labelTextSummary = PopupForm::text(screen, "labelTextSummary");
    Btn = PopupForm::button(screen, "Btn", PopupForm::WideButton, Theme::PrimaryButton);
    retranslateUi(screen);
}

void Ui::SadPuppyScreen::retranslateUi(QWidget*)
{
    labelTextTitle->setText(::SadPuppyScreen::tr("Error"));
    labelTextSummary->setText(::SadPuppyScreen::tr("An error has occurred, please reboot the instrument"));
    Btn->setText(::SadPuppyScreen::tr("OK"));
    PopupForm::arrange(labelIcon, labelTextTitle, labelTextSummary);
}

SadPuppyScreen::SadPuppyScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::SadPuppyScreen)
{
    setObjectName("SadPuppyScreen");
    API_SignalMaster::instance()->emitJobUpdate();
    ui->setupUi(this);
    connect(ui->Btn, &QPushButton::clicked, this, &SadPuppyScreen::on_Btn_clicked);
    playSoundErrorApocalypse();
}

SadPuppyScreen::~SadPuppyScreen()
{
    delete ui;
}

void SadPuppyScreen::on_Btn_clicked()
{
    playSoundButtonClick();
    onGoHome();
}

void SadPuppyScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    DaddyPanel::changeEvent(event);
}
