#include "Screens/LockScreen.h"

#include "Screens/PopupForm.h"
#include "Widgets/BusySpinner.h"
#include "Widgets/KLabel.h"

#include <QLabel>

void Ui::LockScreen::setupUi(QWidget* screen)
{
    labelBackGround = PopupForm::dimmer(screen, "labelBackGround");
    icnPopupBkgnd = PopupForm::card(screen, false, "icnPopupBkgnd");
    spinner = new BusySpinner(screen);
    spinner->setObjectName("spinner");
    spinner->setGeometry(132, Theme::ShortCard.top() + 34, 56, 56);
    labelTextTitle = PopupForm::title(screen, "labelTextTitle",
                                      QRect(26, Theme::ShortCard.top() + 108, 268, 64));
    labelTextTitle->setWordWrap(true);
    labelTextTitle->setText(::LockScreen::tr("Instrument Locked"));
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
    killTimer.setSingleShot(true);
    connect(&killTimer, &QTimer::timeout, this, &LockScreen::onKillTimeout);
}

void LockScreen::setTitle(const QString& text)
{
    ui->labelTextTitle->setText(text);
}

QString LockScreen::title() const
{
    return ui->labelTextTitle->defaultText();
}

void LockScreen::onKillTimeout()
{
    CloseScreen();
}
