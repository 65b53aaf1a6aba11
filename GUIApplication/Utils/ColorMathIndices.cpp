// Indices reduced from one spectrum or a pair: whiteness, yellowness,
// metamerism, opacity and hide, strength, grey scale ratings, gloss. Several
// are tied to one illuminant/observer pair by their definition and refuse
// the others; the IQC forms keep their historical arithmetic (the double
// normalisation of the Hunter-based ones among it).

#include "Utils/ColorMath.h"
#include "Utils/ColorMathHelper.h"
#include "Utils/ColorMathInternal.h"

#include "SharedSystem/WeightTables.h"

#include <cmath>
#include <cstring>

const float asISOR457_Filter[NUM_WAVELENGTHS] = {
    0.002454f, 0.014866f, 0.03937f, 0.074223f, 0.122804f, 0.175724f, 0.211039f, 0.187282f,
    0.113415f, 0.044918f, 0.012696f, 0.001209f, 0.0f,      0.0f,      0.0f,      0.0f,
    0.0f,      0.0f,      0.0f,      0.0f,      0.0f,      0.0f,      0.0f,      0.0f,
    0.0f,      0.0f,      0.0f,      0.0f,      0.0f,      0.0f,      0.0f,
};

namespace {

using namespace ColorMathInternal;



// Kubelka-Munk K/S of a reflectance in percent.
double kOverS(double reflPercent)
{
    double r = reflPercent / 100.0;
    if (r < 9.999999747378752e-05)
        r = 9.999999747378752e-05;
    return (1.0 - r) * (1.0 - r) / (2.0 * r);
}

double capStrength(double v)
{
    return v > 1000.0 ? 1000.0 : v;
}

// Percent spectra to fractions, for the functions of the colour path.
void toFraction(const double* percent, double* fraction)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        fraction[i] = percent[i] / 100.0;
}

bool whitePointForE313(int illumobsnr, double* x0, double* y0)
{
    switch (illumobsnr) {
    case C_2: *x0 = double(0.3101f); *y0 = double(0.3161f); return true;
    case C_10: *x0 = double(0.3104f); *y0 = double(0.3191f); return true;
    case D50_2: *x0 = double(0.3457f); *y0 = double(0.3585f); return true;
    case D50_10: *x0 = double(0.3477f); *y0 = double(0.3595f); return true;
    case D65_2: *x0 = double(0.3127f); *y0 = double(0.3290f); return true;
    case D65_10: *x0 = double(0.3138f); *y0 = double(0.3310f); return true;
    default: return false;
    }
}

bool yellowCoefficients(int illumobsnr, double* cx, double* cz)
{
    switch (illumobsnr) {
    case C_2: *cx = 1.2769; *cz = 1.0592; return true;
    case C_10: *cx = 1.2871; *cz = 1.0781; return true;
    case D65_2: *cx = 1.2985; *cz = 1.1335; return true;
    case D65_10: *cx = 1.3013; *cz = 1.1498; return true;
    default: return false;
    }
}

// Hunter L + 3a - 3b (Stensby) or L - 3b (Hunter), from XYZ that the IQC
// forms have already divided by the white point once.
bool hunterWhiteness(XYZCOORD xyz, int illumobsnr, bool normaliseFirst, bool stensby, double* pWhite)
{
    if (normaliseFirst) {
        const XYZN_T& n = whitePoint(illumobsnr);
        if (n.XWeightSum == 0.0f || n.YWeightSum == 0.0f || n.ZWeightSum == 0.0f)
            return false;
        xyz.X /= n.XWeightSum;
        xyz.Y /= n.YWeightSum;
        xyz.Z /= n.ZWeightSum;
    }
    HUNTERLABCOORD lab;
    if (!ColorMath_XYZToHunterLab(&xyz, illumobsnr, &lab))
        return false;
    *pWhite = stensby ? lab.L + 3.0 * lab.a - 3.0 * lab.b : lab.L - 3.0 * lab.b;
    return true;
}

} // namespace

// ---- Whiteness -------------------------------------------------------------------

bool_t ColorMath_ReflToWhiteE313_73IQC(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || !validPair(illumobsnr) || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    if (n.ZWeightSum == 0.0f || n.YWeightSum == 0.0f) {
        *pWhite = kErrorValue;
        return false;
    }
    *pWhite = 400.0 * xyz.Z / n.ZWeightSum - 300.0 * xyz.Y / n.YWeightSum;
    return true;
}

