#include "Communication/TcpClient.h"

#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"

#include <QDebug>
#include <QMutex>
#include <QMutexLocker>

#include <cstring>

#include <arpa/inet.h>
#include <fcntl.h>
#include <sys/select.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

// One transaction at a time: taken by every public operation, held for the
// whole wait of a reply, and the only guard of the static buffers below.
QRecursiveMutex s_linkMutex;

// One whole frame; allocated once instead of per reply.
unsigned char s_receiveBuffer[TcpClient::MAX_FRAME_SIZE];
// Where an oversized frame is thrown away.
unsigned char s_drainBuffer[1024];

void closeSocket(int& descriptor)
{
    if (descriptor > 0) {
        ::close(descriptor);
        descriptor = 0;
    }
}

} // namespace

TcpClient::TcpClient(QObject* parent)
    : QObject(parent)
{
    std::memset(&serv_addr, 0, sizeof serv_addr);
    std::memset(&client_addr, 0, sizeof client_addr);
    std::memset(&tv, 0, sizeof tv);
}

TcpClient::~TcpClient()
{
    m_watchdog.stop();
    QMutexLocker lock(&s_linkMutex);
    closeSocket(sock_descriptor);
}

void TcpClient::Init()
{
    m_connected = false;
    m_sadPuppyShown = false;
    m_connectedOnce = false;
    onInit();
}

void TcpClient::onInit()
{
    connect(&m_watchdog, &QTimer::timeout, this, &TcpClient::onWatchdogTimeout, Qt::UniqueConnection);
    {
        QMutexLocker lock(&s_linkMutex);
        closeSocket(sock_descriptor);
        sock_descriptor = 0;
        std::memset(&serv_addr, 0, sizeof serv_addr);
        serv_addr.sin_family = AF_INET;
        serv_addr.sin_addr.s_addr = inet_addr(getIpAddress().toLatin1().constData());
        serv_addr.sin_port = htons(static_cast<uint16_t>(getIpPort()));
    }
    m_watchdog.start(WATCHDOG_MS);
}

void TcpClient::onWatchdogTimeout()
{
    if (isConnected())
        return;
    qDebug() << "TCP: Disconnected, trying to reconnect";
    API_SignalMaster::instance()->emitTcpDisconnected();
    // At boot the server may simply not be up yet: only a link that once
    // stood raises the fault screen, and only once per outage.
    if (!m_sadPuppyShown && m_connectedOnce) {
        API_SignalMaster::instance()->emitSadPuppy();
        m_sadPuppyShown = true;
    }
    m_connected = false;
    try {
        connectToHost();
    } catch (unsigned int) {
    }
}

bool TcpClient::isConnected()
{
    QMutexLocker lock(&s_linkMutex);
    if (sock_descriptor <= 0)
        return false;
    // A live idle socket would block (-1); an orderly close reads as 0. So
    // does unread data waiting: the link then counts as down and is replaced.
    return ::recv(sock_descriptor, nullptr, 0, MSG_PEEK | MSG_DONTWAIT) != 0;
}

void TcpClient::connectToHost()
{
    static int timesIn = 0;
    static int formerSockDescriptor = 0;

    QMutexLocker lock(&s_linkMutex);
    closeSocket(sock_descriptor);

    int descriptor = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (descriptor == 0) {
        // 0 means "no socket" here; keep a descriptor that can't be mistaken.
        const int moved = ::fcntl(descriptor, F_DUPFD_CLOEXEC, 1);
        ::close(descriptor);
        descriptor = moved;
    }
    if (descriptor < 0) {
        qDebug() << "TCP: Error Opening socket";
        return;
    }
    sock_descriptor = descriptor;

    if (::connect(sock_descriptor, reinterpret_cast<const sockaddr*>(&serv_addr), sizeof serv_addr) < 0) {
        qDebug() << "TCP: Error Connecting";
        m_connected = false;
        closeSocket(sock_descriptor);
        return;
    }

    qDebug() << "TCP: Connected";
    if (timesIn != 0)
        qDebug() << "We're in connecting again...why? " << formerSockDescriptor;

    m_connected = true;
    m_sadPuppyShown = false;
    API_SignalMaster::instance()->emitTcpReconnected();
    qDebug() << "TCP: Emitting reconnected signal";

    m_connectedOnce = true;
    m_watchdog.start(WATCHDOG_MS);
    formerSockDescriptor = sock_descriptor;
    ++timesIn;
}

