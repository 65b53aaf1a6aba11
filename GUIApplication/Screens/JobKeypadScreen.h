#ifndef JOBKEYPADSCREEN_H
#define JOBKEYPADSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/XMLParser.h"
#include "Widgets/KLabel.h"

#include <QString>
#include <QVector>

#include <functional>
#include <memory>

namespace Ui {
class JobKeypadScreen;
}

class QLabel;
class QPlainTextEdit;
class QSignalMapper;

// One key of a layout on the screen. It takes no input itself: the panel
// follows the finger and asks the labels where they are.
class KeyPadLabel : public KLabel
{
    Q_OBJECT
public:
    explicit KeyPadLabel(QWidget* parent = nullptr);

    KEYPAD_BUTTON_T m_Key;
};

// The enlarged key that stands over the finger while a key is held.
class KeypadNotification : public QWidget
{
    Q_OBJECT
public:
    explicit KeypadNotification(QWidget* parent = nullptr);
    KeypadNotification(QString text, QWidget* parent);

    void setText(QString text);
    QString text() const;

private:
    QLabel* labelBackground;
    QLabel* labelText;
};

class KeyPadLabel;
class JobKeypadScreen;

// The keys of a layout as labels, for every panel that types on a layout
// file (the job's text screens, the Wi-Fi password): build the layers, show
// one, and find the key under the finger. The panel follows the finger in
// its own mouse handlers:
//
//     KeypadArray array;
//     DataManager::instance()->loadKeypad("wifi", array);
//     const int rowY = KeypadLayout::createKeyLabels(this, array, m_keys);
//     KeypadLayout::showLayer(m_keys, KeypadLayout::layerOf(caps, special));
//     ... press/move: KeypadLayout::keyAt(m_keys, layer, event->pos())
typedef QVector<QVector<KeyPadLabel*>> KeyLayers;
namespace KeypadLayout {
// The layer of m_keys shown for the two flags.
int layerOf(bool caps, bool special);
// Labels for every key of `array` on `parent`, in file order into the four
// layers; returns the y of the function row (the largest bottom edge, 0
// without keys).
int createKeyLabels(QWidget* parent, const KeypadArray& array, KeyLayers& layers);
// Whether the layout has a special page (and so a BtnSpecial).
bool hasSpecialPage(const KeyLayers& layers);
// Shows and enables the labels of one layer, hides and disables the others.
void showLayer(const KeyLayers& layers, int layer);
// The first enabled label of the layer whose box holds `pos`, or null.
KeyPadLabel* keyAt(const KeyLayers& layers, int layer, const QPoint& pos);
// A function key (space, delete, shift, special, enter) in the keypad's look.
XPushButton* createFunctionKey(QWidget* parent, const QString& name);
// Sets the text, shrinking the font so that it fits the key.
void fitText(QPushButton* button, const QString& text);
// Where the enlarged key of that size stands over `key`.
QPoint notificationPlace(const QWidget* key, const QSize& popup);
} // namespace KeypadLayout

// Composes the text of languages typed in parts (Korean, Chinese) on a
// keypad in multilingual mode. The keypad offers it each key, Delete and
// Enter first; what it doesn't take, the keypad handles as usual.
class KeypadComposer
{
public:
    virtual ~KeypadComposer() = default;
    virtual bool keyPressed(const QString& text) = 0;
    virtual bool deletePressed() = 0;
    virtual void enterPressed() = 0;
};

// The text entry screen of a job: a title bar with back and next, one text
// field and a keypad placed from the layout file of the user's language.
// The keys come in four layers (capitals, lower case, and both again for the
// special page); a press shows the enlarged key, the character is entered
// at the release under the finger, and a finger that slides off enters
// nothing. The concrete screens decide what the text is and where it goes
// (onNextAction).
//
// Languages that compose their text (Korean, Chinese) are typed on the same
// screen: the multilingual hooks below (initComposer, onShowMultilingualPopup,
// onCharsSelected, onEnterClicked, and the multilingual branches of
// PushEventKey and onDeleteClicked) are virtual so that the composing input
// plugs in without changing the keypad itself.
class JobKeypadScreen : public DaddyPanel
{
    Q_OBJECT
public:
    // The four layers of m_keys.
    enum KeyLayer {
        LayerCapital = 0,
        LayerLower = 1,
        LayerSpecialCapital = 2,
        LayerSpecialLower = 3,
        NumLayers = 4
    };

