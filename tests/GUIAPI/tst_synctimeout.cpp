// A web sync that never gets past 50 percent ends after 120 s with a last
// report of 0 percent. Takes two minutes: labelled "long".

#include "GUIAPI/SyncHarness.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"

#include <QtTest>

using namespace BackendHarness;
using namespace SyncHarness;

class TestSyncTimeout : public QObject
{
    Q_OBJECT

private slots:
    void stalledSyncReportsEveryHalfSecondForTwoMinutesThenZero();
};

void TestSyncTimeout::stalledSyncReportsEveryHalfSecondForTwoMinutesThenZero()
{
    auto sim = startSimulator(0.3);
    QVERIFY(sim);
    RecordingProxy relay(sim->port());
    relay.setInterceptor([](const CmdData& request, const QByteArray& frame) {
        return quint32(request.getCommandCode()) == kGetJobInfoWeb ? stalledWebState(frame, 2001, 50)
                                                                    : QByteArray();
    });
    QVERIFY(relay.listen());

    DataManager* dm = startDataManager();
    SyncObject* sync = SyncObject::instance();
    SignalLog log;
    log.watch(sync, &SyncObject::syncJobPercent, "syncJobPercent");
    QVERIFY(connectBackend(log, relay.port()));
    onDataManagerThread([dm] { dm->onUpdateJobInfos(); });
    QString name;
    for (const Job& job : dm->getAllJobs()) {
        if (job.isJobComplete() && job.getJobState() != 2008)
            name = job.getName();
    }
    QVERIFY(!name.isEmpty());

    UserParams::setAllowSync(true);
    QElapsedTimer clock;
    clock.start();
    QMetaObject::invokeMethod(sync, "onSyncJob", Qt::QueuedConnection, Q_ARG(QString, name));
    const QString last = "syncJobPercent(" + name + ",false,0)";
    QVERIFY(log.waitFor(last, 150000));
    const qint64 elapsed = clock.elapsed();

    const QStringList progress = progressOf(log, name);
    QCOMPARE(progress.last(), last);
    QCOMPARE(progress.count(last), 1);
    const int halfway = progress.count("syncJobPercent(" + name + ",false,50)");
    QCOMPARE(halfway, progress.size() - 1);
    QVERIFY2(elapsed >= 120000 && elapsed < 130000, qPrintable(QString::number(elapsed)));
    // About one report every 500 ms.
    QVERIFY2(halfway >= 200 && halfway <= 241, qPrintable(QString::number(halfway)));
}

QTEST_MAIN(TestSyncTimeout)
#include "tst_synctimeout.moc"
