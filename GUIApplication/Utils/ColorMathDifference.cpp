// Colour differences: CIE76, Hunter and Luv distances, CMC, CIE94, CIEDE2000
// and DIN 6175. The hue rules and constants are the library's own and are
// kept exactly, including where they part from other published forms (the
// plain hue mean of CIEDE2000, CMC from hue and chroma rounded to
// hundredths).

#include "Utils/ColorMath.h"
#include "Utils/ColorMathHelper.h"
#include "Utils/ColorMathInternal.h"

#include <cmath>

namespace {

using namespace ColorMathInternal;

const double kCmcError = 999.0;
const double kPi = 3.1415927410125732;
const double kDegToRad = 0.01745329238474369;
// 25^7 as a float.
const double k25Pow7 = 6103515648.0;


// A hue difference folded once into -180 to 180.
double wrapHue(double d)
{
    if (d > 180.0)
        d -= 360.0;
    else if (d < -180.0)
        d += 360.0;
    return d;
}

// The signed hue term shared by the L*C*h* forms: the magnitude from the
// total difference, the sign from where the trial's hue lies.
double signedDeltaH(const CIELCHCOORD& t, const CIELCHCOORD& s, double dE)
{
    const double dL = t.L - s.L;
    const double dC = t.C - s.C;
    const double x = dE * dE - dL * dL - dC * dC;
    double dH = x < 0.0 ? 0.0 : sqrtS(x);
    const double hs = s.h, ht = t.h;
    if (hs >= 180.0) {
        if (ht > hs - 180.0 && ht < hs)
            dH = -dH;
    } else if (ht < hs || ht > hs + 180.0) {
        dH = -dH;
    }
    return dH;
}

double lchDistance(const CIELCHCOORD& t, const CIELCHCOORD& s)
{
    const double dL = t.L - s.L;
    const double x = dL * dL + t.C * t.C + s.C * s.C - 2.0 * t.C * s.C * cosS((t.h - s.h) * kPi / 180.0);
    return x > 0.0 ? sqrtS(x) : 0.0;
}

// The weights of CMC from the standard's lightness, chroma and hue; false
// (with the result set) when one of them is 0 or undefined.
bool cmcWeights(double L, double C, double h, double* SL, double* SC, double* SH, double* pResult)
{
    if (L > 16.0) {
        const double d = 1.0 + 0.01765 * L;
        if (d == 0.0) {
            *pResult = kErrorValue;
            return false;
        }
        *SL = 0.040975 * L / d;
    } else {
        *SL = 0.511;
    }
    if (*SL == 0.0) {
        *pResult = kCmcError;
        return false;
    }
    *SC = 0.0638 * C / (1.0 + 0.0131 * C) + 0.638;
    if (*SC == 0.0) {
        *pResult = kCmcError;
        return false;
    }
    const double c4 = C * C * C * C;
    const double F = sqrtS(c4 / (c4 + 1900.0));
    double T;
    if (h > 164.0 && h < 345.0)
        T = std::fabs(0.2 * cosS((h + 168.0) * kPi / 180.0)) + 0.56;
    else
        T = std::fabs(0.4 * cosS((h + 35.0) * kPi / 180.0)) + 0.36;
    *SH = *SC * (T * F + 1.0 - F);
    if (*SH == 0.0) {
        *pResult = kCmcError;
        return false;
    }
    return true;
}

double atLeast(double v, double floor)
{
    return v < floor ? floor : v;
}

} // namespace

bool_t ColorMath_LabToDElab(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double* pDElab)
{
    if (!pLabTrial || !pLabStandard || !pDElab)
        return false;
    const double sum = powS(pLabTrial->L - pLabStandard->L, 2.0) + powS(pLabTrial->a - pLabStandard->a, 2.0)
                       + powS(pLabTrial->b - pLabStandard->b, 2.0);
    *pDElab = sum == 0.0 ? 0.0 : sqrtS(sum);
    return true;
}

void ColorMath_BestMatchDElabSquaredCalc(const CIELABCOORD* pLab1, const CIELABCOORD* pLab2, double* pSquared)
{
    if (!pLab1 || !pLab2 || !pSquared)
        return;
    const double dL = pLab1->L - pLab2->L, da = pLab1->a - pLab2->a, db = pLab1->b - pLab2->b;
    *pSquared = dL * dL + da * da + db * db;
}

bool_t ColorMath_HunterLabToDE(const HUNTERLABCOORD* pTrial, const HUNTERLABCOORD* pStandard, double* pDE)
{
    if (!pTrial || !pStandard || !pDE)
        return false;
    *pDE = ColorMathHelper_CalculateGenericDeltaE(pTrial->L - pStandard->L, pTrial->a - pStandard->a,
                                                  pTrial->b - pStandard->b);
    return true;
}

