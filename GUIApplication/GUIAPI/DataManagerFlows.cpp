// DataManager: the daily work. Jobs are made, copied, edited and deleted by
// commands only; the local list is replaced by what the server reports.

#include "GUIAPI/DataManager.h"

#include "Commands/JobOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/UserParams.h"

#include <QDebug>
#include <QMutexLocker>

#include <numeric>
#include <vector>

namespace {

const int kJobSynchronised = 2008;
// A collision from a stale list gets this many tries in all.
const int kAddJobTries = 7;

// CmdOut_ functions return their failures; a throw from below counts the same.
template <typename Call>
STATUS_T statusOf(Call&& call)
{
    try {
        return call();
    } catch (unsigned int status) {
        return status;
    }
}

unsigned int sampleCount(const Job& job)
{
    return static_cast<unsigned int>(job.getNumSamples());
}

void reportIssue(STATUS_T status)
{
    API_SignalMaster::instance()->emitMeasurementIssue(static_cast<int>(status));
}

} // namespace

// ---------------------------------------------------------------- active job

void DataManager::setActiveJob(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    // One past the end is kept: every reader checks against the size.
    if (index > static_cast<unsigned int>(m_JobList.size()))
        index = NO_INDEX;
    m_CurrentJobIndex = index;
}

void DataManager::setActiveSample(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    const unsigned int count = sampleCount(m_JobList[m_CurrentJobIndex]);
    if (index >= count && index != AVERAGED_SAMPLE_INDEX)
        index = NO_INDEX;
    m_CurrentSampleIndex = index;
}

unsigned int DataManager::getActiveJob()
{
    QMutexLocker locker(&m_lock);
    return m_CurrentJobIndex;
}

unsigned int DataManager::getActiveSample()
{
    QMutexLocker locker(&m_lock);
    return m_CurrentSampleIndex;
}

Job DataManager::getActiveJobObject()
{
    QMutexLocker locker(&m_lock);
    return getAJobObject(m_CurrentJobIndex);
}

Job DataManager::getAJobObject(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (index < static_cast<unsigned int>(m_JobList.size()))
        return m_JobList[index];
    return Job();
}

QVector<Job> DataManager::getAllJobs()
{
    QMutexLocker locker(&m_lock);
    return m_JobList;
}

unsigned int DataManager::getNumberOfJobs()
{
    QMutexLocker locker(&m_lock);
    return static_cast<unsigned int>(m_JobList.size());
}

Sample DataManager::getActiveSampleObject()
{
    QMutexLocker locker(&m_lock);
    return getASampleObject(m_CurrentSampleIndex);
}

Sample DataManager::getASampleObject(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return Sample();
    return m_JobList[m_CurrentJobIndex].getSample(index);
}

unsigned int DataManager::getCurrentNumberOfJobSamples()
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return 0;
    return sampleCount(m_JobList[m_CurrentJobIndex]);
}

unsigned int DataManager::getTotalNumSamples()
{
    QMutexLocker locker(&m_lock);
    unsigned int total = 0;
    for (const Job& job : m_JobList)
        total += sampleCount(job);
    return total;
}

unsigned int DataManager::findJobByName(const QString& name)
{
    QMutexLocker locker(&m_lock);
    for (int i = 0; i < m_JobList.size(); ++i) {
        if (m_JobList[i].getName() == name)
            return static_cast<unsigned int>(i);
    }
    return NO_INDEX;
}

bool DataManager::doesJobNameExist(const QString& name)
{
    return findJobByName(name) != NO_INDEX;
}

bool DataManager::doesJobDisplayNameExist(const QString& name)
{
    QMutexLocker locker(&m_lock);
    for (const Job& job : m_JobList) {
        if (job.getDisplayName() == name)
            return true;
    }
    return false;
}

void DataManager::setFullJobUpdateFlag(bool flag)
{
    QMutexLocker locker(&m_lock);
    m_fullJobUpdateFlag = flag;
}

