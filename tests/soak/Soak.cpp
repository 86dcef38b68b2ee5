#include "Soak.h"

#include "Expectation.h"

#include <algorithm>
#include <cstdio>

namespace orvex::soak {

namespace {
// How far the figures may rise from the first third of the steps to the last. The monitor keeps the packets
// of its last refreshes, so its memory follows the rates; the sanitizers take their share.
#ifdef __SANITIZE_ADDRESS__
constexpr double kMoreMegabytes = 150;
#else
constexpr double kMoreMegabytes = 16;
#endif
constexpr ProcessFigures kMargins{.descriptors = 0, .megabytes = kMoreMegabytes, .threads = 0};
constexpr std::ptrdiff_t kWarmUp = 1;   // steps
constexpr std::size_t kFewestSteps = 3; // the warm-up and two that can be compared
} // namespace

Soak::Soak(unsigned seed, std::chrono::milliseconds slack)
    : _monitor(_folder)
    , _watch(_monitor, slack)
    , _steps(seed, _folder, _monitor, _watch)
{
    _watch.awaitLaunch();
}

void Soak::runFor(std::chrono::seconds time)
{
    const qint64 end = _monitor.now() + std::chrono::milliseconds(time).count();
    const auto goesOn = [&] { return _monitor.now() < end || _figures.size() < kFewestSteps; };
    while (goesOn()) {
        for (const Steps::Kind& kind : _steps.round()) {
            if (goesOn())
                take(kind);
        }
    }
}

void Soak::take(const Steps::Kind& kind)
{
    std::printf("%3zu  %-18s  ", _figures.size() + 1, kind.name);
    std::fflush(stdout);
    const qint64 start = _monitor.now();
    _steps.take(kind);
    ++_taken[kind.name];
    _sent += _steps.sent();
    _figures.push_back(ProcessFigures::of(_monitor.id()));
    std::printf("%4.1f s  %s: sent %s, decoded %ld; %s\n", static_cast<double>(_monitor.now() - start) / 1000,
        _steps.played().c_str(), _steps.sent().text().c_str(), _watch.decodedInStep(),
        _figures.back().text().c_str());
    std::fflush(stdout);
}

void Soak::finish()
{
    const long decoded = _monitor.status().decoded;
    _monitor.terminate();
    std::printf("%zu steps:", _figures.size());
    for (const auto& [name, count] : _taken)
        std::printf(" %d %s;", count, name.c_str());
    std::printf("\nsent %s messages, decoded %ld\n", _sent.text().c_str(), decoded);
    _figures.erase(_figures.begin(), _figures.begin() + kWarmUp);
    std::printf("after the first step: %s\n", summaryOf(_figures).c_str());
    std::fflush(stdout);
    expectLevel(_figures, kMargins);
}

} // namespace orvex::soak
