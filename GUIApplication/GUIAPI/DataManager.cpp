// DataManager: the thread, start-up and sync, the status, files and the
// plain accessors. The job, sample, tag and Wi-Fi flows are in
// DataManagerFlows.cpp.

#include "GUIAPI/DataManager.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "Communication/Commands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/MeasureAPI.h"
#include "GUIAPI/SystemAPI.h"
#include "GUIAPI/TargetingAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"

#include <QCoreApplication>
#include <QDebug>
#include <QFile>
#include <QMutexLocker>
#include <QThread>

namespace {

const int kInterfaceVersion = 7;
const int kInitRetryInterval = 500;
// After a successful start, the screens get a moment before the news.
const unsigned long kInitSettleMicroseconds = 1000000;

const int kJobEntity = 1007;
const int kEntityChanged = 2;

// Settings bits of the status: which setting changed on the server.
const uint32_t kBitLanguage = 0x1;
const uint32_t kBitFilterFiles = 0x10;
const uint32_t kBitBrightness = 0x4;
const uint32_t kBitVolume = 0x8;
const uint32_t kBitWifiSettings = 0x20;
const uint32_t kBitMeasuringCircle = 0x800;
const uint32_t kBitDefaultJobName = 0x4000;
const uint32_t kBitDefaultJobSize = 0x8000;
const uint32_t kBitDisplayOffTime = 0x10000;
const uint32_t kBitStandbyTime = 0x20000;
const uint32_t kBitPowerOffTime = 0x40000;
const uint32_t kBitWhiteTransfer = 0x80000;
const uint32_t kBitAutoMeasure = 0x100000;
const uint32_t kBitTextMessage = 0x200000;
const uint32_t kBitViewMeasurements = 0x400000;
const uint32_t kBitWifiScanResults = 0x800000;
const uint32_t kBitsAveraging = 0x2000000 | 0x4000000 | 0x8000000 | 0x10000000;
const uint32_t kBitOrientation = 0x20000000;
const uint32_t kBitLabMode = 0x40000000;

const int kFilterFileIssue = -92934;
const int kWhiteTransferCalibration = 1;
const int kWhiteTransferReferenceCheck = 2;

bool readParameter(PARAMETER_TYPE_T key, PARAMETER_CONTENT_TYPES& value)
{
    return SysAPI_GetParameter(key, value);
}

QString threadIdText()
{
    return QString::number(reinterpret_cast<quintptr>(QThread::currentThreadId()));
}

} // namespace

// ---------------------------------------------------------------- thread

DataManagerTask* DataManagerTask::instance()
{
    static DataManagerTask* task = nullptr;
    if (!task)
        task = new DataManagerTask();
    return task;
}

DataManagerTask::DataManagerTask()
{
    startAndWait();
}

void DataManagerTask::workerCreated(DataManager*)
{
    qDebug().noquote() << QString("DataManager Thread is Running: %1").arg(threadIdText());
}

DataManager* DataManager::instance()
{
    return DataManagerTask::instance()->worker();
}

// ---------------------------------------------------------------- start-up

DataManager::DataManager()
    : m_CurrentJobIndex(NO_INDEX)
    , m_CurrentSampleIndex(NO_INDEX)
    , m_activeImage(IMAGE_NEG_45)
    , m_UserParameters(nullptr)
    , m_DataInitialized(false)
    , m_fullJobUpdateFlag(false)
{
    qDebug() << "DataManager Object Created";
}

