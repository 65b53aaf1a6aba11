#include "Screens/CalibrationPopup.h"

#include "ui_MeasuringPopup.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "GUIAPI/MeasureAPI.h"
#include "SharedSystem/Instrument.h"

#include <QEvent>
#include <QLabel>
#include <QPointer>

namespace {
const unsigned int kCountFrom = 4; // the first tick shows one less
const int kTickMs = 1000;
const int kCloseAfterMs = 2000;
const int kIdlePollMs = 100;

const char* kWhiteRing = ":/Assets/measuring_white_circle.png";
const char* kGreenRing = ":/Assets/measuring_green_circle.png";
const char* kRedRing = ":/Assets/measuring_red_circle.png";
const char* kMeasuringGround = ":/Assets/overlay_background_meas.png";
const char* kCalculatingGround = ":/Assets/overlay_background_calc.png";
} // namespace

CalibrationPopup::CalibrationPopup(QWidget* parent)
    : MeasuringPopup(parent)
{
    setObjectName(QStringLiteral("CalibrationPopup"));
    m_triggered = false;

    // The count stands in the middle of the ring.
    m_pNumberLabel = new QLabel(this);
    m_pNumberLabel->setObjectName(QStringLiteral("labelCountdown"));
    m_pNumberLabel->setGeometry(ui->progressBarCircle->geometry());
    m_pNumberLabel->setAlignment(Qt::AlignCenter);
    QFont big = font();
    big.setPointSize(48);
    big.setBold(true);
    m_pNumberLabel->setFont(big);
    m_pNumberLabel->setStyleSheet(QStringLiteral("color: rgb(45, 45, 45); background: transparent;"));

    // Room for the longer translations of the texts under the ring.
    ui->labelSubText->setGeometry(20, 312, 280, 60);
    ui->labelWarningSubText->setGeometry(20, 374, 280, 64);
    ui->labelSubText->setWordWrap(true);
    ui->labelText->setWordWrap(true);

    m_countdownTimer.setObjectName(QStringLiteral("countdownTimer"));
    m_closeTimer.setSingleShot(true);
    connect(&m_countdownTimer, &QTimer::timeout, this, &CalibrationPopup::onCountdownTimer);
    m_timeToClose = kCloseAfterMs;
    setState(STATE_POPUP_INIT);
}

CalibrationPopup::~CalibrationPopup()
{
    m_countdownTimer.stop();
    m_closeTimer.stop();
}

QString CalibrationPopup::text() const
{
    return ui->labelText->text();
}

QString CalibrationPopup::subText() const
{
    if (ui->labelWarningSubText->isVisibleTo(const_cast<CalibrationPopup*>(this)))
        return ui->labelWarningSubText->text();
    if (ui->labelSubText->isVisibleTo(const_cast<CalibrationPopup*>(this)))
        return ui->labelSubText->text();
    return QString();
}

QString CalibrationPopup::countdownText() const
{
    return m_pNumberLabel->isVisibleTo(const_cast<CalibrationPopup*>(this)) ? m_pNumberLabel->text() : QString();
}

QString CalibrationPopup::startingText() const
{
    return tr("Calibration Starting");
}

QString CalibrationPopup::measuringText() const
{
    return tr("Calibrating");
}

void CalibrationPopup::setState(MEASURING_POPUP_STATE_T state)
{
    ProgressBarCircle* ring = ui->progressBarCircle;
    if (state == STATE_POPUP_INIT) {
        m_state = state;
        m_closeTimer.stop();
        m_uCounter = kCountFrom;
        m_propertyAnimation.stop();
        m_propertyAnimation.setDuration(kTickMs);
        ring->setValue(0);
        ui->labelText->setText(startingText());
        ui->labelWarningSubText->setText(tr("Do not touch or bump instrument"));
        ui->labelWarningSubText->show();
        ui->labelSubText->hide();
        ui->labelBracket->hide();
        ui->labelCheckMark->hide();
        ui->labelTimerSubtext->hide();
        m_pNumberLabel->show();
        m_pNumberLabel->raise();
        m_countdownTimer.start(kTickMs);
        ring->setBackgroundImage(kWhiteRing);
        ring->setForegroundImage(kGreenRing);
        ui->icnPopupBkgnd->setPixmap(QPixmap(kMeasuringGround));
        onCountdownTimer();
        return;
    }

    // Until the trigger the instrument's news belongs to something else.
    if (!m_triggered)
        return;

    switch (state) {
    case STATE_POPUP_MEASURING:
        m_state = state;
        m_propertyAnimation.stop();
        ring->setValue(0);
        ui->labelText->setText(measuringText());
        m_pNumberLabel->hide();
        ui->labelCheckMark->hide();
        ui->labelSubText->hide();
        ui->labelWarningSubText->show();
        ring->setBackgroundImage(kWhiteRing);
        ring->setForegroundImage(kGreenRing);
        ui->icnPopupBkgnd->setPixmap(QPixmap(kMeasuringGround));
        break;
    case STATE_POPUP_CALCULATING:
        m_state = state;
        m_propertyAnimation.stop();
        ring->setValue(0);
        ui->labelText->setText(tr("Calculating"));
        m_pNumberLabel->hide();
        ui->labelCheckMark->hide();
        ui->labelSubText->hide();
        ui->labelWarningSubText->hide();
        ring->setBackgroundImage(kRedRing);
        ring->setForegroundImage(kGreenRing);
        ui->icnPopupBkgnd->setPixmap(QPixmap(kCalculatingGround));
        break;
    case STATE_POPUP_COMPLETE:
        // Every later idle status says the same: the close time runs once.
        if (m_state == STATE_POPUP_COMPLETE)
            return;
        m_state = state;
        m_propertyAnimation.stop();
        ui->labelText->setText(tr("Complete"));
        m_pNumberLabel->hide();
        ui->labelWarningSubText->hide();
        ui->labelSubText->setText(tr("OK to move instrument"));
        ui->labelSubText->show();
        ui->labelCheckMark->show();
        ui->labelCheckMark->raise();
        ring->setForegroundImage(kGreenRing);
        ring->setValue(100);
        ui->icnPopupBkgnd->setPixmap(QPixmap(kCalculatingGround));
        m_closeTimer.start(m_timeToClose);
        break;
    default:
        break;
    }
}

