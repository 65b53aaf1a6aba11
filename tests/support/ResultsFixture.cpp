#include "support/ResultsFixture.h"

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/DataManager.h"
#include "AppShell.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "support/TestSupport.h"
#include "support/Tour.h"

#ifdef MARIGOLD_HAVE_SIM
#include "SimServer.h"
#endif

namespace ResultsFixture {

#ifdef MARIGOLD_HAVE_SIM
namespace {
// One simulator per instrument model, started on first use; the link
// follows the one asked for last.
Sim::ServerThread* g_sims[2] = {nullptr, nullptr};
int g_current = -1;
} // namespace
#endif

bool start(bool elevenAngles)
{
#ifdef MARIGOLD_HAVE_SIM
    const int k = elevenAngles ? 1 : 0;
    if (g_current == k)
        return true;
    static const bool shellReady = [] {
        AppShell::registerMetaTypes();
        LocaleHelper::Init();
        StringTables::Init();
        return true;
    }();
    Q_UNUSED(shellReady);
    if (!g_sims[k]) {
        auto* sim = new Sim::ServerThread;
        sim->options().port = TestSupport::freeLocalPort();
        sim->options().controlPort = -1;
        sim->options().instrument.dataDir =
            TestSupport::makeTempDir(elevenAngles ? QStringLiteral("results-sim11") : QStringLiteral("results-sim6"));
        sim->options().instrument.seed = 11;
        sim->options().instrument.timeScale = 0.2;
        sim->options().instrument.model = elevenAngles ? Sim::Model::Alder : Sim::Model::Birch;
        if (!sim->start()) {
            delete sim;
            return false;
        }
        g_sims[k] = sim;
    }
    setIpAddress(QStringLiteral("127.0.0.1"));
    setIpPort(g_sims[k]->port());
    if (g_current < 0)
        Commands::Init();
    else
        Commands::instance()->tcpClient()->Init();
    Commands::instance()->tcpClient()->connectToHost();
    g_current = k;
    DataManager* data = DataManager::instance();
    data->onSync();
    data->setSystemStatus(Tour::workshopStatus());
    data->updateJobInfos();
    return data->getNumberOfJobs() > 0;
#else
    Q_UNUSED(elevenAngles);
    return false;
#endif
}

QString control(const QString& line)
{
#ifdef MARIGOLD_HAVE_SIM
    return g_current >= 0 ? g_sims[g_current]->control(line) : QString();
#else
    Q_UNUSED(line);
    return QString();
#endif
}

bool activate(const QString& jobName, unsigned int index)
{
    DataManager* data = DataManager::instance();
    const unsigned int job = data->findJobByName(jobName);
    if (job >= data->getNumberOfJobs())
        return false;
    data->setActiveJob(job);
    data->quickLoadJobSamples(job);
    data->setActiveSample(index);
    return data->getActiveSample() == index && data->getActiveSampleObject().isValid();
}

void loadTexturesAndImages()
{
    DataManager::instance()->onLoadCurrentSamplesTexturesAndImages();
}

} // namespace ResultsFixture
