#include "support/ProductHarness.h"

#ifdef MARIGOLD_HAVE_SIM

#include "AppShell.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/JobListScreen.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SimServer.h"
#include "Utils/AudioPlayer.h"
#include "support/TestSupport.h"

#include <QFile>
#include <QtTest>

namespace ProductHarness {

bool startSimulatorAndApplication(Sim::ServerThread& sim, const QString& name, double timeScale, FilterFile filter)
{
    const QString dataDir = TestSupport::makeTempDir(name + QStringLiteral("-sim"));
    if (filter == ExampleFilterFile
        && !QFile::copy(Platform::devicePath(QStringLiteral("/opt/Filter/Filter.xml")), dataDir + "/Filter.xml"))
        return false;
    sim.options().port = TestSupport::freeLocalPort();
    sim.options().controlPort = -1;
    sim.options().instrument.dataDir = dataDir;
    sim.options().instrument.timeScale = timeScale;
    if (!sim.start())
        return false;
    setIpAddress(QStringLiteral("127.0.0.1"));
    setIpPort(sim.port());

    AppShell::registerMetaTypes();
    LocaleHelper::Init();
    StringTables::Init();
    AudioPlayer::instance()->Init();
    DataManager::instance()->Init();
    return true;
}

void standInOtherScreens(const QSet<SCREEN_ID_T>& real, std::function<void(SCREEN_ID_T)> asked)
{
    ScreenMaster::setScreenFactoryOverride([real, asked](SCREEN_ID_T id, QWidget* parent) -> QWidget* {
        if (id == JOB_LIST_SCREEN_ID || id == SAD_PUPPY_POPUP_SCREEN_ID || id == LOCK_SCREEN_ID
            || id == SYNC_SCREEN_ID || real.contains(id))
            return nullptr;
        if (asked)
            asked(id);
        auto* standIn = new DaddyPanel(parent);
        standIn->setObjectName(QStringLiteral("StandIn%1").arg(int(id)));
        return standIn;
    });
}

bool showHome(ScreenMaster* master)
{
    master->show();
    if (!QTest::qWaitFor([] { return DataManager::instance()->getDataInitialized(); }, 20000))
        return false;
    // The home screen settles after the link's start-up, which goes home.
    JobListScreen* home = master->findChild<JobListScreen*>();
    if (!home || !QTest::qWaitFor([home] { return home->isReady(); }, 10000))
        return false;
    QTest::qWait(300);
    return true;
}

} // namespace ProductHarness

#endif // MARIGOLD_HAVE_SIM
