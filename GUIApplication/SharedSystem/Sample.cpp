#include "SharedSystem/Sample.h"

#include "GUIAPI/ColorAPI.h"
#include "SharedSystem/Instrument.h"
#include "Utils/ConversionHelper.h"

#include <QDebug>
#include <QMutexLocker>
#include <QRecursiveMutex>

#include <cstring>

namespace {

// One lock for all samples: the GUI thread reads while DataManager's thread
// writes, and the LAB_T/LCH_T setters re-enter through their double forms.
QRecursiveMutex& sampleMutex()
{
    static QRecursiveMutex mutex;
    return mutex;
}

constexpr int kThumbnailStride = Sample::THUMBNAIL_WIRE_WIDTH * 3;
constexpr int kImageStride = Sample::IMAGE_WIRE_WIDTH * 3;

// A picture over bytes that may be shorter than it: the missing rows stay
// black instead of being read from beyond the buffer.
QImage wrapRgb888(const QByteArray& bytes, int width, int height, int stride, QByteArray& storage)
{
    const int needed = stride * height;
    storage = bytes;
    if (storage.size() < needed) {
        qDebug().noquote() << QStringLiteral("Sample: picture of %1 bytes where %2 x %3 needs %4")
                                  .arg(bytes.size())
                                  .arg(width)
                                  .arg(height)
                                  .arg(needed);
        storage.append(QByteArray(needed - storage.size(), '\0'));
    }
    return QImage(reinterpret_cast<const uchar*>(storage.constData()), width, height, stride,
                  QImage::Format_RGB888);
}

} // namespace

#define SAMPLE_LOCK QMutexLocker lock(&sampleMutex());

Sample::Sample()
{
    clearContents();
}

void Sample::clearContents()
{
    SAMPLE_LOCK
    m_FileID = 0;
    m_JobFileID.clear();
    m_sampleInfo = SAMPLE_INFO_T();
    m_sampleInfo.dbIndex = 0;
    m_sampleInfo.temperature = 0.0f;
    m_sampleInfo.accelerationInfo = ACCELEROMETER_ORIENTATION_T();
    m_sampleInfo.calibrationStatus = CALIBRATION_STATUS_REQUIRED;
    m_sampleInfo.pressureStatus = PRESSURE_SWITCH_T();
    m_sampleInfo.timeStamp = QDateTime::fromSecsSinceEpoch(0);
    m_NumAngleCurves = 6;
    std::memset(m_Refl, 0, sizeof(m_Refl));
    for (int angle = 0; angle < NUM_REFL_ANGLE_TYPES; ++angle)
        m_Labch[angle] = LABCH_T();
    for (int angle = 0; angle < NUM_OF_IMAGE_ANGLES; ++angle) {
        m_ImageFileID[angle] = 0;
        m_Thumbnails[angle].image = QImage();
        m_Thumbnails[angle].buffer.clear();
        m_Images[angle].image = QImage();
        m_Images[angle].buffer.clear();
        m_hasImages[angle] = false;
        m_hasTextures[angle] = false;
        m_texture[angle] = TEXTURE_T();
        m_textureParameters[angle].clear();
    }
    m_colorFilledIn = false;
    m_textureFilledIn = false;
    m_isValid = false;
}

bool Sample::isValid() const
{
    SAMPLE_LOCK
    return m_isValid;
}

bool Sample::reflAngleUsable(int angle) const
{
    return angle >= 0 && angle < NUM_REFL_ANGLE_TYPES && unsigned(angle) < m_NumAngleCurves;
}

int Sample::reflAngleOrZero(int angle) const
{
    return reflAngleUsable(angle) ? angle : 0;
}

bool Sample::imageAngleUsable(int angle)
{
    return angle >= 0 && angle < NUM_OF_IMAGE_ANGLES;
}

int Sample::imageAngleOrZero(int angle)
{
    return imageAngleUsable(angle) ? angle : 0;
}

void Sample::setFileID(unsigned int fileID)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_FileID = fileID;
}

unsigned int Sample::getFileID() const
{
    SAMPLE_LOCK
    return m_FileID;
}

void Sample::setJobFileID(const QString& jobFileID)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_JobFileID = jobFileID;
}

QString Sample::getJobFileID() const
{
    SAMPLE_LOCK
    return m_JobFileID;
}

void Sample::setSampleInfo(const SAMPLE_INFO_T& info)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo = info;
}

SAMPLE_INFO_T Sample::getSampleInfo() const
{
    SAMPLE_LOCK
    return m_sampleInfo;
}

int Sample::getDBIndex() const
{
    SAMPLE_LOCK
    return m_sampleInfo.dbIndex;
}

void Sample::setTemperature(float temperature)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.temperature = temperature;
}

float Sample::getTemperature() const
{
    SAMPLE_LOCK
    return m_sampleInfo.temperature;
}

