#ifndef CALIBRATIONOUTCOMMANDS_H
#define CALIBRATIONOUTCOMMANDS_H

// Commands of calibration and the reference check. Each returns a STATUS_T
// and never throws. The family shares one recursive mutex.

#include "SharedSystem/InstrumentTypes.h"

STATUS_T CmdOut_TriggerCalibration();
// A measurement without a job name: the server takes it as the reference
// measurement. Returns the server's status.
STATUS_T CmdOut_TriggerReferenceCheck();
// Compares the last reference measurement with the stored factory reference.
STATUS_T CmdOut_ReferenceCheck(bool& passed);
STATUS_T CmdOut_GetCalibrationState(CALIBRATION_STATE_T& state);
STATUS_T CmdOut_SetCalibrationSettings();

#endif // CALIBRATIONOUTCOMMANDS_H
