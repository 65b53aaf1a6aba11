// The job records on the wire and the job commands, against a scripted
// server.
#include "Commands/JobOutCommands.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/UserParams.h"
#include "support/ScriptedPeer.h"

#include <QSignalSpy>
#include <QtTest>

#include <memory>

namespace {

const QStringList kStates = {"Make", "Model", "Colour Code"};

TAG_ENTRY_DATA_T tag(const QString& filter, const QString& name, const QString& id, const QString& display)
{
    TAG_ENTRY_DATA_T entry;
    entry.filterName = filter;
    entry.setDefaultName(name);
    entry.id = id;
    entry.displayName = display;
    return entry;
}

struct Description {
    int dbIndex = 4;
    QString name = "JOB 4";
    TagItemList plain;
    TagItemList wide;
    int size = 5;
    QString fileID = "LOCAL-4";
    QString mode = "NONE";
    int spare = 9;
};

void appendDescription(CmdData& out, const Description& d)
{
    out.append_si32(d.dbIndex);
    out.appendString(d.name);
    out.append_si32(d.plain.size());
    for (const TAG_ITEM_T& t : d.plain)
        out.appendTag(t);
    out.append_si32(d.wide.size());
    for (const TAG_ITEM_T& t : d.wide)
        out.appendTag32(t);
    out.append_ui8(char(d.size));
    out.appendString(d.fileID);
    out.appendString(d.mode);
    out.append_ui8(char(d.spare));
}

void appendSampleInfo(CmdData& out, int dbIndex, int day)
{
    out.append_si32(dbIndex);
    const char time[6] = {124, 4, char(day), 10, 30, 0}; // 2024-05-day 10:30:00
    out.appendBuffer(time, 6);
    out.append_f32(1.0f);
    out.append_f32(2.0f);
    out.append_f32(23.5f);
    for (int i = 0; i < 4; ++i)
        out.append_si16(short(i));
    out.append_ui8(1);
    out.append_ui8(CALIBRATION_STATUS_GOOD);
    out.append_ui8(1);
    out.append_ui8(1);
    out.append_ui8(0);
}

struct Info {
    Description description;
    int samples = 2;
    int state = 2001;
    QString mode = "NONE";
    int size = 5;
    int maxSamples = 5;
    QByteArray spare = "xyz";
};

void appendInfo(CmdData& out, const Info& info)
{
    appendDescription(out, info.description);
    out.append_si32(info.samples);
    for (int i = 0; i < info.samples; ++i)
        appendSampleInfo(out, 100 + i, 10 + i);
    out.append_si32(info.state);
    out.appendString(info.mode);
    out.append_si32(info.size);
    out.append_si32(info.maxSamples);
    out.append_si32(info.spare.size());
    out.appendBuffer(info.spare);
}

QByteArray payloadOf(const std::function<void(CmdData&)>& write)
{
    CmdData data;
    write(data);
    return data.getBuffer();
}

// The request's arguments, ready to be read.
CmdData request(const QByteArray& frame)
{
    return CmdData(frame);
}

} // namespace

class TestJobCommands : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;

    void answer(quint32 status, const QByteArray& payload = QByteArray())
    {
        m_peer->setResponder([status, payload](const QByteArray& frame) {
            return ScriptedPeer::Reply{{ScriptedPeer::replyTo(frame, status, payload)}, 0};
        });
    }

    QByteArray lastRequest() const { return m_peer->receivedFrames().value(m_peer->receivedFrames().size() - 1); }

    // Sends the job with an add, then feeds the description it sent back
    // as the server's job info record.
    Job echoedAsJobInfo(const Job& job)
    {
        int index = 0;
        answer(0, payloadOf([](CmdData& d) { d.append_si32(1); }));
        if (CmdOut_AddJob(job, index) != STATUS_OK)
            return Job();
        CmdData reply;
        reply.appendBuffer(request(lastRequest()).getBuffer());
        reply.append_si32(0);
        reply.append_si32(2001);
        reply.appendString("NONE");
        reply.append_si32(5);
        reply.append_si32(5);
        reply.append_si32(0);
        answer(0, reply.getBuffer());
        Job readBack;
        if (CmdOut_GetJobInfo(job.getFileID(), readBack) != STATUS_OK)
            return Job();
        return readBack;
    }

