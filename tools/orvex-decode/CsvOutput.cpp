#include "CsvOutput.h"

#include <utility>

namespace orvex {

CsvOutput::CsvOutput(std::string path, std::string& error)
    : _path(std::move(path))
    , _file(_path)
{
    if (error.empty() && !_file.error().empty())
        error = _path + ": " + _file.error();
}

void CsvOutput::begin(const DecodedCapture& /*capture*/)
{
    _csv.emplace(_file.stream());
}

std::string CsvOutput::end(const DecodedCapture& /*capture*/)
{
    const std::string error = _file.commit();
    return error.empty() ? error : _path + ": " + error;
}

} // namespace orvex
