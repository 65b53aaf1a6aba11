#include "weightgen.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <fstream>
#include <map>
#include <sstream>
#include <stdexcept>

namespace WeightGen {

namespace {

// The range of the published E308 tables; the data reach further, but the
// tables and their white points are defined over 360-780 nm.
constexpr int kTableFirst = 360;
constexpr int kTableLast = 780;
constexpr int kStep = 10;
constexpr int kInstrumentFirst = 400;
constexpr int kInstrumentLast = 700;

std::runtime_error fail(const std::string& path, const std::string& what)
{
    return std::runtime_error(path + ": " + what);
}

std::vector<std::string> splitCsv(const std::string& line)
{
    std::vector<std::string> cells;
    std::string cell;
    std::istringstream in(line);
    while (std::getline(in, cell, ','))
        cells.push_back(cell);
    if (!line.empty() && line.back() == ',')
        cells.emplace_back();
    return cells;
}

double parseNumber(const std::string& path, const std::string& text)
{
    if (text.empty())
        return 0.0;
    size_t used = 0;
    double v = 0.0;
    try {
        v = std::stod(text, &used);
    } catch (const std::exception&) {
        used = 0;
    }
    if (used != text.size())
        throw fail(path, "not a number: '" + text + "'");
    return v;
}

// All data columns of a file, keyed by header name, with the wavelength axis.
struct CsvData
{
    int first = 0;
    int step = 0;
    std::vector<std::string> names;
    std::vector<std::vector<double>> columns;
};

CsvData readCsv(const std::string& path)
{
    std::ifstream in(path);
    if (!in)
        throw fail(path, "cannot be opened");
    CsvData data;
    std::string line;
    if (!std::getline(in, line))
        throw fail(path, "empty");
    const std::vector<std::string> header = splitCsv(line);
    if (header.size() < 2 || header[0] != "wavelength_nm")
        throw fail(path, "header does not start with wavelength_nm");
    data.names.assign(header.begin() + 1, header.end());
    data.columns.resize(data.names.size());
    int previous = 0;
    int rows = 0;
    while (std::getline(in, line)) {
        if (line.empty())
            continue;
        const std::vector<std::string> cells = splitCsv(line);
        if (cells.size() != header.size())
            throw fail(path, "row with " + std::to_string(cells.size()) + " cells: " + line);
        const double nmValue = parseNumber(path, cells[0]);
        const int nm = int(nmValue);
        if (nm != nmValue)
            throw fail(path, "wavelength is not whole: " + cells[0]);
        if (rows == 0) {
            data.first = nm;
        } else if (rows == 1) {
            data.step = nm - previous;
            if (data.step <= 0)
                throw fail(path, "wavelengths do not ascend");
        } else if (nm - previous != data.step) {
            throw fail(path, "uneven step at " + cells[0] + " nm");
        }
        previous = nm;
        for (size_t c = 1; c < cells.size(); ++c)
            data.columns[c - 1].push_back(parseNumber(path, cells[c]));
        ++rows;
    }
    if (rows < 2)
        throw fail(path, "fewer than two rows");
    return data;
}

Spectrum columnOf(const CsvData& data, size_t index)
{
    Spectrum s;
    s.first = data.first;
    s.step = data.step;
    s.values = data.columns[index];
    return s;
}

size_t columnIndex(const CsvData& data, const std::string& column, const std::string& path)
{
    for (size_t i = 0; i < data.names.size(); ++i)
        if (data.names[i] == column)
            return i;
    throw fail(path, "no column " + column);
}

// Solves A x = b in place by Gaussian elimination with partial pivoting.
std::vector<double> solve(std::vector<std::vector<double>> a, std::vector<double> b)
{
    const size_t n = b.size();
    for (size_t p = 0; p < n; ++p) {
        size_t pivot = p;
        for (size_t r = p + 1; r < n; ++r)
            if (std::fabs(a[r][p]) > std::fabs(a[pivot][p]))
                pivot = r;
        if (a[pivot][p] == 0.0)
            throw std::runtime_error("bandpass matrix is singular");
        std::swap(a[p], a[pivot]);
        std::swap(b[p], b[pivot]);
        for (size_t r = p + 1; r < n; ++r) {
            const double f = a[r][p] / a[p][p];
            if (f == 0.0)
                continue;
            for (size_t c = p; c < n; ++c)
                a[r][c] -= f * a[p][c];
            b[r] -= f * b[p];
        }
    }
    std::vector<double> x(n);
    for (size_t i = n; i-- > 0;) {
        double s = b[i];
        for (size_t c = i + 1; c < n; ++c)
            s -= a[i][c] * x[c];
        x[i] = s / a[i][i];
    }
    return x;
}

std::string format(const char* fmt, double v)
{
    char buf[64];
    std::snprintf(buf, sizeof buf, fmt, v);
    return buf;
}

} // namespace

double Spectrum::at(int nm) const
{
    if (!covers(nm))
        throw std::runtime_error("wavelength " + std::to_string(nm) + " nm outside the data");
    if ((nm - first) % step != 0)
        throw std::runtime_error("wavelength " + std::to_string(nm) + " nm between the samples");
    return values[size_t((nm - first) / step)];
}

double Weights::sum(int channel) const
{
    double s = 0.0;
    for (const auto& node : w)
        s += node[size_t(channel)];
    return s;
}

Spectrum readColumn(const std::string& path, const std::string& column)
{
    const CsvData data = readCsv(path);
    return columnOf(data, columnIndex(data, column, path));
}

Observer readObserver(const std::string& path)
{
    const CsvData data = readCsv(path);
    if (data.names.size() != 3)
        throw fail(path, "expected three colour-matching functions");
    if (data.step != 1)
        throw fail(path, "colour-matching functions must be at 1 nm");
    return Observer{columnOf(data, 0), columnOf(data, 1), columnOf(data, 2)};
}

Spectrum toOneNm(const Spectrum& s)
{
    // Sprague (1880) quintic interpolation as CIE 167 recommends for 5 nm
    // data, with its boundary extrapolation of two points at each end.
    if (s.step != 5)
        throw std::runtime_error("Sprague interpolation needs 5 nm data");
    const std::vector<double>& v = s.values;
    const size_t n = v.size();
    if (n < 6)
        throw std::runtime_error("Sprague interpolation needs at least six points");
    static const double ends[4][6] = {
        {884, -1960, 3033, -2648, 1080, -180},
        {508, -540, 488, -367, 144, -24},
        {-24, 144, -367, 488, -540, 508},
        {-180, 1080, -2648, 3033, -1960, 884},
    };
    auto extrapolate = [&](int row, size_t from) {
        double sum = 0.0;
        for (size_t k = 0; k < 6; ++k)
            sum += ends[row][k] * v[from + k];
        return sum / 209.0;
    };
    std::vector<double> p;
    p.push_back(extrapolate(0, 0));
    p.push_back(extrapolate(1, 0));
    p.insert(p.end(), v.begin(), v.end());
    p.push_back(extrapolate(2, n - 6));
    p.push_back(extrapolate(3, n - 6));

    Spectrum out;
    out.first = s.first;
    out.step = 1;
    for (size_t i = 0; i + 1 < n; ++i) {
        const double m2 = p[i], m1 = p[i + 1], p0 = p[i + 2], p1 = p[i + 3], p2 = p[i + 4], p3 = p[i + 5];
        const double a1 = (2 * m2 - 16 * m1 + 16 * p1 - 2 * p2) / 24;
        const double a2 = (-m2 + 16 * m1 - 30 * p0 + 16 * p1 - p2) / 24;
        const double a3 = (-9 * m2 + 39 * m1 - 70 * p0 + 66 * p1 - 33 * p2 + 7 * p3) / 24;
        const double a4 = (13 * m2 - 64 * m1 + 126 * p0 - 124 * p1 + 61 * p2 - 12 * p3) / 24;
        const double a5 = (-5 * m2 + 25 * m1 - 50 * p0 + 50 * p1 - 25 * p2 + 5 * p3) / 24;
        out.values.push_back(p0);
        for (int k = 1; k < 5; ++k) {
            const double x = k / 5.0;
            out.values.push_back(p0 + x * (a1 + x * (a2 + x * (a3 + x * (a4 + x * a5)))));
        }
    }
    out.values.push_back(v[n - 1]);
    return out;
}

std::vector<std::pair<int, double>> lagrangeCoefficients(int nm, int first, int step, int nodeCount)
{
    const int offset = nm - first;
    const int j = offset / step;
    const double r = double(offset % step) / step;
    if (offset % step == 0)
        return {{j, 1.0}};
    if (j == 0)
        return {{0, (r - 1) * (r - 2) / 2}, {1, -r * (r - 2)}, {2, r * (r - 1) / 2}};
    if (j == nodeCount - 2) {
        const double q = 1.0 - r; // measured back from the last node
        const int n = nodeCount;
        return {{n - 1, (q - 1) * (q - 2) / 2}, {n - 2, -q * (q - 2)}, {n - 3, q * (q - 1) / 2}};
    }
    return {{j - 1, -r * (r - 1) * (r - 2) / 6},
            {j, (r + 1) * (r - 1) * (r - 2) / 2},
            {j + 1, -(r + 1) * r * (r - 2) / 2},
            {j + 2, (r + 1) * r * (r - 1) / 6}};
}

Weights lagrangeWeights(const Spectrum& illuminant, const Observer& observer, int first, int last, int step)
{
    if ((last - first) % step != 0 || (last - first) / step < 3)
        throw std::runtime_error("node range must hold at least four nodes on the step grid");
    Weights out;
    out.first = first;
    out.step = step;
    const int nodes = (last - first) / step + 1;
    out.w.assign(size_t(nodes), {0.0, 0.0, 0.0});
    for (int nm = first; nm <= last; ++nm) {
        const double s = illuminant.at(nm);
        const double p[3] = {s * observer.x.at(nm), s * observer.y.at(nm), s * observer.z.at(nm)};
        for (const auto& [node, c] : lagrangeCoefficients(nm, first, step, nodes))
            for (int k = 0; k < 3; ++k)
                out.w[size_t(node)][size_t(k)] += p[k] * c;
    }
    const double scale = 100.0 / out.sum(1);
    for (auto& node : out.w)
        for (double& v : node)
            v *= scale;
    return out;
}

Weights bandpassCorrected(const Weights& plain)
{
    const size_t n = plain.w.size();
    const int step = plain.step;
    std::vector<std::vector<double>> m(n, std::vector<double>(n, 0.0));
    for (size_t i = 0; i < n; ++i) {
        const int centre = plain.first + int(i) * step;
        double total = 0.0;
        for (int nm = std::max(plain.first, centre - step + 1); nm <= std::min(plain.last(), centre + step - 1); ++nm) {
            const double t = 1.0 - std::abs(nm - centre) / double(step);
            total += t;
            for (const auto& [node, c] : lagrangeCoefficients(nm, plain.first, step, int(n)))
                m[i][size_t(node)] += t * c;
        }
        for (double& v : m[i])
            v /= total;
    }
    std::vector<std::vector<double>> mt(n, std::vector<double>(n, 0.0));
    for (size_t i = 0; i < n; ++i)
        for (size_t j = 0; j < n; ++j)
            mt[i][j] = m[j][i];
    Weights out = plain;
    for (size_t k = 0; k < 3; ++k) {
        std::vector<double> b(n, 0.0);
        for (size_t i = 0; i < n; ++i)
            b[i] = plain.w[i][k];
        const std::vector<double> x = solve(mt, b);
        for (size_t i = 0; i < n; ++i)
            out.w[i][k] = x[i];
    }
    return out;
}

Weights foldToRange(const Weights& w, int lo, int hi)
{
    if (lo < w.first || hi > w.last() || (lo - w.first) % w.step != 0 || (hi - w.first) % w.step != 0)
        throw std::runtime_error("range to fold into is not inside the weights");
    Weights out;
    out.first = lo;
    out.step = w.step;
    out.w.assign(size_t((hi - lo) / w.step + 1), {0.0, 0.0, 0.0});
    for (size_t i = 0; i < w.w.size(); ++i) {
        const int nm = w.first + int(i) * w.step;
        const size_t target = nm < lo ? 0 : nm > hi ? out.w.size() - 1 : size_t((nm - lo) / w.step);
        for (int k = 0; k < 3; ++k)
            out.w[target][size_t(k)] += w.w[i][size_t(k)];
    }
    return out;
}

const std::vector<PairSource>& pairSources()
{
    // No public spectra exist for the TL83, TL84, TL85 and U30 lamps; each
    // is computed from the CIE fluorescent lamp that stands for it in common
    // practice (TL84 from F11, TL83 and U30 from F12, TL85 from F10).
    static const std::vector<PairSource> pairs = {
        {"A_2", "A", 2},       {"A_10", "A", 10},       {"C_2", "C", 2},         {"C_10", "C", 10},
        {"D50_2", "D50", 2},   {"D50_10", "D50", 10},   {"D55_2", "D55", 2},     {"D55_10", "D55", 10},
        {"D65_2", "D65", 2},   {"D65_10", "D65", 10},   {"D75_2", "D75", 2},     {"D75_10", "D75", 10},
        {"F2_2", "F2", 2},     {"F2_10", "F2", 10},     {"F7_2", "F7", 2},       {"F7_10", "F7", 10},
        {"F8_2", "F8", 2},     {"F8_10", "F8", 10},     {"F10_2", "F10", 2},     {"F10_10", "F10", 10},
        {"F11_2", "F11", 2},   {"F11_10", "F11", 10},   {"F12_2", "F12", 2},     {"F12_10", "F12", 10},
        {"TL83_2", "F12", 2},  {"TL83_10", "F12", 10},  {"TL84_2", "F11", 2},    {"TL84_10", "F11", 10},
        {"TL85_2", "F10", 2},  {"TL85_10", "F10", 10},  {"U30_2", "F12", 2},     {"U30_10", "F12", 10},
    };
    return pairs;
}

Spectrum illuminantSpectrum(const std::string& dataDir, const std::string& key)
{
    // The fluorescent lamps come from CIE's 1 nm dataset, which resolves the
    // mercury and phosphor lines that the 5 nm tables smear over 10 nm.
    if (!key.empty() && key[0] == 'F')
        return readColumn(dataDir + "/spd_F_series_1nm_cie2018.csv", key);
    const Spectrum s = readColumn(dataDir + "/spd_" + key + ".csv", "relative_spd");
    // C, D55 and D75 are published at 5 nm only. Sprague interpolation to
    // 1 nm keeps their white points those of the 5 nm tables; linear
    // interpolation would move Zn of C by 0.06.
    return s.step == 1 ? s : toOneNm(s);
}

std::vector<PairWeights> computeAll(const std::string& dataDir)
{
    const Observer observer2 = readObserver(dataDir + "/cie1931_2deg_1nm.csv");
    const Observer observer10 = readObserver(dataDir + "/cie1964_10deg_1nm.csv");
    std::map<std::string, Spectrum> illuminants;
    std::vector<PairWeights> all;
    for (const PairSource& pair : pairSources()) {
        auto it = illuminants.find(pair.illuminant);
        if (it == illuminants.end())
            it = illuminants.emplace(pair.illuminant, illuminantSpectrum(dataDir, pair.illuminant)).first;
        const Spectrum& s = it->second;
        const Observer& obs = pair.observer == 2 ? observer2 : observer10;
        // Nodes where both illuminant and observer have data, on the grid.
        int first = std::max({kTableFirst, s.first, obs.x.first});
        int last = std::min({kTableLast, s.last(), obs.x.last()});
        first += (kStep - (first - kTableFirst) % kStep) % kStep;
        last -= (last - kTableFirst) % kStep;
        const Weights plain = lagrangeWeights(s, obs, first, last, kStep);
        all.push_back({foldToRange(plain, kInstrumentFirst, kInstrumentLast),
                       foldToRange(bandpassCorrected(plain), kInstrumentFirst, kInstrumentLast)});
    }
    return all;
}

long long toThousandths(double weight)
{
    return std::llround(weight * 1000.0);
}

bool isWrappedXRow(int set, int pair)
{
    // The F12 rows of set 5 were held in 16 bits; the 611 nm europium line
    // puts their X weight at 610 nm above 32.767.
    return set == 5 && (pair == 22 || pair == 23);
}

int wrap16(long long thousandths)
{
    return int(thousandths > 32767 ? thousandths - 65536 : thousandths);
}

long long unwrapX(long long stored)
{
    return stored < -1000 ? stored + 65536 : stored;
}

namespace {

void appendRow(std::string& out, const std::vector<long long>& values)
{
    out += "        {";
    for (size_t i = 0; i < values.size(); ++i) {
        if (i > 0)
            out += i % 8 == 0 ? ",\n         " : ", ";
        char buf[16];
        std::snprintf(buf, sizeof buf, "%6lld", values[i]);
        out += buf;
    }
    out += "}";
}

void appendSet(std::string& out, int set, const std::vector<PairWeights>& all)
{
    const auto& pairs = pairSources();
    out += "const XYZ_WEIGHTS_T ILLOBS_WEIGHTS_TABLE" + std::to_string(set) + "[eILLUM_OBS_NumOf] = {\n";
    for (size_t p = 0; p < all.size(); ++p) {
        const Weights& w = set == 5 ? all[p].set5 : all[p].set6;
        out += std::string("    { // ") + pairs[p].name + "\n";
        for (int k = 0; k < 3; ++k) {
            std::vector<long long> row;
            for (const auto& node : w.w) {
                const long long v = toThousandths(node[size_t(k)]);
                if (k == 0 && isWrappedXRow(set, int(p))) {
                    const int stored = wrap16(v);
                    if (stored < -32768 || stored > 32767 || unwrapX(stored) != v)
                        throw std::runtime_error(std::string(pairs[p].name) + ": X weight " + std::to_string(v)
                                                 + " cannot be held in the wrapped 16-bit row");
                    row.push_back(stored);
                } else {
                    row.push_back(v);
                }
            }
            appendRow(out, row);
            out += k < 2 ? ",\n" : "},\n";
        }
    }
    out += "};\n\n";
    out += "const XYZN_T XYZN_TABLE" + std::to_string(set) + "[eILLUM_OBS_NumOf] = {\n";
    for (size_t p = 0; p < all.size(); ++p) {
        const Weights& w = set == 5 ? all[p].set5 : all[p].set6;
        out += "    {" + format("%.3f", w.sum(0)) + "f, " + format("%.3f", w.sum(1)) + "f, "
               + format("%.3f", w.sum(2)) + "f}, // " + pairs[p].name + "\n";
    }
    out += "};\n";
}

} // namespace

std::string weightTablesSource(const std::string& dataDir)
{
    const std::vector<PairWeights> all = computeAll(dataDir);
    std::string out =
        "// Generated by tools/weighttables from the CIE data in tools/weighttables/data.\n"
        "// Do not edit: change the generator and build the regenerate_weighttables target.\n"
        "//\n"
        "// Tristimulus weighting factors for 400-700 nm in 10 nm steps, in thousandths,\n"
        "// by the ASTM E308 method: Lagrange weights from the 1 nm data over 360-780 nm,\n"
        "// with the weights outside 400-700 nm added to the end wavelengths.\n"
        "// Set 5 has no bandpass correction built in (for bandpass-corrected spectra);\n"
        "// set 6 has the correction for a triangular 10 nm bandpass built in.\n"
        "// The white points are the sums of the weights before rounding.\n"
        "//\n"
        "// TL83 and U30 are computed from CIE F12, TL84 from F11 and TL85 from F10:\n"
        "// approximations until spectra of those lamps are available.\n"
        "// The X rows of F12_2 and F12_10 in set 5 are held as 16-bit values: an\n"
        "// entry below -1000 stands for itself plus 65536.\n\n";
    appendSet(out, 5, all);
    out += "\n";
    appendSet(out, 6, all);
    return out;
}

namespace {

// Rows of the given statuses (a null name gives rows of 0), in the order
// visual, cyan, magenta, yellow.
std::vector<long long> densityRows(const std::string& dataDir, const std::vector<const char*>& statuses)
{
    const std::string path = dataDir + "/density_status_products.csv";
    const CsvData data = readCsv(path);
    // A blank cell (read as 0) is no response at all; a value is log10 of
    // the product with the peak at 5.
    static const char* responses[3] = {"_red_cyan_log10", "_green_magenta_log10", "_blue_yellow_log10"};
    std::vector<long long> out;
    for (const char* status : statuses) {
        for (int response = 0; response < 4; ++response) {
            std::vector<double> row(31, 0.0);
            if (status) {
                const std::string name = response == 0 ? "visual_log10" : std::string(status) + responses[response - 1];
                const size_t index = columnIndex(data, name, path);
                double sum = 0.0;
                for (int i = 0; i < 31; ++i) {
                    const int nm = 400 + 10 * i;
                    const size_t at = size_t((nm - data.first) / data.step);
                    if ((nm - data.first) % data.step != 0 || at >= data.columns[index].size())
                        throw fail(path, "no row for " + std::to_string(nm) + " nm");
                    const double v = data.columns[index][at];
                    row[size_t(i)] = v == 0.0 ? 0.0 : std::pow(10.0, v - 5.0);
                    sum += row[size_t(i)];
                }
                for (double& v : row)
                    v *= 100000.0 / sum;
            }
            for (double v : row)
                out.push_back(std::llround(v));
        }
    }
    return out;
}

void appendRows(std::string& out, const std::vector<long long>& w, const std::vector<const char*>& names)
{
    static const char* responses[4] = {"visual", "cyan", "magenta", "yellow"};
    const size_t rows = w.size() / 31;
    for (size_t row = 0; row < rows; ++row) {
        out += std::string("    // status ") + names[row / 4] + ", " + responses[row % 4] + "\n";
        for (size_t i = 0; i < 31; ++i) {
            char buf[16];
            std::snprintf(buf, sizeof buf, "%6lld", w[row * 31 + i]);
            out += (i % 8 == 0 ? "    " : " ") + std::string(buf);
            if (row * 31 + i + 1 < w.size())
                out += ",";
            if (i % 8 == 7 || i == 30)
                out += "\n";
        }
    }
}

} // namespace

std::vector<long long> densityWeights(const std::string& dataDir)
{
    return densityRows(dataDir, {"statusA", "statusE", nullptr, "statusT"});
}

std::vector<long long> densityWeightsStatusM(const std::string& dataDir)
{
    return densityRows(dataDir, {"statusM"});
}

std::array<unsigned char, 1000> gammaCurve()
{
    // The sampled points of the display curve; 4 to 10 rise 5 a step.
    static const double knots[][2] = {
        {0, 0},     {3, 0},     {4, 5},     {5, 10},    {6, 15},    {7, 20},    {8, 25},    {9, 30},
        {10, 35},   {13, 48},   {20, 64},   {50, 91},   {100, 115}, {200, 145}, {300, 166}, {400, 184},
        {500, 198}, {600, 212}, {700, 224}, {800, 235}, {900, 245}, {950, 250}, {985, 254}, {999, 255},
    };
    const size_t n = sizeof knots / sizeof knots[0];
    std::vector<double> h(n - 1, 0.0), delta(n - 1, 0.0), d(n, 0.0);
    for (size_t k = 0; k + 1 < n; ++k) {
        h[k] = knots[k + 1][0] - knots[k][0];
        delta[k] = (knots[k + 1][1] - knots[k][1]) / h[k];
    }
    d[0] = delta[0];
    d[n - 1] = delta[n - 2];
    for (size_t k = 1; k + 1 < n; ++k) {
        const double a = delta[k - 1], b = delta[k];
        if (a * b <= 0.0) {
            d[k] = 0.0;
        } else {
            const double w1 = 2 * h[k] + h[k - 1];
            const double w2 = h[k] + 2 * h[k - 1];
            d[k] = (w1 + w2) / (w1 / a + w2 / b);
        }
    }
    std::array<unsigned char, 1000> curve{};
    size_t k = 0;
    for (size_t i = 0; i < curve.size(); ++i) {
        while (k + 2 < n && double(i) > knots[k + 1][0])
            ++k;
        const double y0 = knots[k][1], y1 = knots[k + 1][1];
        const double t = (double(i) - knots[k][0]) / h[k];
        const double t2 = t * t, t3 = t2 * t;
        const double v = (2 * t3 - 3 * t2 + 1) * y0 + (t3 - 2 * t2 + t) * h[k] * d[k]
                         + (-2 * t3 + 3 * t2) * y1 + (t3 - t2) * h[k] * d[k + 1];
        const double r = std::floor(v + 0.5);
        curve[i] = static_cast<unsigned char>(r < 0 ? 0 : r > 255 ? 255 : r);
        if (i > 0 && curve[i] < curve[i - 1])
            throw std::runtime_error("display curve falls at " + std::to_string(i));
    }
    for (const auto& knot : knots)
        if (curve[size_t(knot[0])] != knot[1])
            throw std::runtime_error("display curve misses its point at " + std::to_string(int(knot[0])));
    return curve;
}

std::string gammaSource()
{
    const std::array<unsigned char, 1000> curve = gammaCurve();
    std::string out =
        "// Generated by tools/weighttables. Do not edit: change the generator and\n"
        "// build the regenerate_weighttables target.\n"
        "//\n"
        "// The display curve from linear light (index = value x 1000) to the panel's\n"
        "// 8-bit level: a monotone cubic through the curve's sampled points.\n\n"
        "#include \"Utils/ColorMath.h\"\n\n"
        "const unsigned char FGAMMA[1000] = {";
    for (size_t i = 0; i < curve.size(); ++i) {
        if (i % 16 == 0)
            out += "\n   ";
        char buf[8];
        std::snprintf(buf, sizeof buf, " %3d", curve[i]);
        out += buf;
        if (i + 1 < curve.size())
            out += ",";
    }
    out += "\n};\n";
    return out;
}

std::string densitySource(const std::string& dataDir)
{
    const std::vector<long long> w = densityWeights(dataDir);
    const std::vector<long long> m = densityWeightsStatusM(dataDir);
    std::string out =
        "// Generated by tools/weighttables from the ISO 5-3 status density spectral\n"
        "// products in tools/weighttables/data. Do not edit: change the generator\n"
        "// and build the regenerate_weighttables target.\n"
        "//\n"
        "// Per status (A, E, I, T) and response (visual, cyan, magenta, yellow), 31\n"
        "// weights for 400-700 nm summing to 100,000: the product made linear\n"
        "// (10^(v - 5)) and scaled over the instrument's range. The visual response\n"
        "// is ISO visual for every status. No public data exist for status I; its\n"
        "// rows are 0 and mark that status as unavailable. Status M, which the data\n"
        "// have, stands in a table of its own in the same form.\n\n"
        "#include \"Utils/ColorMath.h\"\n\n"
        "const int32_t den_weight[DEN_WEIGHT_STATUSES * DEN_WEIGHT_RESPONSES * NUM_WAVELENGTHS] = {\n";
    appendRows(out, w, {"A", "E", "I", "T"});
    out += "};\n\nconst int32_t den_weight_M[DEN_WEIGHT_RESPONSES * NUM_WAVELENGTHS] = {\n";
    appendRows(out, m, {"M"});
    out += "};\n";
    return out;
}

} // namespace WeightGen
