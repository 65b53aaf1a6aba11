#ifndef BACKENDHARNESS_H
#define BACKENDHARNESS_H

// The back end as main builds it, against the simulator on a free port. The
// test thread plays the GUI thread: it owns the link client, whose watchdog
// needs its event loop, so the helpers here wait while running events. The
// simulator has a thread of its own, so the test thread may block in
// DataManager accessors as the GUI does.
//
// Signals emitted on the DataManager thread are recorded by SignalLog, which
// takes them queued onto the test thread (QSignalSpy is not meant to be fed
// from another thread); their order per emitting thread is kept.

#include "AppShell.h"
#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/StringTables.h"
#include "SimServer.h"
#include "support/ScriptedPeer.h"
#include "support/TestSupport.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QMetaObject>
#include <QMutex>
#include <QMutexLocker>
#include <QStringList>
#include <QThread>
#include <QVariant>

#include <atomic>
#include <functional>
#include <memory>
#include <mutex>
#include <type_traits>

#include <arpa/inet.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <sys/socket.h>
#include <unistd.h>

namespace BackendHarness {

// Runs events on the calling thread until cond holds or the time is up.
inline bool waitUntil(const std::function<bool()>& cond, int timeoutMs)
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

// Runs events for a while.
inline void settle(int ms)
{
    waitUntil([] { return false; }, ms);
}

// Runs f on the DataManager thread, as a queued slot would, and returns its
// result; the calling thread keeps running its events meanwhile.
template <typename F>
auto onDataManagerThread(F&& f) -> decltype(f())
{
    using Result = decltype(f());
    auto done = std::make_shared<std::atomic<bool>>(false);
    if constexpr (std::is_void_v<Result>) {
        QMetaObject::invokeMethod(
            DataManager::instance(),
            [fn = std::decay_t<F>(std::forward<F>(f)), done]() mutable {
                fn();
                *done = true;
            },
            Qt::QueuedConnection);
        waitUntil([&] { return done->load(); }, 180000);
    } else {
        auto result = std::make_shared<Result>();
        QMetaObject::invokeMethod(
            DataManager::instance(),
            [fn = std::decay_t<F>(std::forward<F>(f)), done, result]() mutable {
                *result = fn();
                *done = true;
            },
            Qt::QueuedConnection);
        waitUntil([&] { return done->load(); }, 180000);
        return *result;
    }
}

// Signals in the order they were emitted, as "Name" or "Name(arg,...)";
// arguments without a text form (records) are left out.
class SignalLog : public QObject
{
public:
    template <typename Sender, typename... Args>
    void watch(Sender* sender, void (Sender::*signal)(Args...), const QString& name)
    {
        connect(
            sender, signal, this,
            [this, name](Args... args) {
                QStringList parts;
                (addArgument(parts, args), ...);
                QMutexLocker locker(&m_mutex);
                m_entries << (parts.isEmpty() ? name : name + "(" + parts.join(",") + ")");
            },
            Qt::QueuedConnection);
    }

    QStringList entries() const
    {
        QMutexLocker locker(&m_mutex);
        return m_entries;
    }
    int count(const QString& entry) const { return entries().count(entry); }
    int countStartingWith(const QString& prefix) const
    {
        int n = 0;
        for (const QString& e : entries())
            n += e.startsWith(prefix) ? 1 : 0;
        return n;
    }
    bool waitFor(const QString& entry, int timeoutMs, int times = 1) const
    {
        return waitUntil([&] { return count(entry) >= times; }, timeoutMs);
    }
    void clear()
    {
        QMutexLocker locker(&m_mutex);
        m_entries.clear();
    }

private:
    // Pictures and other bytes are left out too.
    static void addArgument(QStringList&, const QByteArray&) {}
    template <typename T>
    static void addArgument(QStringList& parts, const T& value)
    {
        const QVariant v = QVariant::fromValue(value);
        if (v.canConvert<QString>())
            parts << v.toString();
    }

