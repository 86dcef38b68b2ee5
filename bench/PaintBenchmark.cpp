// Measures a refresh of the session up to the painted screen: a list of 64 rows whose values have all
// changed, in a handset's window and in one high enough to show all rows.

#include "Benchmarks.h"

#include "OrvexApp.h"
#include "OrvexPaneController.h"

#include "FakeTelephony.h"
#include "ManualRunLoop.h"
#include "PacketText.h"

#include "Animation.h"
#include "FileStorage.h"
#include "QtRunLoop.h"
#include "Window.h"

#include <benchmark/benchmark.h>

#include <QAbstractEventDispatcher>
#include <QApplication>

#include <algorithm>

namespace orvex::bench {
namespace {

constexpr std::size_t kRows = 64;
constexpr int kBarsHeight = 200; // more than the bars need

// The monitor, with the benchmark as its telephony service.
class Monitor {
public:
    Monitor()
    {
        setAnimationsEnabled(false);
        _telephony.technology = telephony::kTechnologyMRL_GSM;
        _app->applicationDidFinishLaunching();
        _runLoop.runPosted();
        sendChannels();
        refresh();
        for (const char* name : {"Serving", "Mobile Allocation", "ARFCNs"})
            open(name);
    }
    ~Monitor() { _app->applicationWillTerminate(); }
    Monitor(const Monitor&) = delete;
    Monitor& operator=(const Monitor&) = delete;

    Window& window() const { return *_app->window(); }
    bool showsList() const { return top().tableList().rowCount() == kRows; }

    // A frequency hopping list in which every channel has changed.
    void sendChannels()
    {
        Bytes payload = {7, kRows};
        for (std::size_t i = 0; i < kRows; ++i) {
            const auto channel = static_cast<std::uint16_t>((++_lastChannel) % 1024);
            payload.push_back(static_cast<std::uint8_t>(channel));
            payload.push_back(static_cast<std::uint8_t>(channel >> 8));
        }
        _telephony.deliver(test::packet(0x51F8, payload));
    }

    void refresh() { _runLoop.advance(std::chrono::seconds(2)); }

private:
    OrvexPaneController& top() const
    {
        return static_cast<OrvexPaneController&>(_app->navigationStack()->topScreen());
    }

    void open(const std::string& name)
    {
        OrvexPaneController& pane = top();
        const auto& rows = *_app->model()->nodeAtPath(pane.path())->childNodes();
        const auto row = std::ranges::find(rows, name, [](const auto& node) { return node->displayName(); });
        pane.didSelectRow(pane.tableList(), static_cast<int>(row - rows.begin()));
    }

    test::ManualRunLoop _runLoop;
    test::FakeTelephony _telephony;
    FileResources _resources{ORVEX_RESOURCES};
    SystemClock _clock;
    IniPreferences _preferences;
    std::shared_ptr<OrvexApp> _app = OrvexApp::create({.session = {.runLoop = _runLoop,
                                                           .ports = _telephony,
                                                           .telephony = _telephony,
                                                           .generators = {_resources, _clock, {}}},
        .preferences = _preferences});
    int _lastChannel = 0;
};

void processUntilPainted()
{
    bool isPainted = false;
    const FirstPaint paint([&isPainted] { isPainted = true; });
    while (!isPainted)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
}

// Finishes everything left over from the previous refresh.
void finishEvents()
{
    while (QAbstractEventDispatcher::instance()->processEvents(QEventLoop::AllEvents)) { }
}

void paint(benchmark::State& state, bool allRows)
{
    Monitor monitor;
    if (allRows)
        monitor.window().resize(
            monitor.window().width(), static_cast<int>(kRows) * TableList::kDefaultRowHeight + kBarsHeight);
    processUntilPainted();
    if (!monitor.showsList())
        return state.SkipWithError("the list is not on the screen");
    for (auto _ : state) {
        state.PauseTiming();
        monitor.sendChannels();
        finishEvents();
        state.ResumeTiming();
        monitor.refresh();
        processUntilPainted();
    }
}

} // namespace

void registerPainting()
{
    benchmark::RegisterBenchmark("paint/handset", paint, false)->Unit(benchmark::kMillisecond)->UseRealTime();
    benchmark::RegisterBenchmark("paint/all rows", paint, true)->Unit(benchmark::kMillisecond)->UseRealTime();
}

} // namespace orvex::bench
