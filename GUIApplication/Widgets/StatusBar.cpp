#include "Widgets/StatusBar.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Utils/ConversionHelper.h"
#include "Widgets/Theme.h"

#include <QLabel>
#include <QStringList>
#include <QStyle>
#include <QVariant>

namespace {

QString rules(const QString& pattern, const QStringList& values)
{
    QString sheet;
    for (const QString& value : values)
        sheet += pattern.arg(value);
    return sheet;
}

QString wifiRules()
{
    return QString("[wifiEnabled=\"%1\"] {image: url(:/Assets/wifi_not_connected.png);}").arg(0)
        + QString("[wifiEnabled=\"%1\"] {image: url(:/Assets/wifi_1bar.png);}").arg(1)
        + QString("[wifiEnabled=\"%1\"] {image: url(:/Assets/wifi_2bar.png);}").arg(2)
        + QString("[wifiEnabled=\"%1\"] {image: url(:/Assets/wifi_3bar.png);}").arg(3);
}

QString calibrationRules()
{
    return QString("[calValid=\"%1\"]    {image: url(:/Assets/calibrate_needed_icon.png);}").arg("false")
        + QString("[calValid=\"%1\"]    {image: url(:/Assets/calibrate_status_icon.png);}").arg("true");
}

QString batteryRules()
{
    QString sheet;
    for (int level : {10, 25, 50, 75, 100})
        sheet += QString("[battery=\"%1\"]     {image: url(:/Assets/battery_%2.png);}").arg(level).arg(level);
    // Charging over AC or USB; full shows the full battery; empty, missing
    // and faulty show that no battery can be trusted.
    sheet += rules("[battery=\"%1\"]     {image: url(:/Assets/battery_charging.png);}", {"0", "1"});
    sheet += QString("[battery=\"%1\"]     {image: url(:/Assets/battery_100.png);}").arg(2);
    sheet += rules("[battery=\"%1\"]     {image: url(:/Assets/battery_not_present.png);}", {"3", "4", "5"});
    return sheet;
}

} // namespace

void Ui::StatusBar::setupUi(QWidget* bar)
{
    bar->resize(Theme::ScreenWidth, ::StatusBar::Height);
    labelBackground = new QLabel(bar);
    labelBackground->setObjectName("labelBackground");
    labelBackground->setGeometry(0, 0, Theme::ScreenWidth, ::StatusBar::Height);
    labelBackground->setStyleSheet("background-image: url(:/Assets/status_bar.png);");

    labelTime = new QLabel(bar);
    labelTime->setObjectName("labelTime");
    labelTime->setGeometry(10, 0, 120, ::StatusBar::Height);
    labelTime->setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    labelTime->setFont(Theme::font(Theme::FontSmall + 1, true));
    labelTime->setStyleSheet(QString("color: %1; background: transparent;").arg(Theme::css(Theme::TextOnDark)));

    labelCalibration = new QLabel(bar);
    labelCalibration->setObjectName("labelCalibration");
    labelCalibration->setGeometry(222, 0, 24, ::StatusBar::Height);

    labelWifi = new QLabel(bar);
    labelWifi->setObjectName("labelWifi");
    labelWifi->setGeometry(252, 0, 24, ::StatusBar::Height);

    labelBattery = new QLabel(bar);
    labelBattery->setObjectName("labelBattery");
    labelBattery->setGeometry(282, 0, 30, ::StatusBar::Height);

    // The bar is one button: its parts only draw.
    for (QLabel* label : {labelBackground, labelTime, labelCalibration, labelWifi, labelBattery})
        label->setAttribute(Qt::WA_TransparentForMouseEvents);
}

StatusBar::StatusBar(QWidget* parent)
    : XPushButton(parent)
    , ui(new Ui::StatusBar)
{
    setObjectName("StatusBar");
    ui->setupUi(this);
    setFocusPolicy(Qt::NoFocus);
    setFlat(true);
    setStyleSheet("QPushButton { border: none; background: transparent; }");
    ui->labelWifi->setStyleSheet(wifiRules());
    ui->labelCalibration->setStyleSheet(calibrationRules());
    ui->labelBattery->setStyleSheet(batteryRules());

    onUpdateCalValid(false);
    onSystemStatusUpdated(DataManager::instance()->getSystemStatus());
    connect(API_SignalMaster::instance(), &API_SignalMaster::StatusUpdated, this,
            &StatusBar::onSystemStatusUpdated);
}

StatusBar::~StatusBar()
{
    delete ui;
}

void StatusBar::updateWidget(QWidget* widget, const char* property, const QVariant& value)
{
    widget->setProperty(property, value);
    widget->style()->unpolish(widget);
    widget->style()->polish(widget);
    widget->update();
}

void StatusBar::setStatusBarToTop()
{
    for (QLabel* label : {ui->labelBattery, ui->labelCalibration, ui->labelTime, ui->labelWifi,
                          ui->labelBackground})
        label->move(label->x(), 0);
}

void StatusBar::onSystemStatusUpdated(const SystemStatus& status)
{
    onUpdateSystemTime(status.getSystemTime());
    onUpdateBattery(status.getBatteryState(), status.getBatteryChargePercent());
    onUpdateWifi(status.getWifiState(), status.getWifiLevel());
    onUpdateCalValid(status.getCalState().nextExternalWhiteCal > 0);
}

void StatusBar::onUpdateSystemTime(const QDateTime& time)
{
    ui->labelTime->setText(convertDateTimeToStatusBarString(time));
}

int StatusBar::wifiBars(int level)
{
    if (level < 34)
        return 1;
    if (level < 67)
        return 2;
    // Levels above 100 are out of the server's range; they show full bars.
    return 3;
}

int StatusBar::batteryLevel(int percent)
{
    if (percent > 100)
        return 5; // a reading no battery gives: shown as not present
    if (percent <= 10)
        return 10;
    if (percent <= 25)
        return 25;
    if (percent <= 50)
        return 50;
    if (percent <= 75)
        return 75;
    return 100;
}

void StatusBar::onUpdateWifi(WIFI_STATUS_T state, int level)
{
    if (state == WIFI_STATUS_CONNECTED) {
        // The state is deliberately not stored here: after a loss of the
        // link the icon comes back only when the bar count changes.
        const int bars = wifiBars(level);
        if (bars != m_currentWifiLevel) {
            updateWidget(ui->labelWifi, "wifiEnabled", bars);
            m_currentWifiLevel = bars;
        }
        return;
    }
    if (state != m_currentWifiState) {
        // Off shows nothing; on without a network shows the crossed fan.
        updateWidget(ui->labelWifi, "wifiEnabled", state == WIFI_STATUS_OFF ? -1 : 0);
        m_currentWifiState = state;
    }
}

void StatusBar::onUpdateBattery(BATTERY_STATUS_T state, int percent)
{
    if (state == BATTERY_DISCHARGING) {
        const int level = batteryLevel(percent);
        if (level != m_currentBatteryLevel) {
            updateWidget(ui->labelBattery, "battery", level);
            m_currentBatteryLevel = level;
        }
        m_currentBatteryState = state;
        return;
    }
    if (state != m_currentBatteryState) {
        updateWidget(ui->labelBattery, "battery", int(state));
        m_currentBatteryState = state;
    }
    // The next discharging reading must refresh the icon.
    m_currentBatteryLevel = -1;
}

void StatusBar::onUpdateCalValid(bool valid)
{
    if (valid == m_currentCalValid)
        return;
    updateWidget(ui->labelCalibration, "calValid", valid);
    m_currentCalValid = valid;
}
