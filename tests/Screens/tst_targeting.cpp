// The targeting screen against the simulator: the read switch and its
// gates, the override popups, auto-measure, the reticle, the number row and
// the SMC button, the end of a job, the job's time limit, a hot sample, a
// busy instrument, online mode, and a link that dies under the screen.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/TargetingAPI.h"
#include "Screens/DaddyPanel.h"
#include "Screens/DeletePopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/MeasuringPopup.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "Screens/ScreenMaster.h"
#include "Screens/TargetingScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Utils/AudioPlayer.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QElapsedTimer>
#include <QLabel>
#include <QPointer>
#include <QPushButton>
#include <QRegularExpression>
#include <QtTest>

namespace {

QList<SCREEN_ID_T>& requestedScreens()
{
    static QList<SCREEN_ID_T> ids;
    return ids;
}

// The GUI thread blocks between the job-complete sound and the next screen,
// so both moments are taken where they happen: the sound on the audio
// thread's log line, the screen in the factory.
QElapsedTimer& testClock()
{
    static QElapsedTimer c;
    return c;
}
QAtomicInteger<qint64> jobSoundAtMs(-1);
QAtomicInteger<qint64> summaryAskedAtMs(-1);
QtMessageHandler previousHandler = nullptr;

void watchMessages(QtMsgType type, const QMessageLogContext& context, const QString& message)
{
    if (message.contains(QLatin1String("job_finished.wav")))
        jobSoundAtMs = testClock().elapsed();
    if (previousHandler)
        previousHandler(type, context, message);
}

int countPlays(const QString& sound)
{
    int n = 0;
    for (const QString& line : Platform::recordedCommands())
        n += line.contains(sound) && !line.startsWith(QLatin1String("stop ")) ? 1 : 0;
    return n;
}

} // namespace

class tst_Targeting : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();
    void cleanup();

    void jobListStartReachesTargeting();
    void pressWithNoFootIsUsedUpFor2s();
    void partFeetWithoutOverrideInforms();
    void overrideMeasureAfterLiftStartsNothing();
    void pressRightAfterPopupCloseIsIgnored();
    void autoMeasureWaitsForReleaseThenMeasuresOnce();
    void backDeletesTheJobMadeHere();
    void leavingDropsTheOverride();
    void reticleColourAndTurn();
    void liveImageFollowsTheFeet();
    void simpleAverageOfSizeZeroShowsThreeNumbers();
    void smcTerminateFromTheThirdSample();
    void lastSampleEndsTheJob();
    void completeJobOpenedLeavesAtInit();
    void jobTimeLimitClosesAndKeepsTheJob();
    void hotSampleWarnsOnce();
    void onlineModeLooksAndLeaves();
    void busyInstrumentClosesTheScreen();
    void deadLinkGivesFaultScreen();

private:
    QString control(const QString& line) { return m_sim.control(line); }
    // A fresh job of the given averaging, active, with targeting running.
    TargetingScreen* openJob(JOB_AVERAGING_MODE_T mode, unsigned size, unsigned smc = 0, int maxSamples = 0);
    TargetingScreen* screen() const;
    int serverSamples(const QString& name);
    int localSamples() const { return DataManager::instance()->getActiveJobObject().getNumSamples(); }
    void waitForFeet(bool s1, bool s2, bool s3);
    void press();
    template <class P>
    P* topPopup() const;
    void measureOnce();

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
    QString m_jobName;
    int m_jobCounter = 0;
};

void tst_Targeting::initTestCase()
{
    testClock().start();
    previousHandler = qInstallMessageHandler(watchMessages);
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("targeting")));

    ProductHarness::standInOtherScreens({TARGETING_SCREEN_ID}, [](SCREEN_ID_T id) {
        requestedScreens() << id;
        if (id == JOB_MEASURE_SCREEN_ID)
            summaryAskedAtMs = testClock().elapsed();
    });

    m_master = new ScreenMaster;
    m_master->show();
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(m_master->findChild<JobListScreen*>()->isReady(), 10000);
    QVERIFY(control(QStringLiteral("outliers 0")).startsWith(QLatin1String("OK")));
}

