#pragma once

#include "Dictionary.h"

namespace orvex {

// The rows of a list of pilots, "INDEX;PN" each: a display sorts them by the text before the semicolon and
// shows the one after it.
class PilotList {
public:
    PilotList();

    void add(int index, int pn, DeferredText content);

    const DictionaryRef& rows() const { return _rows; }
    // "(none)" in place of a list without pilots.
    Value rowsOrNone() const;

private:
    DictionaryRef _rows;
    bool _isEmpty = true;
};

// 10 log10 of a linear ratio, and the unit. A ratio of zero shows as minus infinity.
std::string decibelText(double ratio);

} // namespace orvex
