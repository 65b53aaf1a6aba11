#ifndef INSTRUMENTTYPES_H
#define INSTRUMENTTYPES_H

// Enums and plain records shared by the link, the model and the screens.
// An enum's numbers are also its wire values; the count constant at the end
// of an enum is used as an array bound.

#include <QByteArray>
#include <QDateTime>
#include <QImage>
#include <QMetaType>
#include <QString>
#include <QStringList>
#include <QVector>

#include <cstdint>
#include <vector>

typedef std::uint8_t  uint8_t;
typedef std::uint32_t uint32_t;

// ---- System and power ----------------------------------------------------

typedef enum _SYSTEM_STATE_T {
    STATE_POWER_UP = 0,
    STATE_NOT_CALIBRATED = 1,
    STATE_INIT = 2,
    STATE_MEASURING = 3,
    STATE_CALIBRATING = 4,
    STATE_LOCK = 5,
    STATE_BUSY = 6,
    STATE_CALCULATING = 7,
    STATE_TARGETING = 8,
    STATE_SYSTEM_UPDATE = 9,
    NUM_OF_SYSTEM_STATES = 10
} SYSTEM_STATE_T;

typedef enum _BATTERY_STATUS_T {
    BATTERY_STATUS_CHARGING_AC = 0,
    BATTERY_STATUS_CHARGING_USB = 1,
    BATTERY_STATUS_FULL = 2,
    BATTERY_STATUS_EMPTY = 3,
    BATTERY_STATUS_MISSING = 4,
    BATTERY_ERROR = 5,
    BATTERY_DISCHARGING = 6,
    NUM_OF_BATTERY_STATUS = 7
} BATTERY_STATUS_T;

typedef enum _WIFI_STATUS_T {
    WIFI_STATUS_OFF = 0,
    WIFI_STATUS_CONNECTED = 1,
    WIFI_STATUS_ON_NO_CONNECTION = 2,
    WIFI_STATUS_ON_STATIC = 3,
    NUM_OF_WIFI_STATUS_TYPES = 4
} WIFI_STATUS_T;

typedef enum _WIFI_LEVEL_T {
    WIFI_LEVEL_0 = 0,
    WIFI_LEVEL_1 = 1,
    WIFI_LEVEL_2 = 2,
    WIFI_LEVEL_3 = 3,
    WIFI_LEVEL_NOT_CONNECTED = 4,
    NUM_WIFI_LEVELS = 5
} WIFI_LEVEL_T;

typedef enum _USB_STATUS_T {
    USB_STATUS_OFF = 0,
    USB_STATUS_CONNECTED = 1,
    USB_STATUS_ON_NO_CONNECTION = 2,
    NUM_OF_USB_STATUS_TYPES = 3
} USB_STATUS_T;

typedef enum _POWER_T {
    POWER_REBOOT = 0,
    POWER_SHUTDOWN = 1,
    POWER_STANDBY = 2,
    POWER_FACTORY = 3,
    NUM_POWERS = 4
} POWER_T;

typedef enum _VERSION_TYPE_T {
    VERSION_GUI = 0,
    VERSION_SERVER = 1,
    VERSION_FPGA_BINARY = 2,
    VERSION_FPGA_MODULE = 3,
    VERSION_HARDWARE = 4,
    VERSION_SPLASH_DRIVER = 5,
    VERSION_CAMERA_DRIVER = 6,
    VERSION_BOOTLOADER = 7,
    VERSION_KERNAL = 8,
    VERSION_DISPLAY_DRIVER = 9,
    VERSION_TOUCHSCREEN_DRIVER = 10,
    NUM_VERSION_TYPES = 11
} VERSION_TYPE_T;

