#include "GUIAPI/SyncObject.h"

#include "GUIAPI/DataManager.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/UserParams.h"

#include <QDebug>
#include <QElapsedTimer>
#include <QMutexLocker>
#include <QRecursiveMutex>
#include <QThread>

namespace {

// Both slots: a second request waits for the first. Recursive because the
// waits run events, and onSyncAllJobs calls onSyncJob.
QRecursiveMutex s_syncMutex;

const int kJobSynchronised = 2008;
const int kPollInterval = 500;

} // namespace

SyncObjectTask* SyncObjectTask::instance()
{
    static SyncObjectTask* task = nullptr;
    if (!task)
        task = new SyncObjectTask();
    return task;
}

SyncObjectTask::SyncObjectTask()
{
    startAndWait();
}

void SyncObjectTask::workerCreated(SyncObject*)
{
    // Same text as the DataManager thread's, as the instrument always logged.
    qDebug().noquote() << QString("DataManager Thread is Running: %1")
                              .arg(reinterpret_cast<quintptr>(QThread::currentThreadId()));
}

SyncObject* SyncObject::instance()
{
    return SyncObjectTask::instance()->worker();
}

SyncObject::SyncObject()
{
    qDebug() << "SyncObject Object Created";
}

void SyncObject::onSyncAllJobs()
{
    QMutexLocker locker(&s_syncMutex);
    const QVector<Job> jobs = DataManager::instance()->getAllJobs();
    if (!UserParams::instance()->getAllowSync())
        return;
    for (const Job& job : jobs) {
        if (job.isJobComplete() && job.getJobState() != kJobSynchronised)
            onSyncJob(job.getName());
    }
}

void SyncObject::onSyncJob(const QString& name)
{
    QMutexLocker locker(&s_syncMutex);
    if (!UserParams::instance()->getAllowSync())
        return;
    try {
        SysAPI_SyncJobToWebServer(name);
        QElapsedTimer elapsed;
        elapsed.start();
        for (;;) {
            Delay(kPollInterval);
            unsigned long state = 0;
            unsigned long percent = 0;
            SysAPI_GetJobStateWeb(name, state, percent);
            const bool timeUp = elapsed.elapsed() > SYNC_LIMIT_MS;
            if (state == kJobSynchronised) {
                emit syncJobPercent(name, true, 100);
                return;
            }
            emit syncJobPercent(name, false, static_cast<int>(percent));
            if (timeUp) {
                // No retry and no message: the job stays complete and
                // unsynchronised, so the next round tries it again.
                emit syncJobPercent(name, false, 0);
                return;
            }
        }
    } catch (unsigned int) {
        emit syncJobPercent(name, false, 0);
    }
}
