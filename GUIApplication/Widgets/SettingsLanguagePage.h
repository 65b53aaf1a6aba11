#ifndef SETTINGSLANGUAGEPAGE_H
#define SETTINGSLANGUAGEPAGE_H

#include "Widgets/SettingsPage.h"

// The installed languages, each in its own script's font. Choosing one
// reloads the translation and every screen retranslates.
class SettingsLanguagePage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsLanguagePage(QWidget* parent = nullptr);

public slots:
    void onCreatePage();
    void onUpdatePage() override;
    void onLanguageSelected(const QString& code);

protected:
    void changeEvent(QEvent* event) override;
};

#endif // SETTINGSLANGUAGEPAGE_H
