#ifndef KEYPAD_H
#define KEYPAD_H

// A small fixed keypad that needs no layout file: A to Z on one page, the
// digits on the other, with space and delete below. It is kept ready for
// screens that want a short entry (a number, a code) without the full
// keypad screen.

#include <QPointer>
#include <QString>
#include <QVector>
#include <QWidget>

class QLabel;
class QSignalMapper;
class XPushButton;

// The common part of the two pages: keys as buttons, an enlarged key over
// the finger while it is down.
class KeypadPage : public QWidget
{
    Q_OBJECT
public:
    explicit KeypadPage(QWidget* parent = nullptr);
    ~KeypadPage() override;

    const QVector<XPushButton*>& keyButtons() const { return m_keys; }
    QLabel* notification() const { return m_notificationPopup; }

signals:
    void keyClicked(QString text);

public slots:
    virtual void onKeyClicked(QString text);
    virtual void onKeyPressed(QWidget* key);
    virtual void onKeyReleased(QWidget* key);

protected:
    virtual void createKeys();
    virtual void removeKeys();
    virtual XPushButton* createKey(QString text);
    virtual XPushButton* createKey();
    virtual QLabel* createKeyPressedNotification(QString text);

    // Size and picture of a key on this page.
    virtual QSize keySize() const = 0;
    virtual QString keyPicture() const = 0;
    // The keys in order with their places.
    virtual QVector<QPair<QString, QPoint>> keyPlaces() const = 0;

    QVector<XPushButton*> m_keys;
    QSignalMapper* m_clickedMapper = nullptr;
    QSignalMapper* m_pressedMapper = nullptr;
    QSignalMapper* m_releasedMapper = nullptr;
    // Lives on the window, not on the page; the window may go first.
    QPointer<QLabel> m_notificationPopup;
};

class KeypadNumbers : public KeypadPage
{
    Q_OBJECT
public:
    explicit KeypadNumbers(QWidget* parent = nullptr);

protected:
    QSize keySize() const override { return QSize(93, 47); }
    QString keyPicture() const override { return QStringLiteral(":/Keyboard/key_number.png"); }
    QVector<QPair<QString, QPoint>> keyPlaces() const override;
};

class KeypadLetters : public KeypadPage
{
    Q_OBJECT
public:
    explicit KeypadLetters(QWidget* parent = nullptr);

protected:
    QSize keySize() const override { return QSize(39, 47); }
    QString keyPicture() const override { return QStringLiteral(":/Keyboard/key_letter.png"); }
    QVector<QPair<QString, QPoint>> keyPlaces() const override;
};

class Keypad : public QWidget
{
    Q_OBJECT
public:
    explicit Keypad(QWidget* parent = nullptr);

    KeypadLetters* letters() const { return m_letters; }
    KeypadNumbers* numbers() const { return m_numbers; }
    XPushButton* btnNumLetter() const { return BtnNumLetter; }
    XPushButton* btnSpace() const { return BtnSpace; }
    XPushButton* btnDelete() const { return BtnDelete; }

signals:
    void keyClicked(QString text);
    void deleteClicked();

public slots:
    void on_BtnNumLetter_clicked();

protected:
    void changeEvent(QEvent* event) override;

private:
    void retranslate();

    QLabel* labelBackground;
    KeypadLetters* m_letters;
    KeypadNumbers* m_numbers;
    XPushButton* BtnNumLetter;
    XPushButton* BtnSpace;
    XPushButton* BtnDelete;
};

#endif // KEYPAD_H
