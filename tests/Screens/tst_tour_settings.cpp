// The screenshot tour of the settings: every page of the navigator, the
// power question, the Wi-Fi password keypad, the licence and label viewers
// and the two screens behind the confirmation circle; see support/Tour.h.

#include "GUIAPI/DataManager.h"
#include "Screens/ConfigMainScreen.h"
#include "Screens/DeletePopup.h"
#include "Screens/RestoreFactorySettingsPopup.h"
#include "Screens/WifiPasswordScreen.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/ConfirmationCircleWidget.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsDatabaseMemoryPage.h"
#include "Widgets/SettingsDirectoryExplorerPage.h"
#include "Widgets/SettingsDisplayPage.h"
#include "Widgets/SettingsFileViewerPage.h"
#include "Widgets/SettingsLanguagePage.h"
#include "Widgets/SettingsLegalInformationPage.h"
#include "Widgets/SettingsMainPage.h"
#include "Widgets/SettingsMeasurementPage.h"
#include "Widgets/SettingsNavigator.h"
#include "Widgets/SettingsPowerOptionsPage.h"
#include "Widgets/SettingsPowerPage.h"
#include "Widgets/SettingsSystemAndDiagnosticsPage.h"
#include "Widgets/SettingsSystemInformationPage.h"
#include "Widgets/SettingsVolumePage.h"
#include "Widgets/SettingsWifiPage.h"

#include <QDir>
#include <QLineEdit>
#include <QScrollBar>
#include <QtTest>

#include "support/Tour.h"

namespace SettingsTour {

// The settings screen with `page` pushed over the main page and at rest.
template <class Page>
Page* show(QWidget* display, Page* page = nullptr)
{
    Tour::loadDemoJobs();
    auto* screen = new ConfigMainScreen(display);
    screen->show();
    if (page) {
        screen->navigator()->onNextPage(page);
        screen->navigator()->finishTransitions();
    }
    return page;
}

void scrollToEnd(SettingsPage* page)
{
    FlickList* list = page->getSettingsList();
    list->scrollToBottom();
    list->verticalScrollBar()->setValue(list->verticalScrollBar()->maximum());
}

void allMeasurementRows()
{
    StringTables::Init();
    UserParams::setAutoMeasureSwitchAvailable(true);
    UserParams::setAutoMeasure(true);
    UserParams::setAutoMeasureTimeout(2.0f);
    UserParams::setDisplayLABCH_MenuItem(true);
    UserParams::setDisplayOverridePressureSensorMenuItem(true);
    UserParams::setDisplayMeasurementModeSelectionMenuItem(true);
    UserParams::setJobDefaultAvgInfo(JOB_AVG_MODE_SMC, 3, 5, 0);
}

void wifiPage(QWidget* display)
{
    Tour::loadDemoJobs();
    DataManager::instance()->onLoadWifiSettings();
    auto* page = show(display, new SettingsWifiPage);
    page->onCreatePage();
}

void restoreTurning(QWidget* display)
{
    auto* popup = new RestoreFactorySettingsPopup(display);
    popup->show();
    ConfirmationCircleWidget* circle = popup->confirmationCircle();
    // Half way round, as a finger leaves it.
    QMouseEvent press(QEvent::MouseButtonPress, circle->dotGeometry().center(), Qt::LeftButton, Qt::LeftButton,
                      Qt::NoModifier);
    QApplication::sendEvent(circle, &press);
    for (int angle = 20; angle <= 200; angle += 20) {
        QMouseEvent move(QEvent::MouseMove, circle->trackPoint(angle), Qt::LeftButton, Qt::LeftButton,
                         Qt::NoModifier);
        QApplication::sendEvent(circle, &move);
    }
}

} // namespace SettingsTour

