#include "Widgets/JobListSelectionItem.h"

#include "ui_JobListSelectionItem.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/UserParams.h"

#include "Widgets/KLabel.h"

#include <QEvent>
#include <QStringList>

namespace {

const int kJobStateSynchronised = 2008;

// The arrow is drawn for a title bar button and sits in the middle of its
// picture; the bin is a round badge, shown at icon size in the same 44 pixel
// touch box.
QString arrowStyle()
{
    return QStringLiteral("border: none; background-color: transparent; background-repeat: no-repeat;"
                          " background-position: center; background-image: url(:/Assets/next_button.png);");
}

QString binStyle()
{
    return QStringLiteral("border: none; background-color: transparent; margin: 15px 14px 15px 14px;"
                          " border-image: url(:/Assets/delete_icon.png) 0 0 0 0 stretch stretch;");
}

// A rebuild of the home screen touches every row: fitting text and parsing
// style sheets are what cost, so only what changed is set again.
void setTextIfChanged(KLabel* label, const QString& text)
{
    if (label->defaultText() != text)
        label->setText(text);
}

void setStyleIfChanged(QWidget* widget, const QString& style)
{
    if (widget->styleSheet() != style)
        widget->setStyleSheet(style);
}

} // namespace

JobListSelectionItem::JobListSelectionItem(int jobIndex, QWidget* parent)
    : FlickButton(parent)
    , ui(new Ui::JobListSelectionItem)
    , m_jobIndex(jobIndex)
    , m_actionClicked(false)
{
    ui->setupUi(this);
    setBackground(QStringLiteral(":/Assets/cell_85px.png"));
    setPressedBackground(QStringLiteral(":/Assets/cell_85px_hit.png"));
    ui->labelName->setMaxTextLength(20);
    ui->labelName->setAutoSize(true);
    ui->labelCompleted->setAutoSize(true);
    ui->webSyncWidget->hide();
    connect(ui->BtnAction, &QPushButton::clicked, this, &JobListSelectionItem::sendAction);
    connect(DataManager::instance(), &DataManager::updateWifiState,
            this, &JobListSelectionItem::onWifiStateChanged);
    onWifiStateChanged(DataManager::instance()->getSystemStatus().getWifiState());
}

JobListSelectionItem::~JobListSelectionItem()
{
    delete ui;
}

WebSyncWidget* JobListSelectionItem::webSyncWidget() const
{
    return ui->webSyncWidget;
}

void JobListSelectionItem::setJob(const Job& job)
{
    m_job = job;
    ui->webSyncWidget->setJobName(job.getName());
}

void JobListSelectionItem::onUpdateFields()
{
    onTranslate();
    const bool complete = m_job.isJobComplete();
    ui->labelCompleted->setVisible(complete);
    if (complete) {
        ui->labelName->setGeometry(18, -11, 245, 41);
        ui->labelTags->setGeometry(18, 30, 245, 41);
        setStyleIfChanged(ui->BtnAction, binStyle());
        if (UserParams::instance()->getAllowSync())
            ui->webSyncWidget->setCompleted(m_job.getJobState() == kJobStateSynchronised);
    } else {
        ui->labelName->setGeometry(20, -1, 245, 41);
        ui->labelTags->setGeometry(20, 40, 245, 41);
        setStyleIfChanged(ui->BtnAction, arrowStyle());
    }
}

void JobListSelectionItem::onTranslate()
{
    if (!m_job.isJobValid())
        return;
    setTextIfChanged(ui->labelName, m_job.getDisplayName());
    QStringList tags;
    for (int state = TAG_STATE_1; state < NUM_TAG_STATES; ++state)
        tags << m_job.getTagData(TAG_STATES_T(state)).displayName;
    setTextIfChanged(ui->labelTags, tags.join(QLatin1Char(' ')));
    setTextIfChanged(ui->labelCompleted, m_job.getDateCompletedString());
}

void JobListSelectionItem::onWifiStateChanged(WIFI_STATUS_T state)
{
    ui->webSyncWidget->setVisible(state == WIFI_STATUS_CONNECTED && UserParams::instance()->getAllowSync());
}

void JobListSelectionItem::sendClick()
{
    // The touch that pressed the action button is not also a touch on the row.
    if (m_actionClicked) {
        m_actionClicked = false;
        return;
    }
    DataManager::instance()->setActiveJob(m_jobIndex);
    if (m_job.isJobComplete())
        emit jobClicked();
    else
        FlickButton::sendClick();
}

void JobListSelectionItem::sendAction()
{
    DataManager::instance()->setActiveJob(m_jobIndex);
    if (m_job.isJobComplete())
        emit deleteJob();
    else
        emit startJob();
    m_actionClicked = true;
}

void JobListSelectionItem::mousePressEvent(QMouseEvent* event)
{
    // A new touch on the row itself: whatever the action button swallowed
    // belonged to the last gesture.
    m_actionClicked = false;
    FlickButton::mousePressEvent(event);
}

void JobListSelectionItem::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        onTranslate();
    FlickButton::changeEvent(event);
}
