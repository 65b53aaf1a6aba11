// Web sync of jobs against the simulator: progress to the synchronised
// state, which jobs a round takes, and the switch that allows it.

#include "GUIAPI/SyncHarness.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"

#include <QtTest>

using namespace BackendHarness;
using namespace SyncHarness;

class TestSyncObject : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();

    void syncReportsProgressUntilSynchronised();
    void synchronisedJobsAreReportedByTheListRefresh();
    void roundSkipsSynchronisedAndOpenJobsButDirectSyncDoesNot();
    void nothingHappensWhenSyncIsNotAllowed();

private:
    int serverJobState(const QString& name);
    QString completeUnsyncedJob();

    std::unique_ptr<Sim::ServerThread> m_sim;
    SignalLog m_log;
    DataManager* m_dm = nullptr;
    SyncObject* m_sync = nullptr;
};

void TestSyncObject::initTestCase()
{
    m_sim = startSimulator(0.3);
    QVERIFY(m_sim);
    m_dm = startDataManager();
    m_sync = SyncObject::instance();
    m_log.watch(m_dm, &DataManager::syncJobPercent, "dmSyncJobPercent");
    m_log.watch(m_sync, &SyncObject::syncJobPercent, "syncJobPercent");
    QVERIFY(connectBackend(m_log, m_sim->port()));
    onDataManagerThread([this] { m_dm->onUpdateJobInfos(); });
    QVERIFY(m_dm->getNumberOfJobs() > 0);
}

void TestSyncObject::init()
{
    UserParams::setAllowSync(true);
    m_log.clear();
}

int TestSyncObject::serverJobState(const QString& name)
{
    int state = -1;
    m_sim->call([&](Sim::Server& s) {
        if (const Sim::Job* job = s.instrument().jobs().find(name))
            state = job->state;
    });
    return state;
}

QString TestSyncObject::completeUnsyncedJob()
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    for (const Job& job : m_dm->getAllJobs()) {
        if (job.isJobComplete() && job.getJobState() != 2008)
            return job.getName();
    }
    return QString();
}

void TestSyncObject::syncReportsProgressUntilSynchronised()
{
    const QString name = completeUnsyncedJob();
    QVERIFY(!name.isEmpty());
    QMetaObject::invokeMethod(m_sync, "onSyncJob", Qt::QueuedConnection, Q_ARG(QString, name));
    QVERIFY(m_log.waitFor("syncJobPercent(" + name + ",true,100)", 30000));

    const QStringList progress = progressOf(m_log, name);
    QVERIFY(progress.size() >= 2);
    int last = -1;
    for (const QString& entry : progress.mid(0, progress.size() - 1)) {
        QVERIFY2(entry.contains(",false,"), qPrintable(entry));
        const int percent = entry.section(',', 2).chopped(1).toInt();
        QVERIFY2(percent >= last && percent < 100, qPrintable(entry));
        last = percent;
    }
    QCOMPARE(serverJobState(name), 2008);
}

void TestSyncObject::synchronisedJobsAreReportedByTheListRefresh()
{
    m_dm->setActiveJob(NO_INDEX);
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    QVERIFY(waitUntil([&] { return m_log.countStartingWith("dmSyncJobPercent") > 0; }, 2000));
    for (const Job& job : m_dm->getAllJobs()) {
        const QString entry = "dmSyncJobPercent(" + job.getName() + ",true,100)";
        QCOMPARE(m_log.count(entry), job.getJobState() == 2008 ? 1 : 0);
    }
}

void TestSyncObject::roundSkipsSynchronisedAndOpenJobsButDirectSyncDoesNot()
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    QStringList expected, skipped;
    for (const Job& job : m_dm->getAllJobs()) {
        if (job.isJobComplete() && job.getJobState() != 2008)
            expected << job.getName();
        else
            skipped << job.getName();
    }
    QVERIFY(!expected.isEmpty());
    QVERIFY(!skipped.isEmpty());

    QMetaObject::invokeMethod(m_sync, "onSyncAllJobs", Qt::QueuedConnection);
    for (const QString& name : expected)
        QVERIFY2(m_log.waitFor("syncJobPercent(" + name + ",true,100)", 60000), qPrintable(name));
    for (const QString& name : skipped)
        QVERIFY2(progressOf(m_log, name).isEmpty(), qPrintable(name));

    // A job already synchronised is still followed when asked for by name.
    const QString synced = expected.first();
    m_log.clear();
    QMetaObject::invokeMethod(m_sync, "onSyncJob", Qt::QueuedConnection, Q_ARG(QString, synced));
    QVERIFY(m_log.waitFor("syncJobPercent(" + synced + ",true,100)", 5000));
}

void TestSyncObject::nothingHappensWhenSyncIsNotAllowed()
{
    UserParams::setAllowSync(false);
    const QString name = m_dm->getAJobObject(0).getName();
    QMetaObject::invokeMethod(m_sync, "onSyncJob", Qt::QueuedConnection, Q_ARG(QString, name));
    QMetaObject::invokeMethod(m_sync, "onSyncAllJobs", Qt::QueuedConnection);
    settle(1500);
    QCOMPARE(m_log.countStartingWith("syncJobPercent"), 0);
}

QTEST_MAIN(TestSyncObject)
#include "tst_syncobject.moc"
