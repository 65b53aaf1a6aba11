#include "Widgets/QsKineticScroller.h"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QComboBox>
#include <QCursor>
#include <QDebug>
#include <QLineEdit>
#include <QList>
#include <QMouseEvent>
#include <QScrollBar>
#include <QTextEdit>
#include <QTimer>

#include <algorithm>
#include <cstdlib>

// The scroller's chatter is for bench work only; it costs nothing otherwise.
#define SCROLL_DEBUG \
    if (true) {      \
    } else           \
        qDebug

class QsKineticScrollerImpl
{
public:
    QAbstractScrollArea* scrollArea = nullptr;
    bool isPressed = false;
    bool isMoving = false;
    QPoint lastPressPoint;
    int lastMouseYPos = 0;
    int lastMouseXPos = 0;
    int lastScrollBarPosition = 0;
    int velocity = 0;
    int ignoredMouseMoves = 0;
    QTimer kineticTimer;
    QList<QEvent*> ignoreList;
};

namespace {

// What the filter watches inside an area besides the area and its viewport.
template <class F>
void forEachWatched(QAbstractScrollArea* area, F f)
{
    for (QLineEdit* edit : area->findChildren<QLineEdit*>())
        f(edit);
    for (QTextEdit* text : area->findChildren<QTextEdit*>())
        f(text->viewport());
    for (QComboBox* combo : area->viewport()->findChildren<QComboBox*>())
        f(combo);
    f(area->viewport());
    f(area);
}

} // namespace

QsKineticScroller::QsKineticScroller(QObject* parent, Qt::Orientation orientation)
    : QObject(parent)
    , d(new QsKineticScrollerImpl)
    , m_orientation(orientation)
{
    connect(&d->kineticTimer, &QTimer::timeout, this, &QsKineticScroller::onKineticTimerElapsed);
}

QsKineticScroller::~QsKineticScroller()
{
    d->kineticTimer.stop();
    delete d;
}

void QsKineticScroller::enableKineticScrollFor(QAbstractScrollArea* scrollArea)
{
    Q_ASSERT_X(scrollArea != nullptr, "kinetic scroller", "missing scroll area");
    if (!scrollArea)
        return;

    if (d->scrollArea) {
        forEachWatched(d->scrollArea, [this](QObject* o) { o->removeEventFilter(this); });
        d->scrollArea = nullptr;
    }

    d->scrollArea = scrollArea;
    forEachWatched(scrollArea, [this](QObject* o) { o->installEventFilter(this); });
}

void QsKineticScroller::setOrientation(Qt::Orientation orientation)
{
    m_orientation = orientation;
}

bool QsKineticScroller::isPressed() const { return d->isPressed; }
bool QsKineticScroller::isMoving() const { return d->isMoving; }
int QsKineticScroller::velocity() const { return d->velocity; }
bool QsKineticScroller::isTimerActive() const { return d->kineticTimer.isActive(); }

int QsKineticScroller::along(const QPoint& point) const
{
    return m_orientation == Qt::Vertical ? point.y() : point.x();
}

int QsKineticScroller::scrollValue() const
{
    if (!d->scrollArea)
        return 0;
    return m_orientation == Qt::Vertical ? d->scrollArea->verticalScrollBar()->value()
                                         : d->scrollArea->horizontalScrollBar()->value();
}

void QsKineticScroller::setScrollValue(int value)
{
    if (!d->scrollArea)
        return;
    if (m_orientation == Qt::Vertical)
        d->scrollArea->verticalScrollBar()->setValue(value);
    else
        d->scrollArea->horizontalScrollBar()->setValue(value);
}

void QsKineticScroller::stopMotion()
{
    d->isMoving = false;
    d->velocity = 0;
    d->kineticTimer.stop();
}

