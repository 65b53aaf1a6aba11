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
Sim::ServerThread* g_sim = nullptr;
}
#endif

bool start(bool elevenAngles)
{
#ifdef MARIGOLD_HAVE_SIM
    static const bool started = [elevenAngles] {
        AppShell::registerMetaTypes();
        LocaleHelper::Init();
        StringTables::Init();
        g_sim = new Sim::ServerThread;
        g_sim->options().port = TestSupport::freeLocalPort();
        g_sim->options().controlPort = -1;
        g_sim->options().instrument.dataDir = TestSupport::makeTempDir(QStringLiteral("results-sim"));
        g_sim->options().instrument.seed = 11;
        g_sim->options().instrument.timeScale = 0.2;
        g_sim->options().instrument.model = elevenAngles ? Sim::Model::Alder : Sim::Model::Birch;
        if (!g_sim->start())
            return false;
        setIpAddress(QStringLiteral("127.0.0.1"));
        setIpPort(g_sim->port());
        Commands::Init();
        Commands::instance()->tcpClient()->connectToHost();
        DataManager* data = DataManager::instance();
        data->onSync();
        data->setSystemStatus(Tour::workshopStatus());
        data->updateJobInfos();
        return data->getNumberOfJobs() > 0;
    }();
    return started;
#else
    Q_UNUSED(elevenAngles);
    return false;
#endif
}

QString control(const QString& line)
{
#ifdef MARIGOLD_HAVE_SIM
    return g_sim ? g_sim->control(line) : QString();
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
