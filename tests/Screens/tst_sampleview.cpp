// The sample view of a 6-angle instrument against the simulator: which pages
// the display settings give, the texture page that comes with its data, the
// thumbnails' debounce, the figures in the user's number format, the texture
// columns, the picture viewer and the delete question.

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DeleteSamplePopup.h"
#include "Screens/ImageViewScreen.h"
#include "Screens/SampleViewScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/ClickableLabel.h"
#include "Widgets/ColorPatch.h"
#include "Widgets/FlickButton.h"
#include "Widgets/HorizontalPageContainer.h"
#include "Widgets/ImageViewPage.h"
#include "Widgets/SampleDetailsPage.h"
#include "Widgets/SampleDetailsPageContainer.h"
#include "Widgets/SampleDetailsViewer.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/SampleResultsPage.h"
#include "Widgets/SampleTexturePage.h"
#include "Widgets/SampleViewPageContainer.h"

#include "support/ResultsFixture.h"

#include <QLabel>
#include <QPushButton>
#include <QSignalSpy>
#include <QtTest>

namespace {

void display(bool rainbow, bool labch, bool texture, bool previews = true)
{
    UserParams::setDisplayRainbow(rainbow);
    UserParams::setDisplayLABCH(labch);
    UserParams::setDisplayTexture(texture);
    UserParams::setDisplayPreviewImages(previews);
    UserParams::setDisplayTextureParameters(false);
}

template <class T>
T* page(SampleViewPageContainer* pages, int index)
{
    for (T* candidate : pages->findChildren<T*>()) {
        if (candidate->parentWidget() && candidate->x() == index * candidate->width())
            return candidate;
    }
    return nullptr;
}

} // namespace

class tst_SampleView : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void init();

    void allSettingsOffGiveNoPage();
    void onlyRainbowHasNoRightArrowUntilTextures();
    void sixAnglesLeaveOutThe15DegreePage();
    void secondThumbnailTouchWithinDebounceDoesNothing();
    void figuresFollowPrecisionAndDecimalSign();
    void colourButtonsCarryTheirAngleColour();
    void textureColumnHasSixPagesWithDiffuse();
    void textureParametersByName();
    void imageViewOpensOnTheChosenPicture();
    void titleShowsTimeAndNumber();
    void vanishedSampleClosesTheScreen();
    void deleteAsksThenDeletes();

private:
    SampleViewScreen* openScreen();
    QWidget* m_display = nullptr;
};

void tst_SampleView::initTestCase()
{
    QVERIFY(ResultsFixture::start(false));
    QCOMPARE(Instrument_Get_Num_Camera_Images(), 6);
}

void tst_SampleView::init()
{
    delete m_display;
    m_display = new QWidget;
    m_display->resize(320, 480);
    m_display->show();
    UserParams::setPrecision(2);
    UserParams::setDecimalPoint(QStringLiteral("."));
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job")));
}

SampleViewScreen* tst_SampleView::openScreen()
{
    auto* screen = new SampleViewScreen(m_display);
    screen->SetActiveStatus(true);
    screen->show();
    return screen;
}

void tst_SampleView::allSettingsOffGiveNoPage()
{
    display(false, false, false);
    SampleViewScreen* screen = openScreen();
    QCOMPARE(screen->pageContainer()->getNumberOfPages(), 0);
    // The load that follows the showing adds nothing either.
    QTest::qWait(300);
    QCOMPARE(screen->pageContainer()->getNumberOfPages(), 0);
    screen->pageContainer()->onLoadCurrentSamplesTexturesComplete();
    QCOMPARE(screen->pageContainer()->getNumberOfPages(), 0);
}

