// What the simulator costs: the share of one core that serving the targeting
// reply five times a second takes (the live view's poll), and how fast a job
// list of 400 jobs with 20 readings each is answered, measured through the
// GUI's own command function. Prints medians of repeated runs.

#include "Commands/JobOutCommands.h"
#include "Commands/TargetingOutCommands.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SimServer.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QTemporaryDir>
#include <QTextCodec>
#include <QThread>

#include <algorithm>
#include <cstdio>
#include <ctime>
#include <vector>

namespace {

double median(std::vector<double> v)
{
    std::sort(v.begin(), v.end());
    return v.empty() ? 0.0 : v[v.size() / 2];
}

double threadCpuMs()
{
    timespec t{};
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &t);
    return t.tv_sec * 1000.0 + t.tv_nsec / 1e6;
}

double serverCpuMs(Sim::ServerThread& sim)
{
    double ms = 0.0;
    sim.call([&ms](Sim::Server&) { ms = threadCpuMs(); });
    return ms;
}

bool attach(quint16 port)
{
    TcpClient* old = Commands::instance()->tcpClient();
    setIpAddress(QStringLiteral("127.0.0.1"));
    setIpPort(port);
    Commands::Init();
    delete old;
    // The link client connects from its watchdog, within a second.
    QElapsedTimer t;
    t.start();
    while (!Commands::instance()->tcpClient()->isConnected() && t.elapsed() < 5000) {
        QCoreApplication::processEvents();
        QThread::msleep(20);
    }
    return Commands::instance()->tcpClient()->isConnected();
}

} // namespace

int main(int argc, char* argv[])
{
    QCoreApplication app(argc, argv);
    QTextCodec::setCodecForLocale(QTextCodec::codecForName("UTF-8"));
    QTemporaryDir dir;
    Sim::ServerThread sim;
    sim.options().instrument.dataDir = dir.path();
    if (!sim.start() || !attach(sim.port())) {
        fprintf(stderr, "bench_sim: the simulator did not start\n");
        return 1;
    }
    sim.control(QStringLiteral("place"));

    // ---- targeting: 5 requests a second, the share of a core the server spends ----
    const int kRunSeconds = 4;
    std::vector<double> shares, perRequest;
    for (int run = 0; run < 5; ++run) {
        if (CmdOut_StartTargetingMode() != 0) {
            fprintf(stderr, "bench_sim: targeting refused\n");
            return 1;
        }
        PRESSURE_SWITCH_T p;
        ACCELEROMETER_ORIENTATION_T o;
        CALIBRATION_STATUS_T c;
        QByteArray image;
        const double cpu0 = serverCpuMs(sim);
        QElapsedTimer wall;
        wall.start();
        int requests = 0;
        for (int tick = 0; tick < kRunSeconds * 5; ++tick) {
            while (wall.elapsed() < tick * 200)
                QThread::msleep(2);
            if (CmdOut_GetTargetingInfo(p, o, c, image) != 0 || image.size() != 503208) {
                fprintf(stderr, "bench_sim: bad targeting reply\n");
                return 1;
            }
            ++requests;
        }
        while (wall.elapsed() < kRunSeconds * 1000)
            QThread::msleep(2);
        const double cpu = serverCpuMs(sim) - cpu0;
        shares.push_back(100.0 * cpu / double(wall.elapsed()));
        perRequest.push_back(cpu / requests);
        CmdOut_StopTargetingMode();
    }
    printf("targeting reply at 5/s: %.2f %% of one core (median of %zu runs of %d s; %.2f ms server time per reply)\n",
           median(shares), shares.size(), kRunSeconds, median(perRequest));

    // ---- job list: 400 jobs with 20 readings each ----
    QString made = sim.control(QStringLiteral("bulk 400 20"));
    if (!made.startsWith(QStringLiteral("OK"))) {
        fprintf(stderr, "bench_sim: %s\n", qPrintable(made));
        return 1;
    }
    std::vector<double> listMs;
    int jobs = 0, samples = 0;
    for (int run = 0; run < 15; ++run) {
        QVector<Job> list;
        QElapsedTimer t;
        t.start();
        const STATUS_T st = CmdOut_GetJobInfos(list);
        listMs.push_back(t.nsecsElapsed() / 1e6);
        if (st != 0) {
            fprintf(stderr, "bench_sim: job list failed with %u\n", st);
            return 1;
        }
        jobs = list.size();
        samples = 0;
        for (const Job& j : list)
            samples += j.getNumSamples();
    }
    // The server's own part: the frame in, the reply built.
    std::vector<double> serverMs;
    CmdData request;
    request.setCommandCode(Sim::CMD_GET_JOB_INFOS);
    const QByteArray frame = request.getFullCmd();
    int replyBytes = 0;
    for (int run = 0; run < 15; ++run) {
        sim.call([&](Sim::Server& s) {
            QElapsedTimer t;
            t.start();
            replyBytes = s.protocol().handle(frame).size();
            serverMs.push_back(t.nsecsElapsed() / 1e6);
        });
    }
    // The exchange alone, without turning the reply into jobs.
    std::vector<double> linkMs;
    for (int run = 0; run < 15; ++run) {
        CmdData cmd;
        cmd.setCommandCode(Sim::CMD_GET_JOB_INFOS);
        QElapsedTimer t;
        t.start();
        const CmdData reply = Commands::instance()->sendAndReceive(cmd, true, 4000);
        linkMs.push_back(t.nsecsElapsed() / 1e6);
        if (reply.getPacketlength() != replyBytes - 16)
            fprintf(stderr, "bench_sim: short job list reply\n");
    }
    printf("job list of %d jobs, %d readings (%d bytes): answered by the server in %.1f ms, request and reply "
           "over the link %.1f ms, through CmdOut_GetJobInfos with decoding %.1f ms (medians of 15)\n",
           jobs, samples, replyBytes, median(serverMs), median(linkMs), median(listMs));
    return 0;
}
