// The GUI's real command functions against the simulator, family by family:
// the proof that client and server read each other's bytes alike. Also the
// measuring sequence as a poller sees it, and control-interface commands
// changing what the GUI reads.

#include "Commands/CalibrationOutCommands.h"
#include "Commands/CommunicationsOutCommands.h"
#include "Commands/JobOutCommands.h"
#include "Commands/MeasureOutCommands.h"
#include "Commands/ParametersOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "Commands/TargetingOutCommands.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/SystemStatus.h"
#include "SimServer.h"
#include "support/TestSupport.h"

#include <QFile>
#include <QSignalSpy>
#include <QTextCodec>
#include <QElapsedTimer>
#include <QtTest>

namespace {

QString g_activeJob;

Job findJob(const QVector<Job>& jobs, const QString& name)
{
    for (const Job& j : jobs)
        if (j.getName() == name)
            return j;
    return Job();
}

SystemStatus state()
{
    SystemStatus s;
    CmdOut_GetState(s);
    return s;
}

bool waitForState(SYSTEM_STATE_T wanted, int timeoutMs = 4000)
{
    QElapsedTimer t;
    t.start();
    while (t.elapsed() < timeoutMs) {
        if (state().getSystemState() == wanted)
            return true;
        QTest::qWait(20);
    }
    return false;
}

} // namespace

class TestSimCmdOut : public QObject
{
    Q_OBJECT

    std::unique_ptr<Sim::ServerThread> sim;
    QString dataDir;

    bool attach()
    {
        TcpClient* old = Commands::instance()->tcpClient();
        setIpAddress(QStringLiteral("127.0.0.1"));
        setIpPort(sim->port());
        QSignalSpy reconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpReconnected);
        Commands::Init();
        delete old;
        return reconnected.wait(5000);
    }

    bool startSim(quint16 port = 0)
    {
        sim.reset(new Sim::ServerThread);
        sim->options().port = port;
        sim->options().instrument.dataDir = dataDir;
        sim->options().instrument.timeScale = 0.2;
        sim->options().instrument.seed = 11;
        return sim->start() && attach();
    }

    // Measures into the job through the GUI's trigger; the poller's view of
    // the states seen on the way.
    QVector<SYSTEM_STATE_T> measure(const QString& job, STATUS_T* status = nullptr)
    {
        g_activeJob = job;
        QVector<SYSTEM_STATE_T> seen;
        const STATUS_T st = CmdOut_TriggerMeasurement();
        if (status)
            *status = st;
        if (st != 0)
            return seen;
        QElapsedTimer t;
        t.start();
        while (t.elapsed() < 4000) {
            const SYSTEM_STATE_T s = state().getSystemState();
            if (seen.isEmpty() || seen.last() != s)
                seen << s;
            if (s == STATE_INIT)
                break;
            QTest::qWait(20);
        }
        return seen;
    }

