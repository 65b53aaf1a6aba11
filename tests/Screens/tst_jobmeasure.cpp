// The job summary against the simulator: what each kind of job lists, the
// short dead rows when nothing may be viewed, the edit gates and their one
// warning, the read switch, delete and save.

#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/DeletePopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/JobMeasureScreen.h"
#include "Screens/OverridePopup.h"
#include "Screens/PopupPanel.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/UserParams.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/ColorPatch.h"
#include "Widgets/FlickList.h"
#include "Widgets/JobMeasureListingHeader.h"
#include "Widgets/JobSummaryEditSelectionItem.h"
#include "Widgets/KLabel.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/SampleListSelectionItem.h"
#include "Widgets/SampleListSelectionItemComplete.h"
#include "Widgets/WebSyncButton.h"
#include "Widgets/WebSyncWidget.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QPointer>
#include <QPushButton>
#include <QSignalSpy>
#include <QtTest>

namespace {

QList<SCREEN_ID_T>& requestedScreens()
{
    static QList<SCREEN_ID_T> ids;
    return ids;
}

template <class T>
QList<T*> rowsOf(FlickList* list)
{
    QList<T*> rows;
    for (int i = 0; i < list->count(); ++i)
        if (T* row = qobject_cast<T*>(list->getWidget(i)))
            rows << row;
    return rows;
}

QString labelText(QWidget* w, const char* name)
{
    KLabel* label = w->findChild<KLabel*>(QLatin1String(name));
    return label ? label->defaultText() : QStringLiteral("<none>");
}

} // namespace

class tst_JobMeasure : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();
    void cleanup();

    void completeJobListsDetailsAndReadingsNewestFirst();
    void averagedJobShowsOneRowWithoutNumber();
    void smcJobShowsItsResult();
    void averagingJobBeforeItsAverageHasNoResultRow();
    void allDisplaySettingsOffGiveShortDeadRows();
    void sampleRowOpensTheSampleView();
    void instrumentJobEditsWithoutWarning();
    void foreignJobWarnsOnceThenEditsFreely();
    void readSwitchMeasuresOnlyWhenIdleAndOpen();
    void deleteAsksFirst();
    void saveMarksTheJobSavedAndLeaves();
    void sendRowFollowsWifiAndSendsTheJob();
    void vanishedJobClosesTheScreen();

private:
    JobMeasureScreen* openSummary(const QString& name);
    JobMeasureScreen* summary() const;
    QString control(const QString& line) { return m_sim.control(line); }
    void refresh();
    void waitForState(SYSTEM_STATE_T state);
    template <class P>
    P* topPopup() const;

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

void tst_JobMeasure::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("jobmeasure")));

    // Screens of other areas stand in as plain panels, so that the test sees
    // which one the summary asked for.
    ProductHarness::standInOtherScreens({JOB_MEASURE_SCREEN_ID}, [](SCREEN_ID_T id) { requestedScreens() << id; });
    m_master = new ScreenMaster;
    QVERIFY(ProductHarness::showHome(m_master));
}

void tst_JobMeasure::cleanupTestCase()
{
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_JobMeasure::init()
{
    UserParams::setDisplayLABCH(true);
    UserParams::setDisplayRainbow(true);
    UserParams::setDisplayTexture(true);
    UserParams::setDisplayEditFreeText(true);
    UserParams::setAllowSync(false);
    UserParams::setDownloadedJobNameEditable(false);
    UserParams::setDownloadedJobAttributesEditable(false);
    UserParams::setUserFilterFile(false);
    requestedScreens().clear();
}

void tst_JobMeasure::cleanup()
{
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
}

JobMeasureScreen* tst_JobMeasure::summary() const
{
    return qobject_cast<JobMeasureScreen*>(m_master->currentScreen());
}

void tst_JobMeasure::refresh()
{
    DataManager::instance()->updateJobInfos();
}

JobMeasureScreen* tst_JobMeasure::openSummary(const QString& name)
{
    refresh();
    DataManager* data = DataManager::instance();
    const unsigned int index = data->findJobByName(name);
    if (index == NO_INDEX)
        return nullptr;
    data->setActiveJob(index);
    m_master->onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
    JobMeasureScreen* screen = summary();
    if (!screen)
        return nullptr;
    // The samples come from the data thread behind the spinner.
    if (!QTest::qWaitFor([screen] { return !screen->isLoading(); }, 10000))
        return nullptr;
    return screen;
}

void tst_JobMeasure::waitForState(SYSTEM_STATE_T state)
{
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getSystemStatus().getSystemState() == state, 10000);
}

