#include "Widgets/SettingsPage.h"

#include "ui_SettingsPage.h"

#include "Widgets/FlickList.h"

#include <QFontMetrics>
#include <QPainter>
#include <QSignalMapper>

namespace {
// The visible part of the back button starts here in its own picture.
const int kTitleIconGap = 5;
} // namespace

SettingsPage::SettingsPage(QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::SettingsPage)
{
    construct(QString(), QString());
}

SettingsPage::SettingsPage(const QString& title, QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::SettingsPage)
{
    construct(title, QString());
}

SettingsPage::SettingsPage(const QString& title, const QString& icon, QWidget* parent)
    : MarigoldPanel(parent)
    , ui(new Ui::SettingsPage)
{
    construct(title, icon);
}

SettingsPage::~SettingsPage()
{
    delete ui;
}

void SettingsPage::construct(const QString& title, const QString& icon)
{
    ui->setupUi(this);
    ui->BtnBack->setIcon(backButtonIcon());
    // Colour by palette: a style sheet would undo the font the label fits.
    QPalette titlePalette = ui->labelSubHeader->palette();
    titlePalette.setColor(QPalette::WindowText, QColor(241, 242, 242));
    ui->labelSubHeader->setPalette(titlePalette);
    ui->labelSubHeader->setWordWrap(true);
    m_titleFont = ui->labelSubHeader->defaultFont();
    ui->labelSubHeader->setAutoSize(true);
    ui->SettingsList->setShadowsEnabled(true);
    m_signalMapper = new QSignalMapper(this);
    if (!title.isNull())
        setTitle(title);
    if (!icon.isEmpty())
        setIcon(icon);
    init();
}

void SettingsPage::init()
{
}

void SettingsPage::setTitle(const QString& title)
{
    // The object name keeps to the first line of a title set on two.
    QString name = title;
    name.replace('\n', ' ');
    name.remove(' ');
    name.remove('&');
    name.remove('/');
    setObjectName(QStringLiteral("Settings") + name + QStringLiteral("Page"));
    ui->labelSubHeader->setText(title);
    updateIconLocation();
}

QString SettingsPage::title() const
{
    return ui->labelSubHeader->defaultText();
}

void SettingsPage::setIcon(const QString& icon)
{
    const QPixmap pixmap(icon);
    ui->labelIcon->setPixmap(pixmap);
    ui->labelIcon->resize(pixmap.isNull() ? 0 : qMin(pixmap.width(), 40), ui->labelIcon->height());
    ui->labelIcon->setScaledContents(false);
    updateIconLocation();
}

QIcon SettingsPage::backButtonIcon(const QString& mark)
{
    QImage canvas(QStringLiteral(":/Assets/back_button.png"));
    if (canvas.isNull())
        return QIcon();
    canvas = canvas.convertToFormat(QImage::Format_ARGB32);
    QPainter painter(&canvas);
    painter.setCompositionMode(QPainter::CompositionMode_Clear);
    painter.fillRect(QRect(canvas.width() - 3, 0, 3, canvas.height()), Qt::transparent);
    painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
    const QPixmap picture(mark);
    if (!picture.isNull())
        painter.drawPixmap(78, (canvas.height() - picture.height()) / 2, picture);
    painter.end();
    return QIcon(QPixmap::fromImage(canvas));
}

void SettingsPage::setBackIcon(const QString& icon)
{
    ui->BtnBack->setIcon(backButtonIcon(icon));
}

void SettingsPage::setBackButtonVisible(bool visible)
{
    ui->BtnBack->setVisible(visible);
    ui->BtnBack->setEnabled(visible);
}

FlickList* SettingsPage::getSettingsList() const
{
    return ui->SettingsList;
}

void SettingsPage::gotoNextPage(SettingsPage* page)
{
    emit nextPage(page);
}

