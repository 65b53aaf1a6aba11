#ifndef TCPCLIENT_H
#define TCPCLIENT_H

// The client end of the one connection to the MeasurementServer, on a plain
// blocking socket so that a worker thread can send a frame and wait for its
// reply in one call. A one-second watchdog notices a dead link, reconnects
// for ever and raises the fault screen once per outage of a link that stood.

#include "Communication/CmdData.h"

#include <QObject>
#include <QTimer>

#include <atomic>

#include <netinet/in.h>
#include <sys/time.h>

class TcpClient : public QObject
{
    Q_OBJECT

public:
    // Frames above this size are drained and refused.
    static constexpr int MAX_FRAME_SIZE = CmdData::MAX_FRAME_SIZE;
    static constexpr int WATCHDOG_MS = 1000;

    explicit TcpClient(QObject* parent = nullptr);
    ~TcpClient() override;

    // Forgets any earlier connection and arms the watchdog; the first attempt
    // to connect comes with its first tick.
    void Init();
    // One attempt, blocking for the system's own connect time-out.
    void connectToHost();
    // Peeks at the socket without waiting: true while the peer hasn't closed.
    bool isConnected();

    // Each throws a STATUS_T as unsigned int on failure.
    void send(const CommandData& frame);
    ResponseData receive(int timeout);
    ResponseData sendAndReceive(const CommandData& frame, int timeout);
    CmdData sendAndReceive(const CmdData& packet, int timeout);

public slots:
    void onInit();
    void onWatchdogTimeout();

private:
    // Written by the watchdog on the GUI thread, read by the thread that
    // sends commands.
    std::atomic<bool> m_connected{false};
    bool m_sadPuppyShown = false;
    bool m_connectedOnce = false;
    QTimer m_watchdog;
    int sock_descriptor = 0;
    sockaddr_in serv_addr;
    sockaddr_in client_addr;
    timeval tv;
};

#endif // TCPCLIENT_H
