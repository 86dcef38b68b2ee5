#include "C2K/Publisher.h"

#include "Array.h"
#include "TextFormat.h"

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
    const auto rows = _lookup ? (*_lookup)[internalKey].array() : nullptr;
    if (!rows)
        return;
    for (const Value& element : *rows) {
        const auto entry = element.dictionary();
        const auto dict = entry ? (*entry)[kRowDictionary].dictionary() : nullptr;
        const std::string* row = dict ? (*entry)[kRowName].string() : nullptr;
        if (!row)
            return;
        dict->set(*row, value);
    }
}

void Publisher::print(const char* internalKey, const char* format, ...) const
{
    std::string result;
    std::va_list arguments; // NOLINT(cppcoreguidelines-init-variables): va_start initialises it
    va_start(arguments, format);
    formatInto(result, format, arguments);
    va_end(arguments);
    publish(internalKey, result);
}

} // namespace orvex
