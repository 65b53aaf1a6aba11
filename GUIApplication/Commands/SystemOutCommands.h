#ifndef SYSTEMOUTCOMMANDS_H
#define SYSTEMOUTCOMMANDS_H

// Commands of the system family: state, identity, hardware settings, Wi-Fi,
// self tests and power. Each returns a STATUS_T and never throws; outputs
// read before a failure stay as read. The family shares one recursive mutex.

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QByteArray>
#include <QString>
#include <QVector>

// ---- state and identity ----
STATUS_T CmdOut_GetState(SystemStatus& status);
STATUS_T CmdOut_GetVersion(VERSION_TYPE_T type, QString& version);
STATUS_T CmdOut_GetConfiguration(int& id, QString& text);
STATUS_T CmdOut_GetSerialNum(QString& serial);
STATUS_T CmdOut_GetDeviceInfo(DEVICE_INFO_T& info);
STATUS_T CmdOut_GetCapability(const QString& name, int& value);
// A count under 10 is refused with STATUS_TCP_LENGTH_MISMATCH.
STATUS_T CmdOut_GetMemoryInfo(MEMORY_INFO_T& info);
STATUS_T CmdOut_GetErrorDescriptions(QVector<ERROR_DESCRIPTION_T>& list);
STATUS_T CmdOut_ResetErrorDescriptions();
STATUS_T CmdOut_GetTextureDisplayed(bool& shown);
STATUS_T CmdOut_SetInterfaceConfig(int value);
// These only check that the server answers.
STATUS_T CmdOut_RunSelfTest();
STATUS_T CmdOut_GetBattery();
STATUS_T CmdOut_GetImageChannels();
STATUS_T CmdOut_GetSpectralChannels();

// ---- hardware settings ----
STATUS_T CmdOut_GetDisplayBrightness(unsigned int& level);
STATUS_T CmdOut_SetDisplayBrightness(unsigned int level);
STATUS_T CmdOut_GetBeeperVolume(unsigned int& level);
STATUS_T CmdOut_SetBeeperVolume(unsigned int level);

// ---- filter files kept by the server ----
// A server without the file answers 5: that is success with data untouched.
STATUS_T CmdOut_GetFilter(QByteArray& data);
STATUS_T CmdOut_GetFilterTranslation(QByteArray& data);

// ---- Wi-Fi ----
STATUS_T CmdOut_GetWifiSettings(QVector<NETWORK_DESCRIPTION_T>& list);
STATUS_T CmdOut_GetIpAddress(QString& address);
STATUS_T CmdOut_GetConnectedWifiSSID(QString& ssid);
// These four return STATUS_SERVER_BUSY (769) while the radio is changing.
STATUS_T CmdOut_SetEnableWifi(bool on);
STATUS_T CmdOut_DeleteWifiSetting(const QString& ssid);
STATUS_T CmdOut_AddWifiSetting(NETWORK_DESCRIPTION_T network, const QString& key, int priority);
STATUS_T CmdOut_TriggerWifiScan();
// Returns the server's own status.
STATUS_T CmdOut_VerifyWifiSettings(const QString& ssid, int* result);

// ---- self tests ----
STATUS_T CmdOut_GetSelfTestList(QVector<TEST>& tests);
STATUS_T CmdOut_TriggerSelfTest(unsigned int num);
STATUS_T CmdOut_GetSelfTestResult(unsigned int num, unsigned int& result);

// ---- power ----
// When the server can't be told, reboot and shut-down are done locally.
STATUS_T CmdOut_PowerOffReset(POWER_T action);

#endif // SYSTEMOUTCOMMANDS_H
