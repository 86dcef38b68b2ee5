#pragma once

#include "AppPlatform.h"

#include "PortDirectory.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// Goes through what the start of a session needs, step by step up to the first fault, and says in one line
// each what it finds.
class Diagnosis {
public:
    struct Finding {
        bool isFault = false;
        std::string text; // one line
    };

    // The referents outlive the diagnosis.
    Diagnosis(const OrvexModel::Platform& platform, const PortDirectory& directory)
        : _platform(platform)
        , _directory(directory)
    {
    }
    ~Diagnosis();
    Diagnosis(const Diagnosis&) = delete;
    Diagnosis& operator=(const Diagnosis&) = delete;

    // Call it once. It waits for answers up to the session's own limits.
    std::vector<Finding> run();
    // Whether the last finding is a fault.
    static bool failed(const std::vector<Finding>& findings) { return findings.back().isFault; }

private:
    Finding checkDirectory();
    Finding checkOtherMonitor();
    Finding checkService();
    Finding checkLogChannel();
    Finding checkTechnology();
    Finding checkTemplate();

    OrvexModel::Platform _platform;
    const PortDirectory& _directory;
    std::shared_ptr<LocalPort> _localPort;
    std::unique_ptr<TelephonyConnection> _service;
    std::shared_ptr<RemotePort> _remotePort;
    Value _technology;
};

} // namespace orvex
