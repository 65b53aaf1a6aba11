#include "Widgets/SampleViewPageContainer.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/SampleDetailsViewer.h"
#include "Widgets/SampleResultsPage.h"

SampleViewPageContainer::SampleViewPageContainer(QWidget* parent)
    : BottomDotsPageContainer(parent)
{
    DataManager* data = DataManager::instance();
    connect(this, &SampleViewPageContainer::loadCurrentSamplesTextures, data,
            &DataManager::onLoadCurrentSamplesTextures);
    connect(this, &SampleViewPageContainer::loadCurrentSamplesImages, data, &DataManager::onLoadCurrentSamplesImages);
    connect(this, &SampleViewPageContainer::loadCurrentSamplesTexturesAndImages, data,
            &DataManager::onLoadCurrentSamplesTexturesAndImages);
    connect(data, &DataManager::loadCurrentSamplesTexturesComplete, this,
            &SampleViewPageContainer::onLoadCurrentSamplesTexturesComplete);

    const bool labch = UserParams::getDisplayLABCH();
    const bool rainbow = UserParams::getDisplayRainbow();

    if (rainbow) {
        auto* results = new SampleResultsPage;
        connect(results, &SampleResultsPage::gotoImageViewScreen, this, &SampleViewPageContainer::onGotoImageViewScreen);
        addSamplePage(results);
    }
    if (labch) {
        auto* d45 = new SampleDetailsViewerD45;
        if (!rainbow)
            d45->setLeftButtonEnabled(false);
        addSamplePage(d45);
        if (data->getActiveSampleObject().getNumAngleCurves() > 6) {
            d45->setRightButtonEnabled(true);
            addSamplePage(new SampleDetailsViewerD15);
        }
    }
    setLastRightButtonEnabled(false);
}

void SampleViewPageContainer::addSamplePage(SamplePage* page)
{
    appendPage(page);
    connect(page, &SamplePage::gotoRightPage, this, &SampleViewPageContainer::onGotoRightPage);
    connect(page, &SamplePage::gotoLeftPage, this, &SampleViewPageContainer::onGotoLeftPage);
}

void SampleViewPageContainer::setLastRightButtonEnabled(bool enabled)
{
    if (m_widgetList.empty())
        return;
    if (UserParams::getDisplayLABCH()) {
        if (auto* viewer = qobject_cast<SampleDetailsViewer*>(m_widgetList.back()))
            viewer->setRightButtonEnabled(enabled);
    } else if (m_widgetList.size() == 1 && UserParams::getDisplayRainbow()) {
        if (auto* results = qobject_cast<SampleResultsPage*>(m_widgetList.front()))
            results->setRightButtonEnabled(enabled);
    }
}

void SampleViewPageContainer::onPageInView()
{
    if (UserParams::getDisplayTexture())
        emit loadCurrentSamplesTexturesAndImages();
    else
        emit loadCurrentSamplesImages();
}

void SampleViewPageContainer::onLoadCurrentSamplesTexturesComplete()
{
    // Every opening of the screen reloads; the page is made once.
    if (!UserParams::getDisplayTexture() || m_texturePage)
        return;
    setLastRightButtonEnabled(true);
    m_texturePage = new SampleDetailsViewerTexture;
    m_texturePage->setLeftButtonEnabled(UserParams::getDisplayLABCH() || UserParams::getDisplayRainbow());
    addSamplePage(m_texturePage);
}

void SampleViewPageContainer::onGotoImageViewScreen()
{
    emit gotoImageViewScreen();
}
