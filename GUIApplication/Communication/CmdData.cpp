#include "Communication/CmdData.h"

#include <QDebug>
#include <QVector>

#include <cstring>

namespace {

quint32 readLE32(const unsigned char* p)
{
    return quint32(p[0]) | (quint32(p[1]) << 8) | (quint32(p[2]) << 16) | (quint32(p[3]) << 24);
}

QString hexCode(long code)
{
    return QString::number(static_cast<quint32>(code), 16).right(8);
}

// Registered when the library loads, so that every thread that meets these
// packets in a queued signal finds them, whatever the start-up order.
[[maybe_unused]] const bool s_metaTypesRegistered = (registerLinkMetaTypes(), true);

} // namespace

void registerLinkMetaTypes()
{
    qRegisterMetaType<CmdData>("CmdData");
    qRegisterMetaType<CommandData>("CommandData");
    qRegisterMetaType<ResponseData>("ResponseData");
}

// ---- construction -----------------------------------------------------------

CmdData::CmdData()
    : bmAnswer(false)
    , amInterfaceVersion(0)
{
    clear();
}

CmdData::CmdData(const CmdData& other)
    : bmAnswer(false)
    , amInterfaceVersion(0)
    , commandData(other.getBuffer())
    , commandTransactionID(other.commandTransactionID)
    , commandFlags(other.commandFlags)
    , commandCode(other.commandCode)
    , commandStatus(other.commandStatus)
    , commandIsResponse(other.commandIsResponse)
{
}

CmdData::CmdData(const char* frame)
    : CmdData()
{
    setFullData(frame);
}

CmdData::CmdData(const QByteArray& frame)
    : CmdData()
{
    setFullData(frame);
}

CmdData& CmdData::operator=(const CmdData& other)
{
    if (this != &other) {
        commandData = other.getBuffer();
        m_readPos = 0;
        commandTransactionID = other.commandTransactionID;
        commandFlags = other.commandFlags;
        commandCode = other.commandCode;
        commandStatus = other.commandStatus;
        commandIsResponse = other.commandIsResponse;
    }
    return *this;
}

void CmdData::clear()
{
    commandData.clear();
    m_readPos = 0;
    commandTransactionID = 0;
    commandFlags = COMMAND_FLAGS;
    commandCode = 0;
    commandStatus = 0;
    commandIsResponse = false;
}

void CmdData::respond(long status, bool verifyEmpty)
{
    if (verifyEmpty && getPacketlength() != 0)
        throw STATUS_BAD_RESPONSE;
    commandData.clear();
    m_readPos = 0;
    commandFlags = 0;
    commandStatus = static_cast<qint32>(status);
    commandIsResponse = true;
}

// ---- whole frames -------------------------------------------------------------

QByteArray CmdData::getFullCmd() const
{
    const int payload = getPacketlength();
    const int header = commandIsResponse ? RESPONSE_HEADER_SIZE : COMMAND_HEADER_SIZE;
    const quint32 length = quint32(header + payload);

    QByteArray frame;
    frame.reserve(int(length));
    auto put = [&frame](quint32 value, int bytes) {
        for (int i = 0; i < bytes; ++i)
            frame.append(char((value >> (8 * i)) & 0xFF));
    };
    put(length, 4);
    put(quint16(commandTransactionID), 2);
    frame.append(commandFlags);
    frame.append(char(0));
    put(quint32(commandCode), 4);
    if (commandIsResponse)
        put(quint32(commandStatus), 4);
    frame.append(commandData.constData() + m_readPos, payload);
    return frame;
}

void CmdData::setFullData(const QByteArray& frame)
{
    if (frame.size() < COMMAND_HEADER_SIZE)
        throw STATUS_TCP_DATA_TOO_SMALL;
    const unsigned char* p = reinterpret_cast<const unsigned char*>(frame.constData());
    if (readLE32(p) != quint32(frame.size()))
        throw STATUS_TCP_LENGTH_MISMATCH;

    commandTransactionID = qint16(quint16(p[4]) | (quint16(p[5]) << 8));
    commandFlags = char(p[6]);
    commandCode = qint32(readLE32(p + 8));
    commandIsResponse = (p[6] == 0);
    m_readPos = 0;
    if (commandIsResponse) {
        // The server always sends the status; a response of 12 to 15 bytes
        // gets whatever of it is there and an empty payload.
        quint32 status = 0;
        for (int i = 0; i < 4 && COMMAND_HEADER_SIZE + i < frame.size(); ++i)
            status |= quint32(p[COMMAND_HEADER_SIZE + i]) << (8 * i);
        commandStatus = qint32(status);
        commandData = frame.mid(RESPONSE_HEADER_SIZE);
    } else {
        commandStatus = 0;
        commandData = frame.mid(COMMAND_HEADER_SIZE);
    }
}

