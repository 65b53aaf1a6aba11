// The settings screen against the simulator: opening and closing it from the
// home screen, the main page's rows, parameters that reach the server only
// through a page's back button, the sliders, the language, Wi-Fi switching,
// joining and forgetting, and the system pages.

#include "GUIAPI/DataManager.h"
#include "GUIAPI/SystemAPI.h"
#include "Screens/ConfigMainScreen.h"
#include "Screens/DaddyPanel.h"
#include "Screens/JobListScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/ScreenMaster.h"
#include "Screens/WifiPasswordScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/ConfirmationCircleWidget.h"
#include "Widgets/FlickList.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/SettingsDisplayPage.h"
#include "Widgets/SettingsLanguagePage.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsListSelectionWifiItem.h"
#include "Widgets/SettingsMainPage.h"
#include "Widgets/SettingsMeasurementPage.h"
#include "Widgets/SettingsNavigator.h"
#include "Widgets/SettingsPowerOptionsPage.h"
#include "Widgets/SettingsSliderItems.h"
#include "Widgets/SettingsSystemAndDiagnosticsPage.h"
#include "Widgets/SettingsSystemInformationPage.h"
#include "Widgets/SettingsWifiPage.h"
#include "Widgets/SpinnyCircle.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QDir>
#include <QElapsedTimer>
#include <QLineEdit>
#include <QPointer>
#include <QPushButton>
#include <QSignalSpy>
#include <QSlider>
#include <QtTest>

class tst_Settings : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    void settingsButtonOpensAndBackCloses();
    void wifiRowFollowsTheModelOnlyWhenRebuilt();
    void calibrationRowReadsExpiredAtZero();
    void measurementOptionsReachTheServerOnlyOnBack();
    void leavingOtherwiseSendsNothing();
    void dimmerAtTheEndStoresNever();
    void brightnessStoresAtRelease();
    void languageChoiceReloadsTheTranslation();
    void wifiToggleTwiceWithinDebounceUndoesTheSecond();
    void unknownNetworksOnlyWithoutDhcp();
    void joinWithWrongThenRightPassword();
    void openNetworkSkipsThePassword();
    void serviceRowsAfterTwentyOneClicks();
    void legalRowNeedsLabelPictures();

private:
    ConfigMainScreen* openSettings();
    SettingsNavigator* navigator() const;
    template <class Page>
    Page* push(SETTINGS_T row);
    template <class Page>
    Page* top() const;
    void back();
    QString param(const QString& name);
    QString control(const QString& line) { return m_sim.control(line); }
    SettingsListSelectionWifiItem* networkRow(SettingsWifiPage* page, const QString& ssid, bool known) const;
    void waitForWifiList(SettingsWifiPage* page);
    // Rows of the list as it stands; replaced rows linger as children until
    // they are deleted, so they are not looked for by name.
    static QWidget* listRow(SettingsPage* page, const QString& name);
    static bool listHas(SettingsPage* page, const QString& name) { return listRow(page, name); }
    static SettingsListSelectionItem* addressRow(SettingsPage* page)
    {
        return qobject_cast<SettingsListSelectionItem*>(listRow(page, QStringLiteral("WifiAddressRow")));
    }

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
    QList<SCREEN_ID_T> m_requested;
};

void tst_Settings::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("settings"), 0.2));
    SettingsWifiPage::setVerifyIntervalMs(100);

    // Screens of other areas stand in as plain panels.
    ProductHarness::standInOtherScreens(
        {CONFIG_MAIN_SCREEN_ID, RESTORE_FACTORY_SETTINGS_POPUP_SCREEN_ID, DELETE_ALL_SAMPLES_POPUP_SCREEN_ID},
        [this](SCREEN_ID_T id) { m_requested << id; });
    m_master = new ScreenMaster;
    m_master->show();
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(m_master->findChild<JobListScreen*>()->isReady(), 10000);
}

