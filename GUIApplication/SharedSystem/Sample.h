#ifndef SAMPLE_H
#define SAMPLE_H

// One measurement (or a job's averaged result, sample 255 on the wire): the
// spectra and coordinates per reflectance angle, camera pictures and texture
// figures per image angle, and the conditions of the measurement. It fills
// up in stages (description, colour, textures, images), because a full
// sample is large and the job list must stay fast.
//
// The GUI thread reads samples while DataManager's thread writes them, so
// every accessor holds one process-wide recursive lock. Copies don't.

#include "SharedSystem/InstrumentTypes.h"

#include <QByteArray>
#include <QColor>
#include <QDateTime>
#include <QImage>
#include <QMetaType>
#include <QString>
#include <QVector>

class Sample
{
public:
    // Thumbnails arrive as 56 x 78 and full pictures as 236 x 292, RGB888.
    static constexpr int THUMBNAIL_WIRE_WIDTH = 56;
    static constexpr int THUMBNAIL_WIRE_HEIGHT = 78;
    static constexpr int IMAGE_WIRE_WIDTH = 236;
    static constexpr int IMAGE_WIRE_HEIGHT = 292;

    Sample();

    void clearContents();
    bool isValid() const;
    bool isSampleValid() const { return isValid(); }

    void setFileID(unsigned int fileID);
    unsigned int getFileID() const;
    void setJobFileID(const QString& jobFileID);
    QString getJobFileID() const;

    void setSampleInfo(const SAMPLE_INFO_T& info);
    SAMPLE_INFO_T getSampleInfo() const;
    int getDBIndex() const;
    void setTemperature(float temperature);
    float getTemperature() const;
    void setOrientation(const ACCELEROMETER_ORIENTATION_T& orientation);
    ACCELEROMETER_ORIENTATION_T getOrientation() const;
    void setPosition(int position);
    int getPosition() const;
    void setAcceleration(int acceleration);
    int getAcceleration() const;
    void setCalibrationStatus(CALIBRATION_STATUS_T status);
    CALIBRATION_STATUS_T getCalibrationStatus() const;
    void setPressureSwitch(const PRESSURE_SWITCH_T& pressure);
    PRESSURE_SWITCH_T getPressureSwitch() const;
    void setTimeStamp(const QDateTime& timeStamp);
    QDateTime getTimeStamp() const;
    QString getTimeStampString(const QString& format) const;
    QString getTimeStampString() const;

    // How many reflectance angles hold data; above 11 stores 11.
    void setNumAngleCurves(unsigned int count);
    unsigned int getNumAngleCurves() const;

    void setRefl(int angle, int wavelength, double value);
    double getRefl(int angle, int wavelength) const;
    void setReflectances(int angle, const double* data);
    // The sample's own 31 values, valid while the sample lives. An angle
    // without data gives angle 0's.
    double* getReflectances(int angle);
    const double* getReflectances(int angle) const;

    void setLab(int angle, const LAB_T& lab);
    void setLab(int angle, double l, double a, double b);
    void setLch(int angle, const LCH_T& lch);
    void setLch(int angle, double l, double c, double h);
    LABCH_T getLabch(int angle) const;
    LAB_T getLab(int angle) const;
    LCH_T getLch(int angle) const;

    // The on-screen colour of an angle, opaque, worked out at each call.
    QColor getColor(int angle) const;

    void setImageFileID(int angle, unsigned int id);
    unsigned int getImageFileID(int angle) const;
    void setThumbnailImage(const QByteArray& bytes, int angle);
    QImage getSampleThumbnail(int angle) const;
    void setImage(const QByteArray& bytes, int angle);
    QImage getSampleImage(int angle) const;
    bool hasImage(int angle) const;

    void setTexture(const TEXTURE_T& texture, int angle);
    void setTexture(double directionalCoarseness, double sparkleGrade, double sparkleDensity,
                    double sparkleIntensity, double sparkleArea, int angle);
    TEXTURE_T getTexture(int angle) const;
    void setTextureParameters(const QVector<TEXTURE_PARAMETER_T>& parameters, int angle);
    QVector<TEXTURE_PARAMETER_T> getTextureParameters(int angle) const;
    bool hasTexture(int angle) const;

    void setColorFilledIn(bool filledIn);
    bool getColorFilledIn() const;
    void setTextureFilledIn(bool filledIn);
    bool getTextureFilledIn() const;

private:
    bool reflAngleUsable(int angle) const;
    int reflAngleOrZero(int angle) const;
    static int imageAngleOrZero(int angle);
    static bool imageAngleUsable(int angle);

    unsigned int m_FileID;
    bool m_isValid;
    QString m_JobFileID;
    SAMPLE_INFO_T m_sampleInfo;
    unsigned int m_NumAngleCurves;
    double m_Refl[NUM_REFL_ANGLE_TYPES][NUM_WAVELENGTHS];
    LABCH_T m_Labch[NUM_REFL_ANGLE_TYPES];
    unsigned int m_ImageFileID[NUM_OF_IMAGE_ANGLES];
    IMAGE_CONTAINER_T m_Thumbnails[NUM_OF_IMAGE_ANGLES];
    IMAGE_CONTAINER_T m_Images[NUM_OF_IMAGE_ANGLES];
    bool m_hasImages[NUM_OF_IMAGE_ANGLES];
    bool m_hasTextures[NUM_OF_IMAGE_ANGLES];
    TEXTURE_T m_texture[NUM_OF_IMAGE_ANGLES];
    QVector<TEXTURE_PARAMETER_T> m_textureParameters[NUM_OF_IMAGE_ANGLES];
    bool m_colorFilledIn;
    bool m_textureFilledIn;
};

Q_DECLARE_METATYPE(Sample)

#endif // SAMPLE_H
