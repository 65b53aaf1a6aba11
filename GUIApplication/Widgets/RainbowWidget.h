#ifndef RAINBOWWIDGET_H
#define RAINBOWWIDGET_H

#include <QConicalGradient>
#include <QRect>
#include <QWidget>

class QLabel;
class RainbowPainter;
class SampleColorStrip;

namespace Ui {
class RainbowWidget;
}

// How the colour of the active sample travels with the viewing angle: each
// measured colour sits on a half ring at its angle's tick of the scale
// behind, the ring filled by the gradient between them; the 15 degree ring
// of eleven-angle instruments lies inside the 45 degree one. The sample's
// colour strip runs underneath.
class RainbowWidget : public QWidget
{
    Q_OBJECT
public:
    explicit RainbowWidget(QWidget* parent = nullptr);
    ~RainbowWidget() override;

    // Where the scale pictures and the gradients meet: the common centre of
    // the rings and the angle (degrees, counter-clockwise from the right)
    // of a geometry's colour, or -1 when that ring doesn't show it.
    static QPoint ringCentre();
    static double stopAngle(int reflAngle);

    // Empty gradients for samples that don't have the ring's angles.
    static QConicalGradient createTopRainbowGradient(const QRect& ring);
    static QConicalGradient createBottomRainbowGradient(const QRect& ring);

    RainbowPainter* topPainter() const { return m_rainbowPainterTop; }
    RainbowPainter* bottomPainter() const { return m_rainbowPainterBottom; }
    SampleColorStrip* colorStrip() const;
    QLabel* scaleLabel() const;

private:
    void drawTopRainbow();
    void drawBottomRainbow();
    void drawRainbows();
    void drawScaleNumbers(bool bothRings);

    Ui::RainbowWidget* ui;
    QRect m_topRainbow;
    QRect m_bottomRainbow;
    RainbowPainter* m_rainbowPainterTop;
    RainbowPainter* m_rainbowPainterBottom;
};

#endif // RAINBOWWIDGET_H