private slots:
    void initTestCase()
    {
        Job::setTagStateNameSource([](int state) { return kStates.value(state); });
        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen());
        setIpAddress("127.0.0.1");
        setIpPort(m_peer->port());
        QSignalSpy reconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpReconnected);
        Commands::Init();
        QVERIFY(reconnected.wait(3000));
    }

    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
        Job::setTagStateNameSource(nullptr);
    }

    void init() { UserParams::setDefaults(); }

    void jobInfosAreDecoded()
    {
        Info first;
        first.description.plain = {{"Make", "Ford"}, {"MakeId", "MAKE_FORD"}};
        first.description.wide = {{"DisplayName", "Bonnet"}, {"DisplayMake", "Ford"}, {"DisplayNotes", "scratch"}};
        Info second;
        second.description.dbIndex = 7;
        second.description.fileID = "JOB-7";
        second.description.name = "WEB";
        second.samples = 0;
        second.state = 2008;
        answer(0, payloadOf([&](CmdData& d) {
            d.append_si32(2);
            appendInfo(d, first);
            appendInfo(d, second);
        }));

        QVector<Job> jobs(5);
        QCOMPARE(CmdOut_GetJobInfos(jobs), STATUS_OK);
        QCOMPARE(request(lastRequest()).getCommandCode(), 0x40010000L);
        QCOMPARE(jobs.size(), 2);
        const Job& a = jobs.at(0);
        QVERIFY(a.isJobValid());
        QCOMPARE(a.getDBIndex(), 4);
        QCOMPARE(a.getName(), QString("JOB 4"));
        QCOMPARE(a.getDisplayName(), QString("Bonnet"));
        QCOMPARE(a.getNotes(), QString("scratch"));
        QCOMPARE(a.getTagData(0).defaultName(), QString("Ford"));
        QCOMPARE(a.getTagData(0).id, QString("MAKE_FORD"));
        QCOMPARE(a.getNumSamples(), 2);
        QCOMPARE(a.getSample(1).getDBIndex(), 101);
        QCOMPARE(a.getSample(1).getTimeStamp(), QDateTime(QDate(2024, 5, 11), QTime(10, 30)));
        QCOMPARE(a.getSample(1).getTemperature(), 23.5f);
        QCOMPARE(a.getJobState(), 2001);
        QCOMPARE(a.getJobSize(), 5u);
        QCOMPARE(a.getMaxSamples(), 5);
        QCOMPARE(a.getJobAveragingMode(), JOB_AVG_MODE_NONE);
        QCOMPARE(jobs.at(1).getFileID(), QString("JOB-7"));
        QCOMPARE(jobs.at(1).getDisplayName(), QString("WEB"));
        QCOMPARE(jobs.at(1).getJobState(), 2008);
        QCOMPARE(jobs.at(1).getNumSamples(), 0);
    }

    void averageReadsDifferentlyInTheTwoRecords_data()
    {
        QTest::addColumn<QString>("descriptionMode");
        QTest::addColumn<int>("descriptionSize");
        QTest::addColumn<QString>("infoMode");
        QTest::addColumn<int>("infoSize");
        QTest::addColumn<int>("mode");
        QTest::newRow("description AVERAGE, size 7") << "AVERAGE" << 7 << "SMC" << 7 << int(JOB_AVG_MODE_SIMPLE_3);
        QTest::newRow("description average, size 5") << " average " << 5 << "NONE" << 5 << int(JOB_AVG_MODE_SIMPLE_5);
        QTest::newRow("info AVERAGE, size 7") << "DEV_MODE" << 7 << "AVERAGE" << 7 << int(JOB_AVG_MODE_NONE);
        QTest::newRow("info AVERAGE, size 3") << "DEV_MODE" << 9 << "AVERAGE" << 3 << int(JOB_AVG_MODE_SIMPLE_3);
        QTest::newRow("info smc") << "dev_mode" << 5 << "smc" << 5 << int(JOB_AVG_MODE_SMC);
        QTest::newRow("info stays open") << "DEV_MODE" << 5 << "DEV_MODE" << 5 << int(JOB_AVG_MODE_GUI);
        QTest::newRow("info unknown") << "DEV_MODE" << 5 << "MEDIAN" << 5 << int(JOB_AVG_MODE_NONE);
        QTest::newRow("description smc") << "SMC" << 5 << "AVERAGE" << 5 << int(JOB_AVG_MODE_SMC);
    }

    void averageReadsDifferentlyInTheTwoRecords()
    {
        QFETCH(QString, descriptionMode);
        QFETCH(int, descriptionSize);
        QFETCH(QString, infoMode);
        QFETCH(int, infoSize);
        QFETCH(int, mode);
        Info info;
        info.description.mode = descriptionMode;
        info.description.size = descriptionSize;
        info.mode = infoMode;
        info.size = infoSize;
        answer(0, payloadOf([&](CmdData& d) { appendInfo(d, info); }));
        Job job;
        QCOMPARE(CmdOut_GetJobInfo("LOCAL-4", job), STATUS_OK);
        QCOMPARE(int(job.getJobAveragingMode()), mode);
        QCOMPARE(job.getJobSize(), unsigned(infoSize));
    }

    void aShortReplyKeepsWhatWasRead()
    {
        Info info;
        QByteArray payload = payloadOf([&](CmdData& d) { appendInfo(d, info); });
        payload.chop(5);
        answer(0, payload);
        Job job;
        QCOMPARE(CmdOut_GetJobInfo("LOCAL-4", job), STATUS_BAD_RESPONSE);
        QCOMPARE(job.getName(), QString("JOB 4"));
        QCOMPARE(job.getNumSamples(), 2);

        CmdData sent = request(lastRequest());
        QCOMPARE(sent.getCommandCode(), 0x40010020L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-4"));
        QCOMPARE(sent.getPacketlength(), 0);
    }

    void descriptionOnTheWire()
    {
        Job job;
        job.setDBIndex(12);
        job.setFileID("LOCAL-12");
        job.setName("WING");
        job.setDisplayName("Wing");
        job.setNotes("front left");
        job.setJobSize(0x105);
        job.setJobAveragingMode(JOB_AVG_MODE_SIMPLE_3);
        job.setTagData(0, tag("Make", "Citroën", "MAKE_CITROEN", "Citroën"));
        job.setTagData(1, tag("Model", "C3", "MODEL_C3", "C3"));

        int index = -1;
        answer(0, payloadOf([](CmdData& d) { d.append_si32(31); }));
        QCOMPARE(CmdOut_AddJob(job, index), STATUS_OK);
        QCOMPARE(index, 31);

        CmdData sent = request(lastRequest());
        QCOMPARE(sent.getCommandCode(), 0x40010030L);
        QCOMPARE(sent.nextArg_si32(), 12);
        QCOMPARE(sent.nextArgString(), QString("WING"));
        // Plain: what is ASCII and no "Display..." companion.
        QCOMPARE(sent.nextArg_si32(), 3);
        QCOMPARE(sent.nextArgTag().tagID, QString("MakeId"));
        TAG_ITEM_T model = sent.nextArgTag();
        QCOMPARE(model.tagID + "=" + model.tagText, QString("Model=C3"));
        QCOMPARE(sent.nextArgTag().tagID, QString("ModelId"));
        // Wide, the display name first.
        QCOMPARE(sent.nextArg_si32(), 5);
        QCOMPARE(sent.nextArgTag32().tagID, QString("DisplayName"));
        const TAG_ITEM_T make = sent.nextArgTag32();
        QCOMPARE(make.tagID + "=" + make.tagText, QString("Make=Citroën"));
        QCOMPARE(sent.nextArgTag32().tagID, QString("DisplayMake"));
        QCOMPARE(sent.nextArgTag32().tagID, QString("DisplayModel"));
        const TAG_ITEM_T notes = sent.nextArgTag32();
        QCOMPARE(notes.tagID + "=" + notes.tagText, QString("DisplayNotes=front left"));
        QCOMPARE(int(sent.nextArg_ui8()), 5);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-12"));
        QCOMPARE(sent.nextArgString(), QString("AVERAGE"));
        QCOMPARE(int(sent.nextArg_ui8()), 0);
        QCOMPARE(sent.getPacketlength(), 0);
    }

    void displayNameGoesFirstAmongTheWideTags()
    {
        // With a non-ASCII tag ahead of it the name would not lead on its own.
        Job job;
        job.setFileID("LOCAL-1");
        job.setName("N");
        job.setDisplayName("Schräg");
        int index = 0;
        answer(0, payloadOf([](CmdData& d) { d.append_si32(1); }));
        QCOMPARE(CmdOut_AddJob(job, index), STATUS_OK);
        CmdData sent = request(lastRequest());
        sent.nextArg_si32();
        sent.nextArgString();
        QCOMPARE(sent.nextArg_si32(), 0);
        QCOMPARE(sent.nextArg_si32(), 1);
        const TAG_ITEM_T name = sent.nextArgTag32();
        QCOMPARE(name.tagID + "=" + name.tagText, QString("DisplayName=Schräg"));
    }

    void addJobRefusedKeepsTheIndex()
    {
        Job job;
        job.setFileID("LOCAL-2");
        int index = 77;
        answer(9);
        QCOMPARE(CmdOut_AddJob(job, index), 9u);
        QCOMPARE(index, 77);
    }

    void roundTripOfAJobMadeHere()
    {
        Job job;
        job.setFileID("LOCAL-30");
        job.setName("JOB 30");
        job.setDisplayName("Door");
        job.setNotes("rear");
        job.setTagData(0, tag("Make", "Toyota", "MAKE_TOYOTA", "Toyota"));
        job.setTagData(1, tag("Model", "Yaris", "MODEL_TOYOTA_YARIS", "Yaris"));
        job.setTagData(2, tag("Colour Code", "089 Pearl White", "COLOUR_TOYOTA_089", "089 Blanc nacré"));

        const Job back = echoedAsJobInfo(job);
        QCOMPARE(back.getDisplayName(), QString("Door"));
        QCOMPARE(back.getNotes(), QString("rear"));
        for (int state = 0; state < NUM_TAG_STATES; ++state)
            QVERIFY2(back.getTagData(state).sameEntry(job.getTagData(state)), qPrintable(QString::number(state)));
    }

    void roundTripOfAnOutsideJob()
    {
        // An outside job's empty display companion keeps the tag text.
        Job job;
        job.setFileID("WEB-8");
        job.setName("WEB 8");
        job.setTagData(0, tag("Make", "BMW", "MAKE_BMW", QString()));
        job.setTagData(1, tag("Insurer", "ACME", "INS-1", "ACME Insurance"));

        const Job back = echoedAsJobInfo(job);
        QCOMPARE(back.getDisplayName(), QString("WEB 8"));
        QCOMPARE(back.getTagData(0).defaultName(), QString("BMW"));
        QCOMPARE(back.getTagData(0).displayName, QString("BMW"));
        QCOMPARE(back.getTagData(0).id, QString("MAKE_BMW"));
        // The unknown category comes back as a spare in the first free slot.
        QCOMPARE(back.getTagData(1).filterName, QString("Insurer"));
        QCOMPARE(back.getTagData(1).displayName, QString("ACME Insurance"));
        QVERIFY(back.getTagData(2).filterName.isEmpty());
    }

    void simpleJobCommands()
    {
        answer(1066);
        QCOMPARE(CmdOut_DeleteJob("LOCAL-3"), 1066u);
        CmdData sent = request(lastRequest());
        QCOMPARE(sent.getCommandCode(), 0x40010040L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-3"));

        Job job;
        job.setFileID("LOCAL-3");
        answer(0);
        QCOMPARE(CmdOut_EditJob("LOCAL-3", job), STATUS_OK);
        sent = request(lastRequest());
        QCOMPARE(sent.getCommandCode(), 0x40010050L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-3"));
        QCOMPARE(sent.nextArg_si32(), 0);

        answer(0, payloadOf([](CmdData& d) {
            d.append_ui32(40);
            d.append_ui32(100);
        }));
        unsigned long a = 0;
        unsigned long b = 0;
        QCOMPARE(CmdOut_GetJobInfoWeb("LOCAL-3", a, b), STATUS_OK);
        QCOMPARE(a, 40ul);
        QCOMPARE(b, 100ul);

        // Validated commands hand a server's refusal on as 2.
        answer(9);
        QCOMPARE(CmdOut_SetJobSaved("LOCAL-3"), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(request(lastRequest()).getCommandCode(), 0x40010070L);
    }

    void deleteSampleSendsTheLowByte()
    {
        answer(0);
        QCOMPARE(CmdOut_DeleteSample("LOCAL-5", 256), STATUS_OK);
        CmdData sent = request(lastRequest());
        QCOMPARE(sent.getCommandCode(), 0x41000110L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-5"));
        QCOMPARE(int(sent.nextArg_ui8()), 0);
        QCOMPARE(CmdOut_DeleteSample("LOCAL-5", 255), STATUS_OK);
        sent = request(lastRequest());
        sent.nextArgString();
        QCOMPARE(int(sent.nextArg_ui8()), 255);
    }
};

QTEST_GUILESS_MAIN(TestJobCommands)
#include "tst_jobcommands.moc"
