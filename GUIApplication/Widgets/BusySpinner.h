#ifndef BUSYSPINNER_H
#define BUSYSPINNER_H

#include <QTimer>
#include <QWidget>

// The turning arc of the busy covers. It runs only while visible.
class BusySpinner : public QWidget
{
    Q_OBJECT
public:
    explicit BusySpinner(QWidget* parent = nullptr);

    int angle() const { return m_angle; }
    bool isSpinning() const { return m_timer.isActive(); }

protected:
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    QTimer m_timer;
    int m_angle = 90;
};

#endif // BUSYSPINNER_H
