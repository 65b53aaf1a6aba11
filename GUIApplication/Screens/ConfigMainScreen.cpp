#include "Screens/ConfigMainScreen.h"

#include "Screens/PopupPanel.h"
#include "Widgets/SettingsMainPage.h"
#include "Widgets/SettingsNavigator.h"
#include "Widgets/StatusBar.h"
#include "Widgets/Theme.h"

ConfigMainScreen::ConfigMainScreen(QWidget* parent)
    : DaddyPanel(TRANSITION_DIRECTION_IN_LEFT, parent)
{
    setObjectName(QStringLiteral("ConfigMainScreen"));
    SetTransitionOutDirection(TRANSITION_DIRECTION_IN_LEFT);
    setStyleSheet(QStringLiteral("ConfigMainScreen { background-color: white; }"));
    setAttribute(Qt::WA_StyledBackground, true);

    m_statusBar = new StatusBar(this);
    m_statusBar->setGeometry(0, 0, Theme::ScreenWidth, Theme::StatusBarHeight);

    m_navigator = new SettingsNavigator(this);
    m_navigator->setGeometry(0, Theme::StatusBarHeight, Theme::ScreenWidth,
                             Theme::ScreenHeight - Theme::StatusBarHeight);

    connect(m_navigator, &SettingsNavigator::closeSettings, this, &ConfigMainScreen::onCloseSettings);
    connect(m_navigator, &SettingsNavigator::GotoScreen, this, &ConfigMainScreen::onNavigatorGotoScreen);
    connect(m_navigator, &SettingsNavigator::displayPopup, this, &DaddyPanel::onAddPopup);
    connect(m_navigator, &SettingsNavigator::closePopup, this,
            QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));

    m_mainPage = new SettingsMainPage(m_navigator);
    connect(m_mainPage, &SettingsMainPage::closeSettings, m_navigator, &SettingsNavigator::onCloseSettings);
    m_navigator->setFirstPage(m_mainPage);
    m_statusBar->raise();
}

ConfigMainScreen::~ConfigMainScreen() = default;

void ConfigMainScreen::onCloseSettings()
{
    CloseScreen();
}

void ConfigMainScreen::onNavigatorGotoScreen(SCREEN_ID_T id)
{
    GotoScreen(id);
}
