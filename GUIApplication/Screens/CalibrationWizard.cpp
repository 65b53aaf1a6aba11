#include "Screens/CalibrationWizard.h"

#include "Screens/CalibrationNeededPopup.h"
#include "Screens/CalibrationPopup.h"

#include <QKeyEvent>

namespace {
const int kServiceCloseKey = 68;
} // namespace

CalibrationWizard::CalibrationWizard(QWidget* parent)
    : DaddyPanel(parent)
{
    setObjectName(QStringLiteral("CalibrationWizard"));
    // Transparent: the popup's dimmer shows the screen below.
    setAttribute(Qt::WA_TranslucentBackground);
}

void CalibrationWizard::showEvent(QShowEvent* event)
{
    DaddyPanel::showEvent(event);
    if (m_pNeededPopup)
        return;
    m_pNeededPopup = new CalibrationNeededPopup(parentWidget());
    connect(m_pNeededPopup, &PopupPanel::closePopup, this, &CalibrationWizard::onNeededPopupClosed);
    connect(m_pNeededPopup, &CalibrationNeededPopup::confirmCalibration, this,
            &CalibrationWizard::onShowCalibrationInstructionPopup);
    onAddPopup(m_pNeededPopup);
}

void CalibrationWizard::onNeededPopupClosed(PopupPanel* popup)
{
    // The popup goes with the screen; until then it is out of sight.
    if (popup)
        popup->hide();
    CloseScreen();
}

void CalibrationWizard::onShowCalibrationInstructionPopup()
{
    CloseAndGotoScreen(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
}

void CalibrationWizard::keyPressEvent(QKeyEvent* event)
{
    if (m_readyForCal && isActive()) {
        if (event->key() == kServiceCloseKey) {
            CloseScreen();
            return;
        }
        if (event->key() == Qt::Key_Return) {
            auto* popup = new CalibrationPopup(parentWidget());
            connect(popup, &PopupPanel::closePopup, this, qOverload<PopupPanel*>(&DaddyPanel::onClosePopup));
            onAddPopup(popup);
            return;
        }
    }
    DaddyPanel::keyPressEvent(event);
}
