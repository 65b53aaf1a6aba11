#include "Widgets/BottomDotsPageContainer.h"

#include "ui_BottomDotsPageContainer.h"

#include <QPixmap>

namespace {
const int kDotSpacing = 5;
}

BottomDotsPageContainer::BottomDotsPageContainer(QWidget* parent)
    : HorizontalPageContainer(parent)
    , ui(new Ui::BottomDotsPageContainer)
{
    ui->setupUi(this);
}

BottomDotsPageContainer::~BottomDotsPageContainer()
{
    delete ui;
}

QLabel* BottomDotsPageContainer::pageBar() const
{
    return ui->labelPageBar;
}

void BottomDotsPageContainer::appendPage(QWidget* page)
{
    HorizontalPageContainer::appendPage(page);
}

void BottomDotsPageContainer::prependPage(QWidget* page)
{
    HorizontalPageContainer::prependPage(page);
}

void BottomDotsPageContainer::insertPage(QWidget* page, int index)
{
    HorizontalPageContainer::insertPage(page, index);
}

void BottomDotsPageContainer::updatePage()
{
    HorizontalPageContainer::updatePage();
    drawDots();
}

void BottomDotsPageContainer::drawDots()
{
    const QPixmap open(QStringLiteral(":/Assets/pagination_open.png"));
    const QPixmap filled(QStringLiteral(":/Assets/pagination_filled.png"));
    if (m_widgetList.empty())
        return;
    removeAllDots();

    const int n = getNumberOfPages();
    const int barWidth = ui->labelPageBar->width();
    const int dot = open.width();
    int first;
    if (n % 2 == 1)
        first = barWidth / 2 - ((n / 2) * kDotSpacing + dot * (n / 2) + dot / 2);
    else
        first = int(barWidth / 2 - (dot * (n / 2) + ((n - 1) / 2 + 0.5) * kDotSpacing));

    const QRect bar = ui->labelPageBar->geometry();
    for (int i = 0; i < n; ++i) {
        const QPixmap& picture = (i == m_currentPage) ? filled : open;
        QLabel* label = new QLabel(this);
        label->setPixmap(picture);
        label->setGeometry(first + i * (picture.width() + kDotSpacing),
                           bar.top() + (bar.height() - picture.height()) / 2,
                           picture.width(), picture.height());
        label->raise();
        label->show();
        m_pageDots.push_back(label);
    }
}

void BottomDotsPageContainer::removeAllDots()
{
    for (QLabel* label : m_pageDots)
        delete label;
    m_pageDots.clear();
}

void BottomDotsPageContainer::removeDot(int index)
{
    if (index < 0 || index >= int(m_pageDots.size()))
        throw 2u;
    delete m_pageDots[size_t(index)];
    m_pageDots.erase(m_pageDots.begin() + index);
}
