#include "Widgets/SelfTestListItem.h"

#include "ui_SelfTestListItem.h"

#include <QEvent>

namespace {
const unsigned int kPass = 1;
const unsigned int kFail = 2;
const unsigned int kCanceled = 3;
} // namespace

SelfTestListItem::SelfTestListItem(const QString& name, const QString& shown, QWidget* parent)
    : KLabel(parent)
    , ui(new Ui::SelfTestListItem)
    , m_testName(name)
{
    ui->setupUi(this);
    setFixedSize(320, 62);
    ui->labelName->setAutoSize(true);
    ui->labelResult->setWordWrap(true);
    ui->labelResult->setAutoSize(true);
    ui->labelName->setText(shown);
    setResult(0);
}

SelfTestListItem::~SelfTestListItem()
{
    delete ui;
}

void SelfTestListItem::setResult(unsigned int result)
{
    m_result = result;
    QString text;
    QString style;
    switch (result) {
    case 0: style = QStringLiteral("color: rgb(45, 45, 45);"); break;
    case kPass:
        text = tr("Pass");
        style = QStringLiteral("color: rgb(0, 146, 69);");
        break;
    case kFail:
        text = tr("Fail");
        style = QStringLiteral("color: rgb(255, 62, 62);");
        break;
    case kCanceled:
        text = tr("Canceled");
        style = QStringLiteral("color: rgb(28, 117, 188);");
        break;
    default:
        text = tr("Error");
        style = QStringLiteral("color: rgb(255, 62, 62);");
        break;
    }
    ui->labelResult->setStyleSheet(style);
    ui->labelResult->setText(text);
}

QString SelfTestListItem::resultText() const
{
    return ui->labelResult->defaultText();
}

QString SelfTestListItem::resultStyle() const
{
    return ui->labelResult->styleSheet();
}

void SelfTestListItem::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        setResult(m_result);
    KLabel::changeEvent(event);
}
