#include "Widgets/SettingsPowerOptionsPage.h"

#include "Commands/ParametersOutCommands.h"
#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsSliderItems.h"

#include <QDebug>
#include <QEvent>

namespace {

const int kDimmerNeverSeconds = 120;
const int kMinutesNeverSeconds = 7200;

SettingsListSelectionCompressedSliderItem* makeSlider(int min, int step)
{
    auto* slider = new SettingsListSelectionCompressedSliderItem;
    slider->allowNever(true);
    slider->setMinValue(min);
    slider->setMaxValue(SettingsPowerOptionsPage::NeverPosition);
    slider->setPageStep(step);
    slider->setLastInList(true);
    return slider;
}

void sendSeconds(PARAMETER_TYPE_T key, int seconds)
{
    PARAMETER_CONTENT_TYPES content;
    content.parameterInt = seconds;
    content.parameterString = QString::number(seconds);
    const STATUS_T status = CmdOut_SetParameter(key, content);
    if (status != 0)
        qDebug().noquote() << QString("Power options: parameter %1 not stored, status %2").arg(key).arg(status);
}

} // namespace

SettingsPowerOptionsPage::SettingsPowerOptionsPage(QWidget* parent)
    : SettingsPage(tr("Power Saving\nOptions"), QStringLiteral(":/Assets/settings_power_options_icon.png"), parent)
    , m_powerSlider(makeSlider(1, 2))
    , m_dimmerSlider(makeSlider(10, 5))
    , m_standbySlider(makeSlider(1, 2))
    , m_dimmerHeader(new SettingsListSelectionHeader)
    , m_standbyHeader(new SettingsListSelectionHeader)
    , m_powerHeader(new SettingsListSelectionHeader)
{
    FlickList* list = getSettingsList();
    list->addWidget(m_dimmerHeader);
    list->addWidget(m_dimmerSlider);
    list->addWidget(m_standbyHeader);
    list->addWidget(m_standbySlider);
    list->addWidget(m_powerHeader);
    list->addWidget(m_powerSlider);
    connect(m_dimmerSlider, &SettingsListSelectionSliderItem::sliderChanged, this,
            &SettingsPowerOptionsPage::onDimmerSliderChanged);
    connect(m_standbySlider, &SettingsListSelectionSliderItem::sliderChanged, this,
            &SettingsPowerOptionsPage::onStandbySliderChanged);
    connect(m_powerSlider, &SettingsListSelectionSliderItem::sliderChanged, this,
            &SettingsPowerOptionsPage::onPowerSliderChanged);
    DataManager* data = DataManager::instance();
    connect(data, &DataManager::powerDisplayOffTimeChanged, this, &SettingsPowerOptionsPage::onUpdatePage);
    connect(data, &DataManager::powerStandbyTimeChanged, this, &SettingsPowerOptionsPage::onUpdatePage);
    connect(data, &DataManager::powerOffTimeChanged, this, &SettingsPowerOptionsPage::onUpdatePage);
    connect(data, &DataManager::powerManagementLevelChanged, this, &SettingsPowerOptionsPage::onUpdatePage);
    retranslate();
    onUpdatePage();
}

int SettingsPowerOptionsPage::dimmerPosition(int seconds)
{
    if (seconds <= 0 || seconds >= kDimmerNeverSeconds)
        return NeverPosition;
    return seconds;
}

int SettingsPowerOptionsPage::minutesPosition(int seconds)
{
    if (seconds <= 0 || seconds >= kMinutesNeverSeconds)
        return NeverPosition;
    return seconds / 60;
}

int SettingsPowerOptionsPage::dimmerSeconds(int position)
{
    return position >= NeverPosition ? 0 : position;
}

int SettingsPowerOptionsPage::minutesSeconds(int position)
{
    return position >= NeverPosition ? 0 : position * 60;
}

void SettingsPowerOptionsPage::retranslate()
{
    setTitle(tr("Power Saving\nOptions"));
    m_dimmerHeader->setText(tr("Dim Display"));
    m_standbyHeader->setText(tr("Standby Mode"));
    m_powerHeader->setText(tr("Power Off"));
    m_dimmerSlider->setSummaryText(tr("Seconds until display dims:"));
    m_standbySlider->setSummaryText(tr("Minutes until standby mode:"));
    m_powerSlider->setSummaryText(tr("Minutes until power off:"));
}

void SettingsPowerOptionsPage::onUpdatePage()
{
    m_dimmerSlider->setValue(dimmerPosition(UserParams::getPowerDisplayOffTime()));
    m_standbySlider->setValue(minutesPosition(UserParams::getPowerStandbyTime()));
    m_powerSlider->setValue(minutesPosition(UserParams::getPowerOffTime()));
}

void SettingsPowerOptionsPage::onDimmerSliderChanged(int value)
{
    UserParams::setPowerDisplayOffTime(dimmerSeconds(value));
}

void SettingsPowerOptionsPage::onStandbySliderChanged(int value)
{
    UserParams::setPowerStandbyTime(minutesSeconds(value));
}

void SettingsPowerOptionsPage::onPowerSliderChanged(int value)
{
    UserParams::setPowerOffTime(minutesSeconds(value));
}

void SettingsPowerOptionsPage::on_BtnBack_clicked()
{
    sendSeconds(PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME, UserParams::getPowerDisplayOffTime());
    sendSeconds(PARAMETER_DEFAULT_STANDBY_TIME, UserParams::getPowerStandbyTime());
    sendSeconds(PARAMETER_DEFAULT_POWER_OFF_TIME, UserParams::getPowerOffTime());
    SettingsPage::on_BtnBack_clicked();
}

void SettingsPowerOptionsPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
