#include "Screens/RestoreFactorySettingsPopup.h"

#include "ui_RestoreFactorySettingsPopup.h"

#include "Commands/SystemOutCommands.h"
#include "GUIAPI/API_SignalMaster.h"
#include "GUIAPI/DataManager.h"
#include "Widgets/SettingsPage.h"

#include <QDebug>
#include <QEvent>
#include <QTimer>

RestoreFactorySettingsPopup::RestoreFactorySettingsPopup(QWidget* parent)
    : DaddyPanel(parent)
    , ui(new Ui::RestoreFactorySettingsPopup)
{
    ui->setupUi(this);
    ui->BtnBack->setIcon(SettingsPage::backButtonIcon());
    setObjectName(QStringLiteral("RestoreFactorySettingsPopup"));
    ui->labelTitle->setAutoSize(true);
    connect(ui->confirmationCircleWidget, &ConfirmationCircleWidget::confirmed, this,
            &RestoreFactorySettingsPopup::onConfirmed);
    retranslate();
}

RestoreFactorySettingsPopup::~RestoreFactorySettingsPopup()
{
    delete ui;
}

ConfirmationCircleWidget* RestoreFactorySettingsPopup::confirmationCircle() const
{
    return ui->confirmationCircleWidget;
}

QString RestoreFactorySettingsPopup::titleText() const
{
    return ui->labelTitle->defaultText();
}

QString RestoreFactorySettingsPopup::descriptionText() const
{
    return ui->labelDescirption->text();
}

void RestoreFactorySettingsPopup::setTexts(const QString& title, const QString& description)
{
    ui->labelTitle->setText(title);
    ui->labelDescirption->setText(description);
    ui->labelInstructions->setText(tr("Confirm by moving the dot around the circle"));
}

void RestoreFactorySettingsPopup::retranslate()
{
    setTexts(tr("Restore Factory Settings"),
             tr("All current user settings will go back to defaults. Any jobs or samples will also be lost!"));
}

void RestoreFactorySettingsPopup::onConfirmed()
{
    playSoundButtonClick();
    const STATUS_T status = CmdOut_PowerOffReset(POWER_FACTORY);
    if (status != 0)
        qDebug().noquote() << QString("Factory reset refused, status %1").arg(status);
    CloseScreen();
}

void RestoreFactorySettingsPopup::on_BtnBack_clicked()
{
    playSoundButtonClick();
    CloseScreen();
}

void RestoreFactorySettingsPopup::changeEvent(QEvent* event)
{
    DaddyPanel::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}

DeleteAllSamplesPopup::DeleteAllSamplesPopup(QWidget* parent)
    : RestoreFactorySettingsPopup(parent)
{
    setObjectName(QStringLiteral("DeleteAllSamplesPopup"));
    retranslate();
    connect(DataManager::instance(), &DataManager::DataBaseWiped, this, &DeleteAllSamplesPopup::onDataBaseWiped);
}

void DeleteAllSamplesPopup::retranslate()
{
    setTexts(tr("Clear Database"),
             tr("Are you sure you want to clear the database, this will delete all samples and jobs from the "
                "instrument?"));
}

void DeleteAllSamplesPopup::onConfirmed()
{
    if (m_wiping)
        return;
    m_wiping = true;
    playSoundButtonClick();
    onShowSyncScreen();
    API_SignalMaster::instance()->emitJobDeleteAll();
    QTimer::singleShot(WipeTimeoutMs, this, &DeleteAllSamplesPopup::onDataBaseWiped);
}

void DeleteAllSamplesPopup::onDataBaseWiped()
{
    if (!m_wiping)
        return;
    m_wiping = false;
    onCloseSyncScreen();
    CloseScreen();
}
