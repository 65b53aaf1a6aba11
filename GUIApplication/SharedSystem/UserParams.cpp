#include "SharedSystem/UserParams.h"

#include "SharedSystem/Platform.h"

#include <QDebug>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QMutexLocker>
#include <QTextStream>

namespace {

const char* const kLanguageFile = "/opt/GUI/Languages/default_language.bin";
const char* const kBrandingFolder = "/opt/GUI/Branding/";

} // namespace

// Reads and writes of one field, each under the shared recursive lock.
#define UP_GET(field)                                 \
    UserParams* p = instance();                       \
    QMutexLocker lock(&p->m_mutex);  \
    return p->field;
#define UP_SET(field, value)                          \
    UserParams* p = instance();                       \
    QMutexLocker lock(&p->m_mutex);  \
    p->field = value;

UserParams::UserParams()
{
    applyDefaults();
}

UserParams* UserParams::instance()
{
    // Lives for the whole process; DataManager::Init moves it to its thread.
    static UserParams* s_instance = new UserParams;
    return s_instance;
}

void UserParams::Init()
{
    setDefaults();
}

void UserParams::setDefaults()
{
    UserParams* p = instance();
    QMutexLocker lock(&p->m_mutex);
    p->applyDefaults();
}

void UserParams::applyDefaults()
{
    m_LanguageCode = readLanguageFile();
    m_DecimalPoint = QStringLiteral(".");
    m_Precision = 2;
    m_BeeperVolume = 5;
    m_PowerDisplayOffTime = 60;
    m_PowerStandbyTime = 1800;
    m_PowerOffTime = 3600;
    m_WiFiOn = false;
    m_AutoMeasure = false;
    m_AutoMeasureTimeout = 1.0f;
    m_DisplayLABCH = true;
    m_OverridePressureSensors = false;
    m_DisplayRainbow = true;
    m_DisplayPreviewImages = true;
    m_DisplayTexture = true;
    m_DisplayTextureParameters = true;
    m_DownloadedJobNameEditable = false;
    m_DownloadedJobAttributesEditable = false;
    m_bUseFilterFile = true;
    m_OrientationEnabled = true;
    m_wifiEnabled = true;
    m_LabModeJob.clear();
    m_MeasuringCircleID.clear();
    m_UserCalibrationWarningTimeout = 8;
    m_PowerManagementSetting = 4;
    for (bool& enabled : m_SampleViewModesEnabled)
        enabled = true;
    m_IllumObs = COLOR_ILLUM_OBS_D65_10;
    m_PressureSensorSensitivity = PRESSURE_SENSITIVITY_MEDIUM;
    m_JobDefaultName = QStringLiteral("NEW JOB");
    m_JobDefaultTags[0] = 0;
    m_JobDefaultTags[1] = 0;
    m_JobDefaultTags[2] = 0;
    m_JobDefaultAvgInfo.mode = JOB_AVG_MODE_NONE;
    m_JobDefaultAvgInfo.smcGoodMeasurements = 3;
    m_JobDefaultAvgInfo.smcMaxMeasurements = 5;
    m_JobDefaultAvgInfo.averageNumber = 5;
    m_JobDefaultSize = 5;
    m_DateFormat = QStringLiteral("MM/dd/yy");
    m_TimeFormat = QStringLiteral("h:mm:ss ap");
}

QString UserParams::languageFilePath()
{
    return Platform::devicePath(QString::fromLatin1(kLanguageFile));
}

QString UserParams::readLanguageFile()
{
    QFile file(languageFilePath());
    if (!file.open(QIODevice::ReadOnly | QIODevice::Text))
        return QStringLiteral("en");
    // The file holds the bare code; a trailing newline from a hand edit is
    // not part of it, and a file emptied by accident must not leave the
    // GUI without a language.
    const QString code = QString::fromUtf8(file.readAll()).trimmed();
    return code.isEmpty() ? QStringLiteral("en") : code;
}

QString UserParams::getLanguageCode() { UP_GET(m_LanguageCode) }

void UserParams::setLanguageCode(const QString& code)
{
    if (code.isEmpty())
        return;
    UserParams* p = instance();
    QMutexLocker lock(&p->m_mutex);
    p->m_LanguageCode = code;

    const QString path = languageFilePath();
    QDir().mkpath(QFileInfo(path).absolutePath());
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly | QIODevice::Truncate | QIODevice::Text)) {
        qDebug() << "UserParams: cannot write the language file" << path << file.errorString();
        return;
    }
    QTextStream out(&file);
    out.setCodec("UTF-8");
    out << code;
}

