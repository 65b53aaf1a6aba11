// Round trips of a targeting-size reply (503,208-byte payload) over loopback:
// through Commands::sendAndReceive, and through a bare blocking socket read
// loop as the floor. Prints median and p95 latency, frames per second and
// the ratio of the two medians.

#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "SharedSystem/Instrument.h"
#include "support/ScriptedPeer.h"

#include <QCoreApplication>
#include <QElapsedTimer>

#include <algorithm>
#include <cstdio>
#include <vector>

#include <arpa/inet.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

const int PAYLOAD_BYTES = 503208;
const long CODE = 0x41000220;
const int RUNS = 5;
const int TRIPS_PER_RUN = 60;

struct Figures {
    double median = 0;
    double p95 = 0;
    double framesPerSecond = 0;
};

Figures summarise(std::vector<double> microseconds)
{
    std::sort(microseconds.begin(), microseconds.end());
    Figures f;
    f.median = microseconds[microseconds.size() / 2];
    f.p95 = microseconds[std::min(microseconds.size() - 1, microseconds.size() * 95 / 100)];
    f.framesPerSecond = 1e6 / f.median;
    return f;
}

void print(const char* what, const Figures& f)
{
    std::printf("%-28s median %8.1f us   p95 %8.1f us   %7.1f frames/s   %7.1f MB/s\n", what, f.median, f.p95,
                f.framesPerSecond, f.framesPerSecond * (PAYLOAD_BYTES + 16) / 1e6);
}

std::vector<double> throughCommands()
{
    std::vector<double> times;
    for (int run = 0; run < RUNS; ++run) {
        for (int i = 0; i < TRIPS_PER_RUN; ++i) {
            CmdData cmd;
            cmd.setCommandCode(CODE);
            cmd.append_si16(482);
            cmd.append_si16(348);
            QElapsedTimer clock;
            clock.start();
            const CmdData reply = Commands::instance()->sendAndReceive(cmd, true, 4000);
            times.push_back(clock.nsecsElapsed() / 1000.0);
            if (reply.getPacketlength() != PAYLOAD_BYTES) {
                std::fprintf(stderr, "short reply\n");
                return {};
            }
        }
    }
    return times;
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

std::vector<double> throughBareSocket(quint16 port)
{
    const int fd = ::socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(port);
    if (::connect(fd, reinterpret_cast<sockaddr*>(&address), sizeof address) < 0)
        return {};
    CmdData cmd;
    cmd.setCommandCode(CODE);
    cmd.append_si16(482);
    cmd.append_si16(348);
    const QByteArray request = cmd.getFullCmd();
    std::vector<char> buffer(CmdData::MAX_FRAME_SIZE);
    std::vector<double> times;
    for (int run = 0; run < RUNS; ++run) {
        for (int i = 0; i < TRIPS_PER_RUN; ++i) {
            QElapsedTimer clock;
            clock.start();
            ::send(fd, request.constData(), size_t(request.size()), MSG_NOSIGNAL);
            if (!recvAll(fd, buffer.data(), 4))
                return {};
            const quint32 length = quint8(buffer[0]) | (quint8(buffer[1]) << 8) | (quint8(buffer[2]) << 16)
                | (quint32(quint8(buffer[3])) << 24);
            if (length > buffer.size() || !recvAll(fd, buffer.data() + 4, length - 4))
                return {};
            times.push_back(clock.nsecsElapsed() / 1000.0);
        }
    }
    ::close(fd);
    return times;
}

} // namespace

int main(int argc, char* argv[])
{
    QCoreApplication app(argc, argv);

    QByteArray payload(PAYLOAD_BYTES, '\0');
    for (int i = 0; i < payload.size(); ++i)
        payload[i] = char(i * 13);
    ScriptedPeer peer;
    if (!peer.listen()) {
        std::fprintf(stderr, "cannot listen\n");
        return 1;
    }
    peer.answerAll(0, payload);

    setIpAddress("127.0.0.1");
    setIpPort(peer.port());
    Commands::Init();
    Commands::instance()->tcpClient()->connectToHost();
    if (!Commands::instance()->tcpClient()->isConnected()) {
        std::fprintf(stderr, "no link\n");
        return 1;
    }

    const std::vector<double> link = throughCommands();
    const std::vector<double> floor = throughBareSocket(peer.port());
    if (link.empty() || floor.empty()) {
        std::fprintf(stderr, "a run failed\n");
        return 1;
    }
    std::printf("%d round trips each, %d-byte payload, loopback\n", RUNS * TRIPS_PER_RUN, PAYLOAD_BYTES);
    const Figures l = summarise(link);
    const Figures f = summarise(floor);
    print("Commands::sendAndReceive", l);
    print("bare socket read loop", f);
    std::printf("ratio (median link / median floor): %.2f\n", l.median / f.median);
    delete Commands::instance()->tcpClient();
    return 0;
}
