// Densitometry and print measures: density by status, spectral density,
// trapping, hue error and greyness, dot area, print contrast. Spectra are in
// percent. Only statuses with weights (A, E, T and M) read a table; every
// other status is refused before any table is touched.

#include "Utils/ColorMath.h"
#include "Utils/ColorMathInternal.h"

#include <QtGlobal>

#include <cmath>
#include <cstring>

namespace {

using namespace ColorMathInternal;

const double kSpectralXWeights[5] = {0.1, 0.5, 1.0, 0.5, 0.1};


// The 31 weights of a status and response, or null where we have none.
const int32_t* weightRow(int status, int response)
{
    if (response < VISUAL_RESPONSE || response > YELLOW_RESPONSE)
        return nullptr;
    switch (status) {
    case DENSITY_STATUS_A: return den_weight + 0 * 124 + response * NUM_WAVELENGTHS;
    case DENSITY_STATUS_E: return den_weight + 1 * 124 + response * NUM_WAVELENGTHS;
    case DENSITY_STATUS_t: return den_weight + 3 * 124 + response * NUM_WAVELENGTHS;
    case DENSITY_STATUS_M: return den_weight_M + response * NUM_WAVELENGTHS;
    default: return nullptr; // status I has no data; the others have no rows
    }
}

double weightedSum(const double* refl, const int32_t* row)
{
    double sum = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        sum += refl[i] * double(row[i]);
    return sum;
}

// Plain status density, -log10 of the weighted reflectance.
bool statusDensity(const double* refl, int status, int filter, double* pDensity)
{
    const int32_t* row = weightRow(status, filter);
    if (!row) {
        if (status == DENSITY_STATUS_I)
            *pDensity = kErrorValue;
        return false;
    }
    double r = weightedSum(refl, row) * 1e-7;
    if (r < 0.00001)
        r = 0.00001;
    *pDensity = -log10S(r);
    return true;
}

double clampDensity(double d)
{
    return d < 0.0 ? 0.0 : d > 5.0 ? 5.0 : d;
}

double weightedRefl(const double* refl, int index)
{
    double sum = 0.0;
    for (int k = -2; k <= 2; ++k) {
        const int i = index + k;
        if (i >= 0 && i < NUM_WAVELENGTHS)
            sum += refl[i] * kSpectralXWeights[k + 2];
    }
    return sum;
}

double specialDensity(const double* refl, int index, const double* weights, int n)
{
    double sum = 0.0, wsum = 0.0;
    for (int k = 0; k < n; ++k) {
        const int i = index - n / 2 + k;
        if (i >= 0 && i < NUM_WAVELENGTHS) {
            sum += refl[i] * weights[k];
            wsum += weights[k];
        }
    }
    if (sum <= 0.0 || wsum <= 0.0)
        return 0.0;
    return -log10S(sum / (wsum * 100.0));
}

double bandTolerance()
{
    // The minimum tolerance, on the smoothing's scale (its weights add up to 2.2).
    return 2.0 * 2.2;
}

} // namespace

int ColorMathHelper_FindMaxDensityPoints(const double* dRefls, int* pIndices, int max)
{
    if (!dRefls || !pIndices || max <= 0)
        return 0;
    int found = 0;
    for (int i = 2; i <= NUM_WAVELENGTHS - 3 && found < max; ++i) {
        const double here = weightedRefl(dRefls, i);
        if (here <= weightedRefl(dRefls, i - 1) && here <= weightedRefl(dRefls, i + 1))
            pIndices[found++] = i;
    }
    return found;
}

int ColorMathHelper_ChooseBPWavelen(const double* dRefls, const int* pIndices, int count)
{
    if (!dRefls || !pIndices || count <= 0)
        return -1;
    int best = -1, bestWidth = -1;
    double bestDepth = 0.0;
    for (int k = 0; k < count; ++k) {
        const int i = pIndices[k];
        if (i < 0 || i >= NUM_WAVELENGTHS)
            continue;
        const double bottom = weightedRefl(dRefls, i);
        int width = 1;
        for (int j = i - 1; j >= 0 && weightedRefl(dRefls, j) - bottom <= bandTolerance(); --j)
            ++width;
        for (int j = i + 1; j < NUM_WAVELENGTHS && weightedRefl(dRefls, j) - bottom <= bandTolerance(); ++j)
            ++width;
        if (width > bestWidth || (width == bestWidth && bottom < bestDepth)) {
            best = i;
            bestWidth = width;
            bestDepth = bottom;
        }
    }
    return best;
}

namespace {

// The index of the strongest absorption for spectral X.
int spectralXIndex(const double* refl)
{
    int peaks[NUM_WAVELENGTHS];
    const int n = ColorMathHelper_FindMaxDensityPoints(refl, peaks, NUM_WAVELENGTHS);
    return n == 1 ? peaks[0] : ColorMathHelper_ChooseBPWavelen(refl, peaks, n);
}

bool hasRows(int status)
{
    return weightRow(status, VISUAL_RESPONSE) != nullptr;
}

} // namespace

