// Colour differences and indices against outside references: littleCMS for
// the formulas it shares with the library, the published CIEDE2000 test
// pairs, and hand-worked cases where the library's rules differ from both.

#include "Utils/ColorMath.h"

#include <QtTest>

#include <lcms2.h>

#include <cmath>
#include <cstring>
#include <random>

namespace {

struct Pair
{
    double L1, a1, b1, L2, a2, b2, dE;
};

// The 34 CIEDE2000 test pairs published with the formula's implementation
// notes (Sharma, Wu and Dalal, 2005), with their differences.
const Pair kSharma[] = {
    {50.0000, 2.6772, -79.7751, 50.0000, 0.0000, -82.7485, 2.0425},
    {50.0000, 3.1571, -77.2803, 50.0000, 0.0000, -82.7485, 2.8615},
    {50.0000, 2.8361, -74.0200, 50.0000, 0.0000, -82.7485, 3.4412},
    {50.0000, -1.3802, -84.2814, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, -1.1848, -84.8006, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, -0.9009, -85.5211, 50.0000, 0.0000, -82.7485, 1.0000},
    {50.0000, 0.0000, 0.0000, 50.0000, -1.0000, 2.0000, 2.3669},
    {50.0000, -1.0000, 2.0000, 50.0000, 0.0000, 0.0000, 2.3669},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0009, 7.1792},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0010, 7.1792},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0011, 7.2195},
    {50.0000, 2.4900, -0.0010, 50.0000, -2.4900, 0.0012, 7.2195},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0009, -2.4900, 4.8045},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0010, -2.4900, 4.8045},
    {50.0000, -0.0010, 2.4900, 50.0000, 0.0011, -2.4900, 4.7461},
    {50.0000, 2.5000, 0.0000, 50.0000, 0.0000, -2.5000, 4.3065},
    {50.0000, 2.5000, 0.0000, 73.0000, 25.0000, -18.0000, 27.1492},
    {50.0000, 2.5000, 0.0000, 61.0000, -5.0000, 29.0000, 22.8977},
    {50.0000, 2.5000, 0.0000, 56.0000, -27.0000, -3.0000, 31.9030},
    {50.0000, 2.5000, 0.0000, 58.0000, 24.0000, 15.0000, 19.4535},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.1736, 0.5854, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.2972, 0.0000, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 1.8634, 0.5757, 1.0000},
    {50.0000, 2.5000, 0.0000, 50.0000, 3.2592, 0.3350, 1.0000},
    {60.2574, -34.0099, 36.2677, 60.4626, -34.1751, 39.4387, 1.2644},
    {63.0109, -31.0961, -5.8663, 62.8187, -29.7946, -4.0864, 1.2630},
    {61.2901, 3.7196, -5.3901, 61.4292, 2.2480, -4.9620, 1.8731},
    {35.0831, -44.1164, 3.7933, 35.0232, -40.0716, 1.5901, 1.8645},
    {22.7233, 20.0904, -46.6940, 23.0331, 14.9730, -42.5619, 2.0373},
    {36.4612, 47.8580, 18.3852, 36.2715, 50.5065, 21.2231, 1.4146},
    {90.8027, -2.0831, 1.4410, 91.1528, -1.6435, 0.0447, 1.4441},
    {90.9257, -0.5406, -0.9208, 88.6381, -0.8985, -0.7239, 1.5381},
    {6.7747, -0.2908, -2.4247, 5.8714, -0.0985, -2.2286, 0.6377},
    {2.0776, 0.0795, -1.1350, 0.9033, -0.0636, -0.5514, 0.9082},
};

// The pairs (numbered from 1) where the library's hue rules give another
// result than the published formula. 11, 12 and 15 have hues just over 180
// degrees apart, which the plain mean does not fold back. In 18, 20, 21,
// 23 and 24 the first colour lies on the positive a axis (b = 0), whose hue
// the library puts at 360, not 0, so the plain mean with the other hue
// lands on the opposite side. Pairs 7, 8, 16 and 22 meet one of the rules
// too, but without effect: a neutral colour has no hue term, and two hues
// of 360 or a difference under 180 average alike.
const int kDiffering[] = {11, 12, 15, 18, 20, 21, 23, 24};

