#include "Screens/SelfTestPopup.h"

#include "ui_MeasuringPopup.h"

#include "GUIAPI/API_SignalMaster.h"

#include <QEvent>

SelfTestPopup::SelfTestPopup(const QString& testName, SELF_TEST_TYPE type, QWidget* parent)
    : MeasuringPopup(parent)
    , m_testName(testName)
    , m_testType(type)
{
    setObjectName(QStringLiteral("SelfTestPopup"));
    // A test's name can be long: two lines above the ring.
    ui->labelText->setGeometry(20, 32, 280, 64);
    ui->labelText->setWordWrap(true);
    ui->labelSubText->setGeometry(20, 312, 280, 60);
    ui->labelWarningSubText->setGeometry(20, 374, 280, 64);
    ui->labelSubText->setWordWrap(true);
    connect(API_SignalMaster::instance(), &API_SignalMaster::SelfTestTestComplete, this,
            &SelfTestPopup::onSelfTestTestComplete);
    setState(STATE_POPUP_INIT);
}

QString SelfTestPopup::text() const
{
    return ui->labelText->text();
}

void SelfTestPopup::setState(MEASURING_POPUP_STATE_T state)
{
    m_state = state;
    ProgressBarCircle* ring = ui->progressBarCircle;
    ui->labelText->setText(m_testName);
    ui->labelBracket->hide();
    ui->labelTimerSubtext->hide();
    switch (state) {
    case STATE_POPUP_INIT:
    case STATE_POPUP_MEASURING:
    case STATE_POPUP_CALCULATING: {
        m_propertyAnimation.stop();
        ring->setValue(0);
        ring->setBackgroundImage(QStringLiteral(":/Assets/measuring_white_circle.png"));
        ring->setForegroundImage(state == STATE_POPUP_CALCULATING ? QStringLiteral(":/Assets/measuring_red_circle.png")
                                                                  : QStringLiteral(":/Assets/measuring_green_circle.png"));
        ui->labelCheckMark->hide();
        ui->labelSubText->hide();
        // In the air nothing can be bumped; on a tile the hand must stay off.
        ui->labelWarningSubText->setText(m_testType == SELF_TEST_DEVICE_LIFTED
                                             ? tr("Hold the instrument in open air")
                                             : tr("Do not touch or bump instrument"));
        ui->labelWarningSubText->show();
        ui->icnPopupBkgnd->setPixmap(QPixmap(QStringLiteral(":/Assets/overlay_background_meas.png")));
        break;
    }
    case STATE_POPUP_COMPLETE:
    case STATE_POPUP_AVG:
        m_propertyAnimation.stop();
        ring->setForegroundImage(QStringLiteral(":/Assets/measuring_green_circle.png"));
        ring->setValue(100);
        ui->labelCheckMark->show();
        ui->labelCheckMark->raise();
        ui->labelWarningSubText->hide();
        ui->labelSubText->setText(tr("Complete"));
        ui->labelSubText->show();
        ui->icnPopupBkgnd->setPixmap(QPixmap(QStringLiteral(":/Assets/overlay_background_calc.png")));
        break;
    default:
        break;
    }
}

void SelfTestPopup::onUpdateSystemState(SYSTEM_STATE_T state)
{
    // Idle says nothing: it stands before the test starts as well as after.
    switch (state) {
    case STATE_MEASURING:
    case STATE_CALIBRATING:
    case STATE_BUSY:
        if (m_state != STATE_POPUP_MEASURING && m_state != STATE_POPUP_COMPLETE)
            setState(STATE_POPUP_MEASURING);
        break;
    case STATE_CALCULATING:
        if (m_state != STATE_POPUP_CALCULATING && m_state != STATE_POPUP_COMPLETE)
            setState(STATE_POPUP_CALCULATING);
        break;
    default:
        break;
    }
}

void SelfTestPopup::changeEvent(QEvent* event)
{
    MeasuringPopup::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        const int percent = ui->progressBarCircle->value();
        setState(m_state);
        ui->progressBarCircle->setValue(percent);
    }
}

void SelfTestPopup::onSelfTestTestComplete()
{
    setState(STATE_POPUP_COMPLETE);
}
