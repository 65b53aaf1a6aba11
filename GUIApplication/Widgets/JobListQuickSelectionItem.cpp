#include "Widgets/JobListQuickSelectionItem.h"

#include "ui_JobListQuickSelectionItem.h"

#include <QEvent>

JobListQuickSelectionItem::JobListQuickSelectionItem(QWidget* parent)
    : FlickButton(parent)
    , ui(new Ui::JobListQuickSelectionItem)
{
    ui->setupUi(this);
    setBackground(QStringLiteral(":/Assets/cell_red_85px.png"));
    setPressedBackground(QStringLiteral(":/Assets/cell_85px_hit.png"));
}

JobListQuickSelectionItem::~JobListQuickSelectionItem()
{
    delete ui;
}

QString JobListQuickSelectionItem::text() const
{
    return ui->labelName->text();
}

void JobListQuickSelectionItem::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    FlickButton::changeEvent(event);
}
