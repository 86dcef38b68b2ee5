// Measures the start of orvex until its first frame, without a service and beside one that answers.

#include "Benchmarks.h"
#include "ChildProcess.h"

#include "TelephonyConstants.h"

#include <benchmark/benchmark.h>

#include <QLocalSocket>
#include <QTemporaryDir>

#include <chrono>
#include <memory>
#include <thread>

namespace orvex::bench {
namespace {

std::unique_ptr<ChildProcess> startService(const std::string& directory)
{
    auto service =
        std::make_unique<ChildProcess>(std::vector<std::string>{KORATD_PATH, "--technology", "MRL_LTE"},
            ChildProcess::Environment{"ORVEX_PORT_DIR=" + directory}, ChildProcess::Errors::dropped);
    const QString socket = QString::fromStdString(directory + "/" + telephony::kServicePortName);
    for (int attempt = 0; attempt < 500; ++attempt) {
        QLocalSocket probe;
        probe.connectToServer(socket);
        if (probe.waitForConnected(10))
            break;
        std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    return service;
}

void start(benchmark::State& state, bool besideService)
{
    const QTemporaryDir folder;
    const std::string ports = folder.filePath("ports").toStdString();
    const auto service = besideService ? startService(ports) : nullptr;
    const ChildProcess::Environment environment = {"QT_QPA_PLATFORM=offscreen", "ORVEX_PORT_DIR=" + ports,
        "XDG_CONFIG_HOME=" + folder.filePath("config").toStdString()};
    for (auto _ : state) {
        ChildProcess application({ORVEX_PATH, "--until-painted"}, environment);
        if (!application.waitForOutput())
            state.SkipWithError("orvex painted nothing");
        state.PauseTiming();
        application.waitForEnd();
        state.ResumeTiming();
    }
}

} // namespace

void registerStarting()
{
    for (const bool besideService : {false, true})
        benchmark::RegisterBenchmark(besideService ? "start/service" : "start/alone", start, besideService)
            ->Unit(benchmark::kMillisecond)
            ->UseRealTime();
}

} // namespace orvex::bench
