#ifndef WEIGHTGEN_H
#define WEIGHTGEN_H

// Tristimulus weighting factors for abridged spectra, computed from the CIE
// 1 nm colour-matching functions and illuminant spectra by the ASTM E308 /
// E2022 method, and the sources the colour library compiles from them.
//
// Two sets are produced for every illuminant/observer pair:
//   set 5  Lagrange (Venable) weights, for spectra already corrected for the
//          instrument's bandpass (no correction built in);
//   set 6  the same weights with the correction for a triangular bandpass of
//          the sampling interval built in, for uncorrected spectra.
// Both are computed over the whole range of the data and then cut to the
// instrument's 400-700 nm by the E308 range rule.

#include <array>
#include <string>
#include <vector>

namespace WeightGen {

// A sampled function of wavelength with a uniform step (in nm).
struct Spectrum
{
    int first = 0;
    int step = 1;
    std::vector<double> values;

    int last() const { return first + step * (int(values.size()) - 1); }
    bool covers(int nm) const { return nm >= first && nm <= last(); }
    double at(int nm) const; // the sample at nm; throws off the grid
};

// Colour-matching functions at 1 nm.
struct Observer
{
    Spectrum x, y, z;
};

// Weights per node: nodes are first, first + step, ..., each with X, Y, Z.
struct Weights
{
    int first = 0;
    int step = 10;
    std::vector<std::array<double, 3>> w;

    int last() const { return first + step * (int(w.size()) - 1); }
    double sum(int channel) const;
};

// Reads one column of a CSV file of the colorimetry data (header line, first
// column the wavelength in nm, uniform step). A blank cell reads as 0.
// Throws std::runtime_error with the file name on any defect.
Spectrum readColumn(const std::string& path, const std::string& column);
Observer readObserver(const std::string& path);

// A 5 nm spectrum brought to 1 nm by Sprague interpolation.
Spectrum toOneNm(const Spectrum& s);

// Lagrange interpolation coefficients of the nodes around a wavelength:
// a cubic through the four nearest nodes inside, a quadratic through the
// three nearest in the first and last interval. Returns (node index, c).
std::vector<std::pair<int, double>> lagrangeCoefficients(int nm, int first, int step, int nodeCount);

// Set 5 weights over the nodes first..last (both on the step grid), from
// the 1 nm products illuminant x observer, scaled so that the Y column
// sums to 100.
Weights lagrangeWeights(const Spectrum& illuminant, const Observer& observer,
                        int first, int last, int step);

// Set 6 from set 5: W' = (M^T)^-1 W, where M maps the true node values onto
// what an instrument with a triangular passband of full width at half
// maximum equal to the step reports, under the same Lagrange model.
Weights bandpassCorrected(const Weights& plain);

// The E308 range rule: weights of nodes below lo are added to lo, those
// above hi to hi.
Weights foldToRange(const Weights& w, int lo, int hi);

// One illuminant/observer pair of the tables, in table order.
struct PairSource
{
    const char* name;        // "A_2"
    const char* illuminant;  // key of the illuminant in the data
    int observer;            // 2 or 10
};
const std::vector<PairSource>& pairSources();

// The illuminant spectrum at 1 nm for a key of pairSources().
Spectrum illuminantSpectrum(const std::string& dataDir, const std::string& key);

// Both weight sets of every pair, folded to 400-700 nm, before rounding.
struct PairWeights
{
    Weights set5;
    Weights set6;
};
std::vector<PairWeights> computeAll(const std::string& dataDir);

// The stored form of a weight: thousandths, rounded half away from zero.
long long toThousandths(double weight);

// The 16-bit wrap of the X rows that overflowed that storage, and the rule
// that reads them back.
bool isWrappedXRow(int set, int pair);
int wrap16(long long thousandths);
long long unwrapX(long long stored);

// Status density weights, laid out as den_weight: status (A, E, I, T) x
// response (visual, cyan, magenta, yellow) x 31 wavelengths, each row the
// ISO 5-3 spectral product at 400-700 nm made linear and scaled to sum to
// 100,000. Status I has no public data: its rows are left 0.
std::vector<long long> densityWeights(const std::string& dataDir);
// The four rows of status M, in the same form.
std::vector<long long> densityWeightsStatusM(const std::string& dataDir);

// The generated sources, byte for byte as committed.
std::string weightTablesSource(const std::string& dataDir);
std::string gammaSource();
std::string densitySource(const std::string& dataDir);

// The display curve: 1000 bytes through the sampled points, by a monotone
// cubic (Fritsch-Carlson).
std::array<unsigned char, 1000> gammaCurve();

} // namespace WeightGen

#endif // WEIGHTGEN_H
