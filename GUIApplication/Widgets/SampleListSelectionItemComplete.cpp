#include "Widgets/SampleListSelectionItemComplete.h"

#include "ui_SampleListSelectionItemComplete.h"

#include <QApplication>
#include <QEvent>

namespace {

// Fonts by pixel size in the language's family: a style sheet font would
// keep the fitting labels from shrinking long texts.
QFont pixelFont(int pixels, bool bold = false)
{
    QFont font = QApplication::font();
    font.setPixelSize(pixels);
    font.setBold(bold);
    return font;
}

} // namespace

SampleListSelectionItemComplete::SampleListSelectionItemComplete(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::SampleListSelectionItemComplete)
{
    ui->setupUi(this);
    ui->labelMessage->setFont(pixelFont(15));
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
