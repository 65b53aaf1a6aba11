#ifndef MARIGOLDUIM_H
#define MARIGOLDUIM_H

// The input table of the Korean and Chinese keypads: what the user has typed
// since the last commit (lower case, without blanks or quotes) maps to the
// characters it may stand for, in the table's order. Only one table is held
// at a time; the keypad loads the one of its language at each opening.

#include <QChar>
#include <QHash>
#include <QObject>
#include <QString>
#include <QVector>

typedef QHash<QString, QVector<QChar>> UIM_Hash;

class MarigoldUIM : public QObject
{
    Q_OBJECT
public:
    static MarigoldUIM* instance();

    // Empties the table and loads the one of the language; true when it
    // holds at least one row.
    bool initUIM(const QString& languageCode);
    // The candidates of a spelling, or none.
    QVector<QChar> GetCharVector(const QString& key) const;
    void flush();
    bool isUIM_initialized() const;

    // Replaces the table by the rows of a table's text (a table that
    // doesn't come from the resources); true when it holds a row.
    bool loadTableText(const QString& text);

    // Reads the rows of a table's text into the hash (the last row of a
    // repeated key wins) and returns the number of rows that matched.
    static int parseTable(const QString& text, UIM_Hash& table);

private:
    MarigoldUIM();
    QString getSCM_FileName(const QString& languageCode) const;
    bool loadFile(const QString& fileName);

    UIM_Hash m_uimHash;
};

#endif // MARIGOLDUIM_H
