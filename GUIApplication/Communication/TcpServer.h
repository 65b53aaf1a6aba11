#ifndef TCPSERVER_H
#define TCPSERVER_H

// The inbound command server. It is built and never started by the
// application: calling TCPServerTask::instance() or
// TCPCommandHandlerServer::instance() would open the port.

#include "SharedSystem/WorkerTask.h"

#include <QTcpServer>

class TCPCommandHandlerServer : public QTcpServer
{
    Q_OBJECT

public:
    static constexpr quint16 DEFAULT_PORT = 6300;

    // Listens on every interface at once.
    explicit TCPCommandHandlerServer(quint16 port = DEFAULT_PORT, QObject* parent = nullptr);

    // Starts the server's thread on first use, and with it the port.
    static TCPCommandHandlerServer* instance();

protected:
    void incomingConnection(qintptr socketDescriptor) override;
};

class TCPServerTask : public WorkerTask<TCPCommandHandlerServer>
{
public:
    static TCPServerTask* instance();

private:
    TCPServerTask();
};

#endif // TCPSERVER_H
