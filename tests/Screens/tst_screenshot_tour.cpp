// The screenshot tour: every panel and popup of the product, built offscreen
// at 320 x 480 with realistic content, one PNG per screen in
// build/screenshots/, so that the product can be looked at and reviewed
// without the instrument.
//
// Adding a screen is one line in kTour below:
//     {"name", [](QWidget* d) { new MyScreen(d); }},
// `d` is the display (the central widget of the window). Tour::over<T>(d)
// puts a popup over the job list backdrop; Tour::issue(d, code) raises a
// measurement issue the way the top panel does. A third field names a
// language to take the screen in ("de", "fr", "es").

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/DeletePopup.h"
#include "Screens/ErrorPopup.h"
#include "Screens/JobActionsPopup.h"
#include "Screens/JobListScreen.h"
#include "Screens/LockScreen.h"
#include "Screens/MeasuringPopup.h"
#include "Screens/NotificationPopup.h"
#include "Screens/OverridePopup.h"
#include "Screens/PowerDownPopup.h"
#include "Screens/SadPuppyScreen.h"
#include "Screens/ScreenMaster.h"
#include "Screens/SyncScreen.h"
#include "Screens/TerminateJobPopup.h"
#include "Screens/UndoPopup.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "SharedSystem/UserParams.h"
#include "Widgets/FlickButton.h"
#include "Widgets/FlickList.h"
#include "Widgets/KLabel.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/ProgressBarCircle.h"
#include "Widgets/StatusBar.h"
#include "Widgets/Theme.h"

#include <QApplication>
#include <QDir>
#include <QLabel>
#include <QTranslator>
#include <QtTest>

#include "SimServer.h"
#include "support/TestSupport.h"

#include <functional>

