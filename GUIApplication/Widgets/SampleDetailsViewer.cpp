#include "Widgets/SampleDetailsViewer.h"
#include "ui_SampleDetailsViewer.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/SampleDetailsPageContainer.h"

#include <QEvent>

namespace {
const QChar kDegree(0x00B0);
}

SampleDetailsViewer::SampleDetailsViewer(QWidget* parent)
    : SamplePage(parent)
    , ui(new Ui::SampleDetailsViewer)
    , m_pageContainer(nullptr)
{
    ui->setupUi(this);
}

SampleDetailsViewer::~SampleDetailsViewer()
{
    delete ui;
}

QWidget* SampleDetailsViewer::pageHolder() const
{
    return ui->pageHolder;
}

void SampleDetailsViewer::setLeftButtonEnabled(bool enabled)
{
    ui->BtnPageLeft->setEnabled(enabled);
    ui->BtnPageLeft->setVisible(enabled);
}

void SampleDetailsViewer::setRightButtonEnabled(bool enabled)
{
    ui->BtnPageRight->setEnabled(enabled);
    ui->BtnPageRight->setVisible(enabled);
}

bool SampleDetailsViewer::isLeftButtonEnabled() const
{
    return ui->BtnPageLeft->isEnabled() && !ui->BtnPageLeft->isHidden();
}

bool SampleDetailsViewer::isRightButtonEnabled() const
{
    return ui->BtnPageRight->isEnabled() && !ui->BtnPageRight->isHidden();
}

void SampleDetailsViewer::setTitle(const QString& title)
{
    ui->labelSubHeader->setText(title);
}

QString SampleDetailsViewer::title() const
{
    return ui->labelSubHeader->text();
}

void SampleDetailsViewer::setIllumObs(COLOR_ILLUM_OBS_T illumObs)
{
    ui->labelIllumObs->setText(getStringFromList(illumObs, ILLUM_OBS_TABLE));
}

void SampleDetailsViewer::setIllumObsText(const QString& text)
{
    ui->labelIllumObs->setText(text);
}

QString SampleDetailsViewer::illumObsText() const
{
    return ui->labelIllumObs->text();
}

void SampleDetailsViewer::clearPageContainer()
{
    delete m_pageContainer;
    m_pageContainer = nullptr;
}

void SampleDetailsViewer::addPageContainer(SampleDetailsPageContainer* container)
{
    clearPageContainer();
    m_pageContainer = container;
    if (!container)
        return;
    container->setParent(ui->pageHolder);
    container->setGeometry(ui->pageHolder->rect());
    container->show();
}

void SampleDetailsViewer::on_BtnPageRight_clicked()
{
    playSoundButtonClick();
    emit gotoRightPage();
}

void SampleDetailsViewer::on_BtnPageLeft_clicked()
{
    playSoundButtonClick();
    emit gotoLeftPage();
}

void SampleDetailsViewer::changeEvent(QEvent* event)
{
    SamplePage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}

// ---- colour figures ---------------------------------------------------------------

SampleDetailsViewerDNumber::SampleDetailsViewerDNumber(QWidget* parent)
    : SampleDetailsViewer(parent)
{
    setIllumObs(UserParams::getIllumObs());
}

SampleDetailsViewerD45::SampleDetailsViewerD45(QWidget* parent)
    : SampleDetailsViewerDNumber(parent)
{
    retranslate();
    addPageContainer(new SampleDetailsPageContainerD45(pageHolder()));
}

void SampleDetailsViewerD45::retranslate()
{
    setTitle(tr("45%1 Series").arg(kDegree));
    setIllumObs(UserParams::getIllumObs());
}

SampleDetailsViewerD15::SampleDetailsViewerD15(QWidget* parent)
    : SampleDetailsViewerDNumber(parent)
{
    retranslate();
    addPageContainer(new SampleDetailsPageContainerD15(pageHolder()));
}

void SampleDetailsViewerD15::retranslate()
{
    setTitle(tr("15%1 Series").arg(kDegree));
    setIllumObs(UserParams::getIllumObs());
}

// ---- texture ----------------------------------------------------------------------

SampleDetailsViewerTexture::SampleDetailsViewerTexture(QWidget* parent)
    : SampleDetailsViewer(parent)
{
    retranslate();
    setIllumObsText(QString());
    setRightButtonEnabled(false);
    addPageContainer(new SampleDetailsPageContainerTexture(pageHolder()));
    connect(m_pageContainer, &PageContainer::changedPages, this, &SampleDetailsViewerTexture::OnPageChanged);
    OnPageChanged(0);
}

void SampleDetailsViewerTexture::retranslate()
{
    setTitle(tr("15%1 Texture").arg(kDegree));
}

void SampleDetailsViewerTexture::OnPageChanged(int page)
{
    const QVector<TEXTURE_PARAMETER_T> parameters =
        DataManager::instance()->getActiveSampleObject().getTextureParameters(page);
    if (!parameters.isEmpty())
        setIllumObsText(parameters.first().version);
}
