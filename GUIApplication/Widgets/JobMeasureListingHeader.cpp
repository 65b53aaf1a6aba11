#include "Widgets/JobMeasureListingHeader.h"

#include "ui_JobMeasureListingHeader.h"

#include "GUIAPI/DataManager.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/WebSyncWidget.h"

#include "Widgets/Theme.h"


JobMeasureListingHeader::JobMeasureListingHeader(const QString& text, QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::JobMeasureListingHeader)
{
    ui->setupUi(this);
    ui->labelLeftText->setFont(Theme::pixelFont(13, true));
    ui->labelLeftText->setAutoSize(true);
    ui->labelLeftText->setText(text);
    ui->webSyncWidget->hide();
    DataManager* data = DataManager::instance();
    connect(data, &DataManager::updateWifiState, this, &JobMeasureListingHeader::onWifiStateChanged);
    onWifiStateChanged(data->getSystemStatus().getWifiState());
}

JobMeasureListingHeader::~JobMeasureListingHeader()
{
    delete ui;
}

void JobMeasureListingHeader::setText(const QString& text)
{
    ui->labelLeftText->setText(text);
}

QString JobMeasureListingHeader::text() const
{
    return ui->labelLeftText->defaultText();
}

void JobMeasureListingHeader::setJob(const QString& name, bool synchronised)
{
    ui->webSyncWidget->setJobName(name);
    ui->webSyncWidget->setCompleted(synchronised);
}

WebSyncWidget* JobMeasureListingHeader::webSyncWidget() const
{
    return ui->webSyncWidget;
}

void JobMeasureListingHeader::onWifiStateChanged(WIFI_STATUS_T state)
{
    ui->webSyncWidget->setVisible(state == WIFI_STATUS_CONNECTED && UserParams::getAllowSync());
}
