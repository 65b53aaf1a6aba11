#include "Screens/JobListScreen.h"

#include "ui_JobListScreen.h"

#include "Commands/SystemOutCommands.h"
#include "Communication/Commands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/SyncObject.h"
#include "Screens/DeletePopup.h"
#include "Screens/JobActionsPopup.h"
#include "Screens/NotificationPopup.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/JobListQuickSelectionItem.h"
#include "Widgets/JobListSelectionItem.h"
#include "Widgets/WebSyncButton.h"

#include <QCoreApplication>
#include <QDebug>
#include <QElapsedTimer>
#include <QEvent>
#include <QFontMetrics>
#include <QStyle>

namespace {

const uint kNoJob = 65535;
// From this many jobs the list is re-read behind a cover, on the data thread.
const int kManyJobs = 51;
// A rebuild that adds more rows than this hands control back to the event
// loop now and then, behind the cover.
const int kRowBurst = 50;
// Rows of the complete list above the first job.
const int kCompleteRowOffset = 2;
// The size of a row's form: the rows are laid out before they are made.
const QSize kRowSize(320, 85);
const int kReleaseMemoryDelayMs = 2000;
// The walk for the row to keep in view after a delete starts here.
const int kFirstWalkedRow = 5;
// The instrument needs this long at most to settle after a measurement or a
// calibration before targeting may start.
const qint64 kIdleWaitMs = 14999;
const int kIdlePollMs = 300;

} // namespace

JobListScreen::JobListScreen(QWidget* parent)
    : DaddyPanel(TRANSITION_EFFECT_FADE, parent)
    , ui(nullptr)
    , m_showCompleted(true)
    , m_showingDeleteAll(false)
    , m_ready(false)
    , m_startupPlayed(false)
    , m_numCompletedJobs(0)
    , m_numOpenJobs(0)
    , m_currentlyViewingJob(0)
    , m_jobQuickItem(nullptr)
    , m_pWebSyncButton(nullptr)
    , m_WebSyncButtonIndex(1)
    , m_rowsCreated(0)
    , m_calScreenShown(false)
{
    for (auto& pair : m_selectionItems)
        pair = {nullptr, nullptr};

    // The display controller is re-initialised once per process, before the
    // first frame of the home screen is drawn.
    Platform::runShellCommand(QStringLiteral("echo INIT > /dev/ili9486"));

    ui = new Ui::JobListScreen;
    ui->setupUi(this);
    setObjectName(QStringLiteral("JobListScreen"));
    ui->labelBackground->lower();

    DataManager* data = DataManager::instance();
    SyncObject* sync = SyncObject::instance();
    connect(this, &JobListScreen::updateJobInfos, data, &DataManager::onUpdateJobInfos);
    connect(this, &JobListScreen::CreateNewJob, data, &DataManager::onCreateNewJob);
    connect(this, &JobListScreen::syncJob, sync, &SyncObject::onSyncJob);
    connect(this, &JobListScreen::syncAllJobs, sync, &SyncObject::onSyncAllJobs);
    connect(data, &DataManager::DataBaseWiped, this, &JobListScreen::onUpdateScreen);
    connect(data, &DataManager::jobCreated, this, &JobListScreen::onJobCreated);
    connect(data, &DataManager::DataManagerInitComplete, this, &JobListScreen::onInit);
    connect(data, &DataManager::updateWifiState, this, &JobListScreen::onWifiStateChanged);
    connect(&m_initTimer, &QTimer::timeout, this, &JobListScreen::onInit);
    connect(ui->StatusBarBtn, &QPushButton::clicked, this, &DaddyPanel::onStatusBarBtn_clicked);
    ui->JobList->setRowFactory([this](int row) { return makeRow(row, false); });
    ui->JobListComplete->setRowFactory([this](int row) { return makeRow(row - kCompleteRowOffset, true); });

    onUpdateTitleBar();
    onUpdateTabTitles();

    m_jobQuickItem = new JobListQuickSelectionItem;
    connect(m_jobQuickItem, &QPushButton::clicked, this, &JobListScreen::onDeleteCompletedJobs);
    ui->JobListComplete->addWidget(m_jobQuickItem);
    ui->JobListComplete->setRowHidden(0, true);

    m_pWebSyncButton = new WebSyncButton;
    connect(m_pWebSyncButton, &QPushButton::clicked, this, &JobListScreen::onJobSyncAll);
    ui->JobListComplete->addWidget(m_pWebSyncButton);
    m_WebSyncButtonIndex = ui->JobListComplete->count() - 1;
    ui->JobListComplete->setRowHidden(m_WebSyncButtonIndex, true);

    onWifiStateChanged(data->getSystemStatus().getWifiState());

    m_initTimer.setSingleShot(true);
    m_initTimer.start(3000);
    m_releaseMemoryTimer.setSingleShot(true);
    m_releaseMemoryTimer.setInterval(kReleaseMemoryDelayMs);
    connect(&m_releaseMemoryTimer, &QTimer::timeout, this, [] { Platform::releaseFreedMemory(); });

    stateChanged(true);
    stateChanged(false);
}

