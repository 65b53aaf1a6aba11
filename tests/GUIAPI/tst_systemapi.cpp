// The system API over a scripted server: statuses reduced to true or
// false, the stage loops that end at the first failure, the filter files
// read from the instrument's own disk, and a dead link.

#include "GUIAPI/BackendHarness.h"

#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/Sample.h"

#include <QDir>
#include <QFile>
#include <QtTest>

using namespace BackendHarness;

class TestSystemAPI : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase();
    void statusZeroIsTrueAndAnythingElseFalse();
    void sampleStagesEndAtTheFirstFailure();
    void filterFilesComeFromDiskAndMayBeMissing();
    void syncRequestNamesTheJobInItsParameter();
    void deadLinkIsFalseAndLogged();

private:
    ScriptedPeer m_peer;
};

void TestSystemAPI::initTestCase()
{
    AppShell::registerMetaTypes();
    QVERIFY(m_peer.listen());
    QVERIFY(m_peer.attachCommands());
}

void TestSystemAPI::statusZeroIsTrueAndAnythingElseFalse()
{
    m_peer.answerAll(0, QByteArray(1, char(42)));
    unsigned int volume = 0;
    QVERIFY(SysAPI_GetBeeperVolume(volume));
    QCOMPARE(volume, 42u);

    m_peer.answerAll(9);
    QVERIFY(!SysAPI_GetBeeperVolume(volume));
    QVERIFY(!SysAPI_SetInterfaceConfig(7));
    QVERIFY(!SysAPI_DeleteJob("Job"));
    // A reply that ends early is a failure too.
    m_peer.answerAll(0);
    QVERIFY(!SysAPI_GetBeeperVolume(volume));
}

void TestSystemAPI::sampleStagesEndAtTheFirstFailure()
{
    m_peer.answerAll(5);
    Sample sample;
    const int before = m_peer.receivedFrames().size();
    QVERIFY(!SysAPI_GetSampleImages("Job", 1, sample));
    QCOMPARE(m_peer.receivedFrames().size(), before + 1);
    QVERIFY(!SysAPI_GetSampleTextureAndImages("Job", 1, sample));
    QCOMPARE(m_peer.receivedFrames().size(), before + 2);
    QVERIFY(!SysAPI_GetSampleTextureParameters("Job", 1, sample));
    QCOMPARE(m_peer.receivedFrames().size(), before + 3);
    QVERIFY(!sample.hasImage(IMAGE_NEG_45));
    QVERIFY(!sample.hasTexture(IMAGE_NEG_45));
}

void TestSystemAPI::filterFilesComeFromDiskAndMayBeMissing()
{
    const QString oldRoot = Platform::root();
    const QString root = TestSupport::makeTempDir("systemapi-root");
    Platform::setRoot(root);
    const int frames = m_peer.receivedFrames().size();

    QByteArray filter("left as it was");
    QVERIFY(SysAPI_GetFilter(filter));
    QCOMPARE(filter, QByteArray("left as it was"));

    QVERIFY(QDir(root).mkpath("opt/Filter"));
    QFile file(root + "/opt/Filter/FilterTranslation.xml");
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("<Tags/>");
    file.close();
    QByteArray translation;
    QVERIFY(SysAPI_GetFilterTranslation(translation));
    QCOMPARE(translation, QByteArray("<Tags/>"));

    // A folder where the file should be exists but can't be read as one.
    QVERIFY(QDir(root).mkpath("opt/Filter/Filter.xml"));
    QVERIFY(!SysAPI_GetFilter(filter));

    // Nothing of this goes to the server.
    QCOMPARE(m_peer.receivedFrames().size(), frames);
    Platform::setRoot(oldRoot);
}

void TestSystemAPI::syncRequestNamesTheJobInItsParameter()
{
    m_peer.answerAll(0);
    QVERIFY(SysAPI_SyncJobToWebServer("Job 7"));
    CmdData sent(m_peer.receivedFrames().last());
    QCOMPARE(quint32(sent.getCommandCode()), 0x400A0E10u);
    QCOMPARE(quint32(sent.nextArg_ui16()), quint32(PARAMETER_SYNC_JOB_TO_WEBSERVER));
    QCOMPARE(sent.nextArgString(), QString("Job 7"));
}

void TestSystemAPI::deadLinkIsFalseAndLogged()
{
    m_peer.stop();
    QVERIFY(waitUntil([&] { return !m_peer.hasConnection(); }, 3000));
    settle(1500);
    LogCapture capture;
    PARAMETER_CONTENT_TYPES value;
    value.parameterInt = 1;
    QVERIFY(!SysAPI_SetParameter(PARAMETER_AUTO_MEASURE, value));
    QVERIFY(capture.contains("Error 0x04 in command 0x400a0e10"));
}

QTEST_MAIN(TestSystemAPI)
#include "tst_systemapi.moc"
