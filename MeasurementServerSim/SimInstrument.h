#ifndef SIMINSTRUMENT_H
#define SIMINSTRUMENT_H

// The simulated instrument behind the protocol: its state machine (idle,
// targeting, measuring, calibrating, self tests, lock, busy), the hardware
// it reads (pressure feet, accelerometer, temperatures, battery), the
// calibration clock, the error list, the parameter store and the job table.
//
// Everything runs on the thread that owns the object, driven by its timers:
// nothing blocks. Operations take real time (scaled by Options::timeScale):
// a measurement is STATE_MEASURING with rising percent for 1.5 s, then
// STATE_CALCULATING for 0.3 s, then STATE_INIT with the new sample stored.

#include "SimChanges.h"
#include "SimImages.h"
#include "SimJobs.h"
#include "SimModel.h"
#include "SimParameters.h"
#include "SimStore.h"
#include "SimWifi.h"

#include <QElapsedTimer>
#include <QMap>
#include <QObject>
#include <QTimer>

#include <memory>
#include <random>

namespace Sim {

class Instrument : public QObject
{
    Q_OBJECT

public:
    struct Options {
        QString dataDir;
        bool reset = false;
        Model model = Model::Birch;
        double timeScale = 1.0;   // 0.2 runs every operation five times faster
        quint32 seed = 0;         // 0: a different noise every run
    };

    struct StatusReply {
        SYSTEM_STATE_T state = STATE_INIT;
        int percent = 0;
        int numErrors = 0;
        QDateTime time;
        int batteryState = BATTERY_DISCHARGING;
        int batteryPercent = 0;
        int wifiState = WIFI_STATUS_OFF;
        int wifiLevel = WIFI_LEVEL_NOT_CONNECTED;
        int usbState = USB_STATUS_OFF;
        quint16 measureId = 0;
        quint16 jobId = 0;
        quint8 settingsId = 0;
        quint32 settingsBits = 0;
        QVector<EntityChange> entities;
    };

    struct ErrorEntry {
        quint8 priority = 1;
        int id = 0;
        int category = 0;
        QDateTime time;
        QString text;
    };

    enum class PowerAction { Reboot, Shutdown };

    explicit Instrument(const Options& options, QObject* parent = nullptr);
    ~Instrument() override;

    bool open(QString* error = nullptr);
    Model model() const { return m_options.model; }
    double timeScale() const { return m_options.timeScale; }
    QString dataDir() const { return m_options.dataDir; }

    // ---- state ---------------------------------------------------------------
    SYSTEM_STATE_T state() const;
    int percentComplete() const;
    bool isIdle() const;                 // free to start an operation
    // The state reply; hands over the collected settings bits and entity changes.
    StatusReply takeStatus();
    const Changes& changes() const { return m_changes; }

    // ---- errors ----------------------------------------------------------------
    const QVector<ErrorEntry>& errors() const { return m_errors; }
    void resetErrors() { m_errors.clear(); }
    void pushError(int id, const QString& text = QString());
    static QString errorText(int id);

    // ---- identity and housekeeping figures --------------------------------------
    DEVICE_INFO_T deviceInfo() const;
    QStringList deviceInfoExtras() const;    // the 15 further strings of the reply
    QString serialNumber() const;
    QString version(int type, bool* known) const;
    int capability(const QString& name) const;
    MEMORY_INFO_T memoryInfo() const;
    void setMemoryLimits(int maxJobs, int maxMeasurements);
    CALIBRATION_STATE_T calibrationState() const;
    CALIBRATION_STATUS_T calibrationStatus() const;
    int secondsToCalibration() const;
    QVector<TAG_ITEM_T> languages() const;
    int brightness() const { return m_brightness; }
    void setBrightness(int level);
    int volume() const { return m_volume; }
    void setVolume(int level);
    STATUS_T setInterfaceVersion(int version);
    int interfaceVersion() const { return m_interfaceVersion; }
    int batteryState() const { return m_batteryState; }
    int batteryPercent() const { return m_batteryPercent; }

