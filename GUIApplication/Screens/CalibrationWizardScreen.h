#ifndef CALIBRATIONWIZARDSCREEN_H
#define CALIBRATIONWIZARDSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <functional>

namespace Ui {
class CalibrationWizardScreen;
}

class CalibrationPopup;
class CalibrationSensorPopup;
class CalibrationWizardPageContainer;

// Leads the operator through one set-up: the white calibration (which
// flows on into the reference check), the reference check alone, or one of
// the three self-test set-ups. Instruction pages, a check that the
// instrument sits flat, the countdown, and on to the next step.
class CalibrationWizardScreen : public DaddyPanel
{
    Q_OBJECT
public:
    CalibrationWizardScreen(CALIBRATION_STATES state, QWidget* parent = nullptr);
    ~CalibrationWizardScreen() override;

    static QString getSelfTestTitle(int number, const QString& name);

    CALIBRATION_STATES calibrationState() const { return m_calibrationState; }
    bool isCalibrating() const { return m_bCalibrating; }
    CalibrationWizardPageContainer* pageContainer() const { return m_pPageContainer; }
    CalibrationPopup* calibrationPopup() const { return m_pCalibrationPopup; }
    CalibrationSensorPopup* sensorPopup() const { return m_pSensorPopup; }
    QString title() const;
    bool isBackButtonShown() const;

public slots:
    void onShowCalibrationPopup();
    void onGotoCalibratingPopup();
    void onGotoSensorWarningPopup();
    void onCloseCalibrationPopup(PopupPanel* popup);
    void onCalibrationComplete();
    PopupPanel* onMeasurementIssue(int code) override;
    void onUpdateSystemState(SYSTEM_STATE_T state) override;

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;
    virtual bool validPressureSensors();

private slots:
    void on_BtnBack_clicked();
    void on_BtnCalibrate_clicked();
    void onSensorPopupOkay(PopupPanel* popup);
    void onSensorPopupCancel(PopupPanel* popup);

private:
    void createWizardPageContainer(CALIBRATION_STATES state);
    void enterState(CALIBRATION_STATES state);
    void setTitle(std::function<QString()> title);
    void closeCalibrationPopup();
    void closeSensorPopup();

    Ui::CalibrationWizardScreen* ui;
    bool m_bCalibrating = false;
    CALIBRATION_STATES m_calibrationState = CALIBRATION_WHITE_STATE;
    CalibrationWizardPageContainer* m_pPageContainer = nullptr;
    CalibrationPopup* m_pCalibrationPopup = nullptr;
    CalibrationSensorPopup* m_pSensorPopup = nullptr;
    std::function<QString()> m_title;
};

#endif // CALIBRATIONWIZARDSCREEN_H
