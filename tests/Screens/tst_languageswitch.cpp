// The language changed while screens stand: every screen already built,
// not just the next one, must show the new language's texts, and going
// back must give the English texts again. A text still English after the
// switch is one whose screen does not retranslate itself.

#include "GUIAPI/DataManager.h"
#include "Screens/ConfigMainScreen.h"
#include "Screens/JobListScreen.h"
#include "Screens/JobMeasureScreen.h"
#include "Screens/SampleViewScreen.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/KLabel.h"
#include "Widgets/SampleListSelectionItem.h"
#include "Widgets/SettingsLanguagePage.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsMainPage.h"
#include "Widgets/SettingsNavigator.h"
#include "Widgets/StatusBar.h"
#include "Widgets/WebSyncButton.h"

#include "SimServer.h"
#include "support/ProductHarness.h"
#include "support/Tour.h"
#include "support/TestSupport.h"
#include "support/TranslationFiles.h"

#include <QAbstractButton>
#include <QLabel>
#include <QTextDocument>
#include <QtTest>

namespace {

// English source -> translation, for the sources the language writes
// differently. Sources with the same spelling in both stay out: seeing
// them proves nothing.
QHash<QString, QString> translatedSources(const QString& code)
{
    QHash<QString, QString> map;
    QString error;
    const auto messages =
        TranslationFiles::read(QStringLiteral(MARIGOLD_LANGUAGE_DIR "/MarigoldGuiApp_%1.ts").arg(code), &error);
    for (const TranslationFiles::Message& m : messages) {
        const QString translation = m.translations.value(0);
        if (!translation.isEmpty() && translation != m.source && m.source.trimmed().size() > 1)
            map.insert(m.source, translation);
    }
    return map;
}

// What the operator can read on a screen: label and button texts, by the
// widget's path so that the same widget can be compared across languages.
QMap<QString, QString> visibleTexts(QWidget* screen)
{
    QMap<QString, QString> texts;
    int unnamed = 0;
    auto key = [&](QWidget* w) {
        QString path = w->objectName().isEmpty() ? QStringLiteral("#%1").arg(unnamed++) : w->objectName();
        for (QWidget* p = w->parentWidget(); p && p != screen; p = p->parentWidget())
            path.prepend(p->metaObject()->className() + QStringLiteral("/"));
        return path;
    };
    // The status bar's clock moves on by itself and says nothing in words.
    auto shown = [screen](QWidget* w) {
        for (QWidget* p = w; p && p != screen; p = p->parentWidget())
            if (qobject_cast<StatusBar*>(p))
                return false;
        return w->isVisibleTo(screen);
    };
    for (QLabel* label : screen->findChildren<QLabel*>()) {
        if (!shown(label))
            continue;
        auto* k = qobject_cast<KLabel*>(label);
        const QString text = k ? k->defaultText() : label->text();
        if (!text.trimmed().isEmpty() && !Qt::mightBeRichText(text))
            texts.insert(key(label), text);
    }
    for (QAbstractButton* button : screen->findChildren<QAbstractButton*>()) {
        if (shown(button) && !button->text().trimmed().isEmpty())
            texts.insert(key(button), button->text());
    }
    return texts;
}

} // namespace

class tst_LanguageSwitch : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void cleanupTestCase();
    void cleanup();
    void builtScreensFollowTheLanguageAndComeBack_data();
    void builtScreensFollowTheLanguageAndComeBack();

private:
    QList<QWidget*> screens() const;
    void switchTo(const QString& code);

    Sim::ServerThread m_sim;
    ScreenMaster* m_master = nullptr;
};

void tst_LanguageSwitch::initTestCase()
{
    QVERIFY(ProductHarness::startSimulatorAndApplication(m_sim, QStringLiteral("languageswitch")));
    UserParams::setDisplayEditFreeText(true);
    m_master = new ScreenMaster;
    QVERIFY(ProductHarness::showHome(m_master));

    // A stack as an operator builds it: the list, a job's summary, a
    // reading's results, the job's name on the keypad, and the settings over
    // them all.
    DataManager* data = DataManager::instance();
    const unsigned int job = data->findJobByName(QStringLiteral("Job 1"));
    QVERIFY(job != NO_INDEX);
    data->setActiveJob(job);
    m_master->onAddScreenToStack(JOB_MEASURE_SCREEN_ID);
    JobMeasureScreen* summary = m_master->findChild<JobMeasureScreen*>();
    QVERIFY(summary);
    QTRY_VERIFY_WITH_TIMEOUT(!summary->isLoading(), 10000);
    // The send row, whose text is the summary's own, comes with the Wi-Fi.
    QTRY_VERIFY_WITH_TIMEOUT(summary->findChild<WebSyncButton*>()->isVisibleTo(summary), 10000);
    const QList<SampleListSelectionItem*> rows = summary->findChildren<SampleListSelectionItem*>();
    QVERIFY(!rows.isEmpty());
    rows.first()->click();
    QTRY_VERIFY_WITH_TIMEOUT(m_master->findChild<SampleViewScreen*>(), 5000);
    m_master->onAddScreenToStack(JOB_NAME_SCREEN_ID);
    m_master->onAddScreenToStack(CONFIG_MAIN_SCREEN_ID);
    QTRY_COMPARE_WITH_TIMEOUT(m_master->screenCount(), 5, 5000);
    // In the settings, the page the language is picked on.
    auto* settings = qobject_cast<ConfigMainScreen*>(m_master->currentScreen());
    QVERIFY(settings);
    auto* main = qobject_cast<SettingsMainPage*>(settings->navigator()->pageAt(0));
    QVERIFY(main);
    main->onSettingSelected(int(SETTING_LANGUAGE));
    QTRY_VERIFY(qobject_cast<SettingsLanguagePage*>(settings->navigator()->topPage()));
    QTRY_VERIFY(!settings->navigator()->isAnimating());
    QTest::qWait(300);
}

