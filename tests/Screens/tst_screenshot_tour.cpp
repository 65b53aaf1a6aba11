// The screenshot tour of the home screen, the status bar and the shared
// popups and covers; see support/Tour.h for how the tour works.

#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/DeletePopup.h"
#include "Screens/ErrorPopup.h"
#include "Screens/JobActionsPopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/JobMeasureScreen.h"
#include "Screens/LockScreen.h"
#include "Screens/MeasuringPopup.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "Widgets/KLabel.h"
#include "Screens/PowerDownPopup.h"
#include "Screens/SadPuppyScreen.h"
#include "Screens/SyncScreen.h"
#include "Screens/TerminateJobPopup.h"
#include "Screens/UndoPopup.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/ProgressBarCircle.h"
#include "Widgets/StatusBar.h"
#include "Widgets/Theme.h"

#include <QLabel>
#include "Widgets/KLabel.h"

#include <QtTest>

#include "support/Tour.h"


namespace HomeTourStatus {

// Several status bars in the states the instrument reports.
void statusBarStates(QWidget* display)
{
    display->setAutoFillBackground(true);
    QPalette palette = display->palette();
    palette.setColor(QPalette::Window, Theme::GroundLight);
    display->setPalette(palette);
    struct State
    {
        const char* caption;
        BATTERY_STATUS_T battery;
        int percent;
        WIFI_STATUS_T wifi;
        int level;
        int nextCal;
    };
    const State states[] = {
        {"Idle, strong Wi-Fi, calibrated", BATTERY_DISCHARGING, 72, WIFI_STATUS_CONNECTED, 81, 3600},
        {"Charging over USB, medium Wi-Fi", BATTERY_STATUS_CHARGING_USB, 40, WIFI_STATUS_CONNECTED, 50, 3600},
        {"Battery full, weak Wi-Fi", BATTERY_STATUS_FULL, 100, WIFI_STATUS_CONNECTED, 20, 3600},
        {"Battery low, no network", BATTERY_DISCHARGING, 8, WIFI_STATUS_ON_NO_CONNECTION, 0, 3600},
        {"Half battery, Wi-Fi off, calibration due", BATTERY_DISCHARGING, 45, WIFI_STATUS_OFF, 0, 0},
        {"Battery missing", BATTERY_STATUS_MISSING, 0, WIFI_STATUS_CONNECTED, 70, 3600},
    };
    int y = 16;
    for (const State& s : states) {
        auto* caption = new KLabel(display);
        caption->setGeometry(12, y, 296, 22);
        caption->setFont(Theme::font(Theme::FontSmall + 1, true));
        caption->setStyleSheet(QString("color: %1;").arg(Theme::css(Theme::TextBody)));
        caption->setAutoSize(true);
        caption->setText(s.caption);
        SystemStatus status = Tour::workshopStatus();
        status.setBatteryState(s.battery);
        status.setBatteryChargePercent(s.percent);
        status.setWifiState(s.wifi);
        status.setWifiLevel(s.level);
        CALIBRATION_STATE_T cal;
        cal.nextExternalWhiteCal = s.nextCal;
        status.setCalState(cal);
        Tour::statusBar(display, status)->move(0, y + 24);
        y += 76;
    }
}

} // namespace HomeTourStatus

// ---- The home screen with the simulator's demo jobs ---------------------------

namespace HomeTour {

JobListScreen* home(QWidget* display, bool completeTab)
{
    Tour::loadDemoJobs();
    UserParams::setAllowSync(true);
    auto* screen = new JobListScreen(display);
    screen->SetActiveStatus(true);
    screen->onInit();
    screen->stateChanged(completeTab);
    if (auto* bar = screen->findChild<StatusBar*>())
        bar->onSystemStatusUpdated(Tour::workshopStatus());
    return screen;
}

MeasuringPopup* measuring(QWidget* display, const QString& branding = QString())
{
    Tour::jobListBackdrop(display);
    auto* popup = new MeasuringPopup(branding, display);
    popup->raise();
    popup->show();
    return popup;
}

void progress(MeasuringPopup* popup, int percent)
{
    popup->findChild<ProgressBarCircle*>("progressBarCircle")->setValue(percent);
}

} // namespace HomeTour

// ---- The tour: one line per screen ---------------------------------------------

