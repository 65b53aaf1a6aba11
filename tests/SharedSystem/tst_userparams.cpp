// The user's settings as held between server reads, and the instrument
// model's capabilities.
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>
#include <QtTest>

#include <thread>

class TestUserParams : public QObject
{
    Q_OBJECT

private:
    QTemporaryDir m_root;
    QString m_savedRoot;

    QString languageFile() const { return m_root.path() + "/opt/GUI/Languages/default_language.bin"; }

    void writeLanguageFile(const QByteArray& content)
    {
        QDir().mkpath(QFileInfo(languageFile()).absolutePath());
        QFile file(languageFile());
        QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
        file.write(content);
    }

    QByteArray readLanguageFile() const
    {
        QFile file(languageFile());
        return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray("<missing>");
    }

private slots:
    void initTestCase()
    {
        QVERIFY(m_root.isValid());
        m_savedRoot = Platform::root();
        Platform::setRoot(m_root.path());
    }

    void cleanupTestCase() { Platform::setRoot(m_savedRoot); }

    void init()
    {
        QFile::remove(languageFile());
        UserParams::Init();
        Instrument_Set_Model_Type(MODEL_REFINISH_BIRCH);
    }

    void defaultsFollowTheTable()
    {
        QCOMPARE(UserParams::getLanguageCode(), QString("en"));
        QCOMPARE(UserParams::getDecimalPointString(), QString("."));
        QCOMPARE(UserParams::getPrecision(), 2);
        QCOMPARE(UserParams::getBeeperVolume(), 5u);
        QCOMPARE(UserParams::getPowerDisplayOffTime(), 60);
        QCOMPARE(UserParams::getPowerStandbyTime(), 1800);
        QCOMPARE(UserParams::getPowerOffTime(), 3600);
        QCOMPARE(UserParams::getAutoMeasureTimeout(), 1.0f);
        QVERIFY(UserParams::getDisplayLABCH() && UserParams::getDisplayRainbow());
        QVERIFY(UserParams::getUseFilterFile() && UserParams::getOrientationEnabled() && UserParams::getWifiEnabled());
        QVERIFY(!UserParams::getLabModeEnabled());
        QCOMPARE(UserParams::getCalibrationWarningTimeout(), 8u);
        QCOMPARE(UserParams::getPowerManagementSetting(), 4u);
        QCOMPARE(UserParams::getIllumObs(), COLOR_ILLUM_OBS_D65_10);
        QCOMPARE(UserParams::getPressureSensorSensitivity(), PRESSURE_SENSITIVITY_MEDIUM);
        QCOMPARE(UserParams::getJobDefaultName(), QString("NEW JOB"));
        const JOB_AVERAGING_INFO_T avg = UserParams::getJobDefaultAvgInfo();
        QCOMPARE(int(avg.mode), int(JOB_AVG_MODE_NONE));
        QCOMPARE(avg.smcGoodMeasurements, 3);
        QCOMPARE(avg.smcMaxMeasurements, 5);
        QCOMPARE(avg.averageNumber, 5);
        QCOMPARE(UserParams::getJobDefaultSize(), 5u);
        QCOMPARE(UserParams::getDateFormat(), QString("MM/dd/yy"));
        QCOMPARE(UserParams::getTimeFormat(), QString("h:mm:ss ap"));
        for (int type = 0; type < FUNCTION_TYPES_ENUM_SIZE; ++type)
            QVERIFY(UserParams::getSampleViewModeEnabled(FUNCTION_TYPE_T(type)));
    }

    void languageSurvivesALostLinkThroughItsFile()
    {
        writeLanguageFile("de\n");
        UserParams::setDefaults();
        QCOMPARE(UserParams::getLanguageCode(), QString("de"));

        UserParams::setLanguageCode("ja");
        QCOMPARE(readLanguageFile(), QByteArray("ja"));
        // A lost link resets everything else, but the next start and the
        // defaults begin in the language last chosen.
        UserParams::setPrecision(4);
        UserParams::setDefaults();
        QCOMPARE(UserParams::getPrecision(), 2);
        QCOMPARE(UserParams::getLanguageCode(), QString("ja"));
    }

