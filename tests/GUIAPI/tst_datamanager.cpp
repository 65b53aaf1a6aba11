// DataManager against the simulator: what the settings bits of a status do,
// the server's lock, the job operations with their naming rules, the list
// refresh, the staged sample loads and the memory rules.

#include "GUIAPI/BackendHarness.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "Communication/PollStatus.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"

#include <QtTest>

using namespace BackendHarness;

class TestDataManager : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void init();
    void cleanup();

    void languageBitChangesTheLanguage();
    void volumeAndBrightnessBitsTakeTheServersValues();
    void wifiReadFailureLeavesNoStaleNetworks();
    void wifiBitsReReadTheNetworksAndTellTheScreens();
    void measuringCircleBitTakesTheServersPicture();
    void textMessageIsShownEveryTime();
    void averagingDefaultsFollowTheServer();
    void orientationBitSwitchesOrientation();
    void whiteTransferRequestLeadsToCalibrationOrReferenceCheck();
    void labModeStartsAndEnds();
    void lockEmitsLockStartedAtEveryStatusAndGoHomeOnLeaving();

    void activeJobAndSampleIndicesFollowTheirRules();
    void listIsSortedByCompletionLatestFirst();
    void deletingAllSamplesGoesFromTheHighestNumberDown();
    void refreshKeepsActiveJobAndSampleByDatabaseIndex();
    void refreshDropsActiveJobAndSampleWhenTheyVanish();
    void stagedLoadsFillColourThenImagesAndTextures();
    void averagingJobLoadsItsAveragedSampleOnly();
    void roomToMeasureIsStricterThanRoomToAddAJob();

    void createdJobsAreNamedJobThenJobDashN();
    void copyTakesNameNAndDisplayNameN();

    // These drive the status by hand, with the poll stopped.
    void jobChangeReReadsTheActiveJobAloneUnlessAnotherJobSaysItChanged();
    void filterBitReloadsTheFiltersAndReportsAFileThatWillNotParse();

private:
    QString control(const QString& line) { return m_sim->control(line); }
    // Index in the local list of the first job that matches, or -1.
    int findJob(const std::function<bool(const Job&)>& match);
    int serverSampleCount(const QString& jobName);
    // Makes a job and measures count samples into it; returns its name.
    QString measuredJob(int count);
    unsigned int refreshAndFind(int dbIndex);

    std::unique_ptr<Sim::ServerThread> m_sim;
    QString m_emptied, m_older, m_newer, m_staged;
    SignalLog m_log;
    DataManager* m_dm = nullptr;
};

void TestDataManager::initTestCase()
{
    m_sim = startSimulator(0.3);
    QVERIFY(m_sim);
    m_dm = startDataManager();
    API_SignalMaster* hub = API_SignalMaster::instance();
    m_log.watch(m_dm, &DataManager::languageChanged, "languageChanged");
    m_log.watch(m_dm, &DataManager::beeperVolumeChanged, "beeperVolumeChanged");
    m_log.watch(m_dm, &DataManager::displayBrightnessChanged, "displayBrightnessChanged");
    m_log.watch(m_dm, &DataManager::showMessageBox, "showMessageBox");
    m_log.watch(m_dm, &DataManager::paramUpdate, "paramUpdate");
    m_log.watch(m_dm, &DataManager::updateOrientatonEnabled, "updateOrientatonEnabled");
    m_log.watch(m_dm, &DataManager::loadQuickCurrentJobSamplesComplete, "quickComplete");
    m_log.watch(m_dm, &DataManager::loadCurrentSamplesImagesComplete, "imagesComplete");
    m_log.watch(m_dm, &DataManager::loadCurrentSamplesTexturesComplete, "texturesComplete");
    m_log.watch(m_dm, &DataManager::loadCurrentSamplesTexturesAndImagesComplete, "allComplete");
    m_log.watch(m_dm, &DataManager::DataBaseWiped, "DataBaseWiped");
    m_log.watch(hub, &API_SignalMaster::GoHome, "GoHome");
    m_log.watch(hub, &API_SignalMaster::LockStarted, "LockStarted");
    m_log.watch(hub, &API_SignalMaster::GoToWhiteCalibration, "GoToWhiteCalibration");
    m_log.watch(hub, &API_SignalMaster::GoToRefCheck, "GoToRefCheck");
    m_log.watch(hub, &API_SignalMaster::GoToLabMode, "GoToLabMode");
    m_log.watch(hub, &API_SignalMaster::TriggerTargetingStop, "TriggerTargetingStop");
    m_log.watch(hub, &API_SignalMaster::MeasurementIssue, "MeasurementIssue");
    m_log.watch(hub, &API_SignalMaster::MeasurementComplete, "MeasurementComplete");
    m_log.watch(hub, &API_SignalMaster::StatusUpdated, "StatusUpdated");
    QVERIFY(connectBackend(m_log, m_sim->port()));
    // As the job list screen does while it shows.
    m_dm->setFullJobUpdateFlag(true);
    onDataManagerThread([this] { m_dm->onUpdateJobInfos(); });
    QVERIFY(m_dm->getNumberOfJobs() > 0);

    // Jobs of three measurements each; the one measured last comes first.
    QCOMPARE(control("place"), QString("OK"));
    QCOMPARE(control("param 1000 NONE"), QString("OK"));
    m_emptied = measuredJob(3);
    m_older = measuredJob(3);
    m_newer = measuredJob(3);
    m_staged = measuredJob(2);
    QVERIFY(!m_staged.isEmpty());
}

