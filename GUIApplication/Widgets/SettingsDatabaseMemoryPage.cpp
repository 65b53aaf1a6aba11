#include "Widgets/SettingsDatabaseMemoryPage.h"

#include "GUIAPI/DataManager.h"
#include "Widgets/FlickList.h"
#include "Widgets/SettingsListItems.h"

#include <QEvent>

SettingsDatabaseMemoryPage::SettingsDatabaseMemoryPage(QWidget* parent)
    : SettingsPage(tr("Database / Memory"), parent)
    , m_samples(new SettingsListSelectionProgressItem)
    , m_jobs(new SettingsListSelectionProgressItem)
    , m_clearRow(new SettingsListSelectionItem)
{
    m_samples->setObjectName(QStringLiteral("SamplesBar"));
    m_jobs->setObjectName(QStringLiteral("JobsBar"));
    m_clearRow->setBtnIcon(QString());
    m_clearRow->setLastInList(true);
    getSettingsList()->addWidget(m_samples);
    getSettingsList()->addWidget(m_jobs);
    getSettingsList()->addWidget(m_clearRow);
    connect(m_clearRow, &QPushButton::clicked, this, &SettingsDatabaseMemoryPage::onClearDatabase);
    connect(DataManager::instance(), &DataManager::DataBaseWiped, this, &SettingsDatabaseMemoryPage::onUpdatePage);
    retranslate();
    onUpdatePage();
}

void SettingsDatabaseMemoryPage::retranslate()
{
    setTitle(tr("Database / Memory"));
    m_samples->setSummaryText(tr("Samples"));
    m_jobs->setSummaryText(tr("Jobs"));
    m_clearRow->setBtnSettingText(tr("Clear Database"));
}

void SettingsDatabaseMemoryPage::onUpdatePage()
{
    const MEMORY_INFO_T info = DataManager::instance()->getUpdatedMemInfo();
    m_samples->setMaxValue(info.maxNumMeasurements);
    m_samples->setValue(info.numMeasurements);
    m_jobs->setMaxValue(info.maxNumJobs);
    m_jobs->setValue(info.numJobs);
}

void SettingsDatabaseMemoryPage::onClearDatabase()
{
    playSoundButtonClick();
    onGotoScreen(DELETE_ALL_SAMPLES_POPUP_SCREEN_ID);
}

void SettingsDatabaseMemoryPage::changeEvent(QEvent* event)
{
    SettingsPage::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        retranslate();
}
