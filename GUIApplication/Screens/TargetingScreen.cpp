#include "Screens/TargetingScreen.h"

#include "ui_TargetingScreen.h"

#include "Commands/CalibrationOutCommands.h"
#include "Commands/SystemOutCommands.h"
#include "Commands/TargetingOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "GUIAPI/SystemAPI.h"
#include "GUIAPI/TargetingAPI.h"
#include "Screens/DeletePopup.h"
#include "Screens/MeasuringPopup.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "Screens/TerminateJobPopup.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"
#include "Widgets/XPushButton.h"

#include <QDebug>
#include <QEvent>
#include <QKeyEvent>
#include <QRecursiveMutex>
#include <QStyle>
#include <QThread>
#include <QTransform>

#include <cstdlib>

namespace {

// Guards the poll, the feet and the auto-measure machine against re-entry
// from the event loops that the blocking waits and popups run.
QRecursiveMutex lock_;

const uint kNoJob = 65535;
const STATUS_T kStatusNotReady = 14;
const int kTimeoutIssue = 23;
const int kCalculationFinishedIssue = -1;

const int kPollIntervalMs = 200;
// Every 300th tick (once a minute) the calibration state is read as well.
const int kCalibrationEvery = 300;
// How long a busy instrument may take to become ready for targeting.
const qint64 kNotReadyWaitMs = 14999;
// The instrument must be off the surface this long before auto-measure arms.
const int kAutoMeasureReleaseMs = 700;
// A stop of targeting this early, before it ever ran, is a retry.
const qint64 kStartupRetryMs = 5000;

// The reticle turns red beyond this many degrees from the job's angle; at
// and above 340 degrees it stays green whatever the job asks.
const int kOrientationTolerance = 20;
const int kOrientationGreenFrom = 340;

const int kImageWidth = 482;
const int kImageHeight = 348;
const int kImageBytesPerLine = kImageWidth * 3;
const int kImageBytes = kImageBytesPerLine * kImageHeight;

const int kNumberRowY = 447;
const int kNumberAlignment = 132; // Qt::AlignHCenter | Qt::AlignVCenter
const int kNumberPointSize = 15;

const int kJobStateSmcEnded = 2002;
const int kJobStateSmcForced = 2003;
const int kJobStateSmcEndedOnline = 2005;
const int kJobStateSmcForcedOnline = 2006;

bool allActive(const PRESSURE_SWITCH_T& s)
{
    return s.Switch1 && s.Switch2 && s.Switch3;
}

bool noneActive(const PRESSURE_SWITCH_T& s)
{
    return !s.Switch1 && !s.Switch2 && !s.Switch3;
}

bool isSmcLook(JOB_AVERAGING_MODE_T mode)
{
    return mode == JOB_AVG_MODE_SMC
        || (mode == JOB_AVG_MODE_GUI && UserParams::getJobDefaultAvgInfo().mode == JOB_AVG_MODE_SMC);
}

} // namespace

