#include "SimProtocol.h"

#include "Communication/CmdData.h"
#include "SimImages.h"

#include <QDebug>
#include <QDir>
#include <QFile>

#include <algorithm>

namespace Sim {

namespace {

// Counts in a request above this are taken as garbage, not as lists.
const int kMaxListCount = 1000;
// What a reply may carry, under the client's frame limit with room for the header.
const int kMaxReplyPayload = CmdData::MAX_FRAME_SIZE - 64;

// Ends the reading of a request: a byte left over means client and server
// disagree about the command.
void end(CmdData& in)
{
    if (in.getPacketlength() != 0)
        throw ST_BAD_REQUEST;
}

int readCount(CmdData& in)
{
    const int n = in.nextArg_si32();
    if (n < 0 || n > kMaxListCount)
        throw ST_BAD_REQUEST;
    return n;
}

void putU8(CmdData& out, int v) { out.append_ui8(char(quint8(v))); }

QString hex(quint32 v) { return QStringLiteral("0x%1").arg(v, 8, 16, QLatin1Char('0')); }

bool isWide(const Tag& t)
{
    for (const QChar c : t.text)
        if (c.unicode() > 127)
            return true;
    return t.id.startsWith(QLatin1String("Display"));
}

struct TextureName {
    int figure;
    const char* name;
};
// Named as the instrument names them: short codes, coarseness "C" and
// sparkle grade "SG" among them.
const TextureName kDirectionalParameters[] = {
    {3, "SA"}, {4, "SI"}, {5, "SG"}, {6, "SD"}, {2, "C"}};
const TextureName kDiffuseParameters[] = {{0, "C"}, {1, "CB"}};

} // namespace

// ---- wire forms ----------------------------------------------------------------------------------

namespace Wire {

void putString(CmdData& out, const QString& text)
{
    const QByteArray utf8 = text.toUtf8();
    out.append_si32(utf8.size());
    out.appendBuffer(utf8);
}

void putTime(CmdData& out, const QDateTime& time)
{
    if (!time.isValid()) {
        for (int v : {0, 0, 1, 0, 0, 0})
            putU8(out, v);
        return;
    }
    const QDate d = time.date();
    const QTime t = time.time();
    putU8(out, std::max(0, std::min(255, d.year() - 1900)));
    putU8(out, d.month() - 1);
    putU8(out, d.day());
    putU8(out, t.hour());
    putU8(out, t.minute());
    putU8(out, t.second());
}

void putTag(CmdData& out, const Tag& tag)
{
    putString(out, tag.id);
    putString(out, tag.text);
}

void putTag32(CmdData& out, const Tag& tag)
{
    putString(out, tag.id);
    out.appendString32(tag.text);
}

void splitTags(const QVector<Tag>& tags, QVector<Tag>* plain, QVector<Tag>* wide)
{
    for (const Tag& t : tags)
        (isWide(t) ? wide : plain)->append(t);
    for (int i = 1; i < wide->size(); ++i) {
        if ((*wide)[i].id == QLatin1String("DisplayName")) {
            std::swap((*wide)[0], (*wide)[i]);
            break;
        }
    }
}

void readJobDescription(CmdData& in, int* dbIndex, QString* name, QVector<Tag>* tags, int* size, QString* fileId,
                        QString* modeText, int* spare)
{
    *dbIndex = in.nextArg_si32();
    *name = in.nextArgString();
    const int plain = readCount(in);
    for (int i = 0; i < plain; ++i) {
        const TAG_ITEM_T t = in.nextArgTag();
        tags->append({t.tagID, t.tagText});
    }
    const int wide = readCount(in);
    for (int i = 0; i < wide; ++i) {
        const TAG_ITEM_T t = in.nextArgTag32();
        tags->append({t.tagID, t.tagText});
    }
    *size = in.nextArg_ui8();
    *fileId = in.nextArgString();
    *modeText = in.nextArgString();
    *spare = in.nextArg_ui8();
}

} // namespace Wire

// ---- the front ------------------------------------------------------------------------------------

Protocol::Protocol(Instrument& instrument) : m_instrument(instrument) {}

void Protocol::refuse(quint32 code, STATUS_T status, int count)
{
    m_refusals.insert(code, {status, count});
}

void Protocol::allow(quint32 code)
{
    m_refusals.remove(code);
}

QByteArray Protocol::handle(const QByteArray& frame)
{
    CmdData in;
    try {
        in.setFullData(frame);
    } catch (unsigned int status) {
        qWarning().noquote() << "Sim: unreadable frame of" << frame.size() << "bytes, status" << status;
        return QByteArray();
    }
    if (in.getIsResponse()) {
        qWarning().noquote() << "Sim: a response frame came in as a command, code" << hex(quint32(in.getCommandCode()))
                             << "- ignored";
        return QByteArray();
    }
    const quint32 code = quint32(in.getCommandCode());
    CmdData out;
    out.setTransactionID(in.getTransactionID());
    out.setCommandCode(in.getCommandCode());
    out.respond(0, false);
    ++m_handled;

    STATUS_T status = ST_OK;
    bool keepData = false;
    auto refusal = m_refusals.find(code);
    if (refusal != m_refusals.end()) {
        status = refusal->status;
        if (refusal->remaining > 0 && --refusal->remaining == 0)
            m_refusals.erase(refusal);
    } else {
        try {
            status = dispatch(code, in, out, &keepData);
        } catch (unsigned int thrown) {
            status = thrown;
            keepData = false;
            qWarning().noquote() << "Sim: malformed request for command" << hex(code) << "- status" << thrown;
        }
    }
    if (status != ST_OK && !keepData) {
        out.respond(long(status), false);
    } else {
        out.setStatus(long(status));
    }
    return out.getFullCmd();
}

STATUS_T Protocol::dispatch(quint32 code, CmdData& in, CmdData& out, bool* keepData)
{
    Instrument& ins = m_instrument;
    switch (code) {
    case CMD_GET_STATE:
        return getState(in, out);
    case CMD_GET_ERROR_DESCRIPTIONS:
        return getErrors(in, out);
    case CMD_RESET_ERROR_DESCRIPTIONS:
        end(in);
        ins.resetErrors();
        return ST_OK;
    case CMD_GET_CONFIGURATION: {
        in.nextArg_si32();
        end(in);
        out.append_si32(ins.model() == Model::Alder ? MODEL_REFINISH_ALDER : MODEL_REFINISH_BIRCH);
        Wire::putString(out, modelName(ins.model()));
        return ST_OK;
    }
    case CMD_SET_INTERFACE_CONFIG: {
        const int version = in.nextArg_si32();
        end(in);
        return ins.setInterfaceVersion(version);
    }
    case CMD_GET_IMAGE_RESULT:
    case CMD_GET_SPECTRAL_RESULT:
        end(in);
        return ins.sample(QString(), 0, nullptr, nullptr) ? ST_OK : ST_INDEX_INVALID;
    case CMD_GET_CHANNELS:
        end(in);
        out.append_si32(numSpectralAngles(ins.model()));
        for (int a = 0; a < numSpectralAngles(ins.model()); ++a)
            Wire::putString(out, spectralAngleName(a));
        out.append_si32(numCameraAngles(ins.model()));
        for (int a = 0; a < numCameraAngles(ins.model()); ++a)
            Wire::putString(out, imageAngleName(a));
        return ST_OK;

    // ---- jobs ----
    case CMD_GET_JOB_INFOS: {
        end(in);
        const QVector<Job>& jobs = ins.jobs().jobs();
        out.append_si32(jobs.size());
        for (const Job& j : jobs)
            writeJobInfo(out, j);
        if (out.getPacketlength() > kMaxReplyPayload) {
            qWarning() << "Sim: the job list does not fit into one frame";
            return ST_MEMORY_FULL;
        }
        return ST_OK;
    }
    case CMD_GET_JOB_INFO: {
        const QString name = in.nextArgString();
        end(in);
        const Job* job = ins.jobs().find(name);
        if (!job)
            return ST_NO_SUCH_JOB;
        writeJobInfo(out, *job);
        return ST_OK;
    }
    case CMD_GET_JOB_INFO_WEB: {
        const QString name = in.nextArgString();
        end(in);
        const Job* job = ins.jobs().find(name);
        if (!job)
            return ST_NO_SUCH_JOB;
        out.append_ui32(quint32(job->state));
        out.append_ui32(quint32(job->state == JOB_SYNCHRONISED ? 100 : job->syncPercent));
        return ST_OK;
    }
    case CMD_ADD_JOB:
    case CMD_EDIT_JOB: {
        QString oldName;
        if (code == CMD_EDIT_JOB)
            oldName = in.nextArgString();
        JobBook::Description d;
        Wire::readJobDescription(in, &d.dbIndex, &d.name, &d.tags, &d.size, &d.fileId, &d.modeText, &d.spare);
        end(in);
        if (code == CMD_EDIT_JOB)
            return ins.jobs().edit(oldName, d, ins.jobDefaults());
        int index = 0;
        const STATUS_T st = ins.addJob(d, &index);
        if (st == ST_OK)
            out.append_si32(index);
        return st;
    }
    case CMD_DELETE_JOB:
    case CMD_FORCE_FINISH_SMC:
    case CMD_SET_JOB_SAVED: {
        const QString name = in.nextArgString();
        end(in);
        if (code == CMD_DELETE_JOB)
            return ins.jobs().remove(name);
        if (code == CMD_FORCE_FINISH_SMC)
            return ins.jobs().forceFinish(name);
        return ins.jobs().setSaved(name);
    }
    case CMD_DELETE_SAMPLE: {
        const QString name = in.nextArgString();
        const int number = in.nextArg_ui8();
        end(in);
        return ins.jobs().deleteSample(name, number);
    }
    case CMD_GET_SAMPLE:
        return getSample(in, out, keepData);

    // ---- filter files ----
    case CMD_GET_FILTER:
        return getFilter(in, out, QStringLiteral("Filter.xml"));
    case CMD_GET_FILTER_TRANSLATION:
        return getFilter(in, out, QStringLiteral("FilterTranslation.xml"));

    // ---- calibration and reference ----
    case CMD_REFERENCE_CHECK: {
        const QString reference = in.nextArgString();
        end(in);
        QDateTime when;
        quint8 result = 0;
        const STATUS_T st = ins.referenceCheck(reference, &when, &result);
        if (st == ST_OK) {
            Wire::putTime(out, when);
            putU8(out, result);
        }
        return st;
    }
    case CMD_GET_CALIBRATION_STATE: {
        end(in);
        const CALIBRATION_STATE_T c = ins.calibrationState();
        out.append_si32(c.nextExternalWhiteCal);
        Wire::putTime(out, c.lastExternalWhiteCal);
        out.append_f32(c.dTempExternalWhite);
        out.append_f32(c.referenceTempExternalWhite);
        out.append_si32(c.nextInternalWhiteCal);
        Wire::putTime(out, c.lastInternalWhiteCal);
        out.append_f32(c.dTempInternalWhite);
        out.append_f32(c.referenceTempInternalWhite);
        return ST_OK;
    }
    case CMD_SET_CALIBRATION_SETTINGS:
        end(in);
        return ST_OK;
    case CMD_TRIGGER_CALIBRATION:
        end(in);
        return ins.triggerCalibration();

    // ---- instrument ----
    case CMD_GET_CAPABILITY: {
        const QString name = in.nextArgString();
        end(in);
        out.append_si32(ins.capability(name));
        return ST_OK;
    }
    case CMD_RUN_SELF_TEST:
        end(in);
        return ins.runInternalCheck();
    case CMD_GET_BATTERY:
        end(in);
        putU8(out, ins.batteryState());
        putU8(out, ins.batteryPercent());
        return ST_OK;
    case CMD_GET_PRESSURE_SENSOR: {
        end(in);
        const PRESSURE_SWITCH_T p = ins.switches();
        putU8(out, int(p.Switch1));
        putU8(out, int(p.Switch2));
        putU8(out, int(p.Switch3));
        return ST_OK;
    }
    case CMD_GET_ORIENTATION: {
        end(in);
        const ACCELEROMETER_ORIENTATION_T o = ins.orientation();
        out.append_si16(short(o.OrientationX));
        out.append_si16(short(o.OrientationY));
        out.append_si16(short(o.OrientationZ));
        out.append_si16(short(o.OrientationPosition));
        putU8(out, o.OrientationAcceleration);
        return ST_OK;
    }
    case CMD_GET_LANGUAGES: {
        end(in);
        const QVector<TAG_ITEM_T> langs = ins.languages();
        out.append_si32(langs.size());
        for (const TAG_ITEM_T& l : langs)
            Wire::putTag32(out, {l.tagID, l.tagText});
        return ST_OK;
    }
    case CMD_GET_BEEPER_VOLUME:
        in.nextArg_si8();
        end(in);
        putU8(out, ins.volume());
        return ST_OK;
    case CMD_SET_BEEPER_VOLUME: {
        in.nextArg_ui8();
        const int level = in.nextArg_ui8();
        end(in);
        ins.setVolume(level);
        return ST_OK;
    }
    case CMD_GET_DISPLAY_BRIGHTNESS:
        end(in);
        putU8(out, ins.brightness());
        return ST_OK;
    case CMD_SET_DISPLAY_BRIGHTNESS: {
        const int level = in.nextArg_ui8();
        end(in);
        ins.setBrightness(level);
        return ST_OK;
    }
    case CMD_GET_TEXTURE_DISPLAYED:
        end(in);
        putU8(out, 1);
        return ST_OK;
    case CMD_GET_MEMORY_INFO: {
        end(in);
        const MEMORY_INFO_T m = ins.memoryInfo();
        out.append_si32(10);
        for (int v : {m.numMeasurements, m.maxNumMeasurements, m.numJobs, m.maxNumJobs, m.res1, m.res2, m.sysFlashUsed,
                      m.sysFlashAvailable, m.sysRamUsed, m.sysRamAvailable})
            out.append_si32(v);
        return ST_OK;
    }
    case CMD_GET_SERIAL_NUM:
        end(in);
        Wire::putString(out, ins.serialNumber());
        return ST_OK;
    case CMD_GET_DEVICE_INFO: {
        end(in);
        const DEVICE_INFO_T d = ins.deviceInfo();
        for (const QString& s : {d.serialNum, d.partNumber, d.revisionNum, d.productionDate, d.whitetileSerialNum,
                                 d.instrumentModel, d.certificationDate})
            Wire::putString(out, s);
        for (const QString& s : ins.deviceInfoExtras())
            Wire::putString(out, s);
        return ST_OK;
    }
    case CMD_GET_TEMPERATURE: {
        const int sensor = in.nextArg_ui16();
        end(in);
        float value = 0.0f;
        if (!ins.temperature(sensor, &value))
            return ST_INDEX_INVALID;
        out.append_f32(value);
        return ST_OK;
    }
    case CMD_POWER_OFF_RESET: {
        const qint32 value = in.nextArg_si32();
        end(in);
        return ins.power(value);
    }
    case CMD_GET_VERSION: {
        const int type = in.nextArg_si32();
        end(in);
        bool known = false;
        const QString v = ins.version(type, &known);
        if (!known)
            return ST_INDEX_INVALID;
        Wire::putString(out, v);
        return ST_OK;
    }

    // ---- Wi-Fi ----
    case CMD_GET_WIFI_SETTINGS: {
        end(in);
        const QVector<NETWORK_DESCRIPTION_T> nets = ins.wifi().networks();
        out.append_si32(nets.size());
        for (const NETWORK_DESCRIPTION_T& n : nets) {
            for (const QString& s : {n.SSID, n.MAC, n.Authentication, n.SignalLevel, n.Cell, n.Channel, n.Frequency})
                Wire::putString(out, s);
            out.append_f32(n.Quality);
            putU8(out, n.EncryptionKey ? 1 : 0);
            putU8(out, n.Known ? 1 : 0);
            putU8(out, n.Connected ? 1 : 0);
            out.append_si32(n.Priority);
        }
        return ST_OK;
    }
    case CMD_ADD_WIFI_SETTING: {
        const QString ssid = in.nextArgString();
        const QString auth = in.nextArgString();
        const QString key = in.nextArgString();
        const int priority = in.nextArg_si32();
        end(in);
        return ins.wifi().add(ssid, auth, key, priority);
    }
    case CMD_DELETE_WIFI_SETTING: {
        const QString ssid = in.nextArgString();
        end(in);
        return ins.wifi().forget(ssid);
    }
    case CMD_SET_ENABLE_WIFI: {
        const int on = in.nextArg_ui8();
        end(in);
        return ins.wifi().setEnabled(on != 0);
    }
    case CMD_VERIFY_WIFI_SETTINGS: {
        const QString ssid = in.nextArgString();
        end(in);
        int result = -1;
        const STATUS_T st = ins.wifi().verify(ssid, &result);
        Wire::putString(out, ssid);
        out.append_si32(result);
        *keepData = true;
        return st;
    }
    case CMD_GET_IP_ADDRESS:
        end(in);
        Wire::putString(out, ins.wifi().ipString());
        return ST_OK;
    case CMD_TRIGGER_WIFI_SCAN:
        end(in);
        return ins.wifi().scan();
    case CMD_GET_CONNECTED_WIFI_SSID:
        end(in);
        Wire::putString(out, ins.wifi().connectedSsid());
        return ST_OK;

    // ---- parameters ----
    case CMD_GET_PARAMETER:
        return getParameter(in, out);
    case CMD_SET_PARAMETER:
        return setParameter(in, out);
    case CMD_SET_PARAMETERS_TO_DEFAULTS:
        end(in);
        ins.parametersToDefaults();
        return ST_OK;

    // ---- measuring and targeting ----
    case CMD_TRIGGER_MEASUREMENT: {
        const QString job = in.nextArgString();
        end(in);
        return ins.triggerMeasurement(job);
    }
    case CMD_START_TARGETING:
        in.nextArg_f32();
        in.nextArg_si32();
        end(in);
        return ins.startTargeting();
    case CMD_STOP_TARGETING:
        end(in);
        ins.stopTargeting();
        return ST_OK;
    case CMD_GET_TARGETING_INFO:
        return getTargetingInfo(in, out);
    case CMD_GET_PREVIEW_IMAGE: {
        const int w = in.nextArg_si16();
        const int h = in.nextArg_si16();
        end(in);
        const QByteArray pixels = ins.liveFrame(w, h);
        out.append_si32(pixels.size());
        out.appendBuffer(pixels);
        return ST_OK;
    }

    // ---- self tests ----
    case CMD_GET_SELF_TEST_LIST: {
        end(in);
        const QVector<TEST>& tests = ins.selfTests();
        out.append_si32(tests.size());
        for (const TEST& t : tests) {
            Wire::putString(out, t.description);
            out.append_ui32(t.deviceLocation);
            out.append_ui32(t.approxDuration);
        }
        return ST_OK;
    }
    case CMD_TRIGGER_SELF_TEST: {
        const quint32 num = in.nextArg_ui32();
        end(in);
        return ins.triggerSelfTest(num);
    }
    case CMD_GET_SELF_TEST_RESULT: {
        const quint32 num = in.nextArg_ui32();
        end(in);
        qint32 result = 0;
        const STATUS_T st = ins.selfTestResult(num, &result);
        if (st == ST_OK)
            out.append_si32(result);
        return st;
    }
    default:
        qWarning().noquote() << "Sim: unknown command" << hex(code);
        return ST_UNKNOWN_COMMAND;
    }
}

STATUS_T Protocol::getState(CmdData& in, CmdData& out)
{
    end(in);
    const Instrument::StatusReply r = m_instrument.takeStatus();
    putU8(out, r.state);
    putU8(out, r.percent);
    putU8(out, r.numErrors);
    Wire::putTime(out, r.time);
    putU8(out, r.batteryState);
    putU8(out, r.batteryPercent);
    putU8(out, r.wifiState);
    putU8(out, r.wifiLevel);
    putU8(out, r.usbState);
    out.append_ui32(0);
    out.append_ui16(r.measureId);
    out.append_ui16(r.jobId);
    putU8(out, r.settingsId);
    for (int i = 0; i < 3; ++i)
        putU8(out, 0);
    out.append_ui32(r.settingsBits);
    out.append_ui32(quint32(r.entities.size()));
    for (const EntityChange& e : r.entities) {
        out.append_si32(e.entity);
        Wire::putString(out, e.identifier);
        out.append_si32(e.change);
    }
    return ST_OK;
}

STATUS_T Protocol::getErrors(CmdData& in, CmdData& out)
{
    end(in);
    const QVector<Instrument::ErrorEntry>& errors = m_instrument.errors();
    out.append_si32(errors.size());
    int sequence = 0;
    for (const Instrument::ErrorEntry& e : errors) {
        putU8(out, e.priority);
        out.append_si16(short(e.id));
        out.append_si16(short(e.category));
        Wire::putTime(out, e.time);
        out.append_si32(++sequence);
        Wire::putString(out, e.text);
    }
    return ST_OK;
}

void Protocol::writeSampleInfo(CmdData& out, const Sample& s)
{
    out.append_si32(s.dbIndex);
    Wire::putTime(out, s.time);
    out.append_f32(s.instrumentTemperature);
    out.append_f32(s.calTemperatureDelta);
    out.append_f32(s.temperature);
    out.append_si16(short(s.orientation.OrientationX));
    out.append_si16(short(s.orientation.OrientationY));
    out.append_si16(short(s.orientation.OrientationZ));
    out.append_si16(short(s.orientation.OrientationPosition));
    putU8(out, s.orientation.OrientationAcceleration);
    putU8(out, s.calibrationStatus);
    putU8(out, int(s.pressure.Switch1));
    putU8(out, int(s.pressure.Switch2));
    putU8(out, int(s.pressure.Switch3));
}

void Protocol::writeJobDescription(CmdData& out, const Job& job)
{
    QVector<Tag> plain, wide;
    Wire::splitTags(job.tags, &plain, &wide);
    out.append_si32(job.dbIndex);
    Wire::putString(out, job.name);
    out.append_si32(plain.size());
    for (const Tag& t : plain)
        Wire::putTag(out, t);
    out.append_si32(wide.size());
    for (const Tag& t : wide)
        Wire::putTag32(out, t);
    putU8(out, std::min(255, job.size));
    Wire::putString(out, job.fileId);
    Wire::putString(out, job.modeText);
    putU8(out, std::min(255, job.maxSamples));
}

void Protocol::writeJobInfo(CmdData& out, const Job& job)
{
    writeJobDescription(out, job);
    out.append_si32(job.samples.size());
    for (const Sample& s : job.samples)
        writeSampleInfo(out, s);
    out.append_si32(job.state);
    Wire::putString(out, JobBook::modeString(job));
    out.append_si32(job.size);
    out.append_si32(job.maxSamples);
    out.append_si32(0);
}

STATUS_T Protocol::getSample(CmdData& in, CmdData& out, bool* keepData)
{
    const QString jobName = in.nextArgString();
    const int number = in.nextArg_ui8();
    QStringList imageAngles, spectralAngles;
    QVector<int> imageContents, spectralContents;
    for (int i = 0, n = readCount(in); i < n; ++i)
        imageAngles << in.nextArgString();
    for (int i = 0, n = readCount(in); i < n; ++i)
        spectralAngles << in.nextArgString();
    for (int i = 0, n = readCount(in); i < n; ++i)
        imageContents << in.nextArg_si32();
    for (int i = 0, n = readCount(in); i < n; ++i)
        spectralContents << in.nextArg_si32();
    const int width = in.nextArg_ui16();
    const int height = in.nextArg_ui16();
    in.nextArg_si32();
    in.nextArg_si32();
    end(in);

    const Model model = m_instrument.model();
    QVector<int> cameras, geometries;
    for (const QString& a : imageAngles) {
        if (a.trimmed().compare(QLatin1String("ALL"), Qt::CaseInsensitive) == 0) {
            for (int c = 0; c < numCameraAngles(model); ++c)
                cameras << c;
            continue;
        }
        const int c = imageAngleFromName(a);
        if (c < 0 || c >= numCameraAngles(model))
            return ST_INDEX_INVALID;
        cameras << c;
    }
    for (const QString& a : spectralAngles) {
        if (a.trimmed().compare(QLatin1String("ALL"), Qt::CaseInsensitive) == 0) {
            for (int g = 0; g < numSpectralAngles(model); ++g)
                geometries << g;
            continue;
        }
        const int g = spectralAngleFromName(a);
        if (g < 0 || g >= numSpectralAngles(model))
            return ST_INDEX_INVALID;
        geometries << g;
    }
    const int w = std::max(1, std::min(width, Images::kMaxWidth));
    const int h = std::max(1, std::min(height, Images::kMaxHeight));
    if (imageContents.contains(IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL) && cameras.size() * w * h * 3 > kMaxReplyPayload - 8192)
        return ST_INDEX_INVALID;

    // An empty job with sample 0 is the latest reading, whatever it was.
    const bool latest = jobName.isEmpty() && number == 0;
    if (!latest && !m_instrument.jobs().find(jobName))
        return ST_NO_SUCH_JOB;
    Sample s;
    STATUS_T dataStatus = ST_OK;
    if (!m_instrument.sample(jobName, number, &s, &dataStatus))
        return ST_INDEX_INVALID;

    Wire::putString(out, jobName);
    out.append_si8(static_cast<signed char>(quint8(number)));
    writeSampleInfo(out, s);

    int blocks = 0;
    for (int content : imageContents)
        if (content == IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE || content == IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL
            || content == IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE_PARAMETER)
            blocks += cameras.size();
    out.append_si32(blocks);
    for (int c : cameras) {
        const float* t = s.texture.size() >= (c + 1) * kTextureFigures ? s.texture.constData() + c * kTextureFigures : nullptr;
        for (int content : imageContents) {
            if (content != IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE && content != IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL
                && content != IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE_PARAMETER)
                continue;
            Wire::putString(out, imageAngleName(c));
            out.append_si32(s.dbIndex * 8 + c);
            out.append_si32(content);
            if (content == IMAGE_CHANNEL_CONTENT_TYPE_TEXTURE) {
                Wire::putString(out, QStringLiteral("Texture %1").arg(imageAngleName(c)));
                for (int f = 0; f < kTextureFigures; ++f)
                    out.append_f32(t ? t[f] : 0.0f);
            } else if (content == IMAGE_CHANNEL_CONTENT_TYPE_THUMBNAIL) {
                const QByteArray pixels = Images::samplePicture(s, c, w, h);
                out.append_ui16(quint16(w));
                out.append_ui16(quint16(h));
                out.append_si32(pixels.size());
                out.appendBuffer(pixels);
            } else {
                const bool diffuse = c == IMAGE_DIFFUSE;
                const TextureName* names = diffuse ? kDiffuseParameters : kDirectionalParameters;
                const int count = diffuse ? int(std::size(kDiffuseParameters)) : int(std::size(kDirectionalParameters));
                out.append_si32(count);
                for (int i = 0; i < count; ++i) {
                    Wire::putString(out, QString::fromLatin1(names[i].name));
                    Wire::putString(out, QStringLiteral("1.0"));
                    out.append_f32(t ? t[names[i].figure] : 0.0f);
                }
            }
        }
    }

    out.append_si32(geometries.size());
    for (int g : geometries) {
        Wire::putString(out, spectralAngleName(g));
        int channels = 0;
        for (int content : spectralContents)
            channels += (content == 0 || content == 3 || content == 4) ? 1 : 0;
        out.append_si32(channels);
        const float* lab = s.labch.size() >= (g + 1) * 5 ? s.labch.constData() + g * 5 : nullptr;
        for (int content : spectralContents) {
            if (content == 0) {
                out.append_si32(0);
                out.append_f32(400.0f);
                out.append_f32(10.0f);
                out.append_si32(NUM_WAVELENGTHS);
                for (int wl = 0; wl < NUM_WAVELENGTHS; ++wl)
                    out.append_f32(float(s.reflectance(g, wl)));
            } else if (content == 3 || content == 4) {
                out.append_si32(content);
                out.append_si32(D65_10);
                out.append_si32(0);
                out.append_f32(lab ? lab[0] : 0.0f);
                out.append_f32(lab ? (content == 3 ? lab[1] : lab[3]) : 0.0f);
                out.append_f32(lab ? (content == 3 ? lab[2] : lab[4]) : 0.0f);
            }
        }
    }
    *keepData = true;
    return dataStatus;
}

STATUS_T Protocol::getTargetingInfo(CmdData& in, CmdData& out)
{
    const int w = std::max(1, std::min(int(in.nextArg_si16()), Images::kMaxWidth));
    const int h = std::max(1, std::min(int(in.nextArg_si16()), Images::kMaxHeight));
    end(in);
    const PRESSURE_SWITCH_T p = m_instrument.switches();
    const ACCELEROMETER_ORIENTATION_T o = m_instrument.orientation();
    putU8(out, int(p.Switch1));
    putU8(out, int(p.Switch2));
    putU8(out, int(p.Switch3));
    out.append_si16(short(o.OrientationX));
    out.append_si16(short(o.OrientationY));
    out.append_si16(short(o.OrientationZ));
    out.append_si16(short(o.OrientationPosition));
    putU8(out, o.OrientationAcceleration);
    putU8(out, m_instrument.calibrationStatus());
    out.append_si32(0);
    const QByteArray pixels = m_instrument.liveFrame(w, h);
    out.append_si16(short(w));
    out.append_si16(short(h));
    out.append_si32(pixels.size());
    out.appendBuffer(pixels);
    return ST_OK;
}

STATUS_T Protocol::getParameter(CmdData& in, CmdData& out)
{
    const quint16 key = in.nextArg_ui16();
    end(in);
    out.append_ui16(key);
    const ParamValue* v = m_instrument.parameter(key);
    if (!v)
        return ST_OK;   // a key the server does not keep: the key alone
    switch (v->type) {
    case ParamType::Int: out.append_si32(v->i); break;
    case ParamType::Float: out.append_f32(v->f); break;
    case ParamType::Text: Wire::putString(out, v->s); break;
    case ParamType::WideText: out.appendString32(v->s); break;
    case ParamType::List:
        out.append_si32(v->list.size());
        for (const QString& s : v->list)
            Wire::putString(out, s);
        break;
    }
    return ST_OK;
}

STATUS_T Protocol::setParameter(CmdData& in, CmdData&)
{
    const quint16 key = in.nextArg_ui16();
    const Parameters::Definition* d = Parameters::find(key);
    if (!d || (key == PARAMETER_WEBSERVER_ADDRESS && in.getPacketlength() == 0)) {
        // Keys the server does not keep, and the web server address that a
        // client can't set, come as the key alone.
        end(in);
        return ST_OK;
    }
    ParamValue v;
    v.type = d->type;
    switch (d->type) {
    case ParamType::Int: v.i = in.nextArg_si32(); break;
    case ParamType::Float: v.f = in.nextArg_f32(); break;
    case ParamType::Text: v.s = in.nextArgString(); break;
    case ParamType::WideText: v.s = in.nextArgString32(); break;
    case ParamType::List:
        for (int i = 0, n = readCount(in); i < n; ++i)
            v.list << in.nextArgString();
        break;
    }
    end(in);
    return m_instrument.setParameter(key, v);
}

STATUS_T Protocol::getFilter(CmdData& in, CmdData& out, const QString& file)
{
    end(in);
    QFile f(QDir(m_instrument.dataDir()).filePath(file));
    if (!f.exists())
        return ST_NO_SUCH_FILE;
    if (!f.open(QIODevice::ReadOnly)) {
        qWarning().noquote() << "Sim: cannot read" << f.fileName();
        return ST_NO_SUCH_FILE;
    }
    const QByteArray data = f.read(kMaxReplyPayload - 4);
    out.append_si32(data.size());
    out.appendBuffer(data);
    return ST_OK;
}

} // namespace Sim