template <class P>
P* tst_JobMeasure::topPopup() const
{
    const auto& popups = summary()->popups();
    return popups.empty() ? nullptr : qobject_cast<P*>(popups.back());
}

void tst_JobMeasure::completeJobListsDetailsAndReadingsNewestFirst()
{
    refresh();
    DataManager::instance()->setActiveJob(DataManager::instance()->findJobByName(QStringLiteral("Job 1")));
    m_master->onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
    JobMeasureScreen* screen = summary();
    QVERIFY(screen);
    // Nothing is listed until the samples have been fetched.
    QVERIFY(screen->isLoading());
    QCOMPARE(screen->sampleList()->count(), 0);
    QTRY_VERIFY_WITH_TIMEOUT(!screen->isLoading(), 10000);

    FlickList* list = screen->sampleList();
    QVERIFY(qobject_cast<JobMeasureListingHeader*>(list->getWidget(0)));
    QCOMPARE(qobject_cast<JobMeasureListingHeader*>(list->getWidget(0))->text(), QStringLiteral("Job Details"));
    const QList<JobSummaryEditSelectionItem*> details = rowsOf<JobSummaryEditSelectionItem>(list);
    QCOMPARE(details.size(), 5);
    QCOMPARE(details[0]->description(), QStringLiteral("Name:"));
    QCOMPARE(details[0]->value(), QStringLiteral("Bonnet"));
    QCOMPARE(details[4]->description(), QStringLiteral("Notes:"));
    QCOMPARE(details[4]->value(), QStringLiteral("Customer car, measured before blending"));
    QVERIFY(details[4]->isLastInList());
    QVERIFY(!details[3]->isLastInList());
    // Sending is offered only on a connected radio with sync allowed.
    QVERIFY(list->isRowHidden(screen->webSyncButtonIndex()));

    const QList<ListingHeader*> headers = rowsOf<ListingHeader>(list);
    QCOMPARE(headers.size(), 1);
    QCOMPARE(labelText(headers[0], "labelLeftText"), QStringLiteral("Measurements"));
    QCOMPARE(labelText(headers[0], "labelRightText"), QStringLiteral("3 of 3 completed"));
    QVERIFY(rowsOf<SampleListSelectionItemComplete>(list).isEmpty());

    const QList<SampleListSelectionItem*> samples = rowsOf<SampleListSelectionItem>(list);
    QCOMPARE(samples.size(), 3);
    QCOMPARE(samples[0]->sampleIndex(), 2);
    QCOMPARE(samples[2]->sampleIndex(), 0);
    QCOMPARE(samples[0]->numberLabel()->text(), QStringLiteral("3"));
    QCOMPARE(samples[2]->numberLabel()->text(), QStringLiteral("1"));
    QVERIFY(!samples[0]->dateTimeLabel()->text().isEmpty());
    QVERIFY(!samples[0]->colorStrip()->colorPatches().isEmpty());
    // Red paint, not the black of a failed conversion.
    const QColor colour = samples[0]->colorStrip()->colorPatches().first()->getColor();
    QVERIFY2(colour.red() > colour.blue(), qPrintable(colour.name()));
    QVERIFY(samples[0]->isClickable());
    QCOMPARE(samples[0]->height(), SampleListSelectionItem::ClickableHeight);

    QCOMPARE(labelText(screen, "labelSaveText"), QStringLiteral("Save"));
    QCOMPARE(labelText(screen, "labelHeader"), QStringLiteral("Summary"));

    // Without the notes setting the third tag closes the details.
    UserParams::setDisplayEditFreeText(false);
    screen->onRefreshSampleList();
    const QList<JobSummaryEditSelectionItem*> short_ = rowsOf<JobSummaryEditSelectionItem>(list);
    QCOMPARE(short_.size(), 4);
    QVERIFY(short_[3]->isLastInList());
}

