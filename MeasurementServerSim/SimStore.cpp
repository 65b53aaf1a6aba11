#include "SimStore.h"

#include <QDataStream>
#include <QDebug>
#include <QDir>
#include <QFileInfo>
#include <QHash>
#include <QSqlError>
#include <QSqlQuery>
#include <QVariant>

#include <atomic>

namespace Sim {

namespace {

const int kSchemaVersion = 1;

QByteArray packFloats(const QVector<float>& v)
{
    return QByteArray(reinterpret_cast<const char*>(v.constData()), v.size() * int(sizeof(float)));
}

QVector<float> unpackFloats(const QByteArray& b)
{
    QVector<float> v(b.size() / int(sizeof(float)));
    if (!v.isEmpty())
        memcpy(v.data(), b.constData(), size_t(v.size()) * sizeof(float));
    return v;
}

QByteArray packTags(const QVector<Tag>& tags)
{
    QByteArray out;
    QDataStream s(&out, QIODevice::WriteOnly);
    s << qint32(tags.size());
    for (const Tag& t : tags)
        s << t.id << t.text;
    return out;
}

QVector<Tag> unpackTags(const QByteArray& b)
{
    QVector<Tag> tags;
    QDataStream s(b);
    qint32 n = 0;
    s >> n;
    for (qint32 i = 0; i < n && s.status() == QDataStream::Ok; ++i) {
        Tag t;
        s >> t.id >> t.text;
        tags.append(t);
    }
    return tags;
}

QVariant timeValue(const QDateTime& t)
{
    return t.isValid() ? QVariant(t.toMSecsSinceEpoch()) : QVariant(QVariant::LongLong);
}

QDateTime timeFrom(const QVariant& v)
{
    return v.isNull() ? QDateTime() : QDateTime::fromMSecsSinceEpoch(v.toLongLong());
}

const char* const kSampleColumns =
    "id, job_id, is_average, good, time, temperature, instr_temp, cal_dtemp, "
    "ox, oy, oz, opos, oacc, cal_status, sw1, sw2, sw3, seed, finish, num_angles, refl, labch, texture";

Sample sampleFromQuery(const QSqlQuery& q)
{
    Sample s;
    s.dbIndex = q.value(0).toInt();
    s.good = q.value(3).toBool();
    s.time = timeFrom(q.value(4));
    s.temperature = q.value(5).toFloat();
    s.instrumentTemperature = q.value(6).toFloat();
    s.calTemperatureDelta = q.value(7).toFloat();
    s.orientation.OrientationX = q.value(8).toInt();
    s.orientation.OrientationY = q.value(9).toInt();
    s.orientation.OrientationZ = q.value(10).toInt();
    s.orientation.OrientationPosition = q.value(11).toInt();
    s.orientation.OrientationAcceleration = q.value(12).toInt();
    s.calibrationStatus = q.value(13).toInt();
    s.pressure.Switch1 = q.value(14).toUInt();
    s.pressure.Switch2 = q.value(15).toUInt();
    s.pressure.Switch3 = q.value(16).toUInt();
    s.seed = q.value(17).toUInt();
    s.finish = q.value(18).toString();
    s.numAngles = q.value(19).toInt();
    s.refl = unpackFloats(q.value(20).toByteArray());
    s.labch = unpackFloats(q.value(21).toByteArray());
    s.texture = unpackFloats(q.value(22).toByteArray());
    return s;
}

} // namespace

Store::Store()
{
    static std::atomic<int> counter{0};
    m_connection = QStringLiteral("marigold-sim-store-%1").arg(++counter);
}

Store::~Store()
{
    if (QSqlDatabase::contains(m_connection)) {
        {
            QSqlDatabase db = QSqlDatabase::database(m_connection, false);
            if (db.isOpen())
                db.close();
        }
        QSqlDatabase::removeDatabase(m_connection);
    }
}

void Store::logError(const char* what, const QString& detail) const
{
    qWarning().noquote() << "Sim store:" << what << detail;
}

bool Store::open(const QString& dir, bool reset, QString* error)
{
    QDir d(dir);
    if (!d.exists() && !QDir().mkpath(dir)) {
        if (error)
            *error = QStringLiteral("cannot create data folder %1").arg(dir);
        return false;
    }
    m_path = d.absoluteFilePath(QStringLiteral("server.db"));
    QSqlDatabase db = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), m_connection);
    db.setDatabaseName(m_path);
    if (!db.open()) {
        if (error)
            *error = QStringLiteral("cannot open %1: %2").arg(m_path, db.lastError().text());
        return false;
    }
    exec(QStringLiteral("PRAGMA foreign_keys = ON"));
    exec(QStringLiteral("PRAGMA journal_mode = WAL"));
    exec(QStringLiteral("PRAGMA synchronous = NORMAL"));
    if (reset) {
        for (const char* t : {"samples", "jobs", "params", "wifi", "meta"})
            exec(QStringLiteral("DROP TABLE IF EXISTS %1").arg(QLatin1String(t)));
    }
    if (!createSchema()) {
        if (error)
            *error = QStringLiteral("cannot create the tables in %1").arg(m_path);
        return false;
    }
    return true;
}

