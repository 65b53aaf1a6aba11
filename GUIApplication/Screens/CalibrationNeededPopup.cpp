#include "Screens/CalibrationNeededPopup.h"

#include "ui_CalibrationNeededPopup.h"

#include "GUIAPI/DataManager.h"
#include "Screens/PopupForm.h"

#include <QEvent>

namespace {
const int kMinute = 60;
const int kHour = 3600;
const int kDay = 86400;
} // namespace

CalibrationNeededPopup::CalibrationNeededPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::CalibrationNeededPopup)
{
    ui->setupUi(this);
    setObjectName(QStringLiteral("CalibrationNeededPopup"));
    ui->labelHeaderText->setAutoSize(true);
    ui->labelText->setAutoSize(true);
    ui->labelBackGround->lower();
    setSecondsLeft(DataManager::instance()->getCalState().nextExternalWhiteCal);
}

CalibrationNeededPopup::~CalibrationNeededPopup()
{
    delete ui;
}

QString CalibrationNeededPopup::timeLeftText(int seconds)
{
    if (seconds < 1)
        return QString();
    const QString form = tr("Calibration needed within %1 %2");
    if (seconds < kMinute)
        return form.arg(seconds).arg(tr("seconds"));
    if (seconds < kHour)
        return form.arg(seconds / kMinute + 1).arg(tr("minutes"));
    if (seconds < kDay)
        return form.arg(seconds / kHour + 1).arg(tr("hours"));
    return form.arg(seconds / kDay + 1).arg(tr("days"));
}

void CalibrationNeededPopup::setSecondsLeft(int seconds)
{
    m_seconds = seconds;
    const bool overdue = seconds < 1;
    ui->labelHeaderText->setVisible(overdue);
    ui->labelIcon->setVisible(!overdue);
    if (overdue) {
        ui->labelText->setText(tr("New measurements cannot be made until the instrument is calibrated. "
                                  "Press Calibrate to start the calibration sequence."));
    } else {
        ui->labelText->setText(timeLeftText(seconds));
    }
    layoutTexts();
}

void CalibrationNeededPopup::layoutTexts()
{
    if (ui->labelHeaderText->isHidden()) {
        // Icon and the one line under it, centred on the card.
        const int top = 150;
        ui->labelIcon->move(PopupForm::IconBox.x(), top);
        ui->labelText->setGeometry(PopupForm::TextBox.x(), top + PopupForm::IconBox.height() + 16,
                                   PopupForm::TextBox.width(), 96);
        return;
    }
    PopupForm::arrange(ui->labelIcon, ui->labelHeaderText, ui->labelText);
}

QString CalibrationNeededPopup::headerText() const
{
    return ui->labelHeaderText->text();
}

QString CalibrationNeededPopup::messageText() const
{
    return ui->labelText->defaultText();
}

bool CalibrationNeededPopup::isHeaderShown() const
{
    return !ui->labelHeaderText->isHidden();
}

bool CalibrationNeededPopup::isIconShown() const
{
    return !ui->labelIcon->isHidden();
}

void CalibrationNeededPopup::on_BtnConfirm_clicked()
{
    playSoundButtonClick();
    emit confirmCalibration();
}

void CalibrationNeededPopup::on_BtnCancel_clicked()
{
    playSoundButtonClick();
    // Measurements stay refused by the instrument all the same.
    emit closePopup(this);
}

void CalibrationNeededPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        setSecondsLeft(m_seconds);
    }
    PopupPanel::changeEvent(event);
}
