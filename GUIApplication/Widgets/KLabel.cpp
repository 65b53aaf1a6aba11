#include "Widgets/KLabel.h"

#include <QFontMetrics>
#include <QResizeEvent>

#include <algorithm>

namespace {

// Word wrap and centred both ways.
const int kWrapFlags = Qt::TextWordWrap | Qt::AlignHCenter | Qt::AlignVCenter;

int sizeOf(const QFont& font)
{
    return font.pointSize() > 0 ? font.pointSize() : font.pixelSize();
}

void setSizeOf(QFont& font, qreal size)
{
    if (font.pointSize() > 0)
        font.setPointSizeF(size);
    else
        font.setPixelSize(qMax(1, int(size)));
}

} // namespace

KLabel::KLabel(QWidget* parent)
    : QLabel(parent)
    , m_defaultFont(font())
{
}

KLabel::KLabel(const QString& text, QWidget* parent)
    : QLabel(parent)
    , m_defaultFont(font())
{
    setText(text);
}

void KLabel::setAutoSize(bool autoSize)
{
    m_autoSize = autoSize;
    setText(m_defaultText);
}

void KLabel::setMaxTextLength(int length)
{
    m_maxTextLength = length < 0 ? -1 : length;
    setText(m_defaultText);
}

void KLabel::setText(const QString& text)
{
    m_defaultText = text;
    QLabel::setText(m_maxTextLength < 0 ? text : text.left(m_maxTextLength));
    QLabel::setFont(m_autoSize ? fittedFont(text) : m_defaultFont);
}

void KLabel::setFont(QFont font)
{
    m_defaultFont = font;
    QLabel::setFont(font);
}

void KLabel::resizeEvent(QResizeEvent* event)
{
    QLabel::resizeEvent(event);
    // Forms often size a label after giving it its text.
    if (m_autoSize && event->size() != event->oldSize())
        QLabel::setFont(fittedFont(m_defaultText));
}

QFont KLabel::fittedFont(const QString& text) const
{
    QFont f = m_defaultFont;
    // Measured for this label's screen: a point size becomes a different
    // number of pixels there than on the default device, and whole pixels
    // at that, so a size that fits on paper can still run over.
    const auto metrics = [this](const QFont& font) { return QFontMetrics(font, this); };
    // The text is drawn inside the margins, so it must fit there.
    const int width = contentsRect().width();
    const int height = contentsRect().height();
    if (wordWrap()) {
        // Always the full text, also when a maximum length cuts what shows.
        const QRect box(0, 0, width, height);
        while (sizeOf(f) > 1) {
            const QRect needed = metrics(f).boundingRect(box, kWrapFlags, text);
            if (needed.width() <= width && needed.height() <= height)
                break;
            setSizeOf(f, sizeOf(f) - 1);
        }
        return f;
    }

    const QFontMetrics start = metrics(f);
    const int textWidth = start.horizontalAdvance(text);
    const int textHeight = start.height();
    const float widthRatio = textWidth > 0 ? float(width) / float(textWidth) : 1.0f;
    const float heightRatio = textHeight > 0 ? float(height) / float(textHeight) : 1.0f;
    const float ratio = std::min(widthRatio, heightRatio);
    if (ratio >= 1.0f)
        return f;
    qreal size = f.pointSize() > 0 ? f.pointSizeF() : qreal(f.pixelSize());
    // A box of zero size must still leave a usable font.
    size = std::max<qreal>(1.0, size * ratio);
    setSizeOf(f, size);
    // The scaled size is rounded to whole pixels when drawn: step down
    // until the text really fits.
    const qreal step = f.pointSize() > 0 ? 0.25 : 1.0;
    while (size > 1.0) {
        const QFontMetrics m = metrics(f);
        if (m.horizontalAdvance(text) <= width && m.height() <= qMax(height, 1))
            break;
        size = std::max<qreal>(1.0, size - step);
        setSizeOf(f, size);
    }
    return f;
}
