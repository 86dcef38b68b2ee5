#pragma once

#include "FixedClock.h"
#include "FixedResources.h"
#include "InputMessages.h"
#include "OfflineSession.h"

#include <string>

namespace orvex::fuzz {

// A session as it is lived: messages of any content, a refresh now and then, at the end all that is made of
// it. All log lines are made, and dropped.
class FuzzSession {
public:
    // Over the technology's own template.
    explicit FuzzSession(const std::string& technology);
    // Over another one in its place.
    FuzzSession(const std::string& technology, const DictionaryRef& skeleton);

    // Returns at the end, or where the process would have ended by design.
    void run(InputMessages messages);

    // The steps of a session that is not one run. False where the process would have ended by design: no
    // other step may follow.
    bool take(ByteView message);
    bool refresh();
    // Makes the tree of the screens and a snapshot. To read again what was written takes twice as long as all
    // the rest.
    enum class Ending { written, readAgain };
    void finish(Ending ending);

private:
    test::FixedClock _clock;
    test::FixedResources _resources;
    OfflineSession _session;
};

} // namespace orvex::fuzz
