// The settings building blocks that need no instrument: the slider rows and
// their "Never" end, the confirmation circle's gesture, the Wi-Fi list's
// duplicate and signal rules, the power-saving conversions, the checkable
// and toggle rows, and the page stack's slides.

#include "Screens/PopupPanel.h"
#include "Widgets/ConfirmationCircleWidget.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsListSelectionWifiItem.h"
#include "Widgets/SettingsNavigator.h"
#include "Widgets/SettingsPage.h"
#include "Widgets/SettingsPowerOptionsPage.h"
#include "Widgets/SettingsSliderItems.h"
#include "Widgets/SettingsWifiPage.h"

#include <QLabel>
#include <QPointer>
#include <QSignalSpy>
#include <QSlider>
#include <QStyle>
#include <QStyleOptionSlider>
#include <QtTest>

namespace {

NETWORK_DESCRIPTION_T network(const QString& ssid, bool connected, const QString& mac = QString())
{
    NETWORK_DESCRIPTION_T n;
    n.SSID = ssid;
    n.Connected = connected;
    n.MAC = mac;
    return n;
}

QPoint handleCentre(QSlider* slider)
{
    QStyleOptionSlider option;
    option.initFrom(slider);
    option.orientation = slider->orientation();
    option.minimum = slider->minimum();
    option.maximum = slider->maximum();
    option.sliderPosition = slider->sliderPosition();
    option.sliderValue = slider->value();
    option.rect = slider->rect();
    return slider->style()->subControlRect(QStyle::CC_Slider, &option, QStyle::SC_SliderHandle, slider).center();
}

// The circle is driven through its window, as the touch screen drives it:
// moves then carry the held button.
void press(ConfirmationCircleWidget& c, const QPoint& p)
{
    QTest::mousePress(c.windowHandle(), Qt::LeftButton, Qt::NoModifier, p);
}

void move(ConfirmationCircleWidget& c, const QPoint& p)
{
    QTest::mouseMove(c.windowHandle(), p);
}

void release(ConfirmationCircleWidget& c, const QPoint& p)
{
    QTest::mouseRelease(c.windowHandle(), Qt::LeftButton, Qt::NoModifier, p);
}

void showCircle(ConfirmationCircleWidget& c)
{
    c.show();
    QVERIFY(QTest::qWaitForWindowExposed(&c));
}

} // namespace

class tst_SettingsWidgets : public QObject
{
    Q_OBJECT

private slots:
    void sliderNeverEndEmptiesTheField();
    void sliderDragShowsAtOnceAndReportsOnRelease();
    void sliderStepsReportAtOnce();

    void circleConfirmsAFullClockwiseTurn();
    void circleIgnoresPressBesideTheDot();
    void circleRefusesBackwardsStartAndJumps();
    void circleReleaseAwayFromHomeResets();
    void circleFreezesOffTheRing();

    void duplicateNetworksKeepTheConnectedOne_data();
    void duplicateNetworksKeepTheConnectedOne();
    void qualityThresholds_data();
    void qualityThresholds();
    void wifiRowLevelIcons();

    void powerSavingPositionsAndSeconds();
    void checkableRowInvertsItselfOnClick();
    void toggleRowClickWorksTheSwitch();
    void timeTextInWords();

    void navigatorSlidesPagesInAndOut();
};

void tst_SettingsWidgets::sliderNeverEndEmptiesTheField()
{
    SettingsListSelectionCompressedSliderItem slider;
    slider.allowNever(true);
    slider.setMinValue(10);
    slider.setMaxValue(120);
    slider.setValue(60);
    QCOMPARE(slider.entryText(), QStringLiteral("60"));
    QCOMPARE(slider.maxText(), QStringLiteral("Never"));
    QCOMPARE(slider.minText(), QStringLiteral("10"));

    slider.setValue(120);
    QCOMPARE(slider.entryText(), QString());
    QVERIFY(slider.findChild<QLabel*>(QStringLiteral("labelEntryField"))->styleSheet().contains("rgb(28, 117, 188)"));

    // Without "Never" the end is a number like any other.
    slider.allowNever(false);
    QCOMPARE(slider.maxText(), QStringLiteral("120"));
    QCOMPARE(slider.entryText(), QStringLiteral("120"));
    QVERIFY(slider.findChild<QLabel*>(QStringLiteral("labelEntryField"))->styleSheet().contains("rgb(109, 110, 113)"));
}

