// The calibration wizard against the simulator: the needed popup, a whole
// white calibration flowing into the reference check, failures, the
// pressure feet, the countdown, and the server's own requests.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/CalibrationNeededPopup.h"
#include "Screens/CalibrationPopup.h"
#include "Screens/CalibrationSensorPopup.h"
#include "Screens/CalibrationWizard.h"
#include "Screens/CalibrationWizardScreen.h"
#include "Screens/ErrorPopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/CalibrationStepPageContents.h"
#include "Widgets/CalibrationWizardPage.h"
#include "Widgets/CalibrationWizardPageContainer.h"
#include "Widgets/ClickableLabel.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QPointer>
#include <QPushButton>
#include <QSet>
#include <QtTest>

class tst_Calibration : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    void neededPopupRoundsTimeUp_data();
    void neededPopupRoundsTimeUp();
    void expiredCalibrationAsksAndLeadsToTheSteps();
    void ignoreClosesTheWizard();
    void stepPagesOfEachSetUp();
    void wholeWhiteCalibrationThenReferenceCheck();
    void measurementKeyDuringCountdownIsIgnored();
    void triggerWaitsForAnIdleInstrument();
    void failingCalibrationKeepsTheWizard();
    void liftedFootDuringCalibrationFails();
    void sensorWarningShowsLiveLampsAndChecksAgain();
    void serverRequestsOpenTheRightStep();
    void completionWithNoPopupStillAdvances();
    void selfTestStepsFollowTheLists();

private:
    QString control(const QString& line) { return m_sim.control(line); }
    QWidget* current() const { return m_master->currentScreen(); }
    CalibrationWizardScreen* wizard() const { return qobject_cast<CalibrationWizardScreen*>(current()); }
    CalibrationWizardScreen* openSteps(SCREEN_ID_T id);
    void waitIdle();
    template <class P>
    P* popupOf(DaddyPanel* panel) const
    {
        for (PopupPanel* popup : panel->popups()) {
            if (auto* p = qobject_cast<P*>(popup); p && p->isVisible())
                return p;
        }
        return nullptr;
    }

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

void tst_Calibration::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("calibration")));

    m_master = new ScreenMaster;
    // The start-up sends the stack home once the list stands: not under a test.
    QVERIFY(ProductHarness::showHome(m_master));
    waitIdle();
}

void tst_Calibration::cleanupTestCase()
{
    delete m_master;
    m_master = nullptr;
}

void tst_Calibration::init()
{
    control(QStringLiteral("request none"));
    control(QStringLiteral("place"));
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
    waitIdle();
}

void tst_Calibration::waitIdle()
{
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == STATE_INIT, 20000);
}

CalibrationWizardScreen* tst_Calibration::openSteps(SCREEN_ID_T id)
{
    m_master->onAddScreenToStack(id);
    return wizard();
}

void tst_Calibration::neededPopupRoundsTimeUp_data()
{
    QTest::addColumn<int>("seconds");
    QTest::addColumn<QString>("text");
    QTest::newRow("overdue") << 0 << QString();
    QTest::newRow("1 s") << 1 << "Calibration needed within 1 seconds";
    QTest::newRow("59 s") << 59 << "Calibration needed within 59 seconds";
    QTest::newRow("60 s") << 60 << "Calibration needed within 2 minutes";
    QTest::newRow("3599 s") << 3599 << "Calibration needed within 60 minutes";
    QTest::newRow("3600 s") << 3600 << "Calibration needed within 2 hours";
    QTest::newRow("86399 s") << 86399 << "Calibration needed within 24 hours";
    QTest::newRow("86400 s") << 86400 << "Calibration needed within 2 days";
    QTest::newRow("large") << 2000000000 << "Calibration needed within 23149 days";
}

void tst_Calibration::neededPopupRoundsTimeUp()
{
    QFETCH(int, seconds);
    QFETCH(QString, text);
    QCOMPARE(CalibrationNeededPopup::timeLeftText(seconds), text);

    CalibrationNeededPopup popup;
    popup.setSecondsLeft(seconds);
    const bool overdue = seconds < 1;
    QCOMPARE(popup.isHeaderShown(), overdue);
    QCOMPARE(popup.isIconShown(), !overdue);
    if (overdue)
        QVERIFY(popup.messageText().startsWith("New measurements cannot be made"));
    else
        QCOMPARE(popup.messageText(), text);
}

