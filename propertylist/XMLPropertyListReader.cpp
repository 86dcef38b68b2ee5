#include "XMLPropertyListReader.h"

#include "PropertyListCount.h"
#include "XMLCharacters.h"
#include "XMLPropertyListScalars.h"

#include "Array.h"
#include "Dictionary.h"

#include <algorithm>
#include <utility>

namespace orvex {

namespace {
using Fault = PropertyListFault;

struct Tag {
    enum class Form { opening, closing, empty, none };

    std::string_view name;
    Form form = Form::opening;

    bool isClosing() const { return form == Form::closing; }
    bool isEmpty() const { return form == Form::empty; }
    bool isNone() const { return form == Form::none; }
};

class Reader {
public:
    Reader(std::string_view list, const PropertyListLimits& limits)
        : _rest(list)
        , _count(limits)
    {
    }

    Value run()
    {
        if (_rest.find('\0') != std::string_view::npos)
            throw Fault("a zero byte in the text");
        const Tag root = nextTag();
        if (root.isNone())
            throw Fault("no <plist> element");
        if (root.name != "plist" || root.form != Tag::Form::opening)
            throw Fault("an element outside of <plist>");
        _hasRoot = true;

        const Tag first = nextTagIn("plist");
        if (first.isClosing())
            throw Fault("no value in <plist>");
        Value value = valueOf(first, 0);
        if (!nextTagIn("plist").isClosing())
            throw Fault("more than one value in <plist>");
        if (!nextTag().isNone())
            throw Fault("an element outside of <plist>");
        return value;
    }

private:
    // Recursive: the depth, which is the number of containers around the element, has its limit.
    Value valueOf(const Tag& tag, std::size_t depth)
    {
        if (tag.name == "key")
            throw Fault("a key in the place of a value");
        _count.addNode();
        if (tag.name == "dict")
            return dictionaryOf(tag, depth);
        if (tag.name == "array")
            return arrayOf(tag, depth);
        return scalarOf(tag);
    }

    ArrayRef arrayOf(const Tag& tag, std::size_t depth)
    {
        _count.enterContainer(depth);
        auto array = Array::make();
        if (tag.isEmpty())
            return array;
        for (;;) {
            const Tag element = nextTagIn("array");
            if (element.isClosing())
                return array;
            array->append(valueOf(element, depth + 1));
        }
    }

    DictionaryRef dictionaryOf(const Tag& tag, std::size_t depth)
    {
        _count.enterContainer(depth);
        auto dictionary = Dictionary::make();
        if (tag.isEmpty())
            return dictionary;
        // As large as the one before, as the records of a list are. Taken once, so that the room of all is at
        // most twice what they hold.
        dictionary->reserve(std::exchange(_sizeOfLast, 0));
        for (;;) {
            const Tag keyTag = nextTagIn("dict");
            if (keyTag.isClosing()) {
                _sizeOfLast = dictionary->size();
                return dictionary;
            }
            if (keyTag.name != "key")
                throw Fault("a value without a key in <dict>");
            _count.addNode();
            Value& value = dictionary->slot(contentOf(keyTag, true));
            const Tag valueTag = nextTagIn("dict");
            if (valueTag.isClosing())
                throw Fault("a key without a value in <dict>");
            value = valueOf(valueTag, depth + 1);
        }
    }

    Value scalarOf(const Tag& tag)
    {
        const auto readText = xmlScalarReader(tag.name);
        if (!readText)
            throw Fault("an unknown element");
        Value value = readText(contentOf(tag, tag.name == "string"));
        if (value.isNull())
            throw Fault("the content of <" + std::string(tag.name) + "> cannot be read");
        return value;
    }

    // What stands between the tag and the one that closes it. It holds until the next content is read.
    std::string_view contentOf(const Tag& tag, bool mayHoldMarkup)
    {
        if (tag.isEmpty())
            return {};
        const std::string_view text = takePlainText();
        if (take("</")) {
            close(tag);
            return text;
        }
        _text = text;
        while (!take("</")) {
            if (take("&"))
                appendXMLReference(_text, takePast(";", "a malformed reference"));
            else if (_rest.empty())
                throw Fault("an element that is not closed");
            else if (!mayHoldMarkup)
                throw Fault("markup inside of <" + std::string(tag.name) + ">");
            else if (take("<!--"))
                takePast("-->", "a comment that does not end");
            else if (take("<![CDATA["))
                _text += takePast("]]>", "a CDATA section that does not end");
            else
                throw Fault("an element inside of <" + std::string(tag.name) + ">");
            _text += takePlainText();
        }
        close(tag);
        return _text;
    }