void tst_Targeting::cleanupTestCase()
{
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_Targeting::init()
{
    requestedScreens().clear();
    UserParams::setOverridePressureSensors(false);
    UserParams::setAutoMeasure(false);
    UserParams::setSampleTempCheckEnabled(false);
    UserParams::setOrientationEnabled(true);
    control(QStringLiteral("lift"));
    control(QStringLiteral("tilt 0"));
}

void tst_Targeting::cleanup()
{
    m_master->onGotoHomeScreen();
    QTRY_COMPARE_WITH_TIMEOUT(m_master->screenCount(), 1, 5000);
    QTRY_VERIFY(m_master->findChild<TargetingScreen*>() == nullptr);
    // A refused trigger leaves the status poller on its own targeting poll.
    API_SignalMaster::instance()->emitTriggerResumeIdle();
    control(QStringLiteral("busy off"));
    control(QStringLiteral("param JOB_COMPLETION_TIME 0"));
    control(QStringLiteral("temperature 25"));
    QTest::qWait(300);
}

TargetingScreen* tst_Targeting::screen() const
{
    return qobject_cast<TargetingScreen*>(m_master->currentScreen());
}

TargetingScreen* tst_Targeting::openJob(JOB_AVERAGING_MODE_T mode, unsigned size, unsigned smc, int maxSamples)
{
    DataManager* data = DataManager::instance();
    Job job;
    job.clearContents();
    m_jobName = QStringLiteral("T%1").arg(++m_jobCounter);
    job.setName(m_jobName);
    job.setDisplayName(QStringLiteral("Wing %1").arg(m_jobCounter));
    job.setJobAveragingMode(mode);
    job.setJobSize(size);
    job.setJobSMC(smc);
    job.setMaxSamples(maxSamples);
    const unsigned index = data->addJob(job);
    if (index == NO_INDEX)
        return nullptr;
    data->setActiveJob(index);
    m_master->onAddScreenToStack(TARGETING_SCREEN_ID);
    TargetingScreen* s = screen();
    if (!s)
        return nullptr;
    QElapsedTimer waited;
    waited.start();
    while (!(s->isTargetingTimerActive() && s->framesShown() > 0 && s->isDebounced()) && waited.elapsed() < 5000)
        QTest::qWait(20);
    return s;
}

int tst_Targeting::serverSamples(const QString& name)
{
    const QStringList lines = control(QStringLiteral("jobs")).split(QLatin1Char('\n'));
    const QRegularExpression samples(QStringLiteral("samples (\\d+)"));
    for (const QString& line : lines) {
        if (!line.contains(QStringLiteral("\"%1\"").arg(name)))
            continue;
        const QRegularExpressionMatch m = samples.match(line);
        return m.hasMatch() ? m.captured(1).toInt() : -1;
    }
    return -1;
}

void tst_Targeting::waitForFeet(bool s1, bool s2, bool s3)
{
    QTRY_VERIFY_WITH_TIMEOUT(screen() && bool(screen()->lastPressureReading().Switch1) == s1
                                 && bool(screen()->lastPressureReading().Switch2) == s2
                                 && bool(screen()->lastPressureReading().Switch3) == s3,
                             3000);
}

void tst_Targeting::press()
{
    QTest::keyClick(screen(), Qt::Key_Return);
}

template <class P>
P* tst_Targeting::topPopup() const
{
    TargetingScreen* s = screen();
    if (!s || s->popups().empty())
        return nullptr;
    return qobject_cast<P*>(s->popups().back());
}

void tst_Targeting::measureOnce()
{
    const int before = localSamples();
    QTRY_VERIFY_WITH_TIMEOUT(screen() && screen()->isDebounced() && screen()->isTargetingTimerActive(), 5000);
    waitForFeet(true, true, true);
    press();
    QTRY_COMPARE_WITH_TIMEOUT(localSamples(), before + 1, 8000);
}

void tst_Targeting::jobListStartReachesTargeting()
{
    DataManager* data = DataManager::instance();
    Job job;
    job.clearContents();
    m_jobName = QStringLiteral("T%1").arg(++m_jobCounter);
    job.setName(m_jobName);
    job.setJobAveragingMode(JOB_AVG_MODE_NONE);
    job.setJobSize(3);
    const unsigned index = data->addJob(job);
    QVERIFY(index != NO_INDEX);
    data->setActiveJob(index);
    m_master->findChild<JobListScreen*>()->onStartJob();
    QTRY_VERIFY_WITH_TIMEOUT(screen() != nullptr, 5000);
    QTRY_VERIFY_WITH_TIMEOUT(screen()->isTargetingTimerActive() && screen()->framesShown() > 0, 5000);
    QVERIFY(requestedScreens().isEmpty());
}

void tst_Targeting::pressWithNoFootIsUsedUpFor2s()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QCOMPARE(s->objectName(), QStringLiteral("TargetingScreen"));
    QCOMPARE(serverSamples(m_jobName), 0);

    press();
    QVERIFY(!s->isDebounced());
    QVERIFY(s->popups().empty());
    QElapsedTimer sincePress;
    sincePress.start();

    // Feet down now, but the press before still blocks the switch.
    control(QStringLiteral("place"));
    waitForFeet(true, true, true);
    // A machine too slow to bring the feet within the block proves nothing.
    if (sincePress.elapsed() > 1800)
        QSKIP("the feet came after the two seconds of the block");
    press();
    QTest::qWait(600);
    QCOMPARE(serverSamples(m_jobName), 0);

    // Once the 2 s are over the same press measures, through the popup.
    QTRY_VERIFY_WITH_TIMEOUT(s->isDebounced(), 3000);
    QVERIFY(sincePress.elapsed() >= 1990);
    press();
    QTRY_VERIFY_WITH_TIMEOUT(topPopup<MeasuringPopup>() != nullptr, 3000);
    QTRY_COMPARE_WITH_TIMEOUT(localSamples(), 1, 8000);
    QCOMPARE(serverSamples(m_jobName), 1);
    QVERIFY(countPlays(QStringLiteral("start_measurement.wav")) >= 1);
    // The popup went by itself and targeting came back.
    QTRY_VERIFY_WITH_TIMEOUT(s->popups().empty() && s->isTargetingTimerActive(), 5000);
    QCOMPARE(s->sampleNumbers().size(), size_t(3));
    QCOMPARE(s->findChild<QLabel*>(QStringLiteral("labelSampleBox"))->geometry(),
             s->sampleNumbers()[1]->geometry());
}

