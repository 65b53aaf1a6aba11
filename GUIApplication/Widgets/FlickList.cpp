#include "Widgets/FlickList.h"

#include "Widgets/QsKineticScroller.h"

#include <QLabel>
#include <QPainter>
#include <QResizeEvent>
#include <QScrollBar>
#include <QStyle>

namespace {

const int kShadowHeight = 15;
const int kScrollBarWidth = 5;
const char* const kTopShadow = ":/Assets/shadow_top.png";
const char* const kBottomShadow = ":/Assets/shadow_bottom.png";

} // namespace

void Ui::FlickList::setupUi(QListWidget* list)
{
    labelBackground = new QLabel(list);
    labelBackground->setObjectName("labelBackground");
    labelBackground->setAttribute(Qt::WA_TransparentForMouseEvents);

    labelShadowTop = new QLabel(list);
    labelShadowTop->setObjectName("labelShadowTop");
    labelShadowTop->setGeometry(0, 0, 320, kShadowHeight);
    labelShadowTop->setPixmap(QPixmap(kTopShadow));
    labelShadowTop->setScaledContents(true);
    labelShadowTop->setAttribute(Qt::WA_TransparentForMouseEvents);

    labelShadowBottom = new QLabel(list);
    labelShadowBottom->setObjectName("labelShadowBottom");
    labelShadowBottom->setGeometry(0, 465, 320, kShadowHeight);
    labelShadowBottom->setPixmap(QPixmap(kBottomShadow));
    labelShadowBottom->setScaledContents(true);
    labelShadowBottom->setAttribute(Qt::WA_TransparentForMouseEvents);
}

QString FlickList::verticalScrollBarStyle()
{
    return QString("QScrollBar:vertical {background: #414042;width: %1px; min-width: %2px;}"
                   "QScrollBar::handle:vertical {background: #BCBEC0; min-height: 20px}"
                   "QScrollBar::add-page:vertical, QScrollBar::sub-page:vertical {background: none;}"
                   "QScrollBar::add-line:vertical, QScrollBar::sub-line:vertical {width: 0px; height: 0px;}")
        .arg(kScrollBarWidth)
        .arg(kScrollBarWidth);
}

QString FlickList::horizontalScrollBarStyle()
{
    return QString("QScrollBar:horizontal {background: #414042;height: %1px; min-height: %2px;}"
                   "QScrollBar::handle:horizontal {background: #BCBEC0; min-width: 20px}"
                   "QScrollBar::add-page:horizontal, QScrollBar::sub-page:horizontal {background: none;}"
                   "QScrollBar::add-line:horizontal, QScrollBar::sub-line:horizontal {width: 0px; height: 0px;}")
        .arg(kScrollBarWidth)
        .arg(kScrollBarWidth);
}

FlickList::FlickList(QWidget* parent)
    : QListWidget(parent)
    , ui(new Ui::FlickList)
    , kineticScroller(new QsKineticScroller(nullptr, Qt::Vertical))
{
    ui->setupUi(this);
    setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    setFrameShape(QFrame::NoFrame);
    setLineWidth(0);
    setAttribute(Qt::WA_NoSystemBackground);
    setFocusPolicy(Qt::NoFocus);
    // The rows are widgets that draw their own pressed state; the list itself
    // draws nothing but the ground label behind them.
    setStyleSheet("QListWidget { background: transparent; border: none; }"
                  "QListWidget::item { border: none; padding: 0px; }"
                  "QListWidget::item:selected, QListWidget::item:hover { background: transparent; }");
    viewport()->setAutoFillBackground(false);
    verticalScrollBar()->setStyleSheet(verticalScrollBarStyle());
    horizontalScrollBar()->setStyleSheet(horizontalScrollBarStyle());

    kineticScroller->enableKineticScrollFor(this);
    setScrollingDirection(Qt::Vertical);
    setTopShadowOpacity(0.0);
    setBottomShadowOpacity(0.0);
}

FlickList::~FlickList()
{
    delete kineticScroller;
    delete ui;
}

QListWidgetItem* FlickList::makeItem(QWidget* widget)
{
    auto* item = new QListWidgetItem;
    item->setSizeHint(widget->size());
    return item;
}

void FlickList::addWidget(QWidget* widget)
{
    QListWidgetItem* item = makeItem(widget);
    addItem(item);
    setItemWidget(item, widget);
}

void FlickList::appendWidget(QWidget* widget)
{
    addWidget(widget);
}

void FlickList::prependWidget(QWidget* widget)
{
    QListWidgetItem* item = makeItem(widget);
    insertItem(0, item);
    setItemWidget(item, widget);
}

void FlickList::insertWidget(QWidget* widget, int index)
{
    if (index > count()) {
        appendWidget(widget);
        return;
    }
    QListWidgetItem* item = makeItem(widget);
    insertItem(qMax(0, index), item);
    setItemWidget(item, widget);
}

QWidget* FlickList::getWidget(int index) const
{
    if (index < 0 || index >= count())
        return nullptr;
    return itemWidget(item(index));
}

void FlickList::setRowFactory(RowFactory factory)
{
    m_rowFactory = std::move(factory);
}

void FlickList::addDeferredRow(const QSize& size)
{
    auto* item = new QListWidgetItem;
    item->setSizeHint(size);
    addItem(item);
}

QWidget* FlickList::makeRow(int row)
{
    if (row < 0 || row >= count())
        return nullptr;
    QListWidgetItem* it = item(row);
    if (QWidget* made = itemWidget(it))
        return made;
    if (!m_rowFactory)
        return nullptr;
    QWidget* widget = m_rowFactory(row);
    if (widget)
        setItemWidget(it, widget);
    return widget;
}

