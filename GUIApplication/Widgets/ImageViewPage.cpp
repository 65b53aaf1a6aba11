#include "Widgets/ImageViewPage.h"
#include "ui_ImageViewPage.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/StringTables.h"

#include <QEvent>
#include <QPixmap>

ImageViewPage::ImageViewPage(int angle, QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::ImageViewPage)
    , m_angle(angle)
{
    ui->setupUi(this);
    const QImage image = DataManager::instance()->getActiveSampleImage(static_cast<IMAGE_ANGLE_T>(angle));
    if (!image.isNull()) {
        const QSize box = ui->labelImage->size();
        ui->labelImage->setPixmap(QPixmap::fromImage(
            image.size() == box ? image : image.scaled(box, Qt::KeepAspectRatio, Qt::SmoothTransformation)));
    }
    ui->labelImageAngle->setText(getStringFromList(angle, IMAGE_ANGLE_TABLE));
}

ImageViewPage::~ImageViewPage()
{
    delete ui;
}

bool ImageViewPage::hasImage() const
{
    return !ui->labelImage->pixmap(Qt::ReturnByValue).isNull();
}

QString ImageViewPage::angleText() const
{
    return ui->labelImageAngle->text();
}

void ImageViewPage::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        ui->labelImageAngle->setText(getStringFromList(m_angle, IMAGE_ANGLE_TABLE));
}