void Sample::setOrientation(const ACCELEROMETER_ORIENTATION_T& orientation)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.accelerationInfo = orientation;
}

ACCELEROMETER_ORIENTATION_T Sample::getOrientation() const
{
    SAMPLE_LOCK
    return m_sampleInfo.accelerationInfo;
}

void Sample::setPosition(int position)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.accelerationInfo.OrientationPosition = position;
}

int Sample::getPosition() const
{
    SAMPLE_LOCK
    return m_sampleInfo.accelerationInfo.OrientationPosition;
}

void Sample::setAcceleration(int acceleration)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.accelerationInfo.OrientationAcceleration = acceleration;
}

int Sample::getAcceleration() const
{
    SAMPLE_LOCK
    return m_sampleInfo.accelerationInfo.OrientationAcceleration;
}

void Sample::setCalibrationStatus(CALIBRATION_STATUS_T status)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.calibrationStatus = status;
}

CALIBRATION_STATUS_T Sample::getCalibrationStatus() const
{
    SAMPLE_LOCK
    return m_sampleInfo.calibrationStatus;
}

void Sample::setPressureSwitch(const PRESSURE_SWITCH_T& pressure)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.pressureStatus = pressure;
}

PRESSURE_SWITCH_T Sample::getPressureSwitch() const
{
    SAMPLE_LOCK
    return m_sampleInfo.pressureStatus;
}

void Sample::setTimeStamp(const QDateTime& timeStamp)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_sampleInfo.timeStamp = timeStamp;
}

QDateTime Sample::getTimeStamp() const
{
    SAMPLE_LOCK
    return m_sampleInfo.timeStamp;
}

QString Sample::getTimeStampString(const QString& format) const
{
    SAMPLE_LOCK
    return m_sampleInfo.timeStamp.toString(format);
}

QString Sample::getTimeStampString() const
{
    return convertDateTimeToString(getTimeStamp());
}

void Sample::setNumAngleCurves(unsigned int count)
{
    SAMPLE_LOCK
    m_isValid = true;
    m_NumAngleCurves = count < 12 ? count : 11;
}

unsigned int Sample::getNumAngleCurves() const
{
    SAMPLE_LOCK
    return m_NumAngleCurves;
}

void Sample::setRefl(int angle, int wavelength, double value)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!reflAngleUsable(angle) || wavelength < 0 || wavelength >= NUM_WAVELENGTHS)
        return;
    m_Refl[angle][wavelength] = value;
}

double Sample::getRefl(int angle, int wavelength) const
{
    SAMPLE_LOCK
    if (!reflAngleUsable(angle) || wavelength < 0 || wavelength >= NUM_WAVELENGTHS)
        return 0.0;
    return m_Refl[angle][wavelength];
}

void Sample::setReflectances(int angle, const double* data)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!reflAngleUsable(angle) || data == nullptr)
        return;
    std::memcpy(m_Refl[angle], data, sizeof(m_Refl[angle]));
}

double* Sample::getReflectances(int angle)
{
    SAMPLE_LOCK
    return m_Refl[reflAngleOrZero(angle)];
}

const double* Sample::getReflectances(int angle) const
{
    SAMPLE_LOCK
    return m_Refl[reflAngleOrZero(angle)];
}

void Sample::setLab(int angle, const LAB_T& lab)
{
    SAMPLE_LOCK
    setLab(angle, lab.l, lab.a, lab.b);
}

void Sample::setLab(int angle, double l, double a, double b)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!reflAngleUsable(angle))
        return;
    m_Labch[angle].l = l;
    m_Labch[angle].a = a;
    m_Labch[angle].b = b;
}

void Sample::setLch(int angle, const LCH_T& lch)
{
    SAMPLE_LOCK
    setLch(angle, lch.l, lch.c, lch.h);
}

void Sample::setLch(int angle, double l, double c, double h)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!reflAngleUsable(angle))
        return;
    m_Labch[angle].l = l;
    m_Labch[angle].c = c;
    m_Labch[angle].h = h;
}

LABCH_T Sample::getLabch(int angle) const
{
    SAMPLE_LOCK
    return m_Labch[reflAngleOrZero(angle)];
}

LAB_T Sample::getLab(int angle) const
{
    SAMPLE_LOCK
    const LABCH_T& v = m_Labch[reflAngleOrZero(angle)];
    LAB_T lab;
    lab.l = v.l;
    lab.a = v.a;
    lab.b = v.b;
    return lab;
}

LCH_T Sample::getLch(int angle) const
{
    SAMPLE_LOCK
    const LABCH_T& v = m_Labch[reflAngleOrZero(angle)];
    LCH_T lch;
    lch.l = v.l;
    lch.c = v.c;
    lch.h = v.h;
    return lch;
}