void DataManager::clearAllJobs()
{
    QMutexLocker locker(&m_lock);
    m_JobList.clear();
}

// ---------------------------------------------------------------- create, copy, edit

unsigned int DataManager::createNewJob()
{
    QMutexLocker locker(&m_lock);
    // In lab mode the job is the server's; nothing is made here.
    if (m_UserParameters->getLabModeEnabled())
        return NO_INDEX;

    QString name = "Job";
    QString displayName;
    PARAMETER_CONTENT_TYPES value;
    if (SysAPI_GetParameter(PARAMETER_DEFAULT_JOB_NAME, value))
        displayName = value.parameterString;
    else
        displayName = m_UserParameters->getJobDefaultName();
    int counter = 1;

    unsigned int index = NO_INDEX;
    for (int attempt = 0; attempt < kAddJobTries && index == NO_INDEX; ++attempt) {
        while (doesJobDisplayNameExist(displayName))
            displayName = QString("%1 %2").arg(m_UserParameters->getJobDefaultName()).arg(counter++);
        if (doesJobNameExist(name)) {
            counter = 1;
            while (doesJobNameExist(name))
                name = QString("Job-%1").arg(counter++);
        }
        Job job;
        job.setName(name);
        job.setDisplayName(displayName);
        index = addJob(job);
    }
    return index;
}

void DataManager::onCreateNewJob()
{
    const unsigned int index = createNewJob();
    emit jobCreated(index);
}

unsigned int DataManager::addJob(const Job& job)
{
    QMutexLocker locker(&m_lock);
    int dbIndex = 0;
    const STATUS_T status = statusOf([&] { return CmdOut_AddJob(job, dbIndex); });
    if (status != STATUS_OK) {
        reportIssue(status);
        return NO_INDEX;
    }
    updateJobInfos();
    for (int i = 0; i < m_JobList.size(); ++i) {
        if (m_JobList[i].getDBIndex() == dbIndex)
            return static_cast<unsigned int>(i);
    }
    return NO_INDEX;
}

unsigned int DataManager::copyJob(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return NO_INDEX;

    // Tags, averaging and notes go with the copy; the measurements don't.
    Job copy = m_JobList[index];
    copy.clearSampleList();
    copy.clearAveragedSample();
    copy.setDBIndex(0);
    const QString originalName = copy.getName();
    const QString originalDisplayName = copy.getDisplayName();

    unsigned int newIndex = NO_INDEX;
    for (int attempt = 0; attempt < kAddJobTries && newIndex == NO_INDEX; ++attempt) {
        // Each try names against the list as it stands now, which addJob may
        // just have refreshed.
        QString base = originalName;
        QString candidate = base;
        int counter = 1;
        while (doesJobNameExist(candidate))
            candidate = QString("%1 %2").arg(base).arg(counter++);
        copy.setName(candidate);

        base = originalDisplayName;
        candidate = base;
        if (doesJobDisplayNameExist(candidate)) {
            counter = 1;
            while (doesJobDisplayNameExist(candidate))
                candidate = QString("%1 %2").arg(base).arg(counter++);
        }
        copy.setDisplayName(candidate);
        newIndex = addJob(copy);
    }
    return newIndex;
}

void DataManager::editJob(unsigned int index, const Job& job)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return;
    const QString oldName = m_JobList[index].getName();
    const STATUS_T status = statusOf([&] { return CmdOut_EditJob(oldName, job); });
    if (status != STATUS_OK)
        reportIssue(status);
}

void DataManager::editJobName(unsigned int index, const QString& name)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job job = m_JobList[index];
    const QString oldName = job.getName();
    job.setName(name);
    // A display name that only mirrored the name keeps mirroring it.
    if (job.getDisplayName().isEmpty() || job.getDisplayName() == oldName)
        job.setDisplayName(name);
    editJob(index, job);
}

void DataManager::editJobDisplayName(unsigned int index, const QString& name)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job job = m_JobList[index];
    job.setDisplayName(name);
    editJob(index, job);
}