QString TestDataManager::measuredJob(int count)
{
    const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
    if (index == NO_INDEX)
        return QString();
    const QString name = m_dm->getAJobObject(index).getName();
    for (int i = 0; i < count; ++i) {
        m_dm->setActiveJob(m_dm->findJobByName(name));
        const int done = m_log.count("MeasurementComplete");
        MeasAPI_TriggerMeasurement();
        if (!m_log.waitFor("MeasurementComplete", 10000, done + 1))
            return QString();
        if (!waitUntil([&] { return m_dm->getActiveJobObject().getNumSamples() == i + 1; }, 5000))
            return QString();
    }
    return name;
}

void TestDataManager::init()
{
    m_log.clear();
}

void TestDataManager::cleanup()
{
    // Two idle ticks, so that nothing of one test spills into the next.
    QVERIFY(m_log.waitFor("StatusUpdated", 3000, m_log.count("StatusUpdated") + 2));
}

int TestDataManager::findJob(const std::function<bool(const Job&)>& match)
{
    const QVector<Job> jobs = m_dm->getAllJobs();
    for (int i = 0; i < jobs.size(); ++i) {
        if (match(jobs[i]))
            return i;
    }
    return -1;
}

int TestDataManager::serverSampleCount(const QString& jobName)
{
    int count = -1;
    m_sim->call([&](Sim::Server& s) {
        if (const Sim::Job* job = s.instrument().jobs().find(jobName))
            count = job->samples.size();
    });
    return count;
}

unsigned int TestDataManager::refreshAndFind(int dbIndex)
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    return static_cast<unsigned int>(findJob([dbIndex](const Job& j) { return j.getDBIndex() == dbIndex; }));
}

// ---------------------------------------------------------------- settings bits

void TestDataManager::languageBitChangesTheLanguage()
{
    const QString before = UserParams::getLanguageCode();
    const QString other = before.compare("de", Qt::CaseInsensitive) == 0 ? "fr" : "de";
    QCOMPARE(control("param 18 " + other), QString("OK"));
    QVERIFY(m_log.waitFor("languageChanged(" + other + ")", 3000));
    QCOMPARE(UserParams::getLanguageCode(), other);
    QVERIFY(!m_dm->getKeypadArray().isEmpty());

    // The same code in another case is no change.
    QCOMPARE(control("param 18 " + other.toUpper()), QString("OK"));
    QVERIFY(m_log.waitFor("StatusUpdated", 3000, 3));
    QCOMPARE(m_log.countStartingWith("languageChanged"), 1);

    // No language at all from the server: English keys, the empty code
    // written back, and the screens told.
    // (The simulator refuses an empty code from its control port, as it
    // refuses it from the link: set it underneath, as a server reset would.)
    m_sim->call([](Sim::Server& s) {
        Sim::ParamValue empty = *s.instrument().parameter(PARAMETER_CURRENT_LANGUAGE_ID);
        empty.s.clear();
        s.instrument().forceParameter(PARAMETER_CURRENT_LANGUAGE_ID, empty);
    });
    QVERIFY(m_log.waitFor("languageChanged()", 3000));
    QVERIFY(!m_dm->getKeypadArray().isEmpty());

    QCOMPARE(control("param 18 " + before), QString("OK"));
    QVERIFY(m_log.waitFor("languageChanged(" + before + ")", 3000));
}

