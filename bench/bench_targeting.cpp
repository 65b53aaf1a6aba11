// The targeting screen's live view against the simulator on loopback: the
// real screen and its own 200 ms poll, for 30 s (or the seconds given as the
// first argument). Prints the frames per second reached, the latency from
// the request to the pixmap on the label (median, p95), this process's CPU
// share, and the same frame read through a bare socket loop as the floor.
// The simulator runs as its own process so that its work is not counted.

#include "GUIAPI/DataManager.h"
#include "Communication/CmdData.h"
#include "Screens/JobListScreen.h"
#include "Screens/ScreenMaster.h"
#include "Screens/TargetingScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"

#include "AppShell.h"
#include "support/TestSupport.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QEventLoop>
#include <QProcess>
#include <QTcpSocket>
#include <QTimer>

#include <algorithm>
#include <cstdio>
#include <vector>

#include <arpa/inet.h>
#include <netinet/in.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

const long CODE_GET_TARGETING_INFO = 0x41000220;
const int FLOOR_TRIPS = 150;

double percentile(std::vector<double> v, int p)
{
    if (v.empty())
        return 0;
    std::sort(v.begin(), v.end());
    return v[std::min(v.size() - 1, v.size() * size_t(p) / 100)];
}

double cpuSeconds()
{
    rusage usage{};
    getrusage(RUSAGE_SELF, &usage);
    return usage.ru_utime.tv_sec + usage.ru_utime.tv_usec / 1e6 + usage.ru_stime.tv_sec
        + usage.ru_stime.tv_usec / 1e6;
}

// Sleeps in the event loop, as the product does between ticks.
void waitMs(int ms)
{
    QEventLoop loop;
    QTimer::singleShot(ms, &loop, &QEventLoop::quit);
    loop.exec();
}

bool sendControl(quint16 port, const QByteArray& line)
{
    QTcpSocket socket;
    socket.connectToHost(QStringLiteral("127.0.0.1"), port);
    if (!socket.waitForConnected(2000))
        return false;
    socket.write(line + "\n");
    socket.waitForBytesWritten(1000);
    QByteArray reply;
    QElapsedTimer clock;
    clock.start();
    while (!reply.contains("OK") && !reply.contains("ERR") && clock.elapsed() < 2000) {
        if (socket.waitForReadyRead(200))
            reply += socket.readAll();
    }
    return reply.contains("OK");
}

bool recvAll(int fd, char* to, size_t count)
{
    size_t done = 0;
    while (done < count) {
        const ssize_t n = ::recv(fd, to + done, count - done, 0);
        if (n <= 0)
            return false;
        done += size_t(n);
    }
    return true;
}

std::vector<double> bareSocketFrames(quint16 port)
{
    const int fd = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(port);
    if (::connect(fd, reinterpret_cast<sockaddr*>(&address), sizeof address) < 0)
        return {};
    CmdData cmd;
    cmd.setCommandCode(CODE_GET_TARGETING_INFO);
    cmd.append_si16(482);
    cmd.append_si16(348);
    const QByteArray request = cmd.getFullCmd();
    std::vector<char> buffer(CmdData::MAX_FRAME_SIZE);
    std::vector<double> times;
    for (int i = 0; i < FLOOR_TRIPS; ++i) {
        QElapsedTimer clock;
        clock.start();
        ::send(fd, request.constData(), size_t(request.size()), MSG_NOSIGNAL);
        if (!recvAll(fd, buffer.data(), 4))
            break;
        const quint32 length = quint8(buffer[0]) | (quint8(buffer[1]) << 8) | (quint8(buffer[2]) << 16)
            | (quint32(quint8(buffer[3])) << 24);
        if (length < 4 || length > buffer.size() || !recvAll(fd, buffer.data() + 4, length - 4))
            break;
        times.push_back(clock.nsecsElapsed() / 1000.0);
    }
    ::close(fd);
    return times;
}

} // namespace

