#ifndef TARGETINGSCREEN_H
#define TARGETINGSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QByteArray>
#include <QElapsedTimer>
#include <QImage>
#include <QPixmap>
#include <QPoint>
#include <QPointer>
#include <QTimer>

#include <vector>

namespace Ui {
class TargetingScreen;
}

class Job;
class NotificationPopup;
class PopupPanel;
class QLabel;

typedef enum _TARGETING_AUTO_MEASURE_STATES_T {
    TARGETING_AUTO_MEASURE_OFF = 0,
    TARGETING_AUTO_MEASURE_NOT_READY = 1,
    TARGETING_AUTO_MEASURE_PRESSED_AND_WAITING = 2,
    TARGETING_AUTO_MEASURE_PRESSED_AND_MEASURING = 3,
    NUM_TARGETING_AUTO_MEASURE_STATES = 4
} TARGETING_AUTO_MEASURE_STATES_T;

// Where a measurement is made. While it stands it polls the instrument five
// times a second for the live picture under the aperture, the three pressure
// feet and the tilt, and it decides whether the read switch may measure. It
// runs the auto-measure machine, raises the measuring popup, and after each
// sample decides whether the job is done. Entered from the job list, or by
// the lab starting an online job on the instrument (lab mode).
class TargetingScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit TargetingScreen(QWidget* parent = nullptr);
    ~TargetingScreen() override;

    // What the screen holds, for tests and the bench.
    TARGETING_AUTO_MEASURE_STATES_T autoMeasureState() const { return m_autoMeasState; }
    bool isDebounced() const { return m_bDebounced; }
    bool isShowingOverride() const { return m_showingOverride; }
    bool isTargetingTimerActive() const { return m_TargetingTimer.isActive(); }
    bool hasStartedTargeting() const { return m_targetingStarted; }
    bool isCompletedCreating() const { return m_completedCreating; }
    const std::vector<QLabel*>& sampleNumbers() const { return m_sampleNumbers; }
    PRESSURE_SWITCH_T lastPressureReading() const { return m_pressureSwitch; }
    // True while the red reticle is up.
    bool isReticleRed() const { return m_reticleRed; }
    NotificationPopup* idlePopup() const { return m_idlePopup; }
    // Frames put on the screen since construction.
    qint64 framesShown() const { return m_framesShown; }

    using DaddyPanel::onClosePopup;

signals:
    // A live frame reached the screen; the time from the poll's request, in
    // microseconds.
    void targetingFrameShown(qint64 latencyUs);

public slots:
    virtual void onCloseIdlePopup();
    virtual void onCloseTimeoutPopup();
    virtual void onCloseSMCPopup();
    virtual void onCloseLabModeJobCompletePopup();
    virtual void onDelete();
    virtual void onContinueMeasuring();
    virtual void onShowTerminatePopup();
    virtual void onShowOverridePopup();
    virtual void onShowCantOverridePopup();
    virtual void onCloseOverridePopup(PopupPanel* popup);
    virtual void onCloseCantOverridePopup();
    virtual void onDoTheOverrideThing(PopupPanel* popup);
    virtual void onShowIdlePopup();
    virtual PopupPanel* onShowTimeoutPopup();
    virtual void onShowDeletePopup();
    virtual void onShowMeasuringPopup();
    virtual void onShowSMCPopup();
    virtual void onShowTempWarningPopup();
    virtual void onShowLabModeJobCompletePopup();
    virtual void onShowLabModeSMCJobCompletePopup();
    virtual void on_BtnBack_clicked();
    virtual void on_BtnSMCDone_clicked();
    virtual void onRestartJob();
    virtual void onAverageJobComplete();
    virtual void onTerminateJobCanceled();
    virtual void onReadSwitchPressed();
    virtual void onMeasurementComplete();
    virtual void onUpdateTitleText();
    virtual void onUpdateSampleInfo();
    virtual void onSetActiveStatus(bool active);
    virtual void onUpdateOrientationEnabled(bool on);
    virtual void onExitLabMode();
    virtual void onDebounceTimeut();

    void CloseScreen() override;
    void onClosePopup(PopupPanel* popup) override;
    PopupPanel* onMeasurementIssue(int code) override;
    void onUpdateSystemState(SYSTEM_STATE_T state) override;

    void onInit();
    void onTriggerTargetingStart();
    void onTriggerTargetingStop();
    void onTriggerTargetingPause();
    void onTargetingTimer();
    void onTargetingStopped();
    void onMeasurementStarted();
    void onUpdateTargettingScreen();
    void onImageUpdate(QImage image);
    void onTargetingImageUpdate(const QByteArray& data);
    void onPressureSensorUpdate(PRESSURE_SWITCH_T switches);
    void onUpdateOrientation(int degrees);

    void onAutoGotoStateOff();
    void onAutoGotoStateNotReady();
    void onAutoGotoStatePressedAndWaiting();
    void onAutoGotoStatePressedAndMeasuring();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void createScreen();
    void RestartDebounce(int ms);
    void armAutoMeasureTimer(void (TargetingScreen::*slot)(), int ms);
    void disarmAutoMeasureTimer();
    void hideAutoMeasureIcon();
    void setSensorIcon(QLabel* label, bool active);
    void setPicture(QLabel* label, const QPixmap& picture);
    // Wires a one-button popup of the table: OK runs `slot`, then closes.
    NotificationPopup* addNotification(const QString& title, const QString& text,
                                       void (TargetingScreen::*slot)());
    bool activeJobValidAndOpen();
    // Ends the job flow once the job is complete: sound, 1 s, then the job
    // summary (or, in lab mode, the completion popup).
    void finishCompleteJob(bool labMode);
    // The numbers and the next-sample mark, or the SMC line.
    void showProgress(const Job& job, bool labMode);

    Ui::TargetingScreen* ui;
    QPixmap m_pixmapTargetingGreen;
    QPixmap m_pixmapTargetingRed;
    QPixmap m_pixmapTargetingImage;
    QPoint m_centerPoint;
    std::vector<QLabel*> m_sampleNumbers;
    bool m_showingOverride;
    QByteArray imageBuffer;
    bool m_bDebounced;
    bool m_tempWarningShown;
    bool m_targetingStarted;
    QTimer m_debounceTimer;
    QElapsedTimer m_screenBeenShowing;
    QTimer m_TargetingTimer;
    TARGETING_AUTO_MEASURE_STATES_T m_autoMeasState;
    QTimer m_autoMeasTimer;
    bool m_transitionWaiting;
    bool m_completedCreating;
    NotificationPopup* m_idlePopup;
    QTimer m_initTimer;
    TEST m_currentSelfTest;
    SystemStatus m_statusInfo;
    STATUS_T m_status;
    CALIBRATION_STATE_T m_calState;
    PRESSURE_SWITCH_T m_pressureSwitch;
    ACCELEROMETER_ORIENTATION_T m_orientation;
    CALIBRATION_STATUS_T m_calibStatus;
    QByteArray m_imageData;

    // The reticle last drawn, so that an unchanged reading costs nothing.
    int m_lastDegrees = -1;
    bool m_reticleRed = false;
    // Inside the constructor the screen is not yet on the stack: a close
    // asked for then must wait until it is.
    bool m_constructing = true;
    QElapsedTimer m_frameClock;
    qint64 m_frameRequestedUs = -1;
    qint64 m_framesShown = 0;
    // The end-of-SMC popup once: the constructor and the init step both
    // look at an ended job.
    QPointer<PopupPanel> m_smcEndPopup;
};

#endif // TARGETINGSCREEN_H
