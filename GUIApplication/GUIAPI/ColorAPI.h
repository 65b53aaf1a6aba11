#ifndef COLORAPI_H
#define COLORAPI_H

// The GUI's way into the colour library. The live function is
// ColorAPI_GetRGBValues, which every colour patch uses; L*a*b*, L*C*h* and
// texture values come from the MeasurementServer, so their functions here
// do nothing.

typedef struct _COLORSPACE_OBJECT_T {
    float ColorVal1;
    float ColorVal2;
    float ColorVal3;
    float ColorVal4;
} COLORSPACE_OBJECT_T;

typedef enum _DENSITY_STATUS_T {
    DEN_STATUS_A = 0,
    DEN_STATUS_E = 1,
    DEN_STATUS_I = 2,
    DEN_STATUS_T = 3
} DENSITY_STATUS_T;

typedef enum _DENSITY_FILTER_T {
    DENSITY_FILTER_K = 0,
    DENSITY_FILTER_C = 1,
    DENSITY_FILTER_M = 2,
    DENSITY_FILTER_Y = 3,
    DENSITY_FILTER_CMYK = 4,
    DENSITY_FILTER_ENUM_SIZE = 5,
    DENSITY_FILTER_INVALID = 6
} DENSITY_FILTER_T;

// The screen colour of a spectrum (31 fractions, 400-700 nm) under the
// user's illuminant/observer: red, green, blue as 0-255 in ColorVal1-3,
// 255 in ColorVal4. A failed conversion gives black (0, 0, 0) and false.
bool ColorAPI_GetRGBValues(double* refl, COLORSPACE_OBJECT_T* out);

// The server delivers these: true, and `out` is left as it is.
bool ColorAPI_GetLabValues(double* refl, COLORSPACE_OBJECT_T* out);
bool ColorAPI_GetLChValues(double* refl, COLORSPACE_OBJECT_T* out);
bool ColorAPI_GetTextureValues(double* refl, COLORSPACE_OBJECT_T* out);

// Status E densities of a spectrum in percent: cyan, magenta, yellow and the
// visual (K) response in ColorVal1-4. The result is that of the last (K).
bool ColorAPI_GetCMYKValues(double* refl, COLORSPACE_OBJECT_T* out);

// The density of a spectrum in percent for a status (DENSITY_STATUS_T) and
// one filter (DENSITY_FILTER_K to _Y). False for null pointers, a status or
// filter out of range, DENSITY_FILTER_CMYK (not one response) and a status
// without weights (I).
bool ReflToDensity(double* refl, int status, int filter, float* out);

#endif // COLORAPI_H
