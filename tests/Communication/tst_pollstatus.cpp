// The status poller on the DataManager thread against the simulator, through
// a relay that can hide what the server is doing: which timer runs when, the
// ends of measurements, calibrations and self tests, the kill timer, the
// targeting poll and a lost link.

#include "GUIAPI/BackendHarness.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"

#include <QtEndian>
#include <QtTest>

#include <atomic>

using namespace BackendHarness;

namespace {

const quint32 kGetState = 0x10000000;
const quint32 kTriggerMeasurement = 0x41000000;
const quint32 kGetSelfTestResult = 0x60000102;
const quint32 kTriggerCalibration = 0x60000021;
// The reference check is started with the measurement trigger.
const quint32 kTriggerReferenceCheck = kTriggerMeasurement;
const int kRefusal = 2028;
// Offset of the first payload byte of a reply: the system state of a state.
const int kReplyPayload = CmdData::RESPONSE_HEADER_SIZE;

QStringList idle()
{
    return {"idle"};
}

} // namespace

class TestPollStatus : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void idlePollReportsTheStateTwiceASecond();
    void measurementRunsMeasurementAndKillTimersUntilTheServerIsBackAtRest();
    void measurementNeverSeenBusyEndsWithGoHomeAfter25Seconds();
    void calibrationWithErrorsPendingEndsWithoutCompletion();
    void calibrationAndReferenceTriggersAreRetriedUntilTheServerTakesThem();
    void refusedCalibrationGivesUpAfterSixSecondsAndWaitsAtRest();
    void referenceCheckPollCompletesWhetherThePanelPassesOrNot();
    void selfTestEndsAtOnceWhenItsResultComesWhileBusy();
    void targetingPollReportsPressureImageAndOrientationInThatOrder();
    void lostLinkStopsEveryPoll();

private:
    bool pollerIs(const QStringList& timers, int timeoutMs = 3000)
    {
        return waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == timers; }, timeoutMs);
    }

    std::unique_ptr<Sim::ServerThread> m_sim;
    std::unique_ptr<RecordingProxy> m_relay;
    SignalLog m_log;
    DataManager* m_dm = nullptr;
    // Read on the relay's thread.
    std::atomic<bool> m_hideBusy{false};
    std::atomic<int> m_selfTestResult{-1};
};

void TestPollStatus::initTestCase()
{
    m_sim = startSimulator(0.3);
    QVERIFY(m_sim);
    m_relay = std::make_unique<RecordingProxy>(m_sim->port());
    m_relay->setReplyFilter([this](const CmdData& request, QByteArray& reply) {
        const quint32 code = quint32(request.getCommandCode());
        if (code == kGetState && m_hideBusy && reply.size() > kReplyPayload)
            reply[kReplyPayload] = char(STATE_INIT);
        if (code == kGetSelfTestResult && m_selfTestResult >= 0 && reply.size() >= kReplyPayload + 4)
            qToLittleEndian<qint32>(m_selfTestResult.load(), reply.data() + kReplyPayload);
    });
    QVERIFY(m_relay->listen());

    m_dm = startDataManager();
    API_SignalMaster* hub = API_SignalMaster::instance();
    m_log.watch(m_dm, &DataManager::updatePressureSensorStatus, "updatePressureSensorStatus");
    m_log.watch(hub, &API_SignalMaster::StatusUpdated, "StatusUpdated");
    m_log.watch(hub, &API_SignalMaster::MeasurementStarted, "MeasurementStarted");
    m_log.watch(hub, &API_SignalMaster::MeasurementComplete, "MeasurementComplete");
    m_log.watch(hub, &API_SignalMaster::MeasurementIssue, "MeasurementIssue");
    m_log.watch(hub, &API_SignalMaster::CalibrationComplete, "CalibrationComplete");
    m_log.watch(hub, &API_SignalMaster::ReferenceCheckComplete, "ReferenceCheckComplete");
    m_log.watch(hub, &API_SignalMaster::SelfTestTestComplete, "SelfTestTestComplete");
    m_log.watch(hub, &API_SignalMaster::GoHome, "GoHome");
    m_log.watch(hub, &API_SignalMaster::PressureSwitchesUpdated, "PressureSwitchesUpdated");
    m_log.watch(hub, &API_SignalMaster::TargetingImageUpdated, "TargetingImageUpdated");
    m_log.watch(hub, &API_SignalMaster::OrientationUpdated, "OrientationUpdated");
    QVERIFY(connectBackend(m_log, m_relay->port()));
    QCOMPARE(m_sim->control("place"), QString("OK"));

    const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
    QVERIFY(index != NO_INDEX);
    m_dm->setActiveJob(index);
}

void TestPollStatus::init()
{
    QVERIFY(pollerIs(idle(), 5000));
    m_log.clear();
}