void DataManager::editJobTag(unsigned int index, TAG_STATES_T state, const _TAG_ENTRY_DATA_T& data)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job job = m_JobList[index];
    job.setTagData(state, data);
    editJob(index, job);
}

void DataManager::editCurrentJobName(const QString& name)
{
    QMutexLocker locker(&m_lock);
    editJobName(m_CurrentJobIndex, name);
}

void DataManager::editCurrentJobDisplayName(const QString& name)
{
    QMutexLocker locker(&m_lock);
    editJobDisplayName(m_CurrentJobIndex, name);
}

// ---------------------------------------------------------------- delete

void DataManager::deleteJobAt(unsigned int index)
{
    if (index >= static_cast<unsigned int>(m_JobList.size()))
        return;
    const QString name = m_JobList[index].getName();
    const STATUS_T status = statusOf([&] { return CmdOut_DeleteJob(name); });
    if (status != STATUS_OK)
        reportIssue(status);
}

void DataManager::deleteJob(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    deleteJobAt(index);
}

void DataManager::deleteCompletedJobs()
{
    QMutexLocker locker(&m_lock);
    for (int i = m_JobList.size() - 1; i >= 0; --i) {
        if (m_JobList[i].isJobComplete())
            deleteJobAt(static_cast<unsigned int>(i));
    }
    emit completedJobsDeleted();
}

void DataManager::deleteActiveJob()
{
    QMutexLocker locker(&m_lock);
    deleteJobAt(m_CurrentJobIndex);
}

void DataManager::deleteAllJobs()
{
    QMutexLocker locker(&m_lock);
    // An empty name is the server's "all jobs".
    statusOf([&] { return CmdOut_DeleteJob(QString()); });
    emit DataBaseWiped();
}

void DataManager::onDeleteActiveJobSamples()
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    // Highest first: the server renumbers what follows a deleted sample, so
    // the numbers still to be sent stay valid.
    for (unsigned int i = sampleCount(m_JobList[m_CurrentJobIndex]); i-- > 0;)
        deleteSample(i);
}

void DataManager::deleteSample(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job& job = m_JobList[m_CurrentJobIndex];
    const QString name = job.getName();
    if (index < sampleCount(job)) {
        const STATUS_T status =
            statusOf([&] { return CmdOut_DeleteSample(name, static_cast<int>(index + 1)); });
        if (status != STATUS_OK)
            reportIssue(status);
    } else if (index == AVERAGED_SAMPLE_INDEX) {
        job.clearAveragedSample();
        SysAPI_DeleteSample(name, AVERAGED_SAMPLE_INDEX);
    }
}

void DataManager::deleteActiveSample()
{
    QMutexLocker locker(&m_lock);
    deleteSample(m_CurrentSampleIndex);
}

// ---------------------------------------------------------------- refresh

