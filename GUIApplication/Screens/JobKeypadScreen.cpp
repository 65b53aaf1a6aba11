#include "Screens/JobKeypadScreen.h"
#include "ui_JobKeypadScreen.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/UserParams.h"

#include <QEvent>
#include <QFontMetricsF>
#include <QKeyEvent>
#include <QLabel>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QStyle>
#include <QTextCursor>

namespace {

const QColor kKeyText(0, 174, 239);
const QColor kKeyTextDisabled(190, 190, 190);

// Keys are drawn as small raised caps on the keypad's grey ground; the text
// colour comes from the palette so that a disabled key greys out.
const char* const kKeyStyle =
    "QLabel { background-color: rgb(255, 255, 255); border-radius: 4px;"
    " border-bottom: 1px solid rgb(188, 190, 192); margin: 3px 1px 3px 1px; }"
    "QLabel:disabled { background-color: rgb(241, 242, 242); border-bottom: none; }";

const char* const kFunctionKeyStyle =
    "QPushButton { color: rgb(0, 174, 239); border: none; border-radius: 4px;"
    " background-color: rgb(214, 215, 217); margin: 3px 1px 3px 1px; }"
    "QPushButton:pressed { background-color: rgb(214, 241, 252); }"
    "QPushButton:disabled { color: rgb(190, 190, 190); background-color: rgb(236, 237, 238); }";

const char* const kFieldStyle =
    "background-image: url(:/Assets/entry_field.png);border-image: url(:/Assets/entry_field.png);"
    "selection-background-color: rgb(0, 174, 239);";
const char* const kFieldStyleInvalid =
    "background-image: url(:/Assets/entry_field.png);border-image: url(:/Assets/entry_field.png);"
    "color: rgb(200, 0, 0);";

// The languages whose text is composed from parts rather than typed.
bool isComposedLanguage(const QString& code)
{
    return code == QLatin1String("ko") || code == QLatin1String("zh_Hant")
           || code == QLatin1String("zh_Hans");
}

// Right and bottom edges count the last pixel of the key.
int rightEdge(const QRect& r) { return r.left() + r.width() - 1; }
int bottomEdge(const QRect& r) { return r.top() + r.height() - 1; }

} // namespace

// ---------------------------------------------------------------- KeypadLayout