bool_t ColorMath_CIEYxyToWhiteE313_98(const CIEYXYCOORD* pYxy, int illumobsnr, double* pWhite)
{
    if (!pYxy || !pWhite)
        return false;
    double x0, y0;
    if (!whitePointForE313(illumobsnr, &x0, &y0)) {
        *pWhite = kErrorValue;
        return false;
    }
    const double W = pYxy->Y + 800.0 * (x0 - pYxy->x) + 1700.0 * (y0 - pYxy->y);
    if (!(W > 40.0 && W < 5.0 * pYxy->Y - 280.0)) {
        *pWhite = kErrorValue;
        return false;
    }
    *pWhite = W;
    return true;
}

bool_t ColorMath_CIEYxyToWhiteE313_05(const CIEYXYCOORD* pYxy, int illumobsnr, double* pWhite)
{
    return ColorMath_CIEYxyToWhiteE313_98(pYxy, illumobsnr, pWhite);
}

bool_t ColorMath_XYZtoWhiteE313_98(const XYZCOORD* pXYZ, int illumobsnr, double* pWhite)
{
    CIEYXYCOORD yxy;
    if (!pXYZ || !pWhite || !ColorMath_XYZToCIEYxy(pXYZ, illumobsnr, &yxy))
        return false;
    return ColorMath_CIEYxyToWhiteE313_98(&yxy, illumobsnr, pWhite);
}

bool_t ColorMath_ReflToWhiteE313_98(const double* pRefl, int illumobsnr, double* pWhite)
{
    CIEYXYCOORD yxy;
    if (!pRefl || !pWhite || !ColorMath_ReflToCIEYxy(pRefl, illumobsnr, &yxy))
        return false;
    return ColorMath_CIEYxyToWhiteE313_98(&yxy, illumobsnr, pWhite);
}

bool_t ColorMath_ReflToWhiteE313_05(const double* pRefl, int illumobsnr, double* pWhite)
{
    return ColorMath_ReflToWhiteE313_98(pRefl, illumobsnr, pWhite);
}

bool_t ColorMath_ReflToWhiteE313_Regensdorf(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz, norm;
    if (!pRefl || !pWhite || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz)
        || !ColorMathHelper_GetNormValence(illumobsnr, &norm))
        return false;
    if (norm.Z == 0.0) {
        *pWhite = kErrorValue;
        return false;
    }
    *pWhite = 400.0 * xyz.Z / norm.Z - 3.0 * xyz.Y;
    return true;
}

bool_t ColorMath_ReflToWhiteBerger(const double* pRefl, int illumobsnr, double* pWhite)
{
    RXRYRZCOORD r;
    if (!pRefl || !pWhite || !ColorMath_ReflToRxRyRz(pRefl, illumobsnr, &r))
        return false;
    *pWhite = r.Ry + 3.0 * (r.Rz - r.Rx);
    return true;
}

bool_t ColorMath_ReflToWhiteBergerIQC(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || !validPair(illumobsnr) || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    const double b = 0.01 * n.ZWeightSum * 0.1675;
    const double a = 0.01 * n.XWeightSum - b;
    const double c = 0.01 * n.ZWeightSum;
    if (a == 0.0 || c == 0.0) {
        *pWhite = kErrorValue;
        return false;
    }
    const double rx = xyz.X / a - xyz.Z * b / (a * c);
    const double rz = xyz.Z / c;
    *pWhite = xyz.Y + 3.0 * (rz - rx);
    return true;
}

bool_t ColorMath_ReflToWhiteTaubeIQC(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || illumobsnr != C_2 || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    *pWhite = 3.388 * xyz.Z - 3.0 * xyz.Y;
    return true;
}

bool_t ColorMath_ReflToWhiteHunterIQC(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || illumobsnr != C_2 || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    return hunterWhiteness(xyz, illumobsnr, true, false, pWhite);
}

bool_t ColorMath_ReflToWhiteStensby(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    return hunterWhiteness(xyz, illumobsnr, false, true, pWhite);
}

