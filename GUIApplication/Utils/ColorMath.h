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
// Status M in the same form, a table of its own.
extern const int32_t den_weight_M[DEN_WEIGHT_RESPONSES * NUM_WAVELENGTHS];

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

// ---- Colour differences ------------------------------------------------------
// Trial (sample) minus standard throughout. The arrays of the Calc functions
// hold three values: L, a, b or L, C, h; the coefficient arrays kL, kC, kH.

bool_t ColorMath_LabToDElab(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double* pDElab);
// The squared difference only, in plain double arithmetic, for best-match searches.
void ColorMath_BestMatchDElabSquaredCalc(const CIELABCOORD* pLab1, const CIELABCOORD* pLab2, double* pSquared);
bool_t ColorMath_HunterLabToDE(const HUNTERLABCOORD* pTrial, const HUNTERLABCOORD* pStandard, double* pDE);
bool_t ColorMath_CIELuvToDEuv(const CIELUVCOORD* pTrial, const CIELUVCOORD* pStandard, double* pDE);
// Signed hue difference; the sign is that of the hue angle difference.
double ColorMath_CalcDeltaH(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                            const double* fLChStd);
bool_t ColorMath_CalcDeltaLabLCH(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                                 const double* fLChStd, double* fLabRslt, double* fLChRslt);
bool_t ColorMath_LChToDELCh(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double* pDELCh);
bool_t ColorMath_LChToDHAndDE(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double* pDH,
                              double* pDE);
// CMC(l:c) weighted by the standard; 999.0 and false when it cannot be computed.
bool_t ColorMath_LabToDEcmc(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double l, double c,
                            double* pDEcmc);
bool_t ColorMath_LChToDEcmc(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double l, double c,
                            CIELCHCOORD* pDeltaLCh, double* pDEcmc);
bool_t ColorMath_LabToDE94(const CIELABCOORD* pLabTrial, const CIELABCOORD* pLabStandard, double Kl, double Kc,
                           double* pDE94);
bool_t ColorMath_LChToDE94(const CIELCHCOORD* pLChTrial, const CIELCHCOORD* pLChStandard, double Kl, double Kc,
                           CIELCHCOORD* pLChDelta, double* pDE94);
// kL, kC, kH below 0.001 are raised to it; kH is raised in fLChCoef too.
double ColorMath_CalcCIE94(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                           const double* fLChStd, double* fLChCoef, double* pDeltaLCh, bool bNoStd);
// The hue mean is the plain average of the two hues, also for hues more
// than 180 degrees apart.
double ColorMath_CalcCIE2000(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                             const double* fLChStd, const double* fLChCoef);
double ColorMath_CalcDIN6175(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                             const double* fLChStd, double Angle, double gl, double ga, double gb, double gc,
                             double gh);
double ColorMath_CalcDIN6175c(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                              const double* fLChStd, double Angle);
double ColorMath_CalcDIN6175p(const double* fLabSmp, const double* fLabStd, const double* fLChSmp,
                              const double* fLChStd, double Angle);

// ---- Indices of one spectrum or two ------------------------------------------------

typedef struct _GANZ {
    double Whiteness;
    double Tint;
} GANZ;

extern const float asISOR457_Filter[NUM_WAVELENGTHS];

