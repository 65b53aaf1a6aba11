#ifndef JOBLISTSELECTIONITEM_H
#define JOBLISTSELECTIONITEM_H

#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Job.h"
#include "Widgets/FlickButton.h"

namespace Ui {
class JobListSelectionItem;
}

class WebSyncWidget;

// One job row of the home screen's lists: name, tags, completion date, the
// sync mark, and an action button (the arrow of an open job, the bin of a
// complete one). Rows are made once per job index and kept; only the job
// they show changes.
class JobListSelectionItem : public FlickButton
{
    Q_OBJECT
public:
    explicit JobListSelectionItem(int jobIndex, QWidget* parent = nullptr);
    ~JobListSelectionItem() override;

    void setJob(const Job& job);
    const Job& getJob() const { return m_job; }
    int getJobIndex() const { return m_jobIndex; }

    WebSyncWidget* webSyncWidget() const;

public slots:
    void onUpdateFields();
    void onTranslate();
    void onWifiStateChanged(WIFI_STATUS_T state);
    void sendClick() override;
    void sendAction();

signals:
    void deleteJob();
    void jobClicked();
    void startJob();

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    Ui::JobListSelectionItem* ui;
    int m_jobIndex;
    bool m_actionClicked;
    Job m_job;
};

#endif // JOBLISTSELECTIONITEM_H
