#ifndef CMDDATA_H
#define CMDDATA_H

// One packet of the instrument protocol: a little-endian header and a payload
// of typed arguments without type marks. The same object builds a frame (the
// append family) and takes one apart (the nextArg family).
//
// Command frame:  length(4) transaction(2) flags(1)=0x80 reserved(1) code(4) payload
// Response frame: length(4) transaction(2) flags(1)=0x00 reserved(1) code(4) status(4) payload
//
// Every failure is thrown as an unsigned int holding a STATUS_T.

#include "SharedSystem/InstrumentTypes.h"

#include <QByteArray>
#include <QDateTime>
#include <QMetaType>
#include <QString>
#include <QUuid>

class Job;

// Handle of an inbound connection; nothing on this side reads or writes it.
typedef int CommConnectionID;

class CmdData
{
public:
    // Frames above this size are refused by the link.
    static constexpr int MAX_FRAME_SIZE = 670944;
    static constexpr int COMMAND_HEADER_SIZE = 12;
    static constexpr int RESPONSE_HEADER_SIZE = 16;
    static constexpr char COMMAND_FLAGS = char(0x80);

    CmdData();
    // Copies header and payload only; the scratch of the last read stays behind.
    CmdData(const CmdData& other);
    explicit CmdData(const char* frame);
    explicit CmdData(const QByteArray& frame);
    CmdData& operator=(const CmdData& other);

    // The frame as it goes on the wire.
    QByteArray getFullCmd() const;
    // Parses a whole frame; throws 261 (under 12 bytes) or 263 (length field
    // differs from the size). On a throw the packet keeps what it had.
    void setFullData(const QByteArray& frame);
    // The frame's own length field tells how many bytes to take.
    void setFullData(const char* frame);

    // A ready command: empty payload, id 0, flags 0x80, code 0, status 0.
    void clear();
    // Turns a received command into its response. With verifyEmpty, unread
    // arguments are an error (throws STATUS_BAD_RESPONSE).
    void respond(long status, bool verifyEmpty);

    // The payload not read yet.
    QByteArray getBuffer() const { return m_readPos == 0 ? commandData : commandData.mid(m_readPos); }
    int getPacketlength() const { return commandData.size() - m_readPos; }

    short getTransactionID() const { return commandTransactionID; }
    void setTransactionID(short id) { commandTransactionID = id; }
    char getFlags() const { return commandFlags; }
    void setFlags(char flags) { commandFlags = flags; }
    long getCommandCode() const { return commandCode; }
    void setCommandCode(long code) { commandCode = static_cast<qint32>(code); }
    STATUS_T getStatus() const { return static_cast<STATUS_T>(commandStatus); }
    void setStatus(long status) { commandStatus = static_cast<qint32>(status); }
    bool getIsResponse() const { return commandIsResponse; }
    void setIsResponse(bool isResponse) { commandIsResponse = isResponse; }

    // ---- writers --------------------------------------------------------
    void append_ui8(char value);
    void append_si8(signed char value);
    void append_ui16(unsigned short value);
    void append_si16(short value);
    void append_ui32(unsigned long value);
    void append_si32(long value);
    void append_f32(float value);
    void append_f64(double value);
    // Raw bytes, no length in front.
    void appendBuffer(const char* data, long count);
    void appendBuffer(const QByteArray& data);
    // Count of characters, then the text in the locale codec. The count is
    // not the byte count for non-ASCII text: use appendString32 for that.
    void appendString(const QString& text);
    // Count of characters, then each UTF-16 code value as 4 bytes.
    void appendString32(const QString& text);
    void appendTag(const TAG_ITEM_T& tag);
    void appendTag32(const TAG_ITEM_T& tag);
    // Job encodings; defined with the job model.
    void appendJobDescription(const Job& job);

    // ---- readers (destructive, strictly in order) -----------------------
    // The next n bytes, copied to the scratch array; throws 3 past the end.
    const char* nextArg(long n);
    // The next n bytes as a copy; throws 3 past the end.
    QByteArray nextArgBuffer(long n);
    unsigned char nextArg_ui8();
    signed char nextArg_si8();
    unsigned short nextArg_ui16();
    short nextArg_si16();
    unsigned int nextArg_ui32();
    int nextArg_si32();
    float nextArg_f32();
    double nextArg_f64();
    QString nextArgString();
    QString nextArgString32();
    TAG_ITEM_T nextArgTag();
    TAG_ITEM_T nextArgTag32();
    // Year from 1900, month from 0.
    QDateTime nextArgTime();
    SAMPLE_INFO_T nextArgSampleInfo();
    ACCELEROMETER_ORIENTATION_T nextArgAccelerationInfo();
    PRESSURE_SWITCH_T nextArgPressureSwitchStatus();
    ERROR_DESCRIPTION_T nextArgErrorDescription();
    NETWORK_DESCRIPTION_T nextArgNetworkDescription();
    // Job encodings; defined with the job model.
    void nextArgJobDescription(Job& job);
    void nextArgJobInfo(Job& job);

private:
    void appendLE(quint64 value, int bytes);
    void compactForAppend();
    quint64 takeLE(int bytes);

public:
    bool bmAnswer;
    int amInterfaceVersion;

private:
    QByteArray commandData;
    qint16 commandTransactionID;
    char commandFlags;
    qint32 commandCode;
    qint32 commandStatus;
    bool commandIsResponse;
    QByteArray byteArray;
    // Bytes of commandData already read: the front of the payload is taken
    // away by moving this mark instead of shifting a large image reply after
    // every small field.
    int m_readPos = 0;
};

// An enum taken from a wire byte. A value the enum can't hold becomes its
// count constant, which no code takes for a real state.
template <typename E>
E wireEnum(long value, E count)
{
    return (value < 0 || value > long(count)) ? count : static_cast<E>(value);
}

// True when any character lies above 7-bit ASCII.
bool isString32(const QString& text);
bool isTag32(const TAG_ITEM_T& tag);

// Checks that rsp answers cmd: throws STATUS_BAD_RESPONSE (3) for a reply to
// another transaction or of the wrong kind, STATUS_BAD_RESPONSE_STATUS (2)
// for a reply that carries a non-zero status.
void validateResponse(const CmdData& cmd, const CmdData& rsp);

// A packet of an inbound connection, tagged with the connection's identity.
class CommandData
{
public:
    CommandData();
    explicit CommandData(const QUuid& id);

    QUuid entityID;
    CommConnectionID connectionID;
    CmdData cmd;
};

class ResponseData
{
public:
    ResponseData() = default;
    ResponseData(const QUuid& id, const CmdData& packet) : entityID(id), cmd(packet) {}

    QUuid entityID;
    CmdData cmd;
};

Q_DECLARE_METATYPE(CmdData)
Q_DECLARE_METATYPE(CommandData)
Q_DECLARE_METATYPE(ResponseData)

// Makes the link's packet types travel in queued signals. Runs on its own
// when the library loads; calling it again is harmless.
void registerLinkMetaTypes();

#endif // CMDDATA_H
