#include "support/Tour.h"

#include "Communication/Commands.h"
#include "Communication/TcpClient.h"
#include "GUIAPI/DataManager.h"
#include "Screens/DaddyPanel.h"
#include "Screens/ScreenMaster.h"
#include "SharedSystem/Instrument.h"
#include "SharedSystem/Job.h"
#include "SharedSystem/LocaleHelper.h"
#include "Widgets/FlickButton.h"
#include "Widgets/FlickList.h"
#include "Widgets/KLabel.h"
#include "Widgets/ListingHeader.h"
#include "Widgets/StatusBar.h"
#include "Widgets/Theme.h"

#include <QApplication>
#include <QDir>
#include <QLabel>
#include <QSet>
#include <QTranslator>
#include <QtTest>

#include "support/TestSupport.h"

#ifdef MARIGOLD_HAVE_SIM
#include "SimServer.h"
#endif

namespace Tour {

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

StatusBar* statusBar(QWidget* parent, const SystemStatus& status)
{
    auto* bar = new StatusBar(parent);
    bar->onSystemStatusUpdated(status);
    return bar;
}

QLabel* titleBar(QWidget* parent, const QString& title, int y)
{
    if (y < 0)
        y = StatusBar::Height;
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

namespace {

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

quint16 g_demoPort = 0;

} // namespace

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

void issue(QWidget* display, int code)
{
    jobListBackdrop(display)->onMeasurementIssue(code);
}

bool loadDemoJobs()
{
#ifdef MARIGOLD_HAVE_SIM
    static const bool loaded = [] {
        static Sim::ServerThread sim;
        sim.options().port = TestSupport::freeLocalPort();
        sim.options().controlPort = -1;
        sim.options().instrument.dataDir = TestSupport::makeTempDir("tour-sim");
        sim.options().instrument.seed = 7;
        if (!sim.start())
            return false;
        g_demoPort = sim.port();
        setIpAddress("127.0.0.1");
        setIpPort(sim.port());
        Commands::Init();
        Commands::instance()->tcpClient()->connectToHost();
        DataManager* data = DataManager::instance();
        data->onSync();
        data->setSystemStatus(workshopStatus());
        data->updateJobInfos();
        return data->getNumberOfJobs() > 0;
    }();
    return loaded;
#else
    return false;
#endif
}

quint16 demoServerPort()
{
    return g_demoPort;
}

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

Runner::Runner(QList<Stop> stops)
    : m_stops(std::move(stops))
{
}

void Runner::initTestCase()
{
    m_directory = QDir::cleanPath(QCoreApplication::applicationDirPath() + "/../screenshots");
    QVERIFY(QDir().mkpath(m_directory));
    QApplication::setFont(LocaleHelper::determineFontFromCountryCode("en"));
    DataManager::instance();
}

void Runner::tour_data()
{
    QTest::addColumn<int>("stop");
    for (int i = 0; i < m_stops.size(); ++i)
        QTest::newRow(qPrintable(m_stops.at(i).name)) << i;
}

void Runner::tour()
{
    QFETCH(int, stop);
    const Stop& s = m_stops.at(stop);

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

int run(const QList<Stop>& stops, int argc, char** argv)
{
    QApplication app(argc, argv);
    app.setAttribute(Qt::AA_Use96Dpi, true);
    Runner runner(stops);
    return QTest::qExec(&runner, argc, argv);
}

} // namespace Tour
