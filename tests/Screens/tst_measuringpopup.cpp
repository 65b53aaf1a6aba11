// The measuring popup and its circle: how progress becomes a clockwise
// sweep, which steps animate, the states, and the branding picture.

#include "Screens/MeasuringPopup.h"
#include "Widgets/ProgressBarCircle.h"
#include "Widgets/ProgressBarCirclePainter.h"
#include "Widgets/SpinnyCircle.h"

#include "support/TestSupport.h"

#include <QImage>
#include <QKeyEvent>
#include <QLabel>
#include <QSignalSpy>
#include <QtTest>

namespace {

ProgressBarCircle* circleOf(MeasuringPopup& popup)
{
    return popup.findChild<ProgressBarCircle*>(QStringLiteral("progressBarCircle"));
}

QLabel* labelOf(MeasuringPopup& popup, const char* name)
{
    return popup.findChild<QLabel*>(QLatin1String(name));
}

QString pictureOf(int w, int h)
{
    const QString file = TestSupport::makeTempDir(QStringLiteral("branding"))
        + QStringLiteral("/brand_%1x%2.png").arg(w).arg(h);
    QImage image(w, h, QImage::Format_ARGB32);
    image.fill(QColor(28, 117, 188));
    image.save(file);
    return file;
}

} // namespace

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

    void endPointsJump_data();
    void endPointsJump();
    void stepAnimatesFromShownValue();
    void newStepRestartsFromValueReached();
    void statesFollowTheInstrument();
    void averagingStateChangesNothing();
    void otherStatesClose_data();
    void otherStatesClose();
    void serviceKeyCloses();
    void brandingPictureIsScaled_data();
    void brandingPictureIsScaled();
    void brandingThatDoesNotLoadKeepsDefault();
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

void tst_MeasuringPopup::endPointsJump_data()
{
    QTest::addColumn<int>("percent");
    QTest::newRow("minimum") << 0;
    QTest::newRow("maximum") << 100;
}

void tst_MeasuringPopup::endPointsJump()
{
    QFETCH(int, percent);
    MeasuringPopup popup;
    ProgressBarCircle* circle = circleOf(popup);
    popup.onUpdatePercentComplete(40);
    popup.onUpdatePercentComplete(percent);
    QCOMPARE(circle->value(), percent);
    QCOMPARE(circle->sweepAngle(), percent * 360 / 100);
    // ... and the stopped animation does not pull it back later.
    QTest::qWait(350);
    QCOMPARE(circle->value(), percent);
}

void tst_MeasuringPopup::stepAnimatesFromShownValue()
{
    MeasuringPopup popup;
    ProgressBarCircle* circle = circleOf(popup);
    QElapsedTimer clock;
    clock.start();
    popup.onUpdatePercentComplete(50);
    QVERIFY(circle->value() < 50);
    QTRY_COMPARE_WITH_TIMEOUT(circle->value(), 50, 2000);
    QVERIFY2(clock.elapsed() >= 250, "the step took its 300 ms");
    QCOMPARE(circle->sweepAngle(), 180);
}

void tst_MeasuringPopup::newStepRestartsFromValueReached()
{
    MeasuringPopup popup;
    ProgressBarCircle* circle = circleOf(popup);
    popup.onUpdatePercentComplete(80);
    QTRY_VERIFY(circle->value() >= 20);
    popup.onUpdatePercentComplete(90);
    const int reached = circle->value();
    QVERIFY(reached > 0 && reached < 80);
    QTest::qWait(30);
    QVERIFY(circle->value() >= reached); // no jump back to zero
    QTRY_COMPARE_WITH_TIMEOUT(circle->value(), 90, 2000);
}

void tst_MeasuringPopup::statesFollowTheInstrument()
{
    MeasuringPopup popup;
    ProgressBarCircle* circle = circleOf(popup);
    QCOMPARE(popup.objectName(), QStringLiteral("MeasuringPopup"));
    QCOMPARE(circle->minimum(), 0);
    QCOMPARE(circle->maximum(), 100);
    QCOMPARE(labelOf(popup, "labelText")->text(), QStringLiteral("Measuring"));
    QCOMPARE(circle->foregroundImage(), QStringLiteral(":/Assets/measuring_red_circle.png"));
    QVERIFY(!labelOf(popup, "labelSubText")->isHidden());
    QVERIFY(!labelOf(popup, "labelBracket")->isHidden());
    QVERIFY(labelOf(popup, "labelWarningSubText")->isHidden());
    QVERIFY(labelOf(popup, "labelCheckMark")->isHidden());

    popup.onUpdatePercentComplete(100);
    popup.onUpdateSystemState(STATE_CALCULATING);
    QCOMPARE(circle->value(), 0);
    QCOMPARE(labelOf(popup, "labelText")->text(), QStringLiteral("Calculating"));
    QCOMPARE(labelOf(popup, "labelSubText")->text(), QStringLiteral("OK to move instrument"));
    QCOMPARE(circle->foregroundImage(), QStringLiteral(":/Assets/measuring_green_circle.png"));

    QSignalSpy closed(&popup, &PopupPanel::closePopup);
    popup.onUpdateSystemState(STATE_MEASURING);
    popup.onUpdateSystemState(STATE_CALIBRATING);
    QCOMPARE(labelOf(popup, "labelText")->text(), QStringLiteral("Measuring"));
    // Measuring sets only the title: the sub text keeps what calculating put there.
    QCOMPARE(labelOf(popup, "labelSubText")->text(), QStringLiteral("OK to move instrument"));
    QCOMPARE(closed.count(), 0);

    // Before the instrument starts: no "hold steady", the title as it was.
    popup.onUpdatePercentComplete(100);
    popup.setState(STATE_POPUP_INIT);
    QCOMPARE(circle->value(), 0);
    QVERIFY(labelOf(popup, "labelSubText")->isHidden());
    QVERIFY(labelOf(popup, "labelBracket")->isHidden());
    QCOMPARE(labelOf(popup, "labelText")->text(), QStringLiteral("Measuring"));
    QCOMPARE(circle->foregroundImage(), QStringLiteral(":/Assets/measuring_red_circle.png"));
}

