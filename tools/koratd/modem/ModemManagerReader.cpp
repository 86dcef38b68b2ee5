#include "modem/ModemManagerReader.h"

#include "modem/ModemManagerCells.h"
#include "modem/ModemManagerState.h"

#include <utility>

namespace orvex::korat {

namespace {
using namespace std::chrono_literals;

constexpr auto kAskingPeriod = 5s;
constexpr auto kLongestWait = 15s;      // for cells: those of before are old by then
constexpr auto kLongestCellTime = 310s; // ModemManager gives a modem 300
constexpr auto kQueryTime = 30s;
constexpr auto kDenialTime = 60s; // a permission may have been given by then
constexpr auto kEndTime = 10s;
constexpr auto kLastAnswerTime = 500ms;

constexpr unsigned kSignalRate = 5;        // s
constexpr std::int64_t kNetworkSource = 1; // MM_MODEM_LOCATION_SOURCE_3GPP_LAC_CI

ModemQuestion::Time steadyTime()
{
    return ModemQuestion::Time::clock::now();
}

// A number among an interface's properties; none without such an interface.
std::optional<std::int64_t> numberOf(const DictionaryRef& properties, const char* name)
{
    const std::int64_t* number = properties ? (*properties)[name].integer() : nullptr;
    return number ? std::optional(*number) : std::nullopt;
}
} // namespace

ModemManagerReader::ModemManagerReader(
    RunLoop& runLoop, const QDBusConnection& connection, bool withIdentities)
    : _runLoop(runLoop)
    , _bus(connection)
    , _withIdentities(withIdentities)
    , _objects(_bus, [this] { update(); })
{
}

ModemManagerReader::~ModemManagerReader()
{
    if (isSignalRateOurs())
        _bus.callAndWait(_signalModem, kSignalInterface, "Setup", {0U}, kLastAnswerTime);
}

void ModemManagerReader::setAsking(bool isAsking)
{
    if (!isAsking) {
        _timer.reset();
        _end = _runLoop.startTimer(kEndTime, [this] {
            putSignalBack();
            _cells = {};
            _location.reset();
            update();
            _end.reset(); // its own timer: nothing after this
        });
        return;
    }
    _end.reset();
    _timer = _runLoop.startTimer(kAskingPeriod, [this] { ask(); });
    ask();
}

void ModemManagerReader::update()
{
    const std::string modem = watchedModemIn(_objects.objects());
    if (modem != _modem) {
        _modem = modem;
        forgetAnswers();
    }
    const Condition before = _state.condition;
    _state = modemStateOf(_objects.objects(), _modem, _withIdentities);
    if (_objects.service() != ModemManagerObjects::Service::isThere) {
        _state.condition = _objects.service() == ModemManagerObjects::Service::unknown ? Condition::unknown
                                                                                       : Condition::noService;
    }
    if (_state.condition != Condition::enabled) {
        _cells = {};
        _location.reset();
    }
    _state.cells = _cells.cells;
    _state.cellsLeftOut = _cells.cellsLeftOut;
    _state.cellAnswer = _cells.cellAnswer;
    _state.location = _location;
    ++_version;
    if (_timer && before != Condition::enabled)
        ask();
}

void ModemManagerReader::forgetAnswers()
{
    _cells = {};
    _location.reset();
    _signalModem.clear();
    for (ModemQuestion* question : {&_cellQuestion, &_locationQuestion, &_signalQuestion})
        question->forget();
}

void ModemManagerReader::ask()
{
    if (_state.condition != Condition::enabled)
        return;
    const Time now = steadyTime();
    askForCells(now);
    askForLocation(now);
    setUpSignal(now);
}

void ModemManagerReader::askForCells(Time now)
{
    if (_cellQuestion.isOverdue(now, kLongestWait) && _cells.cellAnswer != CellAnswer::none) {
        _cells = {};
        _cells.cellAnswer = CellAnswer::none;
        update();
    }
    if (!_cellQuestion.mayBeAsked(now))
        return;
    const auto number = _cellQuestion.ask(now);
    _bus.call(
        _modem, kModemInterface, "GetCellInfo", {}, kLongestCellTime, [this, number](const Answer& answer) {
            if (!_cellQuestion.answer(number))
                return;
            takeCellAnswer(answer);
            update();
        });
}

void ModemManagerReader::takeCellAnswer(const Answer& answer)
{
    retryAfter(answer, _cellQuestion);
    if (answer.error.empty()) {
        _cells.cellAnswer = CellAnswer::told;
        takeCells(_cells, answer.value);
        return;
    }
    _cells = {};
    _cells.cellAnswer = answer.isDenied() ? CellAnswer::denied
        : answer.isNotSupported()         ? CellAnswer::notSupported
                                          : CellAnswer::none;
}

void ModemManagerReader::askForLocation(Time now)
{
    const auto sources = numberOf(_objects.properties(_modem, kLocationInterface), "Enabled");
    if (!sources || (*sources & kNetworkSource) == 0 || !_locationQuestion.mayBeAsked(now))
        return;
    const auto number = _locationQuestion.ask(now);
    _bus.call(
        _modem, kLocationInterface, "GetLocation", {}, kQueryTime, [this, number](const Answer& answer) {
            if (!_locationQuestion.answer(number))
                return;
            retryAfter(answer, _locationQuestion);
            _location = locationIn(answer.value);
            update();
        });
}

void ModemManagerReader::setUpSignal(Time now)
{
    const auto rate = numberOf(_objects.properties(_modem, kSignalInterface), "Rate");
    if (rate != 0 || !_signalQuestion.mayBeAsked(now))
        return;
    _signalModem = _modem;
    const auto number = _signalQuestion.ask(now);
    _bus.call(
        _modem, kSignalInterface, "Setup", {kSignalRate}, kQueryTime, [this, number](const Answer& answer) {
            if (!_signalQuestion.answer(number))
                return;
            retryAfter(answer, _signalQuestion);
            if (!answer.error.empty())
                _signalModem.clear();
        });
}

// The news that the rate has become 5 may be still to come; any other rate is somebody else's.
bool ModemManagerReader::isSignalRateOurs() const
{
    const auto rate = numberOf(_objects.properties(_signalModem, kSignalInterface), "Rate");
    return rate && (*rate == kSignalRate || *rate == 0);
}

void ModemManagerReader::putSignalBack()
{
    if (isSignalRateOurs())
        _bus.call(_signalModem, kSignalInterface, "Setup", {0U}, kQueryTime, [](const Answer&) {});
    _signalModem.clear();
}

void ModemManagerReader::retryAfter(const Answer& answer, ModemQuestion& question)
{
    if (answer.isNotSupported())
        question.giveUp();
    else if (answer.isDenied())
        question.waitUntil(steadyTime() + kDenialTime);
}

} // namespace orvex::korat