void tst_Targeting::partFeetWithoutOverrideInforms()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    control(QStringLiteral("switches 110"));
    waitForFeet(true, true, false);
    press();
    NotificationPopup* info = topPopup<NotificationPopup>();
    QVERIFY(info);
    QCOMPARE(info->headerText(), QStringLiteral("Information"));
    QVERIFY(s->isShowingOverride());

    // The switch is ignored while the popup stands, and nothing measures.
    control(QStringLiteral("place"));
    QTest::qWait(2100);
    press();
    QTest::qWait(800);
    QCOMPARE(serverSamples(m_jobName), 0);
    QCOMPARE(int(s->popups().size()), 1);

    QTest::mouseClick(info->findChild<QPushButton*>(QStringLiteral("Btn")), Qt::LeftButton);
    QVERIFY(s->popups().empty());
    QVERIFY(!s->isShowingOverride());
    QVERIFY(s->isTargetingTimerActive());
}

void tst_Targeting::overrideMeasureAfterLiftStartsNothing()
{
    UserParams::setOverridePressureSensors(true);
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    control(QStringLiteral("switches 011"));
    waitForFeet(false, true, true);
    press();
    OverridePopup* ask = topPopup<OverridePopup>();
    QVERIFY(ask);

    control(QStringLiteral("lift"));
    QTest::qWait(300);
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnMeasure")), Qt::LeftButton);
    QVERIFY(s->popups().empty());
    QTest::qWait(1500);
    QCOMPARE(serverSamples(m_jobName), 0);
    QVERIFY(s->isTargetingTimerActive());

    // With one foot still down the same answer does measure.
    control(QStringLiteral("switches 100"));
    waitForFeet(true, false, false);
    QTRY_VERIFY_WITH_TIMEOUT(s->isDebounced(), 3000);
    press();
    ask = topPopup<OverridePopup>();
    QVERIFY(ask);
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnMeasure")), Qt::LeftButton);
    QTRY_COMPARE_WITH_TIMEOUT(serverSamples(m_jobName), 1, 8000);
}

