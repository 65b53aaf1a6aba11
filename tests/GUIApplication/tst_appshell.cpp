// Start-up behaviour: the address argument, the version file, the log and
// the exception barrier of the event loop.
#include "AppShell.h"
#include "MyApplication.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

#include <stdexcept>

namespace {

class Thrower : public QObject
{
public:
    enum Kind { Std, Status, Other };
    Kind kind = Std;
    int handled = 0;

protected:
    bool event(QEvent* e) override
    {
        if (e->type() != QEvent::User)
            return QObject::event(e);
        ++handled;
        switch (kind) {
        case Std: throw std::runtime_error("boom");
        case Status: throw static_cast<unsigned int>(0x103);
        case Other: throw 3.5;
        }
        return true;
    }
};

QString readAll(const QString& path)
{
    QFile f(path);
    f.open(QIODevice::ReadOnly);
    return QString::fromUtf8(f.readAll());
}

} // namespace

class TestAppShell : public QObject
{
    Q_OBJECT

private slots:
    void init()
    {
        setIpAddress("127.0.0.1");
        setIpPort(6300);
        QFile::remove(MyApplication::logFilePath());
        QFile::remove(MyApplication::oldLogFilePath());
    }
    void cleanupTestCase()
    {
        QFile::remove(MyApplication::logFilePath());
        QFile::remove(MyApplication::oldLogFilePath());
    }

    void addressArgument_data()
    {
        QTest::addColumn<QStringList>("args");
        QTest::addColumn<QString>("address");
        QTest::addColumn<int>("port");
        QTest::newRow("address and port") << QStringList{"app", "10.0.0.7:7000"} << "10.0.0.7" << 7000;
        QTest::newRow("no colon") << QStringList{"app", "10.0.0.7"} << "127.0.0.1" << 6300;
        QTest::newRow("two colons") << QStringList{"app", "a:1:2"} << "127.0.0.1" << 6300;
        QTest::newRow("blanks trimmed") << QStringList{"app", "  10.1.1.1 : 6400 "} << "10.1.1.1" << 6400;
        QTest::newRow("port not a number gives 0") << QStringList{"app", "host:abc"} << "host" << 0;
        QTest::newRow("second argument") << QStringList{"app", "h:1", "x"} << "127.0.0.1" << 6300;
        QTest::newRow("no argument") << QStringList{"app"} << "127.0.0.1" << 6300;
        QTest::newRow("empty pieces kept") << QStringList{"app", ":"} << "" << 0;
    }
    void addressArgument()
    {
        QFETCH(QStringList, args);
        QFETCH(QString, address);
        QFETCH(int, port);
        AppShell::applyAddressArgument(args);
        QCOMPARE(getIpAddress(), address);
        QCOMPARE(getIpPort(), port);
    }

    void versionText()
    {
        QCOMPARE(AppShell::versionText("exported", "Apr 20 2023", "07:12:52"),
                 QString("1.0.exported Apr 20 2023 07:12:52"));
        QCOMPARE(AppShell::versionText("1234:1240M", "Apr 20 2023", "07:12:52"),
                 QString("1.0.1240 Apr 20 2023 07:12:52"));
        QCOMPARE(AppShell::versionText("", "d", "t"), QString("1.0. d t"));
    }
    void versionFileHasNoLineEnd()
    {
        QTemporaryDir dir;
        AppShell::writeVersionFile(dir.path());
        const QString text = readAll(dir.path() + "/GUIVersion.txt");
        QVERIFY(text.startsWith("1.0.exported "));
        QVERIFY(!text.endsWith('\n'));
        // Truncated on every start, never appended to.
        AppShell::writeVersionFile(dir.path());
        QCOMPARE(readAll(dir.path() + "/GUIVersion.txt"), text);
    }

    void logRotation_data()
    {
        QTest::addColumn<qint64>("size");
        QTest::addColumn<bool>("rotated");
        QTest::newRow("exactly the limit") << qint64(25000000) << false;
        QTest::newRow("one byte over") << qint64(25000001) << true;
    }
    void logRotation()
    {
        QFETCH(qint64, size);
        QFETCH(bool, rotated);
        {
            QFile live(MyApplication::logFilePath());
            QVERIFY(live.open(QIODevice::WriteOnly));
            QVERIFY(live.resize(size));
        }
        {
            QFile old(MyApplication::oldLogFilePath());
            QVERIFY(old.open(QIODevice::WriteOnly));
            old.write("previous generation");
        }
        MyApplication::logError("fresh line");
        if (rotated) {
            QCOMPARE(readAll(MyApplication::logFilePath()), QString("fresh line\n"));
            QCOMPARE(QFileInfo(MyApplication::oldLogFilePath()).size(), size);
        } else {
            QCOMPARE(QFileInfo(MyApplication::logFilePath()).size(), size + 11);
            QCOMPARE(readAll(MyApplication::oldLogFilePath()), QString("previous generation"));
        }
    }

    void notifyLogsAndGoesOn()
    {
        Thrower throwers[3];
        throwers[0].kind = Thrower::Std;
        throwers[1].kind = Thrower::Status;
        throwers[2].kind = Thrower::Other;
        for (Thrower& t : throwers)
            QCoreApplication::postEvent(&t, new QEvent(QEvent::User));
        QCoreApplication::processEvents();
        for (Thrower& t : throwers)
            QCOMPARE(t.handled, 1);
        const QStringList lines = readAll(MyApplication::logFilePath()).split('\n', Qt::SkipEmptyParts);
        QCOMPARE(lines.size(), 3);
        QVERIFY(lines[0].endsWith("\tstd::exception was caught:\tboom"));
        QVERIFY(lines[1].endsWith("\tunhandled STATUS_T was caught:\t103"));
        QVERIFY(lines[2].endsWith("\tunknown exception was caught"));
        // The event loop still delivers events afterwards.
        bool delivered = false;
        QTimer::singleShot(0, [&] { delivered = true; });
        QTRY_VERIFY(delivered);
    }

    void systemStatusEqualityIsAlwaysFalse()
    {
        SystemStatus a;
        SystemStatus b;
        QVERIFY(!(a == b));
        QVERIFY(!(a == a));
        b.setJobID(7);
        QVERIFY(!(a == b));
    }
    void systemStatusClearContents()
    {
        SystemStatus s;
        s.setSystemState(STATE_MEASURING);
        s.setMeasureID(12);
        s.setEntityChanges({SystemStatus::EntityChange{1007, "Job", 2}});
        s.ClearContents();
        QCOMPARE(s.getSystemState(), STATE_POWER_UP);
        QCOMPARE(s.getMeasureID(), short(0));
        QVERIFY(s.getEntityChanges().empty());
    }
};

int main(int argc, char** argv)
{
    MyApplication app(argc, argv);
    TestAppShell test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_appshell.moc"
