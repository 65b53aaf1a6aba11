#ifndef LOCKSCREEN_H
#define LOCKSCREEN_H

#include "Screens/DaddyPanel.h"

#include <QTimer>

class SpinnyCircle;
class KLabel;
class QLabel;

namespace Ui {
struct LockScreen
{
    QLabel* labelBackGround = nullptr;
    QLabel* icnPopupBkgnd = nullptr;
    SpinnyCircle* spinner = nullptr;
    KLabel* labelTextTitle = nullptr;
    void setupUi(QWidget* screen);
};
} // namespace Ui

// The cover that says the instrument is busy: locked by the server, or
// calibrating. With a time limit it closes itself.
class LockScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit LockScreen(QWidget* parent = nullptr);
    LockScreen(int ms, QWidget* parent);
    ~LockScreen() override;

    void setTitle(const QString& text);
    QString title() const;
    bool hasTimeLimit() const { return killTimer.isActive(); }

public slots:
    void onKillTimeout();

protected:
    void changeEvent(QEvent* event) override;
    // A title given by its source text, translated now and again on every
    // language change (setTitle takes text already translated).
    void setDefaultTitle(const char* context, const char* sourceText);

    Ui::LockScreen* ui;
    QTimer killTimer;

private:
    void init();

    const char* m_titleContext = nullptr;
    const char* m_titleSource = nullptr;
};

#endif // LOCKSCREEN_H