void lchOf(const double* lab, double* lch)
{
    lch[0] = lab[0];
    lch[1] = std::sqrt(lab[1] * lab[1] + lab[2] * lab[2]);
    double h = std::atan2(lab[2], lab[1]) * 180.0 / M_PI;
    if (h < 0.0)
        h += 360.0;
    lch[2] = h;
}

double cie2000(const Pair& p)
{
    const double s[3] = {p.L1, p.a1, p.b1}, t[3] = {p.L2, p.a2, p.b2};
    double ls[3], lt[3];
    lchOf(s, ls);
    lchOf(t, lt);
    const double k[3] = {1.0, 1.0, 1.0};
    return ColorMath_CalcCIE2000(s, t, ls, lt, k);
}

cmsCIELab cms(const CIELABCOORD& c)
{
    return cmsCIELab{c.L, c.a, c.b};
}

// Lab values on the hundredths grid, where the library's rounding before
// the hue angle changes nothing.
CIELABCOORD gridLab(std::mt19937& rng)
{
    std::uniform_int_distribution<int> L(1000, 9500), ab(-8000, 8000);
    return CIELABCOORD{L(rng) / 100.0, ab(rng) / 100.0, ab(rng) / 100.0};
}

void flat(double* refls, double value)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = value;
}

} // namespace

class TestColorDifference : public QObject
{
    Q_OBJECT

private slots:
    void publishedCie2000Pairs()
    {
        double largest = 0.0;
        QStringList differing;
        for (int i = 0; i < int(sizeof(kSharma) / sizeof(kSharma[0])); ++i) {
            const double d = cie2000(kSharma[i]);
            const double deviation = std::fabs(d - kSharma[i].dE);
            const bool expectedToDiffer
                = std::find(std::begin(kDiffering), std::end(kDiffering), i + 1) != std::end(kDiffering);
            if (expectedToDiffer) {
                QVERIFY2(deviation > 0.001, qPrintable(QString("pair %1 should differ").arg(i + 1)));
                differing << QString("%1 (%2 for %3)").arg(i + 1).arg(d, 0, 'f', 4).arg(kSharma[i].dE, 0, 'f', 4);
                continue;
            }
            largest = std::max(largest, deviation);
            QVERIFY2(deviation < 0.0001, qPrintable(QString("pair %1: %2 for %3").arg(i + 1).arg(d, 0, 'f', 5)
                                                        .arg(kSharma[i].dE, 0, 'f', 4)));
        }
        qInfo("largest deviation from the published pairs that follow the same hue rule: %.6f", largest);
        qInfo("pairs that differ by the plain hue mean or the hue of 360 at b = 0: %s",
              qPrintable(differing.join(", ")));
    }

    void cie2000HueRules()
    {
        // Hues of 350 and 10 degrees average to 180, not 0: T and the
        // rotation term are read at the opposite side of the circle, so the
        // result is not the one of the same pair turned by 20 degrees.
        auto labAt = [](double L, double C, double h, double* lab) {
            lab[0] = L;
            lab[1] = C * std::cos(h * M_PI / 180.0);
            lab[2] = C * std::sin(h * M_PI / 180.0);
        };
        double s[3], t[3], s2[3], t2[3], ls[3], lt[3], ls2[3], lt2[3];
        labAt(50.0, 30.0, 350.0, s);
        labAt(50.0, 30.0, 10.0, t);
        labAt(50.0, 30.0, 170.0, s2);
        labAt(50.0, 30.0, 190.0, t2);
        lchOf(s, ls);
        lchOf(t, lt);
        lchOf(s2, ls2);
        lchOf(t2, lt2);
        const double k[3] = {1.0, 1.0, 1.0};
        // Across the 0/360 seam the pair is weighed as if its mean hue were
        // 180: exactly the weighting of the pair that really sits at 180.
        QVERIFY(std::fabs(ColorMath_CalcCIE2000(s, t, ls, lt, k) - ColorMath_CalcCIE2000(s2, t2, ls2, lt2, k)) < 1e-4);

        // Identical colours are 0; coefficients below 0.001 are raised, not divided by.
        QCOMPARE(ColorMath_CalcCIE2000(s, s, ls, ls, k), 0.0);
        const double zero[3] = {0.0, 0.0, 0.0};
        QVERIFY(std::isfinite(ColorMath_CalcCIE2000(s, t, ls, lt, zero)));
        QCOMPARE(ColorMath_CalcCIE2000(nullptr, t, ls, lt, k), -999.0);
    }