bool DataManager::refreshJobInfos()
{
    QMutexLocker locker(&m_lock);
    QVector<Job> jobs;
    if (!SysAPI_GetJobs(jobs))
        return false;

    // The active job and sample are known by their database indices, which
    // survive the reload; list positions don't.
    bool haveJob = false;
    int jobDBIndex = 0;
    bool haveSample = false;
    int sampleDBIndex = 0;
    if (m_CurrentJobIndex < static_cast<unsigned int>(m_JobList.size())) {
        const Job& oldJob = m_JobList[m_CurrentJobIndex];
        for (const Job& newJob : jobs) {
            if (newJob.getDBIndex() != oldJob.getDBIndex())
                continue;
            haveJob = true;
            jobDBIndex = newJob.getDBIndex();
            if (m_CurrentSampleIndex < sampleCount(oldJob)) {
                const int oldSample = oldJob.getSample(m_CurrentSampleIndex).getSampleInfo().dbIndex;
                for (unsigned int s = 0; s < sampleCount(newJob); ++s) {
                    if (newJob.getSample(s).getSampleInfo().dbIndex == oldSample) {
                        haveSample = true;
                        sampleDBIndex = oldSample;
                        break;
                    }
                }
            }
            break;
        }
    }

    m_JobList = jobs;
    m_CurrentJobIndex = NO_INDEX;
    m_CurrentSampleIndex = NO_INDEX;

    if (haveJob) {
        for (int i = 0; i < m_JobList.size(); ++i) {
            if (m_JobList[i].getDBIndex() == jobDBIndex) {
                setActiveJob(static_cast<unsigned int>(i));
                break;
            }
        }
    }
    if (haveSample && m_CurrentJobIndex < static_cast<unsigned int>(m_JobList.size())) {
        const Job& job = m_JobList[m_CurrentJobIndex];
        for (unsigned int s = 0; s < sampleCount(job); ++s) {
            if (job.getSample(s).getSampleInfo().dbIndex == sampleDBIndex) {
                setActiveSample(s);
                break;
            }
        }
    }

    // Latest completion first, by an exchange sort without early stop, so
    // that jobs of equal date keep their server order. The dates are worked
    // out once and the order is applied in one go.
    const int count = m_JobList.size();
    std::vector<QDateTime> dates(static_cast<size_t>(count));
    std::vector<int> order(static_cast<size_t>(count));
    for (int i = 0; i < count; ++i)
        dates[static_cast<size_t>(i)] = m_JobList[i].getDateComplete();
    std::iota(order.begin(), order.end(), 0);
    for (int i = 0; i < count - 1; ++i) {
        for (int j = i + 1; j >= 1; --j) {
            const size_t a = static_cast<size_t>(j - 1);
            const size_t b = static_cast<size_t>(j);
            if (dates[a] < dates[b]) {
                std::swap(dates[a], dates[b]);
                std::swap(order[a], order[b]);
            }
        }
    }
    QVector<Job> sorted;
    sorted.reserve(count);
    for (int i : order)
        sorted.append(m_JobList[i]);
    m_JobList.swap(sorted);

    // Jobs behind the active one aren't reported.
    for (int i = 0; i < m_JobList.size(); ++i) {
        const Job& job = m_JobList[i];
        if (haveJob && job.getDBIndex() == jobDBIndex) {
            setActiveJob(static_cast<unsigned int>(i));
            break;
        }
        if (job.getJobState() == kJobSynchronised)
            emit syncJobPercent(job.getName(), true, 100);
    }
    return true;
}

void DataManager::updateJobInfos()
{
    QMutexLocker locker(&m_lock);
    qDebug() << "updateJobInfos";
    if (refreshJobInfos())
        API_SignalMaster::instance()->emitJobInfoUpdated();
}

void DataManager::onUpdateJobInfos()
{
    updateJobInfos();
}

void DataManager::loadJobs()
{
    updateJobInfos();
}

bool DataManager::refreshCurrentJobInfo()
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return false;
    const QString name = m_JobList[m_CurrentJobIndex].getName();
    Job job;
    const bool read = SysAPI_GetJob(name, job);
    if (job.getJobState() == kJobSynchronised)
        emit syncJobPercent(name, true, 100);
    if (read)
        m_JobList[m_CurrentJobIndex] = job;
    return read;
}

bool DataManager::updateCurrentJobInfo()
{
    QMutexLocker locker(&m_lock);
    if (!refreshCurrentJobInfo())
        return false;
    API_SignalMaster::instance()->emitJobInfoUpdated();
    return true;
}

// ---------------------------------------------------------------- staged samples

bool DataManager::jobUsesAveragedSample(const Job& job) const
{
    const JOB_AVERAGING_MODE_T mode = job.getJobAveragingMode();
    return mode == JOB_AVG_MODE_SIMPLE_3 || mode == JOB_AVG_MODE_SIMPLE_5
        || mode == JOB_AVG_MODE_SMC;
}

