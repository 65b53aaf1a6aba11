// The self tests against the simulator: results by name, an error code in
// the middle of a run, a cancel, and the wizard that goes on after OK.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/CalibrationWizardScreen.h"
#include "Screens/ErrorPopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/ScreenMaster.h"
#include "Screens/SelfTestPopup.h"
#include "Screens/SelfTestScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/SelfTestListItem.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QPointer>
#include <QPushButton>
#include <QSignalSpy>
#include <QtTest>

class tst_SelfTest : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    void rowResults_data();
    void rowResults();
    void namesAreMappedOrKept();
    void whiteTileRunWithPassFailAndError();
    void cancelEndsTheRunAndOkGoesOn();
    void liftedRunNeedsNoPopups();
    void repeatedNameGivesTheResultToTheFirstRow();

private:
    QString control(const QString& line) { return m_sim.control(line); }
    SelfTestScreen* selfTest() const { return qobject_cast<SelfTestScreen*>(m_master->currentScreen()); }
    ErrorPopup* errorOn(DaddyPanel* panel) const
    {
        for (PopupPanel* popup : panel->popups()) {
            if (auto* e = qobject_cast<ErrorPopup*>(popup))
                return e;
        }
        return nullptr;
    }

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

void tst_SelfTest::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("selftest")));

    m_master = new ScreenMaster;
    m_master->show();
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    // The start-up sends the stack home once the list stands: not under a test.
    QTRY_VERIFY_WITH_TIMEOUT(m_master->findChild<JobListScreen*>()->isReady(), 10000);
}

void tst_SelfTest::cleanupTestCase()
{
    delete m_master;
    m_master = nullptr;
}

void tst_SelfTest::init()
{
    for (int num = 0; num < 7; ++num)
        control(QStringLiteral("selftest %1 auto").arg(num));
    control("place");
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == STATE_INIT, 20000);
}

void tst_SelfTest::rowResults_data()
{
    QTest::addColumn<uint>("result");
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("style");
    QTest::newRow("none") << 0u << QString() << "color: rgb(45, 45, 45);";
    QTest::newRow("pass") << 1u << "Pass" << "color: rgb(0, 146, 69);";
    QTest::newRow("fail") << 2u << "Fail" << "color: rgb(255, 62, 62);";
    QTest::newRow("canceled") << 3u << "Canceled" << "color: rgb(28, 117, 188);";
    QTest::newRow("unknown") << 4u << "Error" << "color: rgb(255, 62, 62);";
    QTest::newRow("issue") << 2028u << "Error" << "color: rgb(255, 62, 62);";
}

void tst_SelfTest::rowResults()
{
    QFETCH(uint, result);
    QFETCH(QString, text);
    QFETCH(QString, style);
    SelfTestListItem row("WHITE TRANSFER", "White Calibration");
    row.setResult(2);
    row.setResult(result);
    QCOMPARE(row.resultText(), text);
    QCOMPARE(row.resultStyle(), style);
    QCOMPARE(row.getTestName(), QString("WHITE TRANSFER"));
}

void tst_SelfTest::namesAreMappedOrKept()
{
    QCOMPARE(SelfTestScreen::mapTestName("WHITE TRANSFER"), QString("White Calibration"));
    QCOMPARE(SelfTestScreen::mapTestName("CHECK ERROR LOGS"), QString("Check error logs"));
    QCOMPARE(SelfTestScreen::mapTestName("LAMP AGEING"), QString("LAMP AGEING"));
}

void tst_SelfTest::whiteTileRunWithPassFailAndError()
{
    const QVector<TEST> tests = DataManager::instance()->getTests(SELF_TEST_WHITE_TILE);
    QCOMPARE(tests.size(), 3);
    control(QStringLiteral("selftest %1 1").arg(tests[0].num));
    control(QStringLiteral("selftest %1 2").arg(tests[1].num));
    control(QStringLiteral("selftest %1 2028").arg(tests[2].num));
    QSignalSpy done(API_SignalMaster::instance(), &API_SignalMaster::SelfTestWhiteComplete);

    m_master->onAddScreenToStack(SELF_TEST_SCREEN_WHITE_ID);
    SelfTestScreen* screen = selfTest();
    QVERIFY(screen);
    QCOMPARE(screen->rowCount(), 3);
    QVERIFY(!screen->isOkShown());

    QTRY_COMPARE_WITH_TIMEOUT(screen->row(0)->resultText(), QString("Pass"), 15000);
    QTRY_COMPARE_WITH_TIMEOUT(screen->row(1)->resultText(), QString("Fail"), 15000);
    // The error code: its message, and the run waits for it to be read.
    QTRY_VERIFY_WITH_TIMEOUT(errorOn(screen), 15000);
    QCOMPARE(screen->row(2)->resultText(), QString("Error"));
    QCOMPARE(errorOn(screen)->messageText(), QString("External white tile too dirty or incorrect white tile"));
    QVERIFY(!screen->selfTestPopup());
    QVERIFY(!screen->isOkShown());
    errorOn(screen)->findChild<QPushButton*>()->click();
    QTRY_VERIFY(screen->isOkShown());
    QCOMPARE(screen->statusText(), QString("White Tile Complete"));
    QVERIFY(screen->popups().empty());

    screen->findChild<QPushButton*>("okBtn")->click();
    QCOMPARE(done.count(), 1);
    QTRY_COMPARE(m_master->screenCount(), 1);
}

