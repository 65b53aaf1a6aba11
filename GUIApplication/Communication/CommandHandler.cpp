#include "Communication/CommandHandler.h"

#include <QDebug>
#include <QMutexLocker>

CommandHandler::CommandHandler() = default;

CommandHandler* CommandHandler::instance()
{
    return CommandHandlerTask::worker();
}

void CommandHandler::onCommand(const CommandData& data)
{
    QMutexLocker lock(&m_mutex);
    CmdData cmd = data.cmd;
    emit command(data);
    try {
        try {
            switch (cmd.getCommandCode()) {
            case CODE_ECHO:
                break;
            case CODE_BATTERY_SET:
                cmd = CmdHandler_BatterySet(cmd);
                break;
            default:
                throw STATUS_UNKNOWN_COMMAND;
            }
        } catch (unsigned int status) {
            cmd.respond(status, true);
        }
    } catch (unsigned int status) {
        // The failure's own answer failed too (arguments left unread): the
        // command is dropped rather than let out of the handler's loop.
        qDebug().noquote() << QString("Inbound command 0x%1 dropped: %2")
                                  .arg(QString::number(static_cast<quint32>(cmd.getCommandCode()), 16))
                                  .arg(status);
        return;
    }
    emit response(ResponseData(data.entityID, cmd));
}

CommandHandlerTask* CommandHandlerTask::instance()
{
    static CommandHandlerTask* const s_instance = new CommandHandlerTask();
    return s_instance;
}

CommandHandlerTask::CommandHandlerTask()
{
    startAndWait();
}

CmdData CmdHandler_BatterySet(CmdData cmd)
{
    const char which = char(cmd.nextArg_ui8());
    const QString text = cmd.nextArgString();
    if (which == 'a') {
        // Compared and not used: the hook only proves the path works.
        const bool greeted = (text == "HELLO WORLD");
        Q_UNUSED(greeted);
    }
    cmd.respond(0, true);
    cmd.appendString("Good Deal");
    return cmd;
}
