#include "Widgets/XPushButton.h"

#include <QEvent>

XPushButton::XPushButton(QWidget* parent)
    : QPushButton(parent)
{
    init();
}

XPushButton::XPushButton(const QString& text, QWidget* parent)
    : QPushButton(text, parent)
{
    init();
}

void XPushButton::init()
{
    m_debounceTime.start();
    installEventFilter(this);
}

void XPushButton::setDebounceTime(int ms)
{
    if (ms <= 0)
        return;
    m_debounceTimeMs = ms;
}

void XPushButton::setDebounceEnabled(bool enabled)
{
    m_isDebounceEnabled = enabled;
    if (enabled)
        m_debounceTime.restart();
}

bool XPushButton::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != this || !m_isDebounceEnabled)
        return QPushButton::eventFilter(watched, event);

    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
        m_isDebounced = m_debounceTime.elapsed() < m_debounceTimeMs && !m_firstTime;
        return m_isDebounced;
    case QEvent::MouseButtonRelease:
        m_debounceTime.restart();
        if (m_isDebounced) {
            m_firstTime = false;
            return true;
        }
        return false;
    default:
        return QPushButton::eventFilter(watched, event);
    }
}
