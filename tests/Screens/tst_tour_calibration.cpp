// The screenshot tour of the calibration wizard and the self tests; see
// support/Tour.h for how the tour works.

#include "GUIAPI/DataManager.h"
#include "Screens/CalibrationNeededPopup.h"
#include "Screens/CalibrationPopup.h"
#include "Screens/CalibrationSensorPopup.h"
#include "Screens/CalibrationWizardScreen.h"
#include "Screens/SelfTestPopup.h"
#include "Screens/SelfTestScreen.h"
#include "Widgets/CalibrationWizardPageContainer.h"
#include "Widgets/ProgressBarCircle.h"
#include "SharedSystem/StringTables.h"
#include "Widgets/SelfTestListItem.h"

#include <QtTest>

#include "support/Tour.h"

namespace CalTour {

CalibrationWizardScreen* steps(QWidget* display, CALIBRATION_STATES state, int page)
{
    Tour::loadDemoJobs();
    // The set-up names in the titles, in the stop's language.
    StringTables::Init();
    auto* screen = new CalibrationWizardScreen(state, display);
    screen->SetActiveStatus(true);
    screen->pageContainer()->onSelectPage(page);
    return screen;
}

template <class Popup>
Popup* over(QWidget* display, Popup* popup)
{
    popup->raise();
    popup->show();
    return popup;
}

// The popup as it stands once the instrument has been triggered; the real
// trigger is not sent from the tour.
class Triggered : public CalibrationPopup
{
public:
    explicit Triggered(QWidget* parent)
        : CalibrationPopup(parent)
    {
        m_countdownTimer.stop();
        m_triggered = true;
    }
    void at(MEASURING_POPUP_STATE_T state, int percent)
    {
        setState(state);
        m_closeTimer.stop();
        if (state != STATE_POPUP_COMPLETE)
            findChild<ProgressBarCircle*>("progressBarCircle")->setValue(percent);
    }
};

class TriggeredCheck : public CalibrationReferenceCheckPopup
{
public:
    explicit TriggeredCheck(QWidget* parent)
        : CalibrationReferenceCheckPopup(parent)
    {
        m_countdownTimer.stop();
        m_triggered = true;
    }
    void at(MEASURING_POPUP_STATE_T state, int percent)
    {
        setState(state);
        findChild<ProgressBarCircle*>("progressBarCircle")->setValue(percent);
    }
};

CalibrationPopup* countdown(QWidget* display, int shown)
{
    steps(display, CALIBRATION_WHITE_STATE, 2);
    auto* popup = over(display, new CalibrationPopup(display));
    popup->countdownTimer()->stop();
    while (int(popup->counter()) > shown)
        popup->onCountdownTimer();
    popup->countdownTimer()->stop();
    return popup;
}

class Sensors : public CalibrationSensorPopup
{
public:
    Sensors(QWidget* parent, int s1, int s2, int s3)
        : CalibrationSensorPopup(parent)
    {
        m_pressureSensorTimer.stop();
        PRESSURE_SWITCH_T sw;
        sw.Switch1 = uint32_t(s1);
        sw.Switch2 = uint32_t(s2);
        sw.Switch3 = uint32_t(s3);
        onUpdatePressureSensorStatus(sw);
    }
};

// The list as a run leaves it; the tests themselves are not run here.
class Results : public SelfTestScreen
{
public:
    Results(QWidget* parent, SELF_TEST_TYPE type, const QList<unsigned int>& results, bool canceled)
        : SelfTestScreen(type, parent)
    {
        m_timer.stop();
        m_started = true;
        for (int i = 0; i < results.size() && i < rowCount(); ++i)
            row(i)->setResult(results[i]);
        if (canceled) {
            setStatus([] { return QCoreApplication::translate("SelfTestScreen", "Self Tests Canceled"); });
        } else if (results.size() < rowCount()) {
            setStatus([] { return QCoreApplication::translate("SelfTestScreen", "Testing..."); });
            return;
        } else {
            setStatus([type] {
                return type == SELF_TEST_DEVICE_LIFTED
                    ? QCoreApplication::translate("SelfTestScreen", "All Tests Complete")
                    : getStringFromList(int(type), SELF_TEST_TYPES_COMPLETE_TABLE);
            });
        }
        findChild<QWidget*>("okBtn")->show();
    }
};

Results* results(QWidget* display, SELF_TEST_TYPE type, const QList<unsigned int>& r, bool canceled = false)
{
    Tour::loadDemoJobs();
    StringTables::Init();
    auto* screen = new Results(display, type, r, canceled);
    screen->SetActiveStatus(true);
    return screen;
}

} // namespace CalTour

