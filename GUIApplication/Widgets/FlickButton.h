#ifndef FLICKBUTTON_H
#define FLICKBUTTON_H

#include "Widgets/XPushButton.h"

#include <QIcon>
#include <QRect>

// A list row that tells a tap from a drag. The press is left unaccepted so
// that the list's scroller sees it; the release clicks only while the row
// still overlaps where it stood at the press.
class FlickButton : public XPushButton
{
    Q_OBJECT
public:
    explicit FlickButton(QWidget* parent = nullptr);

    void setBackground(const QString& file);
    void setPressedBackground(const QString& file);
    void clearPressedBackground();
    void setLastInList(bool last);

    bool isLastInList() const { return m_lastInList; }
    bool hasPressedBackground() const { return m_pressedSet; }
    bool isShowingPressed() const { return m_showingPressed; }

public slots:
    virtual void sendClick();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QRect globalRect() const;
    static QIcon makeIcon(const QPixmap& pixmap, bool withDisabled);

    QRect m_pressedBox;
    QIcon m_backgroundIcon;
    QIcon m_backgroundPressedIcon;
    QString m_backgroundIconFile;
    bool m_pressedSet = false;
    bool m_lastInList = false;
    bool m_showingPressed = false;
};

#endif // FLICKBUTTON_H
