#include "SharedSystem/Instrument.h"

namespace {
QString ipAddress = QStringLiteral("127.0.0.1");
int ipPort = 6300;
} // namespace

void setIpAddress(QString address) { ipAddress = address; }
QString getIpAddress() { return ipAddress; }
void setIpPort(int port) { ipPort = port; }
int getIpPort() { return ipPort; }