    mutable QMutex m_mutex;
    QStringList m_entries;
};

// Lines of the debug output, recorded from every thread while it lives.
class LogCapture
{
public:
    LogCapture()
    {
        s_active = this;
        m_previous = qInstallMessageHandler(&LogCapture::handler);
    }
    ~LogCapture()
    {
        qInstallMessageHandler(m_previous);
        s_active = nullptr;
    }
    int count(const QString& text) const
    {
        QMutexLocker locker(&m_mutex);
        return m_lines.count(text);
    }
    bool contains(const QString& text) const { return count(text) > 0; }

private:
    static void handler(QtMsgType type, const QMessageLogContext& context, const QString& message)
    {
        LogCapture* self = s_active;
        if (!self)
            return;
        {
            QMutexLocker locker(&self->m_mutex);
            self->m_lines << message;
        }
        if (self->m_previous)
            self->m_previous(type, context, message);
    }

    static inline std::atomic<LogCapture*> s_active{nullptr};
    QtMessageHandler m_previous = nullptr;
    mutable QMutex m_mutex;
    QStringList m_lines;
};

// A relay between the link client and the simulator that records the code of
// every command, so that tests see what the back end asked and in which
// order. Dropping its connections is a lost link for the GUI.
class RecordingProxy
{
public:
    explicit RecordingProxy(quint16 serverPort)
        : m_serverPort(serverPort)
        , m_peer(std::make_unique<ScriptedPeer>())
    {
        m_peer->setResponder([this](const QByteArray& frame) {
            ScriptedPeer::Reply reply;
            reply.chunks << forward(frame);
            return reply;
        });
    }
    ~RecordingProxy()
    {
        // The relay's thread first: it may be inside forward().
        m_peer.reset();
        closeServerSide();
    }

    bool listen(quint16 port = 0) { return m_peer->listen(port); }
    quint16 port() const { return m_peer->port(); }
    void dropConnections() { m_peer->dropConnections(); }

    // Command codes received so far, oldest first.
    // Answers frames locally: a non-empty result is sent back instead of
    // the simulator's reply. Runs on the relay's thread.
    void setInterceptor(std::function<QByteArray(const CmdData& request, const QByteArray& frame)> f)
    {
        std::lock_guard<std::mutex> lock(m_interceptorMutex);
        m_interceptor = std::move(f);
    }

    // Edits the simulator's replies on their way back. Runs on the relay's
    // thread.
    void setReplyFilter(std::function<void(const CmdData& request, QByteArray& reply)> f)
    {
        std::lock_guard<std::mutex> lock(m_interceptorMutex);
        m_replyFilter = std::move(f);
    }

    QList<quint32> codes() const
    {
        QList<quint32> out;
        for (const QByteArray& frame : m_peer->receivedFrames()) {
            CmdData packet;
            try {
                packet.setFullData(frame);
                out << quint32(packet.getCommandCode());
            } catch (unsigned int) {
                out << 0;
            }
        }
        return out;
    }
    int frameCount() const { return m_peer->receivedFrames().size(); }

private:
    // Runs on the peer's thread: one frame to the simulator, its reply back.
    QByteArray forward(const QByteArray& frame)
    {
        {
            std::lock_guard<std::mutex> lock(m_interceptorMutex);
            if (m_interceptor) {
                CmdData request;
                try {
                    request.setFullData(frame);
                    const QByteArray local = m_interceptor(request, frame);
                    if (!local.isEmpty())
                        return local;
                } catch (unsigned int) {
                }
            }
        }
        for (int attempt = 0; attempt < 2; ++attempt) {
            if (m_fd < 0 && !connectServerSide())
                return QByteArray();
            QByteArray reply;
            if (writeAll(frame) && readFrame(reply)) {
                std::lock_guard<std::mutex> lock(m_interceptorMutex);
                if (m_replyFilter) {
                    CmdData request;
                    try {
                        request.setFullData(frame);
                        m_replyFilter(request, reply);
                    } catch (unsigned int) {
                    }
                }
                return reply;
            }
            closeServerSide();
        }
        return QByteArray();
    }

