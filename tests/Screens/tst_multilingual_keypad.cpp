// Korean and Chinese on the job's keypad against the simulator: spellings
// typed on the keys become characters through the candidate strip, Enter
// commits them, and the job on the server carries them.

#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/JobEditScreens.h"
#include "Screens/JobKeypadScreen.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/MarigoldUIM.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "Utils/AudioPlayer.h"
#include "Widgets/MultilingualComposer.h"
#include "Widgets/MultilingualPopup.h"
#include "Widgets/UimButton.h"
#include "Widgets/XPushButton.h"

#include "AppShell.h"
#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/TestSupport.h"

#include <QFile>
#include <QLabel>
#include <QPlainTextEdit>
#include <QtTest>

namespace {

void sendMouse(QWidget* w, QEvent::Type type, const QPoint& pos)
{
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    const Qt::MouseButtons held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent event(type, pos, w->mapToGlobal(pos), button, held, Qt::NoModifier);
    QApplication::sendEvent(w, &event);
}

KeyPadLabel* labelFor(JobKeypadScreen* screen, QChar c)
{
    for (KeyPadLabel* label : screen->keys().at(screen->currentLayer()))
        if (label->text() == QString(c))
            return label;
    return nullptr;
}

} // namespace

class tst_MultilingualKeypad : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void init();

    void koreanNameReachesTheServer();
    void chineseNamesReachTheServer_data();
    void chineseNamesReachTheServer();
    void sevenCandidatesLeaveAnEmptyPage();
    void deleteInAComposition();
    void fullFieldGreysTheKeysDuringAComposition();
    void aTapInTheFieldEndsTheComposition();
    void englishKeypadHasNoComposer();

private:
    void freshJob();
    JobKeypadScreen* openName(const QString& code);
    // Taps the keys; a blank taps BtnSpace and '\n' BtnEnter.
    void tap(JobKeypadScreen* screen, const QString& keys);
    MultilingualComposer* composerOf(JobKeypadScreen* screen) const
    {
        return dynamic_cast<MultilingualComposer*>(screen->composer());
    }
    QString selected(JobKeypadScreen* screen) const
    {
        return screen->getTextEditPointer()->textCursor().selectedText();
    }

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

void tst_MultilingualKeypad::initTestCase()
{
    // The example filter file of the product is served as the instrument's.
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("uim-keypad"), 0.3,
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
}

void tst_MultilingualKeypad::cleanupTestCase()
{
    if (m_master)
        m_master->onGotoHomeScreen();
    DataManager::instance()->setLanguageCode("en");
    ScreenMaster::setScreenFactoryOverride(nullptr);
    delete m_master;
    m_master = nullptr;
}

void tst_MultilingualKeypad::init()
{
    m_master->onGotoHomeScreen();
    QCoreApplication::processEvents();
}

void tst_MultilingualKeypad::freshJob()
{
    DataManager* data = DataManager::instance();
    const unsigned int index = data->createNewJob();
    QVERIFY(index != 65535);
    data->setActiveJob(index);
    QVERIFY(data->refreshJobInfos());
}

JobKeypadScreen* tst_MultilingualKeypad::openName(const QString& code)
{
    DataManager::instance()->setLanguageCode(code);
    freshJob();
    auto* screen = qobject_cast<JobKeypadScreen*>(m_master->onAddScreenToStack(JOB_NAME_SCREEN_ID));
    QCoreApplication::processEvents();
    DataManager::instance()->setLanguageCode("en");
    if (screen)
        screen->getTextEditPointer()->clear();
    return screen;
}

void tst_MultilingualKeypad::tap(JobKeypadScreen* screen, const QString& keys)
{
    for (const QChar c : keys) {
        if (c == ' ') {
            QTest::mouseClick(screen->btnSpace(), Qt::LeftButton);
            continue;
        }
        if (c == '\n') {
            QTest::mouseClick(screen->btnEnter(), Qt::LeftButton);
            continue;
        }
        KeyPadLabel* key = labelFor(screen, c);
        QVERIFY2(key && key->isEnabled(), qPrintable(QString(c)));
        sendMouse(screen, QEvent::MouseButtonPress, key->geometry().center());
        sendMouse(screen, QEvent::MouseButtonRelease, key->geometry().center());
    }
}

