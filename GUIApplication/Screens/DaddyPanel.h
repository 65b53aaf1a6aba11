#ifndef DADDYPANEL_H
#define DADDYPANEL_H

#include "Screens/MarigoldFullScreenPanel.h"
#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/XPushButton.h"

#include <QGraphicsOpacityEffect>
#include <QLabel>
#include <QPropertyAnimation>
#include <QRect>
#include <QTimer>
#include <QVariant>

#include <vector>

class PopupPanel;
class PowerDownPopup;

typedef enum _TRANSITION_EFFECT_T {
    TRANSITION_EFFECT_POP = 0,
    TRANSITION_EFFECT_SLIDE = 1,
    TRANSITION_EFFECT_FADE = 2,
    NUM_TRANSITION_EFFECTS = 3
} TRANSITION_EFFECT_T;

typedef enum _TRANSITION_DIRECTION_T {
    TRANSITION_DIRECTION_IN_LEFT = 0,
    TRANSITION_DIRECTION_IN_RIGHT = 1,
    TRANSITION_DIRECTION_IN_UP = 2,
    TRANSITION_DIRECTION_IN_DOWN = 3,
    NUM_TRANSITION_DIRECTIONS = 4,
    // Leaving to one side is entering from the other.
    TRANSITION_DIRECTION_OUT_LEFT = 1,
    TRANSITION_DIRECTION_OUT_RIGHT = 0,
    TRANSITION_DIRECTION_OUT_UP = 3,
    TRANSITION_DIRECTION_OUT_DOWN = 2
} TRANSITION_DIRECTION_T;

// Every panel that fills the display. It knows whether it is the top of the
// stack, asks ScreenMaster for other screens by id, carries its popups and
// covers, turns the instrument's numbered issues into popups while it is on
// top, watches the power key and runs its transitions.
class DaddyPanel : public MarigoldFullScreenPanel
{
    Q_OBJECT
public:
    explicit DaddyPanel(QWidget* parent = nullptr);
    // The effect or direction given to these two is dropped on purpose: all
    // screens pop unless they call the setters.
    DaddyPanel(TRANSITION_DIRECTION_T direction, QWidget* parent);
    DaddyPanel(TRANSITION_EFFECT_T effect, QWidget* parent);
    ~DaddyPanel() override;

    static const int PowerKeyHoldMs = 2000;

    void SetTransitionInDirection(TRANSITION_DIRECTION_T direction);
    void SetTransitionOutDirection(TRANSITION_DIRECTION_T direction);
    void SetTransitionInEffect(TRANSITION_EFFECT_T effect);
    void SetTransitionOutEffect(TRANSITION_EFFECT_T effect);
    void SetTransitionIn(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction);
    void SetTransitionOut(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction);
    TRANSITION_EFFECT_T transitionInEffect() const { return m_transitionInEffect; }
    TRANSITION_EFFECT_T transitionOutEffect() const { return m_transitionOutEffect; }
    TRANSITION_DIRECTION_T transitionInDirection() const { return m_transitionInDirection; }
    TRANSITION_DIRECTION_T transitionOutDirection() const { return m_transitionOutDirection; }
    bool GetTransitionInComplete() const { return m_transitionDone; }

    bool isActive() const { return m_ActiveStatus; }
    bool isClosing() const { return m_ScreenIsClosing; }

    void GotoScreen(SCREEN_ID_T id);
    void GotoSyncScreen();
    void CloseAndGotoScreen(SCREEN_ID_T id);

