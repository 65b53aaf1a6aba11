#ifndef SETTINGSLISTITEMS_H
#define SETTINGSLISTITEMS_H

// The rows of the settings lists. All rows but the sliders, the progress
// bar and the information blocks are FlickButtons, so a drag over them
// scrolls the list and only a tap clicks.

#include "Widgets/ClickableLabel.h"
#include "Widgets/FlickButton.h"

#include <QPushButton>
#include <QWidget>

class KLabel;
class QLabel;

namespace SettingsRows {
const int RowHeight = 62;
const int TallRowHeight = 85;
const int HeaderHeight = 32;
// The chevron that says a row leads further.
QPixmap arrowPixmap();
} // namespace SettingsRows

// A row with an icon, the setting's name, its present value and an arrow.
class SettingsListSelectionItem : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionItem(QWidget* parent = nullptr);

    void setBtnIcon(const QString& resource);
    void setArrowIcon(const QString& resource);
    void setBtnSettingText(const QString& text);
    void setBtnStatusText(const QString& text);
    void setClickable(bool clickable);
    void showArrow(bool show);
    QString getBtnSettingText() const;
    QString getBtnStatusText() const;
    bool isClickable() const { return m_clickable; }

public slots:
    void sendClick() override;

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void layoutLabels();

    bool m_clickable = true;
    QLabel* m_labelIcon;
    KLabel* m_labelSetting;
    KLabel* m_labelStatus;
    QLabel* m_labelArrow;
};

// A row of a one-of-many choice; the chosen row carries a tick.
class SettingsListSelectionCheckableItem : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionCheckableItem(QWidget* parent = nullptr);

    void setText(const QString& text);
    QString getText() const;
    void setChecked(bool checked);
    bool getChecked() const { return m_checked; }
    void setParam(const QString& param) { m_param = param; }
    QString getParam() const { return m_param; }
    void setFont(const QFont& font);

public slots:
    void sendClick() override;

private:
    bool m_checked = false;
    QString m_param;
    KLabel* m_labelSetting;
    QLabel* m_labelIcon;
};

// The switch of a toggle row: a pill with a knob, accent when on.
class SettingsToggleSwitch : public QPushButton
{
    Q_OBJECT
public:
    explicit SettingsToggleSwitch(QWidget* parent = nullptr);
    QSize sizeHint() const override { return QSize(56, 32); }

protected:
    void paintEvent(QPaintEvent* event) override;
};

// A row with a text and an on/off switch. A tap anywhere on the row works
// the switch, as on the switch itself.
class SettingsListSelectionToggleItem : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionToggleItem(QWidget* parent = nullptr);

    SettingsToggleSwitch* toggleButton() const { return m_button; }
    QString text() const;

signals:
    void checkedStateChanged(bool checked);

public slots:
    virtual void setText(const QString& text);
    virtual void setButtonChecked(bool checked);
    virtual bool isChecked() const;
    virtual void setEnabled(bool enabled);
    virtual void init();
    void sendClick() override;

private:
    KLabel* m_label;
    SettingsToggleSwitch* m_button;
};

// A row that leads to a sub-page.
class SettingsListSelectionSubMenuItem : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionSubMenuItem(QWidget* parent = nullptr);
    void setText(const QString& text);
    QString getText() const;

private:
    KLabel* m_label;
    QLabel* m_labelArrow;
};

// A section header inside a list.
class SettingsListSelectionHeader : public FlickButton
{
    Q_OBJECT
public:
    explicit SettingsListSelectionHeader(QWidget* parent = nullptr);
    void setText(const QString& text);
    QString getText() const;
    void setAlignment(Qt::Alignment alignment);

private:
    KLabel* m_label;
};

// A read-only bar of how much of something is used.
class SettingsListSelectionProgressItem : public QWidget
{
    Q_OBJECT
public:
    // What the numbers beside the bar count.
    enum ValueType { ValueCount = 0, ValuePercent = 1 };

    explicit SettingsListSelectionProgressItem(QWidget* parent = nullptr, ValueType type = ValueCount);
    void setMinValue(int value);
    void setMaxValue(int value);
    void setValue(int value);
    void setSummaryText(const QString& text);
    int value() const { return m_value; }
    int maxValue() const { return m_max; }
    QString valueText() const;

public slots:
    void onUpdate();

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    int m_valueType;
    int m_min = 0;
    int m_max = 100;
    int m_value = 0;
    KLabel* m_labelSummary;
    KLabel* m_labelValue;
};

// The instrument's description: a block of label and value lines. It is
// clickable so that the service rows can be reached.
class SettingsListSelectionSystemInfo : public ClickableLabel
{
    Q_OBJECT
public:
    explicit SettingsListSelectionSystemInfo(QWidget* parent = nullptr);
    // Pairs of label and value, one line each.
    void setLines(const QList<QPair<QString, QString>>& lines);
};

// How long until each power stage, in words.
class SettingsListSelectionPowerInfo : public QWidget
{
    Q_OBJECT
public:
    explicit SettingsListSelectionPowerInfo(QWidget* parent = nullptr);
    static QString beautifyTimeText(int seconds);
    QString text() const;

public slots:
    void onUpdate();

private:
    KLabel* m_label;
};

#endif // SETTINGSLISTITEMS_H
