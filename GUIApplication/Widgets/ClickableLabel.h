#ifndef CLICKABLELABEL_H
#define CLICKABLELABEL_H

#include "Widgets/KLabel.h"

#include <QRect>

// A label that acts as a button. A release clicks only if the label still
// overlaps where it was at the press, so a drag that carried it away in a
// scrolling list does not.
class ClickableLabel : public KLabel
{
    Q_OBJECT
public:
    explicit ClickableLabel(QWidget* parent = nullptr);

signals:
    void clicked();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;

private:
    QRect globalRect() const;

    QRect m_pressedBox;
};

#endif // CLICKABLELABEL_H
