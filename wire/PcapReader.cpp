#include "PcapReader.h"

#include "TextFormat.h"

#include <pcap/pcap.h>

#include <array>

namespace orvex {

struct PcapReader::Pcap {
    explicit Pcap(pcap_t* opened)
        : handle(opened)
    {
    }
    ~Pcap() { pcap_close(handle); }
    Pcap(const Pcap&) = delete;
    Pcap& operator=(const Pcap&) = delete;

    pcap_t* handle;
};

PcapReader::PcapReader(const std::string& path, std::unique_ptr<CaptureFile> file)
    : CaptureReader(path)
    , _file(std::move(file))
{
    std::FILE* stream = _file->openStream();
    if (!stream) {
        fail(_file->error());
        return;
    }
    std::array<char, PCAP_ERRBUF_SIZE> reason{};
    pcap_t* opened =
        pcap_fopen_offline_with_tstamp_precision(stream, PCAP_TSTAMP_PRECISION_MICRO, reason.data());
    if (!opened) {
        std::fclose(stream);
        fail(_file->error().empty() ? std::string("not a pcap file: ") + reason.data() : _file->error());
        return;
    }
    _pcap = std::make_unique<Pcap>(opened);
    if (pcap_datalink(opened) != DLT_USER0) {
        fail(text("its link type is %d; log messages have %d (USER0)", pcap_datalink(opened), DLT_USER0));
        _pcap.reset();
    }
}

PcapReader::~PcapReader() = default;

CaptureReader::Status PcapReader::next()
{
    if (!_pcap)
        return Status::broken;
    for (;;) {
        pcap_pkthdr* header = nullptr;
        const u_char* bytes = nullptr;
        const int result = pcap_next_ex(_pcap->handle, &header, &bytes);
        if (result != 1 && !_file->error().empty())
            return fail(_file->error());
        if (result == PCAP_ERROR_BREAK)
            return Status::end;
        if (result != 1)
            return fail(pcap_geterr(_pcap->handle));
        if (header->caplen < header->len) {
            ++_incompletePackets;
            continue;
        }
        return yield(ByteView(bytes, header->caplen),
            std::chrono::seconds(header->ts.tv_sec) + std::chrono::microseconds(header->ts.tv_usec));
    }
}

std::string PcapReader::omissions() const
{
    if (_incompletePackets == 0)
        return {};
    return text("%zu packets hold only the beginning of their message and were left out", _incompletePackets);
}

} // namespace orvex
