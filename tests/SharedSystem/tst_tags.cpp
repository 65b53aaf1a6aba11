// The filter tree and its translations, the checks on filter names, the tag
// look-ups, and the keypad layout files.
#include "SharedSystem/Platform.h"
#include "SharedSystem/Tags.h"
#include "SharedSystem/XMLParser.h"

#include <QFile>
#include <QTemporaryDir>
#include <QtTest>

namespace {

QByteArray readFile(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

QByteArray exampleFilter() { return readFile(Platform::devicePath(FILTER_XML_PATH)); }
QByteArray exampleTranslation() { return readFile(Platform::devicePath(FILTER_TRANSLATION_XML_PATH)); }

QByteArray filters(const QByteArray& body)
{
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<Filters ContentVersion=\"1\">" + body + "</Filters>";
}

TAG_ENTRY_DATA_T named(const QString& name)
{
    TAG_ENTRY_DATA_T entry;
    entry.setDefaultName(name);
    return entry;
}

QStringList names(const TagEntryList& entries)
{
    QStringList out;
    for (const TAG_ENTRY_DATA_T& entry : entries)
        out << entry.defaultName();
    return out;
}

QStringList captured;
void capture(QtMsgType, const QMessageLogContext&, const QString& text)
{
    captured << text;
}

} // namespace

class TestTags : public QObject
{
    Q_OBJECT

private slots:
    void exampleFilesValidateAgainstTheirSchemas()
    {
        const QByteArray filter = exampleFilter();
        const QByteArray translation = exampleTranslation();
        QVERIFY(!filter.isEmpty());
        QVERIFY(!translation.isEmpty());
        XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
        QCOMPARE(parser.filterSchema(), Platform::devicePath(FILTER_SCHEMA_PATH));
        QVERIFY(parser.validateXML(filter, parser.filterSchema()));
        QVERIFY(parser.validateXML(translation, parser.translationSchema()));
        QVERIFY(!parser.validateXML(translation, parser.filterSchema()));
        QCOMPARE(testTagXML(filter), 0);
        QCOMPARE(testTagLanguageXML(translation), 0);

        // The schemas built into the program say the same.
        XMLParser builtIn("/opt/Filter/none.xsd", "/opt/Filter/none.xsd");
        QCOMPARE(builtIn.filterSchema(), QString(":/etc/FilterSchema.xsd"));
        QCOMPARE(builtIn.translationSchema(), QString(":/etc/TranslationSchema.xsd"));
        QVERIFY(builtIn.validateXML(filter, builtIn.filterSchema()));
        QVERIFY(builtIn.validateXML(translation, builtIn.translationSchema()));
        QCOMPARE(readFile(":/etc/FilterSchema.xsd"), readFile(Platform::devicePath(FILTER_SCHEMA_PATH)));
        QCOMPARE(readFile(":/etc/TranslationSchema.xsd"), readFile(Platform::devicePath(TRANSLATION_SCHEMA_PATH)));
        QVERIFY(!builtIn.validateXML(filter, "/opt/Filter/none.xsd"));
    }

    void exampleTreeLoadsWithTranslations()
    {
        Tags tags;
        QVERIFY(!tags.hasTags());
        QVERIFY(tags.setTagsArray(exampleFilter(), exampleTranslation()));
        QVERIFY(tags.hasTags());
        QCOMPARE(tags.getNumberOfStates(), 3);
        QCOMPARE(tags.getFilterName(0, "default"), QString("Make"));
        QCOMPARE(tags.getFilterName(1, "de"), QString("Modell"));
        QCOMPARE(tags.getFilterName(2, "ja"), QString("カラーコード"));
        QCOMPARE(tags.getFilterName(2, "xx"), QString("Colour Code"));
        QCOMPARE(tags.getFilterName(3, "default"), QString());
        QCOMPARE(int(tags.getRules()), 3);

        const TagEntryList makes = tags.getEntryDatasForState(0);
        QVERIFY(makes.size() >= 5);
        QCOMPARE(makes.first().defaultName(), QString("Ford"));
        QCOMPARE(makes.first().filterName, QString("Make"));
        // The search below each make keeps the filter found last: with a
        // colour filter under every model, the state lists the colours of
        // each make's last model (3 each).
        QCOMPARE(tags.getEntryDatasForState(2).size(), 18);

        bool translatedColour = false;
        for (const TAG_ENTRY_DATA_T& colour : tags.getEntryDatasForState(2)) {
            QCOMPARE(colour.filterName, QString("Colour Code"));
            QCOMPARE(colour.displayName, colour.defaultName());
            translatedColour = translatedColour || colour.nameHash.value("fr").startsWith(colour.defaultName().section(' ', 0, 0));
        }
        QVERIFY(translatedColour);
    }

