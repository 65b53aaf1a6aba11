// The platform layer: device paths under the root prefix, and shell
// commands that a host build records and never runs.
#include "SharedSystem/Platform.h"
#include "SharedSystem/WorkerTask.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

namespace {

class Probe : public QObject
{
public:
    QThread* builtOn = QThread::currentThread();
};

class ProbeTask : public WorkerTask<Probe>
{
public:
    ProbeTask() { startAndWait(); }
    bool createdSeen = false;

protected:
    void workerCreated(Probe*) override { createdSeen = true; }
};

} // namespace

class TestPlatform : public QObject
{
    Q_OBJECT

private slots:
    void devicePathsFollowTheRoot()
    {
        const QString saved = Platform::root();
        Platform::setRoot("/tmp/stage");
        QCOMPARE(Platform::devicePath("/opt/GUI/Sounds/a.wav"), QString("/tmp/stage/opt/GUI/Sounds/a.wav"));
        Platform::setRoot("/tmp/stage/");
        QCOMPARE(Platform::devicePath("/sys/class/net/wlan0/address"), QString("/tmp/stage/sys/class/net/wlan0/address"));
        Platform::setRoot("/");
        QCOMPARE(Platform::devicePath("/opt/Filter/Filter.xml"), QString("/opt/Filter/Filter.xml"));
        Platform::setRoot(saved);
    }

    void hostBuildNeverRunsShellCommands()
    {
        QVERIFY(!Platform::isDeviceBuild());
        QTemporaryDir dir;
        const QString marker = dir.path() + "/ran";
        Platform::clearRecordedCommands();
        QCOMPARE(Platform::runShellCommand("touch " + marker), 0);
        Platform::runShellCommand("reboot");
        auto player = Platform::startProcess("aplay", {"-N", "/opt/GUI/Sounds/click.wav"});
        player->stop();
        player->stop(); // once only
        QVERIFY(!QFile::exists(marker));
        QCOMPARE(Platform::recordedCommands(),
                 QStringList({"touch " + marker, "reboot", "aplay -N /opt/GUI/Sounds/click.wav",
                              "stop aplay -N /opt/GUI/Sounds/click.wav"}));
    }

    void recordIsBounded()
    {
        Platform::clearRecordedCommands();
        for (int i = 0; i < 1500; ++i)
            Platform::runShellCommand(QString("echo %1").arg(i));
        const QStringList rec = Platform::recordedCommands();
        QCOMPARE(rec.size(), 1000);
        QCOMPARE(rec.last(), QString("echo 1499"));
    }

    void workerIsBuiltOnItsThreadBeforeTheConstructorReturns()
    {
        ProbeTask task;
        QVERIFY(task.isConnectInit);
        QVERIFY(task.createdSeen);
        Probe* probe = ProbeTask::worker();
        QVERIFY(probe);
        QCOMPARE(probe->builtOn, static_cast<QThread*>(&task));
        QCOMPARE(probe->thread(), static_cast<QThread*>(&task));
    }
};

QTEST_GUILESS_MAIN(TestPlatform)
#include "tst_platform.moc"