void tst_Targeting::pressRightAfterPopupCloseIsIgnored()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    control(QStringLiteral("place"));
    waitForFeet(true, true, true);

    // Targeting stopped from anywhere brings the idle popup.
    TargetingAPI_StopPolling();
    NotificationPopup* idle = topPopup<NotificationPopup>();
    QVERIFY(idle);
    QCOMPARE(idle, s->idlePopup());
    QCOMPARE(idle->headerText(), QStringLiteral("Continue Measuring?"));
    QVERIFY(!s->isTargetingTimerActive());

    // Behind the popup the last reading no longer counts.
    press();
    QTest::qWait(500);
    QCOMPARE(serverSamples(m_jobName), 0);
    QTRY_VERIFY_WITH_TIMEOUT(s->isDebounced(), 3000);

    QTest::mouseClick(idle->findChild<QPushButton*>(QStringLiteral("Btn")), Qt::LeftButton);
    QVERIFY(s->popups().empty());
    QVERIFY(s->idlePopup() == nullptr);
    QVERIFY(s->isTargetingTimerActive());
    // Within 500 ms the press is not even counted: no 2 s block follows it.
    press();
    QVERIFY(!s->isDebounced());
    QTest::qWait(650);
    QCOMPARE(serverSamples(m_jobName), 0);
    waitForFeet(true, true, true);
    QVERIFY(s->isDebounced());
    press();
    QTRY_COMPARE_WITH_TIMEOUT(serverSamples(m_jobName), 1, 8000);
}

void tst_Targeting::autoMeasureWaitsForReleaseThenMeasuresOnce()
{
    UserParams::setAutoMeasure(true);
    UserParams::setAutoMeasureTimeout(1.0f);
    control(QStringLiteral("place"));
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 5);
    QVERIFY(s);
    QCOMPARE(s->autoMeasureState(), TARGETING_AUTO_MEASURE_NOT_READY);

    // Sitting on the surface from the start never measures.
    QTest::qWait(2500);
    QCOMPARE(s->autoMeasureState(), TARGETING_AUTO_MEASURE_NOT_READY);
    QCOMPARE(serverSamples(m_jobName), 0);

    // Lifted for less than the release time: still not armed.
    QElapsedTimer lifted;
    lifted.start();
    control(QStringLiteral("lift"));
    waitForFeet(false, false, false);
    control(QStringLiteral("place"));
    waitForFeet(true, true, true);
    if (lifted.elapsed() > 650)
        QSKIP("the machine kept the instrument lifted longer than the release time");
    QTest::qWait(1500);
    QCOMPARE(s->autoMeasureState(), TARGETING_AUTO_MEASURE_NOT_READY);
    QCOMPARE(serverSamples(m_jobName), 0);

    // Lifted long enough, then placed and held for the time-out: one reading.
    control(QStringLiteral("lift"));
    QTRY_COMPARE_WITH_TIMEOUT(s->autoMeasureState(), TARGETING_AUTO_MEASURE_PRESSED_AND_WAITING, 3000);
    control(QStringLiteral("place"));
    QTRY_VERIFY_WITH_TIMEOUT(s->findChild<QLabel*>(QStringLiteral("labelAutoMeasure"))->isVisible(), 3000);
    QTRY_COMPARE_WITH_TIMEOUT(serverSamples(m_jobName), 1, 8000);
    QTRY_COMPARE_WITH_TIMEOUT(s->autoMeasureState(), TARGETING_AUTO_MEASURE_NOT_READY, 5000);
    QTRY_VERIFY_WITH_TIMEOUT(s->isTargetingTimerActive(), 5000);
    QTest::qWait(2500);
    QCOMPARE(serverSamples(m_jobName), 1);
}

