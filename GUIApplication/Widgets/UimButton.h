#ifndef UIMBUTTON_H
#define UIMBUTTON_H

#include "Widgets/FlickButton.h"

// One candidate of the candidate strip: a 40 x 40 key showing one character
// (or the typed spelling, wider). The dynamic property "selected" switches
// it to the accent ground.
class UimButton : public FlickButton
{
    Q_OBJECT
public:
    explicit UimButton(const QString& text, QWidget* parent = nullptr);

    void setSelected(bool selected);
    bool isSelected() const;
    int GetTextWidth() const;

    static const int kSize = 40;
};

#endif // UIMBUTTON_H