bool QsKineticScroller::eventFilter(QObject* object, QEvent* event)
{
    const QEvent::Type type = event->type();
    const bool isMouse = type == QEvent::MouseButtonPress || type == QEvent::MouseButtonRelease
        || type == QEvent::MouseMove;
    if (!isMouse || !d->scrollArea)
        return false;

    // Our own reposted tap goes through, once.
    if (type != QEvent::MouseMove && d->ignoreList.removeOne(event))
        return false;

    auto* mouse = static_cast<QMouseEvent*>(event);
    switch (type) {
    case QEvent::MouseButtonPress:
        SCROLL_DEBUG() << "[scroll] press pos" << mouse->globalPos();
        d->isPressed = true;
        d->lastPressPoint = mouse->globalPos();
        d->lastScrollBarPosition = scrollValue();
        // A touch stops a glide and selects nothing.
        if (d->isMoving)
            stopMotion();
        break;

    case QEvent::MouseMove:
        SCROLL_DEBUG() << "[scroll] move pos" << mouse->globalPos();
        if (!d->isMoving) {
            if (d->ignoredMouseMoves < gMaxIgnoredMouseMoves) {
                ++d->ignoredMouseMoves;
            } else {
                d->ignoredMouseMoves = 0;
                d->isMoving = true;
                if (m_orientation == Qt::Vertical)
                    d->lastMouseYPos = mouse->globalPos().y();
                else
                    d->lastMouseXPos = mouse->globalPos().x();
                if (!d->kineticTimer.isActive())
                    d->kineticTimer.start(gTimerInterval);
            }
        } else {
            // Measured from the press, so the absorbed moves are caught up.
            const int distance = along(mouse->globalPos()) - along(d->lastPressPoint);
            SCROLL_DEBUG() << "[scroll] manual scroll to" << d->lastScrollBarPosition - distance;
            setScrollValue(d->lastScrollBarPosition - distance);
        }
        break;

    case QEvent::MouseButtonRelease: {
        SCROLL_DEBUG() << "[scroll] release pos" << mouse->globalPos();
        d->isPressed = false;
        d->ignoredMouseMoves = 0;

        const bool isEdit = qobject_cast<QLineEdit*>(object)
            || (object->parent() && qobject_cast<QTextEdit*>(object->parent()));
        const bool isCombo = qobject_cast<QComboBox*>(object) != nullptr;
        const bool isViewport = object == d->scrollArea->viewport();

        if (!d->isMoving && (isViewport || isEdit || isCombo)) {
            auto* press = new QMouseEvent(QEvent::MouseButtonPress, mouse->pos(), Qt::LeftButton,
                                          Qt::LeftButton, Qt::NoModifier);
            auto* release = new QMouseEvent(QEvent::MouseButtonRelease, mouse->pos(), Qt::LeftButton,
                                            Qt::NoButton, Qt::NoModifier);
            d->ignoreList << press << release;
            QApplication::postEvent(object, press);
            QApplication::postEvent(object, release);
            if (isEdit) {
                SCROLL_DEBUG() << "[scroll] trying to open keyboard";
                QApplication::postEvent(object, new QEvent(QEvent::RequestSoftwareInputPanel));
            }
        }
        break;
    }

    default:
        break;
    }
    return true;
}

void QsKineticScroller::onKineticTimerElapsed()
{
    if (d->isPressed && d->isMoving) {
        // The speed of the finger over the last tick.
        const QPoint cursor = QCursor::pos();
        if (m_orientation == Qt::Vertical) {
            SCROLL_DEBUG() << "[scroll] cursor Y pos" << cursor.y();
            d->velocity = cursor.y() - d->lastMouseYPos;
            d->lastMouseYPos = cursor.y();
        } else {
            SCROLL_DEBUG() << "[scroll] cursor X pos" << cursor.x();
            d->velocity = cursor.x() - d->lastMouseXPos;
            d->lastMouseXPos = cursor.x();
        }
    } else if (!d->isPressed && d->isMoving) {
        d->velocity = std::clamp(d->velocity, -gMaxDecelerationSpeed, gMaxDecelerationSpeed);
        if (d->velocity > 0)
            d->velocity -= gFriction;
        else if (d->velocity < 0)
            d->velocity += gFriction;
        const int velocity = d->velocity;
        if (std::abs(d->velocity) < std::abs(gFriction))
            stopMotion();
        SCROLL_DEBUG() << "[scroll] kinetic scroll to" << scrollValue() - velocity << "with velocity"
                       << velocity;
        setScrollValue(scrollValue() - velocity);
    } else {
        stopMotion();
    }
}