void tst_Targeting::backDeletesTheJobMadeHere()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QPointer<TargetingScreen> guard(s);
    QVERIFY(DataManager::instance()->getActiveJobObject().getCreatedOnInstrument());
    QTest::mouseClick(s->findChild<QPushButton*>(QStringLiteral("BtnBack")), Qt::LeftButton);
    DeletePopup* ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QCOMPARE(ask->findChild<QLabel*>(QStringLiteral("labelHeader"))->text(), QStringLiteral("Stop Measuring?"));
    // The poll goes on behind the question.
    QVERIFY(s->isTargetingTimerActive());
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnConfirm")), Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    QTRY_COMPARE_WITH_TIMEOUT(serverSamples(m_jobName), -1, 5000);
    // No idle popup came up on the way out.
    QCOMPARE(m_master->screenCount(), 1);
}

void tst_Targeting::leavingDropsTheOverride()
{
    UserParams::setDisplayOverridePressureSensorMenuItem(true);
    UserParams::setOverridePressureSensors(true);
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QVERIFY(UserParams::getOverridePressureSensors());
    m_master->onGotoHomeScreen();
    QTRY_VERIFY(m_master->findChild<TargetingScreen*>() == nullptr);
    QVERIFY(!UserParams::getOverridePressureSensors());
    UserParams::setDisplayOverridePressureSensorMenuItem(false);
}

void tst_Targeting::reticleColourAndTurn()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QCOMPARE(DataManager::instance()->getActiveJobObject().getOrientationAngle(), 0);
    QLabel* reticle = s->findChild<QLabel*>(QStringLiteral("labelAlignmentCurrent"));
    const QPoint centre = reticle->geometry().center();

    s->onUpdateOrientation(345);
    QVERIFY(!s->isReticleRed());
    s->onUpdateOrientation(25);
    QVERIFY(s->isReticleRed());
    s->onUpdateOrientation(20);
    QVERIFY(!s->isReticleRed());
    s->onUpdateOrientation(339);
    QVERIFY(s->isReticleRed());

    // Through the instrument: the turned reticle stays centred and grows to
    // hold its corners.
    control(QStringLiteral("tilt 45"));
    QTRY_VERIFY_WITH_TIMEOUT(s->isReticleRed(), 3000);
    QVERIFY(reticle->width() > 180);
    QVERIFY((reticle->geometry().center() - centre).manhattanLength() <= 1);
    control(QStringLiteral("tilt 350"));
    QTRY_VERIFY_WITH_TIMEOUT(!s->isReticleRed(), 3000);

    s->onUpdateOrientationEnabled(false);
    QVERIFY(!reticle->isVisible());
}

