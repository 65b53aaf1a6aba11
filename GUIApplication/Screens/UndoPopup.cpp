#include "Screens/UndoPopup.h"

#include "Screens/PopupForm.h"
#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

void Ui::UndoPopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    icnPopupBkgnd = PopupForm::card(popup, false, "icnPopupBkgnd");
    const int top = Theme::ShortCard.top();
    labelText = PopupForm::text(popup, "labelText", QRect(26, top + 16, 268, 96));
    labelText->setAlignment(Qt::AlignCenter);
    BtnBack = PopupForm::button(popup, "BtnBack", QRect(26, top + 128, 130, 56), Theme::SecondaryButton);
    BtnUndo = PopupForm::button(popup, "BtnUndo", QRect(164, top + 128, 130, 56), Theme::PrimaryButton);
    retranslateUi(popup);
}

void Ui::UndoPopup::retranslateUi(QWidget*)
{
    BtnUndo->setText(::UndoPopup::tr("Undo"));
    BtnBack->setText(::UndoPopup::tr("Back"));
}

UndoPopup::UndoPopup(QWidget* parent)
    : MarigoldFullScreenPanel(parent)
    , ui(new Ui::UndoPopup)
{
    setObjectName("UndoPopup");
    ui->setupUi(this);
    connect(ui->BtnUndo, &QPushButton::clicked, this, &UndoPopup::undo);
    connect(ui->BtnBack, &QPushButton::clicked, this, &UndoPopup::back);
}

UndoPopup::~UndoPopup()
{
    delete ui;
}

void UndoPopup::setPopupText(const QString& text)
{
    ui->labelText->setText(text);
}

void UndoPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    MarigoldFullScreenPanel::changeEvent(event);
}
