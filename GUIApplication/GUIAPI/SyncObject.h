#ifndef SYNCOBJECT_H
#define SYNCOBJECT_H

// Sends finished jobs to the web service. The server does the sending; this
// asks for it and follows the progress on a thread of its own, so that the
// wait never blocks the screens or DataManager.

#include "SharedSystem/WorkerTask.h"

#include <QObject>
#include <QString>

class SyncObject : public QObject
{
    Q_OBJECT

public:
    // The worker of SyncObjectTask; the thread starts on first use.
    static SyncObject* instance();

    SyncObject();

    // How long one job may take before it counts as failed.
    static const int SYNC_LIMIT_MS = 120000;

public slots:
    // Every complete job not yet synchronised, one after the other.
    void onSyncAllJobs();
    void onSyncJob(const QString& name);

signals:
    void syncJobPercent(QString name, bool done, int percent);
};

class SyncObjectTask : public WorkerTask<SyncObject>
{
public:
    static SyncObjectTask* instance();

private:
    SyncObjectTask();
    void workerCreated(SyncObject* worker) override;
};

#endif // SYNCOBJECT_H
