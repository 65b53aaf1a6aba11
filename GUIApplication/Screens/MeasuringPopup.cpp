#include "Screens/MeasuringPopup.h"

#include "ui_MeasuringPopup.h"

#include "Widgets/KLabel.h"

#include "GUIAPI/DataManager.h"
#include "GUIAPI/API_SignalMaster.h"
#include "SharedSystem/Platform.h"

#include <QDebug>
#include <QEvent>
#include <QKeyEvent>
#include <QPixmap>
#include <QTime>

#include <cmath>

namespace {

const int kBrandingMaxSide = 140;
const int kBrandingLift = 20;

QString timeNow()
{
    return QTime::currentTime().toString(QStringLiteral("hh:mm:ss.zzz"));
}

// The parameter names a device path; anything else (a resource, a test's
// file) is taken as it stands.
QString resolveBrandingPath(const QString& path)
{
    if (path.startsWith(QLatin1String("/opt/")))
        return Platform::devicePath(path);
    return path;
}

} // namespace

MeasuringPopup::MeasuringPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(nullptr)
    , m_timeToClose(0)
    , m_pBrandingImageLabel(nullptr)
{
    Init();
}

MeasuringPopup::MeasuringPopup(const QString& brandingImage, QWidget* parent)
    : PopupPanel(parent)
    , ui(nullptr)
    , m_timeToClose(0)
    , m_pBrandingImageLabel(nullptr)
{
    Init();
    applyBrandingImage(brandingImage);
}

MeasuringPopup::~MeasuringPopup()
{
    qDebug() << QStringLiteral("%1\tPopup ended").arg(timeNow());
    m_propertyAnimation.stop();
    delete m_pBrandingImageLabel;
    delete ui;
}

void MeasuringPopup::Init()
{
    setObjectName(QStringLiteral("MeasuringPopup"));
    qDebug() << QStringLiteral("%1\tPopup started").arg(timeNow());
    if (!ui) {
        ui = new Ui::MeasuringPopup;
        ui->setupUi(this);
        // The dimmer lies under the card, whatever the form's order.
        ui->labelBackGround->lower();
        // Between the brackets: a long translation shrinks to fit.
        ui->labelSubText->setAutoSize(true);
    }
    m_closeTimer.setSingleShot(true);
    m_timeToClose = 0;
    m_propertyAnimation.setTargetObject(ui->progressBarCircle);
    m_propertyAnimation.setPropertyName("value");
    m_propertyAnimation.setDuration(300);
    ui->progressBarCircle->setRange(0, 100);
    m_pBrandingImageLabel = nullptr;
    setState(STATE_POPUP_MEASURING);
    setAttribute(Qt::WA_TranslucentBackground);

    connect(DataManager::instance(), &DataManager::updatePercentComplete,
            this, &MeasuringPopup::onUpdatePercentComplete);
    connect(DataManager::instance(), &DataManager::updateSystemState,
            this, &MeasuringPopup::onUpdateSystemState);
    connect(&m_closeTimer, &QTimer::timeout, this, &MeasuringPopup::onCloseTimeout);
    connect(API_SignalMaster::instance(), &API_SignalMaster::MeasurementComplete,
            this, &MeasuringPopup::onMeasurementComplete);
    connect(API_SignalMaster::instance(), &API_SignalMaster::CalculationComplete,
            this, &MeasuringPopup::onCalculationComplete);
}

void MeasuringPopup::applyBrandingImage(const QString& brandingImage)
{
    if (brandingImage.isEmpty())
        return;
    QPixmap pixmap(resolveBrandingPath(brandingImage));
    if (pixmap.isNull())
        return;

    ProgressBarCircle* circle = ui->progressBarCircle;
    circle->setBackgroundHighlightImage(QStringLiteral(":/Assets/measuring_white_circle_filled.png"));

    const QPoint centre = circle->geometry().center();
    if (pixmap.width() > kBrandingMaxSide && pixmap.width() > pixmap.height())
        pixmap = pixmap.scaledToWidth(kBrandingMaxSide, Qt::SmoothTransformation);
    else if (pixmap.height() > kBrandingMaxSide)
        pixmap = pixmap.scaledToHeight(kBrandingMaxSide, Qt::SmoothTransformation);

    m_pBrandingImageLabel = new QLabel(this);
    m_pBrandingImageLabel->setObjectName(QStringLiteral("labelBrandingImage"));
    QRect area(QPoint(0, 0), pixmap.size());
    area.moveCenter(centre);
    m_pBrandingImageLabel->setGeometry(area);
    m_pBrandingImageLabel->setPixmap(pixmap);

    // The picture's corners must stay inside the ring: grow the circle
    // until its free disc holds the picture's diagonal.
    const int side = qMax(pixmap.width(), pixmap.height());
    const int diagonal = int(std::sqrt(double(side) * side * 2.0) + 0.5);
    const int inner = circle->getCircleInnerDiameterInPixels();
    if (inner > 0 && diagonal > inner) {
        const double factor = double(diagonal) / double(inner);
        const QRect old = circle->geometry();
        QRect grown(0, 0, int(old.width() * factor + 0.5), int(old.height() * factor + 0.5));
        grown.moveCenter(centre);
        const int shift = old.top() - grown.top() - kBrandingLift;
        circle->setGeometry(grown);
        ui->labelText->move(ui->labelText->x(), ui->labelText->y() - shift);
        ui->labelWarningSubText->move(ui->labelWarningSubText->x(), ui->labelWarningSubText->y() + shift);
        ui->labelSubText->move(ui->labelSubText->x(), ui->labelSubText->y() + shift);
        ui->labelBracket->move(ui->labelBracket->x(), ui->labelBracket->y() + shift);
    }

    m_pBrandingImageLabel->show();
    m_pBrandingImageLabel->raise();
}

