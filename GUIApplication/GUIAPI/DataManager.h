#ifndef DATAMANAGER_H
#define DATAMANAGER_H

// The GUI's picture of what the MeasurementServer holds: the job list with
// sample descriptions, colour, textures and images of the samples in hand,
// the filter tree, languages, keypad, Wi-Fi and the last status. It lives on
// its own thread; screens call its accessors directly (one recursive lock
// guards everything) and start long work through its slots, which answer
// with a ...Complete signal. Every change to a job is a command; the local
// list follows only when a status reports the change.

#include "Communication/PollStatus.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/Tags.h"
#include "SharedSystem/WorkerTask.h"
#include "SharedSystem/XMLParser.h"

#include <QDateTime>
#include <QImage>
#include <QObject>
#include <QMutex>
#include <QRecursiveMutex>
#include <QString>
#include <QStringList>
#include <QTimer>
#include <QVector>

class UserParams;

class DataManager : public QObject
{
    Q_OBJECT

public:
    // NO_INDEX (65535) is "none" for the active job and sample and "not
    // found" for look-ups; AVERAGED_SAMPLE_INDEX (255) is a job's averaged
    // sample, on the wire and as a local index alike.

    // The worker of DataManagerTask; the thread starts on first use.
    static DataManager* instance();

    DataManager();

    // Once, from main on the GUI thread: takes the hub, the user parameters
    // and the command front onto this thread and wires everything. The first
    // onInit comes with the link (TcpReconnected).
    void Init();

    PollStatus* getPollStatus();

    // Status and instrument
    MEMORY_INFO_T getMemInfo();
    CALIBRATION_STATE_T getCalState();
    SystemStatus getSystemStatus();
    PRESSURE_SWITCH_T getPressureSensorStatus();
    ACCELEROMETER_ORIENTATION_T getInstrumentOrientation();
    int getInstrumentPosition();
    IMAGE_ANGLE_T getActiveImage();
    void setActiveImage(IMAGE_ANGLE_T angle);
    QString getIpAddress();
    QString getWifiSSID();
    KeypadArray getKeypadArray();
    QVector<TAG_ITEM_T> getLanguagesInstalled();
    bool getDataInitialized();
    // Asks the server.
    bool isMeasurementInProgress();
    static bool isMeasurementInProgress(SYSTEM_STATE_T state);

    // User settings written through to the server
    void setLanguageCode(const QString& code);
    void setBeeperVolume(unsigned int volume);
    void setDisplayBrightness(unsigned int brightness);
    QString getLanguageStringFromCode(const QString& code);

    // What a status means for the model (see onSystemStatusUpdated).
    void setSystemStatus(const SystemStatus& status);

    // Files
    bool loadKeypad(const QString& language, KeypadArray& keys);
    bool loadFilters();

    // Active job and sample
    void setActiveJob(unsigned int index);
    void setActiveSample(unsigned int index);
    unsigned int getActiveJob();
    unsigned int getActiveSample();
    Job getActiveJobObject();
    Job getAJobObject(unsigned int index);
    QVector<Job> getAllJobs();
    unsigned int getNumberOfJobs();
    Sample getActiveSampleObject();
    Sample getASampleObject(unsigned int index);
    unsigned int getCurrentNumberOfJobSamples();
    unsigned int getTotalNumSamples();
    unsigned int findJobByName(const QString& name);
    bool doesJobNameExist(const QString& name);
    bool doesJobDisplayNameExist(const QString& name);
    void setFullJobUpdateFlag(bool flag);

    // Jobs
    unsigned int createNewJob();
    unsigned int addJob(const Job& job);
    unsigned int copyJob(unsigned int index);
    void editJob(unsigned int index, const Job& job);
    void editJobName(unsigned int index, const QString& name);
    void editJobDisplayName(unsigned int index, const QString& name);
    void editJobTag(unsigned int index, TAG_STATES_T state, const _TAG_ENTRY_DATA_T& data);
    void editCurrentJobName(const QString& name);
    void editCurrentJobDisplayName(const QString& name);
    void deleteSample(unsigned int index);
    void clearAllJobs();

