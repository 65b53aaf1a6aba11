// The screenshot tour of the targeting screen: its looks (numbers, SMC,
// online mode, the reticle green and red, feet on and off) and every popup
// it raises; see support/Tour.h for how the tour works.

#include "GUIAPI/DataManager.h"
#include "Screens/TargetingScreen.h"
#include "SharedSystem/UserParams.h"

#include "SimImages.h"
#include "SimSpectra.h"
#include "support/Tour.h"

#include <QtTest>

namespace {

PRESSURE_SWITCH_T feet(bool s1, bool s2, bool s3)
{
    PRESSURE_SWITCH_T p;
    p.Switch1 = s1;
    p.Switch2 = s2;
    p.Switch3 = s3;
    return p;
}

// A targeting screen on the named demo job, its poll held still, showing the
// live picture the simulator renders for the given feet and turn.
TargetingScreen* targeting(QWidget* display, const QString& jobName, const PRESSURE_SWITCH_T& switches,
                           int degrees, bool labMode = false)
{
    UserParams::setLabModeJob(labMode ? jobName : QString());
    UserParams::setSampleTempCheckEnabled(false);
    UserParams::setAutoMeasure(false);
    if (!Tour::loadDemoJobs())
        return nullptr;
    DataManager* data = DataManager::instance();
    data->setActiveJob(data->findJobByName(jobName));
    auto* screen = new TargetingScreen(display);
    screen->onTriggerTargetingPause();
    screen->onInit();
    const int down = int(bool(switches.Switch1)) + int(bool(switches.Switch2)) + int(bool(switches.Switch3));
    Sim::Images::LiveView view;
    const QByteArray frame =
        view.frame(Sim::Spectra::panelSpec(QStringLiteral("silver-metallic"), 1), down, 0, 482, 348, degrees);
    screen->onTargetingImageUpdate(frame);
    screen->onPressureSensorUpdate(switches);
    screen->onUpdateOrientation(degrees);
    screen->show();
    UserParams::setLabModeJob(QString());
    return screen;
}

TargetingScreen* normal(QWidget* d)
{
    return targeting(d, QStringLiteral("Job"), feet(true, true, true), 8);
}

QList<Tour::Stop> stops()
{
    return {
        {"targeting_normal_on_surface", [](QWidget* d) { normal(d); }},
        {"targeting_reticle_red_two_feet", [](QWidget* d) {
             targeting(d, QStringLiteral("Job"), feet(true, true, false), 40);
         }},
        {"targeting_lifted", [](QWidget* d) { targeting(d, QStringLiteral("Job 8"), feet(false, false, false), 0); }},
        {"targeting_smc", [](QWidget* d) { targeting(d, QStringLiteral("Job 4"), feet(true, true, true), 355); }},
        {"targeting_online_mode", [](QWidget* d) {
             targeting(d, QStringLiteral("Job 8"), feet(true, true, true), 0, true);
         }},
        {"targeting_auto_measure_armed", [](QWidget* d) {
             TargetingScreen* s = targeting(d, QStringLiteral("Job"), feet(true, true, true), 3);
             if (s)
                 s->findChild<QLabel*>(QStringLiteral("labelAutoMeasure"))->show();
         }},
        {"targeting_popup_delete", [](QWidget* d) {
             if (TargetingScreen* s = normal(d))
                 s->onShowDeletePopup();
         }},
        {"targeting_popup_exit_online_mode", [](QWidget* d) {
             UserParams::setLabModeJob(QStringLiteral("Job 8"));
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job 8"), feet(true, true, true), 0, true)) {
                 UserParams::setLabModeJob(QStringLiteral("Job 8"));
                 s->onShowDeletePopup();
             }
             UserParams::setLabModeJob(QString());
         }},
        {"targeting_popup_temperature", [](QWidget* d) {
             if (TargetingScreen* s = normal(d))
                 s->onShowTempWarningPopup();
         }},
        {"targeting_popup_temperature_online", [](QWidget* d) {
             UserParams::setLabModeJob(QStringLiteral("Job 8"));
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job 8"), feet(true, true, true), 0, true)) {
                 UserParams::setLabModeJob(QStringLiteral("Job 8"));
                 s->onShowTempWarningPopup();
             }
             UserParams::setLabModeJob(QString());
         }},
        {"targeting_popup_override", [](QWidget* d) {
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job"), feet(true, false, true), 8))
                 s->onShowOverridePopup();
         }},
        {"targeting_popup_cant_override", [](QWidget* d) {
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job"), feet(true, false, true), 8))
                 s->onShowCantOverridePopup();
         }},
        {"targeting_popup_idle", [](QWidget* d) {
             if (TargetingScreen* s = normal(d))
                 s->onShowIdlePopup();
         }},
        {"targeting_popup_job_time_elapsed", [](QWidget* d) {
             if (TargetingScreen* s = normal(d))
                 s->onShowTimeoutPopup();
         }},
        // An SMC job that has ended raises its popup by itself.
        {"targeting_popup_smc_maximum", [](QWidget* d) {
             targeting(d, QStringLiteral("Job 5"), feet(true, true, true), 0);
         }},
        {"targeting_popup_smc_forced", [](QWidget* d) {
             targeting(d, QStringLiteral("Job 6"), feet(true, true, true), 0);
         }},
        {"targeting_popup_online_complete", [](QWidget* d) {
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job 8"), feet(true, true, true), 0, true))
                 s->onShowLabModeJobCompletePopup();
         }},
        {"targeting_popup_online_smc_failed", [](QWidget* d) {
             targeting(d, QStringLiteral("Job 5"), feet(true, true, true), 0, true);
         }},
        {"targeting_popup_online_smc_forced", [](QWidget* d) {
             targeting(d, QStringLiteral("Job 6"), feet(true, true, true), 0, true);
         }},
        {"targeting_popup_terminate", [](QWidget* d) {
             if (TargetingScreen* s = targeting(d, QStringLiteral("Job 4"), feet(true, true, true), 0))
                 s->onShowTerminatePopup();
         }},
        {"targeting_popup_measuring", [](QWidget* d) {
             if (TargetingScreen* s = normal(d))
                 s->onShowMeasuringPopup();
         }},
    };
}

} // namespace

TOUR_MAIN(stops)
