#include "Widgets/SettingsPowerPage.h"

#include "Commands/SystemOutCommands.h"
#include "Screens/DeletePopup.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"

#include <QDebug>
#include <QLabel>
#include <QEvent>
#include <QSignalMapper>

SettingsPowerPage::SettingsPowerPage(QWidget* parent)
    : SettingsPage(tr("Power"), QStringLiteral(":/Assets/settings_shutdown_icon.png"), parent)
{
    onCreatePage();
}

SettingsPowerPage::~SettingsPowerPage()
{
    // The popup lives on the screen; it must not outlive the page it calls.
    if (m_popup)
        emit closePopup(m_popup);
}

void SettingsPowerPage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsPowerPage::onPowerOptionSelected);
    const QList<QPair<QString, POWER_T>> rows {{tr("Power Off"), POWER_SHUTDOWN}, {tr("Reboot"), POWER_REBOOT}};
    for (const auto& entry : rows) {
        auto* row = new SettingsListSelectionItem;
        row->setBtnIcon(QString());
        row->setBtnSettingText(entry.first);
        row->showArrow(false);
        getSettingsList()->addWidget(row);
        connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
        m_signalMapper->setMapping(row, int(entry.second));
    }
    if (auto* last = qobject_cast<FlickButton*>(getSettingsList()->getWidget(getSettingsList()->count() - 1)))
        last->setLastInList(true);
}

void SettingsPowerPage::onPowerOptionSelected(int option)
{
    playSoundButtonClick();
    m_currentPower = POWER_T(option);
    QString title;
    QString text;
    switch (m_currentPower) {
    case POWER_SHUTDOWN:
        title = tr("Shutdown Instrument?");
        text = tr("Are you sure you want to shutdown the instrument?");
        break;
    case POWER_STANDBY:
        title = tr("Enter Standby Mode?");
        text = tr("Are you sure you want to put the instrument into standby mode?");
        break;
    case POWER_REBOOT:
        title = tr("Reboot Instrument?");
        text = tr("Are you sure you want to reboot the instrument?");
        break;
    default:
        return;
    }
    if (m_popup)
        emit closePopup(m_popup);
    m_popup = new DeletePopup(window());
    m_popup->setObjectName(QStringLiteral("PowerConfirmPopup"));
    // A question about power, not about deleting: the warning mark.
    if (auto* icon = m_popup->findChild<QLabel*>(QStringLiteral("labelIcon")))
        icon->setPixmap(QPixmap(QStringLiteral(":/Assets/alert_popup_red_icon.png")));
    m_popup->setHeaderText(title);
    m_popup->setMessageText(text);
    m_popup->setConfirmButtonText(tr("Yes"));
    m_popup->setCancelButtonText(tr("No"));
    connect(m_popup, &DeletePopup::confirmClicked, this, &SettingsPowerPage::onPopupConfirmed);
    connect(m_popup, &DeletePopup::cancelClicked, this, &SettingsPowerPage::onPopupCanceled);
    connect(m_popup, &PopupPanel::closePopup, this, &SettingsPowerPage::onPopupCanceled);
    connect(m_popup, &QObject::destroyed, this, [this]() { m_popup = nullptr; });
    emit displayPopup(m_popup);
}

void SettingsPowerPage::onPopupConfirmed()
{
    const STATUS_T status = CmdOut_PowerOffReset(m_currentPower);
    if (status != 0)
        qDebug().noquote() << QString("Power page: power action %1 refused, status %2").arg(m_currentPower).arg(status);
    onPopupCanceled();
}

void SettingsPowerPage::onPopupCanceled()
{
    if (!m_popup)
        return;
    PopupPanel* popup = m_popup;
    m_popup = nullptr;
    disconnect(popup, nullptr, this, nullptr);
    emit closePopup(popup);
}

void SettingsPowerPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("Power"));
        onCreatePage();
    }
}
