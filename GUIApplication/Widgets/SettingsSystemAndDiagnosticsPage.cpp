#include "Widgets/SettingsSystemAndDiagnosticsPage.h"

#include "SharedSystem/Platform.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsDatabaseMemoryPage.h"
#include "Widgets/SettingsLegalInformationPage.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/SettingsSystemInformationPage.h"

#include <QDir>
#include <QEvent>
#include <QSignalMapper>

SettingsSystemAndDiagnosticsPage::SettingsSystemAndDiagnosticsPage(QWidget* parent)
    : SettingsPage(tr("System &\nDiagnostics"), QStringLiteral(":/Assets/settings_diagnostics_icon.png"), parent)
{
    onCreatePage();
}

QString SettingsSystemAndDiagnosticsPage::legalLabelsPath()
{
    return Platform::devicePath(QStringLiteral("/opt/GUI/Legal/E_labels/"));
}

QStringList SettingsSystemAndDiagnosticsPage::legalLabelFilters()
{
    return {QStringLiteral("*.png"), QStringLiteral("*.jpg"), QStringLiteral("*.jpeg"), QStringLiteral("*.bmp")};
}

bool SettingsSystemAndDiagnosticsPage::hasLegalLabels()
{
    const QDir dir(legalLabelsPath());
    return dir.exists() && !dir.entryList(legalLabelFilters(), QDir::Files).isEmpty();
}

void SettingsSystemAndDiagnosticsPage::addSubMenu(SYS_DIAG_SUB_PAGE_T index, const QString& text)
{
    auto* row = new SettingsListSelectionSubMenuItem;
    row->setText(text);
    getSettingsList()->addWidget(row);
    connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
    m_signalMapper->setMapping(row, int(index));
}

void SettingsSystemAndDiagnosticsPage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsSystemAndDiagnosticsPage::onSubmenuSelected);
    addSubMenu(SYS_DIAG_SUB_PAGE_SYS_INFO, tr("System Information"));
    addSubMenu(SYS_DIAG_SUB_PAGE_DATABASE_MEMORY, tr("Database / Memory"));
    if (hasLegalLabels())
        addSubMenu(SYS_DIAG_SUB_PAGE_LEGAL, tr("Legal Information"));
    if (UserParams::getDisplaySelfTest())
        addSubMenu(SYS_DIAG_SUB_PAGE_SELF_TEST, tr("Self Test"));
    if (auto* last = qobject_cast<FlickButton*>(getSettingsList()->getWidget(getSettingsList()->count() - 1)))
        last->setLastInList(true);
}

QStringList SettingsSystemAndDiagnosticsPage::rowTexts() const
{
    QStringList texts;
    FlickList* list = getSettingsList();
    for (int i = 0; i < list->count(); ++i) {
        if (auto* row = qobject_cast<SettingsListSelectionSubMenuItem*>(list->getWidget(i)))
            texts << row->getText();
    }
    return texts;
}

void SettingsSystemAndDiagnosticsPage::onSubmenuSelected(int index)
{
    playSoundButtonClick();
    switch (index) {
    case SYS_DIAG_SUB_PAGE_SYS_INFO:
        gotoNextPage(new SettingsSystemInformationPage);
        break;
    case SYS_DIAG_SUB_PAGE_DATABASE_MEMORY:
        gotoNextPage(new SettingsDatabaseMemoryPage);
        break;
    case SYS_DIAG_SUB_PAGE_EXIT:
        Platform::runShellCommand(QStringLiteral("killall GUIApplication"));
        break;
    case SYS_DIAG_SUB_PAGE_LEGAL:
        gotoNextPage(new SettingsLegalInformationPage);
        break;
    case SYS_DIAG_SUB_PAGE_SELF_TEST:
        onGotoScreen(CAL_WIZARD_STEPS_SELF_TEST_WHITE_INSTRUCTIONS_ID);
        break;
    default:
        break;
    }
}

void SettingsSystemAndDiagnosticsPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("System &\nDiagnostics"));
        onCreatePage();
    }
}
