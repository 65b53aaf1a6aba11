#include "SimImages.h"

#include "SimColour.h"
#include "SimSpectra.h"

#include <algorithm>
#include <cmath>
#include <cstring>

#include <QHash>

namespace Sim {
namespace Images {

namespace {

inline quint32 hash3(quint32 x, quint32 y, quint32 seed)
{
    quint32 h = x * 0x8da6b343u ^ y * 0xd8163841u ^ seed * 0xcb1ab31fu;
    h ^= h >> 13;
    h *= 0x5bd1e995u;
    h ^= h >> 15;
    return h;
}

inline double unit(quint32 h) { return (h & 0xffffff) / double(0x1000000); }

// Aspecular angle of each camera and the reflectance geometry that sees the
// surface most like it does.
const double kCameraAspecular[NUM_OF_IMAGE_ANGLES] = {-45, -15, 15, 45, 80, 45};

int nearestGeometry(double aspecular, int numAngles)
{
    int best = 0;
    double bestDiff = 1e9;
    for (int a = 0; a < numAngles; ++a) {
        const double d = std::fabs(aspecularDegrees(a) - aspecular);
        if (d < bestDiff) {
            bestDiff = d;
            best = a;
        }
    }
    return best;
}

inline uchar clampByte(double v) { return uchar(std::max(0.0, std::min(255.0, v + 0.5))); }

} // namespace

QByteArray renderCoating(const Coating& c, int width, int height, int originX, int originY)
{
    width = std::max(0, width);
    height = std::max(0, height);
    QByteArray out(width * height * 3, Qt::Uninitialized);
    uchar* p = reinterpret_cast<uchar*>(out.data());
    const double r0 = c.base.red(), g0 = c.base.green(), b0 = c.base.blue();
    // Sparkles sit one per 4 x 4 cell at most, so a flake is a small blob.
    const int cell = 4;
    const double cellChance = std::min(1.0, c.sparkleDensity * cell * cell / 100.0);
    const double cx = width / 2.0, cy = height / 2.0;
    const double rr = 1.0 / std::max(1.0, cx * cx + cy * cy);
    for (int y = 0; y < height; ++y) {
        const int wy = y + originY;
        for (int x = 0; x < width; ++x) {
            const int wx = x + originX;
            const quint32 h = hash3(quint32(wx), quint32(wy), c.seed);
            double shade = 1.0 + c.grain * (unit(h) * 2.0 - 1.0);
            // A lens shows its edges a little darker.
            const double dx = x - cx, dy = y - cy;
            shade *= 1.0 - 0.22 * (dx * dx + dy * dy) * rr;
            double spark = 0.0;
            if (cellChance > 0.0) {
                const int gx = (wx >= 0 ? wx : wx - cell + 1) / cell, gy = (wy >= 0 ? wy : wy - cell + 1) / cell;
                const quint32 ch = hash3(quint32(gx), quint32(gy), c.seed ^ 0x9e3779b9u);
                if (unit(ch) < cellChance) {
                    const double sx = gx * cell + 0.5 + (ch >> 24 & 3), sy = gy * cell + 0.5 + (ch >> 26 & 3);
                    const double d2 = (wx - sx) * (wx - sx) + (wy - sy) * (wy - sy);
                    spark = c.sparkleIntensity * (0.5 + 0.5 * unit(ch >> 4)) * std::exp(-d2 / 1.2);
                }
            }
            double glint = 0.0;
            if (c.shimmer > 0.0) {
                // Platelets lie one per 7 x 7 cell at most and glow over a few pixels.
                const int pc = 7;
                const int gx = (wx >= 0 ? wx : wx - pc + 1) / pc, gy = (wy >= 0 ? wy : wy - pc + 1) / pc;
                const quint32 ph = hash3(quint32(gx), quint32(gy), c.seed ^ 0x85ebca6bu);
                if (unit(ph) < 0.45) {
                    const double sx = gx * pc + 1.5 + (ph >> 24 & 3), sy = gy * pc + 1.5 + (ph >> 26 & 3);
                    const double d2 = (wx - sx) * (wx - sx) + (wy - sy) * (wy - sy);
                    glint = c.shimmer * (0.4 + 0.6 * unit(ph >> 5)) * std::exp(-d2 / 5.0);
                }
            }
            const double light = c.light * shade;
            *p++ = clampByte(r0 * light + 255.0 * spark + c.glintTint.red() * glint);
            *p++ = clampByte(g0 * light + 255.0 * spark + c.glintTint.green() * glint);
            *p++ = clampByte(b0 * light + 255.0 * spark + c.glintTint.blue() * glint);
        }
    }
    return out;
}

QByteArray samplePicture(const Sample& sample, int imageAngle, int width, int height)
{
    width = std::min(std::max(1, width), kMaxWidth);
    height = std::min(std::max(1, height), kMaxHeight);
    if (imageAngle < 0 || imageAngle >= NUM_OF_IMAGE_ANGLES)
        imageAngle = 0;
    const int numAngles = std::max(1, std::min(sample.numAngles, int(sample.refl.size() / NUM_WAVELENGTHS)));
    const int geometry = nearestGeometry(kCameraAspecular[imageAngle], numAngles);
    double r[NUM_WAVELENGTHS];
    for (int w = 0; w < NUM_WAVELENGTHS; ++w)
        r[w] = sample.reflectance(geometry, w);
    Coating c;
    c.base = Colour::screenColour(r);
    // The camera sets its exposure: a bright metallic near the gloss is not
    // burnt out to white, and the flakes keep room above the coating.
    const int peak = std::max({c.base.red(), c.base.green(), c.base.blue()});
    if (peak > 200)
        c.light = 200.0 / peak;
    const Finish& finish = Spectra::finish(sample.finish);
    if (finish.kind == Finish::Pearl && imageAngle != IMAGE_DIFFUSE) {
        // The interference colour: the coating's hue, cleaner and lighter,
        // strongest near the gloss.
        QColor tint = QColor::fromHsvF(c.base.hueF() < 0 ? 0.0 : c.base.hueF(),
                                       std::min(1.0, c.base.saturationF() * 1.6 + 0.15), 1.0);
        c.glintTint = tint;
        c.shimmer = 0.55 * std::exp(-std::fabs(kCameraAspecular[imageAngle]) / 50.0) + 0.12;
    }
    const float* t = sample.texture.size() >= (imageAngle + 1) * kTextureFigures
        ? sample.texture.constData() + imageAngle * kTextureFigures
        : nullptr;
    if (t) {
        const bool diffuse = imageAngle == IMAGE_DIFFUSE;
        c.grain = 0.015 + 0.012 * (diffuse ? t[0] : t[2]);
        c.sparkleDensity = diffuse ? 0.0 : t[6] * 0.25;
        c.sparkleIntensity = diffuse ? 0.0 : std::min(1.0, t[4] / 90.0);
    }
    c.seed = sample.seed * 31u + quint32(imageAngle) * 7919u + 1u;
    // The same spot of the coating at every size: scale the window, not the grain.
    return renderCoating(c, width, height, 0, 0);
}

namespace {
// How far the view wanders from its centre, in pixels.
const int kWanderX = 12;
const int kWanderY = 10;

// Marks on the panel that show which way the instrument is turned: a line
// of masking tape below the spot and the fine scratches of a sanding pass
// across it. The grain alone looks the same at every angle.
void markSurface(QByteArray& tile, int side, double light)
{
    uchar* p = reinterpret_cast<uchar*>(tile.data());
    const double c = side / 2.0;
    const double tapeFrom = c + 64.0, tapeTo = c + 96.0;
    for (int y = 0; y < side; ++y) {
        const double dy = y - c;
        for (int x = 0; x < side; ++x) {
            const double dx = x - c;
            uchar* px = p + (size_t(y) * side + x) * 3;
            if (y >= tapeFrom && y < tapeTo) {
                // Cream paper tape with a darker edge towards the spot.
                const double edge = y < tapeFrom + 3 ? 0.55 : 1.0;
                px[0] = clampByte(232.0 * light * edge);
                px[1] = clampByte(214.0 * light * edge);
                px[2] = clampByte(160.0 * light * edge);
                continue;
            }
            // Scratches run at 30 degrees to the tape, a few pixels apart.
            const double across = dx * 0.5 - dy * 0.8660254037844386;
            const double phase = std::fmod(std::fabs(across), 17.0);
            if (phase < 1.2) {
                for (int k = 0; k < 3; ++k)
                    px[k] = clampByte(px[k] * 1.10 + 6.0 * light);
            }
        }
    }
}
} // namespace

QByteArray LiveView::frame(const QString& panelSpec, int switchesDown, qint64 timeMs, int width, int height,
                           int rotationDegrees)
{
    width = std::min(std::max(1, width), kMaxWidth);
    height = std::min(std::max(1, height), kMaxHeight);
    switchesDown = std::max(0, std::min(3, switchesDown));
    const QString key = QStringLiteral("%1|%2|%3x%4").arg(panelSpec).arg(switchesDown).arg(width).arg(height);
    if (key != m_key) {
        double r[NUM_WAVELENGTHS];
        Spectra::reflectance(panelSpec, REFL_D45_45, r);
        const Finish& f = Spectra::finish(panelSpec);
        Coating c;
        c.base = Colour::screenColour(r);
        c.grain = 0.02 + 0.01 * f.coarseness;
        c.sparkleDensity = f.sparkle * 2.5;
        c.sparkleIntensity = f.sparkle * 0.8;
        c.seed = qHash(panelSpec) | 1u;
        // On the surface the aperture is lit by the instrument's own lamp;
        // partly lifted, light leaks in from the side; lifted, the view goes dark.
        c.light = switchesDown == 3 ? 1.0 : 0.12 + 0.18 * switchesDown;
        if (switchesDown < 3)
            c.sparkleIntensity *= 0.3;
        // Square and wide enough for the view turned to any angle and
        // wandering to its limits.
        const int diagonal = int(std::ceil(std::sqrt(double(width) * width + double(height) * height)));
        m_tileWidth = m_tileHeight = diagonal + 2 * std::max(kWanderX, kWanderY) + 4;
        m_tile = renderCoating(c, m_tileWidth, m_tileHeight, 0, 0);
        markSurface(m_tile, m_tileWidth, c.light);
        m_key = key;
    }
    const double t = timeMs / 1000.0;
    const double wanderX = 8.0 * std::sin(0.9 * t) + 3.0 * std::sin(3.7 * t);
    const double wanderY = 6.0 * std::cos(0.7 * t) + 3.0 * std::sin(4.3 * t);
    QByteArray out(width * height * 3, Qt::Uninitialized);
    uchar* dst = reinterpret_cast<uchar*>(out.data());
    const uchar* src = reinterpret_cast<const uchar*>(m_tile.constData());

    // The instrument turned clockwise sees the surface turned the other way.
    const int degrees = ((rotationDegrees % 360) + 360) % 360;
    const double rad = -degrees * M_PI / 180.0;
    const double cosA = std::cos(rad), sinA = std::sin(rad);
    const double centreX = m_tileWidth / 2.0 + wanderX, centreY = m_tileHeight / 2.0 + wanderY;
    if (degrees == 0) {
        const int x0 = std::max(0, std::min(int(std::lround(centreX - width / 2.0)), m_tileWidth - width));
        const int y0 = std::max(0, std::min(int(std::lround(centreY - height / 2.0)), m_tileHeight - height));
        for (int y = 0; y < height; ++y)
            memcpy(dst + size_t(y) * width * 3, src + (size_t(y0 + y) * m_tileWidth + x0) * 3, size_t(width) * 3);
        return out;
    }
    // Nearest pixel, walked in 16.16 fixed point along each row.
    const qint64 one = 1 << 16;
    const qint64 stepX = qint64(std::lround(cosA * one)), stepY = qint64(std::lround(sinA * one));
    const qint64 maxX = qint64(m_tileWidth - 1) * one, maxY = qint64(m_tileHeight - 1) * one;
    for (int y = 0; y < height; ++y) {
        const double vy = y - height / 2.0;
        const double vx = -width / 2.0;
        qint64 sx = qint64(std::lround((centreX + vx * cosA - vy * sinA) * one));
        qint64 sy = qint64(std::lround((centreY + vx * sinA + vy * cosA) * one));
        uchar* row = dst + size_t(y) * width * 3;
        for (int x = 0; x < width; ++x, sx += stepX, sy += stepY) {
            const qint64 cx = std::max<qint64>(0, std::min(sx, maxX)) >> 16;
            const qint64 cy = std::max<qint64>(0, std::min(sy, maxY)) >> 16;
            const uchar* s = src + (size_t(cy) * m_tileWidth + size_t(cx)) * 3;
            row[0] = s[0];
            row[1] = s[1];
            row[2] = s[2];
            row += 3;
        }
    }
    return out;
}

} // namespace Images
} // namespace Sim
