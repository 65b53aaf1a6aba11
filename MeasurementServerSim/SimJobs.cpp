#include "SimJobs.h"

#include "SimColour.h"
#include "SimSpectra.h"
#include "SimStore.h"

#include <algorithm>

namespace Sim {

namespace {

// The mean of some readings of a job as its averaged sample.
Sample averageOf(const Job& job, const QVector<const Sample*>& readings)
{
    Sample avg;
    if (readings.isEmpty())
        return avg;
    QVector<QVector<float>> refl, texture;
    double temperature = 0.0, instrument = 0.0, delta = 0.0;
    for (const Sample* s : readings) {
        refl.append(s->refl);
        texture.append(s->texture);
        temperature += s->temperature;
        instrument += s->instrumentTemperature;
        delta += s->calTemperatureDelta;
    }
    const Sample& last = *readings.back();
    avg = last;
    avg.dbIndex = job.average.dbIndex;
    const double n = readings.size();
    avg.temperature = float(temperature / n);
    avg.instrumentTemperature = float(instrument / n);
    avg.calTemperatureDelta = float(delta / n);
    avg.refl = Spectra::mean(refl);
    avg.labch = Colour::labch(avg.refl, avg.numAngles);
    avg.texture = Spectra::mean(texture);
    avg.good = true;
    avg.seed = quint32(job.dbIndex) * 7919u + 255u;
    for (const Sample* s : readings)
        if (s->time > avg.time)
            avg.time = s->time;
    return avg;
}

QVector<const Sample*> allReadings(const Job& job)
{
    QVector<const Sample*> v;
    for (const Sample& s : job.samples)
        v.append(&s);
    return v;
}

QVector<const Sample*> goodReadings(const Job& job)
{
    QVector<const Sample*> v;
    for (const Sample& s : job.samples)
        if (s.good)
            v.append(&s);
    return v;
}

} // namespace

JobBook::JobBook(Store& store, Changes& changes) : m_store(store), m_changes(changes) {}

void JobBook::load()
{
    m_jobs = m_store.loadJobs();
}

int JobBook::indexOf(const QString& nameOrFileId) const
{
    for (int i = 0; i < m_jobs.size(); ++i)
        if (m_jobs[i].name == nameOrFileId)
            return i;
    for (int i = 0; i < m_jobs.size(); ++i)
        if (!nameOrFileId.isEmpty() && m_jobs[i].fileId == nameOrFileId)
            return i;
    return -1;
}

const Job* JobBook::find(const QString& nameOrFileId) const
{
    const int i = indexOf(nameOrFileId);
    return i < 0 ? nullptr : &m_jobs[i];
}

Job* JobBook::findMutable(const QString& nameOrFileId)
{
    const int i = indexOf(nameOrFileId);
    return i < 0 ? nullptr : &m_jobs[i];
}

int JobBook::totalSamples() const
{
    int n = 0;
    for (const Job& j : m_jobs)
        n += j.samples.size();
    return n;
}

QString JobBook::modeString(const Job& job)
{
    switch (job.mode) {
    case JOB_AVG_MODE_SMC: return QStringLiteral("SMC");
    case JOB_AVG_MODE_SIMPLE_3:
    case JOB_AVG_MODE_SIMPLE_5: return QStringLiteral("AVERAGE");
    default: return QStringLiteral("NONE");
    }
}

void JobBook::resolveMode(Job& job, const Description& d, const Defaults& defaults) const
{
    QString text = d.modeText.trimmed().toUpper();
    int size = d.size;
    int spare = d.spare;
    if (text == QLatin1String("DEV_MODE")) {
        // The client left the mode open: the instrument's default averaging decides.
        text = defaults.measurementMode.trimmed().toUpper();
        if (text == QLatin1String("SMC")) {
            size = defaults.smcGood;
            spare = defaults.smcMax;
        } else if (text == QLatin1String("AVERAGE")) {
            size = defaults.averagingNumber == 5 ? 5 : 3;
        } else if (size <= 0) {
            size = defaults.minSamples;
        }
    }
    if (text == QLatin1String("SMC")) {
        job.mode = JOB_AVG_MODE_SMC;
        job.size = size > 0 ? size : defaults.smcGood;
        job.maxSamples = spare > 0 ? spare : std::max(defaults.smcMax, job.size);
        job.maxSamples = std::max(job.maxSamples, job.size);
    } else if (text == QLatin1String("AVERAGE")) {
        job.size = size > 0 ? size : (defaults.averagingNumber == 5 ? 5 : 3);
        job.mode = job.size == 5 ? JOB_AVG_MODE_SIMPLE_5 : JOB_AVG_MODE_SIMPLE_3;
        job.maxSamples = job.size;
    } else {
        job.mode = JOB_AVG_MODE_NONE;
        job.size = std::max(0, size);
        job.maxSamples = job.size;
    }
}

void JobBook::persistJob(Job& job)
{
    m_store.saveJob(job);
}

STATUS_T JobBook::add(const Description& d, const Defaults& defaults, int* dbIndex, bool online)
{
    Job job;
    job.name = d.name.trimmed();
    if (job.name.isEmpty())
        job.name = QStringLiteral("Job %1").arg(m_jobs.size() + 1);
    if (indexOf(job.name) >= 0)
        return ST_NAME_EXISTS;
    job.tags = d.tags;
    job.modeText = d.modeText.trimmed().toUpper();
    if (job.modeText.isEmpty())
        job.modeText = QStringLiteral("NONE");
    resolveMode(job, d, defaults);
    job.state = JOB_OPEN;
    job.online = online;
    job.created = QDateTime::currentDateTime();
    job.fileId = QStringLiteral("pending");
    m_store.begin();
    persistJob(job);
    job.fileId = QStringLiteral("%1-%2").arg(online ? QStringLiteral("LAB") : QStringLiteral("LOCAL")).arg(job.dbIndex);
    persistJob(job);
    m_store.commit();
    m_jobs.append(job);
    if (dbIndex)
        *dbIndex = job.dbIndex;
    m_changes.jobChanged(job.name);
    return ST_OK;
}

STATUS_T JobBook::edit(const QString& name, const Description& d, const Defaults& defaults)
{
    Job* job = findMutable(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    const QString newName = d.name.trimmed();
    if (!newName.isEmpty() && newName != job->name) {
        if (indexOf(newName) >= 0)
            return ST_NAME_EXISTS;
        job->name = newName;
    }
    job->tags = d.tags;
    if (job->samples.isEmpty() && !d.modeText.trimmed().isEmpty()) {
        // A job without readings may still change how it averages.
        Job probe = *job;
        resolveMode(probe, d, defaults);
        if (probe.mode == job->mode && probe.mode == JOB_AVG_MODE_SMC && d.spare <= 0)
            probe.maxSamples = std::max(job->maxSamples, probe.size);
        job->mode = probe.mode;
        job->size = probe.size;
        job->maxSamples = probe.maxSamples;
        job->modeText = d.modeText.trimmed().toUpper();
    }
    persistJob(*job);
    m_changes.jobChanged(job->name);
    return ST_OK;
}

STATUS_T JobBook::remove(const QString& name)
{
    if (name.isEmpty()) {
        const bool hadSamples = totalSamples() > 0;
        m_store.deleteAllJobs();
        m_jobs.clear();
        m_changes.jobChanged(QString());
        if (hadSamples)
            m_changes.measurementsChanged(QString());
        return ST_OK;
    }
    const int i = indexOf(name);
    if (i < 0)
        return ST_NO_SUCH_JOB;
    const bool hadSamples = !m_jobs[i].samples.isEmpty();
    m_store.deleteJob(m_jobs[i].dbIndex);
    m_jobs.remove(i);
    m_changes.jobChanged(QString());
    if (hadSamples)
        m_changes.measurementsChanged(QString());
    return ST_OK;
}

STATUS_T JobBook::setSaved(const QString& name)
{
    Job* job = findMutable(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    job->saved = true;
    if (job->state == JOB_COMPLETE)
        job->state = JOB_SAVED;
    persistJob(*job);
    m_changes.jobChanged(job->name);
    return ST_OK;
}

STATUS_T JobBook::deleteSample(const QString& name, int number)
{
    Job* job = findMutable(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    m_store.begin();
    if (number == AVERAGE_SAMPLE) {
        if (!job->hasAverage && job->samples.isEmpty()) {
            m_store.commit();
            return ST_INDEX_INVALID;
        }
        // The averaged result stands for its readings: deleting it restarts the job.
        for (const Sample& s : job->samples)
            m_store.deleteSample(s.dbIndex);
        job->samples.clear();
    } else if (number >= 1 && number <= job->samples.size()) {
        m_store.deleteSample(job->samples[number - 1].dbIndex);
        job->samples.remove(number - 1);
    } else {
        m_store.commit();
        return ST_INDEX_INVALID;
    }
    if (job->samples.isEmpty())
        job->firstMeasured = QDateTime();
    readingsChanged(*job);
    return ST_OK;
}

STATUS_T JobBook::forceFinish(const QString& name)
{
    Job* job = findMutable(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    if (job->mode != JOB_AVG_MODE_SMC || job->state != JOB_OPEN || job->samples.isEmpty())
        return ST_JOB_CLOSED;
    m_store.begin();
    evaluate(*job, true);
    m_store.commit();
    m_changes.jobChanged(job->name);
    return ST_OK;
}

STATUS_T JobBook::canMeasure(const QString& name, int limitSeconds, const QDateTime& now) const
{
    const Job* job = find(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    // Readings are numbered 1 to 254 on the wire; 255 is the average.
    if (job->state != JOB_OPEN || job->samples.size() >= AVERAGE_SAMPLE - 1)
        return ST_JOB_CLOSED;
    if (limitSeconds > 0 && job->firstMeasured.isValid() && job->firstMeasured.secsTo(now) > limitSeconds)
        return ST_JOB_TIME_ELAPSED;
    return ST_OK;
}

void JobBook::commitMeasurement(const QString& name, const Sample& reading)
{
    Job* job = findMutable(name);
    if (!job)
        return;
    m_store.begin();
    Sample s = reading;
    m_store.insertSample(job->dbIndex, s);
    job->samples.append(s);
    if (!job->firstMeasured.isValid())
        job->firstMeasured = s.time;
    readingsChanged(*job);
}

void JobBook::readingsChanged(Job& job)
{
    const int before = job.state;
    evaluate(job);
    m_store.commit();
    m_changes.measurementsChanged(job.name);
    if (job.state != before)
        m_changes.jobChanged(job.name);
}

void JobBook::evaluate(Job& job, bool forced)
{
    const int count = job.samples.size();
    const int previous = job.state;
    const bool hadAverage = job.hasAverage;
    int state = JOB_OPEN;
    QVector<const Sample*> averaged;

    if (job.mode == JOB_AVG_MODE_SMC) {
        // Judge every reading against the job's most central reading (the
        // one closest to all others): one early outlier cannot spoil the
        // readings that follow it.
        int centre = 0;
        double best = 1e300;
        for (int i = 0; i < count; ++i) {
            double sum = 0.0;
            for (int k = 0; k < count; ++k)
                sum += Colour::maxDeltaE(job.samples[i].labch, job.samples[k].labch);
            if (sum < best - 1e-9) {
                best = sum;
                centre = i;
            }
        }
        for (Sample& s : job.samples) {
            const bool good = Colour::maxDeltaE(s.labch, job.samples[centre].labch) <= m_smcTolerance;
            if (good != s.good) {
                s.good = good;
                m_store.updateSampleFlags(s);
            }
        }
        const int good = job.goodCount();
        if (forced) {
            state = job.online ? JOB_SMC_FORCED_ONLINE : JOB_SMC_FORCED;
            averaged = allReadings(job);
        } else if (good >= job.size && job.size > 0) {
            state = JOB_COMPLETE;
            averaged = goodReadings(job);
        } else if (count >= job.maxSamples && job.maxSamples > 0) {
            state = job.online ? JOB_SMC_MAX_USED_ONLINE : JOB_SMC_MAX_USED;
            averaged = allReadings(job);
        }
    } else if (job.mode == JOB_AVG_MODE_SIMPLE_3 || job.mode == JOB_AVG_MODE_SIMPLE_5) {
        if (job.size > 0 && count >= job.size) {
            state = JOB_COMPLETE;
            averaged = allReadings(job);
        }
    } else if (job.size > 0 && count >= job.size) {
        state = JOB_COMPLETE;
    }

    // A saved or synchronised job that is still complete keeps that state.
    if (state == JOB_COMPLETE && (previous == JOB_SAVED || previous == JOB_SYNCHRONISED))
        state = previous;
    job.state = state;
    if (state == JOB_OPEN)
        job.syncPercent = 0;
    job.hasAverage = !averaged.isEmpty();
    if (job.hasAverage)
        job.average = averageOf(job, averaged);
    if (job.hasAverage || hadAverage)
        m_store.saveAverage(job);
    persistJob(job);
}

bool JobBook::sample(const QString& name, int number, Sample* out, STATUS_T* dataStatus) const
{
    const Job* job = find(name);
    if (!job)
        return false;
    if (dataStatus)
        *dataStatus = ST_OK;
    if (number == AVERAGE_SAMPLE) {
        if (job->hasAverage) {
            if (out)
                *out = job->average;
            return true;
        }
        if (job->mode == JOB_AVG_MODE_SMC && job->state == JOB_OPEN && !job->samples.isEmpty()) {
            QVector<const Sample*> readings = goodReadings(*job);
            if (readings.isEmpty())
                readings = allReadings(*job);
            if (out)
                *out = averageOf(*job, readings);
            if (dataStatus)
                *dataStatus = JOB_OPEN;
            return true;
        }
        return false;
    }
    if (number < 1 || number > job->samples.size())
        return false;
    if (out)
        *out = job->samples[number - 1];
    return true;
}

STATUS_T JobBook::startSync(const QString& name)
{
    Job* job = findMutable(name);
    if (!job)
        return ST_NO_SUCH_JOB;
    if (job->state == JOB_OPEN)
        return ST_JOB_CLOSED;
    if (job->state == JOB_SYNCHRONISED)
        return ST_OK;
    job->syncing = true;
    job->syncPercent = 0;
    persistJob(*job);
    return ST_OK;
}

bool JobBook::syncInProgress() const
{
    for (const Job& j : m_jobs)
        if (j.syncing)
            return true;
    return false;
}

void JobBook::advanceSync(int percentStep)
{
    for (Job& j : m_jobs) {
        if (!j.syncing)
            continue;
        j.syncPercent = std::min(100, j.syncPercent + percentStep);
        if (j.syncPercent >= 100) {
            j.syncing = false;
            j.state = JOB_SYNCHRONISED;
            m_changes.jobChanged(j.name);
        }
        persistJob(j);
    }
}

void JobBook::setState(const QString& name, int state)
{
    Job* job = findMutable(name);
    if (!job)
        return;
    job->state = state;
    job->syncPercent = state == JOB_SYNCHRONISED ? 100 : job->syncPercent;
    persistJob(*job);
    m_changes.jobChanged(job->name);
}

void JobBook::setFinish(const QString& name, const QString& panelSpec)
{
    Job* job = findMutable(name);
    if (!job)
        return;
    job->finish = panelSpec;
    persistJob(*job);
}

} // namespace Sim
