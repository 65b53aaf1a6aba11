// The keypad and the job's text screens against the simulator: layout
// files and their fall-back, the layers and the function row, finger
// tracking, the length limit, the name rules, and the tag auto-fill with
// its cascade over the three tags of the example filter file.

#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/JobEditScreens.h"
#include "Screens/JobKeypadScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/PopupPanel.h"
#include "Screens/ScreenMaster.h"
#include "Screens/JobListScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "SharedSystem/XMLParser.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/Keypad.h"
#include "Widgets/WordWrapButton.h"
#include "Widgets/XPushButton.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QElapsedTimer>
#include <QFile>
#include <QPlainTextEdit>
#include <QThread>
#include <QtTest>

namespace {

QString keyXml(int cap, int low, int x, int y, int w = 26, int h = 55, const QString& extra = QString())
{
    return QStringLiteral("<key characterCap=\"%1\" characterLow=\"%2\" xCoord=\"%3\" yCoord=\"%4\" "
                          "width=\"%5\" height=\"%6\" %7/>")
        .arg(cap).arg(low).arg(x).arg(y).arg(w).arg(h).arg(extra);
}

QByteArray layout(const QStringList& keys)
{
    return QByteArray("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<keypad ContentVersion=\"0.1 alpha\">\n")
           + keys.join('\n').toUtf8() + "\n</keypad>\n";
}

void sendMouse(QWidget* w, QEvent::Type type, const QPoint& pos)
{
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    const Qt::MouseButtons held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent event(type, pos, w->mapToGlobal(pos), button, held, Qt::NoModifier);
    QApplication::sendEvent(w, &event);
}

KeyPadLabel* labelFor(JobKeypadScreen* screen, const QString& text, int layer = -1)
{
    const int wanted = layer < 0 ? screen->currentLayer() : layer;
    for (KeyPadLabel* label : screen->keys().at(wanted))
        if (label->text() == text)
            return label;
    return nullptr;
}

QPoint centreOf(QWidget* w)
{
    return w->geometry().center();
}

} // namespace

class tst_Keypad : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    // Layout files
    void brokenLayoutFallsBackInBoundedTime();
    void shippedLayoutsAreRealKeyboards_data();
    void shippedLayoutsAreRealKeyboards();

    // The keypad
    void defaultLayoutPlacesTheFunctionRow();
    void specialKeyBringsSpecialPage();
    void pressShowsKeyAndReleaseEntersIt();
    void slideOffEntersNothing();
    void overlappingKeysFirstWins();
    void readSwitchNeverEntersTheField();
    void composedLanguageHandsKeysToTheComposer();
    void fixedKeypadPagesAndSignals();

    // Name, free tag, notes
    void fullNameGreysTheKeys();
    void nameRules();
    void freeTagAndNotesStoreTheirText();

    // Tags from the filter file
    void tagKeysFollowTheMatches();
    void tagListOpensAndPicks();
    void tooManyMatchesLeaveMoreDead();
    void unknownTagIsRefused();
    void tagCascade();

    // The road of a new job
    void newJobIsNamedAndTaggedOnTheKeypad();

private:
    // A fresh open job, the active one; its tags and notes as given.
    void freshJob(const QStringList& tags = {}, const QString& name = QString());
    Job serverJob();
    template <class S>
    S* open(SCREEN_ID_T id);
    void closeAll();
    // The keypad of `code` from a root holding only the given layout.
    void useLayout(const QByteArray& bytes);
    void restoreLayout();
    NotificationPopup* popupOf(DaddyPanel* panel) const;

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
    QString m_stageRoot;
    QString m_layoutRoot;
};

void tst_Keypad::initTestCase()
{
    m_stageRoot = Platform::devicePath("/");
    // The example filter file of the product is served as the instrument's.
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("keypad"), 0.3,
                                                        ProductHarness::ExampleFilterFile));

    ScreenMaster::setScreenFactoryOverride([](SCREEN_ID_T id, QWidget* parent) -> QWidget* {
        if (id <= JOB_FREE_TEXT_SCREEN_ID || id == JOB_LIST_SCREEN_ID || id == SAD_PUPPY_POPUP_SCREEN_ID
            || id == LOCK_SCREEN_ID || id == SYNC_SCREEN_ID)
            return nullptr;
        return new DaddyPanel(parent);
    });
    m_master = new ScreenMaster;
    m_master->show();
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->getDataInitialized(), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(DataManager::instance()->doesTagExist(), 10000);
    QCOMPARE(int(DataManager::instance()->getTagRules()), 3);

    m_layoutRoot = TestSupport::makeTempDir(QStringLiteral("keypad-root"));
    QVERIFY(QDir(m_layoutRoot).mkpath("opt/GUI/Keypad"));
}

