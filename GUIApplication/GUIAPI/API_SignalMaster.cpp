#include "GUIAPI/API_SignalMaster.h"

API_SignalMaster* API_SignalMaster::instance()
{
    // Never deleted: queued signals may still be in flight when the process ends.
    static API_SignalMaster* const s_instance = new API_SignalMaster();
    return s_instance;
}

API_SignalMaster::API_SignalMaster(QObject* parent)
    : QObject(parent)
{
    // Whatever the start-up order, the hub's own arguments can be queued to
    // another thread as soon as the hub exists.
    qRegisterMetaType<SystemStatus>("SystemStatus");
    qRegisterMetaType<TEST>("TEST");
    qRegisterMetaType<PRESSURE_SWITCH_T>("PRESSURE_SWITCH_T");
    qRegisterMetaType<ACCELEROMETER_ORIENTATION_T>("ACCELEROMETER_ORIENTATION_T");
    qRegisterMetaType<Sample>("Sample");
}

void API_SignalMaster::Init()
{
}

void API_SignalMaster::emitTcpReconnected()
{
    emit TcpReconnected();
}

void API_SignalMaster::emitTcpDisconnected()
{
    emit TcpDisconnected();
}

void API_SignalMaster::emitSadPuppy()
{
    emit SadPuppy();
}

void API_SignalMaster::emitStatusUpdated(const SystemStatus& status)
{
    emit StatusUpdated(status);
}

void API_SignalMaster::emitTriggerMeasurement()
{
    emit TriggerMeasurement();
}

void API_SignalMaster::emitTriggerResumeIdle()
{
    emit TriggerResumeIdle();
}

void API_SignalMaster::emitTriggerCalibration()
{
    emit TriggerCalibration();
}

void API_SignalMaster::emitTriggerReferenceCheck()
{
    emit TriggerReferenceCheck();
}

void API_SignalMaster::emitTriggerTargetingStart()
{
    emit TriggerTargetingStart();
}

void API_SignalMaster::emitTriggerTargetingStop()
{
    emit TriggerTargetingStop();
}

void API_SignalMaster::emitTriggerSelfTest(const TEST& test)
{
    emit TriggerSelfTest(test);
}

void API_SignalMaster::emitTriggerWifiScan()
{
    emit TriggerWifiScan();
}

void API_SignalMaster::emitMeasurementStarted()
{
    emit MeasurementStarted();
}

void API_SignalMaster::emitMeasurementComplete()
{
    emit MeasurementComplete();
}

void API_SignalMaster::emitCalculationComplete()
{
    emit CalculationComplete();
}

void API_SignalMaster::emitCalibrationComplete()
{
    emit CalibrationComplete();
}

void API_SignalMaster::emitReferenceCheckComplete()
{
    emit ReferenceCheckComplete();
}

void API_SignalMaster::emitSelfTestTestComplete(const TEST& test, unsigned int result)
{
    emit SelfTestTestComplete(test, result);
}

void API_SignalMaster::emitSelfTestWhiteComplete()
{
    emit SelfTestWhiteComplete();
}

void API_SignalMaster::emitSelfTestReferenceComplete()
{
    emit SelfTestReferenceComplete();
}

void API_SignalMaster::emitSelfTestOtherComplete()
{
    emit SelfTestOtherComplete();
}

void API_SignalMaster::emitMeasurementIssue(int status)
{
    emit MeasurementIssue(status);
}

void API_SignalMaster::emitLockStarted()
{
    emit LockStarted();
}

void API_SignalMaster::emitLockFinished()
{
    emit LockFinished();
}

void API_SignalMaster::emitSyncScreen()
{
    emit SyncScreen();
}

void API_SignalMaster::emitTargetingImageUpdated(const QByteArray& image)
{
    emit TargetingImageUpdated(image);
}

void API_SignalMaster::emitPressureSwitchesUpdated(const PRESSURE_SWITCH_T& pressure)
{
    emit PressureSwitchesUpdated(pressure);
}

void API_SignalMaster::emitOrientationUpdated(const ACCELEROMETER_ORIENTATION_T& orientation)
{
    emit OrientationUpdated(orientation);
}

void API_SignalMaster::emitAddedSample(const Sample& sample)
{
    emit AddedSample(sample);
}

void API_SignalMaster::emitGoHome()
{
    emit GoHome();
}

void API_SignalMaster::emitGoToWhiteCalibration()
{
    emit GoToWhiteCalibration();
}

void API_SignalMaster::emitGoToRefCheck()
{
    emit GoToRefCheck();
}

void API_SignalMaster::emitGoToLabMode()
{
    emit GoToLabMode();
}

void API_SignalMaster::emitDisplayCalibrationPopup()
{
    emit DisplayCalibrationPopup();
}

void API_SignalMaster::emitTemperatureWarning()
{
    emit TemperatureWarning();
}

void API_SignalMaster::emitJobInfoUpdated()
{
    emit JobInfoUpdated();
}

void API_SignalMaster::emitJobDeleteAll()
{
    emit JobDeleteAll();
}

void API_SignalMaster::emitJobDeleteCurrent()
{
    emit JobDeleteCurrent();
}

void API_SignalMaster::emitJobDeleteAllCompleted()
{
    emit JobDeleteAllCompleted();
}

void API_SignalMaster::emitJobDeleteAllSamples()
{
    emit JobDeleteAllSamples();
}

void API_SignalMaster::emitJobDelete(unsigned int index)
{
    emit JobDelete(index);
}

void API_SignalMaster::emitSampleCurrentDelete()
{
    emit SampleCurrentDelete();
}

void API_SignalMaster::emitJobUpdate()
{
    emit JobUpdate();
}

void API_SignalMaster::emitJobCurrentUpdate()
{
    emit JobCurrentUpdate();
}

void API_SignalMaster::emitJobCurrentDelete()
{
    emit JobCurrentDelete();
}

void API_SignalMaster::emitSampleUpdate()
{
    emit SampleUpdate();
}

void API_SignalMaster::emitSampleCurrentUpdate()
{
    emit SampleCurrentUpdate();
}
