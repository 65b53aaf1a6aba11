// The measure API with the whole back end against the simulator: the order
// of the news of a measurement, error batches, a refused trigger, and the
// other activities the poller follows to their end.

#include "GUIAPI/BackendHarness.h"

#include "Commands/TargetingOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "GUIAPI/SystemAPI.h"

#include <QtTest>

using namespace BackendHarness;

namespace {
const quint32 kTriggerMeasurement = 0x41000000;
}

class TestMeasureAPI : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void completedMeasurementGivesGoodNewsBeforeComplete();
    void measurementWithAnErrorReportsIt();
    void errorBatchReportsTheFirstKnownErrorAndIsReset_data();
    void errorBatchReportsTheFirstKnownErrorAndIsReset();
    void refusedTriggerEndsInTargeting();
    void calibrationCompletes();
    void referenceCheckFailureIsReportedBeforeItsCompletion();
    void selfTestCompletesWithItsResult();

private:
    int serverErrorCount();

    std::unique_ptr<Sim::ServerThread> m_sim;
    SignalLog m_log;
    DataManager* m_dm = nullptr;
};

void TestMeasureAPI::initTestCase()
{
    m_sim = startSimulator(0.3);
    QVERIFY(m_sim);
    m_dm = startDataManager();
    API_SignalMaster* hub = API_SignalMaster::instance();
    m_log.watch(hub, &API_SignalMaster::MeasurementStarted, "MeasurementStarted");
    m_log.watch(hub, &API_SignalMaster::MeasurementIssue, "MeasurementIssue");
    m_log.watch(hub, &API_SignalMaster::MeasurementComplete, "MeasurementComplete");
    m_log.watch(hub, &API_SignalMaster::CalculationComplete, "CalculationComplete");
    m_log.watch(hub, &API_SignalMaster::CalibrationComplete, "CalibrationComplete");
    m_log.watch(hub, &API_SignalMaster::ReferenceCheckComplete, "ReferenceCheckComplete");
    m_log.watch(hub, &API_SignalMaster::SelfTestTestComplete, "SelfTestTestComplete");
    m_log.watch(hub, &API_SignalMaster::DisplayCalibrationPopup, "DisplayCalibrationPopup");
    QVERIFY(connectBackend(m_log, m_sim->port()));
    QCOMPARE(m_sim->control("place"), QString("OK"));

    // An open job to measure into.
    const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
    QVERIFY(index != NO_INDEX);
    m_dm->setActiveJob(index);
}

void TestMeasureAPI::init()
{
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"idle"}; }, 5000));
    m_log.clear();
}

void TestMeasureAPI::cleanup()
{
    m_sim->control("refuse off");
    API_SignalMaster::instance()->emitTriggerResumeIdle();
}

int TestMeasureAPI::serverErrorCount()
{
    int count = -1;
    m_sim->call([&count](Sim::Server& s) { count = s.instrument().errors().size(); });
    return count;
}

void TestMeasureAPI::completedMeasurementGivesGoodNewsBeforeComplete()
{
    const int samples = m_dm->getActiveJobObject().getNumSamples();
    MeasAPI_TriggerMeasurement();
    QVERIFY(MeasAPI_GetMeasurementInProcess());
    QVERIFY(m_log.waitFor("CalculationComplete", 10000));

    const QStringList expected{"MeasurementStarted", "MeasurementIssue(-1)", "MeasurementComplete",
                               "CalculationComplete"};
    QCOMPARE(m_log.entries(), expected);
    QVERIFY(!MeasAPI_GetMeasurementInProcess());
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), QStringList{"idle"});
    // The sample arrives with the job reload the status asks for.
    QVERIFY(waitUntil([&] { return m_dm->getActiveJobObject().getNumSamples() == samples + 1; }, 5000));
}

void TestMeasureAPI::measurementWithAnErrorReportsIt()
{
    QCOMPARE(m_sim->control("fail-next 2036"), QString("OK"));
    MeasAPI_TriggerMeasurement();
    QVERIFY(m_log.waitFor("CalculationComplete", 10000));
    const QStringList log = m_log.entries();
    QVERIFY2(log.indexOf("MeasurementIssue(2036)") >= 0, qPrintable(log.join(' ')));
    QVERIFY(log.indexOf("MeasurementIssue(2036)") < log.indexOf("MeasurementComplete"));
    QVERIFY(waitUntil([&] { return serverErrorCount() == 0; }, 3000));
}