void TestPollStatus::cleanup()
{
    m_hideBusy = false;
    m_selfTestResult = -1;
    m_sim->control("refuse off");
    m_sim->control("refcheck auto");
    if (m_dm->getPollStatus()->activeTimers() != idle())
        API_SignalMaster::instance()->emitTriggerResumeIdle();
}

void TestPollStatus::idlePollReportsTheStateTwiceASecond()
{
    settle(2000);
    const int statuses = m_log.count("StatusUpdated");
    QVERIFY2(statuses >= 3 && statuses <= 5, qPrintable(QString::number(statuses)));
    // The idle tick reads the calibration too.
    CALIBRATION_STATE_T server;
    m_sim->call([&server](Sim::Server& s) { server = s.instrument().calibrationState(); });
    // The wire carries whole seconds.
    QCOMPARE(m_dm->getCalState().lastExternalWhiteCal.toSecsSinceEpoch(),
             server.lastExternalWhiteCal.toSecsSinceEpoch());
}

void TestPollStatus::measurementRunsMeasurementAndKillTimersUntilTheServerIsBackAtRest()
{
    MeasAPI_TriggerMeasurement();
    QVERIFY(m_log.waitFor("MeasurementStarted", 3000));
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), (QStringList{"measurement", "kill"}));
    QVERIFY(m_log.waitFor("MeasurementComplete", 10000));
    QVERIFY(pollerIs(idle()));
    // Ticks of 100 ms while measuring, each reporting twice.
    QVERIFY(m_log.count("StatusUpdated") >= 6);
}

void TestPollStatus::measurementNeverSeenBusyEndsWithGoHomeAfter25Seconds()
{
    // The server measures, but every state the poller reads says at rest.
    m_hideBusy = true;
    QElapsedTimer clock;
    clock.start();
    MeasAPI_TriggerMeasurement();
    QVERIFY(m_log.waitFor("MeasurementStarted", 3000));
    QVERIFY(m_log.waitFor("GoHome", 30000));
    const qint64 elapsed = clock.elapsed();
    QVERIFY2(elapsed >= 24500 && elapsed < 27500, qPrintable(QString::number(elapsed)));
    QCOMPARE(m_log.count("MeasurementComplete"), 0);
    // The flag stays up until the next completion.
    QVERIFY(MeasAPI_GetMeasurementInProcess());
    QVERIFY(pollerIs(idle()));
    const int statuses = m_log.count("StatusUpdated");
    QVERIFY(m_log.waitFor("StatusUpdated", 2000, statuses + 2));
    QVERIFY(pollerIs(idle()));
}

void TestPollStatus::calibrationWithErrorsPendingEndsWithoutCompletion()
{
    QCOMPARE(m_sim->control("fail-next 2001"), QString("OK"));
    MeasAPI_TriggerUserCalibration();
    // DataManager fetches the error from the status instead.
    QVERIFY(m_log.waitFor("MeasurementIssue(2001)", 15000));
    QVERIFY(pollerIs(idle()));
    settle(500);
    QCOMPARE(m_log.count("CalibrationComplete"), 0);

    MeasAPI_TriggerUserCalibration();
    QVERIFY(m_log.waitFor("CalibrationComplete", 15000));
    QVERIFY(pollerIs(idle()));
}

void TestPollStatus::calibrationAndReferenceTriggersAreRetriedUntilTheServerTakesThem()
{
    QCOMPARE(m_sim->control(QString("refuse %1 %2 2").arg(kTriggerCalibration).arg(kRefusal)), QString("OK"));
    MeasAPI_TriggerUserCalibration();
    QVERIFY(m_log.waitFor("CalibrationComplete", 15000));
    // Every refusal reaches the screens (as the front's bad-status code), the
    // third try went through.
    QCOMPARE(m_log.countStartingWith("MeasurementIssue("), 2);
    QVERIFY(pollerIs(idle()));

    m_log.clear();
    QCOMPARE(m_sim->control(QString("refuse %1 %2 3").arg(kTriggerReferenceCheck).arg(kRefusal)), QString("OK"));
    MeasAPI_TriggerReferenceCheck();
    QVERIFY(m_log.waitFor("ReferenceCheckComplete", 15000));
    QCOMPARE(m_log.countStartingWith("MeasurementIssue("), 3);
    QVERIFY(pollerIs(idle()));
}