void CalibrationPopup::onCountdownTimer()
{
    // A stray tick after the count has ended must not wrap the counter.
    if (m_uCounter == 0) {
        m_countdownTimer.stop();
        return;
    }
    --m_uCounter;
    if (m_uCounter > 0) {
        m_pNumberLabel->setText(QString::number(m_uCounter));
        m_propertyAnimation.stop();
        m_propertyAnimation.setStartValue(0);
        m_propertyAnimation.setEndValue(100);
        m_propertyAnimation.start();
        return;
    }
    m_countdownTimer.stop();
    m_propertyAnimation.stop();
    m_propertyAnimation.setDuration(300);
    ui->progressBarCircle->setValue(0);
    // Dropped: the trigger has not been given yet.
    setState(STATE_POPUP_MEASURING);
    triggerCalibration();
}

void CalibrationPopup::changeEvent(QEvent* event)
{
    // The form's own texts come back with a new language; the state's are
    // put over them again.
    MeasuringPopup::changeEvent(event);
    if (event->type() != QEvent::LanguageChange)
        return;
    switch (m_state) {
    case STATE_POPUP_INIT: ui->labelText->setText(startingText()); break;
    case STATE_POPUP_MEASURING: ui->labelText->setText(measuringText()); break;
    case STATE_POPUP_CALCULATING: ui->labelText->setText(tr("Calculating")); break;
    case STATE_POPUP_COMPLETE:
        ui->labelText->setText(tr("Complete"));
        ui->labelSubText->setText(tr("OK to move instrument"));
        break;
    default: break;
    }
    ui->labelWarningSubText->setText(tr("Do not touch or bump instrument"));
}

bool CalibrationPopup::waitForIdle()
{
    // A popup put away during the wait (its deletion may wait for this loop
    // to end) must not start anything afterwards.
    QPointer<CalibrationPopup> self(this);
    while (self && !self->isHidden()
           && DataManager::instance()->getSystemStatus().getSystemState() != STATE_INIT)
        Delay(kIdlePollMs);
    return self && !self->isHidden();
}

void CalibrationPopup::triggerCalibration()
{
    if (!waitForIdle())
        return;
    m_triggered = true;
    MeasAPI_TriggerUserCalibration();
}

void CalibrationPopup::onMeasurementComplete()
{
    if (m_triggered)
        setState(STATE_POPUP_COMPLETE);
}

void CalibrationPopup::onUpdatePercentComplete(int percent)
{
    if (m_triggered)
        MeasuringPopup::onUpdatePercentComplete(percent);
}

// ---- Reference check --------------------------------------------------------------

CalibrationReferenceCheckPopup::CalibrationReferenceCheckPopup(QWidget* parent)
    : CalibrationPopup(parent)
{
    setObjectName(QStringLiteral("CalibrationReferenceCheckPopup"));
    ui->labelText->setText(startingText());
    API_SignalMaster* hub = API_SignalMaster::instance();
    connect(hub, &API_SignalMaster::ReferenceCheckComplete, this,
            &CalibrationReferenceCheckPopup::onReferenceCheckComplete);
    connect(hub, &API_SignalMaster::MeasurementIssue, this, &CalibrationReferenceCheckPopup::onMeasurementIssue);
}

QString CalibrationReferenceCheckPopup::startingText() const
{
    return tr("Measurement Starting");
}

QString CalibrationReferenceCheckPopup::measuringText() const
{
    return tr("Measuring");
}

void CalibrationReferenceCheckPopup::triggerCalibration()
{
    if (!waitForIdle())
        return;
    m_triggered = true;
    MeasAPI_TriggerReferenceCheck();
}

void CalibrationReferenceCheckPopup::onUpdateSystemState(SYSTEM_STATE_T state)
{
    // The end is the check's own signal; an idle state says nothing here.
    switch (state) {
    case STATE_MEASURING:
    case STATE_CALIBRATING:
        setState(STATE_POPUP_MEASURING);
        break;
    case STATE_CALCULATING:
        setState(STATE_POPUP_CALCULATING);
        break;
    default:
        break;
    }
}

void CalibrationReferenceCheckPopup::onUpdatePercentComplete(int percent)
{
    if (DataManager::instance()->getSystemStatus().getSystemState() == STATE_INIT)
        return;
    CalibrationPopup::onUpdatePercentComplete(percent);
}

void CalibrationReferenceCheckPopup::onReferenceCheckComplete()
{
    if (m_triggered)
        setState(STATE_POPUP_COMPLETE);
}

void CalibrationReferenceCheckPopup::onMeasurementIssue(int)
{
    onCloseTimeout();
}
