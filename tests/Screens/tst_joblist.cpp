// The home screen against the simulator: the two tabs and their counts, the
// delete-all and send-all rows, row reuse, the row actions, the gates before
// targeting, and a link that breaks and comes back.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/DeletePopup.h"
#include "Screens/JobActionsPopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/PopupPanel.h"
#include "Screens/ScreenMaster.h"
#include "Screens/LockScreen.h"
#include "Screens/SyncScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/FlickList.h"
#include "Widgets/JobListQuickSelectionItem.h"
#include "Widgets/JobListSelectionItem.h"
#include "Widgets/WebSyncButton.h"
#include "Widgets/WebSyncWidget.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QPushButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QPointer>
#include <QtTest>

namespace {

// Screens of later parts stand in as plain panels, so that the test sees
// which screen the home screen asked for.
QList<SCREEN_ID_T>& requestedScreens()
{
    static QList<SCREEN_ID_T> ids;
    return ids;
}

// Lines that contain `part`, leaving out the stops of a sound: a played
// sound is counted once, whether or not a later one cut it.
int count(const QStringList& lines, const QString& part)
{
    int n = 0;
    for (const QString& line : lines)
        n += line.contains(part) && !line.startsWith(QLatin1String("stop ")) ? 1 : 0;
    return n;
}

// Counts the screens of one class that were shown, however briefly.
class ShowWatcher : public QObject
{
public:
    explicit ShowWatcher(const char* className)
        : m_className(className)
    {
        qApp->installEventFilter(this);
    }
    ~ShowWatcher() override { qApp->removeEventFilter(this); }
    int shown() const { return m_shown; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override
    {
        if (event->type() == QEvent::Show && watched->inherits(m_className))
            ++m_shown;
        return false;
    }

private:
    const char* m_className;
    int m_shown = 0;
};

} // namespace

class tst_JobList : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    void startsOnceAndShowsTheOpenTab();
    void readySoundPlaysOnce();
    void noJobsGivesEmptyTabs();
    void deleteAllRowNeedsTwoCompleteJobs();
    void sendAllRowFollowsWifi();
    void completedJobMovesTabsAndKeepsItsRow();
    void arrowActsOnce();
    void completeRowAsksBeforeDeleting();
    void actionsPopupByJobState();
    void fullInstrumentRefusesNewJob();
    void expiredCalibrationLeadsToTheWizard();
    void newJobGoesToTargeting();
    void busyInstrumentKeepsUserOnList();
    void startupCalibrationCoverShowsOnce();
    void settingsDisableTheListUntilBack();
    void manyJobsAreReReadBehindACover();
    void deletedRowKeepsItsNeighbourInView();
    void deletingTopRowShowsTheTop();
    void rowShowsSyncProgress();
    void sendAllMarksRowsSynchronised();
    void lostLinkShowsFaultAndComesBack();
    void popupStandsWholeAfterRecovery();

private:
    JobListScreen* home() const;
    FlickList* openList() const { return home()->findChild<FlickList*>(QStringLiteral("JobList")); }
    FlickList* completeList() const { return home()->findChild<FlickList*>(QStringLiteral("JobListComplete")); }
    QString control(const QString& line) { return m_sim.control(line); }
    // Replaces the jobs on the instrument and waits for the rebuilt list.
    void setJobs(int open, int complete);
    void refreshAndWait(int open, int complete);
    bool rowVisible(FlickList* list, int row) const;
    // Until the job list has not been re-read for a while.
    void waitForQuietList();
    // The first job index shown in the open (false) or complete (true) list.
    int shownJob(bool complete) const;
    int popupCount() const;
    template <class P>
    P* topPopup() const;
    void goHome();

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

JobListScreen* tst_JobList::home() const
{
    return m_master ? m_master->findChild<JobListScreen*>() : nullptr;
}

void tst_JobList::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("joblist")));

    ProductHarness::standInOtherScreens({}, [](SCREEN_ID_T id) { requestedScreens() << id; });

    Platform::clearRecordedCommands();
    m_master = new ScreenMaster;
    m_master->show();
    QVERIFY(home());
    // The link opens with the home screen; the list follows the init.
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(home()->isReady(), 10000);
}

