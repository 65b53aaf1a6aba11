// The colour API the screens use: screen colour under the user's
// illuminant/observer, its failure as black, and status E densities.
#include "GUIAPI/ColorAPI.h"
#include "SharedSystem/UserParams.h"
#include "Utils/ColorMath.h"

#include <QtTest>

#include <cmath>

namespace {

void fill(double* refls, double value)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = value;
}

const COLORSPACE_OBJECT_T kGarbage = {7.0f, 7.0f, 7.0f, 7.0f};

} // namespace

class TestColorAPI : public QObject
{
    Q_OBJECT

private slots:
    void init() { UserParams::setDefaults(); }

    void screenColourFollowsTheUserIlluminant()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 1.0);
        COLORSPACE_OBJECT_T out = kGarbage;
        QVERIFY(ColorAPI_GetRGBValues(refls, &out));
        QCOMPARE(out.ColorVal1, 255.0f);
        QCOMPARE(out.ColorVal2, 255.0f);
        QCOMPARE(out.ColorVal3, 255.0f);
        QCOMPARE(out.ColorVal4, 255.0f);
        // Under A the white is yellowish: blue drops.
        UserParams::setIllumObs(COLOR_ILLUM_OBS_A_2);
        QVERIFY(ColorAPI_GetRGBValues(refls, &out));
        QCOMPARE(out.ColorVal1, 255.0f);
        QVERIFY(out.ColorVal3 < 200.0f);
        // The same numbers as the library gives for that pair.
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            refls[i] = 0.1 + 0.02 * i;
        COLOR_REF cr = 0;
        QVERIFY(ColorMath_ReflToRGB(refls, A_2, &cr));
        QVERIFY(ColorAPI_GetRGBValues(refls, &out));
        QCOMPARE(out.ColorVal1, float(cr & 0xFF));
        QCOMPARE(out.ColorVal2, float((cr >> 8) & 0xFF));
        QCOMPARE(out.ColorVal3, float(cr >> 16));
    }

    void failedConversionIsBlackNotGarbage()
    {
        COLORSPACE_OBJECT_T out = kGarbage;
        QVERIFY(!ColorAPI_GetRGBValues(nullptr, &out));
        QCOMPARE(out.ColorVal1, 0.0f);
        QCOMPARE(out.ColorVal2, 0.0f);
        QCOMPARE(out.ColorVal3, 0.0f);
        QCOMPARE(out.ColorVal4, 255.0f);
        double refls[NUM_WAVELENGTHS];
        fill(refls, 0.5);
        QVERIFY(!ColorAPI_GetRGBValues(refls, nullptr));
    }

    void serverSuppliedValuesAreLeftAlone()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 0.5);
        COLORSPACE_OBJECT_T out = kGarbage;
        QVERIFY(ColorAPI_GetLabValues(refls, &out));
        QVERIFY(ColorAPI_GetLChValues(refls, &out));
        QVERIFY(ColorAPI_GetTextureValues(refls, &out));
        QCOMPARE(out.ColorVal1, 7.0f);
    }

    void statusEDensities()
    {
        // Spectra in percent: 10 % everywhere is density 1, 100 % is 0.
        double refls[NUM_WAVELENGTHS];
        fill(refls, 10.0);
        COLORSPACE_OBJECT_T out = kGarbage;
        QVERIFY(ColorAPI_GetCMYKValues(refls, &out));
        for (float d : {out.ColorVal1, out.ColorVal2, out.ColorVal3, out.ColorVal4})
            QVERIFY2(std::fabs(d - 1.0f) < 0.001f, qPrintable(QString::number(d)));
        fill(refls, 100.0);
        QVERIFY(ColorAPI_GetCMYKValues(refls, &out));
        QVERIFY(std::fabs(out.ColorVal4) < 0.001f);
        // A cyan ink absorbs red: high cyan density, low yellow density.
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            refls[i] = 400 + 10 * i < 580 ? 60.0 : 3.0;
        QVERIFY(ColorAPI_GetCMYKValues(refls, &out));
        QVERIFY(out.ColorVal1 > 1.3f && out.ColorVal3 < 0.3f);
        // Black beyond the floor: 1e-5 caps the density at 5.
        fill(refls, 0.0);
        float d = 0.0f;
        QVERIFY(ReflToDensity(refls, DEN_STATUS_T, DENSITY_FILTER_K, &d));
        QCOMPARE(d, 5.0f);
    }

    void densityRefusals()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 50.0);
        float d = -1.0f;
        QVERIFY(!ReflToDensity(nullptr, DEN_STATUS_E, DENSITY_FILTER_C, &d));
        QVERIFY(!ReflToDensity(refls, DEN_STATUS_E, DENSITY_FILTER_C, nullptr));
        QVERIFY(!ReflToDensity(refls, 4, DENSITY_FILTER_C, &d));
        QVERIFY(!ReflToDensity(refls, -1, DENSITY_FILTER_C, &d));
        QVERIFY(!ReflToDensity(refls, DEN_STATUS_E, DENSITY_FILTER_ENUM_SIZE, &d));
        // CMYK is not a single response, and status I has no weights.
        QVERIFY(!ReflToDensity(refls, DEN_STATUS_T, DENSITY_FILTER_CMYK, &d));
        QVERIFY(!ReflToDensity(refls, DEN_STATUS_I, DENSITY_FILTER_C, &d));
        QCOMPARE(d, -1.0f);
        QVERIFY(ReflToDensity(refls, DEN_STATUS_A, DENSITY_FILTER_Y, &d));
        QVERIFY(std::fabs(d - 0.30103f) < 0.001f);
    }
};

QTEST_MAIN(TestColorAPI)
#include "tst_colorapi.moc"
