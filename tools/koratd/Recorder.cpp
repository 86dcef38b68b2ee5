#include "Recorder.h"

#include "Report.h"

namespace orvex::korat {

Recorder::Recorder(const std::string& path)
    : _file(std::make_unique<PcapWriter>(path))
{
    _file->flush();
    if (_file->error().empty())
        return;
    report("%s", _file->error().c_str());
    _file.reset();
}

Recorder::~Recorder()
{
    flush();
}

void Recorder::write(ByteView message, Microseconds time)
{
    if (!_file)
        return;
    if (message.size() > PcapWriter::kLongestPacket && ++_cut == 1)
        report("a message of %zu bytes is too long for the recording; only its first %zu bytes were written",
            message.size(), PcapWriter::kLongestPacket);
    _file->write(message, time);
    stopAfterError();
}

void Recorder::reportCut() const
{
    if (_cut > 0)
        report("%zu messages were cut in the recording; a replay skips them", _cut);
}

void Recorder::flush()
{
    if (!_file)
        return;
    _file->flush();
    stopAfterError();
}

void Recorder::stopAfterError()
{
    if (_file->error().empty())
        return;
    report("%s; recording ends here", _file->error().c_str());
    _file.reset();
}

} // namespace orvex::korat
