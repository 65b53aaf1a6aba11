#include "Screens/TerminateJobPopup.h"

#include "Screens/PopupForm.h"
#include "Widgets/XPushButton.h"

#include <QEvent>
#include <QLabel>

void Ui::TerminateJobPopup::setupUi(QWidget* popup)
{
    labelBackground = PopupForm::dimmer(popup, "labelBackground");
    labelPanel = PopupForm::card(popup, false, "labelPanel");
    BtnStoreAverage = PopupForm::button(popup, "BtnStoreAverage", PopupForm::shortCardButton(0),
                                        Theme::PrimaryButton);
    BtnRestartJob = PopupForm::button(popup, "BtnRestartJob", PopupForm::shortCardButton(1),
                                      Theme::DestructiveButton);
    BtnCancel = PopupForm::button(popup, "BtnCancel", PopupForm::shortCardButton(2),
                                  Theme::SecondaryButton);
    retranslateUi(popup);
}

void Ui::TerminateJobPopup::retranslateUi(QWidget*)
{
    BtnStoreAverage->setText(::TerminateJobPopup::tr("Store Average"));
    BtnRestartJob->setText(::TerminateJobPopup::tr("Restart Job"));
    BtnCancel->setText(::TerminateJobPopup::tr("Cancel"));
}

TerminateJobPopup::TerminateJobPopup(QWidget* parent)
    : PopupPanel(parent)
    , ui(new Ui::TerminateJobPopup)
{
    setObjectName("TerminateJobPopup");
    ui->setupUi(this);
    connect(ui->BtnStoreAverage, &QPushButton::clicked, this, &TerminateJobPopup::on_BtnStoreAverage_clicked);
    connect(ui->BtnRestartJob, &QPushButton::clicked, this, &TerminateJobPopup::on_BtnRestartJob_clicked);
    connect(ui->BtnCancel, &QPushButton::clicked, this, &TerminateJobPopup::on_BtnCancel_clicked);
}

TerminateJobPopup::~TerminateJobPopup()
{
    delete ui;
}

void TerminateJobPopup::on_BtnStoreAverage_clicked()
{
    emit averageJob();
}

void TerminateJobPopup::on_BtnRestartJob_clicked()
{
    emit restartJob();
}

void TerminateJobPopup::on_BtnCancel_clicked()
{
    emit closePopup(this);
}

void TerminateJobPopup::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange)
        ui->retranslateUi(this);
    PopupPanel::changeEvent(event);
}
