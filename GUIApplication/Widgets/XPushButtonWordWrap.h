#ifndef XPUSHBUTTONWORDWRAP_H
#define XPUSHBUTTONWORDWRAP_H

#include "Widgets/XPushButton.h"

class KLabel;

// A button whose caption breaks at blanks, first blank first, until it fits.
class XPushButtonWordWrap : public XPushButton
{
    Q_OBJECT
public:
    explicit XPushButtonWordWrap(QWidget* parent = nullptr);

    void setText(const QString& text);
    void setFont(const QFont& font);
    void setStyleSheet(const QString& styleSheet);

    // The caption with the line breaks that make it fit the button.
    static QString wrapToFit(const QString& text, const QFont& font, const QSize& box);

private:
    KLabel* m_pText = nullptr; // kept for forms that expect it; unused
};

#endif // XPUSHBUTTONWORDWRAP_H
