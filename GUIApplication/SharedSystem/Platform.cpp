#include "SharedSystem/Platform.h"

#include <QDebug>
#include <QDir>
#include <QMutex>
#include <QMutexLocker>
#include <QProcess>

#include <cstdlib>

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

void startProgram(const QString& program, const QStringList& arguments)
{
    const QString line = (QStringList(program) + arguments).join(' ');
    record(line);
#ifdef MARIGOLD_DEVICE_BUILD
    QProcess::startDetached(program, arguments);
#else
    qDebug() << "Platform: host build, not starting:" << line;
#endif
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