QString UserParams::getDecimalPoint() { UP_GET(m_DecimalPoint) }
QString UserParams::getDecimalPointString() { return getDecimalPoint(); }

void UserParams::setDecimalPoint(const QString& point)
{
    if (point.isEmpty())
        return;
    UP_SET(m_DecimalPoint, point)
}

int UserParams::getPrecision() { UP_GET(m_Precision) }
void UserParams::setPrecision(int precision) { UP_SET(m_Precision, precision) }

void UserParams::setNumberFormat(const QString& format)
{
    UserParams* p = instance();
    QMutexLocker lock(&p->m_mutex);
    // The first character is the separator, whatever it is ("0.###" gives
    // "0"); the hashes count the decimals.
    setDecimalPoint(format.left(1));
    const int decimals = format.count(QLatin1Char('#'));
    setPrecision(decimals > 0 ? decimals : 2);
}

unsigned int UserParams::getBeeperVolume() { UP_GET(m_BeeperVolume) }
void UserParams::setBeeperVolume(unsigned int volume) { UP_SET(m_BeeperVolume, volume) }
unsigned int UserParams::getDisplayBrightness() { UP_GET(m_DisplayBrightness) }
void UserParams::setDisplayBrightness(unsigned int brightness) { UP_SET(m_DisplayBrightness, brightness) }

int UserParams::getPowerDisplayOffTime() { UP_GET(m_PowerDisplayOffTime) }
void UserParams::setPowerDisplayOffTime(int seconds) { UP_SET(m_PowerDisplayOffTime, seconds) }
int UserParams::getPowerStandbyTime() { UP_GET(m_PowerStandbyTime) }
void UserParams::setPowerStandbyTime(int seconds) { UP_SET(m_PowerStandbyTime, seconds) }
int UserParams::getPowerOffTime() { UP_GET(m_PowerOffTime) }
void UserParams::setPowerOffTime(int seconds) { UP_SET(m_PowerOffTime, seconds) }

bool UserParams::getWiFiOn() { UP_GET(m_WiFiOn) }
void UserParams::setWiFiOn(bool on) { UP_SET(m_WiFiOn, on) }
bool UserParams::getAutoMeasure() { UP_GET(m_AutoMeasure) }
void UserParams::setAutoMeasure(bool on) { UP_SET(m_AutoMeasure, on) }
bool UserParams::getAutoMeasureSwitchAvailable() { UP_GET(m_AutoMeasureSwitchDisplayed) }
void UserParams::setAutoMeasureSwitchAvailable(bool available) { UP_SET(m_AutoMeasureSwitchDisplayed, available) }
float UserParams::getAutoMeasureTimeout() { UP_GET(m_AutoMeasureTimeout) }
void UserParams::setAutoMeasureTimeout(float timeout) { UP_SET(m_AutoMeasureTimeout, timeout) }

bool UserParams::getDisplayLABCH() { UP_GET(m_DisplayLABCH) }
void UserParams::setDisplayLABCH(bool on) { UP_SET(m_DisplayLABCH, on) }
bool UserParams::getOverridePressureSensors() { UP_GET(m_OverridePressureSensors) }
void UserParams::setOverridePressureSensors(bool on) { UP_SET(m_OverridePressureSensors, on) }
bool UserParams::getDisplayRainbow() { UP_GET(m_DisplayRainbow) }
void UserParams::setDisplayRainbow(bool on) { UP_SET(m_DisplayRainbow, on) }
bool UserParams::getDisplayPreviewImages() { UP_GET(m_DisplayPreviewImages) }
void UserParams::setDisplayPreviewImages(bool on) { UP_SET(m_DisplayPreviewImages, on) }
bool UserParams::getDisplayTexture() { UP_GET(m_DisplayTexture) }
void UserParams::setDisplayTexture(bool on) { UP_SET(m_DisplayTexture, on) }
bool UserParams::getDisplayTextureParameters() { UP_GET(m_DisplayTextureParameters) }
void UserParams::setDisplayTextureParameters(bool on) { UP_SET(m_DisplayTextureParameters, on) }
bool UserParams::getDisplaySelfTest() { UP_GET(m_DisplaySelfTest) }
void UserParams::setDisplaySelfTest(bool on) { UP_SET(m_DisplaySelfTest, on) }
bool UserParams::getDisplayEditFreeText() { UP_GET(m_DisplayEditFreeText) }
void UserParams::setDisplayEditFreeText(bool on) { UP_SET(m_DisplayEditFreeText, on) }

