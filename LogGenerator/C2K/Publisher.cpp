#include "C2K/Publisher.h"

#include "Array.h"

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

} // namespace orvex
