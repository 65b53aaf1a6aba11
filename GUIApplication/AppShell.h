#ifndef APPSHELL_H
#define APPSHELL_H

// The steps of start-up that are worth testing on their own.

#include <QString>
#include <QStringList>

namespace AppShell {

// argv as a list, program name first. Exactly one argument of the form
// "address:port" selects the server; anything else keeps the defaults.
// Without TZ, glibc reads /etc/localtime again on every local time
// conversion, which a job list of some thousand samples feels. Sets TZ to
// that file when it is unset; call before any thread starts.
void pinTimeZone();

void applyAddressArgument(const QStringList& arguments);

// "1.0.<revision> <date> <time>", no line end. The revision is the last
// ":"-separated piece of the build's revision string with every "M" removed.
QString versionText(const QString& revisionString, const QString& compileDate,
                    const QString& compileTime);
// Writes the version text to "<dir>/GUIVersion.txt"; a failed open is silent.
void writeVersionFile(const QString& directory);

// Makes the shared types travel in queued signals.
void registerMetaTypes();

// Hides the pointer for the whole run.
void hidePointer();

} // namespace AppShell

#endif // APPSHELL_H