    void againstLittleCms()
    {
        std::mt19937 rng(2024);
        double largestAb = 0.0, largestCmc = 0.0, largest2000 = 0.0;
        int compared2000 = 0;
        for (int i = 0; i < 2000; ++i) {
            const CIELABCOORD s = gridLab(rng), t = gridLab(rng);
            const cmsCIELab cs = cms(s), ct = cms(t);

            double dE = 0.0;
            QVERIFY(ColorMath_LabToDElab(&t, &s, &dE));
            largestAb = std::max(largestAb, std::fabs(dE - cmsDeltaE(&cs, &ct)));

            // Both weigh CMC by the standard; littleCMS takes L below 16 for
            // the constant lightness weight, the library L at or below 16.
            if (s.L != 16.0) {
                double cmc = 0.0;
                QVERIFY(ColorMath_LabToDEcmc(&t, &s, 2.0, 1.0, &cmc));
                largestCmc = std::max(largestCmc, std::fabs(cmc - cmsCMCdeltaE(&cs, &ct, 2.0, 1.0)) / std::max(1.0, cmc));
            }

            // CIEDE2000 agrees where the plain hue mean is the published
            // mean: hues (of a') no more than 180 apart.
            const double ls[3] = {s.L, s.a, s.b}, lt[3] = {t.L, t.a, t.b};
            double hs = std::atan2(s.b, s.a) * 180.0 / M_PI, ht = std::atan2(t.b, t.a) * 180.0 / M_PI;
            hs += hs < 0.0 ? 360.0 : 0.0;
            ht += ht < 0.0 ? 360.0 : 0.0;
            if (std::fabs(hs - ht) < 150.0 && s.b != 0.0 && t.b != 0.0) {
                double lchS[3], lchT[3];
                lchOf(ls, lchS);
                lchOf(lt, lchT);
                const double k[3] = {1.0, 1.0, 1.0};
                const double d = ColorMath_CalcCIE2000(lt, ls, lchT, lchS, k);
                largest2000 = std::max(largest2000, std::fabs(d - cmsCIE2000DeltaE(&ct, &cs, 1.0, 1.0, 1.0)));
                ++compared2000;
            }
        }
        qInfo("largest deviation from littleCMS: dE*ab %.2e, CMC(2:1) %.2e (relative), CIEDE2000 %.2e over %d pairs",
              largestAb, largestCmc, largest2000, compared2000);
        QVERIFY(largestAb < 1e-4);
        QVERIFY(largestCmc < 1e-4);
        QVERIFY(largest2000 < 1e-3);
        QVERIFY(compared2000 > 500);
    }