    // What the panel holds, for its subclasses and for tests.
    const std::vector<PopupPanel*>& popups() const { return m_popups; }
    PopupPanel* messageBox() const { return m_messageBox; }
    QWidget* lockScreen() const { return m_lockScreen; }
    QWidget* calScreen() const { return m_calPopup; }
    PowerDownPopup* powerDownPopup() const { return m_powerDownPopup; }
    bool isPowerKeyTimerRunning() const { return m_powerDownTimer.isActive(); }
    QGraphicsOpacityEffect* opacityEffect() { return m_opacityEffect; }
    QPropertyAnimation* animationIn() { return &m_propertyAnimationIn; }
    QPropertyAnimation* animationOut() { return &m_propertyAnimationOut; }

signals:
    void AddScreenToStack(SCREEN_ID_T id);
    void RemoveAndAddScreenToStack(QWidget* screen, SCREEN_ID_T id);
    void CloseCurrentScreen();
    void CloseScreenSignal(QWidget* screen);
    void GotoHomeScreenSignal();
    void GotoSyncScreenSignal();
    void ReadSwitchPressedSignal();
    void setActiveStatusSignal(bool active);
    void pageInView();
    void pageOutOfView();

public slots:
    void onGoHome() override;
    virtual void SetActiveStatus(bool active);
    virtual void onUpdateScreen();
    virtual void onStatusUpdate();
    virtual PopupPanel* onShowTagInvalidPopup();
    virtual void onCloseCalScreen();
    virtual void CloseScreen();
    virtual void onCloseLockScreen();
    virtual void onCloseSyncScreen();
    virtual void onShowCalScreen();
    virtual void onShowLockScreen();
    virtual void onShowSyncScreen();
    virtual void onAddPopup(PopupPanel* popup);
    virtual void onCloseAllPopups();
    virtual void onClosePopup(PopupPanel* popup);
    virtual void onClosePopup();
    virtual PopupPanel* onMeasurementIssue(int code);
    virtual void onUpdateSystemState(SYSTEM_STATE_T state);

    void onGotoScreen(SCREEN_ID_T id);
    void onStatusBarBtn_clicked();
    void onCloseMessageBox();
    PopupPanel* onShowMessageBoxPopup(const QString& header, const QString& message);
    PopupPanel* onShowErrorPopup(const QString& button, const QString& header, const QString& message);
    PopupPanel* onShowNotificationPopup(const QString& button, const QString& header,
                                        const QString& message);
    void onPowerDownTimeout();
    void onClosePowerDownPopup(PopupPanel* popup);
    void onTransitionEnded();
    void onCoverClosed(QWidget* cover);

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void keyReleaseEvent(QKeyEvent* event) override;
    void showEvent(QShowEvent* event) override;

    virtual QRect GetGeometry(TRANSITION_DIRECTION_T direction);
    virtual void SlideInTransition(QRect from, QRect to);
    virtual void SlideOutTransition(QRect from, QRect to);
    virtual void SlideTransition(QRect from, QRect to, QPropertyAnimation* animation);
    virtual void FadeInTransition();
    virtual void FadeOutTransition();
    virtual void FadeTransition(double start, double end, QPropertyAnimation* animation);
    virtual void performTransition(QVariant from, QVariant to, int ms, QPropertyAnimation* animation);
    virtual void performTransitionOut();

private:
    void init(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction);
    void dispose(QWidget*& cover);
    void watchCover(DaddyPanel* cover);
    // A popup that came from the given row of the issue table.
    PopupPanel* raiseIssuePopup(bool error, const char* title, const char* text);

    QTimer m_powerDownTimer;
    bool m_ActiveStatus = false;
    bool m_ScreenIsClosing = false;
    QPropertyAnimation m_propertyAnimationIn;
    QPropertyAnimation m_propertyAnimationOut;
    QGraphicsOpacityEffect* m_opacityEffect; // owned by the panel as its effect
    bool m_transitionDone = false;
    TRANSITION_EFFECT_T m_transitionInEffect = TRANSITION_EFFECT_POP;
    TRANSITION_EFFECT_T m_transitionOutEffect = TRANSITION_EFFECT_POP;
    TRANSITION_DIRECTION_T m_transitionInDirection = TRANSITION_DIRECTION_IN_LEFT;
    TRANSITION_DIRECTION_T m_transitionOutDirection = TRANSITION_DIRECTION_IN_RIGHT;
    std::vector<PopupPanel*> m_popups;
    QLabel m_shadow;
    void raiseOwnedWidgets();
    QWidget* m_calPopup = nullptr;
    PopupPanel* m_messageBox = nullptr;
    PowerDownPopup* m_powerDownPopup = nullptr;
    QWidget* m_lockScreen = nullptr;
    XPushButton m_debugButton; // never parented nor connected; only placed
};

Q_DECLARE_METATYPE(SCREEN_ID_T)

#endif // DADDYPANEL_H