void tst_Targeting::liveImageFollowsTheFeet()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QLabel* image = s->findChild<QLabel*>(QStringLiteral("labelTargetImage"));
    auto brightness = [image] {
        const QImage shown = image->pixmap(Qt::ReturnByValue).toImage();
        qint64 sum = 0;
        for (int y = 100; y < 250; y += 7)
            for (int x = 150; x < 330; x += 7)
                sum += qGray(shown.pixel(x, y));
        return sum;
    };
    QCOMPARE(image->pixmap(Qt::ReturnByValue).size(), QSize(482, 348));
    const qint64 dark = brightness();
    control(QStringLiteral("place"));
    waitForFeet(true, true, true);
    QTRY_VERIFY_WITH_TIMEOUT(brightness() > dark * 2, 3000);
    QVERIFY(s->findChild<QLabel*>(QStringLiteral("labelHeaderBackground"))->pixmap(Qt::ReturnByValue).cacheKey()
            != QPixmap(QStringLiteral(":/Assets/targeting_header_off.png")).cacheKey());

    // A garbled frame is dropped, never read past its end.
    const qint64 frames = s->framesShown();
    s->onTargetingImageUpdate(QByteArray(1000, 'x'));
    s->onTargetingImageUpdate(QByteArray());
    QCOMPARE(s->framesShown(), frames);
}

void tst_Targeting::simpleAverageOfSizeZeroShowsThreeNumbers()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_SIMPLE_3, 0);
    QVERIFY(s);
    QCOMPARE(s->sampleNumbers().size(), size_t(3));
    for (size_t i = 0; i < 3; ++i) {
        QLabel* number = s->sampleNumbers()[i];
        QCOMPARE(number->text(), QString::number(i + 1));
        QCOMPARE(number->y(), 447);
        QCOMPARE(number->x(), int(i + 1) * 320 / 4 - 15);
    }
    QVERIFY(!s->findChild<QLabel*>(QStringLiteral("labelSMC"))->isVisible());
}

void tst_Targeting::smcTerminateFromTheThirdSample()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_SMC, 4, 4, 8);
    QVERIFY(s);
    QPushButton* done = s->findChild<QPushButton*>(QStringLiteral("BtnSMCDone"));
    QLabel* smc = s->findChild<QLabel*>(QStringLiteral("labelSMC"));
    QVERIFY(smc->isVisible());
    QVERIFY(!s->findChild<QLabel*>(QStringLiteral("labelSampleBox"))->isVisible());
    QVERIFY(s->sampleNumbers().empty());
    control(QStringLiteral("place"));
    measureOnce();
    measureOnce();
    QCOMPARE(localSamples(), 2);
    QVERIFY(!done->isVisible());
    const Job job = DataManager::instance()->getActiveJobObject();
    // The label follows the sample's update, which can trail the count on a slow machine.
    QTRY_COMPARE_WITH_TIMEOUT(smc->text(),
                              QStringLiteral("Averaged 2 of SMC %1:%2").arg(job.getJobSize()).arg(job.getMaxSamples()),
                              5000);
    measureOnce();
    QTRY_VERIFY_WITH_TIMEOUT(done->isVisible(), 3000);

    // Terminate stops the poll and asks; cancel brings targeting back.
    QTest::mouseClick(done, Qt::LeftButton);
    QVERIFY(!s->isTargetingTimerActive());
    QVERIFY(!s->popups().empty());
    QTest::mouseClick(s->popups().back()->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QVERIFY(s->popups().empty());
    QTRY_VERIFY_WITH_TIMEOUT(s->isTargetingTimerActive(), 3000);

    // Store Average force-finishes the job: one notice, and OK ends it.
    QPointer<TargetingScreen> guard(s);
    QTest::mouseClick(done, Qt::LeftButton);
    QTest::mouseClick(s->popups().back()->findChild<QPushButton*>(QStringLiteral("BtnStoreAverage")),
                      Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(topPopup<NotificationPopup>() != nullptr, 5000);
    QTest::qWait(500);
    QCOMPARE(int(s->popups().size()), 1);
    NotificationPopup* notice = topPopup<NotificationPopup>();
    QCOMPARE(notice->headerText(), QStringLiteral("Warning"));
    QCOMPARE(notice->messageText(), QStringLiteral("SMC force finished, all readings averaged for result."));
    QVERIFY(control(QStringLiteral("jobs")).contains(QStringLiteral("\"%1\"  LOCAL").arg(m_jobName)));
    QTest::mouseClick(notice->findChild<QPushButton*>(QStringLiteral("Btn")), Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(requestedScreens().contains(JOB_MEASURE_SCREEN_ID), 5000);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
}

void tst_Targeting::lastSampleEndsTheJob()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 2);
    QVERIFY(s);
    QPointer<TargetingScreen> guard(s);
    control(QStringLiteral("place"));
    measureOnce();
    QVERIFY(guard);
    QVERIFY(requestedScreens().isEmpty());

    const int soundsBefore = countPlays(QStringLiteral("job_finished.wav"));
    jobSoundAtMs = -1;
    summaryAskedAtMs = -1;
    QTRY_VERIFY_WITH_TIMEOUT(s->isDebounced() && s->isTargetingTimerActive(), 5000);
    // A restart clears the feet until the first reading.
    waitForFeet(true, true, true);
    press();
    QTRY_VERIFY_WITH_TIMEOUT(countPlays(QStringLiteral("job_finished.wav")) > soundsBefore, 8000);
    QTRY_VERIFY_WITH_TIMEOUT(requestedScreens().contains(JOB_MEASURE_SCREEN_ID), 5000);
    QVERIFY(jobSoundAtMs >= 0 && summaryAskedAtMs >= 0);
    QVERIFY2(summaryAskedAtMs - jobSoundAtMs >= 950,
             qPrintable(QString::number(summaryAskedAtMs - jobSoundAtMs)));
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    QCOMPARE(m_master->currentScreen()->objectName(), QStringLiteral("StandIn%1").arg(int(JOB_MEASURE_SCREEN_ID)));
    QCOMPARE(serverSamples(m_jobName), 2);
}

