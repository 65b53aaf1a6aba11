// The status bar: thresholds of the battery and Wi-Fi pictures, the cached
// values that keep a repeated snapshot from repainting, and the deliberate
// asymmetries of the cache.

#include "GUIAPI/API_SignalMaster.h"
#include "Widgets/StatusBar.h"

#include <QLabel>
#include <QtTest>

namespace {

QVariant prop(StatusBar& bar, const char* label, const char* property)
{
    return bar.findChild<QLabel*>(label)->property(property);
}

SystemStatus snapshot(BATTERY_STATUS_T battery, int percent, WIFI_STATUS_T wifi, int level,
                      int nextCal)
{
    SystemStatus status;
    status.setBatteryState(battery);
    status.setBatteryChargePercent(percent);
    status.setWifiState(wifi);
    status.setWifiLevel(level);
    CALIBRATION_STATE_T cal;
    cal.nextExternalWhiteCal = nextCal;
    status.setCalState(cal);
    status.setSystemTime(QDateTime(QDate(2020, 2, 1), QTime(14, 5, 9)));
    return status;
}

} // namespace

class TestStatusBar : public QObject
{
    Q_OBJECT

private slots:
    void batteryThresholds_data()
    {
        QTest::addColumn<int>("percent");
        QTest::addColumn<int>("picture");
        QTest::newRow("0") << 0 << 10;
        QTest::newRow("10") << 10 << 10;
        QTest::newRow("11") << 11 << 25;
        QTest::newRow("25") << 25 << 25;
        QTest::newRow("26") << 26 << 50;
        QTest::newRow("75") << 75 << 75;
        QTest::newRow("76") << 76 << 100;
        QTest::newRow("100") << 100 << 100;
        QTest::newRow("beyond") << 101 << 5;
    }

    void batteryThresholds()
    {
        QFETCH(int, percent);
        QFETCH(int, picture);
        StatusBar bar;
        bar.onUpdateBattery(BATTERY_DISCHARGING, percent);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), picture);
    }

    void wifiThresholds_data()
    {
        QTest::addColumn<int>("level");
        QTest::addColumn<int>("bars");
        QTest::newRow("0") << 0 << 1;
        QTest::newRow("33") << 33 << 1;
        QTest::newRow("34") << 34 << 2;
        QTest::newRow("66") << 66 << 2;
        QTest::newRow("67") << 67 << 3;
        QTest::newRow("100") << 100 << 3;
    }

    void wifiThresholds()
    {
        QFETCH(int, level);
        QFETCH(int, bars);
        StatusBar bar;
        bar.onUpdateWifi(WIFI_STATUS_CONNECTED, level);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), bars);
    }

    void aRepeatedSnapshotRepaintsNothing()
    {
        StatusBar bar;
        const SystemStatus status = snapshot(BATTERY_DISCHARGING, 60, WIFI_STATUS_CONNECTED, 80, 3600);
        bar.onSystemStatusUpdated(status);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), 75);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 3);
        QCOMPARE(prop(bar, "labelCalibration", "calValid").toBool(), true);

        // Marks that only a repaint would overwrite.
        bar.findChild<QLabel*>("labelWifi")->setProperty("wifiEnabled", "untouched");
        bar.findChild<QLabel*>("labelBattery")->setProperty("battery", "untouched");
        bar.findChild<QLabel*>("labelCalibration")->setProperty("calValid", "untouched");
        bar.onSystemStatusUpdated(status);
        QCOMPARE(prop(bar, "labelBattery", "battery").toString(), QString("untouched"));
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toString(), QString("untouched"));
        QCOMPARE(prop(bar, "labelCalibration", "calValid").toString(), QString("untouched"));
    }

    void dischargingAfterChargingRepaintsAtTheSamePercent()
    {
        StatusBar bar;
        bar.onUpdateBattery(BATTERY_DISCHARGING, 50);
        bar.onUpdateBattery(BATTERY_STATUS_CHARGING_USB, 50);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), 1);
        bar.onUpdateBattery(BATTERY_DISCHARGING, 50);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), 50);

        bar.onUpdateBattery(BATTERY_STATUS_FULL, 100);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), 2);
        bar.onUpdateBattery(BATTERY_STATUS_MISSING, 0);
        QCOMPARE(prop(bar, "labelBattery", "battery").toInt(), 4);
    }

    void wifiComesBackOnlyWhenTheBarsChange()
    {
        StatusBar bar; // starts from the cleared status: radio off
        bar.onUpdateWifi(WIFI_STATUS_CONNECTED, 50);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 2);
        bar.onUpdateWifi(WIFI_STATUS_ON_NO_CONNECTION, 0);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 0);
        bar.onUpdateWifi(WIFI_STATUS_CONNECTED, 50);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 0); // kept on purpose
        bar.onUpdateWifi(WIFI_STATUS_CONNECTED, 90);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 3);
        bar.onUpdateWifi(WIFI_STATUS_OFF, 0);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), -1);
        // The connected branch never stores the state, so "off" again
        // after a connection is not news.
        bar.onUpdateWifi(WIFI_STATUS_CONNECTED, 10);
        bar.onUpdateWifi(WIFI_STATUS_OFF, 0);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 1);
    }

    void calibrationStartsInvalidAndFollowsTheNextCalibration()
    {
        StatusBar bar;
        bar.onSystemStatusUpdated(snapshot(BATTERY_DISCHARGING, 60, WIFI_STATUS_OFF, 0, 0));
        QCOMPARE(prop(bar, "labelCalibration", "calValid").toBool(), false);
        bar.onSystemStatusUpdated(snapshot(BATTERY_DISCHARGING, 60, WIFI_STATUS_OFF, 0, 1));
        QCOMPARE(prop(bar, "labelCalibration", "calValid").toBool(), true);
    }

    void theHubDrivesTheBarAndTheTimeHasNoSeconds()
    {
        StatusBar bar;
        API_SignalMaster::instance()->emitStatusUpdated(
            snapshot(BATTERY_DISCHARGING, 9, WIFI_STATUS_CONNECTED, 20, 10));
        QTRY_COMPARE(prop(bar, "labelBattery", "battery").toInt(), 10);
        QCOMPARE(prop(bar, "labelWifi", "wifiEnabled").toInt(), 1);
        QCOMPARE(bar.findChild<QLabel*>("labelTime")->text(), QString("2:05pm"));
    }

    void thePicturesAreDrawn()
    {
        StatusBar bar;
        bar.onSystemStatusUpdated(snapshot(BATTERY_DISCHARGING, 9, WIFI_STATUS_CONNECTED, 90, 10));
        const QImage image = bar.grab().toImage();
        QCOMPARE(image.size(), QSize(320, 24));
        // The low battery is drawn in red inside its outline.
        bool red = false;
        for (int x = 282; x < 312 && !red; ++x)
            for (int y = 0; y < 24 && !red; ++y) {
                const QColor c = image.pixelColor(x, y);
                red = c.red() > 200 && c.green() < 100;
            }
        QVERIFY(red);

        bar.setStatusBarToTop();
        QCOMPARE(bar.findChild<QLabel*>("labelBattery")->y(), 0);
    }
};

QTEST_MAIN(TestStatusBar)
#include "tst_statusbar.moc"
