// The base buttons and labels: the debounce gate that always lets presses
// through, KLabel's fitting, the wrapping buttons and the clickable label.

#include "Widgets/ClickableLabel.h"
#include "Widgets/KLabel.h"
#include "Widgets/WordWrapButton.h"
#include "Widgets/XPushButton.h"
#include "Widgets/XPushButtonWordWrap.h"

#include <QApplication>
#include <QFontMetrics>
#include <QSignalSpy>
#include <QtTest>

class TestBaseWidgets : public QObject
{
    Q_OBJECT

private:
    static QFont baseFont()
    {
        QFont f("Liberation Sans");
        f.setPointSize(16);
        return f;
    }

private slots:
    void xPushButtonLetsEveryPressThrough_data()
    {
        QTest::addColumn<int>("debounceMs");
        QTest::addColumn<bool>("enabled");
        QTest::newRow("default 250 ms") << 250 << true;
        QTest::newRow("popup buttons at 5000 ms") << 5000 << true;
        QTest::newRow("debounce switched off") << 250 << false;
    }

    void xPushButtonLetsEveryPressThrough()
    {
        QFETCH(int, debounceMs);
        QFETCH(bool, enabled);
        XPushButton button("OK");
        button.resize(100, 50);
        button.setDebounceTime(debounceMs);
        button.setDebounceEnabled(enabled);
        QSignalSpy clicked(&button, &QPushButton::clicked);
        const QPoint at(50, 25);
        auto send = [&](QEvent::Type type) {
            QMouseEvent event(type, at, button.mapToGlobal(at), Qt::LeftButton,
                              type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton,
                              Qt::NoModifier);
            QApplication::sendEvent(&button, &event);
        };
        // Rapid presses, far inside any debounce time...
        for (int i = 0; i < 6; ++i) {
            send(QEvent::MouseButtonPress);
            send(QEvent::MouseButtonRelease);
        }
        QCOMPARE(clicked.count(), 6);
        // ...and a double click, whose second press clicks too.
        send(QEvent::MouseButtonPress);
        send(QEvent::MouseButtonRelease);
        send(QEvent::MouseButtonDblClick);
        send(QEvent::MouseButtonRelease);
        QCOMPARE(clicked.count(), 8);
    }

    void xPushButtonIgnoresNonPositiveDebounceTimes()
    {
        XPushButton button;
        QCOMPARE(button.debounceTime(), 250);
        button.setDebounceTime(0);
        QCOMPARE(button.debounceTime(), 250);
        button.setDebounceTime(-10);
        QCOMPARE(button.debounceTime(), 250);
        button.setDebounceTime(5000);
        QCOMPARE(button.debounceTime(), 5000);
    }

    void kLabelWithoutAutoSizeKeepsTheDefaultFont()
    {
        KLabel label;
        label.resize(60, 20);
        label.setFont(baseFont());
        label.setText("A text far too long for sixty pixels");
        QCOMPARE(label.font().pointSize(), 16);
        QCOMPARE(label.text(), QString("A text far too long for sixty pixels"));
    }

    void kLabelShrinksAndGrowsBack()
    {
        KLabel label;
        label.resize(120, 40);
        label.setFont(baseFont());
        label.setAutoSize(true);

        const QString longText = "Measurement Cancelled by the operator";
        label.setText(longText);
        QVERIFY(label.font().pointSizeF() < 16.0);
        // Fitted as the label draws: at its screen's resolution, in whole
        // pixels, with no slack.
        for (int width = 80; width <= 300; width += 7) {
            label.resize(width, 40);
            for (const QString& text : {longText, QString("Memoria dello strumento piena"),
                                        QString("Alle abgeschlossenen Aufträge löschen?")}) {
                label.setText(text);
                const int drawn = QFontMetrics(label.font()).horizontalAdvance(text);
                QVERIFY2(drawn <= width, qPrintable(QString("%1 px of %2 in %3").arg(drawn).arg(text).arg(width)));
            }
        }
        label.resize(120, 40);

        label.setText("OK");
        QCOMPARE(label.font().pointSizeF(), 16.0);
    }

    void kLabelFitsWrappedTextInBothDirections()
    {
        KLabel label;
        label.setWordWrap(true);
        label.resize(140, 60);
        label.setFont(baseFont());
        label.setAutoSize(true);
        const QString text = "There is not enough memory to complete the requested Job. Please remove "
                             "existing jobs to free up memory.";
        label.setText(text);
        QVERIFY(label.font().pointSize() < 16);
        const QRect needed = QFontMetrics(label.font())
                                 .boundingRect(QRect(0, 0, 140, 60),
                                               Qt::TextWordWrap | Qt::AlignCenter, text);
        QVERIFY(needed.width() <= 140);
        QVERIFY(needed.height() <= 60);
    }