typedef enum _LANGUAGE_T {
    LANGUAGE_ENGLISH = 0,
    LANGUAGE_SPANISH = 1,
    LANGUAGE_FRENCH = 2,
    LANGUAGE_GERMAN = 3,
    LANGUAGE_ITALIAN = 4,
    LANGUAGE_PORTUGUESE = 5,
    LANGUAGE_JAPANESE = 6,
    LANGUAGE_KOREAN = 7,
    LANGUAGE_CHINESE_SIMPLIFIED = 8,
    LANGUAGE_CUSTOM = 9,
    LANGUAGE_ENUM_SIZE = 10
} LANGUAGE_T;

typedef enum _MODEL_TYPES_T {
    MODEL_REFINISH_MID_TIER = 0,
    MODEL_REFINISH_ALDER = 1,
    MODEL_REFINISH_BIRCH = 2,
    MODEL_QC = 3,
    NUM_MODEL_TYPES = 4
} MODEL_TYPES_T;

typedef enum _SOUNDS {
    eSoundButtonClick = 0,
    eSoundMeasurementStarted = 1,
    eSoundMeasurementSuccessful = 2,
    eSoundMeasurementFailed = 3,
    eSoundJobComplete = 4,
    eSoundCalculationFinished = 5,
    eSoundErrorUser = 6,
    eSoundErrorApocalypse = 7,
    eSoundDeviceReady = 8,
    eSoundDevicePositioned = 9,
    eSoundNone = 10,
    NUM_SOUNDS = 11
} SOUNDS;

// ---- Measurement -----------------------------------------------------------

typedef enum _REFL_ANGLE_T {
    REFL_D45_NEG_15 = 0,
    REFL_D45_15 = 1,
    REFL_D45_25 = 2,
    REFL_D45_45 = 3,
    REFL_D45_75 = 4,
    REFL_D45_110 = 5,
    REFL_D15_NEG_45 = 6,
    REFL_D15_NEG_15 = 7,
    REFL_D15_15 = 8,
    REFL_D15_45 = 9,
    REFL_D15_80 = 10,
    NUM_REFL_ANGLE_TYPES = 11
} REFL_ANGLE_T;

typedef enum _IMAGE_ANGLE_T {
    IMAGE_NEG_45 = 0,
    IMAGE_NEG_15 = 1,
    IMAGE_15 = 2,
    IMAGE_45 = 3,
    IMAGE_80 = 4,
    IMAGE_DIFFUSE = 5,
    NUM_OF_IMAGE_ANGLES = 6
} IMAGE_ANGLE_T;

typedef enum _IMAGE_CHANNEL_CONTENT_TYPE {
    IMAGE_CHANNEL_CONTENT_TYPE_EXR = 0,
    IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE = 1,
    IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL = 2,
    IMAGE_CHANNEL_CONTENT_TYPE_OBSOLETE = 3,
    IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE_PARAMETER = 4,
    NUM_IMAGE_CHANNEL_CONTENT_TYPES = 5
} IMAGE_CHANNEL_CONTENT_TYPE;

typedef enum _CALIBRATION_STATUS_T {
    CALIBRATION_STATUS_GOOD = 0,
    CALIBRATION_STATUS_WARNING = 1,
    CALIBRATION_STATUS_TIMEOUT = 2,
    CALIBRATION_STATUS_REQUIRED = 3,
    NUM_CALIBRATION_STATUS_TYPES = 4
} CALIBRATION_STATUS_T;

typedef enum _CALIBRATION_STATES {
    CALIBRATION_WHITE_STATE = 0,
    CALIBRATION_REFERENCE_CHECK_STATE = 1,
    CALIBRATION_SELF_TEST_WHITE_STATE = 2,
    CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE = 3,
    CALIBRATION_SELF_TEST_OTHER_STATE = 4,
    NUM_CALIBRATION_STATES = 5
} CALIBRATION_STATES;

typedef enum _SELF_TEST_TYPE {
    SELF_TEST_WHITE_TILE = 0,
    SELF_TEST_EFFECT_TILE = 1,
    SELF_TEST_DEVICE_LIFTED = 2,
    NUM_SELF_TEST_TYPES = 3
} SELF_TEST_TYPE;

