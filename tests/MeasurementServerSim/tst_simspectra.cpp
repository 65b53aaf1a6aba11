// Plausibility of the simulated finishes and pictures: the lightness flop of
// metallics, the hue flop of pearls, flat solids, small reading noise, and
// pictures that are the same for a sample and move for the live view.

#include "SimColour.h"
#include "SimImages.h"
#include "SimSpectra.h"

#include <QtTest>

#include <cmath>

using namespace Sim;

namespace {

QVector<float> labOf(const QString& panel, int angles, std::mt19937& rng, bool outlier = false)
{
    Spectra::ReadingNoise noise;
    noise.outlier = outlier;
    return Colour::labch(Spectra::measure(panel, angles, noise, rng), angles);
}

double meanBrightness(const QByteArray& rgb)
{
    double sum = 0.0;
    for (char c : rgb)
        sum += uchar(c);
    return rgb.isEmpty() ? 0.0 : sum / rgb.size();
}

} // namespace

class TestSimSpectra : public QObject
{
    Q_OBJECT

private slots:
    void metallicLightnessFallsAwayFromTheSpecular()
    {
        std::mt19937 rng(1);
        const QVector<float> lab = labOf(Spectra::panelSpec(QStringLiteral("silver-metallic"), 1), 6, rng);
        auto L = [&](int angle) { return lab[angle * 5]; };
        QVERIFY(L(REFL_D45_15) > L(REFL_D45_25));
        QVERIFY(L(REFL_D45_25) > L(REFL_D45_45));
        QVERIFY(L(REFL_D45_45) > L(REFL_D45_75));
        QVERIFY(L(REFL_D45_75) > L(REFL_D45_110));
        QVERIFY(L(REFL_D45_15) > 95.0f);       // reflectance above 100 % near the specular
        QVERIFY(L(REFL_D45_110) < 50.0f);
        QVERIFY(L(REFL_D45_NEG_15) < L(REFL_D45_15));
        // Silver stays grey at every angle.
        for (int a = 0; a < 6; ++a)
            QVERIFY2(lab[a * 5 + 3] < 4.0f, qPrintable(QString::number(a)));
    }

    void solidsAreFlatAndPearlsTurnTheirHue()
    {
        std::mt19937 rng(2);
        const QVector<float> red = labOf(Spectra::panelSpec(QStringLiteral("red-solid"), 1), 6, rng);
        float lo = 1e9f, hi = -1e9f;
        for (int a = 0; a < 6; ++a) {
            lo = std::min(lo, red[a * 5]);
            hi = std::max(hi, red[a * 5]);
        }
        QVERIFY(hi - lo < 6.0f);
        QVERIFY(red[3 * 5 + 1] > 35.0f);                              // a* at 45 degrees
        QVERIFY(red[3 * 5 + 4] > 15.0f && red[3 * 5 + 4] < 50.0f);     // a red hue

        const QVector<float> pearl = labOf(Spectra::panelSpec(QStringLiteral("green-pearl"), 1), 6, rng);
        double dh = std::fabs(double(pearl[1 * 5 + 4]) - pearl[5 * 5 + 4]);
        dh = std::min(dh, 360.0 - dh);
        QVERIFY2(dh > 10.0, qPrintable(QString::number(dh)));

        const QVector<float> white = labOf(Spectra::panelSpec(QStringLiteral("white-solid"), 1), 6, rng);
        QVERIFY(white[3 * 5] > 90.0f);
    }

    void readingsScatterLittleUnlessSpoilt()
    {
        std::mt19937 rng(3);
        const QString panel = Spectra::panelSpec(QStringLiteral("white-solid"), 4);
        const QVector<float> a = labOf(panel, 6, rng);
        const QVector<float> b = labOf(panel, 6, rng);
        QVERIFY(Colour::maxDeltaE(a, b) < 0.3);
        for (int i = 0; i < 5; ++i)
            QVERIFY(Colour::maxDeltaE(a, labOf(panel, 6, rng, true)) > 1.0);
        // Two panels of the same colour are close, not equal.
        const double batch = Colour::maxDeltaE(a, labOf(Spectra::panelSpec(QStringLiteral("white-solid"), 99), 6, rng));
        QVERIFY(batch > 0.05 && batch < 4.0);
    }

