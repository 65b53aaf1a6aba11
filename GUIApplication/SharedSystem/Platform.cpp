#include "SharedSystem/Platform.h"

#include <csignal>
#include <sys/types.h>

#include <QDebug>
#include <QDir>
#include <QMutex>
#include <QMutexLocker>
#include <QProcess>

#include <cstdlib>

#ifdef __GLIBC__
#include <malloc.h>
#endif

namespace {

QMutex& platformMutex()
{
    static QMutex mutex;
    return mutex;
}

QString& rootStorage()
{
    static QString root = [] {
        const QByteArray env = qgetenv("MARIGOLD_ROOT");
        return env.isEmpty() ? QStringLiteral("/") : QString::fromLocal8Bit(env);
    }();
    return root;
}

QStringList& recorded()
{
    static QStringList list;
    return list;
}

void record(const QString& command)
{
    QMutexLocker lock(&platformMutex());
    // Bounded: a long host run plays a sound on every touch.
    if (recorded().size() >= 1000)
        recorded().removeFirst();
    recorded().append(command);
}

} // namespace

namespace Platform {

QString root()
{
    QMutexLocker lock(&platformMutex());
    return rootStorage();
}

void setRoot(const QString& newRoot)
{
    QMutexLocker lock(&platformMutex());
    rootStorage() = newRoot.isEmpty() ? QStringLiteral("/") : newRoot;
}

QString devicePath(const QString& absolutePath)
{
    const QString prefix = root();
    if (prefix == QLatin1String("/"))
        return absolutePath;
    QString base = prefix;
    while (base.endsWith('/'))
        base.chop(1);
    if (absolutePath.startsWith('/'))
        return base + absolutePath;
    return base + '/' + absolutePath;
}

void releaseFreedMemory()
{
#ifdef __GLIBC__
    malloc_trim(0);
#endif
}

bool isDeviceBuild()
{
#ifdef MARIGOLD_DEVICE_BUILD
    return true;
#else
    return false;
#endif
}

int runShellCommand(const QString& command)
{
    record(command);
#ifdef MARIGOLD_DEVICE_BUILD
    return std::system(command.toLocal8Bit().constData());
#else
    qDebug() << "Platform: host build, not running:" << command;
    return 0;
#endif
}

namespace {

class StartedProcess : public Process
{
public:
    StartedProcess(const QString& line, qint64 pid)
        : m_line(line)
        , m_pid(pid)
    {
    }
    ~StartedProcess() override = default;

    void stop() override
    {
        if (m_stopped)
            return;
        m_stopped = true;
        record(QStringLiteral("stop ") + m_line);
#ifdef MARIGOLD_DEVICE_BUILD
        // A detached child belongs to init once started; its pid is ours to
        // end. One that has already finished makes this a no-op.
        if (m_pid > 0)
            ::kill(pid_t(m_pid), SIGTERM);
#endif
    }

private:
    QString m_line;
    qint64 m_pid = 0;
    bool m_stopped = false;
};

} // namespace

std::unique_ptr<Process> startProcess(const QString& program, const QStringList& arguments)
{
    const QString line = (QStringList(program) + arguments).join(' ');
    record(line);
    qint64 pid = 0;
#ifdef MARIGOLD_DEVICE_BUILD
    if (!QProcess::startDetached(program, arguments, QString(), &pid))
        qDebug() << "Platform: could not start" << line;
#else
    qDebug() << "Platform: host build, not starting:" << line;
#endif
    return std::unique_ptr<Process>(new StartedProcess(line, pid));
}

QStringList recordedCommands()
{
    QMutexLocker lock(&platformMutex());
    return recorded();
}

void clearRecordedCommands()
{
    QMutexLocker lock(&platformMutex());
    recorded().clear();
}

} // namespace Platform
