#include "ServiceProgram.h"

#include "Expectation.h"

#include "CaptureReader.h"
#include "ServiceProbe.h"

#include <QRegularExpression>

#include <algorithm>

namespace orvex::soak {

namespace {
constexpr long kFrameHeader = 16; // bytes; the least that a message takes on its way

// The number in the line of koratd that the pattern matches.
std::optional<long> numberIn(const test::Program& korat, const char* pattern)
{
    const QRegularExpression line(pattern, QRegularExpression::MultilineOption);
    const auto match = line.match(QString::fromStdString(korat.errors()));
    return match.hasMatch() ? std::optional(match.captured(1).toLongLong()) : std::nullopt;
}

long messagesIn(const std::string& capture)
{
    const auto reader = CaptureReader::open(capture);
    long count = 0;
    while (reader->next() == CaptureReader::Status::message)
        ++count;
    return count;
}
} // namespace

QStringList Scene::arguments() const
{
    QStringList result{"--technology", technology};
    if (seed)
        result << "--seed" << QString::number(*seed);
    if (rate)
        result << "--rate" << QString::number(*rate);
    return result + more;
}

std::string Scene::text() const
{
    const QString pace = rate ? QString("%1/s").arg(*rate) : QString("own pace");
    return (QStringList{technology, pace} + more).join(' ').toStdString();
}

ServiceProgram::ServiceProgram(const test::ProgramFolder& folder, const Scene& scene)
    : _recording(folder.path("killed.pcap"))
    , _scene(scene)
    , _life([] {
        QElapsedTimer started;
        started.start();
        return started;
    }())
    , _program(folder, KORATD_PATH,
          scene.arguments() + QStringList{"--record", QString::fromStdString(_recording)})
{
    expect(
        test::waitForService(folder, _program) && _program.isRunning(), "koratd serves", _program.errors());
}

Range ServiceProgram::terminate()
{
    expect(_program.terminate() == 0, "koratd ends in order", _program.errors());
    return sent();
}

Range ServiceProgram::waitForDeath()
{
    expect(_program.waitForEnd() == 1, "koratd dies as asked", _program.errors());
    return sent();
}

Range ServiceProgram::kill()
{
    _program.kill();
    const auto mostAllowed = static_cast<double>(_life.elapsed()) * _scene.rate.value_or(0) / 1000 + 1;
    return {messagesIn(_recording), static_cast<long>(mostAllowed)};
}

Range ServiceProgram::sent() const
{
    const auto sent = numberIn(_program, "^koratd: sent (\\d+) messages$");
    expect(sent.has_value(), "koratd says how many messages it has sent", _program.errors());
    // What the monitor had not taken yet may be lost when koratd ends: that is nobody's fault.
    const auto pending = numberIn(_program, "^koratd: the client has not taken the last (\\d+) bytes$");
    const long lost = pending ? *pending / kFrameHeader + 1 : 0;
    return {std::max(*sent - lost, 0L), *sent};
}

} // namespace orvex::soak
