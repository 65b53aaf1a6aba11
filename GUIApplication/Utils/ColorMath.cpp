#include "Utils/ColorMath.h"

#include "SharedSystem/WeightTables.h"
#include "Utils/ColorMathHelper.h"
#include "Utils/ColorMathInternal.h"

#include <cmath>
#if defined(__SSE2__)
#include <emmintrin.h>
#endif

// Hunter Ka and Kb as tabulated for each pair; they follow
// Ka = 175 (Xn + Yn) / 198.04 and Kb = 70 (Yn + Zn) / 218.11 only to the
// precision of the tabulation, and are kept as such.
const float s_HunterKa[eILLUM_OBS_NumOf] = {
    185.21f, 186.3f,  175.0f,  174.3f,  173.52f, 173.79f, 172.71f, 172.87f,
    172.28f, 172.06f, 172.18f, 171.45f, 175.99f, 179.59f, 172.28f, 172.95f,
    173.58f, 174.19f, 173.53f, 175.81f, 177.56f, 180.1f,  183.74f, 186.5f,
    184.16f, 187.33f, 178.27f, 180.91f, 174.47f, 177.05f, 183.48f, 186.67f,
};

const float s_HunterKb[eILLUM_OBS_NumOf] = {
    38.41f, 38.2f,  70.0f,  69.38f, 58.48f, 58.1f,  61.84f, 61.48f,
    67.18f, 66.69f, 71.34f, 70.79f, 52.85f, 53.49f, 67.14f, 66.81f,
    58.55f, 58.15f, 58.52f, 58.83f, 51.65f, 52.16f, 40.33f, 40.91f,
    44.59f, 44.97f, 52.28f, 52.71f, 58.11f, 58.6f,  43.45f, 43.75f,
};

namespace {

using namespace ColorMathInternal;

// Threshold of the linear part of L*, held in double.
const double kEpsilon = 0.008856;
const float kOneThird = 0.33333334f;

// The L*a*b* companding function.
double labF(double v)
{
    return v > kEpsilon ? double(powf(float(v), kOneThird)) : 7.787 * v + 0.137931;
}

double cube(double v)
{
    return double(powf(float(v), 3.0f));
}

// Hue angle in degrees, 0 to 360.
double hueDegrees(double y, double x)
{
    double h = double(atan2f(float(y), float(x))) / 3.1415927 * 180.0;
    if (h < 0.0)
        h += 360.0;
    return h;
}

// L* of the L*C*h* forms: 903.3 in the linear part, not the 903.292 of
// ColorMath_XYZToCIELab.
double lchLightness(double Y, double Yn)
{
    const double ratio = Y / Yn;
    return ratio > kEpsilon ? 116.0 * double(powf(float(ratio), kOneThird)) - 16.0 : 903.3 * ratio;
}

// u' and v' of a tristimulus triple; both 0 for a zero denominator.
void uvPrime(double X, double Y, double Z, double* up, double* vp)
{
    const double d = X + 15.0 * Y + 3.0 * Z;
    *up = d != 0.0 ? 4.0 * X / d : 0.0;
    *vp = d != 0.0 ? 9.0 * Y / d : 0.0;
}

template <bool wrappedX>
void sumWeights(const double* refls, const XYZ_WEIGHTS_T& w, double* X, double* Y, double* Z)
{
    double x = 0.0, y = 0.0, z = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double r = refls[i] * 100.0;
        const int32_t xw = wrappedX ? WeightTable_UnwrapXWeight(w.XWeight[i]) : w.XWeight[i];
        x += xw * r;
        y += w.YWeight[i] * r;
        z += w.ZWeight[i] * r;
    }
    *X = x;
    *Y = y;
    *Z = z;
}

