#ifndef TRANSLATIONFILES_H
#define TRANSLATIONFILES_H

// Reading the translation sources (.ts) as the tests need them: every
// message with its context, source text, translation and state.

#include <QList>
#include <QString>
#include <QStringList>

namespace TranslationFiles {

struct Message
{
    QString context;
    QString source;
    QStringList translations; // one, or one per plural form
    QString type;             // "", "unfinished", "vanished", "obsolete"
};

// The messages of the file; `error` says why a file could not be read whole.
QList<Message> read(const QString& path, QString* error);

} // namespace TranslationFiles

#endif // TRANSLATIONFILES_H
