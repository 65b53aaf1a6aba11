#ifndef CALIBRATIONWIZARD_H
#define CALIBRATIONWIZARD_H

#include "Screens/DaddyPanel.h"

class CalibrationNeededPopup;

// The entry to the calibration when one is due: an empty screen that only
// carries the popup asking for it.
class CalibrationWizard : public DaddyPanel
{
    Q_OBJECT
public:
    explicit CalibrationWizard(QWidget* parent = nullptr);

    CalibrationNeededPopup* neededPopup() const { return m_pNeededPopup; }

public slots:
    void onShowCalibrationInstructionPopup();
    void onNeededPopupClosed(PopupPanel* popup);

protected:
    void showEvent(QShowEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    bool m_readyForCal = false;
    CalibrationNeededPopup* m_pNeededPopup = nullptr;
};

#endif // CALIBRATIONWIZARD_H