void TestMeasureAPI::errorBatchReportsTheFirstKnownErrorAndIsReset_data()
{
    QTest::addColumn<QList<int>>("batch");
    QTest::addColumn<QString>("reported");
    QTest::newRow("unknown then known") << QList<int>{5000, 2033} << "MeasurementIssue(2033)";
    QTest::newRow("only unknown") << QList<int>{5000} << "MeasurementIssue(0)";
    QTest::newRow("first known wins") << QList<int>{2102, 2033} << "MeasurementIssue(2102)";
    QTest::newRow("calibration needed") << QList<int>{2044, 2033} << "DisplayCalibrationPopup";
}

void TestMeasureAPI::errorBatchReportsTheFirstKnownErrorAndIsReset()
{
    QFETCH(QList<int>, batch);
    QFETCH(QString, reported);
    // The whole batch at once, so that one idle status sees it.
    m_sim->call([batch](Sim::Server& s) {
        for (int id : batch)
            s.instrument().pushError(id);
    });
    QVERIFY(waitUntil([&] { return !m_log.entries().isEmpty(); }, 3000));
    settle(300);
    QCOMPARE(m_log.entries(), QStringList{reported});
    QCOMPARE(serverErrorCount(), 0);
}

void TestMeasureAPI::refusedTriggerEndsInTargeting()
{
    QCOMPARE(m_sim->control(QString("refuse %1 2033 1").arg(kTriggerMeasurement)), QString("OK"));
    MeasAPI_TriggerMeasurement();
    QVERIFY(m_log.waitFor("MeasurementIssue(2033)", 5000));
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers().contains("targeting"); }, 3000));
    QVERIFY(!m_dm->getPollStatus()->activeTimers().contains("idle"));
    QVERIFY(!m_dm->getPollStatus()->activeTimers().contains("measurement"));
    QCOMPARE(m_dm->getPollStatus()->lastTriggerStatus(), 2033);
    QCOMPARE(m_log.count("MeasurementStarted"), 0);
    m_sim->control("refuse off");
    CmdOut_StopTargetingMode();
}

void TestMeasureAPI::calibrationCompletes()
{
    MeasAPI_TriggerUserCalibration();
    QVERIFY(m_log.waitFor("CalibrationComplete", 15000));
    QVERIFY(!MeasAPI_GetMeasurementInProcess());
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"idle"}; }, 2000));
    QVERIFY(m_dm->getCalState().nextExternalWhiteCal > 0);
}

void TestMeasureAPI::referenceCheckFailureIsReportedBeforeItsCompletion()
{
    QCOMPARE(m_sim->control("refcheck fail"), QString("OK"));
    MeasAPI_TriggerReferenceCheck();
    QVERIFY(m_log.waitFor("ReferenceCheckComplete", 15000));
    const QStringList log = m_log.entries();
    QVERIFY2(log.indexOf("MeasurementIssue(-2)") >= 0, qPrintable(log.join(' ')));
    QVERIFY(log.indexOf("MeasurementIssue(-2)") < log.indexOf("ReferenceCheckComplete"));

    m_log.clear();
    QCOMPARE(m_sim->control("refcheck pass"), QString("OK"));
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"idle"}; }, 3000));
    MeasAPI_TriggerReferenceCheck();
    QVERIFY(m_log.waitFor("ReferenceCheckComplete", 15000));
    QCOMPARE(m_log.count("MeasurementIssue(-2)"), 0);
    m_sim->control("refcheck auto");
}

void TestMeasureAPI::selfTestCompletesWithItsResult()
{
    const QVector<TEST> tests = onDataManagerThread([this] { return m_dm->getAllTests(); });
    QVERIFY(!tests.isEmpty());
    const TEST test = tests.first();
    QCOMPARE(m_sim->control(QString("selftest %1 7").arg(test.num)), QString("OK"));

    MeasAPI_TriggerSelfTest(test);
    QVERIFY(m_log.waitFor("SelfTestTestComplete(7)", 20000));
    QVERIFY(!MeasAPI_GetMeasurementInProcess());
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"idle"}; }, 2000));
    m_sim->control(QString("selftest %1 auto").arg(test.num));
}

QTEST_MAIN(TestMeasureAPI)
#include "tst_measureapi.moc"