void tst_SampleView::onlyRainbowHasNoRightArrowUntilTextures()
{
    display(true, false, true);
    QSignalSpy requests(DataManager::instance(), &DataManager::loadCurrentSamplesTexturesComplete);
    auto* screen = new SampleViewScreen(m_display);
    SampleViewPageContainer* pages = screen->pageContainer();
    QCOMPARE(pages->getNumberOfPages(), 1);
    auto* results = page<SampleResultsPage>(pages, 0);
    QVERIFY(results);
    QVERIFY(!results->isRightButtonEnabled());
    QVERIFY(!pages->texturePage());

    // Showing the screen asks for the textures; they bring their page.
    screen->show();
    QTRY_VERIFY(pages->texturePage());
    QCOMPARE(pages->getNumberOfPages(), 2);
    QVERIFY(results->isRightButtonEnabled());
    QVERIFY(pages->texturePage()->isLeftButtonEnabled());
    QVERIFY(!pages->texturePage()->isRightButtonEnabled());

    // A later load (the screen shown again) makes no second texture page.
    pages->onLoadCurrentSamplesTexturesComplete();
    QCOMPARE(pages->getNumberOfPages(), 2);

    // The arrow leads there.
    QMetaObject::invokeMethod(results, "on_BtnPageRight_clicked");
    QCOMPARE(pages->getCurrentPage(), 1);
}

void tst_SampleView::sixAnglesLeaveOutThe15DegreePage()
{
    display(true, true, false);
    SampleViewScreen* screen = openScreen();
    SampleViewPageContainer* pages = screen->pageContainer();
    QCOMPARE(pages->getNumberOfPages(), 2);
    QVERIFY(pages->findChildren<SampleDetailsViewerD45*>().size() == 1);
    QVERIFY(pages->findChildren<SampleDetailsViewerD15*>().isEmpty());
    auto* d45 = pages->findChild<SampleDetailsViewerD45*>();
    QVERIFY(d45->isLeftButtonEnabled());
    QVERIFY(!d45->isRightButtonEnabled());
    QCOMPARE(d45->pageContainer()->getNumberOfPages(), 6);
    QVERIFY(page<SampleResultsPage>(pages, 0)->isRightButtonEnabled());
    // No texture display: the images are asked for and nothing is added.
    QTest::qWait(300);
    QCOMPARE(pages->getNumberOfPages(), 2);
    QVERIFY(!d45->isRightButtonEnabled());

    // Without the rainbow the figures come first, with no left arrow.
    display(false, true, false);
    auto* second = new SampleViewScreen(m_display);
    QCOMPARE(second->pageContainer()->getNumberOfPages(), 1);
    QVERIFY(!second->pageContainer()->findChild<SampleDetailsViewerD45*>()->isLeftButtonEnabled());
}

void tst_SampleView::secondThumbnailTouchWithinDebounceDoesNothing()
{
    display(true, false, false);
    SampleViewScreen* screen = openScreen();
    auto* results = page<SampleResultsPage>(screen->pageContainer(), 0);
    QCOMPARE(results->thumbnails().size(), 6);
    for (ClickableLabel* thumbnail : results->thumbnails())
        QVERIFY(!thumbnail->isEnabled());
    // Captions of the camera angles under the pictures.
    QCOMPARE(results->thumbnailLabels().at(5)->text(), QStringLiteral("Diffuse"));
    QCOMPARE(results->thumbnailLabels().at(0)->x(), results->thumbnails().at(0)->x() - 3);

    QTRY_VERIFY(results->thumbnails().at(2)->isEnabled());
    QVERIFY(!results->thumbnails().at(2)->pixmap(Qt::ReturnByValue).isNull());

    QSignalSpy opened(results, &SampleResultsPage::gotoImageViewScreen);
    QTest::mouseClick(results->thumbnails().at(2), Qt::LeftButton);
    QCOMPARE(opened.count(), 1);
    QCOMPARE(int(DataManager::instance()->getActiveImage()), 2);
    QTest::mouseClick(results->thumbnails().at(4), Qt::LeftButton);
    QCOMPARE(opened.count(), 1);
    QCOMPARE(int(DataManager::instance()->getActiveImage()), 2);
    QTRY_VERIFY(results->thumbnails().at(4)->isEnabled());
    QTest::mouseClick(results->thumbnails().at(4), Qt::LeftButton);
    QCOMPARE(opened.count(), 2);
    QCOMPARE(int(DataManager::instance()->getActiveImage()), 4);
}

