#ifndef COLORMATHINTERNAL_H
#define COLORMATHINTERNAL_H

// Shared by the library's own source files only: the checks and the
// single-precision arithmetic its results depend on.

#include "SharedSystem/WeightTables.h"
#include "Utils/ColorMath.h"

#include <cmath>

namespace ColorMathInternal {

constexpr double kErrorValue = -999.0;

inline bool validPair(int illumobsnr)
{
    return illumobsnr >= 0 && illumobsnr < eILLUM_OBS_NumOf;
}

inline const XYZN_T& whitePoint(int illumobsnr)
{
    return pXYZN.load()[illumobsnr];
}

// Power, root, logarithm, exponential and trigonometry in single precision
// on values cast down from double, as the library's results are defined.
inline double sqrtS(double v) { return double(sqrtf(float(v))); }
inline double cosS(double v) { return double(cosf(float(v))); }
inline double sinS(double v) { return double(sinf(float(v))); }
inline double expS(double v) { return double(expf(float(v))); }
inline double logS(double v) { return double(logf(float(v))); }
inline double log10S(double v) { return double(log10f(float(v))); }
inline double powS(double v, double e) { return double(powf(float(v), float(e))); }
inline double pow10S(double v) { return double(powf(10.0f, float(v))); }

} // namespace ColorMathInternal

#endif // COLORMATHINTERNAL_H
