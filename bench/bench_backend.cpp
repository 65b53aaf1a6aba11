// Figures of the back end against the simulator:
//  - refreshJobInfos with 400 jobs of 20 samples (plus the demo jobs),
//  - setSystemStatus for a status that changes nothing,
//  - the idle poll's cost in CPU time per second of this process, with the
//    simulator in a process of its own so that only the GUI side counts.
// Each time is the median of repeated runs.

#include "AppShell.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/StringTables.h"
#include "SimServer.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QProcess>
#include <QTcpServer>
#include <QTemporaryDir>
#include <QThread>
#include <QTimer>

#include <algorithm>
#include <atomic>
#include <cstdio>
#include <functional>
#include <memory>
#include <vector>

#include <sys/resource.h>
#include <unistd.h>

namespace {

const int kJobs = 400;
const int kSamplesPerJob = 20;

quint16 freePort()
{
    QTcpServer probe;
    probe.listen(QHostAddress::LocalHost, 0);
    return probe.serverPort();
}

bool waitUntil(const std::function<bool()>& cond, int timeoutMs)
{
    QElapsedTimer timer;
    timer.start();
    while (!cond()) {
        if (timer.hasExpired(timeoutMs))
            return false;
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
        QThread::msleep(2);
    }
    return true;
}

// Runs f on the DataManager thread while this thread keeps its events going.
void onDataManagerThread(const std::function<void()>& f)
{
    std::atomic<bool> done{false};
    QMetaObject::invokeMethod(
        DataManager::instance(),
        [&] {
            f();
            done = true;
        },
        Qt::QueuedConnection);
    waitUntil([&] { return done.load(); }, 600000);
}

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values.empty() ? 0.0 : values[values.size() / 2];
}

double processCpuMs()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_utime.tv_sec * 1000.0 + usage.ru_utime.tv_usec / 1000.0
        + usage.ru_stime.tv_sec * 1000.0 + usage.ru_stime.tv_usec / 1000.0;
}

// Fills the simulator's store with the bench jobs, measured from one of the
// demo readings with their own times.
bool populate(const QString& dataDir)
{
    Sim::ServerThread sim;
    sim.options().port = freePort();
    sim.options().controlPort = -1;
    sim.options().instrument.dataDir = dataDir;
    if (!sim.start())
        return false;
    bool ok = false;
    sim.call([&ok](Sim::Server& server) {
        Sim::JobBook& book = server.instrument().jobs();
        const Sim::Job* demo = nullptr;
        for (const Sim::Job& job : book.jobs()) {
            if (!job.samples.isEmpty())
                demo = &job;
        }
        if (!demo)
            return;
        const Sim::Sample reading = demo->samples.first();
        const QDateTime start = QDateTime::currentDateTime().addDays(-30);
        const Sim::JobBook::Defaults defaults;
        for (int j = 0; j < kJobs; ++j) {
            Sim::JobBook::Description description;
            description.name = QString("Bench %1").arg(j);
            description.modeText = "NONE";
            description.size = kSamplesPerJob;
            int dbIndex = 0;
            if (book.add(description, defaults, &dbIndex) != 0)
                return;
            for (int s = 0; s < kSamplesPerJob; ++s) {
                Sim::Sample sample = reading;
                // Dates spread so that the sort has work to do.
                sample.time = start.addSecs(((j * 7919) % kJobs) * 600 + s);
                book.commitMeasurement(description.name, sample);
            }
        }
        ok = true;
    });
    return ok;
}

} // namespace

