#ifndef TERMINATEJOBPOPUP_H
#define TERMINATEJOBPOPUP_H

#include "Screens/PopupPanel.h"

class QLabel;
class XPushButton;

namespace Ui {
struct TerminateJobPopup
{
    QLabel* labelBackground = nullptr;
    QLabel* labelPanel = nullptr;
    XPushButton* BtnStoreAverage = nullptr;
    XPushButton* BtnRestartJob = nullptr;
    XPushButton* BtnCancel = nullptr;
    void setupUi(QWidget* popup);
    void retranslateUi(QWidget* popup);
};
} // namespace Ui

// Ends an averaging job early. Its buttons are silent: the screen behind
// answers with its own sounds.
class TerminateJobPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit TerminateJobPopup(QWidget* parent = nullptr);
    ~TerminateJobPopup() override;

signals:
    void averageJob();
    void restartJob();

public slots:
    void on_BtnStoreAverage_clicked();
    void on_BtnRestartJob_clicked();
    void on_BtnCancel_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::TerminateJobPopup* ui;
};

#endif // TERMINATEJOBPOPUP_H
