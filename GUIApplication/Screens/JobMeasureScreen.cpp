#include "Screens/JobMeasureScreen.h"

#include "ui_JobMeasureScreen.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/SyncObject.h"
#include "GUIAPI/SystemAPI.h"
#include "Screens/DeletePopup.h"
#include "Screens/OverridePopup.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/JobMeasureListingHeader.h"
#include "Widgets/JobSummaryEditSelectionItem.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/SampleListSelectionItem.h"
#include "Widgets/SampleListSelectionItemComplete.h"
#include "Widgets/SpinnyCircle.h"
#include "Widgets/WebSyncButton.h"

#include "Widgets/Theme.h"

#include <QDebug>
#include <QEvent>
#include <QKeyEvent>
#include <QTimer>

namespace {

// The tag screens by tag state, with the filter file and without.
const SCREEN_ID_T kTagScreens[NUM_TAG_STATES] = {JOB_TAGS_1_SCREEN_ID, JOB_TAGS_2_SCREEN_ID,
                                                 JOB_TAGS_3_SCREEN_ID};
const SCREEN_ID_T kTagFreeEditScreens[NUM_TAG_STATES] = {
    JOB_TAGS_1_FREE_EDIT_SCREEN_ID, JOB_TAGS_2_FREE_EDIT_SCREEN_ID, JOB_TAGS_3_FREE_EDIT_SCREEN_ID};

const int kSpinnerCentreY = 240;

} // namespace

JobMeasureScreen::JobMeasureScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::JobMeasureScreen)
    , m_spinnyCircle(nullptr)
    , m_screenToOpen(JOB_NAME_SCREEN_ID)
    , m_jobEditable(false)
    , m_WebSyncButtonIndex(-1)
{
    ui->setupUi(this);
    ui->labelHeader->setFont(Theme::pixelFont(22, true));
    ui->labelDeleteText->setFont(Theme::pixelFont(11));
    ui->labelSaveText->setFont(Theme::pixelFont(11));
    setObjectName(QStringLiteral("JobMeasureScreen"));
    // The captions sit on the title buttons; a tap on them is a tap on the button.
    ui->labelDeleteText->setAttribute(Qt::WA_TransparentForMouseEvents);
    ui->labelSaveText->setAttribute(Qt::WA_TransparentForMouseEvents);
    ui->labelHeader->setAutoSize(true);
    ui->labelDeleteText->setAutoSize(true);
    ui->labelSaveText->setAutoSize(true);

    m_spinnyCircle = new SpinnyCircle(this);
    m_spinnyCircle->move((width() - m_spinnyCircle->width()) / 2, kSpinnerCentreY - m_spinnyCircle->height() / 2);
    m_spinnyCircle->hide();

    DataManager* data = DataManager::instance();
    connect(this, &DaddyPanel::ReadSwitchPressedSignal, this, &JobMeasureScreen::onReadSwitchPressed);
    connect(this, &JobMeasureScreen::quickLoadCurrentJobSamples, data, &DataManager::onQuickLoadCurrentJobSamples);
    connect(data, &DataManager::loadQuickCurrentJobSamplesComplete, this,
            &JobMeasureScreen::onQuickLoadCurrentJobSamplesComplete);
    connect(this, &JobMeasureScreen::syncJob, SyncObject::instance(), &SyncObject::onSyncJob);
    connect(data, &DataManager::updateWifiState, this, &JobMeasureScreen::onWifiStateChanged);

    // Without a job the screen closes again, but only once it is on the
    // stack: a close from inside the constructor would leave it there.
    if (data->getActiveJobObject().isJobValid())
        onUpdateScreen();
    else
        QTimer::singleShot(0, this, &JobMeasureScreen::onUpdateScreen);
}

JobMeasureScreen::~JobMeasureScreen()
{
    delete ui;
}

FlickList* JobMeasureScreen::sampleList() const
{
    return ui->SampleList;
}

