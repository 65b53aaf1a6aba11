#include "Screens/JobEditScreens.h"

#include "GUIAPI/DataManager.h"
#include "Screens/NotificationPopup.h"
#include "SharedSystem/Job.h"
#include "Widgets/KLabel.h"
#include "Widgets/WordWrapButton.h"

#include <QLabel>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QStyle>
#include <QTextCursor>

namespace {

// The ground of the strip between the field and the keys.
const char* const kStripStyle = "background-color: rgb(245, 245, 246); border-bottom: 1px solid rgb(188, 190, 192);";

const char* const kQuickSelectStyle =
    "QPushButton { border: none; background: transparent;"
    " border-image: url(:/Assets/keyboard_quick_select_button.png); }"
    "QPushButton:pressed { border-image: none; background-color: rgb(214, 241, 252); border-radius: 18px; }";

const char* const kMoreStyle =
    "QPushButton { border: 2px solid rgb(0, 174, 239); border-radius: 18px; color: rgb(0, 174, 239);"
    " background-color: rgb(255, 255, 255); margin: 2px 0px 2px 0px; }"
    "QPushButton[selected=\"true\"] { color: rgb(255, 255, 255); background-color: rgb(0, 174, 239); }"
    "QPushButton:disabled { color: rgb(190, 190, 190); border-color: rgb(190, 190, 190); }";

const int kQuickWidth = 120;
const int kQuickHeight = 40;
const int kLeftColumn = 6;
const int kMiddleColumn = 132;
const int kStripTop = 106;
// The list opens under the strip, one row per two matches.
const int kListTop = 150;
const int kListRowStep = 44;

WordWrapButton* makeQuickSelect(QWidget* parent, const QString& name, int x, int y)
{
    auto* button = new WordWrapButton(parent);
    button->setObjectName(name);
    button->setFocusPolicy(Qt::NoFocus);
    button->setFlat(true);
    button->setStyleSheet(kQuickSelectStyle);
    button->setGeometry(x, y, kQuickWidth, kQuickHeight);
    QFont font = button->font();
    font.setPointSize(12);
    button->setFont(font);
    button->setFontColor(0, 174, 239);
    button->setTextAutoSize(true);
    return button;
}

// Moves the cursor to the end so that typing goes on after a filled text.
void cursorToEnd(QPlainTextEdit* field)
{
    QTextCursor cursor = field->textCursor();
    cursor.movePosition(QTextCursor::End);
    field->setTextCursor(cursor);
}

// The job as the server now holds it, at once: the next screen must not edit
// from the copy the change left behind, and the summary shows it.
void rereadJob()
{
    DataManager::instance()->updateCurrentJobInfo();
}

NotificationPopup* makeNotification(DaddyPanel* panel, const QString& header, const QString& message)
{
    auto* popup = new NotificationPopup(panel->parentWidget() ? panel->parentWidget() : panel);
    popup->setButtonText(JobKeypadScreen::tr("OK"));
    popup->setHeaderText(header);
    popup->setMessageText(message);
    QObject::connect(popup, &NotificationPopup::btnClicked, panel, QOverload<>::of(&DaddyPanel::onClosePopup));
    QObject::connect(popup, &PopupPanel::closePopup, panel, QOverload<PopupPanel*>::of(&DaddyPanel::onClosePopup));
    panel->onAddPopup(popup);
    return popup;
}

} // namespace

// ---------------------------------------------------------------- name

JobNameEditScreen::JobNameEditScreen(QWidget* parent)
    : JobKeypadScreen(parent)
{
    setObjectName("JobNameEditScreen");
    setTitle([] { return tr("Name"); });
    setChangeColor(true);
    setEntryLength(20);
    QPlainTextEdit* field = getTextEditPointer();
    field->setPlainText(DataManager::instance()->getActiveJobObject().getDisplayName());
    // All selected: the first key replaces the name.
    QTextCursor cursor = field->textCursor();
    cursor.movePosition(QTextCursor::Start);
    cursor.movePosition(QTextCursor::End, QTextCursor::KeepAnchor);
    field->setTextCursor(cursor);
}

