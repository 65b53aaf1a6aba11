#include "GUIAPI/SampleAPI.h"

#include "SharedSystem/Sample.h"

bool SampleAPI_GetRefinishSampleInfo(int index, Sample& sample)
{
    Q_UNUSED(index)
    // The sample already is what the caller holds; nothing is fetched.
    const Sample same = sample;
    sample = same;
    return true;
}

void SampleAPI_DeleteSample()
{
}

void SampleAPI_DeleteAllSamples()
{
}
