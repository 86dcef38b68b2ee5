#include "OrvexConsole.h"

#include "DisplayTreePrinter.h"
#include "TextFormat.h"

#include <QList>
#include <QString>

#include <algorithm>
#include <cwchar>
#include <utility>

namespace orvex {

namespace {

using namespace std::chrono_literals;

constexpr int kNarrowestColumn = 46;
constexpr int kColumnGap = 2;
constexpr int kLinesBesidesBody = 2; // the status line and the cursor's line

// Wide characters take two cells, combining ones none.
int cellsOf(char32_t character)
{
    const int cells = ::wcwidth(static_cast<wchar_t>(character));
    return cells < 0 ? 1 : cells;
}

constexpr auto kConnectionCheckPeriod = 1s;
constexpr const char* kClearScreen = "\x1b[2J";
constexpr const char* kCursorHome = "\x1b[H";
constexpr const char* kClearLineEnd = "\x1b[K";
constexpr const char* kClearBelow = "\x1b[J";

} // namespace

std::string fittedToCells(const std::string& text, int cells, bool padded)
{
    const auto characters = QString::fromStdString(text).toUcs4();
    int needed = 0;
    for (const auto character : characters)
        needed += cellsOf(character);

    QString result;
    int used = 0;
    const int room = needed > cells ? cells - 1 : cells; // a cell for the ellipsis
    for (const auto character : characters) {
        if (used + cellsOf(character) > room)
            break;
        result += QString::fromUcs4(reinterpret_cast<const char32_t*>(&character), 1);
        used += cellsOf(character);
    }
    if (needed > cells && cells > 0) {
        result += QChar(0x2026);
        ++used;
    }
    if (padded)
        result += QString(std::max(0, cells - used), QLatin1Char(' '));
    return result.toStdString();
}

std::vector<std::string> terminalFrame(
    const std::string& status, const std::vector<std::string>& body, TerminalSize size)
{
    const auto height = static_cast<std::size_t>(std::max(1, size.rows - kLinesBesidesBody));
    const std::size_t wanted = (body.size() + height - 1) / height;
    const int possible = std::max(1, (size.columns + kColumnGap) / (kNarrowestColumn + kColumnGap));
    const std::size_t columns = std::clamp<std::size_t>(wanted, 1, static_cast<std::size_t>(possible));
    const int width = (size.columns + kColumnGap) / static_cast<int>(columns) - kColumnGap;

    std::vector<std::string> shown = body;
    if (shown.size() > height * columns) {
        const std::size_t kept = height * columns - 1;
        shown.resize(kept);
        shown.push_back(text("... %zu more lines", body.size() - kept));
    }

    std::vector<std::string> frame{fittedToCells(status, size.columns, false)};
    for (std::size_t row = 0; row < std::min(height, shown.size()); ++row) {
        std::string line;
        for (std::size_t column = 0; column < columns; ++column) {
            const std::size_t index = column * height + row;
            if (index >= shown.size())
                break;
            const bool isLast = index + height >= shown.size();
            line += fittedToCells(shown[index], width, !isLast);
            if (!isLast)
                line += std::string(kColumnGap, ' ');
        }
        frame.push_back(std::move(line));
    }
    return frame;
}

OrvexConsole::OrvexConsole(const AppPlatform& platform, ConsoleOutput& output)
    : _platform(platform)
    , _output(output)
{
}

OrvexConsole::~OrvexConsole()
{
    // A retry queued on the run loop may keep the model alive.
    if (_model)
        _model->setListener(nullptr);
}

void OrvexConsole::start()
{
    _model = OrvexModel::create(_platform.session);
    _model->setListener(this);
    sayConnecting();
    _platform.session.runLoop.post([weakModel = std::weak_ptr(_model)] {
        if (const auto model = weakModel.lock())
            model->restartMonitor();
    });
    _connectionTimer =
        _platform.session.runLoop.startTimer(kConnectionCheckPeriod, [this] { checkConnection(); });
}

void OrvexConsole::applicationWillTerminate()
{
    const auto model = std::exchange(_model, nullptr);
    if (!model)
        return;
    _connectionTimer.reset();
    setGSMRSSIPreference(_platform.preferences, false);
    model->setListener(nullptr);
}

void OrvexConsole::updateViewControllerFromModel()
{
    if (!_model)
        return;
    const OrvexModelNodeRef root = _model->topLevelNodes();
    _tree = root ? DisplayTreePrinter::lines(*root) : std::vector<std::string>();
    if (!_model->isConnected())
        return checkConnection();
    _saidConnecting = false;
    write(updateMessageAt(_platform.session.generators.clock.now()));
}

// The session reports new data, but not a lost connection.
void OrvexConsole::checkConnection()
{
    if (_model && !_model->isConnected() && !_saidConnecting)
        sayConnecting();
}

void OrvexConsole::sayConnecting()
{
    _saidConnecting = true;
    write(kConnectingMessage);
}

void OrvexConsole::write(const std::string& status)
{
    std::string text;
    if (const auto terminal = _output.terminalSize()) {
        // Overwritten rather than cleared first, which would flicker.
        text += _wroteBefore ? kCursorHome : std::string(kCursorHome) + kClearScreen;
        for (const std::string& line : terminalFrame(status, _tree, *terminal))
            text += line + kClearLineEnd + '\n';
        text += kClearBelow;
    } else {
        if (_wroteBefore)
            text += '\n';
        text += status + '\n';
        if (!_saidConnecting) {
            for (const std::string& line : _tree)
                text += line + '\n';
        }
    }
    _wroteBefore = true;
    _output.write(text);
}

} // namespace orvex
