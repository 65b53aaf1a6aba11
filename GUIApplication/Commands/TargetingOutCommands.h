#ifndef TARGETINGOUTCOMMANDS_H
#define TARGETINGOUTCOMMANDS_H

// Commands of the live view before a measurement. Each returns a STATUS_T
// and never throws. The family shares one recursive mutex.

#include "SharedSystem/InstrumentTypes.h"

#include <QByteArray>

// The live picture the GUI asks for, 3 bytes a pixel.
const int TARGETING_IMAGE_WIDTH = 482;
const int TARGETING_IMAGE_HEIGHT = 348;
const int TARGETING_IMAGE_BYTES = TARGETING_IMAGE_WIDTH * TARGETING_IMAGE_HEIGHT * 3;

// Returns the server's status.
STATUS_T CmdOut_StartTargetingMode();
STATUS_T CmdOut_StopTargetingMode();
// The targeting poll. A picture of another size returns
// STATUS_TCP_LENGTH_MISMATCH and leaves image as it was; pressure and
// orientation are filled before the picture is looked at.
STATUS_T CmdOut_GetTargetingInfo(PRESSURE_SWITCH_T& pressure, ACCELEROMETER_ORIENTATION_T& orientation,
                                 CALIBRATION_STATUS_T& calibration, QByteArray& image);
STATUS_T CmdOut_GetInstrumentOrientation(ACCELEROMETER_ORIENTATION_T& orientation);
STATUS_T CmdOut_GetPressureSensor(PRESSURE_SWITCH_T& pressure);
STATUS_T CmdOut_GetPreviewImage(QByteArray& image);

#endif // TARGETINGOUTCOMMANDS_H