// A linear screen value clamped to 0 (NaN too) and 0.999 (as float), then
// ColorMathHelper_Round of it x 1000: an index 0..999 into FGAMMA. The
// clamps are min/max, not branches, which would mispredict on real colours.
inline int32_t gammaIndex(double linear)
{
    const double top = double(0.999f);
#if defined(__SSE2__)
    // The compiler turns the portable form into branches; MAXSD gives its
    // second operand, 0, for NaN.
    const double v = _mm_cvtsd_f64(_mm_min_sd(_mm_max_sd(_mm_set_sd(linear), _mm_setzero_pd()), _mm_set_sd(top)));
#else
    double v = 0.0 < linear ? linear : 0.0;
    v = v < top ? v : top;
#endif
    const double scaled = v * 1000.0; // 0..999.00001: rounding needs no range checks
    int32_t index = int32_t(scaled);
    index += int32_t(scaled - index >= 0.5);
    return index;
}

// The screen path (spectrum, XYZ, RGB) runs at every repaint of a colour
// patch; these bodies are called directly, not through the exported
// symbols, so that the compiler can inline them.
inline bool reflToXYZ(const double* refls, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!refls || !pXYZ || !validPair(illumobsnr))
        return false;
    const XYZ_WEIGHTS_T* table = pILLOBS_TABLE.load();
    double X, Y, Z;
    if (WeightTable_IsXRowWrapped(table, illumobsnr))
        sumWeights<true>(refls, table[illumobsnr], &X, &Y, &Z);
    else
        sumWeights<false>(refls, table[illumobsnr], &X, &Y, &Z);
    X /= 100000.0;
    Y /= 100000.0;
    Z /= 100000.0;
    pXYZ->X = X < 0.0 ? 0.0 : X;
    pXYZ->Y = Y < 0.0 ? 0.0 : Y;
    pXYZ->Z = Z < 0.0 ? 0.0 : Z;
    return true;
}

inline bool xyzToRGB(const XYZCOORD* xyz, COLOR_REF* pcr)
{
    if (!xyz || !pcr)
        return false;
    // Not normalised to any white: a perfect white saturates all three.
    const double linear[3] = {
        0.056507956 * xyz->X - 0.027365549 * xyz->Y - 0.008413978 * xyz->Z,
        -0.014958500 * xyz->X + 0.026018254 * xyz->Y + 0.000538549 * xyz->Z,
        0.000739082 * xyz->X - 0.002633301 * xyz->Y + 0.012043483 * xyz->Z,
    };
    *pcr = COLOR_REF(FGAMMA[gammaIndex(linear[0])]) + COLOR_REF(FGAMMA[gammaIndex(linear[1])]) * 256u
           + COLOR_REF(FGAMMA[gammaIndex(linear[2])]) * 65536u;
    return true;
}

} // namespace

int ColorMath_GetNumIlluminantObservers()
{
    return eILLUM_OBS_NumOf;
}

// ---- Spectrum to coordinates ------------------------------------------------

bool_t ColorMath_ReflToXYZ(const double* refls, int illumobsnr, XYZCOORD* pXYZ)
{
    return reflToXYZ(refls, illumobsnr, pXYZ);
}

bool_t ColorMath_ReflToXYZs(const double* refls, int illumobsnr, double* pX, double* pY, double* pZ)
{
    if (!refls || !pX || !pY || !pZ || !validPair(illumobsnr))
        return false;
    const XYZ_WEIGHTS_T* table = pILLOBS_TABLE.load();
    const XYZ_WEIGHTS_T& w = table[illumobsnr];
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        pX[i] = refls[i] * WeightTable_XWeight(table, illumobsnr, i) / 100000.0;
        pY[i] = refls[i] * w.YWeight[i] / 100000.0;
        pZ[i] = refls[i] * w.ZWeight[i] / 100000.0;
    }
    return true;
}

