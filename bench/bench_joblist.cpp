// The home screen's rebuild: from JobInfoUpdated to the rebuilt job list,
// for 50 and for 400 jobs of 20 readings each, against the simulator; the
// first build (rows made) and the full re-read with the rebuild; and the
// process's resident memory with 400 jobs listed. The simulator runs as a
// process of its own, as the server does on the instrument, so that the
// memory figure is the GUI's alone.

#include "AppShell.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/JobListScreen.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"

#include <QApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QTcpServer>
#include <QTcpSocket>
#include <QTemporaryDir>
#include <QTextStream>

#include <algorithm>
#include <cstdio>
#include <vector>

namespace {

double median(std::vector<double> v)
{
    std::sort(v.begin(), v.end());
    return v.empty() ? 0.0 : v[v.size() / 2];
}

long residentKiB()
{
    QFile status(QStringLiteral("/proc/self/status"));
    if (!status.open(QIODevice::ReadOnly))
        return -1;
    for (const QByteArray& line : status.readAll().split('\n'))
        if (line.startsWith("VmRSS:"))
            return line.mid(6).trimmed().split(' ').first().toLong();
    return -1;
}

bool waitFor(const std::function<bool()>& done, int ms)
{
    QElapsedTimer t;
    t.start();
    while (!done()) {
        if (t.elapsed() > ms)
            return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
    }
    return true;
}

quint16 freePort()
{
    QTcpServer probe;
    probe.listen(QHostAddress::LocalHost, 0);
    return probe.serverPort();
}

// One line on the simulator's control port; returns the reply's last line.
QString control(quint16 port, const QString& line)
{
    QTcpSocket socket;
    socket.connectToHost(QHostAddress::LocalHost, port);
    if (!socket.waitForConnected(5000))
        return QStringLiteral("ERR no control port");
    socket.write(line.toUtf8() + "\n");
    QString last;
    QElapsedTimer t;
    t.start();
    while (t.elapsed() < 60000) {
        if (!socket.canReadLine() && !socket.waitForReadyRead(500))
            continue;
        while (socket.canReadLine()) {
            last = QString::fromUtf8(socket.readLine()).trimmed();
            if (last.startsWith(QLatin1String("OK")) || last.startsWith(QLatin1String("ERR")))
                return last;
        }
    }
    return QStringLiteral("ERR no reply");
}

} // namespace

int main(int argc, char** argv)
{
    // The program's own start-up choice, so that the figures are its own.
    AppShell::pinTimeZone();
    qputenv("QT_QPA_PLATFORM", qgetenv("QT_QPA_PLATFORM").isEmpty() ? QByteArray("offscreen") : qgetenv("QT_QPA_PLATFORM"));
    QApplication app(argc, argv);
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext&, const QString&) {});
    QTextStream out(stdout);

    QTemporaryDir data;
    const quint16 port = freePort();
    const quint16 controlPort = freePort();
    QProcess sim;
    sim.setProgram(QCoreApplication::applicationDirPath() + QStringLiteral("/../bin/MeasurementServerSim"));
    sim.setArguments({QStringLiteral("--port"), QString::number(port), QStringLiteral("--control-port"),
                      QString::number(controlPort), QStringLiteral("--data"), data.path(),
                      QStringLiteral("--reset"), QStringLiteral("--no-stdin")});
    sim.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    sim.start();
    if (!sim.waitForStarted(5000)
        || !waitFor([&] { return control(controlPort, QStringLiteral("status")).startsWith(QLatin1String("OK")); }, 10000)) {
        out << "simulator did not start\n";
        return 1;
    }
    setIpAddress(QStringLiteral("127.0.0.1"));
    setIpPort(port);

    AppShell::registerMetaTypes();
    LocaleHelper::Init();
    StringTables::Init();
    AudioPlayer::instance()->Init();
    DataManager* dataManager = DataManager::instance();
    dataManager->Init();

    ScreenMaster master;
    master.show();
    JobListScreen* home = master.findChild<JobListScreen*>();
    if (!home || !waitFor([&] { return dataManager->getDataInitialized() && home->isReady(); }, 30000)) {
        out << "home screen did not come up\n";
        return 1;
    }

    const int runs = 15;
    const long baseKiB = residentKiB();
    for (int jobs : {50, 400}) {
        dataManager->deleteAllJobs();
        control(controlPort, QStringLiteral("memory 1000 100000"));
        control(controlPort, QStringLiteral("bulk %1 20").arg(jobs));

        // First build: the rows for these jobs are made.
        QElapsedTimer first;
        first.start();
        dataManager->updateJobInfos();
        if (!waitFor([&] { return home->isReady() && home->getNumCompletedJobs() == jobs; }, 60000)) {
            out << "list of " << jobs << " jobs not built\n";
            return 1;
        }
        const qint64 firstMs = first.elapsed();
        const long builtKiB = residentKiB();

        std::vector<double> rebuild;
        std::vector<double> reread;
        for (int i = 0; i < runs; ++i) {
            QElapsedTimer t;
            t.start();
            // Delivered directly on this thread: the timing is the rebuild.
            API_SignalMaster::instance()->emitJobInfoUpdated();
            waitFor([&] { return home->isReady(); }, 10000);
            rebuild.push_back(t.nsecsElapsed() / 1e6);

            QElapsedTimer r;
            r.start();
            dataManager->updateJobInfos();
            QCoreApplication::processEvents();
            waitFor([&] { return home->isReady(); }, 10000);
            reread.push_back(r.nsecsElapsed() / 1e6);
        }
        out << QStringLiteral("jobs %1: JobInfoUpdated to rebuilt list %2 ms (median of %3); "
                              "re-read from the server and rebuild %4 ms; first build with rows made %5 ms\n")
                   .arg(jobs)
                   .arg(median(rebuild), 0, 'f', 1)
                   .arg(runs)
                   .arg(median(reread), 0, 'f', 1)
                   .arg(firstMs);
        if (jobs == 400)
            out << QStringLiteral("resident memory with 400 jobs listed: %1 MiB (%2 MiB before any job was listed)\n")
                       .arg(builtKiB / 1024.0, 0, 'f', 1)
                       .arg(baseKiB / 1024.0, 0, 'f', 1);
        out.flush();
    }
    // The list hands freed memory back once it has been quiet for a moment.
    QElapsedTimer quiet;
    quiet.start();
    while (quiet.elapsed() < 2500)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 50);
    const long rss = residentKiB();
    sim.kill();
    sim.waitForFinished(3000);
    out << QStringLiteral("resident memory after %1 re-reads of the 400 jobs: %2 MiB\n")
               .arg(runs)
               .arg(rss / 1024.0, 0, 'f', 1);
    return 0;
}
