#include "SimTypes.h"

namespace Sim {

namespace {
const char* const kSpectralNames[NUM_REFL_ANGLE_TYPES] = {
    "r45as-15", "r45as15", "r45as25", "r45as45", "r45as75", "r45as110",
    "r15as-45", "r15as-15", "r15as15", "r15as45", "r15as80"};
const double kAspecular[NUM_REFL_ANGLE_TYPES] = {-15, 15, 25, 45, 75, 110, -45, -15, 15, 45, 80};
const char* const kImageNames[NUM_OF_IMAGE_ANGLES] = {
    "r15as-45", "r15as-15", "r15as15", "r15as45", "r15as80", "r15d"};
} // namespace

QString spectralAngleName(int angle)
{
    if (angle < 0 || angle >= NUM_REFL_ANGLE_TYPES)
        return QString();
    return QString::fromLatin1(kSpectralNames[angle]);
}

QString imageAngleName(int angle)
{
    if (angle < 0 || angle >= NUM_OF_IMAGE_ANGLES)
        return QString();
    return QString::fromLatin1(kImageNames[angle]);
}

int spectralAngleFromName(const QString& name)
{
    const QString n = name.trimmed();
    for (int i = 0; i < NUM_REFL_ANGLE_TYPES; ++i)
        if (n.compare(QLatin1String(kSpectralNames[i]), Qt::CaseInsensitive) == 0)
            return i;
    return -1;
}

int imageAngleFromName(const QString& name)
{
    const QString n = name.trimmed();
    for (int i = 0; i < NUM_OF_IMAGE_ANGLES; ++i)
        if (n.compare(QLatin1String(kImageNames[i]), Qt::CaseInsensitive) == 0)
            return i;
    return -1;
}

double aspecularDegrees(int angle)
{
    if (angle < 0 || angle >= NUM_REFL_ANGLE_TYPES)
        return 45.0;
    return kAspecular[angle];
}

bool isD15(int angle)
{
    return angle >= REFL_D15_NEG_45 && angle < NUM_REFL_ANGLE_TYPES;
}

} // namespace Sim