void DataManager::Init()
{
    API_SignalMaster* hub = API_SignalMaster::instance();
    hub->moveToThread(thread());
    UserParams::instance()->moveToThread(thread());
    Commands::instance()->moveToThread(thread());

    hub->Init();
    UserParams::instance()->Init();
    m_pPollStatus.Init();

    m_UserParameters = UserParams::instance();
    qDebug().noquote() << QString("DataManager Object is : 0x%1")
                              .arg(reinterpret_cast<quintptr>(this), 0, 16);

    connect(&m_initTimer, &QTimer::timeout, this, &DataManager::onInit);
    connect(hub, &API_SignalMaster::StatusUpdated, this, &DataManager::onSystemStatusUpdated);
    connect(hub, &API_SignalMaster::OrientationUpdated, this, &DataManager::onOrientationUpdated);
    connect(hub, &API_SignalMaster::PressureSwitchesUpdated, this,
            &DataManager::onPressureSwitchesUpdated);
    connect(hub, &API_SignalMaster::AddedSample, this, &DataManager::onAddSample);
    connect(hub, &API_SignalMaster::JobDeleteCurrent, this, &DataManager::deleteActiveJob);
    connect(hub, &API_SignalMaster::JobDeleteAllSamples, this,
            &DataManager::onDeleteActiveJobSamples);
    connect(hub, &API_SignalMaster::SampleCurrentDelete, this, &DataManager::deleteActiveSample);
    connect(hub, &API_SignalMaster::JobDeleteAll, this, &DataManager::deleteAllJobs);
    connect(hub, &API_SignalMaster::JobDeleteAllCompleted, this,
            &DataManager::deleteCompletedJobs);
    connect(hub, &API_SignalMaster::JobDelete, this, &DataManager::deleteJob);
    connect(hub, &API_SignalMaster::TcpReconnected, this, &DataManager::onInit);
    connect(hub, &API_SignalMaster::TcpDisconnected, this, &DataManager::onClearEverything);
    connect(hub, &API_SignalMaster::SadPuppy, this, &DataManager::onClearEverything);
    connect(hub, &API_SignalMaster::TriggerWifiScan, this, &DataManager::onTriggerWifiScan);

    // Jobs decoded from the wire match their tags against the state names.
    Job::setTagStateNameSource([this](int state) { return cachedTagStateName(state); });
    // A measurement goes into the job in hand.
    MeasureOut_SetActiveJobNameSource([this] { return getActiveJobObject().getName(); });

    onClearEverything();
    m_initTimer.setSingleShot(true);
}

PollStatus* DataManager::getPollStatus()
{
    return &m_pPollStatus;
}

void DataManager::onInit()
{
    QMutexLocker locker(&m_lock);
    QCoreApplication::processEvents();
    if (!onSync()) {
        // No limit: the instrument may take its time to come up.
        m_initTimer.start(kInitRetryInterval);
        qDebug() << "DataManager: init failed, trying again";
        return;
    }
    API_SignalMaster::instance()->emitGoHome();
    API_SignalMaster::instance()->emitTriggerResumeIdle();
    qDebug() << "DataManager: init completed successfully";
    MeasAPI_CheckAndHandleErrors();
    QThread::usleep(kInitSettleMicroseconds);
    emit DataManagerInitComplete();
}