bool_t ColorMath_ReflToRxRyRz(const double* refls, int illumobsnr, RXRYRZCOORD* pRxRyRz)
{
    if (!refls || !pRxRyRz || !validPair(illumobsnr))
        return false;
    XYZCOORD xyz;
    XYZCOORD norm;
    if (!ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) || !ColorMathHelper_GetNormValence(illumobsnr, &norm))
        return false;
    // The blue part of the X function, 400 to 500 nm.
    const XYZ_WEIGHTS_T* table = pILLOBS_TABLE.load();
    int32_t blue = 0;
    for (int i = WAVELENGTH_400; i <= WAVELENGTH_500; ++i)
        blue += WeightTable_XWeight(table, illumobsnr, i);
    const double p = blue / 1000.0 / 100.0;
    const double q = norm.X / 100.0 - p;
    const double r = norm.Z / 100.0;
    if (q == 0.0 || r == 0.0) {
        pRxRyRz->Rx = pRxRyRz->Ry = pRxRyRz->Rz = kErrorValue;
        return false;
    }
    pRxRyRz->Rx = xyz.X / q - xyz.Z * p / (q * r);
    pRxRyRz->Ry = xyz.Y;
    pRxRyRz->Rz = xyz.Z / r;
    return true;
}

bool_t ColorMath_ReflToCIELAB(const double* refls, int illumobsnr, CIELABCOORD* pLab)
{
    XYZCOORD xyz;
    return pLab && ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) && ColorMath_XYZToCIELab(&xyz, illumobsnr, pLab);
}

bool_t ColorMath_ReflToCIELCH(const double* refls, int illumobsnr, CIELCHCOORD* pLch)
{
    XYZCOORD xyz;
    return pLch && ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) && ColorMath_XYZToCIELCH(&xyz, illumobsnr, pLch);
}

bool_t ColorMath_ReflToHunterLAB(const double* refls, int illumobsnr, HUNTERLABCOORD* pLab)
{
    XYZCOORD xyz;
    if (!pLab || !ColorMath_ReflToXYZ(refls, illumobsnr, &xyz))
        return false;
    // Chromaticities, not tristimulus values, are set against the white
    // point here; a black spectrum leaves them at 0.
    double x = 0.0, y = 0.0, z = 0.0;
    ColorMath_XYZToxyz(&xyz, &x, &y, &z);
    const XYZN_T& n = whitePoint(illumobsnr);
    const double xn = x / n.XWeightSum;
    const double yn = y / n.YWeightSum;
    const double zn = z / n.ZWeightSum;
    const double root = double(sqrtf(float(yn)));
    if (root == 0.0) {
        pLab->L = pLab->a = pLab->b = 0.0;
        return true;
    }
    pLab->L = 100.0 * root;
    pLab->a = s_HunterKa[illumobsnr] * (xn - yn) / root;
    pLab->b = s_HunterKb[illumobsnr] * (yn - zn) / root;
    return true;
}

bool_t ColorMath_ReflToCIELUV(const double* refls, int illumobsnr, CIELUVCOORD* pLuv)
{
    XYZCOORD xyz;
    return pLuv && ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) && ColorMath_XYZToCIELUV(&xyz, illumobsnr, pLuv);
}

bool_t ColorMath_ReflToCIEYxy(const double* refls, int illumobsnr, CIEYXYCOORD* pYxy)
{
    XYZCOORD xyz;
    return pYxy && ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) && ColorMath_XYZToCIEYxy(&xyz, illumobsnr, pYxy);
}

bool_t ColorMath_ReflToCIEYuv(const double* refls, int illumobsnr, CIEYUVCOORD* pYuv)
{
    XYZCOORD xyz;
    return pYuv && ColorMath_ReflToXYZ(refls, illumobsnr, &xyz) && ColorMath_XYZToCIEYuv(&xyz, illumobsnr, pYuv);
}

bool_t ColorMath_ReflToRGB(const double* refls, int illumobsnr, COLOR_REF* pcr)
{
    XYZCOORD xyz;
    return pcr && reflToXYZ(refls, illumobsnr, &xyz) && xyzToRGB(&xyz, pcr);
}

// ---- XYZ to coordinates ---------------------------------------------------------

