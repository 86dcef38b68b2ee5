#include "C2K/PilotList.h"

#include "TextFormat.h"

#include <cmath>

namespace orvex {

namespace {
constexpr const char* kSorted = "_sorted"; // the mark of a sorted dictionary: key and value alike
} // namespace

PilotList::PilotList()
    : _rows(Dictionary::make({{kSorted, kSorted}}))
{
}

void PilotList::add(int index, int pn, DeferredText content)
{
    _rows->set(std::to_string(index) + ';' + std::to_string(pn), content);
    _isEmpty = false;
}

Value PilotList::rowsOrNone() const
{
    return _isEmpty ? Value("(none)") : Value(_rows);
}

std::string decibelText(double ratio)
{
    return text("%+.2f dB", 10 * std::log10(ratio));
}

} // namespace orvex