void tst_Calibration::expiredCalibrationAsksAndLeadsToTheSteps()
{
    QVERIFY(control("calibration expire").startsWith("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal < 1, 10000);

    // The job list's gate sends the user here.
    auto* home = qobject_cast<JobListScreen*>(current());
    QVERIFY(home);
    home->findChild<QPushButton*>("BtnAddJob")->click();
    QTRY_VERIFY(qobject_cast<CalibrationWizard*>(current()));
    auto* entry = qobject_cast<CalibrationWizard*>(current());
    QTRY_VERIFY(entry->neededPopup() && entry->neededPopup()->isVisible());
    QVERIFY(entry->neededPopup()->isHeaderShown());
    QCOMPARE(entry->neededPopup()->headerText(), QString("Calibration Required"));

    // A refused measurement (2044) asks the same way.
    API_SignalMaster::instance()->emitDisplayCalibrationPopup();
    QTRY_COMPARE(m_master->screenCount(), 3);
    auto* second = qobject_cast<CalibrationWizard*>(current());
    QVERIFY(second && second != entry);
    QTRY_VERIFY(second->neededPopup());
    second->neededPopup()->findChild<QPushButton*>("BtnCancel")->click();
    QTRY_COMPARE(current(), static_cast<QWidget*>(entry));

    entry->neededPopup()->findChild<QPushButton*>("BtnConfirm")->click();
    QTRY_VERIFY(wizard());
    QCOMPARE(wizard()->calibrationState(), CALIBRATION_WHITE_STATE);
    QCOMPARE(wizard()->title(), QString("Calibration"));
    QTRY_COMPARE(m_master->screenCount(), 2);
    control("calibration renew");
}

void tst_Calibration::ignoreClosesTheWizard()
{
    control("calibration due 7200");
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal > 3600, 10000);
    m_master->onAddScreenToStack(CAL_WIZARD_SCREEN_ID);
    auto* entry = qobject_cast<CalibrationWizard*>(current());
    QVERIFY(entry);
    QTRY_VERIFY(entry->neededPopup());
    CalibrationNeededPopup* popup = entry->neededPopup();
    QVERIFY(!popup->isHeaderShown());
    QVERIFY(popup->messageText().endsWith("hours"));
    popup->findChild<QPushButton*>("BtnCancel")->click();
    QTRY_COMPARE(m_master->screenCount(), 1);
    control("calibration renew");
}

void tst_Calibration::stepPagesOfEachSetUp()
{
    QVERIFY(CalibrationWizardPageContainer::tileSerialNumber().size() > 0);

    struct Expect
    {
        SCREEN_ID_T id;
        int pages;
        QString graphic;
        QString firstText;
    };
    const QList<Expect> all = {
        {CAL_WIZARD_STEPS_INSTRUCTIONS_ID, 3, ":/Assets/cal_graphic_01_white.png", "Calibrate your instrument"},
        {CAL_WIZARD_STEPS_REF_CHECK_INSTRUCTIONS_ID, 3, ":/Assets/cal_graphic_01_effect.png", "Verify your instrument"},
        {CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID, 3, ":/Assets/cal_graphic_01_white.png", "Self test your instrument by using the white"},
        {CAL_WIZARD_STEPS_SELF_TEST_REFERENCE_INSTRUCTIONS_ID, 3, ":/Assets/cal_graphic_01_effect.png", "Self test your instrument by using the effect"},
        {CAL_WIZARD_STEPS_SELF_TEST_OTHER_INSTRUCTIONS_ID, 2, ":/Assets/cal_graphic_01_lifted.png", "Self test your instrument by lifting"},
    };
    for (const Expect& e : all) {
        CalibrationWizardScreen* screen = openSteps(e.id);
        QVERIFY(screen);
        CalibrationWizardPageContainer* pages = screen->pageContainer();
        QCOMPARE(pages->objectName(), QString("PageContainer"));
        QCOMPARE(pages->geometry(), QRect(0, 66, 320, 414));
        QCOMPARE(pages->getNumberOfPages(), e.pages);
        auto* first = qobject_cast<CalibrationStep1PageContents*>(pages->page(0)->pageContents());
        QVERIFY(first);
        QCOMPARE(first->backgroundResource(), e.graphic);
        QVERIFY2(first->descriptionText().startsWith(e.firstText), qPrintable(first->descriptionText()));
        if (e.id != CAL_WIZARD_STEPS_SELF_TEST_OTHER_INSTRUCTIONS_ID)
            QVERIFY(first->descriptionText().contains(CalibrationWizardPageContainer::tileSerialNumber()));
        // Arrows: first right only, last left only.
        QVERIFY(!pages->page(0)->leftArrow()->isVisibleTo(pages->page(0)));
        QVERIFY(pages->page(0)->rightArrow()->isVisibleTo(pages->page(0)));
        CalibrationWizardPage* last = pages->page(e.pages - 1);
        QVERIFY(last->leftArrow()->isVisibleTo(last));
        QVERIFY(!last->rightArrow()->isVisibleTo(last));
        QCOMPARE(last->subHeader()->text(), QString("Step %1").arg(e.pages));
        auto* start = qobject_cast<CalibrationStep3PageContents*>(last->pageContents());
        QVERIFY(start);
        if (e.id >= CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID)
            QCOMPARE(start->topAreaText(), QString("Tap the self test button to start self testing"));
        else
            QCOMPARE(start->topAreaText(), QString("Tap the calibrate button to start calibration"));
        // The arrows step through the pages.
        emit pages->page(0)->gotoRightPage();
        QTRY_COMPARE(pages->getCurrentPage(), 1);
        m_master->onCloseScreen(screen);
    }
    CalibrationWizardScreen* selfTest = openSteps(CAL_WIZARD_STEPS_SELF_TEST_OTHER_INSTRUCTIONS_ID);
    QCOMPARE(selfTest->title(), QString("Self Test 3: Lifted"));
}

void tst_Calibration::wholeWhiteCalibrationThenReferenceCheck()
{
    control("calibration expire");
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal < 1, 10000);
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    QVERIFY(screen);
    QVERIFY(screen->isBackButtonShown());
    screen->findChild<QPushButton*>("BtnCalibrate")->click();
    QPointer<CalibrationPopup> popup = screen->calibrationPopup();
    QVERIFY(popup);
    QVERIFY(!popup->isTriggered());
    QCOMPARE(popup->text(), QString("Calibration Starting"));

    // The count as the user sees it, until the trigger.
    QStringList seen;
    QElapsedTimer clock;
    clock.start();
    while (popup && !popup->isTriggered() && clock.elapsed() < 10000) {
        const QString shown = popup->countdownText();
        if (!shown.isEmpty() && (seen.isEmpty() || seen.last() != shown))
            seen << shown;
        QTest::qWait(20);
    }
    QCOMPARE(seen, QStringList({"3", "2", "1"}));
    QVERIFY(clock.elapsed() >= 2500);

    QTRY_VERIFY_WITH_TIMEOUT(popup && popup->text() == QString("Calibrating"), 10000);
    QVERIFY(screen->isCalibrating());
    // No "Calibrating" cover over our own popup.
    QVERIFY(!screen->calScreen());
    QTRY_VERIFY_WITH_TIMEOUT(popup && popup->text() == QString("Complete"), 15000);
    QCOMPARE(popup->subText(), QString("OK to move instrument"));

    // On to the reference check, with no way back but through it.
    QTRY_COMPARE_WITH_TIMEOUT(screen->calibrationState(), CALIBRATION_REFERENCE_CHECK_STATE, 10000);
    QCOMPARE(screen->title(), QString("Reference Tile Check"));
    QVERIFY(!screen->isBackButtonShown());
    QVERIFY(!screen->isCalibrating());
    QTRY_VERIFY_WITH_TIMEOUT(popup.isNull(), 5000);
    QVERIFY(DataManager::instance()->getCalState().nextExternalWhiteCal > 0);
    QCOMPARE(screen->pageContainer()->getNumberOfPages(), 3);

    // The read switch starts the check.
    waitIdle();
    QTest::keyClick(screen, Qt::Key_Return);
    QPointer<CalibrationPopup> check = screen->calibrationPopup();
    QVERIFY(qobject_cast<CalibrationReferenceCheckPopup*>(check.data()));
    QCOMPARE(check->text(), QString("Measurement Starting"));
    QVERIFY(screen->isBackButtonShown());
    QPointer<CalibrationWizardScreen> alive(screen);
    QTRY_VERIFY_WITH_TIMEOUT(check && check->text() == QString("Measuring"), 10000);
    QTRY_VERIFY_WITH_TIMEOUT(alive.isNull() || alive->isClosing(), 20000);
    QTRY_COMPARE(m_master->screenCount(), 1);
}