bool DataManager::onSync()
{
    QMutexLocker locker(&m_lock);
    bool result = true;
    try {
        clearTagLists();
        clearAllJobs();

        if (!SysAPI_SetInterfaceConfig(kInterfaceVersion)) {
            qDebug().noquote()
                << QString("DataManager: issue setting interface version %1").arg(kInterfaceVersion);
            m_DataInitialized = false;
            return false;
        }

        loadFilters();

        m_LanguagesInstalled.clear();
        if (!SysAPI_GetLanguages(m_LanguagesInstalled) || m_LanguagesInstalled.isEmpty()) {
            qDebug() << "DataManager: issue obtaining installed languages";
            result = false;
        }

        unsigned int volume = 0;
        if (SysAPI_GetBeeperVolume(volume)) {
            m_UserParameters->setBeeperVolume(volume);
        } else {
            qDebug() << "DataManager: issue obtaining beeper volume";
            result = false;
        }

        unsigned int brightness = 0;
        if (SysAPI_GetDisplayBrightness(brightness)) {
            m_UserParameters->setDisplayBrightness(brightness);
        } else {
            qDebug() << "DataManager: issue obtaining display brightness";
            result = false;
        }

        // Some parameter may be unknown to an older server: the instrument
        // still works with the defaults, so this alone doesn't fail the sync.
        if (SysAPI_GetUserParams())
            emit languageChanged(m_UserParameters->getLanguageCode());
        else
            qDebug() << "DataManager: issue obtaining user parameters";

        Instrument_Determine_Model_Type();
        getUpdatedMemInfo();

        if (result)
            result = loadKeypad(m_UserParameters->getLanguageCode(), m_keypadKeys);

        SystemStatus status;
        CALIBRATION_STATE_T calibration;
        const STATUS_T stateResult = CmdOut_GetState(status);
        const STATUS_T calibrationResult = CmdOut_GetCalibrationState(calibration);
        if (stateResult == STATUS_OK && calibrationResult == STATUS_OK) {
            status.setCalState(calibration);
            onSystemStatusUpdated(status);
        }
    } catch (unsigned int) {
        m_DataInitialized = false;
        return false;
    }
    m_DataInitialized = result;
    return result;
}

void DataManager::onClearEverything()
{
    QMutexLocker locker(&m_lock);
    m_SystemStatus.ClearContents();
    UserParams::instance()->setDefaults();
    m_PressureSensorStatus.Switch1 = 1;
    m_PressureSensorStatus.Switch2 = 1;
    m_PressureSensorStatus.Switch3 = 1;
    m_InstrumentOrientation = ACCELEROMETER_ORIENTATION_T();
    m_keypadKeys.clear();
    clearTagLists();
    clearAllJobs();
    m_DataInitialized = false;
    m_activeImage = IMAGE_NEG_45;
    m_CurrentSampleIndex = NO_INDEX;
    m_CurrentJobIndex = NO_INDEX;
    m_targetingImage.image = QImage();
    m_targetingImage.buffer.clear();
    API_SignalMaster::instance()->emitJobInfoUpdated();
}

// ---------------------------------------------------------------- status

void DataManager::onSystemStatusUpdated(SystemStatus status)
{
    setSystemStatus(status);
}

void DataManager::setSystemStatus(const SystemStatus& status)
{
    QMutexLocker locker(&m_lock);
    // Never equal (see SystemStatus): every poll is processed in full.
    if (status == m_SystemStatus)
        return;
    const SystemStatus& old = m_SystemStatus;
    API_SignalMaster* hub = API_SignalMaster::instance();

    const SYSTEM_STATE_T state = status.getSystemState();
    if (state != old.getSystemState())
        emit updateSystemState(state);

    // The server's lock: the instrument is in use from elsewhere.
    if (state == STATE_LOCK)
        hub->emitLockStarted();
    else if (old.getSystemState() == STATE_LOCK)
        hub->emitGoHome();

    if (status.getPercentComplete() != old.getPercentComplete())
        emit updatePercentComplete(status.getPercentComplete());

    if (status.getNumOfErrors() > 0 && !isMeasurementInProgress(state))
        MeasAPI_CheckAndHandleErrors();

    if (status.getSystemTime() != old.getSystemTime())
        emit updateSystemTime(status.getSystemTime());
    if (status.getBatteryState() != old.getBatteryState())
        emit updateBatteryState(status.getBatteryState());
    if (status.getBatteryChargePercent() != old.getBatteryChargePercent())
        emit updateBatteryChargePercent(status.getBatteryChargePercent());
    if (status.getWifiState() != old.getWifiState())
        emit updateWifiState(status.getWifiState());
    if (status.getWifiLevel() != old.getWifiLevel())
        emit updateWifiLevel(status.getWifiLevel());
    if (status.getUSBState() != old.getUSBState())
        emit updateUSBState(status.getUSBState());

    const int nextCal = status.getCalState().nextExternalWhiteCal;
    const int oldNextCal = old.getCalState().nextExternalWhiteCal;
    if (nextCal < 1 && oldNextCal > 0)
        emit updateCalValid(false);
    if (nextCal > 0 && oldNextCal < 1)
        emit updateCalValid(true);

    const bool jobsChanged = status.getJobID() != old.getJobID()
        || status.getMeasureID() != old.getMeasureID();
    if (jobsChanged) {
        if (m_fullJobUpdateFlag)
            updateJobInfos();
        else if (!updateCurrentJobInfo())
            updateJobInfos();
    }

    applySettingsBits(status, jobsChanged);

    bool fullRefreshDone = false;
    for (const SystemStatus::EntityChange& change : status.getEntityChanges()) {
        if (change.entity != kJobEntity || change.change != kEntityChanged)
            continue;
        if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
            continue;
        if (change.identifier1 == m_JobList[m_CurrentJobIndex].getName()) {
            updateCurrentJobInfo();
        } else if (!fullRefreshDone) {
            updateJobInfos();
            fullRefreshDone = true;
        }
    }

    m_SystemStatus = status;
}

