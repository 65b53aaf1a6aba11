#include "GUIAPI/SystemAPI.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/JobOutCommands.h"
#include "Commands/ParametersOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/Sample.h"

#include "SharedSystem/UserParams.h"

#include <QFile>

#include <functional>

namespace {

const QString kBrandingFolder = QStringLiteral("/opt/GUI/Branding/");

// One parameter read; apply runs only when the server answered.
class ParameterReader
{
public:
    bool ok = true;

    void read(PARAMETER_TYPE_T key, const std::function<void(const PARAMETER_CONTENT_TYPES&)>& apply)
    {
        PARAMETER_CONTENT_TYPES value;
        if (CmdOut_GetParameter(key, value) == STATUS_OK)
            apply(value);
        else
            ok = false;
    }

    void text(PARAMETER_TYPE_T key, void (*apply)(const QString&))
    {
        read(key, [apply](const PARAMETER_CONTENT_TYPES& v) { apply(v.parameterString); });
    }

    void flag(PARAMETER_TYPE_T key, void (*apply)(bool))
    {
        read(key, [apply](const PARAMETER_CONTENT_TYPES& v) { apply(v.parameterInt == 1); });
    }

    void seconds(PARAMETER_TYPE_T key, void (*apply)(int))
    {
        read(key, [apply](const PARAMETER_CONTENT_TYPES& v) { apply(v.parameterInt); });
    }

    void count(PARAMETER_TYPE_T key, void (*apply)(unsigned int))
    {
        read(key, [apply](const PARAMETER_CONTENT_TYPES& v) { apply(unsigned(v.parameterInt)); });
    }

    void real(PARAMETER_TYPE_T key, void (*apply)(float))
    {
        read(key, [apply](const PARAMETER_CONTENT_TYPES& v) { apply(v.parameterFloat); });
    }
};

class ParameterWriter
{
public:
    bool ok = true;

    void write(PARAMETER_TYPE_T key, const PARAMETER_CONTENT_TYPES& value)
    {
        if (CmdOut_SetParameter(key, value) != STATUS_OK)
            ok = false;
    }

    void text(PARAMETER_TYPE_T key, const QString& text)
    {
        PARAMETER_CONTENT_TYPES value;
        value.parameterString = text;
        write(key, value);
    }

    void integer(PARAMETER_TYPE_T key, int number)
    {
        PARAMETER_CONTENT_TYPES value;
        value.parameterInt = number;
        write(key, value);
    }

    void flag(PARAMETER_TYPE_T key, bool on) { integer(key, on ? 1 : 0); }

    void real(PARAMETER_TYPE_T key, float number)
    {
        PARAMETER_CONTENT_TYPES value;
        value.parameterFloat = number;
        write(key, value);
    }
};

void setAverageNumber(int number)
{
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    info.averageNumber = number;
    UserParams::setJobDefaultAvgInfo(info);
}

void setSmcGood(int good)
{
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    info.smcGoodMeasurements = good;
    UserParams::setJobDefaultAvgInfo(info);
}

void setSmcMax(int max)
{
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    info.smcMaxMeasurements = max;
    UserParams::setJobDefaultAvgInfo(info);
}

void setAveragingMode(const QString& text)
{
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    info.mode = jobAveragingModeFromParameter(text, info.averageNumber);
    UserParams::setJobDefaultAvgInfo(info);
}

// A CmdOut_ function returns its failures, but the link below may still
// throw; both count as false here.
template <typename Call>
bool succeeded(Call&& call)
{
    try {
        return call() == STATUS_OK;
    } catch (unsigned int) {
        return false;
    }
}

bool readDeviceFile(const QString& devicePath, QByteArray& data)
{
    QFile file(Platform::devicePath(devicePath));
    if (!file.exists())
        return true;
    if (!file.open(QIODevice::ReadOnly))
        return false;
    data = file.readAll();
    return true;
}

} // namespace