void tst_Settings::cleanupTestCase()
{
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_Settings::init()
{
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
    m_requested.clear();
}

ConfigMainScreen* tst_Settings::openSettings()
{
    auto* screen = qobject_cast<ConfigMainScreen*>(m_master->onAddScreenToStack(CONFIG_MAIN_SCREEN_ID));
    return screen;
}

SettingsNavigator* tst_Settings::navigator() const
{
    auto* screen = qobject_cast<ConfigMainScreen*>(m_master->currentScreen());
    return screen ? screen->navigator() : nullptr;
}

template <class Page>
Page* tst_Settings::top() const
{
    return navigator() ? qobject_cast<Page*>(navigator()->topPage()) : nullptr;
}

template <class Page>
Page* tst_Settings::push(SETTINGS_T row)
{
    auto* main = qobject_cast<SettingsMainPage*>(navigator()->pageAt(0));
    main->onSettingSelected(int(row));
    if (!top<Page>())
        return nullptr;
    QElapsedTimer waited;
    waited.start();
    while (navigator()->isAnimating() && waited.elapsed() < 2000)
        QTest::qWait(10);
    return top<Page>();
}

void tst_Settings::back()
{
    SettingsPage* page = navigator()->topPage();
    QTest::mouseClick(page->findChild<QPushButton*>(QStringLiteral("BtnBack")), Qt::LeftButton);
    QTRY_VERIFY(!navigator() || !navigator()->isAnimating());
}

QString tst_Settings::param(const QString& name)
{
    // "OK NAME = value"
    QString value = control(QStringLiteral("param ") + name).section(QStringLiteral(" = "), 1).trimmed();
    if (value.startsWith('"') && value.endsWith('"'))
        value = value.mid(1, value.size() - 2);
    return value;
}

void tst_Settings::settingsButtonOpensAndBackCloses()
{
    JobListScreen* home = m_master->findChild<JobListScreen*>();
    QTest::mouseClick(home->findChild<QPushButton*>(QStringLiteral("BtnSettings")), Qt::LeftButton);
    QTRY_VERIFY(qobject_cast<ConfigMainScreen*>(m_master->currentScreen()));
    QCOMPARE(navigator()->pageCount(), 1);
    // The main page has no page beneath: its back closes the screen.
    back();
    QTRY_COMPARE(m_master->screenCount(), 1);
    QTRY_VERIFY(home->isEnabled());
}

void tst_Settings::wifiRowFollowsTheModelOnlyWhenRebuilt()
{
    UserParams::setWifiEnabled(true);
    ConfigMainScreen* first = openSettings();
    QVERIFY(first->mainPage()->setting(SETTING_WIFI).objectPointer);
    QCOMPARE(first->mainPage()->getSettingsList()->count(), int(NUM_SETTINGS));

    UserParams::setWifiEnabled(false);
    first->mainPage()->onUpdatePage();
    QVERIFY(first->mainPage()->setting(SETTING_WIFI).objectPointer);

    m_master->onCloseScreen(first);
    ConfigMainScreen* second = openSettings();
    QVERIFY(!second->mainPage()->setting(SETTING_WIFI).objectPointer);
    QCOMPARE(second->mainPage()->getSettingsList()->count(), int(NUM_SETTINGS) - 1);
    // The absent row is skipped, not written.
    second->mainPage()->onUpdatePage();
    UserParams::setWifiEnabled(true);
}

void tst_Settings::calibrationRowReadsExpiredAtZero()
{
    ConfigMainScreen* screen = openSettings();
    SettingsListSelectionItem* row = screen->mainPage()->setting(SETTING_CALIBRATION).objectPointer;
    QVERIFY(control(QStringLiteral("calibration expire")).startsWith(QLatin1String("OK")));
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal, 0, 10000);
    screen->mainPage()->onUpdatePage();
    QCOMPARE(row->getBtnStatusText(), QStringLiteral("Expired"));

    QVERIFY(control(QStringLiteral("calibration renew")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal > 0, 10000);
    screen->mainPage()->onUpdatePage();
    QCOMPARE(row->getBtnStatusText(), QStringLiteral("Valid"));

    // The row leads to the wizard without a page of its own.
    screen->mainPage()->onSettingSelected(SETTING_CALIBRATION);
    QCOMPARE(m_requested, QList<SCREEN_ID_T>({CAL_WIZARD_SCREEN_ID}));
}

void tst_Settings::measurementOptionsReachTheServerOnlyOnBack()
{
    UserParams::setAutoMeasureSwitchAvailable(true);
    UserParams::setDisplayLABCH_MenuItem(true);
    UserParams::setDisplayOverridePressureSensorMenuItem(true);
    UserParams::setDisplayMeasurementModeSelectionMenuItem(true);
    UserParams::setAutoMeasure(false);
    QCOMPARE(param(QStringLiteral("AUTO_MEASURE")), QStringLiteral("0"));
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    info.mode = JOB_AVG_MODE_SMC;
    info.smcGoodMeasurements = 3;
    info.smcMaxMeasurements = 5;
    UserParams::setJobDefaultAvgInfo(info);

    openSettings();
    auto* page = push<SettingsMeasurementPage>(SETTING_MEASUREMENT);
    QVERIFY(page);
    FlickList* list = page->getSettingsList();
    // The delay row is there but hidden while auto measurement is off.
    const int delayRow = list->row(list->item(2));
    QVERIFY(list->isRowHidden(delayRow));

    page->autoMeasureToggle()->sendClick();
    QVERIFY(UserParams::getAutoMeasure());
    QVERIFY(!list->isRowHidden(delayRow));
    QCOMPARE(page->autoMeasureToggle()->text(), QStringLiteral("Auto Measurements: On"));

    // m above n drags n along; n below m drags m.
    QCOMPARE(page->mSlider()->getValue(), 3);
    QCOMPARE(page->nSlider()->getValue(), 5);
    for (int i = 0; i < 4; ++i)
        page->mSlider()->slider()->triggerAction(QAbstractSlider::SliderPageStepAdd);
    QCOMPARE(page->mSlider()->getValue(), 7);
    QCOMPARE(page->nSlider()->getValue(), 7);
    page->nSlider()->slider()->triggerAction(QAbstractSlider::SliderToMinimum);
    page->nSlider()->slider()->triggerAction(QAbstractSlider::SliderPageStepAdd);
    QCOMPARE(page->nSlider()->getValue(), 4);
    QCOMPARE(page->mSlider()->getValue(), 4);
    QCOMPARE(UserParams::getJobDefaultAvgInfo().smcGoodMeasurements, 4);
    QCOMPARE(UserParams::getJobDefaultAvgInfo().smcMaxMeasurements, 4);

    // Nothing has gone to the server yet.
    QCOMPARE(param(QStringLiteral("AUTO_MEASURE")), QStringLiteral("0"));
    back();
    QCOMPARE(navigator()->pageCount(), 1);
    QCOMPARE(param(QStringLiteral("AUTO_MEASURE")), QStringLiteral("1"));
    QCOMPARE(param(QStringLiteral("SMC_GOOD_MEASUREMENTS")), QStringLiteral("4"));
    QCOMPARE(param(QStringLiteral("SMC_MAX_MEASUREMENTS")), QStringLiteral("4"));
}

void tst_Settings::leavingOtherwiseSendsNothing()
{
    UserParams::setAutoMeasureSwitchAvailable(true);
    control(QStringLiteral("param AUTO_MEASURE 0"));
    UserParams::setAutoMeasure(false);
    ConfigMainScreen* screen = openSettings();
    auto* page = push<SettingsMeasurementPage>(SETTING_MEASUREMENT);
    page->autoMeasureToggle()->sendClick();
    // Home by the hidden corner: the pages go without their back buttons.
    screen->onGoHome();
    QTRY_COMPARE(m_master->screenCount(), 1);
    QCOMPARE(param(QStringLiteral("AUTO_MEASURE")), QStringLiteral("0"));
    UserParams::setAutoMeasure(false);
}

void tst_Settings::dimmerAtTheEndStoresNever()
{
    control(QStringLiteral("param DEFAULT_DISPLAY_DIMMER_TIME 60"));
    UserParams::setPowerDisplayOffTime(60);
    openSettings();
    auto* page = push<SettingsPowerOptionsPage>(SETTING_POWER);
    QVERIFY(page);
    QCOMPARE(page->dimmerSlider()->getValue(), 60);
    page->dimmerSlider()->slider()->triggerAction(QAbstractSlider::SliderToMaximum);
    // SliderToMaximum is no step: the value is stored at the next step.
    page->dimmerSlider()->slider()->triggerAction(QAbstractSlider::SliderPageStepAdd);
    QCOMPARE(page->dimmerSlider()->getValue(), 120);
    QCOMPARE(page->dimmerSlider()->entryText(), QString());
    QCOMPARE(UserParams::getPowerDisplayOffTime(), 0);
    QCOMPARE(param(QStringLiteral("DEFAULT_DISPLAY_DIMMER_TIME")), QStringLiteral("60"));
    back();
    QCOMPARE(param(QStringLiteral("DEFAULT_DISPLAY_DIMMER_TIME")), QStringLiteral("0"));

    // Stored never reads as the slider's end, with an empty field.
    auto* again = push<SettingsPowerOptionsPage>(SETTING_POWER);
    QCOMPARE(again->dimmerSlider()->getValue(), 120);
    QCOMPARE(again->dimmerSlider()->entryText(), QString());
    QCOMPARE(again->dimmerSlider()->maxText(), QStringLiteral("Never"));
}

void tst_Settings::brightnessStoresAtRelease()
{
    QVERIFY(SysAPI_SetDisplayBrightness(50));
    UserParams::setDisplayBrightness(50);
    openSettings();
    auto* page = push<SettingsDisplayPage>(SETTING_DISPLAY);
    QSlider* slider = page->slider()->slider();
    QCOMPARE(slider->value(), 50);
    QCOMPARE(slider->minimum(), 1);

    slider->setSliderDown(true);
    slider->setSliderPosition(80);
    QCOMPARE(page->slider()->entryText(), QStringLiteral("80"));
    unsigned int level = 0;
    QVERIFY(SysAPI_GetDisplayBrightness(level));
    QCOMPARE(level, 50u);
    slider->setSliderDown(false);
    QVERIFY(SysAPI_GetDisplayBrightness(level));
    QCOMPARE(level, 80u);
    QCOMPARE(UserParams::getDisplayBrightness(), 80u);
    back();
    auto* main = qobject_cast<SettingsMainPage*>(navigator()->topPage());
    QCOMPARE(main->setting(SETTING_DISPLAY).objectPointer->getBtnStatusText(), QStringLiteral("80"));
}

void tst_Settings::languageChoiceReloadsTheTranslation()
{
    openSettings();
    auto* page = push<SettingsLanguagePage>(SETTING_LANGUAGE);
    FlickList* list = page->getSettingsList();
    QVERIFY(list->count() >= 2);
    QSignalSpy changed(DataManager::instance(), &DataManager::languageChanged);
    SettingsListSelectionCheckableItem* german = nullptr;
    SettingsListSelectionCheckableItem* english = nullptr;
    for (int i = 0; i < list->count(); ++i) {
        auto* row = qobject_cast<SettingsListSelectionCheckableItem*>(list->getWidget(i));
        if (row->getParam().compare(QLatin1String("de"), Qt::CaseInsensitive) == 0)
            german = row;
        if (row->getParam().compare(QLatin1String("en"), Qt::CaseInsensitive) == 0)
            english = row;
    }
    QVERIFY(german && english);
    QVERIFY(english->getChecked());
    german->sendClick();
    QCOMPARE(UserParams::getLanguageCode().toLower(), QStringLiteral("de"));
    QVERIFY(changed.count() >= 1);
    QVERIFY(german->getChecked());
    QVERIFY(!english->getChecked());
    QCOMPARE(param(QStringLiteral("CURRENT_LANGUAGE_ID")).toLower(), QStringLiteral("de"));
    // Tapping the chosen row keeps it chosen.
    german->sendClick();
    QVERIFY(german->getChecked());
    english->sendClick();
    QCOMPARE(UserParams::getLanguageCode().toLower(), QStringLiteral("en"));
}

SettingsListSelectionWifiItem* tst_Settings::networkRow(SettingsWifiPage* page, const QString& ssid, bool known) const
{
    FlickList* list = page->getSettingsList();
    for (int i = 0; i < list->count(); ++i) {
        auto* row = qobject_cast<SettingsListSelectionWifiItem*>(list->getWidget(i));
        if (row && row->getBtnSettingText() == ssid && row->isDeleteIconShown() == known)
            return row;
    }
    return nullptr;
}

QWidget* tst_Settings::listRow(SettingsPage* page, const QString& name)
{
    FlickList* list = page->getSettingsList();
    for (int i = 0; i < list->count(); ++i) {
        if (list->getWidget(i) && list->getWidget(i)->objectName() == name)
            return list->getWidget(i);
    }
    return nullptr;
}

void tst_Settings::waitForWifiList(SettingsWifiPage* page)
{
    QTRY_VERIFY_WITH_TIMEOUT(!page->spinner()->isVisible(), 10000);
}

void tst_Settings::wifiToggleTwiceWithinDebounceUndoesTheSecond()
{
    control(QStringLiteral("wifi on"));
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState() != WIFI_STATUS_OFF, 10000);
    openSettings();
    auto* page = push<SettingsWifiPage>(SETTING_WIFI);
    QVERIFY(page);
    waitForWifiList(page);
    SettingsListSelectionToggleItem* toggle = page->toggleRow();
    QVERIFY(toggle->isChecked());
    QCOMPARE(toggle->text(), QStringLiteral("On"));

    toggle->toggleButton()->click();
    QVERIFY(!page->isDebounced());
    QVERIFY(!toggle->isChecked());
    QVERIFY(toggle->text().startsWith(QLatin1String("Off [")));
    // The switch is held for the debounce; a tap that gets through anyway
    // (a second event on the same frame) is undone.
    page->onCheckedStateChanged(true);
    QVERIFY(!toggle->isChecked());
    QTRY_VERIFY_WITH_TIMEOUT(page->isDebounced(), 3000);
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState(), WIFI_STATUS_OFF, 10000);

    toggle->toggleButton()->click();
    QVERIFY(toggle->isChecked());
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState() != WIFI_STATUS_OFF, 15000);
}

