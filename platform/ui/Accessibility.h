#pragma once

namespace orvex {

// Tells assistive technology which of the widgets are lists, rows and progress indicators. Once per process.
void installAccessibility();

} // namespace orvex
