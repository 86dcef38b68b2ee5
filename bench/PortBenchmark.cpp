// Measures the message port, from a sending process to the decoded message: throughput with a sender that
// never pauses, with and without decoding, and latency when idle.

#include "Benchmarks.h"
#include "ChildProcess.h"

#include "SocketMessagePorts.h"

#include "Array.h"
#include "TelephonyConstants.h"

#include <benchmark/benchmark.h>

#include <QCoreApplication>
#include <QEventLoop>
#include <QTemporaryDir>
#include <QTimer>

#include <algorithm>
#include <array>
#include <bit>
#include <cstdlib>
#include <cstring>
#include <thread>

namespace orvex::bench {
namespace {

using namespace std::chrono_literals;
using Nanoseconds = std::chrono::nanoseconds;

constexpr const char* kPortName = "org.orvex.Bench";
constexpr auto kLongestWait = std::chrono::seconds(60);

// The message sent: a log packet of 100 bytes with three LTE neighbours. Its time field holds the time of
// sending, on a clock shared by both processes.
constexpr std::size_t kPortMessageSize = 100;
constexpr std::size_t kPortMessageTime = 5; // 8 bytes, native order
constexpr std::size_t kPortMessageNeighbors = 3;

Bytes portMessage()
{
    constexpr std::array<std::uint8_t, 21> kBeginning = {1, kPortMessageSize - 1, 0, 0x80, 0xB1, 0, 0, 0, 0,
        0, 0, 0,
        0, // end of the header
        3, 0, 0, 0, 0x9C, 0x18, (kPortMessageNeighbors - 1) << 6, 0};
    Bytes message(kPortMessageSize, 0x55);
    std::ranges::copy(kBeginning, message.begin());
    return message;
}

std::chrono::steady_clock::rep portTime()
{
    return std::chrono::steady_clock::now().time_since_epoch().count();
}

// When a message was sent and decoded.
struct Trip {
    Nanoseconds sent;
    Nanoseconds decoded;
};

// The receiving application: a port, a generator and a record of every message.
class Receiver {
public:
    explicit Receiver(std::size_t count, bool decodes = true)
        : _count(count)
        , _decodes(decodes)
    {
        _trips.reserve(count);
    }

    // Starts a sender and receives its messages. Empty unless all of them arrived whole.
    const std::vector<Trip>& run(std::chrono::microseconds pause)
    {
        const std::string directory = _directory.filePath("ports").toStdString();
        SocketMessagePorts ports(directory);
        const auto port =
            ports.createLocalPort(kPortName, [this](std::int32_t, ByteView message) -> std::optional<Bytes> {
                take(message);
                return std::nullopt;
            });
        ChildProcess sender({"/proc/self/exe", kPortSender, directory, kPortName, std::to_string(_count),
            std::to_string(pause.count())});
        QTimer::singleShot(kLongestWait, &_loop, &QEventLoop::quit);
        _loop.exec();
        if (!sender.waitForEnd().isGood || !isWhole())
            _trips.clear();
        return _trips;
    }

private:
    void take(ByteView message)
    {
        if (_decodes)
            _generator->updateState(*_state, message);
        Nanoseconds::rep sent = 0;
        std::memcpy(&sent, message.data() + kPortMessageTime, sizeof sent);
        _trips.push_back({Nanoseconds(sent), Nanoseconds(portTime())});
        if (_trips.size() % kRefreshEvery == 0)
            _generator->generateLogUsingState(*_state);
        if (_trips.size() == _count)
            _loop.quit();
    }

    bool isWhole() const
    {
        if (!_decodes)
            return _trips.size() == _count;
        const auto display = (*_state)["Display"].dictionary();
        const auto list = display ? (*display)["Neighbor Cells List"].array() : nullptr;
        return _trips.size() == _count && list && list->size() == kPortMessageNeighbors;
    }

    // As often as a session would at this rate.
    static constexpr std::size_t kRefreshEvery = 400'000;

    std::size_t _count;
    bool _decodes;
    QTemporaryDir _directory;
    QEventLoop _loop;
    std::unique_ptr<LogGenerator> _generator = makeGenerator(telephony::kTechnologyMRL_LTE);
    DictionaryRef _state = Dictionary::make();
    std::vector<Trip> _trips;
};

double seconds(Nanoseconds time)
{
    return std::chrono::duration<double>(time).count();
}

void portThroughput(benchmark::State& state, bool decodes)
{
    constexpr std::size_t kCount = 400'000;
    for (auto _ : state) {
        Receiver receiver(kCount, decodes);
        const auto& trips = receiver.run(std::chrono::microseconds(0));
        if (trips.empty())
            return state.SkipWithError("messages were lost");
        const double time = seconds(trips.back().decoded - trips.front().decoded);
        state.SetIterationTime(time);
        state.counters["messages/s"] = kCount / time;
    }
}

void portLatency(benchmark::State& state)
{
    constexpr std::size_t kCount = 1000;
    for (auto _ : state) {
        Receiver receiver(kCount);
        std::vector<Nanoseconds> times;
        for (const Trip& trip : receiver.run(std::chrono::milliseconds(2)))
            times.push_back(trip.decoded - trip.sent);
        if (times.empty())
            return state.SkipWithError("messages were lost");
        std::ranges::sort(times);
        state.SetIterationTime(seconds(times[kCount / 2]));
        state.counters["slowest 1 % µs"] = seconds(times[kCount / 100 * 99]) * 1e6;
    }
}

bool send(RemotePort& port, Bytes& message)
{
    const auto time = std::bit_cast<std::array<std::uint8_t, 8>>(portTime());
    std::ranges::copy(time, message.begin() + kPortMessageTime);
    return port.send(0, message, 5s) == RemotePort::Status::success;
}
} // namespace

int sendToPort(int argc, char** argv)
{
    if (argc != 6)
        return 2;
    const QCoreApplication application(argc, argv);
    SocketMessagePorts ports(argv[2]);
    const auto port = ports.createRemotePort(argv[3]);
    if (!port)
        return EXIT_FAILURE;
    const std::chrono::microseconds pause(std::atoi(argv[5]));
    Bytes message = portMessage();
    for (int left = std::atoi(argv[4]); left > 0; --left) {
        if (pause > 0us)
            std::this_thread::sleep_for(pause);
        if (!send(*port, message))
            return EXIT_FAILURE;
    }
    while (port->pendingBytes() > 0 && port->isValid())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    return EXIT_SUCCESS;
}

void registerPorts()
{
    for (const bool decodes : {true, false})
        benchmark::RegisterBenchmark(decodes ? "port/decoded" : "port/alone", portThroughput, decodes)
            ->Unit(benchmark::kMillisecond)
            ->UseManualTime()
            ->Iterations(1);
    benchmark::RegisterBenchmark("port/idle", portLatency)
        ->Unit(benchmark::kMicrosecond)
        ->UseManualTime()
        ->Iterations(1);
}

} // namespace orvex::bench
