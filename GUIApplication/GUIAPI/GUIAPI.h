#ifndef GUIAPI_H
#define GUIAPI_H

// Everything a screen may call below it, in one include.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/JobAPI.h"
#include "GUIAPI/MeasureAPI.h"
#include "GUIAPI/SampleAPI.h"
#include "GUIAPI/SyncObject.h"
#include "GUIAPI/SystemAPI.h"
#include "GUIAPI/TargetingAPI.h"

#endif // GUIAPI_H