void tst_JobMeasure::averagedJobShowsOneRowWithoutNumber()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 2"));
    QVERIFY(screen);
    FlickList* list = screen->sampleList();
    const QList<ListingHeader*> headers = rowsOf<ListingHeader>(list);
    QCOMPARE(headers.size(), 1);
    QCOMPARE(labelText(headers[0], "labelLeftText"), QStringLiteral("Average Results"));
    const QList<SampleListSelectionItem*> samples = rowsOf<SampleListSelectionItem>(list);
    QCOMPARE(samples.size(), 1);
    QCOMPARE(samples[0]->sampleIndex(), int(AVERAGED_SAMPLE_INDEX));
    QVERIFY(samples[0]->numberLabel()->text().isEmpty());
    QVERIFY(!samples[0]->dateTimeLabel()->text().isEmpty());
    QVERIFY(!samples[0]->colorStrip()->colorPatches().isEmpty());
}

void tst_JobMeasure::smcJobShowsItsResult()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 5"));
    QVERIFY(screen);
    const QList<ListingHeader*> headers = rowsOf<ListingHeader>(screen->sampleList());
    QCOMPARE(headers.size(), 1);
    QCOMPARE(labelText(headers[0], "labelLeftText"), QStringLiteral("SMC Results"));
    const QList<SampleListSelectionItem*> samples = rowsOf<SampleListSelectionItem>(screen->sampleList());
    QCOMPARE(samples.size(), 1);
    QCOMPARE(samples[0]->sampleIndex(), int(AVERAGED_SAMPLE_INDEX));
}

void tst_JobMeasure::averagingJobBeforeItsAverageHasNoResultRow()
{
    // A job of three readings to average, none taken yet.
    QVERIFY(control(QStringLiteral("online start Panel3 avg3")).startsWith(QLatin1String("OK")));
    QVERIFY(control(QStringLiteral("online end")).startsWith(QLatin1String("OK")));
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
    requestedScreens().clear();
    refresh();
    DataManager* data = DataManager::instance();
    const QString name = QStringLiteral("Panel3");
    const unsigned int index = data->findJobByName(name);
    QVERIFY(index != NO_INDEX);
    QCOMPARE(data->getAJobObject(index).getJobAveragingMode(), JOB_AVG_MODE_SIMPLE_3);

    JobMeasureScreen* screen = openSummary(name);
    QVERIFY(screen);
    const QList<ListingHeader*> headers = rowsOf<ListingHeader>(screen->sampleList());
    QCOMPARE(headers.size(), 1);
    QCOMPARE(labelText(headers[0], "labelLeftText"), QStringLiteral("Average Results"));
    QVERIFY(rowsOf<SampleListSelectionItem>(screen->sampleList()).isEmpty());
    QCOMPARE(rowsOf<SampleListSelectionItemComplete>(screen->sampleList()).size(), 1);
    QCOMPARE(labelText(screen, "labelSaveText"), QStringLiteral("Measure"));

    // An open job goes on measuring, in place of the summary.
    QTest::mouseClick(screen->findChild<QPushButton*>(QStringLiteral("BtnNext")), Qt::LeftButton);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{TARGETING_SCREEN_ID});
    QCOMPARE(m_master->screenCount(), 2);
    data->setActiveJob(index);
    data->deleteActiveJob();
}

void tst_JobMeasure::allDisplaySettingsOffGiveShortDeadRows()
{
    UserParams::setDisplayLABCH(false);
    UserParams::setDisplayRainbow(false);
    UserParams::setDisplayTexture(false);
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 1"));
    QVERIFY(screen);
    const QList<SampleListSelectionItem*> samples = rowsOf<SampleListSelectionItem>(screen->sampleList());
    QCOMPARE(samples.size(), 3);
    for (SampleListSelectionItem* row : samples) {
        QVERIFY(!row->isClickable());
        QCOMPARE(row->height(), SampleListSelectionItem::PlainHeight);
    }
    DataManager* data = DataManager::instance();
    data->setActiveSample(NO_INDEX);
    QSignalSpy clicked(samples[0], &QPushButton::clicked);
    screen->sampleList()->scrollToItem(screen->sampleList()->item(screen->sampleList()->count() - 3));
    QTest::mouseClick(samples[0], Qt::LeftButton, {}, QPoint(100, 30));
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(data->getActiveSample(), NO_INDEX);
    QVERIFY(requestedScreens().isEmpty());
    QVERIFY(screen->isEnabled());

    // Any one of the three makes the rows lead somewhere.
    UserParams::setDisplayTexture(true);
    screen->onRefreshSampleList();
    QVERIFY(rowsOf<SampleListSelectionItem>(screen->sampleList())[0]->isClickable());
}