bool SysAPI_GetUserParams()
{
    ParameterReader r;
    r.text(PARAMETER_NUMBER_FORMAT, UserParams::setNumberFormat);
    r.text(PARAMETER_DATE_FORMAT, UserParams::setDateFormat);
    r.text(PARAMETER_TIME_FORMAT, UserParams::setTimeFormat);
    r.count(PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS, UserParams::setCalibrationWarningTimeout);
    r.text(PARAMETER_DEFAULT_JOB_NAME, UserParams::setJobDefaultName);
    r.count(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES, UserParams::setJobDefaultSize);
    r.seconds(PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME, UserParams::setPowerDisplayOffTime);
    r.seconds(PARAMETER_DEFAULT_STANDBY_TIME, UserParams::setPowerStandbyTime);
    r.seconds(PARAMETER_DEFAULT_POWER_OFF_TIME, UserParams::setPowerOffTime);
    r.flag(PARAMETER_AUTO_MEASURE, UserParams::setAutoMeasure);
    r.flag(PARAMETER_AUTO_MEASURE_SWITCH_ON_UI, UserParams::setAutoMeasureSwitchAvailable);
    r.flag(PARAMETER_DISPLAY_LABCH, UserParams::setDisplayLABCH);
    r.flag(PARAMETER_OVERRIDE_PRESSURE_SENSORS, UserParams::setOverridePressureSensors);
    r.flag(PARAMETER_DISPLAY_RAINBOW, UserParams::setDisplayRainbow);
    r.flag(PARAMETER_DISPLAY_PREVIEW_IMAGES, UserParams::setDisplayPreviewImages);
    r.flag(PARAMETER_DISPLAY_SELF_TEST, UserParams::setDisplaySelfTest);
    r.flag(PARAMETER_DISPLAY_EDIT_FREE_TEXT, UserParams::setDisplayEditFreeText);
    // The hazard banner follows the mode selection switch on purpose; its
    // own parameter is not read.
    r.flag(PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION, UserParams::setShowHazardWarningBanner);
    r.flag(PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION, UserParams::setDisplayMeasurementModeSelectionMenuItem);
    r.flag(PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN, UserParams::setDisplayLABCH_MenuItem);
    r.flag(PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR, UserParams::setDisplayOverridePressureSensorMenuItem);
    r.flag(PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE, UserParams::setDownloadedJobNameEditable);
    r.flag(PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE, UserParams::setDownloadedJobAttributesEditable);
    r.flag(PARAMETER_USE_FILTER_FILE, UserParams::setUserFilterFile);

    int wifi = 0;
    if (CmdOut_GetCapability(QStringLiteral("WIFI"), wifi) == STATUS_OK)
        UserParams::setWifiEnabled(wifi != 0);
    else
        r.ok = false;
    bool textureShown = false;
    if (CmdOut_GetTextureDisplayed(textureShown) == STATUS_OK)
        UserParams::setDisplayTexture(textureShown);
    else
        r.ok = false;

    r.read(PARAMETER_TEXTURE_IMAGE_CONTENT_DATA_SELECTION,
           [](const PARAMETER_CONTENT_TYPES& v) { UserParams::setDisplayTextureParameters(v.parameterInt == 4); });
    r.flag(PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE, UserParams::setSampleTempCheckEnabled);
    r.real(PARAMETER_AUTO_MEASURE_TIMEOUT, UserParams::setAutoMeasureTimeout);
    r.real(PARAMETER_SAMPLE_TEMP_LIMIT_LOW, UserParams::setSampleTempCheckLowLimit);
    r.real(PARAMETER_SAMPLE_TEMP_LIMIT_HIGH, UserParams::setSampleTempCheckHighLimit);
    r.flag(PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS, UserParams::setEnableViewMeasurements);
    r.text(PARAMETER_CURRENT_LANGUAGE_ID, UserParams::setLanguageCode);
    r.flag(PARAMETER_ORIENATION_ENABLED, UserParams::setOrientationEnabled);
    r.text(PARAMETER_ONLINE_MODE_JOB, UserParams::setLabModeJob);
    r.text(PARAMETER_MEASURING_CIRCLE_ID, UserParams::setMeasuringCircleID);
    r.seconds(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, setAverageNumber);
    r.seconds(PARAMETER_SMC_GOOD_MEASUREMENTS, setSmcGood);
    r.seconds(PARAMETER_SMC_MAX_MEASUREMENTS, setSmcMax);
    r.text(PARAMETER_MEASUREMENT_MODE, setAveragingMode);
    r.read(PARAMETER_WEBSERVER_ADDRESS,
           [](const PARAMETER_CONTENT_TYPES& v) { UserParams::setAllowSync(!v.parameterString.trimmed().isEmpty()); });
    return r.ok;
}

