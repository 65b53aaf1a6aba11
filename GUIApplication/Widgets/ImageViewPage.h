#ifndef IMAGEVIEWPAGE_H
#define IMAGEVIEWPAGE_H

#include <QWidget>

namespace Ui {
class ImageViewPage;
}

// One camera picture of the active sample, full size, with its angle.
class ImageViewPage : public QWidget
{
    Q_OBJECT
public:
    explicit ImageViewPage(int angle, QWidget* parent = nullptr);
    ~ImageViewPage() override;

    int angle() const { return m_angle; }
    bool hasImage() const;
    QString angleText() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::ImageViewPage* ui;
    int m_angle;
};

#endif // IMAGEVIEWPAGE_H
