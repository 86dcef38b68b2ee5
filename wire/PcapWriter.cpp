#include "PcapWriter.h"

#include "OutputFile.h"

#include <pcap/pcap.h>

#include <algorithm>
#include <cerrno>
#include <cstring>

namespace orvex {

struct PcapWriter::Dump {
    explicit Dump(std::FILE* file)
        : handle(pcap_open_dead(DLT_USER0, kLongestPacket))
        , dumper(pcap_dump_fopen(handle, file))
    {
    }
    ~Dump()
    {
        pcap_dump_close(dumper);
        pcap_close(handle);
    }
    Dump(const Dump&) = delete;
    Dump& operator=(const Dump&) = delete;

    pcap_t* handle;
    pcap_dumper_t* dumper;
};

PcapWriter::PcapWriter(const std::string& path)
    : _path(path)
{
    auto [file, error] = openOutputFile(path);
    if (file)
        _dump = std::make_unique<Dump>(file.release());
    else
        _error = path + ": " + error;
}

PcapWriter::~PcapWriter() = default;

void PcapWriter::write(ByteView message, std::chrono::microseconds time)
{
    if (!_dump || !_error.empty())
        return;
    pcap_pkthdr header{};
    header.ts.tv_sec = static_cast<time_t>(time.count() / 1'000'000);
    header.ts.tv_usec = static_cast<suseconds_t>(time.count() % 1'000'000);
    header.caplen = static_cast<bpf_u_int32>(std::min(message.size(), kLongestPacket));
    header.len = static_cast<bpf_u_int32>(message.size());
    pcap_dump(reinterpret_cast<u_char*>(_dump->dumper), &header, message.data());
    if (std::ferror(pcap_dump_file(_dump->dumper)) != 0)
        _error = _path + ": " + std::strerror(errno);
}

void PcapWriter::flush()
{
    if (_dump && _error.empty() && pcap_dump_flush(_dump->dumper) != 0)
        _error = _path + ": " + std::strerror(errno);
}

} // namespace orvex
