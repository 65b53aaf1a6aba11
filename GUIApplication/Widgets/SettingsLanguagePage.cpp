#include "Widgets/SettingsLanguagePage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"

#include <QEvent>
#include <QSignalMapper>

SettingsLanguagePage::SettingsLanguagePage(QWidget* parent)
    : SettingsPage(tr("Language"), QStringLiteral(":/Assets/settings_set_language_icon.png"), parent)
{
    onCreatePage();
}

void SettingsLanguagePage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedString, this, &SettingsLanguagePage::onLanguageSelected);
    const QString current = UserParams::getLanguageCode().trimmed().toUpper();
    const QVector<TAG_ITEM_T> languages = DataManager::instance()->getLanguagesInstalled();
    for (const TAG_ITEM_T& language : languages) {
        auto* row = new SettingsListSelectionCheckableItem;
        row->setText(language.tagText);
        row->setParam(language.tagID);
        row->setChecked(language.tagID.trimmed().toUpper() == current);
        row->setFont(LocaleHelper::determineFontFromCountryCode(language.tagID));
        getSettingsList()->addWidget(row);
        connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
        m_signalMapper->setMapping(row, language.tagID);
    }
    if (auto* last = qobject_cast<FlickButton*>(getSettingsList()->getWidget(getSettingsList()->count() - 1)))
        last->setLastInList(true);
}

void SettingsLanguagePage::onLanguageSelected(const QString& code)
{
    playSoundButtonClick();
    DataManager::instance()->setLanguageCode(code);
    onUpdatePage();
}

void SettingsLanguagePage::onUpdatePage()
{
    // The tapped row has inverted itself; only the present language keeps
    // its tick.
    const QString name = DataManager::instance()->getLanguageStringFromCode(UserParams::getLanguageCode());
    FlickList* list = getSettingsList();
    for (int i = 0; i < list->count(); ++i) {
        if (auto* row = qobject_cast<SettingsListSelectionCheckableItem*>(list->getWidget(i)))
            row->setChecked(row->getText() == name);
    }
}

void SettingsLanguagePage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("Language"));
        // The change polished every style sheet again in the new language's
        // font: each row takes back the font of the language it names.
        FlickList* list = getSettingsList();
        for (int i = 0; i < list->count(); ++i) {
            if (auto* row = qobject_cast<SettingsListSelectionCheckableItem*>(list->getWidget(i)))
                row->setFont(LocaleHelper::determineFontFromCountryCode(row->getParam()));
        }
    }
}
