#include "support/TranslationFiles.h"

#include <QFile>
#include <QXmlStreamReader>

namespace TranslationFiles {

QList<Message> read(const QString& path, QString* error)
{
    QList<Message> messages;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        *error = "cannot open " + path;
        return messages;
    }
    QXmlStreamReader xml(&file);
    QString context;
    Message current;
    while (!xml.atEnd()) {
        xml.readNext();
        if (!xml.isStartElement())
            continue;
        const auto name = xml.name();
        if (name == QLatin1String("context")) {
            context.clear();
        } else if (name == QLatin1String("name")) {
            context = xml.readElementText();
        } else if (name == QLatin1String("message")) {
            current = Message();
            current.context = context;
        } else if (name == QLatin1String("source")) {
            current.source = xml.readElementText();
        } else if (name == QLatin1String("translation")) {
            current.type = xml.attributes().value("type").toString();
            // Plural forms nest; a plain translation is its own text.
            QString text;
            while (!xml.atEnd()) {
                xml.readNext();
                if (xml.isStartElement() && xml.name() == QLatin1String("numerusform")) {
                    current.translations << xml.readElementText();
                } else if (xml.isCharacters()) {
                    text += xml.text();
                } else if (xml.isEndElement() && xml.name() == QLatin1String("translation")) {
                    break;
                }
            }
            if (current.translations.isEmpty())
                current.translations << text;
            messages << current;
        }
    }
    if (xml.hasError())
        *error = QString("%1: line %2: %3").arg(path).arg(xml.lineNumber()).arg(xml.errorString());
    return messages;
}

} // namespace TranslationFiles
