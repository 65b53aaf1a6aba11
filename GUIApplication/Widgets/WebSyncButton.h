#ifndef WEBSYNCBUTTON_H
#define WEBSYNCBUTTON_H

#include "Widgets/FlickButton.h"

namespace Ui {
class WebSyncButton;
}

// The blue list row that sends jobs to the web server.
class WebSyncButton : public FlickButton
{
    Q_OBJECT
public:
    explicit WebSyncButton(QWidget* parent = nullptr);
    ~WebSyncButton() override;

    void SetText(QString text);
    QString text() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::WebSyncButton* ui;
};

#endif // WEBSYNCBUTTON_H