void tst_Settings::unknownNetworksOnlyWithoutDhcp()
{
    control(QStringLiteral("wifi on"));
    control(QStringLiteral("wifi dhcp"));
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState(), WIFI_STATUS_CONNECTED, 15000);
    openSettings();
    auto* page = push<SettingsWifiPage>(SETTING_WIFI);
    QTRY_VERIFY_WITH_TIMEOUT(listHas(page, QStringLiteral("KnownNetworksHeader")), 10000);
    waitForWifiList(page);
    QVERIFY(!listHas(page, QStringLiteral("UnknownNetworksHeader")));
    auto* address = addressRow(page);
    QVERIFY(address);
    QVERIFY(address->getBtnStatusText().startsWith(QLatin1String("DHCP ")));

    control(QStringLiteral("wifi static 192.168.7.9"));
    page->onCreatePage();
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getIpAddress().startsWith(QLatin1String("192.168.7.9")), 10000);
    page->onCreatePage();
    QVERIFY(listHas(page, QStringLiteral("UnknownNetworksHeader")));
    address = addressRow(page);
    QCOMPARE(address->getBtnStatusText(), QStringLiteral("Static IP"));
    QCOMPARE(address->getBtnSettingText(), QStringLiteral("192.168.7.9"));
    control(QStringLiteral("wifi dhcp"));
}

