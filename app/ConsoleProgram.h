#pragma once

#include "AppOptions.h"

namespace orvex {

// Runs a session on the terminal until the user or an option ends it. Returns the exit status.
int runConsole(int argc, char** argv, const AppOptions& options);
// Prints the tree of the file that the options name. Returns the exit status.
int printFile(int argc, char** argv, const AppOptions& options);
// Prints why a session does not come up. Returns the exit status.
int printDiagnosis(int argc, char** argv, const AppOptions& options);

// Qt sets the user's locale, which may have decimal commas; values and property lists have points.
void keepDecimalPoints();

} // namespace orvex
