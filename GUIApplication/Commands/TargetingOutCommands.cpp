#include "Commands/TargetingOutCommands.h"

#include "Communication/Commands.h"

#include <QDebug>

namespace {

QRecursiveMutex s_targetingMutex;

const long CODE_GET_PRESSURE_SENSOR = 0x400A0500;
const long CODE_GET_INSTRUMENT_ORIENTATION = 0x400A0600;
const long CODE_START_TARGETING_MODE = 0x41000200;
const long CODE_STOP_TARGETING_MODE = 0x41000210;
const long CODE_GET_TARGETING_INFO = 0x41000220;
const long CODE_GET_PREVIEW_IMAGE = 0x60000018;

void appendImageSize(CmdData& tx)
{
    tx.append_si16(TARGETING_IMAGE_WIDTH);
    tx.append_si16(TARGETING_IMAGE_HEIGHT);
}

} // namespace

STATUS_T CmdOut_StartTargetingMode()
{
    bool answered = false;
    const STATUS_T status = runCommand(
        s_targetingMutex, CODE_START_TARGETING_MODE, false, DEFAULT_COMMAND_TIMEOUT_MS,
        [](CmdData& tx) {
            tx.append_f32(0.0f);
            tx.append_si32(0);
        },
        [&](CmdData& rx) {
            answered = true;
            return rx.getStatus();
        });
    qDebug() << (answered ? "start targetting successful" : "start targetting failed");
    return status;
}

STATUS_T CmdOut_StopTargetingMode()
{
    const STATUS_T status = runCommand(s_targetingMutex, CODE_STOP_TARGETING_MODE, true,
                                       DEFAULT_COMMAND_TIMEOUT_MS, noArguments, nothingRead);
    qDebug() << (status == STATUS_OK ? "stop targetting successful" : "stop targetting failed");
    return status;
}

STATUS_T CmdOut_GetTargetingInfo(PRESSURE_SWITCH_T& pressure, ACCELEROMETER_ORIENTATION_T& orientation,
                                 CALIBRATION_STATUS_T& calibration, QByteArray& image)
{
    return runCommand(s_targetingMutex, CODE_GET_TARGETING_INFO, false, DEFAULT_COMMAND_TIMEOUT_MS, appendImageSize,
                      [&](CmdData& rx) {
                          if (rx.getStatus() != STATUS_OK)
                              throw rx.getStatus();
                          pressure = rx.nextArgPressureSwitchStatus();
                          orientation = rx.nextArgAccelerationInfo();
                          calibration = wireEnum<CALIBRATION_STATUS_T>(rx.nextArg_ui8(), NUM_CALIBRATION_STATUS_TYPES);
                          const int spares = rx.nextArg_si32();
                          for (int i = 0; i < spares; ++i)
                              rx.nextArg_si32();
                          const int width = rx.nextArg_si16();
                          const int height = rx.nextArg_si16();
                          const int size = rx.nextArg_si32();
                          if (width != TARGETING_IMAGE_WIDTH || height != TARGETING_IMAGE_HEIGHT
                              || size != TARGETING_IMAGE_BYTES)
                              throw STATUS_TCP_LENGTH_MISMATCH;
                          image.truncate(0);
                          image.append(rx.nextArgBuffer(size));
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetInstrumentOrientation(ACCELEROMETER_ORIENTATION_T& orientation)
{
    return runCommand(s_targetingMutex, CODE_GET_INSTRUMENT_ORIENTATION, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      noArguments, [&](CmdData& rx) {
                          orientation = rx.nextArgAccelerationInfo();
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetPressureSensor(PRESSURE_SWITCH_T& pressure)
{
    return runCommand(s_targetingMutex, CODE_GET_PRESSURE_SENSOR, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          pressure = rx.nextArgPressureSwitchStatus();
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetPreviewImage(QByteArray& image)
{
    return runCommand(s_targetingMutex, CODE_GET_PREVIEW_IMAGE, true, DEFAULT_COMMAND_TIMEOUT_MS, appendImageSize,
                      [&](CmdData& rx) {
                          const int size = rx.nextArg_si32();
                          image = rx.nextArgBuffer(size);
                          return STATUS_OK;
                      });
}
