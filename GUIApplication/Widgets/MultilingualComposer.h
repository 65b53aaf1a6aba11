#ifndef MULTILINGUALCOMPOSER_H
#define MULTILINGUALCOMPOSER_H

#include <QObject>
#include <QPointer>
#include <QString>

#include "Screens/JobKeypadScreen.h"
#include "Widgets/MultilingualPopup.h"

class QLabel;
class QPlainTextEdit;
class QWidget;

// Composes Korean and Chinese text on a keypad. Everything typed since the
// last commit is the spelling (as the key labels read, so in capitals); its
// candidates from the input table stand in the strip, the selected one
// stands selected in the field, Space steps on, Enter commits and Delete
// shortens the spelling. The table is the one MarigoldUIM holds. Moving the
// cursor away from the composition (a tap in the field) ends it as it
// stands.
//
// Every multilingual JobKeypadScreen gets one (see create()), which loads
// the table of its language.
class MultilingualComposer : public QObject, public KeypadComposer
{
    Q_OBJECT
public:
    // The strip is placed on `stripParent` at (0, stripTop); the spelling is
    // shown in `bufferLabel` when there is one.
    MultilingualComposer(QPlainTextEdit* field, QWidget* stripParent, QLabel* bufferLabel,
                         int stripTop, QObject* parent = nullptr);
    ~MultilingualComposer() override;

    // The composer of a keypad screen in the language, its table loaded.
    static MultilingualComposer* create(JobKeypadScreen* screen, const QString& languageCode);

    // A key or the blank: always taken.
    bool keyPressed(const QString& text) override;
    // True when Delete only shortened the spelling; false when the caller
    // still has to delete (the strip is gone then).
    bool deletePressed() override;
    void enterPressed() override;
    // Drops the composition, leaving the text as it stands.
    void cancel();

    // Looks the spelling up and shows its candidates, selecting the first;
    // false for an empty spelling.
    bool showCandidates();

    QString buffer() const { return m_multilingualBuffer; }
    MultilingualPopup* popup() const { return m_pMultilingualPopup; }
    int cursorStartingPosition() const { return m_CursorStartingPosition; }

public slots:
    void onCharsSelected(QString chars);

private slots:
    void onCursorMoved();

private:
    void destroyPopup();
    void setBufferLabel(const QString& text);

    QPointer<QPlainTextEdit> m_field;
    QPointer<QWidget> m_stripParent;
    QPointer<QLabel> m_bufferLabel;
    int m_stripTop = 0;

    QString m_multilingualBuffer;
    QPointer<MultilingualPopup> m_pMultilingualPopup;
    int m_CursorStartingPosition = 0;
    bool m_editing = false;
};

#endif // MULTILINGUALCOMPOSER_H
