#include "KoratService.h"
#include "Options.h"
#include "Report.h"

#include "LinuxSystemLog.h"
#include "Process.h"
#include "QtRunLoop.h"
#include "SocketMessagePorts.h"

#include <QCoreApplication>

#include <csignal>
#include <cstdio>

namespace {
constexpr int kWrongUsage = 2;

int serve(const orvex::korat::Options& options)
{
    using namespace orvex;
    QtRunLoop runLoop;
    SocketMessagePorts ports;
    korat::KoratService service({runLoop, ports}, options);
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
    std::signal(SIGPIPE, SIG_IGN); // a reader of its lines that goes does not end the service
    const QCoreApplication application(argc, argv);
    const auto log = orvex::makeLinuxSystemLog("koratd");
    orvex::SystemLog::install(log.get());
    orvex::installFatalErrorHandler();

    const auto result = orvex::korat::optionsFromArguments(orvex::argumentTexts(argc, argv));
    int status = EXIT_SUCCESS;
    if (result.options) {
        status = serve(*result.options);
    } else if (result.error.empty()) {
        std::fputs(result.text.c_str(), stdout);
    } else {
        orvex::korat::report("%s", result.error.c_str());
        std::fputs(result.text.c_str(), stderr);
        status = kWrongUsage;
    }
    orvex::SystemLog::install(nullptr);
    log->flush();
    return status;
}
