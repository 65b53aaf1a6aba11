#include "Widgets/SettingsMeasurementPage.h"

#include "Commands/ParametersOutCommands.h"
#include "GUIAPI/DataManager.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsSliderItems.h"

#include <QDebug>
#include <QEvent>
#include <QSignalMapper>

namespace {

QString onOff(bool on)
{
    return on ? SettingsMeasurementPage::tr("On") : SettingsMeasurementPage::tr("Off");
}

void sendInt(PARAMETER_TYPE_T key, int value)
{
    PARAMETER_CONTENT_TYPES content;
    content.parameterInt = value;
    content.parameterString = QString::number(value);
    const STATUS_T status = CmdOut_SetParameter(key, content);
    if (status != 0)
        qDebug().noquote() << QString("Measurement options: parameter %1 not stored, status %2").arg(key).arg(status);
}

void sendFloat(PARAMETER_TYPE_T key, float value)
{
    PARAMETER_CONTENT_TYPES content;
    content.parameterFloat = value;
    content.parameterInt = int(value);
    content.parameterString = QString::number(double(value));
    const STATUS_T status = CmdOut_SetParameter(key, content);
    if (status != 0)
        qDebug().noquote() << QString("Measurement options: parameter %1 not stored, status %2").arg(key).arg(status);
}

void sendString(PARAMETER_TYPE_T key, const QString& value)
{
    PARAMETER_CONTENT_TYPES content;
    content.parameterString = value;
    const STATUS_T status = CmdOut_SetParameter(key, content);
    if (status != 0)
        qDebug().noquote() << QString("Measurement options: parameter %1 not stored, status %2").arg(key).arg(status);
}

} // namespace

SettingsMeasurementPage::SettingsMeasurementPage(QWidget* parent)
    : SettingsPage(tr("Measurement Options"), QStringLiteral(":/Assets/settings_measure_icon.png"), parent)
{
    onCreatePage();
    DataManager* data = DataManager::instance();
    connect(data, &DataManager::autoMeasureChanged, this, &SettingsMeasurementPage::onUpdateAutoMeasureState);
    connect(data, &DataManager::OverridePressureSensorChanged, this,
            &SettingsMeasurementPage::onUpdateOveridePressureSensorState);
    connect(data, &DataManager::displayLABCHChanged, this, &SettingsMeasurementPage::onUpdateDisplayLABCHState);
}

void SettingsMeasurementPage::onCreatePage()
{
    FlickList* list = getSettingsList();
    if (UserParams::getAutoMeasureSwitchAvailable()) {
        m_pAutoMeasureHeader = new SettingsListSelectionHeader;
        list->addWidget(m_pAutoMeasureHeader);
        m_pAutoMeasureToggle = new SettingsListSelectionToggleItem;
        m_pAutoMeasureToggle->setObjectName(QStringLiteral("AutoMeasureToggle"));
        list->addWidget(m_pAutoMeasureToggle);
        connect(m_pAutoMeasureToggle, &SettingsListSelectionToggleItem::checkedStateChanged, this,
                &SettingsMeasurementPage::onAutoMeasChanged);

        m_pAutoMeasureTimeoutSlider = new SettingsListSelectionCompressedSliderItem;
        m_pAutoMeasureTimeoutSlider->setMinValue(1);
        m_pAutoMeasureTimeoutSlider->setMaxValue(5);
        m_pAutoMeasureTimeoutSlider->setPageStep(1);
        m_pAutoMeasureTimeoutSlider->allowNever(false);
        m_pAutoMeasureTimeoutSlider->setValue(qRound(UserParams::getAutoMeasureTimeout()));
        list->addWidget(m_pAutoMeasureTimeoutSlider);
        m_AutoMeasureTimeoutSliderListWidgetItem = list->item(list->count() - 1);
        connect(m_pAutoMeasureTimeoutSlider, &SettingsListSelectionSliderItem::sliderChanged, this,
                &SettingsMeasurementPage::onAutoMeasureTimeoutSliderChanged);
    }
    if (UserParams::getDisplayrOverridePressureSensoMenuItem()) {
        m_pOverridePressureSensorToggle = new SettingsListSelectionToggleItem;
        m_pOverridePressureSensorToggle->setObjectName(QStringLiteral("OverrideToggle"));
        list->addWidget(m_pOverridePressureSensorToggle);
        connect(m_pOverridePressureSensorToggle, &SettingsListSelectionToggleItem::checkedStateChanged, this,
                &SettingsMeasurementPage::onOverridePressureSensor);
    }
    if (UserParams::getDisplayLABCH_MenuItem()) {
        m_pLABCH_Toggle = new SettingsListSelectionToggleItem;
        m_pLABCH_Toggle->setObjectName(QStringLiteral("LabchToggle"));
        list->addWidget(m_pLABCH_Toggle);
        connect(m_pLABCH_Toggle, &SettingsListSelectionToggleItem::checkedStateChanged, this,
                &SettingsMeasurementPage::onLABCHChanged);
    }
    if (UserParams::getDisplayMeasurementModeSelectionMenuItem()) {
        m_pMeasModeHeader = new SettingsListSelectionHeader;
        list->addWidget(m_pMeasModeHeader);
        connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsMeasurementPage::onMeasModeSelected);
        for (int mode = 0; mode < NumMeasModes; ++mode) {
            auto* row = new SettingsListSelectionCheckableItem;
            row->setObjectName(QStringLiteral("MeasMode%1").arg(mode));
            list->addWidget(row);
            connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
            m_signalMapper->setMapping(row, mode);
            m_measModes[size_t(mode)] = row;
        }
        m_mSlider = new SettingsListSelectionCompressedSliderItem;
        m_mSlider->setMinValue(3);
        m_mSlider->setMaxValue(10);
        m_mSlider->setPageStep(1);
        list->addWidget(m_mSlider);
        m_nSlider = new SettingsListSelectionCompressedSliderItem;
        m_nSlider->setMinValue(3);
        m_nSlider->setMaxValue(15);
        m_nSlider->setPageStep(1);
        m_nSlider->setLastInList(true);
        list->addWidget(m_nSlider);
        connect(m_mSlider, &SettingsListSelectionSliderItem::sliderChanged, this, &SettingsMeasurementPage::onmSliderChanged);
        connect(m_nSlider, &SettingsListSelectionSliderItem::sliderChanged, this, &SettingsMeasurementPage::onnSliderChanged);
    }
    retranslate();
    onUpdatePage();
}

