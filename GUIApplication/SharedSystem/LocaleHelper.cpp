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
    const QString family = fontFamilyForCountryCode(code);
    // The device installs the CJK fonts under their full names ("... JP
    // Regular"); a desktop's font configuration names the family without
    // the style. Without this the family is not found and the text falls
    // back to whatever the desktop's default is.
    static const QString suffix = QStringLiteral(" Regular");
    if (family.endsWith(suffix) && QFont::substitute(family) == family) {
        const QStringList installed = QFontDatabase().families();
        const QString bare = family.left(family.size() - suffix.size());
        if (!installed.contains(family) && installed.contains(bare))
            QFont::insertSubstitution(family, bare);
    }
    return QFont(family);
}