TargetingScreen::TargetingScreen(QWidget* parent)
    : DaddyPanel(TRANSITION_EFFECT_POP, parent)
    , ui(nullptr)
    , m_showingOverride(false)
    , m_bDebounced(true)
    , m_tempWarningShown(false)
    , m_targetingStarted(false)
    , m_autoMeasState(TARGETING_AUTO_MEASURE_OFF)
    , m_transitionWaiting(false)
    , m_completedCreating(false)
    , m_idlePopup(nullptr)
    , m_status(STATUS_OK)
    , m_calibStatus(CALIBRATION_STATUS_GOOD)
{
    DataManager* data = DataManager::instance();
    API_SignalMaster* hub = API_SignalMaster::instance();
    if (UserParams::getLabModeEnabled())
        setObjectName(QStringLiteral("TargetingScreenLabMode"));

    ui = new Ui::TargetingScreen;
    ui->setupUi(this);
    setAttribute(Qt::WA_StyledBackground, true);
    // The form lists the grounds after what stands on them.
    ui->labelFooterBackground->lower();
    ui->labelHeaderBackground->lower();
    ui->labelTargetImage->lower();
    Theme::styleButton(ui->BtnMeasure, Theme::PrimaryButton);
    Theme::styleButton(ui->BtnSMCDone, Theme::SecondaryButton);

    m_completedCreating = false;
    ui->TxtTitle->setMaxTextLength(20);
    ui->TxtTitle->setAutoSize(true);
    ui->BtnMeasure->setDebounceTime(500);
    ui->labelAutoMeasure->setVisible(false);
    ui->BtnSMCDone->hide();
    m_bDebounced = true;
    m_tempWarningShown = false;
    m_autoMeasState = TARGETING_AUTO_MEASURE_OFF;
    m_debounceTimer.setSingleShot(true);
    // The switch's waits are promises to the operator: not 5 % early.
    m_debounceTimer.setTimerType(Qt::PreciseTimer);
    m_autoMeasTimer.setTimerType(Qt::PreciseTimer);
    m_targetingStarted = false;
    m_idlePopup = nullptr;
    m_centerPoint = ui->labelAlignmentCurrent->geometry().center();
    m_showingOverride = false;
    m_sampleNumbers.clear();
    imageBuffer.reserve(kImageBytes);
    m_imageData.reserve(kImageBytes);
    m_pixmapTargetingGreen = QPixmap(QStringLiteral(":/Assets/targeting_reticle_green.png"));
    m_pixmapTargetingRed = QPixmap(QStringLiteral(":/Assets/targeting_reticle_red.png"));
    m_frameClock.start();

    createScreen();

    connect(hub, &API_SignalMaster::TriggerTargetingStart, this, &TargetingScreen::onTriggerTargetingStart);
    connect(hub, &API_SignalMaster::TriggerTargetingStop, this, &TargetingScreen::onTriggerTargetingStop);
    connect(&m_TargetingTimer, &QTimer::timeout, this, &TargetingScreen::onTargetingTimer);
    connect(hub, &API_SignalMaster::TriggerMeasurement, this, &TargetingScreen::onTriggerTargetingPause);

    TargetingAPI_StartPolling();
    onUpdateOrientation(data->getInstrumentPosition());
    onUpdateSampleInfo();
    onUpdateOrientationEnabled(UserParams::getOrientationEnabled());

    connect(data, &DataManager::updateTargetingImage, this, &TargetingScreen::onImageUpdate);
    connect(data, &DataManager::updatePressureSensorStatus, this, &TargetingScreen::onPressureSensorUpdate);
    connect(data, &DataManager::updateInstrumentPosition, this, &TargetingScreen::onUpdateOrientation);
    connect(data, &DataManager::updateOrientatonEnabled, this, &TargetingScreen::onUpdateOrientationEnabled);
    connect(data, &DataManager::autoMeasureChanged, this, &TargetingScreen::onAutoGotoStateOff);
    connect(hub, &API_SignalMaster::MeasurementComplete, this, &TargetingScreen::onMeasurementComplete);
    connect(hub, &API_SignalMaster::JobInfoUpdated, this, &TargetingScreen::onUpdateTargettingScreen);
    connect(hub, &API_SignalMaster::TargetingImageUpdated, this, &TargetingScreen::onTargetingImageUpdate);
    connect(hub, &API_SignalMaster::TriggerTargetingStop, this, &TargetingScreen::onTargetingStopped);
    connect(hub, &API_SignalMaster::MeasurementStarted, this, &TargetingScreen::onMeasurementStarted);
    connect(hub, &API_SignalMaster::TemperatureWarning, this, &TargetingScreen::onShowTempWarningPopup);
    connect(this, &DaddyPanel::setActiveStatusSignal, this, &TargetingScreen::onSetActiveStatus);
    connect(&m_debounceTimer, &QTimer::timeout, this, &TargetingScreen::onDebounceTimeut);
    connect(ui->BtnMeasure, &QPushButton::clicked, this, &TargetingScreen::onReadSwitchPressed);
    connect(&m_initTimer, &QTimer::timeout, this, &TargetingScreen::onInit);

    onAutoGotoStateOff();
    ui->BtnMeasure->raise();
    ui->BtnSMCDone->raise();
    m_screenBeenShowing.start();
    RestartDebounce(500);
    m_initTimer.setSingleShot(true);
    m_initTimer.start(300);
    m_constructing = false;
}

TargetingScreen::~TargetingScreen()
{
    m_TargetingTimer.stop();
    m_autoMeasTimer.stop();
    disconnect(API_SignalMaster::instance(), &API_SignalMaster::TriggerTargetingStop, this,
               &TargetingScreen::onTargetingStopped);
    for (QLabel* label : m_sampleNumbers)
        delete label;
    m_sampleNumbers.clear();
    delete ui;
    ui = nullptr;
    // Leaving the screen drops the override: the next job asks again.
    if (UserParams::getDisplayrOverridePressureSensoMenuItem())
        UserParams::setOverridePressureSensors(false);
}

// ---- Building -----------------------------------------------------------------------

void TargetingScreen::createScreen()
{
    const Job job = DataManager::instance()->getActiveJobObject();
    if (!job.isJobValid())
        return;

    for (QLabel* label : m_sampleNumbers)
        delete label;
    m_sampleNumbers.clear();

    const bool labMode = UserParams::getLabModeEnabled();
    JOB_AVERAGING_MODE_T mode = job.getJobAveragingMode();
    const JOB_AVERAGING_INFO_T defaults = UserParams::getJobDefaultAvgInfo();
    if (isSmcLook(mode) || (mode == JOB_AVG_MODE_NONE && labMode)) {
        ui->labelSMC->show();
        ui->labelSampleBox->hide();
        if (labMode)
            ui->labelSMC->setText(tr("Online Mode"));
        return;
    }

    ui->labelSMC->hide();
    if (mode == JOB_AVG_MODE_GUI)
        mode = defaults.mode;
    int n = int(job.getJobSize());
    if (n == 0) {
        if (mode == JOB_AVG_MODE_SIMPLE_3)
            n = 3;
        else if (mode == JOB_AVG_MODE_SIMPLE_5)
            n = 5;
        else
            n = int(UserParams::getJobDefaultSize());
    }

    const QRect box = ui->labelSampleBox->geometry();
    QFont font = this->font();
    font.setPointSize(kNumberPointSize);
    m_sampleNumbers.reserve(size_t(qMax(0, n)));
    for (int i = 0; i < n; ++i) {
        QLabel* label = new QLabel(this);
        label->setObjectName(QStringLiteral("labelSampleNumber%1").arg(i + 1));
        label->setText(QString::number(i + 1));
        label->setAlignment(Qt::Alignment(kNumberAlignment));
        label->setFont(font);
        const int x = (i + 1) * Theme::ScreenWidth / (n + 1) - box.width() / 2;
        label->setGeometry(x, kNumberRowY, box.width(), box.height());
        label->raise();
        label->show();
        m_sampleNumbers.push_back(label);
    }
}

void TargetingScreen::onInit()
{
    m_completedCreating = true;
    onUpdateSampleInfo();
}