    explicit JobKeypadScreen(QWidget* parent = nullptr);
    ~JobKeypadScreen() override;

    void setEntryLength(int length);
    int entryLength() const { return m_entryLength; }
    void setChangeColor(bool changeColor);
    QPlainTextEdit* getTextEditPointer() const;

    // For the screens built on this one and for tests.
    QString text() const;
    bool isMultilingual() const { return m_multilingual; }
    bool displayCaps() const { return m_displayCap; }
    bool displaySpecial() const { return m_displaySpecial; }
    // The layer the press search walks now.
    int currentLayer() const;
    const QVector<QVector<KeyPadLabel*>>& keys() const { return m_keys; }
    KeyPadLabel* currentKey() const { return m_currentKey; }
    QWidget* keyPopup() const { return m_keyPopup; }
    XPushButton* btnDelete() const { return BtnDelete; }
    XPushButton* btnEnter() const { return BtnEnter; }
    XPushButton* btnSpace() const { return BtnSpace; }
    XPushButton* btnShift() const { return BtnShift; }
    XPushButton* btnSpecial() const { return BtnSpecial; }
    XPushButton* btnBack() const;
    XPushButton* btnNext() const;
    QString title() const;
    // The y of the function row: the largest bottom edge of the keys.
    int functionRowY() const { return m_functionRowY; }
    QLabel* multilingualBufferLabel() const;
    QLabel* labelCover() const;

    // Multilingual keypads get their composer from here, one per screen,
    // made once the keys stand; the screen owns it.
    typedef std::function<KeypadComposer*(JobKeypadScreen* screen, const QString& code)> ComposerFactory;
    static void setComposerFactory(ComposerFactory factory);
    KeypadComposer* composer() const { return m_composer.get(); }

public slots:
    virtual void setTitle(const QString& title);
    // A title in the screen's language, asked again when the language changes.
    void setTitle(std::function<QString()> title);
    virtual void on_BtnBack_clicked();
    virtual void on_BtnNext_clicked();
    virtual void onKeyClicked(const QString& text);
    virtual void onDeleteClicked();
    virtual void onSpaceClicked();
    virtual void onEnterClicked();
    virtual void onShiftClicked();
    virtual void onSpecialClicked();
    virtual void onDisplayCaps(bool caps);
    virtual void onDisplaySpecial(bool special);
    virtual void onHandleCursorSelection(bool selected);
    virtual void on_textEdit_textChanged();
    virtual void onKeyPressed(QWidget* key);
    virtual void onKeyReleased();
    virtual bool onShowMultilingualPopup(const QString& text);
    virtual void onCharsSelected(QString chars);
    virtual void textEditChanged();
    virtual void onNextAction();
    virtual void createPopup();
    virtual void createKeypad();
    virtual void updateKeypad();
    virtual QWidget* createKeyPressedNotification(QString text);
    virtual void PushEventKey(const QString& text);

    void onUpdateScreen() override;

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

    // Multilingual mode starts the composing input for the language code;
    // nothing to do for the languages typed key by key.
    virtual void initComposer(const QString& code);
    // The enabled label of the layer in force under the point, first in
    // file order; null when there is none.
    KeyPadLabel* keyAt(const QPoint& pos) const;
    // The field's look, red for an entry that can't be taken.
    void setFieldStyle(bool invalid);
    // The enabled state of every key label and of BtnSpace.
    void setKeysEnabled(bool enabled);

    Ui::JobKeypadScreen* ui;

    QSignalMapper* m_signalMapper = nullptr;
    QVector<QVector<KeyPadLabel*>> m_keys;
    QWidget* m_keyPopup = nullptr;
    KeyPadLabel* m_currentKey = nullptr;
    XPushButton* BtnDelete = nullptr;
    XPushButton* BtnEnter = nullptr;
    XPushButton* BtnSpace = nullptr;
    XPushButton* BtnShift = nullptr;
    XPushButton* BtnSpecial = nullptr;
    bool m_displayCap = true;
    bool m_displaySpecial = false;
    int m_entryLength = 100;
    bool m_changeColor = false;

private:
    static ComposerFactory& composerFactory();
    void retranslate();
    void updateSpecialText();

    std::unique_ptr<KeypadComposer> m_composer;
    std::function<QString()> m_titleSource;

    bool m_multilingual = false;
    int m_functionRowY = 0;
};

#endif // JOBKEYPADSCREEN_H