bool SysAPI_SetUserParams()
{
    ParameterWriter w;
    // Separator first, one hash per decimal: the form setNumberFormat reads.
    w.text(PARAMETER_NUMBER_FORMAT,
           UserParams::getDecimalPoint() + QString(qMax(0, UserParams::getPrecision()), QLatin1Char('#')));
    w.text(PARAMETER_DATE_FORMAT, UserParams::getDateFormat());
    w.text(PARAMETER_TIME_FORMAT, UserParams::getTimeFormat());
    w.integer(PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS, int(UserParams::getCalibrationWarningTimeout()));
    w.text(PARAMETER_DEFAULT_JOB_NAME, UserParams::getJobDefaultName());
    w.integer(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES, int(UserParams::getJobDefaultSize()));
    w.integer(PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME, UserParams::getPowerDisplayOffTime());
    w.integer(PARAMETER_DEFAULT_STANDBY_TIME, UserParams::getPowerStandbyTime());
    w.integer(PARAMETER_DEFAULT_POWER_OFF_TIME, UserParams::getPowerOffTime());
    w.flag(PARAMETER_AUTO_MEASURE, UserParams::getAutoMeasure());
    w.flag(PARAMETER_AUTO_MEASURE_SWITCH_ON_UI, UserParams::getAutoMeasureSwitchAvailable());
    w.flag(PARAMETER_DISPLAY_LABCH, UserParams::getDisplayLABCH());
    w.flag(PARAMETER_OVERRIDE_PRESSURE_SENSORS, UserParams::getOverridePressureSensors());
    w.flag(PARAMETER_DISPLAY_RAINBOW, UserParams::getDisplayRainbow());
    w.flag(PARAMETER_DISPLAY_PREVIEW_IMAGES, UserParams::getDisplayPreviewImages());
    w.flag(PARAMETER_DISPLAY_SELF_TEST, UserParams::getDisplaySelfTest());
    w.flag(PARAMETER_DISPLAY_EDIT_FREE_TEXT, UserParams::getDisplayEditFreeText());
    w.flag(PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION, UserParams::getDisplayMeasurementModeSelectionMenuItem());
    w.flag(PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN, UserParams::getDisplayLABCH_MenuItem());
    w.flag(PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR, UserParams::getDisplayrOverridePressureSensoMenuItem());
    w.flag(PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE, UserParams::getDownloadedJobNameEditable());
    w.flag(PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE, UserParams::getDownloadedJobAttributesEditable());
    w.flag(PARAMETER_USE_FILTER_FILE, UserParams::getUseFilterFile());
    w.flag(PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE, UserParams::getSampleTempCheckEnabled());
    w.real(PARAMETER_AUTO_MEASURE_TIMEOUT, UserParams::getAutoMeasureTimeout());
    w.real(PARAMETER_SAMPLE_TEMP_LIMIT_LOW, UserParams::getSampleTempCheckLowLimit());
    w.real(PARAMETER_SAMPLE_TEMP_LIMIT_HIGH, UserParams::getSampleTempCheckHighLimit());
    w.flag(PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS, UserParams::getEnableViewMeasurements());
    w.text(PARAMETER_CURRENT_LANGUAGE_ID, UserParams::getLanguageCode());
    w.flag(PARAMETER_ORIENATION_ENABLED, UserParams::getOrientationEnabled());
    w.text(PARAMETER_ONLINE_MODE_JOB, UserParams::getLabModeJob());
    QString circle = UserParams::getMeasuringCircleID();
    if (circle.startsWith(kBrandingFolder))
        circle.remove(0, kBrandingFolder.size());
    w.text(PARAMETER_MEASURING_CIRCLE_ID, circle);
    const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    w.integer(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, info.averageNumber);
    w.integer(PARAMETER_SMC_GOOD_MEASUREMENTS, info.smcGoodMeasurements);
    w.integer(PARAMETER_SMC_MAX_MEASUREMENTS, info.smcMaxMeasurements);
    w.text(PARAMETER_MEASUREMENT_MODE, jobAveragingModeText(info.mode));
    // Read-only here: the Wi-Fi and texture capabilities, the texture
    // content selection (only "parameters or not" is kept) and the web
    // server address, which the server never takes from the GUI.
    return w.ok;
}

