#include "Widgets/WebSyncWidget.h"

#include "GUIAPI/DataManager.h"
#include "GUIAPI/SyncObject.h"
#include "Widgets/KLabel.h"

#include <QPixmap>

namespace {
const char* const kPending = ":/Assets/sync_job_pending.png";
const char* const kCompleted = ":/Assets/sync_job_completed.png";
}

WebSyncWidget::WebSyncWidget(QWidget* parent)
    : QWidget(parent)
    , m_pScreenStack(new QStackedLayout(this))
    , m_pCompletedLabel(new KLabel(this))
{
    m_pScreenStack->setObjectName(QStringLiteral("StackAll"));
    m_pScreenStack->setStackingMode(QStackedLayout::StackAll);
    m_pScreenStack->setContentsMargins(0, 0, 0, 0);

    m_pCompletedLabel->setScaledContents(true);
    m_pCompletedLabel->setAutoSize(true);
    QFont font = m_pCompletedLabel->font();
    font.setPointSize(24);
    m_pCompletedLabel->setFont(font);
    m_pCompletedLabel->setAlignment(Qt::Alignment(132));
    m_pCompletedLabel->setStyleSheet(QStringLiteral("color: rgb(39, 170, 225);"));
    m_pCompletedLabel->setPixmap(QPixmap(QLatin1String(kPending)));
    m_pScreenStack->addWidget(m_pCompletedLabel);

    connect(SyncObject::instance(), &SyncObject::syncJobPercent, this, &WebSyncWidget::onWebSync);
    connect(DataManager::instance(), &DataManager::syncJobPercent, this, &WebSyncWidget::onWebSync);
}

void WebSyncWidget::setJobName(const QString& name)
{
    m_JobName = name;
}

void WebSyncWidget::setCompleted(bool completed)
{
    m_pCompletedLabel->setText(QString());
    m_pCompletedLabel->setPixmap(QPixmap(QLatin1String(completed ? kCompleted : kPending)));
}

QString WebSyncWidget::text() const
{
    return m_pCompletedLabel->text();
}

bool WebSyncWidget::showsPicture() const
{
    return !m_pCompletedLabel->pixmap(Qt::ReturnByValue).isNull();
}

QPixmap WebSyncWidget::picture() const
{
    return m_pCompletedLabel->pixmap(Qt::ReturnByValue);
}

void WebSyncWidget::onWebSync(QString jobName, bool completed, int percentComplete)
{
    if (jobName != m_JobName)
        return;
    // A finished transfer shows its final mark with the next row update,
    // when the job's state says it is on the server.
    if (!completed) {
        if (percentComplete >= 100) {
            setCompleted(true);
        } else if (percentComplete < 1) {
            m_pCompletedLabel->setText(QString());
            m_pCompletedLabel->setPixmap(QPixmap(QLatin1String(kPending)));
        } else {
            m_pCompletedLabel->setPixmap(QPixmap());
            m_pCompletedLabel->setText(QStringLiteral("%1%").arg(percentComplete));
        }
    }
    update();
}
