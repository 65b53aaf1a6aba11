// Speed of the colour path every patch on screen takes (spectrum -> XYZ ->
// screen RGB) and of XYZ -> L*a*b*, with littleCMS's cmsXYZ2Lab on the same
// inputs as the outside reference for both time and values; and CIEDE2000
// beside littleCMS's cmsCIE2000DeltaE.
// Prints nanoseconds per call, the median of repeated runs, timed on the
// thread's CPU clock so that time spent descheduled on a busy machine is
// not counted.
#include "SharedSystem/WeightTables.h"
#include "Utils/ColorMath.h"

#include <lcms2.h>

#include <algorithm>
#include <ctime>
#include <cmath>
#include <cstdio>
#include <functional>
#include <vector>

namespace {

constexpr int kSpectra = 4096;
constexpr int kRuns = 21;
constexpr int kRounds = 20; // passes over all spectra per run

volatile double g_sink;

// Deterministic smooth spectra: sums of a few broad bands.
std::vector<std::vector<double>> makeSpectra()
{
    std::vector<std::vector<double>> out;
    unsigned seed = 12345;
    auto next = [&seed]() {
        seed = seed * 1103515245u + 12345u;
        return double((seed >> 8) & 0xFFFF) / 65535.0;
    };
    for (int s = 0; s < kSpectra; ++s) {
        const double base = 0.02 + 0.3 * next();
        const double amp = 0.6 * next();
        const double centre = 400 + 300 * next();
        const double width = 20 + 80 * next();
        std::vector<double> r(NUM_WAVELENGTHS);
        for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
            const double nm = 400 + 10 * i;
            r[size_t(i)] = std::min(1.0, base + amp * std::exp(-std::pow((nm - centre) / width, 2)));
        }
        out.push_back(std::move(r));
    }
    return out;
}

double threadCpuNs()
{
    timespec ts;
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &ts);
    return double(ts.tv_sec) * 1e9 + double(ts.tv_nsec);
}

// Median nanoseconds per call of `pass`, which makes `calls` calls.
double timeIt(const std::function<void()>& pass, int calls)
{
    std::vector<double> ns;
    pass(); // warm up
    for (int run = 0; run < kRuns; ++run) {
        const double t0 = threadCpuNs();
        for (int round = 0; round < kRounds; ++round)
            pass();
        const double t1 = threadCpuNs();
        ns.push_back((t1 - t0) / (double(calls) * kRounds));
    }
    std::sort(ns.begin(), ns.end());
    return ns[ns.size() / 2];
}

} // namespace