bool SysAPI_GetWifiSettings(QVector<NETWORK_DESCRIPTION_T>& networks)
{
    return succeeded([&] { return CmdOut_GetWifiSettings(networks); });
}

bool SysAPI_GetIpAddress(QString& address)
{
    return succeeded([&] { return CmdOut_GetIpAddress(address); });
}

bool SysAPI_GetConnectedWifiSSID(QString& ssid)
{
    return succeeded([&] { return CmdOut_GetConnectedWifiSSID(ssid); });
}

bool SysAPI_DeleteWifiSetting(const QString& ssid)
{
    return succeeded([&] { return CmdOut_DeleteWifiSetting(ssid); });
}

bool SysAPI_SetEnableWifi(bool on)
{
    return succeeded([&] { return CmdOut_SetEnableWifi(on); });
}

bool SysAPI_TriggerWifiScan()
{
    return succeeded([&] { return CmdOut_TriggerWifiScan(); });
}

bool SysAPI_GetJobs(QVector<Job>& jobs)
{
    return succeeded([&] { return CmdOut_GetJobInfos(jobs); });
}

bool SysAPI_GetJob(const QString& fileID, Job& job)
{
    return succeeded([&] { return CmdOut_GetJobInfo(fileID, job); });
}

bool SysAPI_GetJobStateWeb(const QString& fileID, unsigned long& state, unsigned long& percent)
{
    return succeeded([&] { return CmdOut_GetJobInfoWeb(fileID, state, percent); });
}

bool SysAPI_AddJob(const Job& job, int& index)
{
    return succeeded([&] { return CmdOut_AddJob(job, index); });
}

bool SysAPI_DeleteJob(const QString& fileID)
{
    return succeeded([&] { return CmdOut_DeleteJob(fileID); });
}

bool SysAPI_EditJob(const QString& fileID, const Job& job)
{
    return succeeded([&] { return CmdOut_EditJob(fileID, job); });
}

bool SysAPI_SetJobSaved(const QString& fileID)
{
    return succeeded([&] { return CmdOut_SetJobSaved(fileID); });
}

bool SysAPI_DeleteSample(const QString& fileID, int index)
{
    return succeeded([&] { return CmdOut_DeleteSample(fileID, index); });
}

bool SysAPI_ForceFinishSMC(const QString& fileID)
{
    return succeeded([&] { return CmdOut_ForceFinishSMC(fileID); });
}

bool SysAPI_SyncJobToWebServer(const QString& fileID)
{
    PARAMETER_CONTENT_TYPES value;
    value.parameterString = fileID;
    return SysAPI_SetParameter(PARAMETER_SYNC_JOB_TO_WEBSERVER, value);
}

void SysAPI_GetState()
{
}

bool SysAPI_GetBeeperVolume(unsigned int& level)
{
    return succeeded([&] { return CmdOut_GetBeeperVolume(level); });
}

bool SysAPI_SetBeeperVolume(unsigned int level)
{
    return succeeded([&] { return CmdOut_SetBeeperVolume(level); });
}

bool SysAPI_GetDisplayBrightness(unsigned int& level)
{
    return succeeded([&] { return CmdOut_GetDisplayBrightness(level); });
}

bool SysAPI_SetDisplayBrightness(unsigned int level)
{
    return succeeded([&] { return CmdOut_SetDisplayBrightness(level); });
}

bool SysAPI_SetInterfaceConfig(int version)
{
    return succeeded([&] { return CmdOut_SetInterfaceConfig(version); });
}

bool SysAPI_GetMemoryInfo(MEMORY_INFO_T& info)
{
    return succeeded([&] { return CmdOut_GetMemoryInfo(info); });
}

bool SysAPI_GetAllTests(QVector<TEST>& tests)
{
    return succeeded([&] { return CmdOut_GetSelfTestList(tests); });
}

bool SysAPI_TriggerSelfTest(unsigned int num)
{
    return succeeded([&] { return CmdOut_TriggerSelfTest(num); });
}

bool SysAPI_GetSelfTestResult(unsigned int num, unsigned int& result)
{
    return succeeded([&] { return CmdOut_GetSelfTestResult(num, result); });
}