bool_t ColorMath_ReflToWhiteStensbyIQC(const double* pRefl, int illumobsnr, double* pWhite)
{
    XYZCOORD xyz;
    if (!pRefl || !pWhite || illumobsnr != C_2 || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    return hunterWhiteness(xyz, illumobsnr, true, true, pWhite);
}

bool_t ColorMath_ReflToWhiteGanzGriessner(const double* pRefl, int illumobsnr, GANZ* pWhiteGanz)
{
    CIEYXYCOORD yxy;
    if (!pRefl || !pWhiteGanz || illumobsnr != D65_10 || !ColorMath_ReflToCIEYxy(pRefl, illumobsnr, &yxy))
        return false;
    pWhiteGanz->Whiteness = yxy.Y - 1868.322 * yxy.x - 3695.69 * yxy.y + 1809.441;
    pWhiteGanz->Tint = -937.588 * yxy.x + 826.697 * yxy.y + 21.352;
    return true;
}

bool_t ColorMath_ReflToWhiteISO_R457(const double* pRefl, double* pWhite)
{
    if (!pRefl || !pWhite)
        return false;
    double sum = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        sum += double(asISOR457_Filter[i]) * pRefl[i];
    *pWhite = sum;
    return true;
}

// ---- Yellowness -------------------------------------------------------------------

bool_t ColorMath_XYZtoYellowE313_98(const XYZCOORD* pXYZ, int illumobsnr, double* pYellow)
{
    if (!pXYZ || !pYellow)
        return false;
    double cx, cz;
    if (!yellowCoefficients(illumobsnr, &cx, &cz)) {
        *pYellow = kErrorValue;
        return false;
    }
    cx = double(float(cx));
    cz = double(float(cz));
    *pYellow = pXYZ->Y == 0.0 ? 0.0 : (cx * pXYZ->X - cz * pXYZ->Z) * 100.0 / pXYZ->Y;
    return true;
}

bool_t ColorMath_ReflToYellowE313_98(const double* pRefl, int illumobsnr, double* pYellow)
{
    XYZCOORD xyz;
    if (!pRefl || !pYellow)
        return false;
    if (!validPair(illumobsnr) || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz)) {
        *pYellow = kErrorValue;
        return false;
    }
    return ColorMath_XYZtoYellowE313_98(&xyz, illumobsnr, pYellow);
}

bool_t ColorMath_ReflToYellowE313_73IQC(const double* pRefl, int illumobsnr, double* pYellow)
{
    XYZCOORD xyz;
    if (!pRefl || !pYellow || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    if (xyz.Y == 0.0) {
        *pYellow = kErrorValue;
        return false;
    }
    *pYellow = (1.0 - 0.847 * xyz.Z / xyz.Y) * 100.0;
    return true;
}

bool_t ColorMath_ReflToYellowE313_Regensdorf(const double* pRefl, int illumobsnr, double* pYellow)
{
    XYZCOORD xyz, norm;
    if (!pRefl || !pYellow || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz)
        || !ColorMathHelper_GetNormValence(illumobsnr, &norm))
        return false;
    if (xyz.Y == 0.0 || norm.Z == 0.0) {
        *pYellow = kErrorValue;
        return false;
    }
    *pYellow = (1.0 - 100.0 * xyz.Z / (xyz.Y * norm.Z)) * 100.0;
    return true;
}

bool_t ColorMath_ReflToYellowD1925(const double* pRefl, int illumobsnr, double* pYellow)
{
    RXRYRZCOORD r;
    if (!pRefl || !pYellow || !ColorMath_ReflToRxRyRz(pRefl, illumobsnr, &r))
        return false;
    if (r.Ry == 0.0) {
        *pYellow = kErrorValue;
        return false;
    }
    *pYellow = (r.Rx - r.Rz) * 100.0 / r.Ry;
    return true;
}

bool_t ColorMath_ReflToYellowD1925IQC(const double* pRefl, int illumobsnr, double* pYellow)
{
    XYZCOORD xyz;
    double cx, cz;
    if (!pRefl || !pYellow || illumobsnr == C_10 || !yellowCoefficients(illumobsnr, &cx, &cz)
        || !ColorMath_ReflToXYZ(pRefl, illumobsnr, &xyz))
        return false;
    // The historical form has no test for Y = 0; an error value stands in
    // for the division.
    if (xyz.Y == 0.0) {
        *pYellow = kErrorValue;
        return false;
    }
    *pYellow = (cx * xyz.X - cz * xyz.Z) * 100.0 / xyz.Y;
    return true;
}

