#pragma once

#include "CodeDictionary.h"
#include "PacketReader.h"
#include "RowList.h"

#include <map>
#include <memory>
#include <string>

namespace orvex {

// Sections by their names. Of two sections with one name the later is kept.
using ClassDictionary = std::map<std::string, Base*, std::less<>>;

// A section of the display: takes the packets of its log codes and writes rows into its own place in the
// display dictionary. That place, its sectionRef, is a dictionary of rows or an array of row dictionaries, as
// the technology's template has it. It belongs to the display: the section holds it weakly, and what is
// written while nothing, or a container of the other kind, is bound is dropped.
class Base {
public:
    virtual ~Base() = default;
    Base(const Base&) = delete;
    Base& operator=(const Base&) = delete;

    // The key of this section's entry in the template.
    const std::string& getSectionName() const { return _sectionName; }
    std::vector<LogCode> getLogCodeArray() const { return _logCodes; }

    // Decodes one packet into rows.
    virtual void updateWithData(Packet packet, LogCode logCode) = 0;

    // Binds the section to its container.
    void updateSectionRef(const Value& container);

    // Arrays of the display change only through these two and RowList, which all take the array lock. A null
    // array is left alone.
    static void clearElementsInArray(const ArrayRef& array);
    static void replaceArray(const ArrayRef& array, const Array& with);

    // Ec/No in whole dB of a linear energy ratio in which 2^19 stands for 0 dB. The bands at both ends are
    // peculiar: full scale and above yield 0, the two lowest bands both -31, and below 706 it is 0 again.
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
