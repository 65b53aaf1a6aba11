#include "Utils/ConversionHelper.h"

#include "SharedSystem/UserParams.h"

QString convertDateTimeToString(const QDateTime& dateTime)
{
    return QString("%1 %2").arg(dateTime.toString(UserParams::getTimeFormat()),
                                dateTime.toString(UserParams::getDateFormat()));
}

QString convertDateTimeToStatusBarString(const QDateTime& dateTime)
{
    QString format = UserParams::getTimeFormat();
    format.remove(QStringLiteral(":ss"));
    format.remove(QLatin1Char(' '));
    return dateTime.toString(format);
}