void tst_MultilingualKeypad::koreanNameReachesTheServer()
{
    JobKeypadScreen* screen = openName("ko");
    QVERIFY(screen);
    QVERIFY(screen->isMultilingual());
    MultilingualComposer* composer = composerOf(screen);
    QVERIFY(composer);

    tap(screen, "HAN");
    QVERIFY(composer->popup());
    // The strip stands under the field, the spelling in the label.
    QCOMPARE(composer->popup()->geometry().top(), 107);
    QVERIFY(composer->popup()->isVisible());
    QCOMPARE(composer->popup()->strings().first(), QString::fromUtf8("한"));
    QCOMPARE(screen->multilingualBufferLabel()->text(), QString("HAN"));
    QCOMPARE(selected(screen), QString::fromUtf8("한"));
    tap(screen, "\nGUG\n");
    QVERIFY(!composer->popup());
    QVERIFY(screen->multilingualBufferLabel()->text().isEmpty());
    // A blank outside a composition is a blank, and digits stand as typed.
    tap(screen, " 7\n");
    QCOMPARE(screen->text(), QString::fromUtf8("한국 7"));

    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    QTRY_VERIFY(m_master->currentScreen() != screen);
    DataManager::instance()->refreshJobInfos();
    QCOMPARE(DataManager::instance()->getActiveJobObject().getDisplayName(), QString::fromUtf8("한국 7"));
}

void tst_MultilingualKeypad::chineseNamesReachTheServer_data()
{
    QTest::addColumn<QString>("code");
    QTest::addColumn<QString>("keys");
    QTest::addColumn<QString>("name");
    QTest::newRow("pinyin") << "zh_Hans" << "NI\nHAO\n" << QString::fromUtf8("你好");
    QTest::newRow("pinyin, second candidate") << "zh_Hans" << "SHI  \n" << QString::fromUtf8("是");
    // Names differ: the name screen refuses one that another job carries.
    QTest::newRow("bopomofo with tones") << "zh_Hant" << QString::fromUtf8("ㄏㄠˇ\nㄋㄧˇ\n") << QString::fromUtf8("好你");
}

void tst_MultilingualKeypad::chineseNamesReachTheServer()
{
    QFETCH(QString, code);
    QFETCH(QString, keys);
    QFETCH(QString, name);
    JobKeypadScreen* screen = openName(code);
    QVERIFY(screen && composerOf(screen));
    if (code == "zh_Hans" && keys.startsWith("SHI")) {
        // Space steps to the second candidate of the table's row.
        const QVector<QChar> row = MarigoldUIM::instance()->GetCharVector("shi");
        QVERIFY(row.size() > 2);
        name = QString(row.at(2));
    }
    tap(screen, keys);
    QCOMPARE(screen->text(), name);
    QTest::mouseClick(screen->btnNext(), Qt::LeftButton);
    QTRY_VERIFY(m_master->currentScreen() != screen);
    DataManager::instance()->refreshJobInfos();
    QCOMPARE(DataManager::instance()->getActiveJobObject().getDisplayName(), name);
}

void tst_MultilingualKeypad::sevenCandidatesLeaveAnEmptyPage()
{
    JobKeypadScreen* screen = openName("zh_Hans");
    QVERIFY(screen);
    MultilingualComposer* composer = composerOf(screen);
    // niang has 7 characters: with the spelling, 8 candidates in 2 pages.
    QCOMPARE(MarigoldUIM::instance()->GetCharVector("niang").size(), 7);
    tap(screen, "NIANG");
    MultilingualPopup* strip = composer->popup();
    QCOMPARE(strip->strings().size(), 8);
    QCOMPARE(strip->numPages(), 2);
    QVERIFY(strip->btnPageRight()->isVisible());
    tap(screen, "        ");
    QCOMPARE(strip->currentPage(), 1);
    QVERIFY(strip->buttons().isEmpty());
    QCOMPARE(screen->text(), QString("NIANG"));
    // Space on the empty page does nothing; the left arrow brings the
    // selection back and Enter commits.
    tap(screen, "  ");
    QCOMPARE(screen->text(), QString("NIANG"));
    QCOMPARE(composer->buffer(), QString("NIANG"));
    QTest::mouseClick(strip->btnPageLeft(), Qt::LeftButton);
    QVERIFY(strip->buttons().at(7)->isSelected());
    tap(screen, "\n");
    QCOMPARE(screen->text(), QString("NIANG"));
    QVERIFY(!screen->getTextEditPointer()->textCursor().hasSelection());
}

