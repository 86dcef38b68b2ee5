#pragma once

#include "EventLoop.h"

#include <QProcess>
#include <QTemporaryDir>

#include <chrono>
#include <csignal>
#include <string>
#include <thread>
#include <vector>

namespace orvex::test {

// A folder in which programs find each other and keep what they keep, apart from the user's.
class ProgramFolder {
public:
    std::string ports() const { return path("ports"); }
    std::string path(const char* name) const { return _folder.filePath(name).toStdString(); }

    QProcessEnvironment environment() const
    {
        auto result = QProcessEnvironment::systemEnvironment();
        result.insert("ORVEX_PORT_DIR", QString::fromStdString(ports()));
        result.insert("ORVEX_LOG", "stderr");
        result.insert("XDG_CONFIG_HOME", _folder.filePath("config"));
        result.insert("XDG_STATE_HOME", _folder.filePath("state"));
        result.remove("DBUS_SESSION_BUS_ADDRESS");
        return result;
    }

private:
    QTemporaryDir _folder;
};

// Stops a process where it is, and lets it go on after a while, whatever the test does meanwhile.
inline std::jthread freezeFor(qint64 process, std::chrono::milliseconds time)
{
    ::kill(static_cast<pid_t>(process), SIGSTOP);
    return std::jthread([process, time] {
        std::this_thread::sleep_for(time);
        ::kill(static_cast<pid_t>(process), SIGCONT);
    });
}

// A real program that runs beside the test, and all that it has written so far.
class Program {
public:
    Program(const ProgramFolder& folder, const char* path, const QStringList& arguments)
    {
        _process.setProcessEnvironment(folder.environment());
        _process.start(QString::fromLocal8Bit(path), arguments);
        _process.waitForStarted();
    }
    ~Program() { kill(); }
    Program(const Program&) = delete;
    Program& operator=(const Program&) = delete;

    std::string output() const { return (_output += _process.readAllStandardOutput()).toStdString(); }
    // Standard error: log lines, for the monitor.
    std::string errors() const { return (_errors += _process.readAllStandardError()).toStdString(); }
    bool isRunning() const { return _process.state() == QProcess::Running; }
    qint64 id() const { return _process.processId(); }

    // Waits until the text was written.
    bool waitForError(const char* text) const
    {
        return waitUntil([&] { return errors().find(text) != std::string::npos; }, kLongest);
    }
    std::jthread freezeFor(std::chrono::milliseconds time) const { return test::freezeFor(id(), time); }

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
        if (!waitUntil([this] { return _process.state() == QProcess::NotRunning; }, kLongest))
            return -1;
        return _process.exitStatus() == QProcess::NormalExit ? _process.exitCode() : -1;
    }

private:
    static constexpr std::chrono::milliseconds kLongest{30'000};

    mutable QProcess _process; // is read when somebody asks
    mutable QByteArray _output;
    mutable QByteArray _errors;
};

} // namespace orvex::test
