// The screenshot tour of the result views: every page of a stored sample on
// the 6-angle and the 11-angle instrument, solid, metallic and pearl
// finishes, the delete question and the picture viewer. See support/Tour.h.

#include "GUIAPI/DataManager.h"
#include "Screens/DeleteSamplePopup.h"
#include "Screens/ImageViewScreen.h"
#include "Screens/SampleViewScreen.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/SampleDetailsPageContainer.h"
#include "Widgets/SampleDetailsViewer.h"
#include "Widgets/SampleViewPageContainer.h"

#include <QtTest>

#include "support/ResultsFixture.h"
#include "support/Tour.h"

namespace ResultsTour {

void settings(bool rainbow = true, bool labch = true, bool texture = true, bool parameters = false)
{
    UserParams::setDisplayRainbow(rainbow);
    UserParams::setDisplayLABCH(labch);
    UserParams::setDisplayTexture(texture);
    UserParams::setDisplayPreviewImages(true);
    UserParams::setDisplayTextureParameters(parameters);
    UserParams::setPrecision(2);
    UserParams::setDecimalPoint(QStringLiteral("."));
}

bool open(bool eleven, const QString& job, unsigned int sample = 0)
{
    return ResultsFixture::start(eleven) && ResultsFixture::activate(job, sample);
}

// The sample view on page `page` (-1: the texture page); `row` picks a
// figure page inside a column of figures.
SampleViewScreen* sampleView(QWidget* display, bool eleven, const QString& job, int page, int row = 0,
                             unsigned int sample = 0)
{
    if (!open(eleven, job, sample))
        return nullptr;
    ResultsFixture::loadTexturesAndImages();
    auto* screen = new SampleViewScreen(display);
    screen->SetActiveStatus(true);
    SampleViewPageContainer* pages = screen->pageContainer();
    pages->onLoadCurrentSamplesTexturesComplete();
    const int target = page < 0 ? pages->getNumberOfPages() - 1 : page;
    pages->onSelectPage(target);
    if (row > 0) {
        const auto viewers = pages->findChildren<SampleDetailsViewer*>();
        for (SampleDetailsViewer* viewer : viewers) {
            if (viewer->geometry().left() == target * viewer->width() && viewer->pageContainer())
                viewer->pageContainer()->onSelectPage(row);
        }
    }
    QTest::qWait(320);
    return screen;
}

void images(QWidget* display, bool eleven, const QString& job, int angle, unsigned int sample = 0)
{
    if (!open(eleven, job, sample))
        return;
    ResultsFixture::loadTexturesAndImages();
    DataManager::instance()->setActiveImage(static_cast<IMAGE_ANGLE_T>(angle));
    auto* screen = new ImageViewScreen(display);
    screen->SetActiveStatus(true);
    QTest::qWait(320);
}

} // namespace ResultsTour

static QList<Tour::Stop> stops()
{
    using namespace ResultsTour;
    return {
        // 6 angles, silver metallic
        {"results6_metallic_rainbow", [](QWidget* d) { settings(); sampleView(d, false, "Job", 0); }},
        {"results6_metallic_lab45", [](QWidget* d) { settings(); sampleView(d, false, "Job", 1); }},
        {"results6_metallic_lab45_110", [](QWidget* d) { settings(); sampleView(d, false, "Job", 1, 5); }},
        {"results6_metallic_texture", [](QWidget* d) { settings(); sampleView(d, false, "Job", -1); }},
        {"results6_metallic_texture_diffuse", [](QWidget* d) { settings(); sampleView(d, false, "Job", -1, 5); }},
        {"results6_metallic_texture_parameters",
         [](QWidget* d) { settings(true, true, true, true); sampleView(d, false, "Job", -1, 2); }},
        // 6 angles, red solid, and a blue pearl's averaged result
        {"results6_solid_rainbow", [](QWidget* d) { settings(); sampleView(d, false, "Job 1", 0, 0, 1); }},
        {"results6_solid_lab45", [](QWidget* d) { settings(); sampleView(d, false, "Job 1", 1, 0, 1); }},
        {"results6_solid_texture", [](QWidget* d) { settings(); sampleView(d, false, "Job 1", -1, 0, 1); }},
        {"results6_pearl_average_rainbow", [](QWidget* d) { settings(); sampleView(d, false, "Job 2", 0, 0, 255); }},
        {"results6_lab_only", [](QWidget* d) { settings(false, true, false); sampleView(d, false, "Job", 0); }},
        {"results6_delete_sample", [](QWidget* d) {
             settings();
             if (SampleViewScreen* s = sampleView(d, false, "Job 1", 0, 0, 1))
                 s->on_BtnTrash_clicked();
         }},
        {"results6_images_metallic", [](QWidget* d) { settings(); images(d, false, "Job", 1); }},
        {"results6_images_solid", [](QWidget* d) { settings(); images(d, false, "Job 1", 3); }},
        {"results6_images_pearl_diffuse", [](QWidget* d) { settings(); images(d, false, "Job 2", 5, 255); }},
        // 11 angles
        {"results11_metallic_rainbow", [](QWidget* d) { settings(); sampleView(d, true, "Job", 0); }},
        {"results11_metallic_lab45", [](QWidget* d) { settings(); sampleView(d, true, "Job", 1); }},
        {"results11_metallic_lab15", [](QWidget* d) { settings(); sampleView(d, true, "Job", 2); }},
        {"results11_metallic_texture", [](QWidget* d) { settings(); sampleView(d, true, "Job", -1); }},
        {"results11_solid_rainbow", [](QWidget* d) { settings(); sampleView(d, true, "Job 1", 0); }},
        {"results11_solid_lab15", [](QWidget* d) { settings(); sampleView(d, true, "Job 1", 2, 3); }},
        {"results11_pearl_rainbow", [](QWidget* d) { settings(); sampleView(d, true, "Job 2", 0, 0, 255); }},
        {"results11_images_metallic", [](QWidget* d) { settings(); images(d, true, "Job", 0); }},
        {"results11_metallic_lab45_de", [](QWidget* d) { settings(); sampleView(d, true, "Job", 1); }, "de"},
    };
}

TOUR_MAIN(stops)