void tst_JobMeasure::sampleRowOpensTheSampleView()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 1"));
    QVERIFY(screen);
    FlickList* list = screen->sampleList();
    const QList<SampleListSelectionItem*> samples = rowsOf<SampleListSelectionItem>(list);
    list->scrollToItem(list->item(list->count() - 1));
    QTest::mouseClick(samples[1], Qt::LeftButton, {}, QPoint(100, 40));
    QCOMPARE(DataManager::instance()->getActiveSample(), 1u);
    QCOMPARE(requestedScreens(), QList<SCREEN_ID_T>{SAMPLE_VIEW_SCREEN_ID});
    // Under the sample view the summary is dead, and alive again on return.
    QVERIFY(!screen->isEnabled());
    m_master->onCloseCurrentScreen();
    QTRY_VERIFY(screen->isActive());
    QVERIFY(screen->isEnabled());
}

void tst_JobMeasure::instrumentJobEditsWithoutWarning()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 1"));
    QVERIFY(screen);
    QVERIFY(DataManager::instance()->getActiveJobObject().isTagEditable());
    const QList<JobSummaryEditSelectionItem*> details = rowsOf<JobSummaryEditSelectionItem>(screen->sampleList());
    QVERIFY(details[0]->isEditable());
    QVERIFY(details[0]->isEditMarkerShown());

    screen->onEditJobName();
    QCOMPARE(requestedScreens(), QList<SCREEN_ID_T>{JOB_NAME_SCREEN_ID});
    QVERIFY(screen->popups().empty());
    m_master->onCloseCurrentScreen();
    QTRY_VERIFY(screen->isActive());

    // The tag screens follow the filter file setting.
    screen->onEditTag2();
    UserParams::setUserFilterFile(true);
    m_master->onCloseCurrentScreen();
    QTRY_VERIFY(screen->isActive());
    screen->onEditTag3();
    m_master->onCloseCurrentScreen();
    QTRY_VERIFY(screen->isActive());
    screen->onEditFreeText();
    QCOMPARE(requestedScreens(), (QList<SCREEN_ID_T>{JOB_NAME_SCREEN_ID, JOB_TAGS_2_FREE_EDIT_SCREEN_ID,
                                                     JOB_TAGS_3_SCREEN_ID, JOB_FREE_TEXT_SCREEN_ID}));
}

