#ifndef COMMUNICATIONSOUTCOMMANDS_H
#define COMMUNICATIONSOUTCOMMANDS_H

// Two early Wi-Fi commands kept beside the working ones of the system
// family. Each returns a STATUS_T and never throws.

#include "SharedSystem/InstrumentTypes.h"

STATUS_T CmdOut_GetWIFISettings();
// Carries no command code (0); its reply is only checked against that.
STATUS_T CmdOut_SetWIFISettings();

#endif // COMMUNICATIONSOUTCOMMANDS_H
