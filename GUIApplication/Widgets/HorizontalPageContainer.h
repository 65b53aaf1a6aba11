#ifndef HORIZONTALPAGECONTAINER_H
#define HORIZONTALPAGECONTAINER_H

#include "Widgets/PageContainer.h"

// Pages side by side, swiped left and right. A page narrower than the
// container is centred in it.
class HorizontalPageContainer : public PageContainer
{
    Q_OBJECT
public:
    explicit HorizontalPageContainer(QWidget* parent = nullptr);

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

#endif // HORIZONTALPAGECONTAINER_H
