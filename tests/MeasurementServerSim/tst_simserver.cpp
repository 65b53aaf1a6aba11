// The simulator as a network server: frame reassembly, strict requests,
// several clients, and the control interface's link commands (refuse, delay,
// drop, power) and its lines over TCP.

#include "Communication/CmdData.h"
#include "SimServer.h"
#include "support/TestSupport.h"

#include <QTcpSocket>
#include <QTextCodec>
#include <QtTest>

#include <random>

using namespace Sim;

namespace {

QByteArray command(quint32 code, short tid, const std::function<void(CmdData&)>& args = nullptr)
{
    CmdData c;
    c.setCommandCode(long(code));
    c.setTransactionID(tid);
    if (args)
        args(c);
    return c.getFullCmd();
}

// Reads one whole response frame; an empty packet with status 257 on a time-out.
CmdData readReply(QTcpSocket& s, int timeoutMs = 3000)
{
    QByteArray frame;
    int need = 4;
    QElapsedTimer t;
    t.start();
    while (t.elapsed() < timeoutMs) {
        if (s.bytesAvailable() == 0 && !s.waitForReadyRead(50)) {
            if (s.state() != QAbstractSocket::ConnectedState)
                break;
            continue;
        }
        frame += s.read(need - frame.size());
        if (need == 4 && frame.size() == 4) {
            const uchar* p = reinterpret_cast<const uchar*>(frame.constData());
            need = int(p[0] | p[1] << 8 | p[2] << 16 | quint32(p[3]) << 24);
            if (need < 16)
                break;
        }
        if (need > 4 && frame.size() == need)
            return CmdData(frame);
    }
    CmdData none;
    none.setStatus(257);
    return none;
}

CmdData exchange(QTcpSocket& s, const QByteArray& frame)
{
    s.write(frame);
    s.flush();
    return readReply(s);
}

bool connectTo(QTcpSocket& s, quint16 port)
{
    s.connectToHost(QHostAddress::LocalHost, port);
    return s.waitForConnected(2000);
}

} // namespace

class TestSimServer : public QObject
{
    Q_OBJECT

    std::unique_ptr<ServerThread> sim;

private slots:
    void initTestCase() { QTextCodec::setCodecForLocale(QTextCodec::codecForName("UTF-8")); }

    void init()
    {
        sim.reset(new ServerThread);
        sim->options().controlPort = 0;
        sim->options().instrument.dataDir = TestSupport::makeTempDir(QStringLiteral("simserver"));
        sim->options().instrument.timeScale = 0.2;
        QVERIFY(sim->start());
        QVERIFY(sim->port() != 0);
    }
    void cleanup() { sim.reset(); }

    void framesArriveInPiecesAndInBatches()
    {
        QTcpSocket s;
        QVERIFY(connectTo(s, sim->port()));
        const QByteArray state = command(CMD_GET_STATE, 41);
        for (char c : state) {
            s.write(&c, 1);
            s.flush();
            QTest::qWait(2);
        }
        CmdData r = readReply(s);
        QVERIFY(r.getIsResponse());
        QCOMPARE(r.getStatus(), 0u);
        QCOMPARE(r.getTransactionID(), short(41));
        QCOMPARE(quint32(r.getCommandCode()), quint32(CMD_GET_STATE));
        QCOMPARE(int(r.nextArg_ui8()), int(STATE_INIT));

        s.write(command(CMD_GET_SERIAL_NUM, 7) + command(CMD_GET_DISPLAY_BRIGHTNESS, 8));
        s.flush();
        CmdData first = readReply(s);
        CmdData second = readReply(s);
        QCOMPARE(first.getTransactionID(), short(7));
        QVERIFY(!first.nextArgString().isEmpty());
        QCOMPARE(second.getTransactionID(), short(8));
        QCOMPARE(int(second.nextArg_ui8()), 80);
    }

