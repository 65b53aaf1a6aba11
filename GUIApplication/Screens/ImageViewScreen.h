#ifndef IMAGEVIEWSCREEN_H
#define IMAGEVIEWSCREEN_H

#include "Screens/DaddyPanel.h"

#include <vector>

class HorizontalPageContainer;
class QLabel;

namespace Ui {
class ImageViewScreen;
}

// The camera pictures of the active sample, one per page, opened on the
// picture the operator touched.
class ImageViewScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit ImageViewScreen(QWidget* parent = nullptr);
    ~ImageViewScreen() override;

    HorizontalPageContainer* imageViewPage() const;
    const std::vector<QLabel*>& pageDots() const { return m_pageDots; }

public slots:
    virtual void drawDots();
    virtual void removeAllDots();
    virtual void removeDot(int index);
    void onPageChanged(int page);
    void onCloseScreen();
    void on_BtnZoomOut_clicked();
    void on_BtnPageLeft_clicked();
    void on_BtnPageRight_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    void createScreen();

    Ui::ImageViewScreen* ui;
    std::vector<QLabel*> m_pageDots;
};

#endif // IMAGEVIEWSCREEN_H
