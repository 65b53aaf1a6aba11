#include "SimChanges.h"

#include "SimTypes.h"

namespace Sim {

namespace {
// A client that missed many polls still gets a bounded reply.
const int kMaxEntities = 32;

template <typename T>
void countUp(T& counter)
{
    if (++counter == 0)
        counter = 1;
}
} // namespace

void Changes::entity(const QString& jobName)
{
    for (const EntityChange& e : m_entities)
        if (e.entity == ENTITY_JOB && e.change == CHANGE_MODIFIED && e.identifier == jobName)
            return;
    if (m_entities.size() >= kMaxEntities)
        m_entities.removeFirst();
    m_entities.append({ENTITY_JOB, jobName, CHANGE_MODIFIED});
}

void Changes::jobChanged(const QString& jobName)
{
    countUp(m_jobId);
    if (!jobName.isEmpty())
        entity(jobName);
}

void Changes::measurementsChanged(const QString& jobName)
{
    countUp(m_measureId);
    if (!jobName.isEmpty())
        entity(jobName);
}

void Changes::settingChanged(quint32 bit)
{
    countUp(m_settingsId);
    m_bits |= bit;
}

void Changes::take(quint32* bits, QVector<EntityChange>* entities)
{
    if (bits)
        *bits = m_bits;
    if (entities)
        *entities = m_entities;
    m_bits = 0;
    m_entities.clear();
}

} // namespace Sim
