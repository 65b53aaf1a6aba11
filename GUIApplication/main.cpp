#include "AppShell.h"
#include "GUIAPI/DataManager.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"
#include "MyApplication.h"
#include "Screens/ScreenMaster.h"

#include <QDebug>
#include <QTextCodec>
#include <QThread>

int main(int argc, char* argv[])
{
    AppShell::pinTimeZone();

    // 1, 2
    MyApplication app(argc, argv);
    app.setApplicationName("MarigoldGUIApp");

    // 3
    // argc is what is left after the toolkit took its own options.
    QStringList arguments;
    for (int i = 0; i < argc; ++i)
        arguments << QString::fromLocal8Bit(argv[i]);
    AppShell::applyAddressArgument(arguments);

    // 4
    AppShell::writeVersionFile(QCoreApplication::applicationDirPath());

    // 5
    AppShell::registerMetaTypes();

    // 6: every toLocal8Bit() on the wire depends on this.
    QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8"));

    // 7: the worker tasks return only once their threads run.
    LocaleHelper::instance();
    StringTables::instance();
    AudioPlayerTask::instance();
    DataManagerTask::instance();

    // 8
    LocaleHelper::Init();
    StringTables::Init();
    AudioPlayer::instance()->Init();
    DataManager::instance()->Init();

    // 9
    QThread::currentThread()->setPriority(QThread::HighPriority);
    qDebug() << QString("Main/GUI Thread is Running: %1")
                    .arg(reinterpret_cast<quintptr>(QThread::currentThreadId()));

    // 10
    ScreenMaster screen;
    screen.showFullScreen();

    // 11
    AppShell::hidePointer();

    // 12
    return app.exec();
}
