#include "Screens/ScreenMaster.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/ConfigMainScreen.h"
#include "Screens/DaddyPanel.h"
#include "Screens/JobEditScreens.h"
#include "Screens/JobListScreen.h"
#include "Screens/LockScreen.h"
#include "Screens/RestoreFactorySettingsPopup.h"
#include "Screens/SadPuppyScreen.h"
#include "Screens/SyncScreen.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/Theme.h"

#include <QApplication>
#include <QDebug>
#include <QElapsedTimer>
#include <QRecursiveMutex>
#include <QStackedLayout>
#include <QTranslator>

namespace {

// Guards every stack operation. Recursive: compound slots call the simple
// ones under it, and the wait for a transition runs queued events that may
// come back in.
QRecursiveMutex lock_;

ScreenMaster::ScreenFactory& factoryOverride()
{
    static ScreenMaster::ScreenFactory factory;
    return factory;
}

// The longest a replacement screen may take to finish arriving.
const int kTransitionWaitLimitMs = 2000;

DaddyPanel* asPanel(QWidget* w)
{
    return qobject_cast<DaddyPanel*>(w);
}

} // namespace

void Ui::ScreenMaster::setupUi(QMainWindow* window)
{
    window->setObjectName("ScreenMaster");
    window->resize(Theme::ScreenWidth, Theme::ScreenHeight);
    window->setStyleSheet("border-color: black;");
    centralwidget = new QWidget(window);
    centralwidget->setObjectName("centralwidget");
    window->setCentralWidget(centralwidget);
}

void ScreenMaster::setScreenFactoryOverride(ScreenFactory factory)
{
    factoryOverride() = std::move(factory);
}

QString ScreenMaster::languageFilePath(const QString& code)
{
    return Platform::devicePath(QString("/opt/GUI/Languages/MarigoldGuiApp_%1.qm").arg(code, 0, QChar(' ')));
}

ScreenMaster::ScreenMaster(QWidget* parent)
    : QMainWindow(parent)
    , ui(new Ui::ScreenMaster)
    , m_pTranslator(new QTranslator(this))
{
    QApplication::installTranslator(m_pTranslator);
    setWindowFlags(windowFlags() | Qt::CustomizeWindowHint | Qt::WindowStaysOnTopHint);
    ui->setupUi(this);
    qRegisterMetaType<SCREEN_ID_T>("SCREEN_ID");
    qRegisterMetaType<SCREEN_ID_T>("SCREEN_ID_T");

    // The language's font before the first widget exists: widgets polished
    // by a style sheet take the font they are polished with.
    QApplication::setFont(LocaleHelper::determineFontFromCountryCode(UserParams::getLanguageCode()));
    LaunchFirstScreen();

    connect(DataManager::instance(), &DataManager::languageChanged, this, &ScreenMaster::onLoadLanguage);
    API_SignalMaster* hub = API_SignalMaster::instance();
    connect(hub, &API_SignalMaster::LockStarted, this, &ScreenMaster::onGotoLockScreen);
    connect(hub, &API_SignalMaster::LockFinished, this, &ScreenMaster::onCloseLockScreen);
    connect(hub, &API_SignalMaster::SyncScreen, this, &ScreenMaster::onGotoSyncScreen);
    connect(hub, &API_SignalMaster::GoHome, this, &ScreenMaster::onGotoHomeScreen);
    connect(hub, &API_SignalMaster::GoToLabMode, this, &ScreenMaster::onGotoLabMode);
    connect(hub, &API_SignalMaster::GoToWhiteCalibration, this, &ScreenMaster::onGotoWhiteCalibration);
    connect(hub, &API_SignalMaster::GoToRefCheck, this, &ScreenMaster::onGotoRefCheck);
    connect(hub, &API_SignalMaster::SadPuppy, this, &ScreenMaster::onGotoSadPuppy);
    connect(hub, &API_SignalMaster::DisplayCalibrationPopup, this, &ScreenMaster::onDisplayCalibrationPopup);

    onLoadLanguage(UserParams::getLanguageCode());
}

ScreenMaster::~ScreenMaster()
{
    QApplication::removeTranslator(m_pTranslator);
    delete ui;
}

int ScreenMaster::screenCount() const
{
    return m_ScreenStack ? m_ScreenStack->count() : 0;
}

QWidget* ScreenMaster::currentScreen() const
{
    return m_ScreenStack ? m_ScreenStack->currentWidget() : nullptr;
}

QWidget* ScreenMaster::screenAt(int index) const
{
    return m_ScreenStack ? m_ScreenStack->widget(index) : nullptr;
}

