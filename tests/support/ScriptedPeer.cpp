#include "support/ScriptedPeer.h"

#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"

#include <QSignalSpy>

#include <chrono>
#include <map>

#include <arpa/inet.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/socket.h>
#include <unistd.h>

namespace {

// Frames longer than this are not waited for: what has come is taken as is.
const quint32 kLongestFrame = 16u * 1024u * 1024u;

quint32 lengthField(const QByteArray& bytes)
{
    const unsigned char* p = reinterpret_cast<const unsigned char*>(bytes.constData());
    return quint32(p[0]) | (quint32(p[1]) << 8) | (quint32(p[2]) << 16) | (quint32(p[3]) << 24);
}

void putLE(QByteArray& out, quint32 value, int bytes)
{
    for (int i = 0; i < bytes; ++i)
        out.append(char((value >> (8 * i)) & 0xFF));
}

} // namespace

ScriptedPeer::ScriptedPeer() = default;

ScriptedPeer::~ScriptedPeer()
{
    m_running = false;
    if (m_thread.joinable())
        m_thread.join();
    closeAllLocked();
    if (m_listenFd >= 0)
        ::close(m_listenFd);
}

bool ScriptedPeer::listen(quint16 port)
{
    const int fd = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    if (fd < 0)
        return false;
    const int one = 1;
    ::setsockopt(fd, SOL_SOCKET, SO_REUSEADDR, &one, sizeof one);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(port);
    if (::bind(fd, reinterpret_cast<sockaddr*>(&address), sizeof address) < 0 || ::listen(fd, 8) < 0) {
        ::close(fd);
        return false;
    }
    socklen_t size = sizeof address;
    ::getsockname(fd, reinterpret_cast<sockaddr*>(&address), &size);
    {
        std::lock_guard<std::mutex> lock(m_mutex);
        m_listenFd = fd;
        m_port = ntohs(address.sin_port);
    }
    if (!m_running.exchange(true))
        m_thread = std::thread(&ScriptedPeer::run, this);
    return true;
}

void ScriptedPeer::stop()
{
    if (!m_running)
        return;
    m_stopRequested = true;
    while (m_stopRequested)
        std::this_thread::sleep_for(std::chrono::milliseconds(2));
}

void ScriptedPeer::dropConnections()
{
    if (!m_running)
        return;
    m_dropRequested = true;
    while (m_dropRequested)
        std::this_thread::sleep_for(std::chrono::milliseconds(2));
}

void ScriptedPeer::queueReply(const QByteArray& bytes)
{
    Reply reply;
    reply.chunks << bytes;
    queueReply(reply);
}

void ScriptedPeer::queueReply(const Reply& reply)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_queued << reply;
}

void ScriptedPeer::setResponder(Responder responder)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_responder = std::move(responder);
}

void ScriptedPeer::sendNow(const QByteArray& bytes)
{
    std::lock_guard<std::mutex> lock(m_mutex);
    m_unsolicited << bytes;
}

QList<QByteArray> ScriptedPeer::receivedFrames() const
{
    std::lock_guard<std::mutex> lock(m_mutex);
    return m_frames;
}

QByteArray ScriptedPeer::receivedBytes() const
{
    std::lock_guard<std::mutex> lock(m_mutex);
    return m_allBytes;
}

bool ScriptedPeer::hasConnection() const
{
    std::lock_guard<std::mutex> lock(m_mutex);
    return !m_clients.empty();
}

bool ScriptedPeer::waitForFrames(int count, int timeoutMs) const
{
    std::unique_lock<std::mutex> lock(m_mutex);
    return m_changed.wait_for(lock, std::chrono::milliseconds(timeoutMs),
                              [&] { return m_frames.size() >= count; });
}

bool ScriptedPeer::waitForConnections(int count, int timeoutMs) const
{
    std::unique_lock<std::mutex> lock(m_mutex);
    return m_changed.wait_for(lock, std::chrono::milliseconds(timeoutMs),
                              [&] { return m_accepted.load() >= count; });
}