void TcpClient::send(const CommandData& frame)
{
    QMutexLocker lock(&s_linkMutex);
    const QByteArray bytes = frame.cmd.getFullCmd();
    ssize_t written = 0;
    if (isConnected())
        written = ::send(sock_descriptor, bytes.constData(), size_t(bytes.size()), MSG_NOSIGNAL);
    if (written != ssize_t(bytes.size())) {
        qDebug() << "TCP: Write error";
        throw STATUS_TCP_WRITE_ERROR;
    }
}

ResponseData TcpClient::receive(int timeout)
{
    QMutexLocker lock(&s_linkMutex);

    // One budget for the whole frame: Linux's select counts the time down in
    // place, and the fraction of a second is dropped on purpose.
    timeval budget;
    budget.tv_sec = timeout / 1000;
    budget.tv_usec = 0;
    fd_set readSet;
    FD_ZERO(&readSet);
    if (sock_descriptor <= 0 || sock_descriptor >= FD_SETSIZE)
        throw STATUS_TCP_NOT_CONNECTED;
    FD_SET(sock_descriptor, &readSet);

    int selected = ::select(sock_descriptor + 1, &readSet, nullptr, nullptr, &budget);
    if (selected <= 0) {
        qDebug() << "TCP: timeout getting size: " << selected << "--timeout value of (ms): " << timeout;
        throw STATUS_TCP_TIMEOUT;
    }

    // A short read of the length is not continued: the missing bytes keep
    // the value the field started with.
    unsigned char lengthBytes[4] = {4, 0, 0, 0};
    const ssize_t got = ::recv(sock_descriptor, lengthBytes, sizeof lengthBytes, 0);
    if (got == 0) {
        qDebug() << "TCP: DISCONNECT";
        throw STATUS_TCP_DISCONNECTED;
    }
    if (got < 0) {
        qDebug() << "TCP: STATUS_TCP_TIMEOUT";
        throw STATUS_TCP_TIMEOUT;
    }
    const quint32 length = quint32(lengthBytes[0]) | (quint32(lengthBytes[1]) << 8)
        | (quint32(lengthBytes[2]) << 16) | (quint32(lengthBytes[3]) << 24);
    std::memcpy(s_receiveBuffer, lengthBytes, sizeof lengthBytes);

    if (length > quint32(MAX_FRAME_SIZE)) {
        while (::recv(sock_descriptor, s_drainBuffer, sizeof s_drainBuffer, MSG_DONTWAIT) > 0) {
        }
        qDebug() << "TCP: Data too big";
        throw STATUS_TCP_DATA_TOO_BIG;
    }
    if (length < 4) {
        qDebug() << "TCP: Data too small";
        throw STATUS_TCP_DATA_TOO_SMALL;
    }

    quint32 received = 4;
    while (received < length) {
        selected = ::select(sock_descriptor + 1, &readSet, nullptr, nullptr, &budget);
        if (selected <= 0) {
            qDebug() << "TCP: timeout getting size: " << selected << "timeout value of (ms): " << timeout;
            throw STATUS_TCP_TIMEOUT;
        }
        const ssize_t n = ::recv(sock_descriptor, s_receiveBuffer + received, length - received, MSG_DONTWAIT);
        if (n == 0) {
            qDebug() << "TCP/IP Recv error, client disconnected: Expected: " << length << " received: " << received;
            throw STATUS_TCP_DISCONNECTED;
        }
        if (n < 0) {
            qDebug() << "TCP Read error, there was something, now there's nothing?";
            throw STATUS_TCP_DISCONNECTED;
        }
        received += quint32(n);
        if (received < length)
            ::usleep(1000);
    }

    ResponseData response;
    response.cmd.setFullData(QByteArray(reinterpret_cast<const char*>(s_receiveBuffer), int(length)));
    return response;
}

ResponseData TcpClient::sendAndReceive(const CommandData& frame, int timeout)
{
    QMutexLocker lock(&s_linkMutex);
    ResponseData response;
    if (!m_connected)
        throw STATUS_TCP_NOT_CONNECTED;

    // Asks for no bytes, so it takes nothing away: a stale reply stays in
    // the socket and fails the transaction check of the next command.
    const ssize_t flushed = ::recv(sock_descriptor, nullptr, 0, MSG_DONTWAIT);
    if (flushed > 0)
        qDebug() << "TCP Flushing out of recv buffer: " << flushed;
    else if (flushed == 0)
        qDebug() << "timeout " << flushed;

    send(frame);
    response = receive(timeout);
    return response;
}

CmdData TcpClient::sendAndReceive(const CmdData& packet, int timeout)
{
    QMutexLocker lock(&s_linkMutex);
    CommandData frame{QUuid()};
    frame.cmd = packet;
    return sendAndReceive(frame, timeout).cmd;
}