JobListScreen::~JobListScreen()
{
    delete ui;
}

JobListSelectionItem* JobListScreen::rowOf(int jobIndex, bool complete) const
{
    if (jobIndex < 0 || jobIndex >= m_rowsCreated)
        return nullptr;
    if (complete)
        ui->JobListComplete->makeRow(jobIndex + kCompleteRowOffset);
    else
        ui->JobList->makeRow(jobIndex);
    return m_selectionItems[size_t(jobIndex)][complete ? 1 : 0];
}

void JobListScreen::onInit()
{
    m_ready = true;
    onUpdateScreen();
    DataManager* data = DataManager::instance();
    if (data->getDataInitialized() && !data->doesTagExist())
        onShowTagInvalidPopup();
    ui->BtnAddJob->setEnabled(true);
    onAllowSettingsBtn();
}

void JobListScreen::onAllowSettingsBtn()
{
    ui->BtnSettings->setEnabled(true);
}

void JobListScreen::showEvent(QShowEvent* event)
{
    DaddyPanel::showEvent(event);
    // The link comes up with the home screen.
    Commands::instance()->Init();
}

void JobListScreen::SetActiveStatus(bool active)
{
    DaddyPanel::SetActiveStatus(active);
    if (active)
        setEnabled(true);
    if (!m_ready)
        return;
    DataManager* data = DataManager::instance();
    data->setFullJobUpdateFlag(active);
    if (!active)
        return;
    if (int(data->getAllJobs().size()) >= kManyJobs) {
        onShowSyncScreen();
        emit updateJobInfos();
    } else {
        data->updateJobInfos();
    }
}

void JobListScreen::createRows(int jobIndex)
{
    // Only the places: a row's widget is made when it first comes near the
    // view, so that hundreds of jobs list at once.
    ui->JobList->addDeferredRow(kRowSize);
    ui->JobList->setRowHidden(ui->JobList->count() - 1, true);
    ui->JobListComplete->addDeferredRow(kRowSize);
    ui->JobListComplete->setRowHidden(ui->JobListComplete->count() - 1, true);
    m_rowsCreated = jobIndex + 1;
}

JobListSelectionItem* JobListScreen::makeRow(int jobIndex, bool complete)
{
    if (jobIndex < 0 || jobIndex >= m_rowsCreated)
        return nullptr;
    JobListSelectionItem* row = new JobListSelectionItem(jobIndex);
    connect(row, &JobListSelectionItem::deleteJob, this, &JobListScreen::onDeleteJob);
    connect(row, &JobListSelectionItem::jobClicked, this, &JobListScreen::onJobClicked);
    connect(row, &JobListSelectionItem::startJob, this, &JobListScreen::onStartJob);
    if (complete)
        connect(row, &QPushButton::clicked, this, &JobListScreen::onJobClicked);
    else
        connect(row, &QPushButton::clicked, this, &JobListScreen::onSelectedJob);
    m_selectionItems[size_t(jobIndex)][complete ? 1 : 0] = row;
    fillRow(row, jobIndex, DataManager::instance()->getSystemStatus().getWifiState());
    return row;
}

void JobListScreen::fillRow(JobListSelectionItem* row, int jobIndex, WIFI_STATUS_T wifi)
{
    if (!row || jobIndex >= m_rowJobs.size())
        return;
    row->setJob(m_rowJobs[jobIndex]);
    row->onUpdateFields();
    row->onWifiStateChanged(wifi);
}