    std::string_view takePlainText()
    {
        return takeWhile([](char character) { return character != '<' && character != '&'; });
    }

    // The name and the end of the tag that closes the element, behind its "</".
    void close(const Tag& tag)
    {
        if (!take(tag.name) || !takeEndOfTag())
            throw Fault("<" + std::string(tag.name) + "> is not closed");
    }

    // The next tag of the container's content, or the tag that closes the container.
    Tag nextTagIn(std::string_view container)
    {
        const Tag tag = nextTag();
        if (tag.isNone())
            throw Fault("<" + std::string(container) + "> is not closed");
        if (tag.isClosing() && tag.name != container)
            throw Fault("a closing tag that closes nothing");
        return tag;
    }

    // None at the end of the list.
    Tag nextTag()
    {
        for (;;) {
            takeWhile(isXMLWhiteSpace);
            if (_rest.empty())
                return {{}, Tag::Form::none};
            if (!take("<"))
                throw Fault("text outside of an element");
            if (take("/"))
                return {takeClosingName(), Tag::Form::closing};
            if (take("!--"))
                takePast("-->", "a comment that does not end");
            else if (take("!DOCTYPE"))
                skipDocumentType();
            else if (take("?"))
                skipInstruction();
            else
                return takeOpeningTag();
        }
    }

    Tag takeOpeningTag()
    {
        Tag tag{takeName()};
        if (take(">"))
            return tag;
        const std::string_view attributes = takePast(">", "a tag that does not end");
        if (attributes.ends_with('/'))
            tag.form = Tag::Form::empty;
        const bool isPlain = attributes == "/";
        if (!isPlain
            && (attributes.empty() || !isXMLWhiteSpace(attributes.front()) || hasOpenQuote(attributes)
                || attributes.find('<') != std::string_view::npos))
            throw Fault("a malformed tag");
        return tag;
    }

    std::string_view takeClosingName()
    {
        const std::string_view name = takeName();
        if (!takeEndOfTag())
            throw Fault("a malformed tag");
        return name;
    }

    bool takeEndOfTag()
    {
        takeWhile(isXMLWhiteSpace);
        return take(">");
    }

    std::string_view takeName()
    {
        return takeWhile([](char character) { return character >= 'a' && character <= 'z'; });
    }

    void skipInstruction()
    {
        if (takePast("?>", "a processing instruction that does not end").starts_with('>'))
            throw Fault("a malformed processing instruction");
    }

    void skipDocumentType()
    {
        if (_hasRoot)
            throw Fault("a document type after the start");
        const std::string_view text = takePast(">", "a document type that does not end");
        if (text.find_first_of("[<") != std::string_view::npos || hasOpenQuote(text))
            throw Fault("a document type with declarations");
    }

    static bool hasOpenQuote(std::string_view text)
    {
        char quote = 0;
        for (const char character : text) {
            if (quote ? character == quote : character == '"' || character == '\'')
                quote = quote ? '\0' : character;
        }
        return quote != 0;
    }

    bool take(std::string_view token)
    {
        // Not starts_with(): what compares few bytes, known when it is compiled, needs no call.
        if (_rest.size() < token.size() || !std::equal(token.begin(), token.end(), _rest.begin()))
            return false;
        _rest.remove_prefix(token.size());
        return true;
    }

    std::string_view takePast(std::string_view token, const char* fault)
    {
        const std::size_t length = _rest.find(token);
        if (length == std::string_view::npos)
            throw Fault(fault);
        const std::string_view taken = _rest.substr(0, length);
        _rest.remove_prefix(length + token.size());
        return taken;
    }

    template <typename Predicate>
    std::string_view takeWhile(Predicate isWanted)
    {
        const auto end = std::find_if_not(_rest.begin(), _rest.end(), isWanted);
        const std::string_view taken(_rest.begin(), end);
        _rest.remove_prefix(taken.size());
        return taken;
    }

    std::string_view _rest;
    PropertyListCount _count;
    std::string _text;           // of an element in more than one piece
    std::size_t _sizeOfLast = 0; // of the dictionary that was read last
    bool _hasRoot = false;
};
} // namespace

Value readXMLPropertyList(std::string_view list, const PropertyListLimits& limits)
{
    return Reader(list, limits).run();
}

} // namespace orvex
