#ifndef SCRIPTEDPEER_H
#define SCRIPTEDPEER_H

// A scripted server end of a TCP connection for tests and benchmarks. It
// runs on its own thread with plain sockets, so the code under test may block
// its own thread in a read while the peer goes on sending. The peer records
// every byte it receives, cuts the stream into frames by their length field,
// and answers each frame with exactly the bytes the script gives, in as many
// separate writes as wanted.
//
//   ScriptedPeer peer;
//   peer.listen();                                  // 127.0.0.1, free port
//   peer.queueReply(ScriptedPeer::replyTo(request, 0, payload));
//   ... client sends ...
//   peer.receivedFrames();                          // what the client sent

#include <QByteArray>
#include <QList>

#include <atomic>
#include <condition_variable>
#include <functional>
#include <mutex>
#include <thread>
#include <vector>

class CmdData;

class ScriptedPeer
{
public:
    // The writes that answer one frame; gapMs is slept between two writes.
    struct Reply {
        QList<QByteArray> chunks;
        int gapMs = 0;
    };
    // Called on the peer's thread for each frame that has no queued reply.
    using Responder = std::function<Reply(const QByteArray& frame)>;

    ScriptedPeer();
    ~ScriptedPeer();
    ScriptedPeer(const ScriptedPeer&) = delete;
    ScriptedPeer& operator=(const ScriptedPeer&) = delete;

    // Listens on 127.0.0.1; port 0 picks a free one. Listening again after
    // stop() on the same port is how a test brings a "server" back.
    bool listen(quint16 port = 0);
    quint16 port() const { return m_port; }
    // Closes the connections and the listening socket: the server is gone.
    void stop();
    // Closes the connections, keeps listening.
    void dropConnections();

    // Answers, oldest first, for the next frames. A queued reply wins over
    // the responder.
    void queueReply(const QByteArray& bytes);
    void queueReply(const Reply& reply);
    void setResponder(Responder responder);
    // Writes at once to the newest connection (unsolicited bytes).
    void sendNow(const QByteArray& bytes);

    QList<QByteArray> receivedFrames() const;
    QByteArray receivedBytes() const;
    int connectionCount() const { return m_accepted.load(); }
    bool hasConnection() const;

    // Points the command front at this peer: Commands::Init() with this
    // port, the earlier link client deleted so that its watchdog stays quiet,
    // and waits for the connection. Needs an event loop on the calling thread.
    bool attachCommands(int timeoutMs = 3000);
    // Answers every frame with the given status and payload.
    void answerAll(quint32 status, const QByteArray& payload = QByteArray());

    // Wait until so many frames or connections have been seen.
    bool waitForFrames(int count, int timeoutMs = 5000) const;
    bool waitForConnections(int count, int timeoutMs = 5000) const;
    // Wait until every queued and answered byte has been handed to the kernel.
    bool waitForIdle(int timeoutMs = 5000) const;

    // A response frame that answers request (same id and code, flags 0).
    static QByteArray replyTo(const QByteArray& requestFrame, quint32 status,
                              const QByteArray& payload = QByteArray());
    static QByteArray replyTo(const CmdData& request, quint32 status,
                              const QByteArray& payload = QByteArray());
    // A response header for a given id and code, with any payload.
    static QByteArray responseFrame(short transactionID, long code, quint32 status,
                                    const QByteArray& payload = QByteArray());
    // Just a length field followed by filler, for frames that lie about their size.
    static QByteArray rawFrame(quint32 lengthField, int bodyBytes);
    // Cuts bytes into pieces of the given size.
    static QList<QByteArray> split(const QByteArray& bytes, int pieceSize);

private:
    void run();
    void acceptPending();
    void readFrom(int fd);
    void answerFrames();
    void writeAll(int fd, const QByteArray& bytes);
    void closeAllLocked();

    mutable std::mutex m_mutex;
    mutable std::condition_variable m_changed;
    std::thread m_thread;
    std::atomic<bool> m_running{false};
    std::atomic<int> m_accepted{0};
    std::atomic<bool> m_dropRequested{false};
    std::atomic<bool> m_stopRequested{false};
    int m_listenFd = -1;
    quint16 m_port = 0;
    std::vector<int> m_clients;
    QByteArray m_pending;            // bytes of the newest connection not yet cut into frames
    QList<QByteArray> m_frames;      // frames received
    QList<QByteArray> m_unanswered;  // frames still to answer
    QByteArray m_allBytes;
    QList<Reply> m_queued;
    QList<QByteArray> m_unsolicited;
    Responder m_responder;
    bool m_busyWriting = false;
};

#endif // SCRIPTEDPEER_H
