#ifndef SETTINGSDIRECTORYEXPLORERPAGE_H
#define SETTINGSDIRECTORYEXPLORERPAGE_H

#include "Widgets/SettingsPage.h"

#include <QStringList>

// The files of one folder, by name; a tap opens a file in the viewer page,
// a sub-folder in another explorer page.
class SettingsDirectoryExplorerPage : public SettingsPage
{
    Q_OBJECT
public:
    SettingsDirectoryExplorerPage(const QString& directory, const QString& title, QWidget* parent = nullptr,
                                  const QStringList& nameFilters = QStringList());

    QString directory() const { return m_directory; }
    // The entries shown, folders first, each group by name.
    QStringList entries() const { return m_entries; }
    // A file name made readable: "LGPL-3.txt" reads "LGPL-3".
    static QString displayName(const QString& fileName);

public slots:
    void onCreatePage();
    void onEntrySelected(int index);

protected:
    virtual SettingsPage* makeViewer(const QString& path);

private:
    QString m_directory;
    QStringList m_nameFilters;
    QStringList m_entries;
};

#endif // SETTINGSDIRECTORYEXPLORERPAGE_H