bool_t ColorMath_CIELuvToDEuv(const CIELUVCOORD* pTrial, const CIELUVCOORD* pStandard, double* pDE)
{
    if (!pTrial || !pStandard || !pDE)
        return false;
    *pDE = ColorMathHelper_CalculateGenericDeltaE(pTrial->L - pStandard->L, pTrial->u - pStandard->u,
                                                  pTrial->v - pStandard->v);
    return true;
}

double ColorMath_CalcDeltaH(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                            const double* fLChStd)
{
    if (!fLabSmp || !fLabStd || !fLChSmp || !fLChStd)
        return kErrorValue;
    const double da = fLabSmp[1] - fLabStd[1];
    const double db = fLabSmp[2] - fLabStd[2];
    const double dC = fLChSmp[1] - fLChStd[1];
    const double dH = sqrtS(std::fabs(da * da + db * db - dC * dC));
    return wrapHue(fLChSmp[2] - fLChStd[2]) < 0.0 ? -dH : dH;
}

bool_t ColorMath_CalcDeltaLabLCH(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                                 const double* fLChStd, double* fLabRslt, double* fLChRslt)
{
    if (!fLabSmp || !fLabStd || !fLChSmp || !fLChStd || !fLabRslt || !fLChRslt)
        return false;
    for (int i = 0; i < 3; ++i)
        fLabRslt[i] = fLabSmp[i] - fLabStd[i];
    fLChRslt[0] = fLChSmp[0] - fLChStd[0];
    fLChRslt[1] = fLChSmp[1] - fLChStd[1];
    fLChRslt[2] = ColorMath_CalcDeltaH(fLabSmp, fLabStd, fLChSmp, fLChStd);
    return true;
}

bool_t ColorMath_LChToDELCh(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double* pDELCh)
{
    if (!pLChTrial || !pLChStandard || !pDELCh)
        return false;
    *pDELCh = lchDistance(*pLChTrial, *pLChStandard);
    return true;
}

bool_t ColorMath_LChToDHAndDE(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double* pDH,
                              double* pDE)
{
    if (!pLChTrial || !pLChStandard || !pDH || !pDE)
        return false;
    *pDE = lchDistance(*pLChTrial, *pLChStandard);
    *pDH = signedDeltaH(*pLChTrial, *pLChStandard, *pDE);
    return true;
}

bool_t ColorMath_LabToDEcmc(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double l, double c,
                            double* pDEcmc)
{
    if (!pLabTrial || !pLabStandard || !pDEcmc)
        return false;
    if (l == 0.0 || c == 0.0) {
        *pDEcmc = kCmcError;
        return false;
    }
    CIELCHCOORD t, s;
    ColorMath_CIELabToCIELCH(pLabTrial, &t);
    ColorMath_CIELabToCIELCH(pLabStandard, &s);
    double SL, SC, SH;
    if (!cmcWeights(s.L, s.C, s.h, &SL, &SC, &SH, pDEcmc))
        return false;
    const double dL = pLabTrial->L - pLabStandard->L;
    const double da = pLabTrial->a - pLabStandard->a;
    const double db = pLabTrial->b - pLabStandard->b;
    const double dC = t.C - s.C;
    const double dE = sqrtS(dL * dL + da * da + db * db);
    const double dH = sqrtS(std::fabs(dE * dE - dL * dL - dC * dC));
    const double x = dL / (SL * l), y = dC / (SC * c), z = dH / SH;
    *pDEcmc = sqrtS(x * x + y * y + z * z);
    return true;
}

bool_t ColorMath_LChToDEcmc(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double l, double c,
                            CIELCHCOORD* pDeltaLCh, double* pDEcmc)
{
    if (!pLChTrial || !pLChStandard || !pDeltaLCh || !pDEcmc)
        return false;
    if (l == 0.0 || c == 0.0) {
        *pDEcmc = kCmcError;
        return false;
    }
    const CIELCHCOORD& s = *pLChStandard;
    double SL, SC, SH;
    if (!cmcWeights(s.L, s.C, s.h, &SL, &SC, &SH, pDEcmc))
        return false;
    double dH = 0.0, dE = 0.0;
    ColorMath_LChToDHAndDE(pLChTrial, pLChStandard, &dH, &dE);
    pDeltaLCh->L = (pLChTrial->L - s.L) / (l * SL);
    pDeltaLCh->C = (pLChTrial->C - s.C) / (c * SC);
    pDeltaLCh->h = dH / SH;
    *pDEcmc = ColorMathHelper_CalculateGenericDeltaE(pDeltaLCh->L, pDeltaLCh->C, pDeltaLCh->h);
    return true;
}

