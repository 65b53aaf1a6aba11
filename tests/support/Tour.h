#ifndef TOUR_H
#define TOUR_H

// The screenshot tour: every panel and popup of the product, built offscreen
// at 320 x 480 with realistic content, one PNG per screen in
// build/screenshots/, so that the product can be looked at and reviewed
// without the instrument.
//
// Each area of the product has its own tour program
// (tests/Screens/tst_tour_<area>.cpp, or tst_screenshot_tour.cpp for the
// home screen and the shared popups). A program lists its stops and ends
// with TOUR_MAIN:
//
//     static QList<Tour::Stop> stops()
//     {
//         return {
//             {"name", [](QWidget* d) { new MyScreen(d); }},
//             {"name_de", [](QWidget* d) { new MyScreen(d); }, "de"},
//         };
//     }
//     TOUR_MAIN(stops)
//
// `d` is the display (the central widget of the window). Tour::over<T>(d)
// puts a popup over the job list backdrop; Tour::issue(d, code) raises a
// measurement issue the way the top panel does. A third field names a
// language to take the screen in.
//
// Every shot is also read for text that does not fit its box or that is
// drawn as missing-character boxes; the faults are logged, and fail the
// stop when MARIGOLD_TOUR_STRICT is set. MARIGOLD_TOUR_LANGUAGES (codes
// joined by commas, or "all") takes every stop again in those languages.

#include "SharedSystem/SystemStatus.h"

#include <QList>
#include <QObject>
#include <QString>

#include <functional>

class DaddyPanel;
class QLabel;
class QWidget;
class StatusBar;

namespace Tour {

struct Stop
{
    QString name;
    std::function<void(QWidget* display)> build;
    QString language = QString();
};

// A working morning: idle, battery at 72 %, strong Wi-Fi, calibrated.
SystemStatus workshopStatus();

StatusBar* statusBar(QWidget* parent, const SystemStatus& status = workshopStatus());
QLabel* titleBar(QWidget* parent, const QString& title, int y = -1);

// A job list as the operator sees it, behind popups.
DaddyPanel* jobListBackdrop(QWidget* display);

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
void issue(QWidget* display, int code);

// The simulator's demo set, read once into the DataManager over a real
// link (the status poll is not started, so status bars keep the states
// they are drawn with). False when the simulator could not be started.
bool loadDemoJobs();

// The simulator serving the demo set (after loadDemoJobs), for stops that
// need to change what it holds; its port, or 0.
quint16 demoServerPort();

// The first job of the list that is (or is not) complete becomes the active one.
void activateJob(bool complete);

// Runs the stops as a data-driven QtTest case.
class Runner : public QObject
{
    Q_OBJECT

public:
    explicit Runner(QList<Stop> stops);

private slots:
    void initTestCase();
    void tour_data();
    void tour();

private:
    QList<Stop> m_stops;
    QString m_directory;
};

int run(const QList<Stop>& stops, int argc, char** argv);

// Texts of the visible labels and buttons under `root` that are cut, run
// out of their box, or have characters no installed font can draw.
QStringList textFaults(QWidget* root);
// Visible texts that read as English sentences.
QStringList englishIn(QWidget* root);

// The languages of the product, by the codes of their translation files:
// the nine of LANGUAGE_T and traditional Chinese, which the instrument
// offers for its keypad's phonetic input.
QStringList productLanguages();

} // namespace Tour

#define TOUR_MAIN(stopsFunction)                                                                  \
    int main(int argc, char** argv) { return Tour::run(stopsFunction(), argc, argv); }

#endif // TOUR_H
