#ifndef SETTINGSMEASUREMENTPAGE_H
#define SETTINGSMEASUREMENTPAGE_H

#include "Widgets/SettingsPage.h"

#include <array>

class QListWidgetItem;
class SettingsListSelectionCheckableItem;
class SettingsListSelectionCompressedSliderItem;
class SettingsListSelectionHeader;
class SettingsListSelectionToggleItem;

// How the instrument measures: auto measurement and its delay, the L*C*h*
// display, the pressure-sensor override, and the default averaging of new
// jobs with its SMC m and n. The instrument's model decides which rows
// exist. Changes are kept locally and sent when the user leaves by the
// back button.
class SettingsMeasurementPage : public SettingsPage
{
    Q_OBJECT
public:
    static const int NumMeasModes = 4;

    explicit SettingsMeasurementPage(QWidget* parent = nullptr);

    SettingsListSelectionToggleItem* autoMeasureToggle() const { return m_pAutoMeasureToggle; }
    SettingsListSelectionCompressedSliderItem* autoMeasureTimeoutSlider() const { return m_pAutoMeasureTimeoutSlider; }
    SettingsListSelectionToggleItem* labchToggle() const { return m_pLABCH_Toggle; }
    SettingsListSelectionToggleItem* overrideToggle() const { return m_pOverridePressureSensorToggle; }
    SettingsListSelectionCompressedSliderItem* mSlider() const { return m_mSlider; }
    SettingsListSelectionCompressedSliderItem* nSlider() const { return m_nSlider; }
    SettingsListSelectionCheckableItem* modeRow(int mode) const;

public slots:
    void onUpdatePage() override;
    void on_BtnBack_clicked() override;
    void onAutoMeasChanged(bool on);
    void onLABCHChanged(bool on);
    void onOverridePressureSensor(bool on);
    void onAutoMeasureTimeoutSliderChanged(int value);
    void onmSliderChanged(int value);
    void onnSliderChanged(int value);
    void onMeasModeSelected(int mode);
    void onUpdateAutoMeasureState();
    void onUpdateDisplayLABCHState();
    void onUpdateOveridePressureSensorState();

protected:
    void changeEvent(QEvent* event) override;

private:
    void onCreatePage();
    void storeAveraging();
    void retranslate();

    SettingsListSelectionHeader* m_pAutoMeasureHeader = nullptr;
    SettingsListSelectionToggleItem* m_pAutoMeasureToggle = nullptr;
    SettingsListSelectionCompressedSliderItem* m_pAutoMeasureTimeoutSlider = nullptr;
    QListWidgetItem* m_AutoMeasureTimeoutSliderListWidgetItem = nullptr;
    SettingsListSelectionToggleItem* m_pLABCH_Toggle = nullptr;
    SettingsListSelectionToggleItem* m_pOverridePressureSensorToggle = nullptr;
    SettingsListSelectionCompressedSliderItem* m_mSlider = nullptr;
    SettingsListSelectionCompressedSliderItem* m_nSlider = nullptr;
    SettingsListSelectionHeader* m_pMeasModeHeader = nullptr;
    std::array<SettingsListSelectionCheckableItem*, NumMeasModes> m_measModes {};
};

#endif // SETTINGSMEASUREMENTPAGE_H
