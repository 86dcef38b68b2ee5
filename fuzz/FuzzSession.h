#pragma once

#include "FixedClock.h"
#include "FixedResources.h"
#include "InputMessages.h"
#include "OfflineSession.h"

#include <string>

namespace orvex::fuzz {

// A session over messages of any content, with refreshes, that ends with its tree and snapshot. Log lines are
// formatted and dropped.
class FuzzSession {
public:
    // Uses the technology's own template.
    explicit FuzzSession(const std::string& technology);
    // Uses another template instead.
    FuzzSession(const std::string& technology, const DictionaryRef& skeleton);

    // Takes all messages, or those up to one that ends the process by design.
    void run(InputMessages messages);

    // Single steps. False when the process would have ended by design; no other step may follow.
    bool take(ByteView message);
    bool refresh();
    // Builds the tree and writes a snapshot. Reading both again takes twice as long as all the rest.
    enum class Ending { written, readAgain };
    void finish(Ending ending);

private:
    test::FixedClock _clock;
    test::FixedResources _resources;
    OfflineSession _session;
};

} // namespace orvex::fuzz