// ---- Names ---------------------------------------------------------------------------

int ColorMath_GetNumStatuses()
{
    return DENSITY_STATUS_NumOf;
}

int ColorMath_GetNumResponses()
{
    return 4;
}

int ColorMath_GetNumStatusResponses(int status)
{
    switch (status) {
    case DENSITY_STATUS_A:
    case DENSITY_STATUS_E:
    case DENSITY_STATUS_I:
    case DENSITY_STATUS_t: return 4;
    case DENSITY_STATUS_HIFI: return 7;
    case DENSITY_STATUS_HEXACHROME: return 6;
    default: return 0;
    }
}

const char* ColorMath_GetStatusName(int)
{
    static const char empty[1] = {0};
    return empty;
}

const char* ColorMath_GetResponseName(int)
{
    return ColorMath_GetStatusName(0);
}

const char* ColorMath_GetStatusResponseName(int, int)
{
    return ColorMath_GetStatusName(0);
}

int ColorMath_StatusNameToIndex(const char* name)
{
    if (!name)
        return -1;
    static const struct { const char* name; int index; } names[] = {
        {"Status A", 0}, {"A", 0}, {"Status E", 1}, {"E", 1}, {"Status I", 2}, {"I", 2},
        {"Status T", 3}, {"T", 3}, {"Spectral", 4}, {"S", 4}, {"Spectral X", 5}, {"X", 5},
        {"Hi-Fi", 6}, {"HIFI", 6}, {"H", 6}, {"Hexachrome", 7}, {"HEX", 7}, {"C", 7},
    };
    for (const auto& n : names) {
        if (std::strcmp(name, n.name) == 0)
            return n.index;
    }
    return -1;
}

int ColorMath_ResponseNameToIndex(const char* name)
{
    if (!name)
        return -1;
    static const struct { const char* name; int index; } names[] = {
        {"Visual", 0}, {"V", 0}, {"Cyan", 1}, {"C", 1}, {"Magenta", 2}, {"M", 2}, {"Yellow", 3}, {"Y", 3},
        {"Red", 4}, {"R", 4}, {"Green", 5}, {"G", 5}, {"Blue", 6}, {"B", 6}, {"Hex Orange", 7}, {"O", 7},
        {"Hex Green", 8}, {"E", 8},
    };
    for (const auto& n : names) {
        if (std::strcmp(name, n.name) == 0)
            return n.index;
    }
    return -1;
}

// ---- Densities ---------------------------------------------------------------------------

bool_t ColorMath_ReflToReflDensity(const double* pRefl, int status, int filter, double* pDensity)
{
    if (!pRefl || !pDensity || status < 0 || status >= DENSITY_STATUS_NumOf || filter < 0 || filter > 3)
        return false;
    const int32_t* row = weightRow(status, filter);
    if (!row)
        return false;
    double r = weightedSum(pRefl, row) * 0.00001;
    if (r < double(0.001f))
        r = double(0.001f);
    *pDensity = r;
    return true;
}

double ColorMathHelper_CalculateSpectralDensity(double dRefl)
{
    if (dRefl < 0.00001)
        dRefl = 0.00001;
    return -log10S(dRefl / 100.0);
}

bool_t ColorMath_CalculateSpectralXDensity(const double* pRefl, const double* PaperRefls, double* pDensity)
{
    if (!pRefl || !pDensity)
        return false;
    const int index = spectralXIndex(pRefl);
    if (index < 0)
        return false;
    double d = specialDensity(pRefl, index, kSpectralXWeights, 5);
    if (PaperRefls)
        d -= specialDensity(PaperRefls, index, kSpectralXWeights, 5);
    *pDensity = clampDensity(d);
    return true;
}

bool_t ColorMath_ReflToDensity(const double* r, const double* PaperRefls, int status, int filter, double* pDensity)
{
    if (!r || !pDensity || status < 0 || status >= DENSITY_STATUS_NumOf)
        return false;
    if (status == DENSITY_SPECTRAL) {
        if (filter < 400 || filter > 700)
            return false;
        const int index = (filter - 400) / 10;
        double d = ColorMathHelper_CalculateSpectralDensity(r[index]);
        if (PaperRefls)
            d -= ColorMathHelper_CalculateSpectralDensity(PaperRefls[index]);
        *pDensity = clampDensity(d);
        return true;
    }
    if (status == DENSITY_SPECTRAL_X)
        return ColorMath_CalculateSpectralXDensity(r, PaperRefls, pDensity);
    if (filter < 0 || filter > 3)
        return false;
    double d = 0.0;
    if (!statusDensity(r, status, filter, &d)) {
        if (status == DENSITY_STATUS_I)
            *pDensity = kErrorValue;
        return false;
    }
    if (PaperRefls) {
        double paper = 0.0;
        statusDensity(PaperRefls, status, filter, &paper);
        d -= paper;
    }
    *pDensity = d;
    return true;
}