void SettingsPage::setEnabled(bool enabled)
{
    // The page itself stays enabled, so that it keeps painting normally while
    // it slides away.
    ui->BtnBack->setEnabled(enabled && ui->BtnBack->isVisible());
    ui->SettingsList->setEnabled(enabled);
}

void SettingsPage::onUpdatePage()
{
}

void SettingsPage::updateIconLocation()
{
    // The icon stands left of the centred title, and the two move together
    // as one group; a title too long for the bar with its icon shrinks.
    const QPixmap* icon = ui->labelIcon->pixmap();
    const bool hasIcon = icon && !icon->isNull();
    const int left = 62;
    const int right = 310;
    int textWidth = 0;
    const QFontMetrics metrics(ui->labelSubHeader->defaultFont());
    for (const QString& line : ui->labelSubHeader->defaultText().split('\n'))
        textWidth = qMax(textWidth, metrics.horizontalAdvance(line));
    textWidth += 10;
    if (!hasIcon) {
        ui->labelSubHeader->setGeometry(left, 0, 198, ui->labelSubHeader->height());
        fitTitleFont(198);
        ui->labelSubHeader->setText(ui->labelSubHeader->defaultText());
        return;
    }
    const int iconWidth = ui->labelIcon->width();
    textWidth = qMin(textWidth, right - left - iconWidth - kTitleIconGap);
    const int groupWidth = iconWidth + kTitleIconGap + textWidth;
    const int x = qBound(left, width() > 0 ? 160 - groupWidth / 2 : left, right - groupWidth);
    ui->labelIcon->move(x, ui->labelIcon->y());
    ui->labelSubHeader->setGeometry(x + iconWidth + kTitleIconGap, 0, textWidth, ui->labelSubHeader->height());
    fitTitleFont(textWidth);
    ui->labelSubHeader->setText(ui->labelSubHeader->defaultText());
}

void SettingsPage::fitTitleFont(int boxWidth)
{
    // A single long word (a German compound) cannot wrap: it shrinks.
    QFont font = m_titleFont;
    const QStringList lines = ui->labelSubHeader->defaultText().split('\n');
    auto widest = [&lines](const QFont& f) {
        int w = 0;
        for (const QString& line : lines) {
            for (const QString& word : line.split(' '))
                w = qMax(w, QFontMetrics(f).horizontalAdvance(word));
        }
        return w;
    };
    while (font.pointSize() > 9 && widest(font) > boxWidth - 6)
        font.setPointSize(font.pointSize() - 1);
    ui->labelSubHeader->setFont(font);
}

void SettingsPage::onGotoScreen(SCREEN_ID_T id)
{
    emit GotoScreen(id);
}

void SettingsPage::on_BtnBack_clicked()
{
    playSoundButtonClick();
    emit previousPage();
}

void SettingsPage::clearSignalMapper()
{
    delete m_signalMapper;
    m_signalMapper = nullptr;
}

void SettingsPage::refreshSignalMapper()
{
    clearSignalMapper();
    m_signalMapper = new QSignalMapper(this);
}

void SettingsPage::clearList()
{
    FlickList* list = ui->SettingsList;
    while (list->count() > 0) {
        QListWidgetItem* item = list->item(0);
        QWidget* row = list->itemWidget(item);
        list->removeItemWidget(item);
        delete list->takeItem(0);
        if (row) {
            // Deletion waits for the event loop, which a wait below this
            // one does not run: out of sight at once.
            row->hide();
            row->deleteLater();
        }
    }
}

void SettingsPage::resizeEvent(QResizeEvent* event)
{
    MarigoldPanel::resizeEvent(event);
    // The list fills whatever height the navigator gives the page.
    const int below = qMax(0, height() - ui->SettingsList->y());
    ui->SettingsList->resize(ui->SettingsList->width(), below);
    ui->labelBackground->resize(ui->labelBackground->width(), below);
    ui->labelShadow->resize(ui->labelShadow->width(), below);
}
