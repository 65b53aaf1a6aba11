// libFuzzer target: arbitrary bytes as a received frame, then every reader
// of the packet in turn until the payload runs out or a read is refused.
// A refusal is a thrown STATUS_T and fine; anything else (a crash, a
// sanitizer report, a frame that doesn't survive a round trip) is a fault.

#include "Communication/CmdData.h"

#include <QByteArray>
#include <QTextCodec>

#include <cstddef>
#include <cstdint>
#include <functional>

namespace {

using Reader = std::function<void(CmdData&)>;

const Reader kReaders[] = {
    [](CmdData& c) { c.nextArg_ui8(); },
    [](CmdData& c) { c.nextArg_si8(); },
    [](CmdData& c) { c.nextArg_ui16(); },
    [](CmdData& c) { c.nextArg_si16(); },
    [](CmdData& c) { c.nextArg_ui32(); },
    [](CmdData& c) { c.nextArg_si32(); },
    [](CmdData& c) { c.nextArg_f32(); },
    [](CmdData& c) { c.nextArg_f64(); },
    [](CmdData& c) { c.nextArgBuffer(c.nextArg_si32()); },
    [](CmdData& c) { c.nextArgString(); },
    [](CmdData& c) { c.nextArgString32(); },
    [](CmdData& c) { c.nextArgTag(); },
    [](CmdData& c) { c.nextArgTag32(); },
    [](CmdData& c) { c.nextArgTime(); },
    [](CmdData& c) { c.nextArgSampleInfo(); },
    [](CmdData& c) { c.nextArgAccelerationInfo(); },
    [](CmdData& c) { c.nextArgPressureSwitchStatus(); },
    [](CmdData& c) { c.nextArgErrorDescription(); },
    [](CmdData& c) { c.nextArgNetworkDescription(); },
};
const size_t kReaderCount = sizeof kReaders / sizeof kReaders[0];

// Reads with one reader until the packet is empty or refuses.
void drain(CmdData packet, const Reader& reader)
{
    for (int guard = 0; guard < 100000 && packet.getPacketlength() > 0; ++guard) {
        try {
            reader(packet);
        } catch (unsigned int) {
            return;
        }
    }
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    static const bool codecSet = (QTextCodec::setCodecForLocale(QTextCodec::codecForName("utf8")), true);
    (void)codecSet;

    const QByteArray bytes(reinterpret_cast<const char*>(data), int(size));
    CmdData packet;
    try {
        packet.setFullData(bytes);
    } catch (unsigned int) {
        return 0;
    }

    // What parsed must go out again as it came, but for the reserved byte
    // (always written as 0) and a response too short to hold its status.
    if (!packet.getIsResponse() || size >= 16) {
        QByteArray expected = bytes;
        expected[7] = 0;
        if (packet.getFullCmd() != expected)
            __builtin_trap();
    }

    for (const Reader& reader : kReaders)
        drain(packet, reader);

    // A mixed order, chosen by the payload itself.
    CmdData mixed = packet;
    const QByteArray choices = packet.getBuffer();
    for (int i = 0; i < choices.size() && mixed.getPacketlength() > 0; ++i) {
        try {
            kReaders[uint8_t(choices[i]) % kReaderCount](mixed);
        } catch (unsigned int) {
            break;
        }
    }
    try {
        mixed.respond(0, true);
    } catch (unsigned int) {
        mixed.respond(3, false);
    }
    if (mixed.getPacketlength() != 0 || !mixed.getIsResponse())
        __builtin_trap();
    return 0;
}
