#ifndef CONFIRMATIONCIRCLEWIDGET_H
#define CONFIRMATIONCIRCLEWIDGET_H

#include <QRect>
#include <QWidget>

namespace Ui {
class ConfirmationCircleWidget;
}

typedef enum _CONFIRMATION_WIDGET_STATES_T {
    CONFIRMATION_STATE_IDLE = 0,
    CONFIRMATION_STATE_STARTING = 1,
    CONFIRMATION_STATE_CONTEMPLATING = 2,
    CONFIRMATION_STATE_DECIDED = 3
} CONFIRMATION_WIDGET_STATES_T;

// Confirms a destructive action by a gesture: the user drags the dot from
// the top once clockwise around the ring and lets go at the top. The dot
// must pass the bottom half and reach the last quarter, so a finger that
// jumps across the circle or goes backwards over the top decides nothing.
class ConfirmationCircleWidget : public QWidget
{
    Q_OBJECT
public:
    static const int InnerRadius = 42;
    static const int OuterRadius = 77;
    static const int TrackRadius = 59;

    explicit ConfirmationCircleWidget(QWidget* parent = nullptr);
    ~ConfirmationCircleWidget() override;

    CONFIRMATION_WIDGET_STATES_T state() const { return m_currentState; }
    bool isDragging() const { return m_dragging; }
    int confirmationAngle() const;
    QRect dotGeometry() const;
    QRect confirmationArea() const { return m_confirmationArea; }
    QPoint circleCentre() const;
    // The angle of a point, clockwise from the top, 0 to 359.
    int calculateAngle(const QPointF& point) const;
    // Where on the track a given angle lies, in widget coordinates.
    QPoint trackPoint(int degrees) const;

signals:
    void confirmed();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    void moveDotTo(const QPointF& point, int angle);
    void putDotHome(int pieAngle);

    Ui::ConfirmationCircleWidget* ui;
    bool m_dragging = false;
    QRect m_confirmationArea;
    CONFIRMATION_WIDGET_STATES_T m_currentState = CONFIRMATION_STATE_IDLE;
};

#endif // CONFIRMATIONCIRCLEWIDGET_H