void JobNameEditScreen::useTallField()
{
    QPlainTextEdit* field = getTextEditPointer();
    m_pBtnBackground = new QLabel(this);
    m_pBtnBackground->setObjectName("m_pBtnBackground");
    m_pBtnBackground->setGeometry(0, 104, 320, 44);
    m_pBtnBackground->setStyleSheet(kStripStyle);
    m_pBtnBackground->show();
    m_pBtnBackground->stackUnder(field);
    field->setGeometry(field->x(), field->y(), field->width(), field->height() * 2);
    field->setVerticalScrollBarPolicy(Qt::ScrollBarAsNeeded);
}

void JobNameEditScreen::onNextAction()
{
    DataManager* data = DataManager::instance();
    const QString name = text().trimmed();
    const QString own = data->getActiveJobObject().getDisplayName();
    if (name.isEmpty() || (data->doesJobDisplayNameExist(name) && name != own)) {
        playSoundErrorUser();
        createPopup();
        return;
    }
    // Keeping the own name is allowed and sends nothing.
    if (name != own) {
        data->editCurrentJobDisplayName(name);
        rereadJob();
    }
    CloseScreen();
}

void JobNameEditScreen::createPopup()
{
    if (text().trimmed().isEmpty())
        makeNotification(this, tr("Job Name cannot be empty"), tr("Enter a unique job name that is not empty"));
    else
        makeNotification(this, tr("Job Name Already Exists"),
                         tr("This job name already exists.  Please change the name to a unique name"));
}

// ---------------------------------------------------------------- free tag

JobTagFreeEditScreen::JobTagFreeEditScreen(TAG_STATES_T state, QWidget* parent)
    : JobNameEditScreen(parent)
    , m_tagState(state)
{
    setObjectName("JobTagFreeEditScreen");
    DataManager* data = DataManager::instance();
    setTitle([state] { return DataManager::instance()->getTagStateName(state); });
    setChangeColor(false);
    setEntryLength(40);
    useTallField();
    QPlainTextEdit* field = getTextEditPointer();
    field->setPlainText(data->getActiveJobObject().getTagData(state).defaultName());
    cursorToEnd(field);
    setFieldStyle(false);
}

void JobTagFreeEditScreen::onNextAction()
{
    DataManager* data = DataManager::instance();
    const QString value = text().trimmed();
    TAG_ENTRY_DATA_T tag;
    tag.setDefaultName(value);
    tag.displayName = value;
    tag.id = data->getTagID(m_tagState, value);
    tag.filterName = data->getTagStateNameDefaultLanguage(m_tagState);
    Job job = data->getActiveJobObject();
    job.setTagData(m_tagState, tag);
    data->editJob(data->getActiveJob(), job);
    rereadJob();
    CloseScreen();
}

void JobTagFreeEditScreen::createPopup()
{
}

// ---------------------------------------------------------------- notes

JobFreeTextEditScreen::JobFreeTextEditScreen(QWidget* parent)
    : JobNameEditScreen(parent)
{
    setObjectName("JobFreeTextEditScreen");
    setTitle([] { return tr("Notes"); });
    setChangeColor(false);
    setEntryLength(40);
    useTallField();
    QPlainTextEdit* field = getTextEditPointer();
    field->setPlainText(DataManager::instance()->getActiveJobObject().getNotes());
    cursorToEnd(field);
    setFieldStyle(false);
}

void JobFreeTextEditScreen::onNextAction()
{
    DataManager* data = DataManager::instance();
    Job job = data->getActiveJobObject();
    job.setNotes(text());
    data->editJob(data->getActiveJob(), job);
    rereadJob();
    CloseScreen();
}

void JobFreeTextEditScreen::createPopup()
{
}

// ---------------------------------------------------------------- tag from the filter file

