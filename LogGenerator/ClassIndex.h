#pragma once

#include "Base.h"

namespace orvex {

// The sections of one technology: creates them, finds them by name and by log code. A concrete index holds
// its sections as members, declared in their order of creation, which is also the order in which a packet
// wanted by several reaches them.
class ClassIndex {
public:
    ClassIndex() = default;
    virtual ~ClassIndex();
    ClassIndex(const ClassIndex&) = delete;
    ClassIndex& operator=(const ClassIndex&) = delete;

    // The section of that name; null when there is none.
    Base* getClass(std::string_view sectionName) const;
    // Null when nobody wants the code.
    const CodeDictionary::Subscribers* getSubscribers(LogCode code) const;
    // Every wanted code as a decimal text.
    std::vector<std::string> getAllLogCodes() const;
    // Two lines of diagnosis in the system log.
    void status() const;

protected:
    ClassDictionary _classDict;
    CodeDictionary _codeDictionary;
};

} // namespace orvex