void tst_Settings::joinWithWrongThenRightPassword()
{
    control(QStringLiteral("wifi on"));
    control(QStringLiteral("wifi static 192.168.7.9"));
    QVERIFY(control(QStringLiteral("wifi network Paintshop in 0.8 WPA2-PSK s3cret")).startsWith(QLatin1String("OK")));
    openSettings();
    auto* page = push<SettingsWifiPage>(SETTING_WIFI);
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Paintshop"), false), 15000);
    waitForWifiList(page);

    networkRow(page, QStringLiteral("Paintshop"), false)->sendClick();
    QPointer<WifiPasswordScreen> screen = page->passwordScreen();
    QVERIFY(screen);
    screen->getTextEditPointer()->setText(QStringLiteral("wrong"));
    QTest::mouseClick(screen->findChild<QPushButton*>(QStringLiteral("BtnNext")), Qt::LeftButton);
    QTRY_VERIFY(screen.isNull());
    auto* panel = qobject_cast<DaddyPanel*>(m_master->currentScreen());
    QTRY_VERIFY_WITH_TIMEOUT(!panel->popups().empty(), 10000);
    auto* popup = qobject_cast<NotificationPopup*>(panel->popups().back());
    QVERIFY(popup);
    QCOMPARE(popup->messageText(), QStringLiteral("Incorrect password"));
    QCOMPARE(popup->headerText(), QStringLiteral("Connection Issue"));
    emit popup->btnClicked();
    QVERIFY(panel->popups().empty());

    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Paintshop"), false), 15000);
    waitForWifiList(page);
    networkRow(page, QStringLiteral("Paintshop"), false)->sendClick();
    screen = page->passwordScreen();
    QVERIFY(screen);
    screen->getTextEditPointer()->setText(QStringLiteral("s3cret"));
    QTest::mouseClick(screen->findChild<QPushButton*>(QStringLiteral("BtnNext")), Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Paintshop"), true), 15000);
    QVERIFY(panel->popups().empty());

    // Forgotten again, it is offered to join.
    page->onRemoveSSID(QStringLiteral("Paintshop"));
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Paintshop"), false), 15000);
    control(QStringLiteral("wifi dhcp"));
}

void tst_Settings::openNetworkSkipsThePassword()
{
    control(QStringLiteral("wifi on"));
    control(QStringLiteral("wifi static 192.168.7.9"));
    QVERIFY(control(QStringLiteral("wifi network Canteen in 0.5 OPEN")).startsWith(QLatin1String("OK")));
    openSettings();
    auto* page = push<SettingsWifiPage>(SETTING_WIFI);
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Canteen"), false), 15000);
    waitForWifiList(page);
    networkRow(page, QStringLiteral("Canteen"), false)->sendClick();
    QVERIFY(!page->passwordScreen());
    QVERIFY(!m_master->findChild<WifiPasswordScreen*>());
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Canteen"), true), 15000);
    page->onRemoveSSID(QStringLiteral("Canteen"));
    QTRY_VERIFY_WITH_TIMEOUT(networkRow(page, QStringLiteral("Canteen"), false), 15000);
    control(QStringLiteral("wifi dhcp"));
}

void tst_Settings::serviceRowsAfterTwentyOneClicks()
{
    openSettings();
    push<SettingsSystemAndDiagnosticsPage>(SETTING_SYSTEM)->onSubmenuSelected(SYS_DIAG_SUB_PAGE_SYS_INFO);
    QTRY_VERIFY(top<SettingsSystemInformationPage>() && !navigator()->isAnimating());
    auto* page = top<SettingsSystemInformationPage>();
    FlickList* list = page->getSettingsList();
    const int rows = list->count();
    QCOMPARE(rows, 3);
    QVERIFY(page->infoBlock()->text().contains(QStringLiteral("BIRCH")));
    for (int i = 0; i < 20; ++i)
        emit page->infoBlock()->clicked();
    QCOMPARE(list->count(), rows);
    emit page->infoBlock()->clicked();
    QCOMPARE(list->count(), rows + 3);
    for (int i = 0; i < 5; ++i)
        emit page->infoBlock()->clicked();
    QCOMPARE(list->count(), rows + 3);

    page->onBurnInTestLarchTest();
    QCOMPARE(param(QStringLiteral("BURN_IN_TEST")), QStringLiteral("2"));
    control(QStringLiteral("param BURN_IN_TEST 0"));

    // The factory reset is a screen of its own.
    page->onRowSelected(0);
    QTRY_COMPARE(m_master->currentScreen()->objectName(), QStringLiteral("RestoreFactorySettingsPopup"));
}

void tst_Settings::legalRowNeedsLabelPictures()
{
    const QString oldRoot = Platform::root();
    const QString root = TestSupport::makeTempDir(QStringLiteral("settings-legal"));
    Platform::setRoot(root);
    openSettings();
    auto* page = push<SettingsSystemAndDiagnosticsPage>(SETTING_SYSTEM);
    QVERIFY(!page->rowTexts().contains(QStringLiteral("Legal Information")));

    QVERIFY(QDir().mkpath(root + "/opt/GUI/Legal/E_labels"));
    QFile text(root + "/opt/GUI/Legal/E_labels/readme.txt");
    QVERIFY(text.open(QIODevice::WriteOnly));
    text.close();
    page->onCreatePage();
    // Only pictures count.
    QVERIFY(!page->rowTexts().contains(QStringLiteral("Legal Information")));
    QImage label(20, 20, QImage::Format_RGB32);
    label.fill(Qt::white);
    QVERIFY(label.save(root + "/opt/GUI/Legal/E_labels/ce.png"));
    page->onCreatePage();
    QCOMPARE(page->rowTexts().at(2), QStringLiteral("Legal Information"));
    Platform::setRoot(oldRoot);
}

QTEST_MAIN(tst_Settings)
#include "tst_settings.moc"
