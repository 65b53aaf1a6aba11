#include "Commands/CalibrationOutCommands.h"

#include "Communication/Commands.h"

namespace {

QRecursiveMutex s_calibrationMutex;

const long CODE_REFERENCE_CHECK = 0x40040010;
const long CODE_GET_CALIBRATION_STATE = 0x400A0700;
const long CODE_SET_CALIBRATION_SETTINGS = 0x400A0710;
const long CODE_TRIGGER_MEASUREMENT = 0x41000000;
const long CODE_TRIGGER_CALIBRATION = 0x60000021;

const int REFERENCE_CHECK_TIMEOUT_MS = 8000;
// The stored reference the check is made against.
const char* const FACTORY_REFERENCE = "factory_ref";

} // namespace

STATUS_T CmdOut_TriggerCalibration()
{
    return runCommand(s_calibrationMutex, CODE_TRIGGER_CALIBRATION, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      nothingRead);
}

STATUS_T CmdOut_TriggerReferenceCheck()
{
    return runCommand(
        s_calibrationMutex, CODE_TRIGGER_MEASUREMENT, false, DEFAULT_COMMAND_TIMEOUT_MS,
        [](CmdData& tx) { tx.appendString(QString()); }, [](CmdData& rx) { return rx.getStatus(); });
}

STATUS_T CmdOut_ReferenceCheck(bool& passed)
{
    return runCommand(
        s_calibrationMutex, CODE_REFERENCE_CHECK, true, REFERENCE_CHECK_TIMEOUT_MS,
        [](CmdData& tx) { tx.appendString(FACTORY_REFERENCE); },
        [&](CmdData& rx) {
            rx.nextArgTime();
            passed = rx.nextArg_ui8() == 1;
            return STATUS_OK;
        });
}

STATUS_T CmdOut_GetCalibrationState(CALIBRATION_STATE_T& state)
{
    return runCommand(s_calibrationMutex, CODE_GET_CALIBRATION_STATE, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          state.nextExternalWhiteCal = rx.nextArg_si32();
                          state.lastExternalWhiteCal = rx.nextArgTime();
                          state.dTempExternalWhite = rx.nextArg_f32();
                          state.referenceTempExternalWhite = rx.nextArg_f32();
                          state.nextInternalWhiteCal = rx.nextArg_si32();
                          state.lastInternalWhiteCal = rx.nextArgTime();
                          state.dTempInternalWhite = rx.nextArg_f32();
                          state.referenceTempInternalWhite = rx.nextArg_f32();
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_SetCalibrationSettings()
{
    return runCommand(s_calibrationMutex, CODE_SET_CALIBRATION_SETTINGS, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      noArguments, nothingRead);
}