void tst_JobList::cleanupTestCase()
{
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_JobList::init()
{
    goHome();
    UserParams::setEnableViewMeasurements(false);
    UserParams::setAllowSync(false);
    requestedScreens().clear();
}

void tst_JobList::goHome()
{
    m_master->onGotoHomeScreen();
    for (PopupPanel* popup : std::vector<PopupPanel*>(home()->popups()))
        home()->onClosePopup(popup);
    QTRY_VERIFY(home()->isActive());
    QTRY_VERIFY(home()->isEnabled());
}

void tst_JobList::setJobs(int open, int complete)
{
    DataManager* data = DataManager::instance();
    data->deleteAllJobs();
    if (complete > 0)
        QVERIFY(control(QStringLiteral("bulk %1 1").arg(complete)).startsWith(QLatin1String("OK")));
    for (int i = 0; i < open; ++i)
        QVERIFY(data->createNewJob() != 65535);
    refreshAndWait(open, complete);
}

void tst_JobList::refreshAndWait(int open, int complete)
{
    DataManager::instance()->updateJobInfos();
    QTRY_VERIFY_WITH_TIMEOUT(home()->isReady() && home()->getNumOpenJobs() == open
                                 && home()->getNumCompletedJobs() == complete,
                             10000);
}

void tst_JobList::waitForQuietList()
{
    QSignalSpy updates(API_SignalMaster::instance(), &API_SignalMaster::JobInfoUpdated);
    QElapsedTimer total;
    total.start();
    int seen = -1;
    while (seen != updates.count() && total.elapsed() < 10000) {
        seen = updates.count();
        QTest::qWait(1200);
    }
}

bool tst_JobList::rowVisible(FlickList* list, int row) const
{
    if (row >= list->count() || list->isRowHidden(row))
        return false;
    return list->viewport()->rect().intersects(list->visualItemRect(list->item(row)));
}

int tst_JobList::shownJob(bool complete) const
{
    FlickList* list = complete ? completeList() : openList();
    const int offset = complete ? 2 : 0;
    for (int i = 0; i + offset < list->count(); ++i)
        if (!list->isRowHidden(i + offset))
            return i;
    return -1;
}

int tst_JobList::popupCount() const
{
    return int(home()->popups().size());
}

template <class P>
P* tst_JobList::topPopup() const
{
    const auto& popups = home()->popups();
    return popups.empty() ? nullptr : qobject_cast<P*>(popups.back());
}

void tst_JobList::startsOnceAndShowsTheOpenTab()
{
    // The display controller is set up exactly once, by the home screen.
    QCOMPARE(count(Platform::recordedCommands(), QStringLiteral("echo INIT > /dev/ili9486")), 1);
    QCOMPARE(m_master->screenAt(0), static_cast<QWidget*>(home()));
    QVERIFY(!home()->isShowingCompleted());
    QVERIFY(openList()->isVisible());
    QVERIFY(!completeList()->isVisible());
    QPushButton* left = home()->findChild<QPushButton*>(QStringLiteral("BtnLeftTab"));
    QPushButton* right = home()->findChild<QPushButton*>(QStringLiteral("BtnRightTab"));
    QCOMPARE(left->property("selected").toBool(), true);
    QCOMPARE(right->property("selected").toBool(), false);
    QVERIFY(home()->findChild<QPushButton*>(QStringLiteral("BtnAddJob"))->isEnabled());
    QVERIFY(home()->findChild<QPushButton*>(QStringLiteral("BtnSettings"))->isEnabled());

    QTest::mouseClick(right, Qt::LeftButton);
    QVERIFY(home()->isShowingCompleted());
    QVERIFY(completeList()->isVisible());
    QCOMPARE(right->property("selected").toBool(), true);
    QTest::mouseClick(left, Qt::LeftButton);
    QVERIFY(openList()->isVisible());
}

void tst_JobList::readySoundPlaysOnce()
{
    const QString ready = QStringLiteral("device_ready.wav");
    QTRY_COMPARE(count(Platform::recordedCommands(), ready), 1);
    // The timer and the init signal both reach onInit: no second sound.
    home()->onInit();
    home()->onInit();
    QTest::qWait(200);
    QCOMPARE(count(Platform::recordedCommands(), ready), 1);
    QVERIFY(home()->isReady());
}

void tst_JobList::noJobsGivesEmptyTabs()
{
    setJobs(0, 0);
    QPushButton* left = home()->findChild<QPushButton*>(QStringLiteral("BtnLeftTab"));
    QPushButton* right = home()->findChild<QPushButton*>(QStringLiteral("BtnRightTab"));
    QCOMPARE(left->text(), QStringLiteral("Open (0)"));
    QCOMPARE(right->text(), QStringLiteral("Complete (0)"));
    QVERIFY(completeList()->isRowHidden(0));
    QVERIFY(completeList()->isRowHidden(1));
    for (int row = 0; row < openList()->count(); ++row)
        QVERIFY(openList()->isRowHidden(row));
    for (int row = 2; row < completeList()->count(); ++row)
        QVERIFY(completeList()->isRowHidden(row));
}

void tst_JobList::deleteAllRowNeedsTwoCompleteJobs()
{
    setJobs(1, 1);
    QVERIFY(completeList()->isRowHidden(0));
    setJobs(1, 2);
    QVERIFY(!completeList()->isRowHidden(0));
    QCOMPARE(qobject_cast<JobListQuickSelectionItem*>(completeList()->getWidget(0))->text(),
             QStringLiteral("Delete All Completed Jobs"));

    // The red row asks first, and only a confirmation deletes.
    home()->stateChanged(true);
    QTest::mouseClick(completeList()->getWidget(0), Qt::LeftButton, {}, QPoint(100, 40));
    DeletePopup* ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QCOMPARE(ask->findChild<QLabel*>(QStringLiteral("labelHeader"))->text(),
             QStringLiteral("Delete All Completed Jobs?"));
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnConfirm")), Qt::LeftButton);
    QCOMPARE(popupCount(), 0);
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumCompletedJobs() == 0 && home()->getNumOpenJobs() == 1, 10000);
    QVERIFY(completeList()->isRowHidden(0));
}

