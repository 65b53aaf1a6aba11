// The candidate strip and the composing of text from spellings, on a bare
// field: pages of 8, Space stepping on, Enter committing, Delete shortening.
#include "SharedSystem/MarigoldUIM.h"
#include "Widgets/FlickList.h"
#include "Widgets/MultilingualComposer.h"
#include "Widgets/MultilingualPopup.h"
#include "Widgets/UimButton.h"
#include "Widgets/XPushButton.h"

#include <QLabel>
#include <QPlainTextEdit>
#include <QSignalSpy>
#include <QtTest>

namespace {

QVector<QString> letters(int n)
{
    QVector<QString> out;
    for (int i = 0; i < n; ++i)
        out << QString(QChar(0x4E00 + i));
    return out;
}

// A table with known rows: "ba" has 7 candidates, "b" one, "a" begins with
// its own capital.
const char* const kTable =
    ";;; test table\n(define test\n '(\n"
    "  (((\"a\")) (\"A\" \"\xE5\x95\x8A\"))\n"
    "  (((\"b\")) (\"\xE4\xB8\x8D\"))\n"
    "  (((\"b\" \"a\")) (\"\xE5\x85\xAB\" \"\xE5\xB7\xB4\" \"\xE6\x8A\x8A\" \"\xE7\x88\xB8\" \"\xE5\x90\xA7\" \"\xE6\x8B\x94\" \"\xE9\x9C\xB8\"))\n"
    "  (((\"b\" \"a\" \"i\")) (\"\xE7\x99\xBE\" \"\xE7\x99\xBD\"))\n"
    " ))\n";

} // namespace

class TestMultilingual : public QObject
{
    Q_OBJECT

    QWidget* m_host = nullptr;
    QPlainTextEdit* m_field = nullptr;
    QLabel* m_label = nullptr;
    MultilingualComposer* m_composer = nullptr;

    void type(const QString& keys)
    {
        for (QChar c : keys)
            m_composer->keyPressed(QString(c));
    }
    QString selected() const { return m_field->textCursor().selectedText(); }

private slots:
    void init()
    {
        QVERIFY(MarigoldUIM::instance()->loadTableText(QString::fromUtf8(kTable)));
        m_host = new QWidget;
        m_host->resize(320, 480);
        m_field = new QPlainTextEdit(m_host);
        m_field->setGeometry(20, 66, 280, 39);
        m_label = new QLabel(m_host);
        m_label->hide();
        m_composer = new MultilingualComposer(m_field, m_host, m_label, 107, m_host);
        m_host->show();
    }
    void cleanup()
    {
        delete m_host;
        m_host = nullptr;
        MarigoldUIM::instance()->flush();
    }

    void firstPageSelectsItsFirstCandidate()
    {
        MultilingualPopup popup;
        QSignalSpy spy(&popup, &MultilingualPopup::charsSelected);
        popup.refreshCharacters(letters(3));
        QCOMPARE(popup.numPages(), 1);
        QCOMPARE(popup.buttons().size(), 3);
        QVERIFY(spy.count() >= 1);
        QCOMPARE(spy.last().at(0).toString(), letters(1).at(0));
        QVERIFY(popup.buttons().at(0)->isSelected());
        QVERIFY(popup.btnPageRight()->isHidden());
        // Three 40-pixel keys stand centred.
        QCOMPARE(popup.entryList()->geometry(), QRect(100, 0, 120, 45));
        // One page: Space wraps from the last to the first.
        popup.onNextSelection();
        popup.onNextSelection();
        QCOMPARE(popup.currentSelected(), 2);
        popup.onNextSelection();
        QCOMPARE(popup.currentSelected(), 0);
        QVERIFY(popup.buttons().at(0)->isSelected());
        QVERIFY(!popup.buttons().at(2)->isSelected());
    }

    void spaceWalksThePagesAndWraps()
    {
        MultilingualPopup popup;
        popup.refreshCharacters(letters(10));
        QCOMPARE(popup.numPages(), 2);
        QVERIFY(popup.btnPageRight()->isVisible() || !popup.btnPageRight()->isHidden());
        QVERIFY(popup.btnPageRight()->isEnabled());
        QVERIFY(!popup.btnPageLeft()->isEnabled());
        for (int i = 0; i < 8; ++i)
            popup.onNextSelection();
        QCOMPARE(popup.currentPage(), 1);
        QCOMPARE(popup.buttons().size(), 2);
        QCOMPARE(popup.selectedText(), letters(9).at(8));
        popup.onNextSelection();
        popup.onNextSelection();
        // From the last page back to the first.
        QCOMPARE(popup.currentPage(), 0);
        QCOMPARE(popup.selectedText(), letters(1).at(0));
    }

    void arrowsClampAndRestoreTheSelection()
    {
        MultilingualPopup popup;
        QSignalSpy spy(&popup, &MultilingualPopup::charsSelected);
        popup.refreshCharacters(letters(12));
        popup.onNextSelection(); // index 1 on page 0
        const int selections = spy.count();
        popup.on_BtnPageRight_clicked();
        popup.on_BtnPageRight_clicked();
        QCOMPARE(popup.currentPage(), 1);
        QVERIFY(!popup.btnPageRight()->isEnabled());
        QVERIFY(popup.btnPageLeft()->isEnabled());
        // The arrows select nothing of their own.
        QCOMPARE(spy.count(), selections);
        QCOMPARE(popup.selectedText(), QString());
        popup.on_BtnPageLeft_clicked();
        popup.on_BtnPageLeft_clicked();
        QCOMPARE(popup.currentPage(), 0);
        QCOMPARE(popup.currentSelected(), 1);
        QVERIFY(popup.buttons().at(1)->isSelected());
    }