    void emptyLanguageCodeLeavesCodeAndFileAlone()
    {
        writeLanguageFile("fr");
        UserParams::setDefaults();
        const QDateTime before = QFileInfo(languageFile()).lastModified();
        UserParams::setLanguageCode(QString());
        QCOMPARE(UserParams::getLanguageCode(), QString("fr"));
        QCOMPARE(readLanguageFile(), QByteArray("fr"));
        QCOMPARE(QFileInfo(languageFile()).lastModified(), before);
    }

    void numberFormatTakesTheFirstCharacterAndCountsHashes()
    {
        UserParams::setNumberFormat("0.###");
        QCOMPARE(UserParams::getDecimalPoint(), QString("0"));
        QCOMPARE(UserParams::getPrecision(), 3);

        UserParams::setNumberFormat(",0");
        QCOMPARE(UserParams::getDecimalPoint(), QString(","));
        QCOMPARE(UserParams::getPrecision(), 2);

        // An empty format keeps the separator and falls back to 2 decimals.
        UserParams::setNumberFormat(QString());
        QCOMPARE(UserParams::getDecimalPoint(), QString(","));
        QCOMPARE(UserParams::getPrecision(), 2);
    }

    void settersThatRefuseOrRewrite()
    {
        UserParams::setDecimalPoint(QString());
        UserParams::setDateFormat(QString());
        UserParams::setTimeFormat(QString());
        QCOMPARE(UserParams::getDecimalPoint(), QString("."));
        QCOMPARE(UserParams::getDateFormat(), QString("MM/dd/yy"));
        QCOMPARE(UserParams::getTimeFormat(), QString("h:mm:ss ap"));

        UserParams::setMeasuringCircleID("circle_red.png");
        QCOMPARE(UserParams::getMeasuringCircleID(), QString("/opt/GUI/Branding/circle_red.png"));

        UserParams::setSampleViewModeEnabled(FUNCTION_TEXTURE, false);
        UserParams::setSampleViewModeEnabled(FUNCTION_TYPES_ENUM_SIZE, false);
        QVERIFY(!UserParams::getSampleViewModeEnabled(FUNCTION_TEXTURE));
        QVERIFY(!UserParams::getSampleViewModeEnabled(FUNCTION_TYPES_ENUM_SIZE));
        QVERIFY(UserParams::getSampleViewModeEnabled(FUNCTION_COLORVIEW));

        UserParams::setJobDefaultTag(49, 7);
        UserParams::setJobDefaultTag(50, 9);
        QCOMPARE(UserParams::getJobDefaultTag(49), 7u);
        QCOMPARE(UserParams::getJobDefaultTag(50), 0u);

        UserParams::setLabModeJob("LAB-1");
        QVERIFY(UserParams::getLabModeEnabled());
    }

    void averagingModeFromTheServersText()
    {
        QCOMPARE(jobAveragingModeFromParameter(" smc ", 0), JOB_AVG_MODE_SMC);
        QCOMPARE(jobAveragingModeFromParameter("AVERAGE", 3), JOB_AVG_MODE_SIMPLE_3);
        QCOMPARE(jobAveragingModeFromParameter("average", 5), JOB_AVG_MODE_SIMPLE_5);
        QCOMPARE(jobAveragingModeFromParameter("AVERAGE", 7), JOB_AVG_MODE_NONE);
        QCOMPARE(jobAveragingModeFromParameter("DEV_MODE", 5), JOB_AVG_MODE_NONE);
        QCOMPARE(jobAveragingModeText(JOB_AVG_MODE_SIMPLE_5), QString("AVERAGE"));
        QCOMPARE(jobAveragingModeText(JOB_AVG_MODE_GUI), QString("DEV_MODE"));
        QCOMPARE(jobAveragingModeText(JOB_AVERAGING_MODE_T(9)), QString("NONE"));
    }

