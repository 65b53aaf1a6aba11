#include "Widgets/ProgressBarCirclePainter.h"

#include <QPainter>
#include <QPixmap>

namespace {
// drawPie counts in sixteenths of a degree from three o'clock, counter-clockwise.
const int kTwelveOClock = 90 * 16;
}

ProgressBarCirclePainter::ProgressBarCirclePainter(QWidget* parent)
    : QWidget(parent)
{
    setAttribute(Qt::WA_TranslucentBackground);
    setBrushImage(QStringLiteral(":/Assets/measuring_green_circle.png"));
}

void ProgressBarCirclePainter::setAngle(int angle)
{
    if (angle >= 361)
        angle = 360;
    if (angle < 0)
        angle = 0;
    m_spanAngle = angle * -16;
    update();
}

void ProgressBarCirclePainter::setBrushImage(const QString& file)
{
    m_currentBrushImage = file;
    QPixmap pixmap(file);
    if (!pixmap.isNull() && !size().isEmpty())
        pixmap = pixmap.scaled(size(), Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    brush = QBrush(pixmap);
    update();
}

void ProgressBarCirclePainter::paintEvent(QPaintEvent*)
{
    if (m_spanAngle == 0)
        return;
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(brush);
    painter.drawPie(rect(), kTwelveOClock, m_spanAngle);
}

void ProgressBarCirclePainter::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    setBrushImage(m_currentBrushImage);
}
