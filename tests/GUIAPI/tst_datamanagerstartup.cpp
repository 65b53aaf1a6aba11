// DataManager's start-up against the simulator, seen through a relay that
// records every command: the order of the sync, the failures that are and
// aren't fatal, the endless retry, and a lost link.

#include "GUIAPI/BackendHarness.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"

#include <QSignalSpy>
#include <QElapsedTimer>
#include <QtTest>

using namespace BackendHarness;

namespace {

const quint32 kGetState = 0x10000000;
const quint32 kGetErrors = 0x10000020;
const quint32 kResetErrors = 0x10000022;
const quint32 kGetConfiguration = 0x10000040;
const quint32 kSetInterfaceConfig = 0x10000100;
const quint32 kGetCapability = 0x400A0220;
const quint32 kGetCalibrationState = 0x400A0700;
const quint32 kGetLanguages = 0x400A0900;
const quint32 kGetBeeperVolume = 0x400A0A00;
const quint32 kGetDisplayBrightness = 0x400A0A20;
const quint32 kGetMemoryInfo = 0x400A0B00;
const quint32 kGetParameter = 0x400A0E00;

int firstIndex(const QList<quint32>& codes, quint32 code, int from = 0)
{
    for (int i = from; i < codes.size(); ++i) {
        if (codes[i] == code)
            return i;
    }
    return -1;
}

} // namespace

class TestDataManagerStartup : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void cleanup();

    void syncRunsInItsOrderAndStartsTheIdlePoll();
    void failingUserParameterReadStillSucceeds();
    void noLanguagesRetriesEvery500msForEver();
    void lostLinkClearsEverythingAndNewLinkInitsAgain();

private:
    // Drops the GUI's link and waits until the back end is initialised again.
    bool reconnectAndWaitForInit(int timeoutMs);

    std::unique_ptr<Sim::ServerThread> m_sim;
    std::unique_ptr<RecordingProxy> m_proxy;
    SignalLog m_log;
    DataManager* m_dm = nullptr;
};

void TestDataManagerStartup::initTestCase()
{
    m_sim = startSimulator();
    QVERIFY(m_sim);
    m_proxy = std::make_unique<RecordingProxy>(m_sim->port());
    QVERIFY(m_proxy->listen());

    m_dm = startDataManager();
    API_SignalMaster* hub = API_SignalMaster::instance();
    m_log.watch(m_dm, &DataManager::languageChanged, "languageChanged");
    m_log.watch(hub, &API_SignalMaster::GoHome, "GoHome");
    m_log.watch(hub, &API_SignalMaster::TriggerResumeIdle, "TriggerResumeIdle");
    m_log.watch(hub, &API_SignalMaster::JobInfoUpdated, "JobInfoUpdated");
    m_log.watch(hub, &API_SignalMaster::TcpDisconnected, "TcpDisconnected");
    m_log.watch(hub, &API_SignalMaster::StatusUpdated, "StatusUpdated");

    // The link client lives on this thread, as on the GUI thread.
    QSignalSpy reconnected(hub, &API_SignalMaster::TcpReconnected);
    QVERIFY(connectBackend(m_log, m_proxy->port()));
    QCOMPARE(reconnected.count(), 1);
}

void TestDataManagerStartup::cleanup()
{
    // A failed test must not leave the server refusing for the next one.
    if (m_sim->control("refuse off") != "OK" || !m_dm->getDataInitialized())
        m_log.waitFor("InitComplete", 10000, m_log.count("InitComplete") + 1);
}

bool TestDataManagerStartup::reconnectAndWaitForInit(int timeoutMs)
{
    const int inits = m_log.count("InitComplete");
    m_proxy->dropConnections();
    return m_log.waitFor("InitComplete", timeoutMs, inits + 1);
}

void TestDataManagerStartup::syncRunsInItsOrderAndStartsTheIdlePoll()
{
    // The first connection's frames, up to the first idle ticks.
    QVERIFY(waitUntil([&] { return m_log.count("StatusUpdated") >= 3; }, 5000));
    const QList<quint32> codes = m_proxy->codes();

    QCOMPARE(codes.value(0), kSetInterfaceConfig);
    const int languages = firstIndex(codes, kGetLanguages);
    const int volume = firstIndex(codes, kGetBeeperVolume);
    const int brightness = firstIndex(codes, kGetDisplayBrightness);
    const int firstParameter = firstIndex(codes, kGetParameter);
    const int capability = firstIndex(codes, kGetCapability);
    const int model = firstIndex(codes, kGetConfiguration);
    const int memory = firstIndex(codes, kGetMemoryInfo);
    const int state = firstIndex(codes, kGetState, memory);
    const int calibration = firstIndex(codes, kGetCalibrationState, state);
    const int errors = firstIndex(codes, kGetErrors, calibration);
    const int reset = firstIndex(codes, kResetErrors, errors);
    QVERIFY2(languages > 0 && languages < volume && volume < brightness, "languages, volume, brightness");
    QVERIFY2(brightness < firstParameter && firstParameter < capability, "then the user parameters");
    QVERIFY2(capability < model && model < memory, "then the model and the memory");
    QVERIFY2(memory < state && state < calibration, "then the state and calibration");
    QVERIFY2(calibration < errors && errors < reset, "errors are read and reset after the sync");
    // Nothing but the sync before the state is read.
    QCOMPARE(firstIndex(codes, kGetState), state);

    const QStringList log = m_log.entries();
    QVERIFY(log.indexOf("languageChanged(" + UserParams::getLanguageCode() + ")") >= 0);
    const int goHome = log.indexOf("GoHome");
    QVERIFY(goHome >= 0);
    QVERIFY(goHome < log.indexOf("TriggerResumeIdle"));
    QVERIFY(log.indexOf("TriggerResumeIdle") < log.indexOf("InitComplete"));

    QVERIFY(m_dm->getDataInitialized());
    QVERIFY(!m_dm->getLanguagesInstalled().isEmpty());
    QVERIFY(!m_dm->getKeypadArray().isEmpty());
    QVERIFY(m_dm->doesTagExist());
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), QStringList{"idle"});
    // The idle poll reads the state and the calibration twice a second.
    const int before = m_proxy->codes().count(kGetState);
    settle(1600);
    const int polls = m_proxy->codes().count(kGetState) - before;
    QVERIFY2(polls >= 2 && polls <= 5, qPrintable(QString::number(polls)));
}