void DataManager::quickLoadJobSamples(unsigned int jobIndex)
{
    QMutexLocker locker(&m_lock);
    if (jobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job& job = m_JobList[jobIndex];
    const QString name = job.getName();
    // An averaging job shows its result only.
    if (jobUsesAveragedSample(job)) {
        Sample sample;
        if (SysAPI_GetQuickSampleInformation(name, AVERAGED_SAMPLE_INDEX, sample))
            job.setAveragedSample(sample);
        return;
    }
    const unsigned int count = sampleCount(job);
    for (unsigned int number = 1; number <= count; ++number) {
        Sample sample;
        if (SysAPI_GetQuickSampleInformation(name, static_cast<int>(number), sample))
            job.updateSample(number - 1, sample);
    }
}

void DataManager::onQuickLoadCurrentJobSamples()
{
    {
        QMutexLocker locker(&m_lock);
        quickLoadJobSamples(m_CurrentJobIndex);
    }
    emit loadQuickCurrentJobSamplesComplete();
}

void DataManager::loadSamplesImages(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Sample sample = getASampleObject(index);
    if (!sample.isValid())
        return;
    const QString name = m_JobList[m_CurrentJobIndex].getName();
    const int number = index == AVERAGED_SAMPLE_INDEX ? AVERAGED_SAMPLE_INDEX : static_cast<int>(index + 1);
    const int cameras = Instrument_Get_Num_Camera_Images();
    for (int angle = 0; angle < cameras; ++angle) {
        if (!sample.hasImage(static_cast<IMAGE_ANGLE_T>(angle)))
            SysAPI_GetSampleImages(name, number, sample);
    }
    m_JobList[m_CurrentJobIndex].updateSample(index, sample);
}

void DataManager::loadSamplesTextures(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Sample sample = getASampleObject(index);
    if (!sample.isValid())
        return;
    const QString name = m_JobList[m_CurrentJobIndex].getName();
    const int number = index == AVERAGED_SAMPLE_INDEX ? AVERAGED_SAMPLE_INDEX : static_cast<int>(index + 1);
    const bool parameters = m_UserParameters->getDisplayTextureParameters();
    const int cameras = Instrument_Get_Num_Camera_Images();
    for (int angle = 0; angle < cameras; ++angle) {
        if (sample.hasTexture(static_cast<IMAGE_ANGLE_T>(angle)))
            continue;
        if (parameters)
            SysAPI_GetSampleTextureParameters(name, number, sample);
        else
            SysAPI_GetSampleTextures(name, number, sample);
    }
    m_JobList[m_CurrentJobIndex].updateSample(index, sample);
}

void DataManager::loadSamplesTexturesAndImages(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return;
    Job& job = m_JobList[m_CurrentJobIndex];
    const bool averaged = jobUsesAveragedSample(job);
    const unsigned int sampleIndex = averaged ? AVERAGED_SAMPLE_INDEX : index;
    Sample sample = job.getSample(sampleIndex);
    if (!sample.isValid())
        return;
    const int number = averaged ? AVERAGED_SAMPLE_INDEX : static_cast<int>(index + 1);
    SysAPI_GetSampleTextureAndImages(job.getName(), number, sample);
    if (averaged)
        job.setAveragedSample(sample);
    else
        job.updateSample(index, sample);
}

void DataManager::onLoadCurrentSamplesImages()
{
    {
        QMutexLocker locker(&m_lock);
        loadSamplesImages(m_CurrentSampleIndex);
    }
    emit loadCurrentSamplesImagesComplete();
}

void DataManager::onLoadCurrentSamplesTextures()
{
    {
        QMutexLocker locker(&m_lock);
        loadSamplesTextures(m_CurrentSampleIndex);
    }
    emit loadCurrentSamplesTexturesComplete();
}

void DataManager::onLoadCurrentSamplesTexturesAndImages()
{
    onLoadCurrentSamplesImages();
    onLoadCurrentSamplesTextures();
    emit loadCurrentSamplesTexturesAndImagesComplete();
}

QImage DataManager::getSampleImage(IMAGE_ANGLE_T angle, unsigned int index)
{
    QMutexLocker locker(&m_lock);
    Sample sample = getASampleObject(index);
    if (!sample.isValid())
        return QImage();
    if (sample.hasImage(angle))
        return sample.getSampleImage(angle);
    const QString name = m_JobList[m_CurrentJobIndex].getName();
    const int number = index == AVERAGED_SAMPLE_INDEX ? AVERAGED_SAMPLE_INDEX : static_cast<int>(index + 1);
    SysAPI_GetSampleImage(name, number, sample, angle);
    m_JobList[m_CurrentJobIndex].updateSample(index, sample);
    return sample.getSampleImage(angle);
}

QImage DataManager::getActiveSampleImage(IMAGE_ANGLE_T angle)
{
    QMutexLocker locker(&m_lock);
    return getSampleImage(angle, m_CurrentSampleIndex);
}

// ---------------------------------------------------------------- memory

MEMORY_INFO_T DataManager::getUpdatedMemInfo()
{
    QMutexLocker locker(&m_lock);
    MEMORY_INFO_T info;
    if (SysAPI_GetMemoryInfo(info))
        m_SystemStatus.setMemInfo(info);
    return getMemInfo();
}

bool DataManager::isThereEnoughRoomToMeasure(unsigned int jobIndex)
{
    QMutexLocker locker(&m_lock);
    const MEMORY_INFO_T memory = getUpdatedMemInfo();
    if (jobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return false;
    const Job& job = m_JobList[jobIndex];
    // What the job still has to measure is reserved before it starts.
    const unsigned int target = job.getJobAveragingMode() == JOB_AVG_MODE_SMC
        ? static_cast<unsigned int>(job.getMaxSamples())
        : static_cast<unsigned int>(job.getJobSize());
    const unsigned int needed = target - static_cast<unsigned int>(job.getNumSamples())
        + static_cast<unsigned int>(memory.numMeasurements);
    return needed < static_cast<unsigned int>(memory.maxNumMeasurements);
}

bool DataManager::isThereEnoughRoomToAddJob()
{
    QMutexLocker locker(&m_lock);
    const MEMORY_INFO_T memory = getUpdatedMemInfo();
    const JOB_AVERAGING_INFO_T defaults = m_UserParameters->getJobDefaultAvgInfo();
    int size = 0;
    if (defaults.mode == JOB_AVG_MODE_SIMPLE_3 || defaults.mode == JOB_AVG_MODE_SIMPLE_5)
        size = defaults.averageNumber;
    else if (defaults.mode == JOB_AVG_MODE_SMC)
        size = defaults.smcMaxMeasurements;
    else
        size = static_cast<int>(m_UserParameters->getJobDefaultSize());
    return memory.numJobs < memory.maxNumJobs
        && memory.numMeasurements + size <= memory.maxNumMeasurements;
}

// ---------------------------------------------------------------- tags

bool DataManager::doesTagNameExist(const QString& name)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.doesTagNameExist(name);
}

bool DataManager::doesTagNameExist(TAG_STATES_T state, const QString& name)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.doesTagNameExist(state, name);
}

