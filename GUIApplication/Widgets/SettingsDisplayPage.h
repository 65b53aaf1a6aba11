#ifndef SETTINGSDISPLAYPAGE_H
#define SETTINGSDISPLAYPAGE_H

#include "Widgets/SettingsPage.h"

class SettingsListSelectionSliderItem;

// The brightness of the display. Its lowest value is 1: the screen must never go dark.
class SettingsDisplayPage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsDisplayPage(QWidget* parent = nullptr);
    SettingsListSelectionSliderItem* slider() const { return m_brightnessSlider; }

public slots:
    void onUpdatePage() override;
    void onSliderChanged(int value);

protected:
    void changeEvent(QEvent* event) override;

private:
    SettingsListSelectionSliderItem* m_brightnessSlider;
};

#endif // SETTINGSDISPLAYPAGE_H
