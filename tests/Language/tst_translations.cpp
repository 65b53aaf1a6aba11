// The shipped translation files: every text finished, none left over from
// texts the program no longer has, the same place markers as the English
// text, and each language holding every text the English file holds.

#include <QDir>
#include <QRegularExpression>
#include <QSet>
#include <QtTest>

#include "support/TranslationFiles.h"

namespace {

using TranslationFiles::Message;

QStringList markers(const QString& text)
{
    static const QRegularExpression re("%L?\\d");
    QStringList found;
    auto it = re.globalMatch(text);
    while (it.hasNext())
        found << it.next().captured().remove('L');
    found.sort();
    return found;
}

QString languageDir()
{
    return QStringLiteral(MARIGOLD_LANGUAGE_DIR);
}

} // namespace

class TestTranslations : public QObject
{
    Q_OBJECT

private slots:
    void files_data()
    {
        QTest::addColumn<QString>("path");
        const QStringList files = QDir(languageDir()).entryList({"MarigoldGuiApp_*.ts"}, QDir::Files);
        for (const QString& f : files)
            QTest::newRow(qPrintable(f)) << QDir(languageDir()).filePath(f);
    }

    void files()
    {
        QFETCH(QString, path);
        QString error;
        const QList<Message> messages = TranslationFiles::read(path, &error);
        QVERIFY2(error.isEmpty(), qPrintable(error));
        QVERIFY(!messages.isEmpty());

        QString englishError;
        const QList<Message> english =
            TranslationFiles::read(QDir(languageDir()).filePath("MarigoldGuiApp_en.ts"), &englishError);
        QVERIFY2(englishError.isEmpty(), qPrintable(englishError));
        QSet<QString> englishKeys;
        for (const Message& m : english)
            englishKeys.insert(m.context + '\x1f' + m.source);

        QStringList faults;
        QSet<QString> keys;
        for (const Message& m : messages) {
            const QString where = m.context + ": \"" + m.source.left(60) + "\"";
            keys.insert(m.context + '\x1f' + m.source);
            if (m.type == "unfinished")
                faults << "unfinished " + where;
            else if (m.type == "vanished" || m.type == "obsolete")
                faults << "left over " + where;
            for (const QString& t : m.translations) {
                if (m.type.isEmpty() && t.trimmed().isEmpty() && !m.source.trimmed().isEmpty())
                    faults << "empty " + where;
                if (m.type.isEmpty() && markers(t) != markers(m.source))
                    faults << "place markers differ " + where;
            }
        }
        for (const QString& k : englishKeys - keys)
            faults << "missing " + QString(k).replace('\x1f', ": ");
        QVERIFY2(faults.isEmpty(), qPrintable(faults.mid(0, 40).join('\n')
                                              + (faults.size() > 40 ? QString("\n... %1 in all").arg(faults.size())
                                                                    : QString())));
    }
};

QTEST_GUILESS_MAIN(TestTranslations)
#include "tst_translations.moc"