bool SysAPI_GetCalibrationState(CALIBRATION_STATE_T& state)
{
    return succeeded([&] { return CmdOut_GetCalibrationState(state); });
}

bool SysAPI_GetTextureDisplayed(bool& shown)
{
    return succeeded([&] { return CmdOut_GetTextureDisplayed(shown); });
}

bool SysAPI_GetParameter(PARAMETER_TYPE_T key, PARAMETER_CONTENT_TYPES& value)
{
    return succeeded([&] { return CmdOut_GetParameter(key, value); });
}

bool SysAPI_SetParameter(PARAMETER_TYPE_T key, const PARAMETER_CONTENT_TYPES& value)
{
    return succeeded([&] { return CmdOut_SetParameter(key, value); });
}

bool SysAPI_GetLanguages(QVector<TAG_ITEM_T>& languages)
{
    return succeeded([&] { return CmdOut_GetLanguages(languages); });
}

bool SysAPI_GetFilter(QByteArray& data)
{
    return readDeviceFile("/opt/Filter/Filter.xml", data);
}

bool SysAPI_GetFilterTranslation(QByteArray& data)
{
    return readDeviceFile("/opt/Filter/FilterTranslation.xml", data);
}

bool SysAPI_GetQuickSampleInformation(const QString& fileID, int index, Sample& sample)
{
    return succeeded([&] { return CmdOut_GetRefinishSample(sample, fileID, index); });
}

bool SysAPI_GetAllSampleInformation(const QString& fileID, int index, Sample& sample)
{
    if (!SysAPI_GetQuickSampleInformation(fileID, index, sample))
        return false;
    return SysAPI_GetSampleTextureAndImages(fileID, index, sample);
}

bool SysAPI_GetSampleTextureAndImages(const QString& fileID, int index, Sample& sample)
{
    if (!SysAPI_GetSampleTextures(fileID, index, sample))
        return false;
    return SysAPI_GetSampleImages(fileID, index, sample);
}

bool SysAPI_GetSampleTextures(const QString& fileID, int index, Sample& sample)
{
    for (int angle = 0; angle < NUM_OF_IMAGE_ANGLES; ++angle) {
        if (!SysAPI_GetSampleTexture(fileID, index, sample, static_cast<IMAGE_ANGLE_T>(angle)))
            return false;
    }
    return true;
}

bool SysAPI_GetSampleImages(const QString& fileID, int index, Sample& sample)
{
    for (int angle = 0; angle < NUM_OF_IMAGE_ANGLES; ++angle) {
        if (!SysAPI_GetSampleImage(fileID, index, sample, static_cast<IMAGE_ANGLE_T>(angle)))
            return false;
    }
    return true;
}

bool SysAPI_GetSampleTextureParameters(const QString& fileID, int index, Sample& sample)
{
    for (int angle = 0; angle < NUM_OF_IMAGE_ANGLES; ++angle) {
        if (!SysAPI_GetSampleTextureParametersForAnAngle(fileID, index, sample,
                                                         static_cast<IMAGE_ANGLE_T>(angle)))
            return false;
    }
    return true;
}

bool SysAPI_GetSampleTexture(const QString& fileID, int index, Sample& sample,
                             IMAGE_ANGLE_T angle)
{
    TEXTURE_T texture;
    if (!succeeded([&] { return CmdOut_GetAngleTexture(angle, fileID, index, texture); }))
        return false;
    sample.setTexture(texture, angle);
    return true;
}

bool SysAPI_GetSampleImage(const QString& fileID, int index, Sample& sample, IMAGE_ANGLE_T angle)
{
    QByteArray image;
    if (!succeeded([&] { return CmdOut_GetAngleFullImage(angle, fileID, index, image); }))
        return false;
    sample.setImage(image, angle);
    return true;
}

bool SysAPI_GetSampleTextureParametersForAnAngle(const QString& fileID, int index,
                                                 Sample& sample, IMAGE_ANGLE_T angle)
{
    QVector<TEXTURE_PARAMETER_T> parameters;
    if (!succeeded([&] {
            return CmdOut_GetAngleTextureParameters(angle, fileID, index, parameters);
        }))
        return false;
    sample.setTextureParameters(parameters, angle);
    return true;
}
