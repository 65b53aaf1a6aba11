#ifndef SETTINGSMAINPAGE_H
#define SETTINGSMAINPAGE_H

#include "Widgets/SettingsPage.h"

#include <array>

class SettingsListSelectionItem;

typedef enum _SETTINGS_T {
    SETTING_POWERDOWN = 0,
    SETTING_LANGUAGE = 1,
    SETTING_CALIBRATION = 2,
    SETTING_MEASUREMENT = 3,
    SETTING_WIFI = 4,
    SETTING_DISPLAY = 5,
    SETTING_VOLUME = 6,
    SETTING_POWER = 7,
    SETTING_SYSTEM = 8,
    NUM_SETTINGS = 9
} SETTINGS_T;

struct SettingLookupTableItem
{
    QString iconResource;
    QString settingText;
    QString statusText;
    SettingsListSelectionItem* objectPointer = nullptr; // null for a row not shown
};

// The first page of the settings: one row per area with its present state.
class SettingsMainPage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsMainPage(QWidget* parent = nullptr);

    const SettingLookupTableItem& setting(SETTINGS_T index) const { return settingsLookupTable[index]; }
    // What the row of a setting says about it now.
    static QString statusTextFor(SETTINGS_T index);

signals:
    void closeSettings();

public slots:
    void onUpdatePage() override;
    void on_BtnBack_clicked() override;
    void onCreatePage();
    void onSettingSelected(int index);
    void onUpdateCalValid(bool valid);
    void onTranslate();

protected:
    void changeEvent(QEvent* event) override;

private:
    std::array<SettingLookupTableItem, NUM_SETTINGS> settingsLookupTable;
};

#endif // SETTINGSMAINPAGE_H
