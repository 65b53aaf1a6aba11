#ifndef OVERRIDEPOPUP_H
#define OVERRIDEPOPUP_H

#include "Screens/PopupPanel.h"

class KLabel;
class QLabel;
class XPushButton;

namespace Ui {
struct OverridePopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    QLabel* labelIcon = nullptr;
    KLabel* labelTextTitle = nullptr;
    KLabel* labelTextSummary = nullptr;
    XPushButton* BtnMeasure = nullptr;
    XPushButton* BtnCancel = nullptr;
    void setupUi(QWidget* popup);
};
} // namespace Ui

// Asks the user to go ahead against a warning (measure although a sensor
// objects, edit a job made elsewhere).
class OverridePopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit OverridePopup(QWidget* parent = nullptr);
    ~OverridePopup() override;

    void setTitleText(const QString& text);
    void setBodyText(const QString& text);
    void setConfirmButtonText(const QString& text);
    void setCancelButtonText(const QString& text);

signals:
    void confirmClicked(PopupPanel* popup);

public slots:
    void on_BtnCancel_clicked();
    void on_BtnMeasure_clicked();

protected:
    Ui::OverridePopup* ui;
};

#endif // OVERRIDEPOPUP_H
