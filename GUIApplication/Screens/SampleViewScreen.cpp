#include "Screens/SampleViewScreen.h"
#include "ui_SampleViewScreen.h"

#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DeleteSamplePopup.h"
#include "SharedSystem/Sample.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/SampleViewPageContainer.h"

#include <QEvent>

SampleViewScreen::SampleViewScreen(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::SampleViewScreen)
{
    setObjectName(QStringLiteral("SampleViewScreen"));
    ui->setupUi(this);
    ui->spinner->hide();
    ui->labelTimestamp->hide();
    showTitle();
    connect(ui->PageContainer, &SampleViewPageContainer::gotoImageViewScreen, this,
            &SampleViewScreen::onGotoImageViewScreen);
    connect(this, &DaddyPanel::pageInView, ui->PageContainer, &SampleViewPageContainer::onPageInView);
}

SampleViewScreen::~SampleViewScreen()
{
    delete ui;
}

SampleViewPageContainer* SampleViewScreen::pageContainer() const
{
    return ui->PageContainer;
}

void SampleViewScreen::showTitle()
{
    DataManager* data = DataManager::instance();
    const unsigned int index = data->getActiveSample();
    const Sample sample = data->getActiveSampleObject();
    ui->TxtTitle->setText(sample.getTimeStampString(UserParams::getTimeFormat()));
    // The averaged sample has no number of its own.
    const bool numbered = index != AVERAGED_SAMPLE_INDEX;
    ui->labelNumber->setText(numbered ? QString::number(index + 1) : QString());
    ui->labelNumber->setVisible(numbered);
}

void SampleViewScreen::changeEvent(QEvent* event)
{
    DaddyPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        ui->retranslateUi(this);
        showTitle();
    }
}

void SampleViewScreen::onUpdateScreen()
{
    if (!DataManager::instance()->getActiveSampleObject().isValid())
        CloseScreen();
}

void SampleViewScreen::onGotoImageViewScreen()
{
    GotoScreen(IMAGE_VIEW_SCREEN_ID);
}

void SampleViewScreen::on_BtnBack_clicked()
{
    playSoundButtonClick();
    CloseScreen();
}

void SampleViewScreen::on_BtnTrash_clicked()
{
    playSoundButtonClick();
    createPopup();
}

PopupPanel* SampleViewScreen::createPopup()
{
    auto* popup = new DeleteSamplePopup(this);
    connect(popup, &DeleteSamplePopup::confirmClicked, this, &SampleViewScreen::onDelete);
    connect(popup, &DeleteSamplePopup::confirmClicked, this, qOverload<PopupPanel*>(&DaddyPanel::onClosePopup));
    connect(popup, &DeleteSamplePopup::cancelClicked, this, qOverload<PopupPanel*>(&DaddyPanel::onClosePopup));
    onAddPopup(popup);
    return popup;
}

void SampleViewScreen::onDelete()
{
    setEnabled(false);
    API_SignalMaster::instance()->emitSampleCurrentDelete();
    CloseScreen();
}