void tst_Calibration::measurementKeyDuringCountdownIsIgnored()
{
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    QTest::keyClick(screen, Qt::Key_Return);
    QPointer<CalibrationPopup> popup = screen->calibrationPopup();
    QVERIFY(popup);
    QCOMPARE(popup->countdownText(), QString("3"));
    QTest::keyClick(screen, Qt::Key_Return);
    screen->findChild<QPushButton*>("BtnCalibrate")->click();
    QCOMPARE(screen->calibrationPopup(), popup.data());
    QCOMPARE(int(screen->popups().size()), 1);
    QVERIFY(!popup->isTriggered());
    // Leaving during the count triggers nothing.
    screen->findChild<QPushButton*>("BtnBack")->click();
    QTRY_VERIFY(popup.isNull());
    QTest::qWait(3500);
    QCOMPARE(DataManager::instance()->getSystemStatus().getSystemState(), STATE_INIT);
}

void tst_Calibration::triggerWaitsForAnIdleInstrument()
{
    // The wait runs the event loop inside the popup's last tick, so what the
    // user does meanwhile is scheduled ahead, as it would arrive.
    control("busy on");
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == STATE_BUSY, 10000);
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->onGotoCalibratingPopup();
    QPointer<CalibrationPopup> popup = screen->calibrationPopup();
    QPointer<CalibrationWizardScreen> alive(screen);
    bool waitedUntriggered = false;
    // Busy at the end of the count: the trigger waits; left meanwhile, it
    // never comes, even once the instrument is free again.
    QTimer::singleShot(3600, this, [&] {
        waitedUntriggered = popup && popup->counter() == 0 && !popup->isTriggered();
        if (alive)
            alive->findChild<QPushButton*>("BtnBack")->click();
    });
    QTimer::singleShot(3900, this, [&] { control("busy off"); });
    QTest::qWait(4200);
    QVERIFY(waitedUntriggered);
    waitIdle();
    QTest::qWait(1500);
    QCOMPARE(DataManager::instance()->getSystemStatus().getSystemState(), STATE_INIT);
    QVERIFY(popup.isNull() || !popup->isTriggered());
    QTRY_VERIFY(popup.isNull());

    // Busy, then free while the popup stands: the calibration runs.
    control("busy on");
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == STATE_BUSY, 10000);
    screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->onGotoCalibratingPopup();
    popup = screen->calibrationPopup();
    waitedUntriggered = false;
    QTimer::singleShot(3600, this, [&] {
        waitedUntriggered = popup && popup->counter() == 0 && !popup->isTriggered();
        control("busy off");
    });
    QTRY_VERIFY_WITH_TIMEOUT(popup && popup->isTriggered(), 15000);
    QVERIFY(waitedUntriggered);
    QTRY_COMPARE_WITH_TIMEOUT(screen->calibrationState(), CALIBRATION_REFERENCE_CHECK_STATE, 20000);
}

