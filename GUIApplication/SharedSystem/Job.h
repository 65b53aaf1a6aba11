#ifndef JOB_H
#define JOB_H

// One measuring job: its name, up to three tags, the averaging rule, the
// measured samples and the averaged result. The server holds the real job;
// this is a copy that DataManager replaces whenever the server reports a
// change, and that screens copy freely. No lock of its own.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/Tags.h"

#include <QDateTime>
#include <QMetaType>
#include <QString>
#include <QVector>

#include <functional>

typedef QVector<TAG_ITEM_T> TagItemList;

// Job states the GUI tells apart; all others are the server's business.
constexpr int JOB_STATE_OPEN = 2001;
constexpr int JOB_STATE_SMC_MAX_USED = 2002;
constexpr int JOB_STATE_SMC_FORCED = 2003;
constexpr int JOB_STATE_SMC_MAX_USED_2 = 2005;
constexpr int JOB_STATE_SMC_FORCED_2 = 2006;
constexpr int JOB_STATE_SYNCHRONISED = 2008;

// Sample number of a job's averaged result, and the "none" of indices.
constexpr unsigned int AVERAGED_SAMPLE_INDEX = 255;
constexpr unsigned int NO_INDEX = 65535;

class Job
{
public:
    // Names of the tag states in the filter file's own language, as the
    // owner of the filter tree knows them. Without a source every state
    // name is empty and no server tag matches a state.
    using TagStateNameSource = std::function<QString(int state)>;
    static void setTagStateNameSource(TagStateNameSource source);
    static QString tagStateNameDefaultLanguage(int state);

    Job();

    // Empties the job and takes the averaging from the user's defaults; the
    // mode itself is left open (JOB_AVG_MODE_GUI).
    void clearContents();
    bool isJobValid() const { return m_validJob; }

    void setFileID(const QString& fileID);
    QString getFileID() const { return m_FileID; }
    void setDBIndex(int index);
    int getDBIndex() const { return m_DBIndex; }
    void setCreatedOnInstrument(bool created);
    bool getCreatedOnInstrument() const { return m_CreatedOnInstrument; }
    // Made on this instrument: the identifier holds "local", any case.
    bool isTagEditable() const;

    void setLabMode(bool labMode) { m_isLabMode = labMode; }
    bool isLabMode() const { return m_isLabMode; }

    void setName(const QString& name);
    QString getName() const { return m_Name; }
    void setDisplayName(const QString& name) { m_DisplayName = name; }
    QString getDisplayName() const { return m_DisplayName; }
    void setNotes(const QString& notes) { m_notes = notes; }
    QString getNotes() const { return m_notes; }

    void setTagData(int state, const TAG_ENTRY_DATA_T& data);
    TAG_ENTRY_DATA_T getTagData(int state) const;
    void removeTag(int state);

    void setJobAveragingMode(JOB_AVERAGING_MODE_T mode);
    JOB_AVERAGING_MODE_T getJobAveragingMode() const { return m_AveragingMode; }
    QString getJobAveragingModeString() const;
    void setJobSize(unsigned int size);
    unsigned int getJobSize() const { return m_Size; }
    void setJobSMC(unsigned int smc);
    unsigned int getJobSMC() const { return m_SMC; }
    void setMaxSamples(int maxSamples) { m_maxSamples = maxSamples; }
    int getMaxSamples() const { return m_maxSamples; }
    void setOrientationAngle(int angle);
    int getOrientationAngle() const { return m_OrientationAngle; }
    void setJobState(int state) { m_jobState = state; }
    int getJobState() const { return m_jobState; }

    void addSample(const Sample& sample) { m_sampleList.append(sample); }
    void reserveSamples(int count);
    void clearSampleList() { m_sampleList.clear(); }
    int getNumSamples() const { return m_sampleList.size(); }
    const QVector<Sample>& getSampleList() const { return m_sampleList; }
    // Index 255 is the averaged sample; anything else out of range a blank.
    Sample getSample(unsigned int index) const;
    Sample* getSamplePointer(unsigned int index);
    void updateSample(unsigned int index, const Sample& sample);
    void deleteSample(unsigned int index);

    void setAveragedSample(const Sample& sample);
    void clearAveragedSample();
    bool getAveragedSampleComplete() const { return m_averageComplete; }
    Sample getAveragedSample() const { return m_averagedSample; }

    // The latest time stamp of the samples; the epoch with none.
    QDateTime getDateComplete() const;
    QString getDateCompletedString() const;

    bool isJobComplete() const;

    // The tags as the server stores them, and back.
    TagItemList getJobTagsTheServerCanHandle() const;
    void setJobTagsFromServer(const TagItemList& list);
    TagItemList getTagListForServer() const { return m_tagListForServer; }

    // Identity and content as the server sees it; display name, notes,
    // state, maximum and averaged sample don't count.
    bool operator==(const Job& other) const;
    bool operator!=(const Job& other) const { return !(*this == other); }

private:
    // Display-name items set the display name; they and the companions are
    // no tags of their own.
    bool takeNonTagItem(const TAG_ITEM_T& item);
    void setTagsFromEditableList(const TagItemList& items);
    void setTagsFromOutsideList(const TagItemList& items);

    QString m_FileID;
    int m_DBIndex;
    bool m_CreatedOnInstrument;
    bool m_validJob;
    bool m_averageComplete;
    bool m_isLabMode;
    QString m_Name;
    QString m_DisplayName;
    TAG_ENTRY_DATA_T m_TagID[NUM_TAG_STATES];
    JOB_AVERAGING_MODE_T m_AveragingMode;
    unsigned int m_Size;
    unsigned int m_SMC;
    int m_maxSamples;
    int m_OrientationAngle;
    int m_jobState;
    Sample m_averagedSample;
    QVector<Sample> m_sampleList;
    TagItemList m_tagListForServer;
    QString m_notes;
};

// Orders jobs by completion date.
bool jobLessThan(const Job& a, const Job& b);

Q_DECLARE_METATYPE(Job)

#endif // JOB_H
