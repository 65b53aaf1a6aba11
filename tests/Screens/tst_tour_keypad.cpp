// The screenshot tour of the keypad and the job's text screens: each layer,
// each language layout, the enlarged key, the full field, the name and tag
// checks, the auto-fill list and the edit warning. See support/Tour.h.

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/DataManager.h"
#include "Screens/JobEditScreens.h"
#include "Screens/JobKeypadScreen.h"
#include "Screens/JobMeasureScreen.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/Platform.h"
#include "Widgets/Keypad.h"
#include "Widgets/Theme.h"

#include "SimServer.h"
#include "support/TestSupport.h"
#include "support/Tour.h"

#include <QFile>
#include <QLabel>
#include <QMouseEvent>
#include <QPlainTextEdit>
#include <QtTest>

namespace {

// The simulator's demo jobs with the example filter file, and the first
// open job active under a realistic name.
bool loadData()
{
    static const bool loaded = [] {
        static Sim::ServerThread sim;
        const QString dataDir = TestSupport::makeTempDir("tour-keypad-sim");
        QFile::copy(Platform::devicePath("/opt/Filter/Filter.xml"), dataDir + "/Filter.xml");
        sim.options().port = TestSupport::freeLocalPort();
        sim.options().controlPort = -1;
        sim.options().instrument.dataDir = dataDir;
        sim.options().instrument.seed = 7;
        if (!sim.start())
            return false;
        setIpAddress("127.0.0.1");
        setIpPort(sim.port());
        Commands::Init();
        Commands::instance()->tcpClient()->connectToHost();
        DataManager* data = DataManager::instance();
        data->onSync();
        data->setSystemStatus(Tour::workshopStatus());
        data->updateJobInfos();
        return data->getNumberOfJobs() > 0 && data->doesTagExist();
    }();
    if (loaded) {
        Tour::activateJob(false);
        DataManager::instance()->setLanguageCode("en");
    }
    return loaded;
}

void press(QWidget* screen, const QPoint& at)
{
    QMouseEvent event(QEvent::MouseButtonPress, at, screen->mapToGlobal(at), Qt::LeftButton, Qt::LeftButton,
                      Qt::NoModifier);
    QApplication::sendEvent(screen, &event);
}

QPoint keyCentre(JobKeypadScreen* screen, const QString& text)
{
    for (KeyPadLabel* label : screen->keys().at(screen->currentLayer()))
        if (label->text() == text)
            return label->geometry().center();
    return QPoint(-1, -1);
}

JobNameEditScreen* nameScreen(QWidget* d, const QString& text = QString())
{
    loadData();
    auto* screen = new JobNameEditScreen(d);
    if (!text.isNull())
        screen->getTextEditPointer()->setPlainText(text);
    return screen;
}

// A name screen on the keypad of a language, on its normal or special page.
void layoutStop(QWidget* d, const QString& code, bool special, bool caps)
{
    loadData();
    DataManager::instance()->setLanguageCode(code);
    auto* screen = new JobNameEditScreen(d);
    DataManager::instance()->setLanguageCode("en");
    screen->getTextEditPointer()->setPlainText(code == "wifi" ? "" : "Motorhaube");
    if (special)
        screen->onDisplaySpecial(true);
    if (!caps)
        screen->onDisplayCaps(false);
}

// The name of a job other than the active one.
QString otherJobName()
{
    loadData();
    const QString active = DataManager::instance()->getActiveJobObject().getDisplayName();
    for (const Job& job : DataManager::instance()->getAllJobs())
        if (job.getDisplayName() != active)
            return job.getDisplayName();
    return QString();
}

JobTagEditScreen* tagScreen(QWidget* d, TAG_STATES_T state, const QString& text)
{
    loadData();
    auto* screen = new JobTagEditScreen(state, d);
    screen->getTextEditPointer()->setPlainText(text);
    return screen;
}

QList<Tour::Stop> stops()
{
    QList<Tour::Stop> list = {
        {"keypad_name", [](QWidget* d) { nameScreen(d); }},
        {"keypad_name_lower", [](QWidget* d) {
             auto* s = nameScreen(d, "Door left");
             s->onDisplayCaps(false);
         }},
        {"keypad_key_pressed", [](QWidget* d) {
             auto* s = nameScreen(d, "FENDER");
             press(s, keyCentre(s, "R"));
         }},
        {"keypad_name_full", [](QWidget* d) { nameScreen(d, "REAR BUMPER LEFT 012"); }},
        {"keypad_name_taken", [](QWidget* d) { nameScreen(d, otherJobName()); }},
        {"keypad_name_empty_popup", [](QWidget* d) {
             auto* s = nameScreen(d, "  ");
             s->onNextAction();
         }},
        {"keypad_name_exists_popup", [](QWidget* d) { nameScreen(d, otherJobName())->onNextAction(); }},
        {"keypad_tag_make", [](QWidget* d) { tagScreen(d, TAG_STATE_1, ""); }},
        {"keypad_tag_make_list", [](QWidget* d) { tagScreen(d, TAG_STATE_1, "")->onBtnMoreClicked(); }},
        {"keypad_tag_make_one_match", [](QWidget* d) { tagScreen(d, TAG_STATE_1, "Vo"); }},
        {"keypad_tag_model_typing", [](QWidget* d) { tagScreen(d, TAG_STATE_2, "F"); }},
        {"keypad_tag_colour_too_many", [](QWidget* d) { tagScreen(d, TAG_STATE_3, ""); }},
        {"keypad_tag_colour_typing", [](QWidget* d) { tagScreen(d, TAG_STATE_3, "Z1"); }},
        {"keypad_tag_no_match", [](QWidget* d) { tagScreen(d, TAG_STATE_1, "Fx"); }},
        {"keypad_tag_unknown_popup", [](QWidget* d) { tagScreen(d, TAG_STATE_1, "Fordson")->onNextAction(); }},
        {"keypad_tag_free", [](QWidget* d) {
             loadData();
             auto* s = new JobTagFreeEditScreen(TAG_STATE_2, d);
             s->getTextEditPointer()->setPlainText("Custom van conversion");
         }},
        {"keypad_notes", [](QWidget* d) {
             loadData();
             auto* s = new JobFreeTextEditScreen(d);
             s->getTextEditPointer()->setPlainText("Bonnet resprayed, see edge near hinge");
         }},
        {"keypad_edit_warning", [](QWidget* d) {
             loadData();
             new JobNameEditScreen(d);
             auto* popup = new OverridePopup(d);
             // The job summary's warning, in its words.
             popup->setTitleText(JobMeasureScreen::tr("Warning"));
             popup->setBodyText(JobMeasureScreen::tr(
                 "This job was not created on the instrument. Are you sure you want to edit the job?"));
             popup->setConfirmButtonText(JobMeasureScreen::tr("Edit"));
             popup->setCancelButtonText(JobMeasureScreen::tr("Cancel"));
             popup->raise();
             popup->show();
         }},
        // Korean composes its text: Enter comes in and shift goes.
        {"keypad_multilingual_ko", [](QWidget* d) {
             loadData();
             DataManager::instance()->setLanguageCode("ko");
             new JobNameEditScreen(d);
             DataManager::instance()->setLanguageCode("en");
         }, "ko"},
        {"keypad_fixed_letters", [](QWidget* d) {
             Tour::titleBar(d, "Keypad", 0);
             auto* pad = new Keypad(d);
             pad->move(0, 158);
         }},
        {"keypad_fixed_numbers", [](QWidget* d) {
             Tour::titleBar(d, "Keypad", 0);
             auto* pad = new Keypad(d);
             pad->move(0, 158);
             pad->on_BtnNumLetter_clicked();
         }},
    };
    for (const QString code : {"de", "fr", "es", "it", "pt", "wifi"}) {
        list.append({"keypad_layout_" + code, [code](QWidget* d) { layoutStop(d, code, false, true); }});
        list.append({"keypad_layout_" + code + "_lower", [code](QWidget* d) { layoutStop(d, code, false, false); }});
        list.append({"keypad_layout_" + code + "_special", [code](QWidget* d) { layoutStop(d, code, true, true); }});
        list.append({"keypad_layout_" + code + "_special_lower",
                     [code](QWidget* d) { layoutStop(d, code, true, false); }});
    }
    return list;
}

} // namespace

TOUR_MAIN(stops)
