#include "Attack.h"

#include "Expectation.h"

#include "PacketText.h"
#include "PcapWriter.h"
#include "PortFrame.h"
#include "PropertyListForms.h"
#include "TelephonyConstants.h"

namespace orvex::soak {

namespace {
constexpr std::size_t kIdlePeers = 40;
constexpr long kRepetitions = 3;

std::string repeated(std::size_t count, std::string_view text)
{
    std::string result;
    while (count-- > 0)
        result += text;
    return result;
}

// Cell-monitor lists: other extra packets that cannot be read end the monitor, as they should.
HostileStream cellLists(const Bytes& list)
{
    HostileStream stream;
    while (stream.messages < kRepetitions) {
        const Bytes frame = encodedFrame({.payload = test::packet(kExtraCodeCellMonitorList, list)});
        stream.bytes.insert(stream.bytes.end(), frame.begin(), frame.end());
        ++stream.messages;
    }
    return stream;
}
} // namespace

std::vector<HostileStream> bombs()
{
    std::vector<Bytes> doublings; // each array holds the next one twice
    for (std::uint8_t next = 1; next < 40; ++next)
        doublings.push_back({0xA2, next, next});
    doublings.push_back({0x09});
    std::string keys;
    for (int i = 0; i < 20'000; ++i)
        keys += text("<key>%d</key><true/>", i << 12);
    return {cellLists(test::binaryList(doublings)),
        cellLists(test::bytesOf(test::xmlList(repeated(100'000, "<array>")))),
        cellLists(test::bytesOf(test::xmlList("<array><dict>" + keys + "</dict></array>")))};
}

std::vector<HostileStream> brokenFrames()
{
    HostileStream partial{encodedFrame({.payload = Bytes(kLargestPayload)})};
    partial.bytes.resize(std::size_t{1} << 20);
    const HostileStream partialHeader{Bytes(kFrameHeaderSize - 1)};
    const HostileStream impossibleLength{Bytes(kFrameHeaderSize, 0xFF)};
    HostileStream unknownKind{Bytes(kFrameHeaderSize)};
    unknownKind.bytes[8] = 3;
    return {partial, partialHeader, impossibleLength, unknownKind, partial};
}

std::vector<HostileStream> idlePeers()
{
    return std::vector<HostileStream>(kIdlePeers);
}

void writeLargeMessages(const std::string& capture)
{
    constexpr std::size_t kLength = 60'000;
    PcapWriter writer(capture);
    for (std::uint8_t i = 0; i < 16; ++i)
        writer.write(test::packet(0xB0C1, Bytes(kLength, i)), std::chrono::milliseconds(i));
    writer.flush();
    expect(writer.error().empty(), "a capture to play", writer.error());
}

HostilePeers::HostilePeers(const test::ProgramFolder& folder, const std::vector<HostileStream>& streams)
{
    const QString channel = QString::fromStdString(folder.ports() + '/' + telephony::kLogChannelPortName);
    for (const auto& [bytes, messages] : streams) {
        auto& peer = _peers.emplace_back(std::make_unique<QLocalSocket>());
        peer->connectToServer(channel);
        expect(peer->waitForConnected(), "the log channel takes a peer", peer->errorString().toStdString());
        peer->write(reinterpret_cast<const char*>(bytes.data()), static_cast<qint64>(bytes.size()));
        _sent += {0, messages};
    }
}

} // namespace orvex::soak