    void filterNamesThatWouldCollideWithJobTags_data()
    {
        QTest::addColumn<QByteArray>("body");
        QTest::addColumn<int>("result");
        QTest::newRow("ends in Id") << QByteArray("<Filter Name=\"PaintId\"/>") << TAG_XML_NAME_ENDS_ID;
        QTest::newRow("Display") << QByteArray("<Filter Name=\"Display\"/>") << TAG_XML_NAME_STARTS_DISPLAY;
        QTest::newRow("DisplayName") << QByteArray("<Filter Name=\"DisplayName\"/>") << TAG_XML_NAME_IS_DISPLAYNAME;
        QTest::newRow("DisplayNotes") << QByteArray("<Filter Name=\"DisplayNotes\"/>") << TAG_XML_NAME_IS_DISPLAYNOTES;
        QTest::newRow("deep and ORed")
            << QByteArray("<Filter Name=\"Make\"><Entry Id=\"a\" Name=\"A\"><Filter Name=\"DisplayColour\"/>"
                          "<Filter Name=\"ModelId\"/></Entry></Filter>")
            << (TAG_XML_NAME_STARTS_DISPLAY | TAG_XML_NAME_ENDS_ID);
        QTest::newRow("entry called DisplayName")
            << QByteArray("<Filter Name=\"Make\"><Entry Id=\"DisplayNameId\" Name=\"DisplayName\"/></Filter>") << 0;
        QTest::newRow("lower-case id") << QByteArray("<Filter Name=\"Paid\"/>") << 0;
        QTest::newRow("schema") << QByteArray("<Filter/>") << 1;
    }

    void filterNamesThatWouldCollideWithJobTags()
    {
        QFETCH(QByteArray, body);
        QFETCH(int, result);
        QCOMPARE(testTagXML(filters(body)), result);
    }