void JobListScreen::onUpdateScreen()
{
    if (!isActive() || !m_ready)
        return;
    // Also the guard against re-entry from the event loop turns below.
    m_ready = false;

    DataManager* data = DataManager::instance();
    const QVector<Job> jobs = data->getAllJobs();
    int n = int(jobs.size());
    if (n > kMaxJobRows) {
        qDebug() << "JobListScreen: showing" << kMaxJobRows << "of" << n << "jobs";
        n = kMaxJobRows;
    }

    const bool many = ui->JobList->count() + kRowBurst < n;
    if (many)
        onShowSyncScreen();
    else
        onCloseSyncScreen();

    m_rowJobs = jobs;
    const int yieldEvery = qMax(1, n / 8);
    for (int i = 0; i < n; ++i) {
        if (i >= m_rowsCreated)
            createRows(i);
        if (many && i % yieldEvery == 0)
            QCoreApplication::processEvents();
    }

    // The sync marks follow Wi-Fi changes; a rebuild also catches a change
    // of the sync permission, which comes with no signal of its own.
    const WIFI_STATUS_T wifi = data->getSystemStatus().getWifiState();

    m_numCompletedJobs = 0;
    m_numOpenJobs = 0;
    for (int i = 0; i < kMaxJobRows; ++i) {
        const int completeRow = i + kCompleteRowOffset;
        if (i < n) {
            const Job& job = jobs[i];
            JobListSelectionItem* open = m_selectionItems[size_t(i)][0];
            JobListSelectionItem* complete = m_selectionItems[size_t(i)][1];
            if (job.isJobComplete()) {
                ++m_numCompletedJobs;
                ui->JobListComplete->setRowHidden(completeRow, false);
                ui->JobList->setRowHidden(i, true);
                fillRow(complete, i, wifi);
            } else {
                ++m_numOpenJobs;
                ui->JobListComplete->setRowHidden(completeRow, true);
                ui->JobList->setRowHidden(i, false);
                fillRow(open, i, wifi);
            }
        } else if (i < ui->JobList->count()) {
            ui->JobList->setRowHidden(i, true);
            ui->JobListComplete->setRowHidden(completeRow, true);
        }
    }

    // Deleting all completed jobs is offered from two on.
    ui->JobListComplete->setRowHidden(0, m_numCompletedJobs < 2);

    onWifiStateChanged(wifi);
    onUpdateTitleBar();
    onUpdateTabTitles();

    if (m_currentlyViewingJob < ui->JobListComplete->count())
        ui->JobListComplete->scrollToItem(ui->JobListComplete->item(m_currentlyViewingJob));
    m_currentlyViewingJob = 0;

    if (many)
        onCloseSyncScreen();

    // The previous table and its copies are gone now; handing their memory
    // back takes a while, so it waits until the list has been quiet a moment.
    if (n >= kManyJobs)
        m_releaseMemoryTimer.start();

    if (!m_startupPlayed) {
        playSoundDeviceReady();
        m_startupPlayed = true;
    }
    m_ready = true;
}

void JobListScreen::onWifiStateChanged(WIFI_STATUS_T state)
{
    const bool rowsBelow = ui->JobListComplete->count() > m_WebSyncButtonIndex + 1;
    const bool show = state == WIFI_STATUS_CONNECTED && UserParams::instance()->getAllowSync() == 1 && rowsBelow;
    ui->JobListComplete->setRowHidden(m_WebSyncButtonIndex, !show);
}

void JobListScreen::onUpdateTitleBar()
{
    const QFontMetrics metrics(ui->TxtTitle->font());
    const int textWidth = metrics.horizontalAdvance(ui->TxtTitle->text());
    const QRect icon = ui->IcnTitle->geometry();
    ui->IcnTitle->setGeometry(170 - textWidth / 2 - icon.width(), icon.y(), icon.width(), icon.height());
}

void JobListScreen::onUpdateTabTitles()
{
    ui->BtnLeftTab->setText(tr("Open (%1)").arg(m_numOpenJobs));
    ui->BtnRightTab->setText(tr("Complete (%1)").arg(m_numCompletedJobs));
}

void JobListScreen::setButtonState(QPushButton* button, bool selected)
{
    button->setProperty("selected", selected);
    button->style()->unpolish(button);
    button->style()->polish(button);
    button->update();
}

void JobListScreen::stateChanged(bool showCompleted)
{
    if (showCompleted == m_showCompleted)
        return;
    m_showCompleted = showCompleted;
    setButtonState(ui->BtnLeftTab, !showCompleted);
    setButtonState(ui->BtnRightTab, showCompleted);
    ui->JobList->setVisible(!showCompleted);
    ui->JobListComplete->setVisible(showCompleted);
}

void JobListScreen::on_BtnLeftTab_clicked()
{
    playSoundButtonClick();
    stateChanged(false);
}

void JobListScreen::on_BtnRightTab_clicked()
{
    playSoundButtonClick();
    stateChanged(true);
}

void JobListScreen::onSelectedJob()
{
    playSoundButtonClick();
    if (UserParams::instance()->getEnableViewMeasurements())
        onShowJobActionsPopup();
    else
        enterTargetingMode();
}