bool Store::isOpen() const
{
    return QSqlDatabase::contains(m_connection) && QSqlDatabase::database(m_connection, false).isOpen();
}

qint64 Store::fileSize() const
{
    return QFileInfo(m_path).size() + QFileInfo(m_path + QStringLiteral("-wal")).size();
}

bool Store::exec(const QString& sql)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    if (!q.exec(sql)) {
        logError("query failed:", sql + QStringLiteral(" -- ") + q.lastError().text());
        return false;
    }
    return true;
}

bool Store::createSchema()
{
    bool ok = exec(QStringLiteral("CREATE TABLE IF NOT EXISTS meta (key TEXT PRIMARY KEY, value TEXT)"));
    ok = ok && exec(QStringLiteral(
        "CREATE TABLE IF NOT EXISTS jobs (id INTEGER PRIMARY KEY AUTOINCREMENT, name TEXT NOT NULL UNIQUE, "
        "file_id TEXT NOT NULL, mode_text TEXT NOT NULL, mode INTEGER NOT NULL, size INTEGER NOT NULL, "
        "max_samples INTEGER NOT NULL, state INTEGER NOT NULL, tags BLOB, finish TEXT, created INTEGER, "
        "first_measured INTEGER, online INTEGER NOT NULL DEFAULT 0, saved INTEGER NOT NULL DEFAULT 0, "
        "sync_percent INTEGER NOT NULL DEFAULT 0, syncing INTEGER NOT NULL DEFAULT 0)"));
    ok = ok && exec(QStringLiteral(
        "CREATE TABLE IF NOT EXISTS samples (id INTEGER PRIMARY KEY AUTOINCREMENT, "
        "job_id INTEGER NOT NULL REFERENCES jobs(id) ON DELETE CASCADE, is_average INTEGER NOT NULL, "
        "good INTEGER NOT NULL, time INTEGER, temperature REAL, instr_temp REAL, cal_dtemp REAL, "
        "ox INTEGER, oy INTEGER, oz INTEGER, opos INTEGER, oacc INTEGER, cal_status INTEGER, "
        "sw1 INTEGER, sw2 INTEGER, sw3 INTEGER, seed INTEGER, finish TEXT, num_angles INTEGER, "
        "refl BLOB, labch BLOB, texture BLOB)"));
    ok = ok && exec(QStringLiteral("CREATE INDEX IF NOT EXISTS samples_by_job ON samples(job_id, id)"));
    ok = ok && exec(QStringLiteral(
        "CREATE TABLE IF NOT EXISTS params (key INTEGER PRIMARY KEY, type INTEGER NOT NULL, "
        "ivalue INTEGER, fvalue REAL, svalue TEXT, lvalue BLOB)"));
    ok = ok && exec(QStringLiteral(
        "CREATE TABLE IF NOT EXISTS wifi (ssid TEXT PRIMARY KEY, mac TEXT, auth TEXT, password TEXT, "
        "stored_key TEXT, channel INTEGER, quality REAL, in_range INTEGER, known INTEGER, priority INTEGER, "
        "ordinal INTEGER)"));
    if (ok && meta(QStringLiteral("schema")).isEmpty())
        setMeta(QStringLiteral("schema"), QString::number(kSchemaVersion));
    return ok;
}

