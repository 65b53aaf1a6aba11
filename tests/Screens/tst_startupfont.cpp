// The real ScreenMaster start-up, with the home screen from the real
// factory: the font it draws in comes from the language, not from the
// desktop's default, and the home screen stays usable when a screen it asks
// for does not come.

#include "GUIAPI/DataManager.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"

#include <QApplication>
#include <QFontInfo>
#include <QLabel>
#include <QPushButton>
#include <QtTest>

class TestStartupFont : public QObject
{
    Q_OBJECT

private:
    // The families actually used by the visible texts of the current screen.
    static QSet<QString> familiesOnScreen(ScreenMaster& master)
    {
        QSet<QString> families;
        QWidget* screen = master.currentScreen();
        if (!screen)
            return families;
        for (QLabel* label : screen->findChildren<QLabel*>()) {
            if (label->isVisibleTo(screen) && !label->text().isEmpty())
                families.insert(QFontInfo(label->font()).family());
        }
        for (QPushButton* button : screen->findChildren<QPushButton*>()) {
            if (button->isVisibleTo(screen) && !button->text().isEmpty())
                families.insert(QFontInfo(button->font()).family());
        }
        return families;
    }

private slots:
    void initTestCase()
    {
        // What a desktop gives a program before it chooses its own font.
        QApplication::setFont(QFont("DejaVu Sans", 10));
        StringTables::Init();
        DataManager::instance();
    }

    void homeScreenDrawsInTheLanguagesFont()
    {
        ScreenMaster master;
        master.show();
        QVERIFY(QTest::qWaitForWindowExposed(&master));
        const QString expected = QFontInfo(LocaleHelper::determineFontFromCountryCode("en")).family();
        QVERIFY(expected != "DejaVu Sans");
        const QSet<QString> families = familiesOnScreen(master);
        QVERIFY(!families.isEmpty());
        QVERIFY2(families == QSet<QString>{expected}, qPrintable(QStringList(families.values()).join(", ")));
    }

    void aLanguageChangeReachesScreensAlreadyBuilt()
    {
        ScreenMaster master;
        master.show();
        QVERIFY(QTest::qWaitForWindowExposed(&master));
        master.onLoadLanguage("ja");
        const QString japanese = QFontInfo(LocaleHelper::determineFontFromCountryCode("ja")).family();
        QVERIFY2(japanese.contains("CJK"), qPrintable(japanese)); // the installed CJK font, not a fallback
        QCOMPARE(familiesOnScreen(master), QSet<QString>{japanese});
        master.onLoadLanguage("en");
    }

    void homeStaysUsableWhenARequestedScreenDoesNotCome()
    {
        ScreenMaster master;
        master.show();
        QVERIFY(QTest::qWaitForWindowExposed(&master));
        QWidget* home = master.currentScreen();
        QVERIFY(home);
        // Settings disable the list while their screen is built.
        QVERIFY(QMetaObject::invokeMethod(home, "on_BtnSettings_clicked"));
        QTRY_VERIFY(master.currentScreen() != home || home->isEnabled());
        if (master.currentScreen() == home)
            QVERIFY(home->isEnabled());
        // The settings screen, where it exists, goes again.
        if (master.currentScreen() != home)
            master.onCloseCurrentScreen();
        QCOMPARE(master.currentScreen(), home);
        // A request for an id that names no screen at all.
        home->setEnabled(false);
        QVERIFY(!master.onAddScreenToStack(POPUPS_SCREEN_ID));
        QCOMPARE(master.currentScreen(), home);
        QVERIFY(home->isEnabled());
    }
};

QTEST_MAIN(TestStartupFont)
#include "tst_startupfont.moc"
