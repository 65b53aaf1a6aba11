#ifndef CONFIRMATIONCIRCLECONFIRMPAINTER_H
#define CONFIRMATIONCIRCLECONFIRMPAINTER_H

#include <QPixmap>
#include <QWidget>

// The done part of the confirmation ring: a pie of the blue ring, clockwise
// from twelve o'clock, over the grey one.
class ConfirmationCircleConfirmPainter : public QWidget
{
    Q_OBJECT
public:
    explicit ConfirmationCircleConfirmPainter(QWidget* parent = nullptr);
    int confirmationAngle() const { return m_angle; }

public slots:
    // 0 to 360 degrees; values outside are clamped.
    void setConfirmationAngle(int degrees);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_blue;
    int m_angle = 0;
};

#endif // CONFIRMATIONCIRCLECONFIRMPAINTER_H
