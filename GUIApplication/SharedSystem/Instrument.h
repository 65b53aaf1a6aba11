#ifndef INSTRUMENT_H
#define INSTRUMENT_H

#include <QString>

// Address of the MeasurementServer. Set once from the command line.
void setIpAddress(QString address);
QString getIpAddress();
void setIpPort(int port);
int getIpPort();

#endif // INSTRUMENT_H
