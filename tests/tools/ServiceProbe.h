#pragma once

#include "Program.h"

#include "TelephonyConstants.h"

#include <QLocalSocket>

namespace orvex::test {

// Waits until koratd serves, or has ended. Its socket file is there a moment before it listens.
inline bool waitForService(const ProgramFolder& folder, const Program& korat)
{
    const QString socket = QString::fromStdString(folder.ports() + "/" + telephony::kServicePortName);
    return waitUntil([&] {
        QLocalSocket probe;
        probe.connectToServer(socket);
        return probe.waitForConnected(100) || !korat.isRunning();
    });
}

} // namespace orvex::test