void tst_LanguageSwitch::cleanupTestCase()
{
    if (m_master)
        switchTo(QStringLiteral("en"));
    delete m_master;
    m_master = nullptr;
}

void tst_LanguageSwitch::cleanup()
{
    // A failed case must not leave the next one starting in its language.
    if (UserParams::getLanguageCode() != QLatin1String("en"))
        switchTo(QStringLiteral("en"));
}

QList<QWidget*> tst_LanguageSwitch::screens() const
{
    QList<QWidget*> list;
    for (int i = 0; i < m_master->screenCount(); ++i)
        list << m_master->screenAt(i);
    return list;
}

// As the operator does it: a tap on the language's row of the settings.
void tst_LanguageSwitch::switchTo(const QString& code)
{
    auto* settings = qobject_cast<ConfigMainScreen*>(m_master->currentScreen());
    auto* page = settings ? qobject_cast<SettingsLanguagePage*>(settings->navigator()->topPage()) : nullptr;
    QVERIFY(page);
    for (auto* row : page->findChildren<SettingsListSelectionCheckableItem*>()) {
        if (row->getParam() == code) {
            QTest::mouseClick(row, Qt::LeftButton);
            QTRY_COMPARE(UserParams::getLanguageCode(), code);
            // The change reaches the application as a posted event, which
            // posts one to each window: deliver both rounds before reading,
            // however slow the machine.
            for (int round = 0; round < 3; ++round)
                QCoreApplication::sendPostedEvents(nullptr, QEvent::LanguageChange);
            QTest::qWait(100);
            return;
        }
    }
    QFAIL(qPrintable("no row for " + code));
}

void tst_LanguageSwitch::builtScreensFollowTheLanguageAndComeBack_data()
{
    QTest::addColumn<QString>("code");
    for (const QString& code : Tour::productLanguages()) {
        if (code != QLatin1String("en"))
            QTest::newRow(qPrintable(code)) << code;
    }
}

void tst_LanguageSwitch::builtScreensFollowTheLanguageAndComeBack()
{
    QFETCH(QString, code);
    const QHash<QString, QString> translated = translatedSources(code);
    QVERIFY2(translated.size() > 200, qPrintable(QString::number(translated.size())));
    // The language page names each language in itself, whatever is loaded.
    QSet<QString> ownNames;
    for (const TAG_ITEM_T& language : DataManager::instance()->getLanguagesInstalled())
        ownNames << language.tagText;
    QVERIFY(ownNames.contains(QStringLiteral("English")));

    QList<QMap<QString, QString>> english;
    for (QWidget* screen : screens())
        english << visibleTexts(screen);

    switchTo(code);
    QCOMPARE(QCoreApplication::translate("StringTables", "English"), translated.value(QStringLiteral("English")));
    QStringList untouched;
    QStringList stillEnglish;
    const QList<QWidget*> built = screens();
    for (int i = 0; i < built.size(); ++i) {
        const QMap<QString, QString> now = visibleTexts(built.at(i));
        int changed = 0;
        for (auto it = now.cbegin(); it != now.cend(); ++it) {
            if (english.at(i).value(it.key()) != it.value())
                ++changed;
            if (translated.contains(it.value()) && !ownNames.contains(it.value()))
                stillEnglish << QStringLiteral("%1: %2 \"%3\"")
                                    .arg(built.at(i)->metaObject()->className(), it.key(), it.value());
        }
        // A screen whose English texts the language writes differently
        // (not "Name", which German spells the same) must show a change.
        bool translatable = false;
        for (const QString& text : english.at(i))
            translatable = translatable || translated.contains(text);
        if (translatable && changed == 0)
            untouched << built.at(i)->metaObject()->className();
    }
    QVERIFY2(stillEnglish.isEmpty(), qPrintable(stillEnglish.join('\n')));
    // Each language is still named in its own script's font.
    for (auto* row : m_master->findChildren<SettingsListSelectionCheckableItem*>()) {
        const QString family = QFontInfo(LocaleHelper::determineFontFromCountryCode(row->getParam())).family();
        for (QLabel* label : row->findChildren<QLabel*>()) {
            if (label->text() == row->getText())
                QVERIFY2(QFontInfo(label->font()).family() == family,
                         qPrintable(row->getText() + ": " + QFontInfo(label->font()).family()));
        }
    }
    QVERIFY2(untouched.isEmpty(), qPrintable(untouched.join(", ")));

    switchTo(QStringLiteral("en"));
    for (int i = 0; i < built.size(); ++i) {
        const QMap<QString, QString> back = visibleTexts(built.at(i));
        for (auto it = english.at(i).cbegin(); it != english.at(i).cend(); ++it) {
            QVERIFY2(back.value(it.key()) == it.value(),
                     qPrintable(QStringLiteral("%1: %2 \"%3\" came back as \"%4\"")
                                    .arg(built.at(i)->metaObject()->className(), it.key(), it.value(),
                                         back.value(it.key()))));
        }
    }
}

QTEST_MAIN(tst_LanguageSwitch)
#include "tst_languageswitch.moc"
