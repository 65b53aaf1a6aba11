// The result views of an 11-angle instrument (5 cameras): the 15 degree
// page, two rings whose colours sit on the scale's ticks, the strip across
// all angles, five thumbnails and five texture pages.

#include "GUIAPI/DataManager.h"
#include "Screens/ImageViewScreen.h"
#include "Screens/SampleViewScreen.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/ClickableLabel.h"
#include "Widgets/ColorPatch.h"
#include "Widgets/HorizontalPageContainer.h"
#include "Widgets/RainbowPainter.h"
#include "Widgets/RainbowWidget.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/SampleDetailsPageContainer.h"
#include "Widgets/SampleDetailsViewer.h"
#include "Widgets/SampleResultsPage.h"
#include "Widgets/SampleViewPageContainer.h"

#include "support/ResultsFixture.h"

#include <QLabel>
#include <QtMath>
#include <QtTest>

namespace {

QColor onRing(const QImage& shot, int reflAngle, double radius, double offset)
{
    const QPoint c = RainbowWidget::ringCentre();
    const double t = qDegreesToRadians(RainbowWidget::stopAngle(reflAngle) + offset);
    return shot.pixelColor(qFloor(c.x() + radius * qCos(t)), qFloor(c.y() - radius * qSin(t)));
}

bool near(const QColor& a, const QColor& b)
{
    return qAbs(a.red() - b.red()) <= 2 && qAbs(a.green() - b.green()) <= 2 && qAbs(a.blue() - b.blue()) <= 2;
}

} // namespace

class tst_SampleViewEleven : public QObject
{
    Q_OBJECT
private slots:
    void initTestCase();
    void init();
    void elevenAnglesAddThe15DegreePage();
    void twoRingsShowTheirAnglesColours();
    void stripRunsAcrossAllAngles();
    void fiveCamerasFiveThumbnailsAndTexturePages();

private:
    QWidget* m_display = nullptr;
};

void tst_SampleViewEleven::initTestCase()
{
    QVERIFY(ResultsFixture::start(true));
    QCOMPARE(Instrument_Get_Num_Camera_Images(), 5);
    QCOMPARE(Instrument_Get_Num_Spectral_Angles(), 11);
}

void tst_SampleViewEleven::init()
{
    delete m_display;
    m_display = new QWidget;
    m_display->resize(320, 480);
    m_display->show();
    UserParams::setDisplayRainbow(true);
    UserParams::setDisplayLABCH(true);
    UserParams::setDisplayTexture(true);
    UserParams::setDisplayPreviewImages(true);
    UserParams::setDisplayTextureParameters(false);
    QVERIFY(ResultsFixture::activate(QStringLiteral("Job")));
    QCOMPARE(DataManager::instance()->getActiveSampleObject().getNumAngleCurves(), 11u);
}

void tst_SampleViewEleven::elevenAnglesAddThe15DegreePage()
{
    auto* screen = new SampleViewScreen(m_display);
    SampleViewPageContainer* pages = screen->pageContainer();
    QCOMPARE(pages->getNumberOfPages(), 3);
    auto* d45 = pages->findChild<SampleDetailsViewerD45*>();
    auto* d15 = pages->findChild<SampleDetailsViewerD15*>();
    QVERIFY(d45 && d15);
    QVERIFY(d45->isRightButtonEnabled());
    QVERIFY(!d15->isRightButtonEnabled());
    QVERIFY(d15->isLeftButtonEnabled());
    QCOMPARE(d15->title(), QStringLiteral("15\u00B0 Series"));
    QVERIFY(d15->x() > d45->x());

    auto* column = qobject_cast<SampleDetailsPageContainerDNumber*>(d15->pageContainer());
    QCOMPARE(column->getNumberOfPages(), 5);
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    const QStringList labels = {"-45", "-15", "15", "45", "80"};
    for (int i = 0; i < 5; ++i) {
        QCOMPARE(column->buttonAngles()[size_t(i)], REFL_ANGLE_T(REFL_D15_NEG_45 + i));
        QCOMPARE(column->buttonStrings().at(i).trimmed(), labels.at(i) + QChar(0x00B0));
        QCOMPARE(column->colorPatches()[size_t(i)]->getColor(), sample.getColor(REFL_D15_NEG_45 + i));
    }

    screen->show();
    QTRY_VERIFY(pages->texturePage());
    QCOMPARE(pages->getNumberOfPages(), 4);
    QVERIFY(d15->isRightButtonEnabled());
    // Right from the last page wraps to the first.
    pages->onSelectPage(3);
    pages->onGotoRightPage();
    QCOMPARE(pages->getCurrentPage(), 0);
}

