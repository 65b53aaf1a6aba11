#include "Widgets/SettingsSliderItems.h"

#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"

#include <QEvent>
#include <QLabel>
#include <QSlider>

namespace {

const QString kEntryNumberStyle = QStringLiteral(
    "color: rgb(109, 110, 113); background-color: white; border: 1px solid rgb(214, 215, 217); border-radius: 4px;");
const QString kEntryNeverStyle = QStringLiteral(
    "color: rgb(28, 117, 188); background-color: white; border: 1px solid rgb(214, 215, 217); border-radius: 4px;");

QString sliderStyle()
{
    return QStringLiteral(
        "QSlider { background: transparent; }"
        "QSlider::groove:horizontal { height: 6px; background: rgb(214, 215, 217); border-radius: 3px; }"
        "QSlider::sub-page:horizontal { background: rgb(0, 174, 239); border-radius: 3px; }"
        "QSlider::sub-page:horizontal:disabled { background: rgb(190, 190, 190); }"
        "QSlider::handle:horizontal { background: white; border: 2px solid rgb(0, 174, 239);"
        " width: 24px; height: 24px; margin: -11px 0; border-radius: 14px; }"
        "QSlider::handle:horizontal:pressed { background: rgb(214, 241, 252); }");
}

} // namespace

SettingsListSelectionSliderItem::SettingsListSelectionSliderItem(QWidget* parent)
    : QWidget(parent)
{
    build(false);
}

SettingsListSelectionSliderItem::SettingsListSelectionSliderItem(bool compressed, QWidget* parent)
    : QWidget(parent)
{
    build(compressed);
}

SettingsListSelectionSliderItem::~SettingsListSelectionSliderItem() = default;

void SettingsListSelectionSliderItem::build(bool compressed)
{
    const int height = compressed ? 96 : 124;
    resize(Theme::ScreenWidth, height);

    labelBackground = new QLabel(this);
    labelBackground->setObjectName(QStringLiteral("labelBackground"));
    labelBackground->setGeometry(0, 0, Theme::ScreenWidth, height);
    labelBackground->setStyleSheet(QStringLiteral("background-color: white;"));

    labelBackgroundColor = new QLabel(this);
    labelBackgroundColor->setObjectName(QStringLiteral("labelBackgroundColor"));
    labelBackgroundColor->setGeometry(14, height - 1, Theme::ScreenWidth - 14, 1);
    labelBackgroundColor->setStyleSheet(QStringLiteral("background-color: %1;").arg(Theme::css(Theme::Separator)));

    labelSummaryText = new KLabel(this);
    labelSummaryText->setObjectName(QStringLiteral("labelSummaryText"));
    QPalette summaryPalette = labelSummaryText->palette();
    summaryPalette.setColor(QPalette::WindowText, Theme::TextBody);
    labelSummaryText->setPalette(summaryPalette);
    labelSummaryText->setFont(Theme::font(compressed ? Theme::FontBody : Theme::FontHeadline));
    labelSummaryText->setWordWrap(true);
    labelSummaryText->setAutoSize(true);
    labelSummaryText->setGeometry(20, compressed ? 3 : 10, 218, compressed ? 36 : 38);

    labelEntryField = new QLabel(this);
    labelEntryField->setObjectName(QStringLiteral("labelEntryField"));
    labelEntryField->setAlignment(Qt::AlignCenter);
    labelEntryField->setFont(Theme::font(Theme::FontHeadline, true));
    labelEntryField->setGeometry(244, compressed ? 6 : 12, 60, compressed ? 30 : 34);
    labelEntryField->setStyleSheet(kEntryNumberStyle);

    horizontalSlider = new QSlider(Qt::Horizontal, this);
    horizontalSlider->setObjectName(QStringLiteral("horizontalSlider"));
    horizontalSlider->setGeometry(20, compressed ? 38 : 54, 284, 40);
    horizontalSlider->setFocusPolicy(Qt::NoFocus);
    horizontalSlider->setStyleSheet(sliderStyle());
    horizontalSlider->setTracking(true);

    const int limitsY = compressed ? 74 : 94;
    labelMinText = new QLabel(this);
    labelMinText->setObjectName(QStringLiteral("labelMinText"));
    labelMinText->setGeometry(20, limitsY, 120, 20);
    labelMinText->setFont(Theme::font(Theme::FontSmall));
    labelMinText->setStyleSheet(QStringLiteral("color: %1; background: transparent;").arg(Theme::css(Theme::TextSecondary)));

    labelMaxText = new QLabel(this);
    labelMaxText->setObjectName(QStringLiteral("labelMaxText"));
    labelMaxText->setGeometry(184, limitsY, 120, 20);
    labelMaxText->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    labelMaxText->setFont(Theme::font(Theme::FontSmall));
    labelMaxText->setStyleSheet(labelMinText->styleSheet());

    connect(horizontalSlider, &QSlider::valueChanged, this, &SettingsListSelectionSliderItem::onValueChanged);
    connect(horizontalSlider, &QSlider::sliderReleased, this,
            [this]() { emit sliderChanged(horizontalSlider->sliderPosition()); });
    connect(horizontalSlider, &QSlider::actionTriggered, this, &SettingsListSelectionSliderItem::onActionTriggered);
    onValueChanged(horizontalSlider->value());
}

