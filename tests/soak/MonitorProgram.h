#pragma once

#include "Program.h"

#include <QDateTime>
#include <QElapsedTimer>

#include <string>
#include <vector>

namespace orvex::soak {

// What the window's status line said from a moment on.
struct Status {
    qint64 at = 0; // ms since the start of the monitor
    long decoded = 0;
    QString text;
    QDateTime saidAt;

    bool isUpdate() const { return text.startsWith("Updated "); }
};

// The window of orvex: its status lines, and the errors in its log.
class MonitorProgram {
public:
    explicit MonitorProgram(const test::ProgramFolder& folder);
    ~MonitorProgram();
    MonitorProgram(const MonitorProgram&) = delete;
    MonitorProgram& operator=(const MonitorProgram&) = delete;

    qint64 id() const { return _process.processId(); }
    qint64 now() const { return _clock.elapsed(); }

    const std::vector<Status>& statuses() const { return _statuses; }
    const Status& status() const { return _statuses.back(); }

    // When errors whose lines hold the text were logged, since the last forgetErrors().
    std::vector<qint64> errorsWith(const char* text) const;
    void forgetErrors() { _errors.clear(); }
    // The last log lines and whatever else it wrote to standard error.
    std::string lastWords() const { return _lastWords.toStdString(); }

    // Waits for the condition; false when it did not hold within the time. A monitor that ends fails the
    // soak.
    template <typename Condition>
    bool waitUntil(Condition condition, std::chrono::milliseconds longest)
    {
        const bool held = test::waitUntil([&] { return condition() || !isRunning(); }, longest);
        expectRunning();
        return held;
    }
    void letRun(std::chrono::milliseconds time)
    {
        waitUntil([] { return false; }, time);
    }

    // Asks it to end, and expects that it does in order.
    void terminate();

private:
    struct Error {
        qint64 at = 0;
        QByteArray line;
    };

    bool isRunning() const { return _process.state() == QProcess::Running; }
    void expectRunning() const;
    void readStatuses();
    void readErrors();

    QElapsedTimer _clock;
    QProcess _process;
    std::vector<Status> _statuses;
    std::vector<Error> _errors;
    QByteArray _lastWords;
};

} // namespace orvex::soak
