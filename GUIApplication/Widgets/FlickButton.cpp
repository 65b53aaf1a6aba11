#include "Widgets/FlickButton.h"

#include <QMouseEvent>
#include <QPixmap>

FlickButton::FlickButton(QWidget* parent)
    : XPushButton(parent)
{
    setFocusPolicy(Qt::NoFocus);
    setFlat(true);
    setWindowOpacity(0);
    setAutoFillBackground(false);
    setMouseTracking(false);
    setStyleSheet("background: transparent; border: none;");
}

QIcon FlickButton::makeIcon(const QPixmap& pixmap, bool withDisabled)
{
    QIcon icon;
    QList<QIcon::Mode> modes {QIcon::Normal, QIcon::Active, QIcon::Selected};
    if (withDisabled)
        modes << QIcon::Disabled;
    for (QIcon::Mode mode : modes) {
        icon.addPixmap(pixmap, mode, QIcon::On);
        icon.addPixmap(pixmap, mode, QIcon::Off);
    }
    return icon;
}

void FlickButton::setBackground(const QString& file)
{
    const QPixmap pixmap = QPixmap(file).scaled(size());
    m_backgroundIconFile = file;
    m_backgroundIcon = makeIcon(pixmap, true);
    setIconSize(size());
    setIcon(m_backgroundIcon);
}

void FlickButton::setPressedBackground(const QString& file)
{
    const QPixmap pixmap = QPixmap(file).scaled(size());
    m_backgroundPressedIcon = makeIcon(pixmap, false);
    setIconSize(size());
    m_pressedSet = true;
}

void FlickButton::clearPressedBackground()
{
    m_pressedSet = false;
}

void FlickButton::setLastInList(bool last)
{
    m_lastInList = last;
    if (last) {
        // The last row carries no separator line.
        QPixmap white(size());
        white.fill(Qt::white);
        m_backgroundIcon = makeIcon(white, true);
        setIcon(m_backgroundIcon);
    } else if (!m_backgroundIconFile.isEmpty()) {
        setBackground(m_backgroundIconFile);
    }
}

QRect FlickButton::globalRect() const
{
    return QRect(mapToGlobal(rect().topLeft()), mapToGlobal(rect().bottomRight()));
}

void FlickButton::mousePressEvent(QMouseEvent* event)
{
    m_pressedBox = globalRect();
    // Unaccepted, so the press travels on to the list and its scroller.
    QWidget::mousePressEvent(event);
    if (m_pressedSet) {
        setIcon(m_backgroundPressedIcon);
        m_showingPressed = true;
    }
}

void FlickButton::mouseReleaseEvent(QMouseEvent* event)
{
    if (event->button() != Qt::LeftButton) {
        event->ignore();
        m_pressedBox = QRect(0, 0, 0, 0);
        return;
    }
    const QRect now = globalRect();
    if (rect().contains(event->pos()) && now.intersects(m_pressedBox)) {
        sendClick();
        setDown(false);
    }
    m_pressedBox = QRect(0, 0, 0, 0);
    // The button was never marked down, so the base leaves the release
    // unaccepted and the scroller sees it too.
    XPushButton::mouseReleaseEvent(event);
    setIcon(m_backgroundIcon);
    m_showingPressed = false;
}

void FlickButton::resizeEvent(QResizeEvent* event)
{
    XPushButton::resizeEvent(event);
    setIconSize(size());
}

void FlickButton::sendClick()
{
    click();
}