void DataManager::applySettingsBits(const SystemStatus& status, bool jobsChanged)
{
    const uint32_t bits = status.getUSettingsBits();
    if (bits == 0)
        return;
    UserParams* params = m_UserParameters ? m_UserParameters : UserParams::instance();
    PARAMETER_CONTENT_TYPES value;

    if ((bits & kBitLanguage) && readParameter(PARAMETER_CURRENT_LANGUAGE_ID, value)) {
        // An empty code is a change like any other: the English keypad, the
        // parameter written back, and the screens told.
        const QString code = value.parameterString.trimmed();
        if (code.toUpper() != params->getLanguageCode().trimmed().toUpper())
            setLanguageCode(value.parameterString);
    }
    if (bits & kBitBrightness) {
        unsigned int brightness = 0;
        if (SysAPI_GetDisplayBrightness(brightness) && brightness != params->getDisplayBrightness()) {
            params->setDisplayBrightness(brightness);
            emit displayBrightnessChanged();
        }
    }
    if (bits & kBitVolume) {
        unsigned int volume = 0;
        if (SysAPI_GetBeeperVolume(volume) && volume != params->getBeeperVolume()) {
            params->setBeeperVolume(volume);
            emit beeperVolumeChanged();
        }
    }
    if (bits & kBitWifiSettings)
        emit wifiSettingsChanged();
    if ((bits & kBitDefaultJobSize) && readParameter(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES, value)
        && static_cast<unsigned int>(value.parameterInt) != params->getJobDefaultSize()) {
        params->setJobDefaultSize(value.parameterInt);
        emit paramUpdate();
    }
    if ((bits & kBitDefaultJobName) && readParameter(PARAMETER_DEFAULT_JOB_NAME, value)
        && value.parameterString != params->getJobDefaultName()) {
        params->setJobDefaultName(value.parameterString);
        emit paramUpdate();
    }
    if ((bits & kBitAutoMeasure) && readParameter(PARAMETER_AUTO_MEASURE, value)
        && (value.parameterInt == 1) != params->getAutoMeasure()) {
        params->setAutoMeasure(value.parameterInt == 1);
        emit autoMeasureChanged();
    }
    if ((bits & kBitDisplayOffTime) && readParameter(PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME, value)
        && value.parameterInt != params->getPowerDisplayOffTime()) {
        params->setPowerDisplayOffTime(value.parameterInt);
        emit powerDisplayOffTimeChanged();
    }
    if ((bits & kBitStandbyTime) && readParameter(PARAMETER_DEFAULT_STANDBY_TIME, value)
        && value.parameterInt != params->getPowerStandbyTime()) {
        params->setPowerStandbyTime(value.parameterInt);
        emit powerStandbyTimeChanged();
    }
    if ((bits & kBitPowerOffTime) && readParameter(PARAMETER_DEFAULT_POWER_OFF_TIME, value)
        && value.parameterInt != params->getPowerOffTime()) {
        params->setPowerOffTime(value.parameterInt);
        emit powerOffTimeChanged();
    }
    // A message from the server is shown every time it is sent, even twice.
    if ((bits & kBitTextMessage) && readParameter(PARAMETER_TEXT_MESSAGE, value))
        emit showMessageBox(QString(), value.parameterString);
    if ((bits & kBitViewMeasurements)
        && readParameter(PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS, value)
        && (value.parameterInt == 1) != params->getEnableViewMeasurements())
        params->setEnableViewMeasurements(value.parameterInt == 1);
    if (bits & kBitWifiScanResults) {
        onLoadWifiSettings();
        emit wifiSettingsChanged();
    }
    if ((bits & kBitMeasuringCircle) && readParameter(PARAMETER_MEASURING_CIRCLE_ID, value))
        params->setMeasuringCircleID(value.parameterString);
    if (bits & kBitsAveraging)
        applyAveragingDefaults();
    if ((bits & kBitOrientation) && readParameter(PARAMETER_ORIENATION_ENABLED, value)
        && (value.parameterInt == 1) != params->getOrientationEnabled()) {
        params->setOrientationEnabled(value.parameterInt == 1);
        emit updateOrientatonEnabled(value.parameterInt == 1);
    }
    if ((bits & kBitFilterFiles) && !loadFilters())
        API_SignalMaster::instance()->emitMeasurementIssue(kFilterFileIssue);
    if ((bits & kBitLabMode) && readParameter(PARAMETER_ONLINE_MODE_JOB, value))
        applyLabModeJob(value.parameterString, jobsChanged);
    if ((bits & kBitWhiteTransfer) && readParameter(PARAMETER_WHITE_TRANSFER_REQUEST, value))
        applyWhiteTransferRequest(value.parameterInt);
}

