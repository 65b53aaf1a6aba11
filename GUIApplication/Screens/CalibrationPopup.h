#ifndef CALIBRATIONPOPUP_H
#define CALIBRATIONPOPUP_H

#include "Screens/MeasuringPopup.h"

#include <QTimer>

class QLabel;

// The white calibration under way: a count of 3, 2, 1 for the hand to leave
// the instrument, the trigger, then the instrument's progress. Nothing the
// instrument reports counts before the trigger.
class CalibrationPopup : public MeasuringPopup
{
    Q_OBJECT
public:
    explicit CalibrationPopup(QWidget* parent = nullptr);
    ~CalibrationPopup() override;

    bool isTriggered() const { return m_triggered; }
    unsigned int counter() const { return m_uCounter; }
    MEASURING_POPUP_STATE_T state() const { return m_state; }
    QString text() const;
    QString subText() const;
    // The number shown during the countdown, empty when hidden.
    QString countdownText() const;
    QTimer* countdownTimer() { return &m_countdownTimer; }
    QTimer* closeTimer() { return &m_closeTimer; }

public slots:
    void setState(MEASURING_POPUP_STATE_T state) override;
    void onMeasurementComplete() override;
    void onUpdatePercentComplete(int percent) override;
    virtual void onCountdownTimer();
    virtual void triggerCalibration();

protected:
    void changeEvent(QEvent* event) override;
    // The texts of the start and of the measuring state.
    virtual QString startingText() const;
    virtual QString measuringText() const;
    // Waits, running events, until the instrument is idle. False when the
    // popup went away meanwhile.
    bool waitForIdle();

    QTimer m_countdownTimer;
    unsigned int m_uCounter = 0;
    bool m_triggered = false;
    MEASURING_POPUP_STATE_T m_state = STATE_POPUP_INIT;
    QLabel* m_pNumberLabel = nullptr;
};

// The reference check on the effect tile: the same countdown, and its end
// comes only from the check's own completion.
class CalibrationReferenceCheckPopup : public CalibrationPopup
{
    Q_OBJECT
public:
    explicit CalibrationReferenceCheckPopup(QWidget* parent = nullptr);

public slots:
    void triggerCalibration() override;
    void onUpdateSystemState(SYSTEM_STATE_T state) override;
    void onUpdatePercentComplete(int percent) override;
    virtual void onReferenceCheckComplete();
    virtual void onMeasurementIssue(int code);

protected:
    QString startingText() const override;
    QString measuringText() const override;
};

#endif // CALIBRATIONPOPUP_H
