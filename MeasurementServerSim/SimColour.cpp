#include "SimColour.h"

#include "Utils/ColorMath.h"

#include <algorithm>
#include <cmath>

namespace Sim {
namespace Colour {

QVector<float> labch(const QVector<float>& refl, int numAngles)
{
    QVector<float> out(numAngles * 5, 0.0f);
    double r[NUM_WAVELENGTHS];
    for (int a = 0; a < numAngles; ++a) {
        if ((a + 1) * NUM_WAVELENGTHS > refl.size())
            break;
        for (int w = 0; w < NUM_WAVELENGTHS; ++w)
            r[w] = refl[a * NUM_WAVELENGTHS + w];
        CIELABCOORD lab{0.0, 0.0, 0.0};
        CIELCHCOORD lch{0.0, 0.0, 0.0};
        ColorMath_ReflToCIELAB(r, D65_10, &lab);
        ColorMath_ReflToCIELCH(r, D65_10, &lch);
        float* o = out.data() + a * 5;
        o[0] = float(lab.L);
        o[1] = float(lab.a);
        o[2] = float(lab.b);
        o[3] = float(lch.C);
        o[4] = float(lch.h);
    }
    return out;
}

double deltaE(const float* a, const float* b)
{
    const double dl = double(a[0]) - b[0], da = double(a[1]) - b[1], db = double(a[2]) - b[2];
    return std::sqrt(dl * dl + da * da + db * db);
}

double maxDeltaE(const QVector<float>& a, const QVector<float>& b)
{
    double worst = 0.0;
    const int n = std::min(a.size(), b.size()) / 5;
    for (int i = 0; i < n; ++i)
        worst = std::max(worst, deltaE(a.constData() + i * 5, b.constData() + i * 5));
    return worst;
}

QColor screenColour(const double refl[NUM_WAVELENGTHS])
{
    COLOR_REF c = 0;
    if (!ColorMath_ReflToRGB(refl, D65_10, &c))
        return QColor(128, 128, 128);
    return QColor(int(c & 0xff), int((c >> 8) & 0xff), int((c >> 16) & 0xff));
}

} // namespace Colour
} // namespace Sim
