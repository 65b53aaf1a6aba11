#include "Widgets/SettingsListItems.h"

#include "SharedSystem/UserParams.h"
#include "Widgets/KLabel.h"
#include "Widgets/Theme.h"

#include <QLabel>
#include <QPainter>
#include <QPainterPath>

namespace {

const QString kCell62 = QStringLiteral(":/Assets/cell_62px.png");
const QString kCell62Hit = QStringLiteral(":/Assets/cell_62px_hit.png");

KLabel* rowLabel(QWidget* parent, const QRect& box, int pointSize, bool bold, const QColor& colour,
                 Qt::Alignment alignment = Qt::AlignLeft | Qt::AlignVCenter)
{
    KLabel* label = new KLabel(parent);
    // The style sheet first: polishing must not undo the fitted font.
    label->setStyleSheet(QStringLiteral("color: %1; background: transparent;").arg(Theme::css(colour)));
    label->setGeometry(box);
    label->setFont(Theme::font(pointSize, bold));
    // A long translation goes onto a second line before it shrinks.
    label->setWordWrap(true);
    label->setAutoSize(true);
    label->setAlignment(alignment);
    label->setAttribute(Qt::WA_TransparentForMouseEvents);
    return label;
}

QLabel* rowPicture(QWidget* parent, const QRect& box)
{
    QLabel* label = new QLabel(parent);
    label->setGeometry(box);
    label->setAlignment(Qt::AlignCenter);
    label->setStyleSheet(QStringLiteral("background: transparent;"));
    label->setAttribute(Qt::WA_TransparentForMouseEvents);
    return label;
}

void makeRow(FlickButton* row, int height, bool pressable)
{
    row->resize(Theme::ScreenWidth, height);
    const QString cell = height == SettingsRows::TallRowHeight ? QStringLiteral(":/Assets/cell_85px.png") : kCell62;
    const QString hit = height == SettingsRows::TallRowHeight ? QStringLiteral(":/Assets/cell_85px_hit.png") : kCell62Hit;
    row->setBackground(cell);
    if (pressable)
        row->setPressedBackground(hit);
}

} // namespace

QPixmap SettingsRows::arrowPixmap()
{
    QPixmap pixmap(16, 24);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    QPen pen(Theme::TextSecondary, 2.5, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin);
    painter.setPen(pen);
    painter.drawPolyline(QPolygonF({QPointF(5, 5), QPointF(11, 12), QPointF(5, 19)}));
    return pixmap;
}

// ---------------------------------------------------------------- selection

SettingsListSelectionItem::SettingsListSelectionItem(QWidget* parent)
    : FlickButton(parent)
{
    makeRow(this, SettingsRows::RowHeight, true);
    m_labelIcon = rowPicture(this, QRect(12, 11, 40, 40));
    m_labelSetting = rowLabel(this, QRect(62, 0, 150, SettingsRows::RowHeight), Theme::FontHeadline, false,
                              Theme::TextBody);
    m_labelStatus = rowLabel(this, QRect(190, 0, 100, SettingsRows::RowHeight), Theme::FontBody, false,
                             Theme::TextSecondary, Qt::AlignRight | Qt::AlignVCenter);
    // A value (an address, a name) reads best on one line, smaller if need be.
    m_labelStatus->setWordWrap(false);
    m_labelArrow = rowPicture(this, QRect(292, 19, 16, 24));
    m_labelArrow->setPixmap(SettingsRows::arrowPixmap());
    layoutLabels();
}

void SettingsListSelectionItem::setBtnIcon(const QString& resource)
{
    m_labelIcon->setPixmap(resource.isEmpty() ? QPixmap() : QPixmap(resource));
    m_labelIcon->setVisible(!resource.isEmpty());
    layoutLabels();
}

void SettingsListSelectionItem::setArrowIcon(const QString& resource)
{
    m_labelArrow->setPixmap(resource.isEmpty() ? SettingsRows::arrowPixmap() : QPixmap(resource));
}

void SettingsListSelectionItem::setBtnSettingText(const QString& text)
{
    m_labelSetting->setText(text);
    layoutLabels();
}

void SettingsListSelectionItem::setBtnStatusText(const QString& text)
{
    m_labelStatus->setText(text);
    layoutLabels();
}

void SettingsListSelectionItem::setClickable(bool clickable)
{
    m_clickable = clickable;
    if (clickable)
        setPressedBackground(height() == SettingsRows::TallRowHeight ? QStringLiteral(":/Assets/cell_85px_hit.png")
                                                                     : kCell62Hit);
    else
        clearPressedBackground();
}

