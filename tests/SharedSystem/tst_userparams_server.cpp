// The user's settings read from and written to the server's parameters,
// and the instrument model taken from the server's configuration.
#include "Commands/ParametersOutCommands.h"
#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"
#include "support/ScriptedPeer.h"

#include <QMap>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

#include <memory>
#include <mutex>

namespace {

constexpr long CMD_GET_CONFIGURATION = 0x10000040;
constexpr long CMD_GET_CAPABILITY = 0x400A0220;
constexpr long CMD_GET_TEXTURE_DISPLAYED = 0x400A0A40;
constexpr long CMD_GET_PARAMETER = 0x400A0E00;
constexpr long CMD_SET_PARAMETER = 0x400A0E10;

PARAMETER_CONTENT_TYPES text(const QString& s)
{
    PARAMETER_CONTENT_TYPES v;
    v.parameterString = s;
    return v;
}

PARAMETER_CONTENT_TYPES number(int i)
{
    PARAMETER_CONTENT_TYPES v;
    v.parameterInt = i;
    return v;
}

PARAMETER_CONTENT_TYPES real(float f)
{
    PARAMETER_CONTENT_TYPES v;
    v.parameterFloat = f;
    return v;
}

void appendValue(CmdData& out, int key, const PARAMETER_CONTENT_TYPES& v)
{
    switch (CmdOut_ParameterContentKind(key)) {
    case PARAMETER_CONTENT_STRING:
        out.appendString(v.parameterString);
        break;
    case PARAMETER_CONTENT_STRING32:
        out.appendString32(v.parameterString);
        break;
    case PARAMETER_CONTENT_STRING_LIST:
        out.append_si32(v.paramterStringList.size());
        for (const QString& s : v.paramterStringList)
            out.appendString(s);
        break;
    case PARAMETER_CONTENT_FLOAT:
        out.append_f32(v.parameterFloat);
        break;
    case PARAMETER_CONTENT_INT:
        out.append_si32(v.parameterInt);
        break;
    default:
        break;
    }
}

// A parameter store as the server keeps it.
class FakeServer
{
public:
    std::mutex mutex;
    QMap<int, PARAMETER_CONTENT_TYPES> parameters;
    QList<int> keysRead;
    QMap<int, QByteArray> written; // key -> value bytes as sent
    QString configuration = "BIRCH";
    int wifiCapability = 1;
    bool textureShown = true;

    ScriptedPeer::Reply answer(const QByteArray& frame)
    {
        std::lock_guard<std::mutex> lock(mutex);
        CmdData request(frame);
        CmdData out;
        quint32 status = 0;
        switch (request.getCommandCode()) {
        case CMD_GET_PARAMETER: {
            const int key = request.nextArg_ui16();
            keysRead << key;
            if (parameters.contains(key)) {
                out.append_ui16(static_cast<unsigned short>(key));
                appendValue(out, key, parameters.value(key));
            } else {
                status = 5;
            }
            break;
        }
        case CMD_SET_PARAMETER: {
            const int key = request.nextArg_ui16();
            written.insert(key, request.getBuffer());
            break;
        }
        case CMD_GET_CAPABILITY:
            out.append_si32(wifiCapability);
            break;
        case CMD_GET_TEXTURE_DISPLAYED:
            out.append_ui8(textureShown ? 1 : 0);
            break;
        case CMD_GET_CONFIGURATION:
            out.append_si32(1);
            out.appendString(configuration);
            break;
        default:
            status = 1;
        }
        return ScriptedPeer::Reply{{ScriptedPeer::replyTo(frame, status, out.getBuffer())}, 0};
    }
};

void quiet(QtMsgType, const QMessageLogContext&, const QString&) {}

} // namespace

