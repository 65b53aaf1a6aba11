// A job's identity, its completion rules and its tags on their way to the
// server and back.
#include "SharedSystem/Job.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"

#include <QTemporaryDir>
#include <QtTest>

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

Sample sampleAt(const QDateTime& when, int dbIndex = 0)
{
    Sample sample;
    SAMPLE_INFO_T info;
    info.dbIndex = dbIndex;
    info.timeStamp = when;
    sample.setSampleInfo(info);
    return sample;
}

QStringList ids(const TagItemList& list)
{
    QStringList out;
    for (const TAG_ITEM_T& item : list)
        out << item.tagID + "=" + item.tagText;
    return out;
}

} // namespace

class TestJob : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_root;
    QString m_savedRoot;

private slots:
    void initTestCase()
    {
        m_savedRoot = Platform::root();
        Platform::setRoot(m_root.path());
        Job::setTagStateNameSource([](int state) { return kStates.value(state); });
    }

    void cleanupTestCase()
    {
        Job::setTagStateNameSource(nullptr);
        Platform::setRoot(m_savedRoot);
    }

    void init() { UserParams::setDefaults(); }

    void identityFromTheFileID()
    {
        Job local;
        local.setFileID("LOCAL-17");
        QVERIFY(local.getCreatedOnInstrument());
        QVERIFY(local.isTagEditable());

        Job outside;
        outside.setFileID("17");
        QVERIFY(!outside.getCreatedOnInstrument());
        QVERIFY(!outside.isTagEditable());
        // The tag rule reads the identifier itself, not the flag.
        outside.setCreatedOnInstrument(true);
        QVERIFY(!outside.isTagEditable());

        Job mixed;
        mixed.setFileID("job-Local");
        QVERIFY(mixed.isTagEditable());
    }

    void validityAndTagSlots()
    {
        Job job;
        QVERIFY(!job.isJobValid());
        job.setDisplayName("x");
        job.setNotes("y");
        job.setMaxSamples(3);
        job.setJobState(2005);
        job.addSample(Sample());
        QVERIFY(!job.isJobValid());

        job.setTagData(3, tag("Make", "Ford", "F", "Ford"));
        QVERIFY(job.isJobValid());
        for (int state = 0; state < NUM_TAG_STATES; ++state)
            QVERIFY(job.getTagData(state).filterName.isEmpty());
        QVERIFY(job.getTagData(3).nameHash.contains("default"));

        job.setTagData(1, tag("Model", "Focus", "M", "Focus"));
        QCOMPARE(job.getTagData(1).defaultName(), QString("Focus"));
        job.removeTag(1);
        QCOMPARE(job.getTagData(1).defaultName(), QString());
        QVERIFY(job.getTagData(1).nameHash.contains("default"));

        job.setJobAveragingMode(JOB_AVG_MODE_SMC);
        job.setJobAveragingMode(NUM_JOB_AVG_MODES);
        QCOMPARE(job.getJobAveragingMode(), JOB_AVG_MODE_SMC);
        QCOMPARE(job.getJobAveragingModeString(), QString("SMC"));
    }

    void clearingTakesTheUsersAveraging_data()
    {
        QTest::addColumn<int>("mode");
        QTest::addColumn<uint>("size");
        QTest::addColumn<int>("maxSamples");
        QTest::newRow("smc") << int(JOB_AVG_MODE_SMC) << 0u << 9;
        QTest::newRow("average 3") << int(JOB_AVG_MODE_SIMPLE_3) << 3u << 3;
        QTest::newRow("none") << int(JOB_AVG_MODE_NONE) << 7u << 7;
    }

    void clearingTakesTheUsersAveraging()
    {
        QFETCH(int, mode);
        QFETCH(uint, size);
        QFETCH(int, maxSamples);
        const int number = mode == JOB_AVG_MODE_SIMPLE_3 ? 3 : 5;
        UserParams::setJobDefaultAvgInfo(JOB_AVERAGING_MODE_T(mode), 4, 9, number);
        UserParams::setJobDefaultSize(7);
        Job job;
        QCOMPARE(job.getJobAveragingMode(), JOB_AVG_MODE_GUI);
        QCOMPARE(job.getJobSize(), size);
        QCOMPARE(job.getMaxSamples(), maxSamples);
        QCOMPARE(job.getJobSMC(), 4u);
        QCOMPARE(job.getJobState(), 2001);
        QVERIFY(job.getCreatedOnInstrument());
        QCOMPARE(job.getJobAveragingModeString(), QString("DEV_MODE"));
    }

    void completionRules()
    {
        // Mode 0 with size 0: complete from the start.
        Job none;
        none.setJobAveragingMode(JOB_AVG_MODE_NONE);
        none.setJobSize(0);
        QVERIFY(none.isJobComplete());
        none.setJobSize(2);
        QVERIFY(!none.isJobComplete());
        none.setJobState(2005);
        QVERIFY(none.isJobComplete());

        // Mode 4, open: never complete, however many samples.
        Job open;
        QCOMPARE(open.getJobAveragingMode(), JOB_AVG_MODE_GUI);
        for (int i = 0; i < 100; ++i)
            open.addSample(Sample());
        QVERIFY(!open.isJobComplete());
        open.setJobState(2002);
        QVERIFY(open.isJobComplete());

        // SMC, no longer open: complete even without an averaged sample.
        Job smc;
        smc.setJobAveragingMode(JOB_AVG_MODE_SMC);
        QVERIFY(!smc.isJobComplete());
        smc.setJobState(2003);
        QVERIFY(smc.isJobComplete());
        Job smcAveraged;
        smcAveraged.setJobAveragingMode(JOB_AVG_MODE_SMC);
        smcAveraged.setAveragedSample(Sample());
        QVERIFY(smcAveraged.isJobComplete());
    }

    void modeFourReadsThePresentDefaults()
    {
        Job job;
        job.setJobState(2006);
        // The defaults of the moment decide, not those at creation.
        UserParams::setJobDefaultAvgInfo(JOB_AVG_MODE_SMC, 3, 5, 5);
        QVERIFY(!job.isJobComplete());
        job.setAveragedSample(Sample());
        QVERIFY(job.isJobComplete());
        job.setJobState(2001);
        QVERIFY(!job.isJobComplete());

        Job simple;
        simple.setJobState(2008);
        simple.setJobSize(0);
        UserParams::setJobDefaultAvgInfo(JOB_AVG_MODE_SIMPLE_3, 3, 5, 3);
        simple.addSample(Sample());
        simple.addSample(Sample());
        QVERIFY(!simple.isJobComplete());
        simple.addSample(Sample());
        QVERIFY(simple.isJobComplete());
        UserParams::setJobDefaultAvgInfo(JOB_AVG_MODE_NONE, 3, 5, 5);
        UserParams::setJobDefaultSize(4);
        QVERIFY(!simple.isJobComplete());
    }

    void samplesByIndex()
    {
        Job job;
        job.addSample(sampleAt(QDateTime(QDate(2024, 3, 1), QTime(9, 0)), 11));
        job.addSample(sampleAt(QDateTime(QDate(2024, 3, 2), QTime(9, 0)), 12));
        Sample average = sampleAt(QDateTime(QDate(2025, 1, 1), QTime(9, 0)), 255);
        job.updateSample(255, average);
        QVERIFY(!job.getAveragedSampleComplete());
        QCOMPARE(job.getSample(255).getDBIndex(), 255);
        QCOMPARE(job.getSample(1).getDBIndex(), 12);
        QVERIFY(!job.getSample(2).isValid());
        QVERIFY(job.getSamplePointer(2) == nullptr);
        QCOMPARE(job.getSamplePointer(255)->getDBIndex(), 255);
        job.getSamplePointer(0)->setTemperature(30.0f);
        QCOMPARE(job.getSample(0).getTemperature(), 30.0f);

        // The averaged sample doesn't count for the completion date.
        QCOMPARE(job.getDateComplete(), QDateTime(QDate(2024, 3, 2), QTime(9, 0)));
        job.deleteSample(5);
        job.deleteSample(1);
        QCOMPARE(job.getNumSamples(), 1);
        QCOMPARE(job.getDateComplete(), QDateTime(QDate(2024, 3, 1), QTime(9, 0)));
        job.setAveragedSample(average);
        QVERIFY(job.getAveragedSampleComplete());
        job.clearAveragedSample();
        QVERIFY(!job.getAveragedSampleComplete());

        QCOMPARE(job.getDateCompletedString(), QString("9:00:00 am 03/01/24"));

        Job empty;
        QCOMPARE(empty.getDateComplete().toSecsSinceEpoch(), qint64(0));
        QVERIFY(empty.getDateCompletedString().isEmpty());
        QVERIFY(jobLessThan(empty, job));
        QVERIFY(!jobLessThan(job, empty));
    }

    void equalityIgnoresWhatTheServerDoesNotKey()
    {
        Job a;
        a.setFileID("LOCAL-1");
        a.setName("A");
        a.setTagData(0, tag("Make", "Ford", "F", "Ford"));
        a.addSample(sampleAt(QDateTime(QDate(2024, 1, 1), QTime(8, 0)), 1));
        Job b = a;
        b.setDisplayName("other");
        b.setNotes("notes");
        b.setJobState(2008);
        b.setMaxSamples(99);
        b.setAveragedSample(Sample());
        QVERIFY(a == b);

        b.setTagData(0, tag("Make", "Ford", "F2", "Ford"));
        QVERIFY(a != b);
        b = a;
        b.updateSample(0, sampleAt(QDateTime(QDate(2024, 1, 1), QTime(8, 0)), 2));
        QVERIFY(a != b);
        b = a;
        b.setJobSMC(8);
        QVERIFY(a != b);
    }

    void tagsForTheServer()
    {
        Job job;
        job.setFileID("LOCAL-5");
        job.setTagData(0, tag("Make", "Ford", "MAKE_FORD", "Ford"));
        job.setTagData(2, tag("Colour Code", "Z1 Frozen White", "COLOUR_FORD_Z1", "Z1 Frosty"));
        QCOMPARE(ids(job.getJobTagsTheServerCanHandle()),
                 QStringList({"DisplayName=", "Make=Ford", "MakeId=MAKE_FORD", "DisplayMake=Ford",
                              "Colour Code=Z1 Frozen White", "Colour CodeId=COLOUR_FORD_Z1",
                              "DisplayColour Code=Z1 Frosty"}));
        job.setNotes("left door");
        job.setDisplayName("Door");
        const TagItemList list = job.getJobTagsTheServerCanHandle();
        QCOMPARE(ids(list).first(), QString("DisplayName=Door"));
        QCOMPARE(ids(list).last(), QString("DisplayNotes=left door"));
        // Clearing the notes sends no notes item at all.
        job.setNotes(QString());
        QVERIFY(!ids(job.getJobTagsTheServerCanHandle()).join(",").contains("DisplayNotes"));
    }

    void roundTripOfAJobMadeHere()
    {
        Job job;
        job.setFileID("LOCAL-5");
        job.setName("JOB 5");
        job.setDisplayName("Door");
        job.setNotes("left door");
        job.setTagData(0, tag("Make", "Ford", "MAKE_FORD", "Ford"));
        job.setTagData(1, tag("Model", "Focus", "MODEL_FORD_FOCUS", "Focus"));
        job.setTagData(2, tag("Colour Code", "J7 Magnetic Grey", "COLOUR_FORD_J7", "J7 Magnetic"));

        Job back;
        back.setFileID("LOCAL-5");
        back.setName("JOB 5");
        back.setJobTagsFromServer(job.getJobTagsTheServerCanHandle());
        QCOMPARE(back.getDisplayName(), QString("Door"));
        QCOMPARE(back.getNotes(), QString("left door"));
        for (int state = 0; state < NUM_TAG_STATES; ++state)
            QVERIFY(back.getTagData(state).sameEntry(job.getTagData(state)));
        QCOMPARE(back.getTagListForServer().size(), job.getJobTagsTheServerCanHandle().size());
    }

    void madeHereCarriesTheEntryOver()
    {
        // A tag without companions keeps the id and display name of the tag
        // matched before it. Names match the states trimmed and in any case.
        Job job;
        job.setFileID("LOCAL-9");
        job.setName("NINE");
        job.setJobTagsFromServer({{"DisplayName", ""},
                                  {"Make", "Ford"},
                                  {"MakeId", "MAKE_FORD"},
                                  {"DisplayMake", "Ford Motor"},
                                  {" model ", "Focus"},
                                  {"Unknown", "dropped"}});
        QCOMPARE(job.getDisplayName(), QString("NINE"));
        const TAG_ENTRY_DATA_T model = job.getTagData(1);
        QCOMPARE(model.filterName, QString(" model "));
        QCOMPARE(model.defaultName(), QString("Focus"));
        QCOMPARE(model.id, QString("MAKE_FORD"));
        QCOMPARE(model.displayName, QString("Ford Motor"));
        QVERIFY(job.getTagData(2).filterName.isEmpty());
    }

    void outsideJobKeepsTheTagTextAndUsesSpares()
    {
        Job job;
        job.setFileID("17");
        job.setName("WEB JOB");
        job.setJobTagsFromServer({{"DisplayNotes", "from the office"},
                                  {"Make", "Toyota"},
                                  {"MakeId", ""},
                                  {"DisplayMake", ""},
                                  {"Insurer", "ACME"},
                                  {"InsurerId", "INS-4"},
                                  {"DisplayNotes", "second notes item"}});
        QCOMPARE(job.getNotes(), QString("from the office"));
        QCOMPARE(job.getDisplayName(), QString("WEB JOB"));

        // An empty display companion leaves the tag text as the display name.
        const TAG_ENTRY_DATA_T make = job.getTagData(0);
        QCOMPARE(make.defaultName(), QString("Toyota"));
        QCOMPARE(make.displayName, QString("Toyota"));
        QVERIFY(make.id.isEmpty());

        // An unknown tag lands as a spare three times, is kept once and
        // fills the first empty slot. "Make" also made two spares, which
        // equal slot 0 and go.
        const TAG_ENTRY_DATA_T insurer = job.getTagData(1);
        QCOMPARE(insurer.filterName, QString("Insurer"));
        QCOMPARE(insurer.defaultName(), QString("ACME"));
        QCOMPARE(insurer.id, QString("INS-4"));
        QVERIFY(job.getTagData(2).filterName.isEmpty());
    }

    void roundTripOfAnOutsideJob()
    {
        Job job;
        job.setFileID("JOB-204");
        job.setName("WEB 204");
        job.setDisplayName("Tailgate");
        job.setTagData(0, tag("Make", "Honda", "MAKE_HONDA", "Honda"));
        job.setTagData(2, tag("Colour Code", "R81 Flame Red", "COLOUR_HONDA_R81", "Rouge flamme"));

        Job back;
        back.setFileID("JOB-204");
        back.setName("WEB 204");
        back.setJobTagsFromServer(job.getJobTagsTheServerCanHandle());
        QCOMPARE(back.getDisplayName(), QString("Tailgate"));
        QVERIFY(back.getTagData(0).sameEntry(job.getTagData(0)));
        QVERIFY(back.getTagData(1).filterName.isEmpty());
        QVERIFY(back.getTagData(2).sameEntry(job.getTagData(2)));
        QVERIFY(back.getNotes().isEmpty());
    }

    void withoutStateNamesEveryTagIsASpare()
    {
        Job::setTagStateNameSource(nullptr);
        Job job;
        job.setFileID("88");
        job.setJobTagsFromServer({{"Make", "BMW"}, {"Model", "X5"}, {"Colour Code", "668 Black"}, {"Trim", "M"}});
        QCOMPARE(job.getTagData(0).defaultName(), QString("BMW"));
        QCOMPARE(job.getTagData(1).defaultName(), QString("X5"));
        QCOMPARE(job.getTagData(2).defaultName(), QString("668 Black"));
        Job::setTagStateNameSource([](int state) { return kStates.value(state); });
    }
};

QTEST_GUILESS_MAIN(TestJob)
#include "tst_job.moc"
