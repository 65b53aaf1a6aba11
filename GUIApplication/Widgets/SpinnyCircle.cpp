#include "Widgets/SpinnyCircle.h"

#include <QMutex>
#include <QMutexLocker>
#include <QTransform>

namespace {
QMutex spinLock;
int spinAngle = 0; // guarded by spinLock
const int kStepDegrees = 60;
const int kSize = 60;
}

SpinnyCircle::SpinnyCircle(QWidget* parent)
    : MarigoldPanel(parent)
    , m_pLabelSpinner(nullptr)
    , m_timeToTurn(250)
{
    init();
}

SpinnyCircle::SpinnyCircle(int timeToTurnMs, QWidget* parent)
    : MarigoldPanel(parent)
    , m_pLabelSpinner(nullptr)
    , m_timeToTurn(timeToTurnMs)
{
    init();
}

void SpinnyCircle::init()
{
    setObjectName(QStringLiteral("SpinnyCircle"));
    setAttribute(Qt::WA_TranslucentBackground);
    resize(kSize, kSize);
    spinnyPixmap = QPixmap(QStringLiteral(":/Assets/syncing_icon_spin.png"));
    m_centerPoint = QPoint(kSize / 2, kSize / 2);
    m_pLabelSpinner = new QLabel(this);
    m_pLabelSpinner->setObjectName(QStringLiteral("labelSpinner"));
    m_pLabelSpinner->setPixmap(spinnyPixmap);
    m_pLabelSpinner->setGeometry(QRect(QPoint(0, 0), spinnyPixmap.size()));
    connect(&timer, &QTimer::timeout, this, &SpinnyCircle::onTimeout);
}

int SpinnyCircle::sharedAngle()
{
    QMutexLocker lock(&spinLock);
    return spinAngle;
}

void SpinnyCircle::onTimeout()
{
    QMutexLocker lock(&spinLock);
    spinAngle = (spinAngle + kStepDegrees) % 360;
    const QPixmap turned = spinnyPixmap.transformed(QTransform().rotate(spinAngle), Qt::SmoothTransformation);
    QRect area(QPoint(0, 0), turned.size());
    area.moveCenter(m_centerPoint);
    m_pLabelSpinner->setGeometry(area);
    m_pLabelSpinner->setPixmap(turned);
}

void SpinnyCircle::showEvent(QShowEvent* event)
{
    MarigoldPanel::showEvent(event);
    timer.start(m_timeToTurn);
}

void SpinnyCircle::hideEvent(QHideEvent* event)
{
    timer.stop();
    MarigoldPanel::hideEvent(event);
}
