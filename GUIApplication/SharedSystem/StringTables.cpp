#include "SharedSystem/StringTables.h"

#include <QMutexLocker>

namespace {

const QChar kDegree(176);

// A table built from translated rows; text with %1 takes the degree sign.
QVector<StringLookupTableItem> translatedTable(std::initializer_list<QString> rows)
{
    QVector<StringLookupTableItem> table;
    table.reserve(int(rows.size()));
    int id = 0;
    for (const QString& text : rows) {
        const QString item = text.contains(QLatin1String("%1")) ? text.arg(kDegree) : text;
        table.append(StringTables::makeTableItem(item, id++));
    }
    return table;
}

// The server's names, which are never translated.
QVector<StringLookupTableItem> fixedTable(std::initializer_list<const char*> rows)
{
    QVector<StringLookupTableItem> table;
    table.reserve(int(rows.size()));
    int id = 0;
    for (const char* text : rows)
        table.append(StringTables::makeTableItem(QString::fromLatin1(text), id++));
    return table;
}

} // namespace

StringTables::StringTables() = default;

StringTables* StringTables::instance()
{
    static StringTables* s_instance = new StringTables;
    return s_instance;
}

void StringTables::Init()
{
    reTranslateStringTables();
}

void StringTables::reTranslateStringTables()
{
    instance()->onTranslate();
}

StringLookupTableItem StringTables::makeTableItem(const QString& text, int id)
{
    StringLookupTableItem row;
    row.item = text;
    row.id = id;
    return row;
}

void StringTables::onTranslate()
{
    QVector<QVector<StringLookupTableItem>> tables;
    tables.reserve(NUM_STRING_LOOKUP_TABLES);

    tables.append(translatedTable({
        tr("English"), tr("Spanish"), tr("French"), tr("German"), tr("Italian"),
        tr("Portuguese"), tr("Japanese"), tr("Korean"), tr("Chinese Simplified"), tr("Custom"),
    }));
    tables.append(translatedTable({
        tr("-45%1"), tr("-15%1"), tr("15%1"), tr("45%1"), tr("80%1"), tr("Diffuse"),
    }));
    tables.append(fixedTable({
        "r15as-45", "r15as-15", "r15as15", "r15as45", "r15as80", "r15d",
    }));
    tables.append(translatedTable({
        tr("-15%1"), tr("15%1"), tr("25%1"), tr("45%1"), tr("75%1"), tr("110%1"),
        tr("-45%1"), tr("-15%1"), tr("15%1"), tr("45%1"), tr("80%1"),
    }));
    tables.append(fixedTable({
        "r45as-15", "r45as15", "r45as25", "r45as45", "r45as75", "r45as110",
        "r15as-45", "r15as-15", "r15as15", "r15as45", "r15as80",
    }));
    tables.append(translatedTable({
        tr("A/2%1"), tr("A/10%1"), tr("C/2%1"), tr("C/10%1"), tr("D50/2%1"), tr("D50/10%1"),
        tr("D55/2%1"), tr("D55/10%1"), tr("D65/2%1"), tr("D65/10%1"), tr("D75/2%1"), tr("D75/10%1"),
        tr("F2/2%1"), tr("F2/10%1"), tr("F7/2%1"), tr("F7/10%1"), tr("F8/2%1"), tr("F8/10%1"),
        tr("F10/2%1"), tr("F10/10%1"), tr("F11/2%1"), tr("F11/10%1"), tr("F12/2%1"), tr("F12/10%1"),
    }));
    tables.append(translatedTable({
        tr("Mid Tier"), tr("ALDER"), tr("BIRCH"), tr("QC"),
    }));
    tables.append(translatedTable({
        tr("No Averaging"), tr("Averaging 3"), tr("Averaging 5"), tr("SMC m:n"),
    }));
    tables.append(translatedTable({
        tr("White Tile"), tr("Reference Tile"), tr("Lifted"),
    }));
    tables.append(translatedTable({
        tr("White Tile Complete"), tr("Reference Tile Complete"), tr("Lifted Complete"),
    }));

    QMutexLocker lock(&m_mutex);
    MasterStrings = tables;
}

QString StringTables::getStringFromList(int id, STRING_LOOKUP_TABLE_T table)
{
    StringTables* self = instance();
    QMutexLocker lock(&self->m_mutex);
    if (table >= 0 && table < self->MasterStrings.size()) {
        for (const StringLookupTableItem& row : self->MasterStrings.at(table)) {
            if (row.id == id)
                return row.item;
        }
    }
    return QStringLiteral("UNKNOWN");
}

int StringTables::getValueFromList(const QString& text, STRING_LOOKUP_TABLE_T table)
{
    StringTables* self = instance();
    QMutexLocker lock(&self->m_mutex);
    if (table < 0 || table >= self->MasterStrings.size())
        return -1;
    const QString wanted = text.toUpper();
    for (const StringLookupTableItem& row : self->MasterStrings.at(table)) {
        if (row.item.toUpper() == wanted)
            return row.id;
    }
    return -1;
}

QString getStringFromList(int id, STRING_LOOKUP_TABLE_T table)
{
    return StringTables::getStringFromList(id, table);
}

int getValueFromList(const QString& text, STRING_LOOKUP_TABLE_T table)
{
    return StringTables::getValueFromList(text, table);
}

void reTranslateStringTables()
{
    StringTables::reTranslateStringTables();
}
