#ifndef INSTRUMENT_H
#define INSTRUMENT_H

// What the hardware model can do, the server's address, and small utilities.

#include "SharedSystem/InstrumentTypes.h"

#include <QString>

// Address of the MeasurementServer. Set once from the command line.
void setIpAddress(QString address);
QString getIpAddress();
void setIpPort(int port);
int getIpPort();

// Asks the server for its configuration: "ALDER" is the 11-angle, 5-camera
// instrument, everything else (a failed question too) the 6-angle BIRCH.
void Instrument_Determine_Model_Type();
MODEL_TYPES_T Instrument_Get_Model_Type();
// For a model known by other means (the simulator, tests).
void Instrument_Set_Model_Type(MODEL_TYPES_T model);

int Instrument_Get_Num_Spectral_Angles();
int Instrument_Get_Num_Camera_Images();
int Instrument_Get_Sample_Thumbnail_Width();
int Instrument_Get_Sample_Thumbnail_Height();

// The reflectance angles in order of their aspecular value, for the rainbow
// and the result lists. With 6 curves the enum order already is that order.
REFL_ANGLE_T Instrument_Get_Angle_Low_To_High(int index, int numCurves);
REFL_ANGLE_T Instrument_Get_Angle_High_To_Low(int index, int numCurves);

// Waits while the event loop keeps running.
void Delay(int msec);
// Waits without handling events.
void DelayBlocking(int msec);

// True when a character is beyond 7-bit ASCII: such text goes on the wire
// as 32-bit characters, since the plain string's count is in characters.
// Defined with the packet code, which uses it for tags.
bool isString32(const QString& text);

#endif // INSTRUMENT_H