    // The job list against the server
    bool refreshJobInfos();
    void updateJobInfos();
    void loadJobs();
    bool refreshCurrentJobInfo();
    bool updateCurrentJobInfo();

    // Samples in stages
    void quickLoadJobSamples(unsigned int jobIndex);
    void loadSamplesImages(unsigned int index);
    void loadSamplesTextures(unsigned int index);
    void loadSamplesTexturesAndImages(unsigned int index);
    QImage getSampleImage(IMAGE_ANGLE_T angle, unsigned int index);
    QImage getActiveSampleImage(IMAGE_ANGLE_T angle);

    // Memory
    MEMORY_INFO_T getUpdatedMemInfo();
    bool isThereEnoughRoomToMeasure(unsigned int jobIndex);
    bool isThereEnoughRoomToAddJob();

    // Tags: the filter tree
    bool doesTagNameExist(const QString& name);
    bool doesTagNameExist(TAG_STATES_T state, const QString& name);
    bool doesTagExist();
    QVector<_TAG_ENTRY_DATA_T> tagAutoLookupBeginsWith(const QString& text);
    QVector<_TAG_ENTRY_DATA_T> tagAutoLookupBeginsWith(TAG_STATES_T state, const QString& text);
    QStringList tagAutoLookupBeginsWithStringList(const QString& text);
    QStringList tagAutoLookupBeginsWithStringList(TAG_STATES_T state, const QString& text);
    QVector<_TAG_ENTRY_DATA_T> tagSmartAutoLookupBeginsWith(TAG_STATES_T state,
                                                             const QString& text);
    QStringList tagSmartAutoLookupBeginsWithStringList(TAG_STATES_T state, const QString& text);
    _TAG_ENTRY_DATA_T getParentFilterTag(const _TAG_ENTRY_DATA_T& entry);
    unsigned char getTagRules();
    QVector<_TAG_ENTRY_DATA_T> getTagData(TAG_STATES_T state);
    QVector<_TAG_ENTRY_DATA_T> getSmartTagData(TAG_STATES_T state);
    QString getTagStateName(TAG_STATES_T state);
    QString getTagStateNameDefaultLanguage(TAG_STATES_T state);
    QString getTagID(TAG_STATES_T state, const QString& text);
    QString getTagText(TAG_STATES_T state, const QString& id);

    // Tags: the user's own lists
    void createNewTag(TAG_STATES_T state, const QString& id, const QString& text);
    TAG_ITEM_T getTag(TAG_STATES_T state, unsigned int index);
    QString getTagID_FromIndex(TAG_STATES_T state, unsigned int index);
    QString getTagText_FromIndex(TAG_STATES_T state, unsigned int index);
    unsigned int getNumberOfTags(TAG_STATES_T state, bool flag);
    void setTagStateName(TAG_STATES_T state, const QString& name);
    void clearTagLists();

    // Self tests
    QVector<TEST> getAllTests();
    QVector<TEST> getTests(int type);

    // Wi-Fi
    bool loadWifiSSID();
    void triggerWifiScan();
    bool removeSSID(const QString& ssid);
    NETWORK_DESCRIPTION_T getNetworkDescription(unsigned int index);
    QVector<NETWORK_DESCRIPTION_T> getKnownNetworkDescriptions();
    QVector<NETWORK_DESCRIPTION_T> getUnknownNetworkDescriptions();

