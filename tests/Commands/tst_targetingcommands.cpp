// Targeting, calibration and the two early Wi-Fi commands against a
// scripted server.

#include "Commands/CalibrationOutCommands.h"
#include "Commands/CommunicationsOutCommands.h"
#include "Commands/TargetingOutCommands.h"
#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "support/ScriptedPeer.h"

#include <QTextCodec>
#include <QtTest>

#include <memory>

namespace {

CmdData lastRequest(const ScriptedPeer& peer)
{
    return CmdData(peer.receivedFrames().value(peer.receivedFrames().size() - 1));
}

QByteArray targetingReply(int width, int height, int size, int spares = 2, int pixelBytes = -1)
{
    CmdData p;
    p.append_ui8(1);
    p.append_ui8(0);
    p.append_ui8(1);
    for (short v : {-10, 20, 980, 1})
        p.append_si16(v);
    p.append_ui8(17);
    p.append_ui8(CALIBRATION_STATUS_WARNING);
    p.append_si32(spares);
    for (int i = 0; i < spares; ++i)
        p.append_si32(i);
    p.append_si16(short(width));
    p.append_si16(short(height));
    p.append_si32(size);
    QByteArray pixels(pixelBytes < 0 ? size : pixelBytes, '\0');
    for (int i = 0; i < pixels.size(); ++i)
        pixels[i] = char(i % 251);
    p.appendBuffer(pixels);
    return p.getBuffer();
}

} // namespace

