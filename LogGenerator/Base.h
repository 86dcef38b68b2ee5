#pragma once

#include "Bound.h"
#include "CodeDictionary.h"
#include "PacketReader.h"
#include "RowList.h"

#include "ArrayLock.h"

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

    // Arrays bound to sections change only through these two and refillSection(), which take the array lock.
    static void clearElementsInArray(Array& array);
    static void replaceArray(Array& array, const Array& with);

    // Ec/No in whole dB of a linear energy ratio in which 2^19 stands for 0 dB. The bands at both ends are
    // peculiar: full scale and above yield 0, the two lowest bands both -31, and below 706 it is 0 again.
    static std::int16_t lookUpECNO(std::uint32_t ratio);

protected:
    // Registers the section under its name and for its log codes.
    Base(std::string sectionName, std::vector<LogCode> logCodes, ClassDictionary& dict,
        CodeDictionary& codeDict);

    // The bound dictionary, to write into; a writer over nothing while none is bound.
    RowWriter rows() const { return RowWriter(_sectionRef.dictionary.get()); }
    // The bound array; null while none is bound.
    Array* array() const { return _sectionRef.array.get(); }
    // The two array operations on the bound array, if there is one.
    void clearSection() const;
    void replaceSection(const Array& with) const;
    // Fills the bound array anew, under the array lock: fill(RowList&).
    template <typename Filler>
    void fillSection(Filler fill) const
    {
        const ArrayLockScope lock;
        RowList list(array());
        fill(list);
    }
    // The same with one row dictionary a record, written by print(RowWriter&, record).
    template <typename Records, typename Printer>
    void refillSection(const Records& records, Printer print) const
    {
        fillSection([&](RowList& list) { printRecords(list, records, print); });
    }
    // A new array of such dictionaries, to be set as a row.
    template <typename Records, typename Printer>
    static ArrayRef listOf(const Records& records, Printer print)
    {
        auto result = Array::make();
        RowList list(result.get());
        printRecords(list, records, print);
        return result;
    }

    // "Received an unknown log message: %d"
    static void reportUnknown(LogCode logCode);

private:
    template <typename Records, typename Printer>
    static void printRecords(RowList& list, const Records& records, Printer print)
    {
        for (const auto& record : records)
            print(list.next(), record);
    }
    void updateLogCodeDict(CodeDictionary& codeDict);

    std::string _sectionName;
    std::vector<LogCode> _logCodes;
    struct {
        Bound<Dictionary> dictionary;
        Bound<Array> array;
    } _sectionRef; // one of the two, or neither
};

} // namespace orvex
