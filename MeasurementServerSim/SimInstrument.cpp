#include "SimInstrument.h"

#include "SimColour.h"
#include "SimSpectra.h"

#include <QDebug>
#include <QRandomGenerator>

#include <algorithm>
#include <cmath>

namespace Sim {

namespace {

// Durations of the operations, in ms at time scale 1.
const int kMeasureMs = 1500;
const int kCalculateMs = 300;
const int kCalibrateMs = 3000;
const int kCalibrateCalcMs = 500;
const int kInternalCheckMs = 1000;
const int kSyncStepMs = 300;
const int kSyncStepPercent = 10;
// A targeting client that stopped asking for pictures has gone.
const int kTargetingPollLimitMs = 5000;
// Internal white reference interval, seconds.
const int kInternalCalS = 1800;
// Range of the sample temperature sensor.
const float kSensorLow = 0.0f;
const float kSensorHigh = 70.0f;

struct KnownError {
    int id;
    quint8 priority;
    int category;
    const char* text;
};

const KnownError kErrors[] = {
    {9, 2, 1, "Instrument is full"},
    {2001, 2, 2, "Instrument not on white tile, or internal white dirty"},
    {2005, 2, 2, "Calibration data not valid"},
    {2012, 2, 2, "Not calibrated"},
    {2028, 2, 2, "External white tile too dirty or incorrect white tile"},
    {2032, 2, 3, "The instrument was moved during a measurement"},
    {2033, 2, 3, "The measurement has been aborted by the user"},
    {2034, 1, 4, "Battery is low. Charge the battery"},
    {2035, 3, 4, "Battery is empty. Instrument will shut down"},
    {2036, 3, 5, "Error in shutter motor"},
    {2037, 2, 2, "No stored reference measurement"},
    {2042, 2, 5, "Spectral integration time on white too long"},
    {2043, 3, 5, "Wavelength shift above absolute limit of 5 nm"},
    {2044, 2, 2, "Calibration expired"},
    {2047, 1, 1, "Low Storage"},
    {2100, 2, 6, "Problem occurred changing Wi-Fi modes"},
    {2101, 2, 6, "Problem occurred scanning for Wi-Fi"},
    {2102, 2, 3, "Sample temperature too high (IR Sensor)"},
    {2103, 2, 3, "Sample temperature too low (IR Sensor)"},
    {2118, 1, 4, "Battery level is too low for update"},
    {2119, 1, 7, "Date and time not set"},
    {3234, 3, 5, "Problem during initialization. Please reboot the device"},
    {3235, 3, 5, "Hardware communication error. Please reboot the device"},
    {3236, 3, 5, "Error during measurement"},
    {3237, 2, 5, "Different best matches for checkpoints"},
};

const KnownError* knownError(int id)
{
    for (const KnownError& e : kErrors)
        if (e.id == id)
            return &e;
    return nullptr;
}

TEST makeTest(const char* name, quint32 location, quint32 durationMs, quint32 num)
{
    TEST t;
    t.description = QString::fromLatin1(name);
    t.deviceLocation = location;
    t.approxDuration = durationMs;
    t.num = num;
    return t;
}

qint64 secsSince(const QDateTime& t)
{
    return t.isValid() ? t.secsTo(QDateTime::currentDateTime()) : 0;
}

} // namespace

Instrument::Instrument(const Options& options, QObject* parent)
    : QObject(parent), m_options(options), m_jobs(m_store, m_changes)
{
    qRegisterMetaType<Sim::Instrument::PowerAction>();
    if (m_options.timeScale <= 0.0)
        m_options.timeScale = 1.0;
    m_rng.seed(m_options.seed ? m_options.seed : QRandomGenerator::global()->generate());
    m_wifi.reset(new WifiRadio(m_store, m_changes, m_options.timeScale, this));
    connect(m_wifi.get(), &WifiRadio::error, this, [this](int id, const QString& text) { pushError(id, text); });
    m_switches.Switch1 = m_switches.Switch2 = m_switches.Switch3 = 0;

    m_selfTests << makeTest("WHITE TRANSFER", SELF_TEST_WHITE_TILE, 4000, 0)
                << makeTest("REFERENCE CHECK ON WHITE", SELF_TEST_WHITE_TILE, 2500, 1)
                << makeTest("REPEATABILITY TESTS", SELF_TEST_WHITE_TILE, 6000, 2)
                << makeTest("EFFECT TILE TEST", SELF_TEST_EFFECT_TILE, 3000, 3)
                << makeTest("TEMPERATURE TESTS", SELF_TEST_DEVICE_LIFTED, 1000, 4)
                << makeTest("PRESSURE SENSOR TEST", SELF_TEST_DEVICE_LIFTED, 800, 5)
                << makeTest("CHECK ERROR LOGS", SELF_TEST_DEVICE_LIFTED, 500, 6);

    m_tick.setInterval(50);
    connect(&m_tick, &QTimer::timeout, this, &Instrument::onTick);
    m_housekeeping.setInterval(1000);
    connect(&m_housekeeping, &QTimer::timeout, this, &Instrument::onHousekeeping);
    m_uptime.start();
}

Instrument::~Instrument() = default;

int Instrument::scaled(int ms) const
{
    return std::max(1, int(std::lround(ms * m_options.timeScale)));
}

bool Instrument::open(QString* error)
{
    if (!m_store.open(m_options.dataDir, m_options.reset, error))
        return false;
    const bool fresh = m_store.isEmpty();
    if (fresh)
        qInfo().noquote() << "Sim: fresh data folder, seeding the demo set in" << m_store.filePath();

    loadParameters();
    m_brightness = m_store.meta(QStringLiteral("brightness"), QStringLiteral("80")).toInt();
    m_volume = m_store.meta(QStringLiteral("volume"), QStringLiteral("5")).toInt();
    m_calIntervalS = m_store.meta(QStringLiteral("cal.interval"), QString::number(8 * 3600)).toInt();
    m_maxJobs = m_store.meta(QStringLiteral("mem.maxJobs"), QStringLiteral("500")).toInt();
    m_maxMeasurements = m_store.meta(QStringLiteral("mem.maxMeasurements"), QStringLiteral("10000")).toInt();
    m_jobs.setSmcTolerance(m_store.meta(QStringLiteral("smc.tolerance"), QStringLiteral("1.0")).toDouble());
    const QString lastCal = m_store.meta(QStringLiteral("cal.last"));
    if (lastCal.isEmpty()) {
        // Delivered calibrated: the last white calibration was two hours ago.
        m_lastWhiteCal = QDateTime::currentDateTime().addSecs(-2 * 3600);
        saveCalibration();
    } else {
        m_lastWhiteCal = QDateTime::fromMSecsSinceEpoch(lastCal.toLongLong());
        m_calReferenceTemperature = m_store.meta(QStringLiteral("cal.refTemp"), QStringLiteral("26.5")).toFloat();
    }
    const QString refTime = m_store.meta(QStringLiteral("refcheck.time"));
    if (!refTime.isEmpty())
        m_lastRefCheck = QDateTime::fromMSecsSinceEpoch(refTime.toLongLong());
    m_refCheckResult = quint8(m_store.meta(QStringLiteral("refcheck.result"), QStringLiteral("0")).toInt());

    m_wifi->load(fresh);
    m_jobs.load();
    if (fresh)
        seedDemo();
    m_housekeeping.start();
    return true;
}

// ---- parameters -----------------------------------------------------------------------

void Instrument::loadParameters()
{
    const QMap<int, ParamValue> stored = m_store.loadParameters();
    m_params.clear();
    m_store.begin();
    for (const Parameters::Definition& d : Parameters::all()) {
        auto it = stored.constFind(d.key);
        if (it != stored.constEnd() && it->type == d.type) {
            m_params.insert(d.key, *it);
        } else {
            const ParamValue v = Parameters::factoryValue(d, m_options.model);
            m_params.insert(d.key, v);
            m_store.saveParameter(d.key, v);
        }
    }
    m_store.commit();
}

const ParamValue* Instrument::parameter(int key) const
{
    auto it = m_params.constFind(key);
    return it == m_params.constEnd() ? nullptr : &*it;
}

void Instrument::setParameterValue(int key, const ParamValue& value, bool announce)
{
    const Parameters::Definition* d = Parameters::find(key);
    if (!d)
        return;
    const bool changed = m_params.value(key) != value;
    m_params.insert(key, value);
    if (changed)
        m_store.saveParameter(key, value);
    // A text message is news each time it is sent, even with the same words.
    if (announce && (changed || key == PARAMETER_TEXT_MESSAGE))
        m_changes.settingChanged(d->bit);
}

STATUS_T Instrument::setParameter(int key, const ParamValue& in)
{
    const Parameters::Definition* d = Parameters::find(key);
    if (!d)
        return ST_OK;   // a key this server does not keep is accepted and ignored
    ParamValue v = in;
    v.type = d->type;
    switch (key) {
    case PARAMETER_CURRENT_LANGUAGE_ID: {
        bool installed = false;
        for (const TAG_ITEM_T& l : languages())
            installed = installed || l.tagID.compare(v.s.trimmed(), Qt::CaseInsensitive) == 0;
        if (!installed)
            return ST_INDEX_INVALID;
        v.s = v.s.trimmed();
        break;
    }
    case PARAMETER_MEASUREMENT_MODE: {
        const QString m = v.s.trimmed().toUpper();
        if (m != QLatin1String("NONE") && m != QLatin1String("AVERAGE") && m != QLatin1String("SMC"))
            return ST_INDEX_INVALID;
        v.s = m;
        break;
    }
    case PARAMETER_AVERAGING_NUMBER_OF_SAMPLES:
        if (v.i != 3 && v.i != 5)
            return ST_INDEX_INVALID;
        break;
    case PARAMETER_SMC_GOOD_MEASUREMENTS:
    case PARAMETER_SMC_MAX_MEASUREMENTS:
    case PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES:
        if (v.i < 1 || v.i > 255)
            return ST_INDEX_INVALID;
        break;
    case PARAMETER_WHITE_TRANSFER_REQUEST:
        if (v.i < 0 || v.i > 2)
            return ST_INDEX_INVALID;
        break;
    case PARAMETER_ONLINE_MODE_JOB:
        if (!v.s.isEmpty() && !m_jobs.find(v.s))
            return ST_NO_SUCH_JOB;
        break;
    case PARAMETER_SYNC_JOB_TO_WEBSERVER: {
        if (parameter(PARAMETER_WEBSERVER_ADDRESS)->s.trimmed().isEmpty())
            return ST_NOT_READY;
        const STATUS_T st = m_jobs.startSync(v.s);
        if (st != ST_OK)
            return st;
        updateTick();
        break;
    }
    default:
        break;
    }
    setParameterValue(key, v, true);
    return ST_OK;
}

void Instrument::parametersToDefaults()
{
    m_store.begin();
    for (const Parameters::Definition& d : Parameters::all()) {
        if (d.key == PARAMETER_ONLINE_MODE_JOB || d.key == PARAMETER_SYNC_JOB_TO_WEBSERVER)
            continue;
        setParameterValue(d.key, Parameters::factoryValue(d, m_options.model), true);
    }
    m_store.commit();
}

JobBook::Defaults Instrument::jobDefaults() const
{
    JobBook::Defaults d;
    d.measurementMode = parameter(PARAMETER_MEASUREMENT_MODE)->s;
    d.smcGood = parameter(PARAMETER_SMC_GOOD_MEASUREMENTS)->i;
    d.smcMax = parameter(PARAMETER_SMC_MAX_MEASUREMENTS)->i;
    d.averagingNumber = parameter(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES)->i;
    d.minSamples = parameter(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES)->i;
    return d;
}

// ---- state ------------------------------------------------------------------------------

SYSTEM_STATE_T Instrument::state() const
{
    const qint64 now = m_uptime.elapsed();
    if (now < m_powerUpUntil)
        return STATE_POWER_UP;
    if (m_op.kind != Operation::None) {
        if (m_op.clock.elapsed() < m_op.workMs || m_op.kind == Operation::SelfTest)
            return m_op.workState;
        return STATE_CALCULATING;
    }
    if (m_locked)
        return STATE_LOCK;
    if (m_busyUntil < 0 || now < m_busyUntil)
        return STATE_BUSY;
    if (m_targeting)
        return STATE_TARGETING;
    return STATE_INIT;
}

int Instrument::percentComplete() const
{
    if (m_op.kind != Operation::None) {
        const qint64 e = m_op.clock.elapsed();
        if (e >= m_op.workMs)
            return 100;
        return int(e * 100 / std::max(1, m_op.workMs));
    }
    const qint64 now = m_uptime.elapsed();
    if (m_busyUntil > now && m_busyUntil > m_busyFrom)
        return int((now - m_busyFrom) * 100 / (m_busyUntil - m_busyFrom));
    return 0;
}

bool Instrument::isIdle() const
{
    const SYSTEM_STATE_T s = state();
    return s == STATE_INIT || s == STATE_TARGETING;
}

Instrument::StatusReply Instrument::takeStatus()
{
    StatusReply r;
    r.state = state();
    r.percent = percentComplete();
    r.numErrors = std::min(255, int(m_errors.size()));
    r.time = QDateTime::currentDateTime();
    r.batteryState = m_batteryState;
    r.batteryPercent = m_batteryPercent;
    r.wifiState = m_wifi->state();
    r.wifiLevel = m_wifi->level();
    r.usbState = m_usbState;
    r.measureId = m_changes.measureId();
    r.jobId = m_changes.jobId();
    r.settingsId = m_changes.settingsId();
    m_changes.take(&r.settingsBits, &r.entities);
    return r;
}

// ---- errors ------------------------------------------------------------------------------

QString Instrument::errorText(int id)
{
    const KnownError* e = knownError(id);
    return e ? QString::fromLatin1(e->text) : QStringLiteral("Error %1").arg(id);
}

void Instrument::pushError(int id, const QString& text)
{
    ErrorEntry e;
    const KnownError* k = knownError(id);
    e.id = id;
    e.priority = k ? k->priority : 2;
    e.category = k ? k->category : 0;
    e.time = QDateTime::currentDateTime();
    e.text = text.isEmpty() ? errorText(id) : text;
    if (m_errors.size() >= 50)
        m_errors.removeFirst();
    m_errors.append(e);
    qInfo().noquote() << "Sim: error" << id << e.text;
}

// ---- identity ------------------------------------------------------------------------------

DEVICE_INFO_T Instrument::deviceInfo() const
{
    DEVICE_INFO_T d;
    d.serialNum = serialNumber();
    d.partNumber = m_options.model == Model::Alder ? QStringLiteral("MG-1100-A") : QStringLiteral("MG-0600-B");
    d.revisionNum = QStringLiteral("C");
    d.productionDate = QStringLiteral("2023-09-14");
    d.whitetileSerialNum = QStringLiteral("WT-58213");
    d.instrumentModel = modelName(m_options.model);
    d.certificationDate = QStringLiteral("2024-03-02");
    return d;
}

QStringList Instrument::deviceInfoExtras() const
{
    return {QStringLiteral("EF-31907"),         // effect tile
            QStringLiteral("CAM-7C21"),         // camera module
            QStringLiteral("OPT-2211"),         // optics block
            QStringLiteral("LED-4400"),         // illumination board
            QStringLiteral("PCB-3.2"),          // main board
            QStringLiteral("FW-BOOT-2.04"),
            QStringLiteral("BAT-2S-3400"),
            QStringLiteral("WLAN-8821"),
            QStringLiteral("IR-TS-05"),
            QStringLiteral("ACC-3X"),
            QStringLiteral("2024-03-02"),       // last service
            QStringLiteral("Marigold Instruments"),
            QStringLiteral("EU"),
            QString(),
            QString()};
}

QString Instrument::serialNumber() const
{
    return m_options.model == Model::Alder ? QStringLiteral("A11-240117") : QStringLiteral("B06-231482");
}

QString Instrument::version(int type, bool* known) const
{
    static const char* const kVersions[NUM_VERSION_TYPES] = {
        "", "4.12.3 (simulator)", "2.7.0", "1.9.4", "Rev C", "1.3", "2.0.11", "2.04", "4.19.94", "1.1.2", "3.4"};
    const bool ok = type > VERSION_GUI && type < NUM_VERSION_TYPES;
    if (known)
        *known = ok;
    return ok ? QString::fromLatin1(kVersions[type]) : QString();
}

int Instrument::capability(const QString& name) const
{
    const QString n = name.trimmed().toUpper();
    if (n == QLatin1String("WIFI"))
        return 1;
    if (n == QLatin1String("CAMERA") || n == QLatin1String("TEXTURE"))
        return 1;
    return 0;
}

MEMORY_INFO_T Instrument::memoryInfo() const
{
    MEMORY_INFO_T m;
    m.numMeasurements = m_jobs.totalSamples();
    m.maxNumMeasurements = m_maxMeasurements;
    m.numJobs = m_jobs.jobs().size();
    m.maxNumJobs = m_maxJobs;
    const int storeKb = int(m_store.fileSize() / 1024);
    m.sysFlashUsed = 412000 + storeKb;
    m.sysFlashAvailable = std::max(0, 3774873 - m.sysFlashUsed);
    m.sysRamUsed = 131072 + m.numMeasurements / 4;
    m.sysRamAvailable = 524288 - m.sysRamUsed;
    return m;
}

void Instrument::setMemoryLimits(int maxJobs, int maxMeasurements)
{
    m_maxJobs = std::max(0, maxJobs);
    m_maxMeasurements = std::max(0, maxMeasurements);
    m_store.setMeta(QStringLiteral("mem.maxJobs"), QString::number(m_maxJobs));
    m_store.setMeta(QStringLiteral("mem.maxMeasurements"), QString::number(m_maxMeasurements));
    m_lowStorageReported = false;
}

int Instrument::secondsToCalibration() const
{
    if (!m_lastWhiteCal.isValid())
        return 0;
    return int(std::max<qint64>(0, m_calIntervalS - secsSince(m_lastWhiteCal)));
}

CALIBRATION_STATE_T Instrument::calibrationState() const
{
    CALIBRATION_STATE_T c;
    c.nextExternalWhiteCal = secondsToCalibration();
    c.lastExternalWhiteCal = m_lastWhiteCal;
    c.referenceTempExternalWhite = m_calReferenceTemperature;
    c.dTempExternalWhite = m_instrumentTemperature - m_calReferenceTemperature;
    // The internal white is measured by the instrument itself at a fixed
    // interval since it was switched on.
    const qint64 up = m_uptime.elapsed() / 1000;
    c.nextInternalWhiteCal = int(kInternalCalS - up % kInternalCalS);
    c.lastInternalWhiteCal = QDateTime::currentDateTime().addSecs(-(up % kInternalCalS));
    c.referenceTempInternalWhite = m_instrumentTemperature - 0.3f;
    c.dTempInternalWhite = 0.3f;
    return c;
}

CALIBRATION_STATUS_T Instrument::calibrationStatus() const
{
    if (!m_lastWhiteCal.isValid())
        return CALIBRATION_STATUS_REQUIRED;
    const int left = secondsToCalibration();
    if (left <= 0)
        return CALIBRATION_STATUS_TIMEOUT;
    if (left <= parameter(PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS)->i)
        return CALIBRATION_STATUS_WARNING;
    return CALIBRATION_STATUS_GOOD;
}

QVector<TAG_ITEM_T> Instrument::languages() const
{
    static const char* const kLanguages[][2] = {
        {"en", "English"}, {"es", "Español"}, {"fr", "Français"}, {"de", "Deutsch"}, {"it", "Italiano"},
        {"pt", "Português"}, {"ja", "日本語"}, {"ko", "한국어"}, {"zh_Hans", "简体中文"}, {"zh_Hant", "繁體中文"}};
    QVector<TAG_ITEM_T> list;
    for (const auto& l : kLanguages)
        list.append({QString::fromLatin1(l[0]), QString::fromUtf8(l[1])});
    return list;
}

void Instrument::setBrightness(int level)
{
    level = std::max(0, std::min(255, level));
    if (level == m_brightness)
        return;
    m_brightness = level;
    m_store.setMeta(QStringLiteral("brightness"), QString::number(level));
    m_changes.settingChanged(BIT_BRIGHTNESS);
}

void Instrument::setVolume(int level)
{
    level = std::max(0, std::min(255, level));
    if (level == m_volume)
        return;
    m_volume = level;
    m_store.setMeta(QStringLiteral("volume"), QString::number(level));
    m_changes.settingChanged(BIT_VOLUME);
}

STATUS_T Instrument::setInterfaceVersion(int version)
{
    // Interface versions 1 to 7 are understood.
    if (version < 1 || version > 7)
        return ST_INDEX_INVALID;
    m_interfaceVersion = version;
    return ST_OK;
}

// ---- sensors --------------------------------------------------------------------------------

int Instrument::switchesDown() const
{
    return (m_switches.Switch1 ? 1 : 0) + (m_switches.Switch2 ? 1 : 0) + (m_switches.Switch3 ? 1 : 0);
}

ACCELEROMETER_ORIENTATION_T Instrument::orientation() const
{
    ACCELEROMETER_ORIENTATION_T o;
    const double rad = m_rotation * M_PI / 180.0;
    // Gravity in milli-g, in the instrument's axes: on a vertical panel it lies
    // in the aperture plane and turns with the instrument.
    if (m_vertical) {
        o.OrientationX = int(std::lround(1000.0 * std::sin(rad)));
        o.OrientationY = int(std::lround(1000.0 * std::cos(rad)));
        o.OrientationZ = 0;
    } else {
        o.OrientationZ = 1000;
    }
    o.OrientationPosition = m_rotation;
    o.OrientationAcceleration = 0;
    return o;
}

bool Instrument::temperature(int sensor, float* value) const
{
    float v = 0.0f;
    switch (sensor) {
    case 0: v = m_instrumentTemperature; break;                       // main board
    case 1: v = m_instrumentTemperature - 0.8f; break;                // optics block
    case 2: v = m_instrumentTemperature - 2.5f; break;                // battery
    case 3: v = m_sampleTemperature; break;                           // sample surface (IR)
    default: return false;
    }
    if (value)
        *value = v;
    return true;
}

// ---- operations -------------------------------------------------------------------------------

void Instrument::updateTick()
{
    const bool needed = m_op.kind != Operation::None || m_jobs.syncInProgress();
    if (needed && !m_tick.isActive())
        m_tick.start();
    else if (!needed && m_tick.isActive())
        m_tick.stop();
}

void Instrument::startOperation(Operation::Kind kind, int workMs, int calcMs, SYSTEM_STATE_T workState)
{
    m_op = Operation();
    m_op.kind = kind;
    m_op.workMs = scaled(workMs);
    m_op.calcMs = calcMs > 0 ? scaled(calcMs) : 0;
    m_op.workState = workState;
    m_op.switchesAtStart = m_switches;
    m_op.allDownAtStart = allDown();
    m_op.failure = m_failNext;
    m_failNext = 0;
    m_op.clock.start();
    m_targeting = false;
    updateTick();
}

bool Instrument::bodyMoved() const
{
    // A foot that was on the surface at the start and has left it.
    return (m_op.switchesAtStart.Switch1 && !m_switches.Switch1) || (m_op.switchesAtStart.Switch2 && !m_switches.Switch2)
        || (m_op.switchesAtStart.Switch3 && !m_switches.Switch3);
}

STATUS_T Instrument::triggerMeasurement(const QString& jobName)
{
    if (!isIdle())
        return ST_NOT_READY;
    if (calibrationStatus() == CALIBRATION_STATUS_TIMEOUT || calibrationStatus() == CALIBRATION_STATUS_REQUIRED) {
        pushError(ST_CALIBRATION_EXPIRED);
        return ST_CALIBRATION_EXPIRED;
    }
    if (!jobName.isEmpty()) {
        const STATUS_T st = m_jobs.canMeasure(jobName, parameter(PARAMETER_JOB_COMPLETION_TIME)->i,
                                              QDateTime::currentDateTime());
        if (st != ST_OK)
            return st;
        if (m_jobs.totalSamples() >= m_maxMeasurements)
            return ST_MEMORY_FULL;
    }
    startOperation(jobName.isEmpty() ? Operation::ReferenceCheck : Operation::Measurement, kMeasureMs, kCalculateMs,
                   STATE_MEASURING);
    m_op.job = jobName;
    return ST_OK;
}

STATUS_T Instrument::triggerCalibration()
{
    if (!isIdle())
        return ST_NOT_READY;
    startOperation(Operation::Calibration, kCalibrateMs, kCalibrateCalcMs, STATE_CALIBRATING);
    return ST_OK;
}

STATUS_T Instrument::triggerSelfTest(quint32 num)
{
    if (num >= quint32(m_selfTests.size()))
        return ST_INDEX_INVALID;
    if (!isIdle())
        return ST_NOT_READY;
    const TEST& t = m_selfTests[int(num)];
    const bool optical = t.deviceLocation != SELF_TEST_DEVICE_LIFTED;
    startOperation(Operation::SelfTest, int(t.approxDuration), 0, optical ? STATE_MEASURING : STATE_BUSY);
    m_op.test = num;
    m_selfTestResults.insert(num, 0);
    return ST_OK;
}

STATUS_T Instrument::selfTestResult(quint32 num, qint32* result) const
{
    if (num >= quint32(m_selfTests.size()))
        return ST_INDEX_INVALID;
    if (result)
        *result = m_selfTestResults.value(num, 0);
    return ST_OK;
}

quint32 Instrument::addSelfTest(const QString& name, quint32 location, quint32 durationMs)
{
    TEST t = makeTest("", location, durationMs, quint32(m_selfTests.size()));
    t.description = name;
    m_selfTests << t;
    return t.num;
}

void Instrument::forceSelfTestResult(quint32 num, qint32 result)
{
    if (result < 0)
        m_forcedSelfTestResults.remove(num);
    else
        m_forcedSelfTestResults.insert(num, result);
}

STATUS_T Instrument::runInternalCheck()
{
    if (!isIdle())
        return ST_NOT_READY;
    startOperation(Operation::InternalCheck, kInternalCheckMs, 0, STATE_BUSY);
    return ST_OK;
}

bool Instrument::abortOperation()
{
    if (m_op.kind == Operation::None)
        return false;
    if (m_op.kind == Operation::SelfTest)
        m_op.failure = 3;
    else
        m_op.failure = ST_ABORTED;
    finishOperation();
    return true;
}

STATUS_T Instrument::startTargeting()
{
    if (!isIdle())
        return ST_NOT_READY;
    m_targeting = true;
    m_lastTargetingPoll = m_targetingSince = m_uptime.elapsed();
    return ST_OK;
}

void Instrument::stopTargeting()
{
    m_targeting = false;
}

QString Instrument::panelForView() const
{
    if (!m_panel.isEmpty())
        return Spectra::panelSpec(m_panel, 1);
    if (m_hasLastReading)
        return m_lastReading.finish;
    return Spectra::panelSpec(QStringLiteral("silver-metallic"), 1);
}

QByteArray Instrument::liveFrame(int width, int height)
{
    m_lastTargetingPoll = m_uptime.elapsed();
    return m_liveView.frame(panelForView(), switchesDown(), m_uptime.elapsed(), width, height, m_rotation);
}

STATUS_T Instrument::referenceCheck(const QString& reference, QDateTime* when, quint8* result) const
{
    if (reference.trimmed().compare(QLatin1String("factory_ref"), Qt::CaseInsensitive) != 0)
        return ST_NO_REFERENCE;
    if (when)
        *when = m_lastRefCheck;
    if (result)
        *result = m_refCheckResult;
    return ST_OK;
}

STATUS_T Instrument::power(qint32 value)
{
    switch (value) {
    case POWER_VALUE_STANDBY:
        return ST_OK;
    case POWER_VALUE_REBOOT:
        QTimer::singleShot(0, this, [this] { emit powerRequested(PowerAction::Reboot); });
        return ST_OK;
    case POWER_VALUE_SHUTDOWN:
        QTimer::singleShot(0, this, [this] { emit powerRequested(PowerAction::Shutdown); });
        return ST_OK;
    case POWER_VALUE_FACTORY:
        // Factory settings: parameters, display and sound; jobs and
        // calibration stay. Then the instrument restarts.
        parametersToDefaults();
        setBrightness(80);
        setVolume(5);
        QTimer::singleShot(0, this, [this] { emit powerRequested(PowerAction::Reboot); });
        return ST_OK;
    default:
        return ST_INDEX_INVALID;
    }
}

void Instrument::setPowerUp(int ms)
{
    m_powerUpUntil = m_uptime.elapsed() + scaled(ms);
}

QString Instrument::panelForJob(const QString& jobName)
{
    if (!m_panel.isEmpty())
        return Spectra::panelSpec(m_panel, qHash(jobName));
    const Job* job = m_jobs.find(jobName);
    if (job && !job->finish.isEmpty())
        return job->finish;
    // Each job is a different car: choose its paint once and keep it.
    const QStringList keys = Spectra::finishKeys();
    const quint32 h = qHash(jobName);
    const QString spec = Spectra::panelSpec(keys[int(h % quint32(keys.size()))], h >> 8);
    m_jobs.setFinish(jobName, spec);
    return spec;
}

Sample Instrument::makeReading(const QString& panelSpec, int outlierSign)
{
    Spectra::ReadingNoise noise;
    noise.outlierSign = outlierSign;
    std::uniform_real_distribution<double> u01(0.0, 1.0);
    std::normal_distribution<double> n01(0.0, 1.0);
    noise.outlier = m_forceOutlier >= 0 ? m_forceOutlier == 1 : u01(m_rng) < m_outlierRate;
    m_forceOutlier = -1;
    Sample s;
    s.time = QDateTime::currentDateTime();
    s.temperature = float(m_sampleTemperature + 0.1 * n01(m_rng));
    s.instrumentTemperature = m_instrumentTemperature;
    s.calTemperatureDelta = m_instrumentTemperature - m_calReferenceTemperature;
    s.orientation = orientation();
    s.calibrationStatus = calibrationStatus();
    s.pressure = m_op.switchesAtStart;
    s.seed = m_rng();
    s.finish = panelSpec;
    s.numAngles = numSpectralAngles(m_options.model);
    s.refl = Spectra::measure(panelSpec, s.numAngles, noise, m_rng);
    s.labch = Colour::labch(s.refl, s.numAngles);
    s.texture = Spectra::texture(panelSpec, m_rng);
    return s;
}

void Instrument::checkStorage()
{
    const int used = m_jobs.totalSamples();
    const bool low = m_maxMeasurements > 0 && used * 100 >= m_maxMeasurements * 95;
    if (low && !m_lowStorageReported)
        pushError(ST_LOW_STORAGE);
    m_lowStorageReported = low;
}

qint32 Instrument::judgeSelfTest(const TEST& t) const
{
    auto forced = m_forcedSelfTestResults.constFind(t.num);
    if (forced != m_forcedSelfTestResults.constEnd())
        return *forced;
    if (m_op.failure == 3)
        return 3;
    if (m_op.failure != 0)
        return qint32(m_op.failure);
    const bool calibrated = calibrationStatus() != CALIBRATION_STATUS_TIMEOUT
        && calibrationStatus() != CALIBRATION_STATUS_REQUIRED;
    switch (t.deviceLocation) {
    case SELF_TEST_WHITE_TILE:
    case SELF_TEST_EFFECT_TILE:
        if (!m_op.allDownAtStart || !allDown())
            return 2;
        if (t.num != 0 && !calibrated)
            return 2012;
        return 1;
    default:
        if (t.description == QLatin1String("PRESSURE SENSOR TEST"))
            return switchesDown() == 0 ? 1 : 2;
        if (t.description == QLatin1String("TEMPERATURE TESTS"))
            return (m_instrumentTemperature >= 5.0f && m_instrumentTemperature <= 45.0f) ? 1 : 2;
        for (const ErrorEntry& e : m_errors)
            if (e.id >= 3000)
                return 2;
        return 1;
    }
}

void Instrument::finishOperation()
{
    const Operation op = m_op;
    m_op = Operation();
    const STATUS_T failure = op.failure;
    switch (op.kind) {
    case Operation::Measurement: {
        if (failure) {
            pushError(int(failure));
            break;
        }
        if (m_sampleTemperature > kSensorHigh) {
            pushError(ST_TEMP_TOO_HIGH);
            break;
        }
        if (m_sampleTemperature < kSensorLow) {
            pushError(ST_TEMP_TOO_LOW);
            break;
        }
        m_op = op;   // the reading records the feet as they were at the start
        const Sample s = makeReading(panelForJob(op.job));
        m_op = Operation();
        m_jobs.commitMeasurement(op.job, s);
        const Job* job = m_jobs.find(op.job);
        m_lastReading = job && !job->samples.isEmpty() ? job->samples.last() : s;
        m_hasLastReading = true;
        checkStorage();
        break;
    }
    case Operation::ReferenceCheck: {
        bool passed = failure == 0 && op.allDownAtStart && allDown();
        if (m_forceReference >= 0)
            passed = m_forceReference == 1;
        if (failure)
            pushError(int(failure));
        m_lastRefCheck = QDateTime::currentDateTime();
        m_refCheckResult = passed ? 1 : 2;
        m_store.setMeta(QStringLiteral("refcheck.time"), QString::number(m_lastRefCheck.toMSecsSinceEpoch()));
        m_store.setMeta(QStringLiteral("refcheck.result"), QString::number(m_refCheckResult));
        if (failure == 0) {
            m_op = op;
            m_lastReading = makeReading(Spectra::panelSpec(QStringLiteral("graphite-metallic"), 7));
            m_op = Operation();
            m_hasLastReading = true;
        }
        if (passed && parameter(PARAMETER_WHITE_TRANSFER_REQUEST)->i == 2)
            setParameterValue(PARAMETER_WHITE_TRANSFER_REQUEST, ParamValue{ParamType::Int, 0, 0.0f, {}, {}}, true);
        break;
    }
    case Operation::Calibration: {
        STATUS_T f = failure;
        if (!f && !(op.allDownAtStart && allDown()))
            f = ST_CAL_ERROR;
        if (f) {
            pushError(int(f));
            break;
        }
        m_lastWhiteCal = QDateTime::currentDateTime();
        m_calReferenceTemperature = m_instrumentTemperature;
        saveCalibration();
        if (parameter(PARAMETER_WHITE_TRANSFER_REQUEST)->i == 1)
            setParameterValue(PARAMETER_WHITE_TRANSFER_REQUEST, ParamValue{ParamType::Int, 0, 0.0f, {}, {}}, true);
        break;
    }
    case Operation::SelfTest: {
        m_op = op;
        const qint32 result = judgeSelfTest(m_selfTests[int(op.test)]);
        m_op = Operation();
        m_selfTestResults.insert(op.test, result);
        if (op.test == 0 && result == 1) {
            m_lastWhiteCal = QDateTime::currentDateTime();
            m_calReferenceTemperature = m_instrumentTemperature;
            saveCalibration();
        }
        break;
    }
    case Operation::InternalCheck:
    case Operation::None:
        break;
    }
    updateTick();
}

void Instrument::saveCalibration()
{
    m_store.setMeta(QStringLiteral("cal.last"),
                    m_lastWhiteCal.isValid() ? QString::number(m_lastWhiteCal.toMSecsSinceEpoch()) : QString());
    m_store.setMeta(QStringLiteral("cal.refTemp"), QString::number(double(m_calReferenceTemperature)));
    m_store.setMeta(QStringLiteral("cal.interval"), QString::number(m_calIntervalS));
}

void Instrument::onTick()
{
    if (m_op.kind != Operation::None) {
        const qint64 e = m_op.clock.elapsed();
        if (e < m_op.workMs && bodyMoved() && m_op.kind != Operation::InternalCheck) {
            // Lifting the instrument spoils an optical reading at once.
            if (m_op.kind == Operation::SelfTest) {
                if (m_selfTests[int(m_op.test)].deviceLocation != SELF_TEST_DEVICE_LIFTED)
                    m_op.failure = 3;
            } else if (m_op.kind != Operation::Calibration || m_op.failure == 0) {
                m_op.failure = m_op.kind == Operation::Calibration ? ST_CAL_ERROR : ST_MOVED;
            }
            if (m_op.failure)
                finishOperation();
        } else if (e >= m_op.workMs + m_op.calcMs) {
            finishOperation();
        }
    }
    if (m_jobs.syncInProgress()) {
        const qint64 now = m_uptime.elapsed();
        if (now - m_lastSyncStep >= scaled(kSyncStepMs)) {
            m_lastSyncStep = now;
            const WIFI_STATUS_T w = m_wifi->state();
            if (w == WIFI_STATUS_CONNECTED || w == WIFI_STATUS_ON_STATIC)
                m_jobs.advanceSync(kSyncStepPercent);
        }
    }
    updateTick();
}

void Instrument::onHousekeeping()
{
    const qint64 now = m_uptime.elapsed();
    if (m_busyUntil > 0 && now >= m_busyUntil)
        m_busyUntil = 0;
    if (m_targeting) {
        const bool abandoned = now - m_lastTargetingPoll > kTargetingPollLimitMs;
        const bool idleTooLong = m_targetingTimeoutS > 0 && now - m_targetingSince > qint64(m_targetingTimeoutS) * 1000;
        if (abandoned || idleTooLong)
            m_targeting = false;
    }
    // The battery drifts: a slow discharge, a quicker charge.
    const bool charging = m_batteryState == BATTERY_STATUS_CHARGING_AC || m_batteryState == BATTERY_STATUS_CHARGING_USB;
    const qint64 step = scaled(charging ? 30000 : 300000);
    if (now - m_lastBatteryStep >= step) {
        m_lastBatteryStep = now;
        if (charging && m_batteryPercent < 100) {
            ++m_batteryPercent;
            if (m_batteryPercent >= 100)
                m_batteryState = BATTERY_STATUS_FULL;
        } else if (m_batteryState == BATTERY_DISCHARGING && m_batteryPercent > 5) {
            --m_batteryPercent;
        }
    }
    if (m_batteryState == BATTERY_DISCHARGING) {
        if (m_batteryPercent <= 3 && !m_batteryEmptyReported) {
            m_batteryEmptyReported = true;
            pushError(ST_BATTERY_EMPTY);
        } else if (m_batteryPercent <= 10 && !m_batteryLowReported) {
            m_batteryLowReported = true;
            pushError(ST_BATTERY_LOW);
        }
    }
    if (m_batteryPercent > 10)
        m_batteryLowReported = false;
    if (m_batteryPercent > 3)
        m_batteryEmptyReported = false;
}

// ---- jobs ----------------------------------------------------------------------------------

STATUS_T Instrument::addJob(const JobBook::Description& d, int* dbIndex, bool online)
{
    const MEMORY_INFO_T m = memoryInfo();
    // The room a job will need is reserved when it is made.
    const int wanted = std::max({0, d.size, d.spare});
    if (m.numJobs >= m.maxNumJobs || m.numMeasurements + wanted > m.maxNumMeasurements)
        return ST_MEMORY_FULL;
    return m_jobs.add(d, jobDefaults(), dbIndex, online);
}

bool Instrument::sample(const QString& jobName, int number, Sample* out, STATUS_T* dataStatus) const
{
    if (jobName.isEmpty() && number == 0) {
        if (!m_hasLastReading)
            return false;
        if (out)
            *out = m_lastReading;
        if (dataStatus)
            *dataStatus = ST_OK;
        return true;
    }
    return m_jobs.sample(jobName, number, out, dataStatus);
}

STATUS_T Instrument::startOnlineJob(const QString& name, const QString& modeText, int size, int maxSamples,
                                    QString* created)
{
    JobBook::Description d;
    d.name = name.isEmpty() ? QStringLiteral("ONLINE-%1").arg(QDateTime::currentDateTime().toString(QStringLiteral("hhmmss")))
                            : name;
    d.modeText = modeText.isEmpty() ? QStringLiteral("NONE") : modeText;
    d.size = size;
    d.spare = maxSamples;
    d.tags = {{QStringLiteral("DisplayName"), d.name}};
    int index = 0;
    STATUS_T st = ST_OK;
    if (!m_jobs.find(d.name))
        st = addJob(d, &index, true);
    if (st != ST_OK)
        return st;
    if (created)
        *created = d.name;
    ParamValue v;
    v.type = ParamType::Text;
    v.s = d.name;
    return setParameter(PARAMETER_ONLINE_MODE_JOB, v);
}

void Instrument::endOnlineJob()
{
    ParamValue v;
    v.type = ParamType::Text;
    setParameter(PARAMETER_ONLINE_MODE_JOB, v);
}

// ---- what a person does --------------------------------------------------------------------

void Instrument::setSwitches(bool s1, bool s2, bool s3)
{
    m_switches.Switch1 = s1 ? 1 : 0;
    m_switches.Switch2 = s2 ? 1 : 0;
    m_switches.Switch3 = s3 ? 1 : 0;
    if (m_op.kind != Operation::None)
        onTick();
}

void Instrument::setRotation(int degrees)
{
    m_rotation = ((degrees % 360) + 360) % 360;
}

void Instrument::setSurfaceVertical(bool vertical)
{
    m_vertical = vertical;
}

void Instrument::setBattery(int state, int percent)
{
    if (state >= 0 && state < NUM_OF_BATTERY_STATUS)
        m_batteryState = state;
    if (percent >= 0)
        m_batteryPercent = std::min(100, percent);
    m_lastBatteryStep = m_uptime.elapsed();
    onHousekeeping();
}

void Instrument::setUsb(int state)
{
    if (state >= 0 && state < NUM_OF_USB_STATUS_TYPES)
        m_usbState = state;
}

void Instrument::setLocked(bool locked)
{
    m_locked = locked;
    if (locked)
        m_targeting = false;
}

void Instrument::setBusy(int ms)
{
    const qint64 now = m_uptime.elapsed();
    m_busyFrom = now;
    if (ms > 0)
        m_busyUntil = now + scaled(ms);
    else
        m_busyUntil = ms < 0 ? -1 : 0;
    if (m_busyUntil != 0)
        m_targeting = false;
}

void Instrument::expireCalibration()
{
    m_lastWhiteCal = QDateTime::currentDateTime().addSecs(-m_calIntervalS - 1);
    saveCalibration();
}

void Instrument::renewCalibration()
{
    m_lastWhiteCal = QDateTime::currentDateTime();
    m_calReferenceTemperature = m_instrumentTemperature;
    saveCalibration();
}

void Instrument::setCalibrationDue(int seconds)
{
    m_lastWhiteCal = QDateTime::currentDateTime().addSecs(-(m_calIntervalS - std::max(0, seconds)));
    saveCalibration();
}

void Instrument::setCalibrationInterval(int seconds)
{
    const int left = secondsToCalibration();
    m_calIntervalS = std::max(1, seconds);
    setCalibrationDue(std::min(left, m_calIntervalS));
}

void Instrument::setPanel(const QString& finishKey)
{
    m_panel = finishKey.isEmpty() ? QString() : Spectra::finish(finishKey).key;
}

int Instrument::addBulkJobs(int jobs, int readingsPerJob)
{
    jobs = std::max(0, jobs);
    readingsPerJob = std::max(0, std::min(readingsPerJob, 255));
    int made = 0;
    m_store.begin();
    const QStringList keys = Spectra::finishKeys();
    for (int i = 1; made < jobs && i < 100000; ++i) {
        JobBook::Description d;
        d.name = QStringLiteral("Bulk %1").arg(i);
        if (m_jobs.find(d.name))
            continue;
        d.modeText = QStringLiteral("NONE");
        d.size = readingsPerJob;
        d.tags = {{QStringLiteral("DisplayName"), QStringLiteral("Bulk panel %1").arg(i)}};
        if (addJob(d, nullptr) != ST_OK)
            break;
        const QString panel = Spectra::panelSpec(keys[i % keys.size()], quint32(i));
        m_jobs.setFinish(d.name, panel);
        m_op.switchesAtStart.Switch1 = m_op.switchesAtStart.Switch2 = m_op.switchesAtStart.Switch3 = 1;
        for (int r = 0; r < readingsPerJob; ++r) {
            m_forceOutlier = 0;
            m_jobs.commitMeasurement(d.name, makeReading(panel));
        }
        ++made;
    }
    m_op = Operation();
    m_forceOutlier = -1;
    m_store.commit();
    checkStorage();
    return made;
}

// ---- the demo set -----------------------------------------------------------------------------

void Instrument::seedDemo()
{
    struct DemoJob {
        const char* name;
        const char* display;
        const char* mode;
        int size;
        int max;
        const char* finish;
        int readings;
        int outliers;        // how many of the readings are bad contacts (SMC)
        int state;           // 0: as the readings leave it
        int daysAgo;
    };
    const DemoJob demo[] = {
        {"Job", "Door front left", "NONE", 3, 3, "silver-metallic", 1, 0, 0, 0},
        {"Job 1", "Bonnet", "NONE", 3, 3, "red-solid", 3, 0, 0, 1},
        {"Job 2", "Rear bumper", "AVERAGE", 3, 3, "blue-pearl", 3, 0, 0, 2},
        {"Job 3", "Tailgate", "AVERAGE", 5, 5, "white-pearl", 5, 0, 0, 3},
        {"Job 4", "Roof", "SMC", 3, 5, "graphite-metallic", 2, 0, 0, 0},
        {"Job 5", "Fender right", "SMC", 3, 5, "champagne-metallic", 5, 3, 0, 4},
        {"Job 6", "Quarter panel", "SMC", 4, 8, "green-pearl", 3, 0, JOB_SMC_FORCED, 5},
        {"Job 7", "Mirror cap", "AVERAGE", 3, 3, "orange-metallic", 3, 0, JOB_SYNCHRONISED, 9},
        {"Job 8", "Sill left", "NONE", 5, 5, "black-solid", 0, 0, 0, 0},
    };
    // The demo set is the same on every machine.
    const std::mt19937 savedRng = m_rng;
    m_rng.seed(20240611u);
    m_store.begin();
    const JobBook::Defaults defaults = jobDefaults();
    for (const DemoJob& dj : demo) {
        JobBook::Description d;
        d.name = QString::fromLatin1(dj.name);
        d.modeText = QString::fromLatin1(dj.mode);
        d.size = dj.size;
        d.spare = dj.max;
        d.tags = {{QStringLiteral("DisplayName"), QString::fromLatin1(dj.display)}};
        if (dj.readings > 2)
            d.tags.append({QStringLiteral("DisplayNotes"), QStringLiteral("Customer car, measured before blending")});
        int index = 0;
        if (m_jobs.add(d, defaults, &index) != ST_OK)
            continue;
        const QString panel = Spectra::panelSpec(QString::fromLatin1(dj.finish), qHash(d.name));
        m_jobs.setFinish(d.name, panel);
        const QDateTime base = QDateTime::currentDateTime().addDays(-dj.daysAgo).addSecs(-3600);
        for (int r = 0; r < dj.readings; ++r) {
            m_op.switchesAtStart.Switch1 = m_op.switchesAtStart.Switch2 = m_op.switchesAtStart.Switch3 = 1;
            // Clean readings first, then strays that scatter both ways.
            const bool stray = r >= dj.readings - dj.outliers;
            m_forceOutlier = stray ? 1 : 0;
            Sample s = makeReading(panel, (r % 2) ? -1 : 1);
            s.time = base.addSecs(r * 40);
            s.calibrationStatus = CALIBRATION_STATUS_GOOD;
            m_jobs.commitMeasurement(d.name, s);
        }
        if (dj.state == JOB_SMC_FORCED)
            m_jobs.forceFinish(d.name);
        else if (dj.state != 0)
            m_jobs.setState(d.name, dj.state);
    }
    m_op = Operation();
    m_forceOutlier = -1;
    m_rng = savedRng;
    m_store.commit();
}

} // namespace Sim
