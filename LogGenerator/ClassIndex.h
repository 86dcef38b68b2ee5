#pragma once

#include "PacketKinds.h"
#include "PacketReader.h"

#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace orvex {

class Base;

// Sections by name. Of two with the same name the later one is kept.
using ClassDictionary = std::map<std::string, Base*, std::less<>>;

// Which sections want which log code, in the order in which they subscribed.
class CodeDictionary {
public:
    using Subscribers = std::vector<Base*>;

    // A section that subscribes twice receives each packet twice.
    void subscribe(LogCode code, Base& section);
    // Null when nobody wants the code.
    const Subscribers* subscribers(LogCode code) const;
    // Every code as a decimal text, in the order of the first subscription.
    std::vector<std::string> keys() const;
    // Every code with its sections' names and the length that the first of them asks for.
    std::vector<PacketKind> packetKinds() const;

private:
    // At most about thirty codes, looked up for every packet: a linear search is as fast as a hash table.
    std::vector<LogCode> _codes;
    std::vector<Subscribers> _subscribers; // of the code at the same index
};

// The sections of one technology: creates them and finds them by name and by log code. A concrete index
// holds its sections as members. They are created, and receive a packet that several of them want, in the
// order of declaration.
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
    // What the sections decode.
    std::vector<PacketKind> packetKinds() const { return _codeDictionary.packetKinds(); }
    // Writes two diagnostic lines to the system log.
    void status() const;

protected:
    ClassDictionary _classDict;
    CodeDictionary _codeDictionary;
};

} // namespace orvex
