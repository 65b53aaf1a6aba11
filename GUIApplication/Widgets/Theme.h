#ifndef THEME_H
#define THEME_H

// The look of the product in one place: colours, the fixed geometry of the
// 320 x 480 display, fonts and the style sheets of the common controls.
// Screens take their colours and button styles from here so that every panel
// reads as part of the same instrument.

#include <QColor>
#include <QFont>
#include <QRect>
#include <QString>

class QLabel;
class QPushButton;
class QWidget;

namespace Theme {

// ---- Colours ------------------------------------------------------------------
const QColor Accent(0, 174, 239);          // whatever can be touched or is selected
const QColor AccentPressed(0, 136, 194);
const QColor AccentSecondary(39, 170, 225);
const QColor AccentDeep(28, 117, 188);
const QColor AccentTint(214, 241, 252);    // pressed rows
const QColor TextDark(45, 45, 45);
const QColor TextBody(70, 70, 70);
const QColor TextBody2(90, 90, 90);
const QColor TextSecondary(109, 110, 113);
const QColor TextOnDark(242, 242, 242);
const QColor GroundLight(245, 245, 246);
const QColor GroundPanel(255, 255, 255);
const QColor GroundSelfTest(230, 231, 232);
const QColor Separator(214, 215, 217);
const QColor Chrome(0x41, 0x40, 0x42);
const QColor ChromeDark(0x23, 0x22, 0x25);
const QColor ChromeHandle(0xBC, 0xBE, 0xC0);
const QColor Disabled(190, 190, 190);
const QColor Pass(0, 146, 69);
const QColor Fail(255, 62, 62);
const QColor FailPressed(214, 38, 44);
const QColor Invalid(200, 0, 0);

// ---- Geometry -------------------------------------------------------------------
const int ScreenWidth = 320;
const int ScreenHeight = 480;
const int StatusBarHeight = 24;
const int TitleBarHeight = 66;
const int TouchMinimum = 44;
const int ButtonHeight = 52;

// Where the two popup cards stand on the dimmed screen.
const QRect TallCard(10, 20, 300, 440);   // modal_overlay_inset_440
const QRect ShortCard(10, 140, 300, 200); // modal_overlay_inset_200
// Inner width for text and buttons on a card.
const int CardMargin = 16;

// ---- Text -------------------------------------------------------------------------
// Point sizes of the type scale. The family is the application font, which
// follows the language (CJK languages need their own).
const int FontTitle = 17;
const int FontHeadline = 15;
const int FontBody = 12;
const int FontButton = 13;
const int FontSmall = 10;

QFont font(int pointSize, bool bold = false);
// The same by pixel size, for rows drawn to the pixel.
QFont pixelFont(int pixels, bool bold = false);

// The back and action buttons of a header (151 wide at x -45 and 214) draw
// their dividers at x 106 and 214. A title whose box runs under them gets
// margins that keep its text between the dividers.
void keepBetweenHeaderDividers(QLabel* title);

// "rgb(r, g, b)" for style sheets.
QString css(const QColor& colour);

// ---- Controls ------------------------------------------------------------------
enum ButtonRole {
    PrimaryButton,     // filled with the accent: the expected answer
    SecondaryButton,   // outlined: the way back
    DestructiveButton, // filled red: deletes or powers off
    FlatButton         // no frame: picture buttons in title bars
};
QString buttonStyle(ButtonRole role);
void styleButton(QPushButton* button, ButtonRole role);

// A label with a picture from the resources, sized to the picture when no
// size is given.
QLabel* pictureLabel(QWidget* parent, const QString& resource, const QPoint& at,
                     const QString& objectName);

} // namespace Theme

#endif // THEME_H