bool_t ColorMath_XYZToCIELab(const XYZCOORD* pXYZ, int illumobsnr, CIELABCOORD* pLab)
{
    if (!pXYZ || !pLab || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double xn = pXYZ->X / n.XWeightSum;
    const double yn = pXYZ->Y / n.YWeightSum;
    const double zn = pXYZ->Z / n.ZWeightSum;
    const double fy = labF(yn);
    pLab->L = yn <= kEpsilon ? 903.292 * yn : 116.0 * fy - 16.0;
    pLab->a = 500.0 * (labF(xn) - fy);
    pLab->b = 200.0 * (fy - labF(zn));
    return true;
}

bool_t ColorMath_XYZToCIELCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch)
{
    if (!pXYZ || !pLch || !validPair(illumobsnr))
        return false;
    const double L = lchLightness(pXYZ->Y, whitePoint(illumobsnr).YWeightSum);
    double C = 0.0, h = 0.0;
    if (pXYZ->X != 0.0 || pXYZ->Z != 0.0) {
        CIELABCOORD lab;
        ColorMath_XYZToCIELab(pXYZ, illumobsnr, &lab);
        h = hueDegrees(lab.b, lab.a);
        C = double(powf(float(lab.a * lab.a + lab.b * lab.b), 0.5f));
    }
    pLch->L = L;
    pLch->C = C;
    pLch->h = h;
    return true;
}

bool_t ColorMath_XYZToabLCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch)
{
    return ColorMath_XYZToCIELCH(pXYZ, illumobsnr, pLch);
}

bool_t ColorMath_XYZTouvLCH(const XYZCOORD* pXYZ, int illumobsnr, CIELCHCOORD* pLch)
{
    if (!pXYZ || !pLch || !validPair(illumobsnr))
        return false;
    const double L = lchLightness(pXYZ->Y, whitePoint(illumobsnr).YWeightSum);
    double C = 0.0, h = 0.0;
    if (pXYZ->X != 0.0 || pXYZ->Z != 0.0) {
        CIELUVCOORD luv;
        ColorMath_XYZToCIELUV(pXYZ, illumobsnr, &luv);
        C = double(powf(float(luv.u * luv.u + luv.v * luv.v), 0.5f));
        h = hueDegrees(luv.v, luv.u);
    }
    pLch->L = L;
    pLch->C = C;
    pLch->h = h;
    return true;
}