void tst_MultilingualKeypad::deleteInAComposition()
{
    JobKeypadScreen* screen = openName("ko");
    QVERIFY(screen);
    MultilingualComposer* composer = composerOf(screen);
    tap(screen, "GA\nNA");
    QCOMPARE(screen->text(), QString::fromUtf8("가나"));
    // Two letters: Delete shortens the spelling, the committed text stays.
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QCOMPARE(composer->buffer(), QString("N"));
    QCOMPARE(screen->text(), QString::fromUtf8("가ㄴ"));
    QCOMPARE(selected(screen), QString::fromUtf8("ㄴ"));
    // One letter: the strip and the selected candidate go together.
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QVERIFY(!composer->popup());
    QVERIFY(composer->buffer().isEmpty());
    QCOMPARE(screen->text(), QString::fromUtf8("가"));
    // Outside a composition Delete deletes.
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QCOMPARE(screen->text(), QString());
}

void tst_MultilingualKeypad::fullFieldGreysTheKeysDuringAComposition()
{
    JobKeypadScreen* screen = openName("ko");
    QVERIFY(screen);
    screen->setEntryLength(3);
    tap(screen, "GA\n");
    tap(screen, "N");
    QCOMPARE(screen->text(), QString::fromUtf8("가ㄴ"));
    QVERIFY(labelFor(screen, 'A')->isEnabled());
    tap(screen, "A");
    // The selected run counts: 3 characters and the keys grey.
    tap(screen, "\nH");
    QCOMPARE(screen->text(), QString::fromUtf8("가나ㅎ"));
    QVERIFY(!labelFor(screen, 'A')->isEnabled());
    QVERIFY(!screen->btnSpace()->isEnabled());
    QVERIFY(screen->btnEnter()->isEnabled());
    // A press on a greyed key enters nothing; Delete and Enter still work.
    const QPoint a = labelFor(screen, 'A')->geometry().center();
    sendMouse(screen, QEvent::MouseButtonPress, a);
    sendMouse(screen, QEvent::MouseButtonRelease, a);
    QCOMPARE(composerOf(screen)->buffer(), QString("H"));
    QTest::mouseClick(screen->btnDelete(), Qt::LeftButton);
    QCOMPARE(screen->text(), QString::fromUtf8("가나"));
    QVERIFY(labelFor(screen, 'A')->isEnabled());
}

void tst_MultilingualKeypad::aTapInTheFieldEndsTheComposition()
{
    JobKeypadScreen* screen = openName("zh_Hans");
    QVERIFY(screen);
    MultilingualComposer* composer = composerOf(screen);
    tap(screen, "HAO");
    QVERIFY(composer->popup());
    QPlainTextEdit* field = screen->getTextEditPointer();
    QTextCursor cursor = field->textCursor();
    cursor.setPosition(0);
    field->setTextCursor(cursor);
    QVERIFY(!composer->popup());
    QVERIFY(composer->buffer().isEmpty());
    QCOMPARE(screen->text(), QString::fromUtf8("好"));
    // The next spelling starts where the cursor now is.
    tap(screen, "NI\n");
    QCOMPARE(screen->text(), QString::fromUtf8("你好"));
}

void tst_MultilingualKeypad::englishKeypadHasNoComposer()
{
    JobKeypadScreen* screen = openName("en");
    QVERIFY(screen);
    QVERIFY(!screen->isMultilingual());
    QVERIFY(!screen->composer());
    tap(screen, "HAN");
    QCOMPARE(screen->text(), QString("HAN"));
}

QTEST_MAIN(tst_MultilingualKeypad)
#include "tst_multilingual_keypad.moc"
