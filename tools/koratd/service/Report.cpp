#include "Report.h"

#include "VisibleText.h"

#include <cstdio>

namespace orvex::korat {

void reportText(const std::string& text)
{
    const std::string line = "koratd: " + visibleText(text) + '\n';
    // One call, so that lines of several processes on one terminal stay whole.
    std::fwrite(line.data(), 1, line.size(), stderr);
}

} // namespace orvex::korat
