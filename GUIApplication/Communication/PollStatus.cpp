#include "Communication/PollStatus.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "Commands/TargetingOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "GUIAPI/TargetingAPI.h"

#include <QCoreApplication>
#include <QDebug>
#include <QMutexLocker>
#include <QRecursiveMutex>
#include <QThread>

namespace {

// Every slot takes it: the measure API and the triggers may call in directly,
// and processEvents() inside a tick can deliver a trigger during that tick.
QRecursiveMutex s_pollMutex;

const int kIdleInterval = 500;
const int kMeasurementInterval = 100;
const int kMeasurementLimit = 25000;
const int kCalibrateInterval = 100;
const int kReferenceInterval = 100;
const int kSelfTestInterval = 100;
const int kTargetingInterval = 200;
const int kTriggerRetryLimit = 6000;
const int kTargetingImageBytes = 482 * 348 * 3;
// One calibration read every 300 targeting ticks, once a minute.
const int kTargetingCalibrationEvery = 300;

} // namespace

PollStatus::PollStatus(QObject* parent)
    : QObject(parent)
    , m_status(STATUS_OK)
    , m_calibStatus(CALIBRATION_STATUS_GOOD)
    , m_triggerStatus(0)
{
}

void PollStatus::Init()
{
    QMutexLocker locker(&s_pollMutex);
    m_imageData.reserve(kTargetingImageBytes);
    m_currentSelfTest = TEST();
    m_MeasurementKillTimer.setSingleShot(true);

    connect(&m_IdleTimer, &QTimer::timeout, this, &PollStatus::onIdleTimer);
    connect(&m_MeasurementTimer, &QTimer::timeout, this, &PollStatus::onMeasurementTimer);
    connect(&m_MeasurementKillTimer, &QTimer::timeout, this, &PollStatus::onMeasurementKillTimer);
    connect(&m_CalibrateTimer, &QTimer::timeout, this, &PollStatus::onCalibratingTimer);
    connect(&m_ReferenceTimer, &QTimer::timeout, this, &PollStatus::onReferenceTimer);
    connect(&m_SelfTestTimer, &QTimer::timeout, this, &PollStatus::onSelfTestTimer);
    connect(&m_TargetingTimer, &QTimer::timeout, this, &PollStatus::onTargetingTimer);

    // TriggerTargetingStart/Stop belong to the targeting screen, which runs
    // its own poll; this poller reaches targeting only after a refused
    // measurement trigger.
    API_SignalMaster* hub = API_SignalMaster::instance();
    connect(hub, &API_SignalMaster::TcpDisconnected, this, &PollStatus::onStopPolling);
    connect(hub, &API_SignalMaster::TriggerResumeIdle, this, &PollStatus::onTriggerResumeIdle);
    connect(hub, &API_SignalMaster::TriggerMeasurement, this, &PollStatus::onTriggerMeasurement);
    connect(hub, &API_SignalMaster::TriggerCalibration, this, &PollStatus::onTriggerCalibration);
    connect(hub, &API_SignalMaster::TriggerReferenceCheck, this,
            &PollStatus::onTriggerReferenceCheck);
    connect(hub, &API_SignalMaster::TriggerSelfTest, this, &PollStatus::onTriggerSelfTest);
    connect(hub, &API_SignalMaster::LockStarted, this, &PollStatus::onTriggerResumeIdle);
}

QStringList PollStatus::activeTimers() const
{
    QMutexLocker locker(&s_pollMutex);
    QStringList names;
    if (m_IdleTimer.isActive())
        names << "idle";
    if (m_MeasurementTimer.isActive())
        names << "measurement";
    if (m_MeasurementKillTimer.isActive())
        names << "kill";
    if (m_CalibrateTimer.isActive())
        names << "calibrate";
    if (m_TargetingTimer.isActive())
        names << "targeting";
    if (m_ReferenceTimer.isActive())
        names << "reference";
    if (m_SelfTestTimer.isActive())
        names << "selftest";
    return names;
}

