#ifndef PROGRESSBARCIRCLEPAINTER_H
#define PROGRESSBARCIRCLEPAINTER_H

#include <QBrush>
#include <QString>
#include <QWidget>

// The moving part of the measuring circle: a pie slice of a ring picture,
// swept clockwise from twelve o'clock.
class ProgressBarCirclePainter : public QWidget
{
    Q_OBJECT
public:
    explicit ProgressBarCirclePainter(QWidget* parent = nullptr);

    // Degrees of the sweep, clamped to 0..360.
    void setAngle(int angle);
    // The ring picture the slice is cut from, scaled to the widget.
    void setBrushImage(const QString& file);

    int spanAngle() const { return m_spanAngle; }
    QString brushImage() const { return m_currentBrushImage; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QBrush brush;
    int m_spanAngle = 0; // sixteenths of a degree, negative = clockwise
    QString m_currentBrushImage;
};

#endif // PROGRESSBARCIRCLEPAINTER_H
