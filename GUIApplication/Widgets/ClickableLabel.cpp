#include "Widgets/ClickableLabel.h"

#include <QMouseEvent>

ClickableLabel::ClickableLabel(QWidget* parent)
    : KLabel(parent)
{
}

QRect ClickableLabel::globalRect() const
{
    return QRect(mapToGlobal(rect().topLeft()), mapToGlobal(rect().bottomRight()));
}

void ClickableLabel::mousePressEvent(QMouseEvent* event)
{
    m_pressedBox = globalRect();
    KLabel::mousePressEvent(event);
}

void ClickableLabel::mouseReleaseEvent(QMouseEvent* event)
{
    if (event->button() == Qt::LeftButton) {
        const QRect now = globalRect();
        if (now.intersects(m_pressedBox) && rect().contains(event->pos()))
            emit clicked();
        m_pressedBox = QRect(0, 0, 0, 0);
        KLabel::mouseReleaseEvent(event);
        return;
    }
    m_pressedBox = QRect(0, 0, 0, 0);
}
