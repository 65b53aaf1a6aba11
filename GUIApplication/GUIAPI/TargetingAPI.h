#ifndef TARGETINGAPI_H
#define TARGETINGAPI_H

// The targeting screen runs its own live-view poll; these only tell it to
// start or stop.
void TargetingAPI_StartPolling();
void TargetingAPI_StopPolling();

#endif // TARGETINGAPI_H
