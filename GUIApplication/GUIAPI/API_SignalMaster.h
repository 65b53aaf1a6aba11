#ifndef API_SIGNALMASTER_H
#define API_SIGNALMASTER_H

// The process-wide switchboard. Back-end threads and screens talk through
// these signals; each has an emit function of the same name so that anyone
// can raise it through the singleton. Connections use the automatic rule, so
// a receiver on another thread gets the signal queued with copied arguments.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QByteArray>
#include <QObject>

#include "SharedSystem/Sample.h"

class API_SignalMaster : public QObject
{
    Q_OBJECT

public:
    // Lazy, no lock: first used during start-up on the GUI thread, then moved
    // to the DataManager thread by DataManager::Init().
    static API_SignalMaster* instance();

    void Init();

    // The link
    void emitTcpReconnected();
    void emitTcpDisconnected();
    void emitSadPuppy();

    // The poll
    void emitStatusUpdated(const SystemStatus& status);

    // Requests to the back end (GUI thread to DataManager thread)
    void emitTriggerMeasurement();
    void emitTriggerResumeIdle();
    void emitTriggerCalibration();
    void emitTriggerReferenceCheck();
    void emitTriggerTargetingStart();
    void emitTriggerTargetingStop();
    void emitTriggerSelfTest(const TEST& test);
    void emitTriggerWifiScan();

    // Progress of measurements, calibrations and self tests
    void emitMeasurementStarted();
    void emitMeasurementComplete();
    void emitCalculationComplete();
    void emitCalibrationComplete();
    void emitReferenceCheckComplete();
    void emitSelfTestTestComplete(const TEST& test, unsigned int result);
    void emitSelfTestWhiteComplete();
    void emitSelfTestReferenceComplete();
    void emitSelfTestOtherComplete();

    // News for the screens
    void emitMeasurementIssue(int status);
    void emitLockStarted();
    void emitLockFinished();
    void emitSyncScreen();
    void emitTargetingImageUpdated(const QByteArray& image);
    void emitPressureSwitchesUpdated(const PRESSURE_SWITCH_T& pressure);
    void emitOrientationUpdated(const ACCELEROMETER_ORIENTATION_T& orientation);
    void emitAddedSample(const Sample& sample);
    void emitGoHome();
    void emitGoToWhiteCalibration();
    void emitGoToRefCheck();
    void emitGoToLabMode();
    void emitDisplayCalibrationPopup();
    void emitTemperatureWarning();
    void emitJobInfoUpdated();

    // Job and sample requests from the screens
    void emitJobDeleteAll();
    void emitJobDeleteCurrent();
    void emitJobDeleteAllCompleted();
    void emitJobDeleteAllSamples();
    void emitJobDelete(unsigned int index);
    void emitSampleCurrentDelete();

    // Declared for completeness; nothing listens
    void emitJobUpdate();
    void emitJobCurrentUpdate();
    void emitJobCurrentDelete();
    void emitSampleUpdate();
    void emitSampleCurrentUpdate();

signals:
    // The link
    void TcpReconnected();
    void TcpDisconnected();
    void SadPuppy();

    // The poll
    void StatusUpdated(const SystemStatus& status);

    // Requests to the back end (GUI thread to DataManager thread)
    void TriggerMeasurement();
    void TriggerResumeIdle();
    void TriggerCalibration();
    void TriggerReferenceCheck();
    void TriggerTargetingStart();
    void TriggerTargetingStop();
    void TriggerSelfTest(const TEST& test);
    void TriggerWifiScan();

    // Progress of measurements, calibrations and self tests
    void MeasurementStarted();
    void MeasurementComplete();
    void CalculationComplete();
    void CalibrationComplete();
    void ReferenceCheckComplete();
    void SelfTestTestComplete(const TEST& test, unsigned int result);
    void SelfTestWhiteComplete();
    void SelfTestReferenceComplete();
    void SelfTestOtherComplete();

    // News for the screens
    void MeasurementIssue(int status);
    void LockStarted();
    void LockFinished();
    void SyncScreen();
    void TargetingImageUpdated(const QByteArray& image);
    void PressureSwitchesUpdated(const PRESSURE_SWITCH_T& pressure);
    void OrientationUpdated(const ACCELEROMETER_ORIENTATION_T& orientation);
    void AddedSample(const Sample& sample);
    void GoHome();
    void GoToWhiteCalibration();
    void GoToRefCheck();
    void GoToLabMode();
    void DisplayCalibrationPopup();
    void TemperatureWarning();
    void JobInfoUpdated();

    // Job and sample requests from the screens
    void JobDeleteAll();
    void JobDeleteCurrent();
    void JobDeleteAllCompleted();
    void JobDeleteAllSamples();
    void JobDelete(unsigned int index);
    void SampleCurrentDelete();

    // Declared for completeness; nothing listens
    void JobUpdate();
    void JobCurrentUpdate();
    void JobCurrentDelete();
    void SampleUpdate();
    void SampleCurrentUpdate();

private:
    explicit API_SignalMaster(QObject* parent = nullptr);
};

#endif // API_SIGNALMASTER_H
