#include "Screens/SyncScreen.h"

SyncScreen::SyncScreen(QWidget* parent)
    : SyncScreen(DefaultTimeLimitMs, parent)
{
}

SyncScreen::SyncScreen(int ms, QWidget* parent)
    : LockScreen(ms, parent)
{
    setObjectName("SyncScreen");
    setTitle(tr("Syncing Job Data"));
}
