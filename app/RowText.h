#pragma once

#include "OrvexModelNode.h"

#include <QString>

namespace orvex {

// Rows as text for the clipboard: name, tab, value; a branch is its name. Control characters are escaped, so
// that each row is one line.
QString rowText(const OrvexModelNode& node);
// A line for each row of the node's screen; none for null.
QString screenText(const OrvexModelNode* node);

} // namespace orvex
