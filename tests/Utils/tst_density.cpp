// Densities by status and the print measures built on them.

#include "Utils/ColorMath.h"

#include <QtTest>

#include <cmath>

namespace {

void flat(double* refls, double percent)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = percent;
}

// A cyan ink: absorbs the red end, reflects blue and green.
void cyanInk(double* refls)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = i < 12 ? 70.0 - i : i < 18 ? 55.0 - (i - 12) * 7.0 : 8.0;
}

} // namespace

class TestDensity : public QObject
{
    Q_OBJECT

private slots:
    void flatReflectanceGivesItsLogForEveryStatusWithData()
    {
        const int statuses[] = {DENSITY_STATUS_A, DENSITY_STATUS_E, DENSITY_STATUS_t, DENSITY_STATUS_M};
        for (double percent : {100.0, 50.0, 10.0, 1.0}) {
            double refl[NUM_WAVELENGTHS];
            flat(refl, percent);
            for (int status : statuses) {
                for (int response = VISUAL_RESPONSE; response <= YELLOW_RESPONSE; ++response) {
                    double d = 0.0;
                    QVERIFY(ColorMath_ReflToDensity(refl, nullptr, status, response, &d));
                    QVERIFY2(std::fabs(d + std::log10(percent / 100.0)) < 1e-4,
                             qPrintable(QString("status %1 response %2 at %3 %: %4").arg(status).arg(response).arg(percent).arg(d)));
                }
            }
        }
    }

    void generatedRowsSumAsStated()
    {
        for (int status = 0; status < 4; ++status) {
            for (int response = 0; response < 4; ++response) {
                long long sum = 0;
                for (int i = 0; i < NUM_WAVELENGTHS; ++i)
                    sum += den_weight[status * 124 + response * 31 + i];
                if (status == DENSITY_STATUS_I)
                    QCOMPARE(sum, 0LL); // no published data
                else
                    QVERIFY2(std::llabs(sum - 100000) <= 16, qPrintable(QString::number(sum)));
            }
        }
        for (int response = 0; response < 4; ++response) {
            long long sum = 0;
            for (int i = 0; i < NUM_WAVELENGTHS; ++i)
                sum += den_weight_M[response * 31 + i];
            QVERIFY2(std::llabs(sum - 100000) <= 16, qPrintable(QString::number(sum)));
        }
    }

    void statusesWithoutDataAreRefused()
    {
        double refl[NUM_WAVELENGTHS];
        flat(refl, 50.0);
        double d = 1.0;
        QVERIFY(!ColorMath_ReflToDensity(refl, nullptr, DENSITY_STATUS_I, CYAN_RESPONSE, &d));
        QCOMPARE(d, -999.0);
        for (int status : {6, 7, 8, 9, 10, 11, 13, 14}) {
            QVERIFY(!ColorMath_ReflToDensity(refl, nullptr, status, CYAN_RESPONSE, &d));
            DENSITYSTRUCT all;
            QVERIFY(!ColorMath_ReflToDensities(refl, nullptr, status, &all));
        }
        QVERIFY(!ColorMath_ReflToDensity(refl, nullptr, 15, CYAN_RESPONSE, &d));
        QVERIFY(!ColorMath_ReflToDensity(refl, nullptr, DENSITY_STATUS_A, 4, &d));
        QVERIFY(!ColorMath_ReflToDensity(refl, nullptr, DENSITY_SPECTRAL, 399, &d));
        QVERIFY(!ColorMath_ReflToReflDensity(refl, DENSITY_STATUS_HIFI, 1, &d));
    }

