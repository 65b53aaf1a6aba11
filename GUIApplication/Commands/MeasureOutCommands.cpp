#include "Commands/MeasureOutCommands.h"

#include "Communication/CmdData.h"
#include "Communication/Commands.h"
#include "SharedSystem/StringTables.h"

#include <QMutex>
#include <QMutexLocker>
#include <QRecursiveMutex>
#include <QStringList>

#include <cmath>

namespace {

QRecursiveMutex s_measureMutex;

constexpr long CMD_GET_IMAGE_RESULT = 0x40008001;
constexpr long CMD_GET_SPECTRAL_RESULT = 0x40008002;
constexpr long CMD_FORCE_FINISH_SMC = 0x40010060;
constexpr long CMD_GET_TEMPERATURE = 0x400A0E22;
constexpr long CMD_TRIGGER_MEASUREMENT = 0x41000000;
constexpr long CMD_GET_SAMPLE = 0x41000100;
constexpr int REFINISH_SAMPLE_TIMEOUT_MS = 11000;
// The camera's own size, asked for with texture figures.
constexpr unsigned short TEXTURE_IMAGE_WIDTH = 482;
constexpr unsigned short TEXTURE_IMAGE_HEIGHT = 348;

// Spectral channel types of a curve.
constexpr int CHANNEL_SPECTRUM = 0;
constexpr int CHANNEL_LAB = 3;
constexpr int CHANNEL_LCH = 4;

QMutex& sourceMutex()
{
    static QMutex mutex;
    return mutex;
}

ActiveJobNameSource& activeJobName()
{
    static ActiveJobNameSource source;
    return source;
}

struct SampleRequest {
    QStringList imageAngles;
    QStringList spectralAngles;
    QVector<int> imageContents;
    QVector<int> spectralContents;
    unsigned short width = 0;
    unsigned short height = 0;
};

void appendSampleRequest(CmdData& cmd, const QString& fileID, int index, const SampleRequest& request)
{
    cmd.appendString(fileID);
    cmd.append_ui8(char(index & 0xFF));
    cmd.append_si32(request.imageAngles.size());
    for (const QString& angle : request.imageAngles)
        cmd.appendString(angle);
    cmd.append_si32(request.spectralAngles.size());
    for (const QString& angle : request.spectralAngles)
        cmd.appendString(angle);
    cmd.append_si32(request.imageContents.size());
    for (int content : request.imageContents)
        cmd.append_si32(content);
    cmd.append_si32(request.spectralContents.size());
    for (int content : request.spectralContents)
        cmd.append_si32(content);
    cmd.append_ui16(request.width);
    cmd.append_ui16(request.height);
    cmd.append_si32(5);
    cmd.append_si32(1);
}

SampleRequest singleAngleRequest(IMAGE_ANGLE_T angle, IMAGE_CHANNEL_CONTENT_TYPE content,
                                 unsigned short width, unsigned short height)
{
    SampleRequest request;
    request.imageAngles << getStringFromList(angle, IMAGE_FROM_SERVER_ANGLE_TABLE);
    request.imageContents << content;
    request.width = width;
    request.height = height;
    return request;
}

TEXTURE_T nextArgTexture(CmdData& rx)
{
    TEXTURE_T texture;
    texture.description = rx.nextArgString();
    texture.simpleCoarseness = rx.nextArg_f32();
    texture.backGroundCoarseness = rx.nextArg_f32();
    texture.directionalCoarseness = rx.nextArg_f32();
    texture.sparkleArea = rx.nextArg_f32();
    texture.sparkleIntensity = rx.nextArg_f32();
    texture.sparkleGrade = rx.nextArg_f32();
    texture.sparkleDensity = rx.nextArg_f32();
    texture.res1 = rx.nextArg_f32();
    texture.res2 = rx.nextArg_f32();
    texture.res3 = rx.nextArg_f32();
    texture.res4 = rx.nextArg_f32();
    return texture;
}

// Width and height are the server's business; the bytes are the picture.
QByteArray nextArgThumbnail(CmdData& rx)
{
    rx.nextArg_ui16();
    rx.nextArg_ui16();
    const int size = rx.nextArg_si32();
    return rx.nextArgBuffer(size);
}

QVector<TEXTURE_PARAMETER_T> nextArgTextureParameters(CmdData& rx)
{
    QVector<TEXTURE_PARAMETER_T> parameters;
    const int count = rx.nextArg_si32();
    for (int i = 0; i < count; ++i) {
        TEXTURE_PARAMETER_T parameter;
        parameter.name = rx.nextArgString();
        parameter.version = rx.nextArgString();
        parameter.value = rx.nextArg_f32();
        parameters.append(parameter);
    }
    return parameters;
}

void readImageChannels(CmdData& rx, Sample& sample)
{
    const int count = rx.nextArg_si32();
    for (int i = 0; i < count; ++i) {
        const int angle = getValueFromList(rx.nextArgString(), IMAGE_FROM_SERVER_ANGLE_TABLE);
        rx.nextArg_si32();
        const int content = rx.nextArg_si32();
        if (content == IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE)
            sample.setTexture(nextArgTexture(rx), angle);
        else if (content == IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL)
            sample.setThumbnailImage(nextArgThumbnail(rx), angle);
    }
}

struct Triple {
    double first;
    double second;
    double third;
};

// The body of a coordinate channel: two words the GUI has no use for, then
// three values.
Triple nextArgTriple(CmdData& rx)
{
    rx.nextArg_si32();
    rx.nextArg_si32();
    Triple v;
    v.first = rx.nextArg_f32();
    v.second = rx.nextArg_f32();
    v.third = rx.nextArg_f32();
    return v;
}

void readCurves(CmdData& rx, Sample& sample)
{
    const int curves = rx.nextArg_si32();
    sample.setNumAngleCurves(unsigned(curves));
    for (int curve = 0; curve < curves; ++curve) {
        const int angle = getValueFromList(rx.nextArgString(), ANGLE_FROM_SERVER_TABLE);
        const int channels = rx.nextArg_si32();
        for (int channel = 0; channel < channels; ++channel) {
            const int type = rx.nextArg_si32() & 0xFFFF;
            if (type == CHANNEL_SPECTRUM) {
                rx.nextArg_f32();
                rx.nextArg_f32();
                const int n = rx.nextArg_si32();
                double refl[NUM_WAVELENGTHS] = {};
                for (int i = 0; i < n; ++i) {
                    const float value = rx.nextArg_f32();
                    if (i < NUM_WAVELENGTHS)
                        refl[i] = std::isnan(value) ? 0.0 : double(value);
                }
                sample.setReflectances(angle, refl);
            } else if (type == CHANNEL_LAB) {
                const Triple v = nextArgTriple(rx);
                LAB_T lab;
                lab.l = v.first;
                lab.a = v.second;
                lab.b = v.third;
                sample.setLab(angle, lab);
            } else if (type == CHANNEL_LCH) {
                const Triple v = nextArgTriple(rx);
                LCH_T lch;
                lch.l = v.first;
                lch.c = v.second;
                lch.h = v.third;
                sample.setLch(angle, lch);
            }
        }
    }
}

bool isMeasurementStatus(STATUS_T status)
{
    return status >= 2000 && status <= 2006;
}

// Sends a one-angle sample request and reads the one image channel of the
// reply; read is called when the channel holds the content asked for.
STATUS_T singleAngle(IMAGE_ANGLE_T angle, const QString& fileID, int index, IMAGE_CHANNEL_CONTENT_TYPE content,
                     unsigned short width, unsigned short height, const std::function<void(CmdData&)>& read)
{
    return runCommand(
        s_measureMutex, CMD_GET_SAMPLE, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { appendSampleRequest(tx, fileID, index, singleAngleRequest(angle, content, width, height)); },
        [&](CmdData& rx) {
            rx.nextArgString();
            rx.nextArg_si8();
            rx.nextArgSampleInfo();
            rx.nextArg_si32();
            rx.nextArgString();
            rx.nextArg_si32();
            if (rx.nextArg_si32() == content)
                read(rx);
            rx.nextArg_si32();
            return STATUS_OK;
        });
}

} // namespace

