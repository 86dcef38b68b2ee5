#include "C2K/Publisher.h"

#include "EnumTable.h"

#include "Array.h"
#include "TextFormat.h"

#include <cmath>

namespace orvex {

namespace {
constexpr const char* kRowName = "key";
constexpr const char* kRowDictionary = "dict";
} // namespace

void Publisher::addRow(
    Dictionary& lookup, const std::string& internalKey, const std::string& row, const DictionaryRef& dict)
{
    const Value entry = Dictionary::make({{kRowName, row}, {kRowDictionary, dict}});
    if (const auto rows = lookup[internalKey].array())
        rows->append(entry);
    else
        lookup.set(internalKey, Array::make({entry}));
}

void Publisher::publish(const char* internalKey, const Value& value) const
{
    const Array* rows = _lookup ? (*_lookup)[internalKey].heldArray() : nullptr;
    if (!rows)
        return;
    for (const Value& element : *rows) {
        const Dictionary* entry = element.heldDictionary();
        Dictionary* dict = entry ? (*entry)[kRowDictionary].heldDictionary() : nullptr;
        const std::string* row = dict ? (*entry)[kRowName].string() : nullptr;
        if (!row)
            return;
        dict->set(*row, value);
    }
}

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

namespace {
constexpr EnumText kBandClasses[] = {
    {0, "800 MHz cellular band [0]"},
    {1, "1.8 to 2.0GHz PCS band [1]"},
    {2, "872 to 960MHz TACS band [2]"},
    {3, "832 to 925MHz JTACS band [3]"},
    {4, "1.75 to 1.87GHz Korean PCS band [4]"},
    {5, "450MHz band [5]"},
    {6, "2GHz band [6]"},
    {7, "700MHz band [7]"},
    {8, "1800 MHz band [8]"},
    {9, "900 MHzband [9]"}, // without the blank, as it has always been shown
    {10, "Secondary 800 MHz band [10]"},
    {11, "400 MHz European PAMR band [11]"},
    {12, "800 MHz European PAMR band [12]"},
};
} // namespace

DeferredText bandClassText(int bandClass)
{
    return textOrNumberFor(bandClass, kBandClasses, "[Bad Value %d]");
}

} // namespace orvex
