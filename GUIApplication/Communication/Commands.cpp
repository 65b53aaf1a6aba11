#include "Communication/Commands.h"

#include "Communication/TcpClient.h"

#include <QDebug>
#include <QMutex>
#include <QMutexLocker>

#include <cstdio>

namespace {

QRecursiveMutex s_commandsMutex;

// The codes of the last transaction, for a look with the debugger; never
// printed.
char s_traceBuffer[64];

} // namespace

Commands* Commands::instance()
{
    static Commands* const s_instance = new Commands();
    return s_instance;
}

Commands::Commands(QObject* parent)
    : QObject(parent)
    , m_tcp(nullptr)
    , m_transID(0)
{
}

void Commands::Init()
{
    // Created outside the lock: constructing the client never touches the
    // link, and a transaction in flight may hold the lock for seconds.
    TcpClient* client = new TcpClient();
    Commands* self = instance();
    {
        QMutexLocker lock(&s_commandsMutex);
        self->m_tcp = client;
        self->m_transID = 0;
    }
    client->Init();
}

TcpClient* Commands::tcpClient() const
{
    QMutexLocker lock(&s_commandsMutex);
    return m_tcp;
}

CmdData Commands::sendAndReceive(CmdData& cmd, bool validate, int timeout)
{
    QMutexLocker lock(&s_commandsMutex);

    cmd.setTransactionID(m_transID);
    m_transID = static_cast<short>(static_cast<quint16>(m_transID) + 1);

    try {
        std::snprintf(s_traceBuffer, sizeof s_traceBuffer, "Tx GetCommandCode = 0x%.8X ",
                      static_cast<unsigned int>(cmd.getCommandCode()));
        if (!m_tcp)
            throw STATUS_TCP_NOT_CONNECTED;
        CmdData reply = m_tcp->sendAndReceive(cmd, timeout);
        std::snprintf(s_traceBuffer, sizeof s_traceBuffer, "Rx GetCommandCode = 0x%.8X ",
                      static_cast<unsigned int>(reply.getCommandCode()));
        if (validate)
            validateResponse(cmd, reply);
        return reply;
    } catch (unsigned int status) {
        qDebug().noquote() << QString("Error 0x%1 in command 0x%2")
                                  .arg(QString::number(status, 16).right(2))
                                  .arg(QString::number(static_cast<quint32>(cmd.getCommandCode()), 16).right(8));
        throw;
    }
}
