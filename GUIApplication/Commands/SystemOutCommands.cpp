#include "Commands/SystemOutCommands.h"

#include "Communication/Commands.h"
#include "SharedSystem/Platform.h"

#include <vector>

namespace {

QRecursiveMutex s_systemMutex;

const long CODE_GET_STATE = 0x10000000;
const long CODE_GET_ERROR_DESCRIPTIONS = 0x10000020;
const long CODE_RESET_ERROR_DESCRIPTIONS = 0x10000022;
const long CODE_GET_CONFIGURATION = 0x10000040;
const long CODE_SET_INTERFACE_CONFIG = 0x10000100;
const long CODE_GET_CHANNELS = 0x40008003;
const long CODE_GET_FILTER = 0x40020000;
const long CODE_GET_FILTER_TRANSLATION = 0x40020010;
const long CODE_GET_CAPABILITY = 0x400A0220;
const long CODE_RUN_SELF_TEST = 0x400A0300;
const long CODE_GET_BATTERY = 0x400A0400;
const long CODE_GET_BEEPER_VOLUME = 0x400A0A00;
const long CODE_SET_BEEPER_VOLUME = 0x400A0A10;
const long CODE_GET_DISPLAY_BRIGHTNESS = 0x400A0A20;
const long CODE_SET_DISPLAY_BRIGHTNESS = 0x400A0A30;
const long CODE_GET_TEXTURE_DISPLAYED = 0x400A0A40;
const long CODE_GET_MEMORY_INFO = 0x400A0B00;
const long CODE_GET_SERIAL_NUM = 0x400A0B10;
const long CODE_GET_DEVICE_INFO = 0x400A0B20;
const long CODE_GET_WIFI_SETTINGS = 0x400A0C00;
const long CODE_ADD_WIFI_SETTING = 0x400A0C10;
const long CODE_DELETE_WIFI_SETTING = 0x400A0C20;
const long CODE_SET_ENABLE_WIFI = 0x400A0C30;
const long CODE_VERIFY_WIFI_SETTINGS = 0x400A0C50;
const long CODE_GET_IP_ADDRESS = 0x400A0C70;
const long CODE_TRIGGER_WIFI_SCAN = 0x400A0CA0;
const long CODE_GET_CONNECTED_WIFI_SSID = 0x400A0D20;
const long CODE_POWER_OFF_RESET = 0x400A1000;
const long CODE_GET_VERSION = 0x60000000;
const long CODE_GET_SELF_TEST_LIST = 0x60000100;
const long CODE_TRIGGER_SELF_TEST = 0x60000101;
const long CODE_GET_SELF_TEST_RESULT = 0x60000102;

const int WIFI_SETTINGS_TIMEOUT_MS = 15000;

// The server tells "no such file" with this status.
const STATUS_T SERVER_STATUS_NO_FILE = 5;
// The server tells "radio busy with the last change" with this status.
const STATUS_T SERVER_STATUS_WIFI_BUSY = 19;

// Number of strings of the device information the GUI has no field for.
const int DEVICE_INFO_UNUSED_STRINGS = 15;
// MEMORY_INFO_T's fields on the wire.
const int MEMORY_INFO_FIELDS = 10;

STATUS_T simpleCommand(long code)
{
    return runCommand(s_systemMutex, code, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, nothingRead);
}

STATUS_T readOneString(long code, QString& out)
{
    return runCommand(s_systemMutex, code, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, [&](CmdData& rx) {
        out = rx.nextArgString();
        return STATUS_OK;
    });
}

// The Wi-Fi changes answer without validation and boil the server's status
// down to busy, failed or done.
template <typename Append>
STATUS_T wifiChange(long code, Append append)
{
    return runCommand(s_systemMutex, code, false, DEFAULT_COMMAND_TIMEOUT_MS, append, [](CmdData& rx) {
        const STATUS_T status = rx.getStatus();
        if (status == SERVER_STATUS_WIFI_BUSY)
            return STATUS_SERVER_BUSY;
        return status == STATUS_OK ? STATUS_OK : STATUS_BAD_RESPONSE_STATUS;
    });
}

STATUS_T readFileData(long code, QByteArray& data)
{
    return runCommand(s_systemMutex, code, false, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, [&](CmdData& rx) {
        const STATUS_T status = rx.getStatus();
        if (status == SERVER_STATUS_NO_FILE)
            return STATUS_OK;
        if (status != STATUS_OK)
            return STATUS_BAD_RESPONSE_STATUS;
        const int size = rx.nextArg_si32();
        data = rx.nextArgBuffer(size);
        return STATUS_OK;
    });
}

} // namespace