bool_t ColorMath_XYZToCIELUV(const XYZCOORD* pXYZ, int illumobsnr, CIELUVCOORD* pLuv)
{
    if (!pXYZ || !pLuv || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double yn = pXYZ->Y / n.YWeightSum;
    const double L = yn <= kEpsilon ? 903.292 * yn : 116.0 * ColorMathHelper_cuberoot(yn) - 16.0;
    double up, vp, unp, vnp;
    uvPrime(pXYZ->X, pXYZ->Y, pXYZ->Z, &up, &vp);
    uvPrime(n.XWeightSum, n.YWeightSum, n.ZWeightSum, &unp, &vnp);
    pLuv->L = L;
    pLuv->u = 13.0 * L * (up - unp);
    pLuv->v = 13.0 * L * (vp - vnp);
    return true;
}

bool_t ColorMath_XYZToCIEYxy(const XYZCOORD* pXYZ, int illumobsnr, CIEYXYCOORD* pYxy)
{
    if (!pXYZ || !pYxy || !validPair(illumobsnr))
        return false;
    const double sum = pXYZ->X + pXYZ->Y + pXYZ->Z;
    if (sum == 0.0) {
        pYxy->Y = pYxy->x = pYxy->y = 0.0;
        return false;
    }
    pYxy->Y = pXYZ->Y;
    pYxy->x = pXYZ->X / sum;
    pYxy->y = pXYZ->Y / sum;
    return true;
}

bool_t ColorMath_XYZToCIEYuv(const XYZCOORD* pXYZ, int illumobsnr, CIEYUVCOORD* pYuv)
{
    if (!pXYZ || !pYuv || !validPair(illumobsnr))
        return false;
    CIELUVCOORD luv;
    ColorMath_XYZToCIELUV(pXYZ, illumobsnr, &luv);
    pYuv->Y = pXYZ->Y;
    pYuv->u = luv.u;
    pYuv->v = luv.v;
    return true;
}

bool_t ColorMath_XYZToxyz(const XYZCOORD* pXYZ, double* px, double* py, double* pz)
{
    if (!pXYZ || !px || !py || !pz)
        return false;
    const double sum = pXYZ->X + pXYZ->Y + pXYZ->Z;
    if (sum == 0.0) {
        *px = *py = *pz = 0.0;
        return false;
    }
    *px = pXYZ->X / sum;
    *py = pXYZ->Y / sum;
    *pz = pXYZ->Z / sum;
    return true;
}

bool_t ColorMath_XYZToHunterLab(const XYZCOORD* pXYZ, int illumobsnr, HUNTERLABCOORD* pLab)
{
    if (!pXYZ || !pLab || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double xn = pXYZ->X / n.XWeightSum;
    const double yn = pXYZ->Y / n.YWeightSum;
    const double zn = pXYZ->Z / n.ZWeightSum;
    const double root = double(sqrtf(float(yn)));
    if (root == 0.0) {
        // Black: no chromatic axes to speak of.
        pLab->L = pLab->a = pLab->b = 0.0;
        return true;
    }
    pLab->L = 100.0 * root;
    pLab->a = s_HunterKa[illumobsnr] * (xn - yn) / root;
    pLab->b = s_HunterKb[illumobsnr] * (yn - zn) / root;
    return true;
}

bool_t ColorMath_XYZtoRGB(const XYZCOORD* xyz, COLOR_REF* pcr)
{
    return xyzToRGB(xyz, pcr);
}

// ---- Back conversions -------------------------------------------------------------

bool_t ColorMath_LabToXYZ(const CIELABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pLab || !pXYZ || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double fy = (pLab->L + 16.0) / 116.0;
    const double c = cube(fy);
    const double p = fy + pLab->a / 500.0;
    const double p3 = cube(p);
    const double r = fy - pLab->b / 200.0;
    const double r3 = cube(r);
    pXYZ->Y = c <= kEpsilon ? pLab->L * n.YWeightSum / 903.292 : n.YWeightSum * c;
    pXYZ->X = p3 > kEpsilon ? n.XWeightSum * p3 : n.XWeightSum * (p - 0.137931) / 7.787;
    pXYZ->Z = r3 > kEpsilon ? n.ZWeightSum * r3 : n.ZWeightSum * (r - 0.137931) / 7.787;
    return true;
}

bool_t ColorMath_CIELabToXYZ(const CIELABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ)
{
    return ColorMath_LabToXYZ(pLab, illumobsnr, pXYZ);
}

bool_t ColorMath_HunterLabToXYZ(const HUNTERLABCOORD* pLab, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pLab || !pXYZ || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double l = pLab->L / 100.0;
    const double l2 = l * l;
    pXYZ->Y = n.YWeightSum * l2;
    pXYZ->X = n.XWeightSum * (pLab->a * pLab->L / 100.0 / s_HunterKa[illumobsnr] + l2);
    pXYZ->Z = n.ZWeightSum * (l2 - pLab->b * pLab->L / 100.0 / s_HunterKb[illumobsnr]);
    return true;
}

bool_t ColorMath_LChToCIELab(const CIELCHCOORD* pLch, CIELABCOORD* pLab)
{
    if (!pLch || !pLab)
        return false;
    const float radians = float(pLch->h * 3.1415927410125732 / 180.0);
    const double C = pLch->C;
    pLab->L = pLch->L;
    pLab->a = C * double(cosf(radians));
    pLab->b = C * double(sinf(radians));
    return true;
}

bool_t ColorMath_CIELCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ)
{
    CIELABCOORD lab;
    return pXYZ && ColorMath_LChToCIELab(pLch, &lab) && ColorMath_LabToXYZ(&lab, illumobsnr, pXYZ);
}

bool_t ColorMath_abLCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ)
{
    return ColorMath_CIELCHToXYZ(pLch, illumobsnr, pXYZ);
}

