#include "Widgets/CalibrationWizardPage.h"

#include "ui_CalibrationWizardPage.h"

#include <QEvent>

namespace {
// Where a step's contents stand: between the arrows, below the sub-header,
// above the page dots.
const QRect kContentsBox(40, 42, 240, 352);
} // namespace

CalibrationWizardPage::CalibrationWizardPage(QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::CalibrationWizardPage)
{
    ui->setupUi(this);
    setAttribute(Qt::WA_StyledBackground, true);
    connect(ui->BtnPageRight, &ClickableLabel::clicked, this, &CalibrationWizardPage::gotoRightPage);
    connect(ui->BtnPageLeft, &ClickableLabel::clicked, this, &CalibrationWizardPage::gotoLeftPage);
}

CalibrationWizardPage::~CalibrationWizardPage()
{
    delete ui;
}

KLabel* CalibrationWizardPage::subHeader() const
{
    return ui->labelSubHeader;
}

ClickableLabel* CalibrationWizardPage::leftArrow() const
{
    return ui->BtnPageLeft;
}

ClickableLabel* CalibrationWizardPage::rightArrow() const
{
    return ui->BtnPageRight;
}

void CalibrationWizardPage::setStep(unsigned int step)
{
    m_step = step;
    ui->labelSubHeader->setText(tr("Step %1").arg(step));
}

void CalibrationWizardPage::setLeftArrow(bool on)
{
    ui->BtnPageLeft->setVisible(on);
    ui->BtnPageLeft->setEnabled(on);
}

void CalibrationWizardPage::setRightArrow(bool on)
{
    ui->BtnPageRight->setVisible(on);
    ui->BtnPageRight->setEnabled(on);
}

void CalibrationWizardPage::addPageContents(QWidget* contents)
{
    clearPageContents();
    if (!contents)
        return;
    m_pageContents = contents;
    contents->setParent(this);
    contents->setGeometry(kContentsBox);
    contents->show();
    // The arrows stay touchable over wide contents.
    ui->BtnPageLeft->raise();
    ui->BtnPageRight->raise();
}

void CalibrationWizardPage::clearPageContents()
{
    delete m_pageContents;
    m_pageContents = nullptr;
}

void CalibrationWizardPage::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->labelSubHeader->setText(tr("Step %1").arg(m_step));
    MarigoldPanel::changeEvent(event);
}
