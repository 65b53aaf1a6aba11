// The screenshot tour of Korean and Chinese input: the candidate strip on
// the romaja, pinyin and bopomofo tables, on its first and second page, the
// empty page of a full list, and the bopomofo keypad. See support/Tour.h.

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/DataManager.h"
#include "Screens/JobEditScreens.h"
#include "Screens/JobKeypadScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"

#include "SimServer.h"
#include "support/TestSupport.h"
#include "support/Tour.h"

#include <QFile>
#include <QPlainTextEdit>
#include <QtTest>

namespace {

bool loadData()
{
    static const bool loaded = [] {
        static Sim::ServerThread sim;
        const QString dataDir = TestSupport::makeTempDir("tour-uim-sim");
        QFile::copy(Platform::devicePath("/opt/Filter/Filter.xml"), dataDir + "/Filter.xml");
        sim.options().port = TestSupport::freeLocalPort();
        sim.options().controlPort = -1;
        sim.options().instrument.dataDir = dataDir;
        sim.options().instrument.seed = 7;
        if (!sim.start())
            return false;
        setIpAddress("127.0.0.1");
        setIpPort(sim.port());
        Commands::Init();
        Commands::instance()->tcpClient()->connectToHost();
        DataManager* data = DataManager::instance();
        data->onSync();
        data->setSystemStatus(Tour::workshopStatus());
        data->updateJobInfos();
        return data->getNumberOfJobs() > 0;
    }();
    if (loaded)
        Tour::activateJob(false);
    return loaded;
}

// A name screen of the language with `before` committed, then `keys`
// typed: a blank is Space, '\n' is Enter.
JobKeypadScreen* composing(QWidget* d, const QString& code, const QString& before, const QString& keys,
                           bool special = false)
{
    loadData();
    DataManager::instance()->setLanguageCode(code);
    auto* screen = new JobNameEditScreen(d);
    DataManager::instance()->setLanguageCode("en");
    QPlainTextEdit* field = screen->getTextEditPointer();
    field->setPlainText(before);
    field->moveCursor(QTextCursor::End);
    if (special)
        screen->onDisplaySpecial(true);
    for (const QChar c : keys) {
        if (c == '\n')
            screen->onEnterClicked();
        else if (c == ' ')
            screen->onSpaceClicked();
        else
            screen->onKeyClicked(QString(c));
    }
    return screen;
}

QList<Tour::Stop> stops()
{
    // There is no translation into traditional Chinese yet: those stops are
    // taken in English around the Chinese text.
    return {
        {"uim_ko_keypad", [](QWidget* d) { composing(d, "ko", QString(), QString()); }, "ko"},
        {"uim_ko_syllable", [](QWidget* d) { composing(d, "ko", QString::fromUtf8("도어 "), "HAN"); }, "ko"},
        {"uim_ko_vowel", [](QWidget* d) { composing(d, "ko", QString::fromUtf8("한국"), "A "); }, "ko"},
        {"uim_zh_Hans_first_page", [](QWidget* d) { composing(d, "zh_Hans", QString::fromUtf8("车门"), "SHI"); },
         "zh_Hans"},
        {"uim_zh_Hans_second_page",
         [](QWidget* d) { composing(d, "zh_Hans", QString::fromUtf8("车门"), "SHI         "); }, "zh_Hans"},
        {"uim_zh_Hans_empty_page",
         [](QWidget* d) { composing(d, "zh_Hans", QString(), "NIANG        "); }, "zh_Hans"},
        {"uim_zh_Hant_keypad", [](QWidget* d) { composing(d, "zh_Hant", QString(), QString()); }},
        {"uim_zh_Hant_special", [](QWidget* d) { composing(d, "zh_Hant", QString::fromUtf8("車門"), QString(), true); }},
        {"uim_zh_Hant_first_page",
         [](QWidget* d) { composing(d, "zh_Hant", QString::fromUtf8("車門"), QString::fromUtf8("ㄕ")); }},
        {"uim_zh_Hant_second_page",
         [](QWidget* d) { composing(d, "zh_Hant", QString::fromUtf8("車門"), QString::fromUtf8("ㄕˋ         ")); }},
    };
}

} // namespace

TOUR_MAIN(stops)