void tst_Targeting::completeJobOpenedLeavesAtInit()
{
    // A job already complete when the screen is built: the screen first
    // stands, then leaves for the summary from its init step.
    DataManager* data = DataManager::instance();
    data->setActiveJob(data->findJobByName(QStringLiteral("Job 1")));
    QVERIFY(data->getActiveJobObject().isJobComplete());
    m_master->onAddScreenToStack(TARGETING_SCREEN_ID);
    QPointer<TargetingScreen> guard(screen());
    QVERIFY(guard);
    QTRY_VERIFY_WITH_TIMEOUT(requestedScreens().contains(JOB_MEASURE_SCREEN_ID), 5000);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    QCOMPARE(m_master->screenCount(), 2);
    QCOMPARE(m_master->currentScreen()->objectName(), QStringLiteral("StandIn%1").arg(int(JOB_MEASURE_SCREEN_ID)));
}

void tst_Targeting::jobTimeLimitClosesAndKeepsTheJob()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QPointer<TargetingScreen> guard(s);
    control(QStringLiteral("place"));
    measureOnce();
    QVERIFY(control(QStringLiteral("param JOB_COMPLETION_TIME 1")).startsWith(QLatin1String("OK")));
    // The server counts whole seconds since the first reading and refuses
    // once more than the limit has passed: two full seconds must lie
    // between the stored reading and the next press.
    QTest::qWait(2500);
    QTRY_VERIFY_WITH_TIMEOUT(s->isDebounced() && s->isTargetingTimerActive(), 5000);
    waitForFeet(true, true, true);
    press();
    QTRY_VERIFY_WITH_TIMEOUT(topPopup<NotificationPopup>() != nullptr, 15000);
    NotificationPopup* popup = topPopup<NotificationPopup>();
    QCOMPARE(popup->headerText(), QStringLiteral("Job Time Elapsed"));
    QCOMPARE(popup->messageText(), QStringLiteral("The job wasn't completed within the allocated time"));
    QTest::mouseClick(popup->findChild<QPushButton*>(QStringLiteral("Btn")), Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    QCOMPARE(serverSamples(m_jobName), 1);
    QVERIFY(DataManager::instance()->findJobByName(m_jobName) != NO_INDEX);
}

