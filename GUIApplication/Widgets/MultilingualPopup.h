#ifndef MULTILINGUALPOPUP_H
#define MULTILINGUALPOPUP_H

#include <QString>
#include <QVector>
#include <QWidget>

namespace Ui {
class MultilingualPopup;
}

class QButtonGroup;
class QSignalMapper;
class FlickList;
class UimButton;
class XPushButton;

// The candidate strip above the keypad: the candidates of the spelling in
// pages of 8, the selected one on the accent ground. Selecting a candidate
// (by touch, by the first-candidate rule of a refresh, or by Space through
// onNextSelection) emits charsSelected with it.
class MultilingualPopup : public QWidget
{
    Q_OBJECT
public:
    static const int kPerPage = 8;

    explicit MultilingualPopup(QWidget* parent = nullptr);
    MultilingualPopup(const QVector<QString>& strings, QWidget* parent = nullptr);
    ~MultilingualPopup() override;

    // A new list: back to the first page, whose first candidate is selected.
    void refreshCharacters(const QVector<QString>& strings);
    void refreshCharacters(const QString& string);

    int currentPage() const { return m_currentPage; }
    int numPages() const { return m_numPages; }
    int currentSelected() const { return m_currentSelected; }
    int pageWithCurrentSelection() const { return m_pageWithCurrentSelection; }
    const QVector<QString>& strings() const { return m_stringVector; }
    const QVector<UimButton*>& buttons() const { return m_uimButtons; }
    // The text of the selected candidate while it is on the page shown.
    QString selectedText() const;
    FlickList* entryList() const;
    XPushButton* btnPageLeft() const;
    XPushButton* btnPageRight() const;

public slots:
    virtual void onNextSelection();
    virtual void onButtonSelected(int index);
    void on_BtnPageRight_clicked();
    void on_BtnPageLeft_clicked();

signals:
    void charsSelected(QString chars);

private:
    void init();
    void updateListForPage(int page);
    void updateList(const QVector<QString>& list);
    void clickButton(int index);

    Ui::MultilingualPopup* ui;
    QButtonGroup* m_pButtonGroup = nullptr;
    QVector<UimButton*> m_uimButtons;
    QSignalMapper* m_pSignalMapper = nullptr;
    int m_currentSelected = 0;
    QVector<QString> m_stringVector;
    int m_currentPage = 0;
    int m_numPages = 0;
    int m_pageWithCurrentSelection = 0;
};

#endif // MULTILINGUALPOPUP_H
