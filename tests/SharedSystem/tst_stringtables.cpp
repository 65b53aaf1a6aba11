// Enum to text tables (translated and fixed) and the font choice by locale.
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/StringTables.h"

#include <QFontDatabase>
#include <QTranslator>
#include <QtTest>

namespace {

// Stands in for a loaded .qm file.
class GermanTables : public QTranslator
{
public:
    QString translate(const char* context, const char* sourceText, const char*, int) const override
    {
        if (QByteArray(context) != "StringTables")
            return QString();
        const QByteArray text(sourceText);
        if (text == "English")
            return QStringLiteral("Englisch");
        if (text == "Diffuse")
            return QStringLiteral("Diffus");
        if (text == "45%1")
            return QStringLiteral("45 %1");
        return QString();
    }
    bool isEmpty() const override { return false; }
};

} // namespace

class TestStringTables : public QObject
{
    Q_OBJECT

private slots:
    void initTestCase() { StringTables::Init(); }

    void lookUpByIdAndByText()
    {
        const QString degree(QChar(176));
        QCOMPARE(getStringFromList(99, LANGUAGE_TABLE), QString("UNKNOWN"));
        QCOMPARE(getStringFromList(0, STRING_LOOKUP_TABLE_T(42)), QString("UNKNOWN"));
        QCOMPARE(getStringFromList(8, LANGUAGE_TABLE), QString("Chinese Simplified"));
        QCOMPARE(getStringFromList(IMAGE_45, IMAGE_ANGLE_TABLE), "45" + degree);
        QCOMPARE(getStringFromList(REFL_D15_80, ANGLE_TABLE), "80" + degree);
        QCOMPARE(getStringFromList(COLOR_ILLUM_OBS_D65_10, ILLUM_OBS_TABLE), "D65/10" + degree);
        QCOMPARE(getStringFromList(COLOR_ILLUM_OBS_F12_10, ILLUM_OBS_TABLE), "F12/10" + degree);
        QCOMPARE(getStringFromList(MODEL_REFINISH_ALDER, MODEL_TYPES_TABLE), QString("ALDER"));
        QCOMPARE(getStringFromList(JOB_AVG_MODE_SMC, JOB_AVERAGING_MODES_TABLE), QString("SMC m:n"));
        QCOMPARE(getStringFromList(SELF_TEST_DEVICE_LIFTED, SELF_TEST_TYPES_COMPLETE_TABLE), QString("Lifted Complete"));
        QCOMPARE(getStringFromList(IMAGE_DIFFUSE, IMAGE_FROM_SERVER_ANGLE_TABLE), QString("r15d"));
        QCOMPARE(getStringFromList(REFL_D45_110, ANGLE_FROM_SERVER_TABLE), QString("r45as110"));

        // The server's names compare without regard to case.
        QCOMPARE(getValueFromList("R15AS45", IMAGE_FROM_SERVER_ANGLE_TABLE), 3);
        QCOMPARE(getValueFromList("r15as-15", ANGLE_FROM_SERVER_TABLE), int(REFL_D15_NEG_15));
        QCOMPARE(getValueFromList("r15as-15", IMAGE_FROM_SERVER_ANGLE_TABLE), int(IMAGE_NEG_15));
        // The d45 and d15 -15 degree rows read alike: the first wins. Without
        // the degree sign nothing is found.
        QCOMPARE(getValueFromList("-15" + degree, ANGLE_TABLE), int(REFL_D45_NEG_15));
        QCOMPARE(getValueFromList("-15", ANGLE_TABLE), -1);
        QCOMPARE(getValueFromList("r15d", STRING_LOOKUP_TABLE_T(-1)), -1);
    }

    void tablesFollowTheLanguageOnceRebuilt()
    {
        GermanTables german;
        QCoreApplication::installTranslator(&german);
        // The rows are stored translated: nothing changes until the rebuild.
        QCOMPARE(getStringFromList(0, LANGUAGE_TABLE), QString("English"));
        reTranslateStringTables();
        QCOMPARE(getStringFromList(0, LANGUAGE_TABLE), QString("Englisch"));
        QCOMPARE(getStringFromList(IMAGE_DIFFUSE, IMAGE_ANGLE_TABLE), QString("Diffus"));
        QCOMPARE(getStringFromList(IMAGE_45, IMAGE_ANGLE_TABLE), "45 " + QString(QChar(176)));
        QCOMPARE(getValueFromList("DIFFUS", IMAGE_ANGLE_TABLE), int(IMAGE_DIFFUSE));
        // What the server sends is never translated.
        QCOMPARE(getStringFromList(IMAGE_DIFFUSE, IMAGE_FROM_SERVER_ANGLE_TABLE), QString("r15d"));

        QCoreApplication::removeTranslator(&german);
        reTranslateStringTables();
        QCOMPARE(getStringFromList(0, LANGUAGE_TABLE), QString("English"));
    }

    void fontByLanguage_data()
    {
        QTest::addColumn<QString>("code");
        QTest::addColumn<QString>("family");
        QTest::newRow("simplified") << "zh_Hans" << "Noto Sans Mono CJK SC Regular";
        QTest::newRow("china") << "zh_CN" << "Noto Sans Mono CJK SC Regular";
        QTest::newRow("traditional") << "zh_Hant" << "Noto Sans Mono CJK TC Regular";
        QTest::newRow("taiwan") << "zh_TW" << "Noto Sans Mono CJK TC Regular";
        QTest::newRow("korean") << "ko" << "Noto Sans Mono CJK KR Regular";
        QTest::newRow("thai") << "th" << "Noto Sans Thai Condensed";
        QTest::newRow("japanese") << "ja" << "Noto Sans Mono CJK JP Regular";
    }

    void fontByLanguage()
    {
        QFETCH(QString, code);
        QFETCH(QString, family);
        QCOMPARE(LocaleHelper::fontFamilyForCountryCode(code), family);
        QCOMPARE(LocaleHelper::determineFontFromCountryCode(code).family(), family);
    }

    void latinScriptsTakeTheCondensedFace()
    {
        const bool roboto = QFontDatabase().families().contains("Roboto Condensed");
        const QString expected = roboto ? "Roboto Condensed" : "Liberation Sans Narrow";
        for (const char* code : {"en", "de", "fr", "es", "it", "pt", ""})
            QCOMPARE(LocaleHelper::fontFamilyForCountryCode(code), expected);
    }
};

QTEST_MAIN(TestStringTables)
#include "tst_stringtables.moc"