void DataManager::applyAveragingDefaults()
{
    PARAMETER_CONTENT_TYPES modeValue, goodValue, maxValue, numberValue;
    // All four or nothing: a half-read set would mix old and new defaults.
    if (!readParameter(PARAMETER_MEASUREMENT_MODE, modeValue)
        || !readParameter(PARAMETER_SMC_GOOD_MEASUREMENTS, goodValue)
        || !readParameter(PARAMETER_SMC_MAX_MEASUREMENTS, maxValue)
        || !readParameter(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, numberValue))
        return;

    const QString modeText = modeValue.parameterString.toUpper();
    const int number = numberValue.parameterInt;
    JOB_AVERAGING_MODE_T mode = JOB_AVG_MODE_NONE;
    if (modeText == "SMC")
        mode = JOB_AVG_MODE_SMC;
    else if (modeText == "AVERAGE")
        mode = number == 3 ? JOB_AVG_MODE_SIMPLE_3
                           : (number == 5 ? JOB_AVG_MODE_SIMPLE_5 : JOB_AVG_MODE_NONE);

    const JOB_AVERAGING_INFO_T current = m_UserParameters->getJobDefaultAvgInfo();
    if (current.mode != mode || current.averageNumber != number
        || current.smcGoodMeasurements != goodValue.parameterInt
        || current.smcMaxMeasurements != maxValue.parameterInt) {
        m_UserParameters->setJobDefaultAvgInfo(mode, goodValue.parameterInt, maxValue.parameterInt,
                                               number);
        emit paramUpdate();
    }
}

