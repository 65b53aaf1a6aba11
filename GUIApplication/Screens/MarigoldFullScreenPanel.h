#ifndef MARIGOLDFULLSCREENPANEL_H
#define MARIGOLDFULLSCREENPANEL_H

#include "Screens/MarigoldPanel.h"

class XPushButton;

// A panel that fills the 320 x 480 display. A touch on the 2 x 2 pixel
// top-left corner is a go-home gesture; each branch says what home means.
class MarigoldFullScreenPanel : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit MarigoldFullScreenPanel(QWidget* parent = nullptr);

    XPushButton* debugButton() const { return m_debugButton; }

public slots:
    virtual void onGoHome();

protected:
    void showEvent(QShowEvent* event) override;

private:
    XPushButton* m_debugButton;
};

#endif // MARIGOLDFULLSCREENPANEL_H
