#ifndef SYSTEMAPI_H
#define SYSTEMAPI_H

// Bool-valued calls on top of the CmdOut_ functions for the model and the
// screens: true when the command's status is 0, false on any failure.

#include "SharedSystem/InstrumentTypes.h"

#include <QByteArray>
#include <QString>
#include <QVector>

class Job;
class Sample;

// Reads every user setting from the server's parameters into UserParams.
// Each read stands alone: a failed one leaves its field and makes the
// result false.
bool SysAPI_GetUserParams();
// Writes the user settings back as parameters; false if any write failed.
bool SysAPI_SetUserParams();

// Wi-Fi
bool SysAPI_GetWifiSettings(QVector<NETWORK_DESCRIPTION_T>& networks);
bool SysAPI_GetIpAddress(QString& address);
bool SysAPI_GetConnectedWifiSSID(QString& ssid);
bool SysAPI_DeleteWifiSetting(const QString& ssid);
bool SysAPI_SetEnableWifi(bool on);
bool SysAPI_TriggerWifiScan();

// Jobs
bool SysAPI_GetJobs(QVector<Job>& jobs);
bool SysAPI_GetJob(const QString& fileID, Job& job);
bool SysAPI_GetJobStateWeb(const QString& fileID, unsigned long& state, unsigned long& percent);
bool SysAPI_AddJob(const Job& job, int& index);
bool SysAPI_DeleteJob(const QString& fileID);
bool SysAPI_EditJob(const QString& fileID, const Job& job);
bool SysAPI_SetJobSaved(const QString& fileID);
bool SysAPI_DeleteSample(const QString& fileID, int index);
bool SysAPI_ForceFinishSMC(const QString& fileID);
// Asks the server to send the job to the configured web service.
bool SysAPI_SyncJobToWebServer(const QString& fileID);

// Hardware settings, state, self tests
void SysAPI_GetState();
bool SysAPI_GetBeeperVolume(unsigned int& level);
bool SysAPI_SetBeeperVolume(unsigned int level);
bool SysAPI_GetDisplayBrightness(unsigned int& level);
bool SysAPI_SetDisplayBrightness(unsigned int level);
bool SysAPI_SetInterfaceConfig(int version);
bool SysAPI_GetMemoryInfo(MEMORY_INFO_T& info);
bool SysAPI_GetAllTests(QVector<TEST>& tests);
bool SysAPI_TriggerSelfTest(unsigned int num);
bool SysAPI_GetSelfTestResult(unsigned int num, unsigned int& result);
bool SysAPI_GetCalibrationState(CALIBRATION_STATE_T& state);
bool SysAPI_GetTextureDisplayed(bool& shown);
bool SysAPI_GetParameter(PARAMETER_TYPE_T key, PARAMETER_CONTENT_TYPES& value);
bool SysAPI_SetParameter(PARAMETER_TYPE_T key, const PARAMETER_CONTENT_TYPES& value);
bool SysAPI_GetLanguages(QVector<TAG_ITEM_T>& languages);

// The filter files are read from the instrument's own disk. A missing file
// is no failure (the array stays empty); one that can't be opened is.
bool SysAPI_GetFilter(QByteArray& data);
bool SysAPI_GetFilterTranslation(QByteArray& data);

// Samples, in the stages the screens need them.
bool SysAPI_GetQuickSampleInformation(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetAllSampleInformation(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetSampleTextureAndImages(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetSampleTextures(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetSampleImages(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetSampleTextureParameters(const QString& fileID, int index, Sample& sample);
bool SysAPI_GetSampleTexture(const QString& fileID, int index, Sample& sample,
                             IMAGE_ANGLE_T angle);
bool SysAPI_GetSampleImage(const QString& fileID, int index, Sample& sample, IMAGE_ANGLE_T angle);
bool SysAPI_GetSampleTextureParametersForAnAngle(const QString& fileID, int index,
                                                 Sample& sample, IMAGE_ANGLE_T angle);

#endif // SYSTEMAPI_H