void TestDataManager::wifiReadFailureLeavesNoStaleNetworks()
{
    QTRY_COMPARE_WITH_TIMEOUT(control("wifi on"), QString("OK"), 5000); // busy a moment after a switch
    QCOMPARE(control("wifi network Bodyshop-Guest in 0.7 OPEN"), QString("OK"));
    onDataManagerThread([this] { m_dm->onLoadWifiSettings(); });
    const auto all = [this] { return m_dm->getKnownNetworkDescriptions() + m_dm->getUnknownNetworkDescriptions(); };
    QVERIFY(!all().isEmpty());

    // The radio's list can't be read: nothing from before may stay offered.
    QVERIFY(control(QString("refuse %1 2").arg(0x400A0C00)).startsWith("OK"));
    onDataManagerThread([this] { m_dm->onLoadWifiSettings(); });
    QVERIFY(all().isEmpty());
    QVERIFY(control("refuse off").startsWith("OK"));
    onDataManagerThread([this] { m_dm->onLoadWifiSettings(); });
    QVERIFY(!all().isEmpty());
    QCOMPARE(control("wifi network Bodyshop-Guest out"), QString("OK"));
    QTRY_COMPARE_WITH_TIMEOUT(control("wifi off"), QString("OK"), 5000);
}

void TestDataManager::wifiBitsReReadTheNetworksAndTellTheScreens()
{
    QSignalSpy changed(m_dm, &DataManager::wifiSettingsChanged);
    QTRY_COMPARE_WITH_TIMEOUT(control("wifi on"), QString("OK"), 5000); // busy a moment after a switch
    const auto names = [this] {
        QStringList ssids;
        for (const NETWORK_DESCRIPTION_T& n : m_dm->getKnownNetworkDescriptions() + m_dm->getUnknownNetworkDescriptions())
            ssids << n.SSID;
        return ssids;
    };
    // A network coming on the air (the scan-results bit) is read without
    // anyone asking for the list.
    QCOMPARE(control("wifi network Spraybooth-2 in 0.6 OPEN"), QString("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(names().contains("Spraybooth-2"), 5000);
    QVERIFY(changed.count() >= 1);
    // The settings bit alone tells the screens too.
    const int before = changed.count();
    QCOMPARE(control("wifi static 10.20.30.40"), QString("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(changed.count() >= before + 2, 5000); // 0x20 and the list bit
    QCOMPARE(control("wifi network Spraybooth-2 out"), QString("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(!names().contains("Spraybooth-2"), 5000);
    QCOMPARE(control("wifi dhcp"), QString("OK"));
    QTRY_COMPARE_WITH_TIMEOUT(control("wifi off"), QString("OK"), 5000);
}

void TestDataManager::measuringCircleBitTakesTheServersPicture()
{
    QCOMPARE(control("param MEASURING_CIRCLE_ID paint_drop.svg"), QString("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(UserParams::getMeasuringCircleID().endsWith("/opt/GUI/Branding/paint_drop.svg"), 3000);
    QCOMPARE(control("param MEASURING_CIRCLE_ID colour_wheel.svg"), QString("OK"));
    QTRY_VERIFY_WITH_TIMEOUT(UserParams::getMeasuringCircleID().endsWith("/colour_wheel.svg"), 3000);
}

void TestDataManager::volumeAndBrightnessBitsTakeTheServersValues()
{
    const unsigned int volume = UserParams::getBeeperVolume() == 7 ? 8 : 7;
    const unsigned int brightness = UserParams::getDisplayBrightness() == 42 ? 43 : 42;
    m_sim->call([=](Sim::Server& s) {
        s.instrument().setVolume(int(volume));
        s.instrument().setBrightness(int(brightness));
    });
    QVERIFY(m_log.waitFor("beeperVolumeChanged", 3000));
    QVERIFY(m_log.waitFor("displayBrightnessChanged", 3000));
    QCOMPARE(UserParams::getBeeperVolume(), volume);
    QCOMPARE(UserParams::getDisplayBrightness(), brightness);
}

void TestDataManager::textMessageIsShownEveryTime()
{
    QCOMPARE(control("message Remember the white tile"), QString("OK"));
    QVERIFY(m_log.waitFor("showMessageBox(,Remember the white tile)", 3000));
    QVERIFY(m_log.waitFor("StatusUpdated", 3000, m_log.count("StatusUpdated") + 2));
    QCOMPARE(control("message Remember the white tile"), QString("OK"));
    QVERIFY(m_log.waitFor("showMessageBox(,Remember the white tile)", 3000, 2));
}

void TestDataManager::averagingDefaultsFollowTheServer()
{
    QCOMPARE(control("param 1001 4"), QString("OK"));
    QCOMPARE(control("param 1002 6"), QString("OK"));
    QCOMPARE(control("param 1000 SMC"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultAvgInfo().mode == JOB_AVG_MODE_SMC; }, 3000));
    JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
    QCOMPARE(info.smcGoodMeasurements, 4);
    QCOMPARE(info.smcMaxMeasurements, 6);
    QVERIFY(m_log.waitFor("paramUpdate", 2000));

    QCOMPARE(control("param 1013 5"), QString("OK"));
    QCOMPARE(control("param 1000 AVERAGE"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultAvgInfo().mode == JOB_AVG_MODE_SIMPLE_5; }, 3000));
    QCOMPARE(UserParams::getJobDefaultAvgInfo().averageNumber, 5);

    QCOMPARE(control("param 1000 AVERAGE"), QString("OK"));
    QCOMPARE(control("param 1013 3"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultAvgInfo().mode == JOB_AVG_MODE_SIMPLE_3; }, 3000));

    QCOMPARE(control("param 1000 NONE"), QString("OK"));
    QCOMPARE(control("param 1013 5"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultAvgInfo().averageNumber == 5; }, 3000));
}

void TestDataManager::orientationBitSwitchesOrientation()
{
    QCOMPARE(control("param 19 0"), QString("OK"));
    QVERIFY(m_log.waitFor("updateOrientatonEnabled(false)", 3000));
    QVERIFY(!UserParams::getOrientationEnabled());
    QCOMPARE(control("param 19 1"), QString("OK"));
    QVERIFY(m_log.waitFor("updateOrientatonEnabled(true)", 3000));
    QVERIFY(UserParams::getOrientationEnabled());
}

void TestDataManager::whiteTransferRequestLeadsToCalibrationOrReferenceCheck()
{
    QCOMPARE(control("request white"), QString("OK"));
    QVERIFY(m_log.waitFor("GoToWhiteCalibration", 3000));
    QVERIFY(m_log.count("TriggerTargetingStop") >= 1);
    QCOMPARE(m_log.count("GoToRefCheck"), 0);

    m_log.clear();
    QCOMPARE(control("request refcheck"), QString("OK"));
    QVERIFY(m_log.waitFor("GoToRefCheck", 3000));
    QVERIFY(m_log.count("TriggerTargetingStop") >= 1);
    QCOMPARE(m_log.count("GoToWhiteCalibration"), 0);

    m_log.clear();
    QCOMPARE(control("request none"), QString("OK"));
    QVERIFY(m_log.waitFor("StatusUpdated", 3000, 3));
    QCOMPARE(m_log.count("GoToRefCheck") + m_log.count("GoToWhiteCalibration"), 0);
}

void TestDataManager::labModeStartsAndEnds()
{
    QVERIFY(control("online start LAB-PANEL none").startsWith("OK"));
    QVERIFY(m_log.waitFor("GoToLabMode", 5000));
    QVERIFY(UserParams::getLabModeEnabled());
    const QString labJob = UserParams::getLabModeJob();
    QVERIFY(!labJob.isEmpty());
    QCOMPARE(m_dm->getActiveJobObject().getName(), labJob);
    // In lab mode the job is the lab's: none is made here.
    QCOMPARE(onDataManagerThread([this] { return m_dm->createNewJob(); }), NO_INDEX);

    m_log.clear();
    QCOMPARE(control("online end"), QString("OK"));
    QVERIFY(m_log.waitFor("GoHome", 5000));
    QVERIFY(m_log.count("TriggerTargetingStop") >= 1);
    QVERIFY(UserParams::getLabModeJob().isEmpty());
    QCOMPARE(m_log.count("GoToLabMode"), 0);
}

void TestDataManager::lockEmitsLockStartedAtEveryStatusAndGoHomeOnLeaving()
{
    QCOMPARE(control("lock"), QString("OK"));
    QVERIFY(m_log.waitFor("LockStarted", 3000, 3));
    QCOMPARE(m_log.count("GoHome"), 0);
    QCOMPARE(m_dm->getPollStatus()->activeTimers(), QStringList{"idle"});
    QCOMPARE(m_dm->getSystemStatus().getSystemState(), STATE_LOCK);

    QCOMPARE(control("unlock"), QString("OK"));
    QVERIFY(m_log.waitFor("GoHome", 3000));
    const int locks = m_log.count("LockStarted");
    QVERIFY(m_log.waitFor("StatusUpdated", 3000, m_log.count("StatusUpdated") + 2));
    QCOMPARE(m_log.count("LockStarted"), locks);
    QCOMPARE(m_log.count("GoHome"), 1);
}

// ---------------------------------------------------------------- jobs and samples

void TestDataManager::activeJobAndSampleIndicesFollowTheirRules()
{
    const unsigned int size = m_dm->getNumberOfJobs();
    m_dm->setActiveJob(NO_INDEX);
    m_dm->setActiveSample(0);
    QCOMPARE(m_dm->getActiveSample(), NO_INDEX);
    QCOMPARE(m_dm->getCurrentNumberOfJobSamples(), 0u);

    // One past the end is kept and reads as no job.
    m_dm->setActiveJob(size);
    QCOMPARE(m_dm->getActiveJob(), size);
    QVERIFY(!m_dm->getActiveJobObject().isJobValid());
    QVERIFY(!m_dm->getActiveSampleObject().isValid());
    m_dm->setActiveJob(size + 1);
    QCOMPARE(m_dm->getActiveJob(), NO_INDEX);

    m_dm->setActiveJob(m_dm->findJobByName(m_older));
    const unsigned int count = m_dm->getCurrentNumberOfJobSamples();
    QCOMPARE(count, 3u);
    m_dm->setActiveSample(count - 1);
    QCOMPARE(m_dm->getActiveSample(), count - 1);
    m_dm->setActiveSample(count);
    QCOMPARE(m_dm->getActiveSample(), NO_INDEX);
    m_dm->setActiveSample(AVERAGED_SAMPLE_INDEX);
    QCOMPARE(m_dm->getActiveSample(), AVERAGED_SAMPLE_INDEX);
    m_dm->setActiveJob(NO_INDEX);
}

void TestDataManager::listIsSortedByCompletionLatestFirst()
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    const QVector<Job> jobs = m_dm->getAllJobs();
    QCOMPARE(jobs.first().getName(), m_staged);
    for (int i = 1; i < jobs.size(); ++i)
        QVERIFY(jobs[i - 1].getDateComplete() >= jobs[i].getDateComplete());
    // Jobs without measurements carry the epoch and come last.
    QCOMPARE(jobs.last().getNumSamples(), 0);
    QCOMPARE(jobs.last().getDateComplete().toSecsSinceEpoch(), 0);
}

void TestDataManager::deletingAllSamplesGoesFromTheHighestNumberDown()
{
    const QString name = m_emptied;
    QCOMPARE(serverSampleCount(name), 3);
    m_dm->setActiveJob(m_dm->findJobByName(name));

    // The server renumbers what follows a deleted sample, so deleting from
    // the first number up would run out of numbers and be refused.
    API_SignalMaster::instance()->emitJobDeleteAllSamples();
    QVERIFY(waitUntil([&] { return serverSampleCount(name) == 0; }, 5000));
    QVERIFY(waitUntil([&] { return m_dm->getActiveJobObject().getNumSamples() == 0; }, 3000));
    QCOMPARE(m_log.countStartingWith("MeasurementIssue"), 0);
}

void TestDataManager::refreshKeepsActiveJobAndSampleByDatabaseIndex()
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    const int index = int(m_dm->findJobByName(m_older));
    const int earlier = int(m_dm->findJobByName(m_newer));
    QVERIFY(earlier < index);
    const Job job = m_dm->getAJobObject(index);
    m_dm->setActiveJob(index);
    m_dm->setActiveSample(1);
    const int sampleDB = m_dm->getActiveSampleObject().getSampleInfo().dbIndex;
    QVERIFY(sampleDB != 0);

    // A job before it goes: its place in the list moves up by one.
    onDataManagerThread([=] { m_dm->deleteJob(earlier); });
    QCOMPARE(refreshAndFind(job.getDBIndex()), unsigned(index - 1));
    QCOMPARE(m_dm->getActiveJob(), unsigned(index - 1));
    QCOMPARE(m_dm->getActiveJobObject().getDBIndex(), job.getDBIndex());
    QCOMPARE(m_dm->getActiveSample(), 1u);
    QCOMPARE(m_dm->getActiveSampleObject().getSampleInfo().dbIndex, sampleDB);
}

void TestDataManager::refreshDropsActiveJobAndSampleWhenTheyVanish()
{
    const unsigned int index = m_dm->findJobByName(m_older);
    QVERIFY(index != NO_INDEX);
    const Job job = m_dm->getAJobObject(index);
    m_dm->setActiveJob(index);

    // The active sample goes, its job stays.
    m_dm->setActiveSample(job.getNumSamples() - 1);
    onDataManagerThread([this] { m_dm->deleteActiveSample(); });
    QCOMPARE(refreshAndFind(job.getDBIndex()), m_dm->getActiveJob());
    QCOMPARE(m_dm->getActiveJobObject().getDBIndex(), job.getDBIndex());
    QCOMPARE(m_dm->getActiveSample(), NO_INDEX);

    // Now the job.
    onDataManagerThread([this] { m_dm->deleteActiveJob(); });
    QCOMPARE(refreshAndFind(job.getDBIndex()), unsigned(-1));
    QCOMPARE(m_dm->getActiveJob(), NO_INDEX);
    QCOMPARE(m_dm->getActiveSample(), NO_INDEX);
    QVERIFY(!m_dm->getActiveJobObject().isJobValid());
}

void TestDataManager::stagedLoadsFillColourThenImagesAndTextures()
{
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    m_dm->setActiveJob(m_dm->findJobByName(m_staged));
    m_dm->setActiveSample(0);
    QVERIFY(!m_dm->getActiveSampleObject().getColorFilledIn());

    QMetaObject::invokeMethod(m_dm, "onQuickLoadCurrentJobSamples", Qt::QueuedConnection);
    QVERIFY(m_log.waitFor("quickComplete", 10000));
    const Job job = m_dm->getActiveJobObject();
    for (int s = 0; s < job.getNumSamples(); ++s) {
        const Sample sample = job.getSample(s);
        QVERIFY(sample.getColorFilledIn());
        QVERIFY(!sample.hasImage(IMAGE_NEG_45));
        QVERIFY(!sample.hasTexture(IMAGE_NEG_45));
    }

    QMetaObject::invokeMethod(m_dm, "onLoadCurrentSamplesTexturesAndImages", Qt::QueuedConnection);
    QVERIFY(m_log.waitFor("allComplete", 20000));
    const QStringList log = m_log.entries();
    QVERIFY(log.indexOf("imagesComplete") < log.indexOf("texturesComplete"));
    QVERIFY(log.indexOf("texturesComplete") < log.indexOf("allComplete"));
    const Sample loaded = m_dm->getActiveSampleObject();
    QVERIFY(loaded.getColorFilledIn());
    for (int angle = 0; angle < Instrument_Get_Num_Camera_Images(); ++angle) {
        QVERIFY2(loaded.hasImage(angle), qPrintable(QString::number(angle)));
        QVERIFY2(loaded.hasTexture(angle), qPrintable(QString::number(angle)));
    }
    QVERIFY(!m_dm->getActiveSampleImage(IMAGE_NEG_45).isNull());

    // A full refresh drops what was loaded: it comes again on demand.
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    QVERIFY(!m_dm->getActiveSampleObject().hasImage(IMAGE_NEG_45));
    QVERIFY(!onDataManagerThread([this] { return m_dm->getActiveSampleImage(IMAGE_15); }).isNull());
    QVERIFY(m_dm->getActiveSampleObject().hasImage(IMAGE_15));
}

void TestDataManager::averagingJobLoadsItsAveragedSampleOnly()
{
    const int index = findJob([](const Job& j) {
        return (j.getJobAveragingMode() == JOB_AVG_MODE_SIMPLE_3
                || j.getJobAveragingMode() == JOB_AVG_MODE_SIMPLE_5)
            && j.getNumSamples() >= int(j.getJobSize()) && j.getJobSize() > 0;
    });
    QVERIFY(index >= 0);
    onDataManagerThread([&] { m_dm->quickLoadJobSamples(index); });
    const Job job = m_dm->getAJobObject(index);
    QVERIFY(job.getAveragedSampleComplete());
    QVERIFY(job.getSample(AVERAGED_SAMPLE_INDEX).getColorFilledIn());
    QVERIFY(!job.getSample(0).getColorFilledIn());
}

void TestDataManager::roomToMeasureIsStricterThanRoomToAddAJob()
{
    // A job of 10 measurements, nothing measured yet.
    QCOMPARE(control("param 1000 NONE"), QString("OK"));
    QCOMPARE(control("param 8 10"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultSize() == 10; }, 3000));
    const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
    QVERIFY(index != NO_INDEX);
    QCOMPARE(m_dm->getAJobObject(index).getNumSamples(), 0);

    // Make the store hold exactly 10 measurements less than its limit, as
    // 990 of 1000.
    const MEMORY_INFO_T memory = onDataManagerThread([this] { return m_dm->getUpdatedMemInfo(); });
    QCOMPARE(control(QString("memory %1 %2").arg(memory.numJobs + 20).arg(memory.numMeasurements + 10)),
             QString("OK"));
    QVERIFY(!onDataManagerThread([&] { return m_dm->isThereEnoughRoomToMeasure(index); }));
    QVERIFY(onDataManagerThread([this] { return m_dm->isThereEnoughRoomToAddJob(); }));

    // One more measurement of room and both agree.
    QCOMPARE(control(QString("memory %1 %2").arg(memory.numJobs + 20).arg(memory.numMeasurements + 11)),
             QString("OK"));
    QVERIFY(onDataManagerThread([&] { return m_dm->isThereEnoughRoomToMeasure(index); }));
    // No room for another job at all.
    QCOMPARE(control(QString("memory %1 %2").arg(memory.numJobs).arg(memory.numMeasurements + 100)),
             QString("OK"));
    QVERIFY(!onDataManagerThread([this] { return m_dm->isThereEnoughRoomToAddJob(); }));
    QVERIFY(!onDataManagerThread([this] { return m_dm->isThereEnoughRoomToMeasure(NO_INDEX); }));
    control("memory 400 10000");
}

void TestDataManager::createdJobsAreNamedJobThenJobDashN()
{
    onDataManagerThread([this] { m_dm->deleteAllJobs(); });
    QVERIFY(m_log.waitFor("DataBaseWiped", 3000));
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
    QCOMPARE(m_dm->getNumberOfJobs(), 0u);
    QCOMPARE(control("param 7 Panel"), QString("OK"));
    QVERIFY(waitUntil([] { return UserParams::getJobDefaultName() == "Panel"; }, 3000));

    QStringList names, displayNames;
    for (int i = 0; i < 3; ++i) {
        const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
        QVERIFY(index != NO_INDEX);
        names << m_dm->getAJobObject(index).getName();
        displayNames << m_dm->getAJobObject(index).getDisplayName();
    }
    QCOMPARE(names, (QStringList{"Job", "Job-1", "Job-2"}));
    QCOMPARE(displayNames, (QStringList{"Panel", "Panel 1", "Panel 2"}));
}

void TestDataManager::copyTakesNameNAndDisplayNameN()
{
    const unsigned int original = m_dm->findJobByName("Job");
    QVERIFY(original != NO_INDEX);
    Job tagged = m_dm->getAJobObject(original);
    tagged.setNotes("rear door, check the seam");
    onDataManagerThread([&] { m_dm->editJob(original, tagged); });
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });

    const unsigned int copy = onDataManagerThread([this] {
        return m_dm->copyJob(m_dm->findJobByName("Job"));
    });
    QVERIFY(copy != NO_INDEX);
    const Job job = m_dm->getAJobObject(copy);
    QCOMPARE(job.getName(), QString("Job 1"));
    QCOMPARE(job.getDisplayName(), QString("Panel 3"));
    QCOMPARE(job.getNotes(), QString("rear door, check the seam"));
    QCOMPARE(job.getNumSamples(), 0);

    const unsigned int second = onDataManagerThread([this] {
        return m_dm->copyJob(m_dm->findJobByName("Job"));
    });
    QCOMPARE(m_dm->getAJobObject(second).getName(), QString("Job 2"));
    QCOMPARE(m_dm->getAJobObject(second).getDisplayName(), QString("Panel 4"));
    QCOMPARE(onDataManagerThread([this] { return m_dm->copyJob(NO_INDEX); }), NO_INDEX);
}

