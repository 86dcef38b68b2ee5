#pragma once

#include "Attack.h"
#include "MonitorWatch.h"
#include "ServiceProgram.h"

#include <memory>
#include <random>
#include <vector>

namespace orvex::soak {

// What koratd is put through beside an open monitor, one step after another. A step leaves no service behind,
// so that all of them start alike.
class Steps {
public:
    struct Kind {
        const char* name;
        void (Steps::*take)();
    };
    // In an order of its own at each call.
    std::vector<Kind> round();

    Steps(unsigned seed, const test::ProgramFolder& folder, MonitorProgram& monitor, MonitorWatch& watch)
        : _random(seed)
        , _folder(folder)
        , _monitor(monitor)
        , _watch(watch)
    {
    }

    void take(const Kind& kind);
    // In the last step: what was sent, and what was played, in words.
    Range sent() const { return _sent; }
    const std::string& played() const { return _played; }

private:
    // Streams that end.
    void ended();
    void killed();
    void died();
    void replaced();
    void frozen();
    void rested();
    void asleep();
    void garbage();
    // Streams beside which others attack.
    void flatOut();
    void bombed();
    void brokenFrames();
    void idlePeers();
    // Sessions that do not come about, or only just.
    void absent();
    void refusedChannel();
    void nullPort();
    void unknownTechnology();
    void noReply();
    void badReply();

    unsigned below(unsigned bound) { return static_cast<unsigned>(_random() % bound); }
    MonitorWatch::Milliseconds aWhile();
    QString anyTechnology();
    Scene anyScene();
    Scene anyMarlinScene();
    std::unique_ptr<ServiceProgram> serve(const Scene& scene);
    // Serves until the monitor shows messages, after those that were sent in this step before.
    std::unique_ptr<ServiceProgram> stream(const Scene& scene, long sentBefore = 0);
    void endInOrder(ServiceProgram& service);
    void attackedBy(const std::vector<HostileStream>& streams);
    void unansweredQuery(const char* fault, const char* error);
    void noSession(const Scene& scene, const char* error);

    std::mt19937 _random;
    const test::ProgramFolder& _folder;
    MonitorProgram& _monitor;
    MonitorWatch& _watch;

    QString _technology; // of the generator that the monitor has; empty: it has none
    Range _sent;
    std::string _played;
};

} // namespace orvex::soak
