#include "Screens/WifiPasswordScreen.h"

#include "ui_WifiPasswordScreen.h"

#include "GUIAPI/DataManager.h"
#include "Screens/JobKeypadScreen.h"
#include "Widgets/SettingsPage.h"
#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLineEdit>
#include <QMouseEvent>
#include <QStyle>

WifiPasswordScreen::WifiPasswordScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::WifiPasswordScreen)
{
    ui->setupUi(this);
    ui->BtnBack->setIcon(SettingsPage::backButtonIcon());
    setObjectName(QStringLiteral("WifiPasswordScreen"));
    Theme::keepBetweenHeaderDividers(ui->TxtTitle);
    ui->TxtTitle->setAutoSize(true);
    ui->BtnDisplayPassword->setIcon(QIcon(QStringLiteral(":/Assets/eye_close.png")));
    createKeypad();
    retranslate();
    ui->textEdit->setFocus();
}

WifiPasswordScreen::~WifiPasswordScreen()
{
    delete ui;
}

void WifiPasswordScreen::setNetworkName(const QString& ssid)
{
    m_ssid = ssid;
    retranslate();
}

void WifiPasswordScreen::retranslate()
{
    ui->TxtTitle->setText(tr("Password"));
    ui->textEdit->setPlaceholderText(m_ssid);
    updateKeypad();
}

QLineEdit* WifiPasswordScreen::getTextEditPointer() const
{
    return ui->textEdit;
}

QVector<KeyPadLabel*> WifiPasswordScreen::layer(int index) const
{
    return index >= 0 && index < m_keys.size() ? m_keys.at(index) : QVector<KeyPadLabel*>();
}

int WifiPasswordScreen::layerInForce() const
{
    return KeypadLayout::layerOf(m_displayCap, m_displaySpecial);
}

void WifiPasswordScreen::createKeypad()
{
    // The password keypad has its own layout, whatever the language.
    KeypadArray keys;
    DataManager::instance()->loadKeypad(QStringLiteral("wifi"), keys);
    const int rowY = KeypadLayout::createKeyLabels(this, keys, m_keys);
    const bool hasSpecial = KeypadLayout::hasSpecialPage(m_keys);

    BtnSpace = KeypadLayout::createFunctionKey(this, QStringLiteral("BtnSpace"));
    BtnSpace->setGeometry(hasSpecial ? 134 : 108, rowY, 104, 55);
    BtnSpace->setIcon(QIcon(QStringLiteral(":/Assets/keyboard_space_key.png")));
    BtnSpace->setIconSize(QSize(88, 44));

    BtnDelete = KeypadLayout::createFunctionKey(this, QStringLiteral("BtnDelete"));
    BtnDelete->setGeometry(BtnSpace->geometry().right(), rowY, 52, 55);
    BtnDelete->setIcon(QIcon(QStringLiteral(":/Assets/keyboard_back_key.png")));
    BtnDelete->setIconSize(QSize(44, 44));
    BtnDelete->setAutoRepeat(true);
    BtnDelete->setAutoRepeatDelay(500);
    BtnDelete->setAutoRepeatInterval(90);

    BtnShift = KeypadLayout::createFunctionKey(this, QStringLiteral("BtnShift"));
    BtnShift->setGeometry(BtnSpace->x() - 52, rowY, 52, 55);
    BtnShift->setIcon(QIcon(QStringLiteral(":/Assets/keyboard_shift_key.png")));
    BtnShift->setIconSize(QSize(44, 44));

    BtnSpecial = KeypadLayout::createFunctionKey(this, QStringLiteral("BtnSpecial"));
    BtnSpecial->setGeometry(0, rowY, BtnShift->x(), 55);
    BtnSpecial->setVisible(hasSpecial);
    BtnSpecial->setEnabled(hasSpecial);

    for (XPushButton* button : {BtnSpace, BtnDelete, BtnShift, BtnSpecial})
        button->raise();
    connect(BtnSpace, &QPushButton::clicked, this, &WifiPasswordScreen::onSpaceClicked);
    connect(BtnDelete, &QPushButton::clicked, this, &WifiPasswordScreen::onDeleteClicked);
    connect(BtnShift, &QPushButton::clicked, this, &WifiPasswordScreen::onShiftClicked);
    connect(BtnSpecial, &QPushButton::clicked, this, &WifiPasswordScreen::onSpecialClicked);
    updateKeypad();
}

