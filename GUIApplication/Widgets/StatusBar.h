#ifndef STATUSBAR_H
#define STATUSBAR_H

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"
#include "Widgets/XPushButton.h"

#include <QDateTime>

class QLabel;

namespace Ui {
struct StatusBar
{
    QLabel* labelBackground = nullptr;
    QLabel* labelCalibration = nullptr;
    QLabel* labelWifi = nullptr;
    QLabel* labelBattery = nullptr;
    QLabel* labelTime = nullptr;
    void setupUi(QWidget* bar);
};
} // namespace Ui

// The strip at the top of every main screen: calibration, Wi-Fi, battery
// and the instrument's time. Icons follow dynamic properties through style
// sheet rules; every value is cached so that a repeated status snapshot
// repaints nothing. The whole bar is a button that opens the settings.
class StatusBar : public XPushButton
{
    Q_OBJECT
public:
    static const int Height = 24;

    explicit StatusBar(QWidget* parent = nullptr);
    ~StatusBar() override;

    void setStatusBarToTop();

    // Sets a property and makes the style sheet look at it again.
    static void updateWidget(QWidget* widget, const char* property, const QVariant& value);

    // The Wi-Fi bars for a level of a connected radio.
    static int wifiBars(int level);
    // The battery picture level for a charge while discharging.
    static int batteryLevel(int percent);

public slots:
    void onSystemStatusUpdated(const SystemStatus& status);
    void onUpdateSystemTime(const QDateTime& time);
    void onUpdateBattery(BATTERY_STATUS_T state, int percent);
    void onUpdateWifi(WIFI_STATUS_T state, int level);
    void onUpdateCalValid(bool valid);

private:
    Ui::StatusBar* ui;
    WIFI_STATUS_T m_currentWifiState = NUM_OF_WIFI_STATUS_TYPES;
    bool m_currentCalValid = true;
    int m_currentBatteryLevel = -1;
    int m_currentWifiLevel = -1;
    BATTERY_STATUS_T m_currentBatteryState = NUM_OF_BATTERY_STATUS;
};

#endif // STATUSBAR_H
