#pragma once

#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <chrono>
#include <string>
#include <thread>

namespace orvex::test {

// A bus of the test's own.
class PrivateBus {
public:
    PrivateBus()
    {
        _daemon.start("dbus-daemon",
            {"--session", "--nofork", "--nopidfile", "--address=" + QString::fromStdString(address())});
        for (int i = 0; i < 500 && !QFile::exists(_folder.filePath("bus")); ++i)
            std::this_thread::sleep_for(std::chrono::milliseconds(10));
    }
    ~PrivateBus()
    {
        _daemon.kill();
        _daemon.waitForFinished();
    }
    PrivateBus(const PrivateBus&) = delete;
    PrivateBus& operator=(const PrivateBus&) = delete;

    std::string address() const { return "unix:path=" + _folder.filePath("bus").toStdString(); }

private:
    QTemporaryDir _folder;
    QProcess _daemon;
};

} // namespace orvex::test
