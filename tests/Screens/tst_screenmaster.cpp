// The screen stack: the factory, closing and replacing screens, the home
// screen that nothing closes, the lock, sync and fault screens, the
// calibration guard, the measurement issue table, the power key,
// transitions and languages.

#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Platform.h"
#include "Screens/DaddyPanel.h"
#include "Screens/ErrorPopup.h"
#include "Screens/LockScreen.h"
#include "Screens/PowerDownPopup.h"
#include "Screens/SadPuppyScreen.h"
#include "Screens/ScreenMaster.h"
#include "Screens/SyncScreen.h"
#include "Widgets/XPushButton.h"

#include <QApplication>
#include <QFontInfo>
#include <QPointer>
#include <QSignalSpy>
#include <QStackedLayout>
#include <QtTest>

namespace {

// Stands in for the screens of later parts; the object name is what the
// stack looks at.
class TestPanel : public DaddyPanel
{
    Q_OBJECT
public:
    TestPanel(const QString& name, QWidget* parent)
        : DaddyPanel(parent)
    {
        setObjectName(name);
    }
    using DaddyPanel::FadeTransition;
};

QWidget* testScreens(SCREEN_ID_T id, QWidget* parent)
{
    switch (id) {
    case JOB_LIST_SCREEN_ID: return new TestPanel("JobListScreen", parent);
    case JOB_MEASURE_SCREEN_ID: return new TestPanel("JobMeasureScreen", parent);
    case TARGETING_SCREEN_ID: return new TestPanel("TargetingScreen", parent);
    case CAL_WIZARD_SCREEN_ID: return new TestPanel("CalibrationWizard", parent);
    case CAL_WIZARD_STEPS_INSTRUCTIONS_ID:
    case CAL_WIZARD_STEPS_REF_CHECK_INSTRUCTIONS_ID:
        return new TestPanel("CalibrationWizardScreen", parent);
    default: return nullptr;
    }
}

QStringList names(ScreenMaster& master)
{
    QStringList list;
    for (int i = 0; i < master.screenCount(); ++i)
        list << master.screenAt(i)->objectName();
    return list;
}

QStringList activeNames(ScreenMaster& master)
{
    QStringList list;
    for (int i = 0; i < master.screenCount(); ++i) {
        auto* panel = qobject_cast<DaddyPanel*>(master.screenAt(i));
        if (panel && panel->isActive())
            list << panel->objectName();
    }
    return list;
}

DaddyPanel* top(ScreenMaster& master)
{
    return qobject_cast<DaddyPanel*>(master.currentScreen());
}

void flushDeletes()
{
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QCoreApplication::processEvents();
}

QString played(const QString& file)
{
    return "aplay -N " + Platform::devicePath("/opt/GUI/Sounds/" + file);
}

} // namespace