    bool connectServerSide()
    {
        m_fd = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
        sockaddr_in address{};
        address.sin_family = AF_INET;
        address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
        address.sin_port = htons(m_serverPort);
        if (m_fd < 0 || ::connect(m_fd, reinterpret_cast<sockaddr*>(&address), sizeof address) < 0) {
            closeServerSide();
            return false;
        }
        const int one = 1;
        ::setsockopt(m_fd, IPPROTO_TCP, TCP_NODELAY, &one, sizeof one);
        return true;
    }

    void closeServerSide()
    {
        if (m_fd >= 0)
            ::close(m_fd);
        m_fd = -1;
    }

    bool writeAll(const QByteArray& bytes)
    {
        qint64 done = 0;
        while (done < bytes.size()) {
            const ssize_t n = ::send(m_fd, bytes.constData() + done, size_t(bytes.size() - done),
                                     MSG_NOSIGNAL);
            if (n <= 0)
                return false;
            done += n;
        }
        return true;
    }

    bool readExactly(char* into, qint64 size)
    {
        qint64 done = 0;
        while (done < size) {
            const ssize_t n = ::recv(m_fd, into + done, size_t(size - done), 0);
            if (n <= 0)
                return false;
            done += n;
        }
        return true;
    }

    bool readFrame(QByteArray& frame)
    {
        unsigned char header[4];
        if (!readExactly(reinterpret_cast<char*>(header), 4))
            return false;
        const quint32 length = quint32(header[0]) | (quint32(header[1]) << 8)
            | (quint32(header[2]) << 16) | (quint32(header[3]) << 24);
        if (length < 4 || length > 64u * 1024u * 1024u)
            return false;
        frame.resize(int(length));
        memcpy(frame.data(), header, 4);
        return readExactly(frame.data() + 4, qint64(length) - 4);
    }

    quint16 m_serverPort;
    int m_fd = -1;
    std::mutex m_interceptorMutex;
    std::function<QByteArray(const CmdData&, const QByteArray&)> m_interceptor;
    std::function<void(const CmdData&, QByteArray&)> m_replyFilter;
    std::unique_ptr<ScriptedPeer> m_peer;
};

// The simulator on its own thread with a fresh data folder (the demo set).
inline std::unique_ptr<Sim::ServerThread> startSimulator(double timeScale = 0.3)
{
    auto sim = std::make_unique<Sim::ServerThread>();
    sim->options().port = TestSupport::freeLocalPort();
    sim->options().controlPort = -1;
    sim->options().instrument.dataDir = TestSupport::makeTempDir("backend-sim");
    sim->options().instrument.timeScale = timeScale;
    if (!sim->start())
        return nullptr;
    return sim;
}

// Builds the DataManager thread and wires it as main does; once per process.
inline DataManager* startDataManager()
{
    static bool started = false;
    if (!started) {
        // As main does before: types for the queued signals, and the tables
        // that name the angles on the wire.
        AppShell::registerMetaTypes();
        StringTables::instance();
        StringTables::Init();
        DataManagerTask::instance();
        DataManager::instance()->Init();
        started = true;
    }
    return DataManager::instance();
}

// Opens the link to 127.0.0.1:port, as the job list screen does.
inline void openLink(quint16 port)
{
    setIpAddress("127.0.0.1");
    setIpPort(port);
    Commands::Init();
}

// Opens the link and waits until the back end has synchronised; the log
// records "InitComplete" from now on.
inline bool connectBackend(SignalLog& log, quint16 port)
{
    log.watch(DataManager::instance(), &DataManager::DataManagerInitComplete, "InitComplete");
    openLink(port);
    return log.waitFor("InitComplete", 20000);
}

} // namespace BackendHarness

#endif // BACKENDHARNESS_H
