#include "GUIAPI/JobAPI.h"

#include "GUIAPI/DataManager.h"

unsigned int JobAPI_GetNumberOfJobs()
{
    return DataManager::instance()->getNumberOfJobs();
}

int JobAPI_GetCurrentJobSampleInfo()
{
    return 0;
}

void JobAPI_SaveCurrentJobInfo()
{
}
