#include "SimControl.h"

#include "SimServer.h"
#include "SimSpectra.h"

#include <QRegularExpression>

namespace Sim {

namespace {

const char* const kHelp[] = {
    "place                         all three pressure feet on the surface",
    "lift                          all three feet off the surface",
    "switch N on|off               one foot (N = 1, 2, 3)",
    "switches XYZ                  all three at once, e.g. 110",
    "tilt DEGREES                  rotation of the instrument (0..359)",
    "surface vertical|horizontal   how the panel under the instrument lies",
    "battery PERCENT [STATE]       STATE: discharging, charging-ac, charging-usb, full, empty, missing, error",
    "usb off|connected|on",
    "wifi on|off                   switch the radio",
    "wifi level QUALITY            signal of the connected network, 0..1",
    "wifi network SSID in|out [QUALITY] [AUTH] [PASSWORD]   a network on the air",
    "wifi static ADDRESS | wifi dhcp",
    "wifi fail-mode | wifi fail-scan   the next switch or scan reports an error",
    "lock | unlock                 the instrument is in use from elsewhere",
    "busy SECONDS|on|off           busy: targeting and triggers get status 14",
    "error CODE [TEXT]             put an error into the error list",
    "fail-next CODE                the next measurement, calibration or reference check fails with CODE",
    "abort                         abort the running operation (2033; self test: canceled)",
    "calibration expire|renew|due SECONDS|interval SECONDS",
    "request white|refcheck|none   ask the user for a white calibration or a reference check",
    "refcheck pass|fail|auto       outcome of the next reference checks",
    "selftest NUM RESULT|auto      force the result of a self test",
    "selftest add NAME white|effect|lifted MS   one more self test (names may repeat)",
    "online start [NAME] [none|avg3|avg5|smc M N] | online end",
    "temperature CELSIUS           sample surface temperature",
    "instrument-temperature CELSIUS",
    "panel FINISH|auto             the surface under the instrument (see: finishes)",
    "finishes                      list the finishes",
    "outliers RATE                 share of readings spoilt by a rocking hand, 0..1",
    "next-reading outlier|clean",
    "smc-tolerance DELTA_E",
    "param KEY [VALUE]             read or change a parameter (number or name)",
    "message TEXT                  show a text on the GUI",
    "memory MAX_JOBS MAX_MEASUREMENTS",
    "targeting-timeout SECONDS     leave targeting after so long (0: never)",
    "jobs                          list the jobs",
    "bulk JOBS READINGS            add so many complete jobs of readings (load tests)",
    "job-state NAME STATE          put a job into a state (e.g. 2008)",
    "refuse CODE STATUS [COUNT] | refuse CODE off | refuse off",
    "delay MS                      hold every reply back",
    "drop [SECONDS|forever]        close the link (and stay away)",
    "power on                      come back after drop forever or a shutdown",
    "status                        what the instrument is doing",
    "help",
};

QStringList tokenize(const QString& line)
{
    QStringList out;
    QString current;
    bool quoted = false, has = false;
    for (const QChar c : line) {
        if (c == QLatin1Char('"')) {
            quoted = !quoted;
            has = true;
        } else if (c.isSpace() && !quoted) {
            if (has)
                out << current;
            current.clear();
            has = false;
        } else {
            current += c;
            has = true;
        }
    }
    if (has)
        out << current;
    return out;
}

QString restOf(const QString& line, int words)
{
    QString rest = line.trimmed();
    for (int i = 0; i < words; ++i) {
        const int space = rest.indexOf(QRegularExpression(QStringLiteral("\\s")));
        rest = space < 0 ? QString() : rest.mid(space).trimmed();
    }
    if (rest.size() >= 2 && rest.startsWith(QLatin1Char('"')) && rest.endsWith(QLatin1Char('"')))
        rest = rest.mid(1, rest.size() - 2);
    return rest;
}

QString err(const QString& why) { return QStringLiteral("ERR ") + why; }
QString ok(const QString& what = QString()) { return what.isEmpty() ? QStringLiteral("OK") : QStringLiteral("OK ") + what; }

bool toInt(const QString& s, int* v)
{
    bool good = false;
    *v = s.toInt(&good, 0);
    return good;
}

bool onOff(const QString& s, bool* v)
{
    const QString l = s.toLower();
    if (l == QLatin1String("on") || l == QLatin1String("1") || l == QLatin1String("down"))
        *v = true;
    else if (l == QLatin1String("off") || l == QLatin1String("0") || l == QLatin1String("up"))
        *v = false;
    else
        return false;
    return true;
}

const char* stateName(SYSTEM_STATE_T s)
{
    static const char* const names[] = {"POWER_UP", "NOT_CALIBRATED", "INIT", "MEASURING", "CALIBRATING",
                                        "LOCK", "BUSY", "CALCULATING", "TARGETING", "SYSTEM_UPDATE"};
    return (s >= 0 && s < NUM_OF_SYSTEM_STATES) ? names[s] : "?";
}

} // namespace

Control::Control(Server& server) : m_server(server) {}

QString Control::help()
{
    QStringList lines;
    for (const char* l : kHelp)
        lines << QString::fromLatin1(l);
    lines << QStringLiteral("OK");
    return lines.join(QLatin1Char('\n'));
}

QString Control::run(const QString& line)
{
    const QString trimmed = line.trimmed();
    if (trimmed.isEmpty() || trimmed.startsWith(QLatin1Char('#')))
        return ok();
    QStringList words = tokenize(trimmed);
    if (words.isEmpty())
        return ok();
    const QString command = words.takeFirst().toLower();
    // Free text runs to the end of the line.
    if (command == QLatin1String("message"))
        words = QStringList{restOf(trimmed, 1)};
    else if (command == QLatin1String("error") && words.size() > 1)
        words = QStringList{words.first(), restOf(trimmed, 2)};
    return dispatch(command, words);
}

QString Control::dispatch(const QString& command, const QStringList& a)
{
    Instrument& ins = m_server.instrument();
    const int n = a.size();
    int v = 0;

    if (command == QLatin1String("help"))
        return help();
    if (command == QLatin1String("place")) {
        ins.setSwitches(true, true, true);
        return ok();
    }
    if (command == QLatin1String("lift")) {
        ins.setSwitches(false, false, false);
        return ok();
    }
    if (command == QLatin1String("switch")) {
        bool on = false;
        if (n != 2 || !toInt(a[0], &v) || v < 1 || v > 3 || !onOff(a[1], &on))
            return err(QStringLiteral("usage: switch 1|2|3 on|off"));
        PRESSURE_SWITCH_T s = ins.switches();
        (v == 1 ? s.Switch1 : v == 2 ? s.Switch2 : s.Switch3) = on ? 1 : 0;
        ins.setSwitches(s.Switch1, s.Switch2, s.Switch3);
        return ok();
    }
    if (command == QLatin1String("switches")) {
        if (n != 1 || a[0].size() != 3 || a[0].contains(QRegularExpression(QStringLiteral("[^01]"))))
            return err(QStringLiteral("usage: switches XYZ, each 0 or 1"));
        ins.setSwitches(a[0][0] == QLatin1Char('1'), a[0][1] == QLatin1Char('1'), a[0][2] == QLatin1Char('1'));
        return ok();
    }
    if (command == QLatin1String("tilt") || command == QLatin1String("rotate")) {
        if (n != 1 || !toInt(a[0], &v))
            return err(QStringLiteral("usage: tilt DEGREES"));
        ins.setRotation(v);
        return ok();
    }
    if (command == QLatin1String("surface")) {
        if (n != 1 || (a[0] != QLatin1String("vertical") && a[0] != QLatin1String("horizontal")))
            return err(QStringLiteral("usage: surface vertical|horizontal"));
        ins.setSurfaceVertical(a[0] == QLatin1String("vertical"));
        return ok();
    }
    if (command == QLatin1String("battery")) {
        static const QStringList states = {QStringLiteral("charging-ac"), QStringLiteral("charging-usb"),
                                           QStringLiteral("full"), QStringLiteral("empty"), QStringLiteral("missing"),
                                           QStringLiteral("error"), QStringLiteral("discharging")};
        int state = -1;
        if (n < 1 || n > 2 || !toInt(a[0], &v) || v < 0 || v > 100)
            return err(QStringLiteral("usage: battery PERCENT [STATE]"));
        if (n == 2 && (state = states.indexOf(a[1].toLower())) < 0)
            return err(QStringLiteral("unknown battery state ") + a[1]);
        ins.setBattery(state, v);
        return ok();
    }
    if (command == QLatin1String("usb")) {
        static const QStringList states = {QStringLiteral("off"), QStringLiteral("connected"), QStringLiteral("on")};
        const int s = n == 1 ? states.indexOf(a[0].toLower()) : -1;
        if (s < 0)
            return err(QStringLiteral("usage: usb off|connected|on"));
        ins.setUsb(s);
        return ok();
    }
    if (command == QLatin1String("wifi")) {
        WifiRadio& w = ins.wifi();
        const QString sub = n > 0 ? a[0].toLower() : QString();
        bool on = false;
        if (n == 1 && onOff(sub, &on)) {
            const STATUS_T st = w.setEnabled(on);
            return st == ST_OK ? ok() : err(QStringLiteral("status %1").arg(st));
        }
        if (sub == QLatin1String("level") && n == 2) {
            bool good = false;
            const float q = a[1].toFloat(&good);
            return good && w.setQuality(q) ? ok() : err(QStringLiteral("no connection, or not a number"));
        }
        if (sub == QLatin1String("network") && n >= 3) {
            const bool inRange = a[2].toLower() == QLatin1String("in");
            if (!inRange && a[2].toLower() != QLatin1String("out"))
                return err(QStringLiteral("usage: wifi network SSID in|out [QUALITY] [AUTH] [PASSWORD]"));
            const float q = n > 3 ? a[3].toFloat() : -1.0f;
            const QString auth = n > 4 ? a[4] : QString();
            const QString password = n > 5 ? a[5] : QString();
            w.setNetwork(a[1], inRange, q, auth, password);
            return ok();
        }
        if (sub == QLatin1String("static") && n == 2) {
            w.setStaticAddress(a[1]);
            return ok();
        }
        if (sub == QLatin1String("dhcp") && n == 1) {
            w.setStaticAddress(QString());
            return ok();
        }
        if (sub == QLatin1String("fail-mode")) {
            w.failNextModeChange();
            return ok();
        }
        if (sub == QLatin1String("fail-scan")) {
            w.failNextScan();
            return ok();
        }
        return err(QStringLiteral("usage: wifi on|off|level Q|network ...|static ADDR|dhcp|fail-mode|fail-scan"));
    }
    if (command == QLatin1String("lock") || command == QLatin1String("unlock")) {
        ins.setLocked(command == QLatin1String("lock"));
        return ok();
    }
    if (command == QLatin1String("busy")) {
        bool on = false;
        if (n == 1 && toInt(a[0], &v) && v >= 0)
            ins.setBusy(v * 1000);
        else if (n == 1 && onOff(a[0], &on))
            ins.setBusy(on ? -1 : 0);
        else
            return err(QStringLiteral("usage: busy SECONDS|on|off"));
        return ok();
    }
    if (command == QLatin1String("error")) {
        if (n < 1 || !toInt(a[0], &v))
            return err(QStringLiteral("usage: error CODE [TEXT]"));
        ins.pushError(v, n > 1 ? a[1] : QString());
        return ok();
    }
    if (command == QLatin1String("fail-next")) {
        if (n != 1 || !toInt(a[0], &v) || v <= 0)
            return err(QStringLiteral("usage: fail-next CODE"));
        ins.failNextOperation(STATUS_T(v));
        return ok();
    }
    if (command == QLatin1String("abort"))
        return ins.abortOperation() ? ok() : err(QStringLiteral("nothing is running"));
    if (command == QLatin1String("calibration") || command == QLatin1String("cal")) {
        const QString sub = n > 0 ? a[0].toLower() : QString();
        if (sub == QLatin1String("expire") && n == 1)
            ins.expireCalibration();
        else if (sub == QLatin1String("renew") && n == 1)
            ins.renewCalibration();
        else if (sub == QLatin1String("due") && n == 2 && toInt(a[1], &v) && v >= 0)
            ins.setCalibrationDue(v);
        else if (sub == QLatin1String("interval") && n == 2 && toInt(a[1], &v) && v > 0)
            ins.setCalibrationInterval(v);
        else
            return err(QStringLiteral("usage: calibration expire|renew|due SECONDS|interval SECONDS"));
        return ok(QStringLiteral("next in %1 s").arg(ins.secondsToCalibration()));
    }
    if (command == QLatin1String("request")) {
        static const QStringList what = {QStringLiteral("none"), QStringLiteral("white"), QStringLiteral("refcheck")};
        const int r = n == 1 ? what.indexOf(a[0].toLower()) : -1;
        if (r < 0)
            return err(QStringLiteral("usage: request white|refcheck|none"));
        ParamValue p;
        p.type = ParamType::Int;
        p.i = r;
        ins.setParameter(PARAMETER_WHITE_TRANSFER_REQUEST, p);
        return ok();
    }
    if (command == QLatin1String("refcheck")) {
        static const QStringList what = {QStringLiteral("fail"), QStringLiteral("pass"), QStringLiteral("auto")};
        const int r = n == 1 ? what.indexOf(a[0].toLower()) : -1;
        if (r < 0)
            return err(QStringLiteral("usage: refcheck pass|fail|auto"));
        ins.forceReferenceResult(r == 2 ? -1 : r);
        return ok();
    }
    if (command == QLatin1String("selftest") && n > 0 && a[0].toLower() == QLatin1String("add")) {
        static const QStringList where = {QStringLiteral("white"), QStringLiteral("effect"), QStringLiteral("lifted")};
        const int location = n == 4 ? where.indexOf(a[2].toLower()) : -1;
        if (location < 0 || a[1].isEmpty() || !toInt(a[3], &v) || v < 0)
            return err(QStringLiteral("usage: selftest add NAME white|effect|lifted MS"));
        const quint32 num = ins.addSelfTest(a[1], quint32(location), quint32(v));
        return ok(QStringLiteral("test %1").arg(num));
    }
    if (command == QLatin1String("selftest")) {
        int result = -1;
        if (n != 2 || !toInt(a[0], &v) || v < 0 || v >= ins.selfTests().size()
            || (a[1].toLower() != QLatin1String("auto") && !toInt(a[1], &result)))
            return err(QStringLiteral("usage: selftest NUM RESULT|auto"));
        ins.forceSelfTestResult(quint32(v), a[1].toLower() == QLatin1String("auto") ? -1 : result);
        return ok();
    }
    if (command == QLatin1String("online")) {
        const QString sub = n > 0 ? a[0].toLower() : QString();
        if (sub == QLatin1String("end") && n == 1) {
            ins.endOnlineJob();
            return ok();
        }
        if (sub != QLatin1String("start"))
            return err(QStringLiteral("usage: online start [NAME] [none|avg3|avg5|smc M N] | online end"));
        QString name, mode = QStringLiteral("NONE");
        int size = 0, max = 0;
        int i = 1;
        static const QStringList modes = {QStringLiteral("none"), QStringLiteral("avg3"), QStringLiteral("avg5"),
                                          QStringLiteral("smc")};
        if (i < n && !modes.contains(a[i].toLower()))
            name = a[i++];
        if (i < n) {
            const QString m = a[i++].toLower();
            if (m == QLatin1String("avg3") || m == QLatin1String("avg5")) {
                mode = QStringLiteral("AVERAGE");
                size = m == QLatin1String("avg5") ? 5 : 3;
            } else if (m == QLatin1String("smc")) {
                mode = QStringLiteral("SMC");
                if (i + 1 >= n || !toInt(a[i], &size) || !toInt(a[i + 1], &max) || size < 1 || max < size)
                    return err(QStringLiteral("usage: online start [NAME] smc M N (M <= N)"));
            } else if (m != QLatin1String("none")) {
                return err(QStringLiteral("unknown mode ") + m);
            }
        }
        QString created;
        const STATUS_T st = ins.startOnlineJob(name, mode, size, max, &created);
        return st == ST_OK ? ok(created) : err(QStringLiteral("status %1").arg(st));
    }
    if (command == QLatin1String("temperature") || command == QLatin1String("instrument-temperature")) {
        bool good = false;
        const float t = n == 1 ? a[0].toFloat(&good) : 0.0f;
        if (!good)
            return err(QStringLiteral("usage: %1 CELSIUS").arg(command));
        if (command == QLatin1String("temperature"))
            ins.setSampleTemperature(t);
        else
            ins.setInstrumentTemperature(t);
        return ok();
    }
    if (command == QLatin1String("panel")) {
        if (n != 1)
            return err(QStringLiteral("usage: panel FINISH|auto"));
        if (a[0].toLower() == QLatin1String("auto")) {
            ins.setPanel(QString());
            return ok();
        }
        if (!Spectra::finishKeys().contains(a[0].toLower()))
            return err(QStringLiteral("unknown finish; see: finishes"));
        ins.setPanel(a[0].toLower());
        return ok();
    }
    if (command == QLatin1String("finishes")) {
        QStringList lines;
        for (const Finish& f : Spectra::finishes())
            lines << QStringLiteral("%1  %2").arg(f.key, -20).arg(f.name);
        lines << ok();
        return lines.join(QLatin1Char('\n'));
    }
    if (command == QLatin1String("outliers") || command == QLatin1String("smc-tolerance")) {
        bool good = false;
        const double x = n == 1 ? a[0].toDouble(&good) : 0.0;
        if (!good || x < 0.0)
            return err(QStringLiteral("usage: %1 NUMBER").arg(command));
        if (command == QLatin1String("outliers"))
            ins.setOutlierRate(std::min(1.0, x));
        else
            ins.jobs().setSmcTolerance(x);
        return ok();
    }
    if (command == QLatin1String("next-reading")) {
        if (n != 1 || (a[0] != QLatin1String("outlier") && a[0] != QLatin1String("clean")))
            return err(QStringLiteral("usage: next-reading outlier|clean"));
        ins.forceNextReading(a[0] == QLatin1String("outlier") ? 1 : 0);
        return ok();
    }
    if (command == QLatin1String("param") || command == QLatin1String("message")) {
        const Parameters::Definition* d = command == QLatin1String("message")
            ? Parameters::find(PARAMETER_TEXT_MESSAGE)
            : (n >= 1 ? Parameters::findByName(a[0]) : nullptr);
        if (!d)
            return err(QStringLiteral("usage: param KEY [VALUE]; unknown key"));
        const QString text = command == QLatin1String("message") ? (n > 0 ? a[0] : QString())
                                                                 : (n >= 2 ? a.mid(1).join(QLatin1Char(' ')) : QString());
        if (command == QLatin1String("param") && n == 1)
            return ok(QStringLiteral("%1 = %2").arg(QLatin1String(d->name), Parameters::formatValue(*ins.parameter(d->key))));
        ParamValue p;
        if (!Parameters::parseValue(*d, text, &p))
            return err(QStringLiteral("not a value for ") + QLatin1String(d->name));
        const STATUS_T st = ins.setParameter(d->key, p);
        return st == ST_OK ? ok() : err(QStringLiteral("status %1").arg(st));
    }
    if (command == QLatin1String("memory")) {
        int jobs = 0;
        if (n != 2 || !toInt(a[0], &jobs) || !toInt(a[1], &v))
            return err(QStringLiteral("usage: memory MAX_JOBS MAX_MEASUREMENTS"));
        ins.setMemoryLimits(jobs, v);
        return ok();
    }
    if (command == QLatin1String("targeting-timeout")) {
        if (n != 1 || !toInt(a[0], &v) || v < 0)
            return err(QStringLiteral("usage: targeting-timeout SECONDS"));
        ins.setTargetingTimeout(v);
        return ok();
    }
    if (command == QLatin1String("jobs")) {
        QStringList lines;
        for (const Job& j : ins.jobs().jobs())
            lines << QStringLiteral("%1  \"%2\"  %3  state %4  %5 %6:%7  samples %8%9")
                         .arg(j.dbIndex)
                         .arg(j.name)
                         .arg(j.fileId)
                         .arg(j.state)
                         .arg(JobBook::modeString(j))
                         .arg(j.size)
                         .arg(j.maxSamples)
                         .arg(j.samples.size())
                         .arg(j.hasAverage ? QStringLiteral(" + average") : QString());
        lines << ok(QString::number(ins.jobs().jobs().size()));
        return lines.join(QLatin1Char('\n'));
    }
    if (command == QLatin1String("bulk")) {
        int readings = 0;
        if (n != 2 || !toInt(a[0], &v) || !toInt(a[1], &readings) || v < 1 || readings < 0)
            return err(QStringLiteral("usage: bulk JOBS READINGS"));
        const int made = ins.addBulkJobs(v, readings);
        return made == v ? ok(QString::number(made)) : err(QStringLiteral("only %1 made: memory full").arg(made));
    }
    if (command == QLatin1String("job-state")) {
        if (n != 2 || !toInt(a[1], &v) || !ins.jobs().find(a[0]))
            return err(QStringLiteral("usage: job-state NAME STATE"));
        ins.jobs().setState(a[0], v);
        return ok();
    }
    if (command == QLatin1String("refuse")) {
        Protocol& p = m_server.protocol();
        if (n == 1 && a[0].toLower() == QLatin1String("off")) {
            p.allowAll();
            return ok();
        }
        bool good = false;
        const quint32 code = n >= 2 ? a[0].toUInt(&good, 0) : 0;
        if (!good)
            return err(QStringLiteral("usage: refuse CODE STATUS [COUNT] | refuse CODE off | refuse off"));
        if (a[1].toLower() == QLatin1String("off")) {
            p.allow(code);
            return ok();
        }
        int count = -1;
        if (!toInt(a[1], &v) || (n == 3 && !toInt(a[2], &count)))
            return err(QStringLiteral("usage: refuse CODE STATUS [COUNT]"));
        p.refuse(code, STATUS_T(v), count);
        return ok();
    }
    if (command == QLatin1String("delay")) {
        if (n != 1 || !toInt(a[0], &v) || v < 0)
            return err(QStringLiteral("usage: delay MS"));
        m_server.setReplyDelay(v);
        return ok();
    }
    if (command == QLatin1String("drop")) {
        if (n == 0) {
            m_server.dropClients(0);
        } else if (a[0].toLower() == QLatin1String("forever")) {
            m_server.dropClients(-1);
        } else {
            bool good = false;
            const double s = a[0].toDouble(&good);
            if (!good || s < 0)
                return err(QStringLiteral("usage: drop [SECONDS|forever]"));
            m_server.dropClients(int(s * 1000));
        }
        return ok();
    }
    if (command == QLatin1String("power")) {
        if (n != 1 || a[0].toLower() != QLatin1String("on"))
            return err(QStringLiteral("usage: power on"));
        m_server.powerOn();
        return ok();
    }
    if (command == QLatin1String("status")) {
        const PRESSURE_SWITCH_T s = ins.switches();
        const MEMORY_INFO_T m = ins.memoryInfo();
        QStringList lines;
        lines << QStringLiteral("state %1 %2%").arg(QLatin1String(stateName(ins.state()))).arg(ins.percentComplete())
              << QStringLiteral("model %1").arg(modelName(ins.model()))
              << QStringLiteral("feet %1%2%3, tilt %4").arg(s.Switch1).arg(s.Switch2).arg(s.Switch3)
                     .arg(ins.orientation().OrientationPosition)
              << QStringLiteral("calibration due in %1 s").arg(ins.secondsToCalibration())
              << QStringLiteral("battery %1% state %2").arg(ins.batteryPercent()).arg(ins.batteryState())
              << QStringLiteral("wifi state %1 level %2 \"%3\" %4")
                     .arg(ins.wifi().state())
                     .arg(ins.wifi().level())
                     .arg(ins.wifi().connectedSsid(), ins.wifi().ipString())
              << QStringLiteral("errors %1").arg(ins.errors().size())
              << QStringLiteral("jobs %1/%2, measurements %3/%4").arg(m.numJobs).arg(m.maxNumJobs)
                     .arg(m.numMeasurements).arg(m.maxNumMeasurements)
              << QStringLiteral("clients %1, listening %2, reply delay %3 ms")
                     .arg(m_server.clientCount())
                     .arg(m_server.listening() ? QStringLiteral("yes") : QStringLiteral("no"))
                     .arg(m_server.replyDelay())
              << QStringLiteral("counters job %1 measure %2 settings %3")
                     .arg(ins.changes().jobId()).arg(ins.changes().measureId()).arg(ins.changes().settingsId())
              << ok();
        return lines.join(QLatin1Char('\n'));
    }
    return err(QStringLiteral("unknown command \"%1\"; try: help").arg(command));
}

} // namespace Sim
