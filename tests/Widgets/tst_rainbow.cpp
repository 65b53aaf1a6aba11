// The rainbow chart: which rings a sample gets, the colours the rings show
// at the scale's ticks, and the ticks of both scale pictures against the
// gradient stops.

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Sample.h"
#include "Widgets/RainbowPainter.h"
#include "Widgets/RainbowWidget.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/ColorPatch.h"

#include "support/ResultsFixture.h"

#include <QLabel>
#include <QtMath>
#include <QtTest>

namespace {

const int kTop[] = {REFL_D45_NEG_15, REFL_D45_15, REFL_D45_25, REFL_D45_45, REFL_D45_75, REFL_D45_110};
const int kBottom[] = {REFL_D15_NEG_45, REFL_D15_NEG_15, REFL_D15_15, REFL_D15_45, REFL_D15_80};

QPoint onRadius(int reflAngle, double radius, double offset = 0.0)
{
    const QPoint c = RainbowWidget::ringCentre();
    const double t = qDegreesToRadians(RainbowWidget::stopAngle(reflAngle) + offset);
    return QPoint(qFloor(c.x() + radius * qCos(t)), qFloor(c.y() - radius * qSin(t)));
}

bool near(const QColor& a, const QColor& b, int tolerance)
{
    return qAbs(a.red() - b.red()) <= tolerance && qAbs(a.green() - b.green()) <= tolerance
        && qAbs(a.blue() - b.blue()) <= tolerance;
}

// A tick is darker than the scale's ground and its track.
bool isTick(const QImage& image, const QPoint& p)
{
    return qGray(image.pixel(p)) < 170;
}

} // namespace

class tst_Rainbow : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void sixAnglesGiveOneRingWithTheirColours();
    void otherCountsGiveOnlyTheStrip();
    void scalePicturesHaveTicksOnTheStops();
    void gradientsStopAbruptly();
};

void tst_Rainbow::initTestCase()
{
    QVERIFY(ResultsFixture::start(false));
}

void tst_Rainbow::sixAnglesGiveOneRingWithTheirColours()
{
    for (const QString& job : {QStringLiteral("Job"), QStringLiteral("Job 1")}) {
        QVERIFY(ResultsFixture::activate(job));
        const Sample sample = DataManager::instance()->getActiveSampleObject();
        QCOMPARE(sample.getNumAngleCurves(), 6u);

        RainbowWidget widget;
        widget.show();
        QVERIFY(widget.topPainter());
        QVERIFY(!widget.bottomPainter());
        QVERIFY(!widget.scaleLabel()->pixmap(Qt::ReturnByValue).isNull());
        QCOMPARE(widget.topPainter()->geometry(), QRect(42, 52, 234, 118));
        QCOMPARE(widget.colorStrip()->colorPatches().size(), 6);

        // Mid-ring, on each tick, the ring shows that angle's colour.
        const QImage shot = widget.grab().toImage();
        for (int angle : kTop) {
            // The end colours stop at their tick: look a hair inside the arc.
            const double inward = angle == REFL_D45_110 ? 1.0 : angle == REFL_D45_NEG_15 ? -1.0 : 0.0;
            const QColor seen = shot.pixelColor(onRadius(angle, 104, inward));
            QVERIFY2(near(seen, sample.getColor(angle), 2),
                     qPrintable(QStringLiteral("%1 angle %2: %3 vs %4").arg(job).arg(angle)
                                    .arg(seen.name(), sample.getColor(angle).name())));
        }
        // Beyond the coloured arc the scale's track shows through.
        const QColor right = shot.pixelColor(onRadius(REFL_D45_110, 104) + QPoint(6, 20));
        QVERIFY(near(right, QColor(230, 231, 232), 3));
    }
}

void tst_Rainbow::otherCountsGiveOnlyTheStrip()
{
    // A job without readings: no sample, no angles.
    QVERIFY(!ResultsFixture::activate(QStringLiteral("Job 8")));
    RainbowWidget widget;
    QVERIFY(!widget.topPainter());
    QVERIFY(!widget.bottomPainter());
    QVERIFY(widget.scaleLabel()->pixmap(Qt::ReturnByValue).isNull());
    QVERIFY(widget.colorStrip()->colorPatches().isEmpty());
    QVERIFY(RainbowWidget::createTopRainbowGradient(QRect(0, 0, 10, 10)).stops().size() < 3);
}

void tst_Rainbow::scalePicturesHaveTicksOnTheStops()
{
    const QImage one(QStringLiteral(":/Assets/result_rainbow_15.png"));
    const QImage two(QStringLiteral(":/Assets/result_rainbow_45_15.png"));
    QCOMPARE(one.size(), QSize(320, 215));
    QCOMPARE(two.size(), QSize(320, 215));
    for (int angle : kTop) {
        for (const QImage* image : {&one, &two}) {
            QVERIFY2(isTick(*image, onRadius(angle, 124)), qPrintable(QString::number(angle)));
            // And nowhere else near it: a tick three degrees off is a fault.
            const QPoint c = RainbowWidget::ringCentre();
            for (double off : {-3.0, 3.0}) {
                const double t = qDegreesToRadians(RainbowWidget::stopAngle(angle) + off);
                const QPoint p(qFloor(c.x() + 124 * qCos(t)), qFloor(c.y() - 124 * qSin(t)));
                QVERIFY2(!isTick(*image, p), qPrintable(QString::number(angle)));
            }
        }
    }
    for (int angle : kBottom) {
        QVERIFY2(isTick(two, onRadius(angle, 59)), qPrintable(QString::number(angle)));
        QVERIFY(!isTick(one, onRadius(angle, 59)));
    }
}

void tst_Rainbow::gradientsStopAbruptly()
{
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job")));
    const QRect ring(42, 52, 234, 118);
    const QGradientStops stops = RainbowWidget::createTopRainbowGradient(ring).stops();
    QCOMPARE(stops.size(), 9);
    QCOMPARE(stops.first().second.alpha(), 0);
    QCOMPARE(stops.last().second.alpha(), 0);
    QVERIFY(stops[2].first - stops[1].first < 0.0001);
    QVERIFY(stops[8].first - stops[7].first < 0.0001);
    QCOMPARE(RainbowWidget::createTopRainbowGradient(ring).center(), QPointF(117, 117));
    // A 6-angle sample has no 15 degree ring.
    QVERIFY(RainbowWidget::createBottomRainbowGradient(ring).stops().size() < 3);
}

QTEST_MAIN(tst_Rainbow)
#include "tst_rainbow.moc"
