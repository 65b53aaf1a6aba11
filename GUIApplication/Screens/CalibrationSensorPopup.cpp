#include "Screens/CalibrationSensorPopup.h"

#include "ui_CalibrationSensorPopup.h"

#include "Commands/TargetingOutCommands.h"
#include "GUIAPI/DataManager.h"
#include "Widgets/Theme.h"

#include <QEvent>

namespace {
QPixmap lamp(bool on)
{
    return QPixmap(on ? QStringLiteral(":/Assets/sensor_on.png") : QStringLiteral(":/Assets/sensor_off.png"));
}
} // namespace

CalibrationSensorPopup::CalibrationSensorPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::CalibrationSensorPopup)
{
    ui->setupUi(this);
    setObjectName(QStringLiteral("CalibrationSensorPopup"));
    ui->labelTextTitle->setAutoSize(true);
    ui->labelTextSummary->setAutoSize(true);
    Theme::styleButton(ui->BtnOkay, Theme::PrimaryButton);
    Theme::styleButton(ui->BtnCancel, Theme::SecondaryButton);

    onReadPressureSensors();
    connect(DataManager::instance(), &DataManager::updatePressureSensorStatus, this,
            &CalibrationSensorPopup::onUpdatePressureSensorStatus);
    connect(&m_pressureSensorTimer, &QTimer::timeout, this, &CalibrationSensorPopup::onReadPressureSensors);
    m_pressureSensorTimer.start(RefreshMs);
}

CalibrationSensorPopup::~CalibrationSensorPopup()
{
    m_pressureSensorTimer.stop();
    delete ui;
}

bool CalibrationSensorPopup::lampOn(int sw) const
{
    return sw >= 1 && sw <= 3 && m_lamps[sw - 1];
}

void CalibrationSensorPopup::onReadPressureSensors()
{
    PRESSURE_SWITCH_T sensors;
    // A failed read shows every foot off: the operator must not be told
    // the instrument sits flat when nobody knows.
    if (CmdOut_GetPressureSensor(sensors) != 0)
        sensors = PRESSURE_SWITCH_T();
    onUpdatePressureSensorStatus(sensors);
}

void CalibrationSensorPopup::onUpdatePressureSensorStatus(PRESSURE_SWITCH_T status)
{
    const bool on[3] = {status.Switch1 != 0, status.Switch2 != 0, status.Switch3 != 0};
    QLabel* labels[3] = {ui->labelSensorBottomLeft, ui->labelSensorTopLeft, ui->labelSensorRight};
    for (int i = 0; i < 3; ++i) {
        if (on[i] == m_lamps[i] && labels[i]->pixmap() && !labels[i]->pixmap()->isNull())
            continue;
        m_lamps[i] = on[i];
        labels[i]->setPixmap(lamp(on[i]));
    }
}

void CalibrationSensorPopup::on_BtnOkay_clicked()
{
    playSoundButtonClick();
    emit closePopup(this);
}

void CalibrationSensorPopup::on_BtnCancel_clicked()
{
    playSoundButtonClick();
    emit cancelPopup(this);
}

void CalibrationSensorPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    PopupPanel::changeEvent(event);
}