void TargetingScreen::onUpdateTitleText()
{
    const Job job = DataManager::instance()->getActiveJobObject();
    if (job.isJobValid())
        ui->TxtTitle->setText(job.getDisplayName());
}

void TargetingScreen::onUpdateTargettingScreen()
{
    createScreen();
    onUpdateSampleInfo();
}

void TargetingScreen::finishCompleteJob(bool labMode)
{
    // Not yet on the stack: the init step, 300 ms on, ends the job.
    if (m_constructing)
        return;
    playSoundJobComplete();
    TargetingAPI_StopPolling();
    DelayBlocking(1000);
    if (labMode)
        onShowLabModeJobCompletePopup();
    else
        CloseAndGotoScreen(JOB_MEASURE_SCREEN_ID);
}

void TargetingScreen::onUpdateSampleInfo()
{
    if (isClosing())
        return;
    DataManager* data = DataManager::instance();
    const bool labMode = UserParams::getLabModeEnabled();
    const Job job = data->getActiveJobObject();
    if (!job.isJobValid() && !labMode) {
        // Not yet on the stack: the init step, 300 ms on, leaves.
        if (m_constructing)
            return;
        TargetingAPI_StopPolling();
        // A model emptied by a lost link is the fault screen's business:
        // going home now would take that screen away again.
        if (data->getDataInitialized())
            API_SignalMaster::instance()->emitGoHome();
        return;
    }

    onUpdateTitleText();

    const int samples = job.getNumSamples();
    if (samples > 0 && !m_tempWarningShown && m_completedCreating && UserParams::getSampleTempCheckEnabled()) {
        const float temperature = job.getSample(unsigned(samples - 1)).getTemperature();
        if (temperature > UserParams::getSampleTempCheckHighLimit()
            || temperature < UserParams::getSampleTempCheckLowLimit()) {
            API_SignalMaster::instance()->emitTemperatureWarning();
            return;
        }
    }

    const JOB_AVERAGING_MODE_T mode = job.getJobAveragingMode();
    switch (mode) {
    case JOB_AVG_MODE_SMC: {
        const int state = job.getJobState();
        if (state == kJobStateSmcEnded || state == kJobStateSmcForced || state == kJobStateSmcEndedOnline
            || state == kJobStateSmcForcedOnline) {
            TargetingAPI_StopPolling();
            if (labMode)
                onShowLabModeSMCJobCompletePopup();
            else
                onShowSMCPopup();
        } else if (job.isJobComplete()) {
            finishCompleteJob(labMode);
            return;
        }
        ui->BtnSMCDone->setVisible(samples > 2);
        break;
    }
    case JOB_AVG_MODE_SIMPLE_3:
    case JOB_AVG_MODE_SIMPLE_5:
        if (job.isJobComplete()) {
            finishCompleteJob(labMode);
            return;
        }
        break;
    default:
        // An online job without averaging runs until the lab ends it.
        if (!labMode && job.isJobComplete()) {
            finishCompleteJob(labMode);
            return;
        }
        break;
    }

    showProgress(job, labMode);
}

void TargetingScreen::showProgress(const Job& job, bool labMode)
{
    const JOB_AVERAGING_MODE_T mode = job.getJobAveragingMode();
    const int samples = job.getNumSamples();
    if (isSmcLook(mode)) {
        int size = int(job.getJobSize());
        int maximum = job.getMaxSamples();
        if (size == 0 && maximum == 0) {
            const JOB_AVERAGING_INFO_T defaults = UserParams::getJobDefaultAvgInfo();
            size = defaults.smcGoodMeasurements;
            maximum = defaults.smcMaxMeasurements;
        }
        ui->labelSMC->setText(tr("Averaged %1 of SMC %2:%3").arg(samples).arg(size).arg(maximum));
        ui->labelSampleBox->hide();
    } else if (mode != JOB_AVG_MODE_SIMPLE_3 && mode != JOB_AVG_MODE_SIMPLE_5 && labMode) {
        ui->labelSampleBox->hide();
    } else {
        ui->labelSampleBox->show();
        for (size_t i = 0; i < m_sampleNumbers.size(); ++i) {
            QLabel* label = m_sampleNumbers[i];
            label->setStyleSheet(QStringLiteral("color: rgb(0, 0, 1);"));
            if (int(i) == samples)
                ui->labelSampleBox->setGeometry(label->geometry());
            label->style()->unpolish(label);
            label->style()->polish(label);
            label->update();
        }
        // Past the last number there is no next sample to mark.
        if (samples >= int(m_sampleNumbers.size()))
            ui->labelSampleBox->hide();
    }
}

// ---- Pressure feet and auto-measure ----------------------------------------------------

void TargetingScreen::setSensorIcon(QLabel* label, bool active)
{
    static const QPixmap on(QStringLiteral(":/Assets/sensor_on.png"));
    static const QPixmap off(QStringLiteral(":/Assets/sensor_off.png"));
    setPicture(label, active ? on : off);
}

void TargetingScreen::setPicture(QLabel* label, const QPixmap& picture)
{
    // Compared by identity: the same picture is not set again every tick.
    if (label->pixmap(Qt::ReturnByValue).cacheKey() != picture.cacheKey())
        label->setPixmap(picture);
}

