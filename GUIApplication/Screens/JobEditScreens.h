#ifndef JOBEDITSCREENS_H
#define JOBEDITSCREENS_H

// The screens on which a job's name, tags and notes are typed. Each fills
// its field from the active job and, on next, checks and stores the text
// and closes.

#include "Screens/JobKeypadScreen.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Tags.h"

#include <QVector>

class WordWrapButton;

// The job's name: at most 20 characters, not empty, not another job's.
class JobNameEditScreen : public JobKeypadScreen
{
    Q_OBJECT
public:
    explicit JobNameEditScreen(QWidget* parent = nullptr);

public slots:
    void onNextAction() override;
    void createPopup() override;

protected:
    // The taller field of the tag and notes screens, with a ground behind
    // the strip it covers.
    void useTallField();

    QLabel* m_pBtnBackground = nullptr;
};

// A tag typed freely, for instruments that use no filter file.
class JobTagFreeEditScreen : public JobNameEditScreen
{
    Q_OBJECT
public:
    JobTagFreeEditScreen(TAG_STATES_T state, QWidget* parent = nullptr);

    TAG_STATES_T tagState() const { return m_tagState; }

public slots:
    void onNextAction() override;
    void createPopup() override;

private:
    TAG_STATES_T m_tagState;
};

// The job's notes.
class JobFreeTextEditScreen : public JobNameEditScreen
{
    Q_OBJECT
public:
    explicit JobFreeTextEditScreen(QWidget* parent = nullptr);

public slots:
    void onNextAction() override;
    void createPopup() override;
};

// A tag taken from the filter file. The keypad offers only the letters
// that continue a known tag, the first two matches stand ready as buttons,
// and "more" opens the list of up to 14.
class JobTagEditScreen : public JobKeypadScreen
{
    Q_OBJECT
public:
    // More matches than this and the list would not fit over the keypad.
    static const int kMaxListed = 14;

    JobTagEditScreen(TAG_STATES_T state, QWidget* parent = nullptr);

    TAG_STATES_T tagState() const { return m_tagState; }
    const QVector<TAG_ENTRY_DATA_T>& matches() const { return m_beginsWithMatches; }
    WordWrapButton* btnLeft() const { return m_pBtnLeft; }
    WordWrapButton* btnMiddle() const { return m_pBtnMiddle; }
    XPushButton* btnMore() const { return m_pBtnMore; }
    const QVector<WordWrapButton*>& autoFillButtons() const { return m_autoFillBtns; }
    bool isListOpen() const;

public slots:
    void textEditChanged() override;
    void onNextAction() override;
    void createPopup() override;

    virtual void onBtnLeftClicked();
    virtual void onBtnMiddleClicked();
    virtual void onAutoFillSelected(QString text);
    virtual void onBtnMoreClicked();
    virtual void clearAutoFillPopup();
    virtual void setBtnMoreState(bool state);

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;

private:
    void onListButtonClicked();

    QVector<TAG_ENTRY_DATA_T> m_beginsWithMatches;
    QVector<WordWrapButton*> m_autoFillBtns;
    QLabel* m_autoFillBackground = nullptr;
    QLabel* m_pBtnBackground = nullptr;
    WordWrapButton* m_pBtnLeft = nullptr;
    WordWrapButton* m_pBtnMiddle = nullptr;
    XPushButton* m_pBtnMore = nullptr;
    TAG_STATES_T m_tagState;
};

#endif // JOBEDITSCREENS_H