// ---- state and identity -------------------------------------------------------

STATUS_T CmdOut_GetState(SystemStatus& status)
{
    return runCommand(s_systemMutex, CODE_GET_STATE, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, [&](CmdData& rx) {
        // Each field goes into the status as soon as it is read.
        status.setSystemState(wireEnum<SYSTEM_STATE_T>(rx.nextArg_ui8(), NUM_OF_SYSTEM_STATES));
        status.setPercentComplete(rx.nextArg_ui8());
        status.setNumOfErrors(rx.nextArg_ui8());
        status.setSystemTime(rx.nextArgTime());
        status.setBatteryState(wireEnum<BATTERY_STATUS_T>(rx.nextArg_ui8(), NUM_OF_BATTERY_STATUS));
        status.setBatteryChargePercent(rx.nextArg_ui8());
        status.setWifiState(wireEnum<WIFI_STATUS_T>(rx.nextArg_ui8(), NUM_OF_WIFI_STATUS_TYPES));
        status.setWifiLevel(rx.nextArg_ui8());
        status.setUSBState(wireEnum<USB_STATUS_T>(rx.nextArg_ui8(), NUM_OF_USB_STATUS_TYPES));
        rx.nextArg_ui32();
        status.setMeasureID(short(rx.nextArg_ui16()));
        status.setJobID(short(rx.nextArg_ui16()));
        status.setSettingsID(rx.nextArg_ui8());
        rx.nextArg_ui8();
        rx.nextArg_ui8();
        rx.nextArg_ui8();
        status.setUSettingsBits(rx.nextArg_ui32());
        // The count comes from the wire: no reservation, a short list fails
        // on its first missing entry.
        const unsigned int count = rx.nextArg_ui32();
        std::vector<SystemStatus::EntityChange> changes;
        for (unsigned int i = 0; i < count; ++i) {
            SystemStatus::EntityChange change;
            change.entity = rx.nextArg_si32();
            change.identifier1 = rx.nextArgString();
            change.change = rx.nextArg_si32();
            changes.push_back(change);
        }
        status.setEntityChanges(changes);
        return STATUS_OK;
    });
}

STATUS_T CmdOut_GetVersion(VERSION_TYPE_T type, QString& version)
{
    return runCommand(
        s_systemMutex, CODE_GET_VERSION, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_si32(type); },
        [&](CmdData& rx) {
            version = rx.nextArgString();
            return STATUS_OK;
        });
}

STATUS_T CmdOut_GetConfiguration(int& id, QString& text)
{
    return runCommand(
        s_systemMutex, CODE_GET_CONFIGURATION, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [](CmdData& tx) { tx.append_si32(0); },
        [&](CmdData& rx) {
            id = rx.nextArg_si32();
            text = rx.nextArgString();
            return STATUS_OK;
        });
}

STATUS_T CmdOut_GetSerialNum(QString& serial)
{
    return readOneString(CODE_GET_SERIAL_NUM, serial);
}

STATUS_T CmdOut_GetDeviceInfo(DEVICE_INFO_T& info)
{
    return runCommand(s_systemMutex, CODE_GET_DEVICE_INFO, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, [&](CmdData& rx) {
        info.serialNum = rx.nextArgString();
        info.partNumber = rx.nextArgString();
        info.revisionNum = rx.nextArgString();
        info.productionDate = rx.nextArgString();
        info.whitetileSerialNum = rx.nextArgString();
        info.instrumentModel = rx.nextArgString();
        info.certificationDate = rx.nextArgString();
        for (int i = 0; i < DEVICE_INFO_UNUSED_STRINGS; ++i)
            rx.nextArgString();
        return STATUS_OK;
    });
}

STATUS_T CmdOut_GetCapability(const QString& name, int& value)
{
    return runCommand(
        s_systemMutex, CODE_GET_CAPABILITY, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.appendString(name); },
        [&](CmdData& rx) {
            value = rx.nextArg_si32();
            return STATUS_OK;
        });
}

