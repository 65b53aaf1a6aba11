#include "Widgets/BusySpinner.h"

#include "Widgets/Theme.h"

#include <QPainter>

namespace {
const int kFrameMs = 50;
const int kStepDegrees = 18;
} // namespace

BusySpinner::BusySpinner(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_TranslucentBackground);
    m_timer.setInterval(kFrameMs);
    connect(&m_timer, &QTimer::timeout, this, [this] {
        m_angle = (m_angle - kStepDegrees + 360) % 360;
        update();
    });
}

void BusySpinner::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const int side = qMin(width(), height());
    const int pen = qMax(3, side / 9);
    const QRectF ring((width() - side) / 2.0 + pen / 2.0, (height() - side) / 2.0 + pen / 2.0,
                      side - pen, side - pen);
    painter.setPen(QPen(Theme::Separator, pen));
    painter.drawEllipse(ring);
    QPen arc(Theme::Accent, pen);
    arc.setCapStyle(Qt::RoundCap);
    painter.setPen(arc);
    painter.drawArc(ring, m_angle * 16, 100 * 16);
}

void BusySpinner::showEvent(QShowEvent* event)
{
    QWidget::showEvent(event);
    m_timer.start();
}

void BusySpinner::hideEvent(QHideEvent* event)
{
    QWidget::hideEvent(event);
    m_timer.stop();
}