    void readersAndWritersOnSeveralThreads()
    {
        // Strings are handed out as copies under the lock: a reader never
        // sees a half-written value.
        std::atomic<bool> bad{false};
        std::thread writer([] {
            for (int i = 0; i < 2000; ++i)
                UserParams::setJobDefaultName(i % 2 ? QStringLiteral("ODD JOB NAME") : QStringLiteral("EVEN"));
        });
        std::thread reader([&bad] {
            for (int i = 0; i < 2000; ++i) {
                const QString name = UserParams::getJobDefaultName();
                if (name != "ODD JOB NAME" && name != "EVEN" && name != "NEW JOB")
                    bad = true;
            }
        });
        writer.join();
        reader.join();
        QVERIFY(!bad);
    }

    void modelCapabilities_data()
    {
        QTest::addColumn<int>("model");
        QTest::addColumn<int>("angles");
        QTest::addColumn<int>("cameras");
        QTest::addColumn<int>("thumbnail");
        QTest::newRow("birch") << int(MODEL_REFINISH_BIRCH) << 6 << 6 << 44;
        QTest::newRow("alder") << int(MODEL_REFINISH_ALDER) << 11 << 5 << 56;
        QTest::newRow("qc") << int(MODEL_QC) << 11 << 6 << 44;
        QTest::newRow("mid tier") << int(MODEL_REFINISH_MID_TIER) << 6 << 6 << 44;
    }

    void modelCapabilities()
    {
        QFETCH(int, model);
        QFETCH(int, angles);
        QFETCH(int, cameras);
        QFETCH(int, thumbnail);
        Instrument_Set_Model_Type(MODEL_TYPES_T(model));
        QCOMPARE(Instrument_Get_Num_Spectral_Angles(), angles);
        QCOMPARE(Instrument_Get_Num_Camera_Images(), cameras);
        QCOMPARE(Instrument_Get_Sample_Thumbnail_Width(), thumbnail);
        QCOMPARE(Instrument_Get_Sample_Thumbnail_Height(), thumbnail);
    }

    void angleOrders()
    {
        QCOMPARE(Instrument_Get_Angle_Low_To_High(4, 6), REFL_D45_75);
        QCOMPARE(Instrument_Get_Angle_Low_To_High(0, 11), REFL_D15_NEG_45);
        QCOMPARE(Instrument_Get_Angle_Low_To_High(2, 11), REFL_D45_NEG_15);
        QCOMPARE(Instrument_Get_Angle_Low_To_High(10, 11), REFL_D45_110);
        QCOMPARE(Instrument_Get_Angle_Low_To_High(11, 11), REFL_ANGLE_T(0));
        for (int i = 0; i < 11; ++i)
            QCOMPARE(Instrument_Get_Angle_High_To_Low(i, 11), Instrument_Get_Angle_Low_To_High(10 - i, 11));
        QCOMPARE(Instrument_Get_Angle_High_To_Low(0, 6), REFL_D45_110);
        QCOMPARE(Instrument_Get_Angle_High_To_Low(-1, 11), REFL_ANGLE_T(0));
    }

    void delayKeepsEventsFlowing()
    {
        bool fired = false;
        QTimer::singleShot(10, [&fired] { fired = true; });
        QElapsedTimer timer;
        timer.start();
        Delay(60);
        QVERIFY(fired);
        QVERIFY(timer.elapsed() >= 60);

        fired = false;
        QTimer::singleShot(0, [&fired] { fired = true; });
        DelayBlocking(20);
        QVERIFY(!fired);
        QCoreApplication::processEvents();
        QVERIFY(fired);
    }
};

QTEST_GUILESS_MAIN(TestUserParams)
#include "tst_userparams.moc"
