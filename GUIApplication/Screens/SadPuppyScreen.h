#ifndef SADPUPPYSCREEN_H
#define SADPUPPYSCREEN_H

#include "Screens/DaddyPanel.h"

class KLabel;
class QLabel;
class XPushButton;

namespace Ui {
struct SadPuppyScreen
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    QLabel* labelIcon = nullptr;
    KLabel* labelTextTitle = nullptr;
    KLabel* labelTextSummary = nullptr;
    XPushButton* Btn = nullptr;
    void setupUi(QWidget* screen);
    void retranslateUi(QWidget* screen);
};
} // namespace Ui

// The fault screen when the link to the measurement server is lost. It can
// be dismissed; its text is the only advice.
class SadPuppyScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit SadPuppyScreen(QWidget* parent = nullptr);
    ~SadPuppyScreen() override;

public slots:
    void on_Btn_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::SadPuppyScreen* ui;
};

#endif // SADPUPPYSCREEN_H
