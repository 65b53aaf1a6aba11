#ifndef SAMPLEDETAILSPAGE_H
#define SAMPLEDETAILSPAGE_H

#include "Screens/MarigoldPanel.h"

class QLabel;

namespace Ui {
class SampleDetailsPage;
}

// The L*, a*, b*, C* and h figures of one angle.
class SampleDetailsPage : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit SampleDetailsPage(QWidget* parent = nullptr);
    ~SampleDetailsPage() override;

    // The user's precision and decimal sign: 12.345 with 2 and "," is "12,35".
    static QString formatValue(double value);
    static void setValueText(QLabel* label, double value);

    void set_L_Star(double value);
    void set_a_Star(double value);
    void set_b_Star(double value);
    void set_C_Star(double value);
    void set_h_Star(double value);

    QString valueText(const QString& labelName) const;

private:
    Ui::SampleDetailsPage* ui;
};

#endif // SAMPLEDETAILSPAGE_H
