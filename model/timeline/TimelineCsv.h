#pragma once

#include "TimelineSink.h"

#include <ostream>
#include <string>
#include <vector>

namespace orvex {

// A timeline as a table of comma-separated values (RFC 4180): a line for each change of a row, under the
// heading "time,path,key,text,number,unit".
//
// Times are in UTC: "2026-11-16T05:54:31.200Z". Number and unit are those of a quantity and empty for every
// other text. A row that is no longer shown has an empty text; a row that shows an empty text has "" there.
class TimelineCsv final : public TimelineSink {
public:
    // Writes the heading. The stream outlives the table; its state says whether everything could be written.
    explicit TimelineCsv(std::ostream& stream);

    void sample(Date time) override;
    void addRow(std::size_t number, const TimelineRow& row) override;
    void set(std::size_t number, const std::string& text) override;
    void clear(std::size_t number) override;

private:
    void beginLine(std::size_t number);
    void endLine();

    std::ostream& _stream;
    std::string _time;
    std::string _line;
    std::vector<std::string> _rows; // ",path,key," of each
};

// "2026-11-16T05:54:31.200Z"
std::string timestampOf(Date time);

} // namespace orvex
