#include "Widgets/ListingHeader.h"

#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"

void Ui::ListingHeader::setupUi(QWidget* header)
{
    header->setObjectName("ListingHeader");
    header->resize(Theme::ScreenWidth, ::ListingHeader::Height);
    labelBackground = new QLabel(header);
    labelBackground->setObjectName("labelBackground");
    labelBackground->setGeometry(0, 0, Theme::ScreenWidth, ::ListingHeader::Height);
    labelBackground->setPixmap(QPixmap(":/Assets/listing_header.png"));

    const QString textStyle = "color: rgb(70, 70, 70); background: transparent;";
    labelLeftText = new KLabel(header);
    labelLeftText->setObjectName("labelLeftText");
    labelLeftText->setGeometry(14, 0, 190, ::ListingHeader::Height);
    labelLeftText->setStyleSheet(textStyle);
    labelLeftText->setFont(Theme::font(Theme::FontSmall, true));
    labelLeftText->setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
    labelLeftText->setAutoSize(true);

    labelRightText = new KLabel(header);
    labelRightText->setObjectName("labelRightText");
    labelRightText->setGeometry(204, 0, 102, ::ListingHeader::Height);
    labelRightText->setStyleSheet(textStyle);
    labelRightText->setFont(Theme::font(Theme::FontSmall));
    labelRightText->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    labelRightText->setAutoSize(true);
}

ListingHeader::ListingHeader(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::ListingHeader)
{
    ui->setupUi(this);
}

ListingHeader::ListingHeader(const QString& leftText, QWidget* parent)
    : ListingHeader(parent)
{
    setLeftText(leftText);
}

ListingHeader::ListingHeader(const QString& leftText, const QString& rightText, QWidget* parent)
    : ListingHeader(parent)
{
    setLeftText(leftText);
    setRightText(rightText);
}

ListingHeader::~ListingHeader()
{
    delete ui;
}

void ListingHeader::setLeftText(const QString& text)
{
    ui->labelLeftText->setText(text);
}

void ListingHeader::setRightText(const QString& text)
{
    ui->labelRightText->setText(text);
}