// ---------------------------------------------------------------- hand-made status

namespace {

// Stops the status poll for the length of a test, so that only the statuses
// the test hands over are processed.
class PollPause
{
public:
    explicit PollPause(DataManager* dm)
        : m_dm(dm)
    {
        QMetaObject::invokeMethod(dm->getPollStatus(), "onStopPolling", Qt::BlockingQueuedConnection);
        stopped = dm->getPollStatus()->activeTimers().isEmpty();
    }
    ~PollPause() { API_SignalMaster::instance()->emitTriggerResumeIdle(); }
    bool stopped = false;

private:
    DataManager* m_dm;
};

SystemStatus::EntityChange jobEntity(const QString& name, int change = 2)
{
    SystemStatus::EntityChange e;
    e.entity = 1007;
    e.identifier1 = name;
    e.change = change;
    return e;
}

} // namespace

void TestDataManager::jobChangeReReadsTheActiveJobAloneUnlessAnotherJobSaysItChanged()
{
    const auto newJob = [this] {
        const unsigned int index = onDataManagerThread([this] { return m_dm->createNewJob(); });
        return index == NO_INDEX ? QString() : m_dm->getAJobObject(index).getName();
    };
    const QString active = newJob();
    const QString other = newJob();
    QVERIFY(!active.isEmpty() && !other.isEmpty());
    PollPause pause(m_dm);
    QVERIFY(pause.stopped);
    const auto stateOf = [this](const QString& name) {
        return m_dm->getAJobObject(m_dm->findJobByName(name)).getJobState();
    };
    const int activeBefore = stateOf(active);
    const int otherBefore = stateOf(other);
    const int forced = 2003;
    QVERIFY(m_dm->findJobByName(other) != NO_INDEX);
    QVERIFY(activeBefore != forced && otherBefore != forced);
    m_dm->setActiveJob(m_dm->findJobByName(active));
    m_dm->setFullJobUpdateFlag(false);
    // Both jobs change on the server; the GUI learns only that jobs changed.
    m_sim->call([&](Sim::Server& s) {
        s.instrument().jobs().setState(active, forced);
        s.instrument().jobs().setState(other, forced);
    });
    const auto process = [this](const SystemStatus& status) {
        onDataManagerThread([&] {
            m_dm->setSystemStatus(status);
            return 0;
        });
    };
    SystemStatus status = m_dm->getSystemStatus();
    status.setJobID(short(status.getJobID() + 1));
    status.setEntityChanges({});
    process(status);
    QCOMPARE(stateOf(active), forced);
    QCOMPARE(stateOf(other), otherBefore);

    // Changes of other kinds or entities are not about jobs.
    status.setEntityChanges({jobEntity(other, 1), {1006, other, 2}, jobEntity(active)});
    process(status);
    QCOMPARE(stateOf(other), otherBefore);

    // Another job's own change brings the whole list in.
    status.setEntityChanges({jobEntity(other)});
    process(status);
    QCOMPARE(stateOf(other), forced);
    QCOMPARE(m_dm->getActiveJobObject().getName(), active);

    m_sim->call([&](Sim::Server& s) {
        s.instrument().jobs().setState(active, activeBefore);
        s.instrument().jobs().setState(other, otherBefore);
    });
    m_dm->setFullJobUpdateFlag(true);
    onDataManagerThread([this] { return m_dm->refreshJobInfos(); });
}

