#ifndef SIMIMAGES_H
#define SIMIMAGES_H

// Procedural camera pictures of a painted surface: the coating's colour with
// the grain and the flake sparkle that the texture figures describe. Pictures
// are rendered from the sample's data on request, byte for byte the same
// each time, so the store keeps no pixels. All pictures are RGB888, rows
// packed without padding (width x 3 bytes a row).

#include "SimModel.h"

#include <QByteArray>
#include <QColor>

namespace Sim {
namespace Images {

// Largest picture the server renders (the live view).
const int kMaxWidth = 482;
const int kMaxHeight = 348;

// The picture of one camera angle of a sample.
QByteArray samplePicture(const Sample& sample, int imageAngle, int width, int height);

// The live picture of the targeting view: the surface under the aperture,
// lit when the instrument sits on it and dark when it is lifted, turned as
// the instrument is turned (a tape line and sanding scratches on the panel
// make the turn visible). The time moves the view a little, as a hand
// holding the instrument does. The coating is rendered once per surface and
// light and then only cropped and turned, so a frame costs about a copy.
class LiveView
{
public:
    QByteArray frame(const QString& panelSpec, int switchesDown, qint64 timeMs, int width, int height,
                     int rotationDegrees = 0);

private:
    QString m_key;
    QByteArray m_tile;
    int m_tileWidth = 0;
    int m_tileHeight = 0;
};

struct Coating {
    QColor base;
    double grain = 0.02;          // relative brightness variation of the grain
    double sparkleDensity = 0.0;  // sparkles per 100 pixels
    double sparkleIntensity = 0.0; // 0..1, added brightness of a sparkle's centre
    double light = 1.0;           // overall illumination
    // Pearl: soft glints of the interference colour, larger and dimmer
    // than a metal flake's.
    QColor glintTint;
    double shimmer = 0.0;         // 0..1, brightness of the glints
    quint32 seed = 1;
};
// Renders a window of an endless coating starting at (originX, originY).
QByteArray renderCoating(const Coating& c, int width, int height, int originX, int originY);

} // namespace Images
} // namespace Sim

#endif // SIMIMAGES_H