void MeasureOut_SetActiveJobNameSource(ActiveJobNameSource source)
{
    QMutexLocker lock(&sourceMutex());
    activeJobName() = std::move(source);
}

STATUS_T CmdOut_TriggerMeasurement()
{
    ActiveJobNameSource source;
    {
        QMutexLocker lock(&sourceMutex());
        source = activeJobName();
    }
    const QString jobName = source ? source() : QString();
    return runCommand(s_measureMutex, CMD_TRIGGER_MEASUREMENT, false, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&jobName](CmdData& tx) { tx.appendString(jobName); },
                      [](CmdData& rx) { return rx.getStatus(); });
}

STATUS_T CmdOut_GetSpectralResult()
{
    return runCommand(s_measureMutex, CMD_GET_SPECTRAL_RESULT, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      nothingRead);
}

STATUS_T CmdOut_GetImageResult()
{
    return runCommand(s_measureMutex, CMD_GET_IMAGE_RESULT, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      nothingRead);
}

STATUS_T CmdOut_ForceFinishSMC(const QString& fileID)
{
    return runCommand(s_measureMutex, CMD_FORCE_FINISH_SMC, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [&fileID](CmdData& tx) { tx.appendString(fileID); }, nothingRead);
}

STATUS_T CmdOut_GetRefinishSample(Sample& sample, const QString& fileID, int index)
{
    SampleRequest request;
    request.imageAngles << QStringLiteral("ALL");
    request.spectralAngles << QStringLiteral("ALL");
    request.imageContents << IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL;
    request.spectralContents << CHANNEL_SPECTRUM << CHANNEL_LAB << CHANNEL_LCH;
    request.width = Sample::THUMBNAIL_WIRE_WIDTH;
    request.height = Sample::THUMBNAIL_WIRE_HEIGHT;

    return runCommand(s_measureMutex, CMD_GET_SAMPLE, false, REFINISH_SAMPLE_TIMEOUT_MS,
                      [&](CmdData& tx) { appendSampleRequest(tx, fileID, index, request); },
                      [&sample](CmdData& rx) {
                          // A finished measurement's own status comes with its data.
                          const STATUS_T status = rx.getStatus();
                          if (status != STATUS_OK && !isMeasurementStatus(status))
                              return status;
                          sample.setJobFileID(rx.nextArgString());
                          // The averaged sample is 255 on the wire: the byte is taken unsigned.
                          sample.setFileID(static_cast<unsigned char>(rx.nextArg_si8()));
                          sample.setSampleInfo(rx.nextArgSampleInfo());
                          readImageChannels(rx, sample);
                          readCurves(rx, sample);
                          sample.setColorFilledIn(true);
                          return status;
                      });
}

