#ifndef SETTINGSLISTSELECTIONWIFIITEM_H
#define SETTINGSLISTSELECTIONWIFIITEM_H

#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/FlickButton.h"

class KLabel;
class QLabel;
class XPushButton;

// One network of the Wi-Fi page: its name, its security, the signal bars
// while the radio is on, and for a known network the button to forget it.
class SettingsListSelectionWifiItem : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionWifiItem(QWidget* parent = nullptr);

    void setWifiState(int level);
    int wifiState() const { return m_level; }
    void showWifiIcon(bool show);
    void showDeleteIcon(bool show);
    bool isDeleteIconShown() const;
    bool isWifiIconShown() const;
    void setBtnIcon(const QString& resource);
    void setBtnSettingText(const QString& text);
    void setBtnStatusText(const QString& text);
    QString getBtnSettingText() const;
    QString getBtnStatusText() const;
    void setClickable(bool clickable);
    bool isClickable() const { return m_clickable; }
    void setNetworkDescription(const NETWORK_DESCRIPTION_T& description);
    NETWORK_DESCRIPTION_T getNetworkDescription() const { return m_NetworkDescription; }
    XPushButton* deleteButton() const { return m_btnDelete; }

    // The picture of a signal level; empty for anything but 0 to 3.
    static QString iconForLevel(int level);

signals:
    void deleteClicked();

public slots:
    void sendClick() override;

private:
    NETWORK_DESCRIPTION_T m_NetworkDescription;
    bool m_clickable = false;
    int m_level = WIFI_LEVEL_NOT_CONNECTED;
    QLabel* m_labelIcon;
    KLabel* m_labelSetting;
    KLabel* m_labelStatus;
    XPushButton* m_btnDelete;
};

#endif // SETTINGSLISTSELECTIONWIFIITEM_H