void SettingsMeasurementPage::retranslate()
{
    setTitle(tr("Measurement Options"));
    if (m_pAutoMeasureHeader)
        m_pAutoMeasureHeader->setText(tr("Auto Measurement"));
    if (m_pAutoMeasureTimeoutSlider)
        m_pAutoMeasureTimeoutSlider->setSummaryText(tr("Time to start auto measurement (sec):"));
    if (m_pMeasModeHeader)
        m_pMeasModeHeader->setText(tr("Measurement Mode"));
    for (int mode = 0; mode < NumMeasModes; ++mode) {
        if (m_measModes[size_t(mode)])
            m_measModes[size_t(mode)]->setText(getStringFromList(mode, JOB_AVERAGING_MODES_TABLE));
    }
    if (m_mSlider)
        m_mSlider->setSummaryText(tr("No. of good measurements required:"));
    if (m_nSlider)
        m_nSlider->setSummaryText(tr("Maximum measurements:"));
    onUpdateAutoMeasureState();
    onUpdateDisplayLABCHState();
    onUpdateOveridePressureSensorState();
}

SettingsListSelectionCheckableItem* SettingsMeasurementPage::modeRow(int mode) const
{
    return mode >= 0 && mode < NumMeasModes ? m_measModes[size_t(mode)] : nullptr;
}

void SettingsMeasurementPage::onUpdatePage()
{
    onUpdateAutoMeasureState();
    onUpdateDisplayLABCHState();
    onUpdateOveridePressureSensorState();
    if (m_pAutoMeasureTimeoutSlider)
        m_pAutoMeasureTimeoutSlider->setValue(qRound(UserParams::getAutoMeasureTimeout()));
    const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    for (int mode = 0; mode < NumMeasModes; ++mode) {
        if (m_measModes[size_t(mode)])
            m_measModes[size_t(mode)]->setChecked(info.mode == mode);
    }
    if (m_mSlider && m_nSlider) {
        m_mSlider->setValue(info.smcGoodMeasurements);
        m_nSlider->setValue(qMax(info.smcMaxMeasurements, m_mSlider->getValue()));
    }
}

void SettingsMeasurementPage::onUpdateAutoMeasureState()
{
    if (!m_pAutoMeasureToggle)
        return;
    const bool on = UserParams::getAutoMeasure();
    m_pAutoMeasureToggle->setText(tr("Auto Measurements: %1").arg(onOff(on)));
    m_pAutoMeasureToggle->setButtonChecked(on);
    // The delay matters only while auto measurement is on.
    if (m_AutoMeasureTimeoutSliderListWidgetItem)
        getSettingsList()->setRowHidden(getSettingsList()->row(m_AutoMeasureTimeoutSliderListWidgetItem), !on);
}

