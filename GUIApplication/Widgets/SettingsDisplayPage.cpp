#include "Widgets/SettingsDisplayPage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsSliderItems.h"

#include <QEvent>

SettingsDisplayPage::SettingsDisplayPage(QWidget* parent)
    : SettingsPage(tr("Display Settings"), QStringLiteral(":/Assets/settings_brightness_icon.png"), parent)
    , m_brightnessSlider(new SettingsListSelectionSliderItem)
{
    m_brightnessSlider->setMinValue(1);
    m_brightnessSlider->setMaxValue(100);
    m_brightnessSlider->setPageStep(10);
    m_brightnessSlider->setSummaryText(tr("Display Brightness"));
    m_brightnessSlider->setValue(int(UserParams::getDisplayBrightness()));
    getSettingsList()->addWidget(m_brightnessSlider);
    connect(m_brightnessSlider, &SettingsListSelectionSliderItem::sliderChanged, this, &SettingsDisplayPage::onSliderChanged);
    connect(DataManager::instance(), &DataManager::displayBrightnessChanged, this, &SettingsDisplayPage::onUpdatePage);
}

void SettingsDisplayPage::onSliderChanged(int value)
{
    DataManager::instance()->setDisplayBrightness(static_cast<unsigned int>(value));
}

void SettingsDisplayPage::onUpdatePage()
{
    m_brightnessSlider->setValue(int(UserParams::getDisplayBrightness()));
}

void SettingsDisplayPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("Display Settings"));
        m_brightnessSlider->setSummaryText(tr("Display Brightness"));
    }
}
