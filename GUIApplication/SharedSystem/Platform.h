#ifndef PLATFORM_H
#define PLATFORM_H

// The one place where the process touches the device: every "/opt/..." and
// "/sys/..." path is resolved under a root prefix, and every shell command or
// external program goes through here. A host build never runs them; it logs
// and records them so that tests can see what would have happened.

#include <QString>
#include <QStringList>

#include <memory>

namespace Platform {

// Root prefix for device paths. Taken from MARIGOLD_ROOT on first use,
// default "/". Tests may override it.
QString root();
void setRoot(const QString& root);

// "/opt/GUI/Sounds/x.wav" -> "<root>/opt/GUI/Sounds/x.wav"
QString devicePath(const QString& absolutePath);

// True when built for the instrument (commands really run).
bool isDeviceBuild();

// system() on the device, a log line and a record on the host.
// Returns the command's exit status on the device and 0 on the host.
int runShellCommand(const QString& command);

// A program started by startProcess, which can be stopped again: only that
// process, not every process of the same name.
class Process
{
public:
    virtual ~Process() = default;
    // Ends the process if it still runs; a second call does nothing.
    virtual void stop() = 0;
};

// Starts an external program without waiting for it and gives a handle to
// that one process. A host build records "<program> <arguments>" and, on
// stop, "stop <program> <arguments>".
std::unique_ptr<Process> startProcess(const QString& program, const QStringList& arguments);

// Gives memory that was freed back to the system. The C library keeps freed
// blocks in its per-thread pools, so a job table of hundreds of jobs, read
// again and again on the data thread and copied on the GUI thread, would
// otherwise leave the process as large as its largest moment.
void releaseFreedMemory();

// What a host build would have run, oldest first ("aplay -N /opt/...").
QStringList recordedCommands();
void clearRecordedCommands();

} // namespace Platform

#endif // PLATFORM_H