static QList<Tour::Stop> stops()
{
    using namespace SettingsTour;
    const QString legal = Platform::devicePath(QStringLiteral("/opt/GUI/Legal/"));
    return {
        {"settings_main", [](QWidget* d) { show<SettingsPage>(d); }},
        {"settings_main_end",
         [](QWidget* d) {
             show<SettingsPage>(d);
             scrollToEnd(d->findChild<SettingsMainPage*>());
         }},
        {"settings_main_de", [](QWidget* d) { show<SettingsPage>(d); }, "de"},
        {"settings_language", [](QWidget* d) { show(d, new SettingsLanguagePage); }},
        {"settings_display", [](QWidget* d) { show(d, new SettingsDisplayPage); }},
        {"settings_volume", [](QWidget* d) { show(d, new SettingsVolumePage); }},
        {"settings_measurement",
         [](QWidget* d) {
             allMeasurementRows();
             show(d, new SettingsMeasurementPage);
         }},
        {"settings_measurement_mode",
         [](QWidget* d) {
             allMeasurementRows();
             scrollToEnd(show(d, new SettingsMeasurementPage));
         }},
        {"settings_power_saving",
         [](QWidget* d) {
             UserParams::setPowerDisplayOffTime(30);
             UserParams::setPowerStandbyTime(900);
             UserParams::setPowerOffTime(0);
             show(d, new SettingsPowerOptionsPage);
         }},
        {"settings_power", [](QWidget* d) { show(d, new SettingsPowerPage); }},
        {"settings_power_confirm",
         [](QWidget* d) {
             auto* page = show(d, new SettingsPowerPage);
             page->onPowerOptionSelected(POWER_SHUTDOWN);
         }},
        {"settings_wifi", [](QWidget* d) { wifiPage(d); }},
        {"settings_wifi_password",
         [](QWidget* d) {
             auto* screen = new WifiPasswordScreen(d);
             screen->setNetworkName(QStringLiteral("Paintshop"));
             screen->getTextEditPointer()->setText(QStringLiteral("r3finish"));
             screen->show();
         }},
        {"settings_wifi_password_special",
         [](QWidget* d) {
             auto* screen = new WifiPasswordScreen(d);
             screen->onSpecialClicked();
             screen->findChild<QPushButton*>(QStringLiteral("BtnDisplayPassword"))->setChecked(true);
             screen->getTextEditPointer()->setText(QStringLiteral("r3finish!"));
             screen->show();
         }},
        {"settings_system", [](QWidget* d) { show(d, new SettingsSystemAndDiagnosticsPage); }},
        {"settings_system_information", [](QWidget* d) { show(d, new SettingsSystemInformationPage); }},
        {"settings_system_service_rows",
         [](QWidget* d) {
             auto* page = show(d, new SettingsSystemInformationPage);
             for (int i = 0; i <= SettingsSystemInformationPage::ServiceClicks; ++i)
                 page->onInfoClicked();
             scrollToEnd(page);
         }},
        {"settings_memory", [](QWidget* d) { show(d, new SettingsDatabaseMemoryPage); }},
        {"settings_open_source",
         [legal](QWidget* d) {
             show(d, new SettingsDirectoryExplorerPage(legal + "open_source", QStringLiteral("Open Source")));
         }},
        {"settings_licence_text",
         [legal](QWidget* d) {
             show(d, new SettingsFileViewerPage(legal + "open_source/Qt_5_LGPL-3.txt", QStringLiteral("Qt 5 LGPL-3")));
         }},
        {"settings_legal", [](QWidget* d) { show(d, new SettingsLegalInformationPage); }},
        {"settings_legal_label",
         [legal](QWidget* d) {
             const QStringList labels = QDir(legal + "E_labels").entryList(QDir::Files);
             show(d, new SettingsFileViewerPage(legal + "E_labels/" + labels.value(0),
                                                SettingsDirectoryExplorerPage::displayName(labels.value(0))));
         }},
        {"settings_restore_factory", [](QWidget* d) { (new RestoreFactorySettingsPopup(d))->show(); }},
        {"settings_restore_factory_turning", [](QWidget* d) { restoreTurning(d); }},
        {"settings_clear_database", [](QWidget* d) { (new DeleteAllSamplesPopup(d))->show(); }},
    };
}

TOUR_MAIN(stops)
