#include "Widgets/PageContainer.h"

#include <QMouseEvent>
#include <QResizeEvent>

#include <cstdlib>

namespace {

const unsigned int kBadPageIndex = 2; // STATUS_BAD_RESPONSE_STATUS

int along(const QPoint& point, Qt::Orientation direction)
{
    return direction == Qt::Horizontal ? point.x() : point.y();
}

int across(const QPoint& point, Qt::Orientation direction)
{
    return direction == Qt::Horizontal ? point.y() : point.x();
}

// Left or top edge, and right or bottom edge (QRect's last pixel).
int nearEdge(const QRect& rect, Qt::Orientation direction)
{
    return direction == Qt::Horizontal ? rect.left() : rect.top();
}

int farEdge(const QRect& rect, Qt::Orientation direction)
{
    return direction == Qt::Horizontal ? rect.right() : rect.bottom();
}

} // namespace

PageContainer::PageContainer(QWidget* parent)
    : MarigoldPanel(parent)
    , m_easingCurve(QEasingCurve::InOutQuad)
    , m_viewport(new QWidget(this))
{
    m_propertyAnimation.setTargetObject(m_viewport);
    m_propertyAnimation.setPropertyName("geometry");
    m_viewport->setObjectName(QStringLiteral("viewport"));
    m_viewport->raise();
}

PageContainer::~PageContainer()
{
    // The viewport and with it the pages go with the widget tree; the
    // animation must not touch the viewport on the way.
    m_propertyAnimation.stop();
}

int PageContainer::getNumberOfPages() const
{
    return int(m_widgetList.size());
}

int PageContainer::getCurrentPage() const
{
    return m_currentPage;
}

void PageContainer::checkIndex(int index, bool allowEnd) const
{
    const int limit = getNumberOfPages() + (allowEnd ? 1 : 0);
    if (index < 0 || index >= limit)
        throw kBadPageIndex;
}

QWidget* PageContainer::pageAt(int index) const
{
    checkIndex(index);
    return m_widgetList[size_t(index)];
}

void PageContainer::appendPage(QWidget* page)
{
    insertPage(page, getNumberOfPages());
}

void PageContainer::prependPage(QWidget* page)
{
    insertPage(page, 0);
}

void PageContainer::insertPage(QWidget* page, int index)
{
    checkIndex(index, true);
    if (!m_widgetList.empty()) {
        // Put the pages where they belong before the row shifts under them.
        m_propertyAnimation.stop();
        m_viewport->setGeometry(determineSnapToPosition());
    }
    m_widgetList.insert(m_widgetList.begin() + index, page);
    page->setParent(m_viewport);
    page->raise();
    page->show();
    updatePage();
    updateAllPagePosition();
}

void PageContainer::removePage(int index)
{
    checkIndex(index);
    delete m_widgetList[size_t(index)];
    m_widgetList.erase(m_widgetList.begin() + index);
    updateAllPagePosition();
}

void PageContainer::removeAllPages()
{
    for (QWidget* page : m_widgetList)
        delete page;
    m_widgetList.clear();
}

void PageContainer::updateAllPagePosition()
{
    for (int i = 0; i < getNumberOfPages(); ++i)
        updatePagePosition(i);
    updateViewportSize();
}

void PageContainer::updatePagePosition(int index)
{
    QWidget* page = pageAt(index);
    page->setGeometry(determinePagePosition(index));
}

void PageContainer::updatePage()
{
    update();
}

void PageContainer::smoothSlideToSnap()
{
    const QRect target = determineSnapToPosition();
    if (target == m_viewport->geometry())
        return;
    m_propertyAnimation.setDuration(m_slideTimeMs);
    m_propertyAnimation.setStartValue(m_viewport->geometry());
    m_propertyAnimation.setEndValue(target);
    m_propertyAnimation.setEasingCurve(m_easingCurve);
    m_propertyAnimation.start();
}

