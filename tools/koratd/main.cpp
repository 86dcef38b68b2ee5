#include "CaptureSource.h"
#include "KoratService.h"
#include "Options.h"

#include "LinuxSystemLog.h"
#include "Process.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include <QCoreApplication>

#include <csignal>
#include <cstdlib>

namespace {
int serve(const orvex::korat::Options& options)
{
    using namespace orvex;
    QtRunLoop runLoop;
    SocketMessagePorts ports;
    korat::KoratService service({runLoop, ports}, options,
        std::make_unique<korat::CaptureFeed>(options.technology, options.capture, options.once));
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