typedef enum _JOB_AVERAGING_MODE_T {
    JOB_AVG_MODE_NONE = 0,
    JOB_AVG_MODE_SIMPLE_3 = 1,
    JOB_AVG_MODE_SIMPLE_5 = 2,
    JOB_AVG_MODE_SMC = 3,
    JOB_AVG_MODE_GUI = 4,
    NUM_JOB_AVG_MODES = 5
} JOB_AVERAGING_MODE_T;

typedef enum _PRESSURE_SENSOR_SENSITIVITY_T {
    PRESSURE_SENSITIVITY_OFF = 0,
    PRESSURE_SENSITIVITY_LOW = 1,
    PRESSURE_SENSITIVITY_MEDIUM = 2,
    PRESSURE_SENSITIVITY_HIGH = 3,
    NUM_PRESSURE_SENSITIVITY_TYPES = 4
} PRESSURE_SENSOR_SENSITIVITY_T;

typedef enum _FUNCTION_TYPE_T {
    FUNCTION_COLORVIEW = 0,
    FUNCTION_LABCH_D45 = 1,
    FUNCTION_LABCH_D15 = 2,
    FUNCTION_TEXTURE = 3,
    FUNCTION_TYPES_ENUM_SIZE = 4
} FUNCTION_TYPE_T;

typedef enum _TAG_STATES_T {
    TAG_STATE_1 = 0,
    TAG_STATE_2 = 1,
    TAG_STATE_3 = 2,
    NUM_TAG_STATES = 3
} TAG_STATES_T;

typedef enum _STRING_LOOKUP_TABLE_T {
    LANGUAGE_TABLE = 0,
    IMAGE_ANGLE_TABLE = 1,
    IMAGE_FROM_SERVER_ANGLE_TABLE = 2,
    ANGLE_TABLE = 3,
    ANGLE_FROM_SERVER_TABLE = 4,
    ILLUM_OBS_TABLE = 5,
    MODEL_TYPES_TABLE = 6,
    JOB_AVERAGING_MODES_TABLE = 7,
    SELF_TEST_TYPES_TABLE = 8,
    SELF_TEST_TYPES_COMPLETE_TABLE = 9,
    NUM_STRING_LOOKUP_TABLES = 10
} STRING_LOOKUP_TABLE_T;

typedef enum _WAVELENGTH_ID_T {
    WAVELENGTH_400 = 0, WAVELENGTH_410, WAVELENGTH_420, WAVELENGTH_430,
    WAVELENGTH_440, WAVELENGTH_450, WAVELENGTH_460, WAVELENGTH_470,
    WAVELENGTH_480, WAVELENGTH_490, WAVELENGTH_500, WAVELENGTH_510,
    WAVELENGTH_520, WAVELENGTH_530, WAVELENGTH_540, WAVELENGTH_550,
    WAVELENGTH_560, WAVELENGTH_570, WAVELENGTH_580, WAVELENGTH_590,
    WAVELENGTH_600, WAVELENGTH_610, WAVELENGTH_620, WAVELENGTH_630,
    WAVELENGTH_640, WAVELENGTH_650, WAVELENGTH_660, WAVELENGTH_670,
    WAVELENGTH_680, WAVELENGTH_690, WAVELENGTH_700,
    NUM_WAVELENGTHS
} WAVELENGTH_ID_T;
static_assert(WAVELENGTH_700 == 30 && NUM_WAVELENGTHS == 31, "spectral axis is 400..700 nm in 10 nm steps");

typedef enum _ILLUM_OBS_T {
    A_2 = 0, A_10, C_2, C_10, D50_2, D50_10, D55_2, D55_10,
    D65_2, D65_10, D75_2, D75_10, F2_2, F2_10, F7_2, F7_10,
    F8_2, F8_10, F10_2, F10_10, F11_2, F11_10, F12_2, F12_10,
    TL83_2, TL83_10, TL84_2, TL84_10, TL85_2, TL85_10, U30_2, U30_10,
    eILLUM_OBS_NumOf
} ILLUM_OBS_T;
static_assert(U30_10 == 31 && eILLUM_OBS_NumOf == 32, "32 illuminant/observer pairs");

