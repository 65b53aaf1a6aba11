#include "Widgets/ColorPatch.h"

#include <QStyle>

#include <algorithm>
#include <cmath>

ColorPatch::ColorPatch(QWidget* parent)
    : QLabel(parent)
{
}

void ColorPatch::setColor(const QColor& color)
{
    m_color = color;
    setStyleSheet(QStringLiteral("QLabel {background-color: rgba(%1, %2, %3, %4) }")
                      .arg(color.red())
                      .arg(color.green())
                      .arg(color.blue())
                      .arg(color.alpha()));
    style()->unpolish(this);
    style()->polish(this);
    update();
}

void ColorPatch::setColorRGB(quint8 red, quint8 green, quint8 blue, quint8 alpha)
{
    setColor(QColor(red, green, blue, alpha));
}

void ColorPatch::setColorCMYK(int cyan, int magenta, int yellow, int black, int alpha)
{
    auto clamp = [](int v) { return std::clamp(v, 0, 255); };
    setColor(QColor::fromCmyk(clamp(cyan), clamp(magenta), clamp(yellow), clamp(black), clamp(alpha)));
}

void ColorPatch::setColor(const double* rgb)
{
    if (!rgb)
        return;
    auto channel = [](double v) {
        if (!std::isfinite(v))
            return 0;
        return static_cast<int>(std::lround(std::clamp(v, 0.0, 255.0)));
    };
    setColor(QColor(channel(rgb[0]), channel(rgb[1]), channel(rgb[2])));
}

QColor ColorPatch::getColor() const
{
    return m_color;
}
