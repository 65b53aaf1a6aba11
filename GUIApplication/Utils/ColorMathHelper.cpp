#include "Utils/ColorMathHelper.h"

#include "SharedSystem/WeightTables.h"

#include <cmath>

namespace {

// Kubelka-Munk intermediates of ColorMathHelper_ColorAtEquivStrength.
thread_local double fKS[NUM_WAVELENGTHS];
thread_local double fKSAdjusted[NUM_WAVELENGTHS];
thread_local double fRAdjusted[NUM_WAVELENGTHS];

} // namespace

double ColorMathHelper_Round6(double f)
{
    return std::trunc(f * 1000000.0 + 0.5) / 1000000.0;
}

double ColorMathHelper_MungeValue(double d)
{
    const double scaled = d < 0.0 ? d * 100.0 - 0.5 : d * 100.0 + 0.5;
    return std::trunc(scaled) / 100.0;
}

double ColorMathHelper_cuberoot(double number)
{
    return double(expf(logf(float(number)) * 0.33333334f));
}

double ColorMathHelper_CalculateGenericDeltaE(double fA, double fB, double fC)
{
    const float a = float(fA), b = float(fB), c = float(fC);
    return double(sqrtf(a * a + b * b + c * c));
}

bool_t ColorMathHelper_GetNormValence(int illumobsnr, XYZCOORD* pXYZ)
{
    if (!pXYZ || illumobsnr < 0 || illumobsnr >= eILLUM_OBS_NumOf)
        return false;
    const XYZN_T& n = pXYZN.load()[illumobsnr];
    const double yn = n.YWeightSum;
    pXYZ->X = n.XWeightSum * yn / 100.0;
    pXYZ->Y = yn * yn / 100.0;
    pXYZ->Z = n.ZWeightSum * yn / 100.0;
    return true;
}

bool_t ColorMathHelper_ColorAtEquivStrength(const double* pfStrength, const double* pafSampleRefl,
                                            double* pafAdjustedRefl)
{
    if (!pfStrength || !pafSampleRefl || !pafAdjustedRefl)
        return false;
    if (*pfStrength == 0.0)
        return false;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        double r = pafSampleRefl[i] / 100.0;
        if (r < 0.0001)
            r = 0.0001;
        fKS[i] = (1.0 - r) * (1.0 - r) / (2.0 * r);
        fKSAdjusted[i] = fKS[i] * 100.0 / *pfStrength;
        const double ks = fKSAdjusted[i];
        fRAdjusted[i] = (1.0 + ks - double(sqrtf(float(ks * ks + 2.0 * ks)))) * 100.0;
        pafAdjustedRefl[i] = fRAdjusted[i];
    }
    return true;
}