bool_t ColorMath_ReflToWhiteE313_73IQC(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteE313_98(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteE313_05(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_CIEYxyToWhiteE313_98(const CIEYXYCOORD* pYxy, int illumobsnr, double* pWhite);
bool_t ColorMath_CIEYxyToWhiteE313_05(const CIEYXYCOORD* pYxy, int illumobsnr, double* pWhite);
bool_t ColorMath_XYZtoWhiteE313_98(const XYZCOORD* pXYZ, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteE313_Regensdorf(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteBerger(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteBergerIQC(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteTaubeIQC(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteHunterIQC(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteStensby(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteStensbyIQC(const double* pRefl, int illumobsnr, double* pWhite);
bool_t ColorMath_ReflToWhiteGanzGriessner(const double* pRefl, int illumobsnr, GANZ* pWhiteGanz);
bool_t ColorMath_ReflToWhiteISO_R457(const double* pRefl, double* pWhite);

bool_t ColorMath_ReflToYellowE313_98(const double* pRefl, int illumobsnr, double* pYellow);
bool_t ColorMath_XYZtoYellowE313_98(const XYZCOORD* pXYZ, int illumobsnr, double* pYellow);
bool_t ColorMath_ReflToYellowE313_73IQC(const double* pRefl, int illumobsnr, double* pYellow);
bool_t ColorMath_ReflToYellowE313_Regensdorf(const double* pRefl, int illumobsnr, double* pYellow);
bool_t ColorMath_ReflToYellowD1925(const double* pRefl, int illumobsnr, double* pYellow);
bool_t ColorMath_ReflToYellowD1925IQC(const double* pRefl, int illumobsnr, double* pYellow);
bool_t ColorMath_ReflToCIETintYellow(const double* pRefl, int illumobsnr, double* pTint);

bool_t ColorMath_ReflToMetamerism(const double* pStdRefls, const double* pSampRefls, int IllObs1, int IllObs2,
                                  double* pMetamerism);
bool_t ColorMath_ReflToDIN6172(const double* pStdRefls, const double* pSampRefls, int IllObs1, int IllObs2,
                               double* pMetamerism);
bool_t ColorMath_ReflToABErrorWeights(const double* reflsStd, const double* reflsTrial, int illumobsnr,
                                      double* pAErrWeights, double* pBErrWeights);
// Spectra in percent from here on.
bool_t ColorMath_ReflToOpacity(const double* pafCOBRefls, const double* pafCOWRefls, int illumobsnr,
                               double* pfOpacity);
bool_t ColorMath_ReflToFullColorAtHide(const double* pafWhiteRefls, const double* pafCOWRefls,
                                       const double* pafCOBRefls, double fk1, double fk2, double* pafCAHRefls);
bool_t ColorMath_ReflToStrengthApt(const double* pfStdRefls, const double* pfSampleRefls, double* pfApparentStr);
bool_t ColorMath_ReflToStrengthChr(const double* pfStdRefls, const double* pfSampleRefls, double* pfChromStr,
                                   int* piWaveLength);
bool_t ColorMath_ReflToStrengthTri(const double* pfStdRefls, const double* pfSampleRefls, double* pfTristStr);
bool_t ColorMath_StrengthAtMinDE(const double* pafSampleRefl, const double* pafStdRefl, double* pafAdjustedRefl,
                                 double* pfNewStrength);
// Ratings "5", "4-5" ... "1"; each buffer holds at least four characters.
bool_t ColorMath_ReflToGrayScale(const double* pSmpRefls, const double* pStdRefls, char* Stain, char* Color);
bool_t ColorMath_IsChromatic(const double* refls, int illumobsnr);
void ColorMath_GetAChromaticConstants(double* pLHi, double* pLLo, double* pCHi, double* pCLo);
bool_t ColorMath_ReflToGloss60(const double* pReflInc, const double* pReflExc, int illumobsnr,
                               const double* pCoeffs, double* pGloss);
double ColorMath_FindArea(const double* dRefls, int nStartIndex, int nEndIndex);

// ---- Density and print measures ------------------------------------------------------
// Spectra in percent. Densities come from the status rows of den_weight (A,
// E, T) and den_weight_M (M). Status I has no published data and gives
// -999.0 with false; the statuses without rows (Hi-Fi, Hexachrome and the
// x forms) give false and never read a table.

typedef enum _DENSITY_STATUS {
    DENSITY_STATUS_A = 0,
    DENSITY_STATUS_E = 1,
    DENSITY_STATUS_I = 2,
    DENSITY_STATUS_t = 3,
    DENSITY_SPECTRAL = 4,
    DENSITY_SPECTRAL_X = 5,
    DENSITY_STATUS_HIFI = 6,
    DENSITY_STATUS_HEXACHROME = 7,
    DENSITY_STATUS_Tx = 8,
    DENSITY_STATUS_Ax = 9,
    DENSITY_STATUS_Ex = 10,
    DENSITY_STATUS_G = 11,
    DENSITY_STATUS_M = 12,
    DENSITY_STATUS_Axt = 13,
    DENSITY_STATUS_Mx = 14,
    DENSITY_STATUS_NumOf = 15
} DENSITY_STATUS;

typedef enum _DENSITY_RESPONSE {
    VISUAL_RESPONSE = 0,
    CYAN_RESPONSE = 1,
    MAGENTA_RESPONSE = 2,
    YELLOW_RESPONSE = 3,
    HIFI_RED_RESPONSE = 4,
    HIFI_GREEN_RESPONSE = 5,
    HIFI_BLUE_RESPONSE = 6,
    HEX_WEIGHT1_RESPONSE = 7,
    HEX_WEIGHT2_RESPONSE = 8,
    INVALID_RESPONSE = 9
} DENSITY_RESPONSE;

typedef struct _DENSITYSTRUCT {
    double Density[HEX_WEIGHT2_RESPONSE + 1];
} DENSITYSTRUCT;

int ColorMath_GetNumStatuses();
int ColorMath_GetNumResponses();
int ColorMath_GetNumStatusResponses(int status);
const char* ColorMath_GetStatusName(int status);
const char* ColorMath_GetResponseName(int response);
const char* ColorMath_GetStatusResponseName(int status, int response);
int ColorMath_StatusNameToIndex(const char* name);
int ColorMath_ResponseNameToIndex(const char* name);

bool_t ColorMath_ReflToReflDensity(const double* pRefl, int status, int filter, double* pDensity);
bool_t ColorMath_ReflToDensity(const double* r, const double* PaperRefls, int status, int filter, double* pDensity);
bool_t ColorMath_ReflToDensities(const double* pRefl, const double* PaperRefls, int status, DENSITYSTRUCT* pDensities);
double ColorMathHelper_CalculateSpectralDensity(double dRefl);
bool_t ColorMath_CalculateSpectralXDensity(const double* pRefl, const double* PaperRefls, double* pDensity);
// The dominant response, or for spectral density the wavelength in nm; -1
// when there is none.
int ColorMath_DetermineDensityResponse(const double* pRefls, int status, const double* pPaperRefls);
bool_t ColorMathHelper_AdjustForPaperRefls(const double* pRefls, const double* pPaperRefls, double* r);
bool_t ColorMathHelper_FindDensityMin(const DENSITYSTRUCT* pDensities, double* pMinDen, int* pRespMin, bool fUseVisual);
bool_t ColorMathHelper_FindDensityMax(const DENSITYSTRUCT* pDensities, double* pMaxDen, int* pRespMax, bool fUseVisual);

bool_t ColorMath_DensityToTrap(double O, double S, double U, double* pTrap);
bool_t ColorMath_DensityToPreucilTrap(double O, double S, double U, double* pTrap);
bool_t ColorMath_DensityToBrunnerTrap(double O, double S, double U, double* pTrap);
bool_t ColorMath_DensityToRitzTrap(double O, double S, double U, double* pTrap);
bool_t ColorMath_DensityToNewsTrap(double O, double S, double U, double fDMax, double* pTrap);
bool_t ColorMath_ReflToTrap(const double* pReflTop, const double* pReflBottom, const double* pReflOverprint,
                            const double* ReflPaper, int status, int filter, double* pTrap);

bool_t ColorMath_DensityToHueGray(double DenCyan, double DenMagenta, double DenYellow, double* pGrayness,
                                  double* pHueError);
bool_t ColorMath_DensityToHueGrayDirection(double DenCyan, double DenMagenta, double DenYellow, double* pGrayness,
                                           double* pHueError, int* eRetDir);
bool_t ColorMath_ReflToHueGray(const double* pRefl, const double* PaperRefls, int status, double* pGrayness,
                               double* pHueError);
bool_t ColorMath_CMYToCast(const double* pCMY, double* pCast);
bool_t ColorMath_ReflToBrightness(const double* Refl, double* pBrightness);

bool_t ColorMath_DensityToDotArea(double dDenSolid, double dDenTint, double dCompensationFactor, double* pdDotArea);
bool_t ColorMath_DensityFromDotArea(double dDenSolid, double dDotArea, double dCompensationFactor, double* pdDensity);
bool_t ColorMath_DensityToPrintContrast(double dDenSolid, double dDenTint, double* pPrintContrast);
bool_t ColorMath_FindNFactor(const double* pDenPaper, const double* pDenSolid, const double* pDenTint,
                             double* pNFactor);
bool_t ColorMath_CombineInkColors(const double* pInk1Refls, const double* pInk2Refls, double* pCombinedRefls);
bool_t ColorMath_GetNormalizedDensityWeights(int nStatus, int nResponse, double* pWeights, int* pStartWaveLen,
                                             int* pPeakWavelen, int* pEndWavelen);
bool_t ColorMath_DensitytoIntegratedRefl(double dDen, int status, int filter, double* pRefl);
bool_t ColorMath_CalculateCCRDensities(const double* pRefl, const double* PaperRefls, int status,
                                       DENSITYSTRUCT* pDensities);
double ColorMathHelper_CalculateWeightedRefl(const double* dRefls, int index);
double ColorMathHelper_CalculateSpecialDensity(const double* dRefls, int index, const double* pWeights, int n);
double ColorMathHelper_CalculateSpecDensity(const double* dRefls, int index);
// Candidate absorption peaks for spectral X: the local minima of the
// smoothed spectrum, as indices; returns how many were written (at most max).
int ColorMathHelper_FindMaxDensityPoints(const double* dRefls, int* pIndices, int max);
// Of several candidates, the one with the widest absorbing band (values
// within the minimum tolerance of its bottom); the deepest wins a tie.
int ColorMathHelper_ChooseBPWavelen(const double* dRefls, const int* pIndices, int count);
void ColorMath_GetSpectralXConstants(double* pMinTolerance, double* pChromaticTolerance, double* pWeights);
bool_t ColorMath_DensityMinusPaperToHueGrayDirection(const double* pCMY, const double* pPaperCMY,
                                                     double* pGrayness, double* pHueError, int* eRetDir);
// The response to read for a direction with a hue error above 50; false for
// the directions that have none.
bool_t ColorMath_GetDirectionDensity(const double* pCMY, int eRetDir, int* pResponse);
bool_t ColorMath_ReflToCastBrightness(const double* pRefl, const double* pRefRefl, int status, double* pCast,
                                      double* pBrightness);
bool_t ColorMath_ReflToDotArea(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                               int status, int filter, double dCompensationFactor, double* pdDotArea);
bool_t ColorMath_ReflToDotGain(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                               int status, int filter, double dCompensationFactor, int iScreenPerchentage,
                               double* pdDotGain);
bool_t ColorMath_ReflToPrintContrast(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                     int status, int filter, double* pPrintContrast);
// Polarisation: the spectrum scaled so that its status E responses meet the
// filter readings of a polarised measurement.
bool_t ColorMath_ReflToPolIntercept(const double* pNonPolRefls, double dRedFilterValue, double dGreenFilterValue,
                                    double dBlueFilterValue, double* pIntercept);
bool_t ColorMath_PolReflAdjust(const double* pRefl, const double* pPolFilters, double* pPolRefl, int* pInfo);
bool_t ColorMath_PolReflToDensity(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                  int status, int filter, double* pDensity);
bool_t ColorMath_PolReflToDensities(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                    int status, DENSITYSTRUCT* pDensities);
bool_t ColorMath_PolReflToHueGray(const double* pRefl, const double* pPolFilters, const double* PaperRefls,
                                  int status, double* pGrayness, double* pHueError);
bool_t ColorMath_PolReflToDotArea(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                  const double* pPolFilters, int status, int filter, double dCompensationFactor,
                                  double* pdDotArea);
bool_t ColorMath_PolReflToDotGain(const double* pReflPaper, const double* pReflSolid, const double* pReflTint,
                                  const double* pPolFilters, int status, int filter, double dCompensationFactor,
                                  int iScreenPerchentage, double* pdDotGain);
bool_t ColorMath_PolReflToPrintContrast(const double* pReflPaper, const double* pReflSolid,
                                        const double* pReflTint, const double* pPolFilters, int status, int filter,
                                        double* pPrintContrast);
bool_t ColorMath_PolReflToTrap(const double* pReflTop, const double* pReflBottom, const double* pReflOverprint,
                               const double* ReflPaper, const double* pPolFilters, int status, int filter,
                               double* pTrap);
int ColorMath_PolDetermineDensityResponse(const double* pRefls, const double* pPolFilters, int status,
                                          const double* pPaperRefls);
// Centre wavelength indices and the weights around them, from den_weight;
// false: the Hi-Fi and Hexachrome statuses have no weights here.
bool_t ColorMath_GetHiFiConstants(int* pCentres, double* pWeights);
bool_t ColorMath_GetHexachromeConstants(int* pCentres, double* pWeights);

#endif // COLORMATH_H