class TestUserParamsServer : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;
    std::unique_ptr<FakeServer> m_server;
    QTemporaryDir m_root;
    QString m_savedRoot;

    void fillAll()
    {
        QMap<int, PARAMETER_CONTENT_TYPES>& p = m_server->parameters;
        p[PARAMETER_NUMBER_FORMAT] = text(",###");
        p[PARAMETER_DATE_FORMAT] = text("dd.MM.yyyy");
        p[PARAMETER_TIME_FORMAT] = text("HH:mm:ss");
        p[PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS] = number(12);
        p[PARAMETER_DEFAULT_JOB_NAME] = text("新しいジョブ");
        p[PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES] = number(4);
        p[PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME] = number(30);
        p[PARAMETER_DEFAULT_STANDBY_TIME] = number(600);
        p[PARAMETER_DEFAULT_POWER_OFF_TIME] = number(7200);
        p[PARAMETER_AUTO_MEASURE] = number(1);
        p[PARAMETER_AUTO_MEASURE_SWITCH_ON_UI] = number(1);
        p[PARAMETER_DISPLAY_LABCH] = number(0);
        p[PARAMETER_OVERRIDE_PRESSURE_SENSORS] = number(2); // only 1 is true
        p[PARAMETER_DISPLAY_RAINBOW] = number(0);
        p[PARAMETER_DISPLAY_PREVIEW_IMAGES] = number(0);
        p[PARAMETER_DISPLAY_SELF_TEST] = number(1);
        p[PARAMETER_DISPLAY_EDIT_FREE_TEXT] = number(1);
        p[PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION] = number(1);
        p[PARAMETER_SHOW_HAZARD_WARNING_BANNER] = number(0);
        p[PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN] = number(1);
        p[PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR] = number(1);
        p[PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE] = number(1);
        p[PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE] = number(1);
        p[PARAMETER_USE_FILTER_FILE] = number(0);
        p[PARAMETER_TEXTURE_IMAGE_CONTENT_DATA_SELECTION] = number(4);
        p[PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE] = number(1);
        p[PARAMETER_AUTO_MEASURE_TIMEOUT] = real(2.5f);
        p[PARAMETER_SAMPLE_TEMP_LIMIT_LOW] = real(10.0f);
        p[PARAMETER_SAMPLE_TEMP_LIMIT_HIGH] = real(35.0f);
        p[PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS] = number(1);
        p[PARAMETER_CURRENT_LANGUAGE_ID] = text("de");
        p[PARAMETER_ORIENATION_ENABLED] = number(0);
        p[PARAMETER_ONLINE_MODE_JOB] = text("LAB JOB");
        p[PARAMETER_MEASURING_CIRCLE_ID] = text("ring_blue.png");
        p[PARAMETER_AVERAGING_NUMBER_OF_SAMPLES] = number(3);
        p[PARAMETER_SMC_GOOD_MEASUREMENTS] = number(4);
        p[PARAMETER_SMC_MAX_MEASUREMENTS] = number(8);
        p[PARAMETER_MEASUREMENT_MODE] = text("average");
        p[PARAMETER_WEBSERVER_ADDRESS] = text("https://sync.example");
    }

