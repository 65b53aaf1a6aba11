#include "Screens/DeletePopup.h"

#include "Screens/PopupForm.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

void Ui::DeletePopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, true, "labelPanel");
    labelIcon = PopupForm::icon(popup, ":/Assets/delete_icon.png", "labelIcon");
    labelHeader = PopupForm::title(popup, "labelHeader");
    labelMessage = PopupForm::text(popup, "labelMessage");
    BtnCancel = PopupForm::button(popup, "BtnCancel", PopupForm::LeftButton, Theme::SecondaryButton);
    BtnConfirm = PopupForm::button(popup, "BtnConfirm", PopupForm::RightButton, Theme::DestructiveButton);
    retranslateUi(popup);
}

void Ui::DeletePopup::retranslateUi(QWidget*)
{
    labelHeader->setText(::DeletePopup::tr("Delete All Samples?"));
    BtnConfirm->setText(::DeletePopup::tr("Delete"));
    BtnCancel->setText(::DeletePopup::tr("No"));
    PopupForm::arrange(labelIcon, labelHeader, labelMessage);
}

DeletePopup::DeletePopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::DeletePopup)
{
    setObjectName("DeletePopup");
    ui->setupUi(this);
    connect(ui->BtnConfirm, &QPushButton::clicked, this, &DeletePopup::onConfirmClicked);
    connect(ui->BtnCancel, &QPushButton::clicked, this, &DeletePopup::onCancelClicked);
}

DeletePopup::~DeletePopup()
{
    delete ui;
}

void DeletePopup::changeEvent(QEvent* event)
{
    PopupPanel::changeEvent(event);
    if (event->type() != QEvent::LanguageChange)
        return;
    if (!m_ownHeader)
        ui->labelHeader->setText(tr("Delete All Samples?"));
    if (!m_ownConfirm)
        ui->BtnConfirm->setText(tr("Delete"));
    if (!m_ownCancel)
        ui->BtnCancel->setText(tr("No"));
    PopupForm::arrange(ui->labelIcon, ui->labelHeader, ui->labelMessage);
}

void DeletePopup::setHeaderText(const QString& text)
{
    m_ownHeader = true;
    ui->labelHeader->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelHeader, ui->labelMessage);
}

void DeletePopup::setMessageText(const QString& text)
{
    ui->labelMessage->setText(text);
    PopupForm::arrange(ui->labelIcon, ui->labelHeader, ui->labelMessage);
}

void DeletePopup::setConfirmButtonText(const QString& text)
{
    m_ownConfirm = true;
    ui->BtnConfirm->setText(text);
}

void DeletePopup::setCancelButtonText(const QString& text)
{
    m_ownCancel = true;
    ui->BtnCancel->setText(text);
}

void DeletePopup::onConfirmClicked()
{
    playSoundButtonClick();
    emit confirmClicked(this);
}

void DeletePopup::onCancelClicked()
{
    playSoundButtonClick();
    emit cancelClicked(this);
}
