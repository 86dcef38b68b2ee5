#pragma once

#include "ClassIndex.h"
#include "MRLLogGenerator.h"

#include <stdexcept>

namespace orvex {

// A template with a value other than a text, an array or a dictionary. Never caught.
class InvalidTemplateException : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

// The generator of the Marlin technologies. It decodes nothing itself: a template resource lays out the
// display, a class index holds the sections, and every message is framed and routed by its log code to the
// sections that want it.
//
// The template is a dictionary of texts, arrays and dictionaries. The entry under a section's name becomes
// the section's own; what it holds is shown until the first packet. Besides the common keys the state holds
// "Template" and "TemplateName", see StateTemplate.
class MRLLogGenerator2 : public MRLLogGenerator {
public:
    // `pListName` is the base name of the template resource.
    MRLLogGenerator2(const GeneratorEnvironment& environment, std::string pListName,
        std::unique_ptr<ClassIndex> cIndexObj);
    ~MRLLogGenerator2() override;

    std::vector<PacketKind> packetKinds() const override;
    DictionaryRef getStartCommand() const override;
    void updateState(Dictionary& state, ByteView data) override;
    Value generateLogUsingState(Dictionary& state) override;
    std::string templateError(const Dictionary& state) const override;

    // Frames one message and routes it:
    //
    //   at least 13 bytes, or it is ignored
    //   0x81 in byte 0: the first 2 bytes are a prefix and are removed
    //   log type 1: routed under its code; 255: under 0xFF0000 plus its code; others are dropped
    void updateWithData(ByteView data);

    // A new display for the template, its sections bound. A value of another kind than text, array or
    // dictionary throws InvalidTemplateException.
    Value processTemplate(const Value& object);

    // The state's display. The call that has to build it first returns null; the next one returns it. A
    // display that a predecessor built from the same template is taken over, one of another technology is
    // replaced, and one that no generator made is returned as it is.
    Value getDisplayFromState(Dictionary& state);

protected:
    // Without template and class index.
    MRLLogGenerator2(const GeneratorEnvironment& environment, NeverSetUp tag)
        : MRLLogGenerator(environment, tag)
    {
    }
    bool isSetUp() const { return _cIndex != nullptr; }

private:
    void printDict(const Value& object) const;
    bool isBoundToDisplayOf(const Dictionary& state) const;
    void bindToDisplay(const Value& templateObject, const Value& display);
    void bindSection(std::string_view name, const Value& container);

    std::string _pListName;                  // empty in a generator that was never set up
    std::unique_ptr<ClassIndex> _cIndex;     // null then
    std::weak_ptr<Dictionary> _boundDisplay; // whose entries the sections write into
};

} // namespace orvex
