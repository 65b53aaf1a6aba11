#include "Widgets/SettingsVolumePage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsSliderItems.h"

#include <QEvent>

SettingsVolumePage::SettingsVolumePage(QWidget* parent)
    : SettingsPage(tr("Beeper Volume"), QStringLiteral(":/Assets/settings_beeper_volume_icon.png"), parent)
    , m_beeperSlider(new SettingsListSelectionSliderItem)
{
    m_beeperSlider->setMinValue(0);
    m_beeperSlider->setMaxValue(100);
    m_beeperSlider->setPageStep(10);
    m_beeperSlider->setSummaryText(tr("Beeper Volume"));
    m_beeperSlider->setValue(int(UserParams::getBeeperVolume()));
    getSettingsList()->addWidget(m_beeperSlider);
    connect(m_beeperSlider, &SettingsListSelectionSliderItem::sliderChanged, this, &SettingsVolumePage::onSliderChanged);
    connect(DataManager::instance(), &DataManager::beeperVolumeChanged, this, &SettingsVolumePage::onUpdatePage);
}

void SettingsVolumePage::onSliderChanged(int value)
{
    DataManager::instance()->setBeeperVolume(static_cast<unsigned int>(value));
}

void SettingsVolumePage::onUpdatePage()
{
    m_beeperSlider->setValue(int(UserParams::getBeeperVolume()));
}

void SettingsVolumePage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("Beeper Volume"));
        m_beeperSlider->setSummaryText(tr("Beeper Volume"));
    }
}
