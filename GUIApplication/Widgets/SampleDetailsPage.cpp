#include "Widgets/SampleDetailsPage.h"
#include "ui_SampleDetailsPage.h"

#include "SharedSystem/UserParams.h"

#include <cmath>

SampleDetailsPage::SampleDetailsPage(QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::SampleDetailsPage)
{
    ui->setupUi(this);
}

SampleDetailsPage::~SampleDetailsPage()
{
    delete ui;
}

QString SampleDetailsPage::formatValue(double value)
{
    // A missing figure shows as a dash, not as "nan".
    if (!std::isfinite(value))
        return QStringLiteral("\u2013");
    const int precision = qBound(0, UserParams::getPrecision(), 6);
    QString text = QString::number(value, 'f', precision);
    text.replace(QLatin1Char('.'), UserParams::getDecimalPointString());
    return text;
}

void SampleDetailsPage::setValueText(QLabel* label, double value)
{
    if (label)
        label->setText(formatValue(value));
}

void SampleDetailsPage::set_L_Star(double value) { setValueText(ui->labelLStarValue, value); }
void SampleDetailsPage::set_a_Star(double value) { setValueText(ui->labelaStarValue, value); }
void SampleDetailsPage::set_b_Star(double value) { setValueText(ui->labelbStarValue, value); }
void SampleDetailsPage::set_C_Star(double value) { setValueText(ui->labelCStarValue, value); }
void SampleDetailsPage::set_h_Star(double value) { setValueText(ui->labelhStarValue, value); }

QString SampleDetailsPage::valueText(const QString& labelName) const
{
    const QLabel* label = findChild<QLabel*>(labelName);
    return label ? label->text() : QString();
}
