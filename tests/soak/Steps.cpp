#include "Steps.h"

#include <utility>

namespace orvex::soak {

namespace {
using namespace std::chrono_literals;

constexpr const char* kTechnologies[] = {"MRL_GSM", "MRL_LTE", "MRL_UTRAN2", "MRL_CDMA", "IFX"};
constexpr const char* kPropertyLists = "IFX"; // the monitor ends, as it should, when they are broken
constexpr std::optional<int> kRates[] = {std::nullopt, 20, 200, 2000};
// So slow that the socket takes what comes for more than a second, however busy the monitor is: nothing waits
// inside koratd when it is killed, and what it has recorded has gone out.
constexpr int kGentleRate = 30;
constexpr auto kSleep = 2100ms; // a little more than a refresh
constexpr int kFastRate = 20'000;
constexpr int kFastMessages = 20'000;
constexpr int kFullRate = 1'000'000;
constexpr int kLargeMessages = 1000; // as many as the monitor keeps for a snapshot, or so
} // namespace

std::vector<Steps::Kind> Steps::round()
{
    std::vector<Kind> kinds = {
        {"ended", &Steps::ended},
        {"killed", &Steps::killed},
        {"died", &Steps::died},
        {"replaced", &Steps::replaced},
        {"frozen", &Steps::frozen},
        {"rested", &Steps::rested},
        {"asleep", &Steps::asleep},
        {"garbage", &Steps::garbage},
        {"flat out", &Steps::flatOut},
        {"bombed", &Steps::bombed},
        {"broken frames", &Steps::brokenFrames},
        {"idle peers", &Steps::idlePeers},
        {"absent", &Steps::absent},
        {"refused channel", &Steps::refusedChannel},
        {"null port", &Steps::nullPort},
        {"unknown technology", &Steps::unknownTechnology},
        {"no reply", &Steps::noReply},
        {"bad reply", &Steps::badReply},
    };
    for (std::size_t i = kinds.size(); i > 1; --i)
        std::swap(kinds[i - 1], kinds[below(static_cast<unsigned>(i))]);
    return kinds;
}

void Steps::take(const Kind& kind)
{
    _sent = {};
    _played.clear();
    _watch.beginStep();
    (this->*kind.take)();
}

void Steps::ended()
{
    const auto service = stream(anyScene());
    _watch.watchStream(aWhile());
    endInOrder(*service);
}

void Steps::killed()
{
    Scene scene = anyScene();
    scene.rate = kGentleRate;
    const auto service = stream(scene);
    _watch.watchStream(aWhile());
    _watch.expectLoss();
    _sent += service->kill();
    _watch.awaitLoss(_sent);
}

void Steps::died()
{
    Scene scene = anyScene();
    scene.more << "--fault" << QString("die-after=%1").arg(3 + below(3));
    const auto service = stream(scene);
    _watch.expectLoss();
    _sent += service->waitForDeath();
    _watch.awaitLoss(_sent);
}

// The next one is there before the monitor has noticed that the first has gone.
void Steps::replaced()
{
    {
        const auto first = stream(anyScene());
        _watch.watchStream(aWhile());
        _sent += first->terminate();
    }
    const auto second = stream(anyScene(), _sent.most);
    _watch.watchStream(aWhile());
    endInOrder(*second);
}

void Steps::frozen()
{
    const auto service = stream(anyScene());
    {
        const auto frozen = service->program().freezeFor(4500ms);
        _watch.watchSilence(4400ms);
    }
    _watch.watchStream(aWhile());
    endInOrder(*service);
}

// A fast stream that is over some time before its service goes.
void Steps::rested()
{
    Scene scene = anyScene();
    scene.rate = kFastRate;
    scene.more << "--count" << QString::number(kFastMessages);
    const auto service = stream(scene);
    _watch.awaitDecoded(kFastMessages);
    _watch.watchSilence(3s);
    endInOrder(*service);
}

// The service goes while the monitor stands still, and a refresh is due when it goes on.
void Steps::asleep()
{
    Scene scene = anyScene();
    scene.rate = kGentleRate;
    const auto service = stream(scene);
    _watch.watchStream(aWhile());
    {
        const auto asleep = test::freezeFor(_monitor.id(), kSleep);
        std::this_thread::sleep_for(kSleep / 2);
        _watch.expectLoss();
        _sent += service->terminate();
    }
    _watch.awaitLoss(_sent);
}

void Steps::garbage()
{
    Scene scene = anyMarlinScene();
    scene.more << "--fault" << QString("garbage=%1").arg(5 + below(91));
    const auto service = stream(scene);
    _watch.watchStream(aWhile());
    endInOrder(*service);
}

void Steps::flatOut()
{
    const std::string capture = _folder.path("large.pcap");
    writeLargeMessages(capture);
    const Scene scene{"MRL_LTE", kFullRate, std::nullopt,
        {"--replay", QString::fromStdString(capture), "--loop", "--count", QString::number(kLargeMessages)}};
    const auto service = stream(scene);
    _watch.awaitDecoded(kLargeMessages);
    endInOrder(*service);
}

void Steps::bombed()
{
    attackedBy(bombs());
}

void Steps::brokenFrames()
{
    attackedBy(soak::brokenFrames());
}

void Steps::idlePeers()
{
    attackedBy(soak::idlePeers());
}

void Steps::attackedBy(const std::vector<HostileStream>& streams)
{
    const auto service = stream(anyMarlinScene());
    const HostilePeers peers(_folder, streams);
    _watch.watchStream(aWhile());
    _sent += peers.sent();
    endInOrder(*service);
}

void Steps::absent()
{
    _played = "nothing";
    _watch.awaitRetries("Could not create KoratServerConnection");
}

void Steps::refusedChannel()
{
    Scene scene = anyScene();
    scene.more << "--fault"
               << "refuse-channel=35";
    noSession(scene, "_KoratServerConnectionNetworkMonitorCreateLogChannel returns error: 35!");
}

void Steps::nullPort()
{
    Scene scene = anyScene();
    scene.more << "--fault"
               << "null-port";
    noSession(scene, "Could not create a log channel (Korat returned null port)!");
}

void Steps::unknownTechnology()
{
    Scene scene = anyScene();
    scene.more << "--fault"
               << "unknown-technology";
    _technology.clear(); // the generator goes with the answer
    noSession(scene, "No log generator technology works");
}

void Steps::noReply()
{
    unansweredQuery("no-reply", " ***** No response to GetTechnology; cannot configure");
}

void Steps::badReply()
{
    unansweredQuery("bad-reply", " ***** Could not parse reply to GetTechnology; cannot configure");
}

// A monitor that has a generator goes on with it, so the technology had better be the same.
void Steps::unansweredQuery(const char* fault, const char* error)
{
    Scene scene = anyScene();
    scene.more << "--fault" << fault;
    if (_technology.isEmpty())
        return noSession(scene, error);
    scene.technology = _technology;
    const auto service = stream(scene);
    _watch.expectError(error);
    _watch.watchStream(aWhile());
    endInOrder(*service);
}

void Steps::noSession(const Scene& scene, const char* error)
{
    const auto service = serve(scene);
    _watch.awaitRetries(error);
    _sent += service->terminate();
    _watch.expectDecoded(_sent); // nothing, that is
}

MonitorWatch::Milliseconds Steps::aWhile()
{
    return 2500ms + MonitorWatch::Milliseconds(below(2000));
}

QString Steps::anyTechnology()
{
    return kTechnologies[below(std::size(kTechnologies))];
}

Scene Steps::anyScene()
{
    Scene scene;
    scene.technology = anyTechnology();
    scene.rate = kRates[below(std::size(kRates))];
    scene.seed = below(1'000'000);
    return scene;
}

Scene Steps::anyMarlinScene()
{
    Scene scene = anyScene();
    while (scene.technology == kPropertyLists)
        scene.technology = anyTechnology();
    return scene;
}

std::unique_ptr<ServiceProgram> Steps::serve(const Scene& scene)
{
    _played += (_played.empty() ? "" : ", then ") + scene.text();
    return std::make_unique<ServiceProgram>(_folder, scene);
}

std::unique_ptr<ServiceProgram> Steps::stream(const Scene& scene, long sentBefore)
{
    auto service = serve(scene);
    _watch.awaitUpdate(sentBefore);
    _technology = scene.technology;
    return service;
}

void Steps::endInOrder(ServiceProgram& service)
{
    _watch.expectLoss();
    _sent += service.terminate();
    _watch.awaitLoss(_sent);
}

} // namespace orvex::soak