int main()
{
    const int pair = D65_10;
    const auto spectra = makeSpectra();
    std::vector<XYZCOORD> xyz(kSpectra);
    for (int s = 0; s < kSpectra; ++s)
        ColorMath_ReflToXYZ(spectra[size_t(s)].data(), pair, &xyz[size_t(s)]);
    const XYZN_T& n = pXYZN.load()[pair];
    const cmsCIEXYZ white = {n.XWeightSum, n.YWeightSum, n.ZWeightSum};

    const double tXYZ = timeIt([&] {
        double acc = 0;
        XYZCOORD out;
        for (const auto& r : spectra) {
            ColorMath_ReflToXYZ(r.data(), pair, &out);
            acc += out.Y;
        }
        g_sink = acc;
    }, kSpectra);
    const double tRGB = timeIt([&] {
        COLOR_REF acc = 0;
        COLOR_REF cr;
        for (const auto& r : spectra) {
            ColorMath_ReflToRGB(r.data(), pair, &cr);
            acc ^= cr;
        }
        g_sink = acc;
    }, kSpectra);
    const double tLab = timeIt([&] {
        double acc = 0;
        CIELABCOORD lab;
        for (const auto& v : xyz) {
            ColorMath_XYZToCIELab(&v, pair, &lab);
            acc += lab.L;
        }
        g_sink = acc;
    }, kSpectra);
    const double tCms = timeIt([&] {
        double acc = 0;
        cmsCIELab lab;
        for (const auto& v : xyz) {
            const cmsCIEXYZ in = {v.X, v.Y, v.Z};
            cmsXYZ2Lab(&white, &lab, &in);
            acc += lab.L;
        }
        g_sink = acc;
    }, kSpectra);

    // CIEDE2000 between neighbouring colours of the set, ours and littleCMS's.
    std::vector<CIELABCOORD> labs(kSpectra);
    std::vector<CIELCHCOORD> lchs(kSpectra);
    for (int s = 0; s < kSpectra; ++s) {
        ColorMath_XYZToCIELab(&xyz[size_t(s)], pair, &labs[size_t(s)]);
        ColorMath_CIELabToCIELCH(&labs[size_t(s)], &lchs[size_t(s)]);
    }
    const double kOnes[3] = {1.0, 1.0, 1.0};
    const double tDE2000 = timeIt([&] {
        double acc = 0;
        for (int s = 1; s < kSpectra; ++s) {
            const CIELABCOORD& a = labs[size_t(s)];
            const CIELABCOORD& b = labs[size_t(s - 1)];
            const CIELCHCOORD& ca = lchs[size_t(s)];
            const CIELCHCOORD& cb = lchs[size_t(s - 1)];
            const double la[3] = {a.L, a.a, a.b}, lb[3] = {b.L, b.a, b.b};
            const double ha[3] = {ca.L, ca.C, ca.h}, hb[3] = {cb.L, cb.C, cb.h};
            acc += ColorMath_CalcCIE2000(la, lb, ha, hb, kOnes);
        }
        g_sink = acc;
    }, kSpectra - 1);
    const double tCms2000 = timeIt([&] {
        double acc = 0;
        for (int s = 1; s < kSpectra; ++s) {
            const cmsCIELab a = {labs[size_t(s)].L, labs[size_t(s)].a, labs[size_t(s)].b};
            const cmsCIELab b = {labs[size_t(s - 1)].L, labs[size_t(s - 1)].a, labs[size_t(s - 1)].b};
            acc += cmsCIE2000DeltaE(&a, &b, 1.0, 1.0, 1.0);
        }
        g_sink = acc;
    }, kSpectra - 1);

    // Largest difference from littleCMS, per coordinate and as a distance.
    double dL = 0, da = 0, db = 0, dE = 0;
    for (const auto& v : xyz) {
        CIELABCOORD ours;
        cmsCIELab ref;
        const cmsCIEXYZ in = {v.X, v.Y, v.Z};
        ColorMath_XYZToCIELab(&v, pair, &ours);
        cmsXYZ2Lab(&white, &ref, &in);
        dL = std::max(dL, std::fabs(ours.L - ref.L));
        da = std::max(da, std::fabs(ours.a - ref.a));
        db = std::max(db, std::fabs(ours.b - ref.b));
        dE = std::max(dE, std::sqrt(std::pow(ours.L - ref.L, 2) + std::pow(ours.a - ref.a, 2) + std::pow(ours.b - ref.b, 2)));
    }

    std::printf("colour library, D65/10, %d spectra, median of %d runs\n", kSpectra, kRuns);
    std::printf("  ColorMath_ReflToXYZ      %7.1f ns/call\n", tXYZ);
    std::printf("  ColorMath_ReflToRGB      %7.1f ns/call\n", tRGB);
    std::printf("  ColorMath_XYZToCIELab    %7.1f ns/call\n", tLab);
    std::printf("  cmsXYZ2Lab (littleCMS)   %7.1f ns/call\n", tCms);
    std::printf("  XYZToCIELab / cmsXYZ2Lab %7.2f x time\n", tLab / tCms);
    std::printf("  ColorMath_CalcCIE2000    %7.1f ns/call\n", tDE2000);
    std::printf("  cmsCIE2000DeltaE         %7.1f ns/call\n", tCms2000);
    std::printf("  CalcCIE2000 / cmsCIE2000DeltaE %7.2f x time\n", tDE2000 / tCms2000);
    std::printf("  largest difference from littleCMS: dL %.2e  da %.2e  db %.2e  dE %.2e\n", dL, da, db, dE);
    return 0;
}
