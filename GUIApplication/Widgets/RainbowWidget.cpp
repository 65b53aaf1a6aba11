#include "Widgets/RainbowWidget.h"
#include "ui_RainbowWidget.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/RainbowPainter.h"
#include "Widgets/SampleColorStrip.h"
#include "Widgets/Theme.h"

#include <QtMath>

namespace {

const QRect kTopRing(42, 52, 234, 118);
const int kThickness = 26;
const QColor kNone(255, 255, 255, 0);

struct Stop
{
    double position;
    REFL_ANGLE_T angle;
};

// The stops are the angles of the scale's ticks; the pictures
// result_rainbow_15 and result_rainbow_45_15 are drawn to them.
const Stop kTopStops[] = {
    {0.3055555522441864, REFL_D45_110}, {0.4027777910232544, REFL_D45_75},
    {0.4861111044883728, REFL_D45_45},  {0.5416666865348816, REFL_D45_25},
    {0.5694444179534912, REFL_D45_15},  {0.6527777910232544, REFL_D45_NEG_15},
};
const double kTopBefore = 0.30552777647972107;
const double kTopAfter = 0.6528055667877197;

const Stop kBottomStops[] = {
    {0.375, REFL_D15_80},
    {0.4722222089767456, REFL_D15_45},
    {0.5277777910232544, REFL_D15_15},
    {0.6111111044883728, REFL_D15_NEG_15},
    {0.7083333134651184, REFL_D15_NEG_45},
};
const double kBottomBefore = 0.37497222423553467;
const double kBottomAfter = 0.7083610892295837;

QConicalGradient ringGradient(const QRect& ring)
{
    const qreal w = ring.width();
    return QConicalGradient(QPointF(w / 2, w / 2), 270);
}

} // namespace

RainbowWidget::RainbowWidget(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::RainbowWidget)
    , m_rainbowPainterTop(nullptr)
    , m_rainbowPainterBottom(nullptr)
{
    ui->setupUi(this);
    setBackgroundRole(QPalette::Base);
    setAutoFillBackground(true);

    DataManager* data = DataManager::instance();
    ui->sampleColorStrip->setSampleIndex(int(data->getActiveSample()));
    ui->sampleColorStrip->setSpacing(1);
    // An empty sample still reports 6 curves: it gets no ring of black.
    const Sample sample = data->getActiveSampleObject();
    const unsigned int n = sample.isValid() ? sample.getNumAngleCurves() : 0;

    if (n == 6) {
        ui->labelRainbows->setPixmap(QPixmap(QStringLiteral(":/Assets/result_rainbow_15.png")));
        drawTopRainbow();
        drawScaleNumbers(false);
    } else if (n == 11) {
        ui->labelRainbows->setPixmap(QPixmap(QStringLiteral(":/Assets/result_rainbow_45_15.png")));
        drawRainbows();
        drawScaleNumbers(true);
    }
}

RainbowWidget::~RainbowWidget()
{
    delete ui;
}

SampleColorStrip* RainbowWidget::colorStrip() const
{
    return ui->sampleColorStrip;
}

QLabel* RainbowWidget::scaleLabel() const
{
    return ui->labelRainbows;
}

QPoint RainbowWidget::ringCentre()
{
    return QPoint(kTopRing.left() + kTopRing.width() / 2, kTopRing.top() + kTopRing.width() / 2);
}

double RainbowWidget::stopAngle(int reflAngle)
{
    for (const Stop& s : kTopStops)
        if (s.angle == reflAngle)
            return 270.0 + 360.0 * s.position - 360.0;
    for (const Stop& s : kBottomStops)
        if (s.angle == reflAngle)
            return 270.0 + 360.0 * s.position - 360.0;
    return -1.0;
}

QConicalGradient RainbowWidget::createTopRainbowGradient(const QRect& ring)
{
    QConicalGradient gradient = ringGradient(ring);
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    if (!sample.isValid() || sample.getNumAngleCurves() <= 5)
        return gradient;
    gradient.setColorAt(0.0, kNone);
    gradient.setColorAt(kTopBefore, kNone);
    for (const Stop& s : kTopStops)
        gradient.setColorAt(s.position, sample.getColor(s.angle));
    gradient.setColorAt(kTopAfter, kNone);
    return gradient;
}

QConicalGradient RainbowWidget::createBottomRainbowGradient(const QRect& ring)
{
    QConicalGradient gradient = ringGradient(ring);
    const Sample sample = DataManager::instance()->getActiveSampleObject();
    if (!sample.isValid() || sample.getNumAngleCurves() != 11)
        return gradient;
    gradient.setColorAt(0.0, kNone);
    gradient.setColorAt(kBottomBefore, kNone);
    for (const Stop& s : kBottomStops)
        gradient.setColorAt(s.position, sample.getColor(s.angle));
    gradient.setColorAt(kBottomAfter, kNone);
    return gradient;
}

void RainbowWidget::drawTopRainbow()
{
    m_topRainbow = kTopRing;
    m_rainbowPainterTop = new RainbowPainter(m_topRainbow, this);
    m_rainbowPainterTop->setRainbowThickness(kThickness);
    m_rainbowPainterTop->setGradient(createTopRainbowGradient(m_topRainbow));
    m_rainbowPainterTop->show();
}

void RainbowWidget::drawBottomRainbow()
{
    // 25 pixels inside the outer ring on three sides, on the same baseline:
    // with a thickness of 26 the two rings touch.
    m_bottomRainbow.setLeft(m_topRainbow.left() + 25);
    m_bottomRainbow.setTop(m_topRainbow.top() + 25);
    m_bottomRainbow.setRight(m_topRainbow.right() - 25);
    m_bottomRainbow.setBottom(m_topRainbow.bottom());
    m_rainbowPainterBottom = new RainbowPainter(m_bottomRainbow, this);
    m_rainbowPainterBottom->setRainbowThickness(kThickness);
    m_rainbowPainterBottom->setGradient(createBottomRainbowGradient(m_bottomRainbow));
    m_rainbowPainterBottom->show();
}

void RainbowWidget::drawRainbows()
{
    drawTopRainbow();
    drawBottomRainbow();
}

void RainbowWidget::drawScaleNumbers(bool bothRings)
{
    // The figures beside the ticks: outside the 45 degree ring, inside the
    // 15 degree ring. They are text, so they are not part of the pictures.
    const QPoint c = ringCentre();
    auto place = [this, c](int angle, double radius, int pointSize) {
        const double t = qDegreesToRadians(stopAngle(angle));
        auto* label = new QLabel(getStringFromList(angle, ANGLE_TABLE), this);
        label->setObjectName(QStringLiteral("labelScale%1").arg(angle));
        label->setFont(Theme::font(pointSize));
        label->setAlignment(Qt::AlignCenter);
        label->setStyleSheet(QStringLiteral("color: %1; background: transparent;").arg(Theme::css(Theme::TextSecondary)));
        const int w = 34, h = 16;
        const int x = int(qRound(c.x() + radius * qCos(t))) - w / 2;
        const int y = int(qRound(c.y() - radius * qSin(t))) - h / 2;
        label->setGeometry(x, y, w, h);
        label->show();
    };
    for (const Stop& s : kTopStops)
        place(s.angle, 140.0, Theme::FontSmall);
    // The inner figures stand close together: every other one a step
    // further in, so that neighbours don't touch.
    if (bothRings) {
        int i = 0;
        for (const Stop& s : kBottomStops)
            place(s.angle, (i++ % 2) ? 33.0 : 47.0, 8);
    }
}
