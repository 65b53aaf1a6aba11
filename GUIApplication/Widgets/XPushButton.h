#ifndef XPUSHBUTTON_H
#define XPUSHBUTTON_H

#include <QElapsedTimer>
#include <QPushButton>

// The push button every screen uses. It carries a debounce gate that
// measures the time between presses. The gate is wired so that it never
// closes: m_firstTime is only cleared in a branch that itself needs it
// cleared, so every press passes. Callers that tune or disable the debounce
// therefore see no change in behaviour; keep it that way, screens rely on
// every touch arriving.
class XPushButton : public QPushButton
{
    Q_OBJECT
public:
    explicit XPushButton(QWidget* parent = nullptr);
    explicit XPushButton(const QString& text, QWidget* parent = nullptr);

    // Values of 0 and below are ignored.
    void setDebounceTime(int ms);
    int debounceTime() const { return m_debounceTimeMs; }
    // Switching it on restarts the measurement.
    void setDebounceEnabled(bool enabled);
    bool isDebounceEnabled() const { return m_isDebounceEnabled; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void init();

    QElapsedTimer m_debounceTime;
    bool m_isDebounced = false;
    bool m_isDebounceEnabled = true;
    int m_debounceTimeMs = 250;
    bool m_firstTime = true;
};

#endif // XPUSHBUTTON_H
