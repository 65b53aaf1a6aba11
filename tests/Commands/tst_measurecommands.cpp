// The measure family against a scripted server: the sample request, the
// staged reply reader and the one-angle readers.
#include "Commands/MeasureOutCommands.h"
#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/StringTables.h"
#include "support/ScriptedPeer.h"

#include <QSignalSpy>
#include <QtTest>

#include <limits>
#include <memory>

namespace {

const char* const kImageAngles[] = {"r15as-45", "r15as-15", "r15as15", "r15as45", "r15as80", "r15d"};
const char* const kD45Angles[] = {"r45as-15", "r45as15", "r45as25", "r45as45", "r45as75", "r45as110"};

struct Curve {
    QString angle;
    QVector<float> spectrum; // empty: no spectrum channel
    bool lab = true;
    bool lch = true;
    bool unknownChannelLast = false;
};

void appendHead(CmdData& out, int sampleNumber)
{
    out.appendString("LOCAL-3");
    out.append_si8(static_cast<signed char>(sampleNumber));
    out.append_si32(42);
    const char time[6] = {124, 0, 15, 8, 0, 5};
    out.appendBuffer(time, 6);
    out.append_f32(0.0f);
    out.append_f32(0.0f);
    out.append_f32(24.0f);
    for (int i = 0; i < 4; ++i)
        out.append_si16(short(10 + i));
    out.append_ui8(2);
    out.append_ui8(CALIBRATION_STATUS_WARNING);
    out.append_ui8(1);
    out.append_ui8(0);
    out.append_ui8(1);
}

void appendTexture(CmdData& out, float base)
{
    out.appendString("coating");
    for (int i = 0; i < 11; ++i)
        out.append_f32(base + i);
}

QByteArray thumbnailBytes(int seed)
{
    return QByteArray(56 * 78 * 3, char(seed));
}

void appendCurve(CmdData& out, const Curve& curve)
{
    out.appendString(curve.angle);
    out.append_si32(int(!curve.spectrum.isEmpty()) + int(curve.lab) + int(curve.lch) + int(curve.unknownChannelLast));
    if (!curve.spectrum.isEmpty()) {
        out.append_si32(0x10000); // the type is the low 16 bits
        out.append_f32(400.0f);
        out.append_f32(10.0f);
        out.append_si32(curve.spectrum.size());
        for (float v : curve.spectrum)
            out.append_f32(v);
    }
    if (curve.lab) {
        out.append_si32(3);
        out.append_si32(0);
        out.append_si32(0);
        out.append_f32(50.5f);
        out.append_f32(-3.25f);
        out.append_f32(12.0f);
    }
    if (curve.lch) {
        out.append_si32(4);
        out.append_si32(0);
        out.append_si32(0);
        out.append_f32(51.5f);
        out.append_f32(12.5f);
        out.append_f32(105.0f);
    }
    if (curve.unknownChannelLast)
        out.append_si32(9);
}

QVector<float> ramp(int count)
{
    QVector<float> values;
    for (int i = 0; i < count; ++i)
        values << 0.01f * float(i + 1);
    return values;
}

// A full colour-stage reply: six thumbnails, a texture on one angle, and
// the given curves.
QByteArray refinishReply(const QList<Curve>& curves, int sampleNumber = 2)
{
    CmdData out;
    appendHead(out, sampleNumber);
    out.append_si32(8);
    for (int i = 0; i < 6; ++i) {
        out.appendString(kImageAngles[i]);
        out.append_si32(0);
        out.append_si32(IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL);
        out.append_ui16(56);
        out.append_ui16(78);
        out.append_si32(56 * 78 * 3);
        out.appendBuffer(thumbnailBytes(10 + i));
    }
    out.appendString("r15as45");
    out.append_si32(0);
    out.append_si32(IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE);
    appendTexture(out, 1.0f);
    // A content without a body in this reply.
    out.appendString("r15as80");
    out.append_si32(0);
    out.append_si32(IMAGE_CHANNEL_CONTENT_TYPE_OBSOLETE);
    out.append_si32(curves.size());
    for (const Curve& curve : curves)
        appendCurve(out, curve);
    return out.getBuffer();
}

QList<Curve> sixCurves()
{
    QList<Curve> curves;
    for (const char* angle : kD45Angles) {
        Curve curve;
        curve.angle = angle;
        curve.spectrum = ramp(31);
        curves << curve;
    }
    return curves;
}

QByteArray oneAngleReply(const QString& angle, int content, const std::function<void(CmdData&)>& body)
{
    CmdData out;
    appendHead(out, 1);
    out.append_si32(1);
    out.appendString(angle);
    out.append_si32(0);
    out.append_si32(content);
    body(out);
    out.append_si32(0);
    return out.getBuffer();
}

} // namespace