bool UserParams::getAllowSync() { UP_GET(m_bAllowSync) }
void UserParams::setAllowSync(bool allow) { UP_SET(m_bAllowSync, allow) }
bool UserParams::getShowHazardWarningBanner() { UP_GET(m_ShowHazardBanner) }
void UserParams::setShowHazardWarningBanner(bool show) { UP_SET(m_ShowHazardBanner, show) }
bool UserParams::getDisplayLABCH_MenuItem() { UP_GET(m_DisplayLABCH_MenuItem) }
void UserParams::setDisplayLABCH_MenuItem(bool show) { UP_SET(m_DisplayLABCH_MenuItem, show) }
bool UserParams::getDisplayrOverridePressureSensoMenuItem() { UP_GET(m_DisplayOverridePressureSensorMenuItem) }
void UserParams::setDisplayOverridePressureSensorMenuItem(bool show) { UP_SET(m_DisplayOverridePressureSensorMenuItem, show) }
bool UserParams::getDisplayMeasurementModeSelectionMenuItem() { UP_GET(m_DisplayMeasurementModeSelectionMenuItem) }
void UserParams::setDisplayMeasurementModeSelectionMenuItem(bool show) { UP_SET(m_DisplayMeasurementModeSelectionMenuItem, show) }

bool UserParams::getDownloadedJobNameEditable() { UP_GET(m_DownloadedJobNameEditable) }
void UserParams::setDownloadedJobNameEditable(bool editable) { UP_SET(m_DownloadedJobNameEditable, editable) }
bool UserParams::getDownloadedJobAttributesEditable() { UP_GET(m_DownloadedJobAttributesEditable) }
void UserParams::setDownloadedJobAttributesEditable(bool editable) { UP_SET(m_DownloadedJobAttributesEditable, editable) }
bool UserParams::getUseFilterFile() { UP_GET(m_bUseFilterFile) }
void UserParams::setUserFilterFile(bool use) { UP_SET(m_bUseFilterFile, use) }
bool UserParams::getEnableViewMeasurements() { UP_GET(m_EnableViewMeasurements) }
void UserParams::setEnableViewMeasurements(bool enable) { UP_SET(m_EnableViewMeasurements, enable) }
bool UserParams::getOrientationEnabled() { UP_GET(m_OrientationEnabled) }
void UserParams::setOrientationEnabled(bool enabled) { UP_SET(m_OrientationEnabled, enabled) }
bool UserParams::getWifiEnabled() { UP_GET(m_wifiEnabled) }
void UserParams::setWifiEnabled(bool enabled) { UP_SET(m_wifiEnabled, enabled) }

bool UserParams::getSampleTempCheckEnabled() { UP_GET(m_sampleTempCheckEnabled) }
void UserParams::setSampleTempCheckEnabled(bool enabled) { UP_SET(m_sampleTempCheckEnabled, enabled) }
float UserParams::getSampleTempCheckHighLimit() { UP_GET(m_sampleTempCheckHighLimit) }
void UserParams::setSampleTempCheckHighLimit(float limit) { UP_SET(m_sampleTempCheckHighLimit, limit) }
float UserParams::getSampleTempCheckLowLimit() { UP_GET(m_sampleTempCheckLowLimit) }
void UserParams::setSampleTempCheckLowLimit(float limit) { UP_SET(m_sampleTempCheckLowLimit, limit) }

QString UserParams::getLabModeJob() { UP_GET(m_LabModeJob) }
void UserParams::setLabModeJob(const QString& job) { UP_SET(m_LabModeJob, job) }
bool UserParams::getLabModeEnabled() { return !getLabModeJob().isEmpty(); }

QString UserParams::getMeasuringCircleID() { UP_GET(m_MeasuringCircleID) }
void UserParams::setMeasuringCircleID(const QString& id)
{
    UP_SET(m_MeasuringCircleID, QString::fromLatin1(kBrandingFolder) + id)
}

unsigned int UserParams::getCalibrationWarningTimeout() { UP_GET(m_UserCalibrationWarningTimeout) }
void UserParams::setCalibrationWarningTimeout(unsigned int timeout) { UP_SET(m_UserCalibrationWarningTimeout, timeout) }
unsigned int UserParams::getPowerManagementSetting() { UP_GET(m_PowerManagementSetting) }
void UserParams::setPowerManagementSetting(unsigned int setting) { UP_SET(m_PowerManagementSetting, setting) }