void tst_JobList::sendAllRowFollowsWifi()
{
    setJobs(0, 1);
    UserParams::setAllowSync(true);
    home()->onWifiStateChanged(WIFI_STATUS_CONNECTED);
    QVERIFY(!completeList()->isRowHidden(1));
    home()->onWifiStateChanged(WIFI_STATUS_ON_STATIC);
    QVERIFY(completeList()->isRowHidden(1));
    home()->onWifiStateChanged(WIFI_STATUS_ON_NO_CONNECTION);
    QVERIFY(completeList()->isRowHidden(1));
    UserParams::setAllowSync(false);
    home()->onWifiStateChanged(WIFI_STATUS_CONNECTED);
    QVERIFY(completeList()->isRowHidden(1));

    // The real radio: with a static address the state is ON_STATIC, and the
    // row stays hidden even with sync allowed; with DHCP it shows.
    UserParams::setAllowSync(true);
    QVERIFY(control(QStringLiteral("wifi static 192.168.7.20")).startsWith(QLatin1String("OK")));
    QVERIFY(control(QStringLiteral("wifi on")).startsWith(QLatin1String("OK")));
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState(), WIFI_STATUS_ON_STATIC, 10000);
    refreshAndWait(0, 1);
    QVERIFY(completeList()->isRowHidden(1));
    QVERIFY(!home()->rowOf(0, true)->webSyncWidget()->isVisible());
    QVERIFY(control(QStringLiteral("wifi dhcp")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(!completeList()->isRowHidden(1), 10000);
    QVERIFY(home()->rowOf(0, true)->webSyncWidget()->isVisible());
    QVERIFY(control(QStringLiteral("wifi off")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(completeList()->isRowHidden(1), 10000);
}

void tst_JobList::completedJobMovesTabsAndKeepsItsRow()
{
    setJobs(1, 0);
    const int openRows = openList()->count();
    const int completeRows = completeList()->count();
    JobListSelectionItem* openRow = home()->rowOf(0, false);
    QVERIFY(openRow);
    QVERIFY(!openList()->isRowHidden(0));
    QVERIFY(completeList()->isRowHidden(2));
    const QString name = openRow->getJob().getName();

    QVERIFY(control(QStringLiteral("job-state \"%1\" 2004").arg(name)).startsWith(QLatin1String("OK")));
    refreshAndWait(0, 1);
    // Same rows, reused: the open one hidden, the complete one shown.
    QCOMPARE(openList()->count(), openRows);
    QCOMPARE(completeList()->count(), completeRows);
    QCOMPARE(home()->rowOf(0, false), openRow);
    QVERIFY(openList()->isRowHidden(0));
    QVERIFY(!completeList()->isRowHidden(2));
    QCOMPARE(home()->rowOf(0, true)->getJob().getName(), name);
}

void tst_JobList::arrowActsOnce()
{
    setJobs(1, 0);
    JobListSelectionItem* row = home()->rowOf(0, false);
    QSignalSpy started(row, &JobListSelectionItem::startJob);
    QSignalSpy tapped(row, &QPushButton::clicked);
    QPushButton* arrow = row->findChild<QPushButton*>(QStringLiteral("BtnAction"));
    QTest::mouseClick(arrow, Qt::LeftButton);
    QCOMPARE(started.count(), 1);
    QCOMPARE(tapped.count(), 0);
    // The arrow asked for targeting (the instrument is idle and calibrated).
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{TARGETING_SCREEN_ID});
    goHome();

    // A row click that follows the arrow's press is swallowed...
    row->sendAction();
    row->sendClick();
    QCOMPARE(tapped.count(), 0);
    // ... and the next touch on the row is a touch on the row.
    goHome();
    requestedScreens().clear();
    QTest::mouseClick(row, Qt::LeftButton, {}, QPoint(60, 40));
    QCOMPARE(tapped.count(), 1);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{TARGETING_SCREEN_ID});
}

void tst_JobList::completeRowAsksBeforeDeleting()
{
    setJobs(0, 1);
    home()->stateChanged(true);
    JobListSelectionItem* row = home()->rowOf(0, true);
    QSignalSpy clicked(row, &JobListSelectionItem::jobClicked);
    QTest::mouseClick(row, Qt::LeftButton, {}, QPoint(60, 40));
    QCOMPARE(clicked.count(), 1);
    DeletePopup* ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QCOMPARE(ask->findChild<QLabel*>(QStringLiteral("labelHeader"))->text(), QStringLiteral("Delete Job?"));
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QCOMPARE(popupCount(), 0);
    QCOMPARE(DataManager::instance()->getNumberOfJobs(), 1u);

    // The bin of the row asks the same.
    QTest::mouseClick(row->findChild<QPushButton*>(QStringLiteral("BtnAction")), Qt::LeftButton);
    ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnConfirm")), Qt::LeftButton);
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumCompletedJobs() == 0, 10000);
}

