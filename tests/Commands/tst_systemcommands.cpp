// System commands against a scripted server: what goes out, how replies are
// read, and what a failure leaves behind.

#include "Commands/SystemOutCommands.h"
#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "SharedSystem/Platform.h"
#include "support/ScriptedPeer.h"

#include <QTextCodec>
#include <QtTest>

#include <functional>
#include <memory>

using Call = std::function<STATUS_T()>;
Q_DECLARE_METATYPE(Call)

namespace {

// The request the peer got, opened up for reading.
CmdData sent(const ScriptedPeer& peer, int index = -1)
{
    const QList<QByteArray> frames = peer.receivedFrames();
    return CmdData(index < 0 ? frames.value(frames.size() - 1) : frames.value(index));
}

QByteArray time6(int year, int month, int day, int h, int m, int s)
{
    QByteArray t;
    for (int v : {year - 1900, month - 1, day, h, m, s})
        t.append(char(v));
    return t;
}

QByteArray stateRecord(quint32 changes)
{
    CmdData p;
    p.append_ui8(STATE_MEASURING);
    p.append_ui8(42);
    p.append_ui8(3);
    p.appendBuffer(time6(2024, 2, 29, 13, 14, 15));
    p.append_ui8(BATTERY_DISCHARGING);
    p.append_ui8(77);
    p.append_ui8(WIFI_STATUS_CONNECTED);
    p.append_ui8(2);
    p.append_ui8(USB_STATUS_CONNECTED);
    p.append_ui32(0xDEADBEEF);
    p.append_ui16(0xFFFE);
    p.append_ui16(513);
    p.append_ui8(9);
    p.append_ui8(1);
    p.append_ui8(2);
    p.append_ui8(3);
    p.append_ui32(0x80000001u);
    p.append_ui32(changes);
    for (quint32 i = 0; i < changes; ++i) {
        p.append_si32(long(i) + 1);
        p.appendString(QString("job-%1").arg(i));
        p.append_si32(-long(i));
    }
    return p.getBuffer();
}

} // namespace

class TestSystemCommands : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;