void tst_Calibration::failingCalibrationKeepsTheWizard()
{
    QVERIFY(control("fail-next 2001").startsWith("OK"));
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->onShowCalibrationPopup();
    QVERIFY(screen->calibrationPopup());
    QTRY_VERIFY_WITH_TIMEOUT(popupOf<ErrorPopup>(screen), 20000);
    ErrorPopup* error = popupOf<ErrorPopup>(screen);
    QCOMPARE(error->headerText(), QString("Calibration Error"));
    QCOMPARE(error->messageText(), QString("Instrument not on white tile, or internal white dirty"));
    QVERIFY(!screen->calibrationPopup());
    QCOMPARE(current(), static_cast<QWidget*>(screen));
    QCOMPARE(screen->calibrationState(), CALIBRATION_WHITE_STATE);
    QVERIFY(screen->isCalibrating());

    // Read the message and try again: this time it works.
    error->findChild<QPushButton*>()->click();
    QTRY_VERIFY(screen->popups().empty());
    waitIdle();
    screen->onShowCalibrationPopup();
    QTRY_COMPARE_WITH_TIMEOUT(screen->calibrationState(), CALIBRATION_REFERENCE_CHECK_STATE, 25000);
}

void tst_Calibration::liftedFootDuringCalibrationFails()
{
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->onShowCalibrationPopup();
    QPointer<CalibrationPopup> popup = screen->calibrationPopup();
    QTRY_VERIFY_WITH_TIMEOUT(popup && popup->isTriggered()
                                 && DataManager::instance()->getSystemStatus().getSystemState() == STATE_CALIBRATING,
                             10000);
    control("switch 2 off");
    QTRY_VERIFY_WITH_TIMEOUT(popupOf<ErrorPopup>(screen) || popupOf<NotificationPopup>(screen), 20000);
    QVERIFY(popup.isNull());
    QCOMPARE(current(), static_cast<QWidget*>(screen));
    QCOMPARE(screen->calibrationState(), CALIBRATION_WHITE_STATE);
}

