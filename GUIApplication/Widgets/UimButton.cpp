#include "Widgets/UimButton.h"

#include <QFontMetrics>
#include <QStyle>
#include <QVariant>

namespace {
const char* const kStyle =
    "UimButton { border: none; background: transparent; color: rgb(0, 0, 0); }"
    "UimButton[selected=\"true\"] { border: none; background: rgb(0, 174, 239); color: rgb(255, 255, 255); }";
}

UimButton::UimButton(const QString& text, QWidget* parent)
    : FlickButton(parent)
{
    setText(text);
    setFixedSize(kSize, kSize);
    QFont f = font();
    f.setPointSize(15);
    setFont(f);
    setFocusPolicy(Qt::NoFocus);
    setMouseTracking(false);
    setCheckable(false);
    setFlat(true);
    setProperty("selected", false);
    setStyleSheet(kStyle);
}

void UimButton::setSelected(bool selected)
{
    if (property("selected").toBool() == selected)
        return;
    setProperty("selected", selected);
    // A dynamic property only reaches the style sheet on a re-polish.
    style()->unpolish(this);
    style()->polish(this);
    update();
}

bool UimButton::isSelected() const
{
    return property("selected").toBool();
}

int UimButton::GetTextWidth() const
{
    return QFontMetrics(font()).boundingRect(text()).width();
}
