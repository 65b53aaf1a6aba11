#ifndef STRINGTABLES_H
#define STRINGTABLES_H

// Maps the program's enum values to two kinds of text: what the user sees,
// translated when the tables are built, and the fixed names the
// MeasurementServer uses on the wire. The translated rows are stored as
// translated, so the tables must be rebuilt after a language change before a
// screen reads them again.

#include "SharedSystem/InstrumentTypes.h"

#include <QMutex>
#include <QObject>
#include <QString>
#include <QVector>

typedef struct _StringLookupTableItem {
    QString item;
    int id = 0;
} StringLookupTableItem;

class StringTables : public QObject
{
    Q_OBJECT

public:
    static StringTables* instance();
    static void Init();
    static void reTranslateStringTables();

    // The text of the first row with this id; "UNKNOWN" when there is none.
    static QString getStringFromList(int id, STRING_LOOKUP_TABLE_T table);
    // The id of the first row whose text matches, ignoring case; -1 if none.
    static int getValueFromList(const QString& text, STRING_LOOKUP_TABLE_T table);

    static StringLookupTableItem makeTableItem(const QString& text, int id);

public slots:
    void onTranslate();

private:
    StringTables();

    mutable QMutex m_mutex;
    QVector<QVector<StringLookupTableItem>> MasterStrings;
};

QString getStringFromList(int id, STRING_LOOKUP_TABLE_T table);
int getValueFromList(const QString& text, STRING_LOOKUP_TABLE_T table);
void reTranslateStringTables();

#endif // STRINGTABLES_H