private slots:
    void initTestCase()
    {
        QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8"));
        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen());
        QVERIFY(m_peer->attachCommands());
    }

    void init()
    {
        m_peer->setResponder(nullptr);
        Platform::clearRecordedCommands();
    }

    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
    }

    void getStateReadsTheWholeRecord()
    {
        m_peer->answerAll(0, stateRecord(2));
        SystemStatus status;
        QCOMPARE(CmdOut_GetState(status), STATUS_OK);
        QCOMPARE(sent(*m_peer).getCommandCode(), 0x10000000L);
        QCOMPARE(sent(*m_peer).getPacketlength(), 0);

        QCOMPARE(status.getSystemState(), STATE_MEASURING);
        QCOMPARE(status.getPercentComplete(), 42);
        QCOMPARE(status.getNumOfErrors(), 3);
        QCOMPARE(status.getSystemTime(), QDateTime(QDate(2024, 2, 29), QTime(13, 14, 15)));
        QCOMPARE(status.getBatteryState(), BATTERY_DISCHARGING);
        QCOMPARE(status.getBatteryChargePercent(), 77);
        QCOMPARE(status.getWifiState(), WIFI_STATUS_CONNECTED);
        QCOMPARE(status.getWifiLevel(), 2);
        QCOMPARE(status.getUSBState(), USB_STATUS_CONNECTED);
        QCOMPARE(status.getMeasureID(), short(-2));
        QCOMPARE(status.getJobID(), short(513));
        QCOMPARE(status.getSettingsID(), short(9));
        QCOMPARE(status.getUSettingsBits(), 0x80000001u);
        const auto changes = status.getEntityChanges();
        QCOMPARE(int(changes.size()), 2);
        QCOMPARE(changes[1].entity, 2);
        QCOMPARE(changes[1].identifier1, QString("job-1"));
        QCOMPARE(changes[1].change, -1);

        // No changes: the list is emptied, not kept.
        m_peer->answerAll(0, stateRecord(0));
        QCOMPARE(CmdOut_GetState(status), STATUS_OK);
        QVERIFY(status.getEntityChanges().empty());
    }

    void getStateOneByteShortKeepsWhatWasRead()
    {
        const QByteArray record = stateRecord(0);
        m_peer->answerAll(0, record.left(record.size() - 1));
        SystemStatus status;
        SystemStatus::EntityChange old;
        old.identifier1 = "from the last poll";
        status.setEntityChanges({old});
        QCOMPARE(CmdOut_GetState(status), STATUS_BAD_RESPONSE);
        QCOMPARE(status.getSystemState(), STATE_MEASURING);
        QCOMPARE(status.getSettingsID(), short(9));
        QCOMPARE(status.getUSettingsBits(), 0x80000001u);
        // The count was the field that failed: the list is as it was.
        QCOMPARE(int(status.getEntityChanges().size()), 1);
    }

    void unknownStateBytesDoNotBecomeStates()
    {
        QByteArray record = stateRecord(0);
        record[0] = char(200);
        record[9] = char(99);
        m_peer->answerAll(0, record);
        SystemStatus status;
        QCOMPARE(CmdOut_GetState(status), STATUS_OK);
        QCOMPARE(status.getSystemState(), NUM_OF_SYSTEM_STATES);
        QCOMPARE(status.getBatteryState(), NUM_OF_BATTERY_STATUS);
    }

    void timeOutIsLoggedByItsLastTwoHexDigits()
    {
        // No responder: the server stays silent for the whole 4 s.
        QTest::ignoreMessage(QtDebugMsg, "Error 0x01 in command 0x10000000");
        SystemStatus status;
        QCOMPARE(CmdOut_GetState(status), STATUS_TCP_TIMEOUT);
    }

    void requestsGoOutAsBuilt_data()
    {
        QTest::addColumn<Call>("call");
        QTest::addColumn<long>("code");
        QTest::addColumn<QByteArray>("payload");
        QTest::addColumn<QByteArray>("reply");
        auto str = [](const char* s) {
            CmdData c;
            c.appendString(s);
            return c.getBuffer();
        };
        static QString text;
        static unsigned int level;
        static int number;
        static MEMORY_INFO_T memory;
        QTest::newRow("version") << Call([] { return CmdOut_GetVersion(VERSION_FPGA_MODULE, text); })
                                 << 0x60000000L << QByteArray("\x03\0\0\0", 4) << str("1.2");
        QTest::newRow("configuration") << Call([] { return CmdOut_GetConfiguration(number, text); })
                                       << 0x10000040L << QByteArray(4, '\0') << QByteArray("\x05\0\0\0", 4) + str("cfg");
        QTest::newRow("capability") << Call([] { return CmdOut_GetCapability("WIFI", number); })
                                    << 0x400A0220L << str("WIFI") << QByteArray("\x01\0\0\0", 4);
        QTest::newRow("beeper get") << Call([] { return CmdOut_GetBeeperVolume(level); })
                                    << 0x400A0A00L << QByteArray(1, '\0') << QByteArray("\x04", 1);
        QTest::newRow("beeper set") << Call([] { return CmdOut_SetBeeperVolume(5); })
                                    << 0x400A0A10L << QByteArray("\x00\x05", 2) << QByteArray();
        QTest::newRow("brightness set, low byte") << Call([] { return CmdOut_SetDisplayBrightness(0x12C); })
                                                  << 0x400A0A30L << QByteArray("\x2C", 1) << QByteArray();
        QTest::newRow("interface config") << Call([] { return CmdOut_SetInterfaceConfig(-2); })
                                          << 0x10000100L << QByteArray("\xFE\xFF\xFF\xFF", 4) << QByteArray();
        QTest::newRow("self test trigger") << Call([] { return CmdOut_TriggerSelfTest(7); })
                                           << 0x60000101L << QByteArray("\x07\0\0\0", 4) << QByteArray();
        QTest::newRow("self test result") << Call([] { return CmdOut_GetSelfTestResult(2, level); })
                                          << 0x60000102L << QByteArray("\x02\0\0\0", 4) << QByteArray("\x01\0\0\0", 4);
        QTest::newRow("reset errors") << Call([] { return CmdOut_ResetErrorDescriptions(); })
                                      << 0x10000022L << QByteArray() << QByteArray("ignored");
        QTest::newRow("image channels") << Call([] { return CmdOut_GetImageChannels(); })
                                        << 0x40008003L << QByteArray() << QByteArray();
        QTest::newRow("spectral channels") << Call([] { return CmdOut_GetSpectralChannels(); })
                                           << 0x40008003L << QByteArray() << QByteArray();
        QTest::newRow("battery") << Call([] { return CmdOut_GetBattery(); })
                                 << 0x400A0400L << QByteArray() << QByteArray();
        QTest::newRow("run self test") << Call([] { return CmdOut_RunSelfTest(); })
                                       << 0x400A0300L << QByteArray() << QByteArray();
        QTest::newRow("wifi enable") << Call([] { return CmdOut_SetEnableWifi(true); })
                                     << 0x400A0C30L << QByteArray("\x01", 1) << QByteArray();
        QTest::newRow("wifi delete") << Call([] { return CmdOut_DeleteWifiSetting("Lab"); })
                                     << 0x400A0C20L << str("Lab") << QByteArray();
        QTest::newRow("wifi add") << Call([] {
            NETWORK_DESCRIPTION_T n;
            n.SSID = "Lab";
            n.MAC = "not sent";
            n.Authentication = "WPA2";
            return CmdOut_AddWifiSetting(n, "secret", 3);
        }) << 0x400A0C10L << str("Lab") + str("WPA2") + str("secret") + QByteArray("\x03\0\0\0", 4) << QByteArray();
        QTest::newRow("wifi scan") << Call([] { return CmdOut_TriggerWifiScan(); })
                                   << 0x400A0CA0L << QByteArray() << QByteArray();
        QTest::newRow("memory info") << Call([] { return CmdOut_GetMemoryInfo(memory); })
                                     << 0x400A0B00L << QByteArray() << QByteArray(44, '\x01').replace(0, 4, QByteArray("\x0A\0\0\0", 4));
    }

    void requestsGoOutAsBuilt()
    {
        QFETCH(Call, call);
        QFETCH(long, code);
        QFETCH(QByteArray, payload);
        QFETCH(QByteArray, reply);
        m_peer->answerAll(0, reply);
        QCOMPARE(call(), STATUS_OK);
        const CmdData request = sent(*m_peer);
        QCOMPARE(request.getCommandCode(), code);
        QCOMPARE(request.getBuffer(), payload);
        QCOMPARE(int(quint8(request.getFlags())), 0x80);
    }

    void repliesAreReadIntoTheOutputs()
    {
        CmdData p;
        p.append_si32(2);
        for (const char* name : {"White tile", "Lifted"}) {
            p.appendString(name);
            p.append_ui32(11);
            p.append_ui32(30);
        }
        m_peer->answerAll(0, p.getBuffer());
        QVector<TEST> tests(5);
        QCOMPARE(CmdOut_GetSelfTestList(tests), STATUS_OK);
        QCOMPARE(tests.size(), 2);
        QCOMPARE(tests[1].description, QString("Lifted"));
        QCOMPARE(tests[1].num, 1u);
        QCOMPARE(tests[1].approxDuration, 30u);

        CmdData d;
        for (int i = 0; i < 22; ++i)
            d.appendString(QString("s%1").arg(i));
        m_peer->answerAll(0, d.getBuffer());
        DEVICE_INFO_T info;
        QCOMPARE(CmdOut_GetDeviceInfo(info), STATUS_OK);
        QCOMPARE(info.serialNum, QString("s0"));
        QCOMPARE(info.certificationDate, QString("s6"));
        // The fifteen strings behind are required, though not kept.
        m_peer->answerAll(0, d.getBuffer().left(d.getPacketlength() - 4));
        QCOMPARE(CmdOut_GetDeviceInfo(info), STATUS_BAD_RESPONSE);

        MEMORY_INFO_T memory;
        CmdData m;
        m.append_si32(9);
        for (int i = 0; i < 10; ++i)
            m.append_si32(i + 100);
        m_peer->answerAll(0, m.getBuffer());
        QCOMPARE(CmdOut_GetMemoryInfo(memory), STATUS_TCP_LENGTH_MISMATCH);
        QCOMPARE(memory.numMeasurements, 0);

        CmdData w;
        w.appendString("unused");
        w.append_si32(-5);
        m_peer->answerAll(17, w.getBuffer());
        int verified = 0;
        QCOMPARE(CmdOut_VerifyWifiSettings("Lab", &verified), 17u);
        QCOMPARE(verified, -5);
        QCOMPARE(CmdOut_VerifyWifiSettings("Lab", nullptr), 17u);
    }

    void wifiChangesBoilTheStatusDown_data()
    {
        QTest::addColumn<quint32>("server");
        QTest::addColumn<quint32>("result");
        QTest::newRow("done") << 0u << 0u;
        QTest::newRow("radio busy") << 19u << STATUS_SERVER_BUSY;
        QTest::newRow("other failure") << 7u << STATUS_BAD_RESPONSE_STATUS;
    }

    void wifiChangesBoilTheStatusDown()
    {
        QFETCH(quint32, server);
        QFETCH(quint32, result);
        m_peer->answerAll(server);
        QCOMPARE(CmdOut_SetEnableWifi(false), result);
        QCOMPARE(CmdOut_DeleteWifiSetting("x"), result);
        QCOMPARE(CmdOut_AddWifiSetting(NETWORK_DESCRIPTION_T(), "k", 1), result);
        QCOMPARE(CmdOut_TriggerWifiScan(), result);
    }

    void filterFiles()
    {
        QByteArray data;
        m_peer->answerAll(5);
        QCOMPARE(CmdOut_GetFilter(data), STATUS_OK);
        QVERIFY(data.isEmpty());

        m_peer->answerAll(9);
        QCOMPARE(CmdOut_GetFilterTranslation(data), STATUS_BAD_RESPONSE_STATUS);

        m_peer->answerAll(0, QByteArray("\x05\0\0\0<xml>", 9));
        QCOMPARE(CmdOut_GetFilterTranslation(data), STATUS_OK);
        QCOMPARE(data, QByteArray("<xml>"));
        QCOMPARE(sent(*m_peer).getCommandCode(), 0x40020010L);
    }

    void wifiListIsClearedFirst()
    {
        CmdData p;
        p.append_si32(1);
        for (int i = 0; i < 7; ++i)
            p.appendString("f");
        p.append_f32(0.5f);
        p.append_ui8(0);
        p.append_ui8(1);
        p.append_ui8(0);
        p.append_si32(4);
        m_peer->answerAll(0, p.getBuffer());
        QVector<NETWORK_DESCRIPTION_T> list(3);
        QCOMPARE(CmdOut_GetWifiSettings(list), STATUS_OK);
        QCOMPARE(list.size(), 1);
        QVERIFY(list[0].Known);
        QCOMPARE(list[0].Priority, 4);
    }

    void powerOffResetTellsTheServer_data()
    {
        QTest::addColumn<int>("action");
        QTest::addColumn<QByteArray>("value");
        QTest::newRow("reboot") << int(POWER_REBOOT) << QByteArray("\x49\x54\0\0", 4);
        QTest::newRow("shutdown") << int(POWER_SHUTDOWN) << QByteArray("\x49\x54\x01\0", 4);
        QTest::newRow("standby") << int(POWER_STANDBY) << QByteArray(4, '\0');
        QTest::newRow("factory") << int(POWER_FACTORY) << QByteArray("\x49\x54\x00\x20", 4);
        QTest::newRow("other") << int(NUM_POWERS) << QByteArray("\x49\x54\x01\0", 4);
    }

    void powerOffResetTellsTheServer()
    {
        QFETCH(int, action);
        QFETCH(QByteArray, value);
        m_peer->answerAll(0);
        QCOMPARE(CmdOut_PowerOffReset(POWER_T(action)), STATUS_OK);
        QCOMPARE(sent(*m_peer).getCommandCode(), 0x400A1000L);
        QCOMPARE(sent(*m_peer).getBuffer(), value);
        QVERIFY(Platform::recordedCommands().isEmpty());
    }

    void powerOffResetRefusedByTheServerActsLocally()
    {
        m_peer->answerAll(33);
        QCOMPARE(CmdOut_PowerOffReset(POWER_REBOOT), STATUS_BAD_RESPONSE_STATUS);
        QCOMPARE(Platform::recordedCommands(), QStringList() << "reboot");
    }

    // Last: it takes the server away.
    void powerOffResetOnADeadLinkActsLocally()
    {
        m_peer->stop();
        QTRY_VERIFY_WITH_TIMEOUT(!Commands::instance()->tcpClient()->isConnected(), 3000);
        QTest::qWait(1200); // let the watchdog mark the link down

        QCOMPARE(CmdOut_PowerOffReset(POWER_REBOOT), STATUS_TCP_NOT_CONNECTED);
        QCOMPARE(CmdOut_PowerOffReset(POWER_SHUTDOWN), STATUS_TCP_NOT_CONNECTED);
        QCOMPARE(CmdOut_PowerOffReset(POWER_STANDBY), STATUS_TCP_NOT_CONNECTED);
        QCOMPARE(CmdOut_PowerOffReset(POWER_FACTORY), STATUS_TCP_NOT_CONNECTED);
        QCOMPARE(Platform::recordedCommands(), QStringList() << "reboot" << "poweroff");
    }
};


QTEST_GUILESS_MAIN(TestSystemCommands)
#include "tst_systemcommands.moc"