bool Store::isEmpty()
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    if (!q.exec(QStringLiteral("SELECT (SELECT COUNT(*) FROM jobs) + (SELECT COUNT(*) FROM params)")) || !q.next())
        return true;
    return q.value(0).toInt() == 0;
}

void Store::begin()
{
    if (m_depth++ == 0)
        QSqlDatabase::database(m_connection, false).transaction();
}

void Store::commit()
{
    if (m_depth > 0 && --m_depth == 0) {
        QSqlDatabase db = QSqlDatabase::database(m_connection, false);
        if (!db.commit())
            logError("commit failed:", db.lastError().text());
    }
}

QString Store::meta(const QString& key, const QString& fallback)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("SELECT value FROM meta WHERE key = ?"));
    q.addBindValue(key);
    if (q.exec() && q.next())
        return q.value(0).toString();
    return fallback;
}

void Store::setMeta(const QString& key, const QString& value)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("INSERT OR REPLACE INTO meta (key, value) VALUES (?, ?)"));
    q.addBindValue(key);
    q.addBindValue(value);
    if (!q.exec())
        logError("meta write failed:", q.lastError().text());
}

QVector<Job> Store::loadJobs()
{
    QVector<Job> jobs;
    QHash<int, int> byId;
    QSqlDatabase db = QSqlDatabase::database(m_connection, false);
    QSqlQuery q(db);
    q.setForwardOnly(true);
    if (!q.exec(QStringLiteral(
            "SELECT id, name, file_id, mode_text, mode, size, max_samples, state, tags, finish, created, "
            "first_measured, online, saved, sync_percent, syncing FROM jobs ORDER BY id"))) {
        logError("cannot read jobs:", q.lastError().text());
        return jobs;
    }
    while (q.next()) {
        Job j;
        j.dbIndex = q.value(0).toInt();
        j.name = q.value(1).toString();
        j.fileId = q.value(2).toString();
        j.modeText = q.value(3).toString();
        const int mode = q.value(4).toInt();
        j.mode = (mode >= 0 && mode < NUM_JOB_AVG_MODES) ? JOB_AVERAGING_MODE_T(mode) : JOB_AVG_MODE_NONE;
        j.size = q.value(5).toInt();
        j.maxSamples = q.value(6).toInt();
        j.state = q.value(7).toInt();
        j.tags = unpackTags(q.value(8).toByteArray());
        j.finish = q.value(9).toString();
        j.created = timeFrom(q.value(10));
        j.firstMeasured = timeFrom(q.value(11));
        j.online = q.value(12).toBool();
        j.saved = q.value(13).toBool();
        j.syncPercent = q.value(14).toInt();
        j.syncing = q.value(15).toBool();
        byId.insert(j.dbIndex, jobs.size());
        jobs.append(j);
    }
    QSqlQuery s(db);
    s.setForwardOnly(true);
    if (!s.exec(QStringLiteral("SELECT %1 FROM samples ORDER BY job_id, id").arg(QLatin1String(kSampleColumns)))) {
        logError("cannot read samples:", s.lastError().text());
        return jobs;
    }
    while (s.next()) {
        const auto it = byId.constFind(s.value(1).toInt());
        if (it == byId.constEnd())
            continue;
        Job& j = jobs[*it];
        Sample sample = sampleFromQuery(s);
        if (s.value(2).toBool()) {
            j.average = sample;
            j.hasAverage = true;
        } else {
            j.samples.append(sample);
        }
    }
    return jobs;
}

