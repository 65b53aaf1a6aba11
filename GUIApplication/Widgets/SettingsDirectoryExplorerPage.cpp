#include "Widgets/SettingsDirectoryExplorerPage.h"

#include "Widgets/FlickList.h"
#include "Widgets/SettingsFileViewerPage.h"
#include "Widgets/SettingsListItems.h"
#include "Widgets/Theme.h"

#include <QDir>
#include <QFileInfo>
#include <QLabel>
#include <QSignalMapper>

SettingsDirectoryExplorerPage::SettingsDirectoryExplorerPage(const QString& directory, const QString& title,
                                                             QWidget* parent, const QStringList& nameFilters)
    : SettingsPage(title, parent)
    , m_directory(directory)
    , m_nameFilters(nameFilters)
{
    onCreatePage();
}

QString SettingsDirectoryExplorerPage::displayName(const QString& fileName)
{
    const QFileInfo info(fileName);
    QString name = info.suffix().isEmpty() ? info.fileName() : info.completeBaseName();
    name.replace('_', ' ');
    return name;
}

void SettingsDirectoryExplorerPage::onCreatePage()
{
    clearList();
    refreshSignalMapper();
    connect(m_signalMapper, &QSignalMapper::mappedInt, this, &SettingsDirectoryExplorerPage::onEntrySelected);
    const QDir dir(m_directory);
    m_entries = dir.entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name | QDir::IgnoreCase);
    m_entries += dir.entryList(m_nameFilters, QDir::Files | QDir::Readable, QDir::Name | QDir::IgnoreCase);
    if (m_entries.isEmpty()) {
        auto* empty = new QLabel(tr("No files"));
        empty->setObjectName(QStringLiteral("labelEmpty"));
        empty->resize(Theme::ScreenWidth, SettingsRows::RowHeight);
        empty->setAlignment(Qt::AlignCenter);
        empty->setFont(Theme::font(Theme::FontBody));
        empty->setStyleSheet(QStringLiteral("color: %1; background: white;").arg(Theme::css(Theme::TextSecondary)));
        getSettingsList()->addWidget(empty);
        return;
    }
    for (int i = 0; i < m_entries.size(); ++i) {
        auto* row = new SettingsListSelectionSubMenuItem;
        row->setText(displayName(m_entries.at(i)));
        getSettingsList()->addWidget(row);
        connect(row, &QPushButton::clicked, m_signalMapper, QOverload<>::of(&QSignalMapper::map));
        m_signalMapper->setMapping(row, i);
    }
    if (auto* last = qobject_cast<FlickButton*>(getSettingsList()->getWidget(getSettingsList()->count() - 1)))
        last->setLastInList(true);
}

SettingsPage* SettingsDirectoryExplorerPage::makeViewer(const QString& path)
{
    return new SettingsFileViewerPage(path, displayName(QFileInfo(path).fileName()));
}

void SettingsDirectoryExplorerPage::onEntrySelected(int index)
{
    if (index < 0 || index >= m_entries.size())
        return;
    playSoundButtonClick();
    const QString path = QDir(m_directory).filePath(m_entries.at(index));
    if (QFileInfo(path).isDir())
        gotoNextPage(new SettingsDirectoryExplorerPage(path, displayName(m_entries.at(index)), nullptr, m_nameFilters));
    else
        gotoNextPage(makeViewer(path));
}
