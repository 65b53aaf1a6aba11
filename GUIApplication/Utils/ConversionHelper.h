#ifndef CONVERSIONHELPER_H
#define CONVERSIONHELPER_H

// Date-times in the user's formats (UserParams).

#include <QDateTime>
#include <QString>

// Time, a blank, date: with the default formats "2:05:09 pm 02/01/20".
QString convertDateTimeToString(const QDateTime& dateTime);

// The time alone, without seconds and blanks, for the narrow status bar:
// "h:mm:ss ap" becomes "h:mmap", e.g. "2:05pm".
QString convertDateTimeToStatusBarString(const QDateTime& dateTime);

#endif // CONVERSIONHELPER_H
