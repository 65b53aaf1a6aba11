#ifndef JOBMEASURESCREEN_H
#define JOBMEASURESCREEN_H

#include "Screens/DaddyPanel.h"
#include "SharedSystem/InstrumentTypes.h"
#include "Widgets/WebSyncButton.h"

#include <QPointer>

namespace Ui {
class JobMeasureScreen;
}

class FlickList;
class SpinnyCircle;

// The job summary: what the job is (name, tags, notes), its readings or its
// one averaged result, and the ways on: delete, measure on, or save. Every
// job update rebuilds the whole list behind the spinner, after the samples'
// colours were fetched on the data thread.
class JobMeasureScreen : public DaddyPanel
{
    Q_OBJECT
public:
    explicit JobMeasureScreen(QWidget* parent = nullptr);
    ~JobMeasureScreen() override;

    FlickList* sampleList() const;
    SpinnyCircle* spinner() const { return m_spinnyCircle; }
    bool isLoading() const;
    bool isJobEditable() const { return m_jobEditable; }
    SCREEN_ID_T screenToOpen() const { return m_screenToOpen; }
    WebSyncButton* webSyncButton() const { return m_pWebSyncButton; }
    int webSyncButtonIndex() const { return m_WebSyncButtonIndex; }

    using DaddyPanel::onClosePopup;

public slots:
    void SetActiveStatus(bool active) override;
    void onUpdateScreen() override;

    void onQuickLoadCurrentJobSamplesComplete();
    void onRefreshSampleList();
    void onAddSampleToList(int index);
    void onSelectedSample();
    void onDelete();

    void onEditJobName();
    void onEditTag1();
    void onEditTag2();
    void onEditTag3();
    void onEditFreeText();
    void onShowEditablePopup();
    void onGotoEditScreen();

    void onWebSync();
    void onWifiStateChanged(WIFI_STATUS_T state);
    void onReadSwitchPressed();

    void on_BtnBack_clicked();
    void on_BtnNext_clicked();

signals:
    void quickLoadCurrentJobSamples();
    void syncJob(QString name);

protected:
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void createPopup();
    void openEditScreen(SCREEN_ID_T id);
    void editTag(int tag);
    void updateTitleButtons();

    Ui::JobMeasureScreen* ui;
    SpinnyCircle* m_spinnyCircle;
    SCREEN_ID_T m_screenToOpen;
    bool m_jobEditable;
    // The row lives in the list, which deletes it on each rebuild.
    QPointer<WebSyncButton> m_pWebSyncButton;
    int m_WebSyncButtonIndex;
};

#endif // JOBMEASURESCREEN_H
