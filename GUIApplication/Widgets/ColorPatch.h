#ifndef COLORPATCH_H
#define COLORPATCH_H

#include <QColor>
#include <QLabel>

// A flat rectangle of one measured colour. Drawn by a style sheet so that it
// sits in forms like any other label and follows their geometry.
class ColorPatch : public QLabel
{
    Q_OBJECT
public:
    explicit ColorPatch(QWidget* parent = nullptr);

    void setColor(const QColor& color);
    void setColorRGB(quint8 red, quint8 green, quint8 blue, quint8 alpha = 255);
    void setColorCMYK(int cyan, int magenta, int yellow, int black, int alpha = 255);
    // Red, green and blue as 0..255; values outside are clamped.
    void setColor(const double* rgb);
    QColor getColor() const;

private:
    QColor m_color;
};

#endif // COLORPATCH_H
