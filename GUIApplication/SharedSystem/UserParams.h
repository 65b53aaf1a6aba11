#ifndef USERPARAMS_H
#define USERPARAMS_H

// The settings as last read from the MeasurementServer, kept here so that any
// screen can read them at once. The server owns them: a setter changes only
// this copy; a user's change goes to the server through SysAPI_SetUserParams
// or SysAPI_SetParameter, and other clients' changes come back through the
// settings bits of the status.
//
// Every accessor is static and works on the one instance under its recursive
// lock, so both UserParams::getPrecision() and m_UserParameters->getPrecision()
// read the same value from any thread.

#include "SharedSystem/InstrumentTypes.h"

#include <QObject>
#include <QRecursiveMutex>
#include <QString>

class UserParams : public QObject
{
    Q_OBJECT

public:
    static constexpr int NUM_JOB_DEFAULT_TAGS = 50;

    static UserParams* instance();

    static void Init();
    static void setDefaults();

    // The file that carries the language across a restart, before the server
    // has been asked: "/opt/GUI/Languages/default_language.bin".
    static QString languageFilePath();

    static QString getLanguageCode();
    static void setLanguageCode(const QString& code);

    static QString getDecimalPoint();
    static QString getDecimalPointString();
    static void setDecimalPoint(const QString& point);
    static int getPrecision();
    static void setPrecision(int precision);
    static void setNumberFormat(const QString& format);

    static unsigned int getBeeperVolume();
    static void setBeeperVolume(unsigned int volume);
    static unsigned int getDisplayBrightness();
    static void setDisplayBrightness(unsigned int brightness);

    static int getPowerDisplayOffTime();
    static void setPowerDisplayOffTime(int seconds);
    static int getPowerStandbyTime();
    static void setPowerStandbyTime(int seconds);
    static int getPowerOffTime();
    static void setPowerOffTime(int seconds);

    static bool getWiFiOn();
    static void setWiFiOn(bool on);
    static bool getAutoMeasure();
    static void setAutoMeasure(bool on);
    static bool getAutoMeasureSwitchAvailable();
    static void setAutoMeasureSwitchAvailable(bool available);
    static float getAutoMeasureTimeout();
    static void setAutoMeasureTimeout(float timeout);

    static bool getDisplayLABCH();
    static void setDisplayLABCH(bool on);
    static bool getOverridePressureSensors();
    static void setOverridePressureSensors(bool on);
    static bool getDisplayRainbow();
    static void setDisplayRainbow(bool on);
    static bool getDisplayPreviewImages();
    static void setDisplayPreviewImages(bool on);
    static bool getDisplayTexture();
    static void setDisplayTexture(bool on);
    static bool getDisplayTextureParameters();
    static void setDisplayTextureParameters(bool on);
    static bool getDisplaySelfTest();
    static void setDisplaySelfTest(bool on);
    static bool getDisplayEditFreeText();
    static void setDisplayEditFreeText(bool on);

    static bool getAllowSync();
    static void setAllowSync(bool allow);
    static bool getShowHazardWarningBanner();
    static void setShowHazardWarningBanner(bool show);
    static bool getDisplayLABCH_MenuItem();
    static void setDisplayLABCH_MenuItem(bool show);
    static bool getDisplayrOverridePressureSensoMenuItem();
    static void setDisplayOverridePressureSensorMenuItem(bool show);
    static bool getDisplayMeasurementModeSelectionMenuItem();
    static void setDisplayMeasurementModeSelectionMenuItem(bool show);

    static bool getDownloadedJobNameEditable();
    static void setDownloadedJobNameEditable(bool editable);
    static bool getDownloadedJobAttributesEditable();
    static void setDownloadedJobAttributesEditable(bool editable);
    static bool getUseFilterFile();
    static void setUserFilterFile(bool use);
    static bool getEnableViewMeasurements();
    static void setEnableViewMeasurements(bool enable);
    static bool getOrientationEnabled();
    static void setOrientationEnabled(bool enabled);
    static bool getWifiEnabled();
    static void setWifiEnabled(bool enabled);

    static bool getSampleTempCheckEnabled();
    static void setSampleTempCheckEnabled(bool enabled);
    static float getSampleTempCheckHighLimit();
    static void setSampleTempCheckHighLimit(float limit);
    static float getSampleTempCheckLowLimit();
    static void setSampleTempCheckLowLimit(float limit);

    // Lab (online) mode is on while a job is named for it.
    static QString getLabModeJob();
    static void setLabModeJob(const QString& job);
    static bool getLabModeEnabled();

    static QString getMeasuringCircleID();
    static void setMeasuringCircleID(const QString& id);

