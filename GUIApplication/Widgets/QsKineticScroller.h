#ifndef QSKINETICSCROLLER_H
#define QSKINETICSCROLLER_H

#include <QObject>
#include <QPoint>

class QAbstractScrollArea;
class QEvent;
class QsKineticScrollerImpl;

// Makes a scroll area follow the finger and glide after a flick. It filters
// the area's mouse events: a press is always swallowed, the first two moves
// are absorbed, the third starts a drag, and a release without a drag is
// given back to the widget as a fresh press and release so that a tap still
// acts. A glide loses one pixel per 5 ms tick of its speed, which is capped
// at 30 pixels per tick when the finger leaves.
class QsKineticScroller : public QObject
{
    Q_OBJECT
public:
    static const int gMaxIgnoredMouseMoves = 2;
    static const int gTimerInterval = 5;
    static constexpr int gMaxDecelerationSpeed = 30;
    static const int gFriction = 1;

    explicit QsKineticScroller(QObject* parent = nullptr, Qt::Orientation orientation = Qt::Vertical);
    ~QsKineticScroller() override;

    void enableKineticScrollFor(QAbstractScrollArea* scrollArea);
    void setOrientation(Qt::Orientation orientation);
    Qt::Orientation orientation() const { return m_orientation; }

    // Introspection of the state machine, for the owner and for tests.
    bool isPressed() const;
    bool isMoving() const;
    int velocity() const;
    bool isTimerActive() const;

    bool eventFilter(QObject* object, QEvent* event) override;

public slots:
    void onKineticTimerElapsed();

private:
    void stopMotion();
    int scrollValue() const;
    void setScrollValue(int value);
    int along(const QPoint& point) const;

    QsKineticScrollerImpl* d;
    Qt::Orientation m_orientation;
};

#endif // QSKINETICSCROLLER_H
