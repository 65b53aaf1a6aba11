#include "Screens/PopupPanel.h"

#include "GUIAPI/API_SignalMaster.h"

PopupPanel::PopupPanel(QWidget* parent)
    : MarigoldFullScreenPanel(parent)
{
    setObjectName("PopupPanel");
}

void PopupPanel::onClosePopup()
{
    emit closePopup(this);
}

void PopupPanel::onGoHome()
{
    emit closePopup(this);
    API_SignalMaster::instance()->emitGoHome();
}
