#include "Commands/CommunicationsOutCommands.h"

#include "Communication/Commands.h"

namespace {

QRecursiveMutex s_communicationsMutex;

const long CODE_GET_WIFI_SETTINGS = 0x400A0C00;
const long CODE_NONE = 0;

} // namespace

STATUS_T CmdOut_GetWIFISettings()
{
    return runCommand(s_communicationsMutex, CODE_GET_WIFI_SETTINGS, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      nothingRead);
}

STATUS_T CmdOut_SetWIFISettings()
{
    return runCommand(s_communicationsMutex, CODE_NONE, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, nothingRead);
}
