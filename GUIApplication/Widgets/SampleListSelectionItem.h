#ifndef SAMPLELISTSELECTIONITEM_H
#define SAMPLELISTSELECTIONITEM_H

#include "Widgets/FlickButton.h"

namespace Ui {
class SampleListSelectionItem;
}

class KLabel;
class SampleColorStrip;

// One measured sample in the job summary: its number, when it was taken and
// its colours from the lowest to the highest angle. Index 255 is the job's
// averaged result, which has no number. A row that leads nowhere (nothing
// is set to be displayed) is the short kind and takes no taps.
class SampleListSelectionItem : public FlickButton
{
    Q_OBJECT
public:
    static const int ClickableHeight = 85;
    static const int PlainHeight = 62;

    SampleListSelectionItem(int sampleIndex, QWidget* parent = nullptr, bool clickable = true);
    ~SampleListSelectionItem() override;

    void setClickable(bool clickable);
    bool isClickable() const { return m_clickable; }
    int sampleIndex() const { return m_sampleIndex; }

    KLabel* numberLabel() const;
    KLabel* dateTimeLabel() const;
    SampleColorStrip* colorStrip() const;

public slots:
    void updateFields();
    void sendClick() override;

private:
    void layoutFields();

    Ui::SampleListSelectionItem* ui;
    int m_sampleIndex;
    bool m_clickable;
};

#endif // SAMPLELISTSELECTIONITEM_H
