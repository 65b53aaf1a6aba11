// The simulated instrument on its own: the measuring state sequence, the
// averaging rules, refusals, calibration, self tests, settings bits, Wi-Fi,
// web sync and persistence across a restart.

#include "SimInstrument.h"
#include "SimSpectra.h"
#include "support/TestSupport.h"

#include <QtTest>

#include <memory>

using namespace Sim;

namespace {

const double kScale = 0.2;   // every operation five times faster

std::unique_ptr<Instrument> makeInstrument(const QString& dir, Model model = Model::Birch)
{
    Instrument::Options o;
    o.dataDir = dir;
    o.model = model;
    o.timeScale = kScale;
    o.seed = 7;
    std::unique_ptr<Instrument> ins(new Instrument(o));
    if (!ins->open())
        return nullptr;
    ins->setOutlierRate(0.0);
    return ins;
}

JobBook::Description description(const QString& name, const QString& mode, int size, int max = 0)
{
    JobBook::Description d;
    d.name = name;
    d.modeText = mode;
    d.size = size;
    d.spare = max;
    d.tags = {{QStringLiteral("DisplayName"), name}};
    return d;
}

// Runs one measurement to its end; false if it did not start or not end.
bool measure(Instrument& ins, const QString& job, STATUS_T* status = nullptr)
{
    const STATUS_T st = ins.triggerMeasurement(job);
    if (status)
        *status = st;
    if (st != ST_OK)
        return false;
    QElapsedTimer t;
    t.start();
    while (ins.state() != STATE_INIT && t.elapsed() < 5000)
        QTest::qWait(10);
    return ins.state() == STATE_INIT;
}

ParamValue intParam(int v)
{
    ParamValue p;
    p.type = ParamType::Int;
    p.i = v;
    return p;
}

ParamValue textParam(const QString& s)
{
    ParamValue p;
    p.type = ParamType::Text;
    p.s = s;
    return p;
}

} // namespace

class TestSimInstrument : public QObject
{
    Q_OBJECT

    std::unique_ptr<Instrument> ins;

private slots:
    void init()
    {
        ins = makeInstrument(TestSupport::makeTempDir(QStringLiteral("siminstrument")));
        QVERIFY(ins);
        ins->setSwitches(true, true, true);
        ins->setPanel(QStringLiteral("white-solid"));
    }
    void cleanup() { ins.reset(); }

    void demoSetHoldsJobsInEveryState()
    {
        QSet<int> states;
        bool averaged = false, emptyOpen = false, smcOpen = false;
        for (const Job& j : ins->jobs().jobs()) {
            states << j.state;
            averaged = averaged || (j.mode == JOB_AVG_MODE_SIMPLE_3 && j.hasAverage);
            emptyOpen = emptyOpen || (j.state == JOB_OPEN && j.samples.isEmpty());
            smcOpen = smcOpen || (j.mode == JOB_AVG_MODE_SMC && j.state == JOB_OPEN && !j.samples.isEmpty());
            for (const Sample& s : j.samples) {
                QCOMPARE(s.numAngles, 6);
                QCOMPARE(s.refl.size(), 6 * NUM_WAVELENGTHS);
                QCOMPARE(s.labch.size(), 6 * 5);
            }
        }
        for (int s : {JOB_OPEN, JOB_COMPLETE, JOB_SMC_MAX_USED, JOB_SMC_FORCED, JOB_SYNCHRONISED})
            QVERIFY2(states.contains(s), qPrintable(QString::number(s)));
        QVERIFY(averaged);
        QVERIFY(emptyOpen);
        QVERIFY(smcOpen);
    }

