// The numeric helpers of the colour library: their rounding decides index
// and display values, so halves and negative values matter.
#include "SharedSystem/WeightTables.h"
#include "Utils/ColorMathHelper.h"

#include <QtTest>

#include <cmath>
#include <limits>

class TestColorMathHelper : public QObject
{
    Q_OBJECT

private slots:
    void roundTakesHalvesAwayFromZero()
    {
        QCOMPARE(ColorMathHelper_Round(2.5), 3);
        QCOMPARE(ColorMathHelper_Round(-2.5), -3);
        QCOMPARE(ColorMathHelper_Round(2.4999999), 2);
        QCOMPARE(ColorMathHelper_Round(-2.4999999), -2);
        // Adding 0.5 would round this up in double arithmetic.
        QCOMPARE(ColorMathHelper_Round(0.49999999999999994), 0);
        QCOMPARE(ColorMathHelper_Round(-0.5), -1);
        QCOMPARE(ColorMathHelper_Round(999.0000128746033), 999);
        QCOMPARE(ColorMathHelper_Round(1e20), std::numeric_limits<int32_t>::max());
        QCOMPARE(ColorMathHelper_Round(-1e20), std::numeric_limits<int32_t>::min());
        QCOMPARE(ColorMathHelper_Round(std::nan("")), 0);
    }

    void mungeAndRound6()
    {
        QCOMPARE(ColorMathHelper_MungeValue(-0.005), -0.01);
        QCOMPARE(ColorMathHelper_MungeValue(0.005), 0.01);
        QCOMPARE(ColorMathHelper_MungeValue(1.234), 1.23);
        QCOMPARE(ColorMathHelper_MungeValue(-1.235), -1.24);
        QCOMPARE(ColorMathHelper_MungeValue(-0.004), 0.0);
        QCOMPARE(ColorMathHelper_Round6(1.2345675), 1.234568);
        // The integer part, not the floor: small negatives go to 0.
        QCOMPARE(ColorMathHelper_Round6(-0.0000004), 0.0);
        QCOMPARE(ColorMathHelper_Round6(-0.0000016), -0.000001);
    }

    void singlePrecisionRootsAndDistance()
    {
        QCOMPARE(ColorMathHelper_cuberoot(27.0), double(expf(logf(27.0f) * 0.33333334f)));
        QVERIFY(std::fabs(ColorMathHelper_cuberoot(27.0) - 3.0) < 1e-5);
        QCOMPARE(ColorMathHelper_cuberoot(0.0), 0.0);
        QCOMPARE(ColorMathHelper_CalculateGenericDeltaE(3.0, 4.0, 12.0), 13.0);
        // Single-precision terms: the result is a float widened.
        const double d = ColorMathHelper_CalculateGenericDeltaE(0.1, 0.2, 0.3);
        QCOMPARE(d, double(float(d)));
    }

    void normValenceScalesTheWhiteByYn()
    {
        WeightTable_SelectColorTable(COLOR_TABLE_5);
        XYZCOORD n = {0, 0, 0};
        QVERIFY(ColorMathHelper_GetNormValence(D65_10, &n));
        QCOMPARE(n.X, double(XYZN_TABLE5[D65_10].XWeightSum) * double(XYZN_TABLE5[D65_10].YWeightSum) / 100.0);
        QCOMPARE(n.Y, 100.0);
        XYZCOORD untouched = {1, 2, 3};
        QVERIFY(!ColorMathHelper_GetNormValence(32, &untouched));
        QVERIFY(!ColorMathHelper_GetNormValence(-1, &untouched));
        QCOMPARE(untouched.X, 1.0);
        QVERIFY(!ColorMathHelper_GetNormValence(D65_10, nullptr));
    }

    void colourAtEquivalentStrength()
    {
        double sample[NUM_WAVELENGTHS], adjusted[NUM_WAVELENGTHS], stronger[NUM_WAVELENGTHS];
        for (int i = 0; i < NUM_WAVELENGTHS; ++i)
            sample[i] = 5.0 + 2.5 * i; // percent
        sample[0] = 0.0; // raised to 0.0001 before K/S
        const double same = 100.0, half = 50.0, none = 0.0;
        QVERIFY(ColorMathHelper_ColorAtEquivStrength(&same, sample, adjusted));
        for (int i = 1; i < NUM_WAVELENGTHS; ++i)
            QVERIFY2(std::fabs(adjusted[i] - sample[i]) < 0.01, qPrintable(QString::number(i)));
        // Near black the single-precision root leaves only a rough value.
        QVERIFY(std::fabs(adjusted[0]) < 0.1);
        // A sample of half the strength is brought to the standard's by
        // doubling its K/S: darker everywhere.
        QVERIFY(ColorMathHelper_ColorAtEquivStrength(&half, sample, stronger));
        for (int i = 1; i < NUM_WAVELENGTHS; ++i)
            QVERIFY(stronger[i] < adjusted[i]);
        QVERIFY(!ColorMathHelper_ColorAtEquivStrength(&none, sample, stronger));
        QVERIFY(!ColorMathHelper_ColorAtEquivStrength(nullptr, sample, stronger));
        QVERIFY(!ColorMathHelper_ColorAtEquivStrength(&same, sample, nullptr));
    }
};

QTEST_APPLESS_MAIN(TestColorMathHelper)
#include "tst_colormathhelper.moc"