bool_t ColorMath_ReflToDensities(const double* pRefl, const double* PaperRefls, int status, DENSITYSTRUCT* pDensities)
{
    if (!pRefl || !pDensities)
        return false;
    std::memset(pDensities, 0, sizeof *pDensities);
    if (status == DENSITY_SPECTRAL) {
        const int nm = ColorMath_DetermineDensityResponse(pRefl, status, PaperRefls);
        if (nm < 400)
            return false;
        pDensities->Density[1] = nm;
        return ColorMath_ReflToDensity(pRefl, PaperRefls, status, nm, &pDensities->Density[0]);
    }
    if (status == DENSITY_SPECTRAL_X)
        return ColorMath_ReflToDensity(pRefl, PaperRefls, status, 0, &pDensities->Density[0]);
    if (status == DENSITY_STATUS_Tx || status == DENSITY_STATUS_Ex || status == DENSITY_STATUS_G)
        return ColorMath_CalculateCCRDensities(pRefl, PaperRefls, status, pDensities);
    if (!hasRows(status))
        return false;
    for (int response = VISUAL_RESPONSE; response <= YELLOW_RESPONSE; ++response) {
        if (!ColorMath_ReflToDensity(pRefl, PaperRefls, status, response, &pDensities->Density[response]))
            return false;
    }
    return true;
}

bool_t ColorMathHelper_AdjustForPaperRefls(const double* pRefls, const double* pPaperRefls, double* r)
{
    if (!pRefls || !pPaperRefls || !r)
        return false;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double paper = pPaperRefls[i] > 0.0 ? log10S(100.0 / pPaperRefls[i]) : 5.0;
        const double ink = pRefls[i] > 0.0 ? log10S(100.0 / pRefls[i]) : 5.0;
        const double d = ink - paper;
        const double factor = d <= 0.5 ? 2.0 : 1.0;
        r[i] = 100.0 / pow10S(factor * d + ink);
    }
    return true;
}

bool_t ColorMathHelper_FindDensityMin(const DENSITYSTRUCT* pDensities, double* pMinDen, int* pRespMin, bool fUseVisual)
{
    if (!pDensities || !pMinDen || !pRespMin)
        return false;
    double best = 100.0;
    int resp = -1;
    for (int i = fUseVisual ? 0 : 1; i <= HEX_WEIGHT2_RESPONSE; ++i) {
        const double d = pDensities->Density[i];
        if (d != 0.0 && d < best) {
            best = d;
            resp = i;
        }
    }
    *pMinDen = best;
    *pRespMin = resp;
    return resp >= 0;
}

bool_t ColorMathHelper_FindDensityMax(const DENSITYSTRUCT* pDensities, double* pMaxDen, int* pRespMax, bool fUseVisual)
{
    if (!pDensities || !pMaxDen || !pRespMax)
        return false;
    double best = 0.0;
    int resp = -1;
    for (int i = fUseVisual ? 0 : 1; i <= HEX_WEIGHT2_RESPONSE; ++i) {
        const double d = pDensities->Density[i];
        if (d != 0.0 && d > best) {
            best = d;
            resp = i;
        }
    }
    *pMaxDen = best;
    *pRespMax = resp;
    return resp >= 0;
}

int ColorMath_DetermineDensityResponse(const double* pRefls, int status, const double* pPaperRefls)
{
    if (!pRefls || status < 0 || status >= DENSITY_STATUS_NumOf)
        return -1;
    double adjusted[NUM_WAVELENGTHS];
    const double* refl = pRefls;
    if (pPaperRefls && ColorMathHelper_AdjustForPaperRefls(pRefls, pPaperRefls, adjusted))
        refl = adjusted;
    if (status == DENSITY_SPECTRAL) {
        int best = 2;
        for (int i = 3; i <= 30; ++i) {
            if (ColorMathHelper_CalculateSpectralDensity(refl[i]) > ColorMathHelper_CalculateSpectralDensity(refl[best]))
                best = i;
        }
        return 400 + 10 * best;
    }
    // The visual response is the same for every status: take status A's.
    double visual = 0.0;
    if (!ColorMath_ReflToReflDensity(refl, DENSITY_STATUS_A, VISUAL_RESPONSE, &visual) || visual > 80.0)
        return -1;
    double fraction[NUM_WAVELENGTHS];
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        fraction[i] = refl[i] / 100.0;
    if (!ColorMath_IsChromatic(fraction, D65_10))
        return -1;
    if (status == DENSITY_SPECTRAL_X)
        return 0;
    DENSITYSTRUCT densities;
    if (!ColorMath_ReflToDensities(refl, nullptr, status, &densities))
        return -1;
    double maxDen = 0.0;
    int resp = -1;
    ColorMathHelper_FindDensityMax(&densities, &maxDen, &resp, false);
    return resp;
}