int PollStatus::lastTriggerStatus() const
{
    QMutexLocker locker(&s_pollMutex);
    return m_triggerStatus;
}

void PollStatus::onIdleTimer()
{
    QMutexLocker locker(&s_pollMutex);
    try {
        m_MeasurementKillTimer.stop();
        m_status = CmdOut_GetState(m_statusInfo);
        if (m_status != STATUS_OK)
            return;
        if (CmdOut_GetCalibrationState(m_calState) != STATUS_OK)
            return;
        m_statusInfo.setCalState(m_calState);
        API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);
    } catch (unsigned int) {
        // the next tick asks again
    }
}

void PollStatus::onMeasurementTimer()
{
    static bool startedMeas = false;
    QMutexLocker locker(&s_pollMutex);
    try {
        m_status = CmdOut_GetState(m_statusInfo);
        if (m_status != STATUS_OK)
            throw static_cast<unsigned int>(m_status);
        // No calibration command here: the tick must stay short.
        m_statusInfo.setCalState(DataManager::instance()->getCalState());
        API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);

        const SYSTEM_STATE_T state = m_statusInfo.getSystemState();
        if (state != STATE_INIT) {
            startedMeas = true;
            QCoreApplication::processEvents();
        }
        // Over only once the server has been seen busy and back at rest.
        if (state == STATE_INIT && startedMeas) {
            onTriggerResumeIdle();
            startedMeas = false;
            MeasAPI_MeasurementComplete();
            MeasAPI_CalculationComplete();
        }
        if (m_status == STATUS_OK)
            API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);
    } catch (unsigned int) {
        onTriggerResumeIdle();
    }
}

void PollStatus::onMeasurementKillTimer()
{
    QMutexLocker locker(&s_pollMutex);
    onTriggerResumeIdle();
    API_SignalMaster::instance()->emitGoHome();
}

void PollStatus::onCalibratingTimer()
{
    static bool startedMeas = false;
    QMutexLocker locker(&s_pollMutex);
    try {
        m_status = CmdOut_GetState(m_statusInfo);
        if (m_status != STATUS_OK)
            throw static_cast<unsigned int>(m_status);
        if (CmdOut_GetCalibrationState(m_calState) == STATUS_OK)
            m_statusInfo.setCalState(m_calState);
        API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);

        const SYSTEM_STATE_T state = m_statusInfo.getSystemState();
        if (state != STATE_INIT) {
            startedMeas = true;
            QCoreApplication::processEvents();
        }
        if (state == STATE_INIT && startedMeas) {
            onTriggerResumeIdle();
            startedMeas = false;
            // With errors pending there is no completion: DataManager fetches
            // the errors from the status.
            if (m_statusInfo.getNumOfErrors() == 0)
                MeasAPI_CalibrationComplete();
        }
    } catch (unsigned int) {
        onTriggerResumeIdle();
    }
}

void PollStatus::onReferenceTimer()
{
    static bool startedMeas = false;
    QMutexLocker locker(&s_pollMutex);
    try {
        m_status = CmdOut_GetState(m_statusInfo);
        if (m_status != STATUS_OK)
            throw static_cast<unsigned int>(m_status);
        if (CmdOut_GetCalibrationState(m_calState) == STATUS_OK)
            m_statusInfo.setCalState(m_calState);
        API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);

        const SYSTEM_STATE_T state = m_statusInfo.getSystemState();
        if (state != STATE_INIT)
            startedMeas = true;
        if (state == STATE_INIT && startedMeas) {
            onTriggerResumeIdle();
            startedMeas = false;
            MeasAPI_ReferenceCheckComplete();
        }
    } catch (unsigned int) {
        onTriggerResumeIdle();
    }
}

