#include "Widgets/PageContainer.h"

#include <QMouseEvent>
#include <QResizeEvent>

namespace {
const unsigned int kBadPageIndex = 2; // STATUS_BAD_RESPONSE_STATUS
}

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