private slots:
    void initTestCase()
    {
        QTextCodec::setCodecForLocale(QTextCodec::codecForName("UTF-8"));
        StringTables::Init();   // the server's angle names are looked up there
        MeasureOut_SetActiveJobNameSource([] { return g_activeJob; });
        dataDir = TestSupport::makeTempDir(QStringLiteral("simcmdout"));
        QVERIFY(startSim());
        QCOMPARE(sim->control(QStringLiteral("place")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("outliers 0")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("panel white-solid")), QStringLiteral("OK"));
    }
    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
        Commands::Init();
        sim.reset();
    }

    void systemFamily()
    {
        const SystemStatus s = state();
        QCOMPARE(s.getSystemState(), STATE_INIT);
        QCOMPARE(s.getBatteryState(), BATTERY_DISCHARGING);
        QCOMPARE(s.getBatteryChargePercent(), 86);
        QCOMPARE(s.getWifiState(), WIFI_STATUS_CONNECTED);
        QCOMPARE(s.getWifiLevel(), 3);
        QVERIFY(s.getJobID() != 0 && s.getMeasureID() != 0);
        QVERIFY(qAbs(s.getSystemTime().secsTo(QDateTime::currentDateTime())) < 3);

        QString text;
        QCOMPARE(CmdOut_GetVersion(VERSION_SERVER, text), 0u);
        QVERIFY(!text.isEmpty());
        QCOMPARE(CmdOut_GetVersion(VERSION_GUI, text), STATUS_BAD_RESPONSE_STATUS);
        int id = 0;
        QCOMPARE(CmdOut_GetConfiguration(id, text), 0u);
        QCOMPARE(text, QStringLiteral("BIRCH"));
        QCOMPARE(id, int(MODEL_REFINISH_BIRCH));
        QCOMPARE(CmdOut_GetSerialNum(text), 0u);
        DEVICE_INFO_T info;
        QCOMPARE(CmdOut_GetDeviceInfo(info), 0u);
        QCOMPARE(info.serialNum, text);
        QCOMPARE(info.instrumentModel, QStringLiteral("BIRCH"));
        QVERIFY(!info.whitetileSerialNum.isEmpty());
        int capability = 0;
        QCOMPARE(CmdOut_GetCapability(QStringLiteral("WIFI"), capability), 0u);
        QCOMPARE(capability, 1);
        MEMORY_INFO_T mem;
        QCOMPARE(CmdOut_GetMemoryInfo(mem), 0u);
        QCOMPARE(mem.numJobs, 9);
        QVERIFY(mem.numMeasurements > 20 && mem.numMeasurements < mem.maxNumMeasurements);
        bool texture = false;
        QCOMPARE(CmdOut_GetTextureDisplayed(texture), 0u);
        QVERIFY(texture);
        QCOMPARE(CmdOut_SetInterfaceConfig(7), 0u);
        QCOMPARE(CmdOut_SetInterfaceConfig(99), STATUS_BAD_RESPONSE_STATUS);
        for (STATUS_T st : {CmdOut_GetBattery(), CmdOut_GetImageChannels(), CmdOut_GetSpectralChannels(),
                            CmdOut_PowerOffReset(POWER_STANDBY)})
            QCOMPARE(st, 0u);

        unsigned int level = 0;
        QCOMPARE(CmdOut_SetDisplayBrightness(55), 0u);
        QCOMPARE(CmdOut_GetDisplayBrightness(level), 0u);
        QCOMPARE(level, 55u);
        QCOMPARE(CmdOut_SetBeeperVolume(3), 0u);
        QCOMPARE(CmdOut_GetBeeperVolume(level), 0u);
        QCOMPARE(level, 3u);
        QVERIFY(state().getUSettingsBits() & (Sim::BIT_BRIGHTNESS | Sim::BIT_VOLUME));

        // No filter file on the instrument: status 5, which the GUI takes as none.
        QByteArray filter;
        QCOMPARE(CmdOut_GetFilter(filter), 0u);
        QVERIFY(filter.isEmpty());
        QFile f(dataDir + QStringLiteral("/Filter.xml"));
        QVERIFY(f.open(QIODevice::WriteOnly));
        f.write("<Filters ContentVersion=\"1\"/>");
        f.close();
        QCOMPARE(CmdOut_GetFilter(filter), 0u);
        QCOMPARE(filter, QByteArray("<Filters ContentVersion=\"1\"/>"));

        // Errors put in by a person come out in the GUI's list, and go.
        QCOMPARE(sim->control(QStringLiteral("error 2036")), QStringLiteral("OK"));
        QCOMPARE(state().getNumOfErrors(), 1);
        QVector<ERROR_DESCRIPTION_T> errors;
        QCOMPARE(CmdOut_GetErrorDescriptions(errors), 0u);
        QCOMPARE(errors.size(), 1);
        QCOMPARE(errors[0].errorID, 2036);
        QCOMPARE(errors[0].description, QStringLiteral("Error in shutter motor"));
        QVERIFY(qAbs(errors[0].time.secsTo(QDateTime::currentDateTime())) < 3);
        QCOMPARE(CmdOut_ResetErrorDescriptions(), 0u);
        QCOMPARE(CmdOut_GetErrorDescriptions(errors), 0u);
        QVERIFY(errors.isEmpty());
    }

    void jobFamily()
    {
        QVector<Job> jobs;
        QCOMPARE(CmdOut_GetJobInfos(jobs), 0u);
        QCOMPARE(jobs.size(), 9);
        const Job averaged = findJob(jobs, QStringLiteral("Job 2"));
        QCOMPARE(averaged.getDisplayName(), QStringLiteral("Rear bumper"));
        QCOMPARE(averaged.getJobAveragingMode(), JOB_AVG_MODE_SIMPLE_3);
        QCOMPARE(averaged.getJobState(), Sim::JOB_COMPLETE);
        QCOMPARE(averaged.getNumSamples(), 3);
        QCOMPARE(averaged.getNotes(), QStringLiteral("Customer car, measured before blending"));
        QVERIFY(averaged.getSample(0).getDBIndex() > 0);
        QVERIFY(averaged.getFileID().startsWith(QStringLiteral("LOCAL-")));
        const Job smc = findJob(jobs, QStringLiteral("Job 4"));
        QCOMPARE(smc.getJobAveragingMode(), JOB_AVG_MODE_SMC);
        QCOMPARE(smc.getJobSize(), 3u);
        QCOMPARE(smc.getMaxSamples(), 5);
        QCOMPARE(smc.getJobState(), Sim::JOB_OPEN);
        QCOMPARE(findJob(jobs, QStringLiteral("Job 7")).getJobState(), Sim::JOB_SYNCHRONISED);
        QVERIFY(findJob(jobs, QStringLiteral("Job 5")).isJobComplete());

        // A fresh job of the GUI leaves its mode open; the server decides.
        QCOMPARE(sim->control(QStringLiteral("param MEASUREMENT_MODE AVERAGE")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("param AVERAGING_NUMBER_OF_SAMPLES 5")), QStringLiteral("OK"));
        Job fresh;
        fresh.setName(QStringLiteral("Panel A"));
        fresh.setDisplayName(QStringLiteral("ドア 左"));
        fresh.setNotes(QStringLiteral("scratched"));
        QCOMPARE(fresh.getJobAveragingMode(), JOB_AVG_MODE_GUI);
        int index = 0;
        const quint16 jobIdBefore = quint16(state().getJobID());
        QCOMPARE(CmdOut_AddJob(fresh, index), 0u);
        QVERIFY(index > 0);
        QVERIFY(quint16(state().getJobID()) != jobIdBefore);
        Job read;
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Panel A"), read), 0u);
        QCOMPARE(read.getDBIndex(), index);
        QCOMPARE(read.getDisplayName(), QStringLiteral("ドア 左"));
        QCOMPARE(read.getNotes(), QStringLiteral("scratched"));
        QCOMPARE(read.getJobAveragingMode(), JOB_AVG_MODE_SIMPLE_5);
        QCOMPARE(read.getJobSize(), 5u);
        QVERIFY(read.isTagEditable());
        QCOMPARE(CmdOut_AddJob(fresh, index), 12u);   // the name is taken

        read.setName(QStringLiteral("Panel B"));
        QCOMPARE(CmdOut_EditJob(QStringLiteral("Panel A"), read), 0u);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Panel A"), read), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Panel B"), read), 0u);
        QCOMPARE(read.getDisplayName(), QStringLiteral("ドア 左"));
        QCOMPARE(CmdOut_EditJob(QStringLiteral("Nobody"), read), 10u);

        unsigned long webState = 0, percent = 0;
        QCOMPARE(CmdOut_GetJobInfoWeb(QStringLiteral("Job 7"), webState, percent), 0u);
        QCOMPARE(webState, 2008ul);
        QCOMPARE(percent, 100ul);

        QCOMPARE(CmdOut_DeleteSample(QStringLiteral("Job 1"), 2), 0u);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Job 1"), read), 0u);
        QCOMPARE(read.getNumSamples(), 2);
        QCOMPARE(read.getJobState(), Sim::JOB_OPEN);   // a deleted reading reopens the job
        QCOMPARE(CmdOut_SetJobSaved(QStringLiteral("Job 3")), 0u);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Job 3"), read), 0u);
        QCOMPARE(read.getJobState(), Sim::JOB_SAVED);
        QCOMPARE(CmdOut_DeleteJob(QStringLiteral("Panel B")), 0u);
        QCOMPARE(CmdOut_DeleteJob(QStringLiteral("Panel B")), 10u);
        QCOMPARE(sim->control(QStringLiteral("param MEASUREMENT_MODE NONE")), QStringLiteral("OK"));
    }

    void measuringSequenceAndSamples()
    {
        Job job;
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Job 8"), job), 0u);
        QCOMPARE(job.getNumSamples(), 0);
        state();   // take what changed so far
        const short measureBefore = state().getMeasureID();
        STATUS_T st = 99;
        const QVector<SYSTEM_STATE_T> seen = measure(QStringLiteral("Job 8"), &st);
        QCOMPARE(st, 0u);
        QCOMPARE(seen.first(), STATE_MEASURING);
        QCOMPARE(seen.last(), STATE_INIT);
        QVERIFY(seen.contains(STATE_CALCULATING));
        // The measure identifier has moved, and the job is named as changed
        // (in the state reply that saw the end, which the loop above took).
        QVERIFY(state().getMeasureID() != measureBefore);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Job 8"), job), 0u);
        QCOMPARE(job.getNumSamples(), 1);

        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, QStringLiteral("Job 8"), 1), 0u);
        QVERIFY(sample.getColorFilledIn());
        QCOMPARE(sample.getNumAngleCurves(), 6u);
        QCOMPARE(sample.getSampleInfo().dbIndex, job.getSample(0).getSampleInfo().dbIndex);
        QCOMPARE(sample.getJobFileID(), QStringLiteral("Job 8"));
        const LAB_T lab = sample.getLab(REFL_D45_45);
        QVERIFY(lab.l > 90.0 && qAbs(lab.a) < 3.0);
        QCOMPARE(sample.getLch(REFL_D45_45).l, lab.l);
        QVERIFY(qAbs(sample.getLch(REFL_D45_110).c - std::hypot(sample.getLab(REFL_D45_110).a, sample.getLab(REFL_D45_110).b)) < 1e-3);
        QVERIFY(sample.getRefl(REFL_D45_45, WAVELENGTH_550) > 0.8);
        QCOMPARE(sample.getSampleThumbnail(IMAGE_15).size(), QSize(44, 44));
        QCOMPARE(sample.getPressureSwitch().Switch2, 1u);
        QVERIFY(qAbs(sample.getTimeStamp().secsTo(QDateTime::currentDateTime())) < 5);

        QByteArray image;
        QCOMPARE(CmdOut_GetAngleFullImage(IMAGE_DIFFUSE, QStringLiteral("Job 8"), 1, image), 0u);
        QCOMPARE(image.size(), 236 * 292 * 3);
        TEXTURE_T texture;
        QCOMPARE(CmdOut_GetAngleTexture(IMAGE_15, QStringLiteral("Job 8"), 1, texture), 0u);
        QCOMPARE(texture.description, QStringLiteral("Texture r15as15"));
        QVector<TEXTURE_PARAMETER_T> parameters;
        QCOMPARE(CmdOut_GetAngleTextureParameters(IMAGE_45, QStringLiteral("Job 8"), 1, parameters), 0u);
        QCOMPARE(parameters.size(), 5);
        QCOMPARE(parameters[0].name, QStringLiteral("SA"));

        QCOMPARE(CmdOut_GetRefinishSample(sample, QStringLiteral("Job 8"), 9), 1065u);
        QCOMPARE(CmdOut_GetRefinishSample(sample, QStringLiteral("Nope"), 1), 10u);
        QCOMPARE(CmdOut_GetAngleFullImage(IMAGE_15, QStringLiteral("Job 8"), 9, image), STATUS_BAD_RESPONSE_STATUS);

        // The averaged result, and the running mean of an open SMC job.
        Sample avg;
        QCOMPARE(CmdOut_GetRefinishSample(avg, QStringLiteral("Job 2"), 255), 0u);
        QVERIFY(avg.getColorFilledIn());
        Sample running;
        QCOMPARE(CmdOut_GetRefinishSample(running, QStringLiteral("Job 4"), 255), 2001u);
        QVERIFY(running.getColorFilledIn());

        // The latest reading by the empty name, and the measurement functions
        // that only check for an answer.
        Sample latest;
        QCOMPARE(CmdOut_GetRefinishSample(latest, QString(), 0), 0u);
        QCOMPARE(latest.getSampleInfo().dbIndex, sample.getSampleInfo().dbIndex);
        QCOMPARE(CmdOut_GetSpectralResult(), 0u);
        QCOMPARE(CmdOut_GetImageResult(), 0u);
        QCOMPARE(sim->control(QStringLiteral("temperature 28.5")), QStringLiteral("OK"));
        float temperature = 0.0f;
        QCOMPARE(CmdOut_GetTemperature(temperature, 3), 0u);
        QCOMPARE(temperature, 28.5f);
    }

    void averagingOutcomesThroughTheLink()
    {
        // SMC 3:4 by the server's defaults, one reading from another panel.
        QCOMPARE(sim->control(QStringLiteral("param MEASUREMENT_MODE SMC")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("param SMC_MAX_MEASUREMENTS 4")), QStringLiteral("OK"));
        Job fresh;
        fresh.setName(QStringLiteral("Smc"));
        int index = 0;
        QCOMPARE(CmdOut_AddJob(fresh, index), 0u);
        for (const char* panel : {"white-solid", "red-solid", "white-solid"}) {
            sim->control(QStringLiteral("panel %1").arg(QLatin1String(panel)));
            QCOMPARE(measure(QStringLiteral("Smc")).last(), STATE_INIT);
        }
        Job job;
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Smc"), job), 0u);
        QCOMPARE(job.getJobAveragingMode(), JOB_AVG_MODE_SMC);
        QCOMPARE(job.getJobState(), Sim::JOB_OPEN);
        QCOMPARE(job.getNumSamples(), 3);
        sim->control(QStringLiteral("panel blue-metallic"));
        QCOMPARE(measure(QStringLiteral("Smc")).last(), STATE_INIT);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Smc"), job), 0u);
        QCOMPARE(job.getJobState(), Sim::JOB_SMC_MAX_USED);
        QVERIFY(job.isJobComplete());
        STATUS_T st = 0;
        measure(QStringLiteral("Smc"), &st);
        QCOMPARE(st, 1066u);   // an ended job takes no more readings

        // Force-finish with "Store Average".
        QCOMPARE(CmdOut_ForceFinishSMC(QStringLiteral("Job 4")), 0u);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Job 4"), job), 0u);
        QCOMPARE(job.getJobState(), Sim::JOB_SMC_FORCED);
        Sample avg;
        QCOMPARE(CmdOut_GetRefinishSample(avg, QStringLiteral("Job 4"), 255), 0u);
        QCOMPARE(CmdOut_ForceFinishSMC(QStringLiteral("Job 4")), STATUS_BAD_RESPONSE_STATUS);

        // Simple averaging of 3.
        sim->control(QStringLiteral("panel white-solid"));
        QCOMPARE(sim->control(QStringLiteral("param MEASUREMENT_MODE AVERAGE")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("param AVERAGING_NUMBER_OF_SAMPLES 3")), QStringLiteral("OK"));
        fresh.setName(QStringLiteral("Avg3"));
        QCOMPARE(CmdOut_AddJob(fresh, index), 0u);
        for (int i = 0; i < 3; ++i)
            QCOMPARE(measure(QStringLiteral("Avg3")).last(), STATE_INIT);
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Avg3"), job), 0u);
        QCOMPARE(job.getJobAveragingMode(), JOB_AVG_MODE_SIMPLE_3);
        QCOMPARE(job.getJobState(), Sim::JOB_COMPLETE);
        QCOMPARE(CmdOut_GetRefinishSample(avg, QStringLiteral("Avg3"), 255), 0u);
        QCOMPARE(sim->control(QStringLiteral("param MEASUREMENT_MODE NONE")), QStringLiteral("OK"));
    }

    void targetingFamily()
    {
        QCOMPARE(sim->control(QStringLiteral("switches 110")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("tilt 25")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_StartTargetingMode(), 0u);
        QCOMPARE(state().getSystemState(), STATE_TARGETING);
        PRESSURE_SWITCH_T pressure;
        ACCELEROMETER_ORIENTATION_T orientation;
        CALIBRATION_STATUS_T calibration = CALIBRATION_STATUS_REQUIRED;
        QByteArray first, second;
        QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, first), 0u);
        QCOMPARE(first.size(), 503208);
        QCOMPARE(pressure.Switch1, 1u);
        QCOMPARE(pressure.Switch2, 1u);
        QCOMPARE(pressure.Switch3, 0u);
        QCOMPARE(orientation.OrientationPosition, 25);
        QCOMPARE(calibration, CALIBRATION_STATUS_GOOD);
        // The live image moves on with time; a slow machine may need more
        // than one look before it has.
        QElapsedTimer waited;
        waited.start();
        do {
            QTest::qWait(100);
            QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, second), 0u);
        } while (first == second && waited.elapsed() < 5000);
        QVERIFY(first != second);
        QCOMPARE(CmdOut_GetPressureSensor(pressure), 0u);
        QCOMPARE(pressure.Switch3, 0u);
        QCOMPARE(CmdOut_GetInstrumentOrientation(orientation), 0u);
        QCOMPARE(orientation.OrientationPosition, 25);
        QCOMPARE(CmdOut_GetPreviewImage(first), 0u);
        QCOMPARE(first.size(), 503208);
        QCOMPARE(CmdOut_StopTargetingMode(), 0u);
        QCOMPARE(state().getSystemState(), STATE_INIT);

        // Busy: targeting is refused with 14 until it has passed.
        QCOMPARE(sim->control(QStringLiteral("busy 1")), QStringLiteral("OK"));
        QCOMPARE(state().getSystemState(), STATE_BUSY);
        QCOMPARE(CmdOut_StartTargetingMode(), 14u);
        QVERIFY(waitForState(STATE_INIT, 3000));
        QCOMPARE(CmdOut_StartTargetingMode(), 0u);
        QCOMPARE(CmdOut_StopTargetingMode(), 0u);
        QCOMPARE(sim->control(QStringLiteral("place")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("tilt 0")), QStringLiteral("OK"));
    }

    void calibrationFamily()
    {
        CALIBRATION_STATE_T cal;
        QCOMPARE(CmdOut_GetCalibrationState(cal), 0u);
        QVERIFY(cal.nextExternalWhiteCal > 5 * 3600 && cal.nextExternalWhiteCal <= 6 * 3600 + 60);
        QVERIFY(cal.lastExternalWhiteCal.isValid());
        QVERIFY(cal.nextInternalWhiteCal > 0);
        QCOMPARE(CmdOut_SetCalibrationSettings(), 0u);

        // Expired: measurements refused, the reason in the error list.
        QVERIFY(sim->control(QStringLiteral("calibration expire")).startsWith(QStringLiteral("OK")));
        QCOMPARE(CmdOut_GetCalibrationState(cal), 0u);
        QCOMPARE(cal.nextExternalWhiteCal, 0);
        CmdOut_ResetErrorDescriptions();
        STATUS_T st = 0;
        measure(QStringLiteral("Job"), &st);
        QCOMPARE(st, 2044u);
        QVector<ERROR_DESCRIPTION_T> errors;
        QCOMPARE(CmdOut_GetErrorDescriptions(errors), 0u);
        QCOMPARE(errors.size(), 1);
        QCOMPARE(errors[0].errorID, 2044);

        // Off the tile the calibration fails; on it, it renews the clock.
        CmdOut_ResetErrorDescriptions();
        QCOMPARE(sim->control(QStringLiteral("lift")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_TriggerCalibration(), 0u);
        QCOMPARE(state().getSystemState(), STATE_CALIBRATING);
        QVERIFY(waitForState(STATE_INIT));
        QCOMPARE(CmdOut_GetErrorDescriptions(errors), 0u);
        QCOMPARE(errors.size(), 1);
        QCOMPARE(errors[0].errorID, 2001);
        CmdOut_ResetErrorDescriptions();
        QCOMPARE(sim->control(QStringLiteral("place")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_TriggerCalibration(), 0u);
        QVERIFY(waitForState(STATE_INIT));
        QCOMPARE(state().getNumOfErrors(), 0);
        QCOMPARE(CmdOut_GetCalibrationState(cal), 0u);
        QVERIFY(cal.nextExternalWhiteCal >= 8 * 3600 - 2);

        // The reference check is a measurement without a job.
        QCOMPARE(CmdOut_TriggerReferenceCheck(), 0u);
        QCOMPARE(state().getSystemState(), STATE_MEASURING);
        QVERIFY(waitForState(STATE_INIT));
        bool passed = false;
        QCOMPARE(CmdOut_ReferenceCheck(passed), 0u);
        QVERIFY(passed);
        QCOMPARE(sim->control(QStringLiteral("refcheck fail")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_TriggerReferenceCheck(), 0u);
        QVERIFY(waitForState(STATE_INIT));
        QCOMPARE(CmdOut_ReferenceCheck(passed), 0u);
        QVERIFY(!passed);
        QCOMPARE(sim->control(QStringLiteral("refcheck auto")), QStringLiteral("OK"));
    }

    void selfTestFamily()
    {
        QVector<TEST> tests;
        QCOMPARE(CmdOut_GetSelfTestList(tests), 0u);
        QCOMPARE(tests.size(), 7);
        QCOMPARE(tests[0].description, QStringLiteral("WHITE TRANSFER"));
        QCOMPARE(tests[3].deviceLocation, quint32(SELF_TEST_EFFECT_TILE));
        QCOMPARE(tests[6].num, 6u);
        QCOMPARE(sim->control(QStringLiteral("lift")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_TriggerSelfTest(5), 0u);
        unsigned int result = 99;
        QCOMPARE(CmdOut_GetSelfTestResult(5, result), 0u);
        QCOMPARE(result, 0u);
        QVERIFY(waitForState(STATE_INIT));
        QCOMPARE(CmdOut_GetSelfTestResult(5, result), 0u);
        QCOMPARE(result, 1u);
        QCOMPARE(CmdOut_GetSelfTestResult(40, result), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(CmdOut_RunSelfTest(), 0u);
        QVERIFY(waitForState(STATE_INIT));
        QCOMPARE(sim->control(QStringLiteral("place")), QStringLiteral("OK"));
    }

    void parameterFamily()
    {
        PARAMETER_CONTENT_TYPES v;
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DEFAULT_JOB_NAME, v), 0u);
        QCOMPARE(v.parameterString, QStringLiteral("NEW JOB"));
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DISPLAYED_SPECTRAL_CHANNELS, v), 0u);
        QCOMPARE(v.paramterStringList.size(), 6);
        QCOMPARE(v.paramterStringList.first(), QStringLiteral("r45as-15"));
        QCOMPARE(CmdOut_GetParameter(PARAMETER_SAMPLE_TEMP_LIMIT_HIGH, v), 0u);
        QCOMPARE(v.parameterFloat, 35.0f);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_NUMBER_FORMAT, v), 0u);
        QCOMPARE(v.parameterString, QStringLiteral(".##"));
        QCOMPARE(CmdOut_GetParameter(PARAMETER_WEBSERVER_ADDRESS, v), 0u);
        QVERIFY(v.parameterString.startsWith(QStringLiteral("http")));
        // Every key of the table reads without a hitch.
        for (int key = 0; key <= 65516; ++key) {
            if (CmdOut_ParameterContentKind(key) == PARAMETER_CONTENT_NONE)
                continue;
            PARAMETER_CONTENT_TYPES any;
            QVERIFY2(CmdOut_GetParameter(PARAMETER_TYPE_T(key), any) == 0u, qPrintable(QString::number(key)));
        }

        state();
        v.parameterInt = 1;
        QCOMPARE(CmdOut_SetParameter(PARAMETER_AUTO_MEASURE, v), 0u);
        QVERIFY(state().getUSettingsBits() & Sim::BIT_AUTO_MEASURE);
        v.parameterString = QStringLiteral("新しい仕事");
        QCOMPARE(CmdOut_SetParameter(PARAMETER_DEFAULT_JOB_NAME, v), 0u);
        PARAMETER_CONTENT_TYPES back;
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DEFAULT_JOB_NAME, back), 0u);
        QCOMPARE(back.parameterString, QStringLiteral("新しい仕事"));
        v.parameterString = QStringLiteral("http://elsewhere");
        QCOMPARE(CmdOut_SetParameter(PARAMETER_WEBSERVER_ADDRESS, v), 0u);   // the key alone: no change
        QCOMPARE(CmdOut_GetParameter(PARAMETER_WEBSERVER_ADDRESS, back), 0u);
        QVERIFY(back.parameterString != v.parameterString);
        v.paramterStringList = QStringList{QStringLiteral("r45as45")};
        QCOMPARE(CmdOut_SetParameter(PARAMETER_DISPLAYED_CHANNELS, v), 0u);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DISPLAYED_CHANNELS, back), 0u);
        QCOMPARE(back.paramterStringList, v.paramterStringList);
        v.parameterFloat = 2.5f;
        QCOMPARE(CmdOut_SetParameter(PARAMETER_AUTO_MEASURE_TIMEOUT, v), 0u);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_AUTO_MEASURE_TIMEOUT, back), 0u);
        QCOMPARE(back.parameterFloat, 2.5f);
        QCOMPARE(CmdOut_SetParametersToDefaults(), 0u);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_AUTO_MEASURE, back), 0u);
        QCOMPARE(back.parameterInt, 0);

        QVector<TAG_ITEM_T> languages;
        QCOMPARE(CmdOut_GetLanguages(languages), 0u);
        QCOMPARE(languages.size(), 10);
        QCOMPARE(languages[6].tagID, QStringLiteral("ja"));
        QCOMPARE(languages[6].tagText, QStringLiteral("日本語"));

        // Web sync of a finished job, followed as the GUI does.
        v.parameterString = QStringLiteral("Job 5");
        QCOMPARE(CmdOut_SetParameter(PARAMETER_SYNC_JOB_TO_WEBSERVER, v), 0u);
        unsigned long webState = 0, percent = 0;
        QElapsedTimer t;
        t.start();
        while (webState != 2008 && t.elapsed() < 5000) {
            QCOMPARE(CmdOut_GetJobInfoWeb(QStringLiteral("Job 5"), webState, percent), 0u);
            QTest::qWait(50);
        }
        QCOMPARE(webState, 2008ul);
        QCOMPARE(percent, 100ul);
    }

    void wifiFamily()
    {
        QVector<NETWORK_DESCRIPTION_T> nets;
        QCOMPARE(CmdOut_GetWifiSettings(nets), 0u);
        bool connectedKnown = false, unknownOpen = false;
        for (const NETWORK_DESCRIPTION_T& n : nets) {
            connectedKnown = connectedKnown || (n.Connected && n.Known && n.SSID == QStringLiteral("Workshop-AP"));
            unknownOpen = unknownOpen || (!n.Known && n.Authentication == QStringLiteral("OPEN") && !n.EncryptionKey);
        }
        QVERIFY(connectedKnown);
        QVERIFY(unknownOpen);
        QString text;
        QCOMPARE(CmdOut_GetIpAddress(text), 0u);
        QVERIFY(text.endsWith(QStringLiteral(" dynamic")));
        QCOMPARE(CmdOut_GetConnectedWifiSSID(text), 0u);
        QCOMPARE(text, QStringLiteral("Workshop-AP"));

        QCOMPARE(CmdOut_TriggerWifiScan(), 0u);
        QCOMPARE(CmdOut_TriggerWifiScan(), STATUS_SERVER_BUSY);   // 19 comes back as 769
        QTest::qWait(400);

        NETWORK_DESCRIPTION_T lab;
        lab.SSID = QStringLiteral("Paint-Lab");
        lab.Authentication = QStringLiteral("WPA2-PSK");
        QCOMPARE(CmdOut_AddWifiSetting(lab, QStringLiteral("guess"), 0), 0u);
        int result = -1;
        QElapsedTimer t;
        t.start();
        STATUS_T st = 0;
        while ((st = CmdOut_VerifyWifiSettings(lab.SSID, &result)) != 0 && t.elapsed() < 5000)
            QTest::qWait(50);
        QCOMPARE(st, 0u);
        QCOMPARE(result, 1);   // wrong key
        QCOMPARE(CmdOut_AddWifiSetting(lab, QStringLiteral("spectro2024"), 1), 0u);
        while ((st = CmdOut_VerifyWifiSettings(lab.SSID, &result)) != 0 && t.elapsed() < 10000)
            QTest::qWait(50);
        QCOMPARE(result, 0);
        QCOMPARE(CmdOut_GetConnectedWifiSSID(text), 0u);
        QCOMPARE(text, QStringLiteral("Paint-Lab"));
        QCOMPARE(CmdOut_DeleteWifiSetting(QStringLiteral("Paint-Lab")), 0u);
        QCOMPARE(CmdOut_DeleteWifiSetting(QStringLiteral("Paint-Lab")), STATUS_SERVER_BUSY);
        QTest::qWait(400);
        QCOMPARE(CmdOut_DeleteWifiSetting(QStringLiteral("Paint-Lab")), STATUS_BAD_RESPONSE_STATUS);

        QCOMPARE(CmdOut_SetEnableWifi(false), 0u);
        QCOMPARE(state().getWifiState(), WIFI_STATUS_OFF);
        QTest::qWait(300);
        QCOMPARE(CmdOut_SetEnableWifi(true), 0u);
        QCOMPARE(CmdOut_SetEnableWifi(false), STATUS_SERVER_BUSY);
        QElapsedTimer on;
        on.start();
        while (state().getWifiState() != WIFI_STATUS_CONNECTED && on.elapsed() < 3000)
            QTest::qWait(50);
        QCOMPARE(state().getWifiState(), WIFI_STATUS_CONNECTED);
        QCOMPARE(CmdOut_GetWIFISettings(), 0u);
        QCOMPARE(CmdOut_SetWIFISettings(), STATUS_BAD_RESPONSE_STATUS);   // code 0 is no command
    }

    void controlChangesWhatTheGuiReads()
    {
        QCOMPARE(sim->control(QStringLiteral("lock")), QStringLiteral("OK"));
        QCOMPARE(state().getSystemState(), STATE_LOCK);
        QCOMPARE(sim->control(QStringLiteral("unlock")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("battery 40 charging-usb")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("usb connected")), QStringLiteral("OK"));
        SystemStatus s = state();
        QCOMPARE(s.getSystemState(), STATE_INIT);
        QCOMPARE(s.getBatteryState(), BATTERY_STATUS_CHARGING_USB);
        QCOMPARE(s.getBatteryChargePercent(), 40);
        QCOMPARE(s.getUSBState(), USB_STATUS_CONNECTED);
        QCOMPARE(sim->control(QStringLiteral("wifi level 0.2")), QStringLiteral("OK"));
        QCOMPARE(state().getWifiLevel(), 1);

        QCOMPARE(sim->control(QStringLiteral("message Tile needs cleaning")), QStringLiteral("OK"));
        QVERIFY(state().getUSettingsBits() & Sim::BIT_TEXT_MESSAGE);
        PARAMETER_CONTENT_TYPES v;
        QCOMPARE(CmdOut_GetParameter(PARAMETER_TEXT_MESSAGE, v), 0u);
        QCOMPARE(v.parameterString, QStringLiteral("Tile needs cleaning"));

        QVERIFY(sim->control(QStringLiteral("online start Remote avg3")).startsWith(QStringLiteral("OK Remote")));
        s = state();
        QVERIFY(s.getUSettingsBits() & Sim::BIT_ONLINE_JOB);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_ONLINE_MODE_JOB, v), 0u);
        QCOMPARE(v.parameterString, QStringLiteral("Remote"));
        Job remote;
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Remote"), remote), 0u);
        QVERIFY(!remote.isTagEditable());
        QCOMPARE(sim->control(QStringLiteral("request refcheck")), QStringLiteral("OK"));
        QVERIFY(state().getUSettingsBits() & Sim::BIT_WHITE_TRANSFER);
        QCOMPARE(CmdOut_GetParameter(PARAMETER_WHITE_TRANSFER_REQUEST, v), 0u);
        QCOMPARE(v.parameterInt, 2);

        // Entity changes come with the state that follows the change.
        sim->control(QStringLiteral("fail-next 2036"));
        measure(QStringLiteral("Remote"));
        QCOMPARE(state().getNumOfErrors(), 1);
        CmdOut_ResetErrorDescriptions();
        state();
        measure(QStringLiteral("Remote"));
        bool named = false;
        QCOMPARE(sim->control(QStringLiteral("job-state Remote 2004")), QStringLiteral("OK"));
        for (const SystemStatus::EntityChange& e : state().getEntityChanges())
            named = named || (e.entity == 1007 && e.identifier1 == QStringLiteral("Remote") && e.change == 2);
        QVERIFY(named);

        QCOMPARE(sim->control(QStringLiteral("refuse 0x400A0B10 2036")), QStringLiteral("OK"));
        QString serial;
        QCOMPARE(CmdOut_GetSerialNum(serial), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(sim->control(QStringLiteral("refuse off")), QStringLiteral("OK"));
        QCOMPARE(CmdOut_GetSerialNum(serial), 0u);

        // A dropped link: the next command fails, the client comes back.
        QCOMPARE(sim->control(QStringLiteral("drop")), QStringLiteral("OK"));
        QTest::qWait(100);
        QVERIFY(CmdOut_GetSerialNum(serial) != 0u);
        QVERIFY(attach());
        QCOMPARE(CmdOut_GetSerialNum(serial), 0u);
    }

    void survivesARestart()
    {
        Job fresh;
        fresh.setName(QStringLiteral("Kept"));
        int index = 0;
        QCOMPARE(CmdOut_AddJob(fresh, index), 0u);
        QCOMPARE(measure(QStringLiteral("Kept")).last(), STATE_INIT);
        Sample before;
        QCOMPARE(CmdOut_GetRefinishSample(before, QStringLiteral("Kept"), 1), 0u);
        unsigned int level = 0;
        QCOMPARE(CmdOut_SetDisplayBrightness(21), 0u);

        const quint16 port = sim->port();
        sim.reset();
        QVERIFY(startSim(port));
        Job job;
        QCOMPARE(CmdOut_GetJobInfo(QStringLiteral("Kept"), job), 0u);
        QCOMPARE(job.getDBIndex(), index);
        QCOMPARE(job.getNumSamples(), 1);
        Sample after;
        QCOMPARE(CmdOut_GetRefinishSample(after, QStringLiteral("Kept"), 1), 0u);
        for (int w = 0; w < NUM_WAVELENGTHS; ++w)
            QCOMPARE(after.getRefl(REFL_D45_45, w), before.getRefl(REFL_D45_45, w));
        QCOMPARE(after.getLab(REFL_D45_15).l, before.getLab(REFL_D45_15).l);
        QCOMPARE(CmdOut_GetDisplayBrightness(level), 0u);
        QCOMPARE(level, 21u);
        QVector<Job> jobs;
        QCOMPARE(CmdOut_GetJobInfos(jobs), 0u);
        QVERIFY(!findJob(jobs, QStringLiteral("Smc")).getName().isEmpty());
    }

    void theLargerModel()
    {
        Sim::ServerThread alder;
        alder.options().instrument.dataDir = TestSupport::makeTempDir(QStringLiteral("simalder"));
        alder.options().instrument.model = Sim::Model::Alder;
        alder.options().instrument.timeScale = 0.2;
        QVERIFY(alder.start());
        const quint16 port = sim->port();
        setIpPort(alder.port());
        TcpClient* old = Commands::instance()->tcpClient();
        QSignalSpy reconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpReconnected);
        Commands::Init();
        delete old;
        QVERIFY(reconnected.wait(5000));

        int id = 0;
        QString text;
        QCOMPARE(CmdOut_GetConfiguration(id, text), 0u);
        QCOMPARE(text, QStringLiteral("ALDER"));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, QStringLiteral("Job 1"), 1), 0u);
        QCOMPARE(sample.getNumAngleCurves(), 11u);
        QVERIFY(sample.getLab(REFL_D15_NEG_45).l > 0.0);
        QVERIFY(!sample.getSampleThumbnail(IMAGE_80).isNull());
        QByteArray image;
        QCOMPARE(CmdOut_GetAngleFullImage(IMAGE_DIFFUSE, QStringLiteral("Job 1"), 1, image),
                 STATUS_BAD_RESPONSE_STATUS);   // five cameras, no diffuse one
        PARAMETER_CONTENT_TYPES v;
        QCOMPARE(CmdOut_GetParameter(PARAMETER_DISPLAYED_IMAGE_CHANNELS, v), 0u);
        QCOMPARE(v.paramterStringList.size(), 5);

        setIpPort(port);
        QVERIFY(attach());
    }
};

QTEST_MAIN(TestSimCmdOut)
#include "tst_simcmdout.moc"