bool_t ColorMath_uvLCHToXYZ(const CIELCHCOORD* pLch, int illumobsnr, XYZCOORD* pXYZ)
{
    CIELABCOORD polar;
    if (!pXYZ || !ColorMath_LChToCIELab(pLch, &polar))
        return false;
    const CIELUVCOORD luv = {polar.L, polar.a, polar.b};
    return ColorMath_CIELuvToXYZ(&luv, illumobsnr, pXYZ);
}

bool_t ColorMath_CIELuvToXYZ(const CIELUVCOORD* pLuv, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pLuv || !pXYZ || !validPair(illumobsnr))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double L = pLuv->L;
    if (L == 0.0) {
        // Black: u* and v* carry no chromaticity at L* 0.
        pXYZ->X = pXYZ->Y = pXYZ->Z = 0.0;
        return true;
    }
    const double c = cube((L + 16.0) / 116.0);
    const double Y = c <= kEpsilon ? L * n.YWeightSum / 903.292 : n.YWeightSum * c;
    double unp, vnp;
    uvPrime(n.XWeightSum, n.YWeightSum, n.ZWeightSum, &unp, &vnp);
    const double up = pLuv->u / (13.0 * L) + unp;
    const double vp = pLuv->v / (13.0 * L) + vnp;
    if (vp == 0.0) {
        pXYZ->X = pXYZ->Y = pXYZ->Z = kErrorValue;
        return false;
    }
    pXYZ->X = 9.0 * up * Y / (4.0 * vp);
    pXYZ->Y = Y;
    pXYZ->Z = Y * (12.0 - 20.0 * vp - 3.0 * up) / (4.0 * vp);
    return true;
}

bool_t ColorMath_CIEYxyToXYZ(const CIEYXYCOORD* pYxy, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pYxy || !pXYZ || !validPair(illumobsnr))
        return false;
    if (pYxy->y == 0.0) {
        pXYZ->X = pXYZ->Y = pXYZ->Z = kErrorValue;
        return false;
    }
    pXYZ->X = pYxy->Y * pYxy->x / pYxy->y;
    pXYZ->Y = pYxy->Y;
    pXYZ->Z = pYxy->Y * (1.0 - pYxy->x - pYxy->y) / pYxy->y;
    return true;
}

bool_t ColorMath_CIEYuvToXYZ(const CIEYUVCOORD* pYuv, int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pYuv || !pXYZ || !validPair(illumobsnr))
        return false;
    const double ratio = pYuv->Y / whitePoint(illumobsnr).YWeightSum;
    const CIELUVCOORD luv = {116.0 * ColorMathHelper_cuberoot(ratio) - 16.0, pYuv->u, pYuv->v};
    return ColorMath_CIELuvToXYZ(&luv, illumobsnr, pXYZ);
}

bool_t ColorMath_CIELabToCIELCH(const CIELABCOORD* pLAB, CIELCHCOORD* pLch)
{
    if (!pLAB || !pLch)
        return false;
    double a = ColorMathHelper_MungeValue(pLAB->a);
    const double b = ColorMathHelper_MungeValue(pLAB->b);
    // Keeps atan2 away from a true zero abscissa.
    if (a == 0.0)
        a = double(0.000001f);
    pLch->L = pLAB->L;
    pLch->C = double(sqrtf(float(a * a + b * b)));
    pLch->h = hueDegrees(b, a);
    return true;
}

bool_t ColorMath_RGBToXYZ(const COLOR_REF* pcr, XYZCOORD* pXYZ)
{
    Q_UNUSED(pcr);
    Q_UNUSED(pXYZ);
    return false;
}