int main(int argc, char* argv[])
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    const int seconds = argc > 1 ? std::max(1, atoi(argv[1])) : 30;

    const quint16 port = TestSupport::freeLocalPort();
    quint16 controlPort = TestSupport::freeLocalPort();
    if (controlPort == port)
        controlPort = quint16(port + 1);
    QProcess sim;
    sim.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    sim.setStandardOutputFile(QProcess::nullDevice());
    const QString simPath = QDir(QCoreApplication::applicationDirPath()).filePath("../bin/MeasurementServerSim");
    const QString dataDir = TestSupport::makeTempDir("bench-targeting-sim");
    sim.start(simPath, {"--port", QString::number(port), "--control-port", QString::number(controlPort), "--data",
                        dataDir, "--reset", "--no-stdin", "--seed", "3"});
    if (!sim.waitForStarted(5000)) {
        std::fprintf(stderr, "cannot start %s\n", qPrintable(simPath));
        return 1;
    }
    QElapsedTimer up;
    up.start();
    while (!sendControl(controlPort, "place") && up.elapsed() < 10000)
        waitMs(100);

    setIpAddress(QStringLiteral("127.0.0.1"));
    setIpPort(port);
    AppShell::registerMetaTypes();
    LocaleHelper::Init();
    StringTables::Init();
    AudioPlayer::instance()->Init();
    DataManager* data = DataManager::instance();
    data->Init();

    auto* master = new ScreenMaster;
    master->show();
    up.restart();
    while (!(data->getDataInitialized() && master->findChild<JobListScreen*>()->isReady()) && up.elapsed() < 20000)
        waitMs(50);
    const unsigned job = data->findJobByName(QStringLiteral("Job"));
    if (job == 65535) {
        std::fprintf(stderr, "no open demo job\n");
        return 1;
    }
    data->setActiveJob(job);
    master->onAddScreenToStack(TARGETING_SCREEN_ID);
    auto* screen = qobject_cast<TargetingScreen*>(master->currentScreen());
    if (!screen) {
        std::fprintf(stderr, "no targeting screen\n");
        return 1;
    }

    std::vector<double> latencies;
    bool counting = false;
    QObject::connect(screen, &TargetingScreen::targetingFrameShown, [&](qint64 us) {
        if (counting)
            latencies.push_back(double(us));
    });
    // Past the start: the first frames and the init step.
    waitMs(1500);

    counting = true;
    const qint64 framesBefore = screen->framesShown();
    const double cpuBefore = cpuSeconds();
    QElapsedTimer wall;
    wall.start();
    waitMs(seconds * 1000);
    const double elapsed = wall.nsecsElapsed() / 1e9;
    const double cpu = cpuSeconds() - cpuBefore;
    const qint64 frames = screen->framesShown() - framesBefore;
    counting = false;

    const std::vector<double> floor = bareSocketFrames(port);
    const double screenMedian = percentile(latencies, 50) / 1000.0;
    const double floorMedian = percentile(floor, 50) / 1000.0;

    std::printf("targeting live view, %.1f s against the simulator on loopback, 482 x 348 RGB888 frames\n", elapsed);
    std::printf("frames per second          %6.2f   (poll aims at 5)\n", frames / elapsed);
    std::printf("frame latency, request to pixmap on the label: median %6.2f ms   p95 %6.2f ms   (%zu frames)\n",
                screenMedian, percentile(latencies, 95) / 1000.0, latencies.size());
    std::printf("GUI process CPU            %6.2f %% of one core\n", 100.0 * cpu / elapsed);
    std::printf("bare socket floor, same frame: median %6.2f ms   p95 %6.2f ms   (%zu frames)\n", floorMedian,
                percentile(floor, 95) / 1000.0, floor.size());
    if (floorMedian > 0)
        std::printf("ratio (median screen / median floor): %.2f\n", screenMedian / floorMedian);

    // Leave without the screen's own stop: the simulator goes first.
    sim.kill();
    sim.waitForFinished(3000);
    QDir(dataDir).removeRecursively();
    std::fflush(stdout);
    _exit(0);
}
