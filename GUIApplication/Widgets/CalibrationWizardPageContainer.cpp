#include "Widgets/CalibrationWizardPageContainer.h"

#include "Commands/SystemOutCommands.h"
#include "Widgets/CalibrationWizardPage.h"

#include <QCoreApplication>

CalibrationWizardPageContainer::CalibrationWizardPageContainer(QWidget* parent)
    : BottomDotsPageContainer(parent)
{
}

QString CalibrationWizardPageContainer::tileSerialNumber()
{
    DEVICE_INFO_T info;
    if (CmdOut_GetDeviceInfo(info) != 0)
        return QString();
    return info.whitetileSerialNum;
}

CalibrationWizardPage* CalibrationWizardPageContainer::page(int index) const
{
    if (index < 0 || index >= int(m_widgetList.size()))
        return nullptr;
    return qobject_cast<CalibrationWizardPage*>(m_widgetList[size_t(index)]);
}

CalibrationWizardPage* CalibrationWizardPageContainer::createStep(unsigned int step, bool leftEnabled,
                                                                  bool rightEnabled)
{
    auto* page = new CalibrationWizardPage(this);
    page->setStep(step);
    page->setLeftArrow(leftEnabled);
    page->setRightArrow(rightEnabled);
    connect(page, &CalibrationWizardPage::gotoRightPage, this, &PageContainer::onGotoRightPage);
    connect(page, &CalibrationWizardPage::gotoLeftPage, this, &PageContainer::onGotoLeftPage);
    appendPage(page);
    return page;
}

CalibrationStep3PageContents* CalibrationWizardPageContainer::addStartStep(unsigned int step, StepText top,
                                                                           StepText buttonText)
{
    auto* contents = new CalibrationStep3PageContents;
    if (top)
        contents->setTopAreaText(std::move(top));
    if (buttonText)
        contents->setButtonText(std::move(buttonText));
    connect(contents, &CalibrationStep3PageContents::calibrationClicked, this,
            &CalibrationWizardPageContainer::calibrationClicked);
    createStep(step, true, false)->addPageContents(contents);
    return contents;
}

void CalibrationWizardPageContainer::buildTileSteps(StepText step1, bool effectGraphic, StepText step2,
                                                    StepText step3Top, StepText buttonText)
{
    auto* first = new CalibrationStep1PageContents;
    first->setDescriptionText(std::move(step1));
    if (effectGraphic)
        first->setBackgroundToReference();
    else
        first->setBackgroundToWhite();
    createStep(1, false, true)->addPageContents(first);

    auto* second = new CalibrationStep2PageContents;
    second->setDescriptionText(std::move(step2));
    createStep(2, true, true)->addPageContents(second);

    addStartStep(3, std::move(step3Top), std::move(buttonText));
}

namespace {
StepText selfTestTop()
{
    return [] { return CalibrationWizardPageContainer::tr("Tap the self test button to start self testing"); };
}
StepText selfTestButton()
{
    return [] { return CalibrationWizardPageContainer::tr("Self Test"); };
}
} // namespace

CalibrationWhiteWizardPageContainer::CalibrationWhiteWizardPageContainer(QWidget* parent)
    : CalibrationWizardPageContainer(parent)
{
    const QString number = tileSerialNumber();
    buildTileSteps(
        [number] {
            return CalibrationWizardPageContainer::tr("Calibrate your instrument by using the white reference tile included with your instrument.")
                + QStringLiteral("\n\n") + CalibrationWizardPageContainer::tr("Serial Number: %1").arg(number);
        },
        false,
        [] { return CalibrationWizardPageContainer::tr("Place the instrument on the white calibration tile by aligning the white line on the desired reference."); },
        nullptr, nullptr);
}

CalibrationReferenceWizardPageContainer::CalibrationReferenceWizardPageContainer(QWidget* parent)
    : CalibrationWizardPageContainer(parent)
{
    const QString number = tileSerialNumber();
    buildTileSteps(
        [number] {
            return CalibrationWizardPageContainer::tr("Verify your instrument by using the effect reference tile included with your instrument. Serial Number: %1")
                .arg(number);
        },
        true,
        [] { return CalibrationWizardPageContainer::tr("Place the instrument on the effect reference tile by aligning the white line on the desired reference"); },
        nullptr, nullptr);
}

CalibrationSelfTestWhiteWizardPageContainer::CalibrationSelfTestWhiteWizardPageContainer(QWidget* parent)
    : CalibrationWizardPageContainer(parent)
{
    const QString number = tileSerialNumber();
    buildTileSteps(
        [number] {
            return CalibrationWizardPageContainer::tr("Self test your instrument by using the white reference tile included with your instrument. Serial Number: %1")
                .arg(number);
        },
        false,
        [] { return CalibrationWizardPageContainer::tr("Place the instrument on the white reference tile by aligning the white line on the desired reference"); },
        selfTestTop(), selfTestButton());
}

CalibrationSelfTestReferenceWizardPageContainer::CalibrationSelfTestReferenceWizardPageContainer(QWidget* parent)
    : CalibrationWizardPageContainer(parent)
{
    const QString number = tileSerialNumber();
    buildTileSteps(
        [number] {
            return CalibrationWizardPageContainer::tr("Self test your instrument by using the effect reference tile included with your instrument. Serial Number: %1")
                .arg(number);
        },
        true,
        [] { return CalibrationWizardPageContainer::tr("Place the instrument on the effect reference tile by aligning the white line on the desired reference"); },
        selfTestTop(), selfTestButton());
}

CalibrationSelfTestOtherWizardPageContainer::CalibrationSelfTestOtherWizardPageContainer(QWidget* parent)
    : CalibrationWizardPageContainer(parent)
{
    auto* first = new CalibrationStep1PageContents;
    first->setDescriptionText(
        [] { return CalibrationWizardPageContainer::tr("Self test your instrument by lifting the instrument into open air (not placed on anything)"); });
    first->setBackgroundToLifted();
    createStep(1, false, true)->addPageContents(first);
    addStartStep(2, selfTestTop(), selfTestButton());
}
