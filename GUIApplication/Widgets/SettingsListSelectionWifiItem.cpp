#include "Widgets/SettingsListSelectionWifiItem.h"

#include "Widgets/KLabel.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/Theme.h"
#include "Widgets/XPushButton.h"

#include <QLabel>

SettingsListSelectionWifiItem::SettingsListSelectionWifiItem(QWidget* parent)
    : FlickButton(parent)
{
    resize(Theme::ScreenWidth, SettingsRows::TallRowHeight);
    setBackground(QStringLiteral(":/Assets/cell_85px.png"));

    m_labelIcon = new QLabel(this);
    m_labelIcon->setGeometry(14, 22, 40, 40);
    m_labelIcon->setAlignment(Qt::AlignCenter);
    m_labelIcon->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_labelIcon->setStyleSheet(QStringLiteral("background: transparent;"));

    m_labelSetting = new KLabel(this);
    m_labelSetting->setGeometry(64, 14, 190, 32);
    m_labelSetting->setFont(Theme::font(Theme::FontHeadline, true));
    m_labelSetting->setAutoSize(true);
    m_labelSetting->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_labelSetting->setStyleSheet(QStringLiteral("color: %1; background: transparent;").arg(Theme::css(Theme::TextBody)));

    m_labelStatus = new KLabel(this);
    m_labelStatus->setGeometry(64, 46, 190, 24);
    m_labelStatus->setFont(Theme::font(Theme::FontBody));
    m_labelStatus->setAutoSize(true);
    m_labelStatus->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_labelStatus->setStyleSheet(
        QStringLiteral("color: %1; background: transparent;").arg(Theme::css(Theme::TextSecondary)));

    // Smaller drawn mark, full-size touch target.
    m_btnDelete = new XPushButton(this);
    m_btnDelete->setObjectName(QStringLiteral("BtnDelete"));
    m_btnDelete->setGeometry(258, 18, 50, 50);
    m_btnDelete->setFocusPolicy(Qt::NoFocus);
    m_btnDelete->setIcon(QIcon(QStringLiteral(":/Assets/delete_icon.png")));
    m_btnDelete->setIconSize(QSize(30, 30));
    m_btnDelete->setStyleSheet(QStringLiteral("QPushButton { background: transparent; border: none; }"));
    m_btnDelete->hide();
    connect(m_btnDelete, &QPushButton::clicked, this, &SettingsListSelectionWifiItem::deleteClicked);
}

QString SettingsListSelectionWifiItem::iconForLevel(int level)
{
    switch (level) {
    case WIFI_LEVEL_0: return QStringLiteral(":/Assets/settings_wifi_icon.png");
    case WIFI_LEVEL_1: return QStringLiteral(":/Assets/settings_wifi_1bar.png");
    case WIFI_LEVEL_2: return QStringLiteral(":/Assets/settings_wifi_2bar.png");
    case WIFI_LEVEL_3: return QStringLiteral(":/Assets/settings_wifi_3bar.png");
    default: return QString();
    }
}

void SettingsListSelectionWifiItem::setWifiState(int level)
{
    m_level = level;
    setBtnIcon(iconForLevel(level));
}

void SettingsListSelectionWifiItem::showWifiIcon(bool show)
{
    m_labelIcon->setVisible(show);
}

bool SettingsListSelectionWifiItem::isWifiIconShown() const
{
    return !m_labelIcon->isHidden();
}

void SettingsListSelectionWifiItem::showDeleteIcon(bool show)
{
    m_btnDelete->setVisible(show);
}

bool SettingsListSelectionWifiItem::isDeleteIconShown() const
{
    return !m_btnDelete->isHidden();
}

void SettingsListSelectionWifiItem::setBtnIcon(const QString& resource)
{
    m_labelIcon->setPixmap(resource.isEmpty() ? QPixmap() : QPixmap(resource));
}

void SettingsListSelectionWifiItem::setBtnSettingText(const QString& text)
{
    m_labelSetting->setText(text);
}

void SettingsListSelectionWifiItem::setBtnStatusText(const QString& text)
{
    m_labelStatus->setText(text);
}

QString SettingsListSelectionWifiItem::getBtnSettingText() const
{
    return m_labelSetting->defaultText();
}

QString SettingsListSelectionWifiItem::getBtnStatusText() const
{
    return m_labelStatus->defaultText();
}

void SettingsListSelectionWifiItem::setClickable(bool clickable)
{
    m_clickable = clickable;
    if (clickable)
        setPressedBackground(QStringLiteral(":/Assets/cell_85px_hit.png"));
    else
        clearPressedBackground();
}

void SettingsListSelectionWifiItem::setNetworkDescription(const NETWORK_DESCRIPTION_T& description)
{
    m_NetworkDescription = description;
}

void SettingsListSelectionWifiItem::sendClick()
{
    if (m_clickable)
        FlickButton::sendClick();
}
