#ifndef DELETEPOPUP_H
#define DELETEPOPUP_H

#include "Screens/PopupPanel.h"

class KLabel;
class QLabel;
class XPushButton;

namespace Ui {
struct DeletePopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    QLabel* labelIcon = nullptr;
    KLabel* labelHeader = nullptr;
    KLabel* labelMessage = nullptr;
    XPushButton* BtnConfirm = nullptr;
    XPushButton* BtnCancel = nullptr;
    void setupUi(QWidget* popup);
    void retranslateUi(QWidget* popup);
};
} // namespace Ui

// Asks before something is deleted. Both answers go to the owner, which
// closes the popup.
class DeletePopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit DeletePopup(QWidget* parent = nullptr);
    ~DeletePopup() override;

    void setHeaderText(const QString& text);
    void setMessageText(const QString& text);
    void setConfirmButtonText(const QString& text);
    void setCancelButtonText(const QString& text);

signals:
    void confirmClicked(PopupPanel* popup);
    void cancelClicked(PopupPanel* popup);

public slots:
    void onConfirmClicked();
    void onCancelClicked();

protected:
    void changeEvent(QEvent* event) override;

    Ui::DeletePopup* ui;

private:
    // The owner's own texts are already translated; the defaults follow a
    // language change.
    bool m_ownHeader = false;
    bool m_ownConfirm = false;
    bool m_ownCancel = false;
};

#endif // DELETEPOPUP_H