    void cie94ByHand()
    {
        // littleCMS weighs CIE94 by the geometric mean chroma with 0.048 and
        // 0.014 (the textile form); the library takes the standard's chroma
        // with 0.045 and 0.015. Worked by hand: standard (50, 30, 40) has
        // C 50; trial (52, 33, 38): C 50.3289, dC 0.3289, dH^2 = 9 + 4 -
        // 0.10818 = 12.8918, SC = 3.25, SH = 1.75.
        const CIELABCOORD s{50.0, 30.0, 40.0}, t{52.0, 33.0, 38.0};
        double d94 = 0.0;
        QVERIFY(ColorMath_LabToDE94(&t, &s, 1.0, 1.0, &d94));
        const double expected = std::sqrt(4.0 + std::pow(0.32890 / 3.25, 2) + 12.89182 / (1.75 * 1.75));
        QVERIFY2(std::fabs(d94 - expected) < 1e-4, qPrintable(QString::number(d94, 'f', 6)));
        const cmsCIELab cs = cms(s), ct = cms(t);
        QVERIFY(std::fabs(d94 - cmsCIE94DeltaE(&cs, &ct)) > 1e-3);

        // The L*C*h* form and the array form agree with the L*a*b* form.
        CIELCHCOORD ls, lt, terms;
        ColorMath_CIELabToCIELCH(&s, &ls);
        ColorMath_CIELabToCIELCH(&t, &lt);
        double dLch = 0.0;
        QVERIFY(ColorMath_LChToDE94(&lt, &ls, 1.0, 1.0, &terms, &dLch));
        QVERIFY(std::fabs(dLch - d94) < 1e-4);
        const double aS[3] = {s.L, s.a, s.b}, aT[3] = {t.L, t.a, t.b};
        const double cS[3] = {ls.L, ls.C, ls.h}, cT[3] = {lt.L, lt.C, lt.h};
        double coef[3] = {1.0, 1.0, 0.0};
        double q[3];
        const double dArr = ColorMath_CalcCIE94(aT, aS, cT, cS, coef, q, false);
        QCOMPARE(coef[2], 0.001); // kH raised, also in the caller's array
        coef[2] = 1.0;
        QVERIFY(std::fabs(ColorMath_CalcCIE94(aT, aS, cT, cS, coef, q, false) - d94) < 1e-4);
        QVERIFY(dArr > d94); // a tiny kH made the hue term dominate
    }

    void cmcRules()
    {
        const CIELABCOORD s{50.0, 20.0, 10.0};
        double cmc = 0.0;
        QVERIFY(ColorMath_LabToDEcmc(&s, &s, 2.0, 1.0, &cmc));
        QCOMPARE(cmc, 0.0);
        QVERIFY(!ColorMath_LabToDEcmc(&s, &s, 0.0, 1.0, &cmc));
        QCOMPARE(cmc, 999.0);

        // The lightness weight switches strictly above L 16.
        const CIELABCOORD at16{16.0, 0.0, 0.0}, trial16{17.0, 0.0, 0.0};
        QVERIFY(ColorMath_LabToDEcmc(&trial16, &at16, 1.0, 1.0, &cmc));
        QVERIFY(std::fabs(cmc - 1.0 / 0.511) < 1e-4);
        const CIELABCOORD above{16.01, 0.0, 0.0}, trialAbove{17.01, 0.0, 0.0};
        QVERIFY(ColorMath_LabToDEcmc(&trialAbove, &above, 1.0, 1.0, &cmc));
        const double sl = 0.040975 * 16.01 / (1.0 + 0.01765 * 16.01);
        QVERIFY(std::fabs(cmc - 1.0 / sl) < 1e-3);

        // The L*C*h* form gives the weighted terms with the sign of dH.
        CIELCHCOORD ls{50.0, 30.0, 100.0}, lt{51.0, 32.0, 95.0}, terms;
        QVERIFY(ColorMath_LChToDEcmc(&lt, &ls, 2.0, 1.0, &terms, &cmc));
        QVERIFY(terms.h < 0.0);
        QVERIFY(std::fabs(cmc - std::sqrt(terms.L * terms.L + terms.C * terms.C + terms.h * terms.h)) < 1e-4);
    }

    void hueDifferenceSigns()
    {
        double dH = 0.0, dE = 0.0;
        // Standard below 180: a trial hue just below, or more than 180 above, is negative.
        CIELCHCOORD s{50.0, 20.0, 10.0};
        for (const auto& c : {std::make_pair(5.0, true), std::make_pair(20.0, false), std::make_pair(200.0, true),
                              std::make_pair(185.0, false)}) {
            CIELCHCOORD t{50.0, 20.0, c.first};
            QVERIFY(ColorMath_LChToDHAndDE(&t, &s, &dH, &dE));
            QVERIFY2((dH < 0.0) == c.second, qPrintable(QString::number(c.first)));
        }
        // Standard at or above 180: negative only between hs - 180 and hs.
        s.h = 300.0;
        for (const auto& c : {std::make_pair(290.0, true), std::make_pair(130.0, true), std::make_pair(110.0, false),
                              std::make_pair(310.0, false)}) {
            CIELCHCOORD t{50.0, 20.0, c.first};
            QVERIFY(ColorMath_LChToDHAndDE(&t, &s, &dH, &dE));
            QVERIFY2((dH < 0.0) == c.second, qPrintable(QString::number(c.first)));
        }
        // The array form wraps the hue difference: 355 against 5 is negative.
        const double labS[3] = {50.0, 20.0, 1.7}, labT[3] = {50.0, 20.0, -1.7};
        const double lchS[3] = {50.0, 20.07, 5.0}, lchT[3] = {50.0, 20.07, 355.0};
        QVERIFY(ColorMath_CalcDeltaH(labT, labS, lchT, lchS) < 0.0);
    }