void MeasuringPopup::setState(MEASURING_POPUP_STATE_T state)
{
    if (state == STATE_POPUP_COMPLETE) {
        ui->icnPopupBkgnd->setPixmap(QPixmap(QStringLiteral(":/Assets/overlay_background_calc.png")));
        // The owner deletes the popup inside this call: nothing may follow.
        onCloseTimeout();
        return;
    }
    if (state != STATE_POPUP_INIT && state != STATE_POPUP_MEASURING && state != STATE_POPUP_CALCULATING)
        return;

    const bool calculating = state == STATE_POPUP_CALCULATING;
    ProgressBarCircle* circle = ui->progressBarCircle;
    m_propertyAnimation.stop();
    circle->setValue(0);
    // Measuring leaves the sub text as it stands: the form's "Hold Steady".
    if (state == STATE_POPUP_MEASURING) {
        ui->labelText->setText(tr("Measuring"));
    } else if (calculating) {
        ui->labelText->setText(tr("Calculating"));
        ui->labelSubText->setText(tr("OK to move instrument"));
    }
    // "Hold steady" stands while the instrument works, not before.
    const bool holdSteady = state != STATE_POPUP_INIT;
    ui->labelBracket->setVisible(holdSteady);
    ui->labelSubText->setVisible(holdSteady);
    ui->labelCheckMark->hide();
    ui->labelWarningSubText->hide();
    ui->labelTimerSubtext->hide();
    if (calculating) {
        // The green sweep fills over a full red ring.
        circle->setBackgroundImage(QStringLiteral(":/Assets/measuring_red_circle.png"));
        circle->setForegroundImage(QStringLiteral(":/Assets/measuring_green_circle.png"));
    } else {
        circle->setForegroundImage(QStringLiteral(":/Assets/measuring_red_circle.png"));
    }
    ui->icnPopupBkgnd->setPixmap(QPixmap(calculating ? QStringLiteral(":/Assets/overlay_background_calc.png")
                                                     : QStringLiteral(":/Assets/overlay_background_meas.png")));
}

void MeasuringPopup::setText(QString text)
{
    ui->labelText->setText(text);
}

void MeasuringPopup::onUpdateSystemState(SYSTEM_STATE_T state)
{
    switch (state) {
    case STATE_MEASURING:
    case STATE_CALIBRATING:
        setState(STATE_POPUP_MEASURING);
        break;
    case STATE_CALCULATING:
        setState(STATE_POPUP_CALCULATING);
        break;
    default:
        setState(STATE_POPUP_COMPLETE);
        break;
    }
}

void MeasuringPopup::onMeasurementComplete()
{
    setState(STATE_POPUP_COMPLETE);
}

void MeasuringPopup::onCalculationComplete()
{
    setState(STATE_POPUP_COMPLETE);
}

void MeasuringPopup::onCloseTimeout()
{
    emit closePopup(this);
}

void MeasuringPopup::onUpdatePercentComplete(int percent)
{
    ProgressBarCircle* circle = ui->progressBarCircle;
    m_propertyAnimation.stop();
    if (percent == circle->minimum() || percent == circle->maximum()) {
        circle->setValue(percent);
        return;
    }
    m_propertyAnimation.setStartValue(circle->value());
    m_propertyAnimation.setEndValue(percent);
    m_propertyAnimation.start();
}

void MeasuringPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && ui)
        ui->retranslateUi(this);
    PopupPanel::changeEvent(event);
}

void MeasuringPopup::keyPressEvent(QKeyEvent* event)
{
    // A service key that ends the popup as if the calculation had finished.
    if (event->key() == Qt::Key_D) {
        onCalculationComplete();
        return;
    }
    QWidget::keyPressEvent(event);
}
