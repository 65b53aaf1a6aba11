#ifndef PRODUCTHARNESS_H
#define PRODUCTHARNESS_H

// The program's start-up for screen tests against the simulator: a server
// on a free port with a data folder of its own, the link pointed at it, and
// what main() sets up before the first screen is built.

#include "SharedSystem/InstrumentTypes.h"

#include <QSet>
#include <QString>

#include <functional>

class ScreenMaster;

namespace Sim {
class ServerThread;
}

namespace ProductHarness {

// Whether the simulator serves the product's example filter file as the
// instrument's (make, model, colour code).
enum FilterFile { NoFilterFile, ExampleFilterFile };

// False when the simulator would not start.
bool startSimulatorAndApplication(Sim::ServerThread& sim, const QString& name, double timeScale = 0.3,
                                  FilterFile filter = NoFilterFile);

// Screens of other areas stand in as plain panels named "StandIn<id>", so a
// test sees which one was asked for; the home screen, its covers and `real`
// are built as the product builds them. `asked` hears of each stand-in.
void standInOtherScreens(const QSet<SCREEN_ID_T>& real, std::function<void(SCREEN_ID_T)> asked = nullptr);

// Shows the program's window and waits, as the operator would, for the
// link's start-up and the settled home screen. False when either does not
// come.
bool showHome(ScreenMaster* master);

} // namespace ProductHarness

#endif // PRODUCTHARNESS_H
