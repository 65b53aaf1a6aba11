// The Korean input table is read and parsed at every opening of a Korean
// keypad. Prints the median time of that load and how it compares with
// only reading the same resource into memory.
#include "SharedSystem/MarigoldUIM.h"

#include <QCoreApplication>
#include <QElapsedTimer>
#include <QFile>
#include <QTextStream>

#include <algorithm>
#include <ctime>
#include <vector>

namespace {

double median(std::vector<double> v)
{
    std::sort(v.begin(), v.end());
    return v.empty() ? 0.0 : v[v.size() / 2];
}

// The CPU time of this process: on a machine shared with builds the wall
// time also counts the waits for a core.
double cpuMs()
{
    timespec ts {};
    clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &ts);
    return ts.tv_sec * 1e3 + ts.tv_nsec / 1e6;
}

} // namespace

int main(int argc, char** argv)
{
    QCoreApplication app(argc, argv);
    const int runs = argc > 1 ? qMax(1, QString(argv[1]).toInt()) : 25;
    QTextStream out(stdout);

    struct Table { const char* code; const char* file; QString probe; };
    const Table tables[] = {
        {"ko", ":/Language/romaja.scm", QStringLiteral("han")},
        {"zh_Hans", ":/Language/simplified_chinese.scm", QStringLiteral("ni")},
        {"zh_Hant", ":/Language/traditional_chinese.scm", QString::fromUtf8("ㄋㄧ")},
    };
    for (const Table& t : tables) {
        std::vector<double> load, read, cpu;
        int bytes = 0;
        for (int i = 0; i < runs; ++i) {
            QElapsedTimer timer;
            timer.start();
            QFile file(t.file);
            file.open(QIODevice::ReadOnly);
            bytes = file.readAll().size();
            read.push_back(timer.nsecsElapsed() / 1e6);

            timer.restart();
            const double c0 = cpuMs();
            MarigoldUIM::instance()->initUIM(t.code);
            cpu.push_back(cpuMs() - c0);
            load.push_back(timer.nsecsElapsed() / 1e6);
        }
        const QVector<QChar> probe = MarigoldUIM::instance()->GetCharVector(t.probe);
        const double l = median(load);
        const double r = median(read);
        out << QString("%1: %2 bytes, median load %3 ms (CPU %8 ms), median read %4 ms, load/read %5x over %6 runs (%7 candidates for the probe)\n")
                   .arg(t.code, -8)
                   .arg(bytes)
                   .arg(l, 0, 'f', 2)
                   .arg(r, 0, 'f', 2)
                   .arg(r > 0 ? l / r : 0.0, 0, 'f', 1)
                   .arg(runs)
                   .arg(probe.size())
                   .arg(median(cpu), 0, 'f', 2);
    }
    return 0;
}
