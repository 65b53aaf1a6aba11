#ifndef JOBAPI_H
#define JOBAPI_H

// Job-level entry points kept for the API's completeness; the screens go
// through DataManager instead.

unsigned int JobAPI_GetNumberOfJobs();
int JobAPI_GetCurrentJobSampleInfo();
void JobAPI_SaveCurrentJobInfo();

#endif // JOBAPI_H
