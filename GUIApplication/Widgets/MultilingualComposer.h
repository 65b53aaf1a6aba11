#ifndef MULTILINGUALCOMPOSER_H
#define MULTILINGUALCOMPOSER_H

#include <QObject>
#include <QPointer>
#include <QString>

#include "Widgets/MultilingualPopup.h"

class QLabel;
class QPlainTextEdit;
class QWidget;

// Composes Korean and Chinese text on a keypad. Everything typed since the
// last commit is the spelling (as the key labels read, so in capitals); its
// candidates from the input table stand in the strip, the selected one
// stands selected in the field, Space steps on, Enter commits and Delete
// shortens the spelling. The table is the one MarigoldUIM holds.
class MultilingualComposer : public QObject
{
    Q_OBJECT
public:
    // The strip is placed on `stripParent` at (0, stripTop); the spelling is
    // shown in `bufferLabel` when there is one.
    MultilingualComposer(QPlainTextEdit* field, QWidget* stripParent, QLabel* bufferLabel,
                         int stripTop, QObject* parent = nullptr);
    ~MultilingualComposer() override;

    // A key or the blank: always taken.
    bool keyPressed(const QString& text);
    // True when Delete only shortened the spelling; false when the caller
    // still has to delete (the strip is gone then).
    bool deletePressed();
    void enterPressed();
    // Drops the composition, leaving the text as it stands.
    void cancel();

    // Looks the spelling up and shows its candidates, selecting the first;
    // false for an empty spelling.
    bool showCandidates(const QString& buffer);

    QString buffer() const { return m_multilingualBuffer; }
    MultilingualPopup* popup() const { return m_pMultilingualPopup; }
    int cursorStartingPosition() const { return m_CursorStartingPosition; }

public slots:
    void onCharsSelected(QString chars);

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
};

#endif // MULTILINGUALCOMPOSER_H