void SettingsListSelectionItem::showArrow(bool show)
{
    m_labelArrow->setVisible(show);
    layoutLabels();
}

QString SettingsListSelectionItem::getBtnSettingText() const
{
    return m_labelSetting->defaultText();
}

QString SettingsListSelectionItem::getBtnStatusText() const
{
    return m_labelStatus->defaultText();
}

void SettingsListSelectionItem::sendClick()
{
    if (m_clickable)
        FlickButton::sendClick();
}

void SettingsListSelectionItem::resizeEvent(QResizeEvent* event)
{
    FlickButton::resizeEvent(event);
    layoutLabels();
}

void SettingsListSelectionItem::layoutLabels()
{
    // The name takes what the value leaves; a long value shrinks first.
    const QPixmap* icon = m_labelIcon->pixmap();
    const int left = icon && !icon->isNull() ? 62 : 16;
    const int right = m_labelArrow->isVisibleTo(this) ? 288 : 306;
    const int h = height();
    const QString status = m_labelStatus->defaultText();
    const int settingWidth = QFontMetrics(m_labelSetting->defaultFont()).horizontalAdvance(m_labelSetting->defaultText()) + 16;
    int statusWidth = 0;
    if (!status.isEmpty())
        statusWidth = qMin(QFontMetrics(m_labelStatus->defaultFont()).horizontalAdvance(status) + 14,
                           qMax(100, right - left - settingWidth));
    m_labelStatus->setGeometry(right - statusWidth, 0, statusWidth, h);
    m_labelStatus->setVisible(statusWidth > 0);
    m_labelSetting->setGeometry(left, 0, qMax(40, right - statusWidth - left - 6), h);
    m_labelIcon->move(12, (h - m_labelIcon->height()) / 2);
    m_labelArrow->move(m_labelArrow->x(), (h - m_labelArrow->height()) / 2);
    // Re-fit the texts into their new boxes.
    m_labelSetting->setText(m_labelSetting->defaultText());
    m_labelStatus->setText(status);
}

// ---------------------------------------------------------------- checkable

SettingsListSelectionCheckableItem::SettingsListSelectionCheckableItem(QWidget* parent)
    : FlickButton(parent)
{
    makeRow(this, SettingsRows::RowHeight, true);
    m_labelSetting = rowLabel(this, QRect(20, 0, 240, SettingsRows::RowHeight), Theme::FontHeadline, false,
                              Theme::AccentDeep);
    m_labelIcon = rowPicture(this, QRect(268, 15, 32, 32));
    m_labelIcon->setPixmap(QPixmap(QStringLiteral(":/Assets/settings_select_icon.png")));
    m_labelIcon->hide();
}

void SettingsListSelectionCheckableItem::setText(const QString& text)
{
    m_labelSetting->setText(text);
}

QString SettingsListSelectionCheckableItem::getText() const
{
    return m_labelSetting->defaultText();
}

void SettingsListSelectionCheckableItem::setChecked(bool checked)
{
    m_checked = checked;
    m_labelIcon->setVisible(checked);
}

void SettingsListSelectionCheckableItem::setFont(const QFont& font)
{
    QFont sized = font;
    sized.setPointSize(Theme::FontHeadline);
    m_labelSetting->setFont(sized);
}

void SettingsListSelectionCheckableItem::sendClick()
{
    setChecked(!m_checked);
    FlickButton::sendClick();
}

// ---------------------------------------------------------------- toggle

SettingsToggleSwitch::SettingsToggleSwitch(QWidget* parent)
    : QPushButton(parent)
{
    setCheckable(true);
    setFocusPolicy(Qt::NoFocus);
    setFlat(true);
}

void SettingsToggleSwitch::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF track = QRectF(rect()).adjusted(2, 4, -2, -4);
    const qreal radius = track.height() / 2;
    QColor fill = isChecked() ? Theme::Accent : Theme::Separator;
    if (!isEnabled())
        fill = isChecked() ? Theme::Accent.lighter(150) : Theme::Disabled.lighter(115);
    painter.setPen(Qt::NoPen);
    painter.setBrush(fill);
    painter.drawRoundedRect(track, radius, radius);
    const qreal knob = track.height() - 4;
    const qreal x = isChecked() ? track.right() - 2 - knob : track.left() + 2;
    painter.setBrush(Qt::white);
    painter.setPen(QPen(QColor(0, 0, 0, 40), 1));
    painter.drawEllipse(QRectF(x, track.top() + 2, knob, knob));
}

