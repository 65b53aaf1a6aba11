// The measuring circle: how progress becomes a clockwise sweep.

#include "Widgets/ProgressBarCircle.h"
#include "Widgets/ProgressBarCirclePainter.h"
#include "Widgets/SpinnyCircle.h"

#include <QLabel>
#include <QSignalSpy>
#include <QtTest>

class tst_MeasuringPopup : public QObject
{
    Q_OBJECT
private slots:
    void sweepFollowsValue_data();
    void sweepFollowsValue();
    void painterClampsAngle();
    void emptyRangeKeepsSweep();
    void innerDiameterScalesWithWidth();
    void spinnersShareOneAngle();
};

void tst_MeasuringPopup::sweepFollowsValue_data()
{
    QTest::addColumn<int>("min");
    QTest::addColumn<int>("max");
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("angle");
    QTest::newRow("start") << 0 << 100 << 0 << 0;
    QTest::newRow("half") << 0 << 100 << 50 << 180;
    QTest::newRow("truncated") << 0 << 100 << 33 << 118; // 118.8 cut, not rounded
    QTest::newRow("full") << 0 << 100 << 100 << 360;
    QTest::newRow("past the end") << 0 << 100 << 250 << 360;
    QTest::newRow("below the start") << 0 << 100 << -40 << 0;
    QTest::newRow("offset range") << 50 << 150 << 75 << 90;
    QTest::newRow("far out of int range") << 0 << 1 << 2000000000 << 360;
}

void tst_MeasuringPopup::sweepFollowsValue()
{
    QFETCH(int, min);
    QFETCH(int, max);
    QFETCH(int, value);
    QFETCH(int, angle);
    ProgressBarCircle circle;
    circle.setRange(min, max);
    QSignalSpy changed(&circle, &ProgressBarCircle::valueChanged);
    circle.setValue(value);
    QCOMPARE(circle.value(), value);
    QCOMPARE(circle.sweepAngle(), angle);
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().toInt(), value);
}

void tst_MeasuringPopup::painterClampsAngle()
{
    ProgressBarCirclePainter painter;
    painter.setAngle(361);
    QCOMPARE(painter.spanAngle(), -360 * 16);
    painter.setAngle(360);
    QCOMPARE(painter.spanAngle(), -360 * 16);
    painter.setAngle(-1);
    QCOMPARE(painter.spanAngle(), 0);
    painter.setAngle(90);
    QCOMPARE(painter.spanAngle(), -90 * 16); // negative: clockwise from twelve
    QCOMPARE(painter.brushImage(), QStringLiteral(":/Assets/measuring_green_circle.png"));
}

void tst_MeasuringPopup::emptyRangeKeepsSweep()
{
    ProgressBarCircle circle;
    circle.setValue(50);
    circle.setRange(10, 10);
    circle.setValue(70);
    QCOMPARE(circle.value(), 70);
    QCOMPARE(circle.sweepAngle(), 180);
}

void tst_MeasuringPopup::innerDiameterScalesWithWidth()
{
    ProgressBarCircle circle;
    circle.resize(190, 190);
    QCOMPARE(circle.getCircleInnerDiameterInPixels(), 140);
    circle.resize(269, 269);
    QCOMPARE(circle.getCircleInnerDiameterInPixels(), 198);
}

void tst_MeasuringPopup::spinnersShareOneAngle()
{
    QWidget screen;
    SpinnyCircle first(&screen);
    SpinnyCircle second(40, &screen);
    QCOMPARE(first.size(), QSize(60, 60));
    QCOMPARE(first.timeToTurn(), 250);
    QCOMPARE(second.timeToTurn(), 40);
    QVERIFY(!first.isTurning());
    screen.show();
    QVERIFY(first.isTurning());

    const int start = SpinnyCircle::sharedAngle();
    first.onTimeout();
    second.onTimeout();
    // Each tick moves the one shared angle: two spinners, two steps.
    QCOMPARE(SpinnyCircle::sharedAngle(), (start + 120) % 360);
    for (int i = 0; i < 4; ++i)
        first.onTimeout();
    QCOMPARE(SpinnyCircle::sharedAngle(), start);

    // The turned picture stays centred on the widget.
    QLabel* picture = first.findChild<QLabel*>(QStringLiteral("labelSpinner"));
    QVERIFY(picture);
    QVERIFY(qAbs(picture->geometry().center().x() - 30) <= 1);
    QVERIFY(qAbs(picture->geometry().center().y() - 30) <= 1);

    screen.hide();
    QVERIFY(!first.isTurning());
    QVERIFY(!second.isTurning());
}

QTEST_MAIN(tst_MeasuringPopup)
#include "tst_measuringpopup.moc"