class TestMeasureCommands : public QObject
{
    Q_OBJECT

private:
    std::unique_ptr<ScriptedPeer> m_peer;

    void answer(quint32 status, const QByteArray& payload = QByteArray())
    {
        m_peer->setResponder([status, payload](const QByteArray& frame) {
            return ScriptedPeer::Reply{{ScriptedPeer::replyTo(frame, status, payload)}, 0};
        });
    }

    CmdData lastRequest() const
    {
        const QList<QByteArray> frames = m_peer->receivedFrames();
        return CmdData(frames.value(frames.size() - 1));
    }

private slots:
    void initTestCase()
    {
        StringTables::Init();
        Instrument_Set_Model_Type(MODEL_REFINISH_BIRCH);
        m_peer.reset(new ScriptedPeer);
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
        MeasureOut_SetActiveJobNameSource(nullptr);
    }

    void refinishRequestAsksForEverything()
    {
        answer(0, refinishReply(sixCurves()));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 258), STATUS_OK);
        CmdData sent = lastRequest();
        QCOMPARE(sent.getCommandCode(), 0x41000100L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-3"));
        QCOMPARE(int(sent.nextArg_ui8()), 2);
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.nextArgString(), QString("ALL"));
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.nextArgString(), QString("ALL"));
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.nextArg_si32(), 2);
        QCOMPARE(sent.nextArg_si32(), 3);
        QCOMPARE(sent.nextArg_si32(), 0);
        QCOMPARE(sent.nextArg_si32(), 3);
        QCOMPARE(sent.nextArg_si32(), 4);
        QCOMPARE(int(sent.nextArg_ui16()), 56);
        QCOMPARE(int(sent.nextArg_ui16()), 78);
        QCOMPARE(sent.nextArg_si32(), 5);
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.getPacketlength(), 0);
    }

    void measurementStatusComesWithItsData()
    {
        answer(2001, refinishReply(sixCurves(), 255));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 255), 2001u);
        QVERIFY(sample.getColorFilledIn());
        QCOMPARE(sample.getJobFileID(), QString("LOCAL-3"));
        QCOMPARE(sample.getFileID(), 255u);
        QCOMPARE(sample.getDBIndex(), 42);
        QCOMPARE(sample.getTimeStamp(), QDateTime(QDate(2024, 1, 15), QTime(8, 0, 5)));
        QCOMPARE(sample.getTemperature(), 24.0f);
        QCOMPARE(sample.getOrientation().OrientationZ, 12);
        QCOMPARE(sample.getCalibrationStatus(), CALIBRATION_STATUS_WARNING);
        QCOMPARE(sample.getPressureSwitch().Switch3, 1u);
        QCOMPARE(sample.getNumAngleCurves(), 6u);
        for (int angle = 0; angle < 6; ++angle) {
            QCOMPARE(sample.getRefl(angle, WAVELENGTH_400), double(0.01f * 1.0f));
            QCOMPARE(sample.getRefl(angle, WAVELENGTH_700), double(0.01f * 31.0f));
            QCOMPARE(sample.getLab(angle).a, -3.25);
            QCOMPARE(sample.getLch(angle).h, 105.0);
            // Both channels write L*: the later one stands.
            QCOMPARE(sample.getLabch(angle).l, 51.5);
        }
        for (int angle = 0; angle < NUM_OF_IMAGE_ANGLES; ++angle) {
            QCOMPARE(sample.getSampleThumbnail(angle).size(), QSize(44, 44));
            QCOMPARE(sample.getSampleThumbnail(angle).pixel(0, 0), qRgb(10 + angle, 10 + angle, 10 + angle));
            QVERIFY(!sample.hasImage(angle));
        }
        QVERIFY(sample.hasTexture(IMAGE_45));
        QCOMPARE(sample.getTexture(IMAGE_45).description, QString("coating"));
        QCOMPARE(sample.getTexture(IMAGE_45).simpleCoarseness, 1.0);
        QCOMPARE(sample.getTexture(IMAGE_45).res4, 11.0);
        QVERIFY(!sample.hasTexture(IMAGE_80));
    }

    void otherServerStatusLeavesTheSampleAlone()
    {
        answer(9, refinishReply(sixCurves()));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 1), 9u);
        QVERIFY(!sample.isValid());
        QVERIFY(!sample.getColorFilledIn());
    }

    void spectraAreCutToTheAxisAndCleaned()
    {
        QList<Curve> curves = sixCurves();
        curves[0].spectrum = ramp(32);
        curves[1].spectrum[WAVELENGTH_550] = std::numeric_limits<float>::quiet_NaN();
        curves[2].spectrum = ramp(10);
        // A channel type without a body of its own: nothing more is read for it.
        curves[5].unknownChannelLast = true;
        answer(0, refinishReply(curves));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 1), STATUS_OK);
        // The 32nd value is read and dropped: what follows still lines up.
        QCOMPARE(sample.getRefl(0, WAVELENGTH_700), double(0.01f * 31.0f));
        QCOMPARE(sample.getLab(0).b, 12.0);
        QCOMPARE(sample.getRefl(1, WAVELENGTH_550), 0.0);
        QCOMPARE(sample.getRefl(1, WAVELENGTH_560), double(0.01f * 17.0f));
        QCOMPARE(sample.getRefl(2, WAVELENGTH_490), double(0.01f * 10.0f));
        QCOMPARE(sample.getRefl(2, WAVELENGTH_500), 0.0);
    }

    void elevenAnglesOfAFiveCameraInstrument()
    {
        Instrument_Set_Model_Type(MODEL_REFINISH_ALDER);
        QList<Curve> curves = sixCurves();
        for (int angle = 6; angle < 11; ++angle) {
            Curve curve;
            curve.angle = getStringFromList(angle, ANGLE_FROM_SERVER_TABLE).toUpper();
            curve.spectrum = QVector<float>(31, 0.5f + 0.01f * angle);
            curve.lab = false;
            curves << curve;
        }
        answer(0, refinishReply(curves));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 1), STATUS_OK);
        Instrument_Set_Model_Type(MODEL_REFINISH_BIRCH);
        QCOMPARE(sample.getNumAngleCurves(), 11u);
        QCOMPARE(sample.getRefl(REFL_D15_80, WAVELENGTH_600), double(0.5f + 0.01f * 10));
        QCOMPARE(sample.getLch(REFL_D15_NEG_45).c, 12.5);
        QCOMPARE(sample.getSampleThumbnail(0).size(), QSize(56, 56));
    }

    void noCurvesStillCountsAsFilledIn()
    {
        answer(0, refinishReply({}));
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 1), STATUS_OK);
        QVERIFY(sample.getColorFilledIn());
        QCOMPARE(sample.getNumAngleCurves(), 0u);
        QCOMPARE(sample.getRefl(0, 0), 0.0);
    }

    void aShortReplyIsNotFilledIn()
    {
        QByteArray reply = refinishReply(sixCurves());
        reply.chop(4);
        answer(0, reply);
        Sample sample;
        QCOMPARE(CmdOut_GetRefinishSample(sample, "LOCAL-3", 1), STATUS_BAD_RESPONSE);
        QVERIFY(sample.isValid());
        QCOMPARE(sample.getDBIndex(), 42);
        QVERIFY(!sample.getColorFilledIn());
    }

    void fullImageOfOneAngle()
    {
        const QByteArray pixels(236 * 292 * 3, char(0x5a));
        answer(0, oneAngleReply("r15as-15", IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL, [&](CmdData& out) {
            out.append_ui16(236);
            out.append_ui16(292);
            out.append_si32(pixels.size());
            out.appendBuffer(pixels);
        }));
        QByteArray image;
        QCOMPARE(CmdOut_GetAngleFullImage(IMAGE_NEG_15, "LOCAL-3", 4, image), STATUS_OK);
        QCOMPARE(image, pixels);

        CmdData sent = lastRequest();
        QCOMPARE(sent.nextArgString(), QString("LOCAL-3"));
        QCOMPARE(int(sent.nextArg_ui8()), 4);
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.nextArgString(), QString("r15as-15"));
        QCOMPARE(sent.nextArg_si32(), 0);
        QCOMPARE(sent.nextArg_si32(), 1);
        QCOMPARE(sent.nextArg_si32(), 2);
        QCOMPARE(sent.nextArg_si32(), 0);
        QCOMPARE(int(sent.nextArg_ui16()), 236);
        QCOMPARE(int(sent.nextArg_ui16()), 292);
    }

    void textureAndParametersOfOneAngle()
    {
        answer(0, oneAngleReply("r15d", IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE, [](CmdData& out) { appendTexture(out, 20.0f); }));
        TEXTURE_T texture;
        QCOMPARE(CmdOut_GetAngleTexture(IMAGE_DIFFUSE, "LOCAL-3", 1, texture), STATUS_OK);
        QCOMPARE(texture.description, QString("coating"));
        QCOMPARE(texture.sparkleGrade, 25.0);
        CmdData sent = lastRequest();
        sent.nextArgString();
        sent.nextArg_ui8();
        sent.nextArg_si32();
        QCOMPARE(sent.nextArgString(), QString("r15d"));
        sent.nextArg_si32();
        sent.nextArg_si32();
        QCOMPARE(sent.nextArg_si32(), 1);
        sent.nextArg_si32();
        QCOMPARE(int(sent.nextArg_ui16()), 482);
        QCOMPARE(int(sent.nextArg_ui16()), 348);

        answer(0, oneAngleReply("r15as80", IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE_PARAMETER, [](CmdData& out) {
            out.append_si32(2);
            out.appendString("Sparkle");
            out.appendString("2.1");
            out.append_f32(3.5f);
            out.appendString("Graininess");
            out.appendString("1.0");
            out.append_f32(0.75f);
        }));
        QVector<TEXTURE_PARAMETER_T> parameters(4);
        QCOMPARE(CmdOut_GetAngleTextureParameters(IMAGE_80, "LOCAL-3", 1, parameters), STATUS_OK);
        QCOMPARE(parameters.size(), 2);
        QCOMPARE(parameters.at(1).name, QString("Graininess"));
        QCOMPARE(parameters.at(0).version, QString("2.1"));
        QCOMPARE(parameters.at(0).value, 3.5f);

        // Another content than the one asked for leaves the output alone.
        answer(0, oneAngleReply("r15as80", IMAGE_CHANNEL_CONTENT_TYPE_EXR, [](CmdData&) {}));
        QCOMPARE(CmdOut_GetAngleTextureParameters(IMAGE_80, "LOCAL-3", 1, parameters), STATUS_OK);
        QCOMPARE(parameters.size(), 2);

        // These are validated: a server refusal comes back as 2.
        answer(2001, oneAngleReply("r15d", IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE, [](CmdData& out) { appendTexture(out, 1.0f); }));
        QCOMPARE(CmdOut_GetAngleTexture(IMAGE_DIFFUSE, "LOCAL-3", 1, texture), STATUS_BAD_RESPONSE_STATUS);
    }

    void triggerNamesTheActiveJob()
    {
        MeasureOut_SetActiveJobNameSource([] { return QStringLiteral("FENDER"); });
        answer(2033);
        QCOMPARE(CmdOut_TriggerMeasurement(), 2033u);
        CmdData sent = lastRequest();
        QCOMPARE(sent.getCommandCode(), 0x41000000L);
        QCOMPARE(sent.nextArgString(), QString("FENDER"));

        MeasureOut_SetActiveJobNameSource(nullptr);
        answer(0);
        QCOMPARE(CmdOut_TriggerMeasurement(), STATUS_OK);
        QCOMPARE(lastRequest().nextArgString(), QString());
    }

    void smallMeasureCommands()
    {
        answer(0, [] {
            CmdData out;
            out.append_f32(31.25f);
            return out.getBuffer();
        }());
        float value = 0.0f;
        QCOMPARE(CmdOut_GetTemperature(value, 3), STATUS_OK);
        QCOMPARE(value, 31.25f);
        CmdData sent = lastRequest();
        QCOMPARE(sent.getCommandCode(), 0x400A0E22L);
        QCOMPARE(int(sent.nextArg_ui16()), 3);

        answer(0);
        QCOMPARE(CmdOut_ForceFinishSMC("LOCAL-9"), STATUS_OK);
        sent = lastRequest();
        QCOMPARE(sent.getCommandCode(), 0x40010060L);
        QCOMPARE(sent.nextArgString(), QString("LOCAL-9"));
        QCOMPARE(CmdOut_GetSpectralResult(), STATUS_OK);
        QCOMPARE(lastRequest().getCommandCode(), 0x40008002L);
        QCOMPARE(CmdOut_GetImageResult(), STATUS_OK);
        QCOMPARE(lastRequest().getCommandCode(), 0x40008001L);

        answer(0);
        QCOMPARE(CmdOut_GetTemperature(value, 3), STATUS_BAD_RESPONSE);
    }
};

QTEST_GUILESS_MAIN(TestMeasureCommands)
#include "tst_measurecommands.moc"
