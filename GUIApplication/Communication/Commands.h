#ifndef COMMANDS_H
#define COMMANDS_H

// The one way to the MeasurementServer: numbers each transaction, hands the
// packet to the link, checks that the reply answers it and logs what failed.
// Lock order everywhere: the CmdOut_ family's mutex, then this one, then the
// link's; one transaction at a time in the whole process.

#include "Communication/CmdData.h"

#include <QMutex>
#include <QMutexLocker>
#include <QObject>

class TcpClient;

// The time-out of a command unless its table entry says otherwise.
const int DEFAULT_COMMAND_TIMEOUT_MS = 4000;

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

// The shape of every CmdOut_ function: the family's lock, a new request
// carrying the code and the arguments written by append, one transaction, the
// reply read by read straight into the caller's outputs. read returns the
// function's result (usually STATUS_OK). A status thrown on the way comes back
// as the result, so a CmdOut_ function never throws, and outputs may be half
// filled on a failure.
template <typename Append, typename Read>
STATUS_T runCommand(QRecursiveMutex& familyMutex, long code, bool validate, int timeout,
                    Append append, Read read)
{
    QMutexLocker lock(&familyMutex);
    try {
        CmdData cmdTx;
        CmdData cmdRx;
        cmdTx.setCommandCode(code);
        append(cmdTx);
        cmdRx = Commands::instance()->sendAndReceive(cmdTx, validate, timeout);
        return read(cmdRx);
    } catch (unsigned int status) {
        return status;
    }
}

// For commands without arguments or without anything to read.
inline void noArguments(CmdData&) {}
inline STATUS_T nothingRead(CmdData&) { return STATUS_OK; }

#endif // COMMANDS_H
