#include "Commands/JobOutCommands.h"

#include "Communication/CmdData.h"
#include "Communication/Commands.h"

#include <QRecursiveMutex>

namespace {

QRecursiveMutex s_jobMutex;

constexpr long CMD_GET_JOB_INFOS = 0x40010000;
constexpr long CMD_GET_JOB_INFO = 0x40010020;
constexpr long CMD_GET_JOB_INFO_WEB = 0x40010022;
constexpr long CMD_ADD_JOB = 0x40010030;
constexpr long CMD_DELETE_JOB = 0x40010040;
constexpr long CMD_EDIT_JOB = 0x40010050;
constexpr long CMD_SET_JOB_SAVED = 0x40010070;
constexpr long CMD_DELETE_SAMPLE = 0x41000110;

// The smallest sample info on the wire: si32, time, three f32,
// acceleration, ui8, pressure.
constexpr int SAMPLE_INFO_WIRE_SIZE = 4 + 6 + 12 + 9 + 1 + 3;

// An unvalidated command whose answer is its status.
STATUS_T statusOnly(CmdData& rx)
{
    return rx.getStatus();
}

bool goesWide(const TAG_ITEM_T& tag)
{
    return tag.tagID.startsWith(QLatin1String("Display")) || isTag32(tag)
        || tag.tagID == QLatin1String("DisplayNotes");
}

} // namespace

JOB_AVERAGING_MODE_T jobModeFromDescription(const QString& text, unsigned int jobSize)
{
    const QString mode = text.trimmed().toUpper();
    if (mode == QLatin1String("DEV_MODE"))
        return JOB_AVG_MODE_GUI;
    if (mode == QLatin1String("SMC"))
        return JOB_AVG_MODE_SMC;
    if (mode == QLatin1String("AVERAGE"))
        return jobSize == 5 ? JOB_AVG_MODE_SIMPLE_5 : JOB_AVG_MODE_SIMPLE_3;
    return JOB_AVG_MODE_NONE;
}

JOB_AVERAGING_MODE_T jobModeFromJobInfo(const QString& text, unsigned int jobSize)
{
    const QString mode = text.trimmed().toUpper();
    if (mode == QLatin1String("SMC"))
        return JOB_AVG_MODE_SMC;
    if (mode == QLatin1String("AVERAGE")) {
        if (jobSize == 3)
            return JOB_AVG_MODE_SIMPLE_3;
        if (jobSize == 5)
            return JOB_AVG_MODE_SIMPLE_5;
        return JOB_AVG_MODE_NONE;
    }
    if (mode == QLatin1String("DEV_MODE"))
        return JOB_AVG_MODE_GUI;
    return JOB_AVG_MODE_NONE;
}

// ---- the job records in a packet --------------------------------------------------

void CmdData::appendJobDescription(const Job& job)
{
    // Tags with text beyond ASCII, and every "Display..." companion, go as
    // 32-bit text: a plain string's count is in characters, not bytes.
    TagItemList plain;
    TagItemList wide;
    for (const TAG_ITEM_T& tag : job.getJobTagsTheServerCanHandle()) {
        if (goesWide(tag))
            wide.append(tag);
        else
            plain.append(tag);
    }
    // The server takes the first wide tag as the display name.
    for (int i = 1; i < wide.size(); ++i) {
        if (wide.at(i).tagID == QLatin1String("DisplayName")) {
            std::swap(wide[0], wide[i]);
            break;
        }
    }

    append_si32(job.getDBIndex());
    appendString(job.getName());
    append_si32(plain.size());
    for (const TAG_ITEM_T& tag : plain)
        appendTag(tag);
    append_si32(wide.size());
    for (const TAG_ITEM_T& tag : wide)
        appendTag32(tag);
    append_ui8(char(job.getJobSize() & 0xFF));
    appendString(job.getFileID());
    appendString(job.getJobAveragingModeString());
    append_ui8(0);
}

