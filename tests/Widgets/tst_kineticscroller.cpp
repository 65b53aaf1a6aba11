// The kinetic scroller's state machine, the flick list and its row button.
// Mouse events are sent straight to the widgets so each step of the state
// machine is seen; the timer tick is called by hand with the cursor placed
// where the finger would be.

#include "Widgets/FlickButton.h"
#include "Widgets/FlickList.h"
#include "Widgets/QsKineticScroller.h"

#include <QApplication>
#include <QComboBox>
#include <QCursor>
#include <QLineEdit>
#include <QScrollArea>
#include <QScrollBar>
#include <QSignalSpy>
#include <QVBoxLayout>
#include <QtTest>

namespace {

// Counts what reaches a widget after the scroller's filter.
class EventCounter : public QObject
{
public:
    int presses = 0;
    int releases = 0;
    bool eventFilter(QObject*, QEvent* event) override
    {
        if (event->type() == QEvent::MouseButtonPress)
            ++presses;
        else if (event->type() == QEvent::MouseButtonRelease)
            ++releases;
        return false;
    }
};

// The application consumes input-panel requests before any filter sees
// them, so they are counted where they enter.
class SpyApplication : public QApplication
{
public:
    using QApplication::QApplication;
    QList<QObject*> inputPanelRequests;
    bool notify(QObject* receiver, QEvent* event) override
    {
        if (event->type() == QEvent::RequestSoftwareInputPanel)
            inputPanelRequests << receiver;
        return QApplication::notify(receiver, event);
    }
};

SpyApplication* spyApp()
{
    return static_cast<SpyApplication*>(qApp);
}

void sendMouse(QWidget* target, QEvent::Type type, const QPoint& pos)
{
    const Qt::MouseButtons buttons = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent event(type, pos, target->mapToGlobal(pos), button, buttons, Qt::NoModifier);
    QApplication::sendEvent(target, &event);
}

// The finger as the tick sees it; far to the side so that no window gets a
// synthetic move from it.
void placeFinger(int globalY)
{
    QCursor::setPos(5000, globalY);
}

} // namespace

class TestKineticScroller : public QObject
{
    Q_OBJECT

private:
    // 40 rows of 85 pixels in a 300 pixel high list.
    static FlickList* makeList(QWidget* parent, QList<FlickButton*>* rows = nullptr)
    {
        auto* list = new FlickList(parent);
        list->setGeometry(0, 0, 320, 300);
        for (int i = 0; i < 40; ++i) {
            auto* row = new FlickButton;
            row->resize(320, 85);
            row->setBackground(":/Assets/cell_85px.png");
            row->setPressedBackground(":/Assets/cell_85px_hit.png");
            list->addWidget(row);
            if (rows)
                rows->append(row);
        }
        return list;
    }

    // Press and three moves down by 10 pixels each: the third starts the drag.
    static QPoint startDrag(FlickList* list)
    {
        QWidget* vp = list->viewport();
        const QPoint at(100, 100);
        sendMouse(vp, QEvent::MouseButtonPress, at);
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 10));
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 20));
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 30));
        return at + QPoint(0, 30);
    }

