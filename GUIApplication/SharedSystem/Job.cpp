#include "SharedSystem/Job.h"

#include "SharedSystem/UserParams.h"
#include "Utils/ConversionHelper.h"

#include <QMutex>
#include <QMutexLocker>

namespace {

QMutex& sourceMutex()
{
    static QMutex mutex;
    return mutex;
}

Job::TagStateNameSource& stateNameSource()
{
    static Job::TagStateNameSource source;
    return source;
}

bool sameName(const QString& a, const QString& b)
{
    return a.trimmed().toUpper() == b.trimmed().toUpper();
}

bool sameId(const QString& a, const QString& b)
{
    return a.trimmed() == b.trimmed();
}

enum ItemKind { DisplayNameItem, CompanionItem, TagItem };

ItemKind classify(const TAG_ITEM_T& item)
{
    if (item.tagID.startsWith(QLatin1String("DisplayName")))
        return DisplayNameItem;
    if (item.tagID.startsWith(QLatin1String("Display")) || item.tagID.endsWith(QLatin1String("Id")))
        return CompanionItem;
    return TagItem;
}

// Fills displayName and id of entry from the companions of its filter in
// items ("Display<filter>", "<filter>Id"). With keepOnEmpty an empty
// companion leaves the value as it was.
void readCompanions(TAG_ENTRY_DATA_T& entry, const TagItemList& items, bool keepOnEmpty)
{
    const QString displayKey = QStringLiteral("Display") + entry.filterName;
    const QString idKey = entry.filterName + QStringLiteral("Id");
    for (const TAG_ITEM_T& item : items) {
        if (keepOnEmpty && item.tagText.isEmpty())
            continue;
        if (sameId(item.tagID, displayKey))
            entry.displayName = item.tagText;
        if (sameId(item.tagID, idKey))
            entry.id = item.tagText;
    }
}

} // namespace

void Job::setTagStateNameSource(TagStateNameSource source)
{
    QMutexLocker lock(&sourceMutex());
    stateNameSource() = std::move(source);
}

QString Job::tagStateNameDefaultLanguage(int state)
{
    TagStateNameSource source;
    {
        QMutexLocker lock(&sourceMutex());
        source = stateNameSource();
    }
    return source ? source(state) : QString();
}

Job::Job()
{
    clearContents();
}

void Job::clearContents()
{
    m_FileID.clear();
    m_DBIndex = 0;
    m_CreatedOnInstrument = true;
    m_averageComplete = false;
    m_Name.clear();
    m_DisplayName.clear();
    m_jobState = JOB_STATE_OPEN;
    m_isLabMode = false;
    for (TAG_ENTRY_DATA_T& tag : m_TagID)
        tag = TAG_ENTRY_DATA_T();

    const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    m_SMC = unsigned(info.smcGoodMeasurements);
    m_Size = 0;
    if (info.mode == JOB_AVG_MODE_SMC) {
        m_maxSamples = info.smcMaxMeasurements;
    } else if (info.mode == JOB_AVG_MODE_SIMPLE_3 || info.mode == JOB_AVG_MODE_SIMPLE_5) {
        m_maxSamples = info.averageNumber;
        m_Size = unsigned(info.averageNumber);
    } else {
        m_Size = UserParams::getJobDefaultSize();
        m_maxSamples = int(m_Size);
    }
    // A job that has not been through the server yet leaves the averaging
    // open: the user's defaults at the time decide.
    m_AveragingMode = JOB_AVG_MODE_GUI;

    m_OrientationAngle = 0;
    m_validJob = false;
    m_averagedSample.clearContents();
    m_notes.clear();
    m_sampleList.clear();
    m_tagListForServer.clear();
}

void Job::setFileID(const QString& fileID)
{
    m_validJob = true;
    m_FileID = fileID;
    m_CreatedOnInstrument = fileID.contains(QLatin1String("local"), Qt::CaseInsensitive);
}

void Job::setDBIndex(int index)
{
    m_validJob = true;
    m_DBIndex = index;
}

void Job::setCreatedOnInstrument(bool created)
{
    m_validJob = true;
    m_CreatedOnInstrument = created;
}

bool Job::isTagEditable() const
{
    return m_FileID.contains(QLatin1String("local"), Qt::CaseInsensitive);
}

void Job::setName(const QString& name)
{
    m_validJob = true;
    m_Name = name;
}

void Job::setTagData(int state, const TAG_ENTRY_DATA_T& data)
{
    m_validJob = true;
    if (state >= 0 && state < NUM_TAG_STATES)
        m_TagID[state] = data;
}

