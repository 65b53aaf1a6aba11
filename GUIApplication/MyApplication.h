#ifndef MYAPPLICATION_H
#define MYAPPLICATION_H

#include <QApplication>
#include <QString>

// Stops every exception at the event loop: it is logged to the file beside
// the executable and the loop goes on; the event that threw is lost.
class MyApplication : public QApplication
{
public:
    MyApplication(int& argc, char** argv);

    bool notify(QObject* receiver_, QEvent* event_) override;

    static void logError(QString error);

    // Beside the executable: applicationDirPath() + "/GUILog.txt".
    static QString logFilePath();
    static QString oldLogFilePath();

    // The live log is rotated when it has grown strictly above this.
    static const qint64 LogRotateBytes = 25000000;
};

#endif // MYAPPLICATION_H