void tst_JobList::actionsPopupByJobState()
{
    setJobs(1, 1);
    UserParams::setEnableViewMeasurements(true);

    // An open job: run it or copy it; no delete.
    QVERIFY(shownJob(false) >= 0);
    QTest::mouseClick(home()->rowOf(shownJob(false), false), Qt::LeftButton, {}, QPoint(60, 40));
    JobActionsPopup* actions = topPopup<JobActionsPopup>();
    QVERIFY(actions);
    QPushButton* run = actions->findChild<QPushButton*>(QStringLiteral("BtnViewEditStart"));
    QCOMPARE(run->text(), QStringLiteral("Execute Job"));
    QVERIFY(actions->findChild<QPushButton*>(QStringLiteral("BtnDelete"))->isHidden());
    QVERIFY(!actions->findChild<QPushButton*>(QStringLiteral("BtnDelete"))->isEnabled());
    QVERIFY(actions->findChild<QPushButton*>(QStringLiteral("BtnSync"))->isHidden());
    QCOMPARE(run->geometry(), QRect(30, 214, 260, 48));
    QCOMPARE(actions->findChild<QPushButton*>(QStringLiteral("BtnCancel"))->geometry(), QRect(30, 326, 260, 48));

    // Copy runs, then the popup goes.
    QTest::mouseClick(actions->findChild<QPushButton*>(QStringLiteral("BtnCopy")), Qt::LeftButton);
    QCOMPARE(popupCount(), 0);
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumOpenJobs() == 2, 10000);

    // A complete job with Wi-Fi and sync: five buttons in a column.
    UserParams::setAllowSync(true);
    home()->stateChanged(true);
    const int completeIndex = shownJob(true);
    QVERIFY(completeIndex >= 0);
    QVERIFY(control(QStringLiteral("wifi dhcp")).startsWith(QLatin1String("OK")));
    QVERIFY(control(QStringLiteral("wifi on")).startsWith(QLatin1String("OK")));
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState(), WIFI_STATUS_CONNECTED, 10000);
    QTest::mouseClick(home()->rowOf(completeIndex, true), Qt::LeftButton, {}, QPoint(60, 40));
    actions = topPopup<JobActionsPopup>();
    QVERIFY(actions);
    QPushButton* sync = actions->findChild<QPushButton*>(QStringLiteral("BtnSync"));
    QVERIFY(!sync->isHidden());
    QCOMPARE(sync->geometry(), QRect(30, 276, 260, 36));
    QCOMPARE(actions->findChild<QPushButton*>(QStringLiteral("BtnDelete"))->geometry(), QRect(30, 321, 260, 36));
    QCOMPARE(actions->findChild<QPushButton*>(QStringLiteral("BtnViewEditStart"))->text(), QStringLiteral("View/Edit Job"));

    // View goes to the job's summary.
    QTest::mouseClick(actions->findChild<QPushButton*>(QStringLiteral("BtnViewEditStart")), Qt::LeftButton);
    QCOMPARE(popupCount(), 0);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{JOB_MEASURE_SCREEN_ID});
    QVERIFY(control(QStringLiteral("wifi off")).startsWith(QLatin1String("OK")));
}

