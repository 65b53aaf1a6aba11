#ifndef CALIBRATIONSENSORPOPUP_H
#define CALIBRATIONSENSORPOPUP_H

#include "Screens/PopupPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <QTimer>

namespace Ui {
class CalibrationSensorPopup;
}

// The instrument doesn't sit flat: a lamp per pressure foot, live, so the
// operator sees which foot is off the tile.
class CalibrationSensorPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit CalibrationSensorPopup(QWidget* parent = nullptr);
    ~CalibrationSensorPopup() override;

    static const int RefreshMs = 200;
    // The lamps as last drawn: Switch1, Switch2, Switch3.
    bool lampOn(int sw) const;

signals:
    void cancelPopup(PopupPanel* popup);

public slots:
    void onReadPressureSensors();
    void onUpdatePressureSensorStatus(PRESSURE_SWITCH_T status);

protected:
    void changeEvent(QEvent* event) override;

private slots:
    void on_BtnOkay_clicked();
    void on_BtnCancel_clicked();

protected:
    Ui::CalibrationSensorPopup* ui;
    QTimer m_pressureSensorTimer;
    bool m_lamps[3] = {false, false, false};
};

#endif // CALIBRATIONSENSORPOPUP_H