void SettingsListSelectionSliderItem::onActionTriggered(int action)
{
    // Steps and page steps come from taps beside the handle: each is a
    // decision of its own. A drag is reported when it ends.
    if (action >= QAbstractSlider::SliderSingleStepAdd && action <= QAbstractSlider::SliderPageStepSub) {
        // The slider takes the new value only after this signal; whoever
        // listens must already read it.
        horizontalSlider->setValue(horizontalSlider->sliderPosition());
        emit sliderChanged(horizontalSlider->sliderPosition());
    }
}

void SettingsListSelectionSliderItem::onValueChanged(int value)
{
    if (m_bAllowNever && value == horizontalSlider->maximum()) {
        labelEntryField->setText(QString());
        labelEntryField->setStyleSheet(kEntryNeverStyle);
    } else {
        labelEntryField->setText(QString::number(value));
        labelEntryField->setStyleSheet(kEntryNumberStyle);
    }
}

void SettingsListSelectionSliderItem::setMinValue(int value)
{
    horizontalSlider->setMinimum(value);
    labelMinText->setText(QString::number(value));
    onValueChanged(horizontalSlider->value());
}

void SettingsListSelectionSliderItem::setMaxValue(int value)
{
    horizontalSlider->setMaximum(value);
    updateMaxText();
    onValueChanged(horizontalSlider->value());
}

void SettingsListSelectionSliderItem::updateMaxText()
{
    labelMaxText->setText(m_bAllowNever ? tr("Never") : QString::number(horizontalSlider->maximum()));
}

void SettingsListSelectionSliderItem::allowNever(bool allow)
{
    m_bAllowNever = allow;
    updateMaxText();
    onValueChanged(horizontalSlider->value());
}

void SettingsListSelectionSliderItem::setValue(int value)
{
    horizontalSlider->setValue(value);
    // Also when the value did not change, the field must match the flag.
    onValueChanged(horizontalSlider->value());
}

void SettingsListSelectionSliderItem::setSummaryText(const QString& text)
{
    labelSummaryText->setText(text);
}

void SettingsListSelectionSliderItem::setPageStep(int step)
{
    horizontalSlider->setPageStep(step);
}

int SettingsListSelectionSliderItem::getValue() const
{
    return horizontalSlider->value();
}

QString SettingsListSelectionSliderItem::entryText() const
{
    return labelEntryField->text();
}

QString SettingsListSelectionSliderItem::maxText() const
{
    return labelMaxText->text();
}

QString SettingsListSelectionSliderItem::minText() const
{
    return labelMinText->text();
}

QString SettingsListSelectionSliderItem::summaryText() const
{
    return labelSummaryText->defaultText();
}

void SettingsListSelectionSliderItem::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        updateMaxText();
}

SettingsListSelectionCompressedSliderItem::SettingsListSelectionCompressedSliderItem(QWidget* parent)
    : SettingsListSelectionSliderItem(true, parent)
{
}

void SettingsListSelectionCompressedSliderItem::setLastInList(bool last)
{
    m_lastInList = last;
    labelBackgroundColor->setVisible(!last);
}