void WifiPasswordScreen::updateKeypad()
{
    if (m_keys.size() != 4)
        return;
    KeypadLayout::showLayer(m_keys, layerInForce());
    if (BtnShift) {
        // The latch shows as the keypad shows it.
        BtnShift->setProperty("selected", m_displayCap);
        BtnShift->style()->unpolish(BtnShift);
        BtnShift->style()->polish(BtnShift);
    }
    if (BtnSpecial) {
        // A button reads "&" as the mark of a shortcut key.
        KeypadLayout::fitText(BtnSpecial,
                              QString(m_displaySpecial ? tr("ABC") : tr("@&*")).replace('&', QStringLiteral("&&")));
    }
}

void WifiPasswordScreen::onDisplayCaps(bool caps)
{
    m_displayCap = caps;
    updateKeypad();
}

void WifiPasswordScreen::onDisplaySpecial(bool special)
{
    m_displaySpecial = special;
    updateKeypad();
}

void WifiPasswordScreen::onShiftClicked()
{
    onDisplayCaps(!m_displayCap);
}

void WifiPasswordScreen::onSpecialClicked()
{
    onDisplaySpecial(!m_displaySpecial);
}

QWidget* WifiPasswordScreen::createKeyPressedNotification(const QString& text)
{
    return new KeypadNotification(text, this);
}

void WifiPasswordScreen::onKeyPressed(QWidget* key)
{
    auto* label = qobject_cast<KeyPadLabel*>(key);
    if (!label || label == m_currentKey)
        return;
    if (m_keyPopup) {
        m_keyPopup->hide();
        m_keyPopup->deleteLater();
    }
    m_keyPopup = createKeyPressedNotification(label->text());
    m_keyPopup->move(KeypadLayout::notificationPlace(label, m_keyPopup->size()));
    m_keyPopup->raise();
    m_keyPopup->show();
    m_currentKey = label;
}

void WifiPasswordScreen::onKeyReleased()
{
    if (m_keyPopup) {
        m_keyPopup->hide();
        m_keyPopup->deleteLater();
        m_keyPopup = nullptr;
    }
    m_currentKey = nullptr;
}

void WifiPasswordScreen::mousePressEvent(QMouseEvent* event)
{
    DaddyPanel::mousePressEvent(event);
    if (KeyPadLabel* key = KeypadLayout::keyAt(m_keys, layerInForce(), event->pos()))
        onKeyPressed(key);
}

void WifiPasswordScreen::mouseMoveEvent(QMouseEvent* event)
{
    DaddyPanel::mouseMoveEvent(event);
    if (KeyPadLabel* key = KeypadLayout::keyAt(m_keys, layerInForce(), event->pos()))
        onKeyPressed(key);
    else
        onKeyReleased();
}

void WifiPasswordScreen::mouseReleaseEvent(QMouseEvent* event)
{
    DaddyPanel::mouseReleaseEvent(event);
    if (m_currentKey)
        onKeyClicked(m_currentKey->text());
    onKeyReleased();
}

void WifiPasswordScreen::onKeyClicked(const QString& text)
{
    ui->textEdit->insert(text);
    ui->textEdit->setFocus();
}

void WifiPasswordScreen::onSpaceClicked()
{
    onKeyClicked(QStringLiteral(" "));
}

void WifiPasswordScreen::onDeleteClicked()
{
    ui->textEdit->backspace();
    ui->textEdit->setFocus();
}

void WifiPasswordScreen::on_BtnDisplayPassword_toggled(bool shown)
{
    ui->textEdit->setEchoMode(shown ? QLineEdit::Normal : QLineEdit::Password);
    ui->BtnDisplayPassword->setIcon(
        QIcon(shown ? QStringLiteral(":/Assets/eye_open.png") : QStringLiteral(":/Assets/eye_close.png")));
}

void WifiPasswordScreen::on_BtnNext_clicked()
{
    playSoundButtonClick();
    emit PasswordEntered(ui->textEdit->text());
    CloseScreen();
}

void WifiPasswordScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    CloseScreen();
}

void WifiPasswordScreen::changeEvent(QEvent* event)
{
    DaddyPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