QColor Sample::getColor(int angle) const
{
    SAMPLE_LOCK
    // A failed conversion shows black rather than whatever was in memory.
    COLORSPACE_OBJECT_T rgb = {0.0f, 0.0f, 0.0f, 255.0f};
    ColorAPI_GetRGBValues(const_cast<double*>(m_Refl[reflAngleOrZero(angle)]), &rgb);
    return QColor(qBound(0, int(rgb.ColorVal1), 255), qBound(0, int(rgb.ColorVal2), 255),
                  qBound(0, int(rgb.ColorVal3), 255), 255);
}

void Sample::setImageFileID(int angle, unsigned int id)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!imageAngleUsable(angle))
        return;
    m_ImageFileID[angle] = id;
}

unsigned int Sample::getImageFileID(int angle) const
{
    SAMPLE_LOCK
    return imageAngleUsable(angle) ? m_ImageFileID[angle] : 0;
}

void Sample::setThumbnailImage(const QByteArray& bytes, int angle)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!imageAngleUsable(angle))
        return;
    IMAGE_CONTAINER_T& thumbnail = m_Thumbnails[angle];
    QByteArray storage;
    const QImage wire = wrapRgb888(bytes, THUMBNAIL_WIRE_WIDTH, THUMBNAIL_WIRE_HEIGHT, kThumbnailStride, storage);
    thumbnail.buffer = bytes;
    // The server sends one size for every model; the model's thumbnail is
    // the centre of it.
    const int width = Instrument_Get_Sample_Thumbnail_Width();
    const int height = Instrument_Get_Sample_Thumbnail_Height();
    const int left = (THUMBNAIL_WIRE_WIDTH - width) >> 1;
    const int top = (THUMBNAIL_WIRE_HEIGHT - height) >> 1;
    thumbnail.image = wire.copy(left, top, width, height);
}

QImage Sample::getSampleThumbnail(int angle) const
{
    SAMPLE_LOCK
    return m_Thumbnails[imageAngleOrZero(angle)].image;
}

void Sample::setImage(const QByteArray& bytes, int angle)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!imageAngleUsable(angle))
        return;
    IMAGE_CONTAINER_T& image = m_Images[angle];
    QByteArray storage;
    const QImage wire = wrapRgb888(bytes, IMAGE_WIRE_WIDTH, IMAGE_WIRE_HEIGHT, kImageStride, storage);
    image.buffer = bytes;
    image.image = wire.copy();
    m_hasImages[angle] = true;
}

QImage Sample::getSampleImage(int angle) const
{
    SAMPLE_LOCK
    return m_Images[imageAngleOrZero(angle)].image;
}

bool Sample::hasImage(int angle) const
{
    SAMPLE_LOCK
    return m_hasImages[imageAngleOrZero(angle)];
}

void Sample::setTexture(const TEXTURE_T& texture, int angle)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!imageAngleUsable(angle))
        return;
    m_texture[angle] = texture;
    m_hasTextures[angle] = true;
}

void Sample::setTexture(double directionalCoarseness, double sparkleGrade, double sparkleDensity,
                        double sparkleIntensity, double sparkleArea, int angle)
{
    TEXTURE_T texture;
    texture.directionalCoarseness = directionalCoarseness;
    texture.sparkleGrade = sparkleGrade;
    texture.sparkleDensity = sparkleDensity;
    texture.sparkleIntensity = sparkleIntensity;
    texture.sparkleArea = sparkleArea;
    setTexture(texture, angle);
}

TEXTURE_T Sample::getTexture(int angle) const
{
    SAMPLE_LOCK
    return m_texture[imageAngleOrZero(angle)];
}

void Sample::setTextureParameters(const QVector<TEXTURE_PARAMETER_T>& parameters, int angle)
{
    SAMPLE_LOCK
    m_isValid = true;
    if (!imageAngleUsable(angle))
        return;
    m_textureParameters[angle] = parameters;
    m_hasTextures[angle] = true;
}

QVector<TEXTURE_PARAMETER_T> Sample::getTextureParameters(int angle) const
{
    SAMPLE_LOCK
    return m_textureParameters[imageAngleOrZero(angle)];
}

bool Sample::hasTexture(int angle) const
{
    SAMPLE_LOCK
    return m_hasTextures[imageAngleOrZero(angle)];
}

void Sample::setColorFilledIn(bool filledIn)
{
    SAMPLE_LOCK
    m_colorFilledIn = filledIn;
}

bool Sample::getColorFilledIn() const
{
    SAMPLE_LOCK
    return m_colorFilledIn;
}

void Sample::setTextureFilledIn(bool filledIn)
{
    SAMPLE_LOCK
    m_textureFilledIn = filledIn;
}

bool Sample::getTextureFilledIn() const
{
    SAMPLE_LOCK
    return m_textureFilledIn;
}