QMap<int, ParamValue> Store::loadParameters()
{
    QMap<int, ParamValue> params;
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    if (!q.exec(QStringLiteral("SELECT key, type, ivalue, fvalue, svalue, lvalue FROM params")))
        return params;
    while (q.next()) {
        ParamValue v;
        const int type = q.value(1).toInt();
        v.type = (type >= 0 && type <= int(ParamType::List)) ? ParamType(type) : ParamType::Int;
        v.i = q.value(2).toInt();
        v.f = q.value(3).toFloat();
        v.s = q.value(4).toString();
        QDataStream ls(q.value(5).toByteArray());
        ls >> v.list;
        params.insert(q.value(0).toInt(), v);
    }
    return params;
}

QVector<WifiNetwork> Store::loadWifi()
{
    QVector<WifiNetwork> nets;
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    if (!q.exec(QStringLiteral("SELECT ssid, mac, auth, password, stored_key, channel, quality, in_range, known, "
                               "priority FROM wifi ORDER BY ordinal")))
        return nets;
    while (q.next()) {
        WifiNetwork n;
        n.ssid = q.value(0).toString();
        n.mac = q.value(1).toString();
        n.authentication = q.value(2).toString();
        n.password = q.value(3).toString();
        n.storedKey = q.value(4).toString();
        n.channel = q.value(5).toInt();
        n.quality = q.value(6).toFloat();
        n.inRange = q.value(7).toBool();
        n.known = q.value(8).toBool();
        n.priority = q.value(9).toInt();
        nets.append(n);
    }
    return nets;
}

bool Store::saveJob(Job& job)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    const bool insert = job.dbIndex <= 0;
    if (insert) {
        q.prepare(QStringLiteral(
            "INSERT INTO jobs (name, file_id, mode_text, mode, size, max_samples, state, tags, finish, created, "
            "first_measured, online, saved, sync_percent, syncing) VALUES (?,?,?,?,?,?,?,?,?,?,?,?,?,?,?)"));
    } else {
        q.prepare(QStringLiteral(
            "UPDATE jobs SET name=?, file_id=?, mode_text=?, mode=?, size=?, max_samples=?, state=?, tags=?, "
            "finish=?, created=?, first_measured=?, online=?, saved=?, sync_percent=?, syncing=? WHERE id=?"));
    }
    q.addBindValue(job.name);
    q.addBindValue(job.fileId);
    q.addBindValue(job.modeText);
    q.addBindValue(int(job.mode));
    q.addBindValue(job.size);
    q.addBindValue(job.maxSamples);
    q.addBindValue(job.state);
    q.addBindValue(packTags(job.tags));
    q.addBindValue(job.finish);
    q.addBindValue(timeValue(job.created));
    q.addBindValue(timeValue(job.firstMeasured));
    q.addBindValue(job.online ? 1 : 0);
    q.addBindValue(job.saved ? 1 : 0);
    q.addBindValue(job.syncPercent);
    q.addBindValue(job.syncing ? 1 : 0);
    if (!insert)
        q.addBindValue(job.dbIndex);
    if (!q.exec()) {
        logError("cannot save job:", q.lastError().text());
        return false;
    }
    if (insert)
        job.dbIndex = q.lastInsertId().toInt();
    return true;
}

bool Store::writeSample(int jobId, Sample& s, bool isAverage)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("INSERT INTO samples (%1) VALUES (%2?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?,?)")
                  .arg(QLatin1String(kSampleColumns), s.dbIndex > 0 ? QStringLiteral("?,") : QStringLiteral("NULL,")));
    if (s.dbIndex > 0)
        q.addBindValue(s.dbIndex);
    q.addBindValue(jobId);
    q.addBindValue(isAverage ? 1 : 0);
    q.addBindValue(s.good ? 1 : 0);
    q.addBindValue(timeValue(s.time));
    q.addBindValue(double(s.temperature));
    q.addBindValue(double(s.instrumentTemperature));
    q.addBindValue(double(s.calTemperatureDelta));
    q.addBindValue(s.orientation.OrientationX);
    q.addBindValue(s.orientation.OrientationY);
    q.addBindValue(s.orientation.OrientationZ);
    q.addBindValue(s.orientation.OrientationPosition);
    q.addBindValue(s.orientation.OrientationAcceleration);
    q.addBindValue(s.calibrationStatus);
    q.addBindValue(s.pressure.Switch1);
    q.addBindValue(s.pressure.Switch2);
    q.addBindValue(s.pressure.Switch3);
    q.addBindValue(s.seed);
    q.addBindValue(s.finish);
    q.addBindValue(s.numAngles);
    q.addBindValue(packFloats(s.refl));
    q.addBindValue(packFloats(s.labch));
    q.addBindValue(packFloats(s.texture));
    if (!q.exec()) {
        logError("cannot save sample:", q.lastError().text());
        return false;
    }
    if (s.dbIndex <= 0)
        s.dbIndex = q.lastInsertId().toInt();
    return true;
}

