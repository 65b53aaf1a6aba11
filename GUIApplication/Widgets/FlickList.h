#ifndef FLICKLIST_H
#define FLICKLIST_H

#include <QListWidget>
#include <QPixmap>

#include <functional>

class QLabel;
class QsKineticScroller;

namespace Ui {
struct FlickList
{
    QLabel* labelShadowTop = nullptr;
    QLabel* labelShadowBottom = nullptr;
    QLabel* labelBackground = nullptr;
    void setupUi(QListWidget* list);
};
} // namespace Ui

// The list of every screen: rows are widgets, dragged with the finger and
// gliding after a flick. Edge shadows fade in as rows leave the view so the
// user sees there is more above or below.
class FlickList : public QListWidget
{
    Q_OBJECT
public:
    explicit FlickList(QWidget* parent = nullptr);
    ~FlickList() override;

    void addWidget(QWidget* widget);
    void appendWidget(QWidget* widget);
    void prependWidget(QWidget* widget);
    // An index above the row count appends.
    void insertWidget(QWidget* widget, int index);
    // Null at or past the count, and for a deferred row not yet made.
    QWidget* getWidget(int index) const;

    // Rows whose widgets are made only when they come near the view, so that
    // a list of hundreds is quick to build and light to keep. The factory
    // gets the row number and returns the row's widget (the list owns it).
    using RowFactory = std::function<QWidget*(int row)>;
    void setRowFactory(RowFactory factory);
    void addDeferredRow(const QSize& size);
    // The row's widget, made now if it was deferred; null past the count.
    QWidget* makeRow(int row);
    int madeRowCount() const;

    void setScrollingDirection(Qt::Orientation direction);
    void setBackgroundStyleSheet(const QString& sheet);
    void setShadowsEnabled(bool enabled);

    QsKineticScroller* scroller() const { return kineticScroller; }
    // The opacities last given to the shadows, 0 to 1.
    qreal topShadowOpacity() const { return m_topOpacity; }
    qreal bottomShadowOpacity() const { return m_bottomOpacity; }

    static QString verticalScrollBarStyle();
    static QString horizontalScrollBarStyle();

public slots:
    virtual void setShadowOpacity(qreal opacity, QLabel* label, QPixmap pixmap);
    virtual void setTopShadowOpacity(qreal opacity);
    virtual void setBottomShadowOpacity(qreal opacity);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void scrollContentsBy(int dx, int dy) override;
    void updateGeometries() override;

private:
    QListWidgetItem* makeItem(QWidget* widget);
    void updateShadows();
    // Where a row is, whether or not its widget exists yet.
    QRect rowGeometry(int row) const;
    void makeRowsNearView();

    Ui::FlickList* ui;
    QsKineticScroller* kineticScroller;
    Qt::Orientation m_orientation = Qt::Vertical;
    int m_previousFirstWidgetTop = 1;
    int m_previousLastWidgetBottom = -1;
    bool m_showShadow = true;
    qreal m_topOpacity = 0.0;
    qreal m_bottomOpacity = 0.0;
    RowFactory m_rowFactory;
    bool m_makingRows = false;
};

#endif // FLICKLIST_H
