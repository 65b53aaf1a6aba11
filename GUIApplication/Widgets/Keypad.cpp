#include "Widgets/Keypad.h"

#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>
#include <QSignalMapper>

namespace {

const char* const kKeyText = "color: rgb(0, 174, 239);";

QFont boldFont(const QFont& base, int pointSize)
{
    QFont font = base;
    font.setPointSize(pointSize);
    font.setWeight(75);
    return font;
}

} // namespace

// ---------------------------------------------------------------- KeypadPage

KeypadPage::KeypadPage(QWidget* parent)
    : QWidget(parent)
{
    resize(320, 236);
}

KeypadPage::~KeypadPage()
{
    delete m_notificationPopup;
}

void KeypadPage::removeKeys()
{
    qDeleteAll(m_keys);
    m_keys.clear();
    delete m_clickedMapper;
    delete m_pressedMapper;
    delete m_releasedMapper;
    m_clickedMapper = m_pressedMapper = m_releasedMapper = nullptr;
}

void KeypadPage::createKeys()
{
    removeKeys();
    m_clickedMapper = new QSignalMapper(this);
    m_pressedMapper = new QSignalMapper(this);
    m_releasedMapper = new QSignalMapper(this);
    connect(m_clickedMapper, &QSignalMapper::mappedString, this, &KeypadPage::onKeyClicked);
    connect(m_pressedMapper, &QSignalMapper::mappedWidget, this, &KeypadPage::onKeyPressed);
    connect(m_releasedMapper, &QSignalMapper::mappedWidget, this, &KeypadPage::onKeyReleased);
    for (const auto& place : keyPlaces()) {
        XPushButton* key = createKey(place.first);
        key->move(place.second);
    }
}

XPushButton* KeypadPage::createKey()
{
    auto* key = new XPushButton(this);
    key->resize(keySize());
    key->setFont(boldFont(font(), 15));
    key->setFocusPolicy(Qt::NoFocus);
    key->setFlat(true);
    key->setStyleSheet(QString("QPushButton { border: none; border-image: url(%1); %2 }"
                               "QPushButton:pressed { color: rgb(0, 136, 194); }")
                           .arg(keyPicture(), kKeyText));
    key->show();
    m_keys.append(key);
    return key;
}

XPushButton* KeypadPage::createKey(QString text)
{
    XPushButton* key = createKey();
    key->setText(text);
    key->setObjectName("Key" + text);
    m_clickedMapper->setMapping(key, text);
    m_pressedMapper->setMapping(key, key);
    m_releasedMapper->setMapping(key, key);
    connect(key, &QPushButton::clicked, m_clickedMapper, QOverload<>::of(&QSignalMapper::map));
    connect(key, &QPushButton::pressed, m_pressedMapper, QOverload<>::of(&QSignalMapper::map));
    connect(key, &QPushButton::released, m_releasedMapper, QOverload<>::of(&QSignalMapper::map));
    return key;
}

void KeypadPage::onKeyClicked(QString text)
{
    emit keyClicked(text);
}

QLabel* KeypadPage::createKeyPressedNotification(QString text)
{
    auto* label = new QLabel(text, window());
    label->setObjectName("notification");
    label->resize(61, 73);
    label->setFont(boldFont(font(), 24));
    label->setAlignment(Qt::AlignCenter);
    label->setAttribute(Qt::WA_TransparentForMouseEvents);
    label->setStyleSheet(QString("background: transparent; border-image: url(:/Keyboard/touch_popup.png); %1")
                             .arg(kKeyText));
    return label;
}

void KeypadPage::onKeyPressed(QWidget* key)
{
    onKeyReleased(nullptr);
    auto* button = qobject_cast<XPushButton*>(key);
    if (!button)
        return;
    m_notificationPopup = createKeyPressedNotification(button->text());
    // Over the key, in the coordinates of the window that carries it.
    const QPoint keyTop = button->mapTo(window(), QPoint(button->width() / 2, 0));
    m_notificationPopup->move(keyTop.x() - m_notificationPopup->width() / 2,
                              keyTop.y() - m_notificationPopup->height());
    m_notificationPopup->raise();
    m_notificationPopup->show();
}

void KeypadPage::onKeyReleased(QWidget*)
{
    if (!m_notificationPopup)
        return;
    m_notificationPopup->hide();
    delete m_notificationPopup;
    m_notificationPopup = nullptr;
}

// ---------------------------------------------------------------- pages

