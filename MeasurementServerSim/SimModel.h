#ifndef SIMMODEL_H
#define SIMMODEL_H

// The records the simulated server keeps: jobs with their samples,
// parameters and Wi-Fi networks. SimStore persists them; SimInstrument works
// on the copies it holds in memory.

#include "SharedSystem/InstrumentTypes.h"
#include "SimTypes.h"

#include <QDateTime>
#include <QString>
#include <QStringList>
#include <QVector>

namespace Sim {

struct Tag {
    QString id;
    QString text;
    bool operator==(const Tag& o) const { return id == o.id && text == o.text; }
};

// Texture figures of one camera angle, in the wire order of TEXTURE_T.
const int kTextureFigures = 11;

struct Sample {
    int dbIndex = 0;
    QDateTime time;
    float temperature = 0.0f;             // sample surface (IR sensor)
    float instrumentTemperature = 0.0f;
    float calTemperatureDelta = 0.0f;     // against the last white calibration
    ACCELEROMETER_ORIENTATION_T orientation;
    int calibrationStatus = CALIBRATION_STATUS_GOOD;
    PRESSURE_SWITCH_T pressure;
    bool good = true;                     // counts towards an SMC average
    quint32 seed = 0;                     // pictures are rendered from it
    QString finish;                       // the finish that was measured
    int numAngles = 6;
    QVector<float> refl;                  // numAngles x 31, fraction (1.0 = 100 %)
    QVector<float> labch;                 // numAngles x 5: L, a, b, C, h (D65/10)
    QVector<float> texture;               // 6 camera angles x kTextureFigures

    double reflectance(int angle, int wl) const
    {
        const int i = angle * NUM_WAVELENGTHS + wl;
        return (i >= 0 && i < refl.size()) ? refl[i] : 0.0;
    }
};

struct Job {
    int dbIndex = 0;
    QString name;
    QString fileId;
    QString modeText;                     // as the job was created: NONE, AVERAGE, SMC, DEV_MODE
    JOB_AVERAGING_MODE_T mode = JOB_AVG_MODE_NONE;   // as the server runs it
    int size = 0;                         // wanted measurements; m of SMC m:n
    int maxSamples = 0;                   // n of SMC m:n
    int state = 2001;
    QVector<Tag> tags;
    QString finish;                       // finish of the panel this job measures
    QDateTime created;
    QDateTime firstMeasured;
    bool online = false;                  // started from the lab, not on the instrument
    bool saved = false;
    int syncPercent = 0;
    bool syncing = false;
    QVector<Sample> samples;
    bool hasAverage = false;
    Sample average;

    int goodCount() const
    {
        int n = 0;
        for (const Sample& s : samples)
            n += s.good ? 1 : 0;
        return n;
    }
};

// A parameter's value: all members kept, the key's type says which counts.
enum class ParamType { Int, Float, Text, WideText, List };

struct ParamValue {
    ParamType type = ParamType::Int;
    qint32 i = 0;
    float f = 0.0f;
    QString s;
    QStringList list;
    bool operator==(const ParamValue& o) const
    {
        return type == o.type && i == o.i && f == o.f && s == o.s && list == o.list;
    }
    bool operator!=(const ParamValue& o) const { return !(*this == o); }
};

struct WifiNetwork {
    QString ssid;
    QString mac;
    QString authentication;               // "OPEN", "WPA2-PSK", ...
    QString password;                     // the access point's key (the air side)
    QString storedKey;                    // the key we keep for a known network
    int channel = 1;
    float quality = 0.0f;                 // 0..1
    bool inRange = true;
    bool known = false;
    int priority = 0;
};

} // namespace Sim

#endif // SIMMODEL_H
