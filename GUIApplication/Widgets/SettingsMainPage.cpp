#include "Widgets/SettingsMainPage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsDisplayPage.h"
#include "Widgets/SettingsLanguagePage.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsMeasurementPage.h"
#include "Widgets/SettingsPowerOptionsPage.h"
#include "Widgets/SettingsPowerPage.h"
#include "Widgets/SettingsSystemAndDiagnosticsPage.h"
#include "Widgets/SettingsVolumePage.h"
#include "Widgets/SettingsWifiPage.h"

#include <QEvent>
#include <QSignalMapper>

SettingsMainPage::SettingsMainPage(QWidget* parent)
    : SettingsPage(tr("Settings"), QStringLiteral(":/Assets/settings_icon.png"), parent)
{
    setBackIcon(QStringLiteral(":/Assets/jobs_button.png"));
    settingsLookupTable[SETTING_POWERDOWN].iconResource = QStringLiteral(":/Assets/settings_shutdown_icon.png");
    settingsLookupTable[SETTING_LANGUAGE].iconResource = QStringLiteral(":/Assets/settings_set_language_icon.png");
    settingsLookupTable[SETTING_CALIBRATION].iconResource = QStringLiteral(":/Assets/calibrating_icon.png");
    settingsLookupTable[SETTING_MEASUREMENT].iconResource = QStringLiteral(":/Assets/settings_measure_icon.png");
    settingsLookupTable[SETTING_WIFI].iconResource = QStringLiteral(":/Assets/settings_wifi_icon.png");
    settingsLookupTable[SETTING_DISPLAY].iconResource = QStringLiteral(":/Assets/settings_brightness_icon.png");
    settingsLookupTable[SETTING_VOLUME].iconResource = QStringLiteral(":/Assets/settings_beeper_volume_icon.png");
    settingsLookupTable[SETTING_POWER].iconResource = QStringLiteral(":/Assets/settings_power_options_icon.png");
    settingsLookupTable[SETTING_SYSTEM].iconResource = QStringLiteral(":/Assets/settings_diagnostics_icon.png");
    onTranslate();
    onCreatePage();

    DataManager* data = DataManager::instance();
    connect(data, &DataManager::updateCalValid, this, &SettingsMainPage::onUpdateCalValid);
    connect(data, &DataManager::languageChanged, this, &SettingsMainPage::onUpdatePage);
    connect(data, &DataManager::displayBrightnessChanged, this, &SettingsMainPage::onUpdatePage);
    connect(data, &DataManager::beeperVolumeChanged, this, &SettingsMainPage::onUpdatePage);
    connect(data, &DataManager::loadWifiSettingsComplete, this, &SettingsMainPage::onUpdatePage);
}

QString SettingsMainPage::statusTextFor(SETTINGS_T index)
{
    DataManager* data = DataManager::instance();
    switch (index) {
    case SETTING_LANGUAGE:
        return data->getLanguageStringFromCode(UserParams::getLanguageCode());
    case SETTING_CALIBRATION:
        return data->getCalState().nextExternalWhiteCal > 0 ? tr("Valid") : tr("Expired");
    case SETTING_WIFI: {
        data->loadWifiSSID();
        QString ssid = data->getWifiSSID();
        ssid.remove('"');
        return ssid.isEmpty() ? tr("Not Connected") : ssid;
    }
    case SETTING_DISPLAY:
        return tr("%1").arg(UserParams::getDisplayBrightness());
    case SETTING_VOLUME:
        return tr("%1%").arg(UserParams::getBeeperVolume());
    default:
        return QString();
    }
}

void SettingsMainPage::onTranslate()
{
    setTitle(tr("Settings"));
    settingsLookupTable[SETTING_POWERDOWN].settingText = tr("Power");
    settingsLookupTable[SETTING_LANGUAGE].settingText = tr("Language");
    settingsLookupTable[SETTING_CALIBRATION].settingText = tr("Calibration");
    settingsLookupTable[SETTING_MEASUREMENT].settingText = tr("Measurement Options");
    settingsLookupTable[SETTING_WIFI].settingText = tr("Wi-Fi");
    settingsLookupTable[SETTING_DISPLAY].settingText = tr("Display Settings");
    settingsLookupTable[SETTING_VOLUME].settingText = tr("Beeper Volume");
    settingsLookupTable[SETTING_POWER].settingText = tr("Power Saving Options");
    settingsLookupTable[SETTING_SYSTEM].settingText = tr("System & Diagnostics");
    onUpdatePage();
}

void SettingsMainPage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsMainPage::onSettingSelected);
    for (int i = 0; i < NUM_SETTINGS; ++i) {
        SettingLookupTableItem& entry = settingsLookupTable[size_t(i)];
        entry.objectPointer = nullptr;
        if (i == SETTING_WIFI && !UserParams::getWifiEnabled())
            continue;
        entry.statusText = statusTextFor(SETTINGS_T(i));
        auto* row = new SettingsListSelectionItem;
        row->setObjectName(QStringLiteral("SettingRow%1").arg(i));
        row->setBtnIcon(entry.iconResource);
        row->setBtnSettingText(entry.settingText);
        row->setBtnStatusText(entry.statusText);
        connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
        m_signalMapper->setMapping(row, i);
        getSettingsList()->addWidget(row);
        entry.objectPointer = row;
    }
    if (auto* last = qobject_cast<FlickButton*>(getSettingsList()->getWidget(getSettingsList()->count() - 1)))
        last->setLastInList(true);
}

void SettingsMainPage::onUpdatePage()
{
    for (int i = 0; i < NUM_SETTINGS; ++i) {
        SettingLookupTableItem& entry = settingsLookupTable[size_t(i)];
        entry.statusText = statusTextFor(SETTINGS_T(i));
        if (!entry.objectPointer)
            continue;
        entry.objectPointer->setBtnSettingText(entry.settingText);
        entry.objectPointer->setBtnStatusText(entry.statusText);
    }
    onUpdateCalValid(DataManager::instance()->getCalState().nextExternalWhiteCal >= 1);
}

void SettingsMainPage::onUpdateCalValid(bool valid)
{
    SettingLookupTableItem& entry = settingsLookupTable[SETTING_CALIBRATION];
    entry.statusText = valid ? tr("Valid") : tr("Expired");
    if (entry.objectPointer)
        entry.objectPointer->setBtnStatusText(entry.statusText);
}

void SettingsMainPage::onSettingSelected(int index)
{
    playSoundButtonClick();
    SettingsPage* page = nullptr;
    switch (index) {
    case SETTING_POWERDOWN: page = new SettingsPowerPage; break;
    case SETTING_LANGUAGE: page = new SettingsLanguagePage; break;
    case SETTING_CALIBRATION: onGotoScreen(CAL_WIZARD_SCREEN_ID); return;
    case SETTING_MEASUREMENT: page = new SettingsMeasurementPage; break;
    case SETTING_WIFI: page = new SettingsWifiPage; break;
    case SETTING_DISPLAY: page = new SettingsDisplayPage; break;
    case SETTING_VOLUME: page = new SettingsVolumePage; break;
    case SETTING_POWER: page = new SettingsPowerOptionsPage; break;
    case SETTING_SYSTEM: page = new SettingsSystemAndDiagnosticsPage; break;
    default: return;
    }
    gotoNextPage(page);
}

void SettingsMainPage::on_BtnBack_clicked()
{
    playSoundButtonClick();
    emit closeSettings();
}

void SettingsMainPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        onTranslate();
}