bool_t ColorMath_LabToDE94(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double Kl, double Kc,
                           double* pDE94)
{
    if (!pLabTrial || !pLabStandard || !pDE94)
        return false;
    if (Kl == 0.0 || Kc == 0.0) {
        *pDE94 = kErrorValue;
        return false;
    }
    const double Cs = sqrtS(pLabStandard->a * pLabStandard->a + pLabStandard->b * pLabStandard->b);
    const double Ct = sqrtS(pLabTrial->a * pLabTrial->a + pLabTrial->b * pLabTrial->b);
    const double dL = pLabTrial->L - pLabStandard->L;
    const double da = pLabTrial->a - pLabStandard->a;
    const double db = pLabTrial->b - pLabStandard->b;
    const double dC = Ct - Cs;
    const double dH = sqrtS(std::fabs(da * da + db * db - dC * dC));
    const double SC = 1.0 + 0.04500000178813934 * Cs;
    const double SH = 1.0 + 0.014999999664723873 * Cs;
    const double x = dL / Kl, y = dC / (Kc * SC), z = dH / SH;
    *pDE94 = sqrtS(x * x + y * y + z * z);
    return true;
}

bool_t ColorMath_LChToDE94(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double Kl, double Kc,
                           CIELCHCOORD* pLChDelta, double* pDE94)
{
    if (!pLChTrial || !pLChStandard || !pLChDelta || !pDE94)
        return false;
    double dH = 0.0, dE = 0.0;
    if (Kl == 0.0 || Kc == 0.0 || !ColorMath_LChToDHAndDE(pLChTrial, pLChStandard, &dH, &dE)) {
        *pDE94 = kErrorValue;
        return false;
    }
    const double Cs = pLChStandard->C;
    const double SC = 1.0 + 0.04500000178813934 * Cs;
    const double SH = 1.0 + 0.014999999664723873 * Cs;
    pLChDelta->L = (pLChTrial->L - pLChStandard->L) / Kl;
    pLChDelta->C = (pLChTrial->C - Cs) / (Kc * SC);
    pLChDelta->h = dH / SH;
    *pDE94 = ColorMathHelper_CalculateGenericDeltaE(pLChDelta->L, pLChDelta->C, pLChDelta->h);
    return true;
}

double ColorMath_CalcCIE94(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                           const double* fLChStd, double* fLChCoef, double* pDeltaLCh, bool bNoStd)
{
    if (!fLabSmp || !fLabStd || !fLChSmp || !fLChStd || !fLChCoef)
        return kErrorValue;
    const double kL = atLeast(fLChCoef[0], 0.001);
    const double kC = atLeast(fLChCoef[1], 0.001);
    fLChCoef[2] = atLeast(fLChCoef[2], 0.001);
    const double kH = fLChCoef[2];
    const double C = bNoStd ? sqrtS(fLChSmp[1] * fLChStd[1]) : fLChStd[1];
    const double SC = 1.0 + 0.045 * C;
    const double SH = 1.0 + 0.015 * C;
    const double dL = fLabSmp[0] - fLabStd[0];
    const double da = fLabSmp[1] - fLabStd[1];
    const double db = fLabSmp[2] - fLabStd[2];
    const double dC = fLChSmp[1] - fLChStd[1];
    const double dH = sqrtS(std::fabs(da * da + db * db - dC * dC));
    const double q[3] = {dL / kL, dC / (kC * SC), dH / (kH * SH)};
    if (pDeltaLCh) {
        for (int i = 0; i < 3; ++i)
            pDeltaLCh[i] = q[i];
    }
    return sqrtS(q[0] * q[0] + q[1] * q[1] + q[2] * q[2]);
}