class TestTargetingCommands : public QObject
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
    }

    void cleanupTestCase()
    {
        delete Commands::instance()->tcpClient();
    }

    void targetingInfoTakesTheLivePicture()
    {
        m_peer->answerAll(0, targetingReply(482, 348, TARGETING_IMAGE_BYTES));
        PRESSURE_SWITCH_T pressure;
        ACCELEROMETER_ORIENTATION_T orientation;
        CALIBRATION_STATUS_T calibration = CALIBRATION_STATUS_GOOD;
        QByteArray image("old picture");
        QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, image), STATUS_OK);
        QCOMPARE(image.size(), 503208);
        QCOMPARE(image.at(300), char(300 % 251));
        QCOMPARE(pressure.Switch3, 1u);
        QCOMPARE(orientation.OrientationX, -10);
        QCOMPARE(orientation.OrientationAcceleration, 17);
        QCOMPARE(calibration, CALIBRATION_STATUS_WARNING);

        const CmdData request = lastRequest(*m_peer);
        QCOMPARE(request.getCommandCode(), 0x41000220L);
        QCOMPARE(request.getBuffer(), QByteArray("\xE2\x01\x5C\x01", 4)); // 482, 348
    }

    void targetingPictureOfAnotherSizeIsRefused_data()
    {
        QTest::addColumn<int>("width");
        QTest::addColumn<int>("height");
        QTest::addColumn<int>("size");
        QTest::newRow("480 wide") << 480 << 348 << 480 * 348 * 3;
        QTest::newRow("taller") << 482 << 350 << 482 * 350 * 3;
        QTest::newRow("4 bytes a pixel") << 482 << 348 << 482 * 348 * 4;
        QTest::newRow("negative size") << 482 << 348 << -1;
    }

    void targetingPictureOfAnotherSizeIsRefused()
    {
        QFETCH(int, width);
        QFETCH(int, height);
        QFETCH(int, size);
        m_peer->answerAll(0, targetingReply(width, height, size, 0, qBound(0, size, 1000)));
        PRESSURE_SWITCH_T pressure;
        ACCELEROMETER_ORIENTATION_T orientation;
        CALIBRATION_STATUS_T calibration = CALIBRATION_STATUS_GOOD;
        QByteArray image("old picture");
        QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, image), STATUS_TCP_LENGTH_MISMATCH);
        QCOMPARE(image, QByteArray("old picture"));
        // What came before the picture is already stored.
        QCOMPARE(pressure.Switch1, 1u);
        QCOMPARE(orientation.OrientationZ, 980);
        QCOMPARE(calibration, CALIBRATION_STATUS_WARNING);
    }

    void targetingStatusAndShortPictures()
    {
        PRESSURE_SWITCH_T pressure;
        ACCELEROMETER_ORIENTATION_T orientation;
        CALIBRATION_STATUS_T calibration = CALIBRATION_STATUS_GOOD;
        QByteArray image("old picture");

        // The server's own status comes back as it is, nothing read.
        m_peer->answerAll(2032, targetingReply(482, 348, TARGETING_IMAGE_BYTES));
        QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, image), 2032u);
        QCOMPARE(pressure.Switch1, 0u);
        QCOMPARE(image, QByteArray("old picture"));

        // Pixels missing at the end: a read past the end.
        m_peer->answerAll(0, targetingReply(482, 348, TARGETING_IMAGE_BYTES, 1, 1000));
        QCOMPARE(CmdOut_GetTargetingInfo(pressure, orientation, calibration, image), STATUS_BAD_RESPONSE);
    }

    void targetingModeAndSensors()
    {
        m_peer->answerAll(7);
        QTest::ignoreMessage(QtDebugMsg, "start targetting successful");
        QCOMPARE(CmdOut_StartTargetingMode(), 7u);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x41000200L);
        QCOMPARE(lastRequest(*m_peer).getBuffer(), QByteArray(8, '\0'));

        QTest::ignoreMessage(QtDebugMsg, "stop targetting failed");
        QCOMPARE(CmdOut_StopTargetingMode(), STATUS_BAD_RESPONSE_STATUS);
        m_peer->answerAll(0);
        QTest::ignoreMessage(QtDebugMsg, "stop targetting successful");
        QCOMPARE(CmdOut_StopTargetingMode(), STATUS_OK);

        m_peer->answerAll(0, QByteArray("\x01\x02\x03", 3));
        PRESSURE_SWITCH_T pressure;
        QCOMPARE(CmdOut_GetPressureSensor(pressure), STATUS_OK);
        QCOMPARE(pressure.Switch2, 2u);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x400A0500L);

        m_peer->answerAll(0, QByteArray("\x01\x00\x02\x00\x03\x00\xFF\xFF\x09", 9));
        ACCELEROMETER_ORIENTATION_T orientation;
        QCOMPARE(CmdOut_GetInstrumentOrientation(orientation), STATUS_OK);
        QCOMPARE(orientation.OrientationPosition, -1);
        QCOMPARE(orientation.OrientationAcceleration, 9);

        m_peer->answerAll(0, QByteArray("\x03\0\0\0abc", 7));
        QByteArray preview;
        QCOMPARE(CmdOut_GetPreviewImage(preview), STATUS_OK);
        QCOMPARE(preview, QByteArray("abc"));
        QCOMPARE(lastRequest(*m_peer).getBuffer(), QByteArray("\xE2\x01\x5C\x01", 4));
    }

    void calibration()
    {
        m_peer->answerAll(2033);
        QCOMPARE(CmdOut_TriggerReferenceCheck(), 2033u);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x41000000L);
        QCOMPARE(lastRequest(*m_peer).getBuffer(), QByteArray(4, '\0'));

        bool passed = true;
        m_peer->answerAll(0, QByteArray("\x7B\x00\x01\x00\x00\x00\x02", 7));
        QCOMPARE(CmdOut_ReferenceCheck(passed), STATUS_OK);
        QVERIFY(!passed); // only 1 is a pass
        m_peer->answerAll(0, QByteArray("\x7B\x00\x01\x00\x00\x00\x01", 7));
        QCOMPARE(CmdOut_ReferenceCheck(passed), STATUS_OK);
        QVERIFY(passed);
        CmdData request = lastRequest(*m_peer);
        QCOMPARE(request.getCommandCode(), 0x40040010L);
        QCOMPARE(request.nextArgString(), QString("factory_ref"));

        CmdData state;
        state.append_si32(5);
        state.appendBuffer(QByteArray("\x7C\x0B\x1F\x17\x3B\x00", 6));
        state.append_f32(1.5f);
        state.append_f32(25.0f);
        state.append_si32(-1);
        state.appendBuffer(QByteArray("\x7C\x00\x01\x00\x00\x00", 6));
        state.append_f32(-0.5f);
        state.append_f32(24.0f);
        m_peer->answerAll(0, state.getBuffer());
        CALIBRATION_STATE_T cal;
        QCOMPARE(CmdOut_GetCalibrationState(cal), STATUS_OK);
        QCOMPARE(cal.nextExternalWhiteCal, 5);
        QCOMPARE(cal.lastExternalWhiteCal, QDateTime(QDate(2024, 12, 31), QTime(23, 59, 0)));
        QCOMPARE(cal.referenceTempExternalWhite, 25.0f);
        QCOMPARE(cal.nextInternalWhiteCal, -1);
        QCOMPARE(cal.dTempInternalWhite, -0.5f);
        QCOMPARE(cal.referenceTempInternalWhite, 24.0f);

        m_peer->answerAll(0);
        QCOMPARE(CmdOut_TriggerCalibration(), STATUS_OK);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x60000021L);
        QCOMPARE(CmdOut_SetCalibrationSettings(), STATUS_OK);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x400A0710L);
    }

    void earlyWifiCommands()
    {
        m_peer->answerAll(0);
        QCOMPARE(CmdOut_GetWIFISettings(), STATUS_OK);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0x400A0C00L);
        // No code at all: the frame carries 0 and so must the reply.
        QCOMPARE(CmdOut_SetWIFISettings(), STATUS_OK);
        QCOMPARE(lastRequest(*m_peer).getCommandCode(), 0L);
        QCOMPARE(lastRequest(*m_peer).getFullCmd().size(), 12);
    }
};

QTEST_GUILESS_MAIN(TestTargetingCommands)
#include "tst_targetingcommands.moc"
