#pragma once

#include "GSM/MRL_GSMLogGenerator.h"
#include "LTE/LTELogGenerator.h"
#include "UTRAN/UTRANLogGenerator.h"

#include "C2KFixture.h"

#include "SystemLog.h"
#include "TelephonyConstants.h"

#include <charconv>
#include <functional>

namespace orvex::test {

// What takes packets of one code and writes into a container: a section, or the dispatch of CDMA2000.
struct Decoder {
    std::string name;
    LogCode code;
    // Takes a packet into the container, bound before.
    std::function<void(const Value& container, const Bytes& packet)> feed;
};

// All decoders of a technology.
class EveryDecoder {
public:
    explicit EveryDecoder(const std::string& technology)
    {
        installConsole([](std::string_view) {}); // some sections write a line for every packet
        if (technology == telephony::kTechnologyMRL_GSM)
            addSections(std::make_unique<MRL_GSMClassIndex>());
        else if (technology == telephony::kTechnologyMRL_LTE)
            addSections(std::make_unique<LTEClassIndex>());
        else if (technology == telephony::kTechnologyMRL_UTRAN2)
            addSections(std::make_unique<UTRANClassIndex>());
        else
            addCDMA2000();
    }
    ~EveryDecoder()
    {
        _index.reset();
        installConsole({});
    }
    EveryDecoder(const EveryDecoder&) = delete;
    EveryDecoder& operator=(const EveryDecoder&) = delete;

    const std::vector<Decoder>& all() const { return _decoders; }

private:
    void addSections(std::unique_ptr<ClassIndex> index)
    {
        _index = std::move(index);
        for (const std::string& key : _index->getAllLogCodes()) {
            LogCode code = 0;
            std::from_chars(key.data(), key.data() + key.size(), code);
            for (Base* section : *_index->getSubscribers(code)) {
                _decoders.push_back({section->getSectionName(), code,
                    [section, code](const Value& container, const Bytes& packet) {
                        section->updateSectionRef(container);
                        section->updateWithData(packet, code);
                    }});
            }
        }
    }

    // What decoders remember lasts for one packet: here the counters of the one before, without which no rate
    // is shown.
    void addCDMA2000()
    {
        const ArrayRef codes = (*_c2k.generator.getStartCommand())[telephony::kSetMarlinLogCodes].array();
        for (const Value& code : *codes) {
            _decoders.push_back({"CDMA2000", static_cast<LogCode>(*code.integer()),
                [this](const Value& container, const Bytes& packet) {
                    _c2k.showIn(container.dictionary());
                    for (const char* counter : {"FLDataSeqNum", "FLDataSent", "RLDataSeqNum", "RLDataSent"})
                        _c2k.state.set(counter, 0);
                    _c2k.state.remove("TrafficFER");
                    _c2k.feed(packet);
                    _c2k.log.take();
                }});
        }
    }

    C2KFixture _c2k;
    std::unique_ptr<ClassIndex> _index; // of the other technologies
    std::vector<Decoder> _decoders;
};

} // namespace orvex::test