void tst_JobList::fullInstrumentRefusesNewJob()
{
    setJobs(2, 0);
    QVERIFY(control(QStringLiteral("memory 2 10000")).startsWith(QLatin1String("OK")));
    QTest::mouseClick(home()->findChild<QPushButton*>(QStringLiteral("BtnAddJob")), Qt::LeftButton);
    NotificationPopup* full = topPopup<NotificationPopup>();
    QVERIFY(full);
    QCOMPARE(full->findChild<QLabel*>(QStringLiteral("labelTextTitle"))->text(), QStringLiteral("Instrument Is Full"));
    QVERIFY(full->findChild<QLabel*>(QStringLiteral("labelTextSummary"))->text().startsWith(QLatin1String("A new job cannot be created")));
    QVERIFY(home()->isEnabled());
    QTest::mouseClick(full->findChild<QPushButton*>(QStringLiteral("Btn")), Qt::LeftButton);
    QCOMPARE(popupCount(), 0);

    // No room for the job's measurements: the arrow says so instead of targeting.
    QVERIFY(control(QStringLiteral("memory 500 3")).startsWith(QLatin1String("OK")));
    QTest::mouseClick(home()->rowOf(shownJob(false), false)->findChild<QPushButton*>(QStringLiteral("BtnAction")), Qt::LeftButton);
    full = topPopup<NotificationPopup>();
    QVERIFY(full);
    QVERIFY(full->findChild<QLabel*>(QStringLiteral("labelTextSummary"))->text().startsWith(QLatin1String("There is not enough memory")));
    QVERIFY(requestedScreens().isEmpty());
    QVERIFY(control(QStringLiteral("memory 500 10000")).startsWith(QLatin1String("OK")));
}

