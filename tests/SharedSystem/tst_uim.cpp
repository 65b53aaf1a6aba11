// The input tables: how a table's text is read, which table a language
// gets, and what the generated tables hold.
#include "SharedSystem/MarigoldUIM.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/XMLParser.h"

#include <QFile>
#include <QtTest>

class TestUim : public QObject
{
    Q_OBJECT

private slots:
    void cleanup() { MarigoldUIM::instance()->flush(); }

    void readsRowsAndSkipsEverythingElse()
    {
        const QString text = QString::fromUtf8(
            ";;; a comment (with parentheses) and \"quotes\"\n"
            "(define romaja-rule\n"
            "  '(\n"
            "  ((( \"g\"  \"a\" )) (\"가\"))\n"
            "  (((\"b\" \"a\" \"i\"))\t(\"百\" \"白\" \"百\"))\n"
            "  (((\"(\")) (\"（\"))\n"
            "  (((\"x\")) (\"(\"))\n"
            "  (((\"\\\\\")) (\"＼\"))\n"
            "  (((\"k\")) (\"一\"))\n"
            "  (((\"k\")) (\"二\" \"三\"))\n"
            "  ))\n");
        UIM_Hash table;
        // The rows with a parenthesis as symbol or candidate don't match.
        QCOMPARE(MarigoldUIM::parseTable(text, table), 5);
        QCOMPARE(table.size(), 4);
        QCOMPARE(table.value("ga"), QVector<QChar>({QChar(0xAC00)}));
        // Repeats inside a row are kept, in row order.
        QCOMPARE(table.value("bai"), QVector<QChar>({QChar(0x767E), QChar(0x767D), QChar(0x767E)}));
        QVERIFY(!table.contains("("));
        QVERIFY(!table.contains("x"));
        // The escape backslash stays in the key.
        QVERIFY(table.contains("\\\\"));
        // The last row of a repeated key wins.
        QCOMPARE(table.value("k"), QVector<QChar>({QChar(0x4E8C), QChar(0x4E09)}));
    }

    void keepsTheFirstUnitOfACandidate()
    {
        UIM_Hash table;
        // A longer candidate and one beyond the BMP give their first UTF-16 unit.
        MarigoldUIM::parseTable(QString::fromUtf8("(((\"a\")) (\"abc\" \"\xF0\xA5\x9C\x8C\" \"\"\"\" \"z\"))"), table);
        const QVector<QChar> a = table.value("a");
        QCOMPARE(a.size(), 3);
        QCOMPARE(a.at(0), QChar('a'));
        QVERIFY(a.at(1).isHighSurrogate());
        QCOMPARE(a.at(2), QChar('z'));
    }

    void loadsTheTableOfTheLanguage_data()
    {
        QTest::addColumn<QString>("code");
        QTest::addColumn<QString>("key");
        QTest::addColumn<QString>("first");
        QTest::addColumn<QString>("alsoHas");
        QTest::newRow("ko") << "ko" << "han" << QString::fromUtf8("한") << QString();
        QTest::newRow("ko, final cluster") << "ko" << "dalg" << QString::fromUtf8("닭") << QString();
        QTest::newRow("zh_Hans") << "zh_Hans" << "ni" << QString::fromUtf8("你") << QString();
        QTest::newRow("zh_Hans letter") << "zh_Hans" << "a" << "A" << QString::fromUtf8("啊");
        QTest::newRow("zh_Hant") << "zh_Hant" << QString::fromUtf8("ㄏㄠˇ") << QString::fromUtf8("好") << QString();
        QTest::newRow("zh_Hant toneless") << "zh_Hant" << QString::fromUtf8("ㄋㄧ") << QString() << QString::fromUtf8("你");
        QTest::newRow("zh_TW") << "zh_TW" << QString::fromUtf8("ㄏㄠˇ") << QString::fromUtf8("好") << QString();
    }

    void loadsTheTableOfTheLanguage()
    {
        QFETCH(QString, code);
        QFETCH(QString, key);
        QFETCH(QString, first);
        QFETCH(QString, alsoHas);
        MarigoldUIM* uim = MarigoldUIM::instance();
        QVERIFY(uim->initUIM(code));
        QVERIFY(uim->isUIM_initialized());
        const QVector<QChar> chars = uim->GetCharVector(key);
        QVERIFY2(!chars.isEmpty(), qPrintable(key));
        if (!first.isEmpty())
            QCOMPARE(QString(chars.first()), first);
        if (!alsoHas.isEmpty())
            QVERIFY(chars.contains(alsoHas.at(0)));
    }

    void otherLanguagesLoadNothing()
    {
        MarigoldUIM* uim = MarigoldUIM::instance();
        QVERIFY(uim->initUIM("ko"));
        // Japanese and the rest get no table, and the old one is gone.
        QVERIFY(!uim->initUIM("ja"));
        QVERIFY(!uim->isUIM_initialized());
        QVERIFY(uim->GetCharVector("han").isEmpty());
        QVERIFY(!uim->initUIM("en"));
        QVERIFY(!uim->initUIM(QString()));
    }

    void theTablesHoldWhatTheKeypadsType()
    {
        // Every candidate of the shipped tables is a whole character, and
        // every key is lower case: the keypad lowers what it looks up.
        for (const QString& code : {QString("ko"), QString("zh_Hans"), QString("zh_Hant")}) {
            QFile file(code == "ko" ? ":/Language/romaja.scm"
                                    : code == "zh_Hans" ? ":/Language/simplified_chinese.scm"
                                                        : ":/Language/traditional_chinese.scm");
            QVERIFY(file.open(QIODevice::ReadOnly));
            UIM_Hash table;
            const int rows = MarigoldUIM::parseTable(QString::fromUtf8(file.readAll()), table);
            QVERIFY2(rows > 400, qPrintable(code));
            for (auto it = table.cbegin(); it != table.cend(); ++it) {
                QCOMPARE(it.key(), it.key().toLower());
                QVERIFY2(!it.value().isEmpty(), qPrintable(it.key()));
                for (QChar c : it.value())
                    QVERIFY2(!c.isSurrogate(), qPrintable(it.key()));
            }
            // The keys of the keypad layout of the language spell table keys.
            QFile layout(Platform::devicePath(QString("/opt/GUI/Keypad/keypad_%1.xml").arg(code)));
            QVERIFY2(layout.open(QIODevice::ReadOnly), qPrintable(layout.fileName()));
            KeypadArray keys;
            XMLParser parser("/opt/Filter/FilterSchema.xsd", "/opt/Filter/TranslationSchema.xsd");
            QCOMPARE(parser.parseKeypadXML(layout.readAll(), keys), 0);
            int typed = 0;
            for (const KEYPAD_BUTTON_T& key : keys) {
                if (key.special || key.characterCap.isNull())
                    continue;
                const QString lowered = QString(key.characterCap).toLower();
                if (table.contains(lowered))
                    ++typed;
            }
            QVERIFY2(typed >= 26, qPrintable(code));
        }
    }
};

QTEST_MAIN(TestUim)
#include "tst_uim.moc"
