#include "CaptureReader.h"

#include "DlfReader.h"
#include "PcapReader.h"

#include <algorithm>
#include <array>

namespace orvex {

namespace {

// Stands for a capture that could not be opened.
class NoCapture final : public CaptureReader {
public:
    NoCapture(const std::string& path, const std::string& reason)
        : CaptureReader(path)
    {
        fail(reason);
    }

    Status next() override { return Status::broken; }
    std::string omissions() const override { return {}; }
};

// Magic numbers of pcap (micro- and nanoseconds, both byte orders) and pcapng, all of which libpcap reads.
bool isPcapMagic(const std::array<unsigned char, 4>& bytes)
{
    static constexpr std::array<unsigned char, 4> kMagics[] = {{0xA1, 0xB2, 0xC3, 0xD4},
        {0xD4, 0xC3, 0xB2, 0xA1}, {0xA1, 0xB2, 0x3C, 0x4D}, {0x4D, 0x3C, 0xB2, 0xA1},
        {0x0A, 0x0D, 0x0D, 0x0A}};
    return std::ranges::find(kMagics, bytes) != std::end(kMagics);
}

std::unique_ptr<CaptureReader> openFile(const std::string& path, std::unique_ptr<CaptureFile> file)
{
    std::array<unsigned char, 4> magic{};
    file->peekAt(0, magic);
    if (!file->isOpen())
        return std::make_unique<NoCapture>(path, file->error());
    if (isPcapMagic(magic))
        return std::make_unique<PcapReader>(path, std::move(file));
    return std::make_unique<DlfReader>(path, std::move(file));
}

} // namespace

std::unique_ptr<CaptureReader> CaptureReader::open(const std::string& path)
{
    return openFile(path, std::make_unique<CaptureFile>(path));
}

std::unique_ptr<CaptureReader> CaptureReader::openStandardInput()
{
    return openFile("standard input", CaptureFile::standardInput());
}

} // namespace orvex