KeypadNumbers::KeypadNumbers(QWidget* parent)
    : KeypadPage(parent)
{
    createKeys();
}

QVector<QPair<QString, QPoint>> KeypadNumbers::keyPlaces() const
{
    QVector<QPair<QString, QPoint>> places;
    for (int i = 0; i < 9; ++i)
        places.append({QString::number(i + 1), QPoint(20 + (i % 3) * 94, 33 + (i / 3) * 52)});
    places.append({QStringLiteral("0"), QPoint(114, 189)});
    return places;
}

KeypadLetters::KeypadLetters(QWidget* parent)
    : KeypadPage(parent)
{
    createKeys();
}

QVector<QPair<QString, QPoint>> KeypadLetters::keyPlaces() const
{
    // Rows of 7, 6, 7 and 6 letters; the short rows sit half a key in.
    static const int rowLengths[] = {7, 6, 7, 6};
    QVector<QPair<QString, QPoint>> places;
    char letter = 'A';
    for (int row = 0; row < 4; ++row) {
        const int left = rowLengths[row] == 7 ? 20 : 39;
        for (int i = 0; i < rowLengths[row]; ++i)
            places.append({QString(QChar(letter++)), QPoint(left + i * 40, 33 + row * 52)});
    }
    return places;
}

// ---------------------------------------------------------------- Keypad

Keypad::Keypad(QWidget* parent)
    : QWidget(parent)
    , labelBackground(new QLabel(this))
    , m_letters(new KeypadLetters(this))
    , m_numbers(new KeypadNumbers(this))
    , BtnNumLetter(new XPushButton(this))
    , BtnSpace(new XPushButton(this))
    , BtnDelete(new XPushButton(this))
{
    setObjectName("Keypad");
    resize(320, 322);
    labelBackground->setObjectName("labelBackground");
    labelBackground->setGeometry(0, 0, 320, 373);
    labelBackground->setStyleSheet("background-color: rgb(230, 231, 232);");
    labelBackground->lower();
    m_letters->setObjectName("KeypadLetters");
    m_letters->setGeometry(0, 0, 320, 236);
    m_numbers->setObjectName("KeypadNumbers");
    m_numbers->setGeometry(0, 0, 320, 236);
    m_numbers->hide();

    const QString style = "QPushButton { border: none; border-radius: 5px; color: rgb(0, 174, 239);"
                          " background-color: rgb(214, 215, 217); }"
                          "QPushButton:pressed { background-color: rgb(214, 241, 252); }";
    struct Place
    {
        XPushButton* button;
        const char* name;
        QRect geometry;
    };
    for (const Place& p : {Place{BtnNumLetter, "BtnNumLetter", QRect(20, 241, 79, 47)},
                           Place{BtnSpace, "BtnSpace", QRect(100, 241, 120, 47)},
                           Place{BtnDelete, "BtnDelete", QRect(221, 241, 79, 47)}}) {
        p.button->setObjectName(p.name);
        p.button->setGeometry(p.geometry);
        QFont font = p.button->font();
        font.setPointSize(15);
        p.button->setFont(font);
        p.button->setFocusPolicy(Qt::NoFocus);
        p.button->setStyleSheet(style);
    }
    BtnSpace->setIcon(QIcon(":/Assets/keyboard_space_key.png"));
    BtnSpace->setIconSize(QSize(88, 44));
    BtnDelete->setIcon(QIcon(":/Assets/keyboard_back_key.png"));
    BtnDelete->setIconSize(QSize(44, 44));

    connect(BtnNumLetter, &QPushButton::clicked, this, &Keypad::on_BtnNumLetter_clicked);
    connect(BtnSpace, &QPushButton::clicked, this, [this] { emit keyClicked(QStringLiteral(" ")); });
    connect(BtnDelete, &QPushButton::clicked, this, &Keypad::deleteClicked);
    connect(m_letters, &KeypadPage::keyClicked, this, &Keypad::keyClicked);
    connect(m_numbers, &KeypadPage::keyClicked, this, &Keypad::keyClicked);
    retranslate();
}

void Keypad::on_BtnNumLetter_clicked()
{
    const bool showLetters = !m_letters->isVisibleTo(this);
    m_letters->setVisible(showLetters);
    m_numbers->setVisible(!showLetters);
    retranslate();
}

void Keypad::retranslate()
{
    BtnNumLetter->setText(m_letters->isVisibleTo(this) ? tr("123") : tr("ABC"));
}

void Keypad::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        retranslate();
    QWidget::changeEvent(event);
}