void CmdData::setFullData(const char* frame)
{
    if (!frame)
        throw STATUS_TCP_DATA_TOO_SMALL;
    const quint32 length = readLE32(reinterpret_cast<const unsigned char*>(frame));
    if (length < quint32(COMMAND_HEADER_SIZE))
        throw STATUS_TCP_DATA_TOO_SMALL;
    // The pointer carries no size of its own: never read past what the link
    // could ever have received.
    if (length > quint32(MAX_FRAME_SIZE))
        throw STATUS_TCP_DATA_TOO_BIG;
    setFullData(QByteArray(frame, int(length)));
}

// ---- writers --------------------------------------------------------------------

void CmdData::compactForAppend()
{
    if (m_readPos > 0) {
        commandData.remove(0, m_readPos);
        m_readPos = 0;
    }
}

void CmdData::appendLE(quint64 value, int bytes)
{
    compactForAppend();
    char tmp[8];
    for (int i = 0; i < bytes; ++i)
        tmp[i] = char((value >> (8 * i)) & 0xFF);
    commandData.append(tmp, bytes);
}

void CmdData::append_ui8(char value) { appendLE(quint8(value), 1); }
void CmdData::append_si8(signed char value) { appendLE(quint8(value), 1); }
void CmdData::append_ui16(unsigned short value) { appendLE(value, 2); }
void CmdData::append_si16(short value) { appendLE(quint16(value), 2); }
void CmdData::append_ui32(unsigned long value) { appendLE(quint32(value), 4); }
void CmdData::append_si32(long value) { appendLE(quint32(value), 4); }

void CmdData::append_f32(float value)
{
    quint32 bits;
    std::memcpy(&bits, &value, sizeof bits);
    appendLE(bits, 4);
}

void CmdData::append_f64(double value)
{
    quint64 bits;
    std::memcpy(&bits, &value, sizeof bits);
    appendLE(bits, 8);
}

void CmdData::appendBuffer(const char* data, long count)
{
    if (!data || count <= 0)
        return;
    compactForAppend();
    commandData.append(data, int(count));
}

void CmdData::appendBuffer(const QByteArray& data)
{
    compactForAppend();
    commandData.append(data);
}

void CmdData::appendString(const QString& text)
{
    append_si32(text.length());
    appendBuffer(text.toLocal8Bit());
}

void CmdData::appendString32(const QString& text)
{
    append_si32(text.length());
    for (const QChar c : text)
        append_si32(long(c.unicode()));
}

void CmdData::appendTag(const TAG_ITEM_T& tag)
{
    appendString(tag.tagID);
    appendString(tag.tagText);
}

void CmdData::appendTag32(const TAG_ITEM_T& tag)
{
    appendString(tag.tagID);
    appendString32(tag.tagText);
}

// ---- readers ----------------------------------------------------------------------

const char* CmdData::nextArg(long n)
{
    if (n > getPacketlength())
        throw STATUS_BAD_RESPONSE;
    if (n < 0)
        n = 0;
    byteArray = QByteArray(commandData.constData() + m_readPos, int(n));
    m_readPos += int(n);
    return byteArray.constData();
}

QByteArray CmdData::nextArgBuffer(long n)
{
    if (n > getPacketlength())
        throw STATUS_BAD_RESPONSE;
    if (n <= 0)
        return QByteArray();
    QByteArray out = (m_readPos == 0 && n == commandData.size())
        ? commandData
        : QByteArray(commandData.constData() + m_readPos, int(n));
    m_readPos += int(n);
    return out;
}

quint64 CmdData::takeLE(int bytes)
{
    const unsigned char* p = reinterpret_cast<const unsigned char*>(nextArg(bytes));
    quint64 value = 0;
    for (int i = 0; i < bytes; ++i)
        value |= quint64(p[i]) << (8 * i);
    return value;
}

unsigned char CmdData::nextArg_ui8() { return static_cast<unsigned char>(takeLE(1)); }
signed char CmdData::nextArg_si8() { return static_cast<signed char>(quint8(takeLE(1))); }
unsigned short CmdData::nextArg_ui16() { return static_cast<unsigned short>(takeLE(2)); }
short CmdData::nextArg_si16() { return static_cast<short>(quint16(takeLE(2))); }
unsigned int CmdData::nextArg_ui32() { return static_cast<unsigned int>(takeLE(4)); }
int CmdData::nextArg_si32() { return static_cast<int>(quint32(takeLE(4))); }

float CmdData::nextArg_f32()
{
    const quint32 bits = quint32(takeLE(4));
    float value;
    std::memcpy(&value, &bits, sizeof value);
    return value;
}

double CmdData::nextArg_f64()
{
    const quint64 bits = takeLE(8);
    double value;
    std::memcpy(&value, &bits, sizeof value);
    return value;
}

QString CmdData::nextArgString()
{
    const int count = nextArg_si32();
    return QString::fromLocal8Bit(nextArgBuffer(count));
}

