#include "Widgets/MultilingualPopup.h"
#include "ui_MultilingualPopup.h"

#include "Widgets/FlickList.h"
#include "Widgets/UimButton.h"

#include <QButtonGroup>
#include <QSignalMapper>

MultilingualPopup::MultilingualPopup(QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::MultilingualPopup)
{
    init();
}

MultilingualPopup::MultilingualPopup(const QVector<QString>& strings, QWidget* parent)
    : QWidget(parent)
    , ui(new Ui::MultilingualPopup)
{
    init();
    refreshCharacters(strings);
}

MultilingualPopup::~MultilingualPopup()
{
    delete ui;
}

void MultilingualPopup::init()
{
    ui->setupUi(this);
    setFixedSize(320, 80);
    ui->EntryList->setScrollingDirection(Qt::Horizontal);
    ui->EntryList->setShadowsEnabled(false);
    ui->EntryList->setBackgroundStyleSheet(QStringLiteral("background: transparent;"));
    ui->EntryList->setStyleSheet(QStringLiteral("QListWidget { background: transparent; border: none; }"));
    ui->EntryList->setFrameShape(QFrame::NoFrame);
    ui->EntryList->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    ui->BtnPageLeft->setDebounceEnabled(false);
    ui->BtnPageRight->setDebounceEnabled(false);
    ui->BtnPageLeft->hide();
    ui->BtnPageRight->hide();
}

FlickList* MultilingualPopup::entryList() const
{
    return ui->EntryList;
}

XPushButton* MultilingualPopup::btnPageLeft() const
{
    return ui->BtnPageLeft;
}

XPushButton* MultilingualPopup::btnPageRight() const
{
    return ui->BtnPageRight;
}

QString MultilingualPopup::selectedText() const
{
    if (m_pageWithCurrentSelection != m_currentPage)
        return QString();
    if (m_currentSelected < 0 || m_currentSelected >= m_uimButtons.size())
        return QString();
    return m_uimButtons.at(m_currentSelected)->text();
}

void MultilingualPopup::refreshCharacters(const QVector<QString>& strings)
{
    m_stringVector = strings;
    m_currentPage = 0;
    // A count of exactly 8 or 16 leaves an empty last page: Space walks
    // onto it before wrapping to the first.
    m_numPages = m_stringVector.size() / kPerPage + 1;
    updateListForPage(0);
    if (!m_uimButtons.isEmpty())
        clickButton(0);
}

void MultilingualPopup::refreshCharacters(const QString& string)
{
    refreshCharacters(QVector<QString> {string});
}

void MultilingualPopup::clickButton(int index)
{
    m_uimButtons.at(index)->click();
}

void MultilingualPopup::updateListForPage(int page)
{
    updateList(m_stringVector.mid(page * kPerPage, kPerPage));
}

void MultilingualPopup::updateList(const QVector<QString>& list)
{
    delete m_pSignalMapper;
    qDeleteAll(m_uimButtons);
    m_uimButtons.clear();
    delete m_pButtonGroup;
    m_pSignalMapper = new QSignalMapper(this);
    m_pButtonGroup = new QButtonGroup(this);
    m_pButtonGroup->setExclusive(true);
    ui->EntryList->clear();

    for (int i = 0; i < list.size(); ++i) {
        auto* button = new UimButton(list.at(i));
        if (list.at(i).size() > 1) {
            // The typed spelling stands among the characters: give it room.
            button->setFixedSize(qMax(button->GetTextWidth() + 10, int(UimButton::kSize)), UimButton::kSize);
        }
        connect(button, &QAbstractButton::clicked, m_pSignalMapper,
                static_cast<void (QSignalMapper::*)()>(&QSignalMapper::map));
        m_pSignalMapper->setMapping(button, i);
        m_pButtonGroup->addButton(button);
        ui->EntryList->addWidget(button);
        m_uimButtons.append(button);
    }
    connect(m_pSignalMapper, &QSignalMapper::mappedInt, this, &MultilingualPopup::onButtonSelected);

    const bool paged = m_numPages > 1;
    ui->BtnPageRight->setVisible(paged);
    ui->BtnPageRight->setEnabled(m_currentPage < m_numPages - 1);
    ui->BtnPageLeft->setVisible(paged);
    ui->BtnPageLeft->setEnabled(m_currentPage > 0);

    // Coming back to the page of the selection shows it selected again.
    if (m_pageWithCurrentSelection == m_currentPage && m_currentSelected >= 0
        && m_currentSelected < m_uimButtons.size())
        clickButton(m_currentSelected);

    int sum = 0;
    for (UimButton* b : qAsConst(m_uimButtons))
        sum += b->width();
    if (sum >= width()) {
        ui->EntryList->setGeometry(0, 0, 320, 45);
        ui->labelTextBackground->setGeometry(0, 0, 320, 40);
    } else {
        const int left = (width() - sum) / 2;
        const int height = ui->EntryList->height();
        ui->EntryList->setGeometry(left, ui->EntryList->y(), sum, height);
        ui->labelTextBackground->setGeometry(left, ui->labelTextBackground->y(), sum, height);
    }
}

void MultilingualPopup::onButtonSelected(int index)
{
    if (index < 0 || index >= m_uimButtons.size())
        return;
    for (UimButton* b : qAsConst(m_uimButtons))
        b->setSelected(false);
    m_currentSelected = index;
    m_pageWithCurrentSelection = m_currentPage;
    UimButton* button = m_uimButtons.at(index);
    button->setSelected(true);
    ui->EntryList->scrollToItem(ui->EntryList->item(index));
    emit charsSelected(button->text());
}

void MultilingualPopup::onNextSelection()
{
    const int n = m_uimButtons.size();
    // The empty last page of a full list has nothing to step to; the left
    // arrow, Delete and Enter still work there.
    if (n == 0)
        return;
    const int s = m_currentSelected;
    if (s + 1 != n || m_numPages <= 1) {
        clickButton((s + 1) % n);
        return;
    }
    m_currentPage = (m_currentPage + 1) % m_numPages;
    updateListForPage(m_currentPage);
    if (!m_uimButtons.isEmpty())
        clickButton(0);
}

void MultilingualPopup::on_BtnPageRight_clicked()
{
    m_currentPage = qMin(m_currentPage + 1, m_numPages - 1);
    updateListForPage(m_currentPage);
}

void MultilingualPopup::on_BtnPageLeft_clicked()
{
    m_currentPage = qMax(m_currentPage - 1, 0);
    updateListForPage(m_currentPage);
}
