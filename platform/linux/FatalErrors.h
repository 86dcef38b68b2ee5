#pragma once

namespace orvex {

// From now on an uncaught exception, of whatever type, is the last line of the installed system log, at error
// priority, before the process aborts: "Fatal: uncaught exception of type T: TEXT". Without a log the line
// goes to standard error.
void installFatalErrorHandler();

} // namespace orvex
