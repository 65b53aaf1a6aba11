#ifndef TCPCLIENTSOCKET_H
#define TCPCLIENTSOCKET_H

// One accepted connection of the inbound server. Each read is taken as one
// whole frame and handed to the CommandHandler; responses tagged with this
// connection's identity are written back.

#include "Communication/CmdData.h"

#include <QTcpSocket>
#include <QUuid>

class EntityIDProvider
{
public:
    EntityIDProvider()
        : myEntityID(QUuid::createUuid())
    {
    }

    QUuid myEntityID;
};

class TCPClientSocket : public QTcpSocket, public EntityIDProvider
{
    Q_OBJECT

public:
    explicit TCPClientSocket(QObject* parent = nullptr);
    ~TCPClientSocket() override;

public slots:
    void onDisconnected();
    void onReadyRead();
    void onResponse(const ResponseData& data);

signals:
    void command(const CommandData& data);
};

#endif // TCPCLIENTSOCKET_H