TAG_ENTRY_DATA_T Job::getTagData(int state) const
{
    if (state >= 0 && state < NUM_TAG_STATES)
        return m_TagID[state];
    return TAG_ENTRY_DATA_T();
}

void Job::removeTag(int state)
{
    if (state >= 0 && state < NUM_TAG_STATES)
        m_TagID[state] = TAG_ENTRY_DATA_T();
}

void Job::setJobAveragingMode(JOB_AVERAGING_MODE_T mode)
{
    m_validJob = true;
    if (mode < 0 || mode >= NUM_JOB_AVG_MODES)
        return;
    m_AveragingMode = mode;
}

QString Job::getJobAveragingModeString() const
{
    return jobAveragingModeText(m_AveragingMode);
}

void Job::setJobSize(unsigned int size)
{
    m_validJob = true;
    m_Size = size;
}

void Job::setJobSMC(unsigned int smc)
{
    m_validJob = true;
    m_SMC = smc;
}

void Job::setOrientationAngle(int angle)
{
    m_validJob = true;
    m_OrientationAngle = angle;
}

void Job::reserveSamples(int count)
{
    if (count > 0)
        m_sampleList.reserve(count);
}

Sample Job::getSample(unsigned int index) const
{
    if (index < unsigned(m_sampleList.size()))
        return m_sampleList.at(int(index));
    if (index == AVERAGED_SAMPLE_INDEX)
        return m_averagedSample;
    return Sample();
}

Sample* Job::getSamplePointer(unsigned int index)
{
    if (index < unsigned(m_sampleList.size()))
        return &m_sampleList[int(index)];
    if (index == AVERAGED_SAMPLE_INDEX)
        return &m_averagedSample;
    return nullptr;
}

void Job::updateSample(unsigned int index, const Sample& sample)
{
    if (index < unsigned(m_sampleList.size()))
        m_sampleList[int(index)] = sample;
    else if (index == AVERAGED_SAMPLE_INDEX)
        m_averagedSample = sample;
}

void Job::deleteSample(unsigned int index)
{
    if (index < unsigned(m_sampleList.size()))
        m_sampleList.remove(int(index));
}

void Job::setAveragedSample(const Sample& sample)
{
    m_averagedSample = sample;
    m_averageComplete = true;
}

void Job::clearAveragedSample()
{
    m_averagedSample.clearContents();
    m_averageComplete = false;
}

QDateTime Job::getDateComplete() const
{
    if (m_sampleList.isEmpty())
        return QDateTime::fromSecsSinceEpoch(0);
    QDateTime latest = m_sampleList.first().getTimeStamp();
    for (const Sample& sample : m_sampleList) {
        const QDateTime stamp = sample.getTimeStamp();
        if (stamp > latest)
            latest = stamp;
    }
    return latest;
}

QString Job::getDateCompletedString() const
{
    if (m_sampleList.isEmpty())
        return QString();
    return convertDateTimeToString(getDateComplete());
}

bool Job::isJobComplete() const
{
    const bool open = m_jobState == JOB_STATE_OPEN;
    const unsigned int samples = unsigned(m_sampleList.size());

    switch (m_AveragingMode) {
    case JOB_AVG_MODE_SMC:
        return !open || m_averageComplete;
    case JOB_AVG_MODE_GUI: {
        // Not yet through the server: an open job is never complete, and the
        // user's present defaults count, not the job's own fields.
        const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
        if (info.mode == JOB_AVG_MODE_SMC)
            return !open && m_averageComplete;
        unsigned int size = m_Size;
        if (size == 0) {
            if (info.mode == JOB_AVG_MODE_SIMPLE_3)
                size = 3;
            else if (info.mode == JOB_AVG_MODE_SIMPLE_5)
                size = 5;
            else
                size = UserParams::getJobDefaultSize();
        }
        return !open && (samples >= size || m_averageComplete);
    }
    default:
        return !open || samples >= m_Size || m_averageComplete;
    }
}

TagItemList Job::getJobTagsTheServerCanHandle() const
{
    TagItemList list;
    list.append(TAG_ITEM_T{QStringLiteral("DisplayName"), m_DisplayName});
    for (const TAG_ENTRY_DATA_T& tag : m_TagID) {
        if (tag.filterName.trimmed().isEmpty())
            continue;
        list.append(TAG_ITEM_T{tag.filterName, tag.defaultName()});
        list.append(TAG_ITEM_T{tag.filterName + QStringLiteral("Id"), tag.id});
        list.append(TAG_ITEM_T{QStringLiteral("Display") + tag.filterName, tag.displayName});
    }
    if (!m_notes.isEmpty())
        list.append(TAG_ITEM_T{QStringLiteral("DisplayNotes"), m_notes});
    return list;
}

