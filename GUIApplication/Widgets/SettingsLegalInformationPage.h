#ifndef SETTINGSLEGALINFORMATIONPAGE_H
#define SETTINGSLEGALINFORMATIONPAGE_H

#include "Widgets/SettingsDirectoryExplorerPage.h"

// The instrument's conformity and safety labels: the pictures of the
// labels folder.
class SettingsLegalInformationPage : public SettingsDirectoryExplorerPage
{
    Q_OBJECT
public:
    explicit SettingsLegalInformationPage(QWidget* parent = nullptr);
};

#endif // SETTINGSLEGALINFORMATIONPAGE_H