void JobListScreen::onJobClicked()
{
    playSoundButtonClick();
    if (UserParams::instance()->getEnableViewMeasurements())
        onShowJobActionsPopup();
    else
        onShowDeleteJobsPopup();
}

void JobListScreen::onStartJob()
{
    playSoundButtonClick();
    enterTargetingMode();
}

void JobListScreen::onDeleteJob()
{
    playSoundButtonClick();
    onShowDeleteJobsPopup();
}

void JobListScreen::onDeleteCompletedJobs()
{
    playSoundButtonClick();
    onShowDeleteCompletedJobsPopup();
}

void JobListScreen::onJobSyncAll()
{
    emit syncAllJobs();
}

void JobListScreen::enterTargetingMode()
{
    DataManager* data = DataManager::instance();
    if (!data->isThereEnoughRoomToMeasure(data->getActiveJob())) {
        onShowMeasuresFullPopup();
        return;
    }
    if (data->getCalState().nextExternalWhiteCal > 0) {
        data->turnOffLabMode(true);
        GotoScreen(TARGETING_SCREEN_ID);
    } else {
        // A job can't be measured once the white calibration has run out.
        DaddyPanel::GotoScreen(CAL_WIZARD_SCREEN_ID);
    }
}

void JobListScreen::GotoScreen(SCREEN_ID_T id)
{
    if (id != TARGETING_SCREEN_ID) {
        DaddyPanel::GotoScreen(id);
        return;
    }

    // Targeting needs an idle instrument: wait, behind the "Calibrating"
    // cover, for a measurement or calibration to finish.
    SystemStatus status;
    if (CmdOut_GetState(status) == STATUS_OK && status.getSystemState() == STATE_INIT) {
        DaddyPanel::GotoScreen(id);
        return;
    }
    onShowCalScreen();
    QElapsedTimer waited;
    waited.start();
    bool idle = false;
    for (;;) {
        Delay(kIdlePollMs);
        idle = CmdOut_GetState(status) == STATUS_OK && status.getSystemState() == STATE_INIT;
        if (idle || waited.elapsed() > kIdleWaitMs)
            break;
    }
    onCloseCalScreen();
    if (idle)
        DaddyPanel::GotoScreen(id);
    else
        qDebug() << "JobListScreen: instrument stayed busy, targeting not started";
}

void JobListScreen::on_BtnAddJob_clicked()
{
    playSoundButtonClick();
    DataManager* data = DataManager::instance();
    if (!data->getDataInitialized())
        return;
    if (UserParams::instance()->getLabModeEnabled())
        data->turnOffLabMode(true);
    if (!data->isThereEnoughRoomToAddJob()) {
        onShowJobsFullPopup();
        return;
    }
    if (data->getCalState().nextExternalWhiteCal <= 0) {
        GotoScreen(CAL_WIZARD_SCREEN_ID);
        return;
    }
    if (int(data->getAllJobs().size()) >= kManyJobs)
        onShowSyncScreen();
    setEnabled(false);
    emit CreateNewJob();
}

void JobListScreen::onJobCreated(uint index)
{
    DataManager* data = DataManager::instance();
    data->setActiveJob(index);
    if (data->getActiveJob() != kNoJob) {
        // The new job goes straight to targeting; the screen stays disabled
        // until it is active again.
        onCloseSyncScreen();
        DaddyPanel::GotoScreen(TARGETING_SCREEN_ID);
    } else {
        setEnabled(true);
    }
}

void JobListScreen::on_BtnSettings_clicked()
{
    playSoundButtonClick();
    setEnabled(false);
    GotoScreen(CONFIG_MAIN_SCREEN_ID);
}

