#include "database/DatabaseMerge.h"

#include "database/TimelineDatabase.h"
#include "database/TimelineSchema.h"

#include "Reporting.h"
#include "TextFormat.h"

namespace orvex {

namespace {

bool add(const std::string& input, const TimelineDatabase& database, const DecodeOptions& options)
{
    SqliteConnection source(input);
    if (const std::string fault = timeline_schema::faultOf(source, "main"); !fault.empty())
        return printError(input + ": " + fault);
    const TimelineDatabase::Taken taken = database.take(source);
    if (!taken.error.empty())
        return printError(input + ": not added to " + *options.timelineFile + ": " + taken.error);
    if (taken.known > 0)
        printNote(text("%s: %zu of %zu captures are in %s already", input.c_str(), taken.known,
                      taken.known + taken.added, options.timelineFile->c_str()),
            options);
    return true;
}

} // namespace

bool mergeDatabases(const DecodeOptions& options)
{
    const TimelineDatabase database(*options.timelineFile);
    if (const std::string fault = database.fault(); !fault.empty())
        return printError(*options.timelineFile + ": " + fault);
    bool isGood = true;
    for (const std::string& input : options.inputs)
        isGood = add(input, database, options) && isGood;
    return isGood;
}

} // namespace orvex