void TargetingScreen::onPressureSensorUpdate(PRESSURE_SWITCH_T switches)
{
    QMutexLocker locker(&lock_);
    setSensorIcon(ui->labelSensorBottomLeft, switches.Switch1 != 0);
    setSensorIcon(ui->labelSensorTopLeft, switches.Switch2 != 0);
    setSensorIcon(ui->labelSensorRight, switches.Switch3 != 0);

    const bool all = allActive(switches);
    static const QPixmap headerOn(QStringLiteral(":/Assets/targeting_header_on.png"));
    static const QPixmap headerOff(QStringLiteral(":/Assets/targeting_header_off.png"));
    if (!all) {
        stopAllSounds();
        setPicture(ui->labelHeaderBackground, headerOff);
        setPicture(ui->labelFooterBackground, headerOff);
    } else {
        if (switches.Switch1 != m_pressureSwitch.Switch1 || switches.Switch2 != m_pressureSwitch.Switch2
            || switches.Switch3 != m_pressureSwitch.Switch3)
            playSoundDevicePositioned();
        setPicture(ui->labelHeaderBackground, headerOn);
        setPicture(ui->labelFooterBackground, headerOn);
    }
    m_pressureSwitch = switches;

    switch (m_autoMeasState) {
    case TARGETING_AUTO_MEASURE_OFF:
        ui->labelAutoMeasure->hide();
        break;
    case TARGETING_AUTO_MEASURE_NOT_READY:
        if (!m_transitionWaiting && !all) {
            m_transitionWaiting = true;
            hideAutoMeasureIcon();
            armAutoMeasureTimer(&TargetingScreen::onAutoGotoStatePressedAndWaiting, kAutoMeasureReleaseMs);
        } else if (m_transitionWaiting && all) {
            m_transitionWaiting = false;
            hideAutoMeasureIcon();
            disarmAutoMeasureTimer();
        }
        break;
    case TARGETING_AUTO_MEASURE_PRESSED_AND_WAITING:
        if (!m_transitionWaiting && all) {
            playSoundDevicePositioned();
            m_transitionWaiting = true;
            ui->labelAutoMeasure->show();
            ui->labelAutoMeasure->raise();
            armAutoMeasureTimer(&TargetingScreen::onAutoGotoStatePressedAndMeasuring,
                                int(UserParams::getAutoMeasureTimeout() * 1000.0f));
        } else if (m_transitionWaiting && !all) {
            m_transitionWaiting = false;
            hideAutoMeasureIcon();
            disarmAutoMeasureTimer();
        }
        break;
    default:
        break;
    }
}

void TargetingScreen::armAutoMeasureTimer(void (TargetingScreen::*slot)(), int ms)
{
    m_autoMeasTimer.stop();
    m_autoMeasTimer.disconnect();
    connect(&m_autoMeasTimer, &QTimer::timeout, this, slot);
    m_autoMeasTimer.setSingleShot(true);
    m_autoMeasTimer.start(qMax(0, ms));
}

void TargetingScreen::disarmAutoMeasureTimer()
{
    m_autoMeasTimer.stop();
    m_autoMeasTimer.disconnect();
}

void TargetingScreen::hideAutoMeasureIcon()
{
    ui->labelAutoMeasure->hide();
}

void TargetingScreen::onAutoGotoStateOff()
{
    QMutexLocker locker(&lock_);
    if (UserParams::getAutoMeasure())
        onAutoGotoStateNotReady();
    else
        m_autoMeasState = TARGETING_AUTO_MEASURE_OFF;
    m_transitionWaiting = false;
}

void TargetingScreen::onAutoGotoStateNotReady()
{
    QMutexLocker locker(&lock_);
    m_autoMeasState = TARGETING_AUTO_MEASURE_NOT_READY;
    m_transitionWaiting = false;
}

void TargetingScreen::onAutoGotoStatePressedAndWaiting()
{
    QMutexLocker locker(&lock_);
    m_autoMeasState = TARGETING_AUTO_MEASURE_PRESSED_AND_WAITING;
    m_transitionWaiting = false;
}

void TargetingScreen::onAutoGotoStatePressedAndMeasuring()
{
    QMutexLocker locker(&lock_);
    if (!DataManager::instance()->isMeasurementInProgress()) {
        m_autoMeasState = TARGETING_AUTO_MEASURE_PRESSED_AND_MEASURING;
        m_transitionWaiting = false;
        onReadSwitchPressed();
    } else {
        onAutoGotoStateNotReady();
    }
}

// ---- Read switch ----------------------------------------------------------------------

void TargetingScreen::keyPressEvent(QKeyEvent* event)
{
    if (isActive() && event->key() == Qt::Key_Return) {
        // A held switch repeats on some keyboards: one press is one press.
        if (!event->isAutoRepeat())
            onReadSwitchPressed();
        return;
    }
    DaddyPanel::keyPressEvent(event);
}

void TargetingScreen::RestartDebounce(int ms)
{
    m_bDebounced = false;
    m_debounceTimer.start(ms);
}

void TargetingScreen::onDebounceTimeut()
{
    m_bDebounced = true;
}

void TargetingScreen::onReadSwitchPressed()
{
    if (!m_bDebounced || DataManager::instance()->isMeasurementInProgress())
        return;
    RestartDebounce(2000);
    if (m_showingOverride)
        return;
    const PRESSURE_SWITCH_T switches = m_pressureSwitch;
    if (noneActive(switches))
        return;
    if (!allActive(switches)) {
        TargetingAPI_StartPolling();
        if (UserParams::getOverridePressureSensors())
            onShowOverridePopup();
        else
            onShowCantOverridePopup();
        return;
    }
    stopAllSounds();
    m_autoMeasTimer.stop();
    MeasAPI_TriggerMeasurement();
}

// ---- Orientation and live picture -------------------------------------------------------

