#ifndef SYNCHARNESS_H
#define SYNCHARNESS_H

// The back end against the simulator through a relay, for following web
// syncs; the relay can hold a job's sync progress where a test wants it.

#include "GUIAPI/BackendHarness.h"

#include "AppShell.h"
#include "GUIAPI/SyncObject.h"

#include <QtEndian>

namespace SyncHarness {

const quint32 kGetJobInfoWeb = 0x40010022;

// The reply of a job's web state that the web service never gets past.
inline QByteArray stalledWebState(const QByteArray& frame, quint32 state, quint32 percent)
{
    QByteArray payload(8, '\0');
    qToLittleEndian<quint32>(state, payload.data());
    qToLittleEndian<quint32>(percent, payload.data() + 4);
    return ScriptedPeer::replyTo(frame, 0, payload);
}

// "syncJobPercent(name,done,percent)" entries of a log for one job.
inline QStringList progressOf(const BackendHarness::SignalLog& log, const QString& name)
{
    QStringList out;
    for (const QString& e : log.entries()) {
        if (e.startsWith("syncJobPercent(" + name + ","))
            out << e;
    }
    return out;
}

} // namespace SyncHarness

#endif // SYNCHARNESS_H
