#ifndef SIMJOBS_H
#define SIMJOBS_H

// The server's job table: jobs with their measurements, the averaging rules,
// and the job states that follow from them.
//
// Averaging, by the job's mode:
// - NONE: every reading stands alone; with a size above 0 the job is complete
//   (2004) when it holds that many readings.
// - AVERAGE (3, 5 or any size): complete (2004) with size readings, and the
//   averaged sample (255) is their mean.
// - SMC m:n: a reading is good when its largest CIE76 difference over all
//   geometries to the job's most central reading (the one with the smallest
//   summed difference to all others, the earliest on a tie) is within the
//   SMC tolerance (1.0 by default). m good readings complete the job (2004), averaging the good
//   ones. When n readings are used up first the job ends in 2002 (2005 for an
//   online job), and a force-finish ends it in 2003 (2006 online); both
//   average all readings. Until then the running mean of the good readings
//   is served as sample 255 with status 2001.
// A job in a final state that loses a reading is evaluated afresh, which
// reopens it.

#include "SimChanges.h"
#include "SimModel.h"

#include <functional>

namespace Sim {

class Store;

class JobBook
{
public:
    // A job as the client describes it (add and edit).
    struct Description {
        int dbIndex = 0;
        QString name;
        QVector<Tag> tags;
        int size = 0;
        QString fileId;
        QString modeText;
        int spare = 0;
    };
    // The server's defaults a job made in the client's open mode ("DEV_MODE") takes.
    struct Defaults {
        QString measurementMode = QStringLiteral("NONE");
        int smcGood = 3;
        int smcMax = 5;
        int averagingNumber = 3;
        int minSamples = 5;
    };

    JobBook(Store& store, Changes& changes);

    void load();
    const QVector<Job>& jobs() const { return m_jobs; }
    // By name first, then by file id; -1 if neither.
    int indexOf(const QString& nameOrFileId) const;
    const Job* find(const QString& nameOrFileId) const;
    int totalSamples() const;

    void setSmcTolerance(double deltaE) { m_smcTolerance = deltaE; }
    double smcTolerance() const { return m_smcTolerance; }

    STATUS_T add(const Description& d, const Defaults& defaults, int* dbIndex, bool online = false);
    STATUS_T edit(const QString& name, const Description& d, const Defaults& defaults);
    // An empty name removes every job.
    STATUS_T remove(const QString& name);
    STATUS_T setSaved(const QString& name);
    // number counts from 1; 255 removes the averaged result and with it the readings.
    STATUS_T deleteSample(const QString& name, int number);
    STATUS_T forceFinish(const QString& name);

    // Whether a reading may go into the job now (limitSeconds 0: no time limit).
    STATUS_T canMeasure(const QString& name, int limitSeconds, const QDateTime& now) const;
    // Stores a reading and applies the averaging rules.
    void commitMeasurement(const QString& name, const Sample& reading);

    // The sample as the server serves it; dataStatus is 0, or 2001 for the
    // running mean of an open SMC job. False if there is no such sample.
    bool sample(const QString& name, int number, Sample* out, STATUS_T* dataStatus) const;

    // Web sync: start, then advance by ticks while the link is up.
    STATUS_T startSync(const QString& name);
    bool syncInProgress() const;
    void advanceSync(int percentStep);

    // For seeding and the control interface.
    void setState(const QString& name, int state);
    void setFinish(const QString& name, const QString& panelSpec);

    // Mode text of the resolved mode, as the job information's second text.
    static QString modeString(const Job& job);

private:
    Job* findMutable(const QString& nameOrFileId);
    void resolveMode(Job& job, const Description& d, const Defaults& defaults) const;
    void evaluate(Job& job, bool forced = false);
    // After readings were added or removed inside a store transaction:
    // evaluates the job, ends the transaction and reports the change.
    void readingsChanged(Job& job);
    void persistJob(Job& job);

    Store& m_store;
    Changes& m_changes;
    QVector<Job> m_jobs;
    double m_smcTolerance = 1.0;
};

} // namespace Sim

#endif // SIMJOBS_H
