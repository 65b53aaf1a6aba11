#ifndef CALIBRATIONWIZARDPAGECONTAINER_H
#define CALIBRATIONWIZARDPAGECONTAINER_H

#include "Widgets/BottomDotsPageContainer.h"
#include "Widgets/CalibrationStepPageContents.h"

class CalibrationWizardPage;

// The instruction steps of one set-up, swiped or stepped with the arrows.
// The last step carries the button that starts the operation.
class CalibrationWizardPageContainer : public BottomDotsPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationWizardPageContainer(QWidget* parent = nullptr);

    // The white tile's serial number, as the instrument reports it; the
    // effect tile has none of its own, so its texts carry this one too.
    static QString tileSerialNumber();

    CalibrationWizardPage* page(int index) const;

signals:
    void calibrationClicked();

public slots:
    virtual CalibrationWizardPage* createStep(unsigned int step, bool leftEnabled, bool rightEnabled);

protected:
    // Builds the three pages the subclasses share the shape of.
    void buildTileSteps(StepText step1, bool effectGraphic, StepText step2, StepText step3Top,
                        StepText buttonText);
    CalibrationStep3PageContents* addStartStep(unsigned int step, StepText top, StepText buttonText);
};

class CalibrationWhiteWizardPageContainer : public CalibrationWizardPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationWhiteWizardPageContainer(QWidget* parent = nullptr);
};

class CalibrationReferenceWizardPageContainer : public CalibrationWizardPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationReferenceWizardPageContainer(QWidget* parent = nullptr);
};

class CalibrationSelfTestWhiteWizardPageContainer : public CalibrationWizardPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationSelfTestWhiteWizardPageContainer(QWidget* parent = nullptr);
};

class CalibrationSelfTestReferenceWizardPageContainer : public CalibrationWizardPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationSelfTestReferenceWizardPageContainer(QWidget* parent = nullptr);
};

class CalibrationSelfTestOtherWizardPageContainer : public CalibrationWizardPageContainer
{
    Q_OBJECT
public:
    explicit CalibrationSelfTestOtherWizardPageContainer(QWidget* parent = nullptr);
};

#endif // CALIBRATIONWIZARDPAGECONTAINER_H
