#ifndef VERTICALPAGECONTAINER_H
#define VERTICALPAGECONTAINER_H

#include "Widgets/PageContainer.h"

// Pages stacked one above the other, swiped up and down, each one a
// container's height further down.
class VerticalPageContainer : public PageContainer
{
    Q_OBJECT
public:
    explicit VerticalPageContainer(QWidget* parent = nullptr);

public slots:
    QRect determinePagePosition(int index) override;
    QRect determineSnapToPosition() override;
    void slidePages(int distance) override;
    int distanceLeftToSlide() override;
    void updateViewportSize() override;
    QRect translateGeometry(QRect rect) override;

protected:
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
};

#endif // VERTICALPAGECONTAINER_H
