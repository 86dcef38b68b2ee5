#pragma once

#include <QObject>
#include <QSocketNotifier>

#include <functional>
#include <optional>
#include <string_view>

namespace orvex {

class OrvexApp;

// In characters.
struct TerminalSize {
    int columns = 80;
    int rows = 24;
};

// Where the console writes.
class ConsoleOutput {
public:
    virtual ~ConsoleOutput() = default;

    virtual void write(std::string_view text) = 0;
    // Absent when the output is not a terminal. Called before every frame, since a terminal may be resized.
    virtual std::optional<TerminalSize> terminalSize() const = 0;
};

// The process's standard output.
class StandardOutput final : public ConsoleOutput {
public:
    // Calls back once, when nothing more can be written, with the error. EPIPE when the reader has gone,
    // which is noticed even without a write.
    explicit StandardOutput(std::function<void(int error)> onClosed);

    void write(std::string_view text) override;
    std::optional<TerminalSize> terminalSize() const override;

private:
    void close(int error);

    std::function<void(int error)> _onClosed;
    QSocketNotifier _readerGone;
};

// Prints the number of messages decoded so far and the status line whenever the window draws a new one:
// "1234 Updated 2024-03-05 at 14:07:09". For programs that watch a session.
class StatusPrinter final : public QObject {
public:
    // Both outlive the printer.
    StatusPrinter(const OrvexApp& app, ConsoleOutput& output);
    ~StatusPrinter() override;

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    const OrvexApp& _app;
    ConsoleOutput& _output;
    QString _last;
};

} // namespace orvex