void SettingsMeasurementPage::onUpdateDisplayLABCHState()
{
    if (!m_pLABCH_Toggle)
        return;
    const bool on = UserParams::getDisplayLABCH();
    m_pLABCH_Toggle->setText(tr("Display LABCH: %1").arg(onOff(on)));
    m_pLABCH_Toggle->setButtonChecked(on);
}

void SettingsMeasurementPage::onUpdateOveridePressureSensorState()
{
    if (!m_pOverridePressureSensorToggle)
        return;
    const bool on = UserParams::getOverridePressureSensors();
    m_pOverridePressureSensorToggle->setText(tr("Override Pressure Sensors: %1").arg(onOff(on)));
    m_pOverridePressureSensorToggle->setButtonChecked(on);
}

void SettingsMeasurementPage::onAutoMeasChanged(bool on)
{
    playSoundButtonClick();
    UserParams::setAutoMeasure(on);
    onUpdateAutoMeasureState();
}

void SettingsMeasurementPage::onLABCHChanged(bool on)
{
    playSoundButtonClick();
    UserParams::setDisplayLABCH(on);
    onUpdateDisplayLABCHState();
}

void SettingsMeasurementPage::onOverridePressureSensor(bool on)
{
    playSoundButtonClick();
    UserParams::setOverridePressureSensors(on);
    onUpdateOveridePressureSensorState();
}

void SettingsMeasurementPage::onAutoMeasureTimeoutSliderChanged(int value)
{
    UserParams::setAutoMeasureTimeout(float(value));
}

void SettingsMeasurementPage::onmSliderChanged(int value)
{
    if (m_nSlider && m_nSlider->getValue() < value)
        m_nSlider->setValue(value);
    storeAveraging();
}

void SettingsMeasurementPage::onnSliderChanged(int value)
{
    if (m_mSlider && m_mSlider->getValue() > value)
        m_mSlider->setValue(value);
    storeAveraging();
}

void SettingsMeasurementPage::onMeasModeSelected(int mode)
{
    playSoundButtonClick();
    for (int i = 0; i < NumMeasModes; ++i) {
        if (m_measModes[size_t(i)])
            m_measModes[size_t(i)]->setChecked(i == mode);
    }
    storeAveraging();
}

void SettingsMeasurementPage::storeAveraging()
{
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    for (int mode = 0; mode < NumMeasModes; ++mode) {
        if (m_measModes[size_t(mode)] && m_measModes[size_t(mode)]->getChecked())
            info.mode = JOB_AVERAGING_MODE_T(mode);
    }
    if (info.mode == JOB_AVG_MODE_SIMPLE_3)
        info.averageNumber = 3;
    else if (info.mode == JOB_AVG_MODE_SIMPLE_5)
        info.averageNumber = 5;
    if (m_mSlider && m_nSlider) {
        info.smcGoodMeasurements = m_mSlider->getValue();
        info.smcMaxMeasurements = m_nSlider->getValue();
    }
    UserParams::setJobDefaultAvgInfo(info);
}

void SettingsMeasurementPage::on_BtnBack_clicked()
{
    sendInt(PARAMETER_AUTO_MEASURE, UserParams::getAutoMeasure() ? 1 : 0);
    sendFloat(PARAMETER_AUTO_MEASURE_TIMEOUT, UserParams::getAutoMeasureTimeout());
    sendInt(PARAMETER_DISPLAY_LABCH, UserParams::getDisplayLABCH() ? 1 : 0);
    sendInt(PARAMETER_OVERRIDE_PRESSURE_SENSORS, UserParams::getOverridePressureSensors() ? 1 : 0);
    // The default averaging of new jobs goes with them when its rows exist,
    // so that what the user chose here survives a restart.
    if (m_mSlider && m_nSlider) {
        const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
        sendString(PARAMETER_MEASUREMENT_MODE, jobAveragingModeText(info.mode));
        sendInt(PARAMETER_SMC_GOOD_MEASUREMENTS, info.smcGoodMeasurements);
        sendInt(PARAMETER_SMC_MAX_MEASUREMENTS, info.smcMaxMeasurements);
        sendInt(PARAMETER_AVERAGING_NUMBER_OF_SAMPLES, info.averageNumber);
    }
    SettingsPage::on_BtnBack_clicked();
}

void SettingsMeasurementPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