private slots:
    void movesAreAbsorbedUntilTheThirdAndTheContentFollowsThePress()
    {
        QWidget window;
        window.resize(320, 300);
        FlickList* list = makeList(&window);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QsKineticScroller* scroller = list->scroller();
        list->verticalScrollBar()->setValue(1500);

        QWidget* vp = list->viewport();
        const QPoint at(100, 100);
        sendMouse(vp, QEvent::MouseButtonPress, at);
        QVERIFY(scroller->isPressed());
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 10));
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 20));
        QVERIFY(!scroller->isMoving());
        QCOMPARE(list->verticalScrollBar()->value(), 1500);
        QVERIFY(!scroller->isTimerActive());

        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 30));
        QVERIFY(scroller->isMoving());
        QVERIFY(scroller->isTimerActive());
        // The drag started; the next move catches up with the distance from the press.
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 45));
        QCOMPARE(list->verticalScrollBar()->value(), 1500 - 45);

        sendMouse(vp, QEvent::MouseButtonRelease, at + QPoint(0, 45));
        QVERIFY(!scroller->isPressed());
        QVERIFY(scroller->isMoving()); // gliding
    }

    void glideAtTopSpeedLasts145msAnd435Pixels()
    {
        QWidget window;
        window.resize(320, 300);
        FlickList* list = makeList(&window);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QsKineticScroller* scroller = list->scroller();
        list->verticalScrollBar()->setValue(1500);

        const QPoint last = startDrag(list);
        const int lastGlobalY = list->viewport()->mapToGlobal(last).y();
        QCOMPARE(list->verticalScrollBar()->value(), 1500);

        // A fast finger: 45 pixels in one tick. Free while the finger is down.
        placeFinger(lastGlobalY + 45);
        scroller->onKineticTimerElapsed();
        QCOMPARE(scroller->velocity(), 45);
        QCOMPARE(list->verticalScrollBar()->value(), 1500); // the tick only measures

        sendMouse(list->viewport(), QEvent::MouseButtonRelease, last);
        // Clamped to 30 at the release, then one pixel less each tick: 29
        // ticks of motion, and the tick that finds the speed spent stops it.
        int movingTicks = 0;
        int ticks = 0;
        while (scroller->isMoving() && ticks < 1000) {
            const int before = list->verticalScrollBar()->value();
            scroller->onKineticTimerElapsed();
            ++ticks;
            if (list->verticalScrollBar()->value() != before)
                ++movingTicks;
        }
        QCOMPARE(movingTicks, 29);
        QCOMPARE(movingTicks * QsKineticScroller::gTimerInterval, 145);
        QCOMPARE(ticks, 30);
        QCOMPARE(list->verticalScrollBar()->value(), 1500 - 435);
        QVERIFY(!scroller->isTimerActive());
        QCOMPARE(scroller->velocity(), 0);
    }

    void slowReleasesStopInTheFirstTick_data()
    {
        QTest::addColumn<int>("velocity");
        QTest::newRow("still finger") << 0;
        QTest::newRow("one pixel") << 1;
        QTest::newRow("one pixel up") << -1;
    }

    void slowReleasesStopInTheFirstTick()
    {
        QFETCH(int, velocity);
        QWidget window;
        window.resize(320, 300);
        FlickList* list = makeList(&window);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QsKineticScroller* scroller = list->scroller();
        list->verticalScrollBar()->setValue(800);

        const QPoint last = startDrag(list);
        placeFinger(list->viewport()->mapToGlobal(last).y() + velocity);
        scroller->onKineticTimerElapsed();
        QCOMPARE(scroller->velocity(), velocity);
        sendMouse(list->viewport(), QEvent::MouseButtonRelease, last);

        scroller->onKineticTimerElapsed();
        QVERIFY(!scroller->isMoving());
        QVERIFY(!scroller->isTimerActive());
        QCOMPARE(list->verticalScrollBar()->value(), 800);
    }

    void aPressStopsAGlideAndSelectsNothing()
    {
        QWidget window;
        window.resize(320, 300);
        QList<FlickButton*> rows;
        FlickList* list = makeList(&window, &rows);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QsKineticScroller* scroller = list->scroller();
        list->verticalScrollBar()->setValue(800);
        QSignalSpy itemClicks(list, &QListWidget::itemClicked);

        const QPoint last = startDrag(list);
        placeFinger(list->viewport()->mapToGlobal(last).y() + 20);
        scroller->onKineticTimerElapsed();
        sendMouse(list->viewport(), QEvent::MouseButtonRelease, last);
        scroller->onKineticTimerElapsed();
        QVERIFY(scroller->isMoving());

        sendMouse(list->viewport(), QEvent::MouseButtonPress, QPoint(50, 50));
        QVERIFY(!scroller->isMoving());
        QVERIFY(scroller->isPressed());
        QVERIFY(!scroller->isTimerActive());
        // A tick with neither finger nor motion is idle.
        sendMouse(list->viewport(), QEvent::MouseButtonRelease, QPoint(50, 50));
        QApplication::processEvents();
        QCOMPARE(itemClicks.count(), 1); // the release of a still finger is a tap
    }

    void aTapIsRepostedExactlyOnce()
    {
        QWidget window;
        window.resize(320, 300);
        FlickList* list = makeList(&window);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QSignalSpy itemClicks(list, &QListWidget::itemClicked);
        QWidget* vp = list->viewport();

        // Two moves are still a tap.
        const QPoint at(100, 100);
        sendMouse(vp, QEvent::MouseButtonPress, at);
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 3));
        sendMouse(vp, QEvent::MouseMove, at + QPoint(0, 6));
        sendMouse(vp, QEvent::MouseButtonRelease, at + QPoint(0, 6));
        QCOMPARE(itemClicks.count(), 0); // swallowed...
        QApplication::processEvents();
        QCOMPARE(itemClicks.count(), 1); // ...and given back once
        QCOMPARE(list->currentRow(), 1);
        QApplication::processEvents();
        QCOMPARE(itemClicks.count(), 1);

        // A third move makes it a drag: nothing is given back.
        startDrag(list);
        sendMouse(vp, QEvent::MouseButtonRelease, at + QPoint(0, 30));
        QApplication::processEvents();
        QCOMPARE(itemClicks.count(), 1);
    }

    void anEditGetsTheInputPanelRequestAndAComboDoesNot()
    {
        QScrollArea area;
        area.resize(320, 300);
        auto* content = new QWidget;
        content->resize(300, 600);
        auto* edit = new QLineEdit(content);
        edit->setGeometry(10, 10, 200, 40);
        auto* combo = new QComboBox(content);
        combo->setGeometry(10, 80, 200, 40);
        area.setWidget(content);

        EventCounter editSeen;
        EventCounter comboSeen;
        // Installed before the scroller, so they run after it and see what passes.
        edit->installEventFilter(&editSeen);
        combo->installEventFilter(&comboSeen);
        QsKineticScroller scroller;
        scroller.enableKineticScrollFor(&area);
        area.show();
        QVERIFY(QTest::qWaitForWindowExposed(&area));

        sendMouse(edit, QEvent::MouseButtonPress, QPoint(20, 20));
        sendMouse(edit, QEvent::MouseButtonRelease, QPoint(20, 20));
        QCOMPARE(editSeen.presses, 0);
        QApplication::processEvents();
        QCOMPARE(editSeen.presses, 1);
        QCOMPARE(editSeen.releases, 1);
        QCOMPARE(spyApp()->inputPanelRequests, QList<QObject*>({edit}));

        sendMouse(combo, QEvent::MouseButtonPress, QPoint(20, 20));
        sendMouse(combo, QEvent::MouseButtonRelease, QPoint(20, 20));
        QApplication::processEvents();
        QCOMPARE(comboSeen.presses, 1);
        QCOMPARE(spyApp()->inputPanelRequests.size(), 1);
        combo->hidePopup();

        // Moving the scroller to another area releases the first one.
        QScrollArea other;
        scroller.enableKineticScrollFor(&other);
        sendMouse(edit, QEvent::MouseButtonPress, QPoint(20, 20));
        QCOMPARE(editSeen.presses, 2);
    }

    void horizontalScrollingFollowsX()
    {
        QWidget window;
        window.resize(320, 80);
        auto* list = new FlickList(&window);
        list->setGeometry(0, 0, 320, 60);
        list->setScrollingDirection(Qt::Horizontal);
        for (int i = 0; i < 30; ++i) {
            auto* cell = new QWidget;
            cell->resize(60, 60);
            list->addWidget(cell);
        }
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        list->horizontalScrollBar()->setValue(600);
        QWidget* vp = list->viewport();
        const QPoint at(200, 30);
        sendMouse(vp, QEvent::MouseButtonPress, at);
        for (int dx : {5, 10, 15, 40})
            sendMouse(vp, QEvent::MouseMove, at + QPoint(-dx, 0));
        QCOMPARE(list->horizontalScrollBar()->value(), 640);
        QCOMPARE(list->verticalScrollBar()->value(), 0);
        sendMouse(vp, QEvent::MouseButtonRelease, at + QPoint(-40, 0));
    }

    void flickButtonClicksOnATapButNotWhenCarriedAway()
    {
        QWidget window;
        window.resize(320, 300);
        QList<FlickButton*> rows;
        FlickList* list = makeList(&window, &rows);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        FlickButton* row = rows.at(1);
        QSignalSpy clicked(row, &QPushButton::clicked);

        sendMouse(row, QEvent::MouseButtonPress, QPoint(40, 40));
        QVERIFY(row->isShowingPressed());
        QVERIFY(list->scroller()->isPressed()); // the press travelled on to the list
        sendMouse(row, QEvent::MouseButtonRelease, QPoint(40, 40));
        QCOMPARE(clicked.count(), 1);
        QVERIFY(!row->isShowingPressed());
        QVERIFY(!list->scroller()->isPressed());
        QApplication::processEvents();

        // Dragged more than a row's height: the release no longer meets the
        // rectangle of the press.
        sendMouse(row, QEvent::MouseButtonPress, QPoint(40, 40));
        list->verticalScrollBar()->setValue(list->verticalScrollBar()->value() + 200);
        sendMouse(row, QEvent::MouseButtonRelease, QPoint(40, 40));
        QCOMPARE(clicked.count(), 1);

        // Released off the button.
        sendMouse(row, QEvent::MouseButtonPress, QPoint(40, 40));
        sendMouse(row, QEvent::MouseButtonRelease, QPoint(40, 120));
        QCOMPARE(clicked.count(), 1);
        QApplication::processEvents();
    }

    void flickButtonLastRowIsPlainWhite()
    {
        FlickButton row;
        row.resize(320, 85);
        row.setBackground(":/Assets/cell_85px.png");
        row.setLastInList(true);
        QImage shown = row.icon().pixmap(row.size()).toImage();
        QCOMPARE(shown.pixelColor(100, 84), QColor(Qt::white));
        row.setLastInList(false);
        shown = row.icon().pixmap(row.size()).toImage();
        QVERIFY(shown.pixelColor(100, 84) != QColor(Qt::white)); // the separator is back
        QVERIFY(row.hasPressedBackground() == false);
        row.setPressedBackground(":/Assets/cell_85px_hit.png");
        QVERIFY(row.hasPressedBackground());
        row.clearPressedBackground();
        QVERIFY(!row.hasPressedBackground());
    }

    void rowsAreInsertedWhereAsked()
    {
        FlickList list;
        auto make = [](const QString& name) {
            auto* w = new QWidget;
            w->setObjectName(name);
            w->resize(320, 62);
            return w;
        };
        list.addWidget(make("a"));
        list.appendWidget(make("b"));
        list.prependWidget(make("first"));
        list.insertWidget(make("end"), list.count());
        list.insertWidget(make("beyond"), 99);
        list.insertWidget(make("second"), 1);
        QStringList names;
        for (int i = 0; i < list.count(); ++i)
            names << list.getWidget(i)->objectName();
        QCOMPARE(names, QStringList({"first", "second", "a", "b", "end", "beyond"}));
        QCOMPARE(list.getWidget(list.count()), static_cast<QWidget*>(nullptr));
        QCOMPARE(list.getWidget(-1), static_cast<QWidget*>(nullptr));
        QCOMPARE(list.item(0)->sizeHint(), QSize(320, 62));
    }

    void deferredRowsAreMadeAsTheyComeNearTheView()
    {
        QWidget window;
        window.resize(320, 480);
        FlickList list(&window);
        list.setGeometry(0, 66, 320, 414);
        QList<int> made;
        list.setRowFactory([&made](int row) {
            made << row;
            auto* w = new QWidget;
            w->setObjectName(QString::number(row));
            return w;
        });
        for (int i = 0; i < 400; ++i)
            list.addDeferredRow(QSize(320, 85));
        list.setRowHidden(3, true);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        QCoreApplication::processEvents();

        // The view and a screen either side: a dozen rows, not four hundred,
        // and never the hidden one.
        QVERIFY2(made.size() >= 5 && made.size() <= 16, qPrintable(QString::number(made.size())));
        QVERIFY(!made.contains(3));
        QCOMPARE(list.madeRowCount(), made.size());
        QCOMPARE(list.getWidget(0)->objectName(), QString("0"));
        QCOMPARE(list.getWidget(399), static_cast<QWidget*>(nullptr));

        // Scrolling makes the rows that arrive, once.
        list.verticalScrollBar()->setValue(200 * 85);
        QCoreApplication::processEvents();
        QVERIFY(list.getWidget(200));
        const int afterScroll = made.size();
        list.verticalScrollBar()->setValue(200 * 85 + 10);
        QCoreApplication::processEvents();
        QCOMPARE(made.size(), afterScroll);
        QCOMPARE(made.count(200), 1);

        // Asked for by number, a far row is made at once; a hidden row too.
        QCOMPARE(list.makeRow(399)->objectName(), QString("399"));
        QCOMPARE(list.makeRow(3)->objectName(), QString("3"));
        QCOMPARE(list.makeRow(400), static_cast<QWidget*>(nullptr));
        QCOMPARE(list.makeRow(-1), static_cast<QWidget*>(nullptr));
        // Unhiding brings a row in like any other.
        list.setRowHidden(4, true);
        list.verticalScrollBar()->setValue(0);
        list.setRowHidden(4, false);
        QCoreApplication::processEvents();
        QVERIFY(list.getWidget(4));
    }

    void shadowsShowWhatLiesBeyondTheEdges()
    {
        QWidget window;
        window.resize(320, 300);
        FlickList* list = makeList(&window);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));

        // The first paint always evaluates.
        list->viewport()->grab();
        QCOMPARE(list->topShadowOpacity(), 0.0);
        QCOMPARE(list->bottomShadowOpacity(), 1.0);

        list->verticalScrollBar()->setValue(34); // 40 % of the first row out
        list->viewport()->grab();
        QVERIFY(qAbs(list->topShadowOpacity() - 0.4) < 0.02);

        list->verticalScrollBar()->setValue(list->verticalScrollBar()->maximum());
        list->viewport()->grab();
        QCOMPARE(list->topShadowOpacity(), 1.0);
        QCOMPARE(list->bottomShadowOpacity(), 0.0);

        list->setShadowsEnabled(false);
        QCOMPARE(list->topShadowOpacity(), 0.0);
        list->verticalScrollBar()->setValue(300);
        list->viewport()->grab();
        QCOMPARE(list->topShadowOpacity(), 0.0);
    }
};

int main(int argc, char** argv)
{
    SpyApplication app(argc, argv);
    TestKineticScroller test;
    return QTest::qExec(&test, argc, argv);
}
#include "tst_kineticscroller.moc"