    void din6175()
    {
        const double lab[3] = {50.0, 20.0, 10.0}, lch[3] = {50.0, 22.36, 26.57};
        QCOMPARE(ColorMath_CalcDIN6175c(lab, lab, lch, lch, 10.0), 0.0);
        const double labT[3] = {51.0, 21.0, 11.0}, lchT[3] = {51.0, 23.71, 27.65};
        const double c = ColorMath_CalcDIN6175c(labT, lab, lchT, lch, 10.0);
        const double p = ColorMath_CalcDIN6175p(labT, lab, lchT, lch, 10.0);
        QVERIFY(c > 0.0 && std::isfinite(c));
        QVERIFY(p > 0.0 && p < c); // the larger p weights shrink every term
        // A viewing angle of 0 would divide by zero.
        QCOMPARE(ColorMath_CalcDIN6175c(labT, lab, lchT, lch, 0.0), -999.0);
    }

    void whitenessAndYellowness()
    {
        double white[NUM_WAVELENGTHS];
        flat(white, 0.9);
        double w = 0.0;
        // A flat 90 % grey has the white point's chromaticity: W = Y.
        QVERIFY(ColorMath_ReflToWhiteE313_98(white, D65_10, &w));
        QVERIFY(std::fabs(w - 90.0) < 0.3);
        QVERIFY(!ColorMath_ReflToWhiteE313_98(white, A_10, &w));
        QCOMPARE(w, -999.0);
        // W at 40 exactly is outside the accepted range.
        CIEYXYCOORD yxy{40.0, double(0.3138f), double(0.3310f)};
        QVERIFY(!ColorMath_CIEYxyToWhiteE313_98(&yxy, D65_10, &w));
        QCOMPARE(w, -999.0);
        yxy.Y = 90.0;
        QVERIFY(ColorMath_CIEYxyToWhiteE313_98(&yxy, D65_10, &w));

        QVERIFY(!ColorMath_ReflToWhiteTaubeIQC(white, D65_10, &w));
        QVERIFY(ColorMath_ReflToWhiteTaubeIQC(white, C_2, &w));
        double hunter = 0.0, hunterIqc = 0.0;
        QVERIFY(ColorMath_ReflToWhiteStensby(white, C_2, &hunter));
        QVERIFY(ColorMath_ReflToWhiteStensbyIQC(white, C_2, &hunterIqc));
        QVERIFY(std::fabs(hunter - hunterIqc) > 1.0); // the IQC form normalises twice

        double y = 0.0;
        QVERIFY(ColorMath_ReflToYellowE313_98(white, D65_10, &y));
        QVERIFY(std::fabs(y) < 1.0); // neutral: hardly yellow
        QVERIFY(!ColorMath_ReflToYellowE313_98(white, F2_10, &y));
        QCOMPARE(y, -999.0);
        double yellowish[NUM_WAVELENGTHS];
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            yellowish[i] = i < 10 ? 0.6 : 0.9;
        QVERIFY(ColorMath_ReflToYellowE313_98(yellowish, D65_10, &y));
        QVERIFY(y > 10.0);

        double black[NUM_WAVELENGTHS];
        flat(black, 0.0);
        QVERIFY(ColorMath_ReflToYellowE313_98(black, D65_10, &y));
        QCOMPARE(y, 0.0); // Y of 0 gives 0, not a division
        QVERIFY(!ColorMath_ReflToYellowE313_73IQC(black, D65_10, &y));
    }