void tst_JobMeasure::foreignJobWarnsOnceThenEditsFreely()
{
    // A job started from the lab was not made on this instrument.
    const QString reply = control(QStringLiteral("online start Downloaded none"));
    QVERIFY2(reply.startsWith(QLatin1String("OK")), qPrintable(reply));
    QVERIFY(control(QStringLiteral("online end")).startsWith(QLatin1String("OK")));
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);
    requestedScreens().clear();

    // Without the permissions its rows are plain text, and the slots refuse too.
    JobMeasureScreen* screen = openSummary(QStringLiteral("Downloaded"));
    QVERIFY(screen);
    QVERIFY(!DataManager::instance()->getActiveJobObject().isTagEditable());
    JobSummaryEditSelectionItem* name = rowsOf<JobSummaryEditSelectionItem>(screen->sampleList())[0];
    QVERIFY(!name->isEditable());
    QVERIFY(!name->isEditMarkerShown());
    QSignalSpy clicked(name, &QPushButton::clicked);
    QTest::mouseClick(name, Qt::LeftButton, {}, QPoint(100, 30));
    QCOMPARE(clicked.count(), 0);
    screen->onEditJobName();
    screen->onEditTag1();
    QVERIFY(screen->popups().empty());
    QVERIFY(requestedScreens().isEmpty());

    UserParams::setDownloadedJobNameEditable(true);
    UserParams::setDownloadedJobAttributesEditable(true);
    screen->onRefreshSampleList();
    QVERIFY(rowsOf<JobSummaryEditSelectionItem>(screen->sampleList())[0]->isEditable());

    screen->onEditTag1();
    OverridePopup* warning = topPopup<OverridePopup>();
    QVERIFY(warning);
    QCOMPARE(labelText(warning, "labelTextTitle"), QStringLiteral("Warning"));
    QCOMPARE(labelText(warning, "labelTextSummary"),
             QStringLiteral("This job was not created on the instrument. Are you sure you want to edit the job?"));
    QCOMPARE(warning->findChild<QPushButton*>(QStringLiteral("BtnMeasure"))->text(), QStringLiteral("Edit"));

    // Cancel opens nothing and remembers nothing.
    QTest::mouseClick(warning->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QVERIFY(screen->popups().empty());
    QVERIFY(requestedScreens().isEmpty());
    QVERIFY(!screen->isJobEditable());

    screen->onEditTag1();
    warning = topPopup<OverridePopup>();
    QVERIFY(warning);
    QTest::mouseClick(warning->findChild<QPushButton*>(QStringLiteral("BtnMeasure")), Qt::LeftButton);
    QTRY_VERIFY(screen->popups().empty());
    QCOMPARE(requestedScreens(), QList<SCREEN_ID_T>{JOB_TAGS_1_FREE_EDIT_SCREEN_ID});
    QVERIFY(screen->isJobEditable());
    m_master->onCloseCurrentScreen();
    QTRY_VERIFY(screen->isActive());

    // One yes holds for the screen's life: the next row opens straight away.
    screen->onEditJobName();
    QVERIFY(screen->popups().empty());
    QCOMPARE(requestedScreens().last(), JOB_NAME_SCREEN_ID);

    DataManager::instance()->deleteActiveJob();
}

void tst_JobMeasure::readSwitchMeasuresOnlyWhenIdleAndOpen()
{
    // Complete: the key is the power key.
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 1"));
    QVERIFY(screen);
    QTest::keyPress(screen, Qt::Key_Return);
    QVERIFY(screen->isPowerKeyTimerRunning());
    QTest::keyRelease(screen, Qt::Key_Return);
    QVERIFY(requestedScreens().isEmpty());
    m_master->onGotoHomeScreen();
    QTRY_COMPARE(m_master->screenCount(), 1);

    // Open, instrument busy: nothing.
    screen = openSummary(QStringLiteral("Job"));
    QVERIFY(screen);
    QVERIFY(control(QStringLiteral("busy on")).startsWith(QLatin1String("OK")));
    waitForState(STATE_BUSY);
    QTest::keyPress(screen, Qt::Key_Return);
    QTest::keyRelease(screen, Qt::Key_Return);
    QVERIFY(!screen->isPowerKeyTimerRunning());
    QTest::qWait(100);
    QVERIFY(requestedScreens().isEmpty());

    // Open and idle: on to targeting, in place of the summary, but not while
    // the screen asks a question.
    QVERIFY(control(QStringLiteral("busy off")).startsWith(QLatin1String("OK")));
    waitForState(STATE_INIT);
    screen->on_BtnBack_clicked();
    QTest::keyPress(screen, Qt::Key_Return);
    QTest::keyRelease(screen, Qt::Key_Return);
    QVERIFY(requestedScreens().isEmpty());
    screen->onClosePopup(screen->popups().back());
    QTest::keyPress(screen, Qt::Key_Return);
    QTRY_COMPARE(requestedScreens(), QList<SCREEN_ID_T>{TARGETING_SCREEN_ID});
    QCOMPARE(m_master->screenCount(), 2);
}