bool UserParams::getSampleViewModeEnabled(FUNCTION_TYPE_T type)
{
    if (type < 0 || type >= FUNCTION_TYPES_ENUM_SIZE)
        return false;
    UP_GET(m_SampleViewModesEnabled[type])
}

void UserParams::setSampleViewModeEnabled(FUNCTION_TYPE_T type, bool enabled)
{
    if (type < 0 || type >= FUNCTION_TYPES_ENUM_SIZE)
        return;
    UP_SET(m_SampleViewModesEnabled[type], enabled)
}

COLOR_ILLUM_OBS_T UserParams::getIllumObs() { UP_GET(m_IllumObs) }
void UserParams::setIllumObs(COLOR_ILLUM_OBS_T illumObs) { UP_SET(m_IllumObs, illumObs) }
PRESSURE_SENSOR_SENSITIVITY_T UserParams::getPressureSensorSensitivity() { UP_GET(m_PressureSensorSensitivity) }
void UserParams::setPressureSensorSensitivity(PRESSURE_SENSOR_SENSITIVITY_T sensitivity) { UP_SET(m_PressureSensorSensitivity, sensitivity) }

QString UserParams::getJobDefaultName() { UP_GET(m_JobDefaultName) }
void UserParams::setJobDefaultName(const QString& name) { UP_SET(m_JobDefaultName, name) }

unsigned int UserParams::getJobDefaultTag(int index)
{
    if (index < 0 || index >= NUM_JOB_DEFAULT_TAGS)
        return 0;
    UP_GET(m_JobDefaultTags[index])
}

void UserParams::setJobDefaultTag(int index, unsigned int value)
{
    if (index < 0 || index >= NUM_JOB_DEFAULT_TAGS)
        return;
    UP_SET(m_JobDefaultTags[index], value)
}

JOB_AVERAGING_INFO_T UserParams::getJobDefaultAvgInfo() { UP_GET(m_JobDefaultAvgInfo) }
void UserParams::setJobDefaultAvgInfo(const JOB_AVERAGING_INFO_T& info) { UP_SET(m_JobDefaultAvgInfo, info) }

void UserParams::setJobDefaultAvgInfo(JOB_AVERAGING_MODE_T mode, int smcGood, int smcMax, int averageNumber)
{
    JOB_AVERAGING_INFO_T info;
    info.mode = mode;
    info.smcGoodMeasurements = smcGood;
    info.smcMaxMeasurements = smcMax;
    info.averageNumber = averageNumber;
    setJobDefaultAvgInfo(info);
}

unsigned int UserParams::getJobDefaultSize() { UP_GET(m_JobDefaultSize) }
void UserParams::setJobDefaultSize(unsigned int size) { UP_SET(m_JobDefaultSize, size) }

QString UserParams::getDateFormat() { UP_GET(m_DateFormat) }
void UserParams::setDateFormat(const QString& format)
{
    if (format.isEmpty())
        return;
    UP_SET(m_DateFormat, format)
}

QString UserParams::getTimeFormat() { UP_GET(m_TimeFormat) }
void UserParams::setTimeFormat(const QString& format)
{
    if (format.isEmpty())
        return;
    UP_SET(m_TimeFormat, format)
}

JOB_AVERAGING_MODE_T jobAveragingModeFromParameter(const QString& text, int averageNumber)
{
    const QString mode = text.trimmed().toUpper();
    if (mode == QLatin1String("SMC"))
        return JOB_AVG_MODE_SMC;
    if (mode == QLatin1String("AVERAGE")) {
        if (averageNumber == 3)
            return JOB_AVG_MODE_SIMPLE_3;
        if (averageNumber == 5)
            return JOB_AVG_MODE_SIMPLE_5;
    }
    return JOB_AVG_MODE_NONE;
}

QString jobAveragingModeText(JOB_AVERAGING_MODE_T mode)
{
    switch (mode) {
    case JOB_AVG_MODE_SIMPLE_3:
    case JOB_AVG_MODE_SIMPLE_5:
        return QStringLiteral("AVERAGE");
    case JOB_AVG_MODE_SMC:
        return QStringLiteral("SMC");
    case JOB_AVG_MODE_GUI:
        return QStringLiteral("DEV_MODE");
    default:
        return QStringLiteral("NONE");
    }
}