void PageContainer::onSelectPage(int index)
{
    checkIndex(index);
    m_currentPage = index;
    smoothSlideToSnap();
    updatePage();
    emit changedPages(index);
}

void PageContainer::onGotoRightPage()
{
    int next = m_currentPage + 1;
    if (next >= getNumberOfPages())
        next = 0;
    onSelectPage(next);
}

void PageContainer::onGotoLeftPage()
{
    int previous = m_currentPage - 1;
    if (previous < 0)
        previous = getNumberOfPages() - 1;
    onSelectPage(previous);
}

void PageContainer::mousePressEvent(QMouseEvent* event)
{
    m_mousePressed = true;
    m_hasFocus = false;
    m_firstDirection = false;
    m_previousMousePosition = event->pos();
    // Left unaccepted: a scroll area on the page may want the gesture.
    QWidget::mousePressEvent(event);
}

void PageContainer::moveGesture(QMouseEvent* event, Qt::Orientation direction)
{
    int d = along(event->pos(), direction) - along(m_previousMousePosition, direction);
    const int other = across(event->pos(), direction) - across(m_previousMousePosition, direction);

    // The gesture is taken once it runs mainly along the direction and far
    // enough; until then nothing moves, and a scroll area on the page may
    // have the events.
    if (std::abs(d) > std::abs(other) && std::abs(d) >= m_minSlideDistance && !m_firstDirection) {
        m_hasFocus = true;
        m_firstDirection = true;
    }

    if (m_mousePressed && !m_widgetList.empty() && m_hasFocus) {
        const int margin = direction == Qt::Horizontal ? (width() - m_widgetList.front()->width()) / 2 : 0;
        const QRect container = geometry();
        const QRect view = m_viewport->geometry();
        const int viewNear = nearEdge(view, direction) - margin;
        const int viewFar = farEdge(view, direction) - margin;
        if (viewFar + d > farEdge(container, direction) && viewNear + d < nearEdge(container, direction)) {
            slidePages(d);
            m_previousMousePosition = event->pos();
        } else if (viewFar + d < farEdge(container, direction)) {
            // Past the last page: the far edges meet.
            slidePages(farEdge(container, direction) - farEdge(view, direction) - 1 - margin);
        } else if (viewNear + d > nearEdge(container, direction)) {
            // Before the first page: the near edges meet.
            slidePages(nearEdge(container, direction) - nearEdge(view, direction) + margin);
        }
    }

    if (!m_hasFocus)
        QWidget::mouseMoveEvent(event);
}

void PageContainer::releaseGesture(QMouseEvent* event, Qt::Orientation direction)
{
    // With no pages there is nothing to snap to: the gesture just ends.
    const bool snap = m_hasFocus && !m_widgetList.empty();
    int target = m_currentPage;
    if (snap) {
        // A page dragged by more than half its size gives way to its neighbour.
        const QRect page = translateGeometry(pageAt(m_currentPage)->geometry());
        const int centre = along(page.center(), direction);
        const QRect container = geometry();
        if (centre < nearEdge(container, direction))
            target = m_currentPage + 1;
        else if (centre > farEdge(container, direction))
            target = m_currentPage - 1;
    }
    m_mousePressed = false;
    m_hasFocus = false;
    m_firstDirection = false;
    QWidget::mouseReleaseEvent(event);
    // Last, so that an index past the end throws with the gesture ended.
    if (snap)
        onSelectPage(target);
}

void PageContainer::resizeEvent(QResizeEvent* event)
{
    MarigoldPanel::resizeEvent(event);
    m_propertyAnimation.stop();
    m_viewport->setGeometry(rect());
    updatePage();
    updateAllPagePosition();
    // Before the first page, or with the current page removed under it,
    // there is nothing to line up with.
    if (m_currentPage >= 0 && m_currentPage < getNumberOfPages())
        m_viewport->setGeometry(determineSnapToPosition());
}
