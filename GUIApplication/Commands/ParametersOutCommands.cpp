#include "Commands/ParametersOutCommands.h"

#include "Communication/Commands.h"

namespace {

QRecursiveMutex s_parametersMutex;

const long CODE_GET_LANGUAGES = 0x400A0900;
const long CODE_GET_PARAMETER = 0x400A0E00;
const long CODE_SET_PARAMETER = 0x400A0E10;
const long CODE_SET_PARAMETERS_TO_DEFAULTS = 0x400A1020;

} // namespace

PARAMETER_CONTENT_KIND_T CmdOut_ParameterContentKind(int key)
{
    switch (key) {
    case PARAMETER_NUMBER_FORMAT:
    case PARAMETER_DATE_FORMAT:
    case PARAMETER_TIME_FORMAT:
    case PARAMETER_CURRENT_LANGUAGE_ID:
    case PARAMETER_MEASURING_CIRCLE_ID:
    case PARAMETER_MEASUREMENT_MODE:
    case PARAMETER_ONLINE_MODE_JOB:
    case PARAMETER_WEBSERVER_ADDRESS:
    case PARAMETER_SYNC_JOB_TO_WEBSERVER:
        return PARAMETER_CONTENT_STRING;

    case PARAMETER_DEFAULT_JOB_NAME:
    case PARAMETER_TEXT_MESSAGE:
        return PARAMETER_CONTENT_STRING32;

    case PARAMETER_DISPLAYED_CHANNELS:
    case PARAMETER_DISPLAYED_IMAGE_CHANNELS:
    case PARAMETER_DISPLAYED_SPECTRAL_CHANNELS:
        return PARAMETER_CONTENT_STRING_LIST;

    case PARAMETER_SAMPLE_TEMP_LIMIT_LOW:
    case PARAMETER_SAMPLE_TEMP_LIMIT_HIGH:
    case PARAMETER_AUTO_MEASURE_TIMEOUT:
        return PARAMETER_CONTENT_FLOAT;

    case PARAMETER_CALIBRATION_WARNING_TIME_IN_SECONDS:
    case PARAMETER_DEFAULT_ILLUMINANT:
    case PARAMETER_DEFAULT_OBSERVER:
    case PARAMETER_DEFAULT_MIN_NUMBER_OF_SAMPLES:
    case PARAMETER_DEFAULT_DISPLAY_DIMMER_TIME:
    case PARAMETER_DEFAULT_STANDBY_TIME:
    case PARAMETER_DEFAULT_POWER_OFF_TIME:
    case PARAMETER_DEFAULT_POWER_MANAGEMENT_LEVEL:
    case PARAMETER_AUTO_MEASURE:
    case PARAMETER_ENABLE_VIEW_MEASUREMENTS_OF_COMPLETED_JOBS:
    case PARAMETER_ORIENATION_ENABLED:
    case PARAMETER_JOB_COMPLETION_TIME:
    case PARAMETER_DISPLAY_LABCH:
    case PARAMETER_DISPLAY_RAINBOW:
    case PARAMETER_DISPLAY_PREVIEW_IMAGES:
    case PARAMETER_SAMPLE_TEMP_CHECK_ACTIVE:
    case PARAMETER_AUTO_MEASURE_SWITCH_ON_UI:
    case PARAMETER_DOWNLOADED_JOB_NAME_EDITABLE:
    case PARAMETER_DOWNLOADED_JOB_ATTRIBUTES_EDITABLE:
    case PARAMETER_DISPLAY_SELF_TEST:
    case PARAMETER_SHOW_MENU_ITEM_DISPLAY_LABCH_SCREEN:
    case PARAMETER_SHOW_MEASUREMENT_MODE_SELECTION:
    case PARAMETER_SHOW_HAZARD_WARNING_BANNER:
    case PARAMETER_DISPLAY_EDIT_FREE_TEXT:
    case PARAMETER_TEXTURE_IMAGE_CONTENT_DATA_SELECTION:
    case PARAMETER_OVERRIDE_PRESSURE_SENSORS:
    case PARAMETER_SHOW_MENU_ITEM_OVERRIDE_PRESSURE_SENSOR:
    case PARAMETER_USE_FILTER_FILE:
    case PARAMETER_SMC_GOOD_MEASUREMENTS:
    case PARAMETER_SMC_MAX_MEASUREMENTS:
    case PARAMETER_AVERAGING_NUMBER_OF_SAMPLES:
    case PARAMETER_WHITE_TRANSFER_REQUEST:
    case PARAMETER_BURN_IN_TEST:
        return PARAMETER_CONTENT_INT;

    default:
        return PARAMETER_CONTENT_NONE;
    }
}