bool_t ColorMath_ReflToCIETintYellow(const double* pRefl, int illumobsnr, double* pTint)
{
    CIEYXYCOORD yxy;
    XYZCOORD norm;
    if (!pRefl || !pTint || (illumobsnr != D65_2 && illumobsnr != D65_10)
        || !ColorMath_ReflToCIEYxy(pRefl, illumobsnr, &yxy) || !ColorMathHelper_GetNormValence(illumobsnr, &norm))
        return false;
    const double sum = norm.X + norm.Y + norm.Z;
    if (sum == 0.0)
        return false;
    const double xn = norm.X / sum, yn = norm.Y / sum;
    const double K = illumobsnr == D65_2 ? 1000.0 : 900.0;
    *pTint = (xn - yxy.x) * K - (yn - yxy.y) * 650.0;
    return true;
}

// ---- Metamerism and error weights ---------------------------------------------------

bool_t ColorMath_ReflToMetamerism(const double* pStdRefls, const double* pSampRefls, int IllObs1, int IllObs2,
                                  double* pMetamerism)
{
    if (!pStdRefls || !pSampRefls || !pMetamerism || !validPair(IllObs1))
        return false;
    CIELABCOORD s1, t1, s2, t2;
    double d1, d2;
    if (!ColorMath_ReflToCIELAB(pStdRefls, IllObs1, &s1) || !ColorMath_ReflToCIELAB(pSampRefls, IllObs1, &t1)
        || !ColorMath_ReflToCIELAB(pStdRefls, IllObs2, &s2) || !ColorMath_ReflToCIELAB(pSampRefls, IllObs2, &t2))
        return false;
    ColorMath_LabToDElab(&t1, &s1, &d1);
    ColorMath_LabToDElab(&t2, &s2, &d2);
    *pMetamerism = d1 + d2;
    return true;
}

bool_t ColorMath_ReflToDIN6172(const double* pStdRefls, const double* pSampRefls, int IllObs1, int IllObs2,
                               double* pMetamerism)
{
    CIELABCOORD s1, t1, s2, t2;
    if (!pStdRefls || !pSampRefls || !pMetamerism || !ColorMath_ReflToCIELAB(pStdRefls, IllObs1, &s1)
        || !ColorMath_ReflToCIELAB(pSampRefls, IllObs1, &t1) || !ColorMath_ReflToCIELAB(pStdRefls, IllObs2, &s2)
        || !ColorMath_ReflToCIELAB(pSampRefls, IllObs2, &t2))
        return false;
    const double eL = (s2.L - t2.L) - (s1.L - t1.L);
    const double ea = (s2.a - t2.a) - (s1.a - t1.a);
    const double eb = (s2.b - t2.b) - (s1.b - t1.b);
    *pMetamerism = sqrtS(eL * eL + ea * ea + eb * eb);
    return true;
}

bool_t ColorMath_ReflToABErrorWeights(const double* reflsStd, const double* reflsTrial, int illumobsnr,
                                      double* pAErrWeights, double* pBErrWeights)
{
    if (!reflsStd || !reflsTrial || (!pAErrWeights && !pBErrWeights) || !validPair(illumobsnr))
        return false;
    double Xs[NUM_WAVELENGTHS], Ys[NUM_WAVELENGTHS], Zs[NUM_WAVELENGTHS];
    double Xt[NUM_WAVELENGTHS], Yt[NUM_WAVELENGTHS], Zt[NUM_WAVELENGTHS];
    if (!ColorMath_ReflToXYZs(reflsStd, illumobsnr, Xs, Ys, Zs)
        || !ColorMath_ReflToXYZs(reflsTrial, illumobsnr, Xt, Yt, Zt))
        return false;
    const XYZN_T& n = whitePoint(illumobsnr);
    if (n.XWeightSum == 0.0f || n.YWeightSum == 0.0f || n.ZWeightSum == 0.0f)
        return false;
    double A[NUM_WAVELENGTHS], B[NUM_WAVELENGTHS];
    double maxA = 0.0, maxB = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double a = (Xt[i] - Xs[i]) * 2.5e7 / n.XWeightSum - (Yt[i] - Ys[i]) * 2.5e7 / n.YWeightSum;
        const double b = (Yt[i] - Ys[i]) * 8e6 / n.YWeightSum - (Zt[i] - Zs[i]) * 8e6 / n.ZWeightSum;
        A[i] = a < 0.0 ? -std::cbrt(-a) : std::cbrt(a);
        B[i] = b < 0.0 ? -std::cbrt(-b) : std::cbrt(b);
        maxA = std::fmax(maxA, std::fabs(A[i]));
        maxB = std::fmax(maxB, std::fabs(B[i]));
    }
    // Equal spectra leave nothing to weigh: all weights 0.
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        if (pAErrWeights)
            pAErrWeights[i] = maxA > 0.0 ? A[i] / maxA * 100.0 : 0.0;
        if (pBErrWeights)
            pBErrWeights[i] = maxB > 0.0 ? B[i] / maxB * 100.0 : 0.0;
    }
    return true;
}

