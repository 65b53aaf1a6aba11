#include "SharedSystem/LocaleHelper.h"

#include <QFontDatabase>
#include <QLocale>

LocaleHelper* LocaleHelper::instance()
{
    static LocaleHelper* s_instance = new LocaleHelper;
    return s_instance;
}

void LocaleHelper::Init()
{
    // The fonts are installed on the device by family name; nothing to load.
}

QString LocaleHelper::fontFamilyForCountryCode(const QString& code)
{
    const QLocale locale(code);
    if (locale.script() == QLocale::SimplifiedHanScript)
        return QStringLiteral("Noto Sans Mono CJK SC Regular");
    if (locale.script() == QLocale::TraditionalHanScript)
        return QStringLiteral("Noto Sans Mono CJK TC Regular");
    if (locale.language() == QLocale::Korean)
        return QStringLiteral("Noto Sans Mono CJK KR Regular");
    if (locale.language() == QLocale::Thai)
        return QStringLiteral("Noto Sans Thai Condensed");
    if (locale.language() == QLocale::Japanese)
        return QStringLiteral("Noto Sans Mono CJK JP Regular");

    const QString roboto = QStringLiteral("Roboto Condensed");
    if (QFontDatabase().families().contains(roboto))
        return roboto;
    return QStringLiteral("Liberation Sans Narrow");
}

QFont LocaleHelper::determineFontFromCountryCode(const QString& code)
{
    return QFont(fontFamilyForCountryCode(code));
}
