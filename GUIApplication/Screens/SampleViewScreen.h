#ifndef SAMPLEVIEWSCREEN_H
#define SAMPLEVIEWSCREEN_H

#include "Screens/DaddyPanel.h"

class PopupPanel;
class SampleViewPageContainer;

namespace Ui {
class SampleViewScreen;
}

// One stored sample, the active one, on sliding pages: rainbow chart and
// thumbnails, colour figures, texture figures. Built on that sample; it
// closes when the sample goes away.
class SampleViewScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit SampleViewScreen(QWidget* parent = nullptr);
    ~SampleViewScreen() override;

    SampleViewPageContainer* pageContainer() const;

public slots:
    void onUpdateScreen() override;
    void onGotoImageViewScreen();
    void onDelete();
    void on_BtnBack_clicked();
    void on_BtnTrash_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    PopupPanel* createPopup();
    void showTitle();

    Ui::SampleViewScreen* ui;
};

#endif // SAMPLEVIEWSCREEN_H