void ScreenMaster::LaunchFirstScreen()
{
    QMutexLocker locker(&lock_);
    m_ScreenStack = new QStackedLayout(ui->centralwidget);
    m_ScreenStack->setStackingMode(QStackedLayout::StackAll);
    m_ScreenStack->setContentsMargins(0, 0, 0, 0);
    QWidget* home = createScreen(JOB_LIST_SCREEN_ID);
    if (!home) {
        qDebug() << "ScreenMaster: no home screen to show";
        return;
    }
    m_ScreenStack->addWidget(home);
    if (DaddyPanel* panel = asPanel(home))
        panel->SetActiveStatus(true);
    m_ScreenStack->setCurrentWidget(home);
}

QWidget* ScreenMaster::createScreen(SCREEN_ID_T id)
{
    if (factoryOverride()) {
        if (QWidget* screen = factoryOverride()(id, this))
            return screen;
    }
    // Screens of later parts join this list as they are built.
    switch (id) {
    case JOB_LIST_SCREEN_ID: return new JobListScreen(this);
    case SYNC_SCREEN_ID: return new SyncScreen(this);
    case LOCK_SCREEN_ID: return new LockScreen(this);
    case SAD_PUPPY_POPUP_SCREEN_ID: return new SadPuppyScreen(this);
    case CONFIG_MAIN_SCREEN_ID: return new ConfigMainScreen(this);
    case RESTORE_FACTORY_SETTINGS_POPUP_SCREEN_ID: return new RestoreFactorySettingsPopup(this);
    case DELETE_ALL_SAMPLES_POPUP_SCREEN_ID: return new DeleteAllSamplesPopup(this);
    case JOB_NAME_SCREEN_ID: return new JobNameEditScreen(this);
    case JOB_TAGS_1_SCREEN_ID: return new JobTagEditScreen(TAG_STATE_1, this);
    case JOB_TAGS_2_SCREEN_ID: return new JobTagEditScreen(TAG_STATE_2, this);
    case JOB_TAGS_3_SCREEN_ID: return new JobTagEditScreen(TAG_STATE_3, this);
    case JOB_TAGS_1_FREE_EDIT_SCREEN_ID: return new JobTagFreeEditScreen(TAG_STATE_1, this);
    case JOB_TAGS_2_FREE_EDIT_SCREEN_ID: return new JobTagFreeEditScreen(TAG_STATE_2, this);
    case JOB_TAGS_3_FREE_EDIT_SCREEN_ID: return new JobTagFreeEditScreen(TAG_STATE_3, this);
    case JOB_FREE_TEXT_SCREEN_ID: return new JobFreeTextEditScreen(this);
    default: return nullptr;
    }
}

void ScreenMaster::activateTop()
{
    const int count = m_ScreenStack->count();
    if (count == 0)
        return;
    QWidget* top = m_ScreenStack->widget(count - 1);
    m_ScreenStack->setCurrentWidget(top);
    for (int i = 0; i < count; ++i) {
        if (DaddyPanel* panel = asPanel(m_ScreenStack->widget(i)))
            panel->SetActiveStatus(false);
    }
    if (DaddyPanel* panel = asPanel(top))
        panel->SetActiveStatus(true);
}

QWidget* ScreenMaster::onAddScreenToStack(SCREEN_ID_T id)
{
    QMutexLocker locker(&lock_);
    QWidget* screen = createScreen(id);
    if (!screen) {
        // The asking panel often disabled itself to wait for the new screen;
        // it must not stay dead when none comes.
        qDebug() << "ScreenMaster: no screen for id" << int(id);
        activateTop();
        if (QWidget* top = m_ScreenStack->currentWidget())
            top->setEnabled(true);
        return nullptr;
    }
    m_ScreenStack->addWidget(screen);
    m_ScreenStack->setCurrentWidget(screen);
    for (int i = 0; i < m_ScreenStack->count(); ++i) {
        if (DaddyPanel* panel = asPanel(m_ScreenStack->widget(i)))
            panel->SetActiveStatus(false);
    }
    if (DaddyPanel* panel = asPanel(screen))
        panel->SetActiveStatus(true);
    return screen;
}

void ScreenMaster::onCloseScreen(QWidget* screen)
{
    QMutexLocker locker(&lock_);
    const int index = screen ? m_ScreenStack->indexOf(screen) : -1;
    if (index >= 0) {
        m_ScreenStack->removeWidget(screen);
        screen->deleteLater();
    }
    activateTop();
}

void ScreenMaster::onCloseCurrentScreen()
{
    QMutexLocker locker(&lock_);
    if (m_ScreenStack->count() > 1)
        onCloseScreen(m_ScreenStack->currentWidget());
}