void TargetingScreen::onUpdateOrientation(int degrees)
{
    const Job job = DataManager::instance()->getActiveJobObject();
    if (!job.isJobValid())
        return;
    const bool red = std::abs(degrees - job.getOrientationAngle()) > kOrientationTolerance
        && degrees < kOrientationGreenFrom;
    if (degrees == m_lastDegrees && red == m_reticleRed)
        return;
    m_lastDegrees = degrees;
    m_reticleRed = red;

    const QPixmap& source = red ? m_pixmapTargetingRed : m_pixmapTargetingGreen;
    QTransform turn;
    turn.rotateRadians(degrees * 0.017453292519943295, Qt::ZAxis);
    const QPixmap turned = source.transformed(turn, Qt::SmoothTransformation);
    QRect area(QPoint(0, 0), turned.size());
    area.moveCenter(m_centerPoint);
    ui->labelAlignmentCurrent->setGeometry(area);
    ui->labelAlignmentCurrent->setPixmap(turned);
}

void TargetingScreen::onUpdateOrientationEnabled(bool on)
{
    ui->labelAlignmentCurrent->setVisible(on);
}

void TargetingScreen::onTargetingImageUpdate(const QByteArray& data)
{
    if (data.isNull() || data.size() < kImageBytes)
        return;
    // A view over the bytes, converted once: no copy of the frame is kept.
    const QImage image(reinterpret_cast<const uchar*>(data.constData()), kImageWidth, kImageHeight,
                       kImageBytesPerLine, QImage::Format_RGB888);
    if (image.isNull())
        return;
    m_pixmapTargetingImage = QPixmap::fromImage(image);
    if (m_pixmapTargetingImage.isNull())
        return;
    ui->labelTargetImage->setPixmap(m_pixmapTargetingImage);
    ++m_framesShown;
    if (m_frameRequestedUs >= 0) {
        emit targetingFrameShown(m_frameClock.nsecsElapsed() / 1000 - m_frameRequestedUs);
        m_frameRequestedUs = -1;
    }
}

void TargetingScreen::onImageUpdate(QImage image)
{
    if (image.isNull())
        return;
    m_pixmapTargetingImage = QPixmap::fromImage(image.copy());
    if (!m_pixmapTargetingImage.isNull())
        ui->labelTargetImage->setPixmap(m_pixmapTargetingImage);
}

// ---- The poll ----------------------------------------------------------------------------

void TargetingScreen::onTriggerTargetingStart()
{
    QMutexLocker locker(&lock_);
    m_pressureSwitch = PRESSURE_SWITCH_T();
    if (CmdOut_StartTargetingMode() == kStatusNotReady) {
        // Busy with something else: wait for it to finish, or give up. The
        // poll has nothing to ask a busy instrument meanwhile.
        m_TargetingTimer.stop();
        QElapsedTimer waited;
        waited.start();
        bool ready = false;
        while (waited.elapsed() <= kNotReadyWaitMs) {
            SystemStatus status;
            if (CmdOut_GetState(status) == STATUS_OK && status.getSystemState() == STATE_INIT) {
                ready = true;
                break;
            }
            Delay(100);
        }
        if (!ready) {
            qDebug() << "TargetingScreen: instrument not ready for targeting, leaving";
            if (m_constructing)
                QTimer::singleShot(0, this, &TargetingScreen::CloseScreen);
            else
                CloseScreen();
            return;
        }
        CmdOut_StartTargetingMode();
    }
    QThread::usleep(100000);
    m_targetingStarted = true;
    m_TargetingTimer.start(kPollIntervalMs);
}

void TargetingScreen::onTriggerTargetingStop()
{
    m_TargetingTimer.stop();
    // Without the poll the feet are unknown: a press behind the popups that
    // follow a stop must not measure on the last reading.
    m_pressureSwitch = PRESSURE_SWITCH_T();
    CmdOut_StopTargetingMode();
}

void TargetingScreen::onTriggerTargetingPause()
{
    m_TargetingTimer.stop();
}

void TargetingScreen::onTargetingTimer()
{
    static int checkCalStatus = 0;
    QMutexLocker locker(&lock_);
    m_calState = DataManager::instance()->getSystemStatus().getCalState();
    m_orientation = ACCELEROMETER_ORIENTATION_T();
    m_calibStatus = CALIBRATION_STATUS_GOOD;
    checkCalStatus = (checkCalStatus + 1) % kCalibrationEvery;

    PRESSURE_SWITCH_T switches;
    try {
        m_frameRequestedUs = m_frameClock.nsecsElapsed() / 1000;
        if (CmdOut_GetTargetingInfo(switches, m_orientation, m_calibStatus, m_imageData) == STATUS_OK) {
            onPressureSensorUpdate(switches);
            onTargetingImageUpdate(m_imageData);
            onUpdateOrientation(m_orientation.OrientationPosition);
        }
    } catch (unsigned int) {
    }
    m_frameRequestedUs = -1;

    try {
        m_status = CmdOut_GetState(m_statusInfo);
    } catch (unsigned int code) {
        m_status = code;
    }
    if (m_status != STATUS_OK) {
        TargetingAPI_StopPolling();
        return;
    }
    try {
        if (checkCalStatus == 0)
            CmdOut_GetCalibrationState(m_calState);
    } catch (unsigned int) {
    }
    m_statusInfo.setCalState(m_calState);
    API_SignalMaster::instance()->emitStatusUpdated(m_statusInfo);
    if (m_statusInfo.getSystemState() == STATE_INIT) {
        // The instrument left targeting by itself.
        TargetingAPI_StopPolling();
    }
}

void TargetingScreen::onTargetingStopped()
{
    if (!isActive())
        return;
    if (m_screenBeenShowing.elapsed() < kStartupRetryMs && !m_targetingStarted) {
        TargetingAPI_StartPolling();
        return;
    }
    onShowIdlePopup();
}