JobTagEditScreen::JobTagEditScreen(TAG_STATES_T state, QWidget* parent)
    : JobKeypadScreen(parent)
    , m_tagState(state)
{
    setObjectName("JobTagEditScreen");
    DataManager* data = DataManager::instance();

    m_pBtnBackground = new QLabel(this);
    m_pBtnBackground->setObjectName("m_pBtnBackground");
    m_pBtnBackground->setGeometry(0, 104, 320, 44);
    m_pBtnBackground->setStyleSheet(kStripStyle);
    m_pBtnBackground->show();
    m_pBtnBackground->stackUnder(getTextEditPointer());

    m_pBtnLeft = makeQuickSelect(this, "m_pBtnLeft", kLeftColumn, kStripTop);
    m_pBtnMiddle = makeQuickSelect(this, "m_pBtnMiddle", kMiddleColumn, kStripTop);
    m_pBtnMore = new XPushButton(this);
    m_pBtnMore->setObjectName("m_pBtnMore");
    m_pBtnMore->setFocusPolicy(Qt::NoFocus);
    m_pBtnMore->setFlat(true);
    m_pBtnMore->setGeometry(258, kStripTop, 56, kQuickHeight);
    m_pBtnMore->setStyleSheet(kMoreStyle);
    QFont moreFont = m_pBtnMore->font();
    moreFont.setPointSize(16);
    moreFont.setBold(true);
    m_pBtnMore->setFont(moreFont);
    // Three dots read as "more" in every language.
    m_pBtnMore->setText(QString(QChar(0x2026)));
    m_pBtnMore->setProperty("selected", false);
    for (QWidget* w : {static_cast<QWidget*>(m_pBtnLeft), static_cast<QWidget*>(m_pBtnMiddle),
                       static_cast<QWidget*>(m_pBtnMore)}) {
        w->raise();
    }

    connect(m_pBtnLeft, &QPushButton::clicked, this, &JobTagEditScreen::onBtnLeftClicked);
    connect(m_pBtnMiddle, &QPushButton::clicked, this, &JobTagEditScreen::onBtnMiddleClicked);
    connect(m_pBtnMore, &QPushButton::clicked, this, &JobTagEditScreen::onBtnMoreClicked);

    setTitle([state] { return DataManager::instance()->getTagStateName(state); });
    QPlainTextEdit* field = getTextEditPointer();
    field->setPlainText(data->getActiveJobObject().getTagData(state).defaultName());
    cursorToEnd(field);
    textEditChanged();
}

bool JobTagEditScreen::isListOpen() const
{
    return m_pBtnMore && m_pBtnMore->property("selected").toBool();
}

void JobTagEditScreen::textEditChanged()
{
    // The base constructor runs this before the buttons exist.
    if (!m_pBtnMore) {
        JobKeypadScreen::textEditChanged();
        return;
    }
    DataManager* data = DataManager::instance();
    const QString typed = text();
    m_beginsWithMatches = data->tagSmartAutoLookupBeginsWith(m_tagState, typed);

    m_pBtnLeft->hide();
    m_pBtnMiddle->hide();
    m_pBtnMore->hide();

    // Only the keys that continue a known tag stay alive.
    setKeysEnabled(false);
    bool spaceContinues = false;
    for (const TAG_ENTRY_DATA_T& match : qAsConst(m_beginsWithMatches)) {
        const QString name = match.defaultName();
        if (typed.length() >= name.length())
            continue;
        const QString next = QString(name.at(typed.length())).toUpper();
        if (next == QLatin1String(" "))
            spaceContinues = true;
        for (const QVector<KeyPadLabel*>& layer : qAsConst(m_keys)) {
            for (KeyPadLabel* label : layer) {
                if (label->text().toUpper() == next)
                    label->setEnabled(true);
            }
        }
    }
    if (BtnSpace)
        BtnSpace->setEnabled(spaceContinues);

    const int count = m_beginsWithMatches.size();
    if (typed.isEmpty() && count >= 3 && count <= kMaxListed)
        m_pBtnMore->show();
    if (count >= 1) {
        m_pBtnLeft->setText(m_beginsWithMatches.at(0).defaultName());
        m_pBtnLeft->show();
    }
    if (count >= 2) {
        m_pBtnMiddle->setText(m_beginsWithMatches.at(1).defaultName());
        m_pBtnMiddle->show();
    }
    if (count >= 3)
        m_pBtnMore->show();
    // Too many to list: the button stays, greyed, and leads nowhere.
    m_pBtnMore->setEnabled(count <= kMaxListed);
    // A list left open over the keys would outlive its button.
    if (isListOpen() && !m_pBtnMore->isVisible()) {
        clearAutoFillPopup();
        setBtnMoreState(false);
    }

    setFieldStyle(!data->doesTagNameExist(m_tagState, typed));
    getTextEditPointer()->setFocus();
}

