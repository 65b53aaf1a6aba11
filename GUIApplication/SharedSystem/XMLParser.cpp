#include "SharedSystem/XMLParser.h"

#include "SharedSystem/Platform.h"

#include <QAbstractMessageHandler>
#include <QDebug>
#include <QFile>
#include <QRegExp>
#include <QSet>
#include <QUrl>
#include <QXmlSchema>
#include <QXmlSchemaValidator>
#include <QXmlStreamReader>

const char* const FILTER_XML_PATH = "/opt/Filter/Filter.xml";
const char* const FILTER_TRANSLATION_XML_PATH = "/opt/Filter/FilterTranslation.xml";
const char* const FILTER_SCHEMA_PATH = "/opt/Filter/FilterSchema.xsd";
const char* const TRANSLATION_SCHEMA_PATH = "/opt/Filter/TranslationSchema.xsd";

namespace {

const char* const kBuiltInFilterSchema = ":/etc/FilterSchema.xsd";
const char* const kBuiltInTranslationSchema = ":/etc/TranslationSchema.xsd";

// Device paths live under the platform root; anything else (a resource, a
// test's own file) is taken as it stands.
QString onDisk(const QString& path)
{
    return path.startsWith(QLatin1String("/opt/")) ? Platform::devicePath(path) : path;
}

QString pickSchema(const QString& path, const char* builtIn)
{
    const QString resolved = onDisk(path);
    if (!resolved.isEmpty() && QFile::exists(resolved))
        return resolved;
    return QString::fromLatin1(builtIn);
}

QUrl urlOf(const QString& path)
{
    if (path.startsWith(QLatin1Char(':')))
        return QUrl(QStringLiteral("qrc") + path);
    return QUrl::fromLocalFile(path);
}

// Schema and validation messages go to the log with their place, instead
// of the toolkit's default output.
class LogMessageHandler : public QAbstractMessageHandler
{
protected:
    void handleMessage(QtMsgType, const QString& description, const QUrl& identifier,
                       const QSourceLocation& location) override
    {
        QString text = description;
        text.remove(QRegExp(QStringLiteral("<[^>]*>")));
        qDebug().noquote() << QStringLiteral("XML validation: %1 (%2 line %3, column %4)")
                                  .arg(text.simplified(), identifier.toString())
                                  .arg(location.line())
                                  .arg(location.column());
    }
};

const QLatin1String kCharacterCap("characterCap");
const QLatin1String kCharacterLow("characterLow");
const QLatin1String kXCoord("xCoord");
const QLatin1String kYCoord("yCoord");
const QLatin1String kWidth("width");
const QLatin1String kHeight("height");
const QLatin1String kSpecial("special");

void applyTranslations(const QString& id, const TranslationList& translations, TagNameTranslations& hash)
{
    if (id.isEmpty())
        return;
    for (const TRANSLATION_T& translation : translations) {
        if (translation.id != id)
            continue;
        for (auto it = translation.translations.cbegin(); it != translation.translations.cend(); ++it)
            hash.insert(it.key(), it.value());
    }
}

TAG_FILTER_T parseFilter(QXmlStreamReader& reader, const TranslationList& translations);

TAG_ENTRY_T parseEntry(QXmlStreamReader& reader, const QString& filterName,
                       const TranslationList& translations)
{
    TAG_ENTRY_T entry;
    const QXmlStreamAttributes attributes = reader.attributes();
    entry.data.id = attributes.value(QLatin1String("Id")).toString();
    const QString name = attributes.value(QLatin1String("Name")).toString();
    entry.data.setDefaultName(name);
    entry.data.displayName = name;
    entry.data.filterName = filterName;
    // Entries are translated by their Id.
    applyTranslations(entry.data.id, translations, entry.data.nameHash);

    while (reader.readNextStartElement()) {
        if (reader.name() == QLatin1String("Filter"))
            entry.filters.push_back(parseFilter(reader, translations));
        else
            reader.skipCurrentElement();
    }
    return entry;
}

TAG_FILTER_T parseFilter(QXmlStreamReader& reader, const TranslationList& translations)
{
    TAG_FILTER_T filter;
    filter.name = reader.attributes().value(QLatin1String("Name")).toString();
    filter.filterNameHash.insert(kTagDefaultLanguage, filter.name);
    // Filters are translated by their Name.
    applyTranslations(filter.name, translations, filter.filterNameHash);

    while (reader.readNextStartElement()) {
        if (reader.name() == QLatin1String("Entry"))
            filter.entries.push_back(parseEntry(reader, filter.name, translations));
        else
            reader.skipCurrentElement();
    }
    return filter;
}

} // namespace

XMLParser::XMLParser(const QString& filterSchemaPath, const QString& translationSchemaPath)
    : m_filterSchema(pickSchema(filterSchemaPath, kBuiltInFilterSchema))
    , m_translationSchema(pickSchema(translationSchemaPath, kBuiltInTranslationSchema))
{
}

bool XMLParser::validateXML(const QByteArray& bytes, const QString& schemaPath) const
{
    QFile file(onDisk(schemaPath));
    if (!file.open(QIODevice::ReadOnly)) {
        qDebug().noquote() << "XML validation: cannot open the schema" << schemaPath;
        return false;
    }
    LogMessageHandler handler;
    QXmlSchema schema;
    schema.setMessageHandler(&handler);
    if (!schema.load(&file, urlOf(file.fileName())) || !schema.isValid()) {
        qDebug().noquote() << "XML validation: the schema is not valid" << schemaPath;
        return false;
    }
    QXmlSchemaValidator validator(schema);
    validator.setMessageHandler(&handler);
    return validator.validate(bytes);
}