void tst_Keypad::cleanupTestCase()
{
    closeAll();
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_Keypad::init()
{
    closeAll();
}

void tst_Keypad::closeAll()
{
    if (!m_master)
        return;
    m_master->onGotoHomeScreen();
    QCoreApplication::processEvents();
}

template <class S>
S* tst_Keypad::open(SCREEN_ID_T id)
{
    QWidget* screen = m_master->onAddScreenToStack(id);
    S* typed = qobject_cast<S*>(screen);
    QCoreApplication::processEvents();
    return typed;
}

void tst_Keypad::freshJob(const QStringList& tags, const QString& name)
{
    DataManager* data = DataManager::instance();
    const unsigned int index = data->createNewJob();
    QVERIFY(index != 65535);
    data->setActiveJob(index);
    Job job = data->getActiveJobObject();
    for (int i = 0; i < tags.size() && i < NUM_TAG_STATES; ++i) {
        TAG_ENTRY_DATA_T tag;
        tag.setDefaultName(tags[i]);
        tag.displayName = tags[i];
        tag.id = data->getTagID(TAG_STATES_T(i), tags[i]);
        tag.filterName = data->getTagStateNameDefaultLanguage(TAG_STATES_T(i));
        job.setTagData(i, tag);
    }
    if (!tags.isEmpty())
        data->editJob(index, job);
    if (!name.isEmpty())
        data->editJobDisplayName(index, name);
    QVERIFY(data->refreshJobInfos());
}

Job tst_Keypad::serverJob()
{
    DataManager::instance()->refreshJobInfos();
    return DataManager::instance()->getActiveJobObject();
}

void tst_Keypad::useLayout(const QByteArray& bytes)
{
    QFile file(m_layoutRoot + "/opt/GUI/Keypad/keypad_xx.xml");
    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
    file.write(bytes);
    file.close();
    Platform::setRoot(m_layoutRoot);
    DataManager::instance()->setLanguageCode("xx");
    Platform::setRoot(m_stageRoot);
}

void tst_Keypad::restoreLayout()
{
    DataManager::instance()->setLanguageCode("en");
}

NotificationPopup* tst_Keypad::popupOf(DaddyPanel* panel) const
{
    const auto& popups = panel->popups();
    return popups.empty() ? nullptr : qobject_cast<NotificationPopup*>(popups.back());
}

// ---------------------------------------------------------------- layout files

void tst_Keypad::brokenLayoutFallsBackInBoundedTime()
{
    XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
    KeypadArray keys;
    // Good keys first, then the document breaks off.
    const QByteArray broken = "<?xml version=\"1.0\"?>\n<keypad>\n" + keyXml(65, 97, 10, 170).toUtf8()
                              + "\n<key characterCap=\"66\" <<< \n";
    QTest::ignoreMessage(QtDebugMsg, QRegularExpression("Keypad layout is not well-formed at line 4"));
    QCOMPARE(parser.parseKeypadXML(broken, keys), KEYPAD_XML_NOT_WELL_FORMED);
    QVERIFY(keys.isEmpty());

    // Through the loader: the built-in English layout, and the data lock is
    // free again for another thread at once.
    QFile file(m_layoutRoot + "/opt/GUI/Keypad/keypad_broken.xml");
    QVERIFY(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
    file.write(broken);
    file.close();
    Platform::setRoot(m_layoutRoot);
    QElapsedTimer clock;
    clock.start();
    // On a thread of its own, so that a stall fails the test instead of
    // hanging it.
    bool loaded = false;
    QThread* loader = QThread::create([&keys, &loaded] {
        loaded = DataManager::instance()->loadKeypad("broken", keys);
    });
    loader->start();
    const bool finished = loader->wait(3000);
    Platform::setRoot(m_stageRoot);
    QVERIFY2(finished, "the broken layout stalled the loader");
    delete loader;
    QVERIFY(loaded);
    QVERIFY(clock.elapsed() < 3000);
    QCOMPARE(keys.size(), 36);
    QCOMPARE(keys.first().characterCap, QChar('1'));

    // A missing file falls back as quietly.
    Platform::setRoot(m_layoutRoot);
    QVERIFY(DataManager::instance()->loadKeypad("none", keys));
    Platform::setRoot(m_stageRoot);
    QCOMPARE(keys.size(), 36);
}

void tst_Keypad::shippedLayoutsAreRealKeyboards_data()
{
    QTest::addColumn<QString>("code");
    QTest::addColumn<QString>("letters"); // on the normal page
    QTest::addColumn<QString>("special"); // on the special page
    QTest::newRow("de") << "de" << "QWERTZÜÖÄß" << "§€";
    QTest::newRow("fr") << "fr" << "AZERTYQSDFGHJKLMWXCVBN" << "ÉÈÀÇŒ";
    QTest::newRow("es") << "es" << "QWERTYÑ" << "ÁÉÍÓÚ¿¡";
    QTest::newRow("it") << "it" << "QWERTY" << "ÀÈÉÌÒÙ";
    QTest::newRow("pt") << "pt" << "QWERTYÇ" << "ÃÕÁÂÊ";
    QTest::newRow("wifi") << "wifi" << "QWERTY" << "!@#$%^&*()-_=+[]{}\\|;:'\",.<>/?`~";
}

void tst_Keypad::shippedLayoutsAreRealKeyboards()
{
    QFETCH(QString, code);
    QFETCH(QString, letters);
    QFETCH(QString, special);
    QFile file(Platform::devicePath(QString("/opt/GUI/Keypad/keypad_%1.xml").arg(code)));
    QVERIFY2(file.open(QIODevice::ReadOnly), qPrintable(file.fileName()));
    XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
    KeypadArray keys;
    QCOMPARE(parser.parseKeypadXML(file.readAll(), keys), 0);

    QString normal, onSpecial;
    QVector<QRect> normalRects, specialRects;
    for (const KEYPAD_BUTTON_T& key : keys) {
        QVERIFY(QRect(0, 150, 320, 240).contains(key.geometry));
        QVERIFY(!key.characterCap.isNull() && !key.characterLow.isNull());
        (key.special ? onSpecial : normal) += key.characterCap;
        (key.special ? specialRects : normalRects) << key.geometry;
    }
    for (const QChar c : letters)
        QVERIFY2(normal.contains(c), qPrintable(QString(c)));
    for (const QChar c : special)
        QVERIFY2(onSpecial.contains(c), qPrintable(QString(c)));
    // Keys of one page never overlap, and the rows end where the English ones
    // do, so that the function row stands in the same place.
    int bottom = 0;
    for (const QVector<QRect>* page : {&normalRects, &specialRects}) {
        for (int i = 0; i < page->size(); ++i) {
            bottom = std::max(bottom, page->at(i).bottom());
            for (int j = i + 1; j < page->size(); ++j)
                QVERIFY(!page->at(i).intersects(page->at(j)));
        }
    }
    QCOMPARE(bottom, 389);
}

// ---------------------------------------------------------------- keypad

void tst_Keypad::defaultLayoutPlacesTheFunctionRow()
{
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    QCOMPARE(screen->keys().size(), 4);
    QCOMPARE(screen->keys()[0].size(), 36);
    QCOMPARE(screen->keys()[1].size(), 36);
    QVERIFY(screen->keys()[2].isEmpty() && screen->keys()[3].isEmpty());
    // The function row overlaps the last key row by one pixel.
    QCOMPARE(screen->functionRowY(), 389);
    QCOMPARE(screen->btnSpace()->geometry(), QRect(108, 389, 104, 55));
    QCOMPARE(screen->btnDelete()->x(), 211);
    QCOMPARE(screen->btnShift()->x(), 56);
    QVERIFY(!screen->btnSpecial()->isVisible());
    QVERIFY(!screen->btnEnter()->isVisible());
    // Capitals first; shift is a plain latch.
    QVERIFY(screen->displayCaps());
    QVERIFY(labelFor(screen, "Q")->isVisible());
    QTest::mouseClick(screen->btnShift(), Qt::LeftButton);
    QCOMPARE(screen->currentLayer(), 1);
    QVERIFY(labelFor(screen, "q")->isVisible());
    QVERIFY(!labelFor(screen, "Q", 0)->isVisible());
}

void tst_Keypad::specialKeyBringsSpecialPage()
{
    useLayout(layout({keyXml('A', 'a', 30, 225), keyXml('B', 'b', 56, 225),
                      keyXml('#', 0, 30, 225, 26, 55, "special=\"TRUE\""),
                      keyXml(0xC9, 0xE9, 56, 225, 26, 55, "special=\"true\"")}));
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    restoreLayout();
    QVERIFY(screen);
    QCOMPARE(screen->btnSpace()->x(), 134);
    QVERIFY(screen->btnSpecial()->isVisible());
    QCOMPARE(screen->btnSpecial()->geometry(), QRect(0, 279, 82, 55));
    QCOMPARE(screen->btnSpecial()->text(), QString("Special Keys"));
    // A special key without a small form is absent from the small layer.
    QCOMPARE(screen->keys()[2].size(), 2);
    QCOMPARE(screen->keys()[3].size(), 1);

    QTest::mouseClick(screen->btnSpecial(), Qt::LeftButton);
    QCOMPARE(screen->currentLayer(), 2);
    QCOMPARE(screen->btnSpecial()->text(), QString("ABC"));
    QVERIFY(labelFor(screen, "#")->isVisible());
    QVERIFY(!labelFor(screen, "A", 0)->isVisible());
    screen->getTextEditPointer()->clear();
    const QPoint at = centreOf(labelFor(screen, QString(QChar(0xC9))));
    sendMouse(screen, QEvent::MouseButtonPress, at);
    sendMouse(screen, QEvent::MouseButtonRelease, at);
    QCOMPARE(screen->text(), QString(QChar(0xC9)));
    QTest::mouseClick(screen->btnShift(), Qt::LeftButton);
    QCOMPARE(screen->currentLayer(), 3);
    QVERIFY(!labelFor(screen, "#", 3));
}

void tst_Keypad::pressShowsKeyAndReleaseEntersIt()
{
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    KeyPadLabel* q = labelFor(screen, "Q");
    const QPoint at = centreOf(q);
    sendMouse(screen, QEvent::MouseButtonPress, at);
    QCOMPARE(screen->currentKey(), q);
    QWidget* popup = screen->keyPopup();
    QVERIFY(popup && popup->isVisible());
    QCOMPARE(popup->size(), QSize(92, 134));
    // Centred on the key, its foot 44 pixels below the key's centre.
    QCOMPARE(popup->geometry().center().x(), q->geometry().center().x());
    QCOMPARE(popup->y() + popup->height(), q->y() + q->height() / 2 + 44);
    QCOMPARE(static_cast<KeypadNotification*>(popup)->text(), QString("Q"));
    // The selected name is replaced by the first key.
    sendMouse(screen, QEvent::MouseButtonRelease, at);
    QCOMPARE(screen->text(), QString("Q"));
    QVERIFY(!screen->keyPopup());
    QVERIFY(!screen->currentKey());

    // A finger sliding over the keys enters the one it leaves on.
    sendMouse(screen, QEvent::MouseButtonPress, centreOf(labelFor(screen, "W")));
    sendMouse(screen, QEvent::MouseMove, centreOf(labelFor(screen, "E")));
    QCOMPARE(static_cast<KeypadNotification*>(screen->keyPopup())->text(), QString("E"));
    sendMouse(screen, QEvent::MouseButtonRelease, centreOf(labelFor(screen, "E")));
    QTest::mouseClick(screen->btnSpace(), Qt::LeftButton);
    QCOMPARE(screen->text(), QString("QE "));
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QCOMPARE(screen->text(), QString("Q"));
}

void tst_Keypad::slideOffEntersNothing()
{
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    const QString before = screen->text();
    sendMouse(screen, QEvent::MouseButtonPress, centreOf(labelFor(screen, "K")));
    QVERIFY(screen->keyPopup());
    // Onto the title, and let go there.
    sendMouse(screen, QEvent::MouseMove, QPoint(160, 30));
    QVERIFY(!screen->keyPopup());
    QVERIFY(!screen->currentKey());
    sendMouse(screen, QEvent::MouseButtonRelease, QPoint(160, 30));
    QCOMPARE(screen->text(), before);
    // A press outside any key shows nothing.
    sendMouse(screen, QEvent::MouseButtonPress, QPoint(5, 200));
    QVERIFY(!screen->keyPopup());
    sendMouse(screen, QEvent::MouseButtonRelease, QPoint(5, 200));
    QCOMPARE(screen->text(), before);
}

void tst_Keypad::overlappingKeysFirstWins()
{
    useLayout(layout({keyXml('X', 'x', 100, 200, 40, 55), keyXml('Y', 'y', 120, 200, 40, 55)}));
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    restoreLayout();
    QVERIFY(screen);
    screen->getTextEditPointer()->clear();
    sendMouse(screen, QEvent::MouseButtonPress, QPoint(130, 220));
    sendMouse(screen, QEvent::MouseButtonRelease, QPoint(130, 220));
    QCOMPARE(screen->text(), QString("X"));
    QCOMPARE(screen->functionRowY(), 254);
}

void tst_Keypad::readSwitchNeverEntersTheField()
{
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    const QString before = screen->text();
    QTest::keyClick(screen->getTextEditPointer(), Qt::Key_Return);
    QCOMPARE(screen->text(), before);
}

namespace {
// Takes every other key and records what it saw.
class RecordingComposer : public KeypadComposer
{
public:
    explicit RecordingComposer(QStringList* seen)
        : m_seen(seen)
    {
    }
    bool keyPressed(const QString& text) override
    {
        *m_seen << text;
        return m_seen->size() % 2 == 1;
    }
    bool deletePressed() override
    {
        *m_seen << "<del>";
        return true;
    }
    void enterPressed() override { *m_seen << "<enter>"; }

private:
    QStringList* m_seen;
};
} // namespace

void tst_Keypad::composedLanguageHandsKeysToTheComposer()
{
    QStringList seen;
    QString code;
    JobKeypadScreen::setComposerFactory([&](JobKeypadScreen*, const QString& language) -> KeypadComposer* {
        code = language;
        return new RecordingComposer(&seen);
    });
    DataManager::instance()->setLanguageCode("ko");
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    restoreLayout();
    JobKeypadScreen::setComposerFactory(nullptr);
    QVERIFY(screen);
    QCOMPARE(code, QString("ko"));
    QVERIFY(screen->isMultilingual());
    // Enter comes in, shift goes, and the row moves a half key left.
    QVERIFY(screen->btnEnter()->isVisible());
    QVERIFY(!screen->btnShift()->isVisible());
    QCOMPARE(screen->btnSpace()->x(), 108 - 26);
    QCOMPARE(screen->btnEnter()->x(), 108 + 103 + 51 - 26);

    screen->getTextEditPointer()->clear();
    const QPoint g = centreOf(labelFor(screen, "G"));
    for (int i = 0; i < 2; ++i) {
        sendMouse(screen, QEvent::MouseButtonPress, g);
        sendMouse(screen, QEvent::MouseButtonRelease, g);
    }
    // The first was taken by the composer, the second left to the keypad.
    QCOMPARE(screen->text(), QString("G"));
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QTest::mouseClick(screen->btnEnter(), Qt::LeftButton);
    QCOMPARE(seen, (QStringList{"G", "G", "<del>", "<enter>"}));
    QCOMPARE(screen->text(), QString("G"));
}

void tst_Keypad::fixedKeypadPagesAndSignals()
{
    QWidget window;
    window.resize(320, 480);
    auto* pad = new Keypad(&window);
    pad->move(0, 150);
    window.show();
    QSignalSpy keys(pad, &Keypad::keyClicked);
    QSignalSpy deletes(pad, &Keypad::deleteClicked);

    // Letters first: rows of 7, 6, 7 and 6, the short rows half a key in.
    const auto& letters = pad->letters()->keyButtons();
    QCOMPARE(letters.size(), 26);
    QCOMPARE(letters[0]->geometry(), QRect(20, 33, 39, 47));
    QCOMPARE(letters[7]->pos(), QPoint(39, 85));
    QCOMPARE(letters[25]->text(), QString("Z"));
    QCOMPARE(letters[25]->pos(), QPoint(239, 189));
    QCOMPARE(pad->btnNumLetter()->text(), QString("123"));
    QVERIFY(pad->letters()->isVisible() && !pad->numbers()->isVisible());

    // The enlarged key stands over the held key, on the window.
    QTest::mousePress(letters[2], Qt::LeftButton);
    QLabel* shown = pad->letters()->notification();
    QVERIFY(shown && shown->isVisible());
    QCOMPARE(shown->parentWidget(), &window);
    QCOMPARE(shown->text(), QString("C"));
    QCOMPARE(shown->geometry().bottom() + 1, letters[2]->mapTo(&window, QPoint(0, 0)).y());
    QTest::mouseRelease(letters[2], Qt::LeftButton);
    QVERIFY(!pad->letters()->notification());
    QCOMPARE(keys.takeFirst().at(0).toString(), QString("C"));

    QTest::mouseClick(pad->btnNumLetter(), Qt::LeftButton);
    QCOMPARE(pad->btnNumLetter()->text(), QString("ABC"));
    QVERIFY(!pad->letters()->isVisible() && pad->numbers()->isVisible());
    const auto& numbers = pad->numbers()->keyButtons();
    QCOMPARE(numbers.size(), 10);
    QCOMPARE(numbers[4]->geometry(), QRect(114, 85, 93, 47));
    QCOMPARE(numbers[9]->text(), QString("0"));
    QCOMPARE(numbers[9]->pos(), QPoint(114, 189));
    QTest::mouseClick(numbers[9], Qt::LeftButton);
    QTest::mouseClick(pad->btnSpace(), Qt::LeftButton);
    QTest::mouseClick(pad->btnDelete(), Qt::LeftButton);
    QCOMPARE(keys.size(), 2);
    QCOMPARE(keys[0].at(0).toString(), QString("0"));
    QCOMPARE(keys[1].at(0).toString(), QString(" "));
    QCOMPARE(deletes.size(), 1);
}

// ---------------------------------------------------------------- name, free tag, notes

void tst_Keypad::fullNameGreysTheKeys()
{
    freshJob();
    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    QCOMPARE(screen->entryLength(), 20);
    screen->getTextEditPointer()->clear();
    const QPoint a = centreOf(labelFor(screen, "A"));
    for (int i = 0; i < 19; ++i) {
        sendMouse(screen, QEvent::MouseButtonPress, a);
        sendMouse(screen, QEvent::MouseButtonRelease, a);
    }
    QVERIFY(labelFor(screen, "A")->isEnabled());
    sendMouse(screen, QEvent::MouseButtonPress, a);
    sendMouse(screen, QEvent::MouseButtonRelease, a);
    QCOMPARE(screen->text().length(), 20);
    for (const auto& layer : screen->keys())
        for (KeyPadLabel* label : layer)
            QVERIFY(!label->isEnabled());
    QVERIFY(!screen->btnSpace()->isEnabled());
    QVERIFY(screen->btnDelete()->isEnabled());
    // A press on a grey key shows nothing and enters nothing.
    sendMouse(screen, QEvent::MouseButtonPress, a);
    QVERIFY(!screen->keyPopup());
    sendMouse(screen, QEvent::MouseButtonRelease, a);
    QCOMPARE(screen->text().length(), 20);
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QCOMPARE(screen->text().length(), 19);
    QVERIFY(labelFor(screen, "A")->isEnabled());
}

void tst_Keypad::nameRules()
{
    freshJob({}, "PANEL 7");
    const QString other = DataManager::instance()->getAllJobs().first().getDisplayName();
    QVERIFY(other != "PANEL 7");

    auto* screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    QVERIFY(screen);
    QCOMPARE(screen->title(), QString("Name"));
    QCOMPARE(screen->text(), QString("PANEL 7"));
    QCOMPARE(screen->getTextEditPointer()->textCursor().selectedText(), QString("PANEL 7"));

    // Blanks are empty.
    screen->getTextEditPointer()->setPlainText("   ");
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    NotificationPopup* popup = popupOf(screen);
    QVERIFY(popup);
    QCOMPARE(popup->headerText(), QString("Job Name cannot be empty"));
    QVERIFY(!screen->isClosing());
    // A second tap behind the first doesn't stack another refusal.
    screen->on_BtnNext_clicked();
    QCOMPARE(int(screen->popups().size()), 1);
    screen->onClosePopup(popup);

    // Another job's name shows red and is refused.
    screen->getTextEditPointer()->setPlainText(other);
    QVERIFY(screen->getTextEditPointer()->styleSheet().contains("rgb(200, 0, 0)"));
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    popup = popupOf(screen);
    QVERIFY(popup);
    QCOMPARE(popup->headerText(), QString("Job Name Already Exists"));
    QCOMPARE(popup->messageText(), QString("This job name already exists.  Please change the name to a unique name"));
    screen->onClosePopup(popup);

    // The own name is no clash and closes the screen.
    screen->getTextEditPointer()->setPlainText(" PANEL 7 ");
    QVERIFY(!screen->getTextEditPointer()->styleSheet().contains("rgb(200, 0, 0)"));
    QPointer<JobNameEditScreen> guard(screen);
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    QVERIFY(screen->popups().empty());
    QTRY_VERIFY(!guard);
    QCOMPARE(serverJob().getDisplayName(), QString("PANEL 7"));

    // A new name reaches the server, trimmed.
    screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    screen->getTextEditPointer()->setPlainText("  DOOR LEFT ");
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    QCOMPARE(serverJob().getDisplayName(), QString("DOOR LEFT"));

    // Back stores nothing.
    screen = open<JobNameEditScreen>(JOB_NAME_SCREEN_ID);
    screen->getTextEditPointer()->setPlainText("IGNORED");
    QTest::mouseClick(screen->btnBack(), Qt::LeftButton);
    QCOMPARE(serverJob().getDisplayName(), QString("DOOR LEFT"));
}

void tst_Keypad::freeTagAndNotesStoreTheirText()
{
    freshJob();
    auto* tag = open<JobTagFreeEditScreen>(JOB_TAGS_2_FREE_EDIT_SCREEN_ID);
    QVERIFY(tag);
    QCOMPARE(tag->entryLength(), 40);
    QCOMPARE(tag->getTextEditPointer()->height(), 78);
    QCOMPARE(tag->title(), DataManager::instance()->getTagStateName(TAG_STATE_2));
    // Anything goes, even a name the filter file doesn't know.
    tag->getTextEditPointer()->setPlainText(" Custom Model ");
    QTest::mouseClick(tag->btnNext(), Qt::LeftButton);
    QCOMPARE(serverJob().getTagData(TAG_STATE_2).defaultName(), QString("Custom Model"));

    auto* notes = open<JobFreeTextEditScreen>(JOB_FREE_TEXT_SCREEN_ID);
    QVERIFY(notes);
    QCOMPARE(notes->title(), QString("Notes"));
    notes->getTextEditPointer()->setPlainText("Bumper repaired, check orange peel");
    QTest::mouseClick(notes->btnNext(), Qt::LeftButton);
    QCOMPARE(serverJob().getNotes(), QString("Bumper repaired, check orange peel"));

    notes = open<JobFreeTextEditScreen>(JOB_FREE_TEXT_SCREEN_ID);
    QCOMPARE(notes->text(), QString("Bumper repaired, check orange peel"));
    notes->getTextEditPointer()->clear();
    QTest::mouseClick(notes->btnNext(), Qt::LeftButton);
    QCOMPARE(serverJob().getNotes(), QString());
}

// ---------------------------------------------------------------- tags

void tst_Keypad::tagKeysFollowTheMatches()
{
    freshJob();
    auto* screen = open<JobTagEditScreen>(JOB_TAGS_1_SCREEN_ID);
    QVERIFY(screen);
    QCOMPARE(screen->title(), DataManager::instance()->getTagStateName(TAG_STATE_1));
    // Empty: every make matches, the first two stand ready.
    QCOMPARE(screen->matches().size(), 6);
    QVERIFY(screen->btnLeft()->isVisible() && screen->btnMiddle()->isVisible());
    QCOMPARE(screen->btnLeft()->text(), QString("Ford"));
    QCOMPARE(screen->btnMiddle()->text(), QString("Volkswagen"));
    QVERIFY(screen->btnMore()->isVisible());
    QString alive;
    for (KeyPadLabel* label : screen->keys()[0])
        if (label->isEnabled())
            alive += label->text();
    QCOMPARE(alive, QString("RTFHVB")); // in keyboard order

    // One match: the left button alone.
    screen->getTextEditPointer()->setPlainText("Fo");
    QCOMPARE(screen->matches().size(), 1);
    QVERIFY(screen->btnLeft()->isVisible());
    QVERIFY(!screen->btnMiddle()->isVisible() && !screen->btnMore()->isVisible());
    QVERIFY(labelFor(screen, "R")->isEnabled());
    QVERIFY(!labelFor(screen, "F")->isEnabled());

    // No match: only Delete is left.
    screen->getTextEditPointer()->setPlainText("Fx");
    QVERIFY(screen->matches().isEmpty());
    for (const auto& layer : screen->keys())
        for (KeyPadLabel* label : layer)
            QVERIFY(!label->isEnabled());
    QVERIFY(!screen->btnSpace()->isEnabled());
    QVERIFY(screen->btnDelete()->isEnabled());
    QVERIFY(!screen->btnLeft()->isVisible());

    // A blank that continues a name is a key like the others.
    screen->getTextEditPointer()->setPlainText("");
    QTest::mouseClick(screen->btnLeft(), Qt::LeftButton);
    QCOMPARE(screen->text(), QString("Ford"));
    QVERIFY(!screen->getTextEditPointer()->styleSheet().contains("rgb(200, 0, 0)"));
    auto* colour = open<JobTagEditScreen>(JOB_TAGS_3_SCREEN_ID);
    colour->getTextEditPointer()->setPlainText("Z1");
    QVERIFY(colour->btnSpace()->isEnabled());
    QVERIFY(colour->getTextEditPointer()->styleSheet().contains("rgb(200, 0, 0)"));
}

void tst_Keypad::tagListOpensAndPicks()
{
    freshJob();
    auto* screen = open<JobTagEditScreen>(JOB_TAGS_1_SCREEN_ID);
    QVERIFY(screen);
    QTest::mouseClick(screen->btnMore(), Qt::LeftButton);
    QVERIFY(screen->isListOpen());
    QCOMPARE(screen->autoFillButtons().size(), 6);
    QCOMPARE(screen->autoFillButtons()[1]->x(), screen->btnMiddle()->x());
    QCOMPARE(screen->autoFillButtons()[2]->x(), screen->btnLeft()->x());
    // The keys under the list don't react.
    const QPoint under = centreOf(labelFor(screen, "T"));
    sendMouse(screen, QEvent::MouseButtonPress, under);
    QVERIFY(!screen->keyPopup());
    sendMouse(screen, QEvent::MouseButtonRelease, under);
    QCOMPARE(screen->text(), QString());
    // More again closes it; a pick fills the field and closes it too.
    QTest::mouseClick(screen->btnMore(), Qt::LeftButton);
    QVERIFY(!screen->isListOpen());
    QTest::mouseClick(screen->btnMore(), Qt::LeftButton);
    WordWrapButton* honda = screen->autoFillButtons()[5];
    QCOMPARE(honda->text(), QString("Honda"));
    QTest::mouseClick(honda, Qt::LeftButton);
    QCOMPARE(screen->text(), QString("Honda"));
    QVERIFY(!screen->isListOpen());
    QTRY_VERIFY(screen->findChildren<WordWrapButton*>(QRegularExpression("^autoFill")).isEmpty());
}

void tst_Keypad::tooManyMatchesLeaveMoreDead()
{
    freshJob();
    auto* screen = open<JobTagEditScreen>(JOB_TAGS_3_SCREEN_ID);
    QVERIFY(screen);
    QVERIFY(screen->matches().size() >= 15);
    QVERIFY(screen->btnMore()->isVisible());
    QVERIFY(!screen->btnMore()->isEnabled());
    screen->onBtnMoreClicked();
    QVERIFY(!screen->isListOpen());
    QVERIFY(screen->autoFillButtons().isEmpty());
}

void tst_Keypad::unknownTagIsRefused()
{
    freshJob({"Ford"});
    auto* screen = open<JobTagEditScreen>(JOB_TAGS_1_SCREEN_ID);
    QVERIFY(screen);
    QCOMPARE(screen->text(), QString("Ford"));
    screen->getTextEditPointer()->setPlainText("Fordson");
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    NotificationPopup* popup = popupOf(screen);
    QVERIFY(popup);
    QCOMPARE(popup->headerText(), QString("Tag Name Does Not Exist"));
    QVERIFY(!screen->isClosing());
    QCOMPARE(serverJob().getTagData(TAG_STATE_1).defaultName(), QString("Ford"));
}

void tst_Keypad::tagCascade()
{
    auto setTag = [this](SCREEN_ID_T id, const QString& value) {
        auto* screen = open<JobTagEditScreen>(id);
        QVERIFY(screen);
        screen->getTextEditPointer()->setPlainText(value);
        QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
        QVERIFY(screen->isClosing());
    };
    auto tags = [this] {
        const Job job = serverJob();
        return QStringList{job.getTagData(TAG_STATE_1).defaultName(), job.getTagData(TAG_STATE_2).defaultName(),
                           job.getTagData(TAG_STATE_3).defaultName()};
    };

    // The same first tag again keeps what hangs below it; another wipes it.
    freshJob({"Ford", "Focus", "Z1 Frozen White"});
    setTag(JOB_TAGS_1_SCREEN_ID, "Ford");
    QCOMPARE(tags(), (QStringList{"Ford", "Focus", "Z1 Frozen White"}));
    setTag(JOB_TAGS_1_SCREEN_ID, "Toyota");
    QCOMPARE(tags(), (QStringList{"Toyota", "", ""}));

    // A second tag fills in its parent.
    freshJob();
    setTag(JOB_TAGS_2_SCREEN_ID, "Focus");
    QCOMPARE(tags(), (QStringList{"Ford", "Focus", ""}));

    // A third tag on an empty job: the top-level parent goes into the second
    // tag's slot and the first stays empty. Tags travel under their filter's
    // name, so the server files the make where makes belong.
    freshJob();
    setTag(JOB_TAGS_3_SCREEN_ID, "J7 Magnetic Grey");
    QCOMPARE(tags(), (QStringList{"Ford", "", "J7 Magnetic Grey"}));

    // Clearing the first tag clears the others; clearing the second the third.
    freshJob({"Ford", "Focus", "Z1 Frozen White"});
    setTag(JOB_TAGS_2_SCREEN_ID, "");
    QCOMPARE(tags(), (QStringList{"Ford", "", ""}));
    freshJob({"Ford", "Focus", "Z1 Frozen White"});
    setTag(JOB_TAGS_1_SCREEN_ID, " ");
    QCOMPARE(tags(), (QStringList{"", "", ""}));
}

// ---------------------------------------------------------------- a new job

void tst_Keypad::newJobIsNamedAndTaggedOnTheKeypad()
{
    JobListScreen* home = m_master->findChild<JobListScreen*>();
    QVERIFY(home);
    QTRY_VERIFY(home->isActive() && home->isEnabled() && home->isReady());
    const int before = int(DataManager::instance()->getNumberOfJobs());
    QTest::mouseClick(home->findChild<QPushButton*>("BtnAddJob"), Qt::LeftButton);
    // The new job goes to targeting (a stand-in here); the job's summary
    // opens the text screens from there.
    QTRY_VERIFY_WITH_TIMEOUT(m_master->screenCount() == 2, 10000);
    auto* next = qobject_cast<DaddyPanel*>(m_master->currentScreen());
    QVERIFY(next && !qobject_cast<JobKeypadScreen*>(next));
    QCOMPARE(int(DataManager::instance()->getNumberOfJobs()), before + 1);

    auto tap = [](JobKeypadScreen* screen, const QString& keys) {
        for (const QChar c : keys) {
            if (c == ' ') {
                QTest::mouseClick(screen->btnSpace(), Qt::LeftButton);
                continue;
            }
            KeyPadLabel* key = labelFor(screen, QString(c));
            QVERIFY2(key && key->isEnabled(), qPrintable(QString(c)));
            sendMouse(screen, QEvent::MouseButtonPress, centreOf(key));
            sendMouse(screen, QEvent::MouseButtonRelease, centreOf(key));
        }
    };
    auto openFrom = [this](DaddyPanel* from, SCREEN_ID_T id) {
        from->GotoScreen(id);
        return qobject_cast<JobKeypadScreen*>(m_master->currentScreen());
    };

    JobKeypadScreen* name = openFrom(next, JOB_NAME_SCREEN_ID);
    QVERIFY(name);
    tap(name, "WING RF");
    QTest::mouseClick(name->btnNext(), Qt::LeftButton);
    QTRY_COMPARE(m_master->currentScreen(), static_cast<QWidget*>(next));

    auto* make = qobject_cast<JobTagEditScreen*>(openFrom(next, JOB_TAGS_1_SCREEN_ID));
    QVERIFY(make);
    tap(make, "TO");
    QCOMPARE(make->btnLeft()->text(), QString("Toyota"));
    QTest::mouseClick(make->btnLeft(), Qt::LeftButton);
    QTest::mouseClick(make->btnNext(), Qt::LeftButton);
    QTRY_COMPARE(m_master->currentScreen(), static_cast<QWidget*>(next));

    auto* model = qobject_cast<JobTagEditScreen*>(openFrom(next, JOB_TAGS_2_SCREEN_ID));
    QVERIFY(model);
    tap(model, "C");
    QTest::mouseClick(model->btnLeft(), Qt::LeftButton);
    const QString modelName = model->text();
    QVERIFY(!modelName.isEmpty());
    QTest::mouseClick(model->btnNext(), Qt::LeftButton);
    QTRY_COMPARE(m_master->currentScreen(), static_cast<QWidget*>(next));

    auto* notes = openFrom(next, JOB_FREE_TEXT_SCREEN_ID);
    QVERIFY(notes);
    tap(notes, "CLEAR COAT");
    QTest::mouseClick(notes->btnNext(), Qt::LeftButton);
    QTRY_COMPARE(m_master->currentScreen(), static_cast<QWidget*>(next));

    const Job job = serverJob();
    QCOMPARE(job.getDisplayName(), QString("WING RF"));
    QCOMPARE(job.getTagData(TAG_STATE_1).defaultName(), QString("Toyota"));
    QCOMPARE(job.getTagData(TAG_STATE_2).defaultName(), modelName);
    QCOMPARE(job.getNotes(), QString("CLEAR COAT"));
}

QTEST_MAIN(tst_Keypad)
#include "tst_keypad.moc"
