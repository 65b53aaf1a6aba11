#ifndef SETTINGSNAVIGATOR_H
#define SETTINGSNAVIGATOR_H

#include "Screens/MarigoldPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <QEasingCurve>
#include <QPropertyAnimation>
#include <QVector>

class PopupPanel;
class QSignalMapper;
class SettingsPage;

// The stack of settings pages. A new page is laid under the current one,
// which then slides off to the left and uncovers it; going back slides the
// page below in again over the top one, which is then destroyed.
class SettingsNavigator : public MarigoldPanel
{
    Q_OBJECT
public:
    static const int TransitionMs = 250;

    explicit SettingsNavigator(QWidget* parent = nullptr);
    ~SettingsNavigator() override;

    void setFirstPage(SettingsPage* page);
    int pageCount() const { return m_settingsPagesStack.size(); }
    SettingsPage* topPage() const;
    SettingsPage* pageAt(int index) const;
    bool isAnimating() const;
    // Brings a running slide to its end at once.
    void finishTransitions();

signals:
    void GotoScreen(SCREEN_ID_T id);
    void displayPopup(PopupPanel* popup);
    void closePopup(PopupPanel* popup);
    void closeSettings();

public slots:
    void onNextPage(SettingsPage* page);
    void onPreviousPage();
    void onCloseSettings();
    void onTransitionInEnded();
    void onTransitionOutEnded();

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void createNextPage(SettingsPage* page);
    void onTransitionOutOfView(SettingsPage* page);
    void onTransitionIntoView(SettingsPage* page);
    QRect pageRect() const;

    QSignalMapper* m_signalMapper;
    QPropertyAnimation m_propertyAnimationIn;
    QPropertyAnimation m_propertyAnimationOut;
    QEasingCurve m_easingCurve;
    QVector<SettingsPage*> m_settingsPagesStack;
};

#endif // SETTINGSNAVIGATOR_H
