#include "CaptureSource.h"
#include "KoratService.h"
#include "Options.h"
#include "modem/ModemFeed.h"
#include "modem/ModemManagerReader.h"

#include "LinuxSystemLog.h"
#include "Process.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include <QCoreApplication>

#include <csignal>
#include <cstdlib>

namespace {
std::unique_ptr<orvex::korat::Feed> makeFeed(orvex::RunLoop& runLoop, const orvex::korat::Options& options)
{
    using namespace orvex::korat;
    if (options.from == Options::From::capture)
        return std::make_unique<CaptureFeed>(*options.technology, options.capture, options.once);
    return std::make_unique<ModemFeed>(runLoop,
        std::make_unique<ModemManagerReader>(runLoop, QDBusConnection::systemBus(), options.identities),
        options.technology, options.measurements);
}

int serve(const orvex::korat::Options& options)
{
    using namespace orvex;
    QtRunLoop runLoop;
    SocketMessagePorts ports;
    korat::KoratService service({runLoop, ports}, options, makeFeed(runLoop, options));
    const TerminationSignals stopSignals([&service] {
        service.reportSent();
        service.stop();
        QCoreApplication::exit(0);
    });
    return service.start() ? QCoreApplication::exec() : EXIT_FAILURE;
}
} // namespace

int main(int argc, char** argv)
{
    orvex::occupyStandardStreams();
    const auto options = orvex::korat::Options::parse(argc, argv);
    if (options.earlyExit)
        return options.earlyExit->print();

    std::signal(SIGPIPE, SIG_IGN); // a reader of its lines that goes does not end the service
    const QCoreApplication application(argc, argv);
    const auto log = orvex::makeLinuxSystemLog("koratd");
    orvex::SystemLog::install(log.get());
    orvex::installFatalErrorHandler();

    const int status = serve(options);
    orvex::SystemLog::install(nullptr);
    log->flush();
    return status;
}
