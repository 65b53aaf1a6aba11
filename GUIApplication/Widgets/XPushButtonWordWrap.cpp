#include "Widgets/XPushButtonWordWrap.h"

#include <QFontMetrics>

XPushButtonWordWrap::XPushButtonWordWrap(QWidget* parent)
    : XPushButton(parent)
{
}

QString XPushButtonWordWrap::wrapToFit(const QString& text, const QFont& font, const QSize& box)
{
    const int flags = Qt::AlignHCenter | Qt::AlignVCenter;
    const QFontMetrics metrics(font);
    QString wrapped = text;
    for (;;) {
        const QRect needed = metrics.boundingRect(QRect(QPoint(0, 0), box), flags, wrapped);
        if (needed.width() <= box.width() && needed.height() <= box.height())
            break;
        const int blank = wrapped.indexOf(' ');
        if (blank < 0)
            break; // a single word wider than the button stays too wide
        wrapped[blank] = '\n';
    }
    return wrapped;
}

void XPushButtonWordWrap::setText(const QString& text)
{
    QPushButton::setText(wrapToFit(text, font(), size()));
}

void XPushButtonWordWrap::setFont(const QFont& font)
{
    QPushButton::setFont(font);
}

void XPushButtonWordWrap::setStyleSheet(const QString& styleSheet)
{
    QPushButton::setStyleSheet(styleSheet);
}
