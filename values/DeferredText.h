#pragma once

#include "PrintfFormat.h"
#include "TextFormat.h"

#include <array>
#include <cstdint>
#include <cstring>
#include <utility>

namespace orvex {

// A text formatted on first read. A modem reports a value hundreds of times between two refreshes of the
// screen; each report stores the numbers, only the last one is formatted.
//
// Holds a printf format and up to two arguments. Everything a const char* points to, the format included,
// must live as long as the program: a literal or a table's text.
class DeferredText {
public:
    static constexpr std::size_t kMaximumArguments = 2;

    // A text that needs no formatting.
    explicit DeferredText(const char* text)
        : _format(text)
        , _print([](const DeferredText& late) { return std::string(late._format); })
    {
    }
    // The function's text for a number.
    DeferredText(std::string (*make)(double), double number)
        : _format(nullptr)
        , _print([](const DeferredText& late) {
            return late.argument<std::string (*)(double)>(1)(late.argument<double>(0));
        })
    {
        store(_arguments[0], number);
        store(_arguments[1], make);
    }
    template <typename... Arguments>
    explicit DeferredText(PrintfFormat<std::type_identity_t<Arguments>...> format, Arguments... arguments)
        : _format(format.text())
        , _print(&printed<PrintfArgument<Arguments>...>)
    {
        static_assert(sizeof...(Arguments) <= kMaximumArguments);
        std::uint64_t* slot = _arguments.data();
        (store(*slot++, static_cast<PrintfArgument<Arguments>>(arguments)), ...);
    }

    std::string text() const { return _print(*this); }

private:
    template <typename T>
    static void store(std::uint64_t& slot, T argument)
    {
        static_assert(sizeof argument <= sizeof slot);
        std::memcpy(&slot, &argument, sizeof argument);
    }
    template <typename T>
    T argument(std::size_t index) const
    {
        T result;
        std::memcpy(&result, &_arguments[index], sizeof result);
        return result;
    }
    template <typename... Arguments>
    static std::string printed(const DeferredText& late)
    {
        return late.printWith<Arguments...>(std::index_sequence_for<Arguments...>());
    }
    template <typename... Arguments, std::size_t... index>
    std::string printWith(std::index_sequence<index...>) const
    {
        const PrintfValue values[] = {PrintfValue(argument<Arguments>(index))..., PrintfValue(0)};
        std::string result;
        appendPrinted(result, _format, values);
        return result;
    }

    const char* _format;
    std::string (*_print)(const DeferredText&);
    std::array<std::uint64_t, kMaximumArguments> _arguments;
};

} // namespace orvex
