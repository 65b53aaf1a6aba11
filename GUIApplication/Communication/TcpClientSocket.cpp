#include "Communication/TcpClientSocket.h"

#include "Communication/CommandHandler.h"

TCPClientSocket::TCPClientSocket(QObject* parent)
    : QTcpSocket(parent)
{
    connect(this, &QTcpSocket::disconnected, this, &TCPClientSocket::onDisconnected);
    connect(this, &QTcpSocket::readyRead, this, &TCPClientSocket::onReadyRead);
    if (CommandHandler* handler = CommandHandler::instance()) {
        connect(this, &TCPClientSocket::command, handler, &CommandHandler::onCommand);
        connect(handler, &CommandHandler::response, this, &TCPClientSocket::onResponse);
    }
}

TCPClientSocket::~TCPClientSocket()
{
    // QAbstractSocket's destructor closes the connection and signals it;
    // by then this part of the object is gone, so its slots must not run.
    disconnect(this, nullptr, this, nullptr);
}

void TCPClientSocket::onDisconnected()
{
    deleteLater();
}

void TCPClientSocket::onReadyRead()
{
    CommandData data(myEntityID);
    try {
        // No reassembly: what one read brings is one frame.
        data.cmd.setFullData(readAll());
    } catch (unsigned int) {
        return;
    }
    emit command(data);
}

void TCPClientSocket::onResponse(const ResponseData& data)
{
    if (data.entityID != myEntityID)
        return;
    try {
        write(data.cmd.getFullCmd());
    } catch (unsigned int) {
    }
}
