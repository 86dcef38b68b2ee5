// orvex_bench: all benchmarks, or those that --benchmark_filter names. scripts/bench runs it.
//
//   --table=FILE      write the table of figures to FILE
//   --capture-mib=N   size of the large capture, 1024 by default
//   --directory=DIR   directory for temporary captures, the current one by default

#include "Benchmarks.h"
#include "Table.h"

#include "SystemLog.h"

#include <benchmark/benchmark.h>

#include <QApplication>
#include <QString>

#include <cstdio>
#include <fstream>
#include <string_view>

namespace {

// Removes "--name=VALUE" from the arguments and returns VALUE.
std::string takeOption(int& argc, char** argv, std::string_view name, std::string usual)
{
    for (int i = 1; i < argc; ++i) {
        const std::string_view argument = argv[i];
        if (!argument.starts_with(name))
            continue;
        usual = argument.substr(name.size());
        std::copy(argv + i + 1, argv + argc + 1, argv + i);
        --argc;
    }
    return usual;
}

} // namespace

int main(int argc, char** argv)
{
    using namespace orvex::bench;
    if (argc > 1 && argv[1] == std::string_view(kPortSender))
        return sendToPort(argc, argv);
    const std::string table = takeOption(argc, argv, "--table=", "");
    const std::string directory = takeOption(argc, argv, "--directory=", ".");
    const std::size_t captureMiB = std::stoul(takeOption(argc, argv, "--capture-mib=", "1024"));

    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    orvex::installConsole([](std::string_view) {}); // the benchmarks print there
    registerFloors();
    registerDictionaries();
    registerDecoding();
    registerRebuilding();
    registerPainting();
    registerStarting();
    registerPorts();
    registerTimelines();
    registerOffline(directory, captureMiB);

    benchmark::Initialize(&argc, argv);
    if (benchmark::ReportUnrecognizedArguments(argc, argv))
        return EXIT_FAILURE;
    Results results;
    benchmark::RunSpecifiedBenchmarks(&results);
    if (table.empty())
        return EXIT_SUCCESS;
    std::ofstream file(table);
    file << markdownTable(results) << std::flush;
    return file ? EXIT_SUCCESS : EXIT_FAILURE;
}
