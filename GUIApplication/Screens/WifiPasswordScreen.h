#ifndef WIFIPASSWORDSCREEN_H
#define WIFIPASSWORDSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/XMLParser.h"

#include <QVector>

namespace Ui {
class WifiPasswordScreen;
}

class KeyPadLabel;
class QLabel;
class QLineEdit;
class XPushButton;

// The key of a Wi-Fi network, typed on the keypad of the "wifi" layout.
// The keys are labels placed by the layout file; the screen follows the
// finger itself, shows the key under it enlarged, and types the key under
// the finger when it lifts. Nothing is checked: an empty key can be sent.
class WifiPasswordScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit WifiPasswordScreen(QWidget* parent = nullptr);
    ~WifiPasswordScreen() override;

    void setNetworkName(const QString& ssid);
    QLineEdit* getTextEditPointer() const;
    // The labels of a layer: 0 capitals, 1 lower case, 2 and 3 the special page.
    QVector<KeyPadLabel*> layer(int index) const;
    int layerInForce() const;
    bool isShowingCaps() const { return m_displayCap; }
    bool isShowingSpecial() const { return m_displaySpecial; }
    XPushButton* specialButton() const { return BtnSpecial; }

signals:
    void PasswordEntered(QString password);

public slots:
    virtual void on_BtnBack_clicked();
    virtual void on_BtnNext_clicked();
    virtual void on_BtnDisplayPassword_toggled(bool shown);
    virtual void onKeyClicked(const QString& text);
    virtual void onDeleteClicked();
    virtual void onSpaceClicked();
    virtual void onShiftClicked();
    virtual void onSpecialClicked();
    virtual void onDisplayCaps(bool caps);
    virtual void onDisplaySpecial(bool special);
    virtual void onKeyPressed(QWidget* key);
    virtual void onKeyReleased();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void createKeypad();
    void updateKeypad();
    QWidget* createKeyPressedNotification(const QString& text);
    void retranslate();

    Ui::WifiPasswordScreen* ui;
    QVector<QVector<KeyPadLabel*>> m_keys;
    QWidget* m_keyPopup = nullptr;
    KeyPadLabel* m_currentKey = nullptr;
    XPushButton* BtnDelete = nullptr;
    XPushButton* BtnEnter = nullptr; // no multilingual entry for keys
    XPushButton* BtnSpace = nullptr;
    XPushButton* BtnShift = nullptr;
    XPushButton* BtnSpecial = nullptr;
    bool m_displayCap = true;
    bool m_displaySpecial = false;
    QString m_ssid;
};

#endif // WIFIPASSWORDSCREEN_H