void CmdData::nextArgJobDescription(Job& job)
{
    job.setDBIndex(nextArg_si32());
    job.setName(nextArgString());
    TagItemList tags;
    const int plainCount = nextArg_si32();
    for (int i = 0; i < plainCount; ++i)
        tags.append(nextArgTag());
    const int wideCount = nextArg_si32();
    for (int i = 0; i < wideCount; ++i)
        tags.append(nextArgTag32());
    job.setJobSize(nextArg_ui8());
    job.setFileID(nextArgString());
    // The tags are read against the file id (made here or outside) and the
    // name, so they are handed over once both are in.
    job.setJobTagsFromServer(tags);
    job.setJobAveragingMode(jobModeFromDescription(nextArgString(), job.getJobSize()));
    job.setMaxSamples(nextArg_ui8());
}

void CmdData::nextArgJobInfo(Job& job)
{
    job.clearContents();
    nextArgJobDescription(job);

    const int sampleCount = nextArg_si32();
    // A count is only believed as far as the bytes that follow can hold it.
    job.reserveSamples(qMin(sampleCount, getPacketlength() / SAMPLE_INFO_WIRE_SIZE));
    for (int i = 0; i < sampleCount; ++i) {
        Sample sample;
        sample.setSampleInfo(nextArgSampleInfo());
        job.addSample(sample);
    }
    job.setJobState(nextArg_si32());
    const QString mode = nextArgString();
    job.setJobSize(unsigned(nextArg_si32()));
    job.setMaxSamples(nextArg_si32());
    const int spare = nextArg_si32();
    nextArgBuffer(spare);

    if (job.getJobAveragingMode() == JOB_AVG_MODE_GUI)
        job.setJobAveragingMode(jobModeFromJobInfo(mode, job.getJobSize()));
}

// ---- commands ------------------------------------------------------------------------

STATUS_T CmdOut_GetJobInfos(QVector<Job>& jobs)
{
    return runCommand(s_jobMutex, CMD_GET_JOB_INFOS, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&jobs](CmdData& rx) {
                          jobs.clear();
                          const int count = rx.nextArg_si32();
                          for (int i = 0; i < count; ++i) {
                              Job job;
                              rx.nextArgJobInfo(job);
                              jobs.append(job);
                          }
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetJobInfo(const QString& fileID, Job& job)
{
    return runCommand(s_jobMutex, CMD_GET_JOB_INFO, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID](CmdData& tx) { tx.appendString(fileID); },
                      [&job](CmdData& rx) {
                          rx.nextArgJobInfo(job);
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetJobInfoWeb(const QString& fileID, unsigned long& a, unsigned long& b)
{
    return runCommand(s_jobMutex, CMD_GET_JOB_INFO_WEB, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID](CmdData& tx) { tx.appendString(fileID); },
                      [&a, &b](CmdData& rx) {
                          a = rx.nextArg_ui32();
                          b = rx.nextArg_ui32();
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_AddJob(const Job& job, int& index)
{
    return runCommand(s_jobMutex, CMD_ADD_JOB, false, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&job](CmdData& tx) { tx.appendJobDescription(job); },
                      [&index](CmdData& rx) {
                          const STATUS_T status = rx.getStatus();
                          if (status == STATUS_OK)
                              index = rx.nextArg_si32();
                          return status;
                      });
}

STATUS_T CmdOut_DeleteJob(const QString& fileID)
{
    return runCommand(s_jobMutex, CMD_DELETE_JOB, false, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID](CmdData& tx) { tx.appendString(fileID); }, statusOnly);
}

STATUS_T CmdOut_EditJob(const QString& fileID, const Job& job)
{
    return runCommand(s_jobMutex, CMD_EDIT_JOB, false, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID, &job](CmdData& tx) {
                          tx.appendString(fileID);
                          tx.appendJobDescription(job);
                      },
                      statusOnly);
}

STATUS_T CmdOut_SetJobSaved(const QString& fileID)
{
    return runCommand(s_jobMutex, CMD_SET_JOB_SAVED, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID](CmdData& tx) { tx.appendString(fileID); }, nothingRead);
}

STATUS_T CmdOut_DeleteSample(const QString& fileID, int index)
{
    return runCommand(s_jobMutex, CMD_DELETE_SAMPLE, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID, index](CmdData& tx) {
                          tx.appendString(fileID);
                          tx.append_ui8(char(index & 0xFF));
                      },
                      nothingRead);
}