private slots:
    void initTestCase()
    {
        m_savedRoot = Platform::root();
        Platform::setRoot(m_root.path());
        m_server.reset(new FakeServer);
        m_peer.reset(new ScriptedPeer);
        FakeServer* server = m_server.get();
        m_peer->setResponder([server](const QByteArray& frame) { return server->answer(frame); });
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
        Platform::setRoot(m_savedRoot);
    }

    void init()
    {
        UserParams::setDefaults();
        std::lock_guard<std::mutex> lock(m_server->mutex);
        m_server->parameters.clear();
        m_server->keysRead.clear();
        m_server->written.clear();
    }

    void everySettingIsRead()
    {
        fillAll();
        QVERIFY(SysAPI_GetUserParams());
        QCOMPARE(UserParams::getDecimalPoint(), QString(","));
        QCOMPARE(UserParams::getPrecision(), 3);
        QCOMPARE(UserParams::getDateFormat(), QString("dd.MM.yyyy"));
        QCOMPARE(UserParams::getTimeFormat(), QString("HH:mm:ss"));
        QCOMPARE(UserParams::getCalibrationWarningTimeout(), 12u);
        QCOMPARE(UserParams::getJobDefaultName(), QString("新しいジョブ"));
        QCOMPARE(UserParams::getJobDefaultSize(), 4u);
        QCOMPARE(UserParams::getPowerDisplayOffTime(), 30);
        QCOMPARE(UserParams::getPowerStandbyTime(), 600);
        QCOMPARE(UserParams::getPowerOffTime(), 7200);
        QVERIFY(UserParams::getAutoMeasure());
        QVERIFY(UserParams::getAutoMeasureSwitchAvailable());
        QVERIFY(!UserParams::getDisplayLABCH());
        QVERIFY(!UserParams::getOverridePressureSensors());
        QVERIFY(!UserParams::getDisplayRainbow());
        QVERIFY(!UserParams::getDisplayPreviewImages());
        QVERIFY(UserParams::getDisplaySelfTest());
        QVERIFY(UserParams::getDisplayEditFreeText());
        QVERIFY(UserParams::getDisplayMeasurementModeSelectionMenuItem());
        QVERIFY(UserParams::getDisplayLABCH_MenuItem());
        QVERIFY(UserParams::getDisplayrOverridePressureSensoMenuItem());
        QVERIFY(UserParams::getDownloadedJobNameEditable());
        QVERIFY(UserParams::getDownloadedJobAttributesEditable());
        QVERIFY(!UserParams::getUseFilterFile());
        QVERIFY(UserParams::getWifiEnabled());
        QVERIFY(UserParams::getDisplayTexture());
        QVERIFY(UserParams::getDisplayTextureParameters());
        QVERIFY(UserParams::getSampleTempCheckEnabled());
        QCOMPARE(UserParams::getAutoMeasureTimeout(), 2.5f);
        QCOMPARE(UserParams::getSampleTempCheckLowLimit(), 10.0f);
        QCOMPARE(UserParams::getSampleTempCheckHighLimit(), 35.0f);
        QVERIFY(UserParams::getEnableViewMeasurements());
        QCOMPARE(UserParams::getLanguageCode(), QString("de"));
        QVERIFY(!UserParams::getOrientationEnabled());
        QCOMPARE(UserParams::getLabModeJob(), QString("LAB JOB"));
        QCOMPARE(UserParams::getMeasuringCircleID(), QString("/opt/GUI/Branding/ring_blue.png"));
        const JOB_AVERAGING_INFO_T info = UserParams::getJobDefaultAvgInfo();
        QCOMPARE(info.averageNumber, 3);
        QCOMPARE(info.smcGoodMeasurements, 4);
        QCOMPARE(info.smcMaxMeasurements, 8);
        QCOMPARE(info.mode, JOB_AVG_MODE_SIMPLE_3);
        QVERIFY(UserParams::getAllowSync());
    }

    void hazardBannerFollowsTheModeSelection()
    {
        fillAll();
        QVERIFY(SysAPI_GetUserParams());
        QVERIFY(UserParams::getShowHazardWarningBanner());
        std::lock_guard<std::mutex> lock(m_server->mutex);
        QVERIFY(!m_server->keysRead.contains(PARAMETER_SHOW_HAZARD_WARNING_BANNER));
        QCOMPARE(m_server->keysRead.count(PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION), 2);
    }

    void aFailedReadLeavesItsFieldOnly()
    {
        fillAll();
        {
            std::lock_guard<std::mutex> lock(m_server->mutex);
            m_server->parameters.remove(PARAMETER_DEFAULT_STANDBY_TIME);
            m_server->parameters[PARAMETER_CURRENT_LANGUAGE_ID] = text(QString());
            m_server->parameters[PARAMETER_WEBSERVER_ADDRESS] = text("  ");
            m_server->parameters[PARAMETER_MEASUREMENT_MODE] = text("AVERAGE");
            m_server->parameters[PARAMETER_AVERAGING_NUMBER_OF_SAMPLES] = number(7);
            m_server->wifiCapability = 0;
        }
        UserParams::setLanguageCode("fr");
        QtMessageHandler previous = qInstallMessageHandler(quiet);
        const bool ok = SysAPI_GetUserParams();
        qInstallMessageHandler(previous);
        QVERIFY(!ok);
        QCOMPARE(UserParams::getPowerStandbyTime(), 1800);
        QCOMPARE(UserParams::getPowerOffTime(), 7200);
        // An empty language from the server keeps the one in use.
        QCOMPARE(UserParams::getLanguageCode(), QString("fr"));
        QVERIFY(!UserParams::getAllowSync());
        QVERIFY(!UserParams::getWifiEnabled());
        QCOMPARE(UserParams::getJobDefaultAvgInfo().mode, JOB_AVG_MODE_NONE);
        std::lock_guard<std::mutex> lock(m_server->mutex);
        m_server->wifiCapability = 1;
    }

    void settingsAreWrittenAsParameters()
    {
        UserParams::setNumberFormat(",####");
        UserParams::setJobDefaultName("AUTO");
        UserParams::setMeasuringCircleID("ring.png");
        UserParams::setJobDefaultAvgInfo(JOB_AVG_MODE_SMC, 3, 6, 5);
        UserParams::setAutoMeasureTimeout(1.5f);
        QVERIFY(SysAPI_SetUserParams());

        std::lock_guard<std::mutex> lock(m_server->mutex);
        auto value = [this](int key) {
            CmdData read;
            read.appendBuffer(m_server->written.value(key));
            return read;
        };
        QCOMPARE(value(PARAMETER_NUMBER_FORMAT).nextArgString(), QString(",####"));
        QCOMPARE(value(PARAMETER_DEFAULT_JOB_NAME).nextArgString32(), QString("AUTO"));
        QCOMPARE(value(PARAMETER_MEASURING_CIRCLE_ID).nextArgString(), QString("ring.png"));
        QCOMPARE(value(PARAMETER_MEASUREMENT_MODE).nextArgString(), QString("SMC"));
        QCOMPARE(value(PARAMETER_SMC_MAX_MEASUREMENTS).nextArg_si32(), 6);
        QCOMPARE(value(PARAMETER_AUTO_MEASURE_TIMEOUT).nextArg_f32(), 1.5f);
        QCOMPARE(value(PARAMETER_DISPLAY_LABCH).nextArg_si32(), 1);
        QVERIFY(!m_server->written.contains(PARAMETER_WEBSERVER_ADDRESS));
        QVERIFY(!m_server->written.contains(PARAMETER_SHOW_HAZARD_WARNING_BANNER));
    }

    void modelFromTheConfiguration()
    {
        Instrument_Set_Model_Type(MODEL_QC);
        {
            std::lock_guard<std::mutex> lock(m_server->mutex);
            m_server->configuration = "ALDER";
        }
        Instrument_Determine_Model_Type();
        QCOMPARE(Instrument_Get_Model_Type(), MODEL_REFINISH_ALDER);
        QCOMPARE(Instrument_Get_Num_Spectral_Angles(), 11);

        {
            std::lock_guard<std::mutex> lock(m_server->mutex);
            m_server->configuration = "alder";
        }
        Instrument_Determine_Model_Type();
        QCOMPARE(Instrument_Get_Model_Type(), MODEL_REFINISH_BIRCH);

        // No answer at all also means the six-angle instrument.
        Instrument_Set_Model_Type(MODEL_REFINISH_ALDER);
        m_peer->stop();
        QtMessageHandler previous = qInstallMessageHandler(quiet);
        Instrument_Determine_Model_Type();
        qInstallMessageHandler(previous);
        QCOMPARE(Instrument_Get_Model_Type(), MODEL_REFINISH_BIRCH);
    }
};

QTEST_GUILESS_MAIN(TestUserParamsServer)
#include "tst_userparams_server.moc"
