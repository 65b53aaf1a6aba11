#include "Widgets/CalibrationStepPageContents.h"

#include "ui_CalibrationStep1PageContents.h"
#include "ui_CalibrationStep2PageContents.h"
#include "ui_CalibrationStep3PageContents.h"

#include "Widgets/Theme.h"

#include <QEvent>

namespace {
const char* kWhiteGraphic = ":/Assets/cal_graphic_01_white.png";
const char* kEffectGraphic = ":/Assets/cal_graphic_01_effect.png";
const char* kLiftedGraphic = ":/Assets/cal_graphic_01_lifted.png";
} // namespace

// ---- Step 1 ---------------------------------------------------------------------

CalibrationStep1PageContents::CalibrationStep1PageContents(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::CalibrationStep1PageContents)
{
    ui->setupUi(this);
    ui->labelInstructionText->setAutoSize(true);
    setBackgroundToWhite();
}

CalibrationStep1PageContents::~CalibrationStep1PageContents()
{
    delete ui;
}

void CalibrationStep1PageContents::setDescriptionText(StepText text)
{
    m_text = std::move(text);
    ui->labelInstructionText->setText(m_text ? m_text() : QString());
}

QString CalibrationStep1PageContents::descriptionText() const
{
    return ui->labelInstructionText->defaultText();
}

void CalibrationStep1PageContents::setBackground(const QString& resource)
{
    m_background = resource;
    ui->labelBackground->setPixmap(QPixmap(resource));
}

void CalibrationStep1PageContents::setBackgroundToReference()
{
    setBackground(kEffectGraphic);
}

void CalibrationStep1PageContents::setBackgroundToWhite()
{
    setBackground(kWhiteGraphic);
}

void CalibrationStep1PageContents::setBackgroundToLifted()
{
    setBackground(kLiftedGraphic);
}

void CalibrationStep1PageContents::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && m_text)
        ui->labelInstructionText->setText(m_text());
    QWidget::changeEvent(event);
}

// ---- Step 2 ---------------------------------------------------------------------

CalibrationStep2PageContents::CalibrationStep2PageContents(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::CalibrationStep2PageContents)
{
    ui->setupUi(this);
    ui->labelInstructionText->setAutoSize(true);
    ui->labelHelperText1->setAutoSize(true);
    ui->labelHelperText2->setAutoSize(true);
}

CalibrationStep2PageContents::~CalibrationStep2PageContents()
{
    delete ui;
}

void CalibrationStep2PageContents::setDescriptionText(StepText text)
{
    m_text = std::move(text);
    ui->labelInstructionText->setText(m_text ? m_text() : QString());
}

QString CalibrationStep2PageContents::descriptionText() const
{
    return ui->labelInstructionText->defaultText();
}

void CalibrationStep2PageContents::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        if (m_text)
            ui->labelInstructionText->setText(m_text());
    }
    QWidget::changeEvent(event);
}

// ---- Step 3 ---------------------------------------------------------------------

CalibrationStep3PageContents::CalibrationStep3PageContents(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::CalibrationStep3PageContents)
{
    ui->setupUi(this);
    for (KLabel* label : {ui->labelInstructionText, ui->labelInstructionText_2, ui->labelHelperText1})
        label->setAutoSize(true);
    Theme::styleButton(ui->btnCalibrate, Theme::PrimaryButton);
    // The page's own button has no popup guard: the screen decides.
    connect(ui->btnCalibrate, &QPushButton::clicked, this, &CalibrationStep3PageContents::calibrationClicked);
}

CalibrationStep3PageContents::~CalibrationStep3PageContents()
{
    delete ui;
}

void CalibrationStep3PageContents::setTopAreaText(StepText text)
{
    m_top = std::move(text);
    retranslate();
}

void CalibrationStep3PageContents::setBottomAreaText(StepText text)
{
    m_bottom = std::move(text);
    retranslate();
}

void CalibrationStep3PageContents::setButtonText(StepText text)
{
    m_button = std::move(text);
    retranslate();
}

QString CalibrationStep3PageContents::topAreaText() const
{
    return ui->labelInstructionText->defaultText();
}

QString CalibrationStep3PageContents::bottomAreaText() const
{
    return ui->labelInstructionText_2->defaultText();
}

QWidget* CalibrationStep3PageContents::calibrateButton() const
{
    return ui->btnCalibrate;
}

void CalibrationStep3PageContents::retranslate()
{
    if (m_top)
        ui->labelInstructionText->setText(m_top());
    if (m_bottom)
        ui->labelInstructionText_2->setText(m_bottom());
    if (m_button)
        ui->btnCalibrate->setText(m_button());
}

void CalibrationStep3PageContents::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        retranslate();
    }
    QWidget::changeEvent(event);
}