bool Store::insertSample(int jobId, Sample& sample)
{
    sample.dbIndex = 0;
    return writeSample(jobId, sample, false);
}

bool Store::updateSampleFlags(const Sample& sample)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("UPDATE samples SET good = ? WHERE id = ?"));
    q.addBindValue(sample.good ? 1 : 0);
    q.addBindValue(sample.dbIndex);
    return q.exec();
}

bool Store::saveAverage(Job& job)
{
    begin();
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("DELETE FROM samples WHERE job_id = ? AND is_average = 1"));
    q.addBindValue(job.dbIndex);
    bool ok = q.exec();
    if (ok && job.hasAverage)
        ok = writeSample(job.dbIndex, job.average, true);
    commit();
    return ok;
}

bool Store::deleteSample(int sampleDbIndex)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("DELETE FROM samples WHERE id = ?"));
    q.addBindValue(sampleDbIndex);
    return q.exec();
}

bool Store::deleteJob(int jobId)
{
    begin();
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("DELETE FROM samples WHERE job_id = ?"));
    q.addBindValue(jobId);
    bool ok = q.exec();
    QSqlQuery j(QSqlDatabase::database(m_connection, false));
    j.prepare(QStringLiteral("DELETE FROM jobs WHERE id = ?"));
    j.addBindValue(jobId);
    ok = j.exec() && ok;
    commit();
    return ok;
}

bool Store::deleteAllJobs()
{
    begin();
    const bool ok = exec(QStringLiteral("DELETE FROM samples")) && exec(QStringLiteral("DELETE FROM jobs"));
    commit();
    return ok;
}

bool Store::saveParameter(int key, const ParamValue& v)
{
    QSqlQuery q(QSqlDatabase::database(m_connection, false));
    q.prepare(QStringLiteral("INSERT OR REPLACE INTO params (key, type, ivalue, fvalue, svalue, lvalue) VALUES (?,?,?,?,?,?)"));
    QByteArray list;
    QDataStream ls(&list, QIODevice::WriteOnly);
    ls << v.list;
    q.addBindValue(key);
    q.addBindValue(int(v.type));
    q.addBindValue(v.i);
    q.addBindValue(double(v.f));
    q.addBindValue(v.s);
    q.addBindValue(list);
    if (!q.exec()) {
        logError("cannot save parameter:", q.lastError().text());
        return false;
    }
    return true;
}

bool Store::saveWifi(const QVector<WifiNetwork>& networks)
{
    begin();
    bool ok = exec(QStringLiteral("DELETE FROM wifi"));
    int ordinal = 0;
    for (const WifiNetwork& n : networks) {
        QSqlQuery q(QSqlDatabase::database(m_connection, false));
        q.prepare(QStringLiteral("INSERT INTO wifi (ssid, mac, auth, password, stored_key, channel, quality, in_range, "
                                 "known, priority, ordinal) VALUES (?,?,?,?,?,?,?,?,?,?,?)"));
        q.addBindValue(n.ssid);
        q.addBindValue(n.mac);
        q.addBindValue(n.authentication);
        q.addBindValue(n.password);
        q.addBindValue(n.storedKey);
        q.addBindValue(n.channel);
        q.addBindValue(double(n.quality));
        q.addBindValue(n.inRange ? 1 : 0);
        q.addBindValue(n.known ? 1 : 0);
        q.addBindValue(n.priority);
        q.addBindValue(ordinal++);
        ok = q.exec() && ok;
    }
    commit();
    return ok;
}

} // namespace Sim