// ---- Trap -------------------------------------------------------------------------------

bool_t ColorMath_DensityToTrap(double O, double S, double U, double* pTrap)
{
    if (!pTrap || S == 0.0)
        return false;
    *pTrap = (O - U) / S * 100.0;
    return true;
}

bool_t ColorMath_DensityToPreucilTrap(double O, double S, double U, double* pTrap)
{
    return ColorMath_DensityToTrap(O, S, U, pTrap);
}

bool_t ColorMath_DensityToBrunnerTrap(double O, double S, double U, double* pTrap)
{
    if (!pTrap || S == 0.0)
        return false;
    const double d = 1.0 - pow10S(-(S + U));
    if (d == 0.0)
        return false;
    *pTrap = (1.0 - pow10S(-O)) * 100.0 / d;
    return true;
}

bool_t ColorMath_DensityToRitzTrap(double O, double S, double U, double* pTrap)
{
    if (!pTrap || S == 0.0)
        return false;
    const double d = 1.0 - pow10S(-S);
    if (d == 0.0)
        return false;
    *pTrap = (1.0 - pow10S(-(O - U))) * 100.0 / d;
    return true;
}

bool_t ColorMath_DensityToNewsTrap(double O, double S, double U, double fDMax, double* pTrap)
{
    if (!pTrap || S == 0.0 || fDMax - S == 0.0 || fDMax - O == 0.0)
        return false;
    const double d = double(logf(float(S / (fDMax - S) + 1.0)));
    if (d == 0.0)
        return false;
    *pTrap = double(logf(float((O - U) / (fDMax - O) + 1.0))) * 100.0 / d;
    return true;
}

bool_t ColorMath_ReflToTrap(const double* pReflTop, const double* pReflBottom, const double* pReflOverprint,
                            const double* ReflPaper, int status, int filter, double* pTrap)
{
    double S = 0.0, U = 0.0, O = 0.0;
    if (!pReflTop || !pReflBottom || !pReflOverprint || !pTrap
        || !ColorMath_ReflToDensity(pReflTop, ReflPaper, status, filter, &S)
        || !ColorMath_ReflToDensity(pReflBottom, ReflPaper, status, filter, &U)
        || !ColorMath_ReflToDensity(pReflOverprint, ReflPaper, status, filter, &O))
        return false;
    return ColorMath_DensityToTrap(O, S, U, pTrap);
}

// ---- Hue error, greyness, cast ----------------------------------------------------------------

bool_t ColorMath_DensityToHueGray(double DenCyan, double DenMagenta, double DenYellow, double* pGrayness,
                                  double* pHueError)
{
    if (!pGrayness || !pHueError)
        return false;
    const double maxD = std::fmax(DenCyan, std::fmax(DenMagenta, DenYellow));
    const double minD = std::fmin(DenCyan, std::fmin(DenMagenta, DenYellow));
    const double mid = DenCyan + DenMagenta + DenYellow - maxD - minD;
    *pGrayness = maxD == 0.0 ? 100.0 : minD / maxD * 100.0;
    *pHueError = maxD == minD ? 100.0 : (mid - minD) / (maxD - minD) * 100.0;
    return true;
}

bool_t ColorMath_DensityToHueGrayDirection(double DenCyan, double DenMagenta, double DenYellow, double* pGrayness,
                                           double* pHueError, int* eRetDir)
{
    if (!eRetDir || !ColorMath_DensityToHueGray(DenCyan, DenMagenta, DenYellow, pGrayness, pHueError))
        return false;
    if (DenCyan >= DenMagenta && DenCyan >= DenYellow)
        *eRetDir = DenYellow > DenMagenta ? 9 : 0;
    else if (DenMagenta >= DenYellow)
        *eRetDir = DenYellow > DenCyan ? 8 : 4;
    else
        *eRetDir = DenMagenta > DenCyan ? 1 : 5;
    return true;
}

bool_t ColorMath_ReflToHueGray(const double* pRefl, const double* PaperRefls, int status, double* pGrayness,
                               double* pHueError)
{
    if (status == DENSITY_SPECTRAL_X)
        return false;
    if (status == DENSITY_STATUS_HIFI || status == DENSITY_STATUS_HEXACHROME)
        status = DENSITY_STATUS_E;
    DENSITYSTRUCT d;
    if (!ColorMath_ReflToDensities(pRefl, PaperRefls, status, &d))
        return false;
    return ColorMath_DensityToHueGray(d.Density[CYAN_RESPONSE], d.Density[MAGENTA_RESPONSE],
                                      d.Density[YELLOW_RESPONSE], pGrayness, pHueError);
}

