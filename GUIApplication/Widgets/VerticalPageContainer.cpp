#include "Widgets/VerticalPageContainer.h"

#include <QMouseEvent>

#include <cstdlib>

VerticalPageContainer::VerticalPageContainer(QWidget* parent)
    : PageContainer(parent)
{
}

QRect VerticalPageContainer::determinePagePosition(int index)
{
    const QRect page = pageAt(index)->geometry();
    return QRect(page.x(), height() * index, page.width(), page.height());
}

QRect VerticalPageContainer::determineSnapToPosition()
{
    return m_viewport->geometry().translated(0, distanceLeftToSlide());
}

void VerticalPageContainer::slidePages(int distance)
{
    if (distance == 0)
        return;
    m_propertyAnimation.stop();
    m_viewport->setGeometry(m_viewport->geometry().translated(0, distance));
}

int VerticalPageContainer::distanceLeftToSlide()
{
    const QRect page = translateGeometry(pageAt(m_currentPage)->geometry());
    return geometry().top() - page.top();
}

void VerticalPageContainer::updateViewportSize()
{
    if (m_widgetList.empty())
        return;
    const int span = m_widgetList.back()->geometry().bottom() - m_widgetList.front()->geometry().top();
    m_viewport->setGeometry(0, m_viewport->y(), m_viewport->width(), span);
}

QRect VerticalPageContainer::translateGeometry(QRect rect)
{
    return rect.translated(0, m_viewport->geometry().top());
}

void VerticalPageContainer::mouseMoveEvent(QMouseEvent* event)
{
    const int dx = event->pos().x() - m_previousMousePosition.x();
    int dy = event->pos().y() - m_previousMousePosition.y();

    if (std::abs(dy) > std::abs(dx) && std::abs(dy) >= m_minSlideDistance && !m_firstDirection) {
        m_hasFocus = true;
        m_firstDirection = true;
    }

    if (m_mousePressed && !m_widgetList.empty() && m_hasFocus) {
        const QRect container = geometry();
        const QRect view = m_viewport->geometry();
        if (view.bottom() + dy > container.bottom() && view.top() + dy < container.top()) {
            slidePages(dy);
            m_previousMousePosition = event->pos();
        } else if (view.bottom() + dy < container.bottom()) {
            dy = container.bottom() - view.bottom() - 1;
            slidePages(dy);
        } else if (view.top() + dy > container.top()) {
            dy = container.top() - view.top();
            slidePages(dy);
        }
    }

    if (!m_hasFocus)
        QWidget::mouseMoveEvent(event);
}

void VerticalPageContainer::mouseReleaseEvent(QMouseEvent* event)
{
    // With no pages there is nothing to snap to: the gesture just ends.
    const bool snap = m_hasFocus && !m_widgetList.empty();
    int target = m_currentPage;
    if (snap) {
        const QRect page = translateGeometry(pageAt(m_currentPage)->geometry());
        const QRect container = geometry();
        if (page.center().y() < container.top())
            target = m_currentPage + 1;
        else if (page.center().y() > container.bottom())
            target = m_currentPage - 1;
    }
    m_mousePressed = false;
    m_hasFocus = false;
    m_firstDirection = false;
    QWidget::mouseReleaseEvent(event);
    if (snap)
        onSelectPage(target);
}