bool DataManager::doesTagExist()
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.hasTags();
}

QVector<_TAG_ENTRY_DATA_T> DataManager::tagAutoLookupBeginsWith(const QString& text)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.autoLookup(text);
}

QVector<_TAG_ENTRY_DATA_T> DataManager::tagAutoLookupBeginsWith(TAG_STATES_T state,
                                                                const QString& text)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.autoLookup(state, text);
}

QStringList DataManager::tagAutoLookupBeginsWithStringList(const QString& text)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.autoLookupStringList(text);
}

QStringList DataManager::tagAutoLookupBeginsWithStringList(TAG_STATES_T state,
                                                           const QString& text)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.autoLookupStringList(state, text);
}

QVector<_TAG_ENTRY_DATA_T> DataManager::tagSmartAutoLookupBeginsWith(TAG_STATES_T state,
                                                                     const QString& text)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return {};
    const Job& job = m_JobList[m_CurrentJobIndex];
    return m_TagFilters.autoLookupSmart(state, text, job.getTagData(TAG_STATE_1),
                                        job.getTagData(TAG_STATE_2));
}

QStringList DataManager::tagSmartAutoLookupBeginsWithStringList(TAG_STATES_T state,
                                                                const QString& text)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return {};
    const Job& job = m_JobList[m_CurrentJobIndex];
    return m_TagFilters.autoLookupStringList(state, text, job.getTagData(TAG_STATE_1),
                                             job.getTagData(TAG_STATE_2));
}

