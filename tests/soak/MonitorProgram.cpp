#include "MonitorProgram.h"

#include "Expectation.h"

#include <QRegularExpression>

namespace orvex::soak {

namespace {
using namespace std::chrono_literals;

constexpr auto kLongestEnd = 30s;
constexpr qsizetype kLastWords = 2000;
} // namespace

MonitorProgram::MonitorProgram(const test::ProgramFolder& folder)
{
    _clock.start();
    QObject::connect(&_process, &QProcess::readyReadStandardOutput, &_process, [this] { readStatuses(); });
    QObject::connect(&_process, &QProcess::readyReadStandardError, &_process, [this] { readErrors(); });
    auto environment = folder.environment();
    environment.insert("QT_QPA_PLATFORM", "offscreen");
    environment.insert("LC_ALL", "C.UTF-8"); // the digits of the status line
    environment.insert("ORVEX_ROOT", QString::fromStdString(folder.path("root")));
    // Freed memory that the address sanitizer holds back would look like a leak.
    environment.insert("ASAN_OPTIONS", "quarantine_size_mb=1");
    _process.setProcessEnvironment(environment);
    _process.start(ORVEX_PATH, {"--print-status"});
    _process.waitForStarted();
}

MonitorProgram::~MonitorProgram()
{
    _process.disconnect();
    _process.kill();
    _process.waitForFinished();
}

std::vector<qint64> MonitorProgram::errorsWith(const char* text) const
{
    std::vector<qint64> result;
    for (const Error& error : _errors) {
        if (error.line.contains(text))
            result.push_back(error.at);
    }
    return result;
}

void MonitorProgram::terminate()
{
    expectRunning();
    _process.terminate();
    test::waitUntil([this] { return !isRunning(); }, kLongestEnd);
    expect(!isRunning() && _process.exitStatus() == QProcess::NormalExit && _process.exitCode() == 0,
        "orvex ends in order", lastWords());
}

void MonitorProgram::expectRunning() const
{
    expect(isRunning(), "orvex is running",
        "it has ended with status " + std::to_string(_process.exitCode()) + ": " + lastWords());
}

void MonitorProgram::readStatuses()
{
    static const QRegularExpression form(
        R"(^(\d+) (Connecting|Connecting\.\.\.|Updated \d{4}-\d\d-\d\d at \d\d:\d\d:\d\d)$)");
    _process.setReadChannel(QProcess::StandardOutput);
    while (_process.canReadLine()) {
        const QString line = QString::fromUtf8(_process.readLine()).trimmed();
        const auto match = form.match(line);
        // An unknown text is a status too; the checks will not like it.
        _statuses.push_back({now(), match.captured(1).toLongLong(),
            match.hasMatch() ? match.captured(2) : line, QDateTime::currentDateTime()});
    }
}

void MonitorProgram::readErrors()
{
    _process.setReadChannel(QProcess::StandardError);
    while (_process.canReadLine()) {
        const QByteArray line = _process.readLine();
        if (line.startsWith("<3>"))
            _errors.push_back({now(), line});
        _lastWords = (_lastWords + line).right(kLastWords);
    }
}

} // namespace orvex::soak