void TestDataManagerStartup::failingUserParameterReadStillSucceeds()
{
    LogCapture capture;
    QCOMPARE(m_sim->control(QString("refuse %1 5").arg(kGetParameter)), QString("OK"));
    QVERIFY(reconnectAndWaitForInit(20000));
    QCOMPARE(m_sim->control(QString("refuse %1 off").arg(kGetParameter)), QString("OK"));

    QVERIFY(capture.contains("DataManager: issue obtaining user parameters"));
    QVERIFY(!capture.contains("DataManager: init failed, trying again"));
    QVERIFY(m_dm->getDataInitialized());
    QVERIFY(!m_dm->getKeypadArray().isEmpty());
}

void TestDataManagerStartup::noLanguagesRetriesEvery500msForEver()
{
    LogCapture capture;
    const int inits = m_log.count("InitComplete");
    QCOMPARE(m_sim->control(QString("refuse %1 5").arg(kGetLanguages)), QString("OK"));
    const int asked = m_proxy->codes().count(kGetLanguages);
    m_proxy->dropConnections();

    QVERIFY(waitUntil([&] { return m_proxy->codes().count(kGetLanguages) >= asked + 1; }, 20000));
    const int first = m_proxy->codes().count(kGetLanguages);
    QElapsedTimer retrying;
    retrying.start();
    // It goes on, however slow the machine (a sanitizer build is slow) ...
    QVERIFY(waitUntil([&] { return m_proxy->codes().count(kGetLanguages) - first >= 3; }, 30000));
    settle(500);
    const int tries = m_proxy->codes().count(kGetLanguages) - first;
    // ... and never faster than one try every 500 ms.
    QVERIFY2(tries <= retrying.elapsed() / 500 + 1,
             qPrintable(QString("%1 tries in %2 ms").arg(tries).arg(retrying.elapsed())));
    QVERIFY(capture.count("DataManager: issue obtaining installed languages") >= 3);
    QVERIFY(capture.count("DataManager: init failed, trying again") >= 3);
    QCOMPARE(m_log.count("InitComplete"), inits);
    QVERIFY(!m_dm->getDataInitialized());
    // The keypad load is skipped after the failed step.
    QVERIFY(m_dm->getKeypadArray().isEmpty());

    // The retry goes on until the server answers.
    QCOMPARE(m_sim->control(QString("refuse %1 off").arg(kGetLanguages)), QString("OK"));
    QVERIFY(m_log.waitFor("InitComplete", 10000, inits + 1));
    QVERIFY(m_dm->getDataInitialized());
    QVERIFY(!m_dm->getKeypadArray().isEmpty());
}

void TestDataManagerStartup::lostLinkClearsEverythingAndNewLinkInitsAgain()
{
    onDataManagerThread([this] { m_dm->onUpdateJobInfos(); });
    QVERIFY(m_dm->getNumberOfJobs() > 0);
    const int inits = m_log.count("InitComplete");
    const int disconnects = m_log.count("TcpDisconnected");
    const quint16 port = m_proxy->port();

    m_proxy.reset();
    QVERIFY(m_log.waitFor("TcpDisconnected", 5000, disconnects + 1));
    QVERIFY(waitUntil([&] { return !m_dm->getDataInitialized(); }, 2000));
    QCOMPARE(m_dm->getNumberOfJobs(), 0u);
    QCOMPARE(m_dm->getActiveJob(), NO_INDEX);
    QVERIFY(m_dm->getKeypadArray().isEmpty());
    QCOMPARE(m_dm->getSystemStatus().getSystemState(), STATE_POWER_UP);
    QVERIFY(waitUntil([&] { return m_dm->getPollStatus()->activeTimers().isEmpty(); }, 2000));

    // The server comes back on the same port.
    m_proxy = std::make_unique<RecordingProxy>(m_sim->port());
    QVERIFY(m_proxy->listen(port));
    QVERIFY(m_log.waitFor("InitComplete", 20000, inits + 1));
    QVERIFY(m_dm->getDataInitialized());
    QCOMPARE(m_proxy->codes().value(0), kSetInterfaceConfig);
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), QStringList{"idle"});
}

QTEST_MAIN(TestDataManagerStartup)
#include "tst_datamanagerstartup.moc"
