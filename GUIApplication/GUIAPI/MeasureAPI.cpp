#include "GUIAPI/MeasureAPI.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"

#include <QMutexLocker>
#include <QRecursiveMutex>
#include <QVector>

#include <algorithm>
#include <atomic>
#include <iterator>

namespace {

QRecursiveMutex s_measureMutex;
// Written by the GUI thread's triggers and the poller's completions.
std::atomic<bool> measurementInProcess{false};

const int kCalibrationNeededError = 2044;
// Server errors the user is told about, each by its own message.
const int kReportedErrors[] = {
    1065, 1066, 2001, 2005, 2006, 2012, 2013, 2014, 2028, 2032, 2033, 2034, 2035, 2036, 2037,
    2042, 2043, 2047, 2100, 2101, 2102, 2103, 2118, 2119, 3234, 3235, 3236, 3237,
};
const int kGoodNews = -1;
const int kUnknownErrors = 0;
const int kReferenceCheckFailed = -2;
const unsigned short kSampleTemperatureSensor = 3;

bool isReportedError(int errorID)
{
    return std::find(std::begin(kReportedErrors), std::end(kReportedErrors), errorID)
        != std::end(kReportedErrors);
}

void startActivity()
{
    measurementInProcess = true;
    // A fresh batch: what is left from before belongs to nobody.
    CmdOut_ResetErrorDescriptions();
}

} // namespace

bool MeasAPI_GetMeasurementInProcess()
{
    return measurementInProcess;
}

void MeasAPI_TriggerMeasurement()
{
    QMutexLocker locker(&s_measureMutex);
    startActivity();
    API_SignalMaster::instance()->emitTriggerMeasurement();
}

void MeasAPI_TriggerUserCalibration()
{
    QMutexLocker locker(&s_measureMutex);
    startActivity();
    API_SignalMaster::instance()->emitTriggerCalibration();
}

void MeasAPI_TriggerReferenceCheck()
{
    QMutexLocker locker(&s_measureMutex);
    startActivity();
    API_SignalMaster::instance()->emitTriggerReferenceCheck();
}

void MeasAPI_TriggerSelfTest(const TEST& test)
{
    QMutexLocker locker(&s_measureMutex);
    startActivity();
    API_SignalMaster::instance()->emitTriggerSelfTest(TEST(test));
}

void MeasAPI_MeasurementComplete()
{
    // Read before taking our lock: DataManager calls into this module with
    // its own lock held, so the two are never taken the other way round.
    const SystemStatus status = DataManager::instance()->getSystemStatus();
    QMutexLocker locker(&s_measureMutex);
    if (status.getNumOfErrors() != 0) {
        if (!MeasAPI_CheckAndHandleErrors())
            API_SignalMaster::instance()->emitMeasurementIssue(kGoodNews);
    } else {
        API_SignalMaster::instance()->emitMeasurementIssue(kGoodNews);
    }
    measurementInProcess = false;
    API_SignalMaster::instance()->emitMeasurementComplete();
}

void MeasAPI_CalculationComplete()
{
    QMutexLocker locker(&s_measureMutex);
    measurementInProcess = false;
    API_SignalMaster::instance()->emitCalculationComplete();
}

void MeasAPI_CalibrationComplete()
{
    QMutexLocker locker(&s_measureMutex);
    measurementInProcess = false;
    MeasAPI_CheckAndHandleErrors();
    API_SignalMaster::instance()->emitCalibrationComplete();
}

void MeasAPI_ReferenceCheckComplete()
{
    QMutexLocker locker(&s_measureMutex);
    measurementInProcess = false;
    MeasAPI_CheckAndHandleErrors();
    bool passed = false;
    if (CmdOut_ReferenceCheck(passed) != STATUS_OK || !passed)
        API_SignalMaster::instance()->emitMeasurementIssue(kReferenceCheckFailed);
    API_SignalMaster::instance()->emitReferenceCheckComplete();
}

void MeasAPI_SelfTestComplete(const TEST& test)
{
    unsigned int result = 0;
    SysAPI_GetSelfTestResult(test.num, result);
    measurementInProcess = false;
    API_SignalMaster::instance()->emitSelfTestTestComplete(TEST(test), result);
}

bool MeasAPI_CheckAndHandleErrors()
{
    QMutexLocker locker(&s_measureMutex);
    QVector<ERROR_DESCRIPTION_T> errors;
    const STATUS_T readStatus = CmdOut_GetErrorDescriptions(errors);
    // Reset whatever the read gave: the batch is answered once.
    CmdOut_ResetErrorDescriptions();
    if (readStatus != STATUS_OK || errors.isEmpty())
        return false;

    // Only the first error the user can act on is shown.
    bool handled = false;
    for (const ERROR_DESCRIPTION_T& error : errors) {
        if (error.errorID == kCalibrationNeededError) {
            API_SignalMaster::instance()->emitDisplayCalibrationPopup();
            handled = true;
        } else if (isReportedError(error.errorID)) {
            API_SignalMaster::instance()->emitMeasurementIssue(error.errorID);
            handled = true;
        }
        if (handled)
            break;
    }
    if (!handled)
        API_SignalMaster::instance()->emitMeasurementIssue(kUnknownErrors);
    return true;
}

bool MeasAPI_CollectLatestSampleData()
{
    QMutexLocker locker(&s_measureMutex);
    Sample sample;
    // An empty file id names the latest measurement.
    const STATUS_T status = CmdOut_GetRefinishSample(sample, QString(), 0);
    if (status == STATUS_OK) {
        API_SignalMaster::instance()->emitAddedSample(Sample(sample));
        return true;
    }
    API_SignalMaster::instance()->emitMeasurementIssue(static_cast<int>(status));
    return false;
}

void MeasAPI_TemperatureCheck()
{
    UserParams* params = UserParams::instance();
    if (!params->getSampleTempCheckEnabled())
        return;
    // A failed read compares 0, as the instrument always did.
    float value = 0.0f;
    CmdOut_GetTemperature(value, kSampleTemperatureSensor);
    if (value > params->getSampleTempCheckHighLimit()
        || value < params->getSampleTempCheckLowLimit())
        API_SignalMaster::instance()->emitTemperatureWarning();
}
