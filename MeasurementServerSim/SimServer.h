#ifndef SIMSERVER_H
#define SIMSERVER_H

// MeasurementServerSim as a component: the protocol listener, the control
// listener and the instrument behind them, all on the thread that creates the
// Server and driven by its event loop. Nothing here blocks on a client.
//
// Embedding it in a test (the GUI's link client uses blocking sockets on the
// test's own thread, so the server must run on another one):
//
//   #include "SimServer.h"
//
//   Sim::ServerThread sim;                         // not started yet
//   sim.options().port = TestSupport::freeLocalPort();
//   sim.options().instrument.dataDir = TestSupport::makeTempDir("sim");
//   sim.options().instrument.timeScale = 0.3;     // optional: faster operations
//   QVERIFY(sim.start());                          // a fresh data folder: demo set
//   setIpAddress("127.0.0.1");
//   setIpPort(sim.port());
//   Commands::Init();
//   Commands::instance()->tcpClient()->connectToHost();
//   QCOMPARE(sim.control("place"), QString("OK"));  // all three feet down
//   ... CmdOut_ calls on the test thread ...
//   sim.call([](Sim::Server& s) { s.instrument().jobs().jobs().size(); });
//
// control() takes the lines of the control interface (see README.md) and
// returns the reply; its last line is "OK" or starts with "ERR". call() runs
// any code on the server's thread, for checks the control interface lacks.
// Destroying the ServerThread stops the server; the data folder stays, so a
// second ServerThread on the same folder is the instrument after a restart.
// The simulator's own records (Sim::Job, Sim::Sample) live in namespace Sim;
// keep them qualified next to the GUI's Job and Sample.
//
// Connections: any number of clients may be connected at once; commands are
// served one at a time in the order they arrive. A client that drops leaves
// the others alone; new connections are taken at any time.

#include "SimInstrument.h"
#include "SimProtocol.h"

#include <QHostAddress>
#include <QObject>
#include <QPointer>
#include <QQueue>
#include <QThread>

#include <functional>
#include <memory>

class QSocketNotifier;
class QTcpServer;
class QTcpSocket;

namespace Sim {

class Control;

class Server : public QObject
{
    Q_OBJECT

public:
    struct Options {
        QHostAddress address = QHostAddress::LocalHost;
        quint16 port = 6300;
        int controlPort = 6301;        // -1: no control listener; 0: any free port
        bool controlOnStdin = false;
        Instrument::Options instrument;
    };

    explicit Server(const Options& options, QObject* parent = nullptr);
    ~Server() override;

    bool start(QString* error = nullptr);
    quint16 port() const;
    quint16 controlPort() const;
    Instrument& instrument() { return *m_instrument; }
    Protocol& protocol() { return *m_protocol; }

    // Runs one line of the control interface and returns the reply.
    QString control(const QString& line);

    // Closes every client connection. downMs > 0 also stops listening for
    // that long, downMs < 0 until powerOn().
    void dropClients(int downMs = 0);
    void powerOn();
    bool listening() const;
    int clientCount() const;
    // Holds every reply back by this long (0: answer at once).
    void setReplyDelay(int ms) { m_replyDelayMs = std::max(0, ms); }
    int replyDelay() const { return m_replyDelayMs; }

private:
    struct Client;
    struct Pending {
        QPointer<QTcpSocket> socket;
        QByteArray frame;
    };

    bool listen(QString* error);
    void onNewConnection();
    void onClientData(QTcpSocket* socket);
    void onClientGone(QTcpSocket* socket);
    void processQueue();
    void answer(const Pending& p);
    void onControlConnection();
    void onStdin();
    void onPower(Instrument::PowerAction action);

    Options m_options;
    std::unique_ptr<Instrument> m_instrument;
    std::unique_ptr<Protocol> m_protocol;
    std::unique_ptr<Control> m_control;
    QTcpServer* m_server = nullptr;
    QTcpServer* m_controlServer = nullptr;
    QSocketNotifier* m_stdin = nullptr;
    QByteArray m_stdinBuffer;
    QHash<QTcpSocket*, QByteArray> m_buffers;
    QQueue<Pending> m_queue;
    bool m_waiting = false;
    int m_replyDelayMs = 0;
    bool m_poweredOff = false;
    bool m_bootOnReturn = false;
};

// A Server on a thread of its own, for tests and benchmarks.
class ServerThread
{
public:
    ServerThread();
    explicit ServerThread(const Server::Options& options);
    ~ServerThread();
    ServerThread(const ServerThread&) = delete;
    ServerThread& operator=(const ServerThread&) = delete;

    // Set before start().
    Server::Options& options() { return m_options; }

    bool start(QString* error = nullptr);
    void stop();
    bool isRunning() const { return m_server != nullptr; }
    quint16 port() const { return m_port; }
    quint16 controlPort() const { return m_controlPort; }

    // Runs a control line on the server's thread and returns the reply.
    QString control(const QString& line);
    // Runs f on the server's thread and waits for it.
    void call(const std::function<void(Server&)>& f);

private:
    Server::Options m_options;
    QThread m_thread;
    QObject* m_context = nullptr;
    Server* m_server = nullptr;
    quint16 m_port = 0;
    quint16 m_controlPort = 0;
};

} // namespace Sim

#endif // SIMSERVER_H
