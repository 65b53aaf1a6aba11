#ifndef SETTINGSDATABASEMEMORYPAGE_H
#define SETTINGSDATABASEMEMORYPAGE_H

#include "Widgets/SettingsPage.h"

class SettingsListSelectionProgressItem;

// How full the instrument's store is, and the way to clear it.
class SettingsDatabaseMemoryPage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsDatabaseMemoryPage(QWidget* parent = nullptr);
    SettingsListSelectionProgressItem* samplesBar() const { return m_samples; }
    SettingsListSelectionProgressItem* jobsBar() const { return m_jobs; }

public slots:
    void onUpdatePage() override;
    void onClearDatabase();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();

    SettingsListSelectionProgressItem* m_samples;
    SettingsListSelectionProgressItem* m_jobs;
    class SettingsListSelectionItem* m_clearRow;
};

#endif // SETTINGSDATABASEMEMORYPAGE_H
