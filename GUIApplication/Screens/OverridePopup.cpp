#include "Screens/OverridePopup.h"

#include "Screens/PopupForm.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QLabel>

void Ui::OverridePopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, true, "labelPanel");
    labelIcon = PopupForm::icon(popup, ":/Assets/info_popup_icon.png", "labelIcon");
    labelTextTitle = PopupForm::title(popup, "labelTextTitle");
    labelTextSummary = PopupForm::text(popup, "labelTextSummary");
    BtnCancel = PopupForm::button(popup, "BtnCancel", PopupForm::LeftButton, Theme::SecondaryButton);
    BtnMeasure = PopupForm::button(popup, "BtnMeasure", PopupForm::RightButton, Theme::PrimaryButton);
}

OverridePopup::OverridePopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::OverridePopup)
{
    setObjectName("OverridePopup");
    ui->setupUi(this);
    connect(ui->BtnCancel, &QPushButton::clicked, this, &OverridePopup::on_BtnCancel_clicked);
    connect(ui->BtnMeasure, &QPushButton::clicked, this, &OverridePopup::on_BtnMeasure_clicked);
}

OverridePopup::~OverridePopup()
{
    delete ui;
}

void OverridePopup::setTitleText(const QString& text)
{
    ui->labelTextTitle->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelTextTitle, ui->labelTextSummary);
}

void OverridePopup::setBodyText(const QString& text)
{
    ui->labelTextSummary->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelTextTitle, ui->labelTextSummary);
}

void OverridePopup::setConfirmButtonText(const QString& text)
{
    ui->BtnMeasure->setText(text);
}

void OverridePopup::setCancelButtonText(const QString& text)
{
    ui->BtnCancel->setText(text);
}

void OverridePopup::on_BtnCancel_clicked()
{
    playSoundButtonClick();
    emit closePopup(this);
}

void OverridePopup::on_BtnMeasure_clicked()
{
    playSoundButtonClick();
    emit confirmClicked(this);
}
