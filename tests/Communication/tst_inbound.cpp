// The inbound command server, started here on a free port (the application
// never starts it).

#include "Communication/CmdData.h"
#include "Communication/CommandHandler.h"
#include "Communication/TcpServer.h"
#include "support/TestSupport.h"

#include <QTcpSocket>
#include <QTextCodec>
#include <QtTest>

#include <memory>

namespace {

QByteArray frame(long code, short id, const std::function<void(CmdData&)>& args = nullptr)
{
    CmdData cmd;
    cmd.setCommandCode(code);
    cmd.setTransactionID(id);
    if (args)
        args(cmd);
    return cmd.getFullCmd();
}

QByteArray ask(QTcpSocket& socket, const QByteArray& bytes, int waitMs = 3000)
{
    socket.write(bytes);
    socket.flush();
    QByteArray got;
    QElapsedTimer clock;
    clock.start();
    while (clock.elapsed() < waitMs) {
        if (socket.waitForReadyRead(50))
            got += socket.readAll();
        if (got.size() >= 4) {
            const quint32 length = quint8(got[0]) | (quint8(got[1]) << 8) | (quint8(got[2]) << 16) | (quint32(quint8(got[3])) << 24);
            if (quint32(got.size()) >= length)
                break;
        }
        QCoreApplication::processEvents();
    }
    return got;
}

} // namespace

class TestInbound : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<TCPCommandHandlerServer> m_server;
    quint16 m_port = 0;

    std::unique_ptr<QTcpSocket> client()
    {
        std::unique_ptr<QTcpSocket> socket(new QTcpSocket);
        socket->connectToHost(QHostAddress::LocalHost, m_port);
        QElapsedTimer clock;
        clock.start();
        while (socket->state() != QAbstractSocket::ConnectedState && clock.elapsed() < 3000)
            QTest::qWait(10);
        // The server accepts on this thread too: give it its turn.
        QTest::qWait(50);
        return socket;
    }

private slots:
    void initTestCase()
    {
        QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8"));
        // Until someone starts it, there is no handler at all.
        QVERIFY(CommandHandler::instance() == nullptr);
        QVERIFY(CommandHandlerTask::instance()->isConnectInit);
        QVERIFY(CommandHandler::instance() != nullptr);
        m_port = TestSupport::freeLocalPort();
        m_server.reset(new TCPCommandHandlerServer(m_port));
        QVERIFY(m_server->isListening());
    }

    void cleanupTestCase()
    {
        m_server.reset();
    }

    void batteryHookAnswersGoodDeal()
    {
        auto socket = client();
        const QByteArray reply = ask(*socket, frame(1, 42, [](CmdData& c) {
            c.append_ui8('a');
            c.appendString("HELLO WORLD");
        }));
        CmdData rsp(reply);
        QVERIFY(rsp.getIsResponse());
        QCOMPARE(rsp.getStatus(), 0u);
        QCOMPARE(rsp.getTransactionID(), short(42));
        QCOMPARE(rsp.getCommandCode(), 1L);
        QCOMPARE(rsp.nextArgString(), QString("Good Deal"));
    }

    void echoAndUnknownCodes()
    {
        auto socket = client();
        const QByteArray echo = frame(0, 5, [](CmdData& c) { c.append_si32(77); });
        QCOMPARE(ask(*socket, echo), echo);

        CmdData unknown(ask(*socket, frame(0x1234, 6)));
        QVERIFY(unknown.getIsResponse());
        QCOMPARE(unknown.getStatus(), STATUS_UNKNOWN_COMMAND);
        QCOMPARE(unknown.getTransactionID(), short(6));

        // An unknown command with arguments can't even be refused cleanly:
        // it is dropped, and the connection still works.
        QTest::ignoreMessage(QtDebugMsg, "Inbound command 0x1234 dropped: 3");
        QVERIFY(ask(*socket, frame(0x1234, 7, [](CmdData& c) { c.append_ui8(1); }), 300).isEmpty());
        QCOMPARE(ask(*socket, echo), echo);
    }

    void brokenFramesAreDroppedSilently()
    {
        auto socket = client();
        QVERIFY(ask(*socket, QByteArray("\x20\0\0\0 too short for its length", 30), 300).isEmpty());
        QVERIFY(ask(*socket, QByteArray("\x05\0\0", 3), 300).isEmpty());
    }

    void eachConnectionGetsItsOwnAnswers()
    {
        auto first = client();
        auto second = client();
        const QByteArray a = frame(0, 1, [](CmdData& c) { c.append_ui8('A'); });
        const QByteArray b = frame(0, 2, [](CmdData& c) { c.append_ui8('B'); });
        QCOMPARE(ask(*first, a), a);
        QCOMPARE(ask(*second, b), b);
        QTest::qWait(100);
        QCOMPARE(first->bytesAvailable(), 0);
    }

    void batteryHookDirectly()
    {
        CmdData cmd;
        cmd.setCommandCode(1);
        cmd.append_ui8('z');
        cmd.appendString("anything");
        CmdData rsp = CmdHandler_BatterySet(cmd);
        QVERIFY(rsp.getIsResponse());
        QCOMPARE(rsp.nextArgString(), QString("Good Deal"));

        CmdData extra = cmd;
        extra.append_ui8(0);
        try {
            CmdHandler_BatterySet(extra);
            QFAIL("unread arguments must be refused");
        } catch (unsigned int status) {
            QCOMPARE(status, STATUS_BAD_RESPONSE);
        }
    }
};

QTEST_GUILESS_MAIN(TestInbound)
#include "tst_inbound.moc"
