#include "Widgets/SettingsSystemInformationPage.h"

#include "AppShell.h"
#include "Commands/SystemOutCommands.h"
#include "GUIAPI/SystemAPI.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Platform.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsDirectoryExplorerPage.h"
#include "Widgets/SettingsListItems.h"

#include <QCoreApplication>
#include <QDebug>
#include <QEvent>
#include <QFile>
#include <QSignalMapper>

SettingsSystemInformationPage::SettingsSystemInformationPage(QWidget* parent)
    : SettingsPage(tr("System Information"), parent)
{
    onCreatePage();
}

QString SettingsSystemInformationPage::openSourcePath()
{
    return Platform::devicePath(QStringLiteral("/opt/GUI/Legal/open_source/"));
}

QList<QPair<QString, QString>> SettingsSystemInformationPage::readInformation()
{
    DEVICE_INFO_T info;
    if (CmdOut_GetDeviceInfo(info) != 0)
        qDebug() << "System information: device information not available";
    auto version = [](VERSION_TYPE_T type) {
        QString text;
        if (CmdOut_GetVersion(type, text) != 0)
            return QString();
        return text.trimmed();
    };
    QString url;
    PARAMETER_CONTENT_TYPES value;
    if (SysAPI_GetParameter(PARAMETER_WEBSERVER_ADDRESS, value))
        url = value.parameterString.trimmed();
    if (url.isEmpty())
        url = tr("Not Configured");
    // The program's own version, as its version file states it.
    QString gui;
    QFile versionFile(QCoreApplication::applicationDirPath() + QStringLiteral("/GUIVersion.txt"));
    if (versionFile.open(QIODevice::ReadOnly))
        gui = QString::fromUtf8(versionFile.readLine()).trimmed();
    if (gui.isEmpty())
        gui = AppShell::versionText(QStringLiteral(MARIGOLD_REVISION), QStringLiteral(__DATE__), QStringLiteral(__TIME__));
    return {
        {tr("Instrument Model:"), getStringFromList(Instrument_Get_Model_Type(), MODEL_TYPES_TABLE)},
        {tr("Instrument Serial:"), info.serialNum},
        {tr("Part Number:"), info.partNumber},
        {tr("White Reference Tile:"), info.whitetileSerialNum},
        {tr("Certification Date:"), info.certificationDate},
        {tr("Firmware Revision:"), version(VERSION_SERVER)},
        {tr("Interface Revision:"), gui},
        {tr("Kernel:"), version(VERSION_KERNAL)},
        {tr("Bootloader:"), version(VERSION_BOOTLOADER)},
        {tr("Server URL:"), url},
    };
}

void SettingsSystemInformationPage::addRow(Row row, const QString& text)
{
    auto* item = new SettingsListSelectionSubMenuItem;
    item->setObjectName(QStringLiteral("InfoRow%1").arg(int(row)));
    item->setText(text);
    getSettingsList()->addWidget(item);
    connect(item, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
    m_signalMapper->setMapping(item, int(row));
}

void SettingsSystemInformationPage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsSystemInformationPage::onRowSelected);
    m_info = new SettingsListSelectionSystemInfo;
    m_info->setObjectName(QStringLiteral("SystemInfoBlock"));
    m_info->setLines(readInformation());
    connect(m_info, &ClickableLabel::clicked, this, &SettingsSystemInformationPage::onInfoClicked);
    getSettingsList()->addWidget(m_info);
    addRow(RowRestore, tr("Restore Factory Settings"));
    addRow(RowOpenSource, tr("Open Source"));
    if (m_serviceRowsShown)
        addServiceRows();
}

void SettingsSystemInformationPage::onUpdatePage()
{
    if (m_info)
        m_info->setLines(readInformation());
}

void SettingsSystemInformationPage::onInfoClicked()
{
    // The twenty-first tap opens the service rows, once.
    if (m_timesClicked++ == ServiceClicks && !m_serviceRowsShown) {
        m_serviceRowsShown = true;
        addServiceRows();
    }
}

void SettingsSystemInformationPage::addServiceRows()
{
    addRow(RowJuniper, tr("Burn in BIRCH JuniperX/Juniper"));
    addRow(RowLarch, tr("Burn in ALDER Larch"));
    addRow(RowSpruce, tr("Burn in Spruce / Sequoia"));
}

void SettingsSystemInformationPage::onRowSelected(int row)
{
    playSoundButtonClick();
    switch (row) {
    case RowRestore: onGotoScreen(RESTORE_FACTORY_SETTINGS_POPUP_SCREEN_ID); break;
    case RowOpenSource: gotoNextPage(new SettingsDirectoryExplorerPage(openSourcePath(), tr("Open Source"))); break;
    case RowJuniper: onBurnInTestJuniperTest(); break;
    case RowLarch: onBurnInTestLarchTest(); break;
    case RowSpruce: onBurnInTestSpruceTest(); break;
    default: break;
    }
}

void SettingsSystemInformationPage::startBurnIn(BurnInTest test)
{
    PARAMETER_CONTENT_TYPES value;
    value.parameterInt = int(test);
    value.parameterString = QString::number(int(test));
    if (!SysAPI_SetParameter(PARAMETER_BURN_IN_TEST, value))
        qDebug() << "System information: burn-in test" << int(test) << "not started";
}

void SettingsSystemInformationPage::onBurnInTestJuniperTest()
{
    startBurnIn(BurnInJuniper);
}

void SettingsSystemInformationPage::onBurnInTestLarchTest()
{
    startBurnIn(BurnInLarch);
}

void SettingsSystemInformationPage::onBurnInTestSpruceTest()
{
    startBurnIn(BurnInSpruce);
}

void SettingsSystemInformationPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange) {
        setTitle(tr("System Information"));
        onCreatePage();
    }
}
