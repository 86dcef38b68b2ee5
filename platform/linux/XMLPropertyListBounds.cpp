#include "XMLPropertyListBounds.h"

#include "XMLPropertyListText.h"

#include <algorithm>
#include <stdexcept>
#include <utility>
#include <vector>

namespace orvex {

namespace {
constexpr std::string_view kWhiteSpace = " \t\r\n";

struct Fault : std::runtime_error {
    using std::runtime_error::runtime_error;
};

class Scanner {
public:
    Scanner(std::string_view list, const PropertyListLimits& limits)
        : _rest(list)
        , _limits(limits)
    {
    }

    void run()
    {
        if (_rest.find('\0') != std::string_view::npos)
            throw Fault("a zero byte in the text");
        while (skipWhiteSpace(), !_rest.empty()) {
            if (take("<?"))
                skipInstruction();
            else if (take("<!--"))
                skipPast("-->", "a comment that does not end");
            else if (take("<!DOCTYPE"))
                skipDocumentType();
            else if (take("</"))
                closeContainer();
            else if (take("<"))
                openElement();
            else
                throw Fault("text outside of an element");
        }
        if (!_open.empty())
            throw Fault("<" + std::string(_open.back().name) + "> is not closed");
        if (!_hasRoot)
            throw Fault("no <plist> element");
    }

private:
    struct Container {
        std::string_view name;
        std::size_t children = 0;

        bool isDictionary() const { return name == "dict"; }
        bool isRoot() const { return name == "plist"; }
    };

    void skipWhiteSpace()
    {
        _rest.remove_prefix(std::min(_rest.find_first_not_of(kWhiteSpace), _rest.size()));
    }

    bool take(std::string_view token)
    {
        if (!_rest.starts_with(token))
            return false;
        _rest.remove_prefix(token.size());
        return true;
    }

    std::string_view skipPast(std::string_view token, const char* fault)
    {
        const std::size_t position = _rest.find(token);
        if (position == std::string_view::npos)
            throw Fault(fault);
        const std::string_view skipped = _rest.substr(0, position);
        _rest.remove_prefix(position + token.size());
        return skipped;
    }

    void skipInstruction()
    {
        const std::string_view text = skipPast("?>", "a processing instruction that does not end");
        // "<?>" and quotes that stay open end elsewhere for other parsers.
        if (text.starts_with('>') || hasOpenQuote(text))
            throw Fault("a malformed processing instruction");
    }

    void skipDocumentType()
    {
        if (_hasRoot)
            throw Fault("a document type after the start");
        const std::string_view text = skipPast(">", "a document type that does not end");
        if (text.find_first_of("[<") != std::string_view::npos || hasOpenQuote(text))
            throw Fault("a document type with declarations");
    }

    // Also when only double quotes count.
    static bool hasOpenQuote(std::string_view text)
    {
        if (std::count(text.begin(), text.end(), '"') % 2 != 0)
            return true;
        char quote = 0;
        for (const char character : text) {
            if (quote ? character == quote : character == '"' || character == '\'')
                quote = quote ? '\0' : character;
        }
        return quote != 0;
    }

    std::string_view takeName()
    {
        const std::size_t length =
            std::min(_rest.find_first_not_of("abcdefghijklmnopqrstuvwxyz"), _rest.size());
        const std::string_view name = _rest.substr(0, length);
        _rest.remove_prefix(length);
        return name;
    }

    void openElement()
    {
        const std::string_view name = takeName();
        const std::string_view attributes = skipPast(">", "a tag that does not end");
        const bool isEmpty = attributes.ends_with('/');
        const bool isPlain = attributes.empty() || attributes == "/";
        if (!isPlain
            && (kWhiteSpace.find(attributes.front()) == std::string_view::npos || hasOpenQuote(attributes)
                || attributes.find('<') != std::string_view::npos))
            throw Fault("a malformed tag");

        if (name == "plist") {
            if (isEmpty || std::exchange(_hasRoot, true))
                throw Fault("a <plist> that is empty or not alone");
            _open.push_back({name});
            return;
        }
        countChild(name);
        if (name == "array" || name == "dict") {
            if (_open.size() > _limits.maximumDepth) // <plist> does not count
                throw Fault("nested deeper than " + std::to_string(_limits.maximumDepth) + " containers");
            if (!isEmpty)
                _open.push_back({name});
        } else {
            checkLeaf(name, isEmpty);
        }
    }

    void countChild(std::string_view name)
    {
        if (_open.empty())
            throw Fault("an element outside of <plist>");
        if (++_nodes > _limits.maximumNodes)
            throw Fault("more than " + std::to_string(_limits.maximumNodes) + " values");
        Container& parent = _open.back();
        if (parent.isRoot() && parent.children == 1)
            throw Fault("more than one value in <plist>");
        const bool wantsKey = parent.isDictionary() && parent.children % 2 == 0;
        if ((name == "key") != wantsKey)
            throw Fault(wantsKey ? "a value without a key in <dict>" : "a key in the place of a value");
        ++parent.children;
    }

    void closeContainer()
    {
        const std::string_view name = takeName();
        skipWhiteSpace();
        if (!take(">") || _open.empty() || _open.back().name != name)
            throw Fault("a closing tag that closes nothing");
        if (_open.back().isRoot() && _open.back().children == 0)
            throw Fault("no value in <plist>");
        if (_open.back().isDictionary() && _open.back().children % 2 != 0)
            throw Fault("a key without a value in <dict>");
        _open.pop_back();
    }

    void checkLeaf(std::string_view name, bool isEmpty)
    {
        const bool isText = name == "string" || name == "key";
        if (isEmpty)
            return checkText(name, {});
        std::string_view content;
        for (bool isFirst = true;; isFirst = false) {
            const std::string_view part = skipPast("<", "an element that is not closed");
            if (isFirst)
                content = part;
            if (take("/"))
                break;
            if (!isText)
                throw Fault("markup inside of <" + std::string(name) + ">");
            if (take("!--"))
                skipPast("-->", "a comment that does not end");
            else if (take("![CDATA["))
                skipPast("]]>", "a CDATA section that does not end");
            else
                throw Fault("an element inside of <" + std::string(name) + ">");
        }
        const std::string_view closing = takeName();
        skipWhiteSpace();
        if (closing != name || !take(">"))
            throw Fault("<" + std::string(name) + "> is not closed");
        checkText(name, content);
    }

    static void checkText(std::string_view name, std::string_view content)
    {
        switch (checkXMLPropertyListText(name, content)) {
        case XMLPropertyListText::good: return;
        case XMLPropertyListText::malformed:
            throw Fault("the content of <" + std::string(name) + "> cannot be read");
        case XMLPropertyListText::unknownElement: throw Fault("an unknown element");
        }
    }

    std::string_view _rest;
    const PropertyListLimits& _limits;
    std::vector<Container> _open;
    std::size_t _nodes = 0;
    bool _hasRoot = false;
};
} // namespace

std::optional<std::string> faultOfXMLPropertyList(std::string_view list, const PropertyListLimits& limits)
{
    try {
        Scanner(list, limits).run();
        return std::nullopt;
    } catch (const Fault& fault) {
        return fault.what();
    }
}

} // namespace orvex
