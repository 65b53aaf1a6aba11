// The blocking link client against a scripted server: frame limits, the
// select budget, reassembly, broken peers and the watchdog.

#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"
#include "support/ScriptedPeer.h"
#include "support/TestSupport.h"

#include <QElapsedTimer>
#include <QRegularExpression>
#include <QSignalSpy>
#include <QtTest>

#include <functional>
#include <memory>

namespace {

quint32 thrown(const std::function<void()>& f)
{
    try {
        f();
    } catch (unsigned int status) {
        return status;
    }
    return 0;
}

CmdData request(long code)
{
    CmdData cmd;
    cmd.setCommandCode(code);
    return cmd;
}

} // namespace

class TestTcpClient : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;
    std::unique_ptr<TcpClient> m_client;

    // A client connected to a fresh peer.
    void connectPair()
    {
        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen());
        setIpAddress("127.0.0.1");
        setIpPort(m_peer->port());
        m_client.reset(new TcpClient);
        m_client->Init();
        m_client->connectToHost();
        QVERIFY(m_peer->waitForConnections(1));
        QVERIFY(m_client->isConnected());
    }

    // Unsolicited bytes, handed to the kernel before the client looks.
    void push(const QByteArray& bytes)
    {
        m_peer->sendNow(bytes);
        QVERIFY(m_peer->waitForIdle());
        QTest::qWait(20);
    }

