#include "Widgets/JobSummaryEditSelectionItem.h"

#include "ui_JobSummaryEditSelectionItem.h"

#include "Widgets/KLabel.h"

#include "Widgets/Theme.h"


JobSummaryEditSelectionItem::JobSummaryEditSelectionItem(const QString& description, const QString& value,
                                                         QWidget* parent, bool editable)
    : FlickButton(parent)
    , ui(new Ui::JobSummaryEditSelectionItem)
{
    ui->setupUi(this);
    ui->labelDescription->setFont(Theme::pixelFont(13));
    ui->labelValue->setFont(Theme::pixelFont(18, true));
    // The labels lie over the button; touches must reach the button.
    for (QWidget* child : {static_cast<QWidget*>(ui->labelDescription), static_cast<QWidget*>(ui->labelValue),
                           static_cast<QWidget*>(ui->labelEditMarker)})
        child->setAttribute(Qt::WA_TransparentForMouseEvents);
    setBackground(QStringLiteral(":/Assets/cell_62px.png"));
    // Job texts come from elsewhere too and can be long: they shrink to fit.
    ui->labelValue->setAutoSize(true);
    ui->labelDescription->setAutoSize(true);
    setDescription(description);
    setValue(value);
    setIsEditable(editable);
}

JobSummaryEditSelectionItem::~JobSummaryEditSelectionItem()
{
    delete ui;
}

void JobSummaryEditSelectionItem::setIsEditable(bool editable)
{
    m_editable = editable;
    if (editable)
        setPressedBackground(QStringLiteral(":/Assets/cell_62px_hit.png"));
    else
        clearPressedBackground();
    ui->labelEditMarker->setVisible(editable);
}

void JobSummaryEditSelectionItem::setDescription(const QString& text)
{
    ui->labelDescription->setText(text);
}

void JobSummaryEditSelectionItem::setValue(const QString& text)
{
    ui->labelValue->setText(text);
}

void JobSummaryEditSelectionItem::setMaxTextLength(int length)
{
    ui->labelValue->setMaxTextLength(length);
}

void JobSummaryEditSelectionItem::setAutoSize(bool autoSize)
{
    ui->labelValue->setAutoSize(autoSize);
}

QString JobSummaryEditSelectionItem::description() const
{
    return ui->labelDescription->defaultText();
}

QString JobSummaryEditSelectionItem::value() const
{
    return ui->labelValue->defaultText();
}

KLabel* JobSummaryEditSelectionItem::valueLabel() const
{
    return ui->labelValue;
}

bool JobSummaryEditSelectionItem::isEditMarkerShown() const
{
    return !ui->labelEditMarker->isHidden();
}

void JobSummaryEditSelectionItem::sendClick()
{
    if (m_editable)
        FlickButton::sendClick();
}
