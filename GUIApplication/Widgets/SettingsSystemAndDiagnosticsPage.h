#ifndef SETTINGSSYSTEMANDDIAGNOSTICSPAGE_H
#define SETTINGSSYSTEMANDDIAGNOSTICSPAGE_H

#include "Widgets/SettingsPage.h"

typedef enum _SYS_DIAG_SUB_PAGE_T {
    SYS_DIAG_SUB_PAGE_SYS_INFO = 0,
    SYS_DIAG_SUB_PAGE_DATABASE_MEMORY = 1,
    SYS_DIAG_SUB_PAGE_BATTERY_STATUS = 2,
    SYS_DIAG_SUB_PAGE_EXIT = 3,
    SYS_DIAG_SUB_PAGE_LEGAL = 4,
    SYS_DIAG_SUB_PAGE_SELF_TEST = 5,
    NUM_SYS_DIAG_SUB_PAGES = 6
} SYS_DIAG_SUB_PAGE_T;

// What describes the instrument itself: information, memory, legal notes
// and the self test.
class SettingsSystemAndDiagnosticsPage : public SettingsPage
{
    Q_OBJECT
public:
    explicit SettingsSystemAndDiagnosticsPage(QWidget* parent = nullptr);

    // The folder of the conformity labels; the legal row needs pictures in it.
    static QString legalLabelsPath();
    static QStringList legalLabelFilters();
    static bool hasLegalLabels();
    // The row texts in list order.
    QStringList rowTexts() const;

public slots:
    void onCreatePage();
    void onSubmenuSelected(int index);

protected:
    void changeEvent(QEvent* event) override;

private:
    void addSubMenu(SYS_DIAG_SUB_PAGE_T index, const QString& text);
};

#endif // SETTINGSSYSTEMANDDIAGNOSTICSPAGE_H
