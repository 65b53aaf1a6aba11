#include "Widgets/SampleTexturePage.h"
#include "ui_SampleTexturePage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/SampleDetailsPage.h"

SampleTexturePage::SampleTexturePage(IMAGE_ANGLE_T angle, QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::SampleTexturePage)
    , m_angle(angle)
{
    ui->setupUi(this);
    onUpdateTextures();
}

SampleTexturePage::~SampleTexturePage()
{
    delete ui;
}

void SampleTexturePage::setValueText(QLabel* label, double value)
{
    SampleDetailsPage::setValueText(label, value);
}

void SampleTexturePage::setDC(double value) { setValueText(ui->labelDCValue, value); }
void SampleTexturePage::setSG(double value) { setValueText(ui->labelSGValue, value); }
void SampleTexturePage::setSD(double value) { setValueText(ui->labelSDValue, value); }
void SampleTexturePage::setSI(double value) { setValueText(ui->labelSIValue, value); }
void SampleTexturePage::setSA(double value) { setValueText(ui->labelSAValue, value); }

QString SampleTexturePage::text(const QString& labelName) const
{
    const QLabel* label = findChild<QLabel*>(labelName);
    return label ? label->text() : QString();
}

void SampleTexturePage::onUpdateTextures()
{
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    if (!sample.isValid())
        return;

    if (!UserParams::getDisplayTextureParameters()) {
        const TEXTURE_T texture = sample.getTexture(m_angle);
        setDC(texture.directionalCoarseness);
        setSG(texture.sparkleGrade);
        setSD(texture.sparkleDensity);
        setSI(texture.sparkleIntensity);
        return;
    }

    for (QLabel* label : {ui->labelDC, ui->labelSI, ui->labelSD, ui->labelSG, ui->labelSA, ui->labelDCValue,
                          ui->labelSIValue, ui->labelSDValue, ui->labelSGValue, ui->labelSAValue})
        label->clear();
    const QVector<TEXTURE_PARAMETER_T> parameters = sample.getTextureParameters(m_angle);
    int coarseness = -1;
    int grade = -1;
    for (int i = 0; i < parameters.size(); ++i) {
        const QString name = parameters[i].name.toUpper();
        if (name == QLatin1String("C"))
            coarseness = i;
        else if (name == QLatin1String("SG"))
            grade = i;
    }
    // Coarseness leads; the grade follows on the next row, or leads alone.
    if (coarseness >= 0) {
        ui->labelDC->setText(parameters[coarseness].name);
        setValueText(ui->labelDCValue, parameters[coarseness].value);
        if (grade >= 0) {
            ui->labelSI->setText(parameters[grade].name);
            setValueText(ui->labelSIValue, parameters[grade].value);
        }
    } else if (grade >= 0) {
        ui->labelDC->setText(parameters[grade].name);
        setValueText(ui->labelDCValue, parameters[grade].value);
    }
}
