#ifndef SPINNYCIRCLE_H
#define SPINNYCIRCLE_H

#include "Screens/MarigoldPanel.h"

#include <QLabel>
#include <QPixmap>
#include <QPoint>
#include <QTimer>

// The busy indicator of the lock and sync covers: a picture turned in six
// steps. All spinners share one angle, so that several on screen stay in
// step with each other.
class SpinnyCircle : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit SpinnyCircle(QWidget* parent = nullptr);
    SpinnyCircle(int timeToTurnMs, QWidget* parent = nullptr);

    int timeToTurn() const { return m_timeToTurn; }
    bool isTurning() const { return timer.isActive(); }
    // The angle shared by every spinner, in degrees.
    static int sharedAngle();

public slots:
    void onTimeout();

protected:
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    void init();

    QPixmap spinnyPixmap;
    QPoint m_centerPoint;
    QTimer timer;
    QLabel* m_pLabelSpinner;
    int m_timeToTurn;
};

#endif // SPINNYCIRCLE_H