static QList<Tour::Stop> stops()
{
    return {
    {"home_backdrop", [](QWidget* d) { Tour::jobListBackdrop(d); }},
    {"home_jobs_open", [](QWidget* d) { HomeTour::home(d, false); }},
    {"home_jobs_complete", [](QWidget* d) { HomeTour::home(d, true); }},
    {"home_job_actions_open", [](QWidget* d) {
         Tour::activateJob(false);
         HomeTour::home(d, false)->onShowJobActionsPopup();
     }},
    {"home_job_actions_complete", [](QWidget* d) {
         Tour::activateJob(true);
         HomeTour::home(d, true)->onShowJobActionsPopup();
     }},
    {"home_delete_job", [](QWidget* d) {
         Tour::activateJob(true);
         HomeTour::home(d, true)->onShowDeleteJobsPopup();
     }},
    {"home_delete_completed_jobs", [](QWidget* d) { HomeTour::home(d, true)->onShowDeleteCompletedJobsPopup(); }},
    {"home_jobs_full", [](QWidget* d) { HomeTour::home(d, false)->onShowJobsFullPopup(); }},
    {"home_measures_full", [](QWidget* d) { HomeTour::home(d, false)->onShowMeasuresFullPopup(); }},
    {"status_bar_states", [](QWidget* d) { HomeTourStatus::statusBarStates(d); }},
    {"popup_message_box", [](QWidget* d) {
         Tour::jobListBackdrop(d)->onShowMessageBoxPopup(
             "Message", "Please return the instrument to the paint lab before Friday for its yearly check.");
     }},
    {"issue_2102_temperature_error", [](QWidget* d) { Tour::issue(d, 2102); }},
    {"issue_9_instrument_full", [](QWidget* d) { Tour::issue(d, 9); }},
    {"issue_9_instrument_full_de", [](QWidget* d) { Tour::issue(d, 9); }, "de"},
    {"issue_2032_moved_fr", [](QWidget* d) { Tour::issue(d, 2032); }, "fr"},
    {"issue_2034_battery_warning", [](QWidget* d) { Tour::issue(d, 2034); }},
    {"popup_delete_job", [](QWidget* d) {
         auto* p = Tour::over<DeletePopup>(d);
         p->setHeaderText(JobListScreen::tr("Delete Job?"));
         p->setMessageText(JobListScreen::tr("The entire job and all samples will be permanently deleted."));
     }},
    {"popup_override_edit", [](QWidget* d) {
         auto* p = Tour::over<OverridePopup>(d);
         // As the job summary words it.
         p->setTitleText(JobMeasureScreen::tr("Warning"));
         p->setBodyText(JobMeasureScreen::tr(
             "This job was not created on the instrument. Are you sure you want to edit the job?"));
         p->setConfirmButtonText(JobMeasureScreen::tr("Edit"));
         p->setCancelButtonText(JobMeasureScreen::tr("Cancel"));
     }},
    {"popup_measuring", [](QWidget* d) { HomeTour::progress(HomeTour::measuring(d), 62); }},
    {"popup_measuring_calculating", [](QWidget* d) {
         MeasuringPopup* p = HomeTour::measuring(d);
         p->onUpdateSystemState(STATE_CALCULATING);
         HomeTour::progress(p, 35);
     }},
    {"popup_measuring_branded", [](QWidget* d) {
         UserParams::setMeasuringCircleID("colour_wheel.svg");
         HomeTour::progress(HomeTour::measuring(d, UserParams::getMeasuringCircleID()), 70);
     }},
    {"popup_terminate_job", [](QWidget* d) { Tour::over<TerminateJobPopup>(d); }},
    {"popup_terminate_job_es", [](QWidget* d) { Tour::over<TerminateJobPopup>(d); }, "es"},
    {"popup_power_down", [](QWidget* d) { Tour::over<PowerDownPopup>(d); }},
    {"popup_power_down_de", [](QWidget* d) { Tour::over<PowerDownPopup>(d); }, "de"},
    {"popup_undo", [](QWidget* d) { Tour::over<UndoPopup>(d)->setPopupText("Sample 3 was deleted."); }},
    {"cover_lock", [](QWidget* d) { Tour::over<LockScreen>(d); }},
    {"cover_sync", [](QWidget* d) { Tour::over<SyncScreen>(d); }},
    {"cover_calibrating", [](QWidget* d) { Tour::jobListBackdrop(d)->onShowCalScreen(); }},
    {"screen_fault", [](QWidget* d) { Tour::over<SadPuppyScreen>(d); }},
    {"screen_fault_es", [](QWidget* d) { Tour::over<SadPuppyScreen>(d); }, "es"},
    };
}

TOUR_MAIN(stops)
