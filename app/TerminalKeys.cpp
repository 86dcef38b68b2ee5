#include "TerminalKeys.h"

#include <algorithm>
#include <iterator>

namespace orvex {

namespace {

using Code = TerminalKey::Code;

constexpr char kEscape = '\x1b';

// What follows the escape character; both forms of the cursor keys, and those of rxvt and the Linux console.
struct Sequence {
    std::string_view text;
    Code code;
};
constexpr Sequence kSequences[] = {
    {"[A", Code::up},
    {"OA", Code::up},
    {"[B", Code::down},
    {"OB", Code::down},
    {"[5~", Code::pageUp},
    {"[6~", Code::pageDown},
    {"[H", Code::home},
    {"OH", Code::home},
    {"[1~", Code::home},
    {"[7~", Code::home},
    {"[F", Code::end},
    {"OF", Code::end},
    {"[4~", Code::end},
    {"[8~", Code::end},
};

bool isFinal(char character)
{
    return character >= '@' && character <= '~';
}

// The length of the sequence at the beginning, which follows an escape character.
std::size_t lengthOfSequence(std::string_view rest)
{
    if (rest.empty() || (rest[0] != '[' && rest[0] != 'O'))
        return 0;
    const auto* const final = std::find_if(rest.begin() + 1, rest.end(), isFinal);
    return static_cast<std::size_t>(std::distance(rest.begin(), final)) + (final == rest.end() ? 0 : 1);
}

TerminalKey keyOfSequence(std::string_view sequence)
{
    if (sequence.empty())
        return {Code::escape};
    const auto* const found = std::ranges::find(kSequences, sequence, &Sequence::text);
    return {found == std::end(kSequences) ? Code::other : found->code};
}

std::size_t lengthOfCharacter(std::string_view rest)
{
    const auto isContinuation = [](char byte) { return (static_cast<unsigned char>(byte) & 0xC0) == 0x80; };
    const auto* const end = std::find_if_not(rest.begin() + 1, rest.end(), isContinuation);
    return static_cast<std::size_t>(std::distance(rest.begin(), end));
}

TerminalKey keyOfCharacter(std::string_view character)
{
    switch (character[0]) {
    case '\r':
    case '\n': return {Code::enter};
    case '\b':
    case '\x7f': return {Code::backspace};
    case '\f': return {Code::redraw}; // Ctrl+L
    default: break;
    }
    if (static_cast<unsigned char>(character[0]) < ' ')
        return {Code::other};
    return {Code::text, std::string(character)};
}

} // namespace

std::vector<TerminalKey> terminalKeysIn(std::string_view input)
{
    std::vector<TerminalKey> keys;
    while (!input.empty()) {
        std::size_t length = 0;
        if (input[0] == kEscape) {
            length = 1 + lengthOfSequence(input.substr(1));
            keys.push_back(keyOfSequence(input.substr(1, length - 1)));
        } else {
            length = lengthOfCharacter(input);
            keys.push_back(keyOfCharacter(input.substr(0, length)));
        }
        input.remove_prefix(length);
    }
    return keys;
}

} // namespace orvex
