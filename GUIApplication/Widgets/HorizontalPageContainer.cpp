#include "Widgets/HorizontalPageContainer.h"

#include <QMouseEvent>

#include <cstdlib>

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
    int dx = event->pos().x() - m_previousMousePosition.x();
    const int dy = event->pos().y() - m_previousMousePosition.y();

    if (std::abs(dx) > std::abs(dy) && std::abs(dx) >= m_minSlideDistance && !m_firstDirection) {
        m_hasFocus = true;
        m_firstDirection = true;
    }

    if (m_mousePressed && !m_widgetList.empty() && m_hasFocus) {
        const int margin = (width() - m_widgetList.front()->width()) / 2;
        const QRect container = geometry();
        const QRect view = m_viewport->geometry();
        if (view.right() - margin + dx > container.right()
            && view.left() - margin + dx < container.left()) {
            slidePages(dx);
            m_previousMousePosition = event->pos();
        } else if (view.right() - margin + dx < container.right()) {
            dx = container.right() - view.right() - 1 - margin;
            slidePages(dx);
        } else if (view.left() - margin + dx > container.left()) {
            dx = container.left() - view.left() + margin;
            slidePages(dx);
        }
    }

    if (!m_hasFocus)
        QWidget::mouseMoveEvent(event);
}

void HorizontalPageContainer::mouseReleaseEvent(QMouseEvent* event)
{
    // With no pages there is nothing to snap to: the gesture just ends.
    const bool snap = m_hasFocus && !m_widgetList.empty();
    int target = m_currentPage;
    if (snap) {
        const QRect page = translateGeometry(pageAt(m_currentPage)->geometry());
        const QRect container = geometry();
        if (page.center().x() < container.left())
            target = m_currentPage + 1;
        else if (page.center().x() > container.right())
            target = m_currentPage - 1;
    }
    m_mousePressed = false;
    m_hasFocus = false;
    m_firstDirection = false;
    QWidget::mouseReleaseEvent(event);
    if (snap)
        onSelectPage(target);
}