void tst_MeasuringPopup::averagingStateChangesNothing()
{
    MeasuringPopup popup;
    ProgressBarCircle* circle = circleOf(popup);
    popup.onUpdatePercentComplete(100);
    QSignalSpy closed(&popup, &PopupPanel::closePopup);
    popup.setState(STATE_POPUP_AVG);
    popup.setState(NUM_OF_POPUP_STATES);
    QCOMPARE(circle->value(), 100);
    QCOMPARE(labelOf(popup, "labelText")->text(), QStringLiteral("Measuring"));
    QCOMPARE(closed.count(), 0);
}

void tst_MeasuringPopup::otherStatesClose_data()
{
    QTest::addColumn<int>("state");
    QTest::newRow("init") << int(STATE_INIT);
    QTest::newRow("targeting") << int(STATE_TARGETING);
    QTest::newRow("lock") << int(STATE_LOCK);
    QTest::newRow("busy") << int(STATE_BUSY);
}

void tst_MeasuringPopup::otherStatesClose()
{
    QFETCH(int, state);
    MeasuringPopup popup;
    QSignalSpy closed(&popup, &PopupPanel::closePopup);
    popup.onUpdateSystemState(SYSTEM_STATE_T(state));
    QCOMPARE(closed.count(), 1);
    QCOMPARE(closed.first().first().value<PopupPanel*>(), static_cast<PopupPanel*>(&popup));
}

void tst_MeasuringPopup::serviceKeyCloses()
{
    MeasuringPopup popup;
    QSignalSpy closed(&popup, &PopupPanel::closePopup);
    QKeyEvent other(QEvent::KeyPress, Qt::Key_E, Qt::NoModifier);
    QApplication::sendEvent(&popup, &other);
    QCOMPARE(closed.count(), 0);
    QKeyEvent service(QEvent::KeyPress, Qt::Key_D, Qt::NoModifier);
    QApplication::sendEvent(&popup, &service);
    QCOMPARE(closed.count(), 1);
}

void tst_MeasuringPopup::brandingPictureIsScaled_data()
{
    QTest::addColumn<QSize>("picture");
    QTest::addColumn<QSize>("shown");
    QTest::addColumn<int>("circleSide");
    // Side 140: diagonal 198 against an inner disc of 140, so the circle grows.
    QTest::newRow("wide") << QSize(200, 100) << QSize(140, 70) << 269;
    QTest::newRow("tall") << QSize(100, 200) << QSize(70, 140) << 269;
    QTest::newRow("square at the limit") << QSize(140, 140) << QSize(140, 140) << 269;
    // Side 90: diagonal 127 fits the disc; nothing moves.
    QTest::newRow("small") << QSize(90, 60) << QSize(90, 60) << 190;
}

void tst_MeasuringPopup::brandingPictureIsScaled()
{
    QFETCH(QSize, picture);
    QFETCH(QSize, shown);
    QFETCH(int, circleSide);

    MeasuringPopup plain;
    const QRect plainCircle = circleOf(plain)->geometry();
    const QPoint plainText = labelOf(plain, "labelText")->pos();
    const QPoint plainSub = labelOf(plain, "labelSubText")->pos();

    MeasuringPopup popup(pictureOf(picture.width(), picture.height()));
    QLabel* brand = popup.findChild<QLabel*>(QStringLiteral("labelBrandingImage"));
    QVERIFY(brand);
    QVERIFY(!brand->isHidden());
    QCOMPARE(brand->size(), shown);
    QCOMPARE(brand->geometry().center(), plainCircle.center());

    const QRect circle = circleOf(popup)->geometry();
    QCOMPARE(circle.width(), circleSide);
    QCOMPARE(circle.height(), circleSide);
    QCOMPARE(circle.center(), plainCircle.center());
    const int shift = plainCircle.top() - circle.top() - 20;
    if (circleSide == 190)
        QCOMPARE(circle, plainCircle);
    QCOMPARE(labelOf(popup, "labelText")->pos(), plainText - QPoint(0, circleSide == 190 ? 0 : shift));
    QCOMPARE(labelOf(popup, "labelSubText")->pos(), plainSub + QPoint(0, circleSide == 190 ? 0 : shift));
}

void tst_MeasuringPopup::brandingThatDoesNotLoadKeepsDefault()
{
    MeasuringPopup missing(QStringLiteral("/opt/GUI/Branding/"));
    QVERIFY(!missing.findChild<QLabel*>(QStringLiteral("labelBrandingImage")));
    QCOMPARE(circleOf(missing)->size(), QSize(190, 190));
    MeasuringPopup empty(QString(), nullptr);
    QVERIFY(!empty.findChild<QLabel*>(QStringLiteral("labelBrandingImage")));
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
