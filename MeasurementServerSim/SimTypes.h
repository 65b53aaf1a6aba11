#ifndef SIMTYPES_H
#define SIMTYPES_H

// Numbers of the measurement server's side of the protocol: command codes,
// the server's own status codes, job states, settings bits and entity codes.
// Enums shared with the GUI (states, angles, parameters) come from
// SharedSystem/InstrumentTypes.h.

#include "SharedSystem/InstrumentTypes.h"

#include <QString>

namespace Sim {

// ---- Command codes ------------------------------------------------------------
enum Command : quint32 {
    CMD_GET_STATE = 0x10000000,
    CMD_GET_ERROR_DESCRIPTIONS = 0x10000020,
    CMD_RESET_ERROR_DESCRIPTIONS = 0x10000022,
    CMD_GET_CONFIGURATION = 0x10000040,
    CMD_SET_INTERFACE_CONFIG = 0x10000100,
    CMD_GET_IMAGE_RESULT = 0x40008001,
    CMD_GET_SPECTRAL_RESULT = 0x40008002,
    CMD_GET_CHANNELS = 0x40008003,
    CMD_GET_JOB_INFOS = 0x40010000,
    CMD_GET_JOB_INFO = 0x40010020,
    CMD_GET_JOB_INFO_WEB = 0x40010022,
    CMD_ADD_JOB = 0x40010030,
    CMD_DELETE_JOB = 0x40010040,
    CMD_EDIT_JOB = 0x40010050,
    CMD_FORCE_FINISH_SMC = 0x40010060,
    CMD_SET_JOB_SAVED = 0x40010070,
    CMD_GET_FILTER = 0x40020000,
    CMD_GET_FILTER_TRANSLATION = 0x40020010,
    CMD_REFERENCE_CHECK = 0x40040010,
    CMD_GET_CAPABILITY = 0x400A0220,
    CMD_RUN_SELF_TEST = 0x400A0300,
    CMD_GET_BATTERY = 0x400A0400,
    CMD_GET_PRESSURE_SENSOR = 0x400A0500,
    CMD_GET_ORIENTATION = 0x400A0600,
    CMD_GET_CALIBRATION_STATE = 0x400A0700,
    CMD_SET_CALIBRATION_SETTINGS = 0x400A0710,
    CMD_GET_LANGUAGES = 0x400A0900,
    CMD_GET_BEEPER_VOLUME = 0x400A0A00,
    CMD_SET_BEEPER_VOLUME = 0x400A0A10,
    CMD_GET_DISPLAY_BRIGHTNESS = 0x400A0A20,
    CMD_SET_DISPLAY_BRIGHTNESS = 0x400A0A30,
    CMD_GET_TEXTURE_DISPLAYED = 0x400A0A40,
    CMD_GET_MEMORY_INFO = 0x400A0B00,
    CMD_GET_SERIAL_NUM = 0x400A0B10,
    CMD_GET_DEVICE_INFO = 0x400A0B20,
    CMD_GET_WIFI_SETTINGS = 0x400A0C00,
    CMD_ADD_WIFI_SETTING = 0x400A0C10,
    CMD_DELETE_WIFI_SETTING = 0x400A0C20,
    CMD_SET_ENABLE_WIFI = 0x400A0C30,
    CMD_VERIFY_WIFI_SETTINGS = 0x400A0C50,
    CMD_GET_IP_ADDRESS = 0x400A0C70,
    CMD_TRIGGER_WIFI_SCAN = 0x400A0CA0,
    CMD_GET_CONNECTED_WIFI_SSID = 0x400A0D20,
    CMD_GET_PARAMETER = 0x400A0E00,
    CMD_SET_PARAMETER = 0x400A0E10,
    CMD_GET_TEMPERATURE = 0x400A0E22,
    CMD_POWER_OFF_RESET = 0x400A1000,
    CMD_SET_PARAMETERS_TO_DEFAULTS = 0x400A1020,
    CMD_TRIGGER_MEASUREMENT = 0x41000000,
    CMD_GET_SAMPLE = 0x41000100,
    CMD_DELETE_SAMPLE = 0x41000110,
    CMD_START_TARGETING = 0x41000200,
    CMD_STOP_TARGETING = 0x41000210,
    CMD_GET_TARGETING_INFO = 0x41000220,
    CMD_GET_VERSION = 0x60000000,
    CMD_GET_PREVIEW_IMAGE = 0x60000018,
    CMD_TRIGGER_CALIBRATION = 0x60000021,
    CMD_GET_SELF_TEST_LIST = 0x60000100,
    CMD_TRIGGER_SELF_TEST = 0x60000101,
    CMD_GET_SELF_TEST_RESULT = 0x60000102
};

// ---- Status codes the server answers with ---------------------------------------
const STATUS_T ST_OK = 0;
const STATUS_T ST_UNKNOWN_COMMAND = 1;
const STATUS_T ST_BAD_REQUEST = 3;          // arguments missing or left over
const STATUS_T ST_NO_SUCH_FILE = 5;         // filter files
const STATUS_T ST_MEMORY_FULL = 9;
const STATUS_T ST_NO_SUCH_JOB = 10;
const STATUS_T ST_NO_ENTRY = 10;            // no such database entry (network, test, ...)
const STATUS_T ST_NAME_EXISTS = 12;
const STATUS_T ST_NOT_READY = 14;
const STATUS_T ST_WIFI_BUSY = 19;
const STATUS_T ST_JOB_TIME_ELAPSED = 23;
const STATUS_T ST_INDEX_INVALID = 1065;
const STATUS_T ST_JOB_CLOSED = 1066;
const STATUS_T ST_CAL_ERROR = 2001;          // not on the white tile
const STATUS_T ST_WHITE_TILE_DIRTY = 2028;
const STATUS_T ST_MOVED = 2032;
const STATUS_T ST_ABORTED = 2033;
const STATUS_T ST_BATTERY_LOW = 2034;
const STATUS_T ST_BATTERY_EMPTY = 2035;
const STATUS_T ST_NO_REFERENCE = 2037;
const STATUS_T ST_CALIBRATION_EXPIRED = 2044;
const STATUS_T ST_LOW_STORAGE = 2047;
const STATUS_T ST_WIFI_MODE_ERROR = 2100;
const STATUS_T ST_WIFI_SCAN_ERROR = 2101;
const STATUS_T ST_TEMP_TOO_HIGH = 2102;
const STATUS_T ST_TEMP_TOO_LOW = 2103;

// ---- Job states -------------------------------------------------------------------
const int JOB_OPEN = 2001;
const int JOB_SMC_MAX_USED = 2002;
const int JOB_SMC_FORCED = 2003;
const int JOB_COMPLETE = 2004;
const int JOB_SMC_MAX_USED_ONLINE = 2005;
const int JOB_SMC_FORCED_ONLINE = 2006;
const int JOB_SAVED = 2007;
const int JOB_SYNCHRONISED = 2008;

// The averaged sample of a job on the wire.
const int AVERAGE_SAMPLE = 255;

// ---- Entity changes -----------------------------------------------------------------
const int ENTITY_JOB = 1007;
const int CHANGE_MODIFIED = 2;

// ---- Settings bits of the state reply ------------------------------------------------
enum SettingsBit : quint32 {
    BIT_LANGUAGE = 0x1,
    BIT_BRIGHTNESS = 0x4,
    BIT_VOLUME = 0x8,
    BIT_FILTER = 0x10,
    BIT_WIFI_SETTINGS = 0x20,
    BIT_MEASURING_CIRCLE = 0x800,
    BIT_DEFAULT_JOB_NAME = 0x4000,
    BIT_DEFAULT_SAMPLES = 0x8000,
    BIT_DIMMER_TIME = 0x10000,
    BIT_STANDBY_TIME = 0x20000,
    BIT_POWER_OFF_TIME = 0x40000,
    BIT_WHITE_TRANSFER = 0x80000,
    BIT_AUTO_MEASURE = 0x100000,
    BIT_TEXT_MESSAGE = 0x200000,
    BIT_VIEW_MEASUREMENTS = 0x400000,
    BIT_WIFI_LIST = 0x800000,
    BIT_MEASUREMENT_MODE = 0x2000000,
    BIT_SMC_GOOD = 0x4000000,
    BIT_SMC_MAX = 0x8000000,
    BIT_AVERAGING_NUMBER = 0x10000000,
    BIT_ORIENTATION = 0x20000000,
    BIT_ONLINE_JOB = 0x40000000
};

// ---- Power command values ------------------------------------------------------------
const qint32 POWER_VALUE_REBOOT = 0x5449;
const qint32 POWER_VALUE_SHUTDOWN = 0x15449;
const qint32 POWER_VALUE_STANDBY = 0;
const qint32 POWER_VALUE_FACTORY = 0x20005449;

// ---- Instrument models ------------------------------------------------------------------
enum class Model { Birch, Alder };

inline QString modelName(Model m) { return m == Model::Alder ? QStringLiteral("ALDER") : QStringLiteral("BIRCH"); }
inline int numSpectralAngles(Model m) { return m == Model::Alder ? 11 : 6; }
inline int numCameraAngles(Model m) { return m == Model::Alder ? 5 : 6; }

// Server names of the geometries, in the order of REFL_ANGLE_T and IMAGE_ANGLE_T.
QString spectralAngleName(int angle);
QString imageAngleName(int angle);
int spectralAngleFromName(const QString& name);   // -1 if unknown
int imageAngleFromName(const QString& name);      // -1 if unknown
// Aspecular angle in degrees of a reflectance geometry, and whether it is lit at 15 degrees.
double aspecularDegrees(int angle);
bool isD15(int angle);

} // namespace Sim

#endif // SIMTYPES_H
