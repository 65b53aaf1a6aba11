#ifndef WEBSYNCBUTTON_H
#define WEBSYNCBUTTON_H

#include "Widgets/FlickButton.h"

#include <functional>

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
    // A text of the owner's own, asked again when the language changes
    // (the form's text is the job list's).
    void SetText(std::function<QString()> text);
    QString text() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::WebSyncButton* ui;
    std::function<QString()> m_textSource;
};

#endif // WEBSYNCBUTTON_H