SettingsListSelectionToggleItem::SettingsListSelectionToggleItem(QWidget* parent)
    : FlickButton(parent)
{
    makeRow(this, SettingsRows::RowHeight, false);
    m_label = rowLabel(this, QRect(20, 0, 220, SettingsRows::RowHeight), Theme::FontHeadline, false,
                       Theme::TextBody);
    m_button = new SettingsToggleSwitch(this);
    m_button->setObjectName(QStringLiteral("BtnToggle"));
    m_button->setGeometry(244, 13, 60, 36);
    init();
}

void SettingsListSelectionToggleItem::init()
{
    connect(m_button, &QPushButton::clicked, this, &SettingsListSelectionToggleItem::checkedStateChanged);
}

QString SettingsListSelectionToggleItem::text() const
{
    return m_label->defaultText();
}

void SettingsListSelectionToggleItem::setText(const QString& text)
{
    m_label->setText(text);
}

void SettingsListSelectionToggleItem::setButtonChecked(bool checked)
{
    m_button->setChecked(checked);
}

bool SettingsListSelectionToggleItem::isChecked() const
{
    return m_button->isChecked();
}

void SettingsListSelectionToggleItem::setEnabled(bool enabled)
{
    m_button->setEnabled(enabled);
}

void SettingsListSelectionToggleItem::sendClick()
{
    if (m_button->isEnabled())
        m_button->click();
}

// ---------------------------------------------------------------- sub-menu

SettingsListSelectionSubMenuItem::SettingsListSelectionSubMenuItem(QWidget* parent)
    : FlickButton(parent)
{
    makeRow(this, SettingsRows::RowHeight, true);
    m_label = rowLabel(this, QRect(20, 0, 262, SettingsRows::RowHeight), Theme::FontHeadline, false,
                       Theme::TextBody);
    m_labelArrow = rowPicture(this, QRect(292, 19, 16, 24));
    m_labelArrow->setPixmap(SettingsRows::arrowPixmap());
}

void SettingsListSelectionSubMenuItem::setText(const QString& text)
{
    m_label->setText(text);
}

QString SettingsListSelectionSubMenuItem::getText() const
{
    return m_label->defaultText();
}

// ---------------------------------------------------------------- header

SettingsListSelectionHeader::SettingsListSelectionHeader(QWidget* parent)
    : FlickButton(parent)
{
    resize(Theme::ScreenWidth, SettingsRows::HeaderHeight);
    setBackground(QStringLiteral(":/Assets/listing_header.png"));
    m_label = rowLabel(this, QRect(16, 0, 288, SettingsRows::HeaderHeight), Theme::FontBody, true,
                       Theme::TextBody2);
}

void SettingsListSelectionHeader::setText(const QString& text)
{
    m_label->setText(text);
}

QString SettingsListSelectionHeader::getText() const
{
    return m_label->defaultText();
}

void SettingsListSelectionHeader::setAlignment(Qt::Alignment alignment)
{
    m_label->setAlignment(alignment);
}

// ---------------------------------------------------------------- progress

SettingsListSelectionProgressItem::SettingsListSelectionProgressItem(QWidget* parent, ValueType type)
    : QWidget(parent)
    , m_valueType(type)
{
    resize(Theme::ScreenWidth, SettingsRows::TallRowHeight);
    m_labelSummary = rowLabel(this, QRect(20, 8, 180, 30), Theme::FontHeadline, false, Theme::TextBody);
    m_labelValue = rowLabel(this, QRect(190, 8, 112, 30), Theme::FontBody, false, Theme::TextSecondary,
                            Qt::AlignRight | Qt::AlignVCenter);
}

void SettingsListSelectionProgressItem::setMinValue(int value)
{
    m_min = value;
    onUpdate();
}

void SettingsListSelectionProgressItem::setMaxValue(int value)
{
    m_max = value;
    onUpdate();
}

void SettingsListSelectionProgressItem::setValue(int value)
{
    m_value = value;
    onUpdate();
}

void SettingsListSelectionProgressItem::setSummaryText(const QString& text)
{
    m_labelSummary->setText(text);
}

