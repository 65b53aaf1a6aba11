#include "Screens/LockScreen.h"

#include "Screens/PopupForm.h"
#include "Widgets/SpinnyCircle.h"
#include "Widgets/KLabel.h"

#include <QCoreApplication>
#include <QEvent>
#include <QLabel>

void Ui::LockScreen::setupUi(QWidget* screen)
{
    labelBackGround = PopupForm::dimmer(screen, "labelBackGround");
    icnPopupBkgnd = PopupForm::card(screen, false, "icnPopupBkgnd");
    spinner = new SpinnyCircle(screen);
    spinner->setObjectName("spinner");
    spinner->move(130, Theme::ShortCard.top() + 32);
    labelTextTitle = PopupForm::title(screen, "labelTextTitle",
                                      QRect(26, Theme::ShortCard.top() + 108, 268, 64));
    labelTextTitle->setWordWrap(true);
}

LockScreen::LockScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::LockScreen)
{
    init();
}

LockScreen::LockScreen(int ms, QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::LockScreen)
{
    init();
    killTimer.start(ms);
}

LockScreen::~LockScreen()
{
    delete ui;
}

void LockScreen::init()
{
    setObjectName("LockScreen");
    ui->setupUi(this);
    setDefaultTitle("LockScreen", QT_TRANSLATE_NOOP("LockScreen", "Instrument Locked"));
    killTimer.setSingleShot(true);
    connect(&killTimer, &QTimer::timeout, this, &LockScreen::onKillTimeout);
}

void LockScreen::setTitle(const QString& text)
{
    m_titleContext = m_titleSource = nullptr;
    ui->labelTextTitle->setText(text);
}

void LockScreen::setDefaultTitle(const char* context, const char* sourceText)
{
    m_titleContext = context;
    m_titleSource = sourceText;
    ui->labelTextTitle->setText(QCoreApplication::translate(context, sourceText));
}

void LockScreen::changeEvent(QEvent* event)
{
    DaddyPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange && m_titleSource)
        ui->labelTextTitle->setText(QCoreApplication::translate(m_titleContext, m_titleSource));
}

QString LockScreen::title() const
{
    return ui->labelTextTitle->defaultText();
}

void LockScreen::onKillTimeout()
{
    CloseScreen();
}
