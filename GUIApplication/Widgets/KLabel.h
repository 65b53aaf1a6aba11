#ifndef KLABEL_H
#define KLABEL_H

#include <QLabel>

// A label that fits translated text into its fixed box. With auto size on,
// the font shrinks until the text fits; each fit starts again from the
// default font, so a short text after a long one grows back.
class KLabel : public QLabel
{
    Q_OBJECT
public:
    explicit KLabel(QWidget* parent = nullptr);
    explicit KLabel(const QString& text, QWidget* parent = nullptr);

    void setAutoSize(bool autoSize);
    bool autoSize() const { return m_autoSize; }
    // A negative length means unlimited (-1).
    void setMaxTextLength(int length);
    int maxTextLength() const { return m_maxTextLength; }

    QFont defaultFont() const { return m_defaultFont; }
    // The full text last set, also when only a part of it is shown.
    QString defaultText() const { return m_defaultText; }

public slots:
    virtual void setText(const QString& text);
    virtual void setFont(QFont font);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    QFont fittedFont(const QString& text) const;

    bool m_autoSize = false;
    int m_maxTextLength = -1;
    QFont m_defaultFont;
    QString m_defaultText;
};

#endif // KLABEL_H
