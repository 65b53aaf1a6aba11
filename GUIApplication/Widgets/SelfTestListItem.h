#ifndef SELFTESTLISTITEM_H
#define SELFTESTLISTITEM_H

#include "Widgets/KLabel.h"

namespace Ui {
class SelfTestListItem;
}

// One self test in the list: its name and, once run, its result.
class SelfTestListItem : public KLabel
{
    Q_OBJECT
public:
    // name: as the instrument sends it; shown: the text the operator reads.
    SelfTestListItem(const QString& name, const QString& shown, QWidget* parent = nullptr);
    ~SelfTestListItem() override;

    QString getTestName() const { return m_testName; }
    void setResult(unsigned int result);
    unsigned int result() const { return m_result; }
    QString resultText() const;
    QString resultStyle() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::SelfTestListItem* ui;
    QString m_testName;
    unsigned int m_result = 0;
};

#endif // SELFTESTLISTITEM_H