    void requestsAreReadStrictly()
    {
        QTcpSocket s;
        QVERIFY(connectTo(s, sim->port()));
        CmdData r = exchange(s, command(0x12345678, 3));
        QCOMPARE(r.getStatus(), STATUS_T(ST_UNKNOWN_COMMAND));
        QCOMPARE(quint32(r.getCommandCode()), 0x12345678u);
        QCOMPARE(r.getTransactionID(), short(3));
        QCOMPARE(r.getPacketlength(), 0);

        r = exchange(s, command(CMD_GET_JOB_INFO, 4));   // the job name is missing
        QCOMPARE(r.getStatus(), STATUS_T(ST_BAD_REQUEST));
        r = exchange(s, command(CMD_SET_DISPLAY_BRIGHTNESS, 5, [](CmdData& c) {
            c.append_ui8(char(10));
            c.append_ui8(char(0));   // one byte too many
        }));
        QCOMPARE(r.getStatus(), STATUS_T(ST_BAD_REQUEST));
        r = exchange(s, command(CMD_GET_DISPLAY_BRIGHTNESS, 6));
        QCOMPARE(int(r.nextArg_ui8()), 80);   // the refused request changed nothing

        // A response frame sent to the server is not a command: no answer,
        // and the connection goes on.
        CmdData wrong;
        wrong.setCommandCode(CMD_GET_STATE);
        wrong.respond(0, false);
        s.write(wrong.getFullCmd());
        r = exchange(s, command(CMD_GET_SERIAL_NUM, 9));
        QCOMPARE(r.getTransactionID(), short(9));
    }

    void garbageArgumentsNeverBreakTheServer()
    {
        // Every command with random argument bytes: a reply each time, with
        // the command's code and transaction, and the server goes on.
        const quint32 codes[] = {
            CMD_GET_STATE, CMD_GET_ERROR_DESCRIPTIONS, CMD_GET_CONFIGURATION, CMD_SET_INTERFACE_CONFIG,
            CMD_GET_JOB_INFOS, CMD_GET_JOB_INFO, CMD_GET_JOB_INFO_WEB, CMD_ADD_JOB, CMD_EDIT_JOB,
            CMD_FORCE_FINISH_SMC, CMD_SET_JOB_SAVED, CMD_REFERENCE_CHECK, CMD_GET_CAPABILITY,
            CMD_SET_BEEPER_VOLUME, CMD_SET_DISPLAY_BRIGHTNESS, CMD_ADD_WIFI_SETTING, CMD_VERIFY_WIFI_SETTINGS,
            CMD_GET_PARAMETER, CMD_SET_PARAMETER, CMD_GET_TEMPERATURE, CMD_TRIGGER_MEASUREMENT, CMD_GET_SAMPLE,
            CMD_DELETE_SAMPLE, CMD_START_TARGETING, CMD_GET_TARGETING_INFO, CMD_GET_VERSION, CMD_GET_PREVIEW_IMAGE,
            CMD_TRIGGER_SELF_TEST, CMD_GET_SELF_TEST_RESULT, CMD_DELETE_JOB};
        std::mt19937 rng(99);
        int answered = 0;
        sim->call([&](Server& server) {
            for (quint32 code : codes) {
                for (int i = 0; i < 150; ++i) {
                    QByteArray args(int(rng() % 48), Qt::Uninitialized);
                    for (char& c : args)
                        c = char(rng() % 4 == 0 ? rng() : rng() % 3);   // mostly small numbers, like counts
                    const short tid = short(i);
                    const QByteArray reply = server.protocol().handle(command(code, tid, [&](CmdData& c) {
                        c.appendBuffer(args);
                    }));
                    CmdData r(reply);
                    if (r.getIsResponse() && quint32(r.getCommandCode()) == code && r.getTransactionID() == tid)
                        ++answered;
                }
            }
        });
        QCOMPARE(answered, int(sizeof codes / sizeof codes[0]) * 150);
        QTcpSocket s;
        QVERIFY(connectTo(s, sim->port()));
        QCOMPARE(exchange(s, command(CMD_GET_STATE, 1)).getStatus(), 0u);
    }

    void impossibleLengthsCloseTheConnection()
    {
        for (quint32 length : {5u, 670945u}) {
            QTcpSocket s;
            QVERIFY(connectTo(s, sim->port()));
            QByteArray bad(16, '\0');
            for (int i = 0; i < 4; ++i)
                bad[i] = char((length >> (8 * i)) & 0xff);
            s.write(bad);
            s.flush();
            QTRY_COMPARE_WITH_TIMEOUT(s.state(), QAbstractSocket::UnconnectedState, 3000);
        }
        QTcpSocket again;
        QVERIFY(connectTo(again, sim->port()));
        QCOMPARE(exchange(again, command(CMD_GET_STATE, 1)).getStatus(), 0u);
    }

