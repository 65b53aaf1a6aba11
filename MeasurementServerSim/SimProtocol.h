#ifndef SIMPROTOCOL_H
#define SIMPROTOCOL_H

// The server's side of the wire protocol: takes one command frame, runs the
// command on the instrument, and builds the response frame. Framing and the
// basic encodings are the product's own CmdData; the command replies are
// written here.
//
// Requests are read strictly: a request that ends early or carries bytes
// the command does not take is answered with status 3 and changes nothing.
// Unknown command codes are answered with status 1.

#include "SimInstrument.h"

#include <QByteArray>
#include <QHash>

class CmdData;

namespace Sim {

class Protocol
{
public:
    explicit Protocol(Instrument& instrument);

    // The response to one whole command frame. An empty result means the frame
    // could not be read as a command (the reason is logged).
    QByteArray handle(const QByteArray& frame);

    // Answers a command code with a fixed status (and no data) instead of
    // running it, count times or, with count < 0, until allowed again.
    void refuse(quint32 code, STATUS_T status, int count = -1);
    void allow(quint32 code);
    void allowAll() { m_refusals.clear(); }

    quint64 commandsHandled() const { return m_handled; }

private:
    struct Refusal {
        STATUS_T status = 0;
        int remaining = -1;
    };

    STATUS_T dispatch(quint32 code, CmdData& in, CmdData& out, bool* keepData);

    STATUS_T getState(CmdData& in, CmdData& out);
    STATUS_T getErrors(CmdData& in, CmdData& out);
    STATUS_T getSample(CmdData& in, CmdData& out, bool* keepData);
    STATUS_T getTargetingInfo(CmdData& in, CmdData& out);
    STATUS_T getParameter(CmdData& in, CmdData& out);
    STATUS_T setParameter(CmdData& in, CmdData& out);
    STATUS_T getFilter(CmdData& in, CmdData& out, const QString& file);
    void writeJobInfo(CmdData& out, const Job& job);
    void writeJobDescription(CmdData& out, const Job& job);
    void writeSampleInfo(CmdData& out, const Sample& s);

    Instrument& m_instrument;
    QHash<quint32, Refusal> m_refusals;
    quint64 m_handled = 0;
};

// The server's writers and readers of the wire forms it shares with the GUI.
namespace Wire {
// A String: the count of bytes, then the text in UTF-8. For the 7-bit text
// the protocol carries this is also the count of characters.
void putString(CmdData& out, const QString& text);
void putTime(CmdData& out, const QDateTime& time);
void putTag(CmdData& out, const Tag& tag);
void putTag32(CmdData& out, const Tag& tag);
// Reads a job description as a client sends it.
void readJobDescription(CmdData& in, int* dbIndex, QString* name, QVector<Tag>* tags, int* size, QString* fileId,
                        QString* modeText, int* spare);
// The order a client expects: plain tags, then the wide ones with the
// display name first.
void splitTags(const QVector<Tag>& tags, QVector<Tag>* plain, QVector<Tag>* wide);
} // namespace Wire

} // namespace Sim

#endif // SIMPROTOCOL_H
