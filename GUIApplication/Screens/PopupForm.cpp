#include "Screens/PopupForm.h"

#include "Widgets/KLabel.h"
#include "Widgets/XPushButton.h"

#include <QFontMetrics>
#include <QLabel>
#include <QPixmap>

namespace PopupForm {

QRect shortCardButton(int row)
{
    const int top = Theme::ShortCard.top() + 14;
    return QRect(26, top + row * (Theme::ButtonHeight + 8), 268, Theme::ButtonHeight);
}

QLabel* dimmer(QWidget* popup, const QString& objectName)
{
    auto* label = new QLabel(popup);
    label->setObjectName(objectName);
    label->setGeometry(0, 0, Theme::ScreenWidth, Theme::ScreenHeight);
    label->setPixmap(QPixmap(":/Assets/modal_overlay_90.png"));
    return label;
}

QLabel* card(QWidget* popup, bool tall, const QString& objectName)
{
    auto* label = new QLabel(popup);
    label->setObjectName(objectName);
    label->setGeometry(tall ? Theme::TallCard : Theme::ShortCard);
    label->setPixmap(QPixmap(tall ? ":/Assets/modal_overlay_inset_440.png"
                                  : ":/Assets/modal_overlay_inset_200.png"));
    return label;
}

QLabel* icon(QWidget* popup, const QString& resource, const QString& objectName, const QRect& box)
{
    auto* label = new QLabel(popup);
    label->setObjectName(objectName);
    label->setGeometry(box);
    label->setAlignment(Qt::AlignCenter);
    label->setPixmap(QPixmap(resource));
    return label;
}

KLabel* title(QWidget* popup, const QString& objectName, const QRect& box)
{
    auto* label = new KLabel(popup);
    label->setObjectName(objectName);
    label->setGeometry(box);
    label->setAlignment(Qt::AlignCenter);
    label->setStyleSheet(QString("color: %1; background: transparent;").arg(Theme::css(Theme::TextDark)));
    label->setFont(Theme::font(Theme::FontHeadline + 1, true));
    label->setAutoSize(true);
    return label;
}

KLabel* text(QWidget* popup, const QString& objectName, const QRect& box)
{
    auto* label = new KLabel(popup);
    label->setObjectName(objectName);
    label->setGeometry(box);
    label->setAlignment(Qt::AlignHCenter | Qt::AlignTop);
    label->setWordWrap(true);
    label->setStyleSheet(QString("color: %1; background: transparent;").arg(Theme::css(Theme::TextBody2)));
    label->setFont(Theme::font(Theme::FontBody + 1));
    label->setAutoSize(true);
    return label;
}

XPushButton* button(QWidget* popup, const QString& objectName, const QRect& box, Theme::ButtonRole role)
{
    auto* b = new XPushButton(popup);
    b->setObjectName(objectName);
    b->setGeometry(box);
    Theme::styleButton(b, role);
    return b;
}

void arrange(QWidget* icon, KLabel* title, KLabel* text)
{
    const int gap = 12;
    const int areaTop = Theme::TallCard.top() + 20;
    const int areaBottom = WideButton.top() - 16;
    const bool withIcon = icon && !icon->isHidden();

    const QRect widest(0, 0, TextBox.width(), TextBox.height());
    const int textHeight = qMin(TextBox.height(),
                                QFontMetrics(text->defaultFont(), text)
                                    .boundingRect(widest, Qt::TextWordWrap | Qt::AlignHCenter, text->defaultText())
                                    .height());
    const int block = (withIcon ? IconBox.height() + gap : 0) + TitleBox.height() + 4 + textHeight;
    int y = areaTop + qMax(0, (areaBottom - areaTop - block) / 2);
    if (withIcon) {
        icon->move(IconBox.x(), y);
        y += IconBox.height() + gap;
    }
    title->move(TitleBox.x(), y);
    y += TitleBox.height() + 4;
    // The text keeps all the room down to the buttons, so a long translation
    // still fits by shrinking.
    text->setGeometry(TextBox.x(), y, TextBox.width(), qMax(textHeight, areaBottom - y));
}

} // namespace PopupForm
