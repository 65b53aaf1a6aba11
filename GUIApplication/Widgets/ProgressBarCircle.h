#ifndef PROGRESSBARCIRCLE_H
#define PROGRESSBARCIRCLE_H

#include <QString>
#include <QWidget>

namespace Ui {
class ProgressBarCircle;
}

// A circular progress bar built from three stacked layers: a ring picture
// behind, the clockwise sweep of a second ring picture, and an optional
// picture on top (the ground of a branding image).
class ProgressBarCircle : public QWidget
{
    Q_OBJECT
    Q_PROPERTY(int value READ value WRITE setValue NOTIFY valueChanged)
public:
    explicit ProgressBarCircle(QWidget* parent = nullptr);
    ~ProgressBarCircle() override;

    void setBackgroundImage(const QString& file);
    void setBackgroundHighlightImage(const QString& file);
    void setForegroundImage(const QString& file);

    void setRange(int min, int max);
    void setMinimum(int min);
    void setMaximum(int max);
    int minimum() const { return m_min; }
    int maximum() const { return m_max; }
    int value() const { return m_val; }

    // Diameter of the free disc inside the ring pictures.
    int getCircleInnerDiameterInPixels() const;

    // The sweep, for those who need to look at it (tests, derived popups).
    int sweepAngle() const;
    QString foregroundImage() const;

public slots:
    void setValue(int value);

signals:
    void valueChanged(int value);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    Ui::ProgressBarCircle* ui;
    int m_min = 0;
    int m_max = 100;
    int m_val = 0;
};

#endif // PROGRESSBARCIRCLE_H