// ---- Opacity, hide and strength -------------------------------------------------------

bool_t ColorMath_ReflToOpacity(const double* pafCOBRefls, const double* pafCOWRefls, int illumobsnr,
                               double* pfOpacity)
{
    if (!pafCOBRefls || !pafCOWRefls || !pfOpacity || !validPair(illumobsnr))
        return false;
    double black[NUM_WAVELENGTHS], white[NUM_WAVELENGTHS];
    toFraction(pafCOBRefls, black);
    toFraction(pafCOWRefls, white);
    XYZCOORD b, w;
    if (!ColorMath_ReflToXYZ(black, illumobsnr, &b) || !ColorMath_ReflToXYZ(white, illumobsnr, &w))
        return false;
    const double yw = w.Y == 0.0 ? 9.999999747378752e-06 : w.Y;
    double o = b.Y / yw * 100.0;
    o = o < 0.0 ? 0.0 : o > 1000.0 ? 1000.0 : o;
    *pfOpacity = o;
    return true;
}

bool_t ColorMath_ReflToFullColorAtHide(const double* pafWhiteRefls, const double* pafCOWRefls,
                                       const double* pafCOBRefls, double fk1, double fk2, double* pafCAHRefls)
{
    if (!pafWhiteRefls || !pafCOWRefls || !pafCOBRefls || !pafCAHRefls)
        return false;
    const auto saunderson = [fk1, fk2](double R) {
        double r = R / 100.0;
        if (r <= 0.0)
            r = 0.00001;
        double d = (1.0 - fk1 - fk2) + fk2 * r;
        if (d == 0.0)
            d = 0.00001;
        return (r - fk1) / d;
    };
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double w = saunderson(pafWhiteRefls[i]);
        const double v = saunderson(pafCOWRefls[i]);
        const double k = saunderson(pafCOBRefls[i]);
        double kw = k * w;
        if (kw == 0.0)
            kw = 0.00001;
        double a = ((k - v + w) / kw + v) / 2.0;
        if (a < 1.00001)
            a = 1.00001;
        const double rinf = a - sqrtS(a * a - 1.0);
        double d = 1.0 / rinf - fk2;
        if (d == 0.0)
            d = 0.00001;
        double result = ((1.0 - fk1 - fk2) + fk1 / rinf) / d * 100.0;
        pafCAHRefls[i] = result < 0.0 ? 0.0 : result > 200.0 ? 200.0 : result;
    }
    return true;
}

bool_t ColorMath_ReflToStrengthApt(const double* pfStdRefls, const double* pfSampleRefls, double* pfApparentStr)
{
    if (!pfStdRefls || !pfSampleRefls || !pfApparentStr)
        return false;
    double std = 0.0, smp = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        std += kOverS(pfStdRefls[i]);
        smp += kOverS(pfSampleRefls[i]);
    }
    if (std == 0.0)
        return false;
    *pfApparentStr = capStrength(smp / std * 100.0);
    return true;
}

bool_t ColorMath_ReflToStrengthChr(const double* pfStdRefls, const double* pfSampleRefls, double* pfChromStr,
                                   int* piWaveLength)
{
    if (!pfStdRefls || !pfSampleRefls || !pfChromStr || !piWaveLength)
        return false;
    int index = *piWaveLength != 0 ? *piWaveLength / 10 - 40 : 0;
    if (index == 0) {
        index = 1;
        for (int i = 2; i <= 29; ++i) {
            if (pfStdRefls[i] < pfStdRefls[index])
                index = i;
        }
    }
    if (index < 0 || index > 30)
        return false;
    const double std = kOverS(pfStdRefls[index]);
    if (std == 0.0)
        return false;
    *pfChromStr = capStrength(kOverS(pfSampleRefls[index]) / std * 100.0);
    *piWaveLength = (index + 40) * 10;
    return true;
}