bool ScriptedPeer::waitForIdle(int timeoutMs) const
{
    std::unique_lock<std::mutex> lock(m_mutex);
    return m_changed.wait_for(lock, std::chrono::milliseconds(timeoutMs), [&] {
        return m_unanswered.isEmpty() && m_unsolicited.isEmpty() && !m_busyWriting;
    });
}

bool ScriptedPeer::attachCommands(int timeoutMs)
{
    TcpClient* old = Commands::instance()->tcpClient();
    setIpAddress("127.0.0.1");
    setIpPort(m_port);
    QSignalSpy reconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpReconnected);
    Commands::Init();
    delete old;
    return reconnected.wait(timeoutMs);
}

void ScriptedPeer::answerAll(quint32 status, const QByteArray& payload)
{
    setResponder([status, payload](const QByteArray& frame) {
        Reply reply;
        reply.chunks << replyTo(frame, status, payload);
        return reply;
    });
}

// ---- the peer's thread -------------------------------------------------------

void ScriptedPeer::run()
{
    while (m_running) {
        // The descriptors belong to this thread alone; callers ask.
        if (m_dropRequested || m_stopRequested) {
            std::lock_guard<std::mutex> lock(m_mutex);
            closeAllLocked();
            if (m_stopRequested && m_listenFd >= 0) {
                ::close(m_listenFd);
                m_listenFd = -1;
            }
            m_dropRequested = false;
            m_stopRequested = false;
        }

        std::vector<pollfd> fds;
        {
            std::lock_guard<std::mutex> lock(m_mutex);
            if (m_listenFd >= 0)
                fds.push_back({m_listenFd, POLLIN, 0});
            for (int fd : m_clients)
                fds.push_back({fd, POLLIN, 0});
        }
        if (!fds.empty())
            ::poll(fds.data(), fds.size(), 5);
        else
            std::this_thread::sleep_for(std::chrono::milliseconds(5));

        for (const pollfd& p : fds) {
            if (!(p.revents & (POLLIN | POLLHUP | POLLERR)))
                continue;
            bool isListener;
            {
                std::lock_guard<std::mutex> lock(m_mutex);
                isListener = (p.fd == m_listenFd);
            }
            if (isListener)
                acceptPending();
            else
                readFrom(p.fd);
        }
        answerFrames();
    }
}

void ScriptedPeer::acceptPending()
{
    int listenFd;
    {
        std::lock_guard<std::mutex> lock(m_mutex);
        listenFd = m_listenFd;
    }
    const int fd = ::accept4(listenFd, nullptr, nullptr, SOCK_CLOEXEC);
    if (fd < 0)
        return;
    const int one = 1;
    ::setsockopt(fd, IPPROTO_TCP, TCP_NODELAY, &one, sizeof one);
    std::lock_guard<std::mutex> lock(m_mutex);
    m_clients.push_back(fd);
    m_pending.clear();
    ++m_accepted;
    m_changed.notify_all();
}

void ScriptedPeer::readFrom(int fd)
{
    char buffer[65536];
    const ssize_t n = ::recv(fd, buffer, sizeof buffer, MSG_DONTWAIT);
    std::lock_guard<std::mutex> lock(m_mutex);
    if (n == 0 || (n < 0 && errno != EAGAIN && errno != EWOULDBLOCK)) {
        ::close(fd);
        for (auto it = m_clients.begin(); it != m_clients.end(); ++it) {
            if (*it == fd) {
                m_clients.erase(it);
                break;
            }
        }
        m_changed.notify_all();
        return;
    }
    if (n < 0)
        return;
    m_allBytes.append(buffer, int(n));
    m_pending.append(buffer, int(n));
    while (m_pending.size() >= 4) {
        const quint32 length = lengthField(m_pending);
        int take;
        if (length < 4 || length > kLongestFrame)
            take = m_pending.size();
        else if (quint32(m_pending.size()) >= length)
            take = int(length);
        else
            break;
        const QByteArray frame = m_pending.left(take);
        m_pending.remove(0, take);
        m_frames << frame;
        m_unanswered << frame;
    }
    m_changed.notify_all();
}

