#include "SimSpectra.h"

#include <QHash>

#include <algorithm>
#include <cmath>

namespace Sim {
namespace Spectra {

namespace {

Finish makeSolid(const char* key, const char* name, std::initializer_list<double> body)
{
    Finish f;
    f.key = QString::fromLatin1(key);
    f.name = QString::fromLatin1(name);
    f.kind = Finish::Solid;
    std::copy(body.begin(), body.end(), f.body);
    return f;
}

Finish makeMetallic(const char* key, const char* name, std::initializer_list<double> body, double strength,
                    double lobe, double tint, double sparkle, double coarseness)
{
    Finish f = makeSolid(key, name, body);
    f.kind = Finish::Metallic;
    f.flakeStrength = strength;
    f.lobeWidth = lobe;
    f.flakeTint = tint;
    f.sparkle = sparkle;
    f.coarseness = coarseness;
    return f;
}

Finish makePearl(const char* key, const char* name, std::initializer_list<double> body, double strength, double lobe,
                 double peak, double shift, double sparkle, double coarseness)
{
    Finish f = makeSolid(key, name, body);
    f.kind = Finish::Pearl;
    f.flakeStrength = strength;
    f.lobeWidth = lobe;
    f.pearlPeak = peak;
    f.pearlShift = shift;
    f.sparkle = sparkle;
    f.coarseness = coarseness;
    return f;
}

QVector<Finish> buildFinishes()
{
    QVector<Finish> f;
    //                                              400    450    500    550    600    650    700
    f << makeMetallic("silver-metallic", "Silver metallic", {0.080, 0.085, 0.088, 0.090, 0.090, 0.091, 0.092}, 3.4, 16.0, 0.05, 0.85, 6.5);
    f << makeSolid("white-solid", "White solid", {0.780, 0.850, 0.865, 0.870, 0.872, 0.874, 0.875});
    f << makeSolid("black-solid", "Black solid", {0.0085, 0.0080, 0.0078, 0.0078, 0.0079, 0.0081, 0.0084});
    f << makeSolid("red-solid", "Signal red solid", {0.055, 0.042, 0.038, 0.045, 0.360, 0.610, 0.660});
    f << makeSolid("yellow-solid", "Yellow solid", {0.060, 0.075, 0.320, 0.700, 0.780, 0.800, 0.805});
    f << makeMetallic("graphite-metallic", "Graphite metallic", {0.028, 0.029, 0.030, 0.030, 0.030, 0.031, 0.032}, 0.75, 17.0, 0.05, 0.7, 5.0);
    f << makeMetallic("blue-metallic", "Deep blue metallic", {0.090, 0.110, 0.060, 0.022, 0.015, 0.016, 0.020}, 1.5, 18.0, 0.55, 0.65, 4.5);
    f << makeMetallic("red-metallic", "Ruby red metallic", {0.030, 0.022, 0.020, 0.024, 0.200, 0.400, 0.450}, 1.9, 17.0, 0.65, 0.7, 5.5);
    f << makeMetallic("champagne-metallic", "Champagne metallic", {0.160, 0.190, 0.220, 0.250, 0.280, 0.300, 0.310}, 2.6, 18.0, 0.35, 0.75, 5.0);
    f << makeMetallic("orange-metallic", "Sunset orange metallic", {0.040, 0.035, 0.045, 0.150, 0.450, 0.560, 0.580}, 2.0, 17.0, 0.6, 0.7, 6.0);
    f << makePearl("blue-pearl", "Midnight blue pearl", {0.060, 0.070, 0.040, 0.015, 0.010, 0.010, 0.012}, 0.9, 22.0, 510.0, 1.2, 0.45, 2.5);
    f << makePearl("green-pearl", "Forest green pearl", {0.020, 0.025, 0.060, 0.080, 0.040, 0.025, 0.025}, 1.0, 22.0, 590.0, 1.0, 0.40, 2.5);
    f << makePearl("white-pearl", "Pearl white tri-coat", {0.760, 0.820, 0.840, 0.850, 0.850, 0.852, 0.855}, 0.35, 24.0, 590.0, 1.6, 0.25, 1.5);
    return f;
}

quint32 variantOf(const QString& spec)
{
    const int colon = spec.lastIndexOf(QLatin1Char(':'));
    return colon < 0 ? 0u : spec.mid(colon + 1).toUInt();
}

// Monotone cubic (Fritsch-Carlson) through the 7 body points: smooth, and no
// overshoot below zero at steep absorption edges.
void interpolateBody(const double pts[7], double out[NUM_WAVELENGTHS])
{
    double d[6], m[7];
    for (int i = 0; i < 6; ++i)
        d[i] = (pts[i + 1] - pts[i]) / 50.0;
    m[0] = d[0];
    m[6] = d[5];
    for (int i = 1; i < 6; ++i)
        m[i] = (d[i - 1] * d[i] <= 0.0) ? 0.0 : (d[i - 1] + d[i]) / 2.0;
    for (int i = 0; i < 6; ++i) {
        if (d[i] == 0.0) {
            m[i] = m[i + 1] = 0.0;
            continue;
        }
        const double a = m[i] / d[i], b = m[i + 1] / d[i];
        const double s = a * a + b * b;
        if (s > 9.0) {
            const double t = 3.0 / std::sqrt(s);
            m[i] = t * a * d[i];
            m[i + 1] = t * b * d[i];
        }
    }
    for (int w = 0; w < NUM_WAVELENGTHS; ++w) {
        const double lambda = 400.0 + 10.0 * w;
        const int k = std::min(5, int((lambda - 400.0) / 50.0));
        const double h = 50.0, t = (lambda - (400.0 + 50.0 * k)) / h;
        const double t2 = t * t, t3 = t2 * t;
        out[w] = (2 * t3 - 3 * t2 + 1) * pts[k] + (t3 - 2 * t2 + t) * h * m[k] + (-2 * t3 + 3 * t2) * pts[k + 1]
            + (t3 - t2) * h * m[k + 1];
    }
}

} // namespace

const QVector<Finish>& finishes()
{
    static const QVector<Finish> all = buildFinishes();
    return all;
}

const Finish& finish(const QString& key)
{
    const QVector<Finish>& all = finishes();
    const QString k = panelKey(key);
    for (const Finish& f : all)
        if (f.key == k)
            return f;
    return all.front();
}

QStringList finishKeys()
{
    QStringList keys;
    for (const Finish& f : finishes())
        keys << f.key;
    return keys;
}

QString panelSpec(const QString& key, quint32 variant)
{
    return QStringLiteral("%1:%2").arg(finish(key).key).arg(variant);
}

QString panelKey(const QString& spec)
{
    const int colon = spec.indexOf(QLatin1Char(':'));
    return colon < 0 ? spec : spec.left(colon);
}

void reflectance(const QString& spec, int angle, double out[NUM_WAVELENGTHS])
{
    const Finish& f = finish(spec);
    // The panel's own shade: a slightly lighter or darker, warmer or cooler
    // batch of the same colour.
    std::mt19937 shadeRng(variantOf(spec) * 2654435761u + 17u);
    std::uniform_real_distribution<double> u(-1.0, 1.0);
    const double gain = 1.0 + 0.03 * u(shadeRng);
    const double tilt = 0.025 * u(shadeRng);
    double pts[7];
    for (int i = 0; i < 7; ++i)
        pts[i] = f.body[i] * gain * (1.0 + tilt * (i - 3) / 3.0);
    double body[NUM_WAVELENGTHS];
    interpolateBody(pts, body);

    const double theta = aspecularDegrees(angle);
    const double a = std::fabs(theta);
    // Behind the specular direction the flakes are seen a little less well.
    const double side = theta < 0 ? 0.85 : 1.0;
    // Illumination at 15 degrees from the normal sees the flakes less tilted.
    const double geometry = isD15(angle) ? 0.9 : 1.0;
    const double lobe = f.flakeStrength * side * geometry * std::exp(-a / f.lobeWidth);
    const double gloss = 0.004 * std::exp(-a / 7.0);
    double bodyMax = 1e-6;
    for (double b : body)
        bodyMax = std::max(bodyMax, b);

    for (int w = 0; w < NUM_WAVELENGTHS; ++w) {
        const double lambda = 400.0 + 10.0 * w;
        double r = std::max(0.002, body[w]);
        switch (f.kind) {
        case Finish::Solid:
            r *= 1.0 + 0.05 * std::exp(-a / 15.0);
            break;
        case Finish::Metallic: {
            const double flakeColour = (1.0 - f.flakeTint) + f.flakeTint * body[w] / bodyMax;
            r += lobe * flakeColour;
            break;
        }
        case Finish::Pearl: {
            const double peak = f.pearlPeak - f.pearlShift * a;
            const double x = (lambda - peak) / 55.0;
            r += lobe * (0.3 + 0.7 * std::exp(-x * x));
            break;
        }
        }
        out[w] = r + gloss;
    }
}

QVector<float> measure(const QString& spec, int numAngles, const ReadingNoise& noise, std::mt19937& rng)
{
    numAngles = std::max(0, std::min(numAngles, int(NUM_REFL_ANGLE_TYPES)));
    QVector<float> out(numAngles * NUM_WAVELENGTHS);
    std::normal_distribution<double> n01(0.0, 1.0);
    std::uniform_real_distribution<double> u01(0.0, 1.0);
    double outlierGain = 1.0, outlierSlope = 0.0;
    if (noise.outlier) {
        // A rocked instrument: the whole reading is off by some per cent, more
        // at one end of the angle range than at the other.
        const double sign = noise.outlierSign != 0 ? (noise.outlierSign > 0 ? 1.0 : -1.0) : (u01(rng) < 0.5 ? -1.0 : 1.0);
        outlierGain = 1.0 + sign * (0.06 + 0.05 * u01(rng));
        outlierSlope = (u01(rng) - 0.5) * 0.06;
    }
    double r[NUM_WAVELENGTHS];
    for (int a = 0; a < numAngles; ++a) {
        reflectance(spec, a, r);
        const double gain = (1.0 + noise.gainSigma * n01(rng)) * outlierGain
            * (1.0 + outlierSlope * (a - numAngles / 2.0) / std::max(1, numAngles));
        for (int w = 0; w < NUM_WAVELENGTHS; ++w) {
            const double v = r[w] * gain + noise.additiveSigma * n01(rng);
            out[a * NUM_WAVELENGTHS + w] = float(std::max(0.0005, v));
        }
    }
    return out;
}

QVector<float> texture(const QString& spec, std::mt19937& rng)
{
    const Finish& f = finish(spec);
    static const double kCameraAspecular[NUM_OF_IMAGE_ANGLES] = {-45, -15, 15, 45, 80, 0};
    QVector<float> out(NUM_OF_IMAGE_ANGLES * kTextureFigures, 0.0f);
    std::normal_distribution<double> n01(0.0, 1.0);
    auto jitter = [&](double v, double rel) { return float(std::max(0.0, v * (1.0 + rel * n01(rng)))); };
    for (int c = 0; c < NUM_OF_IMAGE_ANGLES; ++c) {
        float* t = out.data() + c * kTextureFigures;
        const bool diffuse = c == IMAGE_DIFFUSE;
        const double a = std::fabs(kCameraAspecular[c]);
        // simpleCoarseness, backGroundCoarseness, directionalCoarseness,
        // sparkleArea, sparkleIntensity, sparkleGrade, sparkleDensity, res1..4
        if (diffuse) {
            t[0] = jitter(f.coarseness + 0.15, 0.03);
            t[1] = jitter(0.3 * f.coarseness + 0.05, 0.03);
            continue;
        }
        const double intensity = f.sparkle * 110.0 * std::exp(-a / 32.0);
        const double area = f.sparkle * 35.0 * std::exp(-a / 45.0);
        const double density = (f.coarseness + f.sparkle) * 8.0 * std::exp(-a / 60.0);
        t[2] = jitter(f.coarseness * std::exp(-a / 40.0), 0.04);
        t[3] = jitter(area, 0.04);
        t[4] = jitter(intensity, 0.04);
        t[5] = float(std::sqrt(double(t[3]) * double(t[4])) / 4.0);
        t[6] = jitter(density, 0.04);
    }
    return out;
}

QVector<float> mean(const QVector<QVector<float>>& values)
{
    if (values.isEmpty())
        return {};
    const int n = values.front().size();
    QVector<double> acc(n, 0.0);
    int count = 0;
    for (const QVector<float>& v : values) {
        if (v.size() != n)
            continue;
        for (int i = 0; i < n; ++i)
            acc[i] += v[i];
        ++count;
    }
    QVector<float> out(n);
    for (int i = 0; i < n; ++i)
        out[i] = float(acc[i] / std::max(1, count));
    return out;
}

} // namespace Spectra
} // namespace Sim
