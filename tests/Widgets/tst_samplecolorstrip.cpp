// The colour strip of a stored sample: angle order, patch geometry with its
// gaps, and strips too narrow for their gaps.

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "Widgets/ColorPatch.h"
#include "Widgets/SampleColorStrip.h"

#include "support/ResultsFixture.h"

#include <QtTest>

class tst_SampleColorStrip : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void runsFromLowestToHighestAngle();
    void narrowStripShowsNoPatch();
    void patchSetters();
};

void tst_SampleColorStrip::initTestCase()
{
    QVERIFY(ResultsFixture::start(false));
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job 1")));
}

void tst_SampleColorStrip::runsFromLowestToHighestAngle()
{
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const int n = int(sample.getNumAngleCurves());
    QCOMPARE(n, 6);

    QWidget window;
    auto* strip = new SampleColorStrip(&window);
    strip->setGeometry(0, 0, 301, 30);
    strip->setSpacing(1);
    strip->setSampleIndex(int(DataManager::instance()->getActiveSample()));
    window.show();

    const auto& patches = strip->colorPatches();
    QCOMPARE(patches.size(), n);
    const int pw = (301 - n) / n;
    for (int i = 0; i < n; ++i) {
        QCOMPARE(patches[i]->getColor(), sample.getColor(Instrument_Get_Angle_Low_To_High(i, n)));
        QCOMPARE(patches[i]->geometry(), QRect(i * pw + i, 0, pw, 30));
        QVERIFY(patches[i]->isVisible());
    }
    // A red solid is darker away from the gloss: the strip is not one colour.
    QVERIFY(patches.front()->getColor() != patches.back()->getColor());

    // A resize rebuilds, and the old patches go.
    strip->resize(151, 30);
    QCOMPARE(strip->findChildren<ColorPatch*>().size(), n);
    QCOMPARE(patches[1]->x(), (151 - n) / n + 1);
}

void tst_SampleColorStrip::narrowStripShowsNoPatch()
{
    QWidget window;
    auto* strip = new SampleColorStrip(&window);
    strip->setGeometry(0, 0, 5, 10);
    strip->setSpacing(2);
    strip->setSampleIndex(int(DataManager::instance()->getActiveSample()));
    window.show();
    QCOMPARE(strip->colorPatches().size(), 6);
    for (ColorPatch* patch : strip->colorPatches())
        QVERIFY(!patch->isVisible());

    // No sample there: nothing is drawn and nothing breaks.
    SampleColorStrip empty;
    empty.setSampleIndex(200);
    QVERIFY(empty.colorPatches().isEmpty());
}

void tst_SampleColorStrip::patchSetters()
{
    ColorPatch patch;
    patch.setColorRGB(10, 20, 30, 128);
    QCOMPARE(patch.getColor(), QColor(10, 20, 30, 128));
    QVERIFY(patch.styleSheet().contains(QStringLiteral("rgba(10, 20, 30, 128)")));
    const double rgb[3] = {300.0, -4.0, 127.6};
    patch.setColor(rgb);
    QCOMPARE(patch.getColor(), QColor(255, 0, 128));
}

QTEST_MAIN(tst_SampleColorStrip)
#include "tst_samplecolorstrip.moc"
