#include "Screens/ErrorPopup.h"

ErrorPopup::ErrorPopup(QWidget* parent)
    : NotificationPopup(parent)
{
    setObjectName("ErrorPopup");
    setIconResource(":/Assets/alert_popup_red_icon.png");
}
