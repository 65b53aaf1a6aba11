#include "GUIAPI/SystemAPI.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/JobOutCommands.h"
#include "Commands/ParametersOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/Sample.h"

#include <QFile>

namespace {

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
