#include "GUIAPI/TargetingAPI.h"

#include "GUIAPI/API_SignalMaster.h"

void TargetingAPI_StartPolling()
{
    API_SignalMaster::instance()->emitTriggerTargetingStart();
}

void TargetingAPI_StopPolling()
{
    API_SignalMaster::instance()->emitTriggerTargetingStop();
}
