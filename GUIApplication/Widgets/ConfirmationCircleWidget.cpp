#include "Widgets/ConfirmationCircleWidget.h"

#include "ui_ConfirmationCircleWidget.h"

#include <QMouseEvent>
#include <QtMath>

ConfirmationCircleWidget::ConfirmationCircleWidget(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::ConfirmationCircleWidget)
{
    ui->setupUi(this);
    setObjectName(QStringLiteral("confirmationCircleWidget"));
    ui->backgroundCircle->setAttribute(Qt::WA_TransparentForMouseEvents);
    ui->draggingCircle->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_confirmationArea = ui->draggingCircle->geometry();
    // Moves count only while the dot is held; tracking lets every move in.
    setMouseTracking(true);
}

ConfirmationCircleWidget::~ConfirmationCircleWidget()
{
    delete ui;
}

int ConfirmationCircleWidget::confirmationAngle() const
{
    return ui->foregroundCircle->confirmationAngle();
}

QRect ConfirmationCircleWidget::dotGeometry() const
{
    return ui->draggingCircle->geometry();
}

QPoint ConfirmationCircleWidget::circleCentre() const
{
    return ui->backgroundCircle->geometry().center() + QPoint(1, 1);
}

int ConfirmationCircleWidget::calculateAngle(const QPointF& point) const
{
    const QPointF d = point - QPointF(circleCentre());
    // Clockwise from twelve o'clock; y grows downwards on the screen.
    double degrees = qRadiansToDegrees(qAtan2(d.x(), -d.y()));
    if (degrees < 0)
        degrees += 360.0;
    int angle = qRound(degrees);
    return angle >= 360 ? 0 : angle;
}

QPoint ConfirmationCircleWidget::trackPoint(int degrees) const
{
    const double radians = qDegreesToRadians(double(degrees));
    const QPointF centre(circleCentre());
    return QPointF(centre.x() + TrackRadius * qSin(radians), centre.y() - TrackRadius * qCos(radians)).toPoint();
}

void ConfirmationCircleWidget::moveDotTo(const QPointF& point, int angle)
{
    QRect dot = ui->draggingCircle->geometry();
    dot.moveCenter(point.toPoint());
    ui->draggingCircle->setGeometry(dot);
    ui->foregroundCircle->setConfirmationAngle(angle);
}

void ConfirmationCircleWidget::putDotHome(int pieAngle)
{
    ui->draggingCircle->setGeometry(m_confirmationArea);
    ui->foregroundCircle->setConfirmationAngle(pieAngle);
}

void ConfirmationCircleWidget::mousePressEvent(QMouseEvent* event)
{
    if (ui->draggingCircle->geometry().contains(event->pos())) {
        m_dragging = true;
        m_currentState = CONFIRMATION_STATE_STARTING;
    }
    event->accept();
}

void ConfirmationCircleWidget::mouseMoveEvent(QMouseEvent* event)
{
    event->accept();
    if (!m_dragging)
        return;
    const QPointF centre(circleCentre());
    const QPointF d = QPointF(event->pos()) - centre;
    const double r = qSqrt(d.x() * d.x() + d.y() * d.y());
    // Off the ring the dot waits for the finger to come back.
    if (r < InnerRadius || r > OuterRadius)
        return;
    const QPointF onTrack = centre + d * (TrackRadius / r);
    const int angle = calculateAngle(onTrack);

    switch (m_currentState) {
    case CONFIRMATION_STATE_STARTING:
        if (angle <= 89) {
            moveDotTo(onTrack, angle);
        } else if (angle <= 270) {
            moveDotTo(onTrack, angle);
            m_currentState = CONFIRMATION_STATE_CONTEMPLATING;
        }
        // Above 270: backwards over the top, which starts nothing.
        break;
    case CONFIRMATION_STATE_CONTEMPLATING:
        moveDotTo(onTrack, angle);
        if (angle >= 270)
            m_currentState = CONFIRMATION_STATE_DECIDED;
        else if (angle <= 90)
            m_currentState = CONFIRMATION_STATE_STARTING;
        break;
    case CONFIRMATION_STATE_DECIDED:
        if (angle >= 91 && angle <= 269) {
            m_currentState = CONFIRMATION_STATE_CONTEMPLATING;
            moveDotTo(onTrack, angle);
        } else if (angle <= 90 || angle == 270) {
            // Past the top: the circle is complete.
            putDotHome(360);
        } else {
            moveDotTo(onTrack, angle);
        }
        break;
    default:
        break;
    }
}

void ConfirmationCircleWidget::mouseReleaseEvent(QMouseEvent* event)
{
    event->accept();
    const bool decided = m_dragging && m_currentState == CONFIRMATION_STATE_DECIDED
        && ui->draggingCircle->geometry().intersects(m_confirmationArea);
    m_dragging = false;
    m_currentState = CONFIRMATION_STATE_IDLE;
    if (decided) {
        putDotHome(360);
        emit confirmed();
    } else {
        putDotHome(0);
    }
}
