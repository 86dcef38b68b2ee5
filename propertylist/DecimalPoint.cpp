#include "DecimalPoint.h"

namespace orvex {

namespace {
locale_t theDecimalPoint()
{
    static const locale_t locale = newlocale(LC_NUMERIC_MASK, "C", duplocale(LC_GLOBAL_LOCALE));
    return locale;
}
} // namespace

DecimalPoint::DecimalPoint()
    : _previous(uselocale(theDecimalPoint()))
{
}

DecimalPoint::~DecimalPoint()
{
    uselocale(_previous);
}

} // namespace orvex