_TAG_ENTRY_DATA_T DataManager::getParentFilterTag(const _TAG_ENTRY_DATA_T& entry)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.getParentFilterTag(entry);
}

unsigned char DataManager::getTagRules()
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.getRules();
}

QVector<_TAG_ENTRY_DATA_T> DataManager::getTagData(TAG_STATES_T state)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.getEntryDatasForState(state);
}

QVector<_TAG_ENTRY_DATA_T> DataManager::getSmartTagData(TAG_STATES_T state)
{
    QMutexLocker locker(&m_lock);
    if (m_CurrentJobIndex >= static_cast<unsigned int>(m_JobList.size()))
        return {};
    const Job& job = m_JobList[m_CurrentJobIndex];
    return m_TagFilters.getSmartEntryDatasForState(state, job.getTagData(TAG_STATE_1),
                                                   job.getTagData(TAG_STATE_2));
}

QString DataManager::getTagStateName(TAG_STATES_T state)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.getFilterName(state, m_UserParameters->getLanguageCode());
}

QString DataManager::getTagStateNameDefaultLanguage(TAG_STATES_T state)
{
    QMutexLocker locker(&m_lock);
    return m_TagFilters.getFilterName(state, "default");
}

QString DataManager::getTagID(TAG_STATES_T state, const QString& text)
{
    QMutexLocker locker(&m_lock);
    const QString wanted = text.toUpper();
    for (const _TAG_ENTRY_DATA_T& entry : getTagData(state)) {
        if (entry.nameHash.value("default").toUpper() == wanted)
            return entry.id;
    }
    return QString();
}

QString DataManager::getTagText(TAG_STATES_T state, const QString& id)
{
    QMutexLocker locker(&m_lock);
    const QString wanted = id.toUpper();
    for (const _TAG_ENTRY_DATA_T& entry : getTagData(state)) {
        if (entry.id.toUpper() == wanted)
            return entry.nameHash.value("default");
    }
    return QString();
}

void DataManager::createNewTag(TAG_STATES_T state, const QString& id, const QString& text)
{
    QMutexLocker locker(&m_lock);
    if (state >= NUM_TAG_STATES)
        return;
    TAG_ITEM_T item;
    item.tagID = id;
    item.tagText = text;
    m_TagList[state].tagItems.push_back(item);
}

TAG_ITEM_T DataManager::getTag(TAG_STATES_T state, unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (state >= NUM_TAG_STATES || index >= m_TagList[state].tagItems.size())
        return TAG_ITEM_T();
    return m_TagList[state].tagItems[index];
}

QString DataManager::getTagID_FromIndex(TAG_STATES_T state, unsigned int index)
{
    return getTag(state, index).tagID;
}

QString DataManager::getTagText_FromIndex(TAG_STATES_T state, unsigned int index)
{
    return getTag(state, index).tagText;
}

unsigned int DataManager::getNumberOfTags(TAG_STATES_T state, bool flag)
{
    QMutexLocker locker(&m_lock);
    if (state > TAG_STATE_3 || flag)
        return 0;
    return static_cast<unsigned int>(m_TagList[state].tagItems.size());
}

