#pragma once

#include "ClassIndex.h"
#include "PacketReader.h"
#include "RowWriter.h"

#include <map>
#include <memory>
#include <string>

namespace orvex {

// A section of the display: decodes the packets of its log codes and writes rows into its own entry of the
// display dictionary. That entry, its sectionRef, is a dictionary of rows or an array of row dictionaries,
// as the technology's template has it. The display owns it; the section holds it weakly, and drops its rows
// while nothing, or a container of the other kind, is bound.
class Base {
public:
    virtual ~Base() = default;
    Base(const Base&) = delete;
    Base& operator=(const Base&) = delete;

    // The key of this section's entry in the template.
    const std::string& getSectionName() const { return _sectionName; }
    std::vector<LogCode> getLogCodeArray() const { return _logCodes; }

    // Of a packet with this code; a shorter one changes nothing.
    virtual std::size_t minimumLength(LogCode /*logCode*/) const { return 0; }
    // Decodes one packet into rows.
    virtual void updateWithData(Packet packet, LogCode logCode) = 0;

    // Binds the section to its container.
    void updateSectionRef(const Value& container);

    // Arrays of the display change only through these two and RowList, which all take the array lock. A null
    // array is left alone.
    static void clearElementsInArray(const ArrayRef& array);
    static void replaceArray(const ArrayRef& array, const Array& with);

    // Ec/No in whole dB from a linear energy ratio; 2^19 is 0 dB. Both ends are odd: full scale and above
    // give 0, the two lowest bands both give -31, and anything below 706 gives 0 again.
    static std::int16_t lookUpECNO(std::uint32_t ratio);

protected:
    // Registers the section under its name and for its log codes.
    Base(std::string sectionName, std::vector<LogCode> logCodes, ClassDictionary& dict,
        CodeDictionary& codeDict);

    // Writes into the bound dictionary; drops everything while none is bound.
    RowWriter rows() const { return RowWriter(_dictionary.lock()); }
    // The bound array; null while none is bound.
    ArrayRef array() const { return _array.lock(); }

    // "Received an unknown log message: %d"
    static void reportUnknown(LogCode logCode);

private:
    void updateLogCodeDict(CodeDictionary& codeDict);

    std::string _sectionName;
    std::vector<LogCode> _logCodes;
    // The sectionRef: one of the two, or neither.
    std::weak_ptr<Dictionary> _dictionary;
    std::weak_ptr<Array> _array;
};

} // namespace orvex