namespace KeypadLayout {

int layerOf(bool caps, bool special)
{
    if (caps)
        return special ? JobKeypadScreen::LayerSpecialCapital : JobKeypadScreen::LayerCapital;
    return special ? JobKeypadScreen::LayerSpecialLower : JobKeypadScreen::LayerLower;
}

int createKeyLabels(QWidget* parent, const KeypadArray& array, KeyLayers& layers)
{
    QFont font = parent->font();
    font.setPointSize(20);
    QPalette palette = parent->palette();
    for (QPalette::ColorGroup group : {QPalette::Active, QPalette::Inactive}) {
        palette.setColor(group, QPalette::WindowText, kKeyText);
        palette.setColor(group, QPalette::Text, kKeyText);
    }
    palette.setColor(QPalette::Disabled, QPalette::WindowText, kKeyTextDisabled);
    palette.setColor(QPalette::Disabled, QPalette::Text, kKeyTextDisabled);

    layers = KeyLayers(JobKeypadScreen::NumLayers);
    int rowY = 0;
    auto addLabel = [&](const KEYPAD_BUTTON_T& key, QChar character, int layer) {
        auto* label = new KeyPadLabel(parent);
        label->m_Key = key;
        label->setGeometry(key.geometry);
        // A glyph wider than its key (a CJK font's full-width sign) shrinks.
        label->setAutoSize(true);
        label->setFont(font);
        label->setText(QString(character));
        label->setPalette(palette);
        label->setStyleSheet(kKeyStyle);
        label->setAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
        label->raise();
        layers[layer].append(label);
        rowY = std::max(rowY, bottomEdge(key.geometry));
    };
    for (const KEYPAD_BUTTON_T& key : array) {
        if (!key.characterCap.isNull())
            addLabel(key, key.characterCap,
                     key.special ? JobKeypadScreen::LayerSpecialCapital : JobKeypadScreen::LayerCapital);
        if (!key.characterLow.isNull())
            addLabel(key, key.characterLow,
                     key.special ? JobKeypadScreen::LayerSpecialLower : JobKeypadScreen::LayerLower);
    }
    return rowY;
}

bool hasSpecialPage(const KeyLayers& layers)
{
    return layers.size() == JobKeypadScreen::NumLayers
           && (!layers[JobKeypadScreen::LayerSpecialCapital].isEmpty()
               || !layers[JobKeypadScreen::LayerSpecialLower].isEmpty());
}

void showLayer(const KeyLayers& layers, int shown)
{
    for (int layer = 0; layer < layers.size(); ++layer) {
        for (KeyPadLabel* label : layers[layer]) {
            label->setVisible(layer == shown);
            label->setEnabled(layer == shown);
        }
    }
}

KeyPadLabel* keyAt(const KeyLayers& layers, int layer, const QPoint& pos)
{
    if (layer < 0 || layer >= layers.size())
        return nullptr;
    for (KeyPadLabel* label : layers[layer]) {
        if (label->isEnabled() && label->geometry().contains(pos))
            return label;
    }
    return nullptr;
}

XPushButton* createFunctionKey(QWidget* parent, const QString& name)
{
    auto* button = new XPushButton(parent);
    button->setObjectName(name);
    button->setFlat(true);
    button->setFocusPolicy(Qt::NoFocus);
    button->setAutoFillBackground(false);
    button->setStyleSheet(kFunctionKeyStyle);
    QFont font = button->font();
    font.setPointSize(20);
    button->setFont(font);
    button->setDebounceEnabled(false);
    return button;
}

void fitText(QPushButton* button, const QString& text)
{
    button->setText(text);
    QFont font = button->font();
    font.setPointSize(20);
    const QFontMetricsF metrics(font);
    const qreal textWidth = metrics.horizontalAdvance(text);
    const qreal textHeight = metrics.height();
    // The key's cap is inset by its margins.
    const qreal width = button->width() - 8;
    const qreal height = button->height() - 6;
    const qreal ratio = std::min(textWidth > 0 ? width / textWidth : 1.0,
                                 textHeight > 0 ? height / textHeight : 1.0);
    if (ratio < 1.0)
        font.setPointSizeF(std::max<qreal>(1.0, font.pointSizeF() * ratio));
    button->setFont(font);
}

QPoint notificationPlace(const QWidget* key, const QSize& popup)
{
    const QRect g = key->geometry();
    const int centreX = g.left() + g.width() / 2;
    const int centreY = g.top() + g.height() / 2;
    return QPoint(centreX - popup.width() / 2, centreY + 44 - popup.height());
}

} // namespace KeypadLayout

// ---------------------------------------------------------------- KeyPadLabel

KeyPadLabel::KeyPadLabel(QWidget* parent)
    : KLabel(parent)
{
    // The panel tracks the finger; the label must not swallow the press.
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

// ---------------------------------------------------------------- KeypadNotification

KeypadNotification::KeypadNotification(QWidget* parent)
    : QWidget(parent)
    , labelBackground(new QLabel(this))
    , labelText(new QLabel(this))
{
    setObjectName("KeypadNotification");
    resize(92, 134);
    setAttribute(Qt::WA_TransparentForMouseEvents);
    labelBackground->setObjectName("labelBackground");
    labelBackground->setGeometry(0, 0, 92, 134);
    labelBackground->setPixmap(QPixmap(":/Assets/touch_popup.png"));
    labelText->setObjectName("labelText");
    labelText->setGeometry(20, 10, 50, 40);
    QFont font = labelText->font();
    font.setPointSize(24);
    font.setWeight(75);
    labelText->setFont(font);
    labelText->setAlignment(Qt::AlignHCenter | Qt::AlignVCenter);
    labelText->setStyleSheet("color: rgb(0, 174, 239); background: transparent;");
}

KeypadNotification::KeypadNotification(QString text, QWidget* parent)
    : KeypadNotification(parent)
{
    setText(text);
}

void KeypadNotification::setText(QString text)
{
    labelText->setText(text);
}

QString KeypadNotification::text() const
{
    return labelText->text();
}

// ---------------------------------------------------------------- JobKeypadScreen

JobKeypadScreen::JobKeypadScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::JobKeypadScreen)
{
    ui->setupUi(this);
    ui->labelCover->hide();
    ui->multilingualBufferLabel->hide();
    ui->TxtTitle->setAutoSize(false);
    ui->textEdit->setStyleSheet(kFieldStyle);
    ui->textEdit->document()->setDocumentMargin(4);
    // The read switch and the power key arrive as Return; in the field they
    // would become a line break.
    ui->textEdit->installEventFilter(this);

    createKeypad();
    connect(ui->textEdit, &QPlainTextEdit::cursorPositionChanged, this,
            &JobKeypadScreen::on_textEdit_textChanged);
    ui->textEdit->setFocus();
}

