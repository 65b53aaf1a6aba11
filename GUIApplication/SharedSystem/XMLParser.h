#ifndef XMLPARSER_H
#define XMLPARSER_H

// Reads the customer's filter and translation files (validated against their
// W3C schemas) and the on-screen keypad layouts.

#include "SharedSystem/Tags.h"

#include <QByteArray>
#include <QChar>
#include <QRect>
#include <QString>
#include <QVector>

// One key of a keypad layout.
typedef struct _KEYPAD_BUTTON_T {
    QChar characterCap; // null: no label in the capital layers
    QChar characterLow; // null: no label in the lower-case layers
    QString description;
    QRect geometry;     // screen pixels, relative to the panel
    bool special = false;
} KEYPAD_BUTTON_T;
typedef QVector<KEYPAD_BUTTON_T> KeypadArray;

// Reasons for refusing a filter file, ORed: filter names that would collide
// with the names under which a job's tags travel to the server.
constexpr int TAG_XML_NAME_IS_DISPLAYNAME = 0x100;
constexpr int TAG_XML_NAME_IS_DISPLAYNOTES = 0x10;
constexpr int TAG_XML_NAME_STARTS_DISPLAY = 0x1000;
constexpr int TAG_XML_NAME_ENDS_ID = 0x10000;
// A keypad layout without a single key.
constexpr int KEYPAD_XML_NO_KEYS = 0x100000;
// A keypad layout that is not well-formed XML.
constexpr int KEYPAD_XML_NOT_WELL_FORMED = 0x200000;

extern const char* const FILTER_XML_PATH;             // "/opt/Filter/Filter.xml"
extern const char* const FILTER_TRANSLATION_XML_PATH; // "/opt/Filter/FilterTranslation.xml"
extern const char* const FILTER_SCHEMA_PATH;          // "/opt/Filter/FilterSchema.xsd"
extern const char* const TRANSLATION_SCHEMA_PATH;     // "/opt/Filter/TranslationSchema.xsd"

class XMLParser
{
public:
    // Each schema is taken from its path ("/opt/..." under the platform
    // root) or, when no such file exists, from the copy built into the
    // program.
    XMLParser(const QString& filterSchemaPath, const QString& translationSchemaPath);

    QString filterSchema() const { return m_filterSchema; }
    QString translationSchema() const { return m_translationSchema; }

    // 0 on success.
    int parseKeypadXML(const QByteArray& bytes, KeypadArray& keys);
    int validateKeypadXML(const KeypadArray& keys) const;
    int parseTagLanguageXML(const QByteArray& bytes, TranslationList& translations);
    int parseTagXML(const QByteArray& bytes, TagsArray& filters, const TranslationList& translations);
    int validateTagXML(const TagsArray& filters) const;

    bool validateXML(const QByteArray& bytes, const QString& schemaPath) const;

private:
    QString m_filterSchema;
    QString m_translationSchema;
};

int testTagXML(const QByteArray& bytes);
int testTagLanguageXML(const QByteArray& bytes);

#endif // XMLPARSER_H
