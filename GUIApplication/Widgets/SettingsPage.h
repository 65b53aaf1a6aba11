#ifndef SETTINGSPAGE_H
#define SETTINGSPAGE_H

#include "Screens/MarigoldPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <QString>

namespace Ui {
class SettingsPage;
}

class FlickList;
class PopupPanel;
class QSignalMapper;

// One page of the settings: a title bar with a back button over a list of
// rows. Pages are stacked by the SettingsNavigator; a page asks for the next
// one with nextPage() and for its own removal with previousPage().
class SettingsPage : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit SettingsPage(QWidget* parent = nullptr);
    SettingsPage(const QString& title, QWidget* parent = nullptr);
    SettingsPage(const QString& title, const QString& icon, QWidget* parent = nullptr);
    ~SettingsPage() override;

    void setTitle(const QString& title);
    QString title() const;
    void setIcon(const QString& icon);
    void setBackIcon(const QString& icon);
    void setBackButtonVisible(bool visible);
    FlickList* getSettingsList() const;
    void gotoNextPage(SettingsPage* page);
    QSignalMapper* signalMapper() const { return m_signalMapper; }
    // The back button's picture without its divider (titles run under it),
    // with an optional mark beside the chevron.
    static QIcon backButtonIcon(const QString& mark = QString());

signals:
    void GotoScreen(SCREEN_ID_T id);
    void nextPage(SettingsPage* page);
    void displayPopup(PopupPanel* popup);
    void closePopup(PopupPanel* popup);
    void previousPage();

public slots:
    virtual void setEnabled(bool enabled);
    virtual void onUpdatePage();
    virtual void updateIconLocation();
    virtual void onGotoScreen(SCREEN_ID_T id);
    virtual void on_BtnBack_clicked();
    virtual void init();
    virtual void clearSignalMapper();
    virtual void refreshSignalMapper();

protected:
    void resizeEvent(QResizeEvent* event) override;
    // Removes every row of the list and the widgets in them.
    void clearList();

    Ui::SettingsPage* ui;
    QSignalMapper* m_signalMapper = nullptr;

private:
    void construct(const QString& title, const QString& icon);
    // The title's font as large as the bar allows for the present text.
    void fitTitleFont(int boxWidth);

    QFont m_titleFont;
};

#endif // SETTINGSPAGE_H
