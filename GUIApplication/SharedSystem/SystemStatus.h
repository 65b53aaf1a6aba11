#ifndef SYSTEMSTATUS_H
#define SYSTEMSTATUS_H

#include "SharedSystem/InstrumentTypes.h"

#include <QDateTime>
#include <QMetaType>
#include <QString>
#include <vector>

// The latest snapshot of the instrument as polled from the server. Copied by
// value through queued signals.
class SystemStatus
{
public:
    struct EntityChange {
        int entity = 0;
        QString identifier1;
        int change = 0;
    };

    SystemStatus();

    void ClearContents();

    // Always false, even for equal snapshots: the consumer's early return
    // must never be taken, so every poll is processed in full.
    bool operator==(const SystemStatus& other) const;

    SYSTEM_STATE_T getSystemState() const { return m_SystemState; }
    void setSystemState(SYSTEM_STATE_T v) { m_SystemState = v; }
    int getPercentComplete() const { return m_PercentComplete; }
    void setPercentComplete(int v) { m_PercentComplete = v; }
    int getNumOfErrors() const { return m_NumOfErrors; }
    void setNumOfErrors(int v) { m_NumOfErrors = v; }
    QDateTime getSystemTime() const { return m_SystemTime; }
    void setSystemTime(const QDateTime& v) { m_SystemTime = v; }
    BATTERY_STATUS_T getBatteryState() const { return m_BatteryState; }
    void setBatteryState(BATTERY_STATUS_T v) { m_BatteryState = v; }
    int getBatteryChargePercent() const { return m_BatteryChargePercent; }
    void setBatteryChargePercent(int v) { m_BatteryChargePercent = v; }
    WIFI_STATUS_T getWifiState() const { return m_WifiState; }
    void setWifiState(WIFI_STATUS_T v) { m_WifiState = v; }
    int getWifiLevel() const { return m_WifiLevel; }
    void setWifiLevel(int v) { m_WifiLevel = v; }
    USB_STATUS_T getUSBState() const { return m_USBState; }
    void setUSBState(USB_STATUS_T v) { m_USBState = v; }
    short getJobID() const { return m_jobID; }
    void setJobID(short v) { m_jobID = v; }
    short getMeasureID() const { return m_measureID; }
    void setMeasureID(short v) { m_measureID = v; }
    short getSettingsID() const { return m_settingsID; }
    void setSettingsID(short v) { m_settingsID = v; }
    MEMORY_INFO_T getMemInfo() const { return m_memInfo; }
    void setMemInfo(const MEMORY_INFO_T& v) { m_memInfo = v; }
    CALIBRATION_STATE_T getCalState() const { return m_calState; }
    void setCalState(const CALIBRATION_STATE_T& v) { m_calState = v; }
    uint32_t getUSettingsBits() const { return m_uSettingsBits; }
    void setUSettingsBits(uint32_t v) { m_uSettingsBits = v; }
    std::vector<EntityChange> getEntityChanges() const { return m_EntityChanges; }
    void setEntityChanges(const std::vector<EntityChange>& v) { m_EntityChanges = v; }

private:
    SYSTEM_STATE_T m_SystemState;
    int m_PercentComplete;
    int m_NumOfErrors;
    QDateTime m_SystemTime;
    BATTERY_STATUS_T m_BatteryState;
    int m_BatteryChargePercent;
    WIFI_STATUS_T m_WifiState;
    int m_WifiLevel;
    USB_STATUS_T m_USBState;
    short m_jobID;
    short m_measureID;
    short m_settingsID;
    MEMORY_INFO_T m_memInfo;
    CALIBRATION_STATE_T m_calState;
    uint32_t m_uSettingsBits;
    std::vector<EntityChange> m_EntityChanges;
};

Q_DECLARE_METATYPE(SystemStatus)

#endif // SYSTEMSTATUS_H