namespace Tour {

struct Stop
{
    QString name;
    std::function<void(QWidget* display)> build;
    QString language = QString();
};

SystemStatus workshopStatus()
{
    SystemStatus status;
    status.setSystemState(STATE_INIT);
    status.setBatteryState(BATTERY_DISCHARGING);
    status.setBatteryChargePercent(72);
    status.setWifiState(WIFI_STATUS_CONNECTED);
    status.setWifiLevel(81);
    CALIBRATION_STATE_T cal;
    cal.nextExternalWhiteCal = 6 * 3600;
    status.setCalState(cal);
    status.setSystemTime(QDateTime(QDate(2024, 3, 14), QTime(9, 41, 0)));
    return status;
}

StatusBar* statusBar(QWidget* parent, const SystemStatus& status = workshopStatus())
{
    auto* bar = new StatusBar(parent);
    bar->onSystemStatusUpdated(status);
    return bar;
}

QLabel* titleBar(QWidget* parent, const QString& title, int y = StatusBar::Height)
{
    auto* header = new QLabel(parent);
    header->setGeometry(0, y, Theme::ScreenWidth, Theme::TitleBarHeight);
    header->setPixmap(QPixmap(":/Assets/header_standard.png"));
    auto* text = new KLabel(parent);
    text->setGeometry(60, y, 200, Theme::TitleBarHeight - 3);
    text->setAlignment(Qt::AlignCenter);
    text->setFont(Theme::font(Theme::FontTitle, true));
    text->setStyleSheet(QString("color: %1; background: transparent;").arg(Theme::css(Theme::TextOnDark)));
    text->setAutoSize(true);
    text->setText(title);
    return header;
}

// One row of the job list: a colour chip, the job's name and what it holds.
FlickButton* jobRow(const QString& name, const QString& detail, const QString& date, const QColor& paint)
{
    auto* row = new FlickButton;
    row->resize(Theme::ScreenWidth, 85);
    row->setBackground(":/Assets/cell_85px.png");
    row->setPressedBackground(":/Assets/cell_85px_hit.png");
    auto* chip = new QLabel(row);
    chip->setGeometry(14, 17, 50, 50);
    chip->setStyleSheet(QString("background-color: %1; border-radius: 8px; border: 1px solid rgb(200, 201, 203);")
                            .arg(Theme::css(paint)));
    auto* title = new KLabel(row);
    title->setGeometry(78, 14, 170, 30);
    title->setFont(Theme::font(Theme::FontHeadline, true));
    title->setStyleSheet(QString("color: %1;").arg(Theme::css(Theme::TextDark)));
    title->setAutoSize(true);
    title->setText(name);
    auto* sub = new KLabel(row);
    sub->setGeometry(78, 44, 226, 26);
    sub->setFont(Theme::font(Theme::FontSmall + 1));
    sub->setStyleSheet(QString("color: %1;").arg(Theme::css(Theme::TextSecondary)));
    sub->setAutoSize(true);
    sub->setText(detail);
    auto* when = new KLabel(row);
    when->setGeometry(240, 14, 66, 30);
    when->setAlignment(Qt::AlignRight | Qt::AlignVCenter);
    when->setFont(Theme::font(Theme::FontSmall));
    when->setStyleSheet(QString("color: %1;").arg(Theme::css(Theme::TextSecondary)));
    when->setText(date);
    for (QWidget* w : {static_cast<QWidget*>(chip), static_cast<QWidget*>(title),
                       static_cast<QWidget*>(sub), static_cast<QWidget*>(when)})
        w->setAttribute(Qt::WA_TransparentForMouseEvents);
    return row;
}

// A job list as the operator sees it, behind the popups until the real
// home screen is part of the tour.
DaddyPanel* jobListBackdrop(QWidget* display)
{
    auto* panel = new DaddyPanel(display);
    panel->setObjectName("TourJobList");
    panel->setAutoFillBackground(true);
    QPalette palette = panel->palette();
    palette.setColor(QPalette::Window, Theme::GroundLight);
    panel->setPalette(palette);
    statusBar(panel);
    titleBar(panel, "Jobs");
    auto* list = new FlickList(panel);
    list->setGeometry(0, StatusBar::Height + Theme::TitleBarHeight, Theme::ScreenWidth,
                      Theme::ScreenHeight - StatusBar::Height - Theme::TitleBarHeight);
    list->setBackgroundStyleSheet(QString("background-color: %1;").arg(Theme::css(Theme::GroundLight)));
    list->addWidget(new ListingHeader("OPEN JOBS", "2 jobs"));
    list->addWidget(jobRow("Door panel LF", "3 of 5 samples  ·  Averaging 5", "09:12", QColor(172, 28, 36)));
    list->addWidget(jobRow("Fender RF 3-coat", "1 of 3 samples  ·  SMC 3:5", "08:47", QColor(226, 228, 230)));
    list->addWidget(new ListingHeader("COMPLETED", "3 jobs"));
    list->addWidget(jobRow("Hood repair 0412", "5 samples  ·  synchronised", "Mar 13", QColor(24, 44, 86)));
    list->addWidget(jobRow("Bumper rear", "3 samples", "Mar 12", QColor(132, 134, 130)));
    FlickButton* last = jobRow("Mirror cap", "1 sample", "Mar 11", QColor(18, 18, 20));
    list->addWidget(last);
    last->setLastInList(true);
    panel->SetActiveStatus(true);
    return panel;
}

template <class Popup>
Popup* over(QWidget* display)
{
    jobListBackdrop(display);
    auto* popup = new Popup(display);
    popup->raise();
    popup->show();
    return popup;
}

// An issue raised as the instrument raises it: on the active panel.
void issue(QWidget* display, int code)
{
    jobListBackdrop(display)->onMeasurementIssue(code);
}

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
        auto* caption = new QLabel(s.caption, display);
        caption->setGeometry(12, y, 296, 22);
        caption->setFont(Theme::font(Theme::FontSmall + 1, true));
        caption->setStyleSheet(QString("color: %1;").arg(Theme::css(Theme::TextBody)));
        SystemStatus status = workshopStatus();
        status.setBatteryState(s.battery);
        status.setBatteryChargePercent(s.percent);
        status.setWifiState(s.wifi);
        status.setWifiLevel(s.level);
        CALIBRATION_STATE_T cal;
        cal.nextExternalWhiteCal = s.nextCal;
        status.setCalState(cal);
        statusBar(display, status)->move(0, y + 24);
        y += 76;
    }
}

} // namespace Tour

// ---- The home screen with the simulator's demo jobs ---------------------------