void JobTagEditScreen::onBtnLeftClicked()
{
    playSoundButtonClick();
    onAutoFillSelected(m_pBtnLeft->text());
}

void JobTagEditScreen::onBtnMiddleClicked()
{
    playSoundButtonClick();
    onAutoFillSelected(m_pBtnMiddle->text());
}

void JobTagEditScreen::onAutoFillSelected(QString text)
{
    QPlainTextEdit* field = getTextEditPointer();
    field->setPlainText(text);
    cursorToEnd(field);
}

void JobTagEditScreen::onBtnMoreClicked()
{
    playSoundButtonClick();
    if (isListOpen()) {
        clearAutoFillPopup();
        setBtnMoreState(false);
        return;
    }
    // Too many to list: the button stays, but it leads nowhere.
    if (m_beginsWithMatches.size() > kMaxListed)
        return;

    const int count = m_beginsWithMatches.size();
    const int rows = (count + 1) / 2;
    m_autoFillBackground = new QLabel(this);
    m_autoFillBackground->setObjectName("m_autoFillBackground");
    m_autoFillBackground->setPixmap(QPixmap(":/Assets/modal_overlay_inset_440.png"));
    m_autoFillBackground->setScaledContents(true);
    m_autoFillBackground->setGeometry(2, kListTop - 4, 316, rows * kListRowStep + 8);
    m_autoFillBackground->show();
    m_autoFillBackground->raise();
    for (int i = 0; i < count; ++i) {
        const int x = (i & 1) ? kMiddleColumn : kLeftColumn;
        const int y = kListTop + (i / 2) * kListRowStep;
        WordWrapButton* button = makeQuickSelect(this, QString("autoFill%1").arg(i), x, y);
        button->setText(m_beginsWithMatches.at(i).defaultName());
        connect(button, &QPushButton::clicked, this, &JobTagEditScreen::onListButtonClicked);
        button->show();
        button->raise();
        m_autoFillBtns.append(button);
    }
    setBtnMoreState(true);
}

void JobTagEditScreen::onListButtonClicked()
{
    auto* button = qobject_cast<WordWrapButton*>(sender());
    if (!button)
        return;
    playSoundButtonClick();
    const QString chosen = button->text();
    clearAutoFillPopup();
    setBtnMoreState(false);
    onAutoFillSelected(chosen);
}

void JobTagEditScreen::clearAutoFillPopup()
{
    for (WordWrapButton* button : qAsConst(m_autoFillBtns)) {
        button->hide();
        button->deleteLater();
    }
    m_autoFillBtns.clear();
    if (m_autoFillBackground) {
        m_autoFillBackground->hide();
        m_autoFillBackground->deleteLater();
        m_autoFillBackground = nullptr;
    }
}

void JobTagEditScreen::setBtnMoreState(bool state)
{
    m_pBtnMore->setProperty("selected", state);
    m_pBtnMore->style()->unpolish(m_pBtnMore);
    m_pBtnMore->style()->polish(m_pBtnMore);
    m_pBtnMore->update();
}

void JobTagEditScreen::mousePressEvent(QMouseEvent* event)
{
    // The keys under the open list must not react.
    if (isListOpen())
        QWidget::mousePressEvent(event);
    else
        JobKeypadScreen::mousePressEvent(event);
}

