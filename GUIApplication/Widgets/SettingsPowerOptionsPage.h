#ifndef SETTINGSPOWEROPTIONSPAGE_H
#define SETTINGSPOWEROPTIONSPAGE_H

#include "Widgets/SettingsPage.h"

class SettingsListSelectionCompressedSliderItem;

// When the display dims, the instrument goes to standby and switches off.
// Each slider's end means never (stored as 0). Changes are sent when the
// user leaves by the back button.
class SettingsPowerOptionsPage : public SettingsPage
{
    Q_OBJECT
public:
    // The end of every slider: never.
    static const int NeverPosition = 120;

    explicit SettingsPowerOptionsPage(QWidget* parent = nullptr);

    SettingsListSelectionCompressedSliderItem* dimmerSlider() const { return m_dimmerSlider; }
    SettingsListSelectionCompressedSliderItem* standbySlider() const { return m_standbySlider; }
    SettingsListSelectionCompressedSliderItem* powerSlider() const { return m_powerSlider; }

    // Stored seconds to slider position and back.
    static int dimmerPosition(int seconds);
    static int minutesPosition(int seconds);
    static int dimmerSeconds(int position);
    static int minutesSeconds(int position);

public slots:
    void onUpdatePage() override;
    void on_BtnBack_clicked() override;
    void onDimmerSliderChanged(int value);
    void onStandbySliderChanged(int value);
    void onPowerSliderChanged(int value);

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();

    SettingsListSelectionCompressedSliderItem* m_powerSlider;
    SettingsListSelectionCompressedSliderItem* m_dimmerSlider;
    SettingsListSelectionCompressedSliderItem* m_standbySlider;
    class SettingsListSelectionHeader* m_dimmerHeader;
    class SettingsListSelectionHeader* m_standbyHeader;
    class SettingsListSelectionHeader* m_powerHeader;
};

#endif // SETTINGSPOWEROPTIONSPAGE_H
