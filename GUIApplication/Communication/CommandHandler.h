#ifndef COMMANDHANDLER_H
#define COMMANDHANDLER_H

// The inbound side: commands that arrive on the GUI's own server port are
// dispatched here and answered with a response for the same connection.
// Built and never started by the application: nothing calls
// CommandHandlerTask::instance(), so CommandHandler::instance() stays null.

#include "Communication/CmdData.h"
#include "SharedSystem/WorkerTask.h"

#include <QMutex>
#include <QObject>

class CommandHandler : public QObject
{
    Q_OBJECT

public:
    // Codes the GUI answers.
    static constexpr long CODE_ECHO = 0;
    static constexpr long CODE_BATTERY_SET = 1;

    CommandHandler();

    // The handler of the running task; null while the task isn't started.
    static CommandHandler* instance();

public slots:
    void onCommand(const CommandData& data);

signals:
    void command(const CommandData& data);
    void response(const ResponseData& data);

private:
    QRecursiveMutex m_mutex;
};

class CommandHandlerTask : public WorkerTask<CommandHandler>
{
public:
    // Starts the handler's thread on first use.
    static CommandHandlerTask* instance();

private:
    CommandHandlerTask();
};

// A hook for trying the inbound path: whatever the arguments, the answer is
// status 0 and "Good Deal", unless arguments are left unread.
CmdData CmdHandler_BatterySet(CmdData cmd);

#endif // COMMANDHANDLER_H