    void strengthOpacityAndGrey()
    {
        double std[NUM_WAVELENGTHS], weak[NUM_WAVELENGTHS];
        for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
            std[i] = 20.0 + i * 2.0;
            weak[i] = 25.0 + i * 2.0;
        }
        double s = 0.0;
        QVERIFY(ColorMath_ReflToStrengthApt(std, std, &s));
        QCOMPARE(s, 100.0);
        QVERIFY(ColorMath_ReflToStrengthApt(std, weak, &s));
        QVERIFY(s < 100.0);
        int wavelength = 0;
        QVERIFY(ColorMath_ReflToStrengthChr(std, weak, &s, &wavelength));
        QCOMPARE(wavelength, 410); // the lowest of indices 1 to 29
        wavelength = 800;
        QVERIFY(!ColorMath_ReflToStrengthChr(std, weak, &s, &wavelength));
        double zeros[NUM_WAVELENGTHS];
        flat(zeros, 0.0);
        QVERIFY(ColorMath_ReflToStrengthApt(std, zeros, &s));
        QCOMPARE(s, 1000.0); // capped

        double o = 0.0;
        QVERIFY(ColorMath_ReflToOpacity(weak, std, D65_10, &o));
        QVERIFY(o > 100.0);
        QVERIFY(ColorMath_ReflToOpacity(std, zeros, D65_10, &o));
        QCOMPARE(o, 1000.0); // Y over white of 0 stands in as 0.00001

        char stain[4], colour[4];
        QVERIFY(ColorMath_ReflToGrayScale(std, std, stain, colour));
        QCOMPARE(QString(stain), QString("5"));
        QCOMPARE(QString(colour), QString("5"));
        double far[NUM_WAVELENGTHS];
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            far[i] = 80.0 - i * 2.0;
        QVERIFY(ColorMath_ReflToGrayScale(far, std, stain, colour));
        QCOMPARE(QString(colour), QString("1"));
        QVERIFY(QString(stain) != "5" && QString(stain) != "4-5");

        double newStrength = 0.0, adjusted[NUM_WAVELENGTHS];
        QVERIFY(ColorMath_StrengthAtMinDE(weak, std, adjusted, &newStrength));
        // The sample at the found strength lies nearer the standard than as measured.
        double lS[NUM_WAVELENGTHS], lW[NUM_WAVELENGTHS], lA[NUM_WAVELENGTHS];
        CIELABCOORD labS, labW, labA;
        for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
            lS[i] = std[i] / 100.0;
            lW[i] = weak[i] / 100.0;
            lA[i] = adjusted[i] / 100.0;
        }
        ColorMath_ReflToCIELAB(lS, D65_10, &labS);
        ColorMath_ReflToCIELAB(lW, D65_10, &labW);
        ColorMath_ReflToCIELAB(lA, D65_10, &labA);
        double before = 0.0, after = 0.0;
        ColorMath_LabToDElab(&labW, &labS, &before);
        ColorMath_LabToDElab(&labA, &labS, &after);
        QVERIFY2(after < before / 2.0, qPrintable(QString("%1 -> %2 at %3").arg(before).arg(after).arg(newStrength)));
        QVERIFY(newStrength < 100.0); // stated as the strength that brings the sample down to the standard
    }

    void chromaticTestAndArea()
    {
        double grey[NUM_WAVELENGTHS], red[NUM_WAVELENGTHS];
        flat(grey, 0.4);
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            red[i] = i > 20 ? 0.7 : 0.05;
        QVERIFY(!ColorMath_IsChromatic(grey, D65_10));
        QVERIFY(ColorMath_IsChromatic(red, D65_10));
        double lHi, lLo, cHi, cLo;
        ColorMath_GetAChromaticConstants(&lHi, &lLo, &cHi, &cLo);
        QCOMPARE(lHi, 84.0);
        QCOMPARE(cLo, 11.0);
        QCOMPARE(ColorMath_FindArea(grey, 0, 30), 31 * 0.4);
        QCOMPARE(ColorMath_FindArea(grey, -5, 99), 31 * 0.4); // held to the spectrum
    }
};

QTEST_GUILESS_MAIN(TestColorDifference)
#include "tst_colordifference.moc"
