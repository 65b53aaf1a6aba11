#include "Widgets/SettingsWifiPage.h"

#include "Commands/SystemOutCommands.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/SystemAPI.h"
#include "Screens/NotificationPopup.h"
#include "Screens/WifiPasswordScreen.h"
#include "SharedSystem/Platform.h"
#include "Widgets/FlickList.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsListSelectionWifiItem.h"
#include "Widgets/SpinnyCircle.h"

#include <QCoreApplication>
#include <QDebug>
#include <QElapsedTimer>
#include <QEvent>
#include <QFile>
#include <QPointer>
#include <QSignalMapper>

namespace {

int verifyIntervalMs = SettingsWifiPage::VerifyIntervalMs;

// The radio answers "busy" (19) while a switch, scan or join is under way;
// that is retried like the link's own busy answer, but not for ever.
const STATUS_T kRadioBusy = 19;
const int kRadioBusyLimitMs = 15000;

// Repeats a command while it is refused as busy. Events run between the
// tries so that the spinner turns and timers fire.
template<typename Command>
STATUS_T retryWhileBusy(Command command)
{
    QElapsedTimer radioBusy;
    STATUS_T status = command();
    while (status == STATUS_SERVER_BUSY || status == kRadioBusy) {
        if (status == kRadioBusy) {
            if (!radioBusy.isValid())
                radioBusy.start();
            else if (radioBusy.elapsed() > kRadioBusyLimitMs)
                break;
        }
        QElapsedTimer pause;
        pause.start();
        while (pause.elapsed() < 100)
            QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents, 20);
        status = command();
    }
    return status;
}

} // namespace

void SettingsWifiPage::setVerifyIntervalMs(int ms)
{
    verifyIntervalMs = ms > 0 ? ms : VerifyIntervalMs;
}

SettingsWifiPage::SettingsWifiPage(QWidget* parent)
    : SettingsPage(tr("Wi-Fi"), QStringLiteral(":/Assets/settings_wifi_icon.png"), parent)
{
    m_bDebounced = true;
    m_debounceTimer.setSingleShot(true);
    connect(&m_debounceTimer, &QTimer::timeout, this, &SettingsWifiPage::onDebounceTimeut);
    onCreateSpinner();
    onCreateToggleButton();

    DataManager* data = DataManager::instance();
    connect(data, &DataManager::updateWifiState, this, &SettingsWifiPage::onWifiStateChanged);
    connect(data, &DataManager::loadWifiSettingsComplete, this, &SettingsWifiPage::onCreatePage);
    connect(data, &DataManager::wifiSettingsChanged, this, &SettingsWifiPage::onCreatePage);
    connect(this, &SettingsWifiPage::loadWifiSettings, data, &DataManager::onLoadWifiSettings);
    showSpinner(true);
    // The list comes back through loadWifiSettingsComplete.
    emit loadWifiSettings();
}

SettingsWifiPage::~SettingsWifiPage()
{
    closePasswordScreen();
}

void SettingsWifiPage::init()
{
    SettingsPage::init();
}

QString SettingsWifiPage::readMacAddress()
{
    QFile file(Platform::devicePath(QStringLiteral("/sys/class/net/wlan0/address")));
    if (!file.open(QIODevice::ReadOnly))
        return QString();
    return QString::fromLatin1(file.readLine()).trimmed();
}

WIFI_STATUS_T SettingsWifiPage::wifiState() const
{
    return DataManager::instance()->getSystemStatus().getWifiState();
}

void SettingsWifiPage::onCreateSpinner()
{
    if (!m_spinnyCircle) {
        m_spinnyCircle = new SpinnyCircle(this);
        m_spinnyCircle->setObjectName(QStringLiteral("WifiSpinner"));
    }
    m_spinnyCircle->hide();
}

void SettingsWifiPage::showSpinner(bool show)
{
    if (!m_spinnyCircle)
        return;
    const QRect list = getSettingsList()->geometry();
    // Below the switch row, in the middle of what is left.
    const int top = list.top() + SettingsRows::RowHeight;
    m_spinnyCircle->move(list.center().x() - m_spinnyCircle->width() / 2,
                         top + (list.bottom() - top) / 2 - m_spinnyCircle->height() / 2);
    m_spinnyCircle->setVisible(show);
    if (show)
        m_spinnyCircle->raise();
}

void SettingsWifiPage::resizeEvent(QResizeEvent* event)
{
    SettingsPage::resizeEvent(event);
    if (m_spinnyCircle && m_spinnyCircle->isVisible())
        showSpinner(true);
}

