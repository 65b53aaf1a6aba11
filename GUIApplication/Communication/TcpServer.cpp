#include "Communication/TcpServer.h"

#include "Communication/TcpClientSocket.h"

#include <QDebug>

TCPCommandHandlerServer::TCPCommandHandlerServer(quint16 port, QObject* parent)
    : QTcpServer(parent)
{
    if (!listen(QHostAddress::Any, port))
        qDebug() << "TCP server: cannot listen on port" << port << errorString();
}

TCPCommandHandlerServer* TCPCommandHandlerServer::instance()
{
    TCPServerTask::instance();
    return TCPServerTask::worker();
}

void TCPCommandHandlerServer::incomingConnection(qintptr socketDescriptor)
{
    TCPClientSocket* socket = new TCPClientSocket(this);
    socket->setSocketDescriptor(socketDescriptor, QAbstractSocket::ConnectedState, QIODevice::ReadWrite);
}

TCPServerTask* TCPServerTask::instance()
{
    static TCPServerTask* const s_instance = new TCPServerTask();
    return s_instance;
}

TCPServerTask::TCPServerTask()
{
    startAndWait();
}
