#pragma once

#include "AppPlatform.h"

#include "PortDirectory.h"

#include <memory>
#include <string>
#include <vector>

namespace orvex {

// Checks what a session needs to start, up to the first fault, with one line per step.
class Diagnosis {
public:
    struct Finding {
        bool isFault = false;
        std::string text; // one line
    };

    // The arguments must outlive the diagnosis.
    Diagnosis(const OrvexModel::Platform& platform, const PortDirectory& directory)
        : _platform(platform)
        , _directory(directory)
    {
    }
    ~Diagnosis();
    Diagnosis(const Diagnosis&) = delete;
    Diagnosis& operator=(const Diagnosis&) = delete;

    // Call once. Waits for answers as long as a session does.
    std::vector<Finding> run();
    // True if the last finding is a fault.
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
