#ifndef ERRORPOPUP_H
#define ERRORPOPUP_H

#include "Screens/NotificationPopup.h"

// A notification with the red alert icon: something failed.
class ErrorPopup : public NotificationPopup
{
    Q_OBJECT
public:
    explicit ErrorPopup(QWidget* parent = nullptr);
};

#endif // ERRORPOPUP_H