namespace HomeTour {

// The job list shows what a server holds: the simulator's demo set, read
// once. The status poll is not started, so the status bars of the other
// stops keep the states they are drawn with.
bool loadDemoJobs()
{
    static const bool loaded = [] {
        static Sim::ServerThread sim;
        sim.options().port = TestSupport::freeLocalPort();
        sim.options().controlPort = -1;
        sim.options().instrument.dataDir = TestSupport::makeTempDir("tour-sim");
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
        return data->getNumberOfJobs() > 0;
    }();
    return loaded;
}

// The first job of the list that is (or is not) complete becomes the active one.
void activateJob(bool complete)
{
    const QVector<Job> jobs = DataManager::instance()->getAllJobs();
    for (int i = 0; i < jobs.size(); ++i) {
        if (jobs[i].isJobComplete() == complete) {
            DataManager::instance()->setActiveJob(i);
            return;
        }
    }
}

JobListScreen* home(QWidget* display, bool completeTab)
{
    loadDemoJobs();
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

static const QList<Tour::Stop> kTour = {
    {"home_backdrop", [](QWidget* d) { Tour::jobListBackdrop(d); }},
    {"home_jobs_open", [](QWidget* d) { HomeTour::home(d, false); }},
    {"home_jobs_complete", [](QWidget* d) { HomeTour::home(d, true); }},
    {"home_job_actions_open", [](QWidget* d) {
         HomeTour::activateJob(false);
         HomeTour::home(d, false)->onShowJobActionsPopup();
     }},
    {"home_job_actions_complete", [](QWidget* d) {
         HomeTour::activateJob(true);
         HomeTour::home(d, true)->onShowJobActionsPopup();
     }},
    {"home_delete_job", [](QWidget* d) {
         HomeTour::activateJob(true);
         HomeTour::home(d, true)->onShowDeleteJobsPopup();
     }},
    {"home_delete_completed_jobs", [](QWidget* d) { HomeTour::home(d, true)->onShowDeleteCompletedJobsPopup(); }},
    {"home_jobs_full", [](QWidget* d) { HomeTour::home(d, false)->onShowJobsFullPopup(); }},
    {"home_measures_full", [](QWidget* d) { HomeTour::home(d, false)->onShowMeasuresFullPopup(); }},
    {"status_bar_states", [](QWidget* d) { Tour::statusBarStates(d); }},
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
         p->setHeaderText("Delete Job?");
         p->setMessageText("The entire job and all samples will be permanently deleted.");
     }},
    {"popup_override_edit", [](QWidget* d) {
         auto* p = Tour::over<OverridePopup>(d);
         p->setTitleText("Warning");
         p->setBodyText("This job was not created on the instrument. Are you sure you want to edit the job?");
         p->setConfirmButtonText("Edit");
         p->setCancelButtonText("Cancel");
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

class TestScreenshotTour : public QObject
{
    Q_OBJECT

private:
    QString m_directory;

private slots:
    void initTestCase()
    {
        m_directory = QDir::cleanPath(QCoreApplication::applicationDirPath() + "/../screenshots");
        QVERIFY(QDir().mkpath(m_directory));
        QApplication::setFont(LocaleHelper::determineFontFromCountryCode("en"));
        DataManager::instance();
    }

    void tour_data()
    {
        QTest::addColumn<int>("stop");
        for (int i = 0; i < kTour.size(); ++i)
            QTest::newRow(qPrintable(kTour.at(i).name)) << i;
    }

    void tour()
    {
        QFETCH(int, stop);
        const Tour::Stop& s = kTour.at(stop);

        QTranslator translator;
        if (!s.language.isEmpty()) {
            QVERIFY(translator.load(ScreenMaster::languageFilePath(s.language)));
            QApplication::installTranslator(&translator);
            QApplication::setFont(LocaleHelper::determineFontFromCountryCode(s.language));
        }

        QWidget window;
        window.setObjectName("TourWindow");
        window.resize(Theme::ScreenWidth, Theme::ScreenHeight);
        auto* display = new QWidget(&window);
        display->setObjectName("centralwidget");
        display->setGeometry(0, 0, Theme::ScreenWidth, Theme::ScreenHeight);
        s.build(display);
        window.show();
        QVERIFY(QTest::qWaitForWindowExposed(&window));
        // Let show events, fades and the first paint settle.
        QTest::qWait(250);

        const QImage shot = window.grab().toImage();
        QCOMPARE(shot.size(), QSize(Theme::ScreenWidth, Theme::ScreenHeight));
        // Something was drawn: a real screen has more than a handful of colours.
        QSet<QRgb> colours;
        for (int y = 0; y < shot.height(); y += 7)
            for (int x = 0; x < shot.width(); x += 7)
                colours.insert(shot.pixel(x, y));
        QVERIFY2(colours.size() > 4, qPrintable(s.name));

        const QString file = m_directory + "/" + s.name + ".png";
        QVERIFY2(shot.save(file, "PNG"), qPrintable(file));

        if (!s.language.isEmpty()) {
            QApplication::removeTranslator(&translator);
            QApplication::setFont(LocaleHelper::determineFontFromCountryCode("en"));
        }
    }
};

QTEST_MAIN(TestScreenshotTour)
#include "tst_screenshot_tour.moc"