typedef enum _COLOR_ILLUM_OBS_T {
    COLOR_ILLUM_OBS_A_2 = 0, COLOR_ILLUM_OBS_A_10, COLOR_ILLUM_OBS_C_2, COLOR_ILLUM_OBS_C_10,
    COLOR_ILLUM_OBS_D50_2, COLOR_ILLUM_OBS_D50_10, COLOR_ILLUM_OBS_D55_2, COLOR_ILLUM_OBS_D55_10,
    COLOR_ILLUM_OBS_D65_2, COLOR_ILLUM_OBS_D65_10, COLOR_ILLUM_OBS_D75_2, COLOR_ILLUM_OBS_D75_10,
    COLOR_ILLUM_OBS_F2_2, COLOR_ILLUM_OBS_F2_10, COLOR_ILLUM_OBS_F7_2, COLOR_ILLUM_OBS_F7_10,
    COLOR_ILLUM_OBS_F8_2, COLOR_ILLUM_OBS_F8_10, COLOR_ILLUM_OBS_F10_2, COLOR_ILLUM_OBS_F10_10,
    COLOR_ILLUM_OBS_F11_2, COLOR_ILLUM_OBS_F11_10, COLOR_ILLUM_OBS_F12_2, COLOR_ILLUM_OBS_F12_10,
    COLOR_ILLUM_OBS_ENUM_SIZE = 24,
    COLOR_ILLUM_OBS_OFF = 25
} COLOR_ILLUM_OBS_T;
static_assert(COLOR_ILLUM_OBS_F12_10 == 23, "same order as ILLUM_OBS_T through F12");

// ---- Screens -----------------------------------------------------------------

typedef enum _SCREEN_ID_T {
    JOB_LIST_SCREEN_ID = 0,
    JOB_NAME_SCREEN_ID = 1,
    JOB_TAGS_1_SCREEN_ID = 2,
    JOB_TAGS_2_SCREEN_ID = 3,
    JOB_TAGS_3_SCREEN_ID = 4,
    JOB_TAGS_1_FREE_EDIT_SCREEN_ID = 5,
    JOB_TAGS_2_FREE_EDIT_SCREEN_ID = 6,
    JOB_TAGS_3_FREE_EDIT_SCREEN_ID = 7,
    JOB_FREE_TEXT_SCREEN_ID = 8,
    JOB_MEASURE_SCREEN_ID = 9,
    SAMPLE_VIEW_SCREEN_ID = 10,
    IMAGE_VIEW_SCREEN_ID = 11,
    TARGETING_SCREEN_ID = 12,
    SYNC_SCREEN_ID = 13,
    LOCK_SCREEN_ID = 14,
    CONFIG_MAIN_SCREEN_ID = 15,
    CAL_WIZARD_SCREEN_ID = 16,
    CAL_WIZARD_STEPS_INSTRUCTIONS_ID = 17,
    CAL_WIZARD_STEPS_REF_CHECK_INSTRUCTIONS_ID = 18,
    CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID = 19,
    CAL_WIZARD_STEPS_SELF_TEST_REFERENCE_INSTRUCTIONS_ID = 20,
    CAL_WIZARD_STEPS_SELF_TEST_OTHER_INSTRUCTIONS_ID = 21,
    SELF_TEST_SCREEN_WHITE_ID = 22,
    SELF_TEST_SCREEN_EFFECT_ID = 23,
    SELF_TEST_SCREEN_LIFTED_ID = 24,
    POPUPS_SCREEN_ID = 256,
    MEASURING_POPUP_SCREEN_ID = 257,
    CAL_ENTRY_POPUP_SCREEN_ID = 258,
    CALIBRATING_POPUP_SCREEN_ID = 259,
    MEASURE_ERROR_POPUP_SCREEN_ID = 260,
    CAL_IMMINENT_POPUP_SCREEN_ID = 261,
    CAL_NEEDED_POPUP_SCREEN_ID = 262,
    RESTORE_FACTORY_SETTINGS_POPUP_SCREEN_ID = 263,
    DELETE_ALL_SAMPLES_POPUP_SCREEN_ID = 264,
    SAD_PUPPY_POPUP_SCREEN_ID = 265,
    NUM_SCREEN_IDS = 266
} SCREEN_ID_T;