int main(int argc, char* argv[])
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    AppShell::registerMetaTypes();
    // The bench's figures, not the back end's chatter.
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext&, const QString&) {});

    QTemporaryDir dataDir(QDir::tempPath() + "/marigold-bench-backend-XXXXXX");
    QElapsedTimer clock;
    clock.start();
    if (!populate(dataDir.path())) {
        std::fprintf(stderr, "could not fill the simulator's store\n");
        return 1;
    }
    std::printf("store: %d jobs of %d samples written in %.1f s\n", kJobs, kSamplesPerJob,
                clock.elapsed() / 1000.0);

    // The simulator in its own process, on the store just written.
    const quint16 port = freePort();
    QProcess server;
    server.setProgram(QCoreApplication::applicationDirPath() + "/../bin/MeasurementServerSim");
    server.setArguments({"--port", QString::number(port), "--control-port", QString::number(freePort()),
                         "--data", dataDir.path(), "--no-stdin"});
    server.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    server.start();
    if (!server.waitForStarted(5000)) {
        std::fprintf(stderr, "could not start %s\n", qPrintable(server.program()));
        return 1;
    }
    QThread::msleep(1500);

    StringTables::instance();
    StringTables::Init();
    DataManagerTask::instance();
    DataManager* dm = DataManager::instance();
    dm->Init();
    std::atomic<bool> initialised{false};
    QObject::connect(dm, &DataManager::DataManagerInitComplete, &app, [&] { initialised = true; });
    setIpAddress("127.0.0.1");
    setIpPort(port);
    Commands::Init();
    if (!waitUntil([&] { return initialised.load(); }, 60000)) {
        std::fprintf(stderr, "the back end did not come up\n");
        return 1;
    }

    // Idle: the poll runs twice a second; this process's CPU over 10 s, with
    // this thread in a plain event loop as the GUI thread would be.
    auto runEventLoop = [](int ms) {
        QEventLoop loop;
        QTimer::singleShot(ms, &loop, &QEventLoop::quit);
        loop.exec();
    };
    runEventLoop(2000);
    const double cpuBefore = processCpuMs();
    QElapsedTimer idle;
    idle.start();
    runEventLoop(10000);
    const double cpuMsPerSecond = (processCpuMs() - cpuBefore) / (idle.elapsed() / 1000.0);
    std::printf("idle poll: %.2f ms CPU per second (%.2f %% of one core)\n", cpuMsPerSecond,
                cpuMsPerSecond / 10.0);

    // The poll would share the link and the lock with the figures below.
    onDataManagerThread([dm] { dm->getPollStatus()->onStopPolling(); });

    std::vector<double> refresh;
    unsigned int jobs = 0;
    for (int run = 0; run < 11; ++run) {
        onDataManagerThread([&] {
            QElapsedTimer t;
            t.start();
            dm->refreshJobInfos();
            refresh.push_back(t.nsecsElapsed() / 1e6);
        });
        jobs = dm->getNumberOfJobs();
    }
    std::vector<double> exchange;
    for (int run = 0; run < 11; ++run) {
        onDataManagerThread([&] {
            QVector<Job> list;
            QElapsedTimer t;
            t.start();
            SysAPI_GetJobs(list);
            exchange.push_back(t.nsecsElapsed() / 1e6);
        });
    }
    std::printf("refreshJobInfos: %u jobs, %u samples: median %.1f ms (min %.1f, max %.1f)\n", jobs,
                dm->getTotalNumSamples(), median(refresh), *std::min_element(refresh.begin(), refresh.end()),
                *std::max_element(refresh.begin(), refresh.end()));
    std::printf("  of which reading the list from the server (SysAPI_GetJobs): median %.1f ms\n",
                median(exchange));

    // The same status again: every step runs, nothing changes.
    SystemStatus status = dm->getSystemStatus();
    status.setUSettingsBits(0);
    status.setEntityChanges({});
    status.setNumOfErrors(0);
    std::vector<double> perCall;
    const int calls = 2000;
    for (int batch = 0; batch < 15; ++batch) {
        onDataManagerThread([&] {
            QElapsedTimer t;
            t.start();
            for (int i = 0; i < calls; ++i)
                dm->setSystemStatus(status);
            perCall.push_back(t.nsecsElapsed() / 1e3 / calls);
        });
    }
    std::printf("setSystemStatus, no change: median %.2f us per status\n", median(perCall));

    server.terminate();
    server.waitForFinished(5000);
    // Leaves without unwinding the threads that still run.
    std::fflush(stdout);
    _exit(0);
}
