#ifndef COLORMATH_H
#define COLORMATH_H

// The colorimetry library: plain functions from reflectance spectra to
// colour coordinates and between coordinate systems.
//
// Conventions of the whole library:
// - A spectrum is 31 doubles, 400-700 nm in 10 nm steps. The functions here
//   read it as a fraction (1.0 = 100 %).
// - Every function returns bool_t, true when done. Pointer arguments are
//   checked for null first and `illumobsnr` (an ILLUM_OBS_T) for 0 to 31; a
//   failing check gives false and leaves the result untouched. A result that
//   cannot be computed (a zero divisor) is -999.0 with false.
// - Power, root, logarithm, exponential and trigonometric functions are taken
//   in single precision on values cast down from double, and the constants
//   are held as written; the results depend on both, so keep them.
// - Angles are degrees at the interface.
// The weights come from the set selected in SharedSystem/WeightTables.h.

#include "SharedSystem/InstrumentTypes.h"

#include <cstdint>

typedef bool bool_t;

// Red in bits 0-7, green in 8-15, blue in 16-23.
typedef uint32_t COLOR_REF;

typedef struct _XYZCOORD {
    double X;
    double Y;
    double Z;
} XYZCOORD;

typedef struct _CIELABCOORD {
    double L;
    double a;
    double b;
} CIELABCOORD;

// Hunter Lab shares the layout of CIE L*a*b*.
typedef CIELABCOORD HUNTERLABCOORD;

typedef struct _CIELCHCOORD {
    double L;
    double C;
    double h;
} CIELCHCOORD;

typedef struct _CIELUVCOORD {
    double L;
    double u;
    double v;
} CIELUVCOORD;

typedef struct _CIEYXYCOORD {
    double Y;
    double x;
    double y;
} CIEYXYCOORD;

typedef struct _CIEYUVCOORD {
    double Y;
    double u;
    double v;
} CIEYUVCOORD;

typedef struct _RXRYRZCOORD {
    double Rx;
    double Ry;
    double Rz;
} RXRYRZCOORD;

// The display curve: linear light x 1000 (0-999) to an 8-bit level.
extern const unsigned char FGAMMA[1000];

// Status density weights: the entry for a status, response and wavelength
// index i stands at status x 124 + response x 31 + i. Rows exist for status
// A, E, I and T (an all-zero row has no data); the responses are visual,
// cyan, magenta, yellow. A row sums to about 100,000.
enum { DEN_WEIGHT_STATUSES = 4, DEN_WEIGHT_RESPONSES = 4 };
extern const int32_t den_weight[DEN_WEIGHT_STATUSES * DEN_WEIGHT_RESPONSES * NUM_WAVELENGTHS];

// Hunter Lab Ka and Kb per illuminant/observer pair.
extern const float s_HunterKa[eILLUM_OBS_NumOf];
extern const float s_HunterKb[eILLUM_OBS_NumOf];

int ColorMath_GetNumIlluminantObservers();

// ---- Spectrum to coordinates ------------------------------------------------

bool_t ColorMath_ReflToXYZ(const double* refls, int illumobsnr, XYZCOORD* pXYZ);
// Per-wavelength products instead of the sums; not clamped.
bool_t ColorMath_ReflToXYZs(const double* refls, int illumobsnr, double* pX, double* pY, double* pZ);
bool_t ColorMath_ReflToRxRyRz(const double* refls, int illumobsnr, RXRYRZCOORD* pRxRyRz);
bool_t ColorMath_ReflToCIELAB(const double* refls, int illumobsnr, CIELABCOORD* pLab);
bool_t ColorMath_ReflToCIELCH(const double* refls, int illumobsnr, CIELCHCOORD* pLch);
// Works on chromaticities, unlike ColorMath_XYZToHunterLab: the two differ.
bool_t ColorMath_ReflToHunterLAB(const double* refls, int illumobsnr, HUNTERLABCOORD* pLab);
bool_t ColorMath_ReflToCIELUV(const double* refls, int illumobsnr, CIELUVCOORD* pLuv);
bool_t ColorMath_ReflToCIEYxy(const double* refls, int illumobsnr, CIEYXYCOORD* pYxy);
bool_t ColorMath_ReflToCIEYuv(const double* refls, int illumobsnr, CIEYUVCOORD* pYuv);
bool_t ColorMath_ReflToRGB(const double* refls, int illumobsnr, COLOR_REF* pcr);

// ---- XYZ to coordinates ---------------------------------------------------------

bool_t ColorMath_XYZToCIELab(const XYZCOORD* pXYZ, int illumobsnr, CIELABCOORD* pLab);
bool_t ColorMath_XYZToCIELCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch);
bool_t ColorMath_XYZToHunterLab(const XYZCOORD* pXYZ, int illumobsnr, HUNTERLABCOORD* pLab);
bool_t ColorMath_XYZToabLCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch);
bool_t ColorMath_XYZTouvLCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch);
bool_t ColorMath_XYZToCIELUV(const XYZCOORD* pXYZ, int illumobsnr, CIELUVCOORD* pLuv);
bool_t ColorMath_XYZToCIEYxy(const XYZCOORD* pXYZ, int illumobsnr, CIEYXYCOORD* pYxy);
bool_t ColorMath_XYZToCIEYuv(const XYZCOORD* pXYZ, int illumobsnr, CIEYUVCOORD* pYuv);
bool_t ColorMath_XYZToxyz(const XYZCOORD* pXYZ, double* px, double* py, double* pz);
bool_t ColorMath_XYZtoRGB(const XYZCOORD* xyz, COLOR_REF* pcr);

// ---- Back conversions -------------------------------------------------------------

bool_t ColorMath_LabToXYZ(const CIELABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_CIELabToXYZ(const CIELABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_HunterLabToXYZ(const HUNTERLABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_LChToCIELab(const CIELCHCOORD* pLch, CIELABCOORD* pLab);
bool_t ColorMath_CIELCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_abLCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_uvLCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_CIELuvToXYZ(const CIELUVCOORD* pLuv, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_CIEYxyToXYZ(const CIEYXYCOORD* pYxy, int illumobsnr, XYZCOORD* pXYZ);
bool_t ColorMath_CIEYuvToXYZ(const CIEYUVCOORD* pYuv, int illumobsnr, XYZCOORD* pXYZ);
// a and b are rounded to hundredths first; L is copied as it is.
bool_t ColorMath_CIELabToCIELCH(const CIELABCOORD* pLAB, CIELCHCOORD* pLch);
// Not available: always false.
bool_t ColorMath_RGBToXYZ(const COLOR_REF* pcr, XYZCOORD* pXYZ);

#endif // COLORMATH_H
