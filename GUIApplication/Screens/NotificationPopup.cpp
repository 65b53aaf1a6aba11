#include "Screens/NotificationPopup.h"

#include "Screens/PopupForm.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QLabel>

void Ui::NotificationPopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, true, "labelPanel");
    labelIcon = PopupForm::icon(popup, ":/Assets/info_popup_icon.png", "labelIcon");
    labelTextTitle = PopupForm::title(popup, "labelTextTitle");
    labelTextSummary = PopupForm::text(popup, "labelTextSummary");
    Btn = PopupForm::button(popup, "Btn", PopupForm::WideButton, Theme::PrimaryButton);
}

NotificationPopup::NotificationPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::NotificationPopup)
{
    setObjectName("NotificationPopup");
    ui->setupUi(this);
    connect(ui->Btn, &QPushButton::clicked, this, &NotificationPopup::onBtnClicked);
}

NotificationPopup::~NotificationPopup()
{
    delete ui;
}

void NotificationPopup::setHeaderText(const QString& text)
{
    ui->labelTextTitle->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelTextTitle, ui->labelTextSummary);
}

void NotificationPopup::setMessageText(const QString& text)
{
    ui->labelTextSummary->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelTextTitle, ui->labelTextSummary);
}

void NotificationPopup::setButtonText(const QString& text)
{
    ui->Btn->setText(text);
}

void NotificationPopup::setIconResource(const QString& resource)
{
    ui->labelIcon->setPixmap(QPixmap(resource));
}

void NotificationPopup::setIconVisible(bool visible)
{
    ui->labelIcon->setVisible(visible);
    PopupForm::arrange(ui->labelIcon, ui->labelTextTitle, ui->labelTextSummary);
}

QString NotificationPopup::headerText() const
{
    return ui->labelTextTitle->defaultText();
}

QString NotificationPopup::messageText() const
{
    return ui->labelTextSummary->defaultText();
}

void NotificationPopup::onBtnClicked()
{
    playSoundButtonClick();
    emit btnClicked();
}