void tst_JobMeasure::deleteAsksFirst()
{
    DataManager* data = DataManager::instance();
    const unsigned int index = data->createNewJob();
    QVERIFY(index != NO_INDEX);
    refresh();
    const QString name = data->getAJobObject(index).getName();
    JobMeasureScreen* screen = openSummary(name);
    QVERIFY(screen);
    QPushButton* bin = screen->findChild<QPushButton*>(QStringLiteral("BtnBack"));

    QTest::mouseClick(bin, Qt::LeftButton);
    DeletePopup* ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QCOMPARE(labelText(ask, "labelHeader"), QStringLiteral("Delete Job?"));
    QCOMPARE(labelText(ask, "labelMessage"),
             QStringLiteral("The entire job and all samples will be permanently deleted."));
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnCancel")), Qt::LeftButton);
    QVERIFY(screen->popups().empty());
    QCOMPARE(summary(), screen);

    QTest::mouseClick(bin, Qt::LeftButton);
    ask = topPopup<DeletePopup>();
    QVERIFY(ask);
    QPointer<JobMeasureScreen> gone(screen);
    QTest::mouseClick(ask->findChild<QPushButton*>(QStringLiteral("BtnConfirm")), Qt::LeftButton);
    QTRY_VERIFY(gone.isNull());
    QTRY_VERIFY_WITH_TIMEOUT((refresh(), data->findJobByName(name) == NO_INDEX), 10000);
}

void tst_JobMeasure::saveMarksTheJobSavedAndLeaves()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 3"));
    QVERIFY(screen);
    QCOMPARE(labelText(screen, "labelSaveText"), QStringLiteral("Save"));
    QPointer<JobMeasureScreen> gone(screen);
    QPushButton* next = screen->findChild<QPushButton*>(QStringLiteral("BtnNext"));
    QTest::mouseClick(next, Qt::LeftButton);
    QTRY_VERIFY(gone.isNull());
    QVERIFY(requestedScreens().isEmpty());
    QString line;
    for (const QString& l : control(QStringLiteral("jobs")).split(QLatin1Char('\n')))
        if (l.contains(QStringLiteral("\"Job 3\"")))
            line = l;
    QVERIFY2(line.contains(QStringLiteral("state 2007")), qPrintable(line));
}

void tst_JobMeasure::sendRowFollowsWifiAndSendsTheJob()
{
    JobMeasureScreen* screen = openSummary(QStringLiteral("Job 1"));
    QVERIFY(screen);
    FlickList* list = screen->sampleList();
    const int row = screen->webSyncButtonIndex();
    QCOMPARE(screen->webSyncButton()->text(), QStringLiteral("Send Job To Server"));
    screen->onWifiStateChanged(WIFI_STATUS_CONNECTED);
    QVERIFY(list->isRowHidden(row));
    UserParams::setAllowSync(true);
    screen->onWifiStateChanged(WIFI_STATUS_CONNECTED);
    QVERIFY(!list->isRowHidden(row));
    screen->onWifiStateChanged(WIFI_STATUS_ON_NO_CONNECTION);
    QVERIFY(list->isRowHidden(row));
    screen->onWifiStateChanged(WIFI_STATUS_CONNECTED);

    QSignalSpy sent(screen, &JobMeasureScreen::syncJob);
    screen->onWebSync();
    QCOMPARE(sent.count(), 1);
    QCOMPARE(sent.at(0).at(0).toString(), QStringLiteral("Job 1"));

    // The header's sync mark follows the same rule.
    auto* header = qobject_cast<JobMeasureListingHeader*>(list->getWidget(0));
    header->onWifiStateChanged(WIFI_STATUS_CONNECTED);
    QVERIFY(!header->webSyncWidget()->isHidden());
    header->onWifiStateChanged(WIFI_STATUS_ON_NO_CONNECTION);
    QVERIFY(header->webSyncWidget()->isHidden());
}

void tst_JobMeasure::vanishedJobClosesTheScreen()
{
    DataManager* data = DataManager::instance();
    const unsigned int index = data->createNewJob();
    QVERIFY(index != NO_INDEX);
    refresh();
    JobMeasureScreen* screen = openSummary(data->getAJobObject(index).getName());
    QVERIFY(screen);
    QPointer<JobMeasureScreen> gone(screen);
    data->setActiveJob(NO_INDEX);
    screen->onUpdateScreen();
    QTRY_VERIFY(gone.isNull());
    data->setActiveJob(index);
    data->deleteActiveJob();

    // Opened with no job at all, it leaves the stack again.
    data->setActiveJob(NO_INDEX);
    m_master->onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
    QTRY_COMPARE(m_master->screenCount(), 1);
}

QTEST_MAIN(tst_JobMeasure)
#include "tst_jobmeasure.moc"