void tst_SettingsWidgets::sliderDragShowsAtOnceAndReportsOnRelease()
{
    SettingsListSelectionSliderItem item;
    item.setMinValue(1);
    item.setMaxValue(100);
    item.setValue(50);
    item.show();
    QVERIFY(QTest::qWaitForWindowExposed(&item));
    QSignalSpy changed(&item, &SettingsListSelectionSliderItem::sliderChanged);

    QSlider* slider = item.slider();
    const QPoint start = handleCentre(slider);
    QTest::mousePress(slider, Qt::LeftButton, Qt::NoModifier, start);
    QMouseEvent move(QEvent::MouseMove, start + QPoint(60, 0), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(slider, &move);
    const int dragged = slider->value();
    QVERIFY(dragged > 50);
    // The number follows the finger, nothing is reported yet.
    QCOMPARE(item.entryText(), QString::number(dragged));
    QCOMPARE(changed.count(), 0);

    QTest::mouseRelease(slider, Qt::LeftButton, Qt::NoModifier, start + QPoint(60, 0));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.at(0).at(0).toInt(), dragged);
}

void tst_SettingsWidgets::sliderStepsReportAtOnce()
{
    SettingsListSelectionSliderItem item;
    item.setMinValue(0);
    item.setMaxValue(100);
    item.setPageStep(10);
    item.setValue(40);
    QSignalSpy changed(&item, &SettingsListSelectionSliderItem::sliderChanged);
    item.slider()->triggerAction(QAbstractSlider::SliderPageStepAdd);
    item.slider()->triggerAction(QAbstractSlider::SliderSingleStepSub);
    QCOMPARE(changed.count(), 2);
    QCOMPARE(changed.at(0).at(0).toInt(), 50);
    QCOMPARE(changed.at(1).at(0).toInt(), 49);
    QCOMPARE(item.getValue(), 49);
    // Moving the slider from code is no decision of the user's.
    item.setValue(70);
    QCOMPARE(changed.count(), 2);
}

void tst_SettingsWidgets::circleConfirmsAFullClockwiseTurn()
{
    ConfirmationCircleWidget circle;
    showCircle(circle);
    QSignalSpy confirmed(&circle, &ConfirmationCircleWidget::confirmed);
    const QRect home = circle.dotGeometry();

    press(circle, home.center());
    QCOMPARE(circle.state(), CONFIRMATION_STATE_STARTING);
    for (int angle = 10; angle <= 80; angle += 10)
        move(circle, circle.trackPoint(angle));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_STARTING);
    QCOMPARE(circle.confirmationAngle(), 80);
    move(circle, circle.trackPoint(150));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_CONTEMPLATING);
    // Back into the first quarter undoes the decision to go on.
    move(circle, circle.trackPoint(60));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_STARTING);
    move(circle, circle.trackPoint(200));
    move(circle, circle.trackPoint(280));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_DECIDED);
    QCOMPARE(circle.confirmationAngle(), 280);
    // Back into the lower half: not decided any more.
    move(circle, circle.trackPoint(200));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_CONTEMPLATING);
    move(circle, circle.trackPoint(300));
    move(circle, circle.trackPoint(350));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_DECIDED);
    // Past the top the dot snaps home with the ring full.
    move(circle, circle.trackPoint(20));
    QCOMPARE(circle.dotGeometry(), home);
    QCOMPARE(circle.confirmationAngle(), 360);
    QCOMPARE(confirmed.count(), 0);

    release(circle, circle.trackPoint(20));
    QCOMPARE(confirmed.count(), 1);
    QCOMPARE(circle.state(), CONFIRMATION_STATE_IDLE);
    QVERIFY(!circle.isDragging());
}