    // ---- sensors -------------------------------------------------------------------
    PRESSURE_SWITCH_T switches() const { return m_switches; }
    int switchesDown() const;
    ACCELEROMETER_ORIENTATION_T orientation() const;
    bool temperature(int sensor, float* value) const;

    // ---- parameters -----------------------------------------------------------------
    // Null for a key the server does not keep.
    const ParamValue* parameter(int key) const;
    STATUS_T setParameter(int key, const ParamValue& value);
    // Stores a value without the checks of the link, as a damaged or reset
    // store would hold it, and announces it.
    void forceParameter(int key, const ParamValue& value) { setParameterValue(key, value, true); }
    void parametersToDefaults();
    JobBook::Defaults jobDefaults() const;

    // ---- operations -------------------------------------------------------------------
    // An empty job name is a reference check.
    STATUS_T triggerMeasurement(const QString& jobName);
    STATUS_T triggerCalibration();
    STATUS_T startTargeting();
    void stopTargeting();
    bool targeting() const { return m_targeting; }
    // The live picture; each request counts as the client still watching.
    QByteArray liveFrame(int width, int height);
    // The last reference check against the named reference ("factory_ref").
    STATUS_T referenceCheck(const QString& reference, QDateTime* when, quint8* result) const;
    const QVector<TEST>& selfTests() const { return m_selfTests; }
    STATUS_T triggerSelfTest(quint32 num);
    STATUS_T selfTestResult(quint32 num, qint32* result) const;
    STATUS_T runInternalCheck();
    STATUS_T power(qint32 value);

    // ---- jobs and samples ----------------------------------------------------------------
    JobBook& jobs() { return m_jobs; }
    const JobBook& jobs() const { return m_jobs; }
    WifiRadio& wifi() { return *m_wifi; }
    const WifiRadio& wifi() const { return *m_wifi; }
    STATUS_T addJob(const JobBook::Description& d, int* dbIndex, bool online = false);
    // An empty job name with number 0 is the latest reading, whatever it was.
    bool sample(const QString& jobName, int number, Sample* out, STATUS_T* dataStatus) const;

    // ---- what a person or a test does to the instrument -----------------------------------
    void setSwitches(bool s1, bool s2, bool s3);
    void setRotation(int degrees);
    void setSurfaceVertical(bool vertical);
    void setBattery(int state, int percent);
    void setUsb(int state);
    void setLocked(bool locked);
    bool locked() const { return m_locked; }
    // ms > 0: busy for that long; ms < 0: until cleared; 0: clear.
    void setBusy(int ms);
    void failNextOperation(STATUS_T code) { m_failNext = code; }
    bool abortOperation();
    void expireCalibration();
    void renewCalibration();
    void setCalibrationDue(int seconds);
    void setCalibrationInterval(int seconds);
    void setSampleTemperature(float celsius) { m_sampleTemperature = celsius; }
    void setInstrumentTemperature(float celsius) { m_instrumentTemperature = celsius; }
    // Empty: each job measures its own panel.
    void setPanel(const QString& finishKey);
    QString panel() const { return m_panel; }
    void setOutlierRate(double rate) { m_outlierRate = rate; }
    // 1: next reading an outlier, 0: next reading clean, -1: by the rate.
    void forceNextReading(int outlier) { m_forceOutlier = outlier; }
    // -1 automatic, 0 fail, 1 pass.
    void forceReferenceResult(int result) { m_forceReference = result; }
    void forceSelfTestResult(quint32 num, qint32 result);
    // Appends a test to the list (a firmware with more tests); its number.
    quint32 addSelfTest(const QString& name, quint32 location, quint32 durationMs);
    void setTargetingTimeout(int seconds) { m_targetingTimeoutS = seconds; }
    STATUS_T startOnlineJob(const QString& name, const QString& modeText, int size, int maxSamples, QString* created);
    void endOnlineJob();
    void setPowerUp(int ms);
    // Fills the store with jobs of readings, for load tests: jobs "Bulk 1"
    // and on, each complete with its readings. Returns the jobs made.
    int addBulkJobs(int jobs, int readingsPerJob);

signals:
    // The client asked to restart or switch off the instrument.
    void powerRequested(Sim::Instrument::PowerAction action);

private:
    struct Operation {
        enum Kind { None, Measurement, ReferenceCheck, Calibration, SelfTest, InternalCheck };
        Kind kind = None;
        QElapsedTimer clock;
        int workMs = 0;
        int calcMs = 0;
        SYSTEM_STATE_T workState = STATE_MEASURING;
        QString job;
        quint32 test = 0;
        STATUS_T failure = 0;
        bool allDownAtStart = false;
        PRESSURE_SWITCH_T switchesAtStart;
    };