void tst_JobList::expiredCalibrationLeadsToTheWizard()
{
    setJobs(1, 0);
    QVERIFY(control(QStringLiteral("calibration expire")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal <= 0, 10000);
    QTest::mouseClick(home()->rowOf(0, false)->findChild<QPushButton*>(QStringLiteral("BtnAction")), Qt::LeftButton);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{CAL_WIZARD_SCREEN_ID});
    goHome();
    requestedScreens().clear();
    QTest::mouseClick(home()->findChild<QPushButton*>(QStringLiteral("BtnAddJob")), Qt::LeftButton);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{CAL_WIZARD_SCREEN_ID});
    QVERIFY(control(QStringLiteral("calibration renew")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getCalState().nextExternalWhiteCal > 0, 10000);
}

void tst_JobList::newJobGoesToTargeting()
{
    setJobs(0, 0);
    QTest::mouseClick(home()->findChild<QPushButton*>(QStringLiteral("BtnAddJob")), Qt::LeftButton);
    QTRY_COMPARE_WITH_TIMEOUT(requestedScreens(), QList<SCREEN_ID_T>{TARGETING_SCREEN_ID}, 10000);
    QCOMPARE(DataManager::instance()->getNumberOfJobs(), 1u);
    QVERIFY(DataManager::instance()->getActiveJob() == 0);
    // Back home, the screen works again and lists the new job.
    goHome();
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumOpenJobs() == 1, 10000);
}

void tst_JobList::busyInstrumentKeepsUserOnList()
{
    setJobs(1, 0);
    QVERIFY(control(QStringLiteral("busy on")).startsWith(QLatin1String("OK")));
    QElapsedTimer waited;
    waited.start();
    home()->GotoScreen(TARGETING_SCREEN_ID);
    const qint64 ms = waited.elapsed();
    QVERIFY(control(QStringLiteral("busy off")).startsWith(QLatin1String("OK")));
    QVERIFY2(ms >= 15000 && ms < 18000, qPrintable(QString::number(ms)));
    QVERIFY(requestedScreens().isEmpty());
    QCOMPARE(popupCount(), 0);
    QCOMPARE(m_master->currentScreen(), static_cast<QWidget*>(home()));
    QVERIFY(home()->isActive());
}

void tst_JobList::startupCalibrationCoverShowsOnce()
{
    auto covers = [this] {
        int n = 0;
        for (LockScreen* cover : m_master->findChildren<LockScreen*>())
            n += (cover->isVisible() && !qobject_cast<SyncScreen*>(cover)) ? 1 : 0;
        return n;
    };
    QCOMPARE(covers(), 0);
    home()->onUpdateSystemState(STATE_CALIBRATING);
    QCOMPARE(covers(), 1);
    // The next state takes it away, and it never comes back in this process.
    home()->onUpdateSystemState(STATE_INIT);
    QCOMPARE(covers(), 0);
    home()->onUpdateSystemState(STATE_POWER_UP);
    home()->onUpdateSystemState(STATE_CALIBRATING);
    QCOMPARE(covers(), 0);
}

void tst_JobList::settingsDisableTheListUntilBack()
{
    setJobs(1, 0);
    QTest::mouseClick(home()->findChild<QPushButton*>(QStringLiteral("BtnSettings")), Qt::LeftButton);
    QCOMPARE(requestedScreens(), QList<SCREEN_ID_T>{CONFIG_MAIN_SCREEN_ID});
    QVERIFY(!home()->isEnabled());
    QVERIFY(!home()->isActive());
    m_master->onGotoHomeScreen();
    QTRY_VERIFY(home()->isActive());
    QVERIFY(home()->isEnabled());
}

