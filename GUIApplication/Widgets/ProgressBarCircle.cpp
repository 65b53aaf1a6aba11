#include "Widgets/ProgressBarCircle.h"

#include "ui_ProgressBarCircle.h"

#include <QPixmap>
#include <QResizeEvent>

#include <cmath>

namespace {
// Inner diameter of the ring pictures relative to their width (140 of 190).
const double kInnerDiameterRatio = 0.7368421052631579;
}

ProgressBarCircle::ProgressBarCircle(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::ProgressBarCircle)
{
    ui->setupUi(this);
    setAttribute(Qt::WA_TranslucentBackground);
    ui->painter->setBrushImage(QStringLiteral(":/Assets/measuring_green_circle.png"));
    ui->painter->setAngle(0);
}

ProgressBarCircle::~ProgressBarCircle()
{
    delete ui;
}

void ProgressBarCircle::setBackgroundImage(const QString& file)
{
    ui->labelBackground->setPixmap(QPixmap(file));
}

void ProgressBarCircle::setBackgroundHighlightImage(const QString& file)
{
    ui->labelBackgroundHighlight->setPixmap(QPixmap(file));
}

void ProgressBarCircle::setForegroundImage(const QString& file)
{
    ui->painter->setBrushImage(file);
}

void ProgressBarCircle::setRange(int min, int max)
{
    m_min = min;
    m_max = max;
}

void ProgressBarCircle::setMinimum(int min)
{
    m_min = min;
}

void ProgressBarCircle::setMaximum(int max)
{
    m_max = max;
}

int ProgressBarCircle::getCircleInnerDiameterInPixels() const
{
    return int(std::lround(width() * kInnerDiameterRatio));
}

int ProgressBarCircle::sweepAngle() const
{
    return ui->painter->spanAngle() / -16;
}

QString ProgressBarCircle::foregroundImage() const
{
    return ui->painter->brushImage();
}

void ProgressBarCircle::setValue(int value)
{
    m_val = value;
    // An empty range has no proportion to show: leave the sweep where it is
    // rather than divide by zero.
    if (m_max != m_min) {
        double angle = (double(value - m_min) * 360.0) / double(m_max - m_min);
        // The painter clamps to 0..360; keep far-out values inside int first.
        if (angle > 361.0)
            angle = 361.0;
        if (angle < -1.0)
            angle = -1.0;
        ui->painter->setAngle(int(angle));
    }
    emit valueChanged(value);
}

void ProgressBarCircle::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    const QRect all(QPoint(0, 0), event->size());
    ui->labelBackground->setGeometry(all);
    ui->painter->setGeometry(all);
    ui->labelBackgroundHighlight->setGeometry(all);
}
