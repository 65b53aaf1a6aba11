#ifndef SETTINGSVOLUMEPAGE_H
#define SETTINGSVOLUMEPAGE_H

#include "Widgets/SettingsPage.h"

class SettingsListSelectionSliderItem;

// The loudness of the instrument's sounds, 0 (silent) to 100.
class SettingsVolumePage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsVolumePage(QWidget* parent = nullptr);
    SettingsListSelectionSliderItem* slider() const { return m_beeperSlider; }

public slots:
    void onUpdatePage() override;
    void onSliderChanged(int value);

protected:
    void changeEvent(QEvent* event) override;

private:
    SettingsListSelectionSliderItem* m_beeperSlider;
};

#endif // SETTINGSVOLUMEPAGE_H