void tst_SettingsWidgets::circleIgnoresPressBesideTheDot()
{
    ConfirmationCircleWidget circle;
    showCircle(circle);
    QSignalSpy confirmed(&circle, &ConfirmationCircleWidget::confirmed);
    // On the ring, but not on the dot.
    press(circle, circle.trackPoint(90));
    QVERIFY(!circle.isDragging());
    QCOMPARE(circle.state(), CONFIRMATION_STATE_IDLE);
    for (int angle = 100; angle <= 350; angle += 25)
        move(circle, circle.trackPoint(angle));
    QCOMPARE(circle.confirmationAngle(), 0);
    release(circle, circle.trackPoint(0));
    QCOMPARE(confirmed.count(), 0);
}

void tst_SettingsWidgets::circleRefusesBackwardsStartAndJumps()
{
    ConfirmationCircleWidget circle;
    showCircle(circle);
    QSignalSpy confirmed(&circle, &ConfirmationCircleWidget::confirmed);
    const QRect home = circle.dotGeometry();

    // Anticlockwise over the top: the dot does not follow.
    press(circle, home.center());
    move(circle, circle.trackPoint(330));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_STARTING);
    QCOMPARE(circle.dotGeometry(), home);
    QCOMPARE(circle.confirmationAngle(), 0);
    release(circle, home.center());
    QCOMPARE(confirmed.count(), 0);

    // A jump from the first quarter straight to the last is refused as well.
    press(circle, home.center());
    move(circle, circle.trackPoint(40));
    move(circle, circle.trackPoint(300));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_STARTING);
    QCOMPARE(circle.confirmationAngle(), 40);
    release(circle, circle.trackPoint(40));
    QCOMPARE(confirmed.count(), 0);
    QCOMPARE(circle.confirmationAngle(), 0);
    QCOMPARE(circle.dotGeometry(), home);
}

void tst_SettingsWidgets::circleReleaseAwayFromHomeResets()
{
    ConfirmationCircleWidget circle;
    showCircle(circle);
    QSignalSpy confirmed(&circle, &ConfirmationCircleWidget::confirmed);
    const QRect home = circle.dotGeometry();
    press(circle, home.center());
    for (int angle : {45, 135, 225, 300})
        move(circle, circle.trackPoint(angle));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_DECIDED);
    QVERIFY(!circle.dotGeometry().intersects(circle.confirmationArea()));
    release(circle, circle.trackPoint(300));
    QCOMPARE(confirmed.count(), 0);
    QCOMPARE(circle.dotGeometry(), home);
    QCOMPARE(circle.confirmationAngle(), 0);
    QCOMPARE(circle.state(), CONFIRMATION_STATE_IDLE);

    // Let go near the top, the dot touching its home: confirmed.
    press(circle, home.center());
    for (int angle : {45, 135, 225, 300, 345})
        move(circle, circle.trackPoint(angle));
    QVERIFY(circle.dotGeometry().intersects(circle.confirmationArea()));
    release(circle, circle.trackPoint(345));
    QCOMPARE(confirmed.count(), 1);
    QCOMPARE(circle.confirmationAngle(), 360);
}

void tst_SettingsWidgets::circleFreezesOffTheRing()
{
    ConfirmationCircleWidget circle;
    showCircle(circle);
    press(circle, circle.dotGeometry().center());
    move(circle, circle.trackPoint(60));
    const QRect dot = circle.dotGeometry();
    // The centre and far outside are off the ring.
    move(circle, circle.circleCentre());
    move(circle, circle.circleCentre() + QPoint(0, 79));
    QCOMPARE(circle.dotGeometry(), dot);
    QCOMPARE(circle.confirmationAngle(), 60);
    // Back on the ring, it follows again.
    move(circle, circle.trackPoint(120));
    QCOMPARE(circle.state(), CONFIRMATION_STATE_CONTEMPLATING);
}