void tst_JobList::manyJobsAreReReadBehindACover()
{
    setJobs(0, 51);
    home()->GotoScreen(CONFIG_MAIN_SCREEN_ID);
    QVERIFY(!home()->isActive());
    QSignalSpy rebuilt(API_SignalMaster::instance(), &API_SignalMaster::JobInfoUpdated);
    ShowWatcher covers("SyncScreen");
    m_master->onGotoHomeScreen();
    // From 51 jobs the return home re-reads on the data thread, behind the
    // sync cover, which the rebuild takes away.
    QCOMPARE(covers.shown(), 1);
    QTRY_VERIFY_WITH_TIMEOUT(rebuilt.count() >= 1, 10000);
    QTRY_VERIFY_WITH_TIMEOUT(!m_master->findChild<SyncScreen*>(), 5000);
    QCOMPARE(home()->getNumCompletedJobs(), 51);
}

void tst_JobList::deletedRowKeepsItsNeighbourInView()
{
    setJobs(0, 12);
    home()->stateChanged(true);
    FlickList* list = completeList();
    list->scrollToTop();
    // The job on row 10 goes: row 9 is to be in view afterwards.
    const int jobIndex = 8;
    JobListSelectionItem* row = home()->rowOf(jobIndex, true);
    QCOMPARE(list->getWidget(jobIndex + 2), static_cast<QWidget*>(row));
    DataManager::instance()->setActiveJob(jobIndex);
    // The row to keep is taken by the next rebuild, whichever it is: the
    // status poll's own re-read of the new jobs must be over first.
    waitForQuietList();
    // The rebuild that follows the deletion scrolls the neighbour into view;
    // any later rebuild (a status poll on a slow machine) brings row 0 back
    // into view, as it should. So the view is looked at when it moves.
    bool neighbourShown = false;
    QObject watch; // the connection ends with this test, also when it fails
    connect(list->verticalScrollBar(), &QScrollBar::valueChanged, &watch, [&] {
        if (home()->getNumCompletedJobs() == 11 && list->verticalScrollBar()->value() > 0
            && rowVisible(list, jobIndex + 1))
            neighbourShown = true;
    });
    home()->onDeleteJobConfirmed();
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumCompletedJobs() == 11, 10000);
    QTRY_VERIFY_WITH_TIMEOUT(neighbourShown || (list->verticalScrollBar()->value() > 0 && rowVisible(list, jobIndex + 1)),
                             5000);
}

void tst_JobList::deletingTopRowShowsTheTop()
{
    setJobs(0, 12);
    home()->stateChanged(true);
    FlickList* list = completeList();
    list->scrollToBottom();
    QVERIFY(list->verticalScrollBar()->value() > 0);
    // Row 3 is before the walk's start: the list goes to its top.
    DataManager::instance()->setActiveJob(1);
    home()->onDeleteJobConfirmed();
    QTRY_VERIFY_WITH_TIMEOUT(home()->getNumCompletedJobs() == 11, 10000);
    QCOMPARE(list->verticalScrollBar()->value(), 0);
}

void tst_JobList::rowShowsSyncProgress()
{
    WebSyncWidget mark;
    mark.setJobName(QStringLiteral("Job 7"));
    QVERIFY(mark.showsPicture());
    mark.onWebSync(QStringLiteral("Job 8"), false, 40);
    QVERIFY(mark.showsPicture());
    QCOMPARE(mark.text(), QString());
    mark.onWebSync(QStringLiteral("Job 7"), false, 40);
    QCOMPARE(mark.text(), QStringLiteral("40%"));
    QVERIFY(!mark.showsPicture());
    // The final mark comes with the row's next update, not with the news.
    mark.onWebSync(QStringLiteral("Job 7"), true, 100);
    QCOMPARE(mark.text(), QStringLiteral("40%"));
    mark.onWebSync(QStringLiteral("Job 7"), false, 100);
    QVERIFY(mark.showsPicture());
    QCOMPARE(mark.text(), QString());
    mark.onWebSync(QStringLiteral("Job 7"), false, 0);
    QVERIFY(mark.showsPicture());
}