void TargetingScreen::onMeasurementStarted()
{
}

void TargetingScreen::onSetActiveStatus(bool)
{
}

// ---- System state and measurement results ------------------------------------------------

void TargetingScreen::onUpdateSystemState(SYSTEM_STATE_T state)
{
    onCloseCalScreen();
    switch (state) {
    case STATE_CALCULATING:
        playSoundMeasurementSuccessful();
        break;
    case STATE_TARGETING:
        break;
    case STATE_MEASURING:
        onShowMeasuringPopup();
        playSoundMeasurementStarted();
        break;
    default:
        DaddyPanel::onUpdateSystemState(state);
        break;
    }
}

void TargetingScreen::onMeasurementComplete()
{
    DelayBlocking(1000);
    if (isClosing())
        return;
    // The temperature warning stopped targeting for its answer; it comes
    // back with "Continue", not behind the question.
    for (PopupPanel* popup : popups()) {
        if (popup->objectName() == QLatin1String("TempWarning"))
            return;
    }
    if (!DataManager::instance()->getActiveJobObject().isJobComplete())
        TargetingAPI_StartPolling();
}

PopupPanel* TargetingScreen::onMeasurementIssue(int code)
{
    qDebug() << "onMeasurementIssue: " << code;
    PopupPanel* popup = nullptr;
    if (code == kTimeoutIssue)
        popup = onShowTimeoutPopup();
    else
        popup = DaddyPanel::onMeasurementIssue(code);
    if (code == kCalculationFinishedIssue && !DataManager::instance()->getActiveJobObject().isJobValid()) {
        TargetingAPI_StopPolling();
        CloseScreen();
        return popup;
    }
    onAutoGotoStateOff();
    return popup;
}

bool TargetingScreen::activeJobValidAndOpen()
{
    const Job job = DataManager::instance()->getActiveJobObject();
    return job.isJobValid() && !job.isJobComplete();
}

// ---- Popups ---------------------------------------------------------------------------------

NotificationPopup* TargetingScreen::addNotification(const QString& title, const QString& text,
                                                    void (TargetingScreen::*slot)())
{
    auto* popup = new NotificationPopup(parentWidget());
    popup->setHeaderText(title);
    popup->setMessageText(text);
    popup->setButtonText(tr("OK"));
    connect(popup, &NotificationPopup::btnClicked, this, slot);
    connect(popup, &NotificationPopup::btnClicked, this, qOverload<>(&DaddyPanel::onClosePopup));
    onAddPopup(popup);
    return popup;
}

void TargetingScreen::onShowDeletePopup()
{
    hideAutoMeasureIcon();
    auto* popup = new DeletePopup(parentWidget());
    if (UserParams::getLabModeEnabled()) {
        popup->setHeaderText(tr("Exit Online Mode?"));
        popup->setMessageText(tr("Exiting online mode will stop targeting and return to the job list."));
        popup->setConfirmButtonText(tr("Exit"));
        connect(popup, &DeletePopup::confirmClicked, this, &TargetingScreen::onExitLabMode);
    } else {
        popup->setHeaderText(tr("Stop Measuring?"));
        if (DataManager::instance()->getActiveJobObject().getCreatedOnInstrument())
            popup->setMessageText(tr("All measured samples and this job will be permanently deleted."));
        else
            popup->setMessageText(tr("All measured samples from this job will be permanently deleted."));
        connect(popup, &DeletePopup::confirmClicked, this, &TargetingScreen::onDelete);
    }
    connect(popup, &DeletePopup::confirmClicked, this, qOverload<PopupPanel*>(&TargetingScreen::onClosePopup));
    connect(popup, &DeletePopup::cancelClicked, this, qOverload<PopupPanel*>(&TargetingScreen::onClosePopup));
    onAddPopup(popup);
}

void TargetingScreen::onShowTempWarningPopup()
{
    if (m_tempWarningShown)
        return;
    hideAutoMeasureIcon();
    DelayBlocking(700);
    stopAllSounds();
    auto* popup = new DeletePopup(parentWidget());
    popup->setObjectName(QStringLiteral("TempWarning"));
    popup->setHeaderText(tr("Warning"));
    popup->setCancelButtonText(tr("Continue"));
    connect(popup, &DeletePopup::cancelClicked, this, &TargetingScreen::onContinueMeasuring);
    connect(popup, &DeletePopup::cancelClicked, this, qOverload<PopupPanel*>(&TargetingScreen::onClosePopup));
    if (UserParams::getLabModeEnabled()) {
        popup->setMessageText(tr("Temperature out of range.  Continue online mode until complete, or Exit online "
                                 "mode and return to the job list?"));
        popup->setConfirmButtonText(tr("Exit"));
        connect(popup, &DeletePopup::confirmClicked, this, &TargetingScreen::onExitLabMode);
    } else {
        if (DataManager::instance()->getActiveJobObject().getCreatedOnInstrument())
            popup->setMessageText(tr("Temperature out of range.  Continue job until complete, or delete job and all "
                                     "samples and return to the job list?"));
        else
            popup->setMessageText(tr("Temperature out of range.  Continue job until complete, or delete all "
                                     "samples and return to the job list?"));
        popup->setConfirmButtonText(tr("Delete"));
        connect(popup, &DeletePopup::confirmClicked, this, &TargetingScreen::onDelete);
    }
    m_tempWarningShown = true;
    onAddPopup(popup);
    TargetingAPI_StopPolling();
}