void tst_SettingsWidgets::duplicateNetworksKeepTheConnectedOne_data()
{
    QTest::addColumn<QVector<NETWORK_DESCRIPTION_T>>("input");
    QTest::addColumn<QStringList>("macs");
    QTest::newRow("connected copy second") << QVector<NETWORK_DESCRIPTION_T> {network("Shop", false, "a"), network("Shop", true, "b")}
                                           << QStringList {"b"};
    QTest::newRow("connected copy first") << QVector<NETWORK_DESCRIPTION_T> {network("Shop", true, "a"), network("Shop", false, "b")}
                                          << QStringList {"a"};
    QTest::newRow("two unconnected keep the first")
        << QVector<NETWORK_DESCRIPTION_T> {network("Shop", false, "a"), network("Office", false, "x"), network("Shop", false, "b")}
        << QStringList {"a", "x"};
    QTest::newRow("three copies, middle connected")
        << QVector<NETWORK_DESCRIPTION_T> {network("Shop", false, "a"), network("Shop", true, "b"), network("Shop", false, "c")}
        << QStringList {"b"};
    QTest::newRow("distinct names untouched")
        << QVector<NETWORK_DESCRIPTION_T> {network("A", false, "a"), network("B", true, "b")} << QStringList {"a", "b"};
    QTest::newRow("empty") << QVector<NETWORK_DESCRIPTION_T>() << QStringList();
}

void tst_SettingsWidgets::duplicateNetworksKeepTheConnectedOne()
{
    QFETCH(QVector<NETWORK_DESCRIPTION_T>, input);
    QFETCH(QStringList, macs);
    QStringList got;
    for (const NETWORK_DESCRIPTION_T& n : SettingsWifiPage::removeDuplicateNetworks(input))
        got << n.MAC;
    QCOMPARE(got, macs);
}

void tst_SettingsWidgets::qualityThresholds_data()
{
    QTest::addColumn<float>("quality");
    QTest::addColumn<int>("level");
    QTest::newRow("0.66 is two bars") << 0.66f << 2;
    QTest::newRow("just above 0.66") << 0.661f << 3;
    QTest::newRow("0.33 is one bar") << 0.33f << 1;
    QTest::newRow("0.05 is none") << 0.05f << 0;
    QTest::newRow("just above 0.05") << 0.051f << 1;
    QTest::newRow("nothing") << 0.0f << 0;
    QTest::newRow("full") << 1.0f << 3;
}

void tst_SettingsWidgets::qualityThresholds()
{
    QFETCH(float, quality);
    QFETCH(int, level);
    QCOMPARE(SettingsWifiPage::convertToWifiState(quality), level);
}

void tst_SettingsWidgets::wifiRowLevelIcons()
{
    QCOMPARE(SettingsListSelectionWifiItem::iconForLevel(0), QStringLiteral(":/Assets/settings_wifi_icon.png"));
    QCOMPARE(SettingsListSelectionWifiItem::iconForLevel(3), QStringLiteral(":/Assets/settings_wifi_3bar.png"));
    // The value the page uses with the radio off clears the picture.
    QCOMPARE(SettingsListSelectionWifiItem::iconForLevel(5), QString());
    SettingsListSelectionWifiItem row;
    QSignalSpy clicked(&row, &QPushButton::clicked);
    row.sendClick();
    QCOMPARE(clicked.count(), 0);
    row.setClickable(true);
    row.sendClick();
    QCOMPARE(clicked.count(), 1);
}

