#pragma once

#include "FixedClock.h"
#include "FixedResources.h"
#include "InputMessages.h"
#include "OfflineSession.h"

#include <string>

namespace orvex::fuzz {

// A session as it is lived: messages of any content, a refresh now and then, at the end the tree of the
// screens and a snapshot. All log lines are made, and dropped.
class FuzzSession {
public:
    // Over the technology's own template.
    explicit FuzzSession(const std::string& technology);
    // Over another one in its place.
    FuzzSession(const std::string& technology, const DictionaryRef& skeleton);

    // Returns at the end, or where the process would have ended by design.
    void run(InputMessages messages);

private:
    void finish();

    test::FixedClock _clock;
    test::FixedResources _resources;
    OfflineSession _session;
};

} // namespace orvex::fuzz
