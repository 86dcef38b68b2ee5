// orvex_bench_sender DIRECTORY PORT COUNT MICROSECONDS: sends so many messages to a message port, one after
// another or with a pause before each.

#include "PortMessage.h"

#include "SocketMessagePorts.h"

#include <QCoreApplication>

#include <algorithm>
#include <array>
#include <bit>
#include <cstdlib>
#include <thread>

namespace {
using namespace orvex;
using namespace std::chrono_literals;

bool send(RemotePort& port, Bytes& message)
{
    const auto time = std::bit_cast<std::array<std::uint8_t, 8>>(bench::portTime());
    std::ranges::copy(time, message.begin() + bench::kPortMessageTime);
    return port.send(0, message, 5s) == RemotePort::Status::success;
}
} // namespace

int main(int argc, char** argv)
{
    if (argc != 5)
        return 2;
    const QCoreApplication application(argc, argv);
    SocketMessagePorts ports(argv[1]);
    const auto port = ports.createRemotePort(argv[2]);
    if (!port)
        return EXIT_FAILURE;
    const std::chrono::microseconds pause(std::atoi(argv[4]));
    Bytes message = bench::portMessage();
    for (int left = std::atoi(argv[3]); left > 0; --left) {
        if (pause > 0us)
            std::this_thread::sleep_for(pause);
        if (!send(*port, message))
            return EXIT_FAILURE;
    }
    while (port->pendingBytes() > 0 && port->isValid())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    return EXIT_SUCCESS;
}