void tst_SettingsWidgets::powerSavingPositionsAndSeconds()
{
    // Stored seconds to the slider: 0 and anything from the never limit on
    // sit at the end.
    QCOMPARE(SettingsPowerOptionsPage::dimmerPosition(0), 120);
    QCOMPARE(SettingsPowerOptionsPage::dimmerPosition(120), 120);
    QCOMPARE(SettingsPowerOptionsPage::dimmerPosition(119), 119);
    QCOMPARE(SettingsPowerOptionsPage::dimmerPosition(30), 30);
    QCOMPARE(SettingsPowerOptionsPage::minutesPosition(0), 120);
    QCOMPARE(SettingsPowerOptionsPage::minutesPosition(7200), 120);
    QCOMPARE(SettingsPowerOptionsPage::minutesPosition(7199), 119);
    QCOMPARE(SettingsPowerOptionsPage::minutesPosition(1800), 30);
    // And back: the end stores 0, meaning never.
    QCOMPARE(SettingsPowerOptionsPage::dimmerSeconds(120), 0);
    QCOMPARE(SettingsPowerOptionsPage::dimmerSeconds(45), 45);
    QCOMPARE(SettingsPowerOptionsPage::minutesSeconds(120), 0);
    QCOMPARE(SettingsPowerOptionsPage::minutesSeconds(5), 300);
}

void tst_SettingsWidgets::checkableRowInvertsItselfOnClick()
{
    SettingsListSelectionCheckableItem row;
    QSignalSpy clicked(&row, &QPushButton::clicked);
    row.setChecked(true);
    row.sendClick();
    QVERIFY(!row.getChecked());
    row.sendClick();
    QVERIFY(row.getChecked());
    QCOMPARE(clicked.count(), 2);
}

void tst_SettingsWidgets::toggleRowClickWorksTheSwitch()
{
    SettingsListSelectionToggleItem row;
    QSignalSpy changed(&row, &SettingsListSelectionToggleItem::checkedStateChanged);
    row.setButtonChecked(false);
    row.sendClick();
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.at(0).at(0).toBool(), true);
    // A disabled switch ignores the row as well.
    row.setEnabled(false);
    row.sendClick();
    QCOMPARE(changed.count(), 1);
}

void tst_SettingsWidgets::timeTextInWords()
{
    QCOMPARE(SettingsListSelectionPowerInfo::beautifyTimeText(45), QStringLiteral("45 seconds"));
    QCOMPARE(SettingsListSelectionPowerInfo::beautifyTimeText(125), QStringLiteral("2 minutes and 5 seconds"));
    QCOMPARE(SettingsListSelectionPowerInfo::beautifyTimeText(3600), QStringLiteral("1 hour 0 minutes and 0 seconds"));
    QCOMPARE(SettingsListSelectionPowerInfo::beautifyTimeText(7322), QStringLiteral("2 hours 2 minutes and 2 seconds"));
    QCOMPARE(SettingsListSelectionPowerInfo::beautifyTimeText(-5), QStringLiteral("0 seconds"));
}

void tst_SettingsWidgets::navigatorSlidesPagesInAndOut()
{
    SettingsNavigator navigator;
    navigator.resize(320, 456);
    navigator.show();
    auto* first = new SettingsPage(QStringLiteral("First"));
    navigator.setFirstPage(first);
    QCOMPARE(first->objectName(), QStringLiteral("SettingsFirstPage"));
    QCOMPARE(navigator.pageCount(), 1);
    // Back with one page does nothing.
    navigator.onPreviousPage();
    QCOMPARE(navigator.pageCount(), 1);

    auto* second = new SettingsPage(QStringLiteral("Second"));
    first->gotoNextPage(second);
    QCOMPARE(navigator.pageCount(), 2);
    QVERIFY(!first->getSettingsList()->isEnabled());
    QTRY_VERIFY(!navigator.isAnimating());
    QVERIFY(first->isHidden());
    QCOMPARE(second->geometry().topLeft(), QPoint(0, 0));

    QPointer<SettingsPage> gone(second);
    QTest::mouseClick(second->findChild<QPushButton*>(QStringLiteral("BtnBack")), Qt::LeftButton);
    QVERIFY(first->isVisible());
    QTRY_VERIFY(gone.isNull());
    QCOMPARE(navigator.pageCount(), 1);
    QVERIFY(first->getSettingsList()->isEnabled());
    QCOMPARE(first->geometry().topLeft(), QPoint(0, 0));
}

QTEST_MAIN(tst_SettingsWidgets)
#include "tst_settingswidgets.moc"
