#ifndef MEASUREOUTCOMMANDS_H
#define MEASUREOUTCOMMANDS_H

// The measure family: the trigger of a measurement and the requests that
// fetch a stored sample (spectra, coordinates, textures, pictures) from the
// MeasurementServer. Every function returns the STATUS_T of the transaction
// and never throws. The family shares one recursive lock.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Sample.h"

#include <QByteArray>
#include <QString>
#include <QVector>

#include <functional>

// Who knows the active job (DataManager) tells the trigger its name.
using ActiveJobNameSource = std::function<QString()>;
void MeasureOut_SetActiveJobNameSource(ActiveJobNameSource source);

// Measures into the active job.
STATUS_T CmdOut_TriggerMeasurement();
STATUS_T CmdOut_GetSpectralResult();
STATUS_T CmdOut_GetImageResult();

// The colour stage of a sample: spectra, coordinates, textures and
// thumbnails of all angles. A reply that carries one of the measurement
// statuses 2000 to 2006 is read and that status returned.
STATUS_T CmdOut_GetRefinishSample(Sample& sample, const QString& fileID, int index);
STATUS_T CmdOut_GetAngleFullImage(IMAGE_ANGLE_T angle, const QString& fileID, int index, QByteArray& image);
STATUS_T CmdOut_GetAngleTexture(IMAGE_ANGLE_T angle, const QString& fileID, int index, TEXTURE_T& texture);
STATUS_T CmdOut_GetAngleTextureParameters(IMAGE_ANGLE_T angle, const QString& fileID, int index,
                                          QVector<TEXTURE_PARAMETER_T>& parameters);

// Ends the averaging of an SMC job early.
STATUS_T CmdOut_ForceFinishSMC(const QString& fileID);
STATUS_T CmdOut_GetTemperature(float& value, unsigned short sensor);

#endif // MEASUREOUTCOMMANDS_H
