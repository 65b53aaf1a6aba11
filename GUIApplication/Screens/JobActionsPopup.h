#ifndef JOBACTIONSPOPUP_H
#define JOBACTIONSPOPUP_H

#include "Screens/PopupPanel.h"

namespace Ui {
class JobActionsPopup;
}

// What can be done with the active job: view or run it, copy it, send it
// to the server, delete it.
class JobActionsPopup : public PopupPanel
{
    Q_OBJECT
public:
    explicit JobActionsPopup(QWidget* parent = nullptr);
    ~JobActionsPopup() override;

signals:
    void deleteJob();
    void jobViewEditStart();
    void copyJob();
    void syncJob();

private slots:
    void on_BtnDelete_clicked();
    void on_BtnViewEditStart_clicked();
    void on_BtnCancel_clicked();
    void on_BtnCopy_clicked();
    void on_BtnSync_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    void fillFromActiveJob();

    Ui::JobActionsPopup* ui;
};

#endif // JOBACTIONSPOPUP_H