bool JobMeasureScreen::isLoading() const
{
    return !m_spinnyCircle->isHidden();
}

void JobMeasureScreen::SetActiveStatus(bool active)
{
    DaddyPanel::SetActiveStatus(active);
    if (active)
        setEnabled(true);
}

void JobMeasureScreen::updateTitleButtons()
{
    const bool complete = DataManager::instance()->getActiveJobObject().isJobComplete();
    ui->BtnNext->setIcon(QIcon(complete ? QStringLiteral(":/Assets/check_button.png")
                                        : QStringLiteral(":/Assets/next_button.png")));
    ui->labelSaveText->setText(complete ? tr("Save") : tr("Measure"));
}

void JobMeasureScreen::onUpdateScreen()
{
    // On its way out (to targeting, or deleted) the screen shows no more news.
    if (isClosing())
        return;
    const Job job = DataManager::instance()->getActiveJobObject();
    if (!job.isJobValid()) {
        qDebug() << "JobMeasureScreen: the active job is gone, closing";
        CloseScreen();
        return;
    }
    m_spinnyCircle->show();
    m_spinnyCircle->raise();
    ui->SampleList->clear();
    m_pWebSyncButton = nullptr;
    m_WebSyncButtonIndex = -1;
    updateTitleButtons();
    emit quickLoadCurrentJobSamples();
}

void JobMeasureScreen::onQuickLoadCurrentJobSamplesComplete()
{
    onRefreshSampleList();
}

void JobMeasureScreen::onRefreshSampleList()
{
    if (isClosing())
        return;
    m_spinnyCircle->hide();
    ui->SampleList->clear();
    m_pWebSyncButton = nullptr;
    m_WebSyncButtonIndex = -1;

    DataManager* data = DataManager::instance();
    const Job job = data->getActiveJobObject();
    // The job went away while its samples were loading.
    if (!job.isJobValid()) {
        qDebug() << "JobMeasureScreen: the active job went away while loading, closing";
        CloseScreen();
        return;
    }
    updateTitleButtons();

    auto* header = new JobMeasureListingHeader(tr("Job Details"));
    header->setJob(job.getName(), job.getJobState() == JOB_STATE_SYNCHRONISED);
    ui->SampleList->addWidget(header);

    auto* name = new JobSummaryEditSelectionItem(tr("Name:"), job.getDisplayName(), nullptr,
                                                 job.isTagEditable() || UserParams::getDownloadedJobNameEditable());
    name->setObjectName(QStringLiteral("rowName"));
    connect(name, &QPushButton::clicked, this, &JobMeasureScreen::onEditJobName);
    ui->SampleList->addWidget(name);

    const bool notes = UserParams::getDisplayEditFreeText();
    const bool tagsEditable = (job.isTagEditable() || UserParams::getDownloadedJobAttributesEditable())
        && data->doesTagExist();
    void (JobMeasureScreen::*tagSlots[NUM_TAG_STATES])() = {&JobMeasureScreen::onEditTag1,
                                                            &JobMeasureScreen::onEditTag2,
                                                            &JobMeasureScreen::onEditTag3};
    for (int tag = TAG_STATE_1; tag < NUM_TAG_STATES; ++tag) {
        auto* row = new JobSummaryEditSelectionItem(
            tr("%1:").arg(data->getTagStateName(TAG_STATES_T(tag))), job.getTagData(tag).displayName, nullptr,
            tagsEditable);
        row->setObjectName(QStringLiteral("rowTag%1").arg(tag + 1));
        if (tag == TAG_STATE_1) {
            row->setAutoSize(true);
            row->setMaxTextLength(20);
        }
        if (tag == NUM_TAG_STATES - 1 && !notes)
            row->setLastInList(true);
        connect(row, &QPushButton::clicked, this, tagSlots[tag]);
        ui->SampleList->addWidget(row);
    }

    if (notes) {
        auto* row = new JobSummaryEditSelectionItem(
            tr("Notes:"), job.getNotes(), nullptr,
            job.isTagEditable() || UserParams::getDownloadedJobAttributesEditable());
        row->setObjectName(QStringLiteral("rowNotes"));
        row->setLastInList(true);
        connect(row, &QPushButton::clicked, this, &JobMeasureScreen::onEditFreeText);
        ui->SampleList->addWidget(row);
    }

    m_pWebSyncButton = new WebSyncButton;
    m_pWebSyncButton->SetText([] { return tr("Send Job To Server"); });
    connect(m_pWebSyncButton, &QPushButton::clicked, this, &JobMeasureScreen::onWebSync);
    ui->SampleList->addWidget(m_pWebSyncButton);
    m_WebSyncButtonIndex = ui->SampleList->count() - 1;
    onWifiStateChanged(data->getSystemStatus().getWifiState());

    const bool complete = job.isJobComplete();
    switch (job.getJobAveragingMode()) {
    case JOB_AVG_MODE_SIMPLE_3:
    case JOB_AVG_MODE_SIMPLE_5:
    case JOB_AVG_MODE_SMC:
        ui->SampleList->addWidget(new ListingHeader(job.getJobAveragingMode() == JOB_AVG_MODE_SMC
                                                        ? tr("SMC Results")
                                                        : tr("Average Results")));
        if (!complete)
            ui->SampleList->addWidget(new SampleListSelectionItemComplete);
        if (job.getAveragedSampleComplete())
            onAddSampleToList(int(AVERAGED_SAMPLE_INDEX));
        break;
    default: {
        const int samples = job.getNumSamples();
        ui->SampleList->addWidget(new ListingHeader(
            tr("Measurements"), tr("%1 of %2 completed").arg(samples).arg(job.getJobSize())));
        if (!complete)
            ui->SampleList->addWidget(new SampleListSelectionItemComplete);
        // The newest reading stands on top.
        for (int i = samples - 1; i >= 0; --i)
            onAddSampleToList(i);
        break;
    }
    }

    ui->SampleList->scrollToTop();
}