void TargetingScreen::onShowOverridePopup()
{
    hideAutoMeasureIcon();
    if (m_autoMeasState == TARGETING_AUTO_MEASURE_PRESSED_AND_MEASURING)
        return;
    m_showingOverride = true;
    auto* popup = new OverridePopup(parentWidget());
    popup->setTitleText(tr("Override Pressure Sensors?"));
    popup->setBodyText(tr("Not all pressure sensors are active. Press the measure button again to start a "
                          "measurement, otherwise press the cancel button to return to targeting mode."));
    popup->setConfirmButtonText(tr("Measure"));
    popup->setCancelButtonText(tr("Cancel"));
    connect(popup, &OverridePopup::confirmClicked, this, &TargetingScreen::onDoTheOverrideThing);
    connect(popup, &PopupPanel::closePopup, this, &TargetingScreen::onCloseOverridePopup);
    onAddPopup(popup);
}

void TargetingScreen::onShowCantOverridePopup()
{
    hideAutoMeasureIcon();
    if (m_autoMeasState == TARGETING_AUTO_MEASURE_PRESSED_AND_MEASURING)
        return;
    m_showingOverride = true;
    auto* popup = new NotificationPopup(parentWidget());
    popup->setHeaderText(tr("Information"));
    popup->setMessageText(tr("Not all pressure sensors are active. Please ensure all pressure sensors are active "
                             "before measuring"));
    popup->setButtonText(tr("OK"));
    connect(popup, &NotificationPopup::btnClicked, this, &TargetingScreen::onCloseCantOverridePopup);
    onAddPopup(popup);
}

void TargetingScreen::onCloseOverridePopup(PopupPanel* popup)
{
    onClosePopup(popup);
    m_showingOverride = false;
    SystemStatus status;
    if (CmdOut_GetState(status) == STATUS_OK && status.getSystemState() == STATE_INIT)
        onCloseIdlePopup();
}

void TargetingScreen::onCloseCantOverridePopup()
{
    onCloseOverridePopup(qobject_cast<PopupPanel*>(sender()));
}

void TargetingScreen::onDoTheOverrideThing(PopupPanel* popup)
{
    onCloseOverridePopup(popup);
    stopAllSounds();
    PRESSURE_SWITCH_T switches;
    ACCELEROMETER_ORIENTATION_T orientation;
    CALIBRATION_STATUS_T calibration = CALIBRATION_STATUS_GOOD;
    if (CmdOut_GetTargetingInfo(switches, orientation, calibration, m_imageData) != STATUS_OK)
        return;
    if (!noneActive(switches))
        MeasAPI_TriggerMeasurement();
}

void TargetingScreen::onShowIdlePopup()
{
    hideAutoMeasureIcon();
    onAutoGotoStateOff();
    if (!activeJobValidAndOpen() || !popups().empty())
        return;
    m_idlePopup = addNotification(tr("Continue Measuring?"), tr("To continue with measurements, press OK"),
                                  &TargetingScreen::onCloseIdlePopup);
}

PopupPanel* TargetingScreen::onShowTimeoutPopup()
{
    playSoundErrorUser();
    hideAutoMeasureIcon();
    onAutoGotoStateOff();
    // The limit is read and sorted into its unit; the message itself names
    // no figure.
    PARAMETER_CONTENT_TYPES value;
    if (SysAPI_GetParameter(PARAMETER_JOB_COMPLETION_TIME, value)) {
        const int seconds = value.parameterInt;
        QString unit = QStringLiteral("seconds");
        if (seconds >= 86400)
            unit = QStringLiteral("days");
        else if (seconds >= 3600)
            unit = QStringLiteral("hours");
        else if (seconds >= 60)
            unit = QStringLiteral("minutes");
        qDebug() << "TargetingScreen: job time limit" << seconds << "s, in" << unit;
    }
    return addNotification(tr("Job Time Elapsed"), tr("The job wasn't completed within the allocated time"),
                           &TargetingScreen::onCloseTimeoutPopup);
}

void TargetingScreen::onShowMeasuringPopup()
{
    hideAutoMeasureIcon();
    // The state reaches the screen once per change, but never two circles.
    for (PopupPanel* popup : popups()) {
        if (qobject_cast<MeasuringPopup*>(popup))
            return;
    }
    auto* popup = new MeasuringPopup(UserParams::getMeasuringCircleID(), parentWidget());
    connect(popup, &PopupPanel::closePopup, this, qOverload<PopupPanel*>(&TargetingScreen::onClosePopup));
    onAddPopup(popup);
}

void TargetingScreen::onShowSMCPopup()
{
    hideAutoMeasureIcon();
    if (m_smcEndPopup)
        return;
    const Job job = DataManager::instance()->getActiveJobObject();
    const int state = job.getJobState();
    if (state == kJobStateSmcForced || state == kJobStateSmcForcedOnline) {
        m_smcEndPopup = addNotification(tr("Warning"), tr("SMC force finished, all readings averaged for result."),
                                        &TargetingScreen::onCloseSMCPopup);
        return;
    }
    // The English text names no figure; a translation may.
    QString text = tr("Maximum number of SMC measurements used for this job");
    if (text.contains(QLatin1String("%1")))
        text = text.arg(job.getMaxSamples());
    m_smcEndPopup = addNotification(tr("Information"), text, &TargetingScreen::onCloseSMCPopup);
}

void TargetingScreen::onShowLabModeJobCompletePopup()
{
    hideAutoMeasureIcon();
    addNotification(tr("Complete"), tr("The job has completed.  Press OK to exit online mode"),
                    &TargetingScreen::onCloseLabModeJobCompletePopup);
}

