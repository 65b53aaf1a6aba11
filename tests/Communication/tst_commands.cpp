// The command front: transaction numbers, reply checks and the failure log.

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"
#include "support/ScriptedPeer.h"

#include <QSignalSpy>
#include <QtTest>

#include <QThread>

#include <atomic>
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

short transactionOf(const QByteArray& frame)
{
    return short(quint16(quint8(frame.at(4))) | (quint16(quint8(frame.at(5))) << 8));
}

CmdData command(long code)
{
    CmdData cmd;
    cmd.setCommandCode(code);
    return cmd;
}

// Keeps the log quiet while thousands of commands fail on purpose.
void silentHandler(QtMsgType, const QMessageLogContext&, const QString&) {}

} // namespace

class TestCommands : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;

    // A fresh link client on a fresh peer; earlier clients are retired so
    // that their watchdogs don't talk into the test.
    void freshLink(bool waitForConnection = true)
    {
        m_peer.reset(new ScriptedPeer);
        QVERIFY(m_peer->listen());
        const bool connected = m_peer->attachCommands(waitForConnection ? 3000 : 1);
        QVERIFY(connected || !waitForConnection);
    }

    void failQuietly(int calls)
    {
        QtMessageHandler previous = qInstallMessageHandler(silentHandler);
        for (int i = 0; i < calls; ++i) {
            CmdData cmd = command(0x10000000);
            try {
                Commands::instance()->sendAndReceive(cmd, true, 4000);
            } catch (unsigned int) {
            }
        }
        qInstallMessageHandler(previous);
    }

    void bringPeerBack()
    {
        QSignalSpy reconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpReconnected);
        QVERIFY(m_peer->listen(m_peer->port()));
        QVERIFY(reconnected.wait(3000));
    }

    void takePeerAway()
    {
        QSignalSpy disconnected(API_SignalMaster::instance(), &API_SignalMaster::TcpDisconnected);
        m_peer->stop();
        QVERIFY(disconnected.wait(3000));
    }

private slots:
    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
    }

    void transactionIdsStartAt0AndWrapIn16Bits()
    {
        freshLink();
        m_peer->answerAll(0);
        CmdData first = command(0x10000000);
        Commands::instance()->sendAndReceive(first, true, 4000);
        QCOMPARE(transactionOf(m_peer->receivedFrames().value(0)), short(0));
        QCOMPARE(first.getTransactionID(), short(0));

        // Failed calls take numbers too; fail the ones in between on a dead link.
        takePeerAway();
        failQuietly(32766);
        bringPeerBack();
        CmdData a = command(1), b = command(1);
        Commands::instance()->sendAndReceive(a, true, 4000);
        Commands::instance()->sendAndReceive(b, true, 4000);
        QCOMPARE(a.getTransactionID(), short(32767));
        QCOMPARE(b.getTransactionID(), short(-32768));

        takePeerAway();
        failQuietly(32766);
        bringPeerBack();
        CmdData c = command(1), d = command(1);
        Commands::instance()->sendAndReceive(c, true, 4000);
        Commands::instance()->sendAndReceive(d, true, 4000);
        QCOMPARE(c.getTransactionID(), short(-1));
        QCOMPARE(d.getTransactionID(), short(0));
        const QList<QByteArray> frames = m_peer->receivedFrames();
        QCOMPARE(transactionOf(frames.last()), short(0));
        QCOMPARE(frames.at(frames.size() - 2).mid(4, 2), QByteArray("\xFF\xFF", 2));

        // Init starts the numbers again.
        freshLink();
        m_peer->answerAll(0);
        CmdData e = command(1);
        Commands::instance()->sendAndReceive(e, false, 4000);
        QCOMPARE(e.getTransactionID(), short(0));
    }

    void wrongTransactionIdFailsOnlyAValidatedCommand()
    {
        freshLink();
        m_peer->setResponder([](const QByteArray& f) {
            return ScriptedPeer::Reply{{ScriptedPeer::responseFrame(short(transactionOf(f) + 5), 0x400A0A00, 0, "\x07")}, 0};
        });
        CmdData validated = command(0x400A0A00);
        QTest::ignoreMessage(QtDebugMsg, "Invalid response in command 0x400a0a00");
        QTest::ignoreMessage(QtDebugMsg, "Error 0x3 in command 0x400a0a00");
        QCOMPARE(thrown([&] { Commands::instance()->sendAndReceive(validated, true, 4000); }), STATUS_BAD_RESPONSE);

        CmdData loose = command(0x400A0A00);
        CmdData reply = Commands::instance()->sendAndReceive(loose, false, 4000);
        QCOMPARE(reply.getTransactionID(), short(loose.getTransactionID() + 5));
        QCOMPARE(int(reply.nextArg_ui8()), 7);
    }

    void serverStatusOnAValidatedCommandBecomes2()
    {
        freshLink();
        m_peer->answerAll(9);
        CmdData cmd = command(0x40010030);
        QTest::ignoreMessage(QtDebugMsg, "Invalid status in command 0x40010030 9");
        QTest::ignoreMessage(QtDebugMsg, "Error 0x2 in command 0x40010030");
        QCOMPARE(thrown([&] { Commands::instance()->sendAndReceive(cmd, true, 4000); }), STATUS_BAD_RESPONSE_STATUS);

        // Unvalidated, the caller sees the server's own code.
        CmdData loose = command(0x40010030);
        QCOMPARE(Commands::instance()->sendAndReceive(loose, false, 4000).getStatus(), 9u);
    }

    void oneTransactionAtATimeAcrossThreads()
    {
        freshLink();
        // Slow, split replies widen the window in which two callers could mix.
        m_peer->setResponder([](const QByteArray& f) {
            ScriptedPeer::Reply reply;
            reply.chunks = ScriptedPeer::split(ScriptedPeer::replyTo(f, 0, QByteArray(3000, 'r')), 1000);
            return reply;
        });
        std::atomic<int> failures{0};
        auto worker = [&failures] {
            for (int i = 0; i < 100; ++i) {
                CmdData cmd = command(0x10000000);
                try {
                    if (Commands::instance()->sendAndReceive(cmd, true, 4000).getPacketlength() != 3000)
                        ++failures;
                } catch (unsigned int) {
                    ++failures;
                }
            }
        };
        std::unique_ptr<QThread> a(QThread::create(worker));
        std::unique_ptr<QThread> b(QThread::create(worker));
        a->start();
        b->start();
        // Meanwhile the watchdog ticks on this thread against the same link.
        QTRY_VERIFY_WITH_TIMEOUT(a->isFinished() && b->isFinished(), 60000);
        QCOMPARE(failures.load(), 0);
        QSet<short> ids;
        for (const QByteArray& frame : m_peer->receivedFrames())
            ids.insert(transactionOf(frame));
        QCOMPARE(ids.size(), 200);
    }

    void transportFailuresAreLoggedWithTheLastTwoHexDigits()
    {
        freshLink(false);
        // Before the first connection the link refuses at once.
        CmdData cmd = command(0x41000220);
        QTest::ignoreMessage(QtDebugMsg, "Error 0x04 in command 0x41000220");
        QCOMPARE(thrown([&] { Commands::instance()->sendAndReceive(cmd, false, 4000); }), STATUS_TCP_NOT_CONNECTED);
    }
};

QTEST_GUILESS_MAIN(TestCommands)
#include "tst_commands.moc"
