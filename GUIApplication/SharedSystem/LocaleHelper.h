#ifndef LOCALEHELPER_H
#define LOCALEHELPER_H

// Chooses the font family that can show a language: the CJK and Thai
// families for those scripts, a condensed Latin face for the rest.

#include <QFont>
#include <QList>
#include <QObject>
#include <QString>

class LocaleHelper : public QObject
{
    Q_OBJECT

public:
    static LocaleHelper* instance();
    static void Init();

    static QFont determineFontFromCountryCode(const QString& code);
    static QString fontFamilyForCountryCode(const QString& code);

private:
    LocaleHelper() = default;

    QList<int> m_fontIds;
};

#endif // LOCALEHELPER_H
