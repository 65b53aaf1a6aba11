#ifndef MEASURINGPOPUP_H
#define MEASURINGPOPUP_H

#include "Screens/PopupPanel.h"
#include "SharedSystem/InstrumentTypes.h"

#include <QLabel>
#include <QPropertyAnimation>
#include <QString>
#include <QTimer>

namespace Ui {
class MeasuringPopup;
}

typedef enum _MEASURING_POPUP_STATE_T {
    STATE_POPUP_INIT = 0,
    STATE_POPUP_MEASURING = 1,
    STATE_POPUP_CALCULATING = 2,
    STATE_POPUP_COMPLETE = 3,
    STATE_POPUP_AVG = 4,
    NUM_OF_POPUP_STATES = 5
} MEASURING_POPUP_STATE_T;

// Covers the screen while the instrument measures: "hold still", the
// progress on the circle, the change of colour when the calculation starts,
// and gone by itself when the instrument leaves the measuring states. It has
// no cancel button. The calibration and self-test popups derive from it.
class MeasuringPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit MeasuringPopup(QWidget* parent = nullptr);
    // brandingImage: a picture shown inside the circle (a device path under
    // "/opt/GUI/Branding/" or any readable file); ignored if it doesn't load.
    MeasuringPopup(const QString& brandingImage, QWidget* parent = nullptr);
    ~MeasuringPopup() override;

public slots:
    virtual void onUpdatePercentComplete(int percent);
    virtual void onUpdateSystemState(SYSTEM_STATE_T state);
    virtual void onMeasurementComplete();
    virtual void onCalculationComplete();
    virtual void onCloseTimeout();
    virtual void Init();
    virtual void setState(MEASURING_POPUP_STATE_T state);
    virtual void setText(QString text);

protected:
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

    Ui::MeasuringPopup* ui;
    QTimer m_closeTimer;
    QPropertyAnimation m_propertyAnimation;
    int m_timeToClose;
    QLabel* m_pBrandingImageLabel;

private:
    void applyBrandingImage(const QString& brandingImage);
};

#endif // MEASURINGPOPUP_H
