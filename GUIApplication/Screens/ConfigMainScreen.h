#ifndef CONFIGMAINSCREEN_H
#define CONFIGMAINSCREEN_H

#include "Screens/DaddyPanel.h"

class SettingsMainPage;
class SettingsNavigator;
class StatusBar;

// The settings screen: the status bar over a navigator of settings pages,
// which starts at the main page. Closing the main page closes the screen.
class ConfigMainScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit ConfigMainScreen(QWidget* parent = nullptr);
    ~ConfigMainScreen() override;

    SettingsNavigator* navigator() const { return m_navigator; }
    SettingsMainPage* mainPage() const { return m_mainPage; }

public slots:
    void onCloseSettings();
    void onNavigatorGotoScreen(SCREEN_ID_T id);

private:
    StatusBar* m_statusBar;
    SettingsNavigator* m_navigator;
    SettingsMainPage* m_mainPage;
};

#endif // CONFIGMAINSCREEN_H
