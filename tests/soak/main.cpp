// soak SECONDS [SEED [SLACK]]: the window of orvex and koratd, as programs, through whatever can happen
// between them. SLACK is how many seconds longer than it should everything may take.

#include "Soak.h"

#include <QCoreApplication>

#include <cstdio>
#include <exception>
#include <random>

namespace {
constexpr int kWrongUsage = 2;
constexpr unsigned kDefaultSlack = 1;

int runSoak(unsigned seconds, unsigned seed, unsigned slack)
{
    std::printf("seed %u\n", seed);
    try {
        orvex::soak::Soak soak(seed, std::chrono::seconds(slack));
        soak.runFor(std::chrono::seconds(seconds));
        soak.finish();
    } catch (const std::exception& failure) {
        std::printf("FAILED, with seed %u\n%s\n", seed, failure.what());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication application(argc, argv);
    const QStringList arguments = QCoreApplication::arguments().mid(1);
    std::vector<unsigned> numbers;
    bool areNumbers = true;
    for (const QString& argument : arguments)
        numbers.push_back(areNumbers ? argument.toUInt(&areNumbers) : 0);
    if (!areNumbers || numbers.empty() || numbers.size() > 3 || numbers[0] == 0) {
        std::fputs("usage: soak SECONDS [SEED [SLACK]]\n", stderr);
        return kWrongUsage;
    }
    const unsigned seed = numbers.size() > 1 ? numbers[1] : std::random_device()();
    return runSoak(numbers[0], seed, numbers.size() > 2 ? numbers[2] : kDefaultSlack);
}
