#ifndef SYNCSCREEN_H
#define SYNCSCREEN_H

#include "Screens/LockScreen.h"

// The cover shown while a job goes to the web service. It can't hang: it
// closes itself after 1500 ms at the most.
class SyncScreen : public LockScreen
{
    Q_OBJECT
public:
    static const int DefaultTimeLimitMs = 1500;

    explicit SyncScreen(QWidget* parent = nullptr);
    SyncScreen(int ms, QWidget* parent);
};

#endif // SYNCSCREEN_H