JobKeypadScreen::~JobKeypadScreen()
{
    m_composer.reset();
    delete ui;
}

void JobKeypadScreen::setEntryLength(int length)
{
    m_entryLength = length;
    textEditChanged();
}

void JobKeypadScreen::setChangeColor(bool changeColor)
{
    m_changeColor = changeColor;
}

QPlainTextEdit* JobKeypadScreen::getTextEditPointer() const
{
    return ui->textEdit;
}

QString JobKeypadScreen::text() const
{
    return ui->textEdit->toPlainText();
}

XPushButton* JobKeypadScreen::btnBack() const
{
    return ui->BtnBack;
}

XPushButton* JobKeypadScreen::btnNext() const
{
    return ui->BtnNext;
}

QString JobKeypadScreen::title() const
{
    return ui->TxtTitle->defaultText();
}

int JobKeypadScreen::currentLayer() const
{
    return KeypadLayout::layerOf(m_displayCap, m_displaySpecial);
}

void JobKeypadScreen::setTitle(const QString& title)
{
    // The title stands between the back and next buttons; a long tag name
    // is shrunk to the free middle rather than run under them.
    const int room = 104;
    QFont font = ui->TxtTitle->defaultFont();
    font.setPointSize(15);
    const qreal width = QFontMetricsF(font).horizontalAdvance(title);
    if (width > room)
        font.setPointSizeF(std::max<qreal>(8.0, 15.0 * room / width));
    ui->TxtTitle->setText(title);
    ui->TxtTitle->QLabel::setFont(font);
}

void JobKeypadScreen::setTitle(std::function<QString()> title)
{
    m_titleSource = std::move(title);
    setTitle(m_titleSource ? m_titleSource() : QString());
}

void JobKeypadScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    CloseScreen();
}

void JobKeypadScreen::on_BtnNext_clicked()
{
    playSoundButtonClick();
    // A second tap queued behind the first would store twice or stack a
    // second refusal over the first.
    if (isClosing() || !popups().empty())
        return;
    onNextAction();
}

void JobKeypadScreen::onKeyClicked(const QString& text)
{
    PushEventKey(text);
}

void JobKeypadScreen::onDeleteClicked()
{
    if (m_multilingual && m_composer && m_composer->deletePressed())
        return;
    QTextCursor cursor = ui->textEdit->textCursor();
    if (cursor.hasSelection())
        cursor.removeSelectedText();
    else
        cursor.deletePreviousChar();
    ui->textEdit->setTextCursor(cursor);
    ui->textEdit->setFocus();
}

void JobKeypadScreen::onSpaceClicked()
{
    onKeyClicked(QStringLiteral(" "));
}

void JobKeypadScreen::onEnterClicked()
{
    // Enter only takes a composition.
    if (m_multilingual && m_composer)
        m_composer->enterPressed();
}

JobKeypadScreen::ComposerFactory& JobKeypadScreen::composerFactory()
{
    static ComposerFactory factory;
    return factory;
}

void JobKeypadScreen::setComposerFactory(ComposerFactory factory)
{
    composerFactory() = std::move(factory);
}

QLabel* JobKeypadScreen::multilingualBufferLabel() const
{
    return ui->multilingualBufferLabel;
}

QLabel* JobKeypadScreen::labelCover() const
{
    return ui->labelCover;
}

void JobKeypadScreen::onShiftClicked()
{
    onDisplayCaps(!m_displayCap);
}

void JobKeypadScreen::onSpecialClicked()
{
    onDisplaySpecial(!m_displaySpecial);
}

void JobKeypadScreen::onDisplayCaps(bool caps)
{
    m_displayCap = caps;
    updateKeypad();
}

void JobKeypadScreen::onDisplaySpecial(bool special)
{
    m_displaySpecial = special;
    updateKeypad();
}

void JobKeypadScreen::onHandleCursorSelection(bool)
{
}

void JobKeypadScreen::on_textEdit_textChanged()
{
    textEditChanged();
}

void JobKeypadScreen::onKeyPressed(QWidget* key)
{
    KeyPadLabel* label = qobject_cast<KeyPadLabel*>(key);
    if (!label || label == m_currentKey)
        return;
    if (m_keyPopup) {
        m_keyPopup->hide();
        delete m_keyPopup;
        m_keyPopup = nullptr;
    }
    m_keyPopup = createKeyPressedNotification(label->text());
    if (m_keyPopup) {
        m_keyPopup->move(KeypadLayout::notificationPlace(label, m_keyPopup->size()));
        m_keyPopup->raise();
        m_keyPopup->show();
    }
    m_currentKey = label;
}

