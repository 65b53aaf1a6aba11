#ifndef SAMPLEVIEWPAGECONTAINER_H
#define SAMPLEVIEWPAGECONTAINER_H

#include "Widgets/BottomDotsPageContainer.h"

class SampleDetailsViewerTexture;
class SamplePage;

// The pages of one sample, as the display settings and the sample's angles
// ask for: the rainbow and thumbnails, the 45 and 15 degree figures, and
// once the textures have arrived, the texture figures.
class SampleViewPageContainer : public BottomDotsPageContainer
{
    Q_OBJECT
public:
    explicit SampleViewPageContainer(QWidget* parent = nullptr);

    SampleDetailsViewerTexture* texturePage() const { return m_texturePage; }

signals:
    void loadCurrentSamplesTexturesAndImages();
    void loadCurrentSamplesTextures();
    void loadCurrentSamplesImages();
    void gotoImageViewScreen();

public slots:
    void onLoadCurrentSamplesTexturesComplete();
    void onGotoImageViewScreen();
    void onPageInView();

private:
    void addSamplePage(SamplePage* page);
    // The right arrow of the last page, which leads nowhere until a page follows.
    void setLastRightButtonEnabled(bool enabled);

    SampleDetailsViewerTexture* m_texturePage = nullptr;
};

#endif // SAMPLEVIEWPAGECONTAINER_H