void PollStatus::onSelfTestTimer()
{
    static bool startedMeas = false;
    static unsigned int testResult = 0;
    QMutexLocker locker(&s_pollMutex);
    try {
        m_status = CmdOut_GetState(m_statusInfo);
        if (m_status != STATUS_OK)
            return;
        if (CmdOut_GetCalibrationState(m_calState) == STATUS_OK)
            m_statusInfo.setCalState(m_calState);
        API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);

        const SYSTEM_STATE_T state = m_statusInfo.getSystemState();
        if (state != STATE_INIT)
            startedMeas = true;
        CmdOut_GetSelfTestResult(m_currentSelfTest.num, testResult);
        // A result ends the test even while the server still reports busy.
        if ((state == STATE_INIT && startedMeas) || testResult != 0) {
            onTriggerResumeIdle();
            startedMeas = false;
            // So that a failed read in the next test can't end it at once.
            testResult = 0;
            MeasAPI_SelfTestComplete(m_currentSelfTest);
        }
    } catch (unsigned int) {
        // the poll goes on
    }
}

// Steps after the targeting read: the state, now and then the calibration,
// and the end of targeting when the server is back at rest.
void PollStatus::targetingStateTail(bool checkCalibration)
{
    if (CmdOut_GetState(m_statusInfo) != STATUS_OK) {
        TargetingAPI_StopPolling();
        return;
    }
    if (checkCalibration)
        CmdOut_GetCalibrationState(m_calState);
    m_statusInfo.setCalState(m_calState);
    API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);
    if (m_statusInfo.getSystemState() == STATE_INIT)
        TargetingAPI_StopPolling();
}

void PollStatus::onTargetingTimer()
{
    static int checkCalStatus = 0;
    QMutexLocker locker(&s_pollMutex);

    m_calState = DataManager::instance()->getSystemStatus().getCalState();
    m_calibStatus = CALIBRATION_STATUS_GOOD;
    m_pressureSwitch = PRESSURE_SWITCH_T();
    m_orientation = ACCELEROMETER_ORIENTATION_T();
    checkCalStatus = (checkCalStatus + 1) % kTargetingCalibrationEvery;

    try {
        if (CmdOut_GetTargetingInfo(m_pressureSwitch, m_orientation, m_calibStatus, m_imageData)
            == STATUS_OK) {
            API_SignalMaster* hub = API_SignalMaster::instance();
            hub->emitPressureSwitchesUpdated(m_pressureSwitch);
            hub->emitTargetingImageUpdated(QByteArray(m_imageData));
            hub->emitOrientationUpdated(m_orientation);
        }
        targetingStateTail(checkCalStatus == 0);
    } catch (unsigned int) {
        try {
            targetingStateTail(checkCalStatus == 0);
        } catch (unsigned int) {
            TargetingAPI_StopPolling();
        }
    }
}

void PollStatus::onTriggerMeasurement()
{
    QMutexLocker locker(&s_pollMutex);
    m_IdleTimer.stop();
    m_CalibrateTimer.stop();
    m_TargetingTimer.stop();
    m_MeasurementKillTimer.stop();
    m_ReferenceTimer.stop();
    m_SelfTestTimer.stop();
    m_timer.start();

    QThread::usleep(50000);
    m_triggerStatus = static_cast<int>(CmdOut_TriggerMeasurement());
    if (m_triggerStatus != 0) {
        // Refused: back to the live view, the user tries again from there.
        API_SignalMaster::instance()->emitMeasurementIssue(m_triggerStatus);
        onTriggerTargetingStart();
        return;
    }
    API_SignalMaster::instance()->emitMeasurementStarted();
    m_MeasurementTimer.start(kMeasurementInterval);
    m_MeasurementKillTimer.start(kMeasurementLimit);
}