void Job::setJobTagsFromServer(const TagItemList& list)
{
    m_tagListForServer = list;

    TagItemList items = list;
    for (int i = 0; i < items.size(); ++i) {
        if (items.at(i).tagID == QLatin1String("DisplayNotes")) {
            m_notes = items.at(i).tagText;
            items.remove(i);
            break;
        }
    }

    if (isTagEditable())
        setTagsFromEditableList(items);
    else
        setTagsFromOutsideList(items);

    if (m_DisplayName.isEmpty())
        m_DisplayName = m_Name;
}

bool Job::takeNonTagItem(const TAG_ITEM_T& item)
{
    switch (classify(item)) {
    case DisplayNameItem:
        m_DisplayName = item.tagText;
        return true;
    case CompanionItem:
        // Read together with the tag they belong to.
        return true;
    case TagItem:
        break;
    }
    return false;
}

void Job::setTagsFromEditableList(const TagItemList& items)
{
    // The entry carries over from one matched item to the next, so an entry
    // without companions keeps the id and display name of the one before.
    TAG_ENTRY_DATA_T working;
    for (const TAG_ITEM_T& item : items) {
        if (takeNonTagItem(item))
            continue;
        for (int state = 0; state < NUM_TAG_STATES; ++state) {
            if (!sameName(item.tagID, tagStateNameDefaultLanguage(state)))
                continue;
            working.filterName = item.tagID;
            working.setDefaultName(item.tagText);
            readCompanions(working, items, false);
            m_TagID[state] = working;
        }
    }
}

void Job::setTagsFromOutsideList(const TagItemList& items)
{
    // An outside job may use tag names this instrument's states don't know:
    // such tags wait as spares for the free slots.
    QVector<TAG_ENTRY_DATA_T> spares;
    for (const TAG_ITEM_T& item : items) {
        if (takeNonTagItem(item))
            continue;
        for (int state = 0; state < NUM_TAG_STATES; ++state) {
            TAG_ENTRY_DATA_T entry;
            entry.filterName = item.tagID;
            entry.setDefaultName(item.tagText);
            entry.displayName = item.tagText;
            readCompanions(entry, items, true);
            if (sameName(item.tagID, tagStateNameDefaultLanguage(state)))
                m_TagID[state] = entry;
            else
                spares.append(entry);
        }
    }

    QVector<TAG_ENTRY_DATA_T> unique;
    for (const TAG_ENTRY_DATA_T& spare : spares) {
        bool seen = false;
        for (const TAG_ENTRY_DATA_T& kept : unique)
            seen = seen || kept.sameEntry(spare);
        bool inSlot = false;
        for (const TAG_ENTRY_DATA_T& slot : m_TagID)
            inSlot = inSlot || slot.sameEntry(spare);
        if (!seen && !inSlot)
            unique.append(spare);
    }

    int next = 0;
    for (TAG_ENTRY_DATA_T& slot : m_TagID) {
        if (next >= unique.size())
            break;
        if (slot.defaultName().trimmed().isEmpty())
            slot = unique.at(next++);
    }
}

bool Job::operator==(const Job& other) const
{
    if (m_FileID != other.m_FileID || m_DBIndex != other.m_DBIndex
        || m_CreatedOnInstrument != other.m_CreatedOnInstrument || m_Name != other.m_Name)
        return false;
    for (int state = 0; state < NUM_TAG_STATES; ++state) {
        if (m_TagID[state].id != other.m_TagID[state].id
            || m_TagID[state].filterName != other.m_TagID[state].filterName)
            return false;
    }
    if (m_AveragingMode != other.m_AveragingMode || m_Size != other.m_Size || m_SMC != other.m_SMC
        || m_OrientationAngle != other.m_OrientationAngle)
        return false;
    if (m_sampleList.size() != other.m_sampleList.size())
        return false;
    for (int i = 0; i < m_sampleList.size(); ++i) {
        if (m_sampleList.at(i).getSampleInfo() != other.m_sampleList.at(i).getSampleInfo())
            return false;
    }
    return true;
}

bool jobLessThan(const Job& a, const Job& b)
{
    return a.getDateComplete() < b.getDateComplete();
}
