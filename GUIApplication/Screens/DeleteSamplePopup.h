#ifndef DELETESAMPLEPOPUP_H
#define DELETESAMPLEPOPUP_H

#include "Screens/PopupPanel.h"

class KLabel;
class QLabel;
class SampleColorStrip;
class XPushButton;

namespace Ui {
struct DeleteSamplePopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    QLabel* labelIcon = nullptr;
    KLabel* labelHeader = nullptr;
    KLabel* labelMessage = nullptr;
    SampleColorStrip* sampleColorStrip = nullptr;
    XPushButton* BtnConfirm = nullptr;
    XPushButton* BtnCancel = nullptr;
    void setupUi(QWidget* popup);
    void retranslateUi(QWidget* popup);
};
} // namespace Ui

// Asks before the active sample is deleted, showing its time and its
// colours so that the operator sees which reading goes.
class DeleteSamplePopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit DeleteSamplePopup(QWidget* parent = nullptr);
    ~DeleteSamplePopup() override;

    SampleColorStrip* colorStrip() const;
    QString messageText() const;

signals:
    void confirmClicked(PopupPanel* popup);
    void cancelClicked(PopupPanel* popup);

public slots:
    void onConfirmClicked();
    void onCancelClicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::DeleteSamplePopup* ui;
};

#endif // DELETESAMPLEPOPUP_H