void ScriptedPeer::answerFrames()
{
    for (;;) {
        int fd = -1;
        Reply reply;
        bool haveReply = false;
        QByteArray unsolicited;
        {
            std::lock_guard<std::mutex> lock(m_mutex);
            if (!m_clients.empty())
                fd = m_clients.back();
            if (!m_unsolicited.isEmpty()) {
                unsolicited = m_unsolicited.takeFirst();
            } else if (!m_unanswered.isEmpty()) {
                const QByteArray frame = m_unanswered.takeFirst();
                if (!m_queued.isEmpty()) {
                    reply = m_queued.takeFirst();
                    haveReply = true;
                } else if (m_responder) {
                    Responder responder = m_responder;
                    m_busyWriting = true;
                    // The responder runs outside the lock: it may be slow.
                    m_mutex.unlock();
                    reply = responder(frame);
                    m_mutex.lock();
                    haveReply = true;
                }
            } else {
                m_busyWriting = false;
                m_changed.notify_all();
                return;
            }
            m_busyWriting = true;
        }
        if (fd >= 0) {
            if (!unsolicited.isEmpty()) {
                writeAll(fd, unsolicited);
            } else if (haveReply) {
                for (int i = 0; i < reply.chunks.size(); ++i) {
                    if (i > 0 && reply.gapMs > 0)
                        std::this_thread::sleep_for(std::chrono::milliseconds(reply.gapMs));
                    writeAll(fd, reply.chunks.at(i));
                }
            }
        }
    }
}

void ScriptedPeer::writeAll(int fd, const QByteArray& bytes)
{
    qint64 done = 0;
    while (done < bytes.size()) {
        const ssize_t n = ::send(fd, bytes.constData() + done, size_t(bytes.size() - done), MSG_NOSIGNAL);
        if (n <= 0) {
            if (n < 0 && (errno == EINTR || errno == EAGAIN))
                continue;
            return;
        }
        done += n;
    }
}

void ScriptedPeer::closeAllLocked()
{
    for (int fd : m_clients)
        ::close(fd);
    m_clients.clear();
    m_pending.clear();
    m_changed.notify_all();
}

// ---- frame helpers -------------------------------------------------------------

QByteArray ScriptedPeer::responseFrame(short transactionID, long code, quint32 status, const QByteArray& payload)
{
    QByteArray frame;
    putLE(frame, quint32(16 + payload.size()), 4);
    putLE(frame, quint16(transactionID), 2);
    frame.append(char(0));
    frame.append(char(0));
    putLE(frame, quint32(code), 4);
    putLE(frame, status, 4);
    frame.append(payload);
    return frame;
}

QByteArray ScriptedPeer::replyTo(const QByteArray& requestFrame, quint32 status, const QByteArray& payload)
{
    if (requestFrame.size() < 12)
        return responseFrame(0, 0, status, payload);
    const unsigned char* p = reinterpret_cast<const unsigned char*>(requestFrame.constData());
    const short id = short(quint16(p[4]) | (quint16(p[5]) << 8));
    const quint32 code = lengthField(requestFrame.mid(8, 4));
    return responseFrame(id, long(code), status, payload);
}

QByteArray ScriptedPeer::replyTo(const CmdData& request, quint32 status, const QByteArray& payload)
{
    return responseFrame(request.getTransactionID(), request.getCommandCode(), status, payload);
}

QByteArray ScriptedPeer::rawFrame(quint32 lengthField, int bodyBytes)
{
    QByteArray frame;
    putLE(frame, lengthField, 4);
    frame.append(QByteArray(bodyBytes, char(0x5A)));
    return frame;
}

QList<QByteArray> ScriptedPeer::split(const QByteArray& bytes, int pieceSize)
{
    QList<QByteArray> pieces;
    for (int i = 0; i < bytes.size(); i += pieceSize)
        pieces << bytes.mid(i, pieceSize);
    return pieces;
}
