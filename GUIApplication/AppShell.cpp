#include "AppShell.h"

#include "Communication/CmdData.h"
#include "Screens/PopupPanel.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/SystemStatus.h"

#include <QApplication>
#include <QCursor>
#include <QFile>
#include <QMetaType>
#include <QPixmap>
#include <QTextStream>

#ifndef MARIGOLD_REVISION
#define MARIGOLD_REVISION "exported"
#endif

namespace AppShell {

void applyAddressArgument(const QStringList& arguments)
{
    if (arguments.size() != 2)
        return;
    const QStringList parts = arguments.at(1).split(':', Qt::KeepEmptyParts, Qt::CaseSensitive);
    if (parts.size() != 2)
        return;
    setIpAddress(parts.at(0).trimmed());
    setIpPort(parts.at(1).trimmed().toInt(nullptr, 10));
}

QString versionText(const QString& revisionString, const QString& compileDate,
                    const QString& compileTime)
{
    QString revision;
    const QStringList pieces = revisionString.split(':', Qt::KeepEmptyParts);
    if (!pieces.isEmpty()) {
        revision = pieces.last();
        revision.remove('M');
    }
    return "1.0." + revision + " " + compileDate + " " + compileTime;
}

void writeVersionFile(const QString& directory)
{
    QFile file(directory + "/GUIVersion.txt");
    file.open(QIODevice::WriteOnly | QIODevice::Truncate | QIODevice::Text);
    QTextStream out(&file);
    out << versionText(QStringLiteral(MARIGOLD_REVISION), QStringLiteral(__DATE__),
                       QStringLiteral(__TIME__));
    out.flush();
    file.close();
}

void registerMetaTypes()
{
    qRegisterMetaType<CommandData>("CommandData");
    qRegisterMetaType<ResponseData>("ResponseData");
    qRegisterMetaType<SYSTEM_STATE_T>("SYSTEM_STATE_T");
    qRegisterMetaType<BATTERY_STATUS_T>("BATTERY_STATUS_T");
    qRegisterMetaType<LANGUAGE_T>("LANGUAGE_T");
    qRegisterMetaType<WIFI_STATUS_T>("WIFI_STATUS_T");
    qRegisterMetaType<PRESSURE_SWITCH_T>("PRESSURE_SWITCH_T");
    qRegisterMetaType<ACCELEROMETER_ORIENTATION_T>("ACCELEROMETER_ORIENTATION_T");
    qRegisterMetaType<SystemStatus>("SystemStatus");
    qRegisterMetaType<SYSTEM_STATE_T>("SYSTEM_STATE_T");
    qRegisterMetaType<Sample>("Sample");
    qRegisterMetaType<SOUNDS>("SOUNDS");
    qRegisterMetaType<TEST>("TEST");
    qRegisterMetaType<PopupPanel*>("PopupPanel*");
    qRegisterMetaType<NETWORK_DESCRIPTION_T>("NETWORK_DESCRIPTION_T");
}

void hidePointer()
{
    QPixmap blank(16, 16);
    blank.fill(Qt::transparent);
    QApplication::setOverrideCursor(QCursor(blank));
}

void pinTimeZone()
{
    if (qEnvironmentVariableIsEmpty("TZ"))
        qputenv("TZ", ":/etc/localtime");
}

} // namespace AppShell
