#include "Screens/SyncScreen.h"

SyncScreen::SyncScreen(QWidget* parent)
    : SyncScreen(DefaultTimeLimitMs, parent)
{
}

SyncScreen::SyncScreen(int ms, QWidget* parent)
    : LockScreen(ms, parent)
{
    setObjectName("SyncScreen");
    setDefaultTitle("SyncScreen", QT_TRANSLATE_NOOP("SyncScreen", "Syncing Job Data"));
}