void tst_SampleView::figuresFollowPrecisionAndDecimalSign()
{
    UserParams::setPrecision(2);
    UserParams::setDecimalPoint(QStringLiteral(","));
    QCOMPARE(SampleDetailsPage::formatValue(12.349), QStringLiteral("12,35"));
    QCOMPARE(SampleDetailsPage::formatValue(-0.004), QStringLiteral("-0,00"));
    UserParams::setPrecision(0);
    QCOMPARE(SampleDetailsPage::formatValue(12.6), QStringLiteral("13"));
    UserParams::setPrecision(3);
    UserParams::setDecimalPoint(QStringLiteral("."));
    QCOMPARE(SampleDetailsPage::formatValue(7.0), QStringLiteral("7.000"));
    QCOMPARE(SampleDetailsPage::formatValue(qQNaN()), QStringLiteral("\u2013"));

    // The pages show the sample's own figures in that format.
    UserParams::setPrecision(2);
    UserParams::setDecimalPoint(QStringLiteral(","));
    display(false, true, false);
    SampleViewScreen* screen = openScreen();
    auto* d45 = screen->pageContainer()->findChild<SampleDetailsViewerD45*>();
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    for (int angle = REFL_D45_NEG_15; angle <= REFL_D45_110; ++angle) {
        auto* figures = d45->findChild<SampleDetailsPage*>(QStringLiteral("detailsPage%1").arg(angle));
        QVERIFY(figures);
        const LABCH_T labch = sample.getLabch(angle);
        QCOMPARE(figures->valueText("labelLStarValue"), QString::number(labch.l, 'f', 2).replace('.', ','));
        QCOMPARE(figures->valueText("labelhStarValue"), QString::number(labch.h, 'f', 2).replace('.', ','));
        QVERIFY(labch.l > 1.0);
    }
    QCOMPARE(d45->title(), QStringLiteral("45\u00B0 Series"));
    QCOMPARE(d45->illumObsText(), QStringLiteral("D65/10\u00B0"));
}

void tst_SampleView::colourButtonsCarryTheirAngleColour()
{
    display(false, true, false);
    SampleViewScreen* screen = openScreen();
    auto* d45 = screen->pageContainer()->findChild<SampleDetailsViewerD45*>();
    auto* column = qobject_cast<SampleDetailsPageContainerDNumber*>(d45->pageContainer());
    QVERIFY(column);
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    QCOMPARE(column->pageButtons().size(), size_t(6));
    QCOMPARE(column->colorPatches().size(), size_t(6));
    for (size_t i = 0; i < 6; ++i) {
        QCOMPARE(column->colorPatches()[i]->getColor(), sample.getColor(int(i)));
        QCOMPARE(column->colorPatches()[i]->geometry().topLeft(), column->pageButtons()[i]->geometry().topLeft());
        QCOMPARE(column->colorPatches()[i]->width(), 34);
    }
    QCOMPARE(column->buttonStrings().at(3), QStringLiteral("          45\u00B0"));
    QCOMPARE(column->pageButtons()[3]->text(), QStringLiteral("45\u00B0"));

    // A button picks its page; the patch above it doesn't swallow the touch.
    QTest::mouseClick(column->pageButtons()[4], Qt::LeftButton, {}, QPoint(10, 10));
    QCOMPARE(column->getCurrentPage(), 4);
    QVERIFY(column->pageButtons()[4]->property("selected").toBool());
    QVERIFY(!column->pageButtons()[0]->property("selected").toBool());
}

