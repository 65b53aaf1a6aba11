#ifndef SIMSPECTRA_H
#define SIMSPECTRA_H

// Reflectance of automotive finishes at the instrument's geometries.
//
// A finish is a body colour (pigments seen at every angle), plus for effect
// finishes a flake reflection that is strong near the specular direction and
// falls off with the aspecular angle (the lightness flop of metallics), and
// for pearls an interference colour whose peak moves with the angle (the hue
// flop). A measurement adds the small noise of a real reading; an outlier
// reading is what a rocked or dirty contact gives.

#include "SimModel.h"

#include <QString>
#include <QStringList>
#include <QVector>

#include <random>

namespace Sim {

struct Finish {
    enum Kind { Solid, Metallic, Pearl };
    QString key;                 // "silver-metallic"
    QString name;                // "Silver metallic"
    Kind kind = Solid;
    double body[7] = {};         // body reflectance at 400, 450, ... 700 nm
    double flakeStrength = 0.0;  // flake reflection at the specular direction
    double lobeWidth = 18.0;     // degrees over which the flake reflection falls by e
    double flakeTint = 0.0;      // 0 neutral aluminium, 1 flake coloured like the body
    double pearlPeak = 0.0;      // nm: interference peak at the specular direction
    double pearlShift = 0.0;     // nm the peak moves per degree of aspecular angle
    double sparkle = 0.0;        // 0..1, how strongly flakes glint in the camera
    double coarseness = 0.0;     // graininess under diffuse light
};

namespace Spectra {

// All finishes the simulator knows, and one by key ("" or unknown gives the first).
const QVector<Finish>& finishes();
const Finish& finish(const QString& key);
QStringList finishKeys();

// A panel is a finish with a small shade variation of its own: "key:variant".
QString panelSpec(const QString& key, quint32 variant);
QString panelKey(const QString& spec);

// The noise-free reflectance (fraction, 31 values) of a panel at a geometry.
void reflectance(const QString& panelSpec, int angle, double out[NUM_WAVELENGTHS]);

struct ReadingNoise {
    double gainSigma = 0.002;      // per angle, relative
    double additiveSigma = 0.0007; // per wavelength, absolute
    bool outlier = false;          // a rocked or dirty contact
    int outlierSign = 0;           // +1 lighter, -1 darker, 0 either
};

// One reading of a panel at numAngles geometries: numAngles x 31 values.
QVector<float> measure(const QString& panelSpec, int numAngles, const ReadingNoise& noise, std::mt19937& rng);

// Texture figures of a reading, 6 camera angles x kTextureFigures, in the
// order of TEXTURE_T after its description.
QVector<float> texture(const QString& panelSpec, std::mt19937& rng);

// Element-wise mean of equally long vectors; empty input gives an empty result.
QVector<float> mean(const QVector<QVector<float>>& values);

} // namespace Spectra
} // namespace Sim

#endif // SIMSPECTRA_H
