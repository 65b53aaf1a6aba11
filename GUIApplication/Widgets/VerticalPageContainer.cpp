#include "Widgets/VerticalPageContainer.h"

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
    moveGesture(event, Qt::Vertical);
}

void VerticalPageContainer::mouseReleaseEvent(QMouseEvent* event)
{
    releaseGesture(event, Qt::Vertical);
}
