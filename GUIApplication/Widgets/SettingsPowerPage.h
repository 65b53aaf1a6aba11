#ifndef SETTINGSPOWERPAGE_H
#define SETTINGSPOWERPAGE_H

#include "Widgets/SettingsPage.h"

class DeletePopup;

// Switching the instrument off or restarting it, each after a question.
class SettingsPowerPage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsPowerPage(QWidget* parent = nullptr);
    ~SettingsPowerPage() override;

    POWER_T currentPower() const { return m_currentPower; }
    DeletePopup* popup() const { return m_popup; }

public slots:
    void onPowerOptionSelected(int option);
    void onPopupConfirmed();
    void onPopupCanceled();

protected:
    void changeEvent(QEvent* event) override;

private:
    void onCreatePage();

    POWER_T m_currentPower = POWER_SHUTDOWN;
    DeletePopup* m_popup = nullptr;
};

#endif // SETTINGSPOWERPAGE_H