// ---- Parameters (the numbers are the server's keys; the gaps are deliberate) --

typedef enum _PARAMETER_TYPE_T {
    PARAMETER_NUMBER_FORMAT = 0,
    PARAMETER_DATE_FORMAT = 1,
    PARAMETER_TIME_FORMAT = 2,
    PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS = 3,
    PARAMETER_DISPLAYED_CHANNELS = 4,
    PARAMETER_DEFAULT_ILLUMINANT = 5,
    PARAMETER_DEFAULT_OBSERVER = 6,
    PARAMETER_DEFAULT_JOB_NAME = 7,
    PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES = 8,
    PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME = 9,
    PARAMETER_DEFAULT_STANDBY_TIME = 10,
    PARAMETER_DEFAULT_POWER_OFF_TIME = 11,
    PARAMETER_DEFAULT_POWER_MANAGEMENT_LEVEL = 12,
    PARAMETER_AUTO_MEASURE = 13,
    PARAMETER_TEXT_MESSAGE = 14,
    PARAMETER_DISPLAYED_IMAGE_CHANNELS = 15,
    PARAMETER_DISPLAYED_SPECTRAL_CHANNELS = 16,
    PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS = 17,
    PARAMETER_CURRENT_LANGUAGE_ID = 18,
    PARAMETER_ORIENATION_ENABLED = 19,
    PARAMETER_JOB_COMPLETION_TIME = 20,
    PARAMETER_DISPLAY_LABCH = 23,
    PARAMETER_DISPLAY_RAINBOW = 24,
    PARAMETER_DISPLAY_PREVIEW_IMAGES = 25,
    PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE = 26,
    PARAMETER_SAMPLE_TEMP_LIMIT_LOW = 27,
    PARAMETER_SAMPLE_TEMP_LIMIT_HIGH = 28,
    PARAMETER_AUTO_MEASURE_SWITCH_ON_UI = 31,
    PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE = 32,
    PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE = 33,
    PARAMETER_DISPLAY_SELF_TEST = 34,
    PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN = 35,
    PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION = 36,
    PARAMETER_SHOW_HAZARD_WARNING_BANNER = 37,
    PARAMETER_DISPLAY_EDIT_FREE_TEXT = 39,
    PARAMETER_TEXTURE_IMAGE_CONTENT_DATA_SELECTION = 41,
    PARAMETER_AUTO_MEASURE_TIMEOUT = 43,
    PARAMETER_OVERRIDE_PRESSURE_SENSORS = 45,
    PARAMETER_MEASURING_CIRCLE_ID = 46,
    PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR = 47,
    PARAMETER_USE_FILTER_FILE = 48,
    PARAMETER_MEASUREMENT_MODE = 1000,
    PARAMETER_SMC_GOOD_MEASUREMENTS = 1001,
    PARAMETER_SMC_MAX_MEASUREMENTS = 1002,
    PARAMETER_AVERAGING_NUMBER_OF_SAMPLES = 1013,
    PARAMETER_ONLINE_MODE_JOB = 1050,
    PARAMETER_WHITE_TRANSFER_REQUEST = 1060,
    PARAMETER_WEBSERVER_ADDRESS = 3000,
    PARAMETER_SYNC_JOB_TO_WEBSERVER = 3100,
    PARAMETER_BURN_IN_TEST = 65516
} PARAMETER_TYPE_T;

// ---- Status codes ------------------------------------------------------------
// STATUS_T is a plain unsigned 32-bit code, not an enum: the server defines
// most values and the GUI passes unknown ones on as numbers.

typedef unsigned int STATUS_T;

