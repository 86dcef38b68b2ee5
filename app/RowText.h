#pragma once

#include "OrvexModelNode.h"

#include <QString>

namespace orvex {

// Rows as text for the clipboard: name and value with a tab between, a branch its name alone. Control
// characters are escaped, so that a row stays a line and a cell a cell.
QString rowText(const OrvexModelNode& node);
// A line for each row of the screen that shows the node; null has none.
QString screenText(const OrvexModelNode* node);

} // namespace orvex