bool_t ColorMath_CMYToCast(const double* pCMY, double* pCast)
{
    if (!pCMY || !pCast)
        return false;
    *pCast = std::fmax(pCMY[0], std::fmax(pCMY[1], pCMY[2])) - std::fmin(pCMY[0], std::fmin(pCMY[1], pCMY[2]));
    return true;
}

bool_t ColorMath_ReflToBrightness(const double* Refl, double* pBrightness)
{
    if (!Refl || !pBrightness)
        return false;
    static const double w[13] = {0.225, 1.49, 3.923, 7.451, 12.333, 17.591, 21.028,
                                 18.665, 11.402, 4.569, 1.264, 0.062, -0.004};
    double sum = 0.0;
    for (int i = 0; i < 13; ++i)
        sum += w[i] * Refl[i];
    *pBrightness = sum / 100.0;
    return true;
}

// ---- Dot area and contrast -----------------------------------------------------------------------

bool_t ColorMath_DensityToDotArea(double dDenSolid, double dDenTint, double dCompensationFactor, double* pdDotArea)
{
    if (!pdDotArea)
        return false;
    if (dCompensationFactor == 0.0) {
        *pdDotArea = 100.0;
        return false;
    }
    const double n = dCompensationFactor;
    const double d = 1.0 - pow10S(-(dDenSolid / n));
    *pdDotArea = d == 0.0 ? 100.0 : (1.0 - pow10S(-(dDenTint / n))) / d * 100.0;
    return true;
}

bool_t ColorMath_DensityFromDotArea(double dDenSolid, double dDotArea, double dCompensationFactor, double* pdDensity)
{
    if (!pdDensity || dCompensationFactor == 0.0)
        return false;
    const double n = dCompensationFactor;
    const double A = dDotArea / 100.0;
    const double x = pow10S(-dDenSolid / n) * A - A + 1.0;
    if (x <= 0.0)
        return false;
    *pdDensity = -0.4342945 * n * double(logf(float(x)));
    return true;
}

bool_t ColorMath_DensityToPrintContrast(double dDenSolid, double dDenTint, double* pPrintContrast)
{
    if (!pPrintContrast || dDenSolid == 0.0)
        return false;
    *pPrintContrast = (dDenSolid - dDenTint) / dDenSolid * 100.0;
    return true;
}

bool_t ColorMath_FindNFactor(const double* pDenPaper, const double* pDenSolid, const double* pDenTint,
                             double* pNFactor)
{
    if (!pDenPaper || !pDenSolid || !pDenTint || !pNFactor)
        return false;
    const double solid = *pDenSolid - *pDenPaper;
    const double tint = *pDenTint - *pDenPaper;
    double lo = 0.5, hi = 10.1;
    for (int step = 0; step < 15; ++step) {
        const double n = (lo + hi) / 2.0;
        double area = 0.0;
        ColorMath_DensityToDotArea(solid, tint, n, &area);
        if (area >= 49.95 && area <= 50.04) {
            *pNFactor = n;
            return true;
        }
        if (area > 50.0)
            lo = n;
        else
            hi = n;
    }
    return false;
}

bool_t ColorMath_CombineInkColors(const double* pInk1Refls, const double* pInk2Refls, double* pCombinedRefls)
{
    if (!pInk1Refls || !pInk2Refls || !pCombinedRefls)
        return false;
    double larger[NUM_WAVELENGTHS], smaller[NUM_WAVELENGTHS];
    double largestSmaller = 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double d1 = pInk1Refls[i] > 0.0 ? log10S(100.0 / pInk1Refls[i]) : 999.0;
        const double d2 = pInk2Refls[i] > 0.0 ? log10S(100.0 / pInk2Refls[i]) : 999.0;
        larger[i] = std::fmax(d1, d2);
        smaller[i] = std::fmin(d1, d2);
        largestSmaller = std::fmax(largestSmaller, smaller[i]);
    }
    const double f = largestSmaller > 0.0 ? 0.5 / largestSmaller : 0.0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        const double sum = larger[i] + (smaller[i] > 0.6 ? smaller[i] * f : 0.0);
        pCombinedRefls[i] = 100.0 / pow10S(sum);
    }
    return true;
}