void DataManager::applyLabModeJob(const QString& value, bool jobsChanged)
{
    if (value == m_UserParameters->getLabModeJob())
        return;
    if (jobsChanged) {
        // Let the job list's news reach the screens before they navigate.
        qDebug() << "Pausing, job was updated...";
        QThread::yieldCurrentThread();
    }
    if (!value.isEmpty()) {
        refreshJobInfos();
        m_UserParameters->setLabModeJob(value);
        setActiveJob(findJobByName(value));
        qDebug().noquote() << "Going to lab mode with new job name: "
                                  + getActiveJobObject().getName();
        API_SignalMaster::instance()->emitGoToLabMode();
    } else {
        m_UserParameters->setLabModeJob(value);
        qDebug() << "Going Home";
        API_SignalMaster::instance()->emitGoHome();
        TargetingAPI_StopPolling();
        qDebug() << "Pausing, going home...";
        QThread::yieldCurrentThread();
    }
}

void DataManager::applyWhiteTransferRequest(int value)
{
    if (value == kWhiteTransferCalibration) {
        QThread::yieldCurrentThread();
        API_SignalMaster::instance()->emitGoToWhiteCalibration();
        TargetingAPI_StopPolling();
    } else if (value == kWhiteTransferReferenceCheck) {
        QThread::yieldCurrentThread();
        API_SignalMaster::instance()->emitGoToRefCheck();
        TargetingAPI_StopPolling();
    }
}

void DataManager::onPressureSwitchesUpdated(PRESSURE_SWITCH_T status)
{
    QMutexLocker locker(&m_lock);
    if (status.Switch1 == m_PressureSensorStatus.Switch1
        && status.Switch2 == m_PressureSensorStatus.Switch2
        && status.Switch3 == m_PressureSensorStatus.Switch3)
        return;
    m_PressureSensorStatus = status;
    emit updatePressureSensorStatus(status);
}

void DataManager::onOrientationUpdated(ACCELEROMETER_ORIENTATION_T orientation)
{
    QMutexLocker locker(&m_lock);
    const bool positionChanged =
        orientation.OrientationPosition != m_InstrumentOrientation.OrientationPosition;
    m_InstrumentOrientation = orientation;
    if (positionChanged)
        emit updateInstrumentPosition(orientation.OrientationPosition);
}

int DataManager::onAddSample(Sample sample)
{
    // Samples enter the list with the job reload that the status triggers.
    Q_UNUSED(sample)
    return 0;
}

bool DataManager::isMeasurementInProgress()
{
    SystemStatus status;
    CmdOut_GetState(status);
    return isMeasurementInProgress(status.getSystemState());
}

bool DataManager::isMeasurementInProgress(SYSTEM_STATE_T state)
{
    return state != STATE_INIT && state != STATE_TARGETING;
}

// ---------------------------------------------------------------- accessors

MEMORY_INFO_T DataManager::getMemInfo()
{
    QMutexLocker locker(&m_lock);
    return m_SystemStatus.getMemInfo();
}

CALIBRATION_STATE_T DataManager::getCalState()
{
    QMutexLocker locker(&m_lock);
    return m_SystemStatus.getCalState();
}

SystemStatus DataManager::getSystemStatus()
{
    QMutexLocker locker(&m_lock);
    return m_SystemStatus;
}

PRESSURE_SWITCH_T DataManager::getPressureSensorStatus()
{
    QMutexLocker locker(&m_lock);
    return m_PressureSensorStatus;
}

ACCELEROMETER_ORIENTATION_T DataManager::getInstrumentOrientation()
{
    QMutexLocker locker(&m_lock);
    return m_InstrumentOrientation;
}

int DataManager::getInstrumentPosition()
{
    QMutexLocker locker(&m_lock);
    return m_InstrumentOrientation.OrientationPosition;
}

IMAGE_ANGLE_T DataManager::getActiveImage()
{
    QMutexLocker locker(&m_lock);
    return m_activeImage;
}

void DataManager::setActiveImage(IMAGE_ANGLE_T angle)
{
    QMutexLocker locker(&m_lock);
    m_activeImage = angle;
}

QString DataManager::getIpAddress()
{
    QMutexLocker locker(&m_lock);
    return m_ipAddress;
}

QString DataManager::getWifiSSID()
{
    QMutexLocker locker(&m_lock);
    return m_wifiSSID;
}

