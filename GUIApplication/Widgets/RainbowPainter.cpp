#include "Widgets/RainbowPainter.h"

#include <QGradient>
#include <QPainter>
#include <QPainterPath>

RainbowPainter::RainbowPainter(QWidget* parent)
    : QWidget(parent)
{
    setDefaults();
}

RainbowPainter::RainbowPainter(QRect geometry, QWidget* parent)
    : QWidget(parent)
{
    setDefaults();
    setGeometry(geometry);
}

void RainbowPainter::setDefaults()
{
    setBackgroundRole(QPalette::Base);
    setAutoFillBackground(true);
    // The rings overlap each other's boxes and lie on the scale picture: the
    // box itself must not hide what is under it.
    QPalette p = palette();
    p.setBrush(QPalette::Base, Qt::transparent);
    setPalette(p);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    m_thickness = 22;
    m_pen = QPen(Qt::NoPen);
    m_brush = QBrush();
}

void RainbowPainter::setRainbowThickness(int thickness)
{
    m_thickness = thickness;
    update();
}

void RainbowPainter::setBrush(const QBrush& brush)
{
    m_brush = brush;
    update();
}

void RainbowPainter::setGradient(const QGradient& gradient)
{
    setBrush(QBrush(gradient));
}

void RainbowPainter::setPen(const QPen& pen)
{
    m_pen = pen;
    update();
}

void RainbowPainter::setPen(Qt::PenStyle style)
{
    m_pen.setStyle(style);
    update();
}

void RainbowPainter::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setPen(m_pen);
    painter.setBrush(m_brush);
    painter.setRenderHint(QPainter::Antialiasing);

    const qreal s = qMax(width(), height());
    const qreal p = m_pen.widthF();
    const qreal t = m_thickness;
    // Two upper half discs wound the same way; simplified, the smaller cuts
    // itself out of the larger and leaves the half ring.
    QPainterPath path(QPointF(s / 2, s / 2));
    path.arcTo(QRectF(p, 0, s, s - p), 180, -180);
    path.closeSubpath();
    path.arcTo(QRectF(t, t, s - 2 * t, s - 2 * t), 180, -180);
    path.closeSubpath();
    painter.drawPath(path.simplified());
}