void SettingsWifiPage::onCreateToggleButton()
{
    SettingsPage::clearList();
    m_toggle = new SettingsListSelectionToggleItem;
    m_toggle->setObjectName(QStringLiteral("WifiToggle"));
    getSettingsList()->addWidget(m_toggle);
    connect(m_toggle, &SettingsListSelectionToggleItem::checkedStateChanged, this,
            &SettingsWifiPage::onCheckedStateChanged);
    onUpdateToggleState(wifiState() != WIFI_STATUS_OFF);
}

void SettingsWifiPage::onUpdateToggleState(bool on)
{
    if (!m_toggle)
        return;
    // With the radio off its MAC address is still worth knowing.
    m_toggle->setText(on ? tr("On") : tr("Off") + QStringLiteral(" [") + readMacAddress() + QStringLiteral("]"));
    m_toggle->setButtonChecked(on);
}

void SettingsWifiPage::clearSignalMapper()
{
    delete m_signalMapperDelete;
    m_signalMapperDelete = nullptr;
    delete m_signalMapperClickedUnknown;
    m_signalMapperClickedUnknown = nullptr;
}

void SettingsWifiPage::refreshSignalMapper()
{
    clearSignalMapper();
    m_signalMapperDelete = new QSignalMapper(this);
    m_signalMapperClickedUnknown = new QSignalMapper(this);
    connect(m_signalMapperDelete, &QSignalMapper::mappedString, this, &SettingsWifiPage::onRemoveSSID);
    connect(m_signalMapperClickedUnknown, &QSignalMapper::mappedWidget, this, &SettingsWifiPage::onUnknownNetworkClicked);
}

void SettingsWifiPage::clearList()
{
    FlickList* list = getSettingsList();
    // The switch row stays.
    while (list->count() > 1) {
        QListWidgetItem* item = list->item(list->count() - 1);
        QWidget* row = list->itemWidget(item);
        list->removeItemWidget(item);
        delete list->takeItem(list->count() - 1);
        if (row) {
            // Deletion waits for the event loop, which a wait below this
            // one does not run: out of sight at once.
            row->hide();
            row->deleteLater();
        }
    }
    clearSignalMapper();
}

void SettingsWifiPage::onCreatePage()
{
    if (m_joining)
        return;
    clearList();
    onUpdateWifiList();
}

void SettingsWifiPage::onUpdatePage()
{
    onCreatePage();
}

void SettingsWifiPage::markLastRow()
{
    FlickList* list = getSettingsList();
    if (auto* row = qobject_cast<FlickButton*>(list->getWidget(list->count() - 1)))
        row->setLastInList(true);
}

void SettingsWifiPage::onUpdateWifiList()
{
    refreshSignalMapper();
    const WIFI_STATUS_T state = wifiState();
    const bool on = state != WIFI_STATUS_OFF;
    FlickList* list = getSettingsList();
    DataManager* data = DataManager::instance();

    const QString ip = data->getIpAddress();
    QString copy = ip;
    copy.remove(QStringLiteral("dynamic"), Qt::CaseInsensitive);
    copy = copy.trimmed();
    const QStringList parts = copy.split(' ', Qt::SkipEmptyParts);
    const bool dynamic = ip.toUpper().contains(QStringLiteral("DYNAMIC"));

    // 1. The address.
    if (!ip.isEmpty() && !copy.isEmpty()) {
        auto* info = new SettingsListSelectionItem;
        info->setObjectName(QStringLiteral("WifiAddressRow"));
        info->setClickable(false);
        info->showArrow(false);
        info->setBtnIcon(QString());
        info->setBtnSettingText(parts.size() >= 2 ? parts.at(0) : QStringLiteral("..."));
        QString status;
        if (!dynamic) {
            status = tr("Static IP");
        } else if (parts.size() >= 2) {
            status = tr("DHCP") + QLatin1Char(' ') + parts.at(1);
        } else if (parts.size() == 1) {
            status = tr("DHCP") + QLatin1Char(' ') + parts.at(0);
        } else {
            qDebug().noquote() << "Couldn't acquire proper mac address, received " + ip;
            status = tr("DHCP") + QLatin1Char(' ');
        }
        info->setBtnStatusText(status);
        info->setLastInList(true);
        list->addWidget(info);
    }

    // 2. The networks the instrument knows.
    const QVector<NETWORK_DESCRIPTION_T> known = removeDuplicateNetworks(data->getKnownNetworkDescriptions());
    for (int i = 0; i < known.size(); ++i) {
        const NETWORK_DESCRIPTION_T& network = known.at(i);
        if (i == 0) {
            markLastRow();
            auto* header = new ListingHeader(tr("Known Networks"));
            header->setObjectName(QStringLiteral("KnownNetworksHeader"));
            list->addWidget(header);
        }
        auto* row = new SettingsListSelectionWifiItem;
        row->setObjectName(QStringLiteral("KnownNetwork%1").arg(i));
        row->showDeleteIcon(true);
        row->showWifiIcon(network.Connected && on);
        row->setBtnSettingText(network.SSID);
        row->setBtnStatusText(network.Authentication);
        row->setNetworkDescription(network);
        row->setLastInList(i == known.size() - 1 && on);
        row->setWifiState(on ? convertToWifiState(network.Quality) : 5);
        list->addWidget(row);
        connect(row, &SettingsListSelectionWifiItem::deleteClicked, m_signalMapperDelete,
                QOverload<>::of(&QSignalMapper::map));
        m_signalMapperDelete->setMapping(row, network.SSID);
    }

    // 3. Networks to join: only while no DHCP connection stands, so that the
    // user forgets the present network before choosing another.
    if (on && !dynamic) {
        const QVector<NETWORK_DESCRIPTION_T> unknown = removeDuplicateNetworks(data->getUnknownNetworkDescriptions());
        for (int i = 0; i < unknown.size(); ++i) {
            const NETWORK_DESCRIPTION_T& network = unknown.at(i);
            if (i == 0) {
                markLastRow();
                auto* header = new ListingHeader(tr("Unknown Networks"));
                header->setObjectName(QStringLiteral("UnknownNetworksHeader"));
                list->addWidget(header);
            }
            auto* row = new SettingsListSelectionWifiItem;
            row->setObjectName(QStringLiteral("UnknownNetwork%1").arg(i));
            row->setClickable(true);
            row->showDeleteIcon(false);
            row->showWifiIcon(network.Connected);
            row->setBtnSettingText(network.SSID);
            row->setBtnStatusText(network.Authentication);
            row->setNetworkDescription(network);
            row->setWifiState(convertToWifiState(network.Quality));
            row->setLastInList(i == unknown.size() - 1);
            list->addWidget(row);
            connect(row, &QPushButton::clicked, m_signalMapperClickedUnknown, QOverload<>::of(&QSignalMapper::map));
            m_signalMapperClickedUnknown->setMapping(row, row);
        }
    }

    showSpinner(false);
    onUpdateToggleState(on);
}

