#include "Widgets/SettingsNavigator.h"

#include "Screens/PopupPanel.h"
#include "Widgets/SettingsPage.h"

#include <QSignalMapper>

SettingsNavigator::SettingsNavigator(QWidget* parent)
    : MarigoldPanel(parent)
    , m_signalMapper(new QSignalMapper(this))
    , m_easingCurve(QEasingCurve::InOutQuad)
{
    setObjectName(QStringLiteral("SettingsNavigator"));
    m_propertyAnimationIn.setPropertyName("geometry");
    m_propertyAnimationOut.setPropertyName("geometry");
    m_propertyAnimationIn.setEasingCurve(m_easingCurve);
    m_propertyAnimationOut.setEasingCurve(m_easingCurve);
    m_propertyAnimationIn.setDuration(TransitionMs);
    m_propertyAnimationOut.setDuration(TransitionMs);
    connect(&m_propertyAnimationIn, &QPropertyAnimation::finished, this, &SettingsNavigator::onTransitionInEnded);
    connect(&m_propertyAnimationOut, &QPropertyAnimation::finished, this, &SettingsNavigator::onTransitionOutEnded);
}

SettingsNavigator::~SettingsNavigator()
{
    m_propertyAnimationIn.stop();
    m_propertyAnimationOut.stop();
    m_propertyAnimationIn.setTargetObject(nullptr);
    m_propertyAnimationOut.setTargetObject(nullptr);
}

QRect SettingsNavigator::pageRect() const
{
    // Pages are a little wider than the screen: the strip beyond is the
    // shadow they drop on the page they uncover.
    return QRect(0, 0, width() + 15, height());
}

SettingsPage* SettingsNavigator::topPage() const
{
    return m_settingsPagesStack.isEmpty() ? nullptr : m_settingsPagesStack.last();
}

SettingsPage* SettingsNavigator::pageAt(int index) const
{
    return index >= 0 && index < m_settingsPagesStack.size() ? m_settingsPagesStack.at(index) : nullptr;
}

bool SettingsNavigator::isAnimating() const
{
    return m_propertyAnimationIn.state() == QAbstractAnimation::Running
        || m_propertyAnimationOut.state() == QAbstractAnimation::Running;
}

void SettingsNavigator::finishTransitions()
{
    for (QPropertyAnimation* animation : {&m_propertyAnimationOut, &m_propertyAnimationIn}) {
        if (animation->state() == QAbstractAnimation::Running)
            animation->setCurrentTime(animation->totalDuration());
    }
}

void SettingsNavigator::setFirstPage(SettingsPage* page)
{
    createNextPage(page);
}

void SettingsNavigator::onNextPage(SettingsPage* page)
{
    // A second tap while a page is still moving would stack pages the user
    // never saw.
    if (!page)
        return;
    if (isAnimating()) {
        page->deleteLater();
        return;
    }
    createNextPage(page);
}

void SettingsNavigator::createNextPage(SettingsPage* page)
{
    if (!page)
        return;
    const int previousTop = m_settingsPagesStack.size() - 1;
    page->setParent(this);
    page->setGeometry(pageRect());
    connect(page, &SettingsPage::nextPage, this, &SettingsNavigator::onNextPage);
    connect(page, &SettingsPage::previousPage, this, &SettingsNavigator::onPreviousPage);
    connect(page, &SettingsPage::GotoScreen, this, &SettingsNavigator::GotoScreen);
    connect(page, &SettingsPage::displayPopup, this, &SettingsNavigator::displayPopup);
    connect(page, &SettingsPage::closePopup, this, &SettingsNavigator::closePopup);
    m_settingsPagesStack.append(page);
    page->show();
    page->raise();
    if (previousTop >= 0)
        onTransitionOutOfView(m_settingsPagesStack.at(previousTop));
}

void SettingsNavigator::onTransitionOutOfView(SettingsPage* page)
{
    page->raise();
    page->setEnabled(false);
    const QRect from = page->geometry();
    m_propertyAnimationOut.stop();
    m_propertyAnimationOut.setTargetObject(page);
    m_propertyAnimationOut.setStartValue(from);
    m_propertyAnimationOut.setEndValue(from.translated(-width(), 0));
    m_propertyAnimationOut.start();
}

void SettingsNavigator::onTransitionOutEnded()
{
    if (QWidget* target = qobject_cast<QWidget*>(m_propertyAnimationOut.targetObject()))
        target->hide();
}

void SettingsNavigator::onPreviousPage()
{
    if (m_settingsPagesStack.size() <= 1 || isAnimating())
        return;
    SettingsPage* below = m_settingsPagesStack.at(m_settingsPagesStack.size() - 2);
    below->onUpdatePage();
    onTransitionIntoView(below);
}

void SettingsNavigator::onTransitionIntoView(SettingsPage* page)
{
    page->show();
    page->raise();
    m_propertyAnimationIn.stop();
    m_propertyAnimationIn.setTargetObject(page);
    m_propertyAnimationIn.setStartValue(page->geometry());
    m_propertyAnimationIn.setEndValue(pageRect());
    m_propertyAnimationIn.start();
}

void SettingsNavigator::onTransitionInEnded()
{
    if (m_settingsPagesStack.size() <= 1)
        return;
    SettingsPage* top = m_settingsPagesStack.takeLast();
    m_signalMapper->removeMappings(top);
    disconnect(top, nullptr, this, nullptr);
    top->hide();
    top->deleteLater();
    m_settingsPagesStack.last()->setEnabled(true);
}

void SettingsNavigator::onCloseSettings()
{
    emit closeSettings();
}

void SettingsNavigator::resizeEvent(QResizeEvent* event)
{
    MarigoldPanel::resizeEvent(event);
    if (SettingsPage* top = topPage())
        top->setGeometry(pageRect());
}