void tst_SampleView::textureColumnHasSixPagesWithDiffuse()
{
    display(false, false, true);
    SampleViewScreen* screen = openScreen();
    SampleViewPageContainer* pages = screen->pageContainer();
    QTRY_VERIFY(pages->texturePage());
    QCOMPARE(pages->getNumberOfPages(), 1);
    SampleDetailsViewerTexture* viewer = pages->texturePage();
    QVERIFY(!viewer->isLeftButtonEnabled());
    QVERIFY(!viewer->isRightButtonEnabled());
    QCOMPARE(viewer->title(), QStringLiteral("15\u00B0 Texture"));
    SampleDetailsPageContainer* column = viewer->pageContainer();
    QCOMPARE(column->getNumberOfPages(), 6);
    QCOMPARE(column->buttonStrings().last(), QStringLiteral("Diffuse"));

    const Sample sample = DataManager::instance()->getActiveSampleObject();
    for (int angle = IMAGE_NEG_45; angle <= IMAGE_DIFFUSE; ++angle) {
        auto* figures = column->findChild<SampleTexturePage*>(QStringLiteral("texturePage%1").arg(angle));
        QVERIFY(figures);
        const TEXTURE_T t = sample.getTexture(angle);
        QCOMPARE(figures->text("labelDCValue"), QString::number(t.directionalCoarseness, 'f', 2));
        QCOMPARE(figures->text("labelSGValue"), QString::number(t.sparkleGrade, 'f', 2));
        QCOMPARE(figures->text("labelSDValue"), QString::number(t.sparkleDensity, 'f', 2));
        QCOMPARE(figures->text("labelSIValue"), QString::number(t.sparkleIntensity, 'f', 2));
        QVERIFY(figures->text("labelSAValue").isEmpty());
    }
    // A silver metallic glints most near the gloss.
    QVERIFY(sample.getTexture(IMAGE_NEG_15).sparkleIntensity > sample.getTexture(IMAGE_80).sparkleIntensity);
}

void tst_SampleView::textureParametersByName()
{
    display(false, false, true);
    UserParams::setDisplayTextureParameters(true);
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job 1"), 1));
    ResultsFixture::loadTexturesAndImages();
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const QVector<TEXTURE_PARAMETER_T> directional = sample.getTextureParameters(IMAGE_15);
    const QVector<TEXTURE_PARAMETER_T> diffuse = sample.getTextureParameters(IMAGE_DIFFUSE);
    QVERIFY(!directional.isEmpty());
    QVERIFY(!diffuse.isEmpty());

    SampleTexturePage directionalPage(IMAGE_15);
    SampleTexturePage diffusePage(IMAGE_DIFFUSE);
    // Coarseness leads its page (the instrument names it in any case);
    // with it, the grade takes the second row.
    for (SampleTexturePage* figures : {&directionalPage, &diffusePage}) {
        const QVector<TEXTURE_PARAMETER_T> list = sample.getTextureParameters(figures->angle());
        int c = -1, sg = -1;
        for (int i = 0; i < list.size(); ++i) {
            if (list[i].name.toUpper() == "C")
                c = i;
            if (list[i].name.toUpper() == "SG")
                sg = i;
        }
        QVERIFY(c >= 0 || sg >= 0);
        const int first = c >= 0 ? c : sg;
        QCOMPARE(figures->text("labelDC"), list[first].name);
        QCOMPARE(figures->text("labelDCValue"), QString::number(list[first].value, 'f', 2));
        QCOMPARE(figures->text("labelSI"), c >= 0 && sg >= 0 ? list[sg].name : QString());
        QVERIFY(figures->text("labelSG").isEmpty());
        QVERIFY(figures->text("labelSDValue").isEmpty());
    }
    UserParams::setDisplayTextureParameters(false);
}