KeypadArray DataManager::getKeypadArray()
{
    QMutexLocker locker(&m_lock);
    return m_keypadKeys;
}

QVector<TAG_ITEM_T> DataManager::getLanguagesInstalled()
{
    QMutexLocker locker(&m_lock);
    return m_LanguagesInstalled;
}

bool DataManager::getDataInitialized()
{
    QMutexLocker locker(&m_lock);
    return m_DataInitialized;
}

// ---------------------------------------------------------------- settings

void DataManager::setLanguageCode(const QString& code)
{
    QMutexLocker locker(&m_lock);
    UserParams::instance()->setLanguageCode(code);
    loadKeypad(code, m_keypadKeys);
    PARAMETER_CONTENT_TYPES value;
    value.parameterString = code;
    SysAPI_SetParameter(PARAMETER_CURRENT_LANGUAGE_ID, value);
    emit languageChanged(code);
}

void DataManager::setBeeperVolume(unsigned int volume)
{
    QMutexLocker locker(&m_lock);
    UserParams::instance()->setBeeperVolume(volume);
    SysAPI_SetBeeperVolume(volume);
}

void DataManager::setDisplayBrightness(unsigned int brightness)
{
    QMutexLocker locker(&m_lock);
    UserParams::instance()->setDisplayBrightness(brightness);
    const bool result = SysAPI_SetDisplayBrightness(brightness);
    qDebug().noquote() << QString("setDisplayBrightness was set %1 to %2")
                              .arg(result ? "true" : "false")
                              .arg(brightness);
}

QString DataManager::getLanguageStringFromCode(const QString& code)
{
    QMutexLocker locker(&m_lock);
    const QString wanted = code.trimmed().toUpper();
    for (const TAG_ITEM_T& language : m_LanguagesInstalled) {
        if (language.tagID.trimmed().toUpper() == wanted)
            return language.tagText;
    }
    return QString();
}

// ---------------------------------------------------------------- files

bool DataManager::loadKeypad(const QString& language, KeypadArray& keys)
{
    QMutexLocker locker(&m_lock);
    QByteArray bytes;
    QFile file(Platform::devicePath(QString("/opt/GUI/Keypad/keypad_%1.xml").arg(language)));
    if (file.open(QIODevice::ReadOnly))
        bytes = file.readAll();

    XMLParser parser("/opt/Filter/FilterSchema.xsd", "/opt/Filter/TranslationSchema.xsd");
    if (parser.parseKeypadXML(bytes, keys) == 0)
        return true;

    QFile builtIn(":/Language/keypad_en.xml");
    if (!builtIn.open(QIODevice::ReadOnly))
        return false;
    XMLParser fallback("/opt/Filter/FilterSchema.xsd", "/opt/Filter/TranslationSchema.xsd");
    return fallback.parseKeypadXML(builtIn.readAll(), keys) == 0;
}

bool DataManager::loadFilters()
{
    QMutexLocker locker(&m_lock);
    QByteArray filter;
    QByteArray translation;
    if (!SysAPI_GetFilter(filter) || !SysAPI_GetFilterTranslation(translation)) {
        qDebug() << "DataManager: issue obtaining filter";
        return false;
    }
    if (!m_TagFilters.setTagsArray(filter, translation)) {
        qDebug() << "DataManager: couldn't parse filter XML, either invalid or not available";
        return false;
    }
    cacheTagStateNames();
    return true;
}

void DataManager::cacheTagStateNames()
{
    QStringList names;
    for (int state = TAG_STATE_1; state < NUM_TAG_STATES; ++state)
        names << m_TagFilters.getFilterName(state, "default");
    QMutexLocker locker(&m_tagStateNamesLock);
    m_tagStateNamesDefault = names;
}

QString DataManager::cachedTagStateName(int state)
{
    QMutexLocker locker(&m_tagStateNamesLock);
    return m_tagStateNamesDefault.value(state);
}
