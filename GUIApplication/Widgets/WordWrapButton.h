#ifndef WORDWRAPBUTTON_H
#define WORDWRAPBUTTON_H

#include "Widgets/XPushButton.h"

#include <QColor>

class KLabel;

// A button that shows its caption in a word-wrapping KLabel filling it, so a
// long translation wraps and, with auto size, shrinks. It can carry a hidden
// string for the caller (a key's value, an identifier).
class WordWrapButton : public XPushButton
{
    Q_OBJECT
public:
    explicit WordWrapButton(QWidget* parent = nullptr);

    KLabel* label() const { return m_pKLabel; }

public slots:
    virtual void setText(const QString& text);
    virtual void setFont(const QFont& font);
    virtual void setFontColor(int r, int g, int b);
    virtual void setFontColor(QRgb rgb);
    virtual void setFontColor(QColor colour);
    virtual void setGeometry(const QRect& rect);
    virtual void setGeometry(int x, int y, int w, int h);
    virtual void setTextAutoSize(bool autoSize);
    virtual QString text() const;
    virtual void setHiddenString(const QString& hidden);
    virtual QString getHiddenString() const;

protected:
    void changeEvent(QEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    KLabel* m_pKLabel;
    QString m_hiddenString;
};

#endif // WORDWRAPBUTTON_H
