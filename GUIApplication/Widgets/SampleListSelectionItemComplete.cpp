#include "Widgets/SampleListSelectionItemComplete.h"

#include "ui_SampleListSelectionItemComplete.h"

#include "Widgets/Theme.h"

#include <QEvent>

SampleListSelectionItemComplete::SampleListSelectionItemComplete(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::SampleListSelectionItemComplete)
{
    ui->setupUi(this);
    ui->labelMessage->setFont(Theme::pixelFont(15));
    ui->labelMessage->setAutoSize(true);
}

SampleListSelectionItemComplete::~SampleListSelectionItemComplete()
{
    delete ui;
}

QString SampleListSelectionItemComplete::message() const
{
    return ui->labelMessage->defaultText();
}

void SampleListSelectionItemComplete::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    QWidget::changeEvent(event);
}
