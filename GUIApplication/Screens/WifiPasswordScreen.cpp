#include "Screens/WifiPasswordScreen.h"

#include "ui_WifiPasswordScreen.h"

#include "GUIAPI/DataManager.h"
#include "Widgets/SettingsPage.h"
#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPainter>
#include <QPainterPath>

namespace {

const int kKeyFontSize = 20;
const int kFunctionKeyWidth = 52;
const int kSpaceWidth = 104;
const QString kFunctionKeyStyle = QStringLiteral(
    "QPushButton { color: rgb(0, 174, 239); border: none; background: transparent; }"
    "QPushButton:pressed { background: rgb(214, 241, 252); }"
    "QPushButton:disabled { color: rgb(190, 190, 190); }");

// The picture of a function key; drawn here when the resource is missing.
QIcon keyIcon(const QString& resource, const QSize& size, const std::function<void(QPainter&, const QRectF&)>& draw)
{
    QPixmap pixmap(resource);
    if (pixmap.isNull()) {
        pixmap = QPixmap(size);
        pixmap.fill(Qt::transparent);
        QPainter painter(&pixmap);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(Theme::Accent, 2.2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
        draw(painter, QRectF(QPointF(0, 0), QSizeF(size)).adjusted(6, 8, -6, -8));
    }
    return QIcon(pixmap);
}

} // namespace

WifiPasswordScreen::WifiPasswordScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::WifiPasswordScreen)
{
    ui->setupUi(this);
    ui->BtnBack->setIcon(SettingsPage::backButtonIcon());
    setObjectName(QStringLiteral("WifiPasswordScreen"));
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

QVector<KLabel*> WifiPasswordScreen::layer(int index) const
{
    return index >= 0 && index < m_keys.size() ? m_keys.at(index) : QVector<KLabel*>();
}

int WifiPasswordScreen::layerInForce() const
{
    if (m_displayCap)
        return m_displaySpecial ? 2 : 0;
    return m_displaySpecial ? 3 : 1;
}

XPushButton* WifiPasswordScreen::functionKey(const QString& name, const QRect& box)
{
    auto* key = new XPushButton(this);
    key->setObjectName(name);
    key->setGeometry(box);
    key->setFlat(true);
    key->setFocusPolicy(Qt::NoFocus);
    key->setAutoFillBackground(false);
    key->setFont(Theme::font(kKeyFontSize));
    key->setStyleSheet(kFunctionKeyStyle);
    key->show();
    return key;
}

void WifiPasswordScreen::createKeypad()
{
    KeypadArray keys;
    DataManager::instance()->loadKeypad(QStringLiteral("wifi"), keys);
    QPalette palette;
    palette.setColor(QPalette::Active, QPalette::WindowText, Theme::Accent);
    palette.setColor(QPalette::Inactive, QPalette::WindowText, Theme::Accent);
    palette.setColor(QPalette::Disabled, QPalette::WindowText, Theme::Disabled);
    m_keys = QVector<QVector<KLabel*>>(4);
    int functionRowY = 0;
    auto addLabel = [&](const KEYPAD_BUTTON_T& key, QChar character, int layerIndex) {
        auto* label = new KLabel(this);
        label->setText(QString(character));
        label->setGeometry(key.geometry);
        label->setFont(Theme::font(kKeyFontSize));
        label->setPalette(palette);
        label->setAlignment(Qt::AlignCenter);
        label->setAttribute(Qt::WA_TransparentForMouseEvents);
        label->raise();
        m_keys[layerIndex].append(label);
        functionRowY = qMax(functionRowY, key.geometry.top() + key.geometry.height() - 1);
    };
    for (const KEYPAD_BUTTON_T& key : keys) {
        if (!key.characterCap.isNull())
            addLabel(key, key.characterCap, key.special ? 2 : 0);
        if (!key.characterLow.isNull())
            addLabel(key, key.characterLow, key.special ? 3 : 1);
    }
    const bool hasSpecial = !m_keys[2].isEmpty() || !m_keys[3].isEmpty();
    const int spaceLeft = hasSpecial ? 134 : 108;
    BtnSpace = functionKey(QStringLiteral("BtnSpace"), QRect(spaceLeft, functionRowY, kSpaceWidth, 55));
    BtnSpace->setIcon(keyIcon(QStringLiteral(":/Assets/keyboard_space_key.png"), QSize(88, 44),
                              [](QPainter& p, const QRectF& r) {
                                  p.drawPolyline(QPolygonF({QPointF(r.left(), r.center().y()),
                                                            QPointF(r.left(), r.bottom()),
                                                            QPointF(r.right(), r.bottom()),
                                                            QPointF(r.right(), r.center().y())}));
                              }));
    BtnSpace->setIconSize(QSize(88, 44));
    BtnDelete = functionKey(QStringLiteral("BtnDelete"), QRect(spaceLeft + kSpaceWidth, functionRowY, kFunctionKeyWidth, 55));
    BtnDelete->setIcon(keyIcon(QStringLiteral(":/Assets/keyboard_back_key.png"), QSize(44, 44),
                               [](QPainter& p, const QRectF& r) {
                                   QPainterPath path;
                                   path.moveTo(r.left(), r.center().y());
                                   path.lineTo(r.left() + 9, r.top() + 4);
                                   path.lineTo(r.right(), r.top() + 4);
                                   path.lineTo(r.right(), r.bottom() - 4);
                                   path.lineTo(r.left() + 9, r.bottom() - 4);
                                   path.closeSubpath();
                                   p.drawPath(path);
                                   const QPointF c(r.center().x() + 4, r.center().y());
                                   p.drawLine(c + QPointF(-4, -4), c + QPointF(4, 4));
                                   p.drawLine(c + QPointF(-4, 4), c + QPointF(4, -4));
                               }));
    BtnDelete->setIconSize(QSize(44, 44));
    BtnShift = functionKey(QStringLiteral("BtnShift"), QRect(spaceLeft - kFunctionKeyWidth, functionRowY, kFunctionKeyWidth, 55));
    BtnShift->setIcon(keyIcon(QStringLiteral(":/Assets/keyboard_shift_key.png"), QSize(44, 44),
                              [](QPainter& p, const QRectF& r) {
                                  const qreal cx = r.center().x();
                                  p.drawPolygon(QPolygonF({QPointF(cx, r.top()), QPointF(r.right(), r.center().y()),
                                                           QPointF(cx + 5, r.center().y()), QPointF(cx + 5, r.bottom()),
                                                           QPointF(cx - 5, r.bottom()), QPointF(cx - 5, r.center().y()),
                                                           QPointF(r.left(), r.center().y())}));
                              }));
    BtnShift->setIconSize(QSize(44, 44));
    BtnSpecial = functionKey(QStringLiteral("BtnSpecial"), QRect(0, functionRowY, spaceLeft - kFunctionKeyWidth, 55));
    BtnSpecial->setVisible(hasSpecial);
    BtnSpecial->setEnabled(hasSpecial);

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
    const int shown = layerInForce();
    for (int i = 0; i < 4; ++i) {
        for (KLabel* label : m_keys[i]) {
            label->setVisible(i == shown);
            label->setEnabled(i == shown);
        }
    }
    if (BtnSpecial) {
        // A button reads "&" as the mark of a shortcut key.
        BtnSpecial->setText(QString(m_displaySpecial ? tr("ABC") : tr("@&*")).replace('&', QStringLiteral("&&")));
        BtnSpecial->setFont(Theme::font(Theme::FontHeadline, true));
    }
    if (BtnShift)
        // A latched shift shows as a tinted key.
        BtnShift->setStyleSheet(kFunctionKeyStyle
                                + (m_displayCap ? QStringLiteral("QPushButton { background: rgb(214, 241, 252); border-radius: 6px; }")
                                                : QString()));
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

KLabel* WifiPasswordScreen::keyAt(const QPoint& position) const
{
    for (KLabel* label : layer(layerInForce())) {
        if (label->isEnabled() && label->geometry().contains(position))
            return label;
    }
    return nullptr;
}

QWidget* WifiPasswordScreen::createKeyPressedNotification(const QString& text)
{
    auto* popup = new QLabel(text, this);
    popup->setObjectName(QStringLiteral("KeyNotification"));
    popup->resize(56, 80);
    popup->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
    popup->setContentsMargins(0, 8, 0, 0);
    popup->setFont(Theme::font(28, true));
    popup->setAttribute(Qt::WA_TransparentForMouseEvents);
    popup->setStyleSheet(QStringLiteral("color: white; background-color: rgb(0, 174, 239); border-radius: 10px;"));
    return popup;
}

void WifiPasswordScreen::onKeyPressed(QWidget* key)
{
    auto* label = qobject_cast<KLabel*>(key);
    if (!label || label == m_currentKey)
        return;
    if (m_keyPopup) {
        m_keyPopup->hide();
        m_keyPopup->deleteLater();
    }
    m_keyPopup = createKeyPressedNotification(label->text());
    const QPoint centre = label->geometry().center();
    // Above the finger, so that the key stays readable under it.
    m_keyPopup->move(centre.x() - m_keyPopup->width() / 2, centre.y() + 44 - m_keyPopup->height() - 40);
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
    if (KLabel* key = keyAt(event->pos()))
        onKeyPressed(key);
}

void WifiPasswordScreen::mouseMoveEvent(QMouseEvent* event)
{
    DaddyPanel::mouseMoveEvent(event);
    if (KLabel* key = keyAt(event->pos()))
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