QVector<NETWORK_DESCRIPTION_T> SettingsWifiPage::removeDuplicateNetworks(QVector<NETWORK_DESCRIPTION_T> list)
{
    int i = 0;
    while (i < list.size()) {
        bool removedI = false;
        int j = 0;
        while (j < list.size()) {
            if (i == j || list.at(i).SSID != list.at(j).SSID) {
                ++j;
                continue;
            }
            if (!list.at(i).Connected && list.at(j).Connected) {
                list.remove(i);
                removedI = true;
                break;
            }
            list.remove(j);
            if (j < i)
                --i;
        }
        if (!removedI)
            ++i;
    }
    return list;
}

int SettingsWifiPage::convertToWifiState(float quality)
{
    if (quality > 0.66f)
        return WIFI_LEVEL_3;
    if (quality > 0.33f)
        return WIFI_LEVEL_2;
    if (quality > 0.05f)
        return WIFI_LEVEL_1;
    return WIFI_LEVEL_0;
}

void SettingsWifiPage::onCheckedStateChanged(bool on)
{
    if (!m_bDebounced) {
        onUpdateToggleState(!on);
        return;
    }
    m_bDebounced = false;
    m_toggle->setEnabled(false);
    playSoundButtonClick();
    if (!SysAPI_SetEnableWifi(on)) {
        m_toggle->setEnabled(true);
        m_bDebounced = true;
        onUpdateToggleState(wifiState() != WIFI_STATUS_OFF);
        return;
    }
    if (on) {
        clearList();
        showSpinner(true);
    } else {
        onCreatePage();
    }
    onUpdateToggleState(on);
    m_debounceTimer.start(DebounceMs);
}

void SettingsWifiPage::onDebounceTimeut()
{
    m_bDebounced = true;
    if (m_toggle)
        m_toggle->setEnabled(true);
}

void SettingsWifiPage::onWifiStateChanged(WIFI_STATUS_T state)
{
    if (m_joining)
        return;
    if (state == WIFI_STATUS_OFF) {
        onCreatePage();
    } else if (state == WIFI_STATUS_CONNECTED) {
        emit loadWifiSettings();
    } else {
        clearList();
        showSpinner(true);
        triggerScan();
    }
}

void SettingsWifiPage::triggerScan()
{
    if (SysAPI_TriggerWifiScan())
        return;
    clearList();
    showSpinner(true);
    QPointer<SettingsWifiPage> self(this);
    retryWhileBusy([]() { return CmdOut_TriggerWifiScan(); });
    if (!self)
        return;
}

