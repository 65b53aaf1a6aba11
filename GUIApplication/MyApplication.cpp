#include "MyApplication.h"

#include <QDateTime>
#include <QFile>
#include <QFileInfo>
#include <QTextStream>

#include <exception>

MyApplication::MyApplication(int& argc, char** argv)
    : QApplication(argc, argv)
{
}

bool MyApplication::notify(QObject* receiver_, QEvent* event_)
{
    try {
        return QApplication::notify(receiver_, event_);
    } catch (std::exception& e) {
        logError(QDateTime::currentDateTime().toString() + "\tstd::exception was caught:\t"
                 + QString::fromLocal8Bit(e.what()));
    } catch (unsigned int status) {
        logError(QDateTime::currentDateTime().toString() + "\tunhandled STATUS_T was caught:\t"
                 + QString::number(status, 16));
    } catch (...) {
        logError(QDateTime::currentDateTime().toString() + "\tunknown exception was caught");
    }
    return false;
}

QString MyApplication::logFilePath()
{
    return QCoreApplication::applicationDirPath() + "/GUILog.txt";
}

QString MyApplication::oldLogFilePath()
{
    return QCoreApplication::applicationDirPath() + "/GUILog.old.txt";
}

void MyApplication::logError(QString error)
{
    const QString live = logFilePath();
    if (QFileInfo(live).size() > LogRotateBytes) {
        const QString old = oldLogFilePath();
        if (QFile::exists(old))
            QFile::remove(old);
        QFile::copy(live, old);
        QFile::remove(live);
    }
    QFile file(live);
    if (file.open(QIODevice::Append | QIODevice::WriteOnly | QIODevice::Text)) {
        QTextStream out(&file);
        out << error << "\n";
    }
    file.close();
}