void DataManager::setTagStateName(TAG_STATES_T state, const QString& name)
{
    QMutexLocker locker(&m_lock);
    if (state >= NUM_TAG_STATES)
        return;
    m_TagList[state].tagName = name;
}

void DataManager::clearTagLists()
{
    QMutexLocker locker(&m_lock);
    for (TAG_LIST_T& list : m_TagList) {
        list.tagItems.clear();
        list.tagName.clear();
    }
}

// ---------------------------------------------------------------- self tests

QVector<TEST> DataManager::getAllTests()
{
    QMutexLocker locker(&m_lock);
    QVector<TEST> tests;
    SysAPI_GetAllTests(tests);
    for (TEST& test : tests) {
        unsigned int result = 0;
        SysAPI_GetSelfTestResult(test.num, result);
        test.result = result;
    }
    return tests;
}

QVector<TEST> DataManager::getTests(int type)
{
    QMutexLocker locker(&m_lock);
    QVector<TEST> matching;
    for (const TEST& test : getAllTests()) {
        if (static_cast<int>(test.deviceLocation) == type)
            matching.append(test);
    }
    return matching;
}

// ---------------------------------------------------------------- Wi-Fi

void DataManager::onLoadWifiSettings()
{
    {
        QMutexLocker locker(&m_lock);
        // What a failed read gives is no list: networks from an earlier
        // read may be gone, and the page must not offer them.
        QVector<NETWORK_DESCRIPTION_T> networks;
        if (!SysAPI_GetWifiSettings(networks))
            networks.clear();
        m_NetworkDescriptions = networks;
        QString address;
        if (SysAPI_GetIpAddress(address))
            m_ipAddress = address;
        loadWifiSSID();
    }
    emit loadWifiSettingsComplete();
}

bool DataManager::loadWifiSSID()
{
    QMutexLocker locker(&m_lock);
    QString ssid;
    if (!SysAPI_GetConnectedWifiSSID(ssid))
        return false;
    m_wifiSSID = ssid;
    return true;
}

void DataManager::triggerWifiScan()
{
    // The results come later, with settings bit 0x800000.
    SysAPI_TriggerWifiScan();
}

void DataManager::onTriggerWifiScan()
{
    triggerWifiScan();
}

bool DataManager::removeSSID(const QString& ssid)
{
    QMutexLocker locker(&m_lock);
    return SysAPI_DeleteWifiSetting(ssid);
}

NETWORK_DESCRIPTION_T DataManager::getNetworkDescription(unsigned int index)
{
    QMutexLocker locker(&m_lock);
    if (index >= static_cast<unsigned int>(m_NetworkDescriptions.size()))
        return NETWORK_DESCRIPTION_T();
    return m_NetworkDescriptions[index];
}

QVector<NETWORK_DESCRIPTION_T> DataManager::getKnownNetworkDescriptions()
{
    QMutexLocker locker(&m_lock);
    QVector<NETWORK_DESCRIPTION_T> known;
    for (const NETWORK_DESCRIPTION_T& network : m_NetworkDescriptions) {
        if (network.Known)
            known.append(network);
    }
    return known;
}

QVector<NETWORK_DESCRIPTION_T> DataManager::getUnknownNetworkDescriptions()
{
    QMutexLocker locker(&m_lock);
    QVector<NETWORK_DESCRIPTION_T> unknown;
    for (const NETWORK_DESCRIPTION_T& network : m_NetworkDescriptions) {
        if (!network.Known)
            unknown.append(network);
    }
    return unknown;
}

// ---------------------------------------------------------------- lab mode

void DataManager::turnOffLabMode(bool setUserParams)
{
    QMutexLocker locker(&m_lock);
    if (setUserParams) {
        m_UserParameters->setLabModeJob(QString());
        return;
    }
    // The local value follows when the server's settings bit comes back.
    PARAMETER_CONTENT_TYPES value;
    value.parameterString = QString();
    SysAPI_SetParameter(PARAMETER_ONLINE_MODE_JOB, value);
}
