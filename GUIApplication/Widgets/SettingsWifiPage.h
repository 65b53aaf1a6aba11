#ifndef SETTINGSWIFIPAGE_H
#define SETTINGSWIFIPAGE_H

#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/SettingsPage.h"

#include <QTimer>
#include <QVector>

class QSignalMapper;
class SettingsListSelectionToggleItem;
class SpinnyCircle;
class WifiPasswordScreen;

// The instrument's Wi-Fi: the radio's switch, the present address, the
// known networks (which can be forgotten) and, while no DHCP connection
// stands, the networks in range to join. The radio, its scan and its list
// are the server's; the page shows DataManager's copy.
class SettingsWifiPage : public SettingsPage
{
    Q_OBJECT
public:
    static const int DebounceMs = 1500;
    static const int VerifyTries = 30;
    static const int VerifyIntervalMs = 1000;

    explicit SettingsWifiPage(QWidget* parent = nullptr);
    ~SettingsWifiPage() override;

    static QVector<NETWORK_DESCRIPTION_T> removeDuplicateNetworks(QVector<NETWORK_DESCRIPTION_T> list);
    static int convertToWifiState(float quality);
    // The radio's own address, read with the radio off too; empty if unknown.
    static QString readMacAddress();

    SettingsListSelectionToggleItem* toggleRow() const { return m_toggle; }
    SpinnyCircle* spinner() const { return m_spinnyCircle; }
    WifiPasswordScreen* passwordScreen() const { return m_pWifiPasswordScreen; }
    bool isDebounced() const { return m_bDebounced; }
    // For tests: how long the join waits between verifications.
    static void setVerifyIntervalMs(int ms);

signals:
    void loadWifiSettings();

public slots:
    void onUpdatePage() override;
    void init() override;
    void clearSignalMapper() override;
    void refreshSignalMapper() override;

    virtual void OnClosePasswordEntry(QWidget* screen);
    virtual void onWifiStateChanged(WIFI_STATUS_T state);
    virtual void onCreateToggleButton();
    virtual void onCreatePage();
    virtual void onCreateSpinner();
    virtual void onUpdateToggleState(bool on);
    virtual void onUpdateWifiList();
    virtual void onCheckedStateChanged(bool on);
    virtual void onRemoveSSID(const QString& ssid);
    virtual void onUnknownNetworkClicked(QWidget* row);
    virtual void onDebounceTimeut();
    virtual void OnPasswordEntryComplete(const QString& password);
    virtual void onCloseNotification();

protected:
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    void clearList();
    void triggerScan();
    void showSpinner(bool show);
    WIFI_STATUS_T wifiState() const;
    void closePasswordScreen();
    void markLastRow();

    SpinnyCircle* m_spinnyCircle = nullptr;
    bool m_bDebounced = true;
    QTimer m_debounceTimer;
    QSignalMapper* m_signalMapperDelete = nullptr;
    QSignalMapper* m_signalMapperClickedUnknown = nullptr;
    NETWORK_DESCRIPTION_T m_networkDescriptionBuffer;
    WifiPasswordScreen* m_pWifiPasswordScreen = nullptr;
    SettingsListSelectionToggleItem* m_toggle = nullptr;
    // A join is waiting for its verification: list rebuilds wait for it.
    bool m_joining = false;
};

#endif // SETTINGSWIFIPAGE_H
