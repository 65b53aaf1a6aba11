#ifndef SAMPLEAPI_H
#define SAMPLEAPI_H

// Sample-level entry points kept for the API's completeness; the screens go
// through DataManager instead.

class Sample;

bool SampleAPI_GetRefinishSampleInfo(int index, Sample& sample);
void SampleAPI_DeleteSample();
void SampleAPI_DeleteAllSamples();

#endif // SAMPLEAPI_H
