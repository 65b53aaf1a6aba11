#include "Screens/MarigoldFullScreenPanel.h"

#include "Widgets/Theme.h"
#include "Widgets/XPushButton.h"

MarigoldFullScreenPanel::MarigoldFullScreenPanel(QWidget* parent)
    : MarigoldPanel(parent)
    , m_debugButton(new XPushButton(this))
{
    m_debugButton->setObjectName("debugButton");
    m_debugButton->setFocusPolicy(Qt::NoFocus);
    m_debugButton->setFlat(true);
    m_debugButton->setStyleSheet("background: transparent; border: none;");
    m_debugButton->setGeometry(0, 0, 2, 2);
    connect(m_debugButton, &QPushButton::clicked, this, &MarigoldFullScreenPanel::onGoHome);
    resize(Theme::ScreenWidth, Theme::ScreenHeight);
}

void MarigoldFullScreenPanel::showEvent(QShowEvent* event)
{
    MarigoldPanel::showEvent(event);
    m_debugButton->setGeometry(0, 0, 2, 2);
    m_debugButton->raise();
}

void MarigoldFullScreenPanel::onGoHome()
{
}