    void severalClientsAtOnce()
    {
        QTcpSocket a, b;
        QVERIFY(connectTo(a, sim->port()));
        QVERIFY(connectTo(b, sim->port()));
        QCOMPARE(exchange(a, command(CMD_GET_STATE, 1)).getTransactionID(), short(1));
        QCOMPARE(exchange(b, command(CMD_GET_STATE, 2)).getTransactionID(), short(2));
        a.disconnectFromHost();
        QCOMPARE(exchange(b, command(CMD_GET_STATE, 3)).getTransactionID(), short(3));
        QTcpSocket c;
        QVERIFY(connectTo(c, sim->port()));
        QCOMPARE(exchange(c, command(CMD_GET_STATE, 4)).getTransactionID(), short(4));
    }

    void refuseDelayAndDrop()
    {
        QTcpSocket s;
        QVERIFY(connectTo(s, sim->port()));
        QCOMPARE(sim->control(QStringLiteral("refuse 0x41000200 14 1")), QStringLiteral("OK"));
        CmdData r = exchange(s, command(CMD_START_TARGETING, 1, [](CmdData& c) {
            c.append_f32(0.0f);
            c.append_si32(0);
        }));
        QCOMPARE(r.getStatus(), 14u);
        r = exchange(s, command(CMD_START_TARGETING, 2, [](CmdData& c) {
            c.append_f32(0.0f);
            c.append_si32(0);
        }));
        QCOMPARE(r.getStatus(), 0u);   // refused once only

        QCOMPARE(sim->control(QStringLiteral("delay 300")), QStringLiteral("OK"));
        QElapsedTimer t;
        t.start();
        QCOMPARE(exchange(s, command(CMD_GET_STATE, 3)).getStatus(), 0u);
        QVERIFY(t.elapsed() >= 290);
        QCOMPARE(sim->control(QStringLiteral("delay 0")), QStringLiteral("OK"));

        QCOMPARE(sim->control(QStringLiteral("drop 0.6")), QStringLiteral("OK"));
        QTRY_COMPARE_WITH_TIMEOUT(s.state(), QAbstractSocket::UnconnectedState, 2000);
        QTcpSocket away;
        away.connectToHost(QHostAddress::LocalHost, sim->port());
        QVERIFY(!away.waitForConnected(200));
        QTest::qWait(700);
        QTcpSocket back;
        QVERIFY(connectTo(back, sim->port()));
        QCOMPARE(exchange(back, command(CMD_GET_STATE, 4)).getStatus(), 0u);
        QVERIFY(sim->control(QStringLiteral("refuse nonsense")).startsWith(QStringLiteral("ERR")));
    }

    void restartOnRequest()
    {
        QTcpSocket s;
        QVERIFY(connectTo(s, sim->port()));
        const CmdData r = exchange(s, command(CMD_POWER_OFF_RESET, 1, [](CmdData& c) { c.append_si32(0x5449); }));
        QCOMPARE(r.getStatus(), 0u);
        QTRY_COMPARE_WITH_TIMEOUT(s.state(), QAbstractSocket::UnconnectedState, 2000);
        QTcpSocket back;
        QTRY_VERIFY_WITH_TIMEOUT(
            [&] {
                back.abort();
                back.connectToHost(QHostAddress::LocalHost, sim->port());
                return back.waitForConnected(100);
            }(),
            5000);
        CmdData state = exchange(back, command(CMD_GET_STATE, 2));
        QCOMPARE(int(state.nextArg_ui8()), int(STATE_POWER_UP));

        // Switched off, the instrument stays away until switched on again.
        QCOMPARE(exchange(back, command(CMD_POWER_OFF_RESET, 3, [](CmdData& c) { c.append_si32(0x15449); })).getStatus(), 0u);
        QTRY_COMPARE_WITH_TIMEOUT(back.state(), QAbstractSocket::UnconnectedState, 2000);
        QTest::qWait(800);
        QTcpSocket off;
        off.connectToHost(QHostAddress::LocalHost, sim->port());
        QVERIFY(!off.waitForConnected(300));
        QCOMPARE(sim->control(QStringLiteral("power on")), QStringLiteral("OK"));
        QTcpSocket on;
        QVERIFY(connectTo(on, sim->port()));
    }

