#include "Widgets/Theme.h"

#include <QApplication>
#include <QLabel>
#include <QPixmap>
#include <QPushButton>

namespace Theme {

QFont font(int pointSize, bool bold)
{
    // Only size and weight are set: the family stays unresolved, so every
    // widget follows the language's font, also when the language changes
    // after the widget was built. A copy of QApplication::font() would pin
    // whatever family the application had at that moment.
    QFont f;
    f.setPointSize(pointSize);
    f.setBold(bold);
    return f;
}

QFont pixelFont(int pixels, bool bold)
{
    QFont f;
    f.setPixelSize(pixels);
    f.setBold(bold);
    return f;
}

QString css(const QColor& colour)
{
    return QString("rgb(%1, %2, %3)").arg(colour.red()).arg(colour.green()).arg(colour.blue());
}

QString buttonStyle(ButtonRole role)
{
    // Radii and borders are shared so that every button of the product has
    // the same silhouette; only the fill tells its role.
    const QString shape = "border-radius: 8px; padding: 0px 6px;";
    switch (role) {
    case PrimaryButton:
        return QString("QPushButton { background-color: %1; color: white; border: none; %3 }"
                       "QPushButton:pressed { background-color: %2; }"
                       "QPushButton:disabled { background-color: %4; }")
            .arg(css(Accent), css(AccentPressed), shape, css(Disabled));
    case SecondaryButton:
        return QString("QPushButton { background-color: white; color: %1; border: 2px solid %1; %3 }"
                       "QPushButton:pressed { background-color: %2; }"
                       "QPushButton:disabled { color: %4; border-color: %4; }")
            .arg(css(Accent), css(AccentTint), shape, css(Disabled));
    case DestructiveButton:
        return QString("QPushButton { background-color: %1; color: white; border: none; %3 }"
                       "QPushButton:pressed { background-color: %2; }"
                       "QPushButton:disabled { background-color: %4; }")
            .arg(css(Fail), css(FailPressed), shape, css(Disabled));
    case FlatButton:
        return QString("QPushButton { background: transparent; border: none; color: %1; }")
            .arg(css(TextOnDark));
    }
    return QString();
}

void styleButton(QPushButton* button, ButtonRole role)
{
    button->setStyleSheet(buttonStyle(role));
    button->setFont(font(FontButton, role != FlatButton));
    button->setFocusPolicy(Qt::NoFocus);
}

QLabel* pictureLabel(QWidget* parent, const QString& resource, const QPoint& at,
                     const QString& objectName)
{
    auto* label = new QLabel(parent);
    label->setObjectName(objectName);
    const QPixmap pixmap(resource);
    label->setPixmap(pixmap);
    label->setGeometry(QRect(at, pixmap.size()));
    return label;
}

void keepBetweenHeaderDividers(QLabel* title)
{
    const QRect box = title->geometry();
    title->setContentsMargins(qMax(0, 108 - box.left()), 0, qMax(0, box.right() + 1 - 212), 0);
}

} // namespace Theme
