#ifndef CALIBRATIONNEEDEDPOPUP_H
#define CALIBRATIONNEEDEDPOPUP_H

#include "Screens/PopupPanel.h"

namespace Ui {
class CalibrationNeededPopup;
}

// Asks for a calibration: overdue ("Calibration Required") or soon
// ("Calibration needed within ..."). The time left is always rounded up by
// a whole unit, so the operator never reads less time than there is.
class CalibrationNeededPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit CalibrationNeededPopup(QWidget* parent = nullptr);
    ~CalibrationNeededPopup() override;

    // The text for so many seconds left; empty below 1 (overdue).
    static QString timeLeftText(int seconds);

    void setSecondsLeft(int seconds);
    int secondsLeft() const { return m_seconds; }
    QString headerText() const;
    QString messageText() const;
    bool isHeaderShown() const;
    bool isIconShown() const;

signals:
    void confirmCalibration();

protected:
    void changeEvent(QEvent* event) override;

private slots:
    void on_BtnConfirm_clicked();
    void on_BtnCancel_clicked();

private:
    void layoutTexts();
    Ui::CalibrationNeededPopup* ui;
    int m_seconds = 0;
};

#endif // CALIBRATIONNEEDEDPOPUP_H