    void refusedFileKeepsTheOldTree()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(exampleFilter(), QByteArray()));
        QVERIFY(!tags.setTagsArray(filters("<Filter Name=\"ColourId\"/>"), QByteArray()));
        QVERIFY(!tags.setTagsArray(QByteArray(), QByteArray()));
        QCOMPARE(tags.getFilterName(0, "default"), QString("Make"));
        QCOMPARE(tags.getEntryDatasForState(0).first().defaultName(), QString("Ford"));
    }

    void translationFileProblemsAreLoggedUnlessEmpty()
    {
        Tags tags;
        captured.clear();
        QtMessageHandler previous = qInstallMessageHandler(capture);
        const bool emptyOk = tags.setTagsArray(exampleFilter(), QByteArray());
        const QStringList afterEmpty = captured;
        const bool brokenOk = tags.setTagsArray(exampleFilter(), "<Tags><Tag Name=\"Make\">");
        qInstallMessageHandler(previous);

        QVERIFY(emptyOk && brokenOk);
        QVERIFY(afterEmpty.isEmpty());
        QVERIFY(captured.contains("No translation file being used.  Either empty or invalid formatting"));
        // Names fall back to the file's own.
        QCOMPARE(tags.getFilterName(0, "de"), QString("Make"));
    }

    void sameFilterInTwoPlacesIsOneState()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(filters("<Filter Name=\"Make\"><Entry Id=\"f\" Name=\"Ford\"/></Filter>"
                                          "<Filter Name=\"Make\"><Entry Id=\"t\" Name=\"Toyota\"/></Filter>"),
                                  QByteArray()));
        QCOMPARE(tags.getNumberOfStates(), 1);
        QCOMPARE(names(tags.getEntryDatasForState(0)), QStringList({"Ford", "Toyota"}));
        QCOMPARE(int(tags.getRules()), int(TAG_RULE_NARROW_SECOND));
    }

    void threeTopLevelFiltersDoNotNarrow()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(filters("<Filter Name=\"Make\"><Entry Id=\"f\" Name=\"Ford\"/></Filter>"
                                          "<Filter Name=\"Model\"><Entry Id=\"m1\" Name=\"Focus\"/>"
                                          "<Entry Id=\"m2\" Name=\"Corolla\"/></Filter>"
                                          "<Filter Name=\"Colour\"><Entry Id=\"c\" Name=\"Blue\"/></Filter>"),
                                  QByteArray()));
        QCOMPARE(int(tags.getRules()), 0);
        QCOMPARE(tags.getFilterName(3, "default"), QString());
        QCOMPARE(names(tags.getSmartEntryDatasForState(1, named("Ford"), named(""))),
                 QStringList({"Focus", "Corolla"}));
        QVERIFY(tags.getSmartEntryDatasForState(3, named("Ford"), named("")).isEmpty());
    }

    void smartNarrowingFollowsTheFirstTags()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(exampleFilter(), exampleTranslation()));
        const QStringList fordModels = names(tags.getSmartEntryDatasForState(1, named("Ford"), named("")));
        QCOMPARE(fordModels, QStringList({"Focus", "Fiesta", "Transit"}));
        QCOMPARE(tags.getSmartEntryDatasForState(1, named("Nobody"), named("")).size(),
                 tags.getEntryDatasForState(1).size());

        const QStringList focusColours = names(tags.getSmartEntryDatasForState(2, named("Ford"), named("Focus")));
        QCOMPARE(focusColours.size(), 4);
        QVERIFY(focusColours.contains("Z1 Frozen White"));
        // Only the first make is ever narrowed to its models' colours.
        QCOMPARE(tags.getSmartEntryDatasForState(2, named("Volkswagen"), named("Golf")).size(),
                 tags.getEntryDatasForState(2).size());
        QCOMPARE(tags.getSmartEntryDatasForState(0, named("Ford"), named("Focus")).size(),
                 tags.getEntryDatasForState(0).size());
    }

    void parentOfAnEntryIsItsTopLevelEntry()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(exampleFilter(), exampleTranslation()));
        TAG_ENTRY_DATA_T golf;
        for (const TAG_ENTRY_DATA_T& model : tags.getEntryDatasForState(1)) {
            if (model.defaultName() == "Golf")
                golf = model;
        }
        QCOMPARE(tags.getParentFilterTag(golf).defaultName(), QString("Volkswagen"));

        TAG_ENTRY_DATA_T stranger = golf;
        stranger.id = "nothing";
        QCOMPARE(tags.getParentFilterTag(stranger).defaultName(), QString());
        QVERIFY(tags.getParentFilterTag(stranger).id.isEmpty());
    }

    void lookUpByPrefix()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(exampleFilter(), exampleTranslation()));
        // The entry list forms upper-case both sides ...
        QCOMPARE(names(tags.autoLookup("fo")), QStringList({"Ford", "Focus"}));
        QCOMPARE(names(tags.autoLookup(1, "fo")), QStringList({"Focus"}));
        QCOMPARE(names(tags.autoLookupSmart(1, "f", named("Ford"), named(""))), QStringList({"Focus", "Fiesta"}));
        // ... the name list forms only the names.
        QVERIFY(tags.autoLookupStringList("fo").isEmpty());
        QCOMPARE(tags.autoLookupStringList("FO"), QStringList({"Ford", "Focus"}));
        QVERIFY(tags.autoLookupStringList(0, "to").isEmpty());
        QCOMPARE(tags.autoLookupStringList(0, "TO"), QStringList({"Toyota"}));
        // The same colour under several models is named once.
        const QStringList whites = tags.autoLookupStringList(2, "Z1");
        QCOMPARE(whites, QStringList({"Z1 Frozen White"}));
        QCOMPARE(tags.autoLookup(2, "Z1").size(), 1);
        QCOMPARE(tags.autoLookupSmart(2, "Z1", named("Ford"), named("Fiesta")).size(), 1);
        QCOMPARE(tags.autoLookupStringList(2, "F", named("Ford"), named("Focus")), QStringList());
        QCOMPARE(tags.autoLookupSmartStringList(2, "J7", named("Ford"), named("Focus")), QStringList({"J7 Magnetic Grey"}));
    }

    void tagNamesExist()
    {
        Tags tags;
        QVERIFY(tags.setTagsArray(exampleFilter(), exampleTranslation()));
        QVERIFY(tags.doesTagNameExist("  Ford "));
        QVERIFY(tags.doesTagNameExist("Colour Code"));
        QVERIFY(!tags.doesTagNameExist("ford"));
        QVERIFY(tags.doesTagNameExist(1, "Civic"));
        QVERIFY(!tags.doesTagNameExist(0, "Civic"));
        QVERIFY(!tags.doesTagNameExist(5, "Civic"));
    }

    void digKeepsTheResultOfTheLastBranch()
    {
        // A find in an earlier branch is overwritten by a later miss, but
        // what was found stays copied out.
        TAG_ENTRY_T top;
        TAG_FILTER_T level;
        level.name = "Model";
        TAG_ENTRY_T hit;
        TAG_FILTER_T wanted;
        wanted.name = "Colour";
        wanted.entries.resize(2);
        hit.filters.push_back(wanted);
        level.entries.push_back(hit);
        level.entries.push_back(TAG_ENTRY_T());
        top.filters.push_back(level);

        TAG_FILTER_T found;
        QVERIFY(!Tags::digToFilterFromEntry(top, "Colour", found));
        QCOMPARE(found.name, QString("Colour"));
        QCOMPARE(int(found.entries.size()), 2);

        level.entries.pop_back();
        top.filters[0] = level;
        QVERIFY(Tags::digToFilterFromEntry(top, "Colour", found));
    }

    void englishKeypadLayout()
    {
        XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
        KeypadArray keys;
        const QByteArray builtIn = readFile(":/Language/keypad_en.xml");
        QCOMPARE(parser.parseKeypadXML(builtIn, keys), 0);
        QCOMPARE(keys.size(), 36);
        QCOMPARE(keys.at(0).characterCap, QChar('1'));
        QCOMPARE(keys.at(0).characterLow, QChar('1'));
        QCOMPARE(keys.at(0).geometry, QRect(30, 170, 26, 55));
        QCOMPARE(keys.at(9).characterCap, QChar('0'));
        QCOMPARE(keys.at(9).geometry.left(), 30 + 9 * 26);
        QCOMPARE(keys.at(10).characterCap, QChar('Q'));
        QCOMPARE(keys.at(10).characterLow, QChar('q'));
        QCOMPARE(keys.at(10).geometry, QRect(30, 225, 26, 55));
        QCOMPARE(keys.at(20).characterCap, QChar('A'));
        QCOMPARE(keys.at(20).geometry.topLeft(), QPoint(43, 280));
        QCOMPARE(keys.at(35).characterLow, QChar('m'));
        QCOMPARE(keys.at(35).geometry.topLeft(), QPoint(58 + 6 * 26, 335));
        int lowestBottom = 0;
        for (const KEYPAD_BUTTON_T& key : keys) {
            QVERIFY(!key.special);
            QVERIFY(key.description.isEmpty());
            QCOMPARE(key.geometry.size(), QSize(26, 55));
            lowestBottom = qMax(lowestBottom, key.geometry.bottom());
        }
        QCOMPARE(lowestBottom, 389);
        QCOMPARE(readFile(Platform::devicePath("/opt/GUI/Keypad/keypad_en.xml")), builtIn);
    }

    void keysAreRecognisedByTheirAttributes()
    {
        XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
        KeypadArray keys;
        keys.resize(3);
        const QByteArray layout =
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?><keypad ContentVersion=\"0.1 alpha\">"
            "<!-- a comment -->"
            "<key characterCap=\"65\" characterLow=\"97\" xCoord=\"1\" yCoord=\"2\" height=\"4\"/>"
            "<button characterCap=\"196\" characterLow=\"0\" xCoord=\"5\" yCoord=\"6\" width=\"7\" height=\"8\" special=\" true \"/>"
            "<key characterCap=\"66\" characterLow=\"98\" xCoord=\"9\" yCoord=\"10\" width=\"11\" height=\"12\" special=\"yes\"/>"
            "</keypad>";
        QCOMPARE(parser.parseKeypadXML(layout, keys), 0);
        QCOMPARE(keys.size(), 2);
        QCOMPARE(keys.at(0).characterCap, QChar(196));
        QVERIFY(keys.at(0).characterLow.isNull());
        QVERIFY(keys.at(0).special);
        QCOMPARE(keys.at(0).geometry, QRect(5, 6, 7, 8));
        QVERIFY(!keys.at(1).special);

        QCOMPARE(parser.parseKeypadXML(QByteArray(), keys), KEYPAD_XML_NO_KEYS);
        QVERIFY(keys.isEmpty());
        QCOMPARE(parser.parseKeypadXML("<keypad><key characterCap=\"65\"/></keypad>", keys), KEYPAD_XML_NO_KEYS);
        QCOMPARE(parser.validateKeypadXML(KeypadArray(1)), 0);
    }

    void brokenLayoutEndsTheWalk()
    {
        // Not well-formed: the walk stops at the fault instead of spinning on
        // it, and the whole layout is refused so that the caller falls back
        // to the built-in one rather than half a keypad.
        XMLParser parser(FILTER_SCHEMA_PATH, TRANSLATION_SCHEMA_PATH);
        KeypadArray keys;
        const QByteArray layout =
            "<keypad><key characterCap=\"65\" characterLow=\"97\" xCoord=\"1\" yCoord=\"2\" width=\"3\" height=\"4\"/>"
            "<key characterCap=\"66\" <<<";
        QCOMPARE(parser.parseKeypadXML(layout, keys), KEYPAD_XML_NOT_WELL_FORMED);
        QVERIFY(keys.isEmpty());
        QCOMPARE(parser.parseKeypadXML("<<<", keys), KEYPAD_XML_NOT_WELL_FORMED);
    }
};

QTEST_GUILESS_MAIN(TestTags)
#include "tst_tags.moc"
