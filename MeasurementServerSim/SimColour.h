#ifndef SIMCOLOUR_H
#define SIMCOLOUR_H

// The server's colour results, worked out with the product's colour library:
// L*a*b* and L*C*h* under D65 and the 10 degree observer, per geometry, and the
// colour of a patch as the instrument's display shows it (for the pictures).

#include "SharedSystem/InstrumentTypes.h"

#include <QColor>
#include <QVector>

namespace Sim {
namespace Colour {

// numAngles x 5 values L, a, b, C, h from numAngles x 31 reflectances.
QVector<float> labch(const QVector<float>& refl, int numAngles);

// CIE 1976 colour difference of the L, a, b at the start of two labch records.
double deltaE(const float* a, const float* b);
// The largest difference over the geometries of two labch vectors of the same size.
double maxDeltaE(const QVector<float>& a, const QVector<float>& b);

// Display colour of one spectrum (31 values, fraction).
QColor screenColour(const double refl[NUM_WAVELENGTHS]);

} // namespace Colour
} // namespace Sim

#endif // SIMCOLOUR_H
