#ifndef RESULTSFIXTURE_H
#define RESULTSFIXTURE_H

// The result views need a stored sample with its colour, textures and
// pictures. This serves the simulator's demo set of the 6-angle or the
// 11-angle instrument, reads it over a real link, and makes a demo job's
// sample the active one.

#include <QString>

namespace ResultsFixture {

// False when the simulator could not be started or served no jobs.
bool start(bool elevenAngles);

// Asking for the other model starts its simulator too and moves the link
// to it.

// A control line to the simulator, with its reply.
QString control(const QString& line);

// The demo job of that name becomes the active job, its samples are read
// (descriptions and colour) and sample `index` (255: the averaged one)
// becomes the active sample. False when the job or sample is not there.
bool activate(const QString& jobName, unsigned int index = 0);

// Textures and pictures of the active sample, read as the views do.
void loadTexturesAndImages();

} // namespace ResultsFixture

#endif // RESULTSFIXTURE_H