private slots:
    void cleanup()
    {
        m_client.reset();
        m_peer.reset();
    }

    void frameOfTheLargestSizeIsAccepted()
    {
        connectPair();
        const QByteArray payload(CmdData::MAX_FRAME_SIZE - 16, 'x');
        m_peer->sendNow(ScriptedPeer::responseFrame(3, 0x41000220, 0, payload));
        const ResponseData rsp = m_client->receive(4000);
        QCOMPARE(rsp.cmd.getPacketlength(), payload.size());
        QCOMPARE(rsp.cmd.getTransactionID(), short(3));
    }

    void oversizedFrameIsRefusedAndDrained()
    {
        connectPair();
        push(ScriptedPeer::rawFrame(CmdData::MAX_FRAME_SIZE + 1, 5000));
        QTest::ignoreMessage(QtDebugMsg, "TCP: Data too big");
        QCOMPARE(thrown([&] { m_client->receive(2000); }), STATUS_TCP_DATA_TOO_BIG);
        // Nothing of it is left in front of the next reply.
        QVERIFY(m_client->isConnected());
        push(ScriptedPeer::responseFrame(1, 7, 0, "ok"));
        QCOMPARE(m_client->receive(2000).cmd.getBuffer(), QByteArray("ok"));
    }

    void lengthFieldsUnderTheHeaderSize_data()
    {
        QTest::addColumn<quint32>("length");
        QTest::addColumn<QString>("log");
        QTest::newRow("3: refused by the link") << 3u << "TCP: Data too small";
        QTest::newRow("4: refused by the packet") << 4u << QString();
        QTest::newRow("11: refused by the packet") << 11u << QString();
    }

    void lengthFieldsUnderTheHeaderSize()
    {
        QFETCH(quint32, length);
        QFETCH(QString, log);
        connectPair();
        push(ScriptedPeer::rawFrame(length, length >= 4 ? int(length) - 4 : 0));
        if (!log.isEmpty())
            QTest::ignoreMessage(QtDebugMsg, log.toLatin1().constData());
        QCOMPARE(thrown([&] { m_client->receive(2000); }), STATUS_TCP_DATA_TOO_SMALL);
    }

    void selectBudgetDropsTheFractionOfASecond()
    {
        connectPair();
        QElapsedTimer clock;
        QTest::ignoreMessage(QtDebugMsg, QRegularExpression("^TCP: timeout getting size: .*999$"));
        clock.start();
        QCOMPARE(thrown([&] { m_client->receive(999); }), STATUS_TCP_TIMEOUT);
        QVERIFY2(clock.elapsed() < 400, qPrintable(QString::number(clock.elapsed())));

        QTest::ignoreMessage(QtDebugMsg, QRegularExpression("^TCP: timeout getting size: .*4500$"));
        clock.restart();
        QCOMPARE(thrown([&] { m_client->receive(4500); }), STATUS_TCP_TIMEOUT);
        QVERIFY2(clock.elapsed() >= 3900 && clock.elapsed() < 4700, qPrintable(QString::number(clock.elapsed())));
    }

    void selectBudgetCoversTheWholeFrame()
    {
        connectPair();
        // Twelve pieces half a second apart: a budget renewed by every piece
        // would wait for all of them.
        const QByteArray frame = ScriptedPeer::responseFrame(0, 5, 0, QByteArray(1200, 'p'));
        ScriptedPeer::Reply slow;
        slow.chunks = ScriptedPeer::split(frame, 101);
        slow.gapMs = 500;
        m_peer->queueReply(slow);
        QElapsedTimer clock;
        clock.start();
        QTest::ignoreMessage(QtDebugMsg, QRegularExpression("^TCP: timeout getting size: .*2000$"));
        QCOMPARE(thrown([&] { m_client->sendAndReceive(request(5), 2000); }), STATUS_TCP_TIMEOUT);
        QVERIFY2(clock.elapsed() >= 1900 && clock.elapsed() < 2800, qPrintable(QString::number(clock.elapsed())));
    }

    void replySplitAcrossManyWritesIsReassembled()
    {
        connectPair();
        m_peer->setResponder([](const QByteArray& frame) {
            QByteArray payload(150000, '\0');
            for (int i = 0; i < payload.size(); ++i)
                payload[i] = char(i * 7);
            ScriptedPeer::Reply reply;
            reply.chunks = ScriptedPeer::split(ScriptedPeer::replyTo(frame, 0, payload), 1499);
            reply.gapMs = 1;
            return reply;
        });
        const CmdData rsp = m_client->sendAndReceive(request(0x60000018), 4000);
        QCOMPARE(rsp.getPacketlength(), 150000);
        const QByteArray got = rsp.getBuffer();
        for (int i : {0, 1, 1498, 1499, 77777, 149999})
            QCOMPARE(got.at(i), char(i * 7));
        // The request went out whole and as built.
        QCOMPARE(m_peer->receivedFrames().value(0), request(0x60000018).getFullCmd());
    }

    void peerThatGoesAway()
    {
        connectPair();
        m_peer->sendNow(ScriptedPeer::responseFrame(0, 1, 0, QByteArray(100, 'a')).left(40));
        QVERIFY(m_peer->waitForIdle());
        QTest::qWait(20);
        m_peer->dropConnections();
        QTest::ignoreMessage(QtDebugMsg, QRegularExpression("^TCP/IP Recv error, client disconnected: Expected: "));
        QCOMPARE(thrown([&] { m_client->receive(2000); }), STATUS_TCP_DISCONNECTED);

        connectPair();
        m_peer->dropConnections();
        QTest::qWait(20);
        QVERIFY(!m_client->isConnected());
        QTest::ignoreMessage(QtDebugMsg, "TCP: DISCONNECT");
        QCOMPARE(thrown([&] { m_client->receive(2000); }), STATUS_TCP_DISCONNECTED);
    }

    void commandsFailAtOnceWithoutALink()
    {
        setIpPort(TestSupport::freeLocalPort());
        TcpClient client;
        client.Init();
        QVERIFY(!client.isConnected());
        QCOMPARE(thrown([&] { client.sendAndReceive(request(1), 4000); }), STATUS_TCP_NOT_CONNECTED);
        QTest::ignoreMessage(QtDebugMsg, "TCP: Error Connecting");
        client.connectToHost();
        QCOMPARE(thrown([&] { client.sendAndReceive(request(1), 4000); }), STATUS_TCP_NOT_CONNECTED);
    }

    void unreadDataCountsAsADeadLink()
    {
        connectPair();
        push("stale");
        // The zero-byte peek sees data and reads 0: the link looks closed,
        // so the write is refused and the watchdog will replace the socket.
        QVERIFY(!m_client->isConnected());
        QTest::ignoreMessage(QtDebugMsg, "timeout  0");
        QTest::ignoreMessage(QtDebugMsg, "TCP: Write error");
        QCOMPARE(thrown([&] { m_client->sendAndReceive(request(2), 1000); }), STATUS_TCP_WRITE_ERROR);
        // And the stale bytes are still there: the flush takes nothing.
        QVERIFY(!m_client->isConnected());
    }

    void watchdogRaisesTheFaultScreenOncePerOutage()
    {
        API_SignalMaster* hub = API_SignalMaster::instance();
        QSignalSpy disconnected(hub, &API_SignalMaster::TcpDisconnected);
        QSignalSpy reconnected(hub, &API_SignalMaster::TcpReconnected);
        QSignalSpy sadPuppy(hub, &API_SignalMaster::SadPuppy);

        const quint16 port = TestSupport::freeLocalPort();
        setIpAddress("127.0.0.1");
        setIpPort(port);
        m_client.reset(new TcpClient);
        m_client->Init();

        // At boot the server isn't up: retries every second, no fault screen.
        QTRY_VERIFY_WITH_TIMEOUT(disconnected.count() >= 2, 5000);
        QCOMPARE(sadPuppy.count(), 0);
        QCOMPARE(reconnected.count(), 0);

        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen(port));
        QVERIFY(reconnected.wait(2500));
        disconnected.clear();
        QTest::qWait(1500);
        QCOMPARE(disconnected.count(), 0);

        // The server dies: one fault screen, a disconnect every second.
        m_peer->stop();
        QTRY_VERIFY_WITH_TIMEOUT(disconnected.count() >= 3, 8000);
        QCOMPARE(sadPuppy.count(), 1);

        // It comes back: reconnected, and a later outage raises it again.
        reconnected.clear();
        QVERIFY(m_peer->listen(port));
        QVERIFY(reconnected.wait(2500));
        QVERIFY(m_peer->waitForConnections(2));
        m_peer->stop();
        QTRY_COMPARE_WITH_TIMEOUT(sadPuppy.count(), 2, 2500);
    }
};

QTEST_GUILESS_MAIN(TestTcpClient)
#include "tst_tcpclient.moc"