void JobListScreen::onShowJobActionsPopup()
{
    JobActionsPopup* popup = new JobActionsPopup(parentWidget());
    // Each action runs before the popup closes.
    connect(popup, &JobActionsPopup::jobViewEditStart, this, &JobListScreen::onJobViewEditStart);
    connect(popup, &JobActionsPopup::jobViewEditStart, this, QOverload<>::of(&DaddyPanel::onClosePopup));
    connect(popup, &JobActionsPopup::deleteJob, this, &JobListScreen::onShowDeleteJobsPopup);
    connect(popup, &JobActionsPopup::deleteJob, this, QOverload<>::of(&DaddyPanel::onClosePopup));
    connect(popup, &JobActionsPopup::copyJob, this, &JobListScreen::onCopyJob);
    connect(popup, &JobActionsPopup::copyJob, this, QOverload<>::of(&DaddyPanel::onClosePopup));
    connect(popup, &JobActionsPopup::syncJob, this, &JobListScreen::onSyncJob);
    connect(popup, &JobActionsPopup::syncJob, this, QOverload<>::of(&DaddyPanel::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    onAddPopup(popup);
}

void JobListScreen::onJobViewEditStart()
{
    DataManager* data = DataManager::instance();
    data->turnOffLabMode(true);
    if (data->getActiveJobObject().isJobComplete())
        onGotoJobSummaryScreen();
    else
        enterTargetingMode();
}

void JobListScreen::onGotoJobSummaryScreen()
{
    GotoScreen(JOB_MEASURE_SCREEN_ID);
}

void JobListScreen::onCopyJob()
{
    DataManager* data = DataManager::instance();
    data->copyJob(data->getActiveJob());
}

void JobListScreen::onSyncJob()
{
    emit syncJob(DataManager::instance()->getActiveJobObject().getName());
}

void JobListScreen::onShowDeleteJobsPopup()
{
    DeletePopup* popup = new DeletePopup(parentWidget());
    popup->setHeaderText(tr("Delete Job?"));
    popup->setMessageText(tr("The entire job and all samples will be permanently deleted."));
    connect(popup, &DeletePopup::confirmClicked, this, &JobListScreen::onDeleteJobConfirmed);
    connect(popup, &DeletePopup::confirmClicked, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    connect(popup, &DeletePopup::cancelClicked, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    onAddPopup(popup);
}

void JobListScreen::onShowDeleteCompletedJobsPopup()
{
    m_showingDeleteAll = true;
    DeletePopup* popup = new DeletePopup(parentWidget());
    popup->setHeaderText(tr("Delete All Completed Jobs?"));
    popup->setMessageText(tr("All completed jobs will be permanently deleted."));
    connect(popup, &DeletePopup::confirmClicked, this, &JobListScreen::onDeleteJobsCompletedConfirmed);
    connect(popup, &DeletePopup::confirmClicked, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    connect(popup, &DeletePopup::cancelClicked, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    onAddPopup(popup);
}

void JobListScreen::onDeleteJobConfirmed()
{
    // Keep the row above the deleted job in view. The first rows are
    // deliberately not walked: a job near the top leaves the list at the top.
    m_currentlyViewingJob = 0;
    const int active = int(DataManager::instance()->getActiveJob());
    const int rows = ui->JobListComplete->count();
    for (int row = kFirstWalkedRow; row < rows; ++row) {
        // Complete rows stand in job order after the two fixed rows, made or not.
        if (row - kCompleteRowOffset == active) {
            m_currentlyViewingJob = row - 1;
            break;
        }
    }
    if (m_currentlyViewingJob > 0 && m_currentlyViewingJob == rows - 1)
        --m_currentlyViewingJob;
    API_SignalMaster::instance()->emitJobDeleteCurrent();
}

void JobListScreen::onDeleteJobsCompletedConfirmed()
{
    API_SignalMaster::instance()->emitJobDeleteAllCompleted();
}

void JobListScreen::onClosePopup(PopupPanel* popup)
{
    DaddyPanel::onClosePopup(popup);
    m_showingDeleteAll = false;
}

PopupPanel* JobListScreen::showFullPopup(const QString& text)
{
    NotificationPopup* popup = new NotificationPopup(parentWidget());
    popup->setButtonText(tr("OK"));
    popup->setHeaderText(tr("Instrument Is Full"));
    popup->setMessageText(text);
    connect(popup, &NotificationPopup::btnClicked, this, QOverload<>::of(&DaddyPanel::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&JobListScreen::onClosePopup));
    onAddPopup(popup);
    return popup;
}

void JobListScreen::onShowJobsFullPopup()
{
    showFullPopup(tr("A new job cannot be created until one or more existing jobs are removed from the instrument."));
}

void JobListScreen::onShowMeasuresFullPopup()
{
    showFullPopup(tr("There is not enough memory to complete the requested Job. Please remove existing jobs to free up memory."));
}

void JobListScreen::onUpdateSystemState(SYSTEM_STATE_T state)
{
    DaddyPanel::onUpdateSystemState(state);
    // The start-up calibration is shown once per process life; the base
    // takes the cover away at the next state change.
    if (isActive() && (state == STATE_POWER_UP || state == STATE_CALIBRATING) && !m_calScreenShown) {
        onShowCalScreen();
        m_calScreenShown = true;
    }
}

void JobListScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && ui) {
        ui->retranslateUi(this);
        onUpdateTitleBar();
        onUpdateTabTitles();
    }
    DaddyPanel::changeEvent(event);
}