void JobKeypadScreen::onKeyReleased()
{
    if (m_keyPopup) {
        m_keyPopup->hide();
        delete m_keyPopup;
        m_keyPopup = nullptr;
    }
    m_currentKey = nullptr;
}

bool JobKeypadScreen::onShowMultilingualPopup(const QString&)
{
    return false;
}

void JobKeypadScreen::onCharsSelected(QString chars)
{
    // A candidate taken from the composing input goes in like typed text.
    ui->textEdit->insertPlainText(chars);
}

void JobKeypadScreen::setKeysEnabled(bool enabled)
{
    for (const QVector<KeyPadLabel*>& layer : qAsConst(m_keys)) {
        for (KeyPadLabel* label : layer)
            label->setEnabled(enabled);
    }
    if (BtnSpace)
        BtnSpace->setEnabled(enabled);
}

void JobKeypadScreen::setFieldStyle(bool invalid)
{
    QPlainTextEdit* field = ui->textEdit;
    field->setStyleSheet(invalid ? kFieldStyleInvalid : kFieldStyle);
    field->style()->unpolish(field);
    field->style()->polish(field);
    field->update();
}

void JobKeypadScreen::textEditChanged()
{
    setKeysEnabled(ui->textEdit->toPlainText().length() < m_entryLength);
    if (m_changeColor) {
        // A name that another job carries already shows red while typed.
        const QString name = ui->textEdit->toPlainText().trimmed();
        DataManager* data = DataManager::instance();
        const bool taken = data->doesJobDisplayNameExist(name)
                           && name != data->getActiveJobObject().getDisplayName();
        setFieldStyle(taken);
    }
    ui->textEdit->setFocus();
}

void JobKeypadScreen::onNextAction()
{
    CloseScreen();
}

void JobKeypadScreen::createPopup()
{
}

void JobKeypadScreen::createKeypad()
{
    const int rowY = KeypadLayout::createKeyLabels(this, DataManager::instance()->getKeypadArray(), m_keys);
    m_functionRowY = rowY;

    const bool hasSpecial = KeypadLayout::hasSpecialPage(m_keys);

    BtnSpace = KeypadLayout::createFunctionKey(this, "BtnSpace");
    BtnSpace->setGeometry(hasSpecial ? 134 : 108, rowY, 104, 55);
    BtnSpace->setIcon(QIcon(":/Assets/keyboard_space_key.png"));
    BtnSpace->setIconSize(QSize(88, 44));

    BtnDelete = KeypadLayout::createFunctionKey(this, "BtnDelete");
    BtnDelete->setGeometry(rightEdge(BtnSpace->geometry()), rowY, 52, 55);
    BtnDelete->setIcon(QIcon(":/Assets/keyboard_back_key.png"));
    BtnDelete->setIconSize(QSize(44, 44));
    // Delete repeats while held, as on any keyboard.
    BtnDelete->setAutoRepeat(true);
    BtnDelete->setAutoRepeatDelay(500);
    BtnDelete->setAutoRepeatInterval(90);

    BtnEnter = KeypadLayout::createFunctionKey(this, "BtnEnter");
    BtnEnter->setGeometry(rightEdge(BtnDelete->geometry()), rowY, 52, 55);
    BtnEnter->setIcon(QIcon(":/Assets/keyboard_enter_key.png"));
    BtnEnter->setIconSize(QSize(52, 44));
    BtnEnter->setDebounceEnabled(true);

    BtnShift = KeypadLayout::createFunctionKey(this, "BtnShift");
    BtnShift->setGeometry(BtnSpace->x() - 52, rowY, 52, 55);
    BtnShift->setIcon(QIcon(":/Assets/keyboard_shift_key.png"));
    BtnShift->setIconSize(QSize(44, 44));

    BtnSpecial = KeypadLayout::createFunctionKey(this, "BtnSpecial");
    BtnSpecial->setGeometry(0, rowY, BtnShift->x(), 55);
    BtnSpecial->setVisible(hasSpecial);
    BtnSpecial->setEnabled(hasSpecial);

    const QString code = UserParams::instance()->getLanguageCode();
    m_multilingual = isComposedLanguage(code);
    BtnEnter->setVisible(m_multilingual);
    BtnEnter->setEnabled(m_multilingual);
    if (m_multilingual) {
        initComposer(code);
        if (composerFactory())
            m_composer.reset(composerFactory()(this, code));
        BtnShift->hide();
        BtnShift->setEnabled(false);
        for (XPushButton* button : {BtnShift, BtnSpace, BtnDelete, BtnEnter})
            button->move(button->x() - 26, button->y());
    }

    for (XPushButton* button : {BtnSpace, BtnDelete, BtnEnter, BtnShift, BtnSpecial})
        button->raise();

    connect(BtnSpace, &QPushButton::clicked, this, &JobKeypadScreen::onSpaceClicked);
    connect(BtnEnter, &QPushButton::clicked, this, &JobKeypadScreen::onEnterClicked);
    connect(BtnDelete, &QPushButton::clicked, this, &JobKeypadScreen::onDeleteClicked);
    connect(BtnShift, &QPushButton::clicked, this, &JobKeypadScreen::onShiftClicked);
    connect(BtnSpecial, &QPushButton::clicked, this, &JobKeypadScreen::onSpecialClicked);

    updateKeypad();
}