STATUS_T CmdOut_GetAngleFullImage(IMAGE_ANGLE_T angle, const QString& fileID, int index, QByteArray& image)
{
    return singleAngle(angle, fileID, index, IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL, Sample::IMAGE_WIRE_WIDTH,
                       Sample::IMAGE_WIRE_HEIGHT, [&image](CmdData& rx) { image = nextArgThumbnail(rx); });
}

STATUS_T CmdOut_GetAngleTexture(IMAGE_ANGLE_T angle, const QString& fileID, int index, TEXTURE_T& texture)
{
    return singleAngle(angle, fileID, index, IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE, TEXTURE_IMAGE_WIDTH,
                       TEXTURE_IMAGE_HEIGHT, [&texture](CmdData& rx) { texture = nextArgTexture(rx); });
}

STATUS_T CmdOut_GetAngleTextureParameters(IMAGE_ANGLE_T angle, const QString& fileID, int index,
                                          QVector<TEXTURE_PARAMETER_T>& parameters)
{
    return singleAngle(angle, fileID, index, IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE_PARAMETER, TEXTURE_IMAGE_WIDTH,
                       TEXTURE_IMAGE_HEIGHT, [&parameters](CmdData& rx) { parameters = nextArgTextureParameters(rx); });
}

STATUS_T CmdOut_GetTemperature(float& value, unsigned short sensor)
{
    return runCommand(s_measureMutex, CMD_GET_TEMPERATURE, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      [sensor](CmdData& tx) { tx.append_ui16(sensor); },
                      [&value](CmdData& rx) {
                          value = rx.nextArg_f32();
                          return STATUS_OK;
                      });
}