void ScreenMaster::onRemoveAndAddScreenToStack(QWidget* screen, SCREEN_ID_T id)
{
    QMutexLocker locker(&lock_);
    QWidget* added = onAddScreenToStack(id);
    if (DaddyPanel* panel = asPanel(added)) {
        // The old screen stays beneath until the new one stands.
        QElapsedTimer waited;
        waited.start();
        while (!panel->GetTransitionInComplete() && waited.elapsed() < kTransitionWaitLimitMs)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 10);
    }
    onCloseScreen(screen);
}

void ScreenMaster::onGotoHomeScreen()
{
    QMutexLocker locker(&lock_);
    while (m_ScreenStack->count() >= 2)
        onCloseScreen(m_ScreenStack->currentWidget());
}

void ScreenMaster::onGotoLabMode()
{
    QMutexLocker locker(&lock_);
    onGotoHomeScreen();
    onAddScreenToStack(TARGETING_SCREEN_ID);
}

void ScreenMaster::gotoCalibrationStep(SCREEN_ID_T id)
{
    QMutexLocker locker(&lock_);
    QWidget* current = m_ScreenStack->currentWidget();
    // Already inside the wizard: the request is dropped.
    if (current && current->objectName() == QLatin1String("CalibrationWizardScreen"))
        return;
    onGotoHomeScreen();
    onAddScreenToStack(id);
}

void ScreenMaster::onGotoWhiteCalibration()
{
    gotoCalibrationStep(CAL_WIZARD_STEPS_INSTRUCTIONS_ID);
}

void ScreenMaster::onGotoRefCheck()
{
    gotoCalibrationStep(CAL_WIZARD_STEPS_REF_CHECK_INSTRUCTIONS_ID);
}

void ScreenMaster::addUnlessOnTop(const char* className, SCREEN_ID_T id)
{
    QMutexLocker locker(&lock_);
    QWidget* current = m_ScreenStack->currentWidget();
    if (m_ScreenStack->count() > 0 && current
        && QLatin1String(current->metaObject()->className()) != QLatin1String(className))
        onAddScreenToStack(id);
}

void ScreenMaster::onGotoSadPuppy()
{
    QMutexLocker locker(&lock_);
    onGotoHomeScreen();
    // The short word on purpose: the test passes whatever is on top, and the
    // go-home has left only the home screen.
    addUnlessOnTop("SadPuppy", SAD_PUPPY_POPUP_SCREEN_ID);
}

void ScreenMaster::onGotoLockScreen()
{
    // Raised at every status snapshot while locked: one lock screen only.
    addUnlessOnTop("LockScreen", LOCK_SCREEN_ID);
}

void ScreenMaster::onGotoSyncScreen()
{
    addUnlessOnTop("SyncScreen", SYNC_SCREEN_ID);
}

void ScreenMaster::onCloseLockScreen()
{
    QMutexLocker locker(&lock_);
    if (m_ScreenStack->count() == 0)
        return;
    auto isLock = [](QWidget* w) {
        return w && QLatin1String(w->metaObject()->className()) == QLatin1String("LockScreen");
    };
    if (isLock(m_ScreenStack->currentWidget())) {
        onCloseCurrentScreen();
        return;
    }
    for (int i = 0; i < m_ScreenStack->count(); ++i) {
        if (isLock(m_ScreenStack->widget(i))) {
            onCloseScreen(m_ScreenStack->widget(i));
            return;
        }
    }
}

void ScreenMaster::onDisplayCalibrationPopup()
{
    onAddScreenToStack(CAL_WIZARD_SCREEN_ID);
}

bool ScreenMaster::onLoadLanguage(const QString& code)
{
    QMutexLocker locker(&lock_);
    QApplication::setFont(LocaleHelper::determineFontFromCountryCode(code));
    // A widget with a style sheet keeps the font it was polished with; only
    // setting its sheet again makes it take the new family.
    for (QWidget* widget : QApplication::allWidgets()) {
        if (!widget->styleSheet().isEmpty())
            widget->setStyleSheet(widget->styleSheet());
    }
    const bool loaded = onLoadLanguageFile(languageFilePath(code));
    // Whatever the load gave: a missing file leaves the previous texts.
    reTranslateStringTables();
    return loaded;
}

bool ScreenMaster::onLoadLanguageFile(const QString& path)
{
    const bool loaded = m_pTranslator->load(path, QString(), QString(), QString());
    qDebug() << "ScreenMaster: language file" << path << (loaded ? "loaded" : "not loaded");
    return loaded;
}
