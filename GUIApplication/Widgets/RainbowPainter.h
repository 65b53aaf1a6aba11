#ifndef RAINBOWPAINTER_H
#define RAINBOWPAINTER_H

#include <QBrush>
#include <QPen>
#include <QRect>
#include <QWidget>

class QGradient;

// One half ring of the rainbow chart, filled with a brush (a conical
// gradient whose centre is the middle of the widget's lower edge).
class RainbowPainter : public QWidget
{
    Q_OBJECT
public:
    explicit RainbowPainter(QWidget* parent = nullptr);
    RainbowPainter(QRect geometry, QWidget* parent);

    void setRainbowThickness(int thickness);
    int rainbowThickness() const { return m_thickness; }
    void setBrush(const QBrush& brush);
    QBrush brush() const { return m_brush; }
    void setGradient(const QGradient& gradient);
    void setPen(const QPen& pen);
    void setPen(Qt::PenStyle style);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    void setDefaults();

    int m_thickness;
    QBrush m_brush;
    QPen m_pen;
};

#endif // RAINBOWPAINTER_H