QString CmdData::nextArgString32()
{
    const int count = nextArg_si32();
    if (count <= 0)
        return QString();
    if (qint64(count) * 4 > getPacketlength())
        throw STATUS_BAD_RESPONSE;
    QVector<uint> ucs4(count);
    const unsigned char* p = reinterpret_cast<const unsigned char*>(commandData.constData() + m_readPos);
    for (int i = 0; i < count; ++i)
        ucs4[i] = readLE32(p + 4 * i);
    m_readPos += count * 4;
    return QString::fromUcs4(ucs4.constData(), count);
}

TAG_ITEM_T CmdData::nextArgTag()
{
    TAG_ITEM_T tag;
    tag.tagID = nextArgString();
    tag.tagText = nextArgString();
    return tag;
}

TAG_ITEM_T CmdData::nextArgTag32()
{
    TAG_ITEM_T tag;
    tag.tagID = nextArgString();
    tag.tagText = nextArgString32();
    return tag;
}

QDateTime CmdData::nextArgTime()
{
    const unsigned char* p = reinterpret_cast<const unsigned char*>(nextArg(6));
    const QDate date(1900 + p[0], p[1] + 1, p[2]);
    const QTime time(p[3], p[4], p[5], 0);
    return QDateTime(date, time);
}

ACCELEROMETER_ORIENTATION_T CmdData::nextArgAccelerationInfo()
{
    ACCELEROMETER_ORIENTATION_T info;
    info.OrientationX = nextArg_si16();
    info.OrientationY = nextArg_si16();
    info.OrientationZ = nextArg_si16();
    info.OrientationPosition = nextArg_si16();
    info.OrientationAcceleration = nextArg_ui8();
    return info;
}

PRESSURE_SWITCH_T CmdData::nextArgPressureSwitchStatus()
{
    PRESSURE_SWITCH_T status;
    status.Switch1 = nextArg_ui8();
    status.Switch2 = nextArg_ui8();
    status.Switch3 = nextArg_ui8();
    return status;
}

SAMPLE_INFO_T CmdData::nextArgSampleInfo()
{
    SAMPLE_INFO_T info;
    info.dbIndex = nextArg_si32();
    info.timeStamp = nextArgTime();
    nextArg_f32();
    nextArg_f32();
    info.temperature = nextArg_f32();
    info.accelerationInfo = nextArgAccelerationInfo();
    info.calibrationStatus = wireEnum<CALIBRATION_STATUS_T>(nextArg_ui8(), NUM_CALIBRATION_STATUS_TYPES);
    info.pressureStatus = nextArgPressureSwitchStatus();
    return info;
}

ERROR_DESCRIPTION_T CmdData::nextArgErrorDescription()
{
    ERROR_DESCRIPTION_T error;
    error.priority = nextArg_ui8();
    error.errorID = nextArg_si16();
    error.category = nextArg_si16();
    error.time = nextArgTime();
    nextArg_si32();
    error.description = nextArgString();
    return error;
}

NETWORK_DESCRIPTION_T CmdData::nextArgNetworkDescription()
{
    NETWORK_DESCRIPTION_T network;
    network.SSID = nextArgString();
    network.MAC = nextArgString();
    network.Authentication = nextArgString();
    network.SignalLevel = nextArgString();
    network.Cell = nextArgString();
    network.Channel = nextArgString();
    network.Frequency = nextArgString();
    network.Quality = nextArg_f32();
    network.EncryptionKey = nextArg_ui8() != 0;
    network.Known = nextArg_ui8() != 0;
    network.Connected = nextArg_ui8() != 0;
    network.Priority = nextArg_si32();
    return network;
}

// ---- free functions -------------------------------------------------------------

bool isString32(const QString& text)
{
    for (const QChar c : text) {
        if (c.unicode() > 127)
            return true;
    }
    return false;
}

bool isTag32(const TAG_ITEM_T& tag)
{
    return isString32(tag.tagText);
}

void validateResponse(const CmdData& cmd, const CmdData& rsp)
{
    const bool valid = cmd.getCommandCode() == rsp.getCommandCode()
        && cmd.getTransactionID() == rsp.getTransactionID()
        && quint8(cmd.getFlags()) == 0x80
        && rsp.getFlags() == 0
        && !cmd.getIsResponse()
        && rsp.getIsResponse();
    if (!valid) {
        qDebug().noquote() << QString("Invalid response in command 0x%1").arg(hexCode(cmd.getCommandCode()));
        throw STATUS_BAD_RESPONSE;
    }
    if (rsp.getStatus() != STATUS_OK) {
        qDebug().noquote() << QString("Invalid status in command 0x%1 %2")
                                  .arg(hexCode(cmd.getCommandCode()))
                                  .arg(rsp.getStatus());
        throw STATUS_BAD_RESPONSE_STATUS;
    }
}

// ---- inbound records ------------------------------------------------------------

CommandData::CommandData()
    : connectionID(0)
{
}

CommandData::CommandData(const QUuid& id)
    : entityID(id)
    , connectionID(0)
{
}
