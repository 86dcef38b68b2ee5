#pragma once

#include "SignalPipe.h"

#include <QStringList>

#include <functional>
#include <string>

// What a program does once, around its main function.
namespace orvex {

// The command line for QCommandLineParser, which takes texts, while file names are bytes in any encoding or
// none. Each byte becomes one character; argumentBytes() gives the bytes back, whatever the locale.
QStringList argumentTexts(int count, const char* const* arguments);
std::string argumentBytes(const QString& text);

// Called first. If the program was started without a standard input, output or error, the next files it opens
// would take their numbers, and lines meant for the user would land in them. /dev/null takes the numbers
// instead, open for reading, so that writing still fails.
void occupyStandardStreams();

// From now on an uncaught exception of any type is the last line of the installed system log, at error
// priority, before the process aborts: "Fatal: uncaught exception of type T: TEXT". Without a log the line
// goes to standard error.
void installFatalErrorHandler();

// Turns the first SIGINT, SIGTERM or SIGHUP into a call on the event loop. Only one object may exist at a
// time; its destructor restores the signals' default effect.
//
// A process that has not ended one second after a signal, because it waits for a reader, a bus or a service,
// dies of that signal, after the act of setLastAct().
class TerminationSignals {
public:
    explicit TerminationSignals(std::function<void()> onSignal);

private:
    SignalPipe _pipe;
};

// Called before a process that is stuck dies of a signal; null for nothing. It runs in a signal handler.
void setLastAct(void (*act)());

} // namespace orvex
