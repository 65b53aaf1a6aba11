#ifndef SETTINGSSYSTEMINFORMATIONPAGE_H
#define SETTINGSSYSTEMINFORMATIONPAGE_H

#include "Widgets/SettingsPage.h"

#include <QPair>

class SettingsListSelectionSystemInfo;

// The instrument's identity and versions, the factory reset and the open
// source notices. Twenty taps on the information block bring the service
// rows of the burn-in tests.
class SettingsSystemInformationPage : public SettingsPage
{
    Q_OBJECT
public:
    static const int ServiceClicks = 20;
    // What each burn-in row asks of the server's burn-in parameter.
    enum BurnInTest { BurnInJuniper = 1, BurnInLarch = 2, BurnInSpruce = 3 };

    explicit SettingsSystemInformationPage(QWidget* parent = nullptr);

    int timesClicked() const { return m_timesClicked; }
    bool serviceRowsShown() const { return m_serviceRowsShown; }
    SettingsListSelectionSystemInfo* infoBlock() const { return m_info; }
    static QList<QPair<QString, QString>> readInformation();
    static QString openSourcePath();

public slots:
    void onInfoClicked();
    void onRowSelected(int row);
    void onBurnInTestJuniperTest();
    void onBurnInTestLarchTest();
    void onBurnInTestSpruceTest();
    void onUpdatePage() override;

protected:
    void changeEvent(QEvent* event) override;

private:
    enum Row { RowRestore = 0, RowOpenSource = 1, RowJuniper = 2, RowLarch = 3, RowSpruce = 4 };
    void onCreatePage();
    void addRow(Row row, const QString& text);
    void addServiceRows();
    void startBurnIn(BurnInTest test);

    int m_timesClicked = 0;
    bool m_serviceRowsShown = false;
    SettingsListSelectionSystemInfo* m_info = nullptr;
};

#endif // SETTINGSSYSTEMINFORMATIONPAGE_H