void tst_SampleViewEleven::twoRingsShowTheirAnglesColours()
{
    // A metallic, a solid and a pearl's averaged result.
    const QList<QPair<QString, unsigned int>> samples = {{"Job", 0}, {"Job 1", 0}, {"Job 2", 255}};
    for (const auto& [job, index] : samples) {
        QVERIFY(ResultsFixture::activate(job, index));
        const Sample sample = DataManager::instance()->getActiveSampleObject();
        RainbowWidget widget;
        widget.show();
        QVERIFY2(widget.topPainter() && widget.bottomPainter(),
                 qPrintable(QStringLiteral("%1: %2 curves").arg(job).arg(sample.getNumAngleCurves())));
        QCOMPARE(widget.bottomPainter()->geometry(), QRect(67, 77, 184, 93));
        QVERIFY(!widget.scaleLabel()->pixmap(Qt::ReturnByValue).isNull());
        const QImage shot = widget.grab().toImage();
        for (int angle = REFL_D45_NEG_15; angle <= REFL_D45_110; ++angle) {
            const double inward = angle == REFL_D45_110 ? 1.0 : angle == REFL_D45_NEG_15 ? -1.0 : 0.0;
            QVERIFY2(near(onRing(shot, angle, 104, inward), sample.getColor(angle)),
                     qPrintable(QStringLiteral("%1 %2").arg(job).arg(angle)));
        }
        for (int angle = REFL_D15_NEG_45; angle <= REFL_D15_80; ++angle) {
            const double inward = angle == REFL_D15_80 ? 0.5 : angle == REFL_D15_NEG_45 ? -0.5 : 0.0;
            QVERIFY2(near(onRing(shot, angle, 79, inward), sample.getColor(angle)),
                     qPrintable(QStringLiteral("%1 angle %2: %3 vs %4").arg(job).arg(angle)
                                    .arg(onRing(shot, angle, 79, inward).name(), sample.getColor(angle).name())));
        }
    }
}

void tst_SampleViewEleven::stripRunsAcrossAllAngles()
{
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    RainbowWidget widget;
    const auto& patches = widget.colorStrip()->colorPatches();
    QCOMPARE(patches.size(), 11);
    for (int i = 0; i < 11; ++i)
        QCOMPARE(patches[i]->getColor(), sample.getColor(Instrument_Get_Angle_Low_To_High(i, 11)));
    for (int i = 1; i < 11; ++i)
        QVERIFY(patches[i]->x() > patches[i - 1]->x());
}

void tst_SampleViewEleven::fiveCamerasFiveThumbnailsAndTexturePages()
{
    auto* screen = new SampleViewScreen(m_display);
    screen->show();
    SampleViewPageContainer* pages = screen->pageContainer();
    auto* results = pages->findChild<SampleResultsPage*>();
    QCOMPARE(results->thumbnails().size(), 5);
    QCOMPARE(results->thumbnails().front()->geometry(), QRect(6, results->thumbnails().front()->y(), 56, 56));
    QCOMPARE(results->thumbnails().at(1)->x(), 6 + 56 + 7);

    QTRY_VERIFY(pages->texturePage());
    SampleDetailsPageContainer* column = pages->texturePage()->pageContainer();
    QCOMPARE(column->getNumberOfPages(), 5);
    QVERIFY(!column->buttonStrings().contains(QStringLiteral("Diffuse")));

    QTRY_VERIFY(results->thumbnails().at(4)->isEnabled());
    DataManager::instance()->setActiveImage(IMAGE_80);
    auto* viewer = new ImageViewScreen(m_display);
    QCOMPARE(viewer->imageViewPage()->getNumberOfPages(), 5);
    QCOMPARE(viewer->imageViewPage()->getCurrentPage(), 4);
    QCOMPARE(viewer->pageDots().size(), size_t(5));
}

QTEST_MAIN(tst_SampleViewEleven)
#include "tst_sampleview_eleven.moc"
