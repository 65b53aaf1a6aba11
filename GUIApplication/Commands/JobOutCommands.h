#ifndef JOBOUTCOMMANDS_H
#define JOBOUTCOMMANDS_H

// Listing, adding, editing and deleting jobs on the MeasurementServer. A job
// is named by its file id. Every function returns the STATUS_T of the
// transaction (0 is success) and never throws; outputs may be half filled
// on a failure. The family shares one recursive lock.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Job.h"

#include <QString>
#include <QVector>

STATUS_T CmdOut_GetJobInfos(QVector<Job>& jobs);
STATUS_T CmdOut_GetJobInfo(const QString& fileID, Job& job);
STATUS_T CmdOut_GetJobInfoWeb(const QString& fileID, unsigned long& a, unsigned long& b);
// The index of the new job is read only when the server accepts it.
STATUS_T CmdOut_AddJob(const Job& job, int& index);
STATUS_T CmdOut_DeleteJob(const QString& fileID);
STATUS_T CmdOut_EditJob(const QString& fileID, const Job& job);
STATUS_T CmdOut_SetJobSaved(const QString& fileID);
// The index travels as one byte: 256 goes out as 0.
STATUS_T CmdOut_DeleteSample(const QString& fileID, int index);

// The averaging mode as the two job records name it. A job description
// reads "AVERAGE" as 5 readings for size 5 and 3 otherwise; the job info
// record, which only re-reads a job still in JOB_AVG_MODE_GUI, is stricter
// and takes sizes other than 3 and 5 as no averaging.
JOB_AVERAGING_MODE_T jobModeFromDescription(const QString& text, unsigned int jobSize);
JOB_AVERAGING_MODE_T jobModeFromJobInfo(const QString& text, unsigned int jobSize);

#endif // JOBOUTCOMMANDS_H