    void theEmptyLastPageIsHarmless()
    {
        // Exactly 8 candidates: a second, empty page.
        MultilingualPopup popup;
        popup.refreshCharacters(letters(8));
        QCOMPARE(popup.numPages(), 2);
        for (int i = 0; i < 8; ++i)
            popup.onNextSelection();
        QCOMPARE(popup.currentPage(), 1);
        QVERIFY(popup.buttons().isEmpty());
        // Space on the empty page does nothing at all.
        QSignalSpy spy(&popup, &MultilingualPopup::charsSelected);
        popup.onNextSelection();
        popup.onNextSelection();
        QCOMPARE(spy.count(), 0);
        QCOMPARE(popup.currentPage(), 1);
        popup.on_BtnPageLeft_clicked();
        QCOMPARE(popup.currentPage(), 0);
        QVERIFY(popup.buttons().at(7)->isSelected());
    }

    void theTypedSpellingGetsAWiderKey()
    {
        MultilingualPopup popup;
        popup.refreshCharacters(QVector<QString> {letters(1).at(0), QStringLiteral("SHUANG")});
        UimButton* raw = popup.buttons().at(1);
        QCOMPARE(raw->width(), qMax(raw->GetTextWidth() + 10, 40));
        QVERIFY(raw->width() > 40);
    }

    void composesSelectsAndCommits()
    {
        m_field->setPlainText(QStringLiteral("X"));
        m_field->moveCursor(QTextCursor::End);
        type("BA");
        QCOMPARE(m_composer->buffer(), QStringLiteral("BA"));
        QVERIFY(m_composer->popup());
        QCOMPARE(m_composer->popup()->y(), 107);
        // The first candidate stands selected in the field after the text.
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X八"));
        QCOMPARE(selected(), QString::fromUtf8("八"));
        QCOMPARE(m_label->text(), QStringLiteral("BA"));
        // A blank steps on and never joins the spelling.
        m_composer->keyPressed(" ");
        QCOMPARE(m_composer->buffer(), QStringLiteral("BA"));
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X巴"));
        m_composer->enterPressed();
        QVERIFY(!m_composer->popup());
        QVERIFY(m_composer->buffer().isEmpty());
        QVERIFY(m_label->text().isEmpty());
        QVERIFY(!m_field->textCursor().hasSelection());
        QCOMPARE(m_field->textCursor().position(), 2);
        // The next key starts a new composition after the committed one.
        type("A");
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X巴A"));
        m_composer->enterPressed();
        // Without a strip a blank is a blank.
        m_composer->keyPressed(" ");
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X巴A "));
        QVERIFY(m_composer->buffer().isEmpty());
        QVERIFY(!m_composer->popup());
    }

    void unknownSpellingsStandForThemselves()
    {
        type("QZ");
        QCOMPARE(m_composer->popup()->strings(), QVector<QString> {QStringLiteral("QZ")});
        QCOMPARE(m_field->toPlainText(), QStringLiteral("QZ"));
        QCOMPARE(selected(), QStringLiteral("QZ"));
        // Space over a single candidate keeps it.
        m_composer->keyPressed(" ");
        QCOMPARE(m_field->toPlainText(), QStringLiteral("QZ"));
    }

    void aCandidateEqualToTheSpellingIsNotRepeated()
    {
        type("A");
        QCOMPARE(m_composer->popup()->strings(),
                 (QVector<QString> {QStringLiteral("A"), QString::fromUtf8("啊")}));
        QCOMPARE(selected(), QStringLiteral("A"));
    }

    void sevenCandidatesAndTheSpellingMakeTwoPages()
    {
        type("BA");
        MultilingualPopup* popup = m_composer->popup();
        QCOMPARE(popup->strings().size(), 8);
        QCOMPARE(popup->strings().last(), QStringLiteral("BA"));
        QCOMPARE(popup->numPages(), 2);
        for (int i = 0; i < 7; ++i)
            m_composer->keyPressed(" ");
        QCOMPARE(m_field->toPlainText(), QStringLiteral("BA"));
        // Onto the empty page, and once more: the text keeps the last one.
        m_composer->keyPressed(" ");
        QCOMPARE(popup->currentPage(), 1);
        m_composer->keyPressed(" ");
        m_composer->keyPressed(" ");
        QCOMPARE(m_field->toPlainText(), QStringLiteral("BA"));
        QCOMPARE(m_composer->buffer(), QStringLiteral("BA"));
        m_composer->enterPressed();
        QCOMPARE(m_field->toPlainText(), QStringLiteral("BA"));
        QVERIFY(!m_composer->popup());
    }

    void deleteShortensTheSpelling()
    {
        m_field->setPlainText(QStringLiteral("X"));
        m_field->moveCursor(QTextCursor::End);
        type("BAI");
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X百"));
        QVERIFY(m_composer->deletePressed());
        QCOMPARE(m_composer->buffer(), QStringLiteral("BA"));
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X八"));
        QCOMPARE(selected(), QString::fromUtf8("八"));
        QVERIFY(m_composer->deletePressed());
        QCOMPARE(m_field->toPlainText(), QString::fromUtf8("X不"));
        // A one-letter spelling: the strip goes and the caller deletes the
        // selected candidate with it.
        QVERIFY(!m_composer->deletePressed());
        QVERIFY(!m_composer->popup());
        QVERIFY(m_composer->buffer().isEmpty());
        QCOMPARE(selected(), QString::fromUtf8("不"));
    }

    void withoutATableEverySpellingStandsAsTyped()
    {
        MarigoldUIM::instance()->flush();
        type("HAN");
        QCOMPARE(m_field->toPlainText(), QStringLiteral("HAN"));
        QCOMPARE(m_composer->popup()->strings().size(), 1);
    }
};

QTEST_MAIN(TestMultilingual)
#include "tst_multilingual.moc"
