#ifndef WORKERTASK_H
#define WORKERTASK_H

// The background-worker pattern shared by AudioPlayerTask, DataManagerTask,
// SyncObjectTask and the inbound server tasks: a thread object whose
// constructor returns only once run() has built the worker, so that the
// worker's own instance() is valid as soon as the task exists.
//
//   class AudioPlayerTask : public WorkerTask<AudioPlayer> {
//   public:
//       static AudioPlayerTask* instance();     // lazy, no lock
//   private:
//       AudioPlayerTask() { startAndWait(); }
//       void workerCreated(AudioPlayer*) override { qDebug() << "..."; }
//   };
//   AudioPlayer* AudioPlayer::instance() { return AudioPlayerTask::worker(); }

#include <QThread>

#include <atomic>

class WorkerThreadBase : public QThread
{
public:
    // Set by run() once the worker exists, cleared when its loop ends.
    std::atomic<bool> isConnectInit{false};

    ~WorkerThreadBase() override
    {
        quit();
        wait();
    }

protected:
    // Called from the most derived constructor, so that run() sees a fully
    // built object.
    void startAndWait(Priority priority = InheritPriority)
    {
        isConnectInit = false;
        start(priority);
        while (!isConnectInit)
            msleep(50);
    }
};

template <class Worker>
class WorkerTask : public WorkerThreadBase
{
public:
    // The worker built on this thread; null before the task has started.
    static Worker* worker() { return s_worker.load(); }

protected:
    // Runs on the new thread right after the worker is built.
    virtual void workerCreated(Worker*) {}

    void run() override
    {
        Worker* w = new Worker();
        s_worker = w;
        workerCreated(w);
        isConnectInit = true;
        exec();
        isConnectInit = false;
    }

private:
    static inline std::atomic<Worker*> s_worker{nullptr};
};

#endif // WORKERTASK_H