    void startOperation(Operation::Kind kind, int workMs, int calcMs, SYSTEM_STATE_T workState);
    void finishOperation();
    void onTick();
    void onHousekeeping();
    void updateTick();
    int scaled(int ms) const;
    bool allDown() const { return switchesDown() == 3; }
    Sample makeReading(const QString& panelSpec, int outlierSign = 0);
    QString panelForJob(const QString& jobName);
    QString panelForView() const;
    void checkStorage();
    void seedDemo();
    void loadParameters();
    void saveCalibration();
    bool bodyMoved() const;
    qint32 judgeSelfTest(const TEST& test) const;
    void setParameterValue(int key, const ParamValue& value, bool announce);

    Options m_options;
    Store m_store;
    Changes m_changes;
    JobBook m_jobs;
    std::unique_ptr<WifiRadio> m_wifi;
    QMap<int, ParamValue> m_params;
    std::mt19937 m_rng;
    Images::LiveView m_liveView;

    QTimer m_tick;
    QTimer m_housekeeping;
    QElapsedTimer m_uptime;
    Operation m_op;

    // hardware
    PRESSURE_SWITCH_T m_switches;
    int m_rotation = 0;
    bool m_vertical = true;
    float m_sampleTemperature = 23.5f;
    float m_instrumentTemperature = 27.0f;
    int m_batteryState = BATTERY_DISCHARGING;
    int m_batteryPercent = 86;
    int m_usbState = USB_STATUS_OFF;
    qint64 m_lastBatteryStep = 0;
    bool m_batteryLowReported = false;
    bool m_batteryEmptyReported = false;

    // state
    bool m_locked = false;
    qint64 m_busyUntil = 0;      // uptime ms; -1 without end
    qint64 m_busyFrom = 0;
    qint64 m_powerUpUntil = 0;
    bool m_targeting = false;
    qint64 m_lastTargetingPoll = 0;
    qint64 m_targetingSince = 0;
    int m_targetingTimeoutS = 180;
    int m_interfaceVersion = 0;
    int m_brightness = 80;
    int m_volume = 5;
    QVector<ErrorEntry> m_errors;
    bool m_lowStorageReported = false;
    int m_maxJobs = 500;
    int m_maxMeasurements = 10000;

    // calibration
    QDateTime m_lastWhiteCal;
    int m_calIntervalS = 8 * 3600;
    float m_calReferenceTemperature = 26.5f;
    QDateTime m_lastRefCheck;
    quint8 m_refCheckResult = 0;   // 0 none yet, 1 passed, 2 failed

    // self tests
    QVector<TEST> m_selfTests;
    QMap<quint32, qint32> m_selfTestResults;
    QMap<quint32, qint32> m_forcedSelfTestResults;

    // injections
    STATUS_T m_failNext = 0;
    QString m_panel;
    double m_outlierRate = 0.08;
    int m_forceOutlier = -1;
    int m_forceReference = -1;
    Sample m_lastReading;
    bool m_hasLastReading = false;
    qint64 m_lastSyncStep = 0;
};

} // namespace Sim

Q_DECLARE_METATYPE(Sim::Instrument::PowerAction)

#endif // SIMINSTRUMENT_H