class TestScreenMaster : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase()
    {
        ScreenMaster::setScreenFactoryOverride(testScreens);
    }

    void init()
    {
        Platform::clearRecordedCommands();
    }

    void theHomeScreenStandsAtTheBottomAndIsActive()
    {
        ScreenMaster master;
        QCOMPARE(master.objectName(), QString("ScreenMaster"));
        QCOMPARE(master.size(), QSize(320, 480));
        QCOMPARE(master.screenStack()->stackingMode(), QStackedLayout::StackAll);
        QCOMPARE(names(master), QStringList({"JobListScreen"}));
        QCOMPARE(activeNames(master), QStringList({"JobListScreen"}));

        master.onCloseCurrentScreen();
        master.onGotoHomeScreen();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen"}));
        QCOMPARE(activeNames(master), QStringList({"JobListScreen"}));
    }

    void theFactoryBuildsKnownIdsAndLeavesTheStackForOthers()
    {
        ScreenMaster master;
        QVERIFY(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));
        QCOMPARE(activeNames(master), QStringList({"JobMeasureScreen"}));
        QVERIFY(!master.onAddScreenToStack(POPUPS_SCREEN_ID));
        QVERIFY(!master.onAddScreenToStack(CAL_NEEDED_POPUP_SCREEN_ID));
        QVERIFY(!master.onAddScreenToStack(NUM_SCREEN_IDS)); // a valid value that names no screen
        QCOMPARE(names(master), QStringList({"JobListScreen", "JobMeasureScreen"}));
        QCOMPARE(activeNames(master), QStringList({"JobMeasureScreen"}));

        QWidget* lock = master.onAddScreenToStack(LOCK_SCREEN_ID);
        QCOMPARE(lock->metaObject()->className(), "LockScreen");
        QWidget* sync = master.onAddScreenToStack(SYNC_SCREEN_ID);
        QCOMPARE(sync->metaObject()->className(), "SyncScreen");
        QCOMPARE(activeNames(master), QStringList({"SyncScreen"}));
    }

    void closingAScreenThatIsNotThereDeletesNothing()
    {
        ScreenMaster master;
        QPointer<QWidget> measure = master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        QPointer<QWidget> targeting = master.onAddScreenToStack(TARGETING_SCREEN_ID);
        top(master)->SetActiveStatus(false);

        QPointer<QWidget> stray = new QWidget;
        master.onCloseScreen(stray);
        master.onCloseScreen(nullptr);
        flushDeletes();
        QVERIFY(stray);
        QCOMPARE(names(master), QStringList({"JobListScreen", "JobMeasureScreen", "TargetingScreen"}));
        // The top is activated again.
        QCOMPARE(activeNames(master), QStringList({"TargetingScreen"}));

        // A screen below the top goes; a second close of it is harmless.
        master.onCloseScreen(measure);
        master.onCloseScreen(measure);
        flushDeletes();
        QVERIFY(!measure);
        QCOMPARE(names(master), QStringList({"JobListScreen", "TargetingScreen"}));
        QCOMPARE(activeNames(master), QStringList({"TargetingScreen"}));
        delete stray;
    }

    void aSecondCloseScreenDoesNothing()
    {
        ScreenMaster master;
        auto* panel = qobject_cast<DaddyPanel*>(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));
        master.onAddScreenToStack(TARGETING_SCREEN_ID);
        QSignalSpy closes(panel, &DaddyPanel::CloseScreenSignal);
        QSignalSpy homes(panel, &DaddyPanel::GotoHomeScreenSignal);
        QSignalSpy replaces(panel, &DaddyPanel::RemoveAndAddScreenToStack);

        panel->CloseScreen();
        QVERIFY(panel->isClosing());
        panel->CloseScreen();
        panel->onGoHome();
        panel->CloseAndGotoScreen(JOB_MEASURE_SCREEN_ID);
        QCOMPARE(closes.count(), 1);
        QCOMPARE(homes.count(), 0);
        QCOMPARE(replaces.count(), 0);
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "TargetingScreen"}));
    }

    void aClosingScreenHearsNoMoreNews()
    {
        ScreenMaster master;
        auto* panel = qobject_cast<DaddyPanel*>(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));
        panel->CloseScreen();
        // Still alive until the next turn of the loop, but deaf.
        API_SignalMaster::instance()->emitMeasurementIssue(9);
        QVERIFY(panel->popups().empty());
        flushDeletes();
        // The home screen took over and reports.
        QCOMPARE(top(master)->popups().size(), size_t(1));
        top(master)->onCloseAllPopups();
    }

    void replacingAScreenKeepsTheOldOneUntilTheNewOneStands()
    {
        ScreenMaster master;
        auto* measure = qobject_cast<DaddyPanel*>(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));
        QPointer<QWidget> old = measure;
        measure->CloseAndGotoScreen(TARGETING_SCREEN_ID);
        flushDeletes();
        QVERIFY(!old);
        QCOMPARE(names(master), QStringList({"JobListScreen", "TargetingScreen"}));
        QCOMPARE(activeNames(master), QStringList({"TargetingScreen"}));

        // An id with no screen still loses the old screen.
        master.onRemoveAndAddScreenToStack(master.currentScreen(), POPUPS_SCREEN_ID);
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen"}));
    }

    void goingHomeClosesEverythingAboveTheHomeScreen()
    {
        ScreenMaster master;
        master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        master.onAddScreenToStack(TARGETING_SCREEN_ID);
        API_SignalMaster::instance()->emitGoHome();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen"}));
        QCOMPARE(activeNames(master), QStringList({"JobListScreen"}));

        master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        API_SignalMaster::instance()->emitGoToLabMode();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "TargetingScreen"}));
    }

    void repeatedLockSnapshotsAddOneLockScreen()
    {
        ScreenMaster master;
        master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        for (int i = 0; i < 4; ++i)
            API_SignalMaster::instance()->emitLockStarted();
        QCOMPARE(names(master), QStringList({"JobListScreen", "JobMeasureScreen", "LockScreen"}));
        QCOMPARE(activeNames(master), QStringList({"LockScreen"}));

        API_SignalMaster::instance()->emitLockFinished();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "JobMeasureScreen"}));

        // A lock screen below the top is found and closed.
        master.onGotoLockScreen();
        master.onAddScreenToStack(TARGETING_SCREEN_ID);
        master.onCloseLockScreen();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "JobMeasureScreen", "TargetingScreen"}));
        master.onCloseLockScreen(); // none left: nothing happens
        QCOMPARE(master.screenCount(), 3);

        master.onGotoSyncScreen();
        master.onGotoSyncScreen();
        QCOMPARE(names(master).count("SyncScreen"), 1);
    }

    void theWizardIsNotInterruptedByItself()
    {
        ScreenMaster master;
        API_SignalMaster::instance()->emitGoToWhiteCalibration();
        QCOMPARE(names(master), QStringList({"JobListScreen", "CalibrationWizardScreen"}));
        QPointer<QWidget> wizard = master.currentScreen();

        API_SignalMaster::instance()->emitGoToWhiteCalibration();
        API_SignalMaster::instance()->emitGoToRefCheck();
        flushDeletes();
        QVERIFY(wizard);
        QCOMPARE(master.currentScreen(), wizard.data());
        QCOMPARE(master.screenCount(), 2);

        // From elsewhere the request goes home first.
        API_SignalMaster::instance()->emitGoHome();
        master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        master.onAddScreenToStack(TARGETING_SCREEN_ID);
        API_SignalMaster::instance()->emitGoToRefCheck();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "CalibrationWizardScreen"}));

        // The calibration popup screen is added without any check.
        API_SignalMaster::instance()->emitDisplayCalibrationPopup();
        API_SignalMaster::instance()->emitDisplayCalibrationPopup();
        QCOMPARE(names(master).count("CalibrationWizard"), 2);
    }

    void aLostLinkLeavesTheFaultScreenOverTheHomeScreen()
    {
        ScreenMaster master;
        master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
        master.onAddScreenToStack(TARGETING_SCREEN_ID);
        API_SignalMaster::instance()->emitSadPuppy();
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen", "SadPuppyScreen"}));
        QCOMPARE(activeNames(master), QStringList({"SadPuppyScreen"}));
        QTRY_VERIFY(Platform::recordedCommands().contains(played("errorUser.wav")));

        // Dismissed with its button, back to the job list.
        auto* ok = master.currentScreen()->findChild<XPushButton*>("Btn");
        QTest::mouseClick(ok, Qt::LeftButton);
        flushDeletes();
        QCOMPARE(names(master), QStringList({"JobListScreen"}));
    }

    void anIssueIsShownOnceOnTheActivePanel()
    {
        ScreenMaster master;
        auto* home = top(master);
        auto* measure = qobject_cast<DaddyPanel*>(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));
        API_SignalMaster::instance()->emitMeasurementIssue(9);
        QCOMPARE(home->popups().size(), size_t(0));
        QCOMPARE(measure->popups().size(), size_t(1));
        QCOMPARE(master.findChildren<ErrorPopup*>().size(), 1);
        auto* popup = qobject_cast<ErrorPopup*>(measure->popups().front());
        QVERIFY(popup);
        QCOMPARE(popup->headerText(), QString("Instrument Is Full"));
        QVERIFY(!popup->isHidden());
        QTRY_VERIFY(Platform::recordedCommands().contains(played("errorUser.wav")));

        // Its button closes it.
        QTest::mouseClick(popup->findChild<XPushButton*>("Btn"), Qt::LeftButton);
        QCOMPARE(measure->popups().size(), size_t(0));
        QCOMPARE(master.findChildren<ErrorPopup*>().size(), 0);
    }

    void theIssueTable_data()
    {
        QTest::addColumn<int>("code");
        QTest::addColumn<QString>("kind");
        QTest::addColumn<QString>("title");
        QTest::addColumn<QString>("text");
        QTest::addColumn<QString>("sound");
        QTest::newRow("reference check") << -2 << "NotificationPopup" << "Warning"
                                          << "Reference Check Failed" << "errorUser.wav";
        QTest::newRow("good news") << -1 << "" << "" << "" << "calculation_finished.wav";
        QTest::newRow("no entries") << 1000 << "ErrorPopup" << "Error" << "No database entries"
                                    << "errorUser.wav";
        QTest::newRow("1066") << 1066 << "ErrorPopup" << "Error" << "No database entries"
                              << "errorUser.wav";
        QTest::newRow("1065") << 1065 << "ErrorPopup" << "Error" << "Index invalid" << "errorUser.wav";
        QTest::newRow("moved") << 2032 << "ErrorPopup" << "Measurement Cancelled"
                               << "The instrument was moved during a measurement"
                               << "measurement_failed.wav";
        QTest::newRow("white tile") << 2001 << "ErrorPopup" << "Calibration Error"
                                    << "Instrument not on white tile, or internal white dirty"
                                    << "measurement_failed.wav";
        QTest::newRow("aborted") << 2033 << "ErrorPopup" << "Measurement Aborted"
                                 << "The measurement has been aborted by the user"
                                 << "measurement_failed.wav";
        QTest::newRow("battery low") << 2034 << "NotificationPopup" << "Warning"
                                     << "Battery is low. Charge the battery" << "errorUser.wav";
        QTest::newRow("low storage") << 2047 << "NotificationPopup" << "Warning" << "Low Storage"
                                     << "errorUser.wav";
        QTest::newRow("update battery") << 2118 << "ErrorPopup" << "Warning"
                                        << "Battery level is too low for update" << "errorUser.wav";
        QTest::newRow("checkpoints") << 3237 << "ErrorPopup" << "Error"
                                     << "Different best matches for checkpoints" << "errorUser.wav";
        QTest::newRow("success") << 0 << "" << "" << "" << "";
        QTest::newRow("not listed") << 2044 << "" << "" << "" << "";
        QTest::newRow("tag filter") << -92934 << "" << "" << "" << "errorUser.wav";
    }

    void theIssueTable()
    {
        QFETCH(int, code);
        QFETCH(QString, kind);
        QFETCH(QString, title);
        QFETCH(QString, text);
        QFETCH(QString, sound);
        ScreenMaster master;
        DaddyPanel* home = top(master);
        PopupPanel* popup = home->onMeasurementIssue(code);
        if (kind.isEmpty()) {
            QVERIFY(!popup);
        } else {
            QVERIFY(popup);
            QCOMPARE(popup->objectName(), kind);
            auto* note = qobject_cast<NotificationPopup*>(popup);
            QCOMPARE(note->headerText(), title);
            QCOMPARE(note->messageText(), text);
        }
        if (!sound.isEmpty())
            QTRY_VERIFY(Platform::recordedCommands().contains(played(sound)));
        home->onCloseAllPopups();
    }

    void issue15OpensTheCalibrationWizard()
    {
        ScreenMaster master;
        API_SignalMaster::instance()->emitMeasurementIssue(15);
        QCOMPARE(names(master), QStringList({"JobListScreen", "CalibrationWizard"}));
    }

    void messageBoxesReplaceEachOtherAndPopupsPileUp()
    {
        ScreenMaster master;
        DaddyPanel* home = top(master);
        QPointer<PopupPanel> first = home->onShowMessageBoxPopup("Server", "First");
        PopupPanel* second = home->onShowMessageBoxPopup("Server", "Second");
        QVERIFY(!first);
        QCOMPARE(home->messageBox(), second);
        home->onShowErrorPopup("OK", "Error", "One");
        home->onShowNotificationPopup("OK", "Warning", "Two");
        QCOMPARE(home->popups().size(), size_t(2));
        QTest::mouseClick(second->findChild<XPushButton*>("Btn"), Qt::LeftButton);
        QVERIFY(!home->messageBox());
        home->onCloseAllPopups();
        QVERIFY(home->popups().empty());
        QCOMPARE(master.findChildren<PopupPanel*>().size(), 0);

        // A popup deleted behind the panel's back leaves the list.
        delete home->onShowErrorPopup("OK", "Error", "Gone");
        QVERIFY(home->popups().empty());
    }

    void coversShareOneFieldAndTheSyncCoverClosesItself()
    {
        ScreenMaster master;
        master.show();
        DaddyPanel* home = top(master);
        home->onShowLockScreen();
        QWidget* lock = home->lockScreen();
        QCOMPARE(lock->metaObject()->className(), "LockScreen");
        home->onShowSyncScreen(); // the lock cover stands: nothing
        home->onShowLockScreen();
        QCOMPARE(home->lockScreen(), lock);
        home->onCloseSyncScreen(); // closes whatever cover stands
        QVERIFY(!home->lockScreen());

        home->onShowSyncScreen();
        QCOMPARE(home->lockScreen()->metaObject()->className(), "SyncScreen");
        QVERIFY(home->lockScreen()->isVisible());
        QTRY_VERIFY_WITH_TIMEOUT(!home->lockScreen(), 4000);

        home->onShowCalScreen();
        QCOMPARE(qobject_cast<LockScreen*>(home->calScreen())->title(), QString("Calibrating"));
        home->onUpdateSystemState(STATE_INIT); // any state removes it
        QVERIFY(!home->calScreen());
    }

    void thePowerKeyMustBeHeldOnTheActivePanel()
    {
        ScreenMaster master;
        master.show();
        DaddyPanel* home = top(master);
        auto* measure = qobject_cast<DaddyPanel*>(master.onAddScreenToStack(JOB_MEASURE_SCREEN_ID));

        // An inactive panel starts no timer.
        QTest::keyPress(home, Qt::Key_Return);
        QVERIFY(!home->isPowerKeyTimerRunning());

        // A short press shows nothing.
        QTest::keyPress(measure, Qt::Key_Return);
        QVERIFY(measure->isPowerKeyTimerRunning());
        QTest::qWait(300);
        QTest::keyRelease(measure, Qt::Key_Return);
        QVERIFY(!measure->isPowerKeyTimerRunning());
        QTest::qWait(DaddyPanel::PowerKeyHoldMs + 200);
        QVERIFY(!measure->powerDownPopup());

        // A release on a panel that lost the top still stops its timer.
        QTest::keyPress(measure, Qt::Key_Return);
        measure->SetActiveStatus(false);
        QTest::keyRelease(measure, Qt::Key_Return);
        QVERIFY(!measure->isPowerKeyTimerRunning());
        measure->SetActiveStatus(true);

        // Held: the power-down popup, once.
        QTest::keyPress(measure, Qt::Key_Return);
        QTRY_VERIFY_WITH_TIMEOUT(measure->powerDownPopup(), 3000);
        PowerDownPopup* popup = measure->powerDownPopup();
        QVERIFY(popup->isVisible());
        QCOMPARE(popup->parentWidget(), static_cast<QWidget*>(measure));
        measure->onPowerDownTimeout(); // a second one replaces the first
        QVERIFY(measure->powerDownPopup() != nullptr);
        QCOMPARE(measure->findChildren<PowerDownPopup*>().size(), 1);
        QTest::keyRelease(measure, Qt::Key_Return);

        // A foreign pointer is ignored; Cancel closes it.
        measure->onClosePowerDownPopup(nullptr);
        QVERIFY(measure->powerDownPopup());
        QTest::mouseClick(measure->powerDownPopup()->findChild<XPushButton*>("BtnCancel"), Qt::LeftButton);
        QVERIFY(!measure->powerDownPopup());
    }

    void transitionsSettersAndTheFadeClamp()
    {
        QWidget parent;
        parent.resize(320, 480);
        TestPanel panel("Fading", &parent);
        QCOMPARE(panel.transitionInEffect(), TRANSITION_EFFECT_POP);
        QVERIFY(panel.GetTransitionInComplete());
        panel.SetTransitionInDirection(NUM_TRANSITION_DIRECTIONS);
        QCOMPARE(panel.transitionInDirection(), TRANSITION_DIRECTION_IN_LEFT);
        panel.SetTransitionInDirection(TRANSITION_DIRECTION_IN_UP);
        QCOMPARE(panel.transitionOutDirection(), TRANSITION_DIRECTION_IN_UP);
        panel.SetTransitionOut(TRANSITION_EFFECT_T(7), TRANSITION_DIRECTION_OUT_LEFT);
        QCOMPARE(panel.transitionOutEffect(), TRANSITION_EFFECT_POP);
        QCOMPARE(panel.transitionOutDirection(), TRANSITION_DIRECTION_IN_RIGHT);

        panel.FadeTransition(0.0, 1.7, panel.animationOut());
        QCOMPARE(panel.animationOut()->startValue().toDouble(), 0.1);
        QCOMPARE(panel.animationOut()->endValue().toDouble(), 1.0);
        QVERIFY(!panel.GetTransitionInComplete());
        QTRY_VERIFY(panel.GetTransitionInComplete());

        // A fade-in reports through the out animation.
        panel.hide();
        panel.SetTransitionIn(TRANSITION_EFFECT_FADE, TRANSITION_DIRECTION_IN_LEFT);
        QSignalSpy inView(&panel, &DaddyPanel::pageInView);
        QSignalSpy outOfView(&panel, &DaddyPanel::pageOutOfView);
        parent.show();
        panel.show();
        QTRY_COMPARE(outOfView.count(), 1);
        QCOMPARE(inView.count(), 0);
        QCOMPARE(panel.opacityEffect()->opacity(), 1.0);

        // A slide lands where the panel belongs.
        panel.hide();
        panel.SetTransitionIn(TRANSITION_EFFECT_SLIDE, TRANSITION_DIRECTION_IN_RIGHT);
        panel.move(0, 0);
        panel.show();
        QTRY_COMPARE(inView.count(), 1);
        QCOMPARE(panel.geometry(), QRect(0, 0, 320, 480));
    }

    void aLanguageLoadsItsTranslationAndFont()
    {
        ScreenMaster master;
        QVERIFY(ScreenMaster::languageFilePath("de").endsWith("/opt/GUI/Languages/MarigoldGuiApp_de.qm"));
        QVERIFY(master.onLoadLanguage("de"));
        QCOMPARE(QCoreApplication::translate("PowerDownPopup", "Cancel"), QString("Abbrechen"));
        QCOMPARE(QCoreApplication::translate("DaddyPanel", "Instrument Is Full"),
                 QString("Gerätespeicher voll"));
        const QString latin = QFontInfo(QApplication::font()).family();
        QVERIFY2(latin == "Roboto Condensed" || latin == "Liberation Sans Narrow", qPrintable(latin));

        QVERIFY(master.onLoadLanguage("fr"));
        QCOMPARE(QCoreApplication::translate("SyncScreen", "Syncing Job Data"),
                 QString("Synchronisation des données du travail"));

        QVERIFY(!master.onLoadLanguage("xx"));
        QVERIFY(master.onLoadLanguage("es"));
        QVERIFY(master.onLoadLanguage("en")); // English ships its own file: no missing-file line at start
        QCOMPARE(QCoreApplication::translate("PowerDownPopup", "Cancel"), QString("Cancel"));
    }
};

QTEST_MAIN(TestScreenMaster)
#include "tst_screenmaster.moc"