QString SettingsListSelectionProgressItem::valueText() const
{
    if (m_valueType == ValuePercent) {
        const int span = m_max - m_min;
        const int percent = span > 0 ? qBound(0, (m_value - m_min) * 100 / span, 100) : 0;
        return tr("%1%").arg(percent);
    }
    return tr("%1 of %2").arg(m_value).arg(m_max);
}

void SettingsListSelectionProgressItem::onUpdate()
{
    m_labelValue->setText(valueText());
    update();
}

void SettingsListSelectionProgressItem::paintEvent(QPaintEvent*)
{
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.fillRect(rect(), Qt::white);
    const QRectF track(20, 48, width() - 40, 14);
    painter.setPen(Qt::NoPen);
    painter.setBrush(Theme::Separator);
    painter.drawRoundedRect(track, 7, 7);
    const int span = m_max - m_min;
    const qreal share = span > 0 ? qBound(0.0, qreal(m_value - m_min) / span, 1.0) : 0.0;
    if (share > 0) {
        // Nearly full reads as a warning.
        painter.setBrush(share >= 0.9 ? Theme::Fail : Theme::Accent);
        painter.drawRoundedRect(QRectF(track.left(), track.top(), qMax(14.0, track.width() * share),
                                       track.height()), 7, 7);
    }
    painter.fillRect(QRect(14, height() - 1, width() - 14, 1), Theme::Separator);
}

// ---------------------------------------------------------------- system info

SettingsListSelectionSystemInfo::SettingsListSelectionSystemInfo(QWidget* parent)
    : ClickableLabel(parent)
{
    setFixedWidth(Theme::ScreenWidth);
    setWordWrap(true);
    setTextFormat(Qt::RichText);
    setAlignment(Qt::AlignLeft | Qt::AlignTop);
    setMargin(0);
    setContentsMargins(16, 10, 12, 10);
    setFont(Theme::font(Theme::FontSmall));
    setStyleSheet(QStringLiteral("background-color: white; color: %1;").arg(Theme::css(Theme::TextBody)));
}

void SettingsListSelectionSystemInfo::setLines(const QList<QPair<QString, QString>>& lines)
{
    QString html = QStringLiteral("<table cellspacing='0' cellpadding='2'>");
    for (const auto& line : lines) {
        html += QStringLiteral("<tr><td style='color:%1; padding-right:8px'>%2</td><td><b>%3</b></td></tr>")
                    .arg(Theme::css(Theme::TextSecondary), line.first.toHtmlEscaped(),
                         line.second.toHtmlEscaped());
    }
    html += QStringLiteral("</table>");
    setText(html);
    resize(Theme::ScreenWidth, heightForWidth(Theme::ScreenWidth));
}

// ---------------------------------------------------------------- power info

SettingsListSelectionPowerInfo::SettingsListSelectionPowerInfo(QWidget* parent)
    : QWidget(parent)
{
    resize(Theme::ScreenWidth, 110);
    setAutoFillBackground(true);
    QPalette ground = palette();
    ground.setColor(QPalette::Window, Qt::white);
    setPalette(ground);
    m_label = rowLabel(this, QRect(20, 6, 284, 98), Theme::FontBody, false, Theme::TextBody,
                       Qt::AlignLeft | Qt::AlignVCenter);
    m_label->setAutoSize(false);
    m_label->setWordWrap(true);
    onUpdate();
}

QString SettingsListSelectionPowerInfo::beautifyTimeText(int seconds)
{
    if (seconds < 0)
        seconds = 0;
    const int hours = seconds / 3600;
    const int minutes = (seconds % 3600) / 60;
    const int rest = seconds % 60;
    QString text;
    if (hours == 1)
        text += tr("%1 hour ").arg(hours);
    else if (hours > 1)
        text += tr("%1 hours ").arg(hours);
    if (hours > 0 || minutes > 0)
        text += tr("%1 minutes and ").arg(minutes);
    text += tr("%1 seconds").arg(rest);
    return text;
}

QString SettingsListSelectionPowerInfo::text() const
{
    return m_label->text();
}

void SettingsListSelectionPowerInfo::onUpdate()
{
    // A stored 0 is a stage switched off.
    auto stage = [](int seconds) {
        return seconds > 0 ? beautifyTimeText(seconds) : tr("Never");
    };
    m_label->setText(tr("Display dims after: %1\nStandby after: %2\nPower off after: %3")
                         .arg(stage(UserParams::getPowerDisplayOffTime()),
                              stage(UserParams::getPowerStandbyTime()), stage(UserParams::getPowerOffTime())));
}
