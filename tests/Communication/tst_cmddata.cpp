// Packet layout and argument encodings, byte for byte.

#include "Communication/CmdData.h"

#include <QTextCodec>
#include <QtTest>

namespace {

QByteArray bytes(std::initializer_list<int> values)
{
    QByteArray out;
    for (int v : values)
        out.append(char(v));
    return out;
}

// A response frame around a payload, built by hand (not by the code under test).
QByteArray response(const QByteArray& payload, quint32 status = 0)
{
    QByteArray frame;
    const quint32 length = quint32(16 + payload.size());
    for (int i = 0; i < 4; ++i)
        frame.append(char((length >> (8 * i)) & 0xFF));
    frame += bytes({0x34, 0x12, 0x00, 0x00, 0x00, 0x00, 0x00, 0x10});
    for (int i = 0; i < 4; ++i)
        frame.append(char((status >> (8 * i)) & 0xFF));
    return frame + payload;
}

CmdData readerOf(const CmdData& written)
{
    CmdData reply = written;
    reply.respond(0, false);
    reply = CmdData(response(written.getBuffer()));
    return reply;
}

quint32 thrown(const std::function<void()>& f)
{
    try {
        f();
    } catch (unsigned int status) {
        return status;
    }
    return 0;
}

} // namespace

class TestCmdData : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase()
    {
        QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8"));
    }

    void commandFrameLayout()
    {
        CmdData cmd;
        QCOMPARE(int(quint8(cmd.getFlags())), 0x80);
        QVERIFY(!cmd.getIsResponse());
        cmd.setTransactionID(short(0xFEDC));
        cmd.setCommandCode(0x400A0E10);
        cmd.append_ui16(0xBEEF);
        QCOMPARE(cmd.getFullCmd(), bytes({14, 0, 0, 0, 0xDC, 0xFE, 0x80, 0, 0x10, 0x0E, 0x0A, 0x40, 0xEF, 0xBE}));
        // The bare command is the smallest frame.
        QCOMPARE(CmdData().getFullCmd().size(), 12);
    }

    void responseFrameLayoutAndRespond()
    {
        CmdData cmd;
        cmd.setTransactionID(7);
        cmd.setCommandCode(1);
        cmd.respond(0x01020304, true);
        cmd.appendString("Hi");
        QCOMPARE(cmd.getFullCmd(), bytes({22, 0, 0, 0, 7, 0, 0, 0, 1, 0, 0, 0, 4, 3, 2, 1, 2, 0, 0, 0, 'H', 'i'}));

        // A fully read command may be answered with the check; an unread
        // argument fails it and leaves the packet as it was.
        CmdData read;
        read.append_ui8('a');
        read.nextArg_ui8();
        read.respond(5, true);
        QVERIFY(read.getIsResponse());
        QCOMPARE(read.getStatus(), 5u);
        QCOMPARE(int(read.getFlags()), 0);

        CmdData unread;
        unread.append_ui8('a');
        QCOMPARE(thrown([&] { unread.respond(0, true); }), STATUS_BAD_RESPONSE);
        QVERIFY(!unread.getIsResponse());
        QCOMPARE(unread.getPacketlength(), 1);
        unread.respond(0, false);
        QCOMPARE(unread.getPacketlength(), 0);
    }

    void parseFrames()
    {
        CmdData rsp(response(bytes({9, 8}), 2001));
        QVERIFY(rsp.getIsResponse());
        QCOMPARE(rsp.getStatus(), 2001u);
        QCOMPARE(rsp.getTransactionID(), short(0x1234));
        QCOMPARE(rsp.getCommandCode(), 0x10000000L);
        QCOMPARE(rsp.getBuffer(), bytes({9, 8}));
        // A frame survives the round trip unchanged.
        QCOMPARE(rsp.getFullCmd(), response(bytes({9, 8}), 2001));

        // Only flags 0 marks a response; anything else is a command whose
        // payload starts right after the code.
        CmdData odd(bytes({13, 0, 0, 0, 1, 0, 0x01, 0x77, 5, 0, 0, 0, 0x42}));
        QVERIFY(!odd.getIsResponse());
        QCOMPARE(odd.getStatus(), 0u);
        QCOMPARE(odd.getBuffer(), bytes({0x42}));
    }

    void malformedFramesKeepThePacket()
    {
        CmdData packet(response(bytes({1, 2, 3}), 4));
        const QByteArray before = packet.getFullCmd();

        QCOMPARE(thrown([&] { packet.setFullData(QByteArray(11, '\0')); }), STATUS_TCP_DATA_TOO_SMALL);
        QByteArray lying = response(bytes({1, 2}));
        lying[0] = char(lying.size() + 1);
        QCOMPARE(thrown([&] { packet.setFullData(lying); }), STATUS_TCP_LENGTH_MISMATCH);
        lying[0] = char(lying.size() - 1);
        QCOMPARE(thrown([&] { packet.setFullData(lying); }), STATUS_TCP_LENGTH_MISMATCH);
        QCOMPARE(packet.getFullCmd(), before);

        // The pointer form takes its size from the length field.
        QByteArray frame = response(bytes({6}));
        frame.append("trailing bytes are not part of the frame");
        packet.setFullData(frame.constData());
        QCOMPARE(packet.getBuffer(), bytes({6}));
        QCOMPARE(thrown([&] { packet.setFullData(bytes({4, 0, 0, 0, 0, 0, 0, 0}).constData()); }),
                 STATUS_TCP_DATA_TOO_SMALL);
        QCOMPARE(thrown([&] { packet.setFullData(static_cast<const char*>(nullptr)); }), STATUS_TCP_DATA_TOO_SMALL);
    }

    void integersAndFloatsAreLittleEndianAndSigned()
    {
        CmdData w;
        w.append_ui8(char(0xFF));
        w.append_si8(-2);
        w.append_ui16(0xFFFE);
        w.append_si16(-3);
        w.append_ui32(0xFFFFFFFDul);
        w.append_si32(-4);
        w.append_f32(-1.5f);
        w.append_f64(3.25);
        QCOMPARE(w.getBuffer().left(12), bytes({0xFF, 0xFE, 0xFE, 0xFF, 0xFD, 0xFF, 0xFD, 0xFF, 0xFF, 0xFF, 0xFC, 0xFF}));
        QCOMPARE(w.getBuffer().mid(16, 2), bytes({0xC0, 0xBF})); // -1.5f is 0xBFC00000

        CmdData r = readerOf(w);
        QCOMPARE(int(r.nextArg_ui8()), 255);
        QCOMPARE(int(r.nextArg_si8()), -2);
        QCOMPARE(int(r.nextArg_ui16()), 0xFFFE);
        QCOMPARE(int(r.nextArg_si16()), -3);
        QCOMPARE(r.nextArg_ui32(), 0xFFFFFFFDu);
        QCOMPARE(r.nextArg_si32(), -4);
        QCOMPARE(r.nextArg_f32(), -1.5f);
        QCOMPARE(r.nextArg_f64(), 3.25);
        QCOMPARE(r.getPacketlength(), 0);
        QCOMPARE(thrown([&] { r.nextArg_ui8(); }), STATUS_BAD_RESPONSE);
    }

    void readingPastTheEndThrowsAndConsumesNothing()
    {
        CmdData r(response(bytes({1, 2, 3})));
        QCOMPARE(thrown([&] { r.nextArg_si32(); }), STATUS_BAD_RESPONSE);
        QCOMPARE(r.getPacketlength(), 3);
        QCOMPARE(thrown([&] { r.nextArgBuffer(4); }), STATUS_BAD_RESPONSE);
        QCOMPARE(r.nextArgBuffer(3), bytes({1, 2, 3}));

        // A string whose count is beyond the packet.
        CmdData s(response(bytes({5, 0, 0, 0, 'a', 'b'})));
        QCOMPARE(thrown([&] { s.nextArgString(); }), STATUS_BAD_RESPONSE);
        CmdData s32(response(bytes({2, 0, 0, 0, 'a', 0, 0, 0})));
        QCOMPARE(thrown([&] { s32.nextArgString32(); }), STATUS_BAD_RESPONSE);
        // A huge count must not overflow the size check.
        CmdData huge(response(bytes({0xFF, 0xFF, 0xFF, 0x7F})));
        QCOMPARE(thrown([&] { huge.nextArgString32(); }), STATUS_BAD_RESPONSE);
    }

    void stringsAndString32()
    {
        CmdData empty;
        empty.appendString(QString());
        empty.appendString32(QString());
        QCOMPARE(empty.getBuffer(), QByteArray(8, '\0'));

        // The count is characters, not bytes: three characters, four bytes.
        const QString gruen = QString::fromUtf8("Grü");
        CmdData plain;
        plain.appendString(gruen);
        QCOMPARE(plain.getBuffer(), bytes({3, 0, 0, 0, 'G', 'r', 0xC3, 0xBC}));
        // So the reader takes one byte short and is out of step.
        CmdData r = readerOf(plain);
        QVERIFY(r.nextArgString() != gruen);
        QCOMPARE(r.getPacketlength(), 1);

        const QString japanese = QString::fromUtf8("標準ジョブ名 Ä");
        CmdData wide;
        wide.appendString32(japanese);
        QCOMPARE(wide.getPacketlength(), 4 + 4 * japanese.length());
        QCOMPARE(wide.getBuffer().mid(4, 4), bytes({0x19, 0x6A, 0, 0})); // U+6A19
        wide.appendString("ascii");
        CmdData rw = readerOf(wide);
        QCOMPARE(rw.nextArgString32(), japanese);
        QCOMPARE(rw.nextArgString(), QString("ascii"));

        QVERIFY(!isString32("plain text ~"));
        QVERIFY(isString32(QString::fromUtf8("é")));
        TAG_ITEM_T tag{"DisplayNotes", QString::fromUtf8("メモ")};
        QVERIFY(isTag32(tag));
        tag.tagID = QString::fromUtf8("ü");
        tag.tagText = "x";
        QVERIFY(!isTag32(tag)); // only the text decides
    }

    void tags()
    {
        CmdData w;
        w.appendTag(TAG_ITEM_T{"Color", "Red"});
        w.appendTag32(TAG_ITEM_T{"DisplayName", QString::fromUtf8("赤")});
        CmdData r = readerOf(w);
        const TAG_ITEM_T a = r.nextArgTag();
        const TAG_ITEM_T b = r.nextArgTag32();
        QCOMPARE(a.tagID, QString("Color"));
        QCOMPARE(a.tagText, QString("Red"));
        QCOMPARE(b.tagID, QString("DisplayName"));
        QCOMPARE(b.tagText, QString::fromUtf8("赤"));
    }

    void timeCountsYearsFrom1900AndMonthsFrom0()
    {
        CmdData r(response(bytes({123, 0, 31, 23, 59, 58, 124, 11, 1, 0, 0, 0})));
        QCOMPARE(r.nextArgTime(), QDateTime(QDate(2023, 1, 31), QTime(23, 59, 58)));
        QCOMPARE(r.nextArgTime(), QDateTime(QDate(2024, 12, 1), QTime(0, 0, 0)));
        // Nonsense from the wire gives an invalid time, not a crash.
        CmdData bad(response(bytes({255, 255, 255, 255, 255, 255})));
        QVERIFY(!bad.nextArgTime().isValid());
    }

    void compositeRecords()
    {
        QByteArray payload;
        // sample info: index, time, two spare floats, temperature, acceleration, calibration, pressure
        payload += bytes({0x2A, 0, 0, 0, 120, 5, 6, 7, 8, 9});
        payload += bytes({0, 0, 0x80, 0x3F, 0, 0, 0x80, 0x3F, 0, 0, 0xC8, 0x41}); // 1, 1, 25.0
        payload += bytes({0xFF, 0xFF, 2, 0, 3, 0, 4, 0, 200});
        payload += bytes({99, 1, 0, 1});
        // error description: priority, id, category, time, spare, text
        payload += bytes({3, 0xF1, 0x07, 0xFE, 0xFF, 121, 2, 3, 4, 5, 6, 1, 0, 0, 0, 2, 0, 0, 0, 'N', 'o'});
        // network description
        for (const char* s : {"Lab", "aa:bb", "WPA2", "-40", "c", "6", "2437"}) {
            const QByteArray t(s);
            payload += bytes({t.size(), 0, 0, 0}) + t;
        }
        payload += bytes({0, 0, 0x40, 0x40, 1, 0, 7, 0xFE, 0xFF, 0xFF, 0xFF});

        CmdData r(response(payload));
        const SAMPLE_INFO_T info = r.nextArgSampleInfo();
        QCOMPARE(info.dbIndex, 42);
        QCOMPARE(info.timeStamp, QDateTime(QDate(2020, 6, 6), QTime(7, 8, 9)));
        QCOMPARE(info.temperature, 25.0f);
        QCOMPARE(info.accelerationInfo.OrientationX, -1);
        QCOMPARE(info.accelerationInfo.OrientationPosition, 4);
        QCOMPARE(info.accelerationInfo.OrientationAcceleration, 200);
        // 99 is no calibration status: it reads as the count, never as a real state.
        QCOMPARE(info.calibrationStatus, NUM_CALIBRATION_STATUS_TYPES);
        QCOMPARE(info.pressureStatus.Switch1, 1u);
        QCOMPARE(info.pressureStatus.Switch2, 0u);
        QCOMPARE(info.pressureStatus.Switch3, 1u);

        const ERROR_DESCRIPTION_T error = r.nextArgErrorDescription();
        QCOMPARE(int(error.priority), 3);
        QCOMPARE(error.errorID, 2033);
        QCOMPARE(error.category, -2);
        QCOMPARE(error.time.date(), QDate(2021, 3, 3));
        QCOMPARE(error.description, QString("No"));

        const NETWORK_DESCRIPTION_T net = r.nextArgNetworkDescription();
        QCOMPARE(net.SSID, QString("Lab"));
        QCOMPARE(net.Frequency, QString("2437"));
        QCOMPARE(net.Quality, 3.0f);
        QVERIFY(net.EncryptionKey);
        QVERIFY(!net.Known);
        QVERIFY(net.Connected); // any non-zero byte
        QCOMPARE(net.Priority, -2);
        QCOMPARE(r.getPacketlength(), 0);
    }

    void copiesCarryHeaderAndPayloadOnly()
    {
        CmdData a(response(bytes({1, 2, 3, 4, 5}), 9));
        a.bmAnswer = true;
        a.nextArg_ui8();
        CmdData b(a);
        QCOMPARE(b.getBuffer(), bytes({2, 3, 4, 5}));
        QCOMPARE(b.getStatus(), 9u);
        QVERIFY(b.getIsResponse());
        QVERIFY(!b.bmAnswer);
        // Reading the copy leaves the original alone.
        b.nextArg_si32();
        QCOMPARE(a.getPacketlength(), 4);
        // Writing after reading keeps the unread part in front.
        a.append_ui8(6);
        QCOMPARE(a.getBuffer(), bytes({2, 3, 4, 5, 6}));
        a.clear();
        QCOMPARE(a.getFullCmd(), CmdData().getFullCmd());
    }

    void validateResponseChecks_data()
    {
        QTest::addColumn<int>("change");
        QTest::addColumn<quint32>("expected");
        QTest::newRow("matching") << 0 << 0u;
        QTest::newRow("other code") << 1 << STATUS_BAD_RESPONSE;
        QTest::newRow("other transaction") << 2 << STATUS_BAD_RESPONSE;
        QTest::newRow("reply flags not 0") << 3 << STATUS_BAD_RESPONSE;
        QTest::newRow("request flags not 0x80") << 4 << STATUS_BAD_RESPONSE;
        QTest::newRow("request is a response") << 5 << STATUS_BAD_RESPONSE;
        QTest::newRow("server status") << 6 << STATUS_BAD_RESPONSE_STATUS;
    }

    void validateResponseChecks()
    {
        QFETCH(int, change);
        QFETCH(quint32, expected);
        CmdData cmd;
        cmd.setCommandCode(0x400A0E00);
        cmd.setTransactionID(11);
        CmdData rsp = cmd;
        rsp.respond(0, true);
        switch (change) {
        case 1: rsp.setCommandCode(0x400A0E10); break;
        case 2: rsp.setTransactionID(12); break;
        case 3: rsp.setFlags(1); break;
        case 4: cmd.setFlags(0x40); break;
        case 5: cmd.setIsResponse(true); break;
        case 6:
            rsp.setStatus(9);
            QTest::ignoreMessage(QtDebugMsg, "Invalid status in command 0x400a0e00 9");
            break;
        default: break;
        }
        if (expected == STATUS_BAD_RESPONSE)
            QTest::ignoreMessage(QtDebugMsg, "Invalid response in command 0x400a0e00");
        QCOMPARE(thrown([&] { validateResponse(cmd, rsp); }), expected);
    }
};

QTEST_GUILESS_MAIN(TestCmdData)
#include "tst_cmddata.moc"
