#ifndef BOTTOMDOTSPAGECONTAINER_H
#define BOTTOMDOTSPAGECONTAINER_H

#include "Widgets/HorizontalPageContainer.h"

#include <QLabel>

#include <vector>

namespace Ui {
class BottomDotsPageContainer;
}

// Horizontal pages with a row of dots on a bar at the bottom, the dot of
// the page in view filled.
class BottomDotsPageContainer : public HorizontalPageContainer
{
    Q_OBJECT
public:
    explicit BottomDotsPageContainer(QWidget* parent = nullptr);
    ~BottomDotsPageContainer() override;

    const std::vector<QLabel*>& pageDots() const { return m_pageDots; }
    QLabel* pageBar() const;

public slots:
    void appendPage(QWidget* page) override;
    void prependPage(QWidget* page) override;
    void insertPage(QWidget* page, int index) override;
    void updatePage() override;
    virtual void drawDots();
    virtual void removeAllDots();
    virtual void removeDot(int index);

private:
    Ui::BottomDotsPageContainer* ui;
    std::vector<QLabel*> m_pageDots;
};

#endif // BOTTOMDOTSPAGECONTAINER_H