    void kLabelFitsInsideItsMargins()
    {
        // A title box that buttons overlap at both ends keeps its text in
        // the middle through margins; the fitting must honour them.
        for (bool wrap : {false, true}) {
            KLabel label;
            label.setWordWrap(wrap);
            label.resize(221, 66);
            label.setContentsMargins(59, 0, 59, 0);
            label.setFont(baseFont());
            label.setAutoSize(true);
            const QString text = "Referenzkachel-Prüfung";
            label.setText(text);
            const QRect box = label.contentsRect();
            const QRect needed = QFontMetrics(label.font()).boundingRect(
                QRect(QPoint(0, 0), box.size()), (wrap ? Qt::TextWordWrap : 0) | Qt::AlignCenter, text);
            QVERIFY2(needed.width() <= box.width(), qPrintable(QString::number(needed.width())));
            QVERIFY(needed.height() <= box.height());
        }
    }

    void kLabelMaxLengthCutsWhatShowsButNotWhatIsFitted()
    {
        KLabel label;
        label.setWordWrap(true);
        label.resize(100, 30);
        label.setFont(baseFont());
        label.setAutoSize(true);
        label.setMaxTextLength(3);
        const QString text = "Sample temperature too high (IR Sensor)";
        label.setText(text);
        QCOMPARE(label.text(), QString("Sam"));
        QCOMPARE(label.defaultText(), text);
        // "Sam" alone would fit at 16 points; the fit measured the full text.
        QVERIFY(label.font().pointSize() < 16);

        label.setMaxTextLength(0);
        QCOMPARE(label.text(), QString());
        label.setMaxTextLength(-5);
        QCOMPARE(label.maxTextLength(), -1);
        QCOMPARE(label.text(), text);
    }

    void kLabelSurvivesAnEmptyBox()
    {
        KLabel label;
        label.resize(0, 0);
        label.setFont(baseFont());
        label.setAutoSize(true);
        label.setText("Error");
        QVERIFY(label.font().pointSizeF() >= 1.0);
        label.setWordWrap(true);
        label.setText("Error in shutter motor");
        QVERIFY(label.font().pointSize() >= 1);
        label.setText(QString());
    }

    void wordWrapBreaksAtTheFirstBlanksUntilItFits()
    {
        const QFont font = baseFont();
        const QFontMetrics metrics(font);
        const QSize wide(metrics.horizontalAdvance("Restart Job") + 10, 3 * metrics.height());
        QCOMPARE(XPushButtonWordWrap::wrapToFit("Restart Job", font, wide), QString("Restart Job"));

        const QSize narrow(metrics.horizontalAdvance("Restart") + 4, 3 * metrics.height());
        QCOMPARE(XPushButtonWordWrap::wrapToFit("Restart Job", font, narrow),
                 QString("Restart\nJob"));
        // A word wider than the button: the blanks run out, the loop ends.
        const QSize tiny(20, 200);
        QCOMPARE(XPushButtonWordWrap::wrapToFit("Supercalibration of tiles", font, tiny),
                 QString("Supercalibration\nof\ntiles"));

        XPushButtonWordWrap button;
        button.setFont(font);
        button.resize(narrow);
        button.setText("Restart Job");
        QCOMPARE(button.text(), QString("Restart\nJob"));
    }

    void wordWrapButtonCarriesItsTextInALabel()
    {
        WordWrapButton button;
        button.setGeometry(10, 10, 80, 60);
        button.setText("Store Average");
        QCOMPARE(button.text(), QString("Store Average"));
        QCOMPARE(button.label()->geometry(), QRect(0, 0, 80, 60));
        QVERIFY(button.label()->wordWrap());
        button.setFontColor(255, 62, 62);
        QVERIFY(button.label()->styleSheet().contains("color:rgb(255, 62, 62);"));
        button.setHiddenString("job-17");
        QCOMPARE(button.getHiddenString(), QString("job-17"));
        QSignalSpy clicked(&button, &QPushButton::clicked);
        QTest::mouseClick(&button, Qt::LeftButton, {}, QPoint(40, 30));
        QCOMPARE(clicked.count(), 1);
    }

    void clickableLabelClicksOnlyWhenReleasedOnIt()
    {
        QWidget window;
        window.resize(320, 200);
        ClickableLabel label;
        label.setParent(&window);
        label.setGeometry(10, 10, 100, 40);
        QSignalSpy clicked(&label, &ClickableLabel::clicked);

        QTest::mouseClick(&label, Qt::LeftButton, {}, QPoint(50, 20));
        QCOMPARE(clicked.count(), 1);

        // Released outside the label: no click.
        QTest::mousePress(&label, Qt::LeftButton, {}, QPoint(50, 20));
        QTest::mouseRelease(&label, Qt::LeftButton, {}, QPoint(50, 80));
        QCOMPARE(clicked.count(), 1);

        // The label was carried away between press and release (a list scrolled).
        QTest::mousePress(&label, Qt::LeftButton, {}, QPoint(50, 20));
        label.move(10, 150);
        QTest::mouseRelease(&label, Qt::LeftButton, {}, QPoint(50, 20));
        QCOMPARE(clicked.count(), 1);

        // Another button never clicks.
        QTest::mouseClick(&label, Qt::RightButton, {}, QPoint(50, 20));
        QCOMPARE(clicked.count(), 1);
    }
};

QTEST_MAIN(TestBaseWidgets)
#include "tst_basewidgets.moc"