void JobMeasureScreen::onAddSampleToList(int index)
{
    // With nothing set to be displayed the sample screen would be empty.
    const bool clickable =
        UserParams::getDisplayLABCH() || UserParams::getDisplayRainbow() || UserParams::getDisplayTexture();
    auto* row = new SampleListSelectionItem(index, nullptr, clickable);
    ui->SampleList->addWidget(row);
    connect(row, &QPushButton::clicked, this, &JobMeasureScreen::onSelectedSample);
}

void JobMeasureScreen::onSelectedSample()
{
    playSoundButtonClick();
    setEnabled(false);
    GotoScreen(SAMPLE_VIEW_SCREEN_ID);
}

void JobMeasureScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    createPopup();
}

void JobMeasureScreen::createPopup()
{
    DeletePopup* popup = new DeletePopup(parentWidget());
    popup->setHeaderText(tr("Delete Job?"));
    popup->setMessageText(tr("The entire job and all samples will be permanently deleted."));
    connect(popup, &DeletePopup::confirmClicked, this, &JobMeasureScreen::onDelete);
    connect(popup, &DeletePopup::confirmClicked, this, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    connect(popup, &DeletePopup::cancelClicked, this, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    onAddPopup(popup);
}

void JobMeasureScreen::onDelete()
{
    API_SignalMaster::instance()->emitJobDeleteCurrent();
    CloseScreen();
}

void JobMeasureScreen::on_BtnNext_clicked()
{
    playSoundButtonClick();
    const Job job = DataManager::instance()->getActiveJobObject();
    // One tap leaves: a second one before the stack has moved does nothing.
    setEnabled(false);
    if (!job.isJobComplete()) {
        CloseAndGotoScreen(TARGETING_SCREEN_ID);
        return;
    }
    SysAPI_SetJobSaved(job.getName());
    CloseScreen();
}

void JobMeasureScreen::keyPressEvent(QKeyEvent* event)
{
    // On an open job the read switch measures on; on a complete one the key
    // is the power key as everywhere else.
    if (isActive() && event->key() == Qt::Key_Return
        && !DataManager::instance()->getActiveJobObject().isJobComplete()) {
        onReadSwitchPressed();
        return;
    }
    DaddyPanel::keyPressEvent(event);
}

void JobMeasureScreen::onReadSwitchPressed()
{
    // A question on screen (delete, edit) is answered first.
    if (!popups().empty())
        return;
    DataManager* data = DataManager::instance();
    const Job job = data->getActiveJobObject();
    if (job.isJobValid() && data->getSystemStatus().getSystemState() == STATE_INIT && !job.isJobComplete())
        CloseAndGotoScreen(TARGETING_SCREEN_ID);
}

void JobMeasureScreen::onEditJobName()
{
    playSoundButtonClick();
    openEditScreen(JOB_NAME_SCREEN_ID);
}

void JobMeasureScreen::editTag(int tag)
{
    playSoundButtonClick();
    openEditScreen(UserParams::getUseFilterFile() ? kTagScreens[tag] : kTagFreeEditScreens[tag]);
}

void JobMeasureScreen::onEditTag1()
{
    editTag(TAG_STATE_1);
}

void JobMeasureScreen::onEditTag2()
{
    editTag(TAG_STATE_2);
}

void JobMeasureScreen::onEditTag3()
{
    editTag(TAG_STATE_3);
}

void JobMeasureScreen::onEditFreeText()
{
    playSoundButtonClick();
    openEditScreen(JOB_FREE_TEXT_SCREEN_ID);
}

void JobMeasureScreen::openEditScreen(SCREEN_ID_T id)
{
    m_screenToOpen = id;
    const bool permitted = id == JOB_NAME_SCREEN_ID ? UserParams::getDownloadedJobNameEditable()
                                                    : UserParams::getDownloadedJobAttributesEditable();
    if (DataManager::instance()->getActiveJobObject().isTagEditable() || (permitted && m_jobEditable))
        onGotoEditScreen();
    else if (permitted)
        onShowEditablePopup();
}

void JobMeasureScreen::onShowEditablePopup()
{
    OverridePopup* popup = new OverridePopup(parentWidget());
    popup->setTitleText(tr("Warning"));
    popup->setBodyText(tr("This job was not created on the instrument. Are you sure you want to edit the job?"));
    popup->setConfirmButtonText(tr("Edit"));
    popup->setCancelButtonText(tr("Cancel"));
    connect(popup, &PopupPanel::closePopup, this, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    connect(popup, &OverridePopup::confirmClicked, this, &JobMeasureScreen::onGotoEditScreen);
    connect(popup, &OverridePopup::confirmClicked, this, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    onAddPopup(popup);
}

void JobMeasureScreen::onGotoEditScreen()
{
    setEnabled(false);
    GotoScreen(m_screenToOpen);
    // One yes holds for the life of this screen.
    m_jobEditable = true;
}

void JobMeasureScreen::onWebSync()
{
    emit syncJob(DataManager::instance()->getActiveJobObject().getName());
}

void JobMeasureScreen::onWifiStateChanged(WIFI_STATUS_T state)
{
    if (!m_pWebSyncButton || m_WebSyncButtonIndex < 0 || m_WebSyncButtonIndex >= ui->SampleList->count())
        return;
    const bool show = state == WIFI_STATUS_CONNECTED && UserParams::getAllowSync() == 1;
    ui->SampleList->setRowHidden(m_WebSyncButtonIndex, !show);
}

void JobMeasureScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && ui) {
        ui->retranslateUi(this);
        updateTitleButtons();
        // The rows carry translated captions: build them again.
        if (!isLoading())
            onRefreshSampleList();
    }
    DaddyPanel::changeEvent(event);
}