double ColorMath_CalcCIE2000(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                             const double* fLChStd, const double* fLChCoef)
{
    if (!fLabSmp || !fLabStd || !fLChSmp || !fLChStd || !fLChCoef)
        return kErrorValue;
    const double kL = atLeast(fLChCoef[0], 0.001);
    const double kC = atLeast(fLChCoef[1], 0.001);
    const double kH = atLeast(fLChCoef[2], 0.001);

    const double C1 = sqrtS(fLabSmp[1] * fLabSmp[1] + fLabSmp[2] * fLabSmp[2]);
    const double C2 = sqrtS(fLabStd[1] * fLabStd[1] + fLabStd[2] * fLabStd[2]);
    const double Cm = (C1 + C2) / 2.0;
    const double Cm7 = powS(Cm, 7.0);
    const double G = 0.5 * (1.0 - sqrtS(Cm7 / (Cm7 + k25Pow7)));

    double Cp[2], hp[2];
    const double* lab[2] = {fLabSmp, fLabStd};
    for (int i = 0; i < 2; ++i) {
        const double ap = (1.0 + G) * lab[i][1];
        const double b = lab[i][2];
        Cp[i] = sqrtS(ap * ap + b * b);
        hp[i] = double(atan2f(float(b), float(ap))) / kDegToRad;
        // Also b = 0: a positive a' then sits at 360, not at 0.
        if (b <= 0.0)
            hp[i] += 360.0;
    }

    const double dLp = fLabSmp[0] - fLabStd[0];
    const double dCp = Cp[0] - Cp[1];
    const double dhp = wrapHue(hp[0] - hp[1]);
    const double dHp = 2.0 * sqrtS(Cp[0] * Cp[1]) * sinS(dhp / 2.0 * kDegToRad);

    const double Lm = (fLabSmp[0] + fLabStd[0]) / 2.0;
    const double Lm50 = (Lm - 50.0) * (Lm - 50.0);
    const double SL = 1.0 + 0.015 * Lm50 / sqrtS(20.0 + Lm50);
    const double Cpm = (Cp[0] + Cp[1]) / 2.0;
    const double hm = (hp[0] + hp[1]) / 2.0;
    const double T = 1.0 - 0.17 * cosS((hm - 30.0) * kDegToRad) + 0.24 * cosS(2.0 * hm * kDegToRad)
                     + 0.32 * cosS((3.0 * hm + 6.0) * kDegToRad) - 0.2 * cosS((4.0 * hm - 63.0) * kDegToRad);
    const double SH = 1.0 + 0.015 * Cpm * T;
    const double SC = 1.0 + 0.045 * Cpm;
    const double hr = (hm - 275.0) / 25.0;
    const double dTheta = 30.0 * expS(-(hr * hr));
    const double Cpm7 = powS(Cpm, 7.0);
    const double RC = 2.0 * sqrtS(Cpm7 / (Cpm7 + k25Pow7));
    const double RT = -sinS(2.0 * dTheta * kDegToRad) * RC;

    const double l = dLp / (kL * SL), c = dCp / (kC * SC), h = dHp / (kH * SH);
    const double x = l * l + c * c + h * h + RT * c * h;
    return x > 0.0 ? sqrtS(x) : 0.0;
}

double ColorMath_CalcDIN6175(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                             const double* fLChStd, double Angle, double gl, double ga, double gb, double gc,
                             double gh)
{
    if (!fLabSmp || !fLabStd || !fLChSmp || !fLChStd || Angle == 0.0)
        return kErrorValue;
    const double L = sqrtS(fLabSmp[0] * fLabStd[0]);
    const double C = sqrtS(fLChSmp[1] * fLChStd[1]);
    const double Sl = 0.15 * sqrtS(L) + 31.5 / Angle;
    const double Sa = atLeast(0.48 * sqrtS(C) - 0.35 * sqrtS(L) + 42.0 / Angle, 0.7);
    const double Sb = atLeast(0.14 * sqrtS(C) - 0.2 * sqrtS(L) + 21.0 / Angle + 0.7, 0.7);
    const double Dl = gl * Sl, Da = ga * 0.7, Db = gb * 0.7, Dc = gc * Sa, Dh = gh * Sb;
    if (Dl == 0.0 || Da == 0.0 || Db == 0.0 || Dc == 0.0 || Dh == 0.0)
        return kErrorValue;
    const double dL = fLabSmp[0] - fLabStd[0];
    const double da = fLabSmp[1] - fLabStd[1];
    const double db = fLabSmp[2] - fLabStd[2];
    const double dC = fLChSmp[1] - fLChStd[1];
    const double dH = ColorMath_CalcDeltaH(fLabSmp, fLabStd, fLChSmp, fLChStd);
    const double e1 = sqrtS(powS(dL / Dl, 2.0) + powS(da / Da, 2.0) + powS(db / Db, 2.0));
    const double e2 = sqrtS(powS(dL / Dl, 2.0) + powS(dC / Dc, 2.0) + powS(dH / Dh, 2.0));
    const double w = 1.0 / (1.0 + expS(C - (8.0 / (1.0 + expS(27.0 - L)) + 10.0)));
    return w * e1 + (1.0 - w) * e2;
}

double ColorMath_CalcDIN6175c(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                              const double* fLChStd, double Angle)
{
    return ColorMath_CalcDIN6175(fLabSmp, fLabStd, fLChSmp, fLChStd, Angle, 1.0, 1.0, 1.0, 1.0, 1.0);
}

double ColorMath_CalcDIN6175p(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                              const double* fLChStd, double Angle)
{
    return ColorMath_CalcDIN6175(fLabSmp, fLabStd, fLChSmp, fLChStd, Angle, 2.0, 1.2, 1.2, 1.8, 1.2);
}
