#ifndef SIMCHANGES_H
#define SIMCHANGES_H

// What the state reply tells a client about changes: the change counters of
// the job table, the measurements and the settings, the settings bits and the
// entity changes. Bits and entity changes collect until the next state reply
// takes them; the counters only ever count up (skipping 0, the value of a
// client that has seen nothing yet).

#include <QString>
#include <QVector>

namespace Sim {

struct EntityChange {
    int entity = 0;
    QString identifier;
    int change = 0;
};

class Changes
{
public:
    // The job table changed (a job added, edited, deleted or finished).
    void jobChanged(const QString& jobName);
    // The measurements of a job changed (a sample added or deleted).
    void measurementsChanged(const QString& jobName);
    void settingChanged(quint32 bit);

    quint16 jobId() const { return m_jobId; }
    quint16 measureId() const { return m_measureId; }
    quint8 settingsId() const { return m_settingsId; }
    quint32 pendingBits() const { return m_bits; }
    const QVector<EntityChange>& pendingEntities() const { return m_entities; }

    // Hands the bits and entity changes to a state reply and forgets them.
    void take(quint32* bits, QVector<EntityChange>* entities);

private:
    void entity(const QString& jobName);

    quint16 m_jobId = 1;
    quint16 m_measureId = 1;
    quint8 m_settingsId = 1;
    quint32 m_bits = 0;
    QVector<EntityChange> m_entities;
};

} // namespace Sim

#endif // SIMCHANGES_H