void JobTagEditScreen::mouseMoveEvent(QMouseEvent* event)
{
    if (isListOpen())
        QWidget::mouseMoveEvent(event);
    else
        JobKeypadScreen::mouseMoveEvent(event);
}

void JobTagEditScreen::onNextAction()
{
    DataManager* data = DataManager::instance();
    const QString value = text().trimmed();
    const unsigned char rules = data->getTagRules();
    Job job = data->getActiveJobObject();

    if (!value.isEmpty() && !data->doesTagNameExist(m_tagState, value)) {
        playSoundErrorUser();
        createPopup();
        return;
    }

    m_beginsWithMatches = data->tagSmartAutoLookupBeginsWith(m_tagState, value);
    const TAG_ENTRY_DATA_T old = job.getTagData(m_tagState);

    TAG_ENTRY_DATA_T tag;
    tag.setDefaultName(value);
    tag.displayName = value;
    if (m_beginsWithMatches.isEmpty()) {
        tag.id = data->getTagID(m_tagState, value);
        tag.filterName = data->getTagStateNameDefaultLanguage(m_tagState);
    } else {
        for (const TAG_ENTRY_DATA_T& match : qAsConst(m_beginsWithMatches)) {
            if (match.defaultName() == value) {
                // The identity is taken from the first match, whichever
                // entry carried the equal name.
                tag.id = m_beginsWithMatches.at(0).id;
                tag.filterName = m_beginsWithMatches.at(0).filterName;
                break;
            }
        }
    }
    job.setTagData(m_tagState, tag);

    const bool bit0 = rules & 0x01;
    const bool bit1 = rules & 0x02;
    if (!value.isEmpty()) {
        switch (m_tagState) {
        case TAG_STATE_1:
            // A new first tag wipes the tags that hung below the old one.
            if (old.defaultName() != value && bit0) {
                const TAG_ENTRY_DATA_T empty = [] {
                    TAG_ENTRY_DATA_T e;
                    e.setDefaultName(QString());
                    return e;
                }();
                job.setTagData(TAG_STATE_2, empty);
                if (bit1)
                    job.setTagData(TAG_STATE_3, empty);
            }
            break;
        case TAG_STATE_2:
            // A second tag fills in its parent.
            if (job.getTagData(TAG_STATE_1).defaultName().isEmpty() && bit0) {
                const TAG_ENTRY_DATA_T parent = data->getParentFilterTag(tag);
                if (!parent.defaultName().isEmpty())
                    job.setTagData(TAG_STATE_1, parent);
            }
            break;
        case TAG_STATE_3:
            if (job.getTagData(TAG_STATE_2).defaultName().isEmpty() && bit1) {
                const TAG_ENTRY_DATA_T parent = data->getParentFilterTag(tag);
                if (!parent.defaultName().isEmpty())
                    job.setTagData(TAG_STATE_2, parent);
                // The top-level parent lands on the second tag once more and
                // the first stays empty; jobs already out there carry their
                // tags this way, so it is kept.
                if (job.getTagData(TAG_STATE_1).defaultName().isEmpty()) {
                    const TAG_ENTRY_DATA_T again = data->getParentFilterTag(tag);
                    if (!again.defaultName().isEmpty())
                        job.setTagData(TAG_STATE_2, again);
                }
            }
            break;
        default:
            break;
        }
    } else {
        // Clearing a tag clears the tags that depend on it.
        if (m_tagState == TAG_STATE_1 && bit0) {
            job.setTagData(TAG_STATE_2, tag);
            if (bit1)
                job.setTagData(TAG_STATE_3, tag);
        } else if (m_tagState == TAG_STATE_2 && bit1) {
            job.setTagData(TAG_STATE_3, tag);
        }
    }

    data->editJob(data->getActiveJob(), job);
    rereadJob();
    CloseScreen();
}

void JobTagEditScreen::createPopup()
{
    makeNotification(this, tr("Tag Name Does Not Exist"),
                     tr("This tag name does not exist. Please change the name to an existing tag name"));
}