void tst_SampleView::imageViewOpensOnTheChosenPicture()
{
    ResultsFixture::loadTexturesAndImages();
    DataManager::instance()->setActiveImage(IMAGE_45);
    auto* viewer = new ImageViewScreen(m_display);
    viewer->show();
    HorizontalPageContainer* pages = viewer->imageViewPage();
    QCOMPARE(pages->getNumberOfPages(), 6);
    QCOMPARE(pages->getCurrentPage(), int(IMAGE_45));
    QCOMPARE(viewer->pageDots().size(), size_t(6));
    auto* shown = viewer->findChild<ImageViewPage*>(QStringLiteral("imagePage3"));
    QVERIFY(shown->hasImage());
    QCOMPARE(shown->angleText(), QStringLiteral("45\u00B0"));

    // The filled dot follows the page, and the arrows wrap round.
    QMetaObject::invokeMethod(viewer, "on_BtnPageRight_clicked");
    QCOMPARE(pages->getCurrentPage(), 4);
    QCOMPARE(viewer->pageDots().size(), size_t(6));
    const QImage filled = QPixmap(":/Assets/pagination_filled.png").toImage();
    QCOMPARE(viewer->pageDots()[4]->pixmap(Qt::ReturnByValue).toImage(), filled);
    QVERIFY(viewer->pageDots()[3]->pixmap(Qt::ReturnByValue).toImage() != filled);
    QMetaObject::invokeMethod(viewer, "on_BtnPageRight_clicked");
    QMetaObject::invokeMethod(viewer, "on_BtnPageRight_clicked");
    QCOMPARE(pages->getCurrentPage(), 0);

    QMetaObject::invokeMethod(viewer, "on_BtnZoomOut_clicked");
    QVERIFY(viewer->isClosing());
}

void tst_SampleView::titleShowsTimeAndNumber()
{
    display(true, true, true);
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job 1"), 2));
    SampleViewScreen* screen = openScreen();
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    QCOMPARE(screen->findChild<QLabel*>("TxtTitle")->text(), sample.getTimeStampString(UserParams::getTimeFormat()));
    QCOMPARE(screen->findChild<QLabel*>("labelNumber")->text(), QStringLiteral("3"));

    QVERIFY(ResultsFixture::activate(QStringLiteral("Job 2"), 255));
    SampleViewScreen* averaged = openScreen();
    QVERIFY(averaged->findChild<QLabel*>("labelNumber")->text().isEmpty());
    QVERIFY(averaged->pageContainer()->getNumberOfPages() >= 2);
}

void tst_SampleView::vanishedSampleClosesTheScreen()
{
    SampleViewScreen* screen = openScreen();
    screen->onUpdateScreen();
    QVERIFY(!screen->isClosing());
    DataManager::instance()->setActiveSample(400);
    screen->onUpdateScreen();
    QVERIFY(screen->isClosing());
}

void tst_SampleView::deleteAsksThenDeletes()
{
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job 3"), 255) || ResultsFixture::activate(QStringLiteral("Job 1"), 0));
    SampleViewScreen* screen = openScreen();
    QSignalSpy deletes(API_SignalMaster::instance(), &API_SignalMaster::SampleCurrentDelete);

    QTest::mouseClick(screen->findChild<QPushButton*>("BtnTrash"), Qt::LeftButton);
    QCOMPARE(screen->popups().size(), size_t(1));
    auto* popup = qobject_cast<DeleteSamplePopup*>(screen->popups().front());
    QVERIFY(popup);
    QCOMPARE(popup->colorStrip()->colorPatches().size(), 6);
    QCOMPARE(popup->messageText(),
             DataManager::instance()->getActiveSampleObject().getTimeStampString(UserParams::getTimeFormat()));
    QTest::mouseClick(popup->findChild<QPushButton*>("BtnCancel"), Qt::LeftButton);
    QTRY_VERIFY(screen->popups().empty());
    QCOMPARE(deletes.count(), 0);
    QVERIFY(!screen->isClosing());

    QTest::mouseClick(screen->findChild<QPushButton*>("BtnTrash"), Qt::LeftButton);
    popup = qobject_cast<DeleteSamplePopup*>(screen->popups().front());
    QTest::mouseClick(popup->findChild<QPushButton*>("BtnConfirm"), Qt::LeftButton);
    QCOMPARE(deletes.count(), 1);
    QVERIFY(!screen->isEnabled());
    QVERIFY(screen->isClosing());
}

QTEST_MAIN(tst_SampleView)
#include "tst_sampleview.moc"
