#include "Widgets/WebSyncButton.h"

#include "ui_WebSyncButton.h"

#include <QEvent>

WebSyncButton::WebSyncButton(QWidget* parent)
    : FlickButton(parent)
    , ui(new Ui::WebSyncButton)
{
    ui->setupUi(this);
    setBackground(QStringLiteral(":/Assets/cell_blue_85px.png"));
    setPressedBackground(QStringLiteral(":/Assets/cell_85px_hit.png"));
}

WebSyncButton::~WebSyncButton()
{
    delete ui;
}

void WebSyncButton::SetText(QString text)
{
    ui->labelText->setText(text);
}

void WebSyncButton::SetText(std::function<QString()> text)
{
    m_textSource = std::move(text);
    ui->labelText->setText(m_textSource ? m_textSource() : QString());
}

QString WebSyncButton::text() const
{
    return ui->labelText->text();
}

void WebSyncButton::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        if (m_textSource)
            ui->labelText->setText(m_textSource());
    }
    FlickButton::changeEvent(event);
}
