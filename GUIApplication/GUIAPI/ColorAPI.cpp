#include "GUIAPI/ColorAPI.h"

#include "SharedSystem/UserParams.h"
#include "Utils/ColorMath.h"

#include <cmath>

bool ColorAPI_GetRGBValues(double* refl, COLORSPACE_OBJECT_T* out)
{
    if (!out)
        return false;
    // Zero so that a failed conversion shows black rather than whatever the
    // caller's memory held; Sample::getColor does not test the result.
    COLOR_REF cr = 0;
    const bool ok = ColorMath_ReflToRGB(refl, UserParams::getIllumObs(), &cr);
    if (!ok)
        cr = 0;
    out->ColorVal1 = float(cr & 0xFF);
    out->ColorVal2 = float((cr >> 8) & 0xFF);
    out->ColorVal3 = float((cr >> 16) & 0xFF);
    out->ColorVal4 = 255.0f;
    return ok;
}

bool ColorAPI_GetLabValues(double* refl, COLORSPACE_OBJECT_T* out)
{
    Q_UNUSED(refl);
    Q_UNUSED(out);
    return true;
}

bool ColorAPI_GetLChValues(double* refl, COLORSPACE_OBJECT_T* out)
{
    Q_UNUSED(refl);
    Q_UNUSED(out);
    return true;
}

bool ColorAPI_GetTextureValues(double* refl, COLORSPACE_OBJECT_T* out)
{
    Q_UNUSED(refl);
    Q_UNUSED(out);
    return true;
}

bool ColorAPI_GetCMYKValues(double* refl, COLORSPACE_OBJECT_T* out)
{
    if (!out)
        return false;
    bool ok = ReflToDensity(refl, DEN_STATUS_E, DENSITY_FILTER_C, &out->ColorVal1);
    ok = ReflToDensity(refl, DEN_STATUS_E, DENSITY_FILTER_M, &out->ColorVal2);
    ok = ReflToDensity(refl, DEN_STATUS_E, DENSITY_FILTER_Y, &out->ColorVal3);
    ok = ReflToDensity(refl, DEN_STATUS_E, DENSITY_FILTER_K, &out->ColorVal4);
    return ok;
}

bool ReflToDensity(double* refl, int status, int filter, float* out)
{
    if (!refl || !out || status < DEN_STATUS_A || status > DEN_STATUS_T || filter < DENSITY_FILTER_K
        || filter > DENSITY_FILTER_CMYK)
        return false;
    // CMYK names four responses, not one; there is no row to read for it.
    if (filter >= DEN_WEIGHT_RESPONSES)
        return false;
    const int32_t* weight = den_weight + (status * DEN_WEIGHT_RESPONSES + filter) * NUM_WAVELENGTHS;
    bool hasWeights = false;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        hasWeights = hasWeights || weight[i] != 0;
    if (!hasWeights)
        return false;
    // Accumulated in single precision; a row sums to 100,000, so 100 %
    // gives 1.0 after the factor 1e-7.
    float sum = 0.0f;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        sum = float(double(sum) + refl[i] * weight[i]);
    double reflectance = sum * 1e-7;
    if (reflectance < 1e-5)
        reflectance = 1e-5;
    *out = -log10f(float(reflectance));
    return true;
}