bool_t ColorMath_ReflToStrengthTri(const double* pfStdRefls, const double* pfSampleRefls, double* pfTristStr)
{
    if (!pfStdRefls || !pfSampleRefls || !pfTristStr)
        return false;
    double s[NUM_WAVELENGTHS], t[NUM_WAVELENGTHS];
    toFraction(pfStdRefls, s);
    toFraction(pfSampleRefls, t);
    XYZCOORD xs, xt;
    if (!ColorMath_ReflToXYZ(s, D65_10, &xs) || !ColorMath_ReflToXYZ(t, D65_10, &xt))
        return false;
    double vs = xs.X, vt = xt.X;
    if (xs.Y < vs) {
        vs = xs.Y;
        vt = xt.Y;
    }
    if (xs.Z < vs) {
        vs = xs.Z;
        vt = xt.Z;
    }
    const double ks = kOverS(vs);
    if (ks == 0.0)
        return false;
    *pfTristStr = capStrength(kOverS(vt) / ks * 100.0);
    return true;
}

bool_t ColorMath_StrengthAtMinDE(const double* pafSampleRefl, const double* pafStdRefl, double* pafAdjustedRefl,
                                 double* pfNewStrength)
{
    if (!pafSampleRefl || !pafStdRefl || !pafAdjustedRefl || !pfNewStrength)
        return false;
    const auto deltaE = [pafStdRefl](const double* percent, double* pDE) {
        double a[NUM_WAVELENGTHS], b[NUM_WAVELENGTHS];
        toFraction(percent, a);
        toFraction(pafStdRefl, b);
        CIELABCOORD la, lb;
        return ColorMath_ReflToCIELAB(a, D65_10, &la) && ColorMath_ReflToCIELAB(b, D65_10, &lb)
               && ColorMath_LabToDElab(&la, &lb, pDE);
    };
    double d1 = 0.0;
    if (!deltaE(pafSampleRefl, &d1))
        return false;
    double oldStrength = 100.0, newStrength = 50.0;
    bool flag = false;
    for (int trial = 0; trial < 20; ++trial) {
        if (newStrength <= 0.0)
            newStrength = 0.1;
        if (newStrength > 999.0)
            newStrength = 999.0;
        double d2 = 0.0;
        if (!ColorMathHelper_ColorAtEquivStrength(&newStrength, pafSampleRefl, pafAdjustedRefl)
            || !deltaE(pafAdjustedRefl, &d2))
            return false;
        if (std::fabs(d1 - d2) < 0.005 && trial > 4)
            break;
        const double step = newStrength - oldStrength;
        if (d1 > d2) {
            newStrength += step;
            d1 = d2;
            flag = true;
        } else if (flag && d1 < d2) {
            newStrength = oldStrength + step / 2.0;
            flag = false;
            continue;
        } else if (d1 < d2) {
            newStrength = oldStrength + (oldStrength - newStrength);
            flag = true;
        } else {
            oldStrength = newStrength;
        }
    }
    if (oldStrength != 100.0 && !ColorMathHelper_ColorAtEquivStrength(&newStrength, pafSampleRefl, pafAdjustedRefl))
        return false;
    *pfNewStrength = newStrength;
    return true;
}

// ---- Grey scale, chroma test, gloss -------------------------------------------------------

