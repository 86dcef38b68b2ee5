#pragma once

#include "database/SqliteConnection.h"

#include <cstddef>
#include <optional>
#include <string>

namespace orvex {

// The SQLite file in which the timelines of many captures meet. Processes on one machine may add to it at
// once.
class TimelineDatabase {
public:
    // The file may be missing. A link is followed unless it is another user's.
    explicit TimelineDatabase(const std::string& path);

    // Why nothing can be added; empty when all looks well.
    std::string fault() const;

    struct Taken {
        std::size_t added = 0;
        std::size_t replaced = 0; // of those, captures that were in with other settings
        std::size_t known = 0;    // not added: they are in with the same settings
        std::string error;        // why nothing changed; empty if all went well
    };
    // Adds the captures of the schema "main", all of them or none. A new file, readable by its owner only,
    // gets its name when it is whole. Called when there is no fault.
    Taken take(SqliteConnection& source) const;

private:
    // None when another process has made the file meanwhile.
    std::optional<Taken> create(SqliteConnection& source) const;
    bool exists() const;
    // Why an existing file must not be touched.
    std::string faultOfFile() const;

    std::string _path;  // behind links
    std::string _fault; // of the links
};

} // namespace orvex
