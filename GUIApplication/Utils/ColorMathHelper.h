#ifndef COLORMATHHELPER_H
#define COLORMATHHELPER_H

// Numeric helpers of the colour library. Their rounding and precision are
// part of the library's results.

#include "Utils/ColorMath.h"

// To a 32-bit integer: a fraction of 0.5 or more goes away from zero, a
// smaller one is cut off (2.5 -> 3, -2.5 -> -3, 2.4 -> 2). Values beyond
// the 32-bit range saturate; NaN gives 0. Inline: it sits on the path of
// every colour patch.
inline int32_t ColorMathHelper_Round(double f)
{
    if (!(f > -2147483648.0 && f < 2147483648.0)) // also NaN
        return f > 0.0 ? INT32_MAX : f < 0.0 ? INT32_MIN : 0;
    int64_t whole = int64_t(f);                    // toward zero
    const double fraction = f - double(whole);     // exact
    whole += int64_t(fraction >= 0.5) - int64_t(fraction <= -0.5); // no branch to mispredict
    return whole > INT32_MAX ? INT32_MAX : whole < INT32_MIN ? INT32_MIN : int32_t(whole);
}

// The integer part of (f x 1,000,000 + 0.5), over 1,000,000.
double ColorMathHelper_Round6(double f);

// To hundredths, halves away from zero (-0.005 -> -0.01).
double ColorMathHelper_MungeValue(double d);

// exp(log(number) / 3) in single precision.
double ColorMathHelper_cuberoot(double number);

// sqrt(fA^2 + fB^2 + fC^2) with single-precision terms.
double ColorMathHelper_CalculateGenericDeltaE(double fA, double fB, double fC);

// The white point scaled by Yn/100: (Xn Yn/100, Yn Yn/100, Zn Yn/100).
bool_t ColorMathHelper_GetNormValence(int illumobsnr, XYZCOORD* pXYZ);

// The sample spectrum (percent) at another strength (percent), through
// Kubelka-Munk K/S. Its intermediates live in file-scope arrays, one set per
// thread.
bool_t ColorMathHelper_ColorAtEquivStrength(const double* pfStrength, const double* pafSampleRefl,
                                            double* pafAdjustedRefl);

#endif // COLORMATHHELPER_H
