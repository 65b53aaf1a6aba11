#include "Screens/ImageViewScreen.h"
#include "ui_ImageViewScreen.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Instrument.h"
#include "Widgets/ImageViewPage.h"

#include <QEvent>
#include <QLabel>
#include <QPixmap>

namespace {
const int kDotGap = 5;
const int kDotsCentreY = 458;
} // namespace

ImageViewScreen::ImageViewScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::ImageViewScreen)
{
    setObjectName(QStringLiteral("ImageViewScreen"));
    ui->setupUi(this);
    connect(ui->imageViewPage, &PageContainer::changedPages, this, &ImageViewScreen::onPageChanged);
    createScreen();
}

ImageViewScreen::~ImageViewScreen()
{
    delete ui;
}

HorizontalPageContainer* ImageViewScreen::imageViewPage() const
{
    return ui->imageViewPage;
}

void ImageViewScreen::createScreen()
{
    const int n = Instrument_Get_Num_Camera_Images();
    ui->imageViewPage->removeAllPages();
    for (int i = 0; i < n; ++i) {
        auto* page = new ImageViewPage(i);
        page->setObjectName(QStringLiteral("imagePage%1").arg(i));
        ui->imageViewPage->appendPage(page);
    }
    const int active = int(DataManager::instance()->getActiveImage());
    if (n > 0)
        ui->imageViewPage->onSelectPage(active >= 0 && active < n ? active : 0);
    drawDots();
}

void ImageViewScreen::drawDots()
{
    removeAllDots();
    const QPixmap open(QStringLiteral(":/Assets/pagination_open.png"));
    const QPixmap filled(QStringLiteral(":/Assets/pagination_filled.png"));
    const int n = ui->imageViewPage->getNumberOfPages();
    if (n == 0)
        return;
    const int dot = open.width();
    int x = (width() - (n * dot + (n - 1) * kDotGap)) / 2;
    const int current = ui->imageViewPage->getCurrentPage();
    for (int i = 0; i < n; ++i) {
        const QPixmap& picture = i == current ? filled : open;
        auto* label = new QLabel(this);
        label->setObjectName(QStringLiteral("dot%1").arg(i));
        label->setPixmap(picture);
        label->setGeometry(x, kDotsCentreY - picture.height() / 2, picture.width(), picture.height());
        label->raise();
        label->show();
        m_pageDots.push_back(label);
        x += dot + kDotGap;
    }
}

void ImageViewScreen::removeAllDots()
{
    for (QLabel* dot : m_pageDots)
        delete dot;
    m_pageDots.clear();
}

void ImageViewScreen::removeDot(int index)
{
    if (index < 0 || index >= int(m_pageDots.size()))
        return;
    delete m_pageDots[size_t(index)];
    m_pageDots.erase(m_pageDots.begin() + index);
}

void ImageViewScreen::onPageChanged(int)
{
    drawDots();
}

void ImageViewScreen::onCloseScreen()
{
    CloseScreen();
}

void ImageViewScreen::on_BtnZoomOut_clicked()
{
    playSoundButtonClick();
    onCloseScreen();
}

void ImageViewScreen::on_BtnPageLeft_clicked()
{
    playSoundButtonClick();
    ui->imageViewPage->onGotoLeftPage();
}

void ImageViewScreen::on_BtnPageRight_clicked()
{
    playSoundButtonClick();
    ui->imageViewPage->onGotoRightPage();
}

void ImageViewScreen::changeEvent(QEvent* event)
{
    DaddyPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
}
