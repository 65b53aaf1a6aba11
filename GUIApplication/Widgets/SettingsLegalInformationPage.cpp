#include "Widgets/SettingsLegalInformationPage.h"

#include "Widgets/SettingsSystemAndDiagnosticsPage.h"

SettingsLegalInformationPage::SettingsLegalInformationPage(QWidget* parent)
    : SettingsDirectoryExplorerPage(SettingsSystemAndDiagnosticsPage::legalLabelsPath(), tr("Legal Information"),
                                    parent, SettingsSystemAndDiagnosticsPage::legalLabelFilters())
{
}