    void controlLinesOverTcp()
    {
        QTcpSocket c;
        QVERIFY(connectTo(c, sim->controlPort()));
        QVERIFY(c.waitForReadyRead(2000));
        c.readAll();   // greeting
        auto ask = [&c](const QByteArray& line) {
            c.write(line + '\n');
            c.flush();
            QByteArray reply;
            QElapsedTimer t;
            t.start();
            while (t.elapsed() < 2000 && !(reply.endsWith("\n") && (reply.contains("OK") || reply.contains("ERR")))) {
                c.waitForReadyRead(50);
                reply += c.readAll();
            }
            return QString::fromUtf8(reply).trimmed();
        };
        QCOMPARE(ask("switches 101"), QStringLiteral("OK"));
        QCOMPARE(ask("tilt 370"), QStringLiteral("OK"));
        QVERIFY(ask("bogus").startsWith(QStringLiteral("ERR unknown command")));
        QVERIFY(ask("switch 4 on").startsWith(QStringLiteral("ERR")));
        QVERIFY(ask("help").endsWith(QStringLiteral("OK")));
        sim->call([](Server& s) {
            const PRESSURE_SWITCH_T p = s.instrument().switches();
            QCOMPARE(p.Switch1 + p.Switch2 * 10 + p.Switch3 * 100, 101u);
            QCOMPARE(s.instrument().orientation().OrientationPosition, 10);
        });
    }

    void controlCommandsReachTheInstrument()
    {
        QCOMPARE(sim->control(QStringLiteral("battery 9 discharging")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("error 3235 Bus fault on the camera")), QStringLiteral("OK"));
        QVERIFY(sim->control(QStringLiteral("online start \"Lab one\" smc 3 5")).startsWith(QStringLiteral("OK Lab one")));
        QCOMPARE(sim->control(QStringLiteral("param AUTO_MEASURE 1")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("param 13")), QStringLiteral("OK AUTO_MEASURE = 1"));
        QCOMPARE(sim->control(QStringLiteral("message Please calibrate")), QStringLiteral("OK"));
        QCOMPARE(sim->control(QStringLiteral("request white")), QStringLiteral("OK"));
        QVERIFY(sim->control(QStringLiteral("calibration due 90")).startsWith(QStringLiteral("OK next in")));
        QVERIFY(sim->control(QStringLiteral("online start x smc 5 3")).startsWith(QStringLiteral("ERR")));
        QVERIFY(sim->control(QStringLiteral("panel chrome")).startsWith(QStringLiteral("ERR")));
        QVERIFY(sim->control(QStringLiteral("status")).contains(QStringLiteral("battery 9%")));
        QCOMPARE(sim->control(QStringLiteral("bulk 2 3")), QStringLiteral("OK 2"));
        sim->call([](Server& s) {
            Instrument& ins = s.instrument();
            QCOMPARE(ins.batteryPercent(), 9);
            QVector<int> ids;
            for (const Instrument::ErrorEntry& e : ins.errors())
                ids << e.id;
            QVERIFY(ids.contains(int(ST_BATTERY_LOW)));
            QVERIFY(ids.contains(3235));
            QCOMPARE(ins.errors().last().text, QStringLiteral("Bus fault on the camera"));
            QCOMPARE(ins.parameter(PARAMETER_ONLINE_MODE_JOB)->s, QStringLiteral("Lab one"));
            QCOMPARE(ins.jobs().find(QStringLiteral("Lab one"))->maxSamples, 5);
            QCOMPARE(ins.parameter(PARAMETER_TEXT_MESSAGE)->s, QStringLiteral("Please calibrate"));
            QCOMPARE(ins.parameter(PARAMETER_WHITE_TRANSFER_REQUEST)->i, 1);
            QCOMPARE(ins.secondsToCalibration(), 90);
            QCOMPARE(ins.jobs().find(QStringLiteral("Bulk 2"))->samples.size(), 3);
            QCOMPARE(ins.jobs().find(QStringLiteral("Bulk 2"))->state, JOB_COMPLETE);
            const quint32 bits = ins.takeStatus().settingsBits;
            for (quint32 bit : {BIT_ONLINE_JOB, BIT_AUTO_MEASURE, BIT_TEXT_MESSAGE, BIT_WHITE_TRANSFER})
                QVERIFY(bits & bit);
        });
    }
};

QTEST_GUILESS_MAIN(TestSimServer)
#include "tst_simserver.moc"
