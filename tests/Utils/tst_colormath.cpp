// Spectra to colour coordinates and back: the edge cases that decide the
// on-screen colour and the values the server reports, and the round trips
// that tie each conversion to its inverse.
#include "SharedSystem/WeightTables.h"
#include "Utils/ColorMath.h"
#include "Utils/ColorMathHelper.h"

#include <QtTest>

#include <cmath>

namespace {

void fill(double* refls, double value)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = value;
}

// A plausible paint spectrum: a red.
void red(double* refls)
{
    for (int i = 0; i < NUM_WAVELENGTHS; ++i)
        refls[i] = 0.05 + 0.6 / (1 + std::exp(-(400 + 10 * i - 600) / 15.0));
}

bool near(double a, double b, double tolerance)
{
    return std::fabs(a - b) <= tolerance;
}

const XYZN_T& white(int pair)
{
    return XYZN_TABLE5[pair];
}

} // namespace

class TestColorMath : public QObject
{
    Q_OBJECT

private slots:
    void init() { WeightTable_SelectColorTable(COLOR_TABLE_5); }

    void blackIsBlackEverywhere()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 0.0);
        XYZCOORD xyz = {1, 1, 1};
        QVERIFY(ColorMath_ReflToXYZ(refls, D65_10, &xyz));
        QCOMPARE(xyz.X, 0.0);
        QCOMPARE(xyz.Y, 0.0);
        QCOMPARE(xyz.Z, 0.0);
        COLOR_REF cr = 0x123456;
        QVERIFY(ColorMath_ReflToRGB(refls, D65_10, &cr));
        QCOMPARE(cr, COLOR_REF(0));
        // Chromaticity of black is undefined: zeros and false.
        CIEYXYCOORD yxy = {5, 5, 5};
        QVERIFY(!ColorMath_XYZToCIEYxy(&xyz, D65_10, &yxy));
        QCOMPARE(yxy.Y + yxy.x + yxy.y, 0.0);
        // L*C*h* of black has no hue, and Hunter Lab no axes.
        CIELCHCOORD lch;
        QVERIFY(ColorMath_XYZToCIELCH(&xyz, D65_10, &lch));
        QCOMPARE(lch.L, 0.0);
        QCOMPARE(lch.C, 0.0);
        QCOMPARE(lch.h, 0.0);
        HUNTERLABCOORD hunter;
        QVERIFY(ColorMath_XYZToHunterLab(&xyz, D65_10, &hunter));
        QVERIFY(ColorMath_ReflToHunterLAB(refls, D65_10, &hunter));
        QCOMPARE(hunter.L + hunter.a + hunter.b, 0.0);
    }

    void perfectWhiteSaturatesTheScreen()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 1.0);
        // Under the daylight sources; the matrix is not normalised to any
        // white, so all three channels pass 0.999.
        for (int table : {COLOR_TABLE_5, COLOR_TABLE_6}) {
            WeightTable_SelectColorTable(table);
            for (int pair : {C_2, D65_2, D65_10, D75_10}) {
                COLOR_REF cr = 0;
                QVERIFY(ColorMath_ReflToRGB(refls, pair, &cr));
                QCOMPARE(cr, COLOR_REF(0xFFFFFF));
            }
        }
        // The white of every pair is its white point.
        for (int table : {COLOR_TABLE_5, COLOR_TABLE_6}) {
            WeightTable_SelectColorTable(table);
            for (int pair = 0; pair < ColorMath_GetNumIlluminantObservers(); ++pair) {
                XYZCOORD xyz;
                QVERIFY(ColorMath_ReflToXYZ(refls, pair, &xyz));
                QVERIFY2(near(xyz.X, pXYZN.load()[pair].XWeightSum, 0.02), qPrintable(QString::number(pair)));
                QVERIFY(near(xyz.Y, 100.0, 0.02));
                QVERIFY(near(xyz.Z, pXYZN.load()[pair].ZWeightSum, 0.02));
            }
        }
    }

    void rgbChannelsAndCurve()
    {
        // Linear red of exactly 0.5 with no green: R = FGAMMA[500], the
        // little blue that X carries rounds to index 7.
        XYZCOORD xyz = {0.5 / 0.056507956, 0.0, 0.0};
        COLOR_REF cr = 0;
        QVERIFY(ColorMath_XYZtoRGB(&xyz, &cr));
        QCOMPARE(cr & 0xFF, COLOR_REF(FGAMMA[500]));
        QCOMPARE((cr >> 8) & 0xFF, COLOR_REF(0));
        QCOMPARE(cr >> 16, COLOR_REF(FGAMMA[7]));
        QCOMPARE(int(FGAMMA[500]), 198);
        XYZCOORD broken = {std::nan(""), 1e300, -1e300};
        QVERIFY(ColorMath_XYZtoRGB(&broken, &cr));
        QVERIFY(!ColorMath_XYZtoRGB(nullptr, &cr));
        QVERIFY(!ColorMath_RGBToXYZ(&cr, &xyz));
    }

    void displayCurveThroughItsPoints()
    {
        const int points[][2] = {{0, 0},     {3, 0},     {4, 5},     {5, 10},    {10, 35},   {13, 48},
                                 {20, 64},   {50, 91},   {100, 115}, {200, 145}, {300, 166}, {400, 184},
                                 {500, 198}, {600, 212}, {700, 224}, {800, 235}, {900, 245}, {950, 250},
                                 {985, 254}, {999, 255}};
        for (const auto& p : points)
            QCOMPARE(int(FGAMMA[p[0]]), p[1]);
        for (int i = 4; i <= 10; ++i)
            QCOMPARE(int(FGAMMA[i]), 5 * (i - 3));
        for (int i = 1; i < 1000; ++i)
            QVERIFY(FGAMMA[i] >= FGAMMA[i - 1]);
    }

    void badArgumentsLeaveTheResultAlone()
    {
        double refls[NUM_WAVELENGTHS];
        red(refls);
        XYZCOORD xyz = {7, 8, 9};
        QVERIFY(!ColorMath_ReflToXYZ(refls, 32, &xyz));
        QVERIFY(!ColorMath_ReflToXYZ(refls, -1, &xyz));
        QVERIFY(!ColorMath_ReflToXYZ(nullptr, D65_10, &xyz));
        QVERIFY(!ColorMath_ReflToXYZ(refls, D65_10, nullptr));
        QCOMPARE(xyz.X, 7.0);
        QCOMPARE(xyz.Z, 9.0);
        CIELABCOORD lab = {1, 2, 3};
        QVERIFY(!ColorMath_ReflToCIELAB(refls, eILLUM_OBS_NumOf, &lab));
        QVERIFY(!ColorMath_XYZToCIELab(&xyz, 32, &lab));
        QCOMPARE(lab.L, 1.0);
        COLOR_REF cr = 42;
        QVERIFY(!ColorMath_ReflToRGB(refls, 32, &cr));
        QCOMPARE(cr, COLOR_REF(42));
        double xs[NUM_WAVELENGTHS], ys[NUM_WAVELENGTHS];
        QVERIFY(!ColorMath_ReflToXYZs(refls, D65_10, xs, ys, nullptr));
        QCOMPARE(ColorMath_GetNumIlluminantObservers(), 32);
    }

    void lightnessNearBlackUsesTwoSlopes()
    {
        // Just below the 0.008856 ratio L* is linear: 903.292 in L*a*b*,
        // 903.3 in the L*C*h* forms.
        const double ratio = 0.0088;
        const XYZCOORD xyz = {ratio * white(D65_10).XWeightSum, ratio * white(D65_10).YWeightSum,
                              ratio * white(D65_10).ZWeightSum};
        CIELABCOORD lab;
        CIELCHCOORD lch, uvlch;
        CIELUVCOORD luv;
        QVERIFY(ColorMath_XYZToCIELab(&xyz, D65_10, &lab));
        QVERIFY(ColorMath_XYZToCIELCH(&xyz, D65_10, &lch));
        QVERIFY(ColorMath_XYZTouvLCH(&xyz, D65_10, &uvlch));
        QVERIFY(ColorMath_XYZToCIELUV(&xyz, D65_10, &luv));
        QCOMPARE(lab.L, 903.292 * ratio);
        QCOMPARE(lch.L, 903.3 * ratio);
        QCOMPARE(uvlch.L, 903.3 * ratio);
        QCOMPARE(luv.L, 903.292 * ratio);
        // Above it, the cube root, taken in single precision.
        const XYZCOORD grey = {0.2 * white(D65_10).XWeightSum, 20.0, 0.2 * white(D65_10).ZWeightSum};
        QVERIFY(ColorMath_XYZToCIELab(&grey, D65_10, &lab));
        QCOMPARE(lab.L, 116.0 * double(powf(0.2f, 0.33333334f)) - 16.0);
        QVERIFY(near(lab.a, 0.0, 1e-4) && near(lab.b, 0.0, 1e-4));
    }

    void lchWithoutChromaWhenXAndZAreZero()
    {
        const XYZCOORD xyz = {0.0, 30.0, 0.0};
        CIELCHCOORD lch = {1, 1, 1};
        QVERIFY(ColorMath_XYZToCIELCH(&xyz, D50_2, &lch));
        QVERIFY(lch.L > 60.0);
        QCOMPARE(lch.C, 0.0);
        QCOMPARE(lch.h, 0.0);
    }

    void labToLchRoundsAndAvoidsATrueZero()
    {
        CIELCHCOORD lch;
        // a and b go to hundredths before C and h: 3.004999 and 4.0049
        // make an exact 3-4-5 triangle; L stays unrounded.
        const CIELABCOORD rounded = {50.123456, 3.004999, 4.0049};
        QVERIFY(ColorMath_CIELabToCIELCH(&rounded, &lch));
        QCOMPARE(lch.L, 50.123456);
        QCOMPARE(lch.C, 5.0);
        // a of -0.004 rounds to -0: with a true zero atan2(-0, -0) would give
        // a hue of 180; the small positive a keeps it at 0 and C above 0.
        const CIELABCOORD neutral = {40.0, -0.004, -0.004};
        QVERIFY(ColorMath_CIELabToCIELCH(&neutral, &lch));
        QCOMPARE(lch.h, 0.0);
        QCOMPARE(lch.C, double(sqrtf(float(double(0.000001f) * double(0.000001f)))));
        QVERIFY(lch.C > 0.0);
        const CIELABCOORD blue = {40.0, 0.0, -20.0};
        QVERIFY(ColorMath_CIELabToCIELCH(&blue, &lch));
        QVERIFY(near(lch.h, 270.0, 1e-4));
        QVERIFY(!ColorMath_CIELabToCIELCH(nullptr, &lch));
    }

    void hunterConstantsAndTheTwoHunterForms()
    {
        // X at twice the white, Y at the white, Z zero: a = Ka and b = Kb.
        const struct { int pair; float ka, kb; } rows[] = {{C_2, 175.0f, 70.0f}, {D65_10, 172.06f, 66.69f}};
        for (const auto& r : rows) {
            const XYZCOORD xyz = {2.0 * white(r.pair).XWeightSum, white(r.pair).YWeightSum, 0.0};
            HUNTERLABCOORD hunter;
            QVERIFY(ColorMath_XYZToHunterLab(&xyz, r.pair, &hunter));
            QCOMPARE(hunter.L, 100.0);
            QCOMPARE(hunter.a, double(r.ka));
            QCOMPARE(hunter.b, double(r.kb));
        }
        // The spectrum form works on chromaticities: its L of a mid grey is
        // nowhere near the tristimulus form's.
        double refls[NUM_WAVELENGTHS];
        fill(refls, 0.5);
        HUNTERLABCOORD fromSpectrum, fromXYZ;
        XYZCOORD xyz;
        QVERIFY(ColorMath_ReflToHunterLAB(refls, D65_10, &fromSpectrum));
        QVERIFY(ColorMath_ReflToXYZ(refls, D65_10, &xyz));
        QVERIFY(ColorMath_XYZToHunterLab(&xyz, D65_10, &fromXYZ));
        QVERIFY(near(fromXYZ.L, 100.0 * std::sqrt(0.5), 0.01));
        QVERIFY(fromSpectrum.L < 10.0);
        // And back from the tristimulus form.
        XYZCOORD back;
        QVERIFY(ColorMath_HunterLabToXYZ(&fromXYZ, D65_10, &back));
        QVERIFY(near(back.X, xyz.X, 1e-3) && near(back.Y, xyz.Y, 1e-3) && near(back.Z, xyz.Z, 1e-3));
    }

    void roundTripsThroughEveryCoordinateSystem_data()
    {
        QTest::addColumn<int>("pair");
        QTest::addColumn<int>("table");
        QTest::newRow("D65_10 set 5") << int(D65_10) << int(COLOR_TABLE_5);
        QTest::newRow("A_2 set 5") << int(A_2) << int(COLOR_TABLE_5);
        QTest::newRow("F12_2 set 5") << int(F12_2) << int(COLOR_TABLE_5);
        QTest::newRow("F11_10 set 6") << int(F11_10) << int(COLOR_TABLE_6);
    }

    void roundTripsThroughEveryCoordinateSystem()
    {
        QFETCH(int, pair);
        QFETCH(int, table);
        WeightTable_SelectColorTable(table);
        double refls[NUM_WAVELENGTHS];
        red(refls);
        XYZCOORD xyz, back;
        QVERIFY(ColorMath_ReflToXYZ(refls, pair, &xyz));
        const double tol = 2e-3 * xyz.Y;
        auto same = [&](const XYZCOORD& b) {
            return near(b.X, xyz.X, tol) && near(b.Y, xyz.Y, tol) && near(b.Z, xyz.Z, tol);
        };

        CIELABCOORD lab;
        QVERIFY(ColorMath_ReflToCIELAB(refls, pair, &lab));
        QVERIFY(lab.a > 20.0 && lab.b > 0.0); // it is a red
        QVERIFY(ColorMath_LabToXYZ(&lab, pair, &back) && same(back));
        QVERIFY(ColorMath_CIELabToXYZ(&lab, pair, &back) && same(back));

        CIELCHCOORD lch;
        QVERIFY(ColorMath_ReflToCIELCH(refls, pair, &lch));
        QVERIFY(near(lch.C, std::hypot(lab.a, lab.b), 1e-3));
        QVERIFY(ColorMath_CIELCHToXYZ(&lch, pair, &back) && same(back));
        QVERIFY(ColorMath_abLCHToXYZ(&lch, pair, &back) && same(back));
        CIELABCOORD polar;
        QVERIFY(ColorMath_LChToCIELab(&lch, &polar));
        QVERIFY(near(polar.a, lab.a, 1e-3) && near(polar.b, lab.b, 1e-3));

        CIELUVCOORD luv;
        QVERIFY(ColorMath_ReflToCIELUV(refls, pair, &luv));
        QVERIFY(ColorMath_CIELuvToXYZ(&luv, pair, &back) && same(back));
        QVERIFY(ColorMath_XYZTouvLCH(&xyz, pair, &lch));
        QVERIFY(ColorMath_uvLCHToXYZ(&lch, pair, &back) && same(back));

        CIEYXYCOORD yxy;
        QVERIFY(ColorMath_ReflToCIEYxy(refls, pair, &yxy));
        QCOMPARE(yxy.Y, xyz.Y);
        QVERIFY(ColorMath_CIEYxyToXYZ(&yxy, pair, &back) && same(back));
        double x, y, z;
        QVERIFY(ColorMath_XYZToxyz(&xyz, &x, &y, &z));
        QVERIFY(near(x + y + z, 1.0, 1e-12));

        CIEYUVCOORD yuv;
        QVERIFY(ColorMath_ReflToCIEYuv(refls, pair, &yuv));
        QCOMPARE(yuv.u, luv.u);
        QVERIFY(ColorMath_CIEYuvToXYZ(&yuv, pair, &back) && same(back));

        // The per-wavelength products read the spectrum without the factor
        // 100 of the sums: together they make a hundredth of X, Y and Z.
        double xs[NUM_WAVELENGTHS], ys[NUM_WAVELENGTHS], zs[NUM_WAVELENGTHS];
        QVERIFY(ColorMath_ReflToXYZs(refls, pair, xs, ys, zs));
        double sx = 0, sy = 0, sz = 0;
        for (int i = 0; i < NUM_WAVELENGTHS; ++i) {
            sx += xs[i];
            sy += ys[i];
            sz += zs[i];
        }
        QVERIFY(near(100 * sx, xyz.X, 1e-9) && near(100 * sy, xyz.Y, 1e-9) && near(100 * sz, xyz.Z, 1e-9));
    }

    void zeroDivisorsGiveTheErrorValue()
    {
        XYZCOORD xyz = {1, 2, 3};
        const CIEYXYCOORD flat = {20.0, 0.3, 0.0};
        QVERIFY(!ColorMath_CIEYxyToXYZ(&flat, D65_10, &xyz));
        QCOMPARE(xyz.X, -999.0);
        // L* of 0 is black whatever u* and v* say.
        const CIELUVCOORD black = {0.0, 12.0, -7.0};
        QVERIFY(ColorMath_CIELuvToXYZ(&black, D65_10, &xyz));
        QCOMPARE(xyz.X + xyz.Y + xyz.Z, 0.0);
    }

    void whiteGivesRxRyRzOfHundred()
    {
        double refls[NUM_WAVELENGTHS];
        fill(refls, 1.0);
        RXRYRZCOORD r;
        for (int pair : {C_2, D65_10, F12_10}) {
            QVERIFY(ColorMath_ReflToRxRyRz(refls, pair, &r));
            QVERIFY2(near(r.Rx, 100.0, 0.05) && near(r.Ry, 100.0, 0.05) && near(r.Rz, 100.0, 0.05),
                     qPrintable(QString("%1: %2 %3 %4").arg(pair).arg(r.Rx).arg(r.Ry).arg(r.Rz)));
        }
        QVERIFY(!ColorMath_ReflToRxRyRz(refls, 32, &r));
    }

    void wrappedRowsReadAsTheirTrueWeights()
    {
        // Half of the white in both sets: a misread 16-bit entry would put X
        // out by hundreds.
        double refls[NUM_WAVELENGTHS];
        fill(refls, 0.5);
        for (int table : {COLOR_TABLE_5, COLOR_TABLE_6}) {
            WeightTable_SelectColorTable(table);
            for (int pair : {F12_2, F12_10}) {
                XYZCOORD xyz;
                QVERIFY(ColorMath_ReflToXYZ(refls, pair, &xyz));
                QVERIFY(near(xyz.X, 0.5 * pXYZN.load()[pair].XWeightSum, 0.02));
            }
        }
    }
};

QTEST_APPLESS_MAIN(TestColorMath)
#include "tst_colormath.moc"
