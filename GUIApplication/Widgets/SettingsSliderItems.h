#ifndef SETTINGSSLIDERITEMS_H
#define SETTINGSSLIDERITEMS_H

#include <QWidget>

class KLabel;
class QLabel;
class QSlider;

// A settings row with a slider and its value. The value shown follows the
// finger at once; the value is reported (sliderChanged) only when the
// finger lets go or the slider steps, so that a drag stores once. With
// "Never" allowed the maximum means off: its end reads "Never" and the
// value field is left empty there.
class SettingsListSelectionSliderItem : public QWidget
{
    Q_OBJECT
public:
    explicit SettingsListSelectionSliderItem(QWidget* parent = nullptr);
    ~SettingsListSelectionSliderItem() override;

    void setMinValue(int value);
    void setMaxValue(int value);
    void setValue(int value);
    void setSummaryText(const QString& text);
    void setPageStep(int step);
    void allowNever(bool allow);
    int getValue() const;
    bool isNeverAllowed() const { return m_bAllowNever; }

    QSlider* slider() const { return horizontalSlider; }
    QString entryText() const;
    QString maxText() const;
    QString minText() const;
    QString summaryText() const;

signals:
    void sliderChanged(int value);

protected:
    // The compressed row lays the same parts out lower and tighter.
    SettingsListSelectionSliderItem(bool compressed, QWidget* parent);
    void changeEvent(QEvent* event) override;

    QSlider* horizontalSlider;
    KLabel* labelSummaryText;
    QLabel* labelMinText;
    QLabel* labelMaxText;
    QLabel* labelEntryField;
    QLabel* labelBackground;
    QLabel* labelBackgroundColor;

private:
    void build(bool compressed);
    void onValueChanged(int value);
    void onActionTriggered(int action);
    void updateMaxText();

    bool m_bAllowNever = false;
};

// The slider row of the measurement and power pages: lower, and able to be
// the last row of its block (no separator line).
class SettingsListSelectionCompressedSliderItem : public SettingsListSelectionSliderItem
{
    Q_OBJECT
public:
    explicit SettingsListSelectionCompressedSliderItem(QWidget* parent = nullptr);
    void setLastInList(bool last);
    bool isLastInList() const { return m_lastInList; }

private:
    bool m_lastInList = false;
};

#endif // SETTINGSSLIDERITEMS_H
