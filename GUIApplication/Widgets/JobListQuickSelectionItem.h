#ifndef JOBLISTQUICKSELECTIONITEM_H
#define JOBLISTQUICKSELECTIONITEM_H

#include "Widgets/FlickButton.h"

namespace Ui {
class JobListQuickSelectionItem;
}

// The red row at the top of the complete list: delete all completed jobs.
class JobListQuickSelectionItem : public FlickButton
{
    Q_OBJECT
public:
    explicit JobListQuickSelectionItem(QWidget* parent = nullptr);
    ~JobListQuickSelectionItem() override;

    QString text() const;

protected:
    void changeEvent(QEvent* event) override;

private:
    Ui::JobListQuickSelectionItem* ui;
};

#endif // JOBLISTQUICKSELECTIONITEM_H
