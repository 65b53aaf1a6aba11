#include "SimServer.h"

#include "Communication/CmdData.h"
#include "SimControl.h"

#include <QDebug>
#include <QSocketNotifier>
#include <QTcpServer>
#include <QTcpSocket>
#include <QTimer>

#include <cstdio>
#include <unistd.h>

namespace Sim {

namespace {

quint32 lengthField(const QByteArray& b)
{
    const uchar* p = reinterpret_cast<const uchar*>(b.constData());
    return quint32(p[0]) | quint32(p[1]) << 8 | quint32(p[2]) << 16 | quint32(p[3]) << 24;
}

// Restarting takes the instrument this long before it answers again.
const int kRebootDownMs = 3000;
const int kPowerUpMs = 2000;

} // namespace

Server::Server(const Options& options, QObject* parent) : QObject(parent), m_options(options)
{
    m_instrument.reset(new Instrument(m_options.instrument, this));
    m_protocol.reset(new Protocol(*m_instrument));
    m_control.reset(new Control(*this));
    connect(m_instrument.get(), &Instrument::powerRequested, this, &Server::onPower);
}

Server::~Server()
{
    for (QTcpSocket* s : m_buffers.keys()) {
        s->disconnect(this);
        s->abort();
    }
}

bool Server::start(QString* error)
{
    if (!m_instrument->open(error))
        return false;
    if (!listen(error))
        return false;
    if (m_options.controlPort >= 0) {
        m_controlServer = new QTcpServer(this);
        connect(m_controlServer, &QTcpServer::newConnection, this, &Server::onControlConnection);
        if (!m_controlServer->listen(QHostAddress::LocalHost, quint16(m_options.controlPort))) {
            // The protocol is what matters; the control lines still work on stdin.
            qWarning().noquote() << QStringLiteral("Sim: no control port %1: %2")
                                        .arg(m_options.controlPort)
                                        .arg(m_controlServer->errorString());
            delete m_controlServer;
            m_controlServer = nullptr;
        }
    }
    if (m_options.controlOnStdin) {
        m_stdin = new QSocketNotifier(STDIN_FILENO, QSocketNotifier::Read, this);
        connect(m_stdin, &QSocketNotifier::activated, this, &Server::onStdin);
    }
    qInfo().noquote() << QStringLiteral("Sim: %1 listening on %2:%3, control on %4, data in %5")
                             .arg(modelName(m_instrument->model()), m_options.address.toString())
                             .arg(port())
                             .arg(m_controlServer ? QString::number(controlPort()) : QStringLiteral("(none)"))
                             .arg(m_instrument->dataDir());
    return true;
}

bool Server::listen(QString* error)
{
    if (!m_server) {
        m_server = new QTcpServer(this);
        connect(m_server, &QTcpServer::newConnection, this, &Server::onNewConnection);
    }
    if (m_server->isListening())
        return true;
    if (!m_server->listen(m_options.address, m_options.port)) {
        const QString why = QStringLiteral("port %1: %2").arg(m_options.port).arg(m_server->errorString());
        if (error)
            *error = why;
        qWarning().noquote() << "Sim: cannot listen on" << why;
        return false;
    }
    // Once a port is chosen it stays: a restarted instrument comes back where it was.
    m_options.port = m_server->serverPort();
    return true;
}

quint16 Server::port() const
{
    return m_server && m_server->isListening() ? m_server->serverPort() : m_options.port;
}

quint16 Server::controlPort() const
{
    return m_controlServer ? m_controlServer->serverPort() : 0;
}

bool Server::listening() const
{
    return m_server && m_server->isListening();
}

int Server::clientCount() const
{
    return m_buffers.size();
}

QString Server::control(const QString& line)
{
    return m_control->run(line);
}

void Server::onNewConnection()
{
    while (QTcpSocket* s = m_server->nextPendingConnection()) {
        if (m_poweredOff) {
            s->abort();
            s->deleteLater();
            continue;
        }
        s->setSocketOption(QAbstractSocket::LowDelayOption, 1);
        m_buffers.insert(s, QByteArray());
        connect(s, &QTcpSocket::readyRead, this, [this, s] { onClientData(s); });
        connect(s, &QTcpSocket::disconnected, this, [this, s] { onClientGone(s); });
        qInfo().noquote() << "Sim: client connected from port" << s->peerPort() << "-" << m_buffers.size()
                          << "connection(s)";
    }
}

void Server::onClientGone(QTcpSocket* socket)
{
    if (m_buffers.remove(socket))
        qInfo().noquote() << "Sim: client gone -" << m_buffers.size() << "connection(s)";
    socket->deleteLater();
}

void Server::onClientData(QTcpSocket* socket)
{
    auto it = m_buffers.find(socket);
    if (it == m_buffers.end())
        return;
    QByteArray& buffer = *it;
    buffer.append(socket->readAll());
    // A frame may come in pieces, or several in one read.
    while (buffer.size() >= 4) {
        const quint32 length = lengthField(buffer);
        if (length < quint32(CmdData::COMMAND_HEADER_SIZE) || length > quint32(CmdData::MAX_FRAME_SIZE)) {
            qWarning().noquote() << "Sim: frame length" << length << "out of range; closing that connection";
            m_buffers.remove(socket);
            socket->abort();
            socket->deleteLater();
            return;
        }
        if (quint32(buffer.size()) < length)
            break;
        m_queue.enqueue({socket, buffer.left(int(length))});
        buffer.remove(0, int(length));
    }
    processQueue();
}

void Server::processQueue()
{
    while (!m_queue.isEmpty() && !m_waiting) {
        if (m_replyDelayMs > 0) {
            m_waiting = true;
            QTimer::singleShot(m_replyDelayMs, this, [this] {
                m_waiting = false;
                if (!m_queue.isEmpty())
                    answer(m_queue.dequeue());
                processQueue();
            });
            return;
        }
        answer(m_queue.dequeue());
    }
}

void Server::answer(const Pending& p)
{
    if (!p.socket || !m_buffers.contains(p.socket))
        return;
    const QByteArray reply = m_protocol->handle(p.frame);
    if (!reply.isEmpty())
        p.socket->write(reply);
}

void Server::dropClients(int downMs)
{
    const QList<QTcpSocket*> sockets = m_buffers.keys();
    m_buffers.clear();
    m_queue.clear();
    for (QTcpSocket* s : sockets) {
        s->disconnect(this);
        s->close();
        s->deleteLater();
    }
    if (!sockets.isEmpty())
        qInfo().noquote() << "Sim: dropped" << sockets.size() << "connection(s)";
    if (downMs == 0 || !m_server)
        return;
    m_server->close();
    if (downMs < 0) {
        m_poweredOff = true;
        qInfo() << "Sim: off the air until \"power on\"";
        return;
    }
    QTimer::singleShot(downMs, this, [this] {
        if (m_poweredOff)
            return;
        if (m_bootOnReturn)
            m_instrument->setPowerUp(kPowerUpMs);
        m_bootOnReturn = false;
        listen(nullptr);
    });
}

void Server::powerOn()
{
    m_poweredOff = false;
    m_instrument->setPowerUp(kPowerUpMs);
    listen(nullptr);
}

void Server::onPower(Instrument::PowerAction action)
{
    if (action == Instrument::PowerAction::Shutdown) {
        qInfo() << "Sim: switched off by the client";
        dropClients(-1);
        return;
    }
    qInfo() << "Sim: restarting on the client's request";
    m_bootOnReturn = true;
    dropClients(int(kRebootDownMs * m_instrument->timeScale()));
}

void Server::onControlConnection()
{
    while (QTcpSocket* s = m_controlServer->nextPendingConnection()) {
        connect(s, &QTcpSocket::disconnected, s, &QObject::deleteLater);
        connect(s, &QTcpSocket::readyRead, this, [this, s] {
            while (s->canReadLine()) {
                const QString line = QString::fromUtf8(s->readLine()).trimmed();
                if (line == QLatin1String("quit") || line == QLatin1String("exit")) {
                    s->disconnectFromHost();
                    return;
                }
                s->write(control(line).toUtf8() + '\n');
            }
        });
        s->write("MeasurementServerSim control. Type help.\n");
    }
}

void Server::onStdin()
{
    char chunk[1024];
    const ssize_t got = ::read(STDIN_FILENO, chunk, sizeof chunk);
    if (got <= 0) {
        // End of input (or a closed terminal): stop watching it.
        m_stdin->setEnabled(false);
        return;
    }
    m_stdinBuffer.append(chunk, int(got));
    int nl;
    while ((nl = m_stdinBuffer.indexOf('\n')) >= 0) {
        const QString line = QString::fromUtf8(m_stdinBuffer.left(nl)).trimmed();
        m_stdinBuffer.remove(0, nl + 1);
        if (line.isEmpty())
            continue;
        const QByteArray reply = control(line).toUtf8() + '\n';
        fwrite(reply.constData(), 1, size_t(reply.size()), stdout);
        fflush(stdout);
    }
}

// ---- on a thread of its own ---------------------------------------------------------------------

ServerThread::ServerThread()
{
    m_options.port = 0;
    m_options.controlPort = -1;
}

ServerThread::ServerThread(const Server::Options& options) : m_options(options) {}

ServerThread::~ServerThread()
{
    stop();
}

bool ServerThread::start(QString* error)
{
    if (m_server)
        return true;
    m_thread.setObjectName(QStringLiteral("MeasurementServerSim"));
    m_thread.start();
    m_context = new QObject;
    m_context->moveToThread(&m_thread);
    bool ok = false;
    QString why;
    QMetaObject::invokeMethod(
        m_context,
        [this, &ok, &why] {
            auto* server = new Server(m_options);
            ok = server->start(&why);
            if (ok) {
                m_server = server;
                m_port = server->port();
                m_controlPort = server->controlPort();
            } else {
                delete server;
            }
        },
        Qt::BlockingQueuedConnection);
    if (!ok) {
        if (error)
            *error = why;
        qWarning().noquote() << "Sim: cannot start:" << why;
        stop();
    }
    return ok;
}

void ServerThread::stop()
{
    if (m_context && m_thread.isRunning()) {
        QMetaObject::invokeMethod(
            m_context,
            [this] {
                delete m_server;
                m_server = nullptr;
            },
            Qt::BlockingQueuedConnection);
    }
    if (m_thread.isRunning()) {
        m_thread.quit();
        m_thread.wait();
    }
    // The thread has ended: its last object can go from here.
    delete m_context;
    m_context = nullptr;
}

QString ServerThread::control(const QString& line)
{
    QString reply = QStringLiteral("ERR the simulator is not running");
    call([&reply, &line](Server& s) { reply = s.control(line); });
    return reply;
}

void ServerThread::call(const std::function<void(Server&)>& f)
{
    if (!m_context || !m_server)
        return;
    if (QThread::currentThread() == &m_thread) {
        f(*m_server);
        return;
    }
    QMetaObject::invokeMethod(
        m_context, [this, &f] {
            if (m_server)
                f(*m_server);
        },
        Qt::BlockingQueuedConnection);
}

} // namespace Sim