void tst_JobList::sendAllMarksRowsSynchronised()
{
    setJobs(0, 1);
    UserParams::setAllowSync(true);
    QVERIFY(control(QStringLiteral("wifi dhcp")).startsWith(QLatin1String("OK")));
    QVERIFY(control(QStringLiteral("wifi on")).startsWith(QLatin1String("OK")));
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getWifiState(), WIFI_STATUS_CONNECTED, 10000);
    refreshAndWait(0, 1);
    home()->stateChanged(true);
    WebSyncWidget* mark = home()->rowOf(0, true)->webSyncWidget();
    QVERIFY(mark->isVisible());
    const QImage pending = QPixmap(QStringLiteral(":/Assets/sync_job_pending.png")).toImage();
    const QImage done = QPixmap(QStringLiteral(":/Assets/sync_job_completed.png")).toImage();
    QCOMPARE(mark->picture().toImage(), pending);

    // The blue row sends every complete job; the row's mark counts up.
    QStringList seen;
    QTimer watch;
    connect(&watch, &QTimer::timeout, this, [&] {
        if (!mark->text().isEmpty() && !seen.contains(mark->text()))
            seen << mark->text();
    });
    watch.start(20);
    QTest::mouseClick(completeList()->getWidget(1), Qt::LeftButton, {}, QPoint(100, 40));
    // The server's news of the finished job re-reads the list by itself.
    QTRY_COMPARE_WITH_TIMEOUT(DataManager::instance()->getAJobObject(0).getJobState(), 2008, 20000);
    watch.stop();
    QVERIFY2(!seen.isEmpty() && seen.first().endsWith(QLatin1Char('%')), qPrintable(seen.join(',')));
    // The state 2008 gives the final mark with the row's update.
    QTRY_COMPARE_WITH_TIMEOUT(mark->picture().toImage(), done, 10000);
    QVERIFY(control(QStringLiteral("wifi off")).startsWith(QLatin1String("OK")));
}

void tst_JobList::lostLinkShowsFaultAndComesBack()
{
    setJobs(1, 2);
    QVERIFY(control(QStringLiteral("drop 3")).startsWith(QLatin1String("OK")));
    QElapsedTimer down;
    down.start();
    QTRY_VERIFY_WITH_TIMEOUT(m_master->currentScreen()
                                 && QString(m_master->currentScreen()->metaObject()->className()) == QLatin1String("SadPuppyScreen"),
                             5000);
    QVERIFY2(down.elapsed() < 3000, qPrintable(QString::number(down.elapsed())));
    // Back: the fault screen goes and the list returns with its jobs.
    QTRY_VERIFY_WITH_TIMEOUT(m_master->currentScreen() == home(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    refreshAndWait(1, 2);
}

void tst_JobList::popupStandsWholeAfterRecovery()
{
    // A warning up when the link dies: after the fault screen has gone it
    // must stand above the list again, not be half covered by it.
    QVERIFY(control(QStringLiteral("battery 8")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(popupCount() > 0, 10000);
    QPointer<PopupPanel> warning = home()->popups().back();
    QVERIFY(control(QStringLiteral("battery 72")).startsWith(QLatin1String("OK")));
    QVERIFY(control(QStringLiteral("drop 3")).startsWith(QLatin1String("OK")));
    QTRY_VERIFY_WITH_TIMEOUT(m_master->currentScreen()
                                 && QString(m_master->currentScreen()->metaObject()->className()) == QLatin1String("SadPuppyScreen"),
                             5000);
    QTRY_VERIFY_WITH_TIMEOUT(m_master->currentScreen() == home(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    QTest::qWait(300);

    if (warning && warning->isVisible()) {
        // Whole: whatever is drawn at its corners and its middle is the popup.
        QWidget* display = warning->parentWidget();
        const QRect area = warning->geometry();
        for (const QPoint& p : {area.center(), area.topLeft() + QPoint(20, 20), area.bottomRight() - QPoint(20, 20)}) {
            QWidget* hit = display->childAt(p);
            QVERIFY2(hit && (hit == warning || warning->isAncestorOf(hit)),
                     qPrintable(QString("at %1,%2: %3").arg(p.x()).arg(p.y())
                                    .arg(hit ? hit->metaObject()->className() : "nothing")));
        }
    }
    goHome();
}

QTEST_MAIN(tst_JobList)
#include "tst_joblist.moc"
