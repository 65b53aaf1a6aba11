#ifndef CALIBRATIONWIZARDPAGE_H
#define CALIBRATIONWIZARDPAGE_H

#include "Screens/MarigoldPanel.h"

namespace Ui {
class CalibrationWizardPage;
}

class ClickableLabel;
class KLabel;

// One numbered step of the calibration and self-test instructions: a
// sub-header, the arrows to the neighbouring steps and the step's contents.
class CalibrationWizardPage : public MarigoldPanel
{
    Q_OBJECT
public:
    explicit CalibrationWizardPage(QWidget* parent = nullptr);
    ~CalibrationWizardPage() override;

    // The sub-header reads "Step n".
    void setStep(unsigned int step);
    unsigned int step() const { return m_step; }
    void setLeftArrow(bool on);
    void setRightArrow(bool on);
    QWidget* pageContents() const { return m_pageContents; }
    KLabel* subHeader() const;
    ClickableLabel* leftArrow() const;
    ClickableLabel* rightArrow() const;

signals:
    void gotoRightPage();
    void gotoLeftPage();

public slots:
    virtual void addPageContents(QWidget* contents);
    virtual void clearPageContents();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::CalibrationWizardPage* ui;
    QWidget* m_pageContents = nullptr;
    unsigned int m_step = 1;
};

#endif // CALIBRATIONWIZARDPAGE_H