static QList<Tour::Stop> stops()
{
    using namespace CalTour;
    return {
    {"cal_needed_overdue", [](QWidget* d) {
         Tour::jobListBackdrop(d);
         over(d, new CalibrationNeededPopup(d))->setSecondsLeft(0);
     }},
    {"cal_needed_overdue_de", [](QWidget* d) {
         Tour::jobListBackdrop(d);
         over(d, new CalibrationNeededPopup(d))->setSecondsLeft(0);
     }, "de"},
    {"cal_needed_soon", [](QWidget* d) {
         Tour::jobListBackdrop(d);
         over(d, new CalibrationNeededPopup(d))->setSecondsLeft(5400);
     }},
    {"cal_white_step1", [](QWidget* d) { steps(d, CALIBRATION_WHITE_STATE, 0); }},
    {"cal_white_step2", [](QWidget* d) { steps(d, CALIBRATION_WHITE_STATE, 1); }},
    {"cal_white_step3", [](QWidget* d) { steps(d, CALIBRATION_WHITE_STATE, 2); }},
    {"cal_white_step1_fr", [](QWidget* d) { steps(d, CALIBRATION_WHITE_STATE, 0); }, "fr"},
    {"cal_reference_step1", [](QWidget* d) { steps(d, CALIBRATION_REFERENCE_CHECK_STATE, 0); }},
    {"cal_reference_step2", [](QWidget* d) { steps(d, CALIBRATION_REFERENCE_CHECK_STATE, 1); }},
    {"cal_selftest_white_step1", [](QWidget* d) { steps(d, CALIBRATION_SELF_TEST_WHITE_STATE, 0); }},
    {"cal_selftest_white_step3", [](QWidget* d) { steps(d, CALIBRATION_SELF_TEST_WHITE_STATE, 2); }},
    {"cal_selftest_effect_step1", [](QWidget* d) { steps(d, CALIBRATION_SELF_TEST_REFERENCE_CHECK_STATE, 0); }},
    {"cal_selftest_lifted_step1", [](QWidget* d) { steps(d, CALIBRATION_SELF_TEST_OTHER_STATE, 0); }},
    {"cal_selftest_lifted_step2", [](QWidget* d) { steps(d, CALIBRATION_SELF_TEST_OTHER_STATE, 1); }},
    {"cal_sensor_warning", [](QWidget* d) {
         steps(d, CALIBRATION_WHITE_STATE, 2);
         over(d, new Sensors(d, 1, 0, 1));
     }},
    {"cal_sensor_warning_all_off", [](QWidget* d) {
         steps(d, CALIBRATION_WHITE_STATE, 2);
         over(d, new Sensors(d, 0, 0, 0));
     }},
    {"cal_countdown_3", [](QWidget* d) { countdown(d, 3); }},
    {"cal_countdown_1", [](QWidget* d) { countdown(d, 1); }},
    {"cal_calibrating", [](QWidget* d) {
         steps(d, CALIBRATION_WHITE_STATE, 2);
         over(d, new Triggered(d))->at(STATE_POPUP_MEASURING, 45);
     }},
    {"cal_calculating", [](QWidget* d) {
         steps(d, CALIBRATION_WHITE_STATE, 2);
         over(d, new Triggered(d))->at(STATE_POPUP_CALCULATING, 60);
     }},
    {"cal_complete", [](QWidget* d) {
         steps(d, CALIBRATION_WHITE_STATE, 2);
         over(d, new Triggered(d))->at(STATE_POPUP_COMPLETE, 100);
     }},
    {"cal_reference_measuring", [](QWidget* d) {
         steps(d, CALIBRATION_REFERENCE_CHECK_STATE, 2);
         over(d, new TriggeredCheck(d))->at(STATE_POPUP_MEASURING, 30);
     }},
    {"selftest_white_running", [](QWidget* d) {
         results(d, SELF_TEST_WHITE_TILE, {1});
         auto* popup = over(d, new SelfTestPopup(SelfTestScreen::mapTestName("REFERENCE CHECK ON WHITE"),
                                                 SELF_TEST_WHITE_TILE, d));
         popup->setState(STATE_POPUP_MEASURING);
         popup->findChild<ProgressBarCircle*>("progressBarCircle")->setValue(40);
     }},
    {"selftest_white_results", [](QWidget* d) { results(d, SELF_TEST_WHITE_TILE, {1, 2, 1}); }},
    {"selftest_white_error", [](QWidget* d) {
         results(d, SELF_TEST_WHITE_TILE, {1, 1, 2028})->onMeasurementIssue(2028);
     }},
    {"selftest_effect_canceled", [](QWidget* d) { results(d, SELF_TEST_EFFECT_TILE, {3}, true); }},
    {"selftest_lifted_results", [](QWidget* d) { results(d, SELF_TEST_DEVICE_LIFTED, {1, 1, 2}); }},
    {"selftest_lifted_results_ja", [](QWidget* d) { results(d, SELF_TEST_DEVICE_LIFTED, {1, 1, 2}); }, "ja"},
    };
}

TOUR_MAIN(stops)