void tst_Calibration::sensorWarningShowsLiveLampsAndChecksAgain()
{
    control("switches 101");
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->findChild<QPushButton*>("BtnCalibrate")->click();
    CalibrationSensorPopup* warning = screen->sensorPopup();
    QVERIFY(warning);
    QVERIFY(!screen->calibrationPopup());
    QVERIFY(warning->lampOn(1));
    QVERIFY(!warning->lampOn(2));
    QVERIFY(warning->lampOn(3));

    // OK with a foot still up: checked again, warned again.
    warning->findChild<QPushButton*>("BtnOkay")->click();
    QTRY_VERIFY(screen->sensorPopup() && screen->sensorPopup() != warning);
    warning = screen->sensorPopup();

    control("switch 2 on");
    control("switch 3 off");
    QTRY_VERIFY_WITH_TIMEOUT(warning->lampOn(2) && !warning->lampOn(3), 2000);
    control("place");
    QTRY_VERIFY_WITH_TIMEOUT(warning->lampOn(3), 2000);
    warning->findChild<QPushButton*>("BtnOkay")->click();
    QTRY_VERIFY(!screen->sensorPopup());
    QPointer<CalibrationPopup> popup = screen->calibrationPopup();
    QVERIFY(popup);

    // Cancel only closes the warning.
    screen->findChild<QPushButton*>("BtnBack")->click();
    QTRY_VERIFY(popup.isNull());
    control("lift");
    screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    screen->onShowCalibrationPopup();
    QVERIFY(screen->sensorPopup());
    screen->sensorPopup()->findChild<QPushButton*>("BtnCancel")->click();
    QTRY_VERIFY(!screen->sensorPopup());
    QVERIFY(!screen->calibrationPopup());
    QCOMPARE(current(), static_cast<QWidget*>(screen));
}

void tst_Calibration::serverRequestsOpenTheRightStep()
{
    QVERIFY(control("request white").startsWith("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(wizard(), 10000);
    QCOMPARE(wizard()->calibrationState(), CALIBRATION_WHITE_STATE);
    CalibrationWizardScreen* shown = wizard();
    // Asked again while the wizard stands: nothing.
    QTest::qWait(1500);
    API_SignalMaster::instance()->emitGoToWhiteCalibration();
    API_SignalMaster::instance()->emitGoToRefCheck();
    QTest::qWait(300);
    QCOMPARE(wizard(), shown);
    QCOMPARE(m_master->screenCount(), 2);

    control("request refcheck");
    m_master->onGotoHomeScreen();
    QTRY_VERIFY_WITH_TIMEOUT(wizard() && wizard()->calibrationState() == CALIBRATION_REFERENCE_CHECK_STATE, 10000);
    QCOMPARE(wizard()->title(), QString("Reference Tile Check"));
    QCOMPARE(m_master->screenCount(), 2);
    control("request none");
}

void tst_Calibration::completionWithNoPopupStillAdvances()
{
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
    QVERIFY(!screen->calibrationPopup());
    API_SignalMaster::instance()->emitCalibrationComplete();
    QTRY_COMPARE(screen->calibrationState(), CALIBRATION_REFERENCE_CHECK_STATE);
    QVERIFY(!screen->isBackButtonShown());
    QPointer<CalibrationWizardScreen> alive(screen);
    API_SignalMaster::instance()->emitReferenceCheckComplete();
    QTRY_VERIFY(alive.isNull() || alive->isClosing());
}

void tst_Calibration::selfTestStepsFollowTheLists()
{
    // White set-up done: on to the effect tile, then the air, then gone.
    CalibrationWizardScreen* screen = openSteps(CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID);
    QCOMPARE(screen->title(), QString("Self Test 1: White Tile"));
    API_SignalMaster::instance()->emitSelfTestWhiteComplete();
    QTRY_COMPARE(screen->calibrationState(), CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE);
    QCOMPARE(screen->title(), QString("Self Test 2: Reference Tile"));
    API_SignalMaster::instance()->emitSelfTestReferenceComplete();
    QTRY_COMPARE(screen->calibrationState(), CALIBRATION_SELF_TEST_OTHER_STATE);
    QCOMPARE(screen->pageContainer()->getNumberOfPages(), 2);
    // In the air the feet are not checked: straight to the tests.
    control("lift");
    screen->onShowCalibrationPopup();
    QTRY_VERIFY(current() != screen);
    QCOMPARE(QString(current()->metaObject()->className()), QString("SelfTestScreen"));
    QVERIFY(!screen->sensorPopup());
    QPointer<CalibrationWizardScreen> alive(screen);
    m_master->onCloseScreen(current());
    API_SignalMaster::instance()->emitSelfTestOtherComplete();
    QTRY_VERIFY(alive.isNull() || alive->isClosing());
}

QTEST_MAIN(tst_Calibration)
#include "tst_calibration.moc"