    static unsigned int getCalibrationWarningTimeout();
    static void setCalibrationWarningTimeout(unsigned int timeout);
    static unsigned int getPowerManagementSetting();
    static void setPowerManagementSetting(unsigned int setting);

    static bool getSampleViewModeEnabled(FUNCTION_TYPE_T type);
    static void setSampleViewModeEnabled(FUNCTION_TYPE_T type, bool enabled);

    static COLOR_ILLUM_OBS_T getIllumObs();
    static void setIllumObs(COLOR_ILLUM_OBS_T illumObs);
    static PRESSURE_SENSOR_SENSITIVITY_T getPressureSensorSensitivity();
    static void setPressureSensorSensitivity(PRESSURE_SENSOR_SENSITIVITY_T sensitivity);

    static QString getJobDefaultName();
    static void setJobDefaultName(const QString& name);
    static unsigned int getJobDefaultTag(int index);
    static void setJobDefaultTag(int index, unsigned int value);
    static JOB_AVERAGING_INFO_T getJobDefaultAvgInfo();
    static void setJobDefaultAvgInfo(const JOB_AVERAGING_INFO_T& info);
    static void setJobDefaultAvgInfo(JOB_AVERAGING_MODE_T mode, int smcGood, int smcMax, int averageNumber);
    static unsigned int getJobDefaultSize();
    static void setJobDefaultSize(unsigned int size);

    static QString getDateFormat();
    static void setDateFormat(const QString& format);
    static QString getTimeFormat();
    static void setTimeFormat(const QString& format);

private:
    UserParams();
    void applyDefaults();
    static QString readLanguageFile();

    mutable QRecursiveMutex m_mutex;

    QString m_LanguageCode;
    QString m_DecimalPoint;
    int m_Precision = 2;
    unsigned int m_BeeperVolume = 5;
    unsigned int m_DisplayBrightness = 0;
    int m_PowerDisplayOffTime = 60;
    int m_PowerStandbyTime = 1800;
    int m_PowerOffTime = 3600;
    bool m_WiFiOn = false;
    bool m_AutoMeasure = false;
    bool m_AutoMeasureSwitchDisplayed = false;
    float m_AutoMeasureTimeout = 1.0f;
    bool m_DisplayLABCH = true;
    bool m_OverridePressureSensors = false;
    bool m_DisplayRainbow = true;
    bool m_DisplayPreviewImages = true;
    bool m_DisplayTexture = true;
    bool m_DisplayTextureParameters = true;
    bool m_DisplaySelfTest = false;
    bool m_DisplayEditFreeText = false;
    bool m_bAllowSync = false;
    bool m_ShowHazardBanner = false;
    bool m_DisplayLABCH_MenuItem = false;
    bool m_DisplayOverridePressureSensorMenuItem = false;
    bool m_DisplayMeasurementModeSelectionMenuItem = false;
    bool m_DownloadedJobNameEditable = false;
    bool m_DownloadedJobAttributesEditable = false;
    bool m_bUseFilterFile = true;
    bool m_EnableViewMeasurements = false;
    bool m_OrientationEnabled = true;
    bool m_wifiEnabled = true;
    bool m_sampleTempCheckEnabled = false;
    float m_sampleTempCheckHighLimit = 0.0f;
    float m_sampleTempCheckLowLimit = 0.0f;
    QString m_LabModeJob;
    QString m_MeasuringCircleID;
    unsigned int m_UserCalibrationWarningTimeout = 8;
    unsigned int m_PowerManagementSetting = 4;
    bool m_SampleViewModesEnabled[FUNCTION_TYPES_ENUM_SIZE] = {true, true, true, true};
    COLOR_ILLUM_OBS_T m_IllumObs = COLOR_ILLUM_OBS_D65_10;
    PRESSURE_SENSOR_SENSITIVITY_T m_PressureSensorSensitivity = PRESSURE_SENSITIVITY_MEDIUM;
    QString m_JobDefaultName;
    unsigned int m_JobDefaultTags[NUM_JOB_DEFAULT_TAGS] = {};
    JOB_AVERAGING_INFO_T m_JobDefaultAvgInfo;
    unsigned int m_JobDefaultSize = 5;
    QString m_DateFormat;
    QString m_TimeFormat;
};

// The server's averaging-mode parameter as the user's default: "SMC" is
// JOB_AVG_MODE_SMC, "AVERAGE" is the simple average of 3 or 5 readings by the
// averaging number (any other number gives no averaging), anything else none.
JOB_AVERAGING_MODE_T jobAveragingModeFromParameter(const QString& text, int averageNumber);

// The mode as the server names it: "AVERAGE", "SMC", "DEV_MODE" or "NONE".
QString jobAveragingModeText(JOB_AVERAGING_MODE_T mode);

#endif // USERPARAMS_H
