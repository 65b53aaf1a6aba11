#include "Screens/DaddyPanel.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/LockScreen.h"
#include "Screens/ErrorPopup.h"
#include "Screens/PowerDownPopup.h"
#include "Screens/SyncScreen.h"

#include <QCoreApplication>
#include <QDebug>
#include <QElapsedTimer>
#include <QKeyEvent>

#include <algorithm>

namespace {

// Waits on the GUI thread for an animation never last longer than this; an
// animation that cannot run (a hidden panel) must not freeze the screen.
const int kTransitionWaitLimitMs = 2000;

template <class Done>
void spinUntil(Done done)
{
    QElapsedTimer waited;
    waited.start();
    while (!done() && waited.elapsed() < kTransitionWaitLimitMs)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
}

enum IssueSound { SoundErrorUser, SoundMeasurementFailed };
enum IssuePopup { ErrorKind, NotificationKind };

struct Issue
{
    int code;
    IssueSound sound;
    IssuePopup popup;
    const char* title;
    const char* text;
};

// The instrument's numbered issues and what the top panel shows for them.
// -92934 (tag filter), -1 (good news) and 15 (calibration needed) are
// handled apart.
const Issue kIssues[] = {
    {-2, SoundErrorUser, NotificationKind, QT_TRANSLATE_NOOP("DaddyPanel", "Warning"),
     QT_TRANSLATE_NOOP("DaddyPanel", "Reference Check Failed")},
    {9, SoundErrorUser, ErrorKind, QT_TRANSLATE_NOOP("DaddyPanel", "Instrument Is Full"),
     QT_TRANSLATE_NOOP("DaddyPanel", "There is not enough memory to complete the requested Job. "
                                     "Please remove existing jobs to free up memory.")},
    {10, SoundErrorUser, ErrorKind, QT_TRANSLATE_NOOP("DaddyPanel", "Error"),
     QT_TRANSLATE_NOOP("DaddyPanel", "No database entries")},
    {11, SoundErrorUser, ErrorKind, "Error", "No database entries"},
    {1000, SoundErrorUser, ErrorKind, "Error", "No database entries"},
    {1001, SoundErrorUser, ErrorKind, "Error", "No database entries"},
    {1066, SoundErrorUser, ErrorKind, "Error", "No database entries"},
    {13, SoundMeasurementFailed, ErrorKind, QT_TRANSLATE_NOOP("DaddyPanel", "Measurement Cancelled"),
     QT_TRANSLATE_NOOP("DaddyPanel", "The instrument was moved during a measurement")},
    {2032, SoundMeasurementFailed, ErrorKind, "Measurement Cancelled",
     "The instrument was moved during a measurement"},
    {1065, SoundErrorUser, ErrorKind, "Error", QT_TRANSLATE_NOOP("DaddyPanel", "Index invalid")},
    {2001, SoundMeasurementFailed, ErrorKind, QT_TRANSLATE_NOOP("DaddyPanel", "Calibration Error"),
     QT_TRANSLATE_NOOP("DaddyPanel", "Instrument not on white tile, or internal white dirty")},
    {2005, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Calibration data not valid")},
    {2006, SoundErrorUser, ErrorKind, "Error", "Calibration data not valid"},
    {2012, SoundErrorUser, ErrorKind, "Error", QT_TRANSLATE_NOOP("DaddyPanel", "Not calibrated")},
    {2013, SoundErrorUser, ErrorKind, "Error", "Not calibrated"},
    {2014, SoundErrorUser, ErrorKind, "Error", "Not calibrated"},
    {2028, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "External white tile too dirty or incorrect white tile")},
    {2033, SoundMeasurementFailed, ErrorKind, QT_TRANSLATE_NOOP("DaddyPanel", "Measurement Aborted"),
     QT_TRANSLATE_NOOP("DaddyPanel", "The measurement has been aborted by the user")},
    {2034, SoundErrorUser, NotificationKind, "Warning",
     QT_TRANSLATE_NOOP("DaddyPanel", "Battery is low. Charge the battery")},
    {2035, SoundErrorUser, NotificationKind, "Warning",
     QT_TRANSLATE_NOOP("DaddyPanel", "Battery is empty. Instrument will shut down")},
    {2036, SoundErrorUser, ErrorKind, "Error", QT_TRANSLATE_NOOP("DaddyPanel", "Error in shutter motor")},
    {2037, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "No stored reference measurement")},
    {2042, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Spectral integration time on white too long")},
    {2043, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Wavelength shift above absolute limit of 5 nm")},
    {2047, SoundErrorUser, NotificationKind, "Warning", QT_TRANSLATE_NOOP("DaddyPanel", "Low Storage")},
    {2100, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Problem occurred changing Wi-Fi modes")},
    {2101, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Problem occurred scanning for Wi-Fi")},
    {2102, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Sample temperature too high (IR Sensor)")},
    {2103, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Sample temperature too low (IR Sensor)")},
    {2118, SoundErrorUser, ErrorKind, "Warning",
     QT_TRANSLATE_NOOP("DaddyPanel", "Battery level is too low for update")},
    {2119, SoundErrorUser, ErrorKind, "Warning", QT_TRANSLATE_NOOP("DaddyPanel", "Date and time not set")},
    {3234, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Problem during initialization. Please reboot the device")},
    {3235, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Hardware communication error. Please reboot the device")},
    {3236, SoundErrorUser, ErrorKind, "Error", QT_TRANSLATE_NOOP("DaddyPanel", "Error during measurement")},
    {3237, SoundErrorUser, ErrorKind, "Error",
     QT_TRANSLATE_NOOP("DaddyPanel", "Different best matches for checkpoints")},
};

const int kTagInvalidIssue = -92934;
const int kCalculationFinishedIssue = -1;
const int kCalibrationNeededIssue = 15;

// The parent's slot names, when the parent keeps the screen stack.
bool keepsTheStack(QObject* parent)
{
    return parent
        && parent->metaObject()->indexOfSlot("onAddScreenToStack(SCREEN_ID_T)") >= 0;
}

} // namespace

DaddyPanel::DaddyPanel(QWidget* parent)
    : MarigoldFullScreenPanel(parent)
    , m_opacityEffect(new QGraphicsOpacityEffect(this))
{
    init(TRANSITION_EFFECT_POP, TRANSITION_DIRECTION_IN_LEFT);
}

DaddyPanel::DaddyPanel(TRANSITION_DIRECTION_T, QWidget* parent)
    : MarigoldFullScreenPanel(parent)
    , m_opacityEffect(new QGraphicsOpacityEffect(this))
{
    init(TRANSITION_EFFECT_POP, TRANSITION_DIRECTION_IN_LEFT);
}

DaddyPanel::DaddyPanel(TRANSITION_EFFECT_T, QWidget* parent)
    : MarigoldFullScreenPanel(parent)
    , m_opacityEffect(new QGraphicsOpacityEffect(this))
{
    init(TRANSITION_EFFECT_POP, TRANSITION_DIRECTION_IN_LEFT);
}

DaddyPanel::~DaddyPanel()
{
    m_powerDownTimer.stop();
    m_propertyAnimationIn.stop();
    m_propertyAnimationOut.stop();
    onCloseAllPopups();
    onCloseMessageBox();
    onCloseLockScreen();
    onCloseCalScreen();
    delete m_powerDownPopup;
    m_powerDownPopup = nullptr;
}

void DaddyPanel::init(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction)
{
    qRegisterMetaType<SCREEN_ID_T>("SCREEN_ID_T");
    qRegisterMetaType<PopupPanel*>("PopupPanel*");

    m_calPopup = nullptr;
    m_messageBox = nullptr;
    m_powerDownPopup = nullptr;
    m_lockScreen = nullptr;
    m_ActiveStatus = false;
    m_ScreenIsClosing = false;
    m_transitionInEffect = TRANSITION_EFFECT_POP;
    m_transitionOutEffect = TRANSITION_EFFECT_POP;
    m_transitionInDirection = TRANSITION_DIRECTION_IN_LEFT;
    m_transitionOutDirection = TRANSITION_DIRECTION_IN_RIGHT;
    m_transitionDone = false;

    m_opacityEffect->setOpacity(1.0);
    setGraphicsEffect(m_opacityEffect);
    m_shadow.setParent(this);
    m_shadow.setObjectName("shadow");
    m_shadow.hide();

    SetTransitionIn(effect, direction);

    QObject* stack = parent();
    if (keepsTheStack(stack)) {
        connect(this, SIGNAL(AddScreenToStack(SCREEN_ID_T)), stack, SLOT(onAddScreenToStack(SCREEN_ID_T)));
        connect(this, SIGNAL(CloseCurrentScreen()), stack, SLOT(onCloseCurrentScreen()));
        connect(this, SIGNAL(CloseScreenSignal(QWidget*)), stack, SLOT(onCloseScreen(QWidget*)));
        connect(this, SIGNAL(RemoveAndAddScreenToStack(QWidget*, SCREEN_ID_T)), stack,
                SLOT(onRemoveAndAddScreenToStack(QWidget*, SCREEN_ID_T)));
        connect(this, SIGNAL(GotoHomeScreenSignal()), stack, SLOT(onGotoHomeScreen()));
        connect(this, SIGNAL(GotoSyncScreenSignal()), stack, SLOT(onGotoSyncScreen()));
    }

    m_powerDownTimer.setSingleShot(true);
    connect(&m_powerDownTimer, &QTimer::timeout, this, &DaddyPanel::onPowerDownTimeout);
    connect(&m_propertyAnimationIn, &QAbstractAnimation::finished, this, &DaddyPanel::onTransitionEnded);
    connect(&m_propertyAnimationOut, &QAbstractAnimation::finished, this, &DaddyPanel::onTransitionEnded);
    connect(&m_propertyAnimationIn, &QAbstractAnimation::finished, this, &DaddyPanel::pageInView);
    connect(&m_propertyAnimationOut, &QAbstractAnimation::finished, this, &DaddyPanel::pageOutOfView);

    API_SignalMaster* hub = API_SignalMaster::instance();
    connect(hub, &API_SignalMaster::JobInfoUpdated, this, &DaddyPanel::onUpdateScreen);
    connect(hub, &API_SignalMaster::MeasurementIssue, this, &DaddyPanel::onMeasurementIssue);
    DataManager* data = DataManager::instance();
    connect(data, &DataManager::showMessageBox, this, &DaddyPanel::onShowMessageBoxPopup);
    connect(data, &DataManager::updateSystemState, this, &DaddyPanel::onUpdateSystemState);
}

// ---- Transition settings --------------------------------------------------------

void DaddyPanel::SetTransitionInDirection(TRANSITION_DIRECTION_T direction)
{
    if (direction >= NUM_TRANSITION_DIRECTIONS)
        return;
    m_transitionInDirection = direction;
    m_transitionOutDirection = direction;
}

void DaddyPanel::SetTransitionOutDirection(TRANSITION_DIRECTION_T direction)
{
    if (direction >= NUM_TRANSITION_DIRECTIONS)
        return;
    m_transitionOutDirection = direction;
}

void DaddyPanel::SetTransitionInEffect(TRANSITION_EFFECT_T effect)
{
    if (effect >= NUM_TRANSITION_EFFECTS)
        return;
    m_transitionInEffect = effect;
    if (effect == TRANSITION_EFFECT_POP)
        m_transitionDone = true;
    m_transitionOutEffect = effect;
}

void DaddyPanel::SetTransitionOutEffect(TRANSITION_EFFECT_T effect)
{
    if (effect >= NUM_TRANSITION_EFFECTS)
        return;
    m_transitionOutEffect = effect;
}

void DaddyPanel::SetTransitionIn(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction)
{
    SetTransitionInEffect(effect);
    SetTransitionInDirection(direction);
}

void DaddyPanel::SetTransitionOut(TRANSITION_EFFECT_T effect, TRANSITION_DIRECTION_T direction)
{
    SetTransitionOutEffect(effect);
    SetTransitionOutDirection(direction);
}

// ---- Navigation -------------------------------------------------------------------

void DaddyPanel::GotoScreen(SCREEN_ID_T id)
{
    emit AddScreenToStack(id);
}

void DaddyPanel::onGotoScreen(SCREEN_ID_T id)
{
    emit AddScreenToStack(id);
}

void DaddyPanel::GotoSyncScreen()
{
    emit GotoSyncScreenSignal();
}

void DaddyPanel::CloseAndGotoScreen(SCREEN_ID_T id)
{
    if (m_ScreenIsClosing)
        return;
    m_ScreenIsClosing = true;
    emit RemoveAndAddScreenToStack(this, id);
}

void DaddyPanel::CloseScreen()
{
    if (m_ScreenIsClosing)
        return;
    m_ScreenIsClosing = true;
    performTransitionOut();
    emit CloseScreenSignal(this);
}

void DaddyPanel::onGoHome()
{
    if (m_ScreenIsClosing)
        return;
    m_ScreenIsClosing = true;
    emit GotoHomeScreenSignal();
}

void DaddyPanel::onStatusBarBtn_clicked()
{
    GotoScreen(CONFIG_MAIN_SCREEN_ID);
}

void DaddyPanel::SetActiveStatus(bool active)
{
    m_ActiveStatus = active;
    emit setActiveStatusSignal(active);
    if (active) {
        raiseOwnedWidgets();
        grabKeyboard();
    } else {
        releaseKeyboard();
    }
    update();
}

void DaddyPanel::raiseOwnedWidgets()
{
    // The popups and covers are siblings of the panel in the screen stack.
    // A panel that comes back on top (a fault screen closed over it) is
    // raised by the stack; what it owns must stand above it again, whole.
    for (PopupPanel* popup : m_popups) {
        if (popup)
            popup->raise();
    }
    for (QWidget* owned : {static_cast<QWidget*>(m_messageBox), static_cast<QWidget*>(m_powerDownPopup),
                           m_calPopup, m_lockScreen}) {
        if (owned)
            owned->raise();
    }
}

void DaddyPanel::onUpdateScreen()
{
}

void DaddyPanel::onStatusUpdate()
{
}

PopupPanel* DaddyPanel::onShowTagInvalidPopup()
{
    return nullptr;
}

void DaddyPanel::onUpdateSystemState(SYSTEM_STATE_T)
{
    onCloseCalScreen();
}

// ---- Popups and covers --------------------------------------------------------------

void DaddyPanel::onAddPopup(PopupPanel* popup)
{
    if (!popup)
        return;
    m_popups.push_back(popup);
    // A popup deleted by someone else must not stay on the list.
    connect(popup, &QObject::destroyed, this, [this](QObject* gone) {
        m_popups.erase(std::remove(m_popups.begin(), m_popups.end(), gone), m_popups.end());
    });
    popup->raise();
    popup->show();
}

void DaddyPanel::onClosePopup(PopupPanel* popup)
{
    if (!popup)
        return;
    auto it = std::find(m_popups.begin(), m_popups.end(), popup);
    if (it != m_popups.end())
        m_popups.erase(it);
    popup->hide();
    popup->disconnect(this);
    disconnect(popup);
    delete popup;
}

void DaddyPanel::onClosePopup()
{
    onClosePopup(qobject_cast<PopupPanel*>(sender()));
}

void DaddyPanel::onCloseAllPopups()
{
    for (auto it = m_popups.rbegin(); it != m_popups.rend(); ++it) {
        PopupPanel* popup = *it;
        if (!popup)
            continue;
        popup->hide();
        popup->disconnect(this);
        disconnect(popup);
        delete popup;
    }
    m_popups.clear();
}

void DaddyPanel::onCloseMessageBox()
{
    if (!m_messageBox)
        return;
    m_messageBox->disconnect(this);
    m_messageBox->hide();
    delete m_messageBox;
    m_messageBox = nullptr;
}

void DaddyPanel::dispose(QWidget*& cover)
{
    if (!cover)
        return;
    cover->disconnect(this);
    disconnect(cover);
    cover->hide();
    delete cover;
    cover = nullptr;
}

void DaddyPanel::onCloseLockScreen()
{
    dispose(m_lockScreen);
}

void DaddyPanel::onCloseSyncScreen()
{
    onCloseLockScreen();
}

void DaddyPanel::onCloseCalScreen()
{
    dispose(m_calPopup);
}

void DaddyPanel::watchCover(DaddyPanel* cover)
{
    // A cover that closes itself (a sync cover's time limit) is deleted by
    // its owner, after the cover's own timer has returned.
    connect(cover, &DaddyPanel::CloseScreenSignal, this, &DaddyPanel::onCoverClosed,
            Qt::QueuedConnection);
}

void DaddyPanel::onCoverClosed(QWidget* cover)
{
    // The queued request may name a cover that was deleted meanwhile: only
    // once the pointer is known to be one of ours is the object touched.
    // Only the cover that asked, not a newer one in the same place.
    if (!cover || (cover != m_lockScreen && cover != m_calPopup))
        return;
    auto* closing = qobject_cast<DaddyPanel*>(cover);
    if (!closing || !closing->isClosing())
        return;
    if (cover == m_lockScreen)
        onCloseLockScreen();
    else
        onCloseCalScreen();
}

void DaddyPanel::onShowCalScreen()
{
    onCloseCalScreen();
    auto* cover = new LockScreen(parentWidget());
    cover->setTitle(tr("Calibrating"));
    m_calPopup = cover;
    watchCover(cover);
    cover->raise();
    cover->show();
}

void DaddyPanel::onShowLockScreen()
{
    if (m_lockScreen)
        return;
    auto* cover = new LockScreen(parentWidget());
    m_lockScreen = cover;
    watchCover(cover);
    cover->raise();
    cover->show();
    QCoreApplication::processEvents();
}

void DaddyPanel::onShowSyncScreen()
{
    if (m_lockScreen)
        return;
    auto* cover = new SyncScreen(parentWidget());
    m_lockScreen = cover;
    watchCover(cover);
    cover->raise();
    cover->show();
    QCoreApplication::processEvents();
}

PopupPanel* DaddyPanel::onShowMessageBoxPopup(const QString& header, const QString& message)
{
    onCloseMessageBox();
    auto* box = new NotificationPopup(parentWidget());
    box->setButtonText(tr("OK"));
    connect(box, &NotificationPopup::btnClicked, this, &DaddyPanel::onCloseMessageBox);
    box->setHeaderText(header);
    box->setMessageText(message);
    box->raise();
    box->show();
    m_messageBox = box;
    return box;
}

PopupPanel* DaddyPanel::onShowErrorPopup(const QString& button, const QString& header,
                                         const QString& message)
{
    auto* popup = new ErrorPopup(parentWidget());
    connect(popup, &NotificationPopup::btnClicked, this, qOverload<>(&DaddyPanel::onClosePopup));
    popup->setButtonText(button);
    popup->setHeaderText(header);
    popup->setMessageText(message);
    onAddPopup(popup);
    return popup;
}

PopupPanel* DaddyPanel::onShowNotificationPopup(const QString& button, const QString& header,
                                                const QString& message)
{
    auto* popup = new NotificationPopup(parentWidget());
    connect(popup, &NotificationPopup::btnClicked, this, qOverload<>(&DaddyPanel::onClosePopup));
    popup->setButtonText(button);
    popup->setHeaderText(header);
    popup->setMessageText(message);
    onAddPopup(popup);
    return popup;
}

// ---- Measurement issues --------------------------------------------------------------

PopupPanel* DaddyPanel::raiseIssuePopup(bool error, const char* title, const char* text)
{
    const QString button = tr("OK");
    const QString header = QCoreApplication::translate("DaddyPanel", title);
    const QString message = QCoreApplication::translate("DaddyPanel", text);
    return error ? onShowErrorPopup(button, header, message)
                 : onShowNotificationPopup(button, header, message);
}

PopupPanel* DaddyPanel::onMeasurementIssue(int code)
{
    // Every panel hears every issue; only the one on top answers.
    if (!m_ActiveStatus)
        return nullptr;

    switch (code) {
    case kTagInvalidIssue:
        playSoundErrorUser();
        return onShowTagInvalidPopup();
    case kCalculationFinishedIssue:
        playSoundCalculationFinished();
        return nullptr;
    case kCalibrationNeededIssue:
        playSoundErrorUser();
        onGotoScreen(CAL_WIZARD_SCREEN_ID);
        return nullptr;
    default:
        break;
    }

    for (const Issue& issue : kIssues) {
        if (issue.code != code)
            continue;
        if (issue.sound == SoundMeasurementFailed)
            playSoundMeasurementFailed();
        else
            playSoundErrorUser();
        return raiseIssuePopup(issue.popup == ErrorKind, issue.title, issue.text);
    }
    return nullptr;
}

// ---- The power key ------------------------------------------------------------------

void DaddyPanel::keyPressEvent(QKeyEvent* event)
{
    // The power key and the read switch both arrive as Return. A held key
    // repeats on some keyboards: only the first press counts.
    if (m_ActiveStatus && event->key() == Qt::Key_Return) {
        if (!event->isAutoRepeat())
            m_powerDownTimer.start(PowerKeyHoldMs);
        return;
    }
    MarigoldFullScreenPanel::keyPressEvent(event);
}

void DaddyPanel::keyReleaseEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Return && !event->isAutoRepeat())
        m_powerDownTimer.stop();
    MarigoldFullScreenPanel::keyReleaseEvent(event);
}

void DaddyPanel::onPowerDownTimeout()
{
    onClosePowerDownPopup(m_powerDownPopup);
    m_powerDownPopup = new PowerDownPopup(this);
    connect(m_powerDownPopup, &PopupPanel::closePopup, this, &DaddyPanel::onClosePowerDownPopup);
    m_powerDownPopup->raise();
    m_powerDownPopup->show();
}

void DaddyPanel::onClosePowerDownPopup(PopupPanel* popup)
{
    if (!popup || popup != m_powerDownPopup)
        return;
    m_powerDownPopup->disconnect(this);
    delete m_powerDownPopup;
    m_powerDownPopup = nullptr;
}

// ---- Transitions --------------------------------------------------------------------

void DaddyPanel::showEvent(QShowEvent* event)
{
    switch (m_transitionInEffect) {
    case TRANSITION_EFFECT_SLIDE:
        m_opacityEffect->setOpacity(1.0);
        SlideInTransition(GetGeometry(m_transitionInDirection), geometry());
        break;
    case TRANSITION_EFFECT_FADE:
        FadeInTransition();
        break;
    default:
        m_opacityEffect->setOpacity(1.0);
        emit pageInView();
        break;
    }
    // The panel's own corner button is not raised here; see m_debugButton.
    MarigoldPanel::showEvent(event);
    m_debugButton.setGeometry(0, 0, 2, 2);
    m_debugButton.raise();
}

QRect DaddyPanel::GetGeometry(TRANSITION_DIRECTION_T direction)
{
    const QRect g = geometry();
    switch (direction) {
    case TRANSITION_DIRECTION_IN_LEFT: return g.translated(g.width(), 0);
    case TRANSITION_DIRECTION_IN_RIGHT: return g.translated(-g.width(), 0);
    case TRANSITION_DIRECTION_IN_UP: return g.translated(0, g.height());
    case TRANSITION_DIRECTION_IN_DOWN: return g.translated(0, -g.height());
    default: return g;
    }
}

void DaddyPanel::SlideInTransition(QRect from, QRect to)
{
    SlideTransition(from, to, &m_propertyAnimationIn);
}

void DaddyPanel::SlideOutTransition(QRect from, QRect to)
{
    SlideTransition(from, to, &m_propertyAnimationOut);
}

void DaddyPanel::SlideTransition(QRect from, QRect to, QPropertyAnimation* animation)
{
    animation->stop();
    animation->setTargetObject(this);
    animation->setPropertyName("geometry");
    performTransition(from, to, 250, animation);
}

void DaddyPanel::FadeInTransition()
{
    // The out animation on purpose: a finished fade-in reports pageOutOfView.
    FadeTransition(0.1, 1.0, &m_propertyAnimationOut);
}

void DaddyPanel::FadeOutTransition()
{
    FadeTransition(1.0, 0.1, &m_propertyAnimationOut);
}

void DaddyPanel::FadeTransition(double start, double end, QPropertyAnimation* animation)
{
    start = std::clamp(start, 0.1, 1.0);
    end = std::clamp(end, 0.1, 1.0);
    spinUntil([animation] { return animation->state() != QAbstractAnimation::Running; });
    animation->setTargetObject(m_opacityEffect);
    animation->setPropertyName("opacity");
    performTransition(start, end, 150, animation);
}

void DaddyPanel::performTransition(QVariant from, QVariant to, int ms, QPropertyAnimation* animation)
{
    m_transitionDone = false;
    animation->setDuration(ms);
    animation->setStartValue(from);
    animation->setEndValue(to);
    animation->start(QAbstractAnimation::KeepWhenStopped);
}

void DaddyPanel::onTransitionEnded()
{
    m_transitionDone = true;
}

void DaddyPanel::performTransitionOut()
{
    // A closing screen sees no more news.
    API_SignalMaster::instance()->disconnect(this);
    DataManager::instance()->disconnect(this);

    if (m_transitionOutEffect == TRANSITION_EFFECT_SLIDE)
        SlideOutTransition(geometry(), GetGeometry(m_transitionOutDirection));
    else if (m_transitionOutEffect == TRANSITION_EFFECT_FADE)
        FadeOutTransition();
    spinUntil([this] { return m_transitionDone; });
}
