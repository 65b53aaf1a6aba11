#include "Widgets/MultilingualComposer.h"

#include "SharedSystem/MarigoldUIM.h"
#include "Widgets/MultilingualPopup.h"

#include <QLabel>
#include <QPlainTextEdit>
#include <QScopedValueRollback>
#include <QTextCursor>

namespace {
// Keypad screens in Korean and Chinese compose through this class.
const bool s_registered = [] {
    JobKeypadScreen::setComposerFactory(&MultilingualComposer::create);
    return true;
}();
} // namespace

MultilingualComposer* MultilingualComposer::create(JobKeypadScreen* screen, const QString& languageCode)
{
    // The table is read afresh at every opening; what came before may have
    // been another language's.
    MarigoldUIM::instance()->initUIM(languageCode);
    int top = 0;
    if (QWidget* field = screen->findChild<QWidget*>(QStringLiteral("labelTextBackground")))
        top = field->geometry().bottom() + 2;
    // With a special page the function row covers the spelling's label
    // whole, and only a sliver of it would show below the keys; the strip
    // shows the spelling anyway.
    QLabel* label = screen->multilingualBufferLabel();
    if (screen->btnSpecial() && !screen->btnSpecial()->isHidden())
        label = nullptr;
    return new MultilingualComposer(screen->getTextEditPointer(), screen, label, top);
}

MultilingualComposer::MultilingualComposer(QPlainTextEdit* field, QWidget* stripParent,
                                           QLabel* bufferLabel, int stripTop, QObject* parent)
    : QObject(parent)
    , m_field(field)
    , m_stripParent(stripParent)
    , m_bufferLabel(bufferLabel)
    , m_stripTop(stripTop)
{
    if (m_field)
        connect(m_field, &QPlainTextEdit::cursorPositionChanged, this, &MultilingualComposer::onCursorMoved);
}

void MultilingualComposer::onCursorMoved()
{
    if (m_editing || !m_pMultilingualPopup || !m_field)
        return;
    const QTextCursor cursor = m_field->textCursor();
    if (!cursor.hasSelection() || cursor.selectionStart() != m_CursorStartingPosition)
        cancel();
}

MultilingualComposer::~MultilingualComposer()
{
    destroyPopup();
}

bool MultilingualComposer::keyPressed(const QString& text)
{
    if (text != QLatin1String(" ")) {
        m_multilingualBuffer.append(text);
        // With a spelling the strip always has the spelling itself to show.
        if (!showCandidates() && !m_pMultilingualPopup && m_field) {
            QScopedValueRollback<bool> editing(m_editing, true);
            QTextCursor cursor = m_field->textCursor();
            cursor.insertText(text);
            m_field->setTextCursor(cursor);
        }
        return true;
    }
    // A blank steps through the candidates and never joins the spelling.
    if (m_pMultilingualPopup)
        m_pMultilingualPopup->onNextSelection();
    else
        onCharsSelected(QStringLiteral(" "));
    return true;
}

bool MultilingualComposer::showCandidates()
{
    if (m_multilingualBuffer.isEmpty())
        return false;
    const QVector<QChar> chars = MarigoldUIM::instance()->GetCharVector(m_multilingualBuffer.toLower());
    setBufferLabel(m_multilingualBuffer);

    QVector<QString> strings;
    strings.reserve(chars.size() + 1);
    for (QChar c : chars)
        strings.append(QString(c));

    if (!m_pMultilingualPopup && m_stripParent) {
        m_pMultilingualPopup = new MultilingualPopup(m_stripParent);
        m_pMultilingualPopup->move(0, m_stripTop);
        m_pMultilingualPopup->show();
        m_pMultilingualPopup->raise();
        connect(m_pMultilingualPopup, &MultilingualPopup::charsSelected, this,
                &MultilingualComposer::onCharsSelected);
    }
    // An unknown spelling stands for itself; a known one keeps it last so
    // that the letters themselves can still be had.
    if (!strings.contains(m_multilingualBuffer))
        strings.append(m_multilingualBuffer);
    if (m_pMultilingualPopup)
        m_pMultilingualPopup->refreshCharacters(strings);
    return !strings.isEmpty();
}

void MultilingualComposer::onCharsSelected(QString chars)
{
    if (!m_field)
        return;
    QScopedValueRollback<bool> editing(m_editing, true);
    QTextCursor cursor = m_field->textCursor();
    if (chars == QLatin1String(" ")) {
        cursor.setKeepPositionOnInsert(false);
        cursor.beginEditBlock();
        m_CursorStartingPosition = cursor.position();
        cursor.removeSelectedText();
        cursor.insertText(chars);
        cursor.endEditBlock();
    } else {
        // The candidate replaces the previous one and stays selected: that
        // selected run is the composition.
        cursor.setKeepPositionOnInsert(true);
        cursor.beginEditBlock();
        cursor.removeSelectedText();
        m_CursorStartingPosition = cursor.position();
        cursor.insertText(chars);
        cursor.setPosition(m_CursorStartingPosition);
        cursor.movePosition(QTextCursor::Right, QTextCursor::KeepAnchor, chars.size());
        cursor.endEditBlock();
    }
    m_field->setTextCursor(cursor);
    m_field->setFocus();
}

void MultilingualComposer::enterPressed()
{
    if (m_field) {
        QScopedValueRollback<bool> editing(m_editing, true);
        QTextCursor cursor = m_field->textCursor();
        cursor.setPosition(cursor.position());
        m_field->setTextCursor(cursor);
    }
    destroyPopup();
    m_multilingualBuffer.clear();
    setBufferLabel(QString());
}

bool MultilingualComposer::deletePressed()
{
    if (m_pMultilingualPopup && m_multilingualBuffer.size() >= 2) {
        m_multilingualBuffer.chop(1);
        showCandidates();
        return true;
    }
    cancel();
    return false;
}

void MultilingualComposer::cancel()
{
    destroyPopup();
    m_multilingualBuffer.clear();
    setBufferLabel(QString());
}

void MultilingualComposer::destroyPopup()
{
    if (!m_pMultilingualPopup)
        return;
    disconnect(m_pMultilingualPopup, nullptr, this, nullptr);
    delete m_pMultilingualPopup.data();
    m_pMultilingualPopup.clear();
}

void MultilingualComposer::setBufferLabel(const QString& text)
{
    if (!m_bufferLabel)
        return;
    m_bufferLabel->setText(text);
    m_bufferLabel->setVisible(!text.isEmpty());
}