void TestDataManager::filterBitReloadsTheFiltersAndReportsAFileThatWillNotParse()
{
    PollPause pause(m_dm);
    QVERIFY(pause.stopped);
    // A device tree of this test's own, so that the shared one stays whole.
    const QString stagedRoot = Platform::root();
    const QString root = TestSupport::makeTempDir("filter-root");
    QVERIFY(QDir(root).mkpath("opt/Filter"));
    for (const char* name : {"Filter.xml", "FilterTranslation.xml", "FilterSchema.xsd", "TranslationSchema.xsd"}) {
        const QString path = QString("/opt/Filter/") + name;
        QVERIFY(QFile::copy(Platform::devicePath(path), root + path));
    }
    Platform::setRoot(root);
    const QString filter = Platform::devicePath("/opt/Filter/Filter.xml");
    const QString translation = Platform::devicePath("/opt/Filter/FilterTranslation.xml");

    SystemStatus status = m_dm->getSystemStatus();
    status.setEntityChanges({});
    status.setUSettingsBits(0x10);
    const auto process = [this, &status] {
        onDataManagerThread([&] {
            m_dm->setSystemStatus(status);
            return 0;
        });
    };
    // The filter tree of a paint maker: make, model, colour code.
    process();
    QVERIFY(onDataManagerThread([this] { return m_dm->doesTagExist(); }));
    QCOMPARE(m_log.countStartingWith("MeasurementIssue"), 0);

    // A file cut off in the middle: the operator is told, nothing hangs.
    QFile broken(filter);
    QVERIFY(broken.open(QIODevice::WriteOnly | QIODevice::Truncate));
    broken.write("<?xml version=\"1.0\"?><Filters><Filter Name=\"Make\"><Entry");
    broken.close();
    process();
    QVERIFY(m_log.waitFor("MeasurementIssue(-92934)", 3000));

    // No file at all is the same issue.
    QFile::remove(filter);
    QFile::remove(translation);
    m_log.clear();
    process();
    QVERIFY(m_log.waitFor("MeasurementIssue(-92934)", 3000));
    // Without the bit the filters are left alone.
    m_log.clear();
    status.setUSettingsBits(0);
    process();
    QCOMPARE(m_log.countStartingWith("MeasurementIssue"), 0);
    Platform::setRoot(stagedRoot);
}

QTEST_MAIN(TestDataManager)
#include "tst_datamanager.moc"
