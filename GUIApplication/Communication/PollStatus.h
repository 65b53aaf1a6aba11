#ifndef POLLSTATUS_H
#define POLLSTATUS_H

// The pulse of the GUI. The server never pushes anything, so one of these
// timers is always asking it for its state; which one runs tells what the GUI
// believes the instrument is doing (idle, measuring, calibrating, reference
// check, self test or targeting). Lives on the DataManager thread as a member
// of DataManager.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QByteArray>
#include <QElapsedTimer>
#include <QObject>
#include <QStringList>
#include <QTimer>

class PollStatus : public QObject
{
    Q_OBJECT

public:
    explicit PollStatus(QObject* parent = nullptr);

    // Connects the timers and the trigger signals of the hub. The poller
    // stays stopped until the first TriggerResumeIdle.
    void Init();

    // Names of the timers that run now ("idle", "measurement", "kill",
    // "calibrate", "targeting", "reference", "selftest"); for diagnostics.
    QStringList activeTimers() const;
    // Result of the last trigger command.
    int lastTriggerStatus() const;

public slots:
    void onIdleTimer();
    void onMeasurementTimer();
    void onMeasurementKillTimer();
    void onCalibratingTimer();
    void onReferenceTimer();
    void onSelfTestTimer();
    void onTargetingTimer();

    void onTriggerMeasurement();
    void onTriggerCalibration();
    void onTriggerReferenceCheck();
    void onTriggerSelfTest(TEST test);
    void onTriggerTargetingStart();
    void onTriggerTargetingStop();
    void onTriggerResumeIdle();
    void onStartPolling();
    void onStopPolling();

private:
    void targetingStateTail(bool checkCalibration);

    QTimer m_MeasurementTimer;
    QTimer m_MeasurementKillTimer;
    QTimer m_IdleTimer;
    QTimer m_CalibrateTimer;
    QTimer m_TargetingTimer;
    QTimer m_ReferenceTimer;
    QTimer m_SelfTestTimer;
    QByteArray m_imageData;
    TEST m_currentSelfTest;
    SystemStatus m_statusInfo;
    STATUS_T m_status;
    CALIBRATION_STATE_T m_calState;
    PRESSURE_SWITCH_T m_pressureSwitch;
    ACCELEROMETER_ORIENTATION_T m_orientation;
    CALIBRATION_STATUS_T m_calibStatus;
    QElapsedTimer m_timer;
    int m_triggerStatus;
};

#endif // POLLSTATUS_H