const STATUS_T STATUS_OK = 0;
const STATUS_T STATUS_UNKNOWN_COMMAND = 1;
const STATUS_T STATUS_BAD_RESPONSE_STATUS = 2;
const STATUS_T STATUS_BAD_RESPONSE = 3;
const STATUS_T STATUS_TCP_TIMEOUT = 257;
const STATUS_T STATUS_TCP_WRITE_ERROR = 258;
const STATUS_T STATUS_TCP_DISCONNECTED = 259;
const STATUS_T STATUS_TCP_NOT_CONNECTED = 260;
const STATUS_T STATUS_TCP_DATA_TOO_SMALL = 261;
const STATUS_T STATUS_TCP_DATA_TOO_BIG = 262;
const STATUS_T STATUS_TCP_LENGTH_MISMATCH = 263;

// Retry loops repeat a command while the server answers this.
const STATUS_T STATUS_SERVER_BUSY = 769;

// ---- Colour records ------------------------------------------------------------

typedef struct _LABCH_T {
    double l = 0.0;
    double a = 0.0;
    double b = 0.0;
    double c = 0.0;
    double h = 0.0;
} LABCH_T;

typedef struct _LAB_T {
    double l = 0.0;
    double a = 0.0;
    double b = 0.0;
} LAB_T;

typedef struct _LCH_T {
    double l = 0.0;
    double c = 0.0;
    double h = 0.0;
} LCH_T;

// ---- Other records -------------------------------------------------------------

typedef struct _TEXTURE_T {
    QString description;
    double simpleCoarseness = 0.0;
    double backGroundCoarseness = 0.0;
    double directionalCoarseness = 0.0;
    double sparkleArea = 0.0;
    double sparkleIntensity = 0.0;
    double sparkleGrade = 0.0;
    double sparkleDensity = 0.0;
    double res1 = 0.0;
    double res2 = 0.0;
    double res3 = 0.0;
    double res4 = 0.0;
} TEXTURE_T;

typedef struct _TEXTURE_PARAMETER_T {
    QString name;
    QString version;
    float value = 0.0f;
} TEXTURE_PARAMETER_T;

typedef struct _IMAGE_CONTAINER_T {
    QImage image;
    QByteArray buffer;
} IMAGE_CONTAINER_T;

typedef struct _PRESSURE_SWITCH_T {
    uint32_t Switch1 = 0;
    uint32_t Switch2 = 0;
    uint32_t Switch3 = 0;
} PRESSURE_SWITCH_T;

typedef struct _ACCELEROMETER_ORIENTATION_T {
    int OrientationX = 0;
    int OrientationY = 0;
    int OrientationZ = 0;
    int OrientationPosition = 0;
    int OrientationAcceleration = 0;
} ACCELEROMETER_ORIENTATION_T;

typedef struct _SAMPLE_INFO_T {
    int dbIndex = 0;
    QDateTime timeStamp;
    float temperature = 0.0f;
    ACCELEROMETER_ORIENTATION_T accelerationInfo;
    CALIBRATION_STATUS_T calibrationStatus = CALIBRATION_STATUS_GOOD;
    PRESSURE_SWITCH_T pressureStatus;

    bool operator==(const _SAMPLE_INFO_T& other) const
    {
        return dbIndex == other.dbIndex && timeStamp == other.timeStamp
            && temperature == other.temperature
            && accelerationInfo.OrientationX == other.accelerationInfo.OrientationX
            && accelerationInfo.OrientationY == other.accelerationInfo.OrientationY
            && accelerationInfo.OrientationZ == other.accelerationInfo.OrientationZ
            && accelerationInfo.OrientationPosition == other.accelerationInfo.OrientationPosition
            && accelerationInfo.OrientationAcceleration == other.accelerationInfo.OrientationAcceleration
            && calibrationStatus == other.calibrationStatus
            && pressureStatus.Switch1 == other.pressureStatus.Switch1
            && pressureStatus.Switch2 == other.pressureStatus.Switch2
            && pressureStatus.Switch3 == other.pressureStatus.Switch3;
    }
    bool operator!=(const _SAMPLE_INFO_T& other) const { return !(*this == other); }
} SAMPLE_INFO_T;

