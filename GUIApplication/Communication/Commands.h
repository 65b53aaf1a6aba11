#ifndef COMMANDS_H
#define COMMANDS_H

// The one way to the MeasurementServer: numbers each transaction, hands the
// packet to the link, checks that the reply answers it and logs what failed.
// Lock order everywhere: the CmdOut_ family's mutex, then this one, then the
// link's; one transaction at a time in the whole process.

#include "Communication/CmdData.h"

#include <QObject>

class TcpClient;

class Commands : public QObject
{
    Q_OBJECT

public:
    // Lazy, no lock. Moved to the DataManager thread by DataManager::Init().
    static Commands* instance();

    // Builds a new link client on the calling thread and restarts the
    // transaction numbers at 0. An earlier client is left running as it is.
    static void Init();

    // Sends cmd with the next transaction id and returns the reply. With
    // validate, a reply to another transaction throws 3 and a non-zero
    // status throws 2. Every failure is logged once here and thrown again.
    CmdData sendAndReceive(CmdData& cmd, bool validate, int timeout);

    // The link client in use; null before Init().
    TcpClient* tcpClient() const;

private:
    explicit Commands(QObject* parent = nullptr);

    TcpClient* m_tcp;
    short m_transID;
};

#endif // COMMANDS_H
