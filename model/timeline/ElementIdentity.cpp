#include "ElementIdentity.h"

#include "Array.h"

#include <algorithm>
#include <iterator>

namespace orvex {

namespace {

// A row that identifies. Sections have several names for the same thing, which have one label, so that a cell
// has the same key wherever it is shown.
struct IdentifyingRow {
    std::string_view name;
    std::string_view label;
};

// In the order in which they make a key. The channel stands behind the cell, because a text cut short should
// still tell cells apart.
constexpr IdentifyingRow kIdentifyingRows[] = {
    // cells
    {"Physical Cell ID", "Physical Cell ID"},
    {"Cell ID", "Cell ID"},
    {"Scrambling Code", "Scrambling Code"},
    {"PSC", "Scrambling Code"},
    {"Cell Parameter ID", "Cell Parameter ID"},
    {"BSIC", "BSIC"},
    {"BSIC ID", "BSIC"},
    {"Base Station ID", "Base Station ID"},
    {"Pilot", "Pilot"},
    {"PN Offset", "PN Offset"},
    // their channels
    {"E-ARFCN", "E-ARFCN"},
    {"E ARFCN", "E-ARFCN"},
    {"EARFCN", "E-ARFCN"},
    {"NR-ARFCN", "NR-ARFCN"},
    {"UARFCN", "UARFCN"},
    {"U ARFCN", "UARFCN"},
    {"Downlink Frequency", "UARFCN"},
    {"ARFCN", "ARFCN"},
    {"Carrier", "Carrier"},
    {"Channel", "Channel"},
    {"Band", "Band"},
    // contexts, channels and processes
    {"Context ID", "Context ID"},
    {"Process ID", "Process ID"},
    {"Transport Channel ID", "Transport Channel ID"},
    {"TRCH ID", "TRCH ID"},
    {"CCTRCH ID", "CCTRCH ID"},
    {"TSNUM", "TSNUM"},
    // networks
    {"Mobile Country Code", "Mobile Country Code"},
    {"Mobile Network Code", "Mobile Network Code"},
};

struct SharedEntry {
    std::string_view list;
    SharedIdentity identity;
};

struct NamedEntry {
    std::string_view dictionary;
    const char* name;
};
constexpr NamedEntry kDictionariesOfElements[] = {
    {"/1x Active Set/Pilots", "Pilot"},
    {"/EV-DO Active Set/Pilots", "Pilot"},
    {"/EV-DO Fingers/Carrier to Interference", "Pilot"},
};

const Dictionary::Entry& entryAt(const Dictionary& dictionary, std::size_t place)
{
    return *std::next(dictionary.begin(), static_cast<std::ptrdiff_t>(place));
}

} // namespace

ElementIdentity::ElementIdentity(const Value& element)
{
    const Dictionary* dictionary = element.heldDictionary();
    if (!dictionary)
        return;
    _size = dictionary->size();
    readRows(*dictionary);
    // {Context = {Context ID = 5; …}; Name Servers = (…); }
    for (std::size_t place = 0; _rows.empty() && place < dictionary->size(); ++place) {
        const auto& [key, value] = entryAt(*dictionary, place);
        if (const Dictionary* inner = value.heldDictionary()) {
            _inner = place;
            _innerKey = key;
            readRows(*inner);
        }
    }
    std::ranges::sort(_rows, {}, &Row::rank);
}

void ElementIdentity::readRows(const Dictionary& dictionary)
{
    std::size_t place = 0;
    for (const auto& [key, value] : dictionary) {
        const auto* known = std::ranges::find(kIdentifyingRows, key, &IdentifyingRow::name);
        if (known != std::end(kIdentifyingRows)) {
            if (const std::string* text = value.string(); text && !text->empty())
                _rows.push_back({place, known->name, *text,
                    static_cast<std::size_t>(known - std::begin(kIdentifyingRows))});
        }
        ++place;
    }
}

bool ElementIdentity::isStillOf(const Value& element) const
{
    const Dictionary* dictionary = element.heldDictionary();
    if (!dictionary)
        return !_size;
    if (_size != dictionary->size())
        return false;
    if (_rows.empty())
        return ElementIdentity(element)._rows.empty();
    if (_inner) {
        const auto& [key, value] = entryAt(*dictionary, *_inner);
        dictionary = key == _innerKey ? value.heldDictionary() : nullptr;
    }
    return dictionary && std::ranges::all_of(_rows, [&](const Row& row) {
        if (row.place >= dictionary->size())
            return false;
        const auto& [key, value] = entryAt(*dictionary, row.place);
        const std::string* text = value.string();
        return key == row.key && text && *text == row.text;
    });
}

std::string ElementIdentity::text() const
{
    std::string result;
    for (const Row& row : _rows)
        result.append(result.empty() ? "" : ", ")
            .append(kIdentifyingRows[row.rank].label)
            .append(" ")
            .append(row.text);
    return result;
}

const SharedIdentity* sharedIdentityOfList(std::string_view path)
{
    static const SharedEntry kEntries[] = {
        {"/Neighbor Cells List", {{"Neighbor Measurements", "E-ARFCN"}, "E-ARFCN"}},
        {"/Measured Neighbor Cells",
            {{"Connected mode LTE Intra-frequency Measurement", "E-ARFCN"}, "E-ARFCN"}},
        {"/Detected Cells", {{"Connected mode LTE Intra-frequency Measurement", "E-ARFCN"}, "E-ARFCN"}},
        {"/Serving/Active Set", {{"Serving", "UMTS RR Info", "Downlink Frequency"}, "UARFCN"}},
    };
    const auto* entry = std::ranges::find(kEntries, path, &SharedEntry::list);
    return entry == std::end(kEntries) ? nullptr : &entry->identity;
}

const std::string* textOf(const SharedIdentity& identity, const Value& display)
{
    const Value* value = &display;
    for (const char* key : identity.path) {
        const Dictionary* dictionary = value->heldDictionary();
        if (!dictionary)
            return nullptr;
        value = &(*dictionary)[key];
    }
    const std::string* text = value->string();
    return text && !text->empty() ? text : nullptr;
}

const char* elementNameOfDictionary(std::string_view path)
{
    const auto* entry = std::ranges::find(kDictionariesOfElements, path, &NamedEntry::dictionary);
    return entry == std::end(kDictionariesOfElements) ? nullptr : entry->name;
}

} // namespace orvex