    // Lab mode off: locally only (true), or through the server (false).
    void turnOffLabMode(bool setUserParams);

public slots:
    void deleteJob(unsigned int index);
    void deleteCompletedJobs();
    void deleteActiveJob();
    void onDeleteActiveJobSamples();
    void deleteActiveSample();
    void deleteAllJobs();
    void onQuickLoadCurrentJobSamples();
    void onLoadWifiSettings();
    bool onSync();
    void onUpdateJobInfos();
    void onCreateNewJob();
    void onInit();
    void onLoadCurrentSamplesTexturesAndImages();
    void onLoadCurrentSamplesTextures();
    void onLoadCurrentSamplesImages();
    void onTriggerWifiScan();
    void onClearEverything();
    int onAddSample(Sample sample);
    void onSystemStatusUpdated(SystemStatus status);
    void onPressureSwitchesUpdated(PRESSURE_SWITCH_T status);
    void onOrientationUpdated(ACCELEROMETER_ORIENTATION_T orientation);

signals:
    void DataManagerInitComplete();
    void jobDeleted(uint index);
    void jobCreated(uint index);
    void completedJobsDeleted();
    void updateSystemState(SYSTEM_STATE_T state);
    void updateCalValid(bool valid);
    void updatePercentComplete(int percent);
    void updateNumOfErrors(int count);
    void updateSystemTime(QDateTime time);
    void updateBatteryState(BATTERY_STATUS_T state);
    void updateBatteryChargePercent(int percent);
    void updateWifiState(WIFI_STATUS_T state);
    void updateWifiLevel(int level);
    void updateUSBState(USB_STATUS_T state);
    void updateTargetingImage(QImage image);
    void updateSampleImage(QImage image);
    void updatePressureSensorStatus(PRESSURE_SWITCH_T status);
    void updateInstrumentPosition(int position);
    void updateNewSampleAdded(uint index);
    void updateSampleDeleted(uint index);
    void updateOrientatonEnabled(bool enabled);
    void DataBaseWiped();
    void languageChanged(QString code);
    void displayBrightnessChanged();
    void beeperVolumeChanged();
    void wifiSettingsChanged();
    void powerManagementLevelChanged();
    void autoMeasureChanged();
    void displayLABCHChanged();
    void OverridePressureSensorChanged();
    void powerDisplayOffTimeChanged();
    void powerStandbyTimeChanged();
    void powerOffTimeChanged();
    void paramUpdate();
    void showMessageBox(QString title, QString text);
    void loadCurrentSamplesTexturesAndImagesComplete();
    void loadCurrentSamplesTexturesComplete();
    void loadCurrentSamplesImagesComplete();
    void loadWifiSettingsComplete();
    void loadQuickCurrentJobSamplesComplete();
    void syncJobPercent(QString name, bool done, int percent);

private:
    void applySettingsBits(const SystemStatus& status, bool jobsChanged);
    void applyAveragingDefaults();
    void applyLabModeJob(const QString& value, bool jobsChanged);
    void applyWhiteTransferRequest(int value);
    unsigned int addJobWithRetries(Job job, const QString& name, const QString& displayName,
                                   bool copy);
    void deleteJobAt(unsigned int index);
    void cacheTagStateNames();
    QString cachedTagStateName(int state);
    bool jobUsesAveragedSample(const Job& job) const;

    unsigned int m_CurrentJobIndex;
    QVector<Job> m_JobList;
    unsigned int m_CurrentSampleIndex;
    QVector<NETWORK_DESCRIPTION_T> m_NetworkDescriptions;
    QString m_ipAddress;
    QString m_wifiSSID;
    TAG_LIST_T m_TagList[NUM_TAG_STATES];
    Tags m_TagFilters;
    QVector<TAG_ITEM_T> m_LanguagesInstalled;
    KeypadArray m_keypadKeys;
    KeypadArray m_keypadEnglishKeys;
    SystemStatus m_SystemStatus;
    IMAGE_CONTAINER_T m_targetingImage;
    PRESSURE_SWITCH_T m_PressureSensorStatus;
    ACCELEROMETER_ORIENTATION_T m_InstrumentOrientation;
    IMAGE_ANGLE_T m_activeImage;
    UserParams* m_UserParameters;
    bool m_DataInitialized;
    QTimer m_initTimer;
    bool m_fullJobUpdateFlag;
    PollStatus m_pPollStatus;

    QRecursiveMutex m_lock;
    // The tag state names in the filter file's language, for decoding jobs
    // inside the link's locks without taking m_lock (a leaf lock).
    QMutex m_tagStateNamesLock;
    QStringList m_tagStateNamesDefault;
};

// The DataManager thread. Its constructor returns once DataManager exists.
class DataManagerTask : public WorkerTask<DataManager>
{
public:
    static DataManagerTask* instance();

private:
    DataManagerTask();
    void workerCreated(DataManager* worker) override;
};

#endif // DATAMANAGER_H
