#ifndef JOBLISTSCREEN_H
#define JOBLISTSCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/InstrumentTypes.h"
#include "SharedSystem/Job.h"

#include <QString>
#include <QTimer>
#include <QVector>

#include <array>

namespace Ui {
class JobListScreen;
}

class JobListSelectionItem;
class JobListQuickSelectionItem;
class QPushButton;
class WebSyncButton;

// The home screen: every job on the instrument in an Open and a Complete
// tab. It creates, copies, deletes and sends jobs, and it is the gate to
// measuring: room on the instrument, a valid calibration and an idle
// instrument are checked here before targeting starts. It is built once at
// start, lies at the bottom of the screen stack and is never closed.
class JobListScreen : public DaddyPanel
{
    Q_OBJECT
public:
    // Rows are made once per job index, up to the instrument's job limit.
    static const int kMaxJobRows = 400;

    explicit JobListScreen(QWidget* parent = nullptr);
    ~JobListScreen() override;

    int getNumOpenJobs() const { return m_numOpenJobs; }
    int getNumCompletedJobs() const { return m_numCompletedJobs; }
    bool isShowingCompleted() const { return m_showCompleted; }
    bool isReady() const { return m_ready; }
    // The row of job index i in the open (false) or complete (true) list,
    // made now if it had not come into view yet; null past the jobs listed.
    JobListSelectionItem* rowOf(int jobIndex, bool complete) const;

    using DaddyPanel::onClosePopup;

public slots:
    void SetActiveStatus(bool active) override;
    void onUpdateScreen() override;
    void onClosePopup(PopupPanel* popup) override;
    void onUpdateSystemState(SYSTEM_STATE_T state) override;
    virtual void GotoScreen(SCREEN_ID_T id);

    void onInit();
    void onJobCreated(uint index);
    void onWifiStateChanged(WIFI_STATUS_T state);
    void onUpdateTitleBar();
    void onUpdateTabTitles();
    void onAllowSettingsBtn();
    void stateChanged(bool showCompleted);

    void onSelectedJob();
    void onJobClicked();
    void onStartJob();
    void onDeleteJob();
    void onDeleteCompletedJobs();
    void onJobSyncAll();

    void onShowJobActionsPopup();
    void onShowDeleteJobsPopup();
    void onShowDeleteCompletedJobsPopup();
    void onDeleteJobConfirmed();
    void onDeleteJobsCompletedConfirmed();
    void onShowJobsFullPopup();
    void onShowMeasuresFullPopup();
    void onJobViewEditStart();
    void onCopyJob();
    void onSyncJob();
    void onGotoJobSummaryScreen();
    void enterTargetingMode();

    void on_BtnAddJob_clicked();
    void on_BtnSettings_clicked();
    void on_BtnLeftTab_clicked();
    void on_BtnRightTab_clicked();

signals:
    void updateJobInfos();
    void CreateNewJob();
    void syncJob(QString name);
    void syncAllJobs();

protected:
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void setButtonState(QPushButton* button, bool selected);
    void createRows(int jobIndex);
    JobListSelectionItem* makeRow(int jobIndex, bool complete);
    void fillRow(JobListSelectionItem* row, int jobIndex, WIFI_STATUS_T wifi);
    PopupPanel* showFullPopup(const QString& text);

    Ui::JobListScreen* ui;
    bool m_showCompleted;
    bool m_showingDeleteAll;
    bool m_ready;
    bool m_startupPlayed;
    int m_numCompletedJobs;
    int m_numOpenJobs;
    int m_currentlyViewingJob;
    std::array<std::array<JobListSelectionItem*, 2>, kMaxJobRows> m_selectionItems;
    // What each row shows, kept for rows that are made later.
    QVector<Job> m_rowJobs;
    int m_rowsCreated;
    JobListQuickSelectionItem* m_jobQuickItem;
    WebSyncButton* m_pWebSyncButton;
    int m_WebSyncButtonIndex;
    QTimer m_initTimer;
    QTimer m_releaseMemoryTimer;
    bool m_calScreenShown;
};

#endif // JOBLISTSCREEN_H