    void measuringSequenceAsSeenByAPoller()
    {
        QVERIFY(ins->addJob(description(QStringLiteral("Door"), QStringLiteral("NONE"), 3), nullptr) == ST_OK);
        ins->takeStatus();
        const quint16 measureBefore = ins->changes().measureId();
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("Door")), ST_OK);

        QVector<SYSTEM_STATE_T> seen;
        QVector<int> percents;
        bool idChangedWhileBusy = false;
        QElapsedTimer t;
        t.start();
        while (t.elapsed() < 3000) {
            const Instrument::StatusReply r = ins->takeStatus();
            if (seen.isEmpty() || seen.last() != r.state)
                seen << r.state;
            if (r.state == STATE_MEASURING)
                percents << r.percent;
            if (r.state != STATE_INIT && r.measureId != measureBefore)
                idChangedWhileBusy = true;
            if (r.state == STATE_INIT) {
                QVERIFY(r.measureId != measureBefore);
                QCOMPARE(r.entities.size(), 1);
                QCOMPARE(r.entities[0].entity, ENTITY_JOB);
                QCOMPARE(r.entities[0].identifier, QStringLiteral("Door"));
                QCOMPARE(r.entities[0].change, CHANGE_MODIFIED);
                break;
            }
            QTest::qWait(10);
        }
        QCOMPARE(seen, (QVector<SYSTEM_STATE_T>{STATE_MEASURING, STATE_CALCULATING, STATE_INIT}));
        QVERIFY(!idChangedWhileBusy);
        QVERIFY(percents.size() > 5);
        QVERIFY(std::is_sorted(percents.begin(), percents.end()));
        QVERIFY(percents.last() > 80);
        // About 1.5 s measuring and 0.3 s calculating, scaled.
        QVERIFY(t.elapsed() >= int(1800 * kScale) - 20);
        QCOMPARE(ins->jobs().find(QStringLiteral("Door"))->samples.size(), 1);
        // Entity changes are handed out once.
        QVERIFY(ins->takeStatus().entities.isEmpty());
    }

    void simpleAveragingProducesSample255()
    {
        QCOMPARE(ins->addJob(description(QStringLiteral("Avg"), QStringLiteral("AVERAGE"), 3), nullptr), ST_OK);
        Sample s;
        QVERIFY(measure(*ins, QStringLiteral("Avg")));
        QVERIFY(measure(*ins, QStringLiteral("Avg")));
        QVERIFY(!ins->sample(QStringLiteral("Avg"), AVERAGE_SAMPLE, &s, nullptr));
        QCOMPARE(ins->jobs().find(QStringLiteral("Avg"))->state, JOB_OPEN);
        QVERIFY(measure(*ins, QStringLiteral("Avg")));
        const Job* job = ins->jobs().find(QStringLiteral("Avg"));
        QCOMPARE(job->state, JOB_COMPLETE);
        STATUS_T dataStatus = 99;
        QVERIFY(ins->sample(QStringLiteral("Avg"), AVERAGE_SAMPLE, &s, &dataStatus));
        QCOMPARE(dataStatus, ST_OK);
        for (int i : {0, 17, 6 * NUM_WAVELENGTHS - 1}) {
            const double mean = (job->samples[0].refl[i] + job->samples[1].refl[i] + job->samples[2].refl[i]) / 3.0;
            QVERIFY(qAbs(s.refl[i] - mean) < 1e-6);
        }
        STATUS_T st = 0;
        QVERIFY(!measure(*ins, QStringLiteral("Avg"), &st));
        QCOMPARE(st, ST_JOB_CLOSED);
    }

    void smcCompletesWithGoodReadingsAndEndsWhenMaxIsUsed()
    {
        // 3:4 with a stray reading in the middle: three good ones complete it.
        QCOMPARE(ins->addJob(description(QStringLiteral("SmcOk"), QStringLiteral("SMC"), 3, 4), nullptr), ST_OK);
        for (const char* panel : {"white-solid", "red-solid", "white-solid", "white-solid"}) {
            ins->setPanel(QString::fromLatin1(panel));
            QVERIFY(measure(*ins, QStringLiteral("SmcOk")));
        }
        const Job* ok = ins->jobs().find(QStringLiteral("SmcOk"));
        QCOMPARE(ok->state, JOB_COMPLETE);
        QCOMPARE(ok->goodCount(), 3);
        QVERIFY(!ok->samples[1].good);
        QVERIFY(ok->hasAverage);
        // The average is that of the good readings only: white, not pinkish.
        QVERIFY(ok->average.labch[1] < 2.0f);

        // 3:4 with two strays: n is used up first.
        QCOMPARE(ins->addJob(description(QStringLiteral("SmcMax"), QStringLiteral("SMC"), 3, 4), nullptr), ST_OK);
        Sample running;
        STATUS_T dataStatus = 0;
        for (const char* panel : {"white-solid", "white-solid", "red-solid", "blue-metallic"}) {
            ins->setPanel(QString::fromLatin1(panel));
            QVERIFY(measure(*ins, QStringLiteral("SmcMax")));
            if (ins->jobs().find(QStringLiteral("SmcMax"))->state == JOB_OPEN) {
                // While open, sample 255 is the running mean of the good readings.
                QVERIFY(ins->sample(QStringLiteral("SmcMax"), AVERAGE_SAMPLE, &running, &dataStatus));
                QCOMPARE(dataStatus, STATUS_T(JOB_OPEN));
            }
        }
        const Job* max = ins->jobs().find(QStringLiteral("SmcMax"));
        QCOMPARE(max->state, JOB_SMC_MAX_USED);
        QCOMPARE(max->goodCount(), 2);
        QVERIFY(ins->sample(QStringLiteral("SmcMax"), AVERAGE_SAMPLE, &running, &dataStatus));
        QCOMPARE(dataStatus, ST_OK);
        // All readings are averaged when the run ended by count.
        QVERIFY(max->average.labch[1] > 5.0f);
    }

    void forceFinishAveragesAllReadings()
    {
        QCOMPARE(ins->addJob(description(QStringLiteral("Smc"), QStringLiteral("SMC"), 3, 5), nullptr), ST_OK);
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Smc")), ST_JOB_CLOSED);   // nothing to average yet
        QVERIFY(measure(*ins, QStringLiteral("Smc")));
        QVERIFY(measure(*ins, QStringLiteral("Smc")));
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Smc")), ST_OK);
        const Job* job = ins->jobs().find(QStringLiteral("Smc"));
        QCOMPARE(job->state, JOB_SMC_FORCED);
        QVERIFY(job->hasAverage);
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Smc")), ST_JOB_CLOSED);
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Nope")), ST_NO_SUCH_JOB);
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Job 1")), ST_JOB_CLOSED);   // not an SMC job

        // Online jobs end in the other member of each pair.
        QString created;
        QCOMPARE(ins->startOnlineJob(QStringLiteral("Lab"), QStringLiteral("SMC"), 2, 3, &created), ST_OK);
        QVERIFY(ins->jobs().find(QStringLiteral("Lab"))->fileId.startsWith(QStringLiteral("LAB-")));
        QVERIFY(measure(*ins, QStringLiteral("Lab")));
        QCOMPARE(ins->jobs().forceFinish(QStringLiteral("Lab")), ST_OK);
        QCOMPARE(ins->jobs().find(QStringLiteral("Lab"))->state, JOB_SMC_FORCED_ONLINE);
    }

    void jobMadeInOpenModeTakesTheServerDefaults()
    {
        QCOMPARE(ins->setParameter(PARAMETER_MEASUREMENT_MODE, textParam(QStringLiteral("smc"))), ST_OK);
        QCOMPARE(ins->setParameter(PARAMETER_SMC_GOOD_MEASUREMENTS, intParam(4)), ST_OK);
        QCOMPARE(ins->setParameter(PARAMETER_SMC_MAX_MEASUREMENTS, intParam(7)), ST_OK);
        QCOMPARE(ins->addJob(description(QStringLiteral("Dev"), QStringLiteral("DEV_MODE"), 0), nullptr), ST_OK);
        const Job* job = ins->jobs().find(QStringLiteral("Dev"));
        QCOMPARE(job->mode, JOB_AVG_MODE_SMC);
        QCOMPARE(job->size, 4);
        QCOMPARE(job->maxSamples, 7);
        QCOMPARE(job->modeText, QStringLiteral("DEV_MODE"));
        QCOMPARE(JobBook::modeString(*job), QStringLiteral("SMC"));
        QVERIFY(job->fileId.startsWith(QStringLiteral("LOCAL-")));
        QCOMPARE(ins->addJob(description(QStringLiteral("Dev"), QStringLiteral("NONE"), 1), nullptr), ST_NAME_EXISTS);
        QCOMPARE(ins->setParameter(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, intParam(4)), ST_INDEX_INVALID);
    }

    void measurementRefusals()
    {
        QCOMPARE(ins->addJob(description(QStringLiteral("R"), QStringLiteral("NONE"), 5), nullptr), ST_OK);
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("Nope")), ST_NO_SUCH_JOB);

        ins->setLocked(true);
        QCOMPARE(ins->state(), STATE_LOCK);
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_NOT_READY);
        QCOMPARE(ins->startTargeting(), ST_NOT_READY);
        ins->setLocked(false);

        ins->setBusy(-1);
        QCOMPARE(ins->state(), STATE_BUSY);
        QCOMPARE(ins->startTargeting(), ST_NOT_READY);
        ins->setBusy(0);
        QCOMPARE(ins->startTargeting(), ST_OK);
        QCOMPARE(ins->state(), STATE_TARGETING);

        // Expired calibration: refused, and the reason waits in the error list.
        ins->resetErrors();
        ins->expireCalibration();
        QCOMPARE(ins->calibrationState().nextExternalWhiteCal, 0);
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_CALIBRATION_EXPIRED);
        QCOMPARE(ins->errors().size(), 1);
        QCOMPARE(ins->errors()[0].id, int(ST_CALIBRATION_EXPIRED));
        ins->renewCalibration();

        ins->setMemoryLimits(500, ins->jobs().totalSamples());
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_MEMORY_FULL);
        ins->setMemoryLimits(500, 10000);

        QVERIFY(measure(*ins, QStringLiteral("R")));
        QCOMPARE(ins->setParameter(PARAMETER_JOB_COMPLETION_TIME, intParam(1)), ST_OK);
        QTest::qWait(2100);
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_JOB_TIME_ELAPSED);

        // A measurement leaves targeting; during it nothing else may start.
        QCOMPARE(ins->setParameter(PARAMETER_JOB_COMPLETION_TIME, intParam(0)), ST_OK);
        QCOMPARE(ins->startTargeting(), ST_OK);
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_OK);
        QVERIFY(!ins->targeting());
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("R")), ST_NOT_READY);
        QCOMPARE(ins->triggerCalibration(), ST_NOT_READY);
    }

    void liftingOrAbortingSpoilsTheReading()
    {
        QCOMPARE(ins->addJob(description(QStringLiteral("M"), QStringLiteral("NONE"), 5), nullptr), ST_OK);
        ins->resetErrors();
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("M")), ST_OK);
        QTest::qWait(60);
        ins->setSwitches(true, false, true);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 1000);
        QCOMPARE(ins->errors().size(), 1);
        QCOMPARE(ins->errors()[0].id, int(ST_MOVED));
        QVERIFY(ins->jobs().find(QStringLiteral("M"))->samples.isEmpty());

        ins->setSwitches(true, true, true);
        ins->resetErrors();
        QCOMPARE(ins->triggerMeasurement(QStringLiteral("M")), ST_OK);
        QVERIFY(ins->abortOperation());
        QCOMPARE(ins->state(), STATE_INIT);
        QCOMPARE(ins->errors()[0].id, int(ST_ABORTED));

        ins->resetErrors();
        ins->failNextOperation(3236);
        QVERIFY(measure(*ins, QStringLiteral("M")));
        QCOMPARE(ins->errors()[0].id, 3236);
        QVERIFY(ins->jobs().find(QStringLiteral("M"))->samples.isEmpty());

        ins->resetErrors();
        ins->setSampleTemperature(85.0f);
        QVERIFY(measure(*ins, QStringLiteral("M")));
        QCOMPARE(ins->errors()[0].id, int(ST_TEMP_TOO_HIGH));
        ins->setSampleTemperature(31.0f);
        QVERIFY(measure(*ins, QStringLiteral("M")));
        QCOMPARE(ins->jobs().find(QStringLiteral("M"))->samples.size(), 1);
        QVERIFY(qAbs(ins->jobs().find(QStringLiteral("M"))->samples[0].temperature - 31.0f) < 0.5f);
    }

    void calibrationAndReferenceCheck()
    {
        ins->resetErrors();
        ins->setCalibrationDue(100);
        ins->setSwitches(false, false, false);
        QCOMPARE(ins->triggerCalibration(), ST_OK);
        QCOMPARE(ins->state(), STATE_CALIBRATING);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 2000);
        QCOMPARE(ins->errors().size(), 1);
        QCOMPARE(ins->errors()[0].id, int(ST_CAL_ERROR));
        QVERIFY(ins->secondsToCalibration() <= 100);

        // A requested white calibration is cleared by a good one.
        QCOMPARE(ins->setParameter(PARAMETER_WHITE_TRANSFER_REQUEST, intParam(1)), ST_OK);
        ins->takeStatus();
        ins->resetErrors();
        ins->setSwitches(true, true, true);
        QCOMPARE(ins->triggerCalibration(), ST_OK);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 2000);
        QVERIFY(ins->errors().isEmpty());
        QCOMPARE(ins->secondsToCalibration(), 8 * 3600);
        QCOMPARE(ins->parameter(PARAMETER_WHITE_TRANSFER_REQUEST)->i, 0);
        QVERIFY(ins->takeStatus().settingsBits & BIT_WHITE_TRANSFER);
        QCOMPARE(ins->calibrationStatus(), CALIBRATION_STATUS_GOOD);

        // The count-down runs in real seconds.
        const int before = ins->calibrationState().nextExternalWhiteCal;
        QTest::qWait(1100);
        QVERIFY(ins->calibrationState().nextExternalWhiteCal <= before - 1);
        ins->setCalibrationDue(60);
        QCOMPARE(ins->calibrationStatus(), CALIBRATION_STATUS_WARNING);

        // Reference check: the empty job name.
        QDateTime when;
        quint8 result = 9;
        QVERIFY(measure(*ins, QString()));
        QCOMPARE(ins->referenceCheck(QStringLiteral("factory_ref"), &when, &result), ST_OK);
        QCOMPARE(result, quint8(1));
        QVERIFY(when.secsTo(QDateTime::currentDateTime()) < 5);
        ins->setSwitches(false, false, false);
        QVERIFY(measure(*ins, QString()));
        QCOMPARE(ins->referenceCheck(QStringLiteral("factory_ref"), &when, &result), ST_OK);
        QCOMPARE(result, quint8(2));
        QCOMPARE(ins->referenceCheck(QStringLiteral("other_ref"), &when, &result), ST_NO_REFERENCE);
    }

    void selfTestsByLocation()
    {
        const QVector<TEST>& tests = ins->selfTests();
        QSet<quint32> locations;
        for (int i = 0; i < tests.size(); ++i) {
            QCOMPARE(tests[i].num, quint32(i));
            QVERIFY(tests[i].approxDuration > 0);
            locations << tests[i].deviceLocation;
        }
        QCOMPARE(locations, (QSet<quint32>{0, 1, 2}));

        // Pressure sensor test: passes lifted, and the result is 0 while it runs.
        const quint32 pressure = 5;
        QCOMPARE(tests[int(pressure)].description, QStringLiteral("PRESSURE SENSOR TEST"));
        ins->setSwitches(false, false, false);
        QCOMPARE(ins->triggerSelfTest(pressure), ST_OK);
        qint32 result = -1;
        QCOMPARE(ins->selfTestResult(pressure, &result), ST_OK);
        QCOMPARE(result, 0);
        QCOMPARE(ins->state(), STATE_BUSY);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 2000);
        QCOMPARE(ins->selfTestResult(pressure, &result), ST_OK);
        QCOMPARE(result, 1);

        // An optical test lifted half way is canceled.
        ins->setSwitches(true, true, true);
        QCOMPARE(ins->triggerSelfTest(3), ST_OK);
        QCOMPARE(ins->state(), STATE_MEASURING);
        QTest::qWait(50);
        ins->setSwitches(false, false, false);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 2000);
        QCOMPARE(ins->selfTestResult(3, &result), ST_OK);
        QCOMPARE(result, 3);

        ins->forceSelfTestResult(6, 2036);
        QCOMPARE(ins->triggerSelfTest(6), ST_OK);
        QTRY_COMPARE_WITH_TIMEOUT(ins->state(), STATE_INIT, 2000);
        QCOMPARE(ins->selfTestResult(6, &result), ST_OK);
        QCOMPARE(result, 2036);
        QCOMPARE(ins->triggerSelfTest(99), ST_INDEX_INVALID);
    }

    void settingsBitsAndCounters()
    {
        ins->takeStatus();
        const quint8 before = ins->changes().settingsId();
        QCOMPARE(ins->setParameter(PARAMETER_AUTO_MEASURE, intParam(1)), ST_OK);
        Instrument::StatusReply r = ins->takeStatus();
        QCOMPARE(r.settingsBits, quint32(BIT_AUTO_MEASURE));
        QVERIFY(r.settingsId != before);
        // Bits are handed out once, and an unchanged value raises none.
        QCOMPARE(ins->takeStatus().settingsBits, 0u);
        QCOMPARE(ins->setParameter(PARAMETER_AUTO_MEASURE, intParam(1)), ST_OK);
        QCOMPARE(ins->takeStatus().settingsBits, 0u);
        // A text message is news each time.
        ParamValue msg;
        msg.type = ParamType::WideText;
        msg.s = QStringLiteral("Lunch at 12");
        ins->setParameter(PARAMETER_TEXT_MESSAGE, msg);
        ins->takeStatus();
        ins->setParameter(PARAMETER_TEXT_MESSAGE, msg);
        QCOMPARE(ins->takeStatus().settingsBits, quint32(BIT_TEXT_MESSAGE));

        ins->setBrightness(33);
        ins->setVolume(2);
        ins->setParameter(PARAMETER_MEASUREMENT_MODE, textParam(QStringLiteral("AVERAGE")));
        QCOMPARE(ins->takeStatus().settingsBits, quint32(BIT_BRIGHTNESS | BIT_VOLUME | BIT_MEASUREMENT_MODE));
        QCOMPARE(ins->setParameter(PARAMETER_CURRENT_LANGUAGE_ID, textParam(QStringLiteral("xx"))), ST_INDEX_INVALID);
        QCOMPARE(ins->setParameter(PARAMETER_CURRENT_LANGUAGE_ID, textParam(QStringLiteral("de"))), ST_OK);
        QCOMPARE(ins->takeStatus().settingsBits, quint32(BIT_LANGUAGE));
        // A key the server does not keep is accepted and ignored.
        QCOMPARE(ins->setParameter(21, intParam(5)), ST_OK);
        QVERIFY(!ins->parameter(21));

        ins->parametersToDefaults();
        QCOMPARE(ins->parameter(PARAMETER_AUTO_MEASURE)->i, 0);
        QVERIFY(ins->takeStatus().settingsBits & (BIT_AUTO_MEASURE | BIT_LANGUAGE));
    }

    void wifiJoinOutcomes()
    {
        WifiRadio& w = ins->wifi();
        QCOMPARE(w.state(), WIFI_STATUS_CONNECTED);
        QVERIFY(w.ipString().endsWith(QStringLiteral(" dynamic")));
        QCOMPARE(w.ipString().split(QLatin1Char(' ')).size(), 3);
        int result = -1;

        QCOMPARE(w.add(QStringLiteral("Paint-Lab"), QStringLiteral("WPA2-PSK"), QStringLiteral("wrong"), 0), ST_OK);
        QCOMPARE(w.verify(QStringLiteral("Paint-Lab"), &result), ST_WIFI_BUSY);
        QCOMPARE(w.scan(), ST_WIFI_BUSY);
        QTRY_COMPARE_WITH_TIMEOUT(w.verify(QStringLiteral("Paint-Lab"), &result), ST_OK, 3000);
        QCOMPARE(result, 1);

        w.setNetwork(QStringLiteral("Paint-Lab"), false, -1.0f, QString(), QString());
        QCOMPARE(w.add(QStringLiteral("Paint-Lab"), QStringLiteral("WPA2-PSK"), QStringLiteral("spectro2024"), 0), ST_OK);
        QTRY_COMPARE_WITH_TIMEOUT(w.verify(QStringLiteral("Paint-Lab"), &result), ST_OK, 3000);
        QCOMPARE(result, 2);

        w.setNetwork(QStringLiteral("Paint-Lab"), true, 0.4f, QString(), QString());
        ins->takeStatus();
        QCOMPARE(w.add(QStringLiteral("Paint-Lab"), QStringLiteral("WPA2-PSK"), QStringLiteral("spectro2024"), 2), ST_OK);
        QTRY_COMPARE_WITH_TIMEOUT(w.verify(QStringLiteral("Paint-Lab"), &result), ST_OK, 3000);
        QCOMPARE(result, 0);
        QCOMPARE(w.connectedSsid(), QStringLiteral("Paint-Lab"));
        QCOMPARE(w.level(), int(WIFI_LEVEL_2));
        QVERIFY(ins->takeStatus().settingsBits & BIT_WIFI_LIST);

        w.setStaticAddress(QStringLiteral("10.0.0.9"));
        QCOMPARE(w.state(), WIFI_STATUS_ON_STATIC);
        QVERIFY(!w.ipString().contains(QStringLiteral("dynamic")));
        QCOMPARE(w.forget(QStringLiteral("Nowhere")), ST_NO_ENTRY);

        QCOMPARE(w.setEnabled(false), ST_OK);
        QCOMPARE(w.state(), WIFI_STATUS_OFF);
        QCOMPARE(w.level(), int(WIFI_LEVEL_NOT_CONNECTED));
        QVERIFY(w.ipString().isEmpty());
        QTRY_VERIFY_WITH_TIMEOUT(!w.busy(), 2000);
        QCOMPARE(w.scan(), ST_WIFI_SCAN_ERROR);
        for (const NETWORK_DESCRIPTION_T& n : w.networks())
            QVERIFY(n.Known);
    }

    void webSyncRunsTo2008()
    {
        QCOMPARE(ins->addJob(description(QStringLiteral("S"), QStringLiteral("NONE"), 1), nullptr), ST_OK);
        QCOMPARE(ins->setParameter(PARAMETER_SYNC_JOB_TO_WEBSERVER, textParam(QStringLiteral("S"))), ST_JOB_CLOSED);
        QVERIFY(measure(*ins, QStringLiteral("S")));
        QCOMPARE(ins->jobs().find(QStringLiteral("S"))->state, JOB_COMPLETE);
        ins->takeStatus();
        QCOMPARE(ins->setParameter(PARAMETER_SYNC_JOB_TO_WEBSERVER, textParam(QStringLiteral("S"))), ST_OK);
        QTRY_VERIFY_WITH_TIMEOUT(ins->jobs().find(QStringLiteral("S"))->syncPercent > 0, 2000);
        QTRY_COMPARE_WITH_TIMEOUT(ins->jobs().find(QStringLiteral("S"))->state, JOB_SYNCHRONISED, 5000);
        bool named = false;
        for (const EntityChange& e : ins->takeStatus().entities)
            named = named || e.identifier == QStringLiteral("S");
        QVERIFY(named);
    }

    void survivesARestart()
    {
        const QString dir = TestSupport::makeTempDir(QStringLiteral("simrestart"));
        QVector<float> refl;
        {
            std::unique_ptr<Instrument> first = makeInstrument(dir, Model::Alder);
            first->setSwitches(true, true, true);
            QCOMPARE(first->addJob(description(QStringLiteral("Keep"), QStringLiteral("AVERAGE"), 3), nullptr), ST_OK);
            for (int i = 0; i < 3; ++i)
                QVERIFY(measure(*first, QStringLiteral("Keep")));
            QCOMPARE(first->setParameter(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES, intParam(7)), ST_OK);
            first->setBrightness(42);
            first->jobs().remove(QStringLiteral("Job 1"));
            refl = first->jobs().find(QStringLiteral("Keep"))->samples[1].refl;
            QCOMPARE(refl.size(), 11 * NUM_WAVELENGTHS);
        }
        std::unique_ptr<Instrument> second = makeInstrument(dir, Model::Alder);
        const Job* keep = second->jobs().find(QStringLiteral("Keep"));
        QVERIFY(keep);
        QCOMPARE(keep->samples.size(), 3);
        QCOMPARE(keep->state, JOB_COMPLETE);
        QVERIFY(keep->hasAverage);
        QCOMPARE(keep->samples[1].refl, refl);
        QCOMPARE(keep->tags.first().text, QStringLiteral("Keep"));
        QVERIFY(!second->jobs().find(QStringLiteral("Job 1")));      // no reseeding over a kept store
        QCOMPARE(second->parameter(PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES)->i, 7);
        QCOMPARE(second->brightness(), 42);
        second.reset();

        // --reset starts over from the demo set.
        Instrument::Options o;
        o.dataDir = dir;
        o.reset = true;
        Instrument fresh(o);
        QVERIFY(fresh.open());
        QVERIFY(!fresh.jobs().find(QStringLiteral("Keep")));
        QVERIFY(fresh.jobs().find(QStringLiteral("Job 1")));
    }
};

QTEST_GUILESS_MAIN(TestSimInstrument)
#include "tst_siminstrument.moc"