bool_t ColorMath_ReflToGrayScale(const double* pSmpRefls, const double* pStdRefls, char* Stain, char* Color)
{
    if (!pSmpRefls || !pStdRefls || !Stain || !Color)
        return false;
    double s[NUM_WAVELENGTHS], t[NUM_WAVELENGTHS];
    toFraction(pSmpRefls, t);
    toFraction(pStdRefls, s);
    CIELABCOORD lt, ls;
    CIELCHCOORD ct, cs;
    if (!ColorMath_ReflToCIELAB(t, D65_10, &lt) || !ColorMath_ReflToCIELAB(s, D65_10, &ls))
        return false;
    ColorMath_CIELabToCIELCH(&lt, &ct);
    ColorMath_CIELabToCIELCH(&ls, &cs);
    const double labT[3] = {lt.L, lt.a, lt.b}, labS[3] = {ls.L, ls.a, ls.b};
    const double lchT[3] = {ct.L, ct.C, ct.h}, lchS[3] = {cs.L, cs.C, cs.h};
    double dLab[3], dLch[3], dE = 0.0;
    ColorMath_CalcDeltaLabLCH(labT, labS, lchT, lchS, dLab, dLch);
    ColorMath_LabToDElab(&lt, &ls, &dE);

    double hm = (ct.h + cs.h) / 2.0;
    if (std::fabs(ct.h - cs.h) > 180.0)
        hm += ct.h + cs.h < 360.0 ? 180.0 : -180.0;
    const double Cm = (ct.C + cs.C) / 2.0;
    const double d = hm - 280.0;
    const double t30 = std::fabs(d) > 180.0 ? (360.0 - std::fabs(d)) / 30.0 : d / 30.0;
    const double D = dLch[1] * Cm * expS(-(t30 * t30)) / 100.0;
    const double dHp = dLch[2] - D;
    const double dCp = dLch[1] - D;
    const double dCk = dCp / (1.0 + (Cm * 20.0 / 1000.0) * (Cm * 20.0 / 1000.0));
    const double dHk = dHp / (1.0 + (Cm * 10.0 / 1000.0) * (Cm * 10.0 / 1000.0));
    const double F = sqrtS(dLch[0] * dLch[0] + dCk * dCk + dHk * dHk);

    double x = dE * dE - dLch[0] * dLch[0];
    if (x < 0.0)
        x = 0.0;
    const double g = dE - 0.4 * sqrtS(x);
    double R = 5.0;
    if (g > 0.0) {
        R = 6.1 - 1.45 * logS(g);
        if (R > 4.0)
            R = 5.0 - 0.23 * g;
    }
    static const char* const kRatings[] = {"5", "4-5", "4", "3-4", "3", "2-3", "2", "1-2", "1"};
    static const double kStainFloors[] = {4.75, 4.25, 3.75, 3.25, 2.75, 2.25, 1.75, 1.25};
    static const double kColorFloors[] = {11.6, 8.2, 5.8, 4.1, 2.95, 2.1, 1.25, 0.4};
    int stain = 8;
    for (int i = 0; i < 8; ++i) {
        if (R >= kStainFloors[i]) {
            stain = i;
            break;
        }
    }
    // The colour rating runs the other way: a large F is a poor "1".
    int color = 0;
    for (int i = 0; i < 8; ++i) {
        if (F >= kColorFloors[i]) {
            color = 8 - i;
            break;
        }
    }
    std::strcpy(Stain, kRatings[stain]);
    std::strcpy(Color, kRatings[color]);
    return true;
}

bool_t ColorMath_IsChromatic(const double* refls, int illumobsnr)
{
    CIELCHCOORD lch;
    if (!refls || !ColorMath_ReflToCIELCH(refls, illumobsnr, &lch))
        return false;
    return lch.C > 12.6 - 0.114285715 * lch.L;
}

void ColorMath_GetAChromaticConstants(double* pLHi, double* pLLo, double* pCHi, double* pCLo)
{
    if (pLHi)
        *pLHi = 84.0;
    if (pLLo)
        *pLLo = 14.0;
    if (pCHi)
        *pCHi = 3.0;
    if (pCLo)
        *pCLo = 11.0;
}

bool_t ColorMath_ReflToGloss60(const double* pReflInc, const double* pReflExc, int illumobsnr,
                               const double* pCoeffs, double* pGloss)
{
    XYZCOORD inc, exc;
    if (!pReflInc || !pReflExc || !pCoeffs || !pGloss || !ColorMath_ReflToXYZ(pReflInc, illumobsnr, &inc)
        || !ColorMath_ReflToXYZ(pReflExc, illumobsnr, &exc))
        return false;
    const double d = inc.Y - exc.Y;
    if (d < 0.0001 || pCoeffs[1] == 0.0) {
        *pGloss = pCoeffs[3];
        return true;
    }
    *pGloss = pCoeffs[0] * double(powf(float(d / pCoeffs[1]), float(pCoeffs[2]))) + pCoeffs[3];
    return true;
}

double ColorMath_FindArea(const double* dRefls, int nStartIndex, int nEndIndex)
{
    if (!dRefls)
        return 0.0;
    if (nStartIndex < 0)
        nStartIndex = 0;
    if (nEndIndex > NUM_WAVELENGTHS - 1)
        nEndIndex = NUM_WAVELENGTHS - 1;
    double sum = 0.0;
    for (int i = nStartIndex; i <= nEndIndex; ++i)
        sum += dRefls[i];
    return sum;
}
