#ifndef SETTINGSFILEVIEWERPAGE_H
#define SETTINGSFILEVIEWERPAGE_H

#include "Widgets/SettingsPage.h"

class QsKineticScroller;
class QScrollArea;
class QPlainTextEdit;

// One file of a legal folder: a picture fitted to the width, or a text,
// both scrolled with the finger.
class SettingsFileViewerPage : public SettingsPage
{
    Q_OBJECT
public:
    SettingsFileViewerPage(const QString& path, const QString& title, QWidget* parent = nullptr);

    bool isPicture() const { return m_picture; }
    QString text() const;

    static bool isPictureFile(const QString& path);
    // Joins the lines of each paragraph; paragraphs stay apart.
    static QString reflow(const QString& text);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QString m_path;
    bool m_picture;
    QPlainTextEdit* m_text = nullptr;
    QScrollArea* m_area = nullptr;
    QsKineticScroller* m_scroller = nullptr;
};

#endif // SETTINGSFILEVIEWERPAGE_H
