// Swiped pages: when the finger takes the gesture, where the pages snap,
// the wrap of the arrows, the dots, and the index faults.

#include "Widgets/BottomDotsPageContainer.h"
#include "Widgets/HorizontalPageContainer.h"
#include "Widgets/VerticalPageContainer.h"

#include <QApplication>
#include <QMouseEvent>
#include <QSignalSpy>
#include <QtTest>

namespace {

QWidget* makePage(int w, int h)
{
    QWidget* page = new QWidget;
    page->resize(w, h);
    return page;
}

void press(QWidget* w, QPoint p)
{
    QMouseEvent e(QEvent::MouseButtonPress, p, w->mapToGlobal(p), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(w, &e);
}

void move(QWidget* w, QPoint p)
{
    QMouseEvent e(QEvent::MouseMove, p, w->mapToGlobal(p), Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
    QApplication::sendEvent(w, &e);
}

void release(QWidget* w, QPoint p)
{
    QMouseEvent e(QEvent::MouseButtonRelease, p, w->mapToGlobal(p), Qt::LeftButton, Qt::NoButton, Qt::NoModifier);
    QApplication::sendEvent(w, &e);
}

QWidget* viewportOf(QWidget* container)
{
    return container->findChild<QWidget*>(QStringLiteral("viewport"), Qt::FindDirectChildrenOnly);
}

// The containers work in their parent's coordinates, as they stand on a
// screen: give them one, with the container at its top left.
QWidget* host()
{
    static QWidget* screen = [] {
        QWidget* w = new QWidget;
        w->resize(320, 480);
        w->show();
        return w;
    }();
    return screen;
}

template <class C>
void fill(C& container, int pages, int w = 320, int h = 400)
{
    container.resize(320, 400);
    container.show();
    for (int i = 0; i < pages; ++i)
        container.appendPage(makePage(w, h));
}

bool throwsTwo(const std::function<void()>& f)
{
    try {
        f();
    } catch (unsigned int code) {
        return code == 2;
    }
    return false;
}

} // namespace

class tst_PageContainer : public QObject
{
    Q_OBJECT
private slots:
    void pagesLieSideBySide();
    void narrowPageIsCentred();
    void diagonalIsNotTaken();
    void otherAxisFirstDoesNotBlock();
    void dragAtFirstPageClamps();
    void dragPastHalfTurnsThePage();
    void dragAtLastPageClampsAndStays();
    void arrowsWrapAround();
    void badIndexThrowsTwo();
    void emptyContainerIgnoresGestures();
    void verticalPagesFlipUpward();
    void dotsAreCentredOnTheBar();
};

void tst_PageContainer::pagesLieSideBySide()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    QCOMPARE(c.getNumberOfPages(), 3);
    QCOMPARE(c.determinePagePosition(2), QRect(640, 0, 320, 400));
    // The right edge counts as the last pixel column of the last page.
    QCOMPARE(viewportOf(&c)->geometry(), QRect(0, 0, 959, 400));
}

void tst_PageContainer::narrowPageIsCentred()
{
    HorizontalPageContainer c(host());
    fill(c, 2, 280, 400);
    QCOMPARE(viewportOf(&c)->x(), 20);
    QCOMPARE(c.distanceLeftToSlide(), 0);
    c.onSelectPage(1);
    QTRY_COMPARE(viewportOf(&c)->x(), 20 - 280);
}

void tst_PageContainer::diagonalIsNotTaken()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    QWidget* view = viewportOf(&c);
    press(&c, QPoint(200, 100));
    move(&c, QPoint(180, 120)); // |dx| == |dy|
    QCOMPARE(view->x(), 0);
    move(&c, QPoint(190, 110)); // along the axis, but under 15 pixels
    QCOMPARE(view->x(), 0);
    release(&c, QPoint(190, 110));
    QCOMPARE(c.getCurrentPage(), 0);
}

void tst_PageContainer::otherAxisFirstDoesNotBlock()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    QWidget* view = viewportOf(&c);
    press(&c, QPoint(200, 100));
    move(&c, QPoint(200, 140)); // vertical first: not taken
    QCOMPARE(view->x(), 0);
    move(&c, QPoint(150, 110)); // now mainly horizontal, applied in full
    QCOMPARE(view->x(), -50);
    QSignalSpy changed(&c, &PageContainer::changedPages);
    release(&c, QPoint(150, 110));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(changed.first().first().toInt(), 0); // not past half: snaps back
    QTRY_COMPARE(view->x(), 0);
}

void tst_PageContainer::dragAtFirstPageClamps()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    QWidget* view = viewportOf(&c);
    press(&c, QPoint(20, 100));
    move(&c, QPoint(250, 100));
    QCOMPARE(view->x(), 0);
    move(&c, QPoint(300, 100));
    QCOMPARE(view->x(), 0);
    release(&c, QPoint(300, 100));
    QCOMPARE(c.getCurrentPage(), 0);
}

void tst_PageContainer::dragPastHalfTurnsThePage()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    QWidget* view = viewportOf(&c);
    QSignalSpy changed(&c, &PageContainer::changedPages);
    press(&c, QPoint(300, 100));
    move(&c, QPoint(100, 100));
    QCOMPARE(view->x(), -200);
    release(&c, QPoint(100, 100));
    QCOMPARE(c.getCurrentPage(), 1);
    QCOMPARE(changed.count(), 1);
    QTRY_COMPARE(view->x(), -320);
}