void PollStatus::onTriggerCalibration()
{
    QMutexLocker locker(&s_pollMutex);
    m_IdleTimer.stop();
    m_TargetingTimer.stop();
    m_MeasurementTimer.stop();
    m_ReferenceTimer.stop();
    m_SelfTestTimer.stop();
    CmdOut_StopTargetingMode();
    m_timer.start();
    do {
        QThread::usleep(50000);
        m_triggerStatus = static_cast<int>(CmdOut_TriggerCalibration());
        if (m_triggerStatus != 0)
            API_SignalMaster::instance()->emitMeasurementIssue(m_triggerStatus);
    } while (m_triggerStatus != 0 && !m_timer.hasExpired(kTriggerRetryLimit));
    // Started even when the trigger never got through: the poll then waits
    // at rest until something resumes idle.
    m_CalibrateTimer.start(kCalibrateInterval);
}

void PollStatus::onTriggerReferenceCheck()
{
    QMutexLocker locker(&s_pollMutex);
    m_IdleTimer.stop();
    m_TargetingTimer.stop();
    m_MeasurementTimer.stop();
    m_CalibrateTimer.stop();
    m_SelfTestTimer.stop();
    CmdOut_StopTargetingMode();
    m_timer.start();
    do {
        QThread::usleep(50000);
        m_triggerStatus = static_cast<int>(CmdOut_TriggerReferenceCheck());
        if (m_triggerStatus != 0)
            API_SignalMaster::instance()->emitMeasurementIssue(m_triggerStatus);
    } while (m_triggerStatus != 0 && !m_timer.hasExpired(kTriggerRetryLimit));
    m_ReferenceTimer.start(kReferenceInterval);
}

void PollStatus::onTriggerSelfTest(TEST test)
{
    QMutexLocker locker(&s_pollMutex);
    m_IdleTimer.stop();
    m_TargetingTimer.stop();
    m_MeasurementTimer.stop();
    m_CalibrateTimer.stop();
    m_ReferenceTimer.stop();
    CmdOut_StopTargetingMode();
    m_timer.start();
    QThread::usleep(50000);
    m_triggerStatus = static_cast<int>(CmdOut_TriggerSelfTest(test.num));
    if (m_triggerStatus != 0) {
        API_SignalMaster::instance()->emitMeasurementIssue(m_triggerStatus);
        return;
    }
    m_currentSelfTest = test;
    m_SelfTestTimer.start(kSelfTestInterval);
}

void PollStatus::onTriggerTargetingStart()
{
    QMutexLocker locker(&s_pollMutex);
    qDebug().noquote() << QString("%1 beginning").arg(__FUNCTION__);
    m_IdleTimer.stop();
    m_CalibrateTimer.stop();
    m_MeasurementTimer.stop();
    m_ReferenceTimer.stop();
    CmdOut_StartTargetingMode();
    QThread::usleep(100000);
    m_TargetingTimer.start(kTargetingInterval);
    qDebug().noquote() << QString("%1 end").arg(__FUNCTION__);
}

void PollStatus::onTriggerTargetingStop()
{
    QMutexLocker locker(&s_pollMutex);
    m_MeasurementKillTimer.stop();
    CmdOut_StopTargetingMode();
    onTriggerResumeIdle();
}

void PollStatus::onTriggerResumeIdle()
{
    QMutexLocker locker(&s_pollMutex);
    m_CalibrateTimer.stop();
    m_MeasurementTimer.stop();
    m_TargetingTimer.stop();
    m_MeasurementKillTimer.stop();
    m_ReferenceTimer.stop();
    m_SelfTestTimer.stop();
    m_IdleTimer.start(kIdleInterval);
}

void PollStatus::onStartPolling()
{
    QMutexLocker locker(&s_pollMutex);
    m_IdleTimer.start(kIdleInterval);
}

void PollStatus::onStopPolling()
{
    QMutexLocker locker(&s_pollMutex);
    qDebug() << "PollStatus: stopping polling";
    // The kill timer is left: if it fires, the idle poll comes back even
    // without a link.
    m_MeasurementTimer.stop();
    m_IdleTimer.stop();
    m_CalibrateTimer.stop();
    m_TargetingTimer.stop();
    m_ReferenceTimer.stop();
    m_SelfTestTimer.stop();
}
