#ifndef MEASUREAPI_H
#define MEASUREAPI_H

// Start and finish of measurements, calibrations, reference checks and self
// tests, and the reading of the errors they leave on the server. The
// triggers only raise signals; PollStatus does the work on the DataManager
// thread and calls the completion functions from its ticks.

#include "SharedSystem/InstrumentTypes.h"

// True from any trigger until a completion function ran. A poll that ends
// otherwise (kill timer, lost link) leaves it set until the next completion.
bool MeasAPI_GetMeasurementInProcess();

void MeasAPI_TriggerMeasurement();
void MeasAPI_TriggerUserCalibration();
void MeasAPI_TriggerReferenceCheck();
void MeasAPI_TriggerSelfTest(const TEST& test);

// MeasurementIssue(-1) (the good news) or the first known server error, then
// MeasurementComplete.
void MeasAPI_MeasurementComplete();
void MeasAPI_CalculationComplete();
void MeasAPI_CalibrationComplete();
void MeasAPI_ReferenceCheckComplete();
void MeasAPI_SelfTestComplete(const TEST& test);

// Reads and resets the server's error list and reports the first error the
// GUI knows; MeasurementIssue(0) for a list of unknown errors only. True if
// the list held anything.
bool MeasAPI_CheckAndHandleErrors();

// The latest measurement as a sample (AddedSample); not part of the
// measuring flow, where samples arrive with the job reload.
bool MeasAPI_CollectLatestSampleData();
// TemperatureWarning when the sample sensor is outside the user's limits.
void MeasAPI_TemperatureCheck();

#endif // MEASUREAPI_H
