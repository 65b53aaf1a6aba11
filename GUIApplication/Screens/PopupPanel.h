#ifndef POPUPPANEL_H
#define POPUPPANEL_H

#include "Screens/MarigoldFullScreenPanel.h"

// Everything that floats over a panel. The panel that adds a popup deletes
// it; the popup only asks to be closed. The hidden corner closes the popup
// and sends the whole stack home.
class PopupPanel : public MarigoldFullScreenPanel
{
    Q_OBJECT
public:
    explicit PopupPanel(QWidget* parent = nullptr);

signals:
    void closePopup(PopupPanel* popup);

public slots:
    void onClosePopup();
    void onGoHome() override;
};

Q_DECLARE_METATYPE(PopupPanel*)

#endif // POPUPPANEL_H
