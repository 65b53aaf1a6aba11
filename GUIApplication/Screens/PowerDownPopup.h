#ifndef POWERDOWNPOPUP_H
#define POWERDOWNPOPUP_H

#include "Screens/PopupPanel.h"

class QLabel;
class XPushButton;

namespace Ui {
struct PowerDownPopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    XPushButton* BtnPowerOff = nullptr;
    XPushButton* BtnReboot = nullptr;
    XPushButton* BtnCancel = nullptr;
    void setupUi(QWidget* popup);
    void retranslateUi(QWidget* popup);
};
} // namespace Ui

// Raised by holding the power key: the instrument powers off or reboots
// through the server.
class PowerDownPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit PowerDownPopup(QWidget* parent = nullptr);
    ~PowerDownPopup() override;

public slots:
    void on_BtnPowerOff_clicked();
    void on_BtnReboot_clicked();
    void on_BtnStandby_clicked();
    void on_BtnCancel_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::PowerDownPopup* ui;
};

#endif // POWERDOWNPOPUP_H
