#ifndef POPUPFORM_H
#define POPUPFORM_H

// The parts every popup and cover is built from, placed on one grid so that
// all of them share the same card, type and buttons.

#include "Widgets/Theme.h"

#include <QRect>
#include <QString>

class KLabel;
class QLabel;
class QWidget;
class XPushButton;

namespace PopupForm {

// Grid of the tall card (modal_overlay_inset_440).
const QRect IconBox(128, 48, 64, 64);
const QRect TitleBox(26, 124, 268, 44);
const QRect TextBox(26, 172, 268, 192);
const QRect WideButton(26, 384, 268, 56);
const QRect LeftButton(26, 384, 130, 56);
const QRect RightButton(164, 384, 130, 56);
// Grid of the short card (modal_overlay_inset_200): three stacked buttons.
QRect shortCardButton(int row);

// The dimmed screen behind a popup.
QLabel* dimmer(QWidget* popup, const QString& objectName);
// The card, tall (440) or short (200).
QLabel* card(QWidget* popup, bool tall, const QString& objectName);
QLabel* icon(QWidget* popup, const QString& resource, const QString& objectName,
             const QRect& box = IconBox);
KLabel* title(QWidget* popup, const QString& objectName, const QRect& box = TitleBox);
KLabel* text(QWidget* popup, const QString& objectName, const QRect& box = TextBox);
XPushButton* button(QWidget* popup, const QString& objectName, const QRect& box, Theme::ButtonRole role);

// Centres icon, title and text as one block in the space above the buttons
// of the tall card, so that a one-line message does not float under an empty
// card. Call again whenever a text or the icon's visibility changes.
void arrange(QWidget* icon, KLabel* title, KLabel* text);

} // namespace PopupForm

#endif // POPUPFORM_H