void SettingsWifiPage::onRemoveSSID(const QString& ssid)
{
    playSoundButtonClick();
    clearList();
    showSpinner(true);
    QPointer<SettingsWifiPage> self(this);
    if (!DataManager::instance()->removeSSID(ssid))
        retryWhileBusy([ssid]() { return CmdOut_DeleteWifiSetting(ssid); });
    if (self)
        triggerScan();
}

void SettingsWifiPage::onUnknownNetworkClicked(QWidget* row)
{
    auto* item = qobject_cast<SettingsListSelectionWifiItem*>(row);
    if (!item)
        return;
    playSoundButtonClick();
    m_networkDescriptionBuffer = item->getNetworkDescription();
    if (m_networkDescriptionBuffer.Authentication.compare(QLatin1String("OPEN"), Qt::CaseInsensitive) == 0) {
        OnPasswordEntryComplete(QString());
        return;
    }
    closePasswordScreen();
    // Over the whole screen, as any keypad.
    QWidget* host = window();
    m_pWifiPasswordScreen = new WifiPasswordScreen(nullptr);
    m_pWifiPasswordScreen->setParent(host);
    m_pWifiPasswordScreen->setNetworkName(m_networkDescriptionBuffer.SSID);
    connect(m_pWifiPasswordScreen, &DaddyPanel::CloseScreenSignal, this, &SettingsWifiPage::OnClosePasswordEntry);
    connect(m_pWifiPasswordScreen, &WifiPasswordScreen::PasswordEntered, this,
            &SettingsWifiPage::OnPasswordEntryComplete);
    m_pWifiPasswordScreen->move(0, 0);
    m_pWifiPasswordScreen->show();
    m_pWifiPasswordScreen->raise();
    m_pWifiPasswordScreen->SetActiveStatus(true);
}

void SettingsWifiPage::closePasswordScreen()
{
    if (!m_pWifiPasswordScreen)
        return;
    WifiPasswordScreen* screen = m_pWifiPasswordScreen;
    m_pWifiPasswordScreen = nullptr;
    disconnect(screen, nullptr, this, nullptr);
    screen->SetActiveStatus(false);
    screen->hide();
    screen->deleteLater();
    // Give the hardware keys back to the settings screen beneath.
    if (auto* panel = qobject_cast<DaddyPanel*>(window()->findChild<DaddyPanel*>(QStringLiteral("ConfigMainScreen"))))
        panel->SetActiveStatus(true);
}

void SettingsWifiPage::OnClosePasswordEntry(QWidget* screen)
{
    if (screen && screen == m_pWifiPasswordScreen)
        closePasswordScreen();
}

void SettingsWifiPage::OnPasswordEntryComplete(const QString& password)
{
    closePasswordScreen();
    clearList();
    showSpinner(true);
    m_joining = true;
    QPointer<SettingsWifiPage> self(this);
    const NETWORK_DESCRIPTION_T network = m_networkDescriptionBuffer;
    const STATUS_T added = retryWhileBusy([&]() { return CmdOut_AddWifiSetting(network, password, 0); });
    if (!self)
        return;
    if (added != 0)
        qDebug().noquote() << QString("Wi-Fi: joining \"%1\" refused, status %2").arg(network.SSID).arg(added);
    SysAPI_TriggerWifiScan();

    // The join takes the radio a while; the user waits for its outcome.
    int result = 0;
    for (int attempt = 0; attempt < VerifyTries; ++attempt) {
        QElapsedTimer pause;
        pause.start();
        while (pause.elapsed() < verifyIntervalMs)
            QCoreApplication::processEvents(QEventLoop::ExcludeUserInputEvents, 20);
        if (!self)
            return;
        if (CmdOut_VerifyWifiSettings(network.SSID, &result) == 0)
            break;
    }
    qDebug().noquote() << QString("Wi-Fi: joining \"%1\" gave %2").arg(network.SSID).arg(result);
    m_joining = false;

    if (result == 1 || result == 2) {
        auto* popup = new NotificationPopup(window());
        popup->setObjectName(QStringLiteral("WifiConnectionIssuePopup"));
        popup->setHeaderText(tr("Connection Issue"));
        popup->setMessageText(result == 1 ? tr("Incorrect password") : tr("Network not in range"));
        popup->setButtonText(tr("OK"));
        connect(popup, &NotificationPopup::btnClicked, this, &SettingsWifiPage::onCloseNotification);
        emit displayPopup(popup);
    }
    triggerScan();
}

void SettingsWifiPage::onCloseNotification()
{
    if (auto* popup = qobject_cast<PopupPanel*>(sender()))
        emit closePopup(popup);
}

void SettingsWifiPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("Wi-Fi"));
        onUpdateToggleState(wifiState() != WIFI_STATUS_OFF);
        onCreatePage();
    }
}