    void paperAndSpectralDensity()
    {
        double ink[NUM_WAVELENGTHS], paper[NUM_WAVELENGTHS];
        cyanInk(ink);
        flat(paper, 90.0);
        double withPaper = 0.0, plain = 0.0;
        QVERIFY(ColorMath_ReflToDensity(ink, nullptr, DENSITY_STATUS_t, CYAN_RESPONSE, &plain));
        QVERIFY(ColorMath_ReflToDensity(ink, paper, DENSITY_STATUS_t, CYAN_RESPONSE, &withPaper));
        QVERIFY(std::fabs(plain - withPaper + std::log10(0.9)) < 1e-3);
        QVERIFY(plain > 0.9); // a cyan absorbs the red: about 8 % reflected

        double spectral = 0.0;
        QVERIFY(ColorMath_ReflToDensity(ink, nullptr, DENSITY_SPECTRAL, 650, &spectral));
        QVERIFY(std::fabs(spectral + std::log10(0.08)) < 1e-4);
        double black[NUM_WAVELENGTHS];
        flat(black, 0.0);
        QVERIFY(ColorMath_ReflToDensity(black, nullptr, DENSITY_SPECTRAL, 500, &spectral));
        QCOMPARE(spectral, 5.0); // held to the instrument's range

        QCOMPARE(ColorMath_DetermineDensityResponse(ink, DENSITY_STATUS_t, nullptr), int(CYAN_RESPONSE));
        double grey[NUM_WAVELENGTHS];
        flat(grey, 40.0);
        QCOMPARE(ColorMath_DetermineDensityResponse(grey, DENSITY_STATUS_t, nullptr), -1); // not chromatic
        DENSITYSTRUCT d;
        QVERIFY(ColorMath_ReflToDensities(ink, nullptr, DENSITY_SPECTRAL, &d));
        QCOMPARE(d.Density[1], 580.0); // the first wavelength of the strongest absorption
        double x = 0.0;
        QVERIFY(ColorMath_ReflToDensity(ink, nullptr, DENSITY_SPECTRAL_X, 0, &x));
        QVERIFY(x > 0.9 && x <= 5.0);
    }

    void printMeasures()
    {
        double trap = 0.0;
        QVERIFY(ColorMath_DensityToTrap(1.8, 1.5, 1.0, &trap));
        QVERIFY(std::fabs(trap - 800.0 / 15.0) < 1e-9);
        QVERIFY(!ColorMath_DensityToTrap(1.8, 0.0, 1.0, &trap));
        QVERIFY(ColorMath_DensityToBrunnerTrap(1.8, 1.5, 1.0, &trap));
        QVERIFY(ColorMath_DensityToRitzTrap(1.8, 1.5, 1.0, &trap));
        QVERIFY(!ColorMath_DensityToNewsTrap(1.8, 1.5, 1.0, 1.5, &trap));

        double grey = 0.0, hue = 0.0;
        int dir = -1;
        QVERIFY(ColorMath_DensityToHueGrayDirection(1.4, 0.6, 0.2, &grey, &hue, &dir));
        QVERIFY(std::fabs(grey - 0.2 / 1.4 * 100.0) < 1e-9);
        QVERIFY(std::fabs(hue - 0.4 / 1.2 * 100.0) < 1e-9);
        QCOMPARE(dir, 0);
        QVERIFY(ColorMath_DensityToHueGray(0.0, 0.0, 0.0, &grey, &hue));
        QCOMPARE(grey, 100.0);
        QCOMPARE(hue, 100.0);

        double area = 0.0;
        QVERIFY(ColorMath_DensityToDotArea(1.4, 1.4, 1.0, &area));
        QVERIFY(std::fabs(area - 100.0) < 1e-6);
        QVERIFY(!ColorMath_DensityToDotArea(1.4, 0.5, 0.0, &area));
        QCOMPARE(area, 100.0);
        double density = 0.0;
        QVERIFY(ColorMath_DensityToDotArea(1.4, 0.5, 1.7, &area));
        QVERIFY(ColorMath_DensityFromDotArea(1.4, area, 1.7, &density));
        QVERIFY(std::fabs(density - 0.5) < 1e-4); // the two are inverse

        const double paper = 0.05, solid = 1.45, tint = 0.45;
        double n = 0.0;
        QVERIFY(ColorMath_FindNFactor(&paper, &solid, &tint, &n));
        QVERIFY(ColorMath_DensityToDotArea(solid - paper, tint - paper, n, &area));
        QVERIFY(area >= 49.95 && area <= 50.04);

        double contrast = 0.0;
        QVERIFY(ColorMath_DensityToPrintContrast(1.5, 0.6, &contrast));
        QVERIFY(std::fabs(contrast - 60.0) < 1e-9);
        QVERIFY(!ColorMath_DensityToPrintContrast(0.0, 0.6, &contrast));
    }