void TargetingScreen::onShowLabModeSMCJobCompletePopup()
{
    hideAutoMeasureIcon();
    if (m_smcEndPopup)
        return;
    const Job job = DataManager::instance()->getActiveJobObject();
    const int state = job.getJobState();
    if (state == kJobStateSmcForced || state == kJobStateSmcForcedOnline)
        m_smcEndPopup = addNotification(
            tr("Warning"), tr("SMC force finished, all readings averaged for result.  Press OK to exit online mode"),
            &TargetingScreen::onCloseLabModeJobCompletePopup);
    else
        m_smcEndPopup = addNotification(tr("Warning"),
                                        tr("SMC failed after maximum measurements %1, the final results are "
                                           "averaged.  Press OK to exit online mode")
                                            .arg(job.getMaxSamples()),
                                        &TargetingScreen::onCloseLabModeJobCompletePopup);
}

void TargetingScreen::onShowTerminatePopup()
{
    hideAutoMeasureIcon();
    auto* popup = new TerminateJobPopup(parentWidget());
    connect(popup, &TerminateJobPopup::averageJob, this, &TargetingScreen::onAverageJobComplete);
    connect(popup, &TerminateJobPopup::averageJob, this, qOverload<>(&DaddyPanel::onClosePopup));
    connect(popup, &TerminateJobPopup::restartJob, this, &TargetingScreen::onRestartJob);
    connect(popup, &TerminateJobPopup::restartJob, this, qOverload<>(&DaddyPanel::onClosePopup));
    connect(popup, &PopupPanel::closePopup, this, &TargetingScreen::onTerminateJobCanceled);
    connect(popup, &PopupPanel::closePopup, this, qOverload<PopupPanel*>(&TargetingScreen::onClosePopup));
    onAddPopup(popup);
}

void TargetingScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    onShowDeletePopup();
}

void TargetingScreen::on_BtnSMCDone_clicked()
{
    QMutexLocker locker(&lock_);
    onShowTerminatePopup();
    TargetingAPI_StopPolling();
}

// ---- Popup answers --------------------------------------------------------------------------

void TargetingScreen::onClosePopup(PopupPanel* popup)
{
    if (!popup)
        popup = qobject_cast<PopupPanel*>(sender());
    if (!popup)
        return;
    if (popup == m_idlePopup)
        m_idlePopup = nullptr;
    const QString name = popup->objectName();
    if ((name == QLatin1String("ErrorPopup") || name == QLatin1String("OverridePopup")
         || name == QLatin1String("TempWarning"))
        && activeJobValidAndOpen())
        TargetingAPI_StartPolling();
    DaddyPanel::onClosePopup(popup);
    RestartDebounce(500);
    m_showingOverride = false;
}

void TargetingScreen::onCloseIdlePopup()
{
    RestartDebounce(500);
    TargetingAPI_StartPolling();
}

void TargetingScreen::onCloseTimeoutPopup()
{
    RestartDebounce(500);
    TargetingAPI_StopPolling();
    CloseScreen();
}

void TargetingScreen::onCloseSMCPopup()
{
    if (DataManager::instance()->getActiveJobObject().isJobComplete()) {
        playSoundJobComplete();
        DelayBlocking(1000);
        TargetingAPI_StopPolling();
        CloseAndGotoScreen(JOB_MEASURE_SCREEN_ID);
    } else {
        RestartDebounce(500);
    }
}

void TargetingScreen::onCloseLabModeJobCompletePopup()
{
    DataManager* data = DataManager::instance();
    if (data->getActiveJobObject().isJobComplete()) {
        onExitLabMode();
        data->setActiveJob(kNoJob);
        CloseScreen();
    } else {
        RestartDebounce(500);
    }
}

void TargetingScreen::onExitLabMode()
{
    TargetingAPI_StopPolling();
    DataManager::instance()->turnOffLabMode(false);
    CloseScreen();
}

void TargetingScreen::onDelete()
{
    disconnect(API_SignalMaster::instance(), &API_SignalMaster::TriggerTargetingStop, this,
               &TargetingScreen::onTargetingStopped);
    TargetingAPI_StopPolling();
    setEnabled(false);
    if (DataManager::instance()->getActiveJobObject().getCreatedOnInstrument())
        API_SignalMaster::instance()->emitJobDeleteCurrent();
    else
        API_SignalMaster::instance()->emitJobDeleteAllSamples();
    CloseScreen();
}

void TargetingScreen::onContinueMeasuring()
{
    onUpdateSampleInfo();
    if (!DataManager::instance()->getActiveJobObject().isJobComplete())
        TargetingAPI_StartPolling();
}

void TargetingScreen::onAverageJobComplete()
{
    DataManager* data = DataManager::instance();
    if (SysAPI_ForceFinishSMC(data->getActiveJobObject().getName())) {
        data->refreshJobInfos();
        onShowSMCPopup();
    }
}

void TargetingScreen::onRestartJob()
{
    API_SignalMaster::instance()->emitJobDeleteAllSamples();
    TargetingAPI_StartPolling();
}

void TargetingScreen::onTerminateJobCanceled()
{
    TargetingAPI_StartPolling();
}

// ---- Panel plumbing -----------------------------------------------------------------------

void TargetingScreen::CloseScreen()
{
    DaddyPanel::CloseScreen();
}

void TargetingScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && ui) {
        const QString title = ui->TxtTitle->text();
        ui->retranslateUi(this);
        ui->TxtTitle->setText(title);
        const Job job = DataManager::instance()->getActiveJobObject();
        if (job.isJobValid()) {
            createScreen();
            showProgress(job, UserParams::getLabModeEnabled());
        }
    }
    DaddyPanel::changeEvent(event);
}
