#ifndef PAGECONTAINER_H
#define PAGECONTAINER_H

#include "Screens/MarigoldPanel.h"

#include <QEasingCurve>
#include <QPoint>
#include <QPropertyAnimation>
#include <QRect>
#include <QWidget>

#include <vector>

// Holder of pages that the finger swipes through one at a time. The pages
// sit side by side on a viewport widget that follows the finger and then
// slides to the nearest page boundary. The direction is supplied by the
// horizontal and vertical subclasses.
//
// Page indices out of range are a caller's fault and throw the unsigned
// value 2, as the link layer does with its status codes.
class PageContainer : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit PageContainer(QWidget* parent = nullptr);
    ~PageContainer() override;

    int getNumberOfPages() const;
    int getCurrentPage() const;

public slots:
    virtual void appendPage(QWidget* page);
    virtual void prependPage(QWidget* page);
    virtual void insertPage(QWidget* page, int index);
    virtual void removePage(int index);
    virtual void removeAllPages();
    virtual void updateAllPagePosition();
    virtual void updatePagePosition(int index);
    virtual void updatePage();
    virtual void smoothSlideToSnap();
    virtual QRect determinePagePosition(int index) = 0;
    virtual QRect determineSnapToPosition() = 0;
    virtual void slidePages(int distance) = 0;
    virtual int distanceLeftToSlide() = 0;
    virtual void updateViewportSize() = 0;
    virtual QRect translateGeometry(QRect rect) = 0;
    virtual void onSelectPage(int index);
    virtual void onGotoRightPage();
    virtual void onGotoLeftPage();

signals:
    void changedPages(int index);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

    // The gesture, written once for both directions: the horizontal
    // container reads x and centres pages narrower than itself, the
    // vertical one reads y.
    void moveGesture(QMouseEvent* event, Qt::Orientation direction);
    void releaseGesture(QMouseEvent* event, Qt::Orientation direction);

    // Throws 2 unless 0 <= index < count (or <= count when allowEnd).
    void checkIndex(int index, bool allowEnd = false) const;
    QWidget* pageAt(int index) const;
    QWidget* viewport() const { return m_viewport; }

    int m_currentPage = 0;
    std::vector<QWidget*> m_widgetList;
    bool m_mousePressed = false;
    QPoint m_previousMousePosition;
    bool m_hasFocus = false;
    bool m_firstDirection = false;
    int m_slideTimeMs = 250;
    int m_slideRefreshRate = 5;
    int m_minSlideDistance = 15;
    QEasingCurve m_easingCurve;
    QPropertyAnimation m_propertyAnimation;
    QWidget* m_viewport;
};

#endif // PAGECONTAINER_H