bool_t ColorMath_GetNormalizedDensityWeights(int nStatus, int nResponse, double* pWeights, int* pStartWaveLen,
                                             int* pPeakWavelen, int* pEndWavelen)
{
    const int32_t* row = weightRow(nStatus, nResponse);
    if (!row || !pWeights || !pStartWaveLen || !pPeakWavelen || !pEndWavelen)
        return false;
    int peak = 0, first = -1, last = -1;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
        if (row[i] > row[peak])
            peak = i;
        if (row[i] != 0) {
            if (first < 0)
                first = i;
            last = i;
        }
    }
    if (row[peak] == 0)
        return false;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        pWeights[i] = double(row[i]) * 100.0 / double(row[peak]);
    *pStartWaveLen = 400 + 10 * first;
    *pPeakWavelen = 400 + 10 * peak;
    *pEndWavelen = 400 + 10 * last;
    return true;
}

bool_t ColorMath_DensitytoIntegratedRefl(double dDen, int status, int filter, double* pRefl)
{
    if (!pRefl || status == DENSITY_SPECTRAL_X || filter == 0)
        return false;
    const int32_t* row = weightRow(status, filter);
    if (!row)
        return false;
    int32_t largest = 0;
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        largest = row[i] > largest ? row[i] : largest;
    if (largest == 0)
        return false;
    *pRefl = 1e7 / (double(largest) * pow10S(dDen));
    return true;
}

// ---- Corrections, wrappers and polarisation -------------------------------------------------

bool_t ColorMath_CalculateCCRDensities(const double* pRefl, const double* PaperRefls, int status,
                                       DENSITYSTRUCT* pDensities)
{
    Q_UNUSED(PaperRefls);
    if (!pRefl || !pDensities)
        return false;
    std::memset(pDensities, 0, sizeof *pDensities);
    // The corrected statuses (Tx, Ex, G) start from reflectances of their own
    // filter rows, which our data do not have: refused, never guessed.
    Q_UNUSED(status);
    return false;
}

double ColorMathHelper_CalculateWeightedRefl(const double* dRefls, int index)
{
    return dRefls && index >= 0 && index < NUM_WAVELENGTHS ? weightedRefl(dRefls, index) : 0.0;
}

double ColorMathHelper_CalculateSpecialDensity(const double* dRefls, int index, const double* pWeights, int n)
{
    if (!dRefls || !pWeights || n <= 0 || index < 0 || index >= NUM_WAVELENGTHS)
        return 0.0;
    return specialDensity(dRefls, index, pWeights, n);
}

double ColorMathHelper_CalculateSpecDensity(const double* dRefls, int index)
{
    return ColorMathHelper_CalculateSpecialDensity(dRefls, index, kSpectralXWeights, 5);
}

void ColorMath_GetSpectralXConstants(double* pMinTolerance, double* pChromaticTolerance, double* pWeights)
{
    if (pMinTolerance)
        *pMinTolerance = 2.0;
    if (pChromaticTolerance)
        *pChromaticTolerance = 84.0;
    if (pWeights) {
        pWeights[0] = 1.0;
        pWeights[1] = 0.5;
        pWeights[2] = 0.1;
    }
}

bool_t ColorMath_DensityMinusPaperToHueGrayDirection(const double* pCMY, const double* pPaperCMY,
                                                     double* pGrayness, double* pHueError, int* eRetDir)
{
    if (!pCMY || !pPaperCMY)
        return false;
    return ColorMath_DensityToHueGrayDirection(pCMY[0] - pPaperCMY[0], pCMY[1] - pPaperCMY[1],
                                               pCMY[2] - pPaperCMY[2], pGrayness, pHueError, eRetDir);
}

bool_t ColorMath_GetDirectionDensity(const double* pCMY, int eRetDir, int* pResponse)
{
    if (!pCMY || !pResponse)
        return false;
    double grey = 0.0, hue = 0.0;
    int dir = -1;
    if (!ColorMath_DensityToHueGrayDirection(pCMY[0], pCMY[1], pCMY[2], &grey, &hue, &dir) || hue <= 50.0)
        return false;
    switch (eRetDir) {
    case 0: *pResponse = 3; return true;
    case 1: *pResponse = 2; return true;
    case 4: *pResponse = 7; return true;
    case 5: *pResponse = 6; return true;
    case 8: *pResponse = 11; return true;
    case 9: *pResponse = 10; return true;
    default: return false;
    }
}

bool_t ColorMath_ReflToCastBrightness(const double* pRefl, const double* pRefRefl, int status, double* pCast,
                                      double* pBrightness)
{
    if (!pRefl || !pCast || !pBrightness)
        return false;
    double cmy[3], ref[3] = {0.0, 0.0, 0.0};
    for (int f = 1; f <= 3; ++f) {
        if (!ColorMath_ReflToReflDensity(pRefl, status, f, &cmy[f - 1]))
            return false;
        if (pRefRefl && !ColorMath_ReflToReflDensity(pRefRefl, status, f, &ref[f - 1]))
            return false;
    }
    if (pRefRefl) {
        for (int i = 0; i < 3; ++i)
            cmy[i] -= ref[i];
    }
    double b = 0.0, refB = 0.0;
    ColorMath_ReflToBrightness(pRefl, &b);
    if (pRefRefl)
        ColorMath_ReflToBrightness(pRefRefl, &refB);
    *pBrightness = b - refB;
    return ColorMath_CMYToCast(cmy, pCast);
}