void tst_SelfTest::cancelEndsTheRunAndOkGoesOn()
{
    m_master->onAddScreenToStack(CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID);
    auto* wizard = qobject_cast<CalibrationWizardScreen*>(m_master->currentScreen());
    QVERIFY(wizard);
    wizard->onShowCalibrationPopup();
    QTRY_VERIFY(selfTest());
    SelfTestScreen* screen = selfTest();
    QCOMPARE(screen->testType(), SELF_TEST_WHITE_TILE);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == STATE_MEASURING, 10000);
    // A long test has its popup, named.
    QVERIFY(screen->selfTestPopup());
    QCOMPARE(screen->selfTestPopup()->testName(), QString("White Calibration"));
    QTRY_COMPARE(screen->selfTestPopup()->state(), STATE_POPUP_MEASURING);
    QVERIFY(control("abort").startsWith("OK"));
    QTRY_COMPARE_WITH_TIMEOUT(screen->statusText(), QString("Self Tests Canceled"), 10000);
    QVERIFY(screen->isOkShown());
    QCOMPARE(screen->row(0)->resultText(), QString("Canceled"));
    QCOMPARE(screen->row(1)->resultText(), QString());
    QCOMPARE(screen->row(2)->resultText(), QString());
    QVERIFY(!screen->selfTestPopup());
    QTest::qWait(1500);
    QCOMPARE(screen->row(1)->resultText(), QString());

    // OK after the cancel still finishes the set-up, and the wizard goes on.
    screen->findChild<QPushButton*>("okBtn")->click();
    QTRY_COMPARE(m_master->currentScreen(), static_cast<QWidget*>(wizard));
    QTRY_COMPARE(wizard->calibrationState(), CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE);
}

void tst_SelfTest::liftedRunNeedsNoPopups()
{
    control("lift");
    m_master->onAddScreenToStack(SELF_TEST_SCREEN_LIFTED_ID);
    SelfTestScreen* screen = selfTest();
    QVERIFY(screen);
    QCOMPARE(screen->rowCount(), 3);
    QTRY_VERIFY_WITH_TIMEOUT(screen->isOkShown(), 15000);
    QCOMPARE(screen->statusText(), QString("All Tests Complete"));
    for (int i = 0; i < 3; ++i)
        QCOMPARE(screen->row(i)->resultText(), QString("Pass"));
    QVERIFY(screen->popups().empty());
    QSignalSpy done(API_SignalMaster::instance(), &API_SignalMaster::SelfTestOtherComplete);
    screen->findChild<QPushButton*>("okBtn")->click();
    QCOMPARE(done.count(), 1);
}

void tst_SelfTest::repeatedNameGivesTheResultToTheFirstRow()
{
    // A firmware that lists one name twice: the second run's result lands
    // on the first row as well, and the second row stays empty.
    const QString added = control("selftest add \"CHECK ERROR LOGS\" lifted 300");
    QVERIFY2(added.startsWith("OK test "), qPrintable(added));
    const int num = added.section(' ', 2, 2).toInt();
    control("lift");
    m_master->onAddScreenToStack(SELF_TEST_SCREEN_LIFTED_ID);
    SelfTestScreen* screen = selfTest();
    QCOMPARE(screen->rowCount(), 4);
    QCOMPARE(screen->row(2)->getTestName(), screen->row(3)->getTestName());
    control(QStringLiteral("selftest %1 2").arg(num));
    QTRY_VERIFY_WITH_TIMEOUT(screen->isOkShown(), 15000);
    QCOMPARE(screen->row(2)->resultText(), QString("Fail"));
    QCOMPARE(screen->row(3)->resultText(), QString());
    QCOMPARE(screen->testCounter(), 5);
}

QTEST_MAIN(tst_SelfTest)
#include "tst_selftest.moc"