void tst_Targeting::hotSampleWarnsOnce()
{
    UserParams::setSampleTempCheckEnabled(true);
    UserParams::setSampleTempCheckLowLimit(10.0f);
    UserParams::setSampleTempCheckHighLimit(40.0f);
    control(QStringLiteral("temperature 55"));
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 5);
    QVERIFY(s);
    control(QStringLiteral("place"));
    measureOnce();
    QTRY_VERIFY_WITH_TIMEOUT(topPopup<DeletePopup>() != nullptr, 5000);
    DeletePopup* warning = topPopup<DeletePopup>();
    QCOMPARE(warning->objectName(), QStringLiteral("TempWarning"));
    QCOMPARE(warning->findChild<QLabel*>(QStringLiteral("labelHeader"))->text(), QStringLiteral("Warning"));
    QVERIFY(!s->isTargetingTimerActive());

    // Continue: targeting again, and the next hot sample passes silently.
    QTest::mouseClick(warning->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QVERIFY(s->popups().empty());
    QTRY_VERIFY_WITH_TIMEOUT(s->isTargetingTimerActive(), 3000);
    measureOnce();
    QTest::qWait(1500);
    QVERIFY(topPopup<DeletePopup>() == nullptr);
    QCOMPARE(serverSamples(m_jobName), 2);
}

void tst_Targeting::onlineModeLooksAndLeaves()
{
    QVERIFY(control(QStringLiteral("online start \"Lab panel\" none")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(screen() != nullptr, 8000);
    TargetingScreen* s = screen();
    QCOMPARE(s->objectName(), QStringLiteral("TargetingScreenLabMode"));
    QLabel* smc = s->findChild<QLabel*>(QStringLiteral("labelSMC"));
    QVERIFY(smc->isVisible());
    QCOMPARE(smc->text(), QStringLiteral("Online Mode"));
    QVERIFY(s->sampleNumbers().empty());

    // Back asks before leaving online mode.
    QTest::mouseClick(s->findChild<QPushButton*>(QStringLiteral("BtnBack")), Qt::LeftButton);
    DeletePopup* ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QCOMPARE(ask->findChild<QLabel*>(QStringLiteral("labelHeader"))->text(), QStringLiteral("Exit Online Mode?"));
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QVERIFY(s->popups().empty());

    // The lab ends the job: home.
    QVERIFY(control(QStringLiteral("online end")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(m_master->findChild<TargetingScreen*>() == nullptr, 8000);
    QTRY_VERIFY_WITH_TIMEOUT(!UserParams::getLabModeEnabled(), 5000);
}

void tst_Targeting::busyInstrumentClosesTheScreen()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QPointer<TargetingScreen> guard(s);
    control(QStringLiteral("busy on"));
    QElapsedTimer waited;
    waited.start();
    TargetingAPI_StartPolling();
    QVERIFY(waited.elapsed() >= 14900);
    QVERIFY(waited.elapsed() < 20000);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    control(QStringLiteral("busy off"));
}

void tst_Targeting::deadLinkGivesFaultScreen()
{
    TargetingScreen* s = openJob(JOB_AVG_MODE_NONE, 3);
    QVERIFY(s);
    QPointer<TargetingScreen> guard(s);
    control(QStringLiteral("place"));
    QVERIFY(control(QStringLiteral("drop 3")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(m_master->currentScreen()
                                 && QLatin1String(m_master->currentScreen()->metaObject()->className())
                                     == QLatin1String("SadPuppyScreen"),
                             5000);
    QTRY_VERIFY_WITH_TIMEOUT(guard.isNull(), 3000);
    // Back: the fault screen goes and the home screen returns.
    QTRY_VERIFY_WITH_TIMEOUT(m_master->screenCount() == 1, 20000);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
}

QTEST_MAIN(tst_Targeting)
#include "tst_targeting.moc"