bool_t ColorMath_ReflToDotArea(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                               int status, int filter, double dCompensationFactor, double* pdDotArea)
{
    double solid = 0.0, tint = 0.0;
    if (!pReflSolid || !pReflTint || !pdDotArea
        || !ColorMath_ReflToDensity(pReflSolid, pReflPaper, status, filter, &solid)
        || !ColorMath_ReflToDensity(pReflTint, pReflPaper, status, filter, &tint))
        return false;
    return ColorMath_DensityToDotArea(solid, tint, dCompensationFactor, pdDotArea);
}

bool_t ColorMath_ReflToDotGain(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                               int status, int filter, double dCompensationFactor, int iScreenPerchentage,
                               double* pdDotGain)
{
    double area = 0.0;
    if (!pdDotGain
        || !ColorMath_ReflToDotArea(pReflPaper, pReflSolid, pReflTint, status, filter, dCompensationFactor, &area))
        return false;
    const double gain = area - iScreenPerchentage;
    *pdDotGain = gain < 0.0 ? 0.0 : gain;
    return true;
}

bool_t ColorMath_ReflToPrintContrast(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                     int status, int filter, double* pPrintContrast)
{
    double solid = 0.0, tint = 0.0;
    if (!pReflSolid || !pReflTint || !pPrintContrast
        || !ColorMath_ReflToDensity(pReflSolid, pReflPaper, status, filter, &solid)
        || !ColorMath_ReflToDensity(pReflTint, pReflPaper, status, filter, &tint))
        return false;
    return ColorMath_DensityToPrintContrast(solid, tint, pPrintContrast);
}

bool_t ColorMath_ReflToPolIntercept(const double* pNonPolRefls, double dRedFilterValue, double dGreenFilterValue,
                                    double dBlueFilterValue, double* pIntercept)
{
    if (!pNonPolRefls || !pIntercept)
        return false;
    const double values[3] = {dRedFilterValue, dGreenFilterValue, dBlueFilterValue};
    double intercept[3];
    for (int f = 1; f <= 3; ++f) {
        const double sum = weightedSum(pNonPolRefls, weightRow(DENSITY_STATUS_E, f)) / 100.0;
        intercept[f - 1] = (sum - 100000.0 * pow10S(-values[f - 1])) / 10.0;
    }
    const int response = ColorMath_DetermineDensityResponse(pNonPolRefls, DENSITY_STATUS_E, nullptr);
    if (response >= CYAN_RESPONSE && response <= YELLOW_RESPONSE)
        *pIntercept = intercept[response - 1];
    else
        *pIntercept = (intercept[0] + intercept[1] + intercept[2]) / 3.0;
    return true;
}

bool_t ColorMath_PolReflAdjust(const double* pRefl, const double* pPolFilters, double* pPolRefl, int* pInfo)
{
    if (!pRefl || !pPolFilters || !pPolRefl)
        return false;
    const auto ratioOf = [pRefl, pPolFilters](int f) {
        const double sum = weightedSum(pRefl, weightRow(DENSITY_STATUS_E, f)) * 0.00001;
        double ratio = sum != 0.0 ? pPolFilters[f] / sum : 0.0;
        if (ratio == 0.0 || ratio > 1.0)
            ratio = 1.0;
        return ratio;
    };
    int response = ColorMath_DetermineDensityResponse(pRefl, DENSITY_STATUS_E, nullptr);
    double ratio;
    if (response == CYAN_RESPONSE || response == MAGENTA_RESPONSE)
        ratio = ratioOf(response);
    else if (response == YELLOW_RESPONSE)
        ratio = (ratioOf(MAGENTA_RESPONSE) + ratioOf(YELLOW_RESPONSE)) / 2.0;
    else {
        response = VISUAL_RESPONSE;
        ratio = (ratioOf(0) + ratioOf(1) + ratioOf(2) + ratioOf(3)) / 4.0;
    }
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        pPolRefl[i] = pRefl[i] * ratio;
    if (pInfo)
        *pInfo = response;
    return true;
}

namespace {

// Adjusts a spectrum that may be null (paper is optional).
const double* polAdjusted(const double* refl, const double* filters, double* buffer)
{
    if (!refl)
        return nullptr;
    return ColorMath_PolReflAdjust(refl, filters, buffer, nullptr) ? buffer : nullptr;
}

} // namespace