STATUS_T CmdOut_GetParameter(PARAMETER_TYPE_T key, PARAMETER_CONTENT_TYPES& value)
{
    return runCommand(
        s_parametersMutex, CODE_GET_PARAMETER, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_ui16(static_cast<unsigned short>(key)); },
        [&](CmdData& rx) {
            rx.nextArg_ui16();
            switch (CmdOut_ParameterContentKind(key)) {
            case PARAMETER_CONTENT_STRING:
                value.parameterString = rx.nextArgString();
                break;
            case PARAMETER_CONTENT_STRING32:
                value.parameterString = rx.nextArgString32();
                break;
            case PARAMETER_CONTENT_STRING_LIST: {
                // Built aside so that a short list leaves the caller's alone.
                QStringList list;
                const int count = rx.nextArg_si32();
                for (int i = 0; i < count; ++i)
                    list << rx.nextArgString();
                value.paramterStringList = list;
                break;
            }
            case PARAMETER_CONTENT_FLOAT:
                value.parameterFloat = rx.nextArg_f32();
                break;
            case PARAMETER_CONTENT_INT:
                value.parameterInt = rx.nextArg_si32();
                break;
            case PARAMETER_CONTENT_NONE:
                break;
            }
            return STATUS_OK;
        });
}

STATUS_T CmdOut_SetParameter(PARAMETER_TYPE_T key, const PARAMETER_CONTENT_TYPES& value)
{
    return runCommand(
        s_parametersMutex, CODE_SET_PARAMETER, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) {
            tx.append_ui16(static_cast<unsigned short>(key));
            // The web server address is set on the server's side only: the
            // frame carries the key alone.
            if (key == PARAMETER_WEBSERVER_ADDRESS)
                return;
            switch (CmdOut_ParameterContentKind(key)) {
            case PARAMETER_CONTENT_STRING:
                tx.appendString(value.parameterString);
                break;
            case PARAMETER_CONTENT_STRING32:
                tx.appendString32(value.parameterString);
                break;
            case PARAMETER_CONTENT_STRING_LIST:
                tx.append_si32(value.paramterStringList.size());
                for (const QString& item : value.paramterStringList)
                    tx.appendString(item);
                break;
            case PARAMETER_CONTENT_FLOAT:
                tx.append_f32(value.parameterFloat);
                break;
            case PARAMETER_CONTENT_INT:
                tx.append_si32(value.parameterInt);
                break;
            case PARAMETER_CONTENT_NONE:
                break;
            }
        },
        nothingRead);
}

STATUS_T CmdOut_SetParametersToDefaults()
{
    return runCommand(s_parametersMutex, CODE_SET_PARAMETERS_TO_DEFAULTS, true, DEFAULT_COMMAND_TIMEOUT_MS,
                      noArguments, nothingRead);
}

STATUS_T CmdOut_GetLanguages(QVector<TAG_ITEM_T>& languages)
{
    return runCommand(s_parametersMutex, CODE_GET_LANGUAGES, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          languages.clear();
                          const int count = rx.nextArg_si32();
                          for (int i = 0; i < count; ++i)
                              languages.append(rx.nextArgTag32());
                          return STATUS_OK;
                      });
}
