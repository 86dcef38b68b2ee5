#include "Diagnosis.h"

#include "PropertyList.h"
#include "TelephonyConstants.h"
#include "VisibleText.h"

#include "Dictionary.h"

namespace orvex {

namespace {

using namespace std::chrono_literals;
using Finding = Diagnosis::Finding;

constexpr auto kAnswerTimeout = 1s;

Finding fine(std::string text)
{
    return {false, std::move(text)};
}

Finding fault(std::string text)
{
    return {true, std::move(text)};
}

std::string knownTechnologies()
{
    std::string result;
    for (const char* technology : telephony::kTechnologies)
        result += (result.empty() ? "" : ", ") + std::string(technology);
    return result;
}

} // namespace

Diagnosis::~Diagnosis()
{
    if (_remotePort)
        _remotePort->invalidate();
    if (_localPort)
        _localPort->invalidate();
}

std::vector<Finding> Diagnosis::run()
{
    using Check = Finding (Diagnosis::*)();
    constexpr Check kChecks[] = {&Diagnosis::checkDirectory, &Diagnosis::checkOtherMonitor,
        &Diagnosis::checkService, &Diagnosis::checkLogChannel, &Diagnosis::checkTechnology,
        &Diagnosis::checkTemplate};
    std::vector<Finding> findings;
    for (const Check check : kChecks) {
        findings.push_back((this->*check)());
        if (findings.back().isFault)
            break;
    }
    return findings;
}

Finding Diagnosis::checkDirectory()
{
    const std::string path = "The port directory " + visibleText(_directory.path());
    const std::string why = _directory.fault();
    return why.empty() ? fine(path + " is open to no other user.")
                       : fault(path + " cannot be used: " + why + '.');
}

Finding Diagnosis::checkOtherMonitor()
{
    auto local = _platform.ports.createLocalPort(
        telephony::kLogChannelPortName, [](auto&&...) { return std::nullopt; });
    if (!local.port)
        return fault("The socket of the log channel cannot be created; the system log says why.");
    _localPort = std::move(local.port);
    if (local.alreadyExisted)
        return fault("Another monitor is running and has the log channel.");
    return fine("No other monitor has the log channel.");
}

Finding Diagnosis::checkService()
{
    _service = _platform.telephony.connect({});
    const std::string name = telephony::kServicePortName;
    if (!_service)
        return fault("The telephony service is not running: nobody listens at " + name + '.');
    return fine("The telephony service listens at " + name + '.');
}

Finding Diagnosis::checkLogChannel()
{
    const auto reply = _service->createNetworkMonitorLogChannel(telephony::kLogChannelPortName);
    if (!reply.failure.empty())
        return fault("The telephony service could not be asked for a log channel: " + reply.failure + '.');
    if (reply.errorCode != 0)
        return fault(
            "The telephony service refuses a log channel: error " + std::to_string(reply.errorCode) + '.');
    const std::string name = reply.remotePortName.value_or("");
    if (name.empty())
        return fault("The telephony service grants a log channel but names no port for it.");
    _remotePort = _platform.ports.createRemotePort(name);
    if (!_remotePort)
        return fault(
            "Nobody listens at the port that the telephony service names, " + visibleText(name) + '.');
    return fine("The telephony service grants a log channel.");
}

Finding Diagnosis::checkTechnology()
{
    const auto query =
        propertyListXML(Dictionary::make({{telephony::kGetTechnology, telephony::kGetTechnology}}));
    const auto sent =
        _remotePort->request(telephony::kLogChannelMessageId, *query, kAnswerTimeout, kAnswerTimeout);
    if (sent.status != RemotePort::Status::success)
        return fault("The telephony service does not take the question for its technology.");
    if (!sent.reply)
        return fault("The telephony service does not answer the question for its technology.");
    const auto reply = propertyListFromData(*sent.reply);
    const auto answers = reply.value ? reply.value->dictionary() : nullptr;
    if (!answers || !answers->contains(telephony::kGetTechnology))
        return fault("The telephony service gives a strange answer to the question for its technology.");
    _technology = (*answers)[telephony::kGetTechnology];
    const std::string name = _technology.string() ? visibleText(*_technology.string()) : "(not a text)";
    if (!LogGenerator::generatorFromTechnology(_technology, _platform.generators))
        return fault("The telephony service names the technology " + name
            + ", which Orvex does not know. It knows " + knownTechnologies() + '.');
    return fine("The technology is " + name + '.');
}

Finding Diagnosis::checkTemplate()
{
    const auto generator = LogGenerator::generatorFromTechnology(_technology, _platform.generators);
    const std::string error = generator->templateError({});
    return error.empty() ? fine("Its template can be read. A session comes up.") : fault(error);
}

} // namespace orvex