    void wrappersAndPolarisation()
    {
        double ink[NUM_WAVELENGTHS], paper[NUM_WAVELENGTHS], tint[NUM_WAVELENGTHS];
        cyanInk(ink);
        flat(paper, 90.0);
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            tint[i] = (ink[i] + paper[i]) / 2.0;
        double gain = -1.0, area = 0.0;
        QVERIFY(ColorMath_ReflToDotArea(paper, ink, tint, DENSITY_STATUS_t, CYAN_RESPONSE, 1.0, &area));
        QVERIFY(ColorMath_ReflToDotGain(paper, ink, tint, DENSITY_STATUS_t, CYAN_RESPONSE, 1.0, 50, &gain));
        QVERIFY(std::fabs(gain - std::max(0.0, area - 50.0)) < 1e-9);
        QVERIFY(ColorMath_ReflToDotGain(paper, ink, tint, DENSITY_STATUS_t, CYAN_RESPONSE, 1.0, 100, &gain));
        QCOMPARE(gain, 0.0);

        // A polarised reading equal to the unpolarised one changes nothing;
        // a darker one scales the spectrum down.
        double filters[4];
        for (int f = 0; f < 4; ++f)
            QVERIFY(ColorMath_ReflToReflDensity(ink, DENSITY_STATUS_E, f, &filters[f]));
        double adjusted[NUM_WAVELENGTHS];
        int response = -1;
        QVERIFY(ColorMath_PolReflAdjust(ink, filters, adjusted, &response));
        QCOMPARE(response, int(CYAN_RESPONSE));
        QVERIFY(std::fabs(adjusted[20] - ink[20]) < 1e-9);
        filters[CYAN_RESPONSE] /= 2.0;
        QVERIFY(ColorMath_PolReflAdjust(ink, filters, adjusted, &response));
        QVERIFY(std::fabs(adjusted[20] - ink[20] / 2.0) < 1e-6);
        double plain = 0.0, polarised = 0.0;
        QVERIFY(ColorMath_ReflToDensity(ink, nullptr, DENSITY_STATUS_E, CYAN_RESPONSE, &plain));
        QVERIFY(ColorMath_PolReflToDensity(ink, filters, nullptr, DENSITY_STATUS_E, CYAN_RESPONSE, &polarised));
        QVERIFY(std::fabs(polarised - plain - std::log10(2.0)) < 1e-3);

        int dir = 0;
        const double cmy[3] = {0.2, 1.4, 0.9};
        QVERIFY(ColorMath_GetDirectionDensity(cmy, 4, &dir));
        QCOMPARE(dir, 7);
        QVERIFY(!ColorMath_GetDirectionDensity(cmy, 2, &dir));

        DENSITYSTRUCT d;
        QVERIFY(!ColorMath_ReflToDensities(ink, nullptr, DENSITY_STATUS_Ex, &d));
        QVERIFY(!ColorMath_GetHiFiConstants(nullptr, nullptr));
    }

    void namesAndWeights()
    {
        QCOMPARE(ColorMath_StatusNameToIndex("Status T"), 3);
        QCOMPARE(ColorMath_StatusNameToIndex("HEX"), 7);
        QCOMPARE(ColorMath_StatusNameToIndex("Status M"), -1);
        QCOMPARE(ColorMath_ResponseNameToIndex("E"), 8);
        QCOMPARE(ColorMath_ResponseNameToIndex(nullptr), -1);
        QCOMPARE(ColorMath_GetNumStatuses(), 15);
        QCOMPARE(ColorMath_GetNumStatusResponses(DENSITY_STATUS_HIFI), 7);
        QCOMPARE(QString(ColorMath_GetStatusName(0)), QString());

        double w[NUM_WAVELENGTHS];
        int start = 0, peak = 0, end = 0;
        QVERIFY(ColorMath_GetNormalizedDensityWeights(DENSITY_STATUS_t, CYAN_RESPONSE, w, &start, &peak, &end));
        QVERIFY2(start >= 550 && peak >= 600 && end == 700, qPrintable(QString("%1 %2 %3").arg(start).arg(peak).arg(end)));
        QCOMPARE(w[(peak - 400) / 10], 100.0);
        QVERIFY(!ColorMath_GetNormalizedDensityWeights(DENSITY_STATUS_I, CYAN_RESPONSE, w, &start, &peak, &end));
    }
};

QTEST_GUILESS_MAIN(TestDensity)
#include "tst_density.moc"