void JobKeypadScreen::initComposer(const QString&)
{
}

void JobKeypadScreen::updateKeypad()
{
    KeypadLayout::showLayer(m_keys, currentLayer());
    // Shift shows its latch by the accent ground.
    if (BtnShift) {
        BtnShift->setProperty("selected", m_displayCap);
        BtnShift->setStyleSheet(QString(kFunctionKeyStyle)
                                + (m_displayCap ? "QPushButton { background-color: rgb(214, 241, 252); }" : ""));
    }
    updateSpecialText();
    textEditChanged();
}

void JobKeypadScreen::updateSpecialText()
{
    if (!BtnSpecial)
        return;
    // A translation longer than the key shrinks to fit it.
    KeypadLayout::fitText(BtnSpecial, m_displaySpecial ? tr("ABC") : tr("Special Keys"));
}

QWidget* JobKeypadScreen::createKeyPressedNotification(QString text)
{
    return new KeypadNotification(text, this);
}

void JobKeypadScreen::PushEventKey(const QString& text)
{
    if (m_multilingual && (onShowMultilingualPopup(text) || (m_composer && m_composer->keyPressed(text))))
        return;
    QTextCursor cursor = ui->textEdit->textCursor();
    cursor.insertText(text);
    ui->textEdit->setTextCursor(cursor);
    ui->textEdit->setFocus();
}

void JobKeypadScreen::onUpdateScreen()
{
    DaddyPanel::onUpdateScreen();
    // The job went away under the screen (deleted, or the link dropped).
    if (!isClosing() && !DataManager::instance()->getActiveJobObject().isJobValid())
        CloseScreen();
}

KeyPadLabel* JobKeypadScreen::keyAt(const QPoint& pos) const
{
    return KeypadLayout::keyAt(m_keys, currentLayer(), pos);
}

void JobKeypadScreen::mousePressEvent(QMouseEvent* event)
{
    DaddyPanel::mousePressEvent(event);
    // The panel follows the finger from here to the release.
    event->accept();
    if (KeyPadLabel* label = keyAt(event->pos()))
        onKeyPressed(label);
}

void JobKeypadScreen::mouseMoveEvent(QMouseEvent* event)
{
    DaddyPanel::mouseMoveEvent(event);
    event->accept();
    if (KeyPadLabel* label = keyAt(event->pos()))
        onKeyPressed(label);
    else
        onKeyReleased();
}

void JobKeypadScreen::mouseReleaseEvent(QMouseEvent* event)
{
    DaddyPanel::mouseReleaseEvent(event);
    event->accept();
    if (m_currentKey)
        onKeyClicked(m_currentKey->text());
    onKeyReleased();
}

bool JobKeypadScreen::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == ui->textEdit
        && (event->type() == QEvent::KeyPress || event->type() == QEvent::KeyRelease)) {
        auto* key = static_cast<QKeyEvent*>(event);
        if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
            if (event->type() == QEvent::KeyPress)
                keyPressEvent(key);
            else
                keyReleaseEvent(key);
            return true;
        }
    }
    return DaddyPanel::eventFilter(watched, event);
}

void JobKeypadScreen::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        retranslate();
    DaddyPanel::changeEvent(event);
}

void JobKeypadScreen::retranslate()
{
    const QString title = ui->TxtTitle->defaultText();
    ui->retranslateUi(this);
    setTitle(m_titleSource ? m_titleSource() : title);
    updateSpecialText();
}
