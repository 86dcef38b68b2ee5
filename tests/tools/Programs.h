#pragma once

#include "EventLoop.h"
#include "TelephonyConstants.h"

#include <gtest/gtest.h>

#include <QLocalSocket>
#include <QProcess>
#include <QTemporaryDir>

#include <chrono>
#include <string>

namespace orvex::test {

// A folder in which programs find each other and keep what they keep, apart from the user's.
class ProgramFolder {
public:
    std::string ports() const { return path("ports"); }
    std::string path(const char* name) const { return _folder.filePath(name).toStdString(); }
    QString name(const char* file) const { return _folder.filePath(file); }

    QProcessEnvironment environment() const
    {
        auto result = QProcessEnvironment::systemEnvironment();
        result.insert("ORVEX_PORT_DIR", name("ports"));
        result.insert("ORVEX_LOG", "stderr");
        result.insert("XDG_CONFIG_HOME", name("config"));
        result.insert("XDG_STATE_HOME", name("state"));
        result.remove("DBUS_SESSION_BUS_ADDRESS");
        return result;
    }

private:
    QTemporaryDir _folder;
};

// A real program that runs beside the test, and all that it has written so far.
class Program {
public:
    Program(const ProgramFolder& folder, const std::string& path, const QStringList& arguments)
    {
        _process.setProcessEnvironment(folder.environment());
        _process.start(QString::fromStdString(path), arguments);
        _process.waitForStarted();
    }
    ~Program() { kill(); }
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;

    std::string output() const { return (_output += _process.readAllStandardOutput()).toStdString(); }
    // Standard error: log lines, for the monitor.
    std::string errors() const { return (_errors += _process.readAllStandardError()).toStdString(); }
    bool isRunning() const { return _process.state() == QProcess::Running; }
    pid_t id() const { return static_cast<pid_t>(_process.processId()); }

    // Waits until the text was written to standard output or standard error.
    bool waitFor(const char* text) const
    {
        return waitUntil([&] { return (output() + errors()).find(text) != std::string::npos; }, kLongest);
    }
    void kill()
    {
        _process.kill();
        _process.waitForFinished();
    }
    // Asks it to end. Its exit status; -1 when it did not end, or crashed.
    int terminate()
    {
        _process.terminate();
        return waitForEnd();
    }
    int waitForEnd()
    {
        if (!waitUntil([this] { return !isRunning(); }, kLongest))
            return -1;
        return _process.exitStatus() == QProcess::NormalExit ? _process.exitCode() : -1;
    }

private:
    static constexpr std::chrono::milliseconds kLongest{30'000};

    mutable QProcess _process; // is read when somebody asks
    mutable QByteArray _output;
    mutable QByteArray _errors;
};

// koratd, ready to serve.
class KoratProgram : public Program {
public:
    explicit KoratProgram(const ProgramFolder& folder, const QStringList& arguments = {})
        : Program(folder, KORATD_PATH, arguments)
    {
        // Its socket file is there a moment before it listens.
        EXPECT_TRUE(waitUntil([&] {
            QLocalSocket probe;
            probe.connectToServer(folder.name("ports/") + telephony::kServicePortName);
            return probe.waitForConnected(100) || !isRunning();
        }));
    }

    // Ends it and returns how many messages it says it has sent to all its clients.
    long long terminateAndCount()
    {
        EXPECT_EQ(terminate(), 0) << errors();
        const auto line = errors().rfind("koratd: sent ");
        return line == std::string::npos ? -1 : std::atoll(errors().c_str() + line + 13);
    }
};

// What a program wrote until it ended.
struct Result {
    int status;
    std::string output;
    std::string errors;
};

inline Result run(const std::string& program, const QStringList& arguments)
{
    const ProgramFolder folder;
    Program process(folder, program, arguments);
    const int status = process.waitForEnd();
    return {status, process.output(), process.errors()};
}

} // namespace orvex::test
