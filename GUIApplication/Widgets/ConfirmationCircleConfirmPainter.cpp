#include "Widgets/ConfirmationCircleConfirmPainter.h"

#include <QPainter>
#include <QPainterPath>

ConfirmationCircleConfirmPainter::ConfirmationCircleConfirmPainter(QWidget* parent)
    : QWidget(parent)
    , m_blue(QStringLiteral(":/Assets/confirm_blue_circle.png"))
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void ConfirmationCircleConfirmPainter::setConfirmationAngle(int degrees)
{
    const int angle = qBound(0, degrees, 360);
    if (angle == m_angle)
        return;
    m_angle = angle;
    update();
}

void ConfirmationCircleConfirmPainter::paintEvent(QPaintEvent*)
{
    if (m_angle <= 0 || m_blue.isNull())
        return;
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setRenderHint(QPainter::SmoothPixmapTransform);
    const QRectF area = rect();
    QPainterPath pie;
    pie.moveTo(area.center());
    // Qt counts angles anticlockwise from three o'clock.
    pie.arcTo(area.adjusted(-2, -2, 2, 2), 90.0, -double(m_angle));
    pie.closeSubpath();
    painter.setClipPath(pie);
    painter.drawPixmap(rect(), m_blue);
}
