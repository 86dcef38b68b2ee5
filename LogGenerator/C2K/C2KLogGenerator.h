#pragma once

#include "MRLLogGenerator.h"

namespace orvex {

// The generator of MRL_CDMA: 1x and EV-DO. It has no sections: the template lays out nested dictionaries
// whose texts name internal keys, "kRxAGC0" say, and one decoder per log code publishes values under those
// keys into every row that names them. A row is empty until then.
//
// Besides the common keys the state holds "Template" and "TemplateName", "Lookup" (see Publisher), and what
// decoders remember between packets. "ExtraInfo" gets the counters of the data rates.
class C2KLogGenerator final : public MRLLogGenerator {
public:
    using MRLLogGenerator::MRLLogGenerator;
    static std::unique_ptr<LogGenerator> generator(const GeneratorEnvironment& environment);

    std::vector<PacketKind> packetKinds() const override;
    DictionaryRef getStartCommand() const override;
    void updateState(Dictionary& state, ByteView data) override;
    Value generateLogUsingState(Dictionary& state) override;
    std::string templateError(const Dictionary& state) const override;

    // Lays out the display of a template: dictionaries become sections, the text "_sorted" stays, any other
    // text becomes an empty row that shows the internal key it names. Other values make no row.
    static void processTemplate(const Dictionary& skeleton, const DictionaryRef& storeDisplayIntoDict,
        Dictionary& storeLookupIntoDict);

    // The state's display, laid out first when it has none or one of another technology. Null, with a log
    // line, when there is no template.
    static Value getDisplayFromState(Dictionary& state, const Resources& resources);

    // Decodes one message, framed as MessageFrame says, and keeps its packet when its code is one of ours.
    void updateFromLog(ByteView message, const DictionaryRef& usingLookup, Dictionary& usingState);
};

} // namespace orvex
