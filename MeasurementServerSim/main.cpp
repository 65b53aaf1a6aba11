// MeasurementServerSim: the instrument's measurement server, simulated, for
// running and demonstrating the GUI on any machine. See README.md beside this
// file for the options and the control interface.

#include "SimServer.h"

#include <QCommandLineParser>
#include <QDir>
#include <QCoreApplication>
#include <QStandardPaths>
#include <QTextCodec>

#include <cstdio>

int main(int argc, char* argv[])
{
    // Readings carry local times; without TZ glibc stats /etc/localtime on
    // every conversion.
    if (qEnvironmentVariableIsEmpty("TZ"))
        qputenv("TZ", ":/etc/localtime");
    QCoreApplication app(argc, argv);
    // Text on the wire is UTF-8, as on the instrument.
    QTextCodec::setCodecForLocale(QTextCodec::codecForName("UTF-8"));
    QCoreApplication::setApplicationName(QStringLiteral("MeasurementServerSim"));

    QCommandLineParser parser;
    parser.setApplicationDescription(QStringLiteral("Simulator of the instrument's measurement server."));
    parser.addHelpOption();
    QCommandLineOption port(QStringLiteral("port"), QStringLiteral("Protocol port on 127.0.0.1 (default 6300)."),
                            QStringLiteral("port"), QStringLiteral("6300"));
    QCommandLineOption controlPort(QStringLiteral("control-port"),
                                   QStringLiteral("Control port on 127.0.0.1 (default 6301, -1 for none)."),
                                   QStringLiteral("port"), QStringLiteral("6301"));
    QCommandLineOption data(QStringLiteral("data"), QStringLiteral("Data folder (default ~/.local/share/MeasurementServerSim)."),
                            QStringLiteral("dir"));
    QCommandLineOption reset(QStringLiteral("reset"), QStringLiteral("Start fresh from the demo set."));
    QCommandLineOption model(QStringLiteral("model"), QStringLiteral("BIRCH (6 angles, default) or ALDER (11 angles)."),
                             QStringLiteral("model"), QStringLiteral("BIRCH"));
    QCommandLineOption timeScale(QStringLiteral("time-scale"),
                                 QStringLiteral("Factor on every duration (0.2: five times faster)."),
                                 QStringLiteral("factor"), QStringLiteral("1"));
    QCommandLineOption seed(QStringLiteral("seed"), QStringLiteral("Seed of the measurement noise (0: random)."),
                            QStringLiteral("n"), QStringLiteral("0"));
    QCommandLineOption noStdin(QStringLiteral("no-stdin"), QStringLiteral("Do not read control lines from standard input."));
    parser.addOptions({port, controlPort, data, reset, model, timeScale, seed, noStdin});
    parser.process(app);

    Sim::Server::Options o;
    bool ok = true;
    o.port = quint16(parser.value(port).toUInt(&ok));
    if (!ok) {
        fprintf(stderr, "Bad --port\n");
        return 2;
    }
    o.controlPort = parser.value(controlPort).toInt(&ok);
    if (!ok || o.controlPort > 65535) {
        fprintf(stderr, "Bad --control-port\n");
        return 2;
    }
    o.controlOnStdin = !parser.isSet(noStdin);
    const QString m = parser.value(model).trimmed().toUpper();
    if (m != QLatin1String("BIRCH") && m != QLatin1String("ALDER")) {
        fprintf(stderr, "--model is BIRCH or ALDER\n");
        return 2;
    }
    o.instrument.model = m == QLatin1String("ALDER") ? Sim::Model::Alder : Sim::Model::Birch;
    o.instrument.dataDir = parser.isSet(data)
        ? parser.value(data)
        : QStandardPaths::writableLocation(QStandardPaths::AppDataLocation);
    o.instrument.reset = parser.isSet(reset);
    o.instrument.timeScale = parser.value(timeScale).toDouble(&ok);
    if (!ok || o.instrument.timeScale <= 0.0) {
        fprintf(stderr, "Bad --time-scale\n");
        return 2;
    }
    o.instrument.seed = parser.value(seed).toUInt();

    Sim::Server server(o);
    QString error;
    if (!server.start(&error)) {
        fprintf(stderr, "MeasurementServerSim: %s\n", qPrintable(error));
        return 1;
    }
    // Every change is committed as it happens, so ending the process by a
    // signal loses nothing.
    return app.exec();
}
