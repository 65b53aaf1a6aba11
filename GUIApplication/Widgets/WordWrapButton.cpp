#include "Widgets/WordWrapButton.h"

#include "Widgets/KLabel.h"

#include <QEvent>
#include <QStyle>

WordWrapButton::WordWrapButton(QWidget* parent)
    : XPushButton(parent)
    , m_pKLabel(new KLabel(this))
{
    m_pKLabel->setWordWrap(true);
    m_pKLabel->setAlignment(Qt::AlignCenter);
    // The button takes the touches; the label only draws.
    m_pKLabel->setAttribute(Qt::WA_TransparentForMouseEvents);
    m_pKLabel->setGeometry(rect());
    m_pKLabel->show();
    m_pKLabel->raise();
}

void WordWrapButton::setText(const QString& text)
{
    m_pKLabel->setText(text);
}

void WordWrapButton::setFont(const QFont& font)
{
    m_pKLabel->setFont(font);
}

void WordWrapButton::setFontColor(int r, int g, int b)
{
    setFontColor(QColor(r, g, b));
}

void WordWrapButton::setFontColor(QRgb rgb)
{
    setFontColor(QColor(rgb));
}

void WordWrapButton::setFontColor(QColor colour)
{
    m_pKLabel->setStyleSheet(QString("color:rgb(%1, %2, %3);")
                                 .arg(colour.red())
                                 .arg(colour.green())
                                 .arg(colour.blue()));
    style()->unpolish(this);
    style()->polish(this);
}

void WordWrapButton::setGeometry(const QRect& rect)
{
    XPushButton::setGeometry(rect);
    m_pKLabel->setGeometry(0, 0, rect.width(), rect.height());
}

void WordWrapButton::setGeometry(int x, int y, int w, int h)
{
    setGeometry(QRect(x, y, w, h));
}

void WordWrapButton::setTextAutoSize(bool autoSize)
{
    m_pKLabel->setAutoSize(autoSize);
}

QString WordWrapButton::text() const
{
    return m_pKLabel->text();
}

void WordWrapButton::setHiddenString(const QString& hidden)
{
    m_hiddenString = hidden;
}

QString WordWrapButton::getHiddenString() const
{
    return m_hiddenString;
}

void WordWrapButton::changeEvent(QEvent* event)
{
    XPushButton::changeEvent(event);
}

void WordWrapButton::resizeEvent(QResizeEvent* event)
{
    XPushButton::resizeEvent(event);
    m_pKLabel->setGeometry(rect());
}
