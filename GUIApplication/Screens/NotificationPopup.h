#ifndef NOTIFICATIONPOPUP_H
#define NOTIFICATIONPOPUP_H

#include "Screens/PopupPanel.h"

class KLabel;
class QLabel;
class XPushButton;

namespace Ui {
struct NotificationPopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    QLabel* labelIcon = nullptr;
    KLabel* labelTextTitle = nullptr;
    KLabel* labelTextSummary = nullptr;
    XPushButton* Btn = nullptr;
    void setupUi(QWidget* popup);
};
} // namespace Ui

// A message with one button. The caller sets the texts.
class NotificationPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit NotificationPopup(QWidget* parent = nullptr);
    ~NotificationPopup() override;

    void setHeaderText(const QString& text);
    void setMessageText(const QString& text);
    void setButtonText(const QString& text);
    void setIconResource(const QString& resource);
    void setIconVisible(bool visible);

    QString headerText() const;
    QString messageText() const;

signals:
    void btnClicked();

public slots:
    void onBtnClicked();

protected:
    Ui::NotificationPopup* ui;
};

#endif // NOTIFICATIONPOPUP_H