    void elevenGeometriesForTheLargerModel()
    {
        std::mt19937 rng(4);
        const QVector<float> refl =
            Spectra::measure(Spectra::panelSpec(QStringLiteral("blue-metallic"), 1), 11, Spectra::ReadingNoise(), rng);
        QCOMPARE(refl.size(), 11 * NUM_WAVELENGTHS);
        for (float r : refl)
            QVERIFY(r > 0.0f && r < 3.0f);
        const QVector<float> lab = Colour::labch(refl, 11);
        QVERIFY(lab[REFL_D15_15 * 5] > lab[REFL_D15_80 * 5]);
        QCOMPARE(spectralAngleName(REFL_D15_NEG_45), QStringLiteral("r15as-45"));
        QCOMPARE(spectralAngleFromName(QStringLiteral("R45AS110")), int(REFL_D45_110));
        QCOMPARE(imageAngleFromName(QStringLiteral("r15d")), int(IMAGE_DIFFUSE));
        QCOMPARE(imageAngleFromName(QStringLiteral("r45as45")), -1);
    }

    void textureFollowsTheFinish()
    {
        std::mt19937 rng(5);
        const QVector<float> metal = Spectra::texture(Spectra::panelSpec(QStringLiteral("silver-metallic"), 1), rng);
        const QVector<float> solid = Spectra::texture(Spectra::panelSpec(QStringLiteral("black-solid"), 1), rng);
        QCOMPARE(metal.size(), NUM_OF_IMAGE_ANGLES * kTextureFigures);
        const int intensity = 4;
        QVERIFY(metal[IMAGE_15 * kTextureFigures + intensity] > metal[IMAGE_80 * kTextureFigures + intensity]);
        QVERIFY(metal[IMAGE_15 * kTextureFigures + intensity] > 10.0f * (solid[IMAGE_15 * kTextureFigures + intensity] + 0.1f));
        QVERIFY(metal[IMAGE_DIFFUSE * kTextureFigures] > solid[IMAGE_DIFFUSE * kTextureFigures]);
    }

    void picturesAreStableForASampleAndMoveLive()
    {
        std::mt19937 rng(6);
        Sample s;
        s.numAngles = 6;
        s.seed = 1234;
        s.refl = Spectra::measure(Spectra::panelSpec(QStringLiteral("red-metallic"), 1), 6, Spectra::ReadingNoise(), rng);
        s.texture = Spectra::texture(Spectra::panelSpec(QStringLiteral("red-metallic"), 1), rng);
        const QByteArray thumb = Images::samplePicture(s, IMAGE_15, 56, 78);
        QCOMPARE(thumb.size(), 56 * 78 * 3);
        QCOMPARE(Images::samplePicture(s, IMAGE_15, 56, 78), thumb);
        QVERIFY(Images::samplePicture(s, IMAGE_45, 56, 78) != thumb);
        QCOMPARE(Images::samplePicture(s, IMAGE_15, 236, 292).size(), 236 * 292 * 3);
        // Oversized requests are cut to what the camera gives.
        QCOMPARE(Images::samplePicture(s, IMAGE_15, 5000, 5000).size(), 482 * 348 * 3);

        Images::LiveView view;
        const QString panel = Spectra::panelSpec(QStringLiteral("silver-metallic"), 1);
        const QByteArray a = view.frame(panel, 3, 0, 482, 348);
        const QByteArray b = view.frame(panel, 3, 700, 482, 348);
        QCOMPARE(a.size(), 503208);
        QVERIFY(a != b);
        const QByteArray lifted = view.frame(panel, 0, 700, 482, 348);
        QVERIFY(meanBrightness(lifted) < 0.5 * meanBrightness(b));
    }
};

QTEST_GUILESS_MAIN(TestSimSpectra)
#include "tst_simspectra.moc"