int XMLParser::parseKeypadXML(const QByteArray& bytes, KeypadArray& keys)
{
    keys.clear();
    if (bytes.isEmpty())
        return KEYPAD_XML_NO_KEYS;

    // A key is recognised by its attributes, whatever the element is called.
    QXmlStreamReader reader(bytes);
    for (;;) {
        const QXmlStreamReader::TokenType token = reader.readNext();
        if (token == QXmlStreamReader::NoToken || token == QXmlStreamReader::EndDocument)
            break;
        if (token == QXmlStreamReader::Invalid) {
            // The reader stays on its invalid token for ever, so the loop must
            // leave here. Half a layout is worse than none: the caller falls
            // back to the built-in one.
            qDebug().noquote() << QStringLiteral("Keypad layout is not well-formed at line %1, column %2: %3; the layout is refused")
                                      .arg(reader.lineNumber())
                                      .arg(reader.columnNumber())
                                      .arg(reader.errorString());
            keys.clear();
            return KEYPAD_XML_NOT_WELL_FORMED;
        }
        if (token != QXmlStreamReader::StartElement)
            continue;

        const QXmlStreamAttributes attributes = reader.attributes();
        int found = 0;
        for (const QLatin1String& name : {kCharacterCap, kCharacterLow, kXCoord, kYCoord, kWidth, kHeight}) {
            if (attributes.hasAttribute(name))
                ++found;
        }
        if (found != 6)
            continue;

        KEYPAD_BUTTON_T key;
        key.characterCap = QChar(attributes.value(kCharacterCap).toUShort());
        key.characterLow = QChar(attributes.value(kCharacterLow).toUShort());
        key.geometry = QRect(attributes.value(kXCoord).toInt(), attributes.value(kYCoord).toInt(),
                             attributes.value(kWidth).toInt(), attributes.value(kHeight).toInt());
        key.special = attributes.value(kSpecial).toString().trimmed().toUpper() == QLatin1String("TRUE");
        keys.append(key);
    }
    return validateKeypadXML(keys);
}

int XMLParser::validateKeypadXML(const KeypadArray& keys) const
{
    return keys.isEmpty() ? KEYPAD_XML_NO_KEYS : 0;
}

int XMLParser::parseTagLanguageXML(const QByteArray& bytes, TranslationList& translations)
{
    if (bytes.isEmpty())
        return 0;
    if (!validateXML(bytes, m_translationSchema))
        return 1;

    translations.clear();
    QXmlStreamReader reader(bytes);
    if (!reader.readNextStartElement())
        return 0;
    while (reader.readNextStartElement()) {
        if (reader.name() != QLatin1String("Tag") || !reader.attributes().hasAttribute(QLatin1String("Name"))) {
            reader.skipCurrentElement();
            continue;
        }
        TRANSLATION_T translation;
        translation.id = reader.attributes().value(QLatin1String("Name")).toString();
        while (reader.readNextStartElement()) {
            if (reader.name() == QLatin1String("Translation")
                && reader.attributes().hasAttribute(QLatin1String("Name"))) {
                const QString language = reader.attributes().value(QLatin1String("Name")).toString();
                translation.translations.insert(language, reader.readElementText());
            } else {
                reader.skipCurrentElement();
            }
        }
        translations.append(translation);
    }
    return 0;
}

int XMLParser::parseTagXML(const QByteArray& bytes, TagsArray& filters, const TranslationList& translations)
{
    if (!validateXML(bytes, m_filterSchema))
        return 1;

    filters.clear();
    QXmlStreamReader reader(bytes);
    if (reader.readNextStartElement()) {
        while (reader.readNextStartElement()) {
            if (reader.name() == QLatin1String("Filter"))
                filters.push_back(parseFilter(reader, translations));
            else
                reader.skipCurrentElement();
        }
    }
    return validateTagXML(filters);
}

int XMLParser::validateTagXML(const TagsArray& filters) const
{
    // Only filter names travel as tag names to the server; entries are free.
    int result = 0;
    for (const TAG_FILTER_T& filter : Tags::getAllFilterNames(filters)) {
        const QString& name = filter.name;
        if (name == QLatin1String("DisplayName"))
            result |= TAG_XML_NAME_IS_DISPLAYNAME;
        else if (name == QLatin1String("DisplayNotes"))
            result |= TAG_XML_NAME_IS_DISPLAYNOTES;
        else if (name.startsWith(QLatin1String("Display")))
            result |= TAG_XML_NAME_STARTS_DISPLAY;
        else if (name.endsWith(QLatin1String("Id")))
            result |= TAG_XML_NAME_ENDS_ID;
    }
    return result;
}

int testTagXML(const QByteArray& bytes)
{
    XMLParser parser(QString::fromLatin1(FILTER_SCHEMA_PATH), QString::fromLatin1(TRANSLATION_SCHEMA_PATH));
    TagsArray filters;
    return parser.parseTagXML(bytes, filters, TranslationList());
}

int testTagLanguageXML(const QByteArray& bytes)
{
    XMLParser parser(QString::fromLatin1(FILTER_SCHEMA_PATH), QString::fromLatin1(TRANSLATION_SCHEMA_PATH));
    TranslationList translations;
    return parser.parseTagLanguageXML(bytes, translations);
}
