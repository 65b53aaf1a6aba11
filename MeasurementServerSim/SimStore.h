#ifndef SIMSTORE_H
#define SIMSTORE_H

// Persistence of the simulated server: one SQLite file ("server.db") in the
// data folder, through Qt's QSQLITE driver. The instrument keeps its data in
// memory and writes every change through, so the store is read only at
// start. A store belongs to the thread that opened it.

#include "SimModel.h"

#include <QHash>
#include <QMap>
#include <QSqlDatabase>
#include <QString>
#include <QVector>

namespace Sim {

class Store
{
public:
    Store();
    ~Store();
    Store(const Store&) = delete;
    Store& operator=(const Store&) = delete;

    // Opens (and creates) dir/server.db. With reset, all content is removed.
    bool open(const QString& dir, bool reset, QString* error = nullptr);
    bool isOpen() const;
    QString filePath() const { return m_path; }
    // True when the database holds no jobs and no parameters: a fresh store.
    bool isEmpty();
    qint64 fileSize() const;

    // ---- reading (at start) ----
    QVector<Job> loadJobs();
    QMap<int, ParamValue> loadParameters();
    QVector<WifiNetwork> loadWifi();
    QString meta(const QString& key, const QString& fallback = QString());

    // ---- writing ----
    void setMeta(const QString& key, const QString& value);
    // Inserts when job.dbIndex is 0 and assigns it; otherwise updates the job's
    // own row (not its samples).
    bool saveJob(Job& job);
    // Inserts a new sample of the job and assigns its dbIndex.
    bool insertSample(int jobId, Sample& sample);
    bool updateSampleFlags(const Sample& sample);
    // Stores the averaged sample of a job (assigning its dbIndex), or removes it.
    bool saveAverage(Job& job);
    bool deleteSample(int sampleDbIndex);
    bool deleteJob(int jobId);
    bool deleteAllJobs();
    bool saveParameter(int key, const ParamValue& value);
    bool saveWifi(const QVector<WifiNetwork>& networks);

    // Groups the writes of one change; nested calls join the outer one.
    void begin();
    void commit();

private:
    bool exec(const QString& sql);
    bool createSchema();
    bool writeSample(int jobId, Sample& sample, bool isAverage);
    void logError(const char* what, const QString& detail) const;

    QString m_connection;
    QString m_path;
    int m_depth = 0;
};

} // namespace Sim

#endif // SIMSTORE_H