STATUS_T CmdOut_GetMemoryInfo(MEMORY_INFO_T& info)
{
    return runCommand(s_systemMutex, CODE_GET_MEMORY_INFO, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments, [&](CmdData& rx) {
        if (rx.nextArg_si32() < MEMORY_INFO_FIELDS)
            return STATUS_TCP_LENGTH_MISMATCH;
        info.numMeasurements = rx.nextArg_si32();
        info.maxNumMeasurements = rx.nextArg_si32();
        info.numJobs = rx.nextArg_si32();
        info.maxNumJobs = rx.nextArg_si32();
        info.res1 = rx.nextArg_si32();
        info.res2 = rx.nextArg_si32();
        info.sysFlashUsed = rx.nextArg_si32();
        info.sysFlashAvailable = rx.nextArg_si32();
        info.sysRamUsed = rx.nextArg_si32();
        info.sysRamAvailable = rx.nextArg_si32();
        return STATUS_OK;
    });
}

STATUS_T CmdOut_GetErrorDescriptions(QVector<ERROR_DESCRIPTION_T>& list)
{
    return runCommand(s_systemMutex, CODE_GET_ERROR_DESCRIPTIONS, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          list.clear();
                          const int count = rx.nextArg_si32();
                          for (int i = 0; i < count; ++i)
                              list.append(rx.nextArgErrorDescription());
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_ResetErrorDescriptions()
{
    return simpleCommand(CODE_RESET_ERROR_DESCRIPTIONS);
}

STATUS_T CmdOut_GetTextureDisplayed(bool& shown)
{
    return runCommand(s_systemMutex, CODE_GET_TEXTURE_DISPLAYED, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          shown = rx.nextArg_ui8() != 0;
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_SetInterfaceConfig(int value)
{
    return runCommand(
        s_systemMutex, CODE_SET_INTERFACE_CONFIG, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_si32(value); }, nothingRead);
}

STATUS_T CmdOut_RunSelfTest()
{
    return simpleCommand(CODE_RUN_SELF_TEST);
}

STATUS_T CmdOut_GetBattery()
{
    return simpleCommand(CODE_GET_BATTERY);
}

STATUS_T CmdOut_GetImageChannels()
{
    return simpleCommand(CODE_GET_CHANNELS);
}

STATUS_T CmdOut_GetSpectralChannels()
{
    return simpleCommand(CODE_GET_CHANNELS);
}

// ---- hardware settings ------------------------------------------------------------

STATUS_T CmdOut_GetDisplayBrightness(unsigned int& level)
{
    return runCommand(s_systemMutex, CODE_GET_DISPLAY_BRIGHTNESS, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          level = rx.nextArg_ui8();
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_SetDisplayBrightness(unsigned int level)
{
    return runCommand(
        s_systemMutex, CODE_SET_DISPLAY_BRIGHTNESS, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_ui8(char(level)); }, nothingRead);
}

STATUS_T CmdOut_GetBeeperVolume(unsigned int& level)
{
    return runCommand(
        s_systemMutex, CODE_GET_BEEPER_VOLUME, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [](CmdData& tx) { tx.append_si8(0); },
        [&](CmdData& rx) {
            level = rx.nextArg_ui8();
            return STATUS_OK;
        });
}

STATUS_T CmdOut_SetBeeperVolume(unsigned int level)
{
    return runCommand(
        s_systemMutex, CODE_SET_BEEPER_VOLUME, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) {
            tx.append_ui8(0);
            tx.append_ui8(char(level));
        },
        nothingRead);
}

// ---- filter files -----------------------------------------------------------------

STATUS_T CmdOut_GetFilter(QByteArray& data)
{
    return readFileData(CODE_GET_FILTER, data);
}

STATUS_T CmdOut_GetFilterTranslation(QByteArray& data)
{
    return readFileData(CODE_GET_FILTER_TRANSLATION, data);
}

// ---- Wi-Fi --------------------------------------------------------------------------

STATUS_T CmdOut_GetWifiSettings(QVector<NETWORK_DESCRIPTION_T>& list)
{
    return runCommand(s_systemMutex, CODE_GET_WIFI_SETTINGS, true, WIFI_SETTINGS_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          list.clear();
                          const int count = rx.nextArg_si32();
                          for (int i = 0; i < count; ++i)
                              list.append(rx.nextArgNetworkDescription());
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_GetIpAddress(QString& address)
{
    return readOneString(CODE_GET_IP_ADDRESS, address);
}

STATUS_T CmdOut_GetConnectedWifiSSID(QString& ssid)
{
    return readOneString(CODE_GET_CONNECTED_WIFI_SSID, ssid);
}

STATUS_T CmdOut_SetEnableWifi(bool on)
{
    return wifiChange(CODE_SET_ENABLE_WIFI, [&](CmdData& tx) { tx.append_ui8(on ? 1 : 0); });
}

STATUS_T CmdOut_DeleteWifiSetting(const QString& ssid)
{
    return wifiChange(CODE_DELETE_WIFI_SETTING, [&](CmdData& tx) { tx.appendString(ssid); });
}

STATUS_T CmdOut_AddWifiSetting(NETWORK_DESCRIPTION_T network, const QString& key, int priority)
{
    return wifiChange(CODE_ADD_WIFI_SETTING, [&](CmdData& tx) {
        tx.appendString(network.SSID);
        tx.appendString(network.Authentication);
        tx.appendString(key);
        tx.append_si32(priority);
    });
}

STATUS_T CmdOut_TriggerWifiScan()
{
    return wifiChange(CODE_TRIGGER_WIFI_SCAN, noArguments);
}

STATUS_T CmdOut_VerifyWifiSettings(const QString& ssid, int* result)
{
    return runCommand(
        s_systemMutex, CODE_VERIFY_WIFI_SETTINGS, false, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.appendString(ssid); },
        [&](CmdData& rx) {
            rx.nextArgString();
            const int value = rx.nextArg_si32();
            if (result)
                *result = value;
            return rx.getStatus();
        });
}

// ---- self tests -----------------------------------------------------------------------

STATUS_T CmdOut_GetSelfTestList(QVector<TEST>& tests)
{
    return runCommand(s_systemMutex, CODE_GET_SELF_TEST_LIST, true, DEFAULT_COMMAND_TIMEOUT_MS, noArguments,
                      [&](CmdData& rx) {
                          tests.clear();
                          const int count = rx.nextArg_si32();
                          for (int i = 0; i < count; ++i) {
                              TEST test;
                              test.description = rx.nextArgString();
                              test.deviceLocation = rx.nextArg_ui32();
                              test.approxDuration = rx.nextArg_ui32();
                              test.num = uint32_t(i);
                              tests.append(test);
                          }
                          return STATUS_OK;
                      });
}

STATUS_T CmdOut_TriggerSelfTest(unsigned int num)
{
    return runCommand(
        s_systemMutex, CODE_TRIGGER_SELF_TEST, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_ui32(num); }, nothingRead);
}

STATUS_T CmdOut_GetSelfTestResult(unsigned int num, unsigned int& result)
{
    return runCommand(
        s_systemMutex, CODE_GET_SELF_TEST_RESULT, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_ui32(num); },
        [&](CmdData& rx) {
            result = static_cast<unsigned int>(rx.nextArg_si32());
            return STATUS_OK;
        });
}

// ---- power ------------------------------------------------------------------------------

STATUS_T CmdOut_PowerOffReset(POWER_T action)
{
    long value;
    switch (action) {
    case POWER_REBOOT: value = 0x5449; break;
    case POWER_STANDBY: value = 0; break;
    case POWER_FACTORY: value = 0x20005449; break;
    case POWER_SHUTDOWN:
    default: value = 0x15449; break;
    }

    QMutexLocker lock(&s_systemMutex);
    const STATUS_T status = runCommand(
        s_systemMutex, CODE_POWER_OFF_RESET, true, DEFAULT_COMMAND_TIMEOUT_MS,
        [&](CmdData& tx) { tx.append_si32(value); }, nothingRead);
    // The server couldn't be told: do what the user asked for ourselves.
    if (status != STATUS_OK) {
        if (action == POWER_REBOOT)
            Platform::runShellCommand("reboot");
        else if (action == POWER_SHUTDOWN)
            Platform::runShellCommand("poweroff");
    }
    return status;
}
