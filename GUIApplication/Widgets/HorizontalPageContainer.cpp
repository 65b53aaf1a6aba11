#include "Widgets/HorizontalPageContainer.h"

HorizontalPageContainer::HorizontalPageContainer(QWidget* parent)
    : PageContainer(parent)
{
}

QRect HorizontalPageContainer::determinePagePosition(int index)
{
    // Every page before this one is counted as wide as this one.
    const QRect page = pageAt(index)->geometry();
    return QRect(page.width() * index, 0, page.width(), page.height());
}

QRect HorizontalPageContainer::determineSnapToPosition()
{
    return m_viewport->geometry().translated(distanceLeftToSlide(), 0);
}

void HorizontalPageContainer::slidePages(int distance)
{
    if (distance == 0)
        return;
    m_propertyAnimation.stop();
    m_viewport->setGeometry(m_viewport->geometry().translated(distance, 0));
}

int HorizontalPageContainer::distanceLeftToSlide()
{
    const QRect page = translateGeometry(pageAt(m_currentPage)->geometry());
    return geometry().left() - page.left() + (width() - page.width()) / 2;
}

void HorizontalPageContainer::updateViewportSize()
{
    if (m_widgetList.empty())
        return;
    const int span = m_widgetList.back()->geometry().right() - m_widgetList.front()->geometry().left();
    m_viewport->setGeometry(m_viewport->x(), 0, span, m_viewport->height());
}

QRect HorizontalPageContainer::translateGeometry(QRect rect)
{
    return rect.translated(m_viewport->geometry().left(), 0);
}

void HorizontalPageContainer::mouseMoveEvent(QMouseEvent* event)
{
    moveGesture(event, Qt::Horizontal);
}

void HorizontalPageContainer::mouseReleaseEvent(QMouseEvent* event)
{
    releaseGesture(event, Qt::Horizontal);
}
