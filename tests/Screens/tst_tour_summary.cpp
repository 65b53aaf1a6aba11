// The job summary in the screenshot tour: an open job, a complete one with
// its readings, an averaged and an SMC result, the short rows when nothing
// may be viewed, and the summary's two questions.

#include "GUIAPI/DataManager.h"
#include "Screens/JobMeasureScreen.h"
#include "SharedSystem/StringTables.h"
#include "SharedSystem/SystemStatus.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickList.h"
#include "Widgets/StatusBar.h"

#include "support/Tour.h"

#include <QThread>
#include <QtTest>

namespace {

JobMeasureScreen* summary(QWidget* display, const QString& job, bool sync = false, bool viewable = true)
{
    // The angle names of the sample answers are read through the tables.
    StringTables::Init();
    Tour::loadDemoJobs();
    DataManager* data = DataManager::instance();
    data->setActiveJob(data->findJobByName(job));
    UserParams::setAllowSync(sync);
    UserParams::setDisplayEditFreeText(true);
    UserParams::setDisplayLABCH(viewable);
    UserParams::setDisplayRainbow(viewable);
    UserParams::setDisplayTexture(viewable);
    auto* screen = new JobMeasureScreen(display);
    screen->SetActiveStatus(true);
    QTest::qWaitFor([screen] { return !screen->isLoading(); }, 5000);
    if (auto* bar = screen->findChild<StatusBar*>())
        bar->onSystemStatusUpdated(Tour::workshopStatus());
    screen->onWifiStateChanged(sync ? WIFI_STATUS_CONNECTED : WIFI_STATUS_ON_NO_CONNECTION);
    return screen;
}

} // namespace

static QList<Tour::Stop> stops()
{
    return {
        {"summary_loading",
         [](QWidget* d) {
             summary(d, "Job 1");
             // The data thread is held up, so the next load is still running
             // when the shot is taken.
             QMetaObject::invokeMethod(DataManager::instance(), [] { QThread::msleep(800); }, Qt::QueuedConnection);
             d->findChild<JobMeasureScreen*>()->onUpdateScreen();
         }},
        {"summary_open", [](QWidget* d) { summary(d, "Job"); }},
        {"summary_complete", [](QWidget* d) { summary(d, "Job 1", true); }},
        {"summary_complete_readings",
         [](QWidget* d) {
             JobMeasureScreen* s = summary(d, "Job 1", true);
             s->sampleList()->scrollToBottom();
         }},
        {"summary_open_readings", [](QWidget* d) { summary(d, "Job")->sampleList()->scrollToBottom(); }},
        {"summary_averaged", [](QWidget* d) { summary(d, "Job 2"); }},
        {"summary_averaged_result", [](QWidget* d) { summary(d, "Job 2")->sampleList()->scrollToBottom(); }},
        {"summary_smc", [](QWidget* d) { summary(d, "Job 5"); }},
        {"summary_smc_readings",
         [](QWidget* d) { summary(d, "Job 5")->sampleList()->scrollToBottom(); }},
        {"summary_rows_not_viewable",
         [](QWidget* d) { summary(d, "Job 1", false, false)->sampleList()->scrollToBottom(); }},
        {"summary_edit_warning", [](QWidget* d) { summary(d, "Job 1")->onShowEditablePopup(); }},
        {"summary_delete", [](QWidget* d) { summary(d, "Job 1")->on_BtnBack_clicked(); }},
        {"summary_open_de", [](QWidget* d) { summary(d, "Job 4"); }, "de"},
        {"summary_complete_fr", [](QWidget* d) { summary(d, "Job 1", true); }, "fr"},
    };
}

TOUR_MAIN(stops)