bool_t ColorMath_PolReflToDensity(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                  int status, int filter, double* pDensity)
{
    double a[NUM_WAVELENGTHS], p[NUM_WAVELENGTHS];
    const double* r = polAdjusted(pRefl, pPolFilters, a);
    return r && ColorMath_ReflToDensity(r, polAdjusted(PaperRefls, pPolFilters, p), status, filter, pDensity);
}

bool_t ColorMath_PolReflToDensities(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                    int status, DENSITYSTRUCT* pDensities)
{
    double a[NUM_WAVELENGTHS], p[NUM_WAVELENGTHS];
    const double* r = polAdjusted(pRefl, pPolFilters, a);
    return r && ColorMath_ReflToDensities(r, polAdjusted(PaperRefls, pPolFilters, p), status, pDensities);
}

bool_t ColorMath_PolReflToHueGray(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                  int status, double* pGrayness, double* pHueError)
{
    double a[NUM_WAVELENGTHS], p[NUM_WAVELENGTHS];
    const double* r = polAdjusted(pRefl, pPolFilters, a);
    return r && ColorMath_ReflToHueGray(r, polAdjusted(PaperRefls, pPolFilters, p), status, pGrayness, pHueError);
}

bool_t ColorMath_PolReflToDotArea(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                  const double* pPolFilters, int status, int filter, double dCompensationFactor,
                                  double* pdDotArea)
{
    double p[NUM_WAVELENGTHS], s[NUM_WAVELENGTHS], t[NUM_WAVELENGTHS];
    const double* solid = polAdjusted(pReflSolid, pPolFilters, s);
    const double* tint = polAdjusted(pReflTint, pPolFilters, t);
    return solid && tint
           && ColorMath_ReflToDotArea(polAdjusted(pReflPaper, pPolFilters, p), solid, tint, status, filter,
                                      dCompensationFactor, pdDotArea);
}

bool_t ColorMath_PolReflToDotGain(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                  const double* pPolFilters, int status, int filter, double dCompensationFactor,
                                  int iScreenPerchentage, double* pdDotGain)
{
    double p[NUM_WAVELENGTHS], s[NUM_WAVELENGTHS], t[NUM_WAVELENGTHS];
    const double* solid = polAdjusted(pReflSolid, pPolFilters, s);
    const double* tint = polAdjusted(pReflTint, pPolFilters, t);
    return solid && tint
           && ColorMath_ReflToDotGain(polAdjusted(pReflPaper, pPolFilters, p), solid, tint, status, filter,
                                      dCompensationFactor, iScreenPerchentage, pdDotGain);
}

bool_t ColorMath_PolReflToPrintContrast(const double* pReflPaper, const double* pReflSolid,
                                        const double* pReflTint, const double* pPolFilters, int status, int filter,
                                        double* pPrintContrast)
{
    double p[NUM_WAVELENGTHS], s[NUM_WAVELENGTHS], t[NUM_WAVELENGTHS];
    const double* solid = polAdjusted(pReflSolid, pPolFilters, s);
    const double* tint = polAdjusted(pReflTint, pPolFilters, t);
    return solid && tint
           && ColorMath_ReflToPrintContrast(polAdjusted(pReflPaper, pPolFilters, p), solid, tint, status, filter,
                                            pPrintContrast);
}

bool_t ColorMath_PolReflToTrap(const double* pReflTop, const double* pReflBottom, const double* pReflOverprint,
                               const double* ReflPaper, const double* pPolFilters, int status, int filter,
                               double* pTrap)
{
    double a[NUM_WAVELENGTHS], b[NUM_WAVELENGTHS], o[NUM_WAVELENGTHS], p[NUM_WAVELENGTHS];
    const double* top = polAdjusted(pReflTop, pPolFilters, a);
    const double* bottom = polAdjusted(pReflBottom, pPolFilters, b);
    const double* over = polAdjusted(pReflOverprint, pPolFilters, o);
    return top && bottom && over
           && ColorMath_ReflToTrap(top, bottom, over, polAdjusted(ReflPaper, pPolFilters, p), status, filter, pTrap);
}

int ColorMath_PolDetermineDensityResponse(const double* pRefls, const double* pPolFilters, int status,
                                          const double* pPaperRefls)
{
    double a[NUM_WAVELENGTHS], p[NUM_WAVELENGTHS];
    const double* r = polAdjusted(pRefls, pPolFilters, a);
    return r ? ColorMath_DetermineDensityResponse(r, status, polAdjusted(pPaperRefls, pPolFilters, p)) : -1;
}

bool_t ColorMath_GetHiFiConstants(int* pCentres, double* pWeights)
{
    Q_UNUSED(pCentres);
    Q_UNUSED(pWeights);
    return false;
}

bool_t ColorMath_GetHexachromeConstants(int* pCentres, double* pWeights)
{
    Q_UNUSED(pCentres);
    Q_UNUSED(pWeights);
    return false;
}
