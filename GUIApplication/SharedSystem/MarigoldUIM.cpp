#include "SharedSystem/MarigoldUIM.h"

#include <QFile>
#include <QLocale>
#include <QRegularExpression>

#include <utility>

namespace {

// One row: (((symbols)) (candidates)). Anything between rows (comments, the
// define) is passed over, and a row whose symbol or candidate is itself a
// parenthesis doesn't match.
const QString kRowPattern = QStringLiteral("\\(\\(\\(([^()]*)\\)\\)\\s*\\(([^()]*)\\)\\)");

// The spelling with blanks and quotes taken out, trimmed. Escape backslashes
// stay, as the table wrote them.
QString keyOf(QStringView symbols)
{
    QString key;
    key.reserve(symbols.size());
    for (QChar c : symbols) {
        if (c != QLatin1Char(' ') && c != QLatin1Char('"'))
            key.append(c);
    }
    // Blanks are gone already; only other white space can remain.
    if (!key.isEmpty() && (key.front().isSpace() || key.back().isSpace()))
        return std::move(key).trimmed();
    return key;
}

// The first UTF-16 unit of each blank-separated candidate, quotes removed,
// in row order with repeats kept.
QVector<QChar> candidatesOf(QStringView text)
{
    int begin = 0;
    int end = text.size();
    while (begin < end && text.at(begin).isSpace())
        ++begin;
    while (end > begin && text.at(end - 1).isSpace())
        --end;
    QVector<QChar> out;
    bool inPiece = false;
    for (int i = begin; i < end; ++i) {
        const QChar c = text.at(i);
        if (c == QLatin1Char('"'))
            continue;
        if (c == QLatin1Char(' ')) {
            inPiece = false;
        } else if (!inPiece) {
            out.append(c);
            inPiece = true;
        }
    }
    return out;
}

} // namespace

MarigoldUIM* MarigoldUIM::instance()
{
    static MarigoldUIM* s_instance = new MarigoldUIM();
    return s_instance;
}

MarigoldUIM::MarigoldUIM()
    : QObject(nullptr)
{
}

bool MarigoldUIM::initUIM(const QString& languageCode)
{
    flush();
    loadFile(getSCM_FileName(languageCode));
    return isUIM_initialized();
}

QVector<QChar> MarigoldUIM::GetCharVector(const QString& key) const
{
    return m_uimHash.value(key);
}

void MarigoldUIM::flush()
{
    m_uimHash.clear();
}

bool MarigoldUIM::isUIM_initialized() const
{
    return !m_uimHash.isEmpty();
}

QString MarigoldUIM::getSCM_FileName(const QString& languageCode) const
{
    const QLocale locale(languageCode);
    // The script decides before the language: a Chinese code names its
    // table by the script it writes.
    if (locale.script() == QLocale::SimplifiedHanScript)
        return QStringLiteral(":/Language/simplified_chinese.scm");
    if (locale.script() == QLocale::TraditionalHanScript)
        return QStringLiteral(":/Language/traditional_chinese.scm");
    if (locale.language() == QLocale::Korean)
        return QStringLiteral(":/Language/romaja.scm");
    return QString();
}

bool MarigoldUIM::loadFile(const QString& fileName)
{
    if (fileName.isEmpty())
        return false;
    QFile file(fileName);
    if (!file.open(QIODevice::ReadOnly | QIODevice::Text))
        return false;
    const QString text = QString::fromUtf8(file.readAll());
    parseTable(text, m_uimHash);
    return true;
}

bool MarigoldUIM::loadTableText(const QString& text)
{
    flush();
    parseTable(text, m_uimHash);
    return isUIM_initialized();
}

int MarigoldUIM::parseTable(const QString& text, UIM_Hash& table)
{
    static const QRegularExpression row(kRowPattern, QRegularExpression::NoPatternOption);
    int rows = 0;
    // A row takes some 30 characters; growing the hash row by row would
    // rehash it a dozen times on the Korean table.
    table.reserve(table.size() + text.size() / 32);
    QRegularExpressionMatchIterator it = row.globalMatch(text);
    while (it.hasNext()) {
        const QRegularExpressionMatch m = it.next();
        table.insert(keyOf(m.capturedView(1)), candidatesOf(m.capturedView(2)));
        ++rows;
    }
    return rows;
}