void TestPollStatus::refusedCalibrationGivesUpAfterSixSecondsAndWaitsAtRest()
{
    QCOMPARE(m_sim->control(QString("refuse %1 %2").arg(kTriggerCalibration).arg(kRefusal)), QString("OK"));
    QElapsedTimer clock;
    clock.start();
    MeasAPI_TriggerUserCalibration();
    QVERIFY(pollerIs({"calibrate"}, 15000));
    const qint64 elapsed = clock.elapsed();
    QVERIFY2(elapsed >= 5900 && elapsed < 10000, qPrintable(QString::number(elapsed)));

    // Nothing was started, so the calibration poll sits at rest and never
    // completes; only a resume brings the idle poll back.
    settle(1000);
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), QStringList{"calibrate"});
    QCOMPARE(m_log.count("CalibrationComplete"), 0);
    // One try every 50 ms or so, for six seconds.
    const int refusals = m_log.countStartingWith("MeasurementIssue(");
    QVERIFY2(refusals >= 10, qPrintable(QString::number(refusals)));
}

void TestPollStatus::referenceCheckPollCompletesWhetherThePanelPassesOrNot()
{
    QCOMPARE(m_sim->control("refcheck fail"), QString("OK"));
    MeasAPI_TriggerReferenceCheck();
    QVERIFY(pollerIs({"reference"}));
    QVERIFY(m_log.waitFor("ReferenceCheckComplete", 15000));
    QCOMPARE(m_log.count("MeasurementIssue(-2)"), 1);
    QVERIFY(pollerIs(idle()));

    m_log.clear();
    QCOMPARE(m_sim->control("refcheck pass"), QString("OK"));
    MeasAPI_TriggerReferenceCheck();
    QVERIFY(m_log.waitFor("ReferenceCheckComplete", 15000));
    QCOMPARE(m_log.count("MeasurementIssue(-2)"), 0);
    QVERIFY(pollerIs(idle()));
}

void TestPollStatus::selfTestEndsAtOnceWhenItsResultComesWhileBusy()
{
    const QVector<TEST> tests = onDataManagerThread([this] { return m_dm->getAllTests(); });
    TEST longest;
    for (const TEST& t : tests) {
        if (t.approxDuration > longest.approxDuration)
            longest = t;
    }
    QVERIFY(longest.approxDuration > 0);

    MeasAPI_TriggerSelfTest(longest);
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"selftest"}; }, 3000));
    QVERIFY(waitUntil([&] { return m_dm->getSystemStatus().getSystemState() != STATE_INIT; }, 3000));
    m_selfTestResult = 5;
    QVERIFY(m_log.waitFor("SelfTestTestComplete(5)", 3000));
    bool serverStillBusy = false;
    m_sim->call([&](Sim::Server& s) { serverStillBusy = !s.instrument().isIdle(); });
    QVERIFY(serverStillBusy);
    QVERIFY(pollerIs(idle()));
    m_sim->control("abort");
}

void TestPollStatus::targetingPollReportsPressureImageAndOrientationInThatOrder()
{
    // A refused trigger leaves the poller in targeting.
    QCOMPARE(m_sim->control(QString("refuse %1 2033 1").arg(kTriggerMeasurement)), QString("OK"));
    MeasAPI_TriggerMeasurement();
    QVERIFY(m_log.waitFor("MeasurementIssue(2033)", 3000));
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers() == QStringList{"targeting"}; }, 3000));
    QVERIFY(m_log.waitFor("OrientationUpdated", 3000, 3));
    QStringList order;
    for (const QString& e : m_log.entries()) {
        if (e == "PressureSwitchesUpdated" || e == "TargetingImageUpdated" || e == "OrientationUpdated")
            order << e;
    }
    for (int i = 0; i + 2 < order.size(); i += 3) {
        QCOMPARE(order.mid(i, 3),
                 (QStringList{"PressureSwitchesUpdated", "TargetingImageUpdated", "OrientationUpdated"}));
    }

    // DataManager signals only a change of the feet.
    const int changes = m_log.count("updatePressureSensorStatus");
    QCOMPARE(m_sim->control("switch 2 off"), QString("OK"));
    QVERIFY(m_log.waitFor("updatePressureSensorStatus", 3000, changes + 1));
    settle(600);
    QCOMPARE(m_log.count("updatePressureSensorStatus"), changes + 1);
    QCOMPARE(m_dm->getPressureSensorStatus().Switch2, 0u);
    QCOMPARE(m_sim->control("place"), QString("OK"));
    API_SignalMaster::instance()->emitTriggerResumeIdle();
}

void TestPollStatus::lostLinkStopsEveryPoll()
{
    API_SignalMaster::instance()->emitTcpDisconnected();
    QVERIFY(pollerIs(QStringList(), 3000));
    const int frames = m_relay->frameCount();
    settle(1200);
    QCOMPARE(m_relay->frameCount(), frames);
    API_SignalMaster::instance()->emitTriggerResumeIdle();
    QVERIFY(pollerIs(idle()));
}

QTEST_MAIN(TestPollStatus)
#include "tst_pollstatus.moc"