void tst_PageContainer::dragAtLastPageClampsAndStays()
{
    HorizontalPageContainer c(host());
    fill(c, 2);
    QWidget* view = viewportOf(&c);
    c.onSelectPage(1);
    QTRY_COMPARE(view->x(), -320);
    press(&c, QPoint(300, 100));
    move(&c, QPoint(20, 100));
    QCOMPARE(view->x(), -320); // the clamp keeps the last page's centre inside
    release(&c, QPoint(20, 100));
    QCOMPARE(c.getCurrentPage(), 1);
}

void tst_PageContainer::arrowsWrapAround()
{
    HorizontalPageContainer c(host());
    fill(c, 3);
    c.onGotoLeftPage();
    QCOMPARE(c.getCurrentPage(), 2);
    c.onGotoRightPage();
    QCOMPARE(c.getCurrentPage(), 0);
    c.onGotoRightPage();
    QCOMPARE(c.getCurrentPage(), 1);

    HorizontalPageContainer single(host());
    fill(single, 1);
    QSignalSpy changed(&single, &PageContainer::changedPages);
    single.onGotoRightPage();
    single.onGotoLeftPage();
    QCOMPARE(single.getCurrentPage(), 0);
    QCOMPARE(changed.count(), 2);
}

void tst_PageContainer::badIndexThrowsTwo()
{
    BottomDotsPageContainer c(host());
    fill(c, 3);
    QVERIFY(throwsTwo([&] { c.onSelectPage(3); }));
    QVERIFY(throwsTwo([&] { c.onSelectPage(-1); }));
    QVERIFY(throwsTwo([&] { c.removePage(3); }));
    QVERIFY(throwsTwo([&] { c.updatePagePosition(7); }));
    QVERIFY(throwsTwo([&] { c.determinePagePosition(-1); }));
    QVERIFY(throwsTwo([&] { c.removeDot(3); }));
    QWidget* stray = makePage(320, 400);
    QVERIFY(throwsTwo([&] { c.insertPage(stray, 4); }));
    delete stray;
    QCOMPARE(c.getCurrentPage(), 0);
    QCOMPARE(c.getNumberOfPages(), 3);

    // Inserting at the count is an append.
    c.insertPage(makePage(320, 400), 3);
    QCOMPARE(c.getNumberOfPages(), 4);

    // Removing the page in view leaves the index past the end: the next
    // snap finds no page there.
    c.onSelectPage(3);
    c.removePage(3);
    QCOMPARE(c.getCurrentPage(), 3);
    QVERIFY(throwsTwo([&] { c.distanceLeftToSlide(); }));
    c.resize(320, 410); // a resize must not fall over it
}

void tst_PageContainer::emptyContainerIgnoresGestures()
{
    HorizontalPageContainer c(host());
    c.resize(320, 400);
    c.show();
    const QRect before = viewportOf(&c)->geometry();
    press(&c, QPoint(300, 100));
    move(&c, QPoint(100, 100));
    c.updateViewportSize();
    QCOMPARE(viewportOf(&c)->geometry(), before);
    release(&c, QPoint(100, 100));
    QCOMPARE(c.getCurrentPage(), 0);
}

void tst_PageContainer::verticalPagesFlipUpward()
{
    VerticalPageContainer c(host());
    fill(c, 3);
    QWidget* view = viewportOf(&c);
    QCOMPARE(c.determinePagePosition(1), QRect(0, 400, 320, 400));
    press(&c, QPoint(100, 350));
    move(&c, QPoint(120, 300)); // mainly vertical, 50 up
    QCOMPARE(view->y(), -50);
    move(&c, QPoint(100, 100));
    QCOMPARE(view->y(), -250);
    release(&c, QPoint(100, 100));
    QCOMPARE(c.getCurrentPage(), 1);
    QTRY_COMPARE(view->y(), -400);
}

void tst_PageContainer::dotsAreCentredOnTheBar()
{
    BottomDotsPageContainer c(host());
    c.show();
    QCOMPARE(c.pageBar()->geometry(), QRect(0, 395, 320, 19));
    QVERIFY(c.pageDots().empty());

    c.appendPage(makePage(320, 395));
    c.appendPage(makePage(320, 395));
    QCOMPARE(c.pageDots().size(), size_t(2));
    const int dot = c.pageDots()[0]->width();
    // Two dots: 5 apart, the gap on the middle of the bar.
    const int left = c.pageDots()[0]->x();
    QCOMPARE(c.pageDots()[1]->x(), left + dot + 5);
    QVERIFY(qAbs((left + c.pageDots()[1]->geometry().right()) / 2 - 160) <= 1);
    QCOMPARE(c.pageDots()[0]->y() + dot / 2, 395 + 19 / 2);

    c.appendPage(makePage(320, 395));
    QCOMPARE(c.pageDots().size(), size_t(3));
    // Three dots: the middle one on the middle of the bar.
    QVERIFY(qAbs(c.pageDots()[1]->geometry().center().x() - 160) <= 1);

    // The filled dot follows the page in view.
    const QImage open = c.pageDots()[2]->pixmap(Qt::ReturnByValue).toImage();
    c.onSelectPage(2);
    QCOMPARE(c.pageDots().size(), size_t(3));
    QCOMPARE(c.pageDots()[0]->pixmap(Qt::ReturnByValue).toImage(), open);
    QVERIFY(c.pageDots()[2]->pixmap(Qt::ReturnByValue).toImage() != open);

    c.removeDot(0);
    QCOMPARE(c.pageDots().size(), size_t(2));
}

QTEST_MAIN(tst_PageContainer)
#include "tst_pagecontainer.moc"