int FlickList::madeRowCount() const
{
    int made = 0;
    for (int row = 0; row < count(); ++row)
        made += itemWidget(item(row)) ? 1 : 0;
    return made;
}

void FlickList::makeRowsNearView()
{
    if (!m_rowFactory || m_makingRows || !isVisible())
        return;
    m_makingRows = true;
    // A screen's worth either side, so that a flick finds its rows made.
    const QRect view = viewport()->rect();
    const QRect near = m_orientation == Qt::Vertical ? view.adjusted(0, -view.height(), 0, view.height())
                                                     : view.adjusted(-view.width(), 0, view.width(), 0);
    for (int row = 0; row < count(); ++row) {
        QListWidgetItem* it = item(row);
        if (itemWidget(it))
            continue;
        const QRect r = visualItemRect(it);
        if (!r.isEmpty() && r.intersects(near))
            makeRow(row);
    }
    m_makingRows = false;
}

void FlickList::showEvent(QShowEvent* event)
{
    QListWidget::showEvent(event);
    makeRowsNearView();
}

void FlickList::scrollContentsBy(int dx, int dy)
{
    QListWidget::scrollContentsBy(dx, dy);
    makeRowsNearView();
}

void FlickList::updateGeometries()
{
    QListWidget::updateGeometries();
    makeRowsNearView();
}

QRect FlickList::rowGeometry(int row) const
{
    if (QWidget* widget = getWidget(row))
        return widget->geometry();
    return visualItemRect(item(row));
}

void FlickList::setScrollingDirection(Qt::Orientation direction)
{
    m_orientation = direction;
    if (direction == Qt::Vertical) {
        setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
        setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        setFlow(QListView::TopToBottom);
        ui->labelShadowTop->show();
        ui->labelShadowBottom->show();
    } else {
        setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        setHorizontalScrollBarPolicy(Qt::ScrollBarAsNeeded);
        setFlow(QListView::LeftToRight);
        ui->labelShadowTop->hide();
        ui->labelShadowBottom->hide();
    }
    kineticScroller->setOrientation(direction);
}

void FlickList::setBackgroundStyleSheet(const QString& sheet)
{
    ui->labelBackground->setStyleSheet(sheet);
    ui->labelBackground->style()->unpolish(ui->labelBackground);
    ui->labelBackground->style()->polish(ui->labelBackground);
}

void FlickList::setShadowsEnabled(bool enabled)
{
    m_showShadow = enabled;
    if (!enabled) {
        setTopShadowOpacity(0.0);
        setBottomShadowOpacity(0.0);
    }
}

void FlickList::setShadowOpacity(qreal opacity, QLabel* label, QPixmap pixmap)
{
    if (!label)
        return;
    QSize size = label->pixmap(Qt::ReturnByValue).size();
    if (size.isEmpty())
        size = pixmap.size();
    QPixmap faded(size);
    faded.fill(Qt::transparent);
    QPainter painter(&faded);
    painter.setOpacity(qBound<qreal>(0.0, opacity, 1.0));
    painter.drawPixmap(QRect(QPoint(0, 0), size), pixmap);
    painter.end();
    label->setPixmap(faded);
}

void FlickList::setTopShadowOpacity(qreal opacity)
{
    m_topOpacity = qBound<qreal>(0.0, opacity, 1.0);
    setShadowOpacity(opacity, ui->labelShadowTop, QPixmap(kTopShadow));
}

void FlickList::setBottomShadowOpacity(qreal opacity)
{
    m_bottomOpacity = qBound<qreal>(0.0, opacity, 1.0);
    setShadowOpacity(opacity, ui->labelShadowBottom, QPixmap(kBottomShadow));
}

void FlickList::paintEvent(QPaintEvent* event)
{
    QListWidget::paintEvent(event);
    updateShadows();
}

void FlickList::updateShadows()
{
    if (count() == 0 || !m_showShadow)
        return;
    const QRect f = rowGeometry(0);
    const QRect l = rowGeometry(count() - 1);
    // Each change rebuilds a pixmap: only when the ends have moved.
    if (f.top() == m_previousFirstWidgetTop && l.bottom() == m_previousLastWidgetBottom)
        return;
    m_previousFirstWidgetTop = f.top();
    m_previousLastWidgetBottom = l.bottom();

    qreal top = 1.0;
    if (f.top() < 0 && f.top() > -f.height())
        top = f.height() > 0 ? qreal(-f.top()) / f.height() : 1.0;
    else if (f.top() > -f.height())
        top = 0.0;
    setTopShadowOpacity(top);

    const int h = height();
    qreal bottom = 1.0;
    if (l.bottom() < h + l.height() && l.top() < h)
        bottom = l.height() > 0 ? qreal(l.bottom() - h) / l.height() : 0.0;
    else if (l.top() < h)
        bottom = 0.0;
    setBottomShadowOpacity(bottom);
}

void FlickList::resizeEvent(QResizeEvent* event)
{
    QListWidget::resizeEvent(event);
    ui->labelBackground->setGeometry(rect());
    ui->labelBackground->lower();
    ui->labelShadowTop->setGeometry(0, 0, width(), ui->labelShadowTop->height());
    ui->labelShadowBottom->setGeometry(0, height() - ui->labelShadowBottom->height(), width(),
                                       ui->labelShadowBottom->height());
    ui->labelShadowTop->raise();
    ui->labelShadowBottom->raise();
}