typedef struct _MEMORY_INFO_T {
    int numMeasurements = 0;
    int maxNumMeasurements = 0;
    int numJobs = 0;
    int maxNumJobs = 0;
    int res1 = 0;
    int res2 = 0;
    int sysFlashUsed = 0;
    int sysFlashAvailable = 0;
    int sysRamUsed = 0;
    int sysRamAvailable = 0;
} MEMORY_INFO_T;

typedef struct _CALIBRATION_STATE_T {
    int nextExternalWhiteCal = 0;
    QDateTime lastExternalWhiteCal;
    float dTempExternalWhite = 0.0f;
    float referenceTempExternalWhite = 0.0f;
    int nextInternalWhiteCal = 0;
    QDateTime lastInternalWhiteCal;
    float dTempInternalWhite = 0.0f;
    float referenceTempInternalWhite = 0.0f;
} CALIBRATION_STATE_T;

typedef struct _DEVICE_INFO_T {
    QString serialNum;
    QString partNumber;
    QString revisionNum;
    QString productionDate;
    QString whitetileSerialNum;
    QString instrumentModel;
    QString certificationDate;
} DEVICE_INFO_T;

typedef struct _ERROR_DESCRIPTION_T {
    uint8_t priority = 0;
    int errorID = 0;
    int category = 0;
    QDateTime time;
    QString description;
} ERROR_DESCRIPTION_T;

typedef struct _NETWORK_DESCRIPTION_T {
    QString SSID;
    QString MAC;
    QString Authentication;
    QString SignalLevel;
    QString Cell;
    QString Channel;
    QString Frequency;
    float Quality = 0.0f;
    bool EncryptionKey = false;
    bool Known = false;
    bool Connected = false;
    int Priority = 0;
} NETWORK_DESCRIPTION_T;

typedef struct _TEST {
    QString description;
    uint32_t deviceLocation = 0;
    uint32_t approxDuration = 0;
    uint32_t num = 0;
    uint32_t result = 0;
} TEST;

typedef struct _TAG_ITEM_T {
    QString tagID;
    QString tagText;
} TAG_ITEM_T;
typedef TAG_ITEM_T LANGUAGE_ITEM_T;

typedef struct _TAG_LIST_T {
    std::vector<TAG_ITEM_T> tagItems;
    QString tagName;
} TAG_LIST_T;

typedef struct _JOB_AVERAGING_INFO_T {
    JOB_AVERAGING_MODE_T mode = JOB_AVG_MODE_NONE;
    int smcGoodMeasurements = 0;
    int smcMaxMeasurements = 0;
    int averageNumber = 0;
} JOB_AVERAGING_INFO_T;

typedef struct _PARSED_TIME_T {
    uint8_t year = 0;
    uint8_t month = 0;
    uint8_t day = 0;
    uint8_t hour = 0;
    uint8_t minute = 0;
    uint8_t second = 0;
} PARSED_TIME_T;

typedef struct _PARAMETER_CONTENT_TYPES {
    std::int32_t parameterInt = 0;
    QString parameterString;
    QStringList paramterStringList;
    float parameterFloat = 0.0f;
} PARAMETER_CONTENT_TYPES;

Q_DECLARE_METATYPE(SYSTEM_STATE_T)
Q_DECLARE_METATYPE(BATTERY_STATUS_T)
Q_DECLARE_METATYPE(LANGUAGE_T)
Q_DECLARE_METATYPE(WIFI_STATUS_T)
Q_DECLARE_METATYPE(PRESSURE_SWITCH_T)
Q_DECLARE_METATYPE(ACCELEROMETER_ORIENTATION_T)
Q_DECLARE_METATYPE(SOUNDS)
Q_DECLARE_METATYPE(TEST)
Q_DECLARE_METATYPE(NETWORK_DESCRIPTION_T)

#endif // INSTRUMENTTYPES_H
