#include "SharedSystem/Instrument.h"

#include "Commands/SystemOutCommands.h"

#include <QCoreApplication>
#include <QElapsedTimer>

#include <atomic>

namespace {
QString ipAddress = QStringLiteral("127.0.0.1");
int ipPort = 6300;

// Read by every thread, written by DataManager's sync.
std::atomic<int> modelType{MODEL_REFINISH_BIRCH};

const REFL_ANGLE_T kLowToHigh[NUM_REFL_ANGLE_TYPES] = {
    REFL_D15_NEG_45, REFL_D15_NEG_15, REFL_D45_NEG_15, REFL_D15_15, REFL_D45_15, REFL_D45_25,
    REFL_D15_45, REFL_D45_45, REFL_D45_75, REFL_D15_80, REFL_D45_110,
};
} // namespace

void setIpAddress(QString address) { ipAddress = address; }
QString getIpAddress() { return ipAddress; }
void setIpPort(int port) { ipPort = port; }
int getIpPort() { return ipPort; }

void Instrument_Determine_Model_Type()
{
    int id = 0;
    QString configuration;
    CmdOut_GetConfiguration(id, configuration);
    Instrument_Set_Model_Type(configuration == QLatin1String("ALDER") ? MODEL_REFINISH_ALDER : MODEL_REFINISH_BIRCH);
}

MODEL_TYPES_T Instrument_Get_Model_Type()
{
    return static_cast<MODEL_TYPES_T>(modelType.load());
}

void Instrument_Set_Model_Type(MODEL_TYPES_T model)
{
    modelType.store(model);
}

int Instrument_Get_Num_Spectral_Angles()
{
    const MODEL_TYPES_T model = Instrument_Get_Model_Type();
    return (model == MODEL_REFINISH_ALDER || model == MODEL_QC) ? 11 : 6;
}

int Instrument_Get_Num_Camera_Images()
{
    return Instrument_Get_Model_Type() == MODEL_REFINISH_ALDER ? 5 : 6;
}

namespace {
int thumbnailSize()
{
    switch (Instrument_Get_Num_Camera_Images()) {
    case 6:
        return 44;
    case 5:
        return 56;
    default:
        return 0;
    }
}
} // namespace

int Instrument_Get_Sample_Thumbnail_Width() { return thumbnailSize(); }
int Instrument_Get_Sample_Thumbnail_Height() { return thumbnailSize(); }

REFL_ANGLE_T Instrument_Get_Angle_Low_To_High(int index, int numCurves)
{
    if (numCurves == 6)
        return static_cast<REFL_ANGLE_T>(index);
    if (index < 0 || index >= NUM_REFL_ANGLE_TYPES)
        return REFL_D45_NEG_15;
    return kLowToHigh[index];
}

REFL_ANGLE_T Instrument_Get_Angle_High_To_Low(int index, int numCurves)
{
    if (numCurves == 6)
        return (index >= 0 && index < 6) ? static_cast<REFL_ANGLE_T>(5 - index) : REFL_D45_NEG_15;
    if (index < 0 || index >= NUM_REFL_ANGLE_TYPES)
        return REFL_D45_NEG_15;
    return kLowToHigh[NUM_REFL_ANGLE_TYPES - 1 - index];
}

void Delay(int msec)
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < msec)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
}

void DelayBlocking(int msec)
{
    QElapsedTimer timer;
    timer.start();
    while (timer.elapsed() < msec) {
    }
}
