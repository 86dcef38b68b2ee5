#include "PropertyListReaders.h"

#include "XMLScalars.h"
#include "XMLText.h"

#include "Array.h"
#include "Dictionary.h"

#include <pugixml.hpp>

#include <algorithm>
#include <string_view>
#include <utility>

namespace orvex {

namespace {
using Fault = PropertyListFault;

bool isBlank(std::string_view text)
{
    return std::ranges::all_of(text, isXMLWhiteSpace);
}

// The parser takes about 64 bytes of memory per tag, comment, attribute and text between tags, so their
// number is limited too.
void requireFewTags(std::string_view text, const PropertyListLimits& limits)
{
    const std::size_t most = limits.maximumNodes + 1000; // <plist>, comments and the version are no values
    if (text.size() <= most)
        return;
    std::size_t count = 0;
    for (std::size_t i = 1; i < text.size(); ++i) {
        if ((text[i - 1] == '<' && text[i] != '/') || text[i] == '=')
            ++count;
    }
    if (count > most)
        throw PropertyListCount::tooManyNodes(limits);
}

// Comments and CDATA may split a text into pieces. Blank pieces are kept only then, because keeping the
// indentation takes twice the memory.
unsigned parserOptions(std::string_view text)
{
    using namespace pugi;
    const bool mayHavePieces =
        text.find("!--") != std::string_view::npos || text.find("![") != std::string_view::npos;
    return parse_minimal | parse_declaration | parse_doctype | parse_pi | parse_comments | parse_cdata
        | parse_fragment | parse_embed_pcdata | (mayHavePieces ? parse_ws_pcdata : parse_ws_pcdata_single);
}

// Checks what the parser does not: which elements there are, what they may hold, and document types, whose
// declarations the parser skips. The parser leaves character references alone so that malformed ones can be
// refused.
class XMLReader {
public:
    explicit XMLReader(const PropertyListLimits& limits)
        : _count(limits)
    {
    }

    Value valueOf(const pugi::xml_document& document)
    {
        Value value;
        forEachElement(rootOf(document), [&](pugi::xml_node element) {
            if (!value.isNull())
                throw Fault("more than one value in <plist>");
            value = valueOf(element, 0);
        });
        if (value.isNull())
            throw Fault("no value in <plist>");
        return value;
    }

private:
    pugi::xml_node rootOf(const pugi::xml_document& document)
    {
        pugi::xml_node root;
        for (const pugi::xml_node node : document.children()) {
            switch (node.type()) {
            case pugi::node_element:
                if (root || std::string_view(node.name()) != "plist")
                    throw Fault("an element outside of <plist>");
                root = node;
                requirePlainAttributes(root);
                break;
            case pugi::node_doctype:
                if (root)
                    throw Fault("a document type after the start");
                requireNoDeclarations(node.value());
                break;
            default: requireNoText(node);
            }
        }
        if (!root)
            throw Fault("no <plist> element");
        return root;
    }

    // Recursive: the depth, the number of containers around the element, is limited.
    Value valueOf(pugi::xml_node element, std::size_t depth)
    {
        const std::string_view name = element.name();
        if (name == "key")
            throw Fault("a key in the place of a value");
        _count.addNode();
        requirePlainAttributes(element);
        if (name == "dict")
            return dictionaryOf(element, depth);
        if (name == "array")
            return arrayOf(element, depth);
        const auto readText = xmlScalarReader(name);
        if (!readText)
            throw Fault("an unknown element");
        Value value = readText(textOf(element, name == "string"));
        if (value.isNull())
            throw Fault("the content of <" + std::string(name) + "> cannot be read");
        return value;
    }

    ArrayRef arrayOf(pugi::xml_node element, std::size_t depth)
    {
        _count.enterContainer(depth);
        auto array = Array::make();
        forEachElement(element, [&](pugi::xml_node child) { array->append(valueOf(child, depth + 1)); });
        return array;
    }

    DictionaryRef dictionaryOf(pugi::xml_node element, std::size_t depth)
    {
        _count.enterContainer(depth);
        auto dictionary = Dictionary::make();
        // Records of a list have equal sizes. Each size is used once, so at most half of the room is wasted.
        dictionary->reserve(std::exchange(_sizeOfLast, 0));
        Value* value = nullptr; // of the preceding key
        forEachElement(element, [&](pugi::xml_node child) {
            if (value) {
                *std::exchange(value, nullptr) = valueOf(child, depth + 1);
                return;
            }
            if (std::string_view(child.name()) != "key")
                throw Fault("a value without a key in <dict>");
            _count.addNode();
            requirePlainAttributes(child);
            value = &dictionary->slot(textOf(child, true));
        });
        if (value)
            throw Fault("a key without a value in <dict>");
        _sizeOfLast = dictionary->size();
        return dictionary;
    }

    template <typename Function>
    static void forEachElement(pugi::xml_node container, Function function)
    {
        if (!isBlank(container.value()))
            throw Fault("text outside of an element");
        // Not children(), whose iterators call into the library several times per step.
        for (pugi::xml_node child = container.first_child(); child; child = child.next_sibling()) {
            if (child.type() == pugi::node_element)
                function(child);
            else
                requireNoText(child);
        }
    }

    static void requireNoText(pugi::xml_node node)
    {
        if (node.type() == pugi::node_cdata || (node.type() == pugi::node_pcdata && !isBlank(node.value())))
            throw Fault("text outside of an element");
    }

    // The text of an element without child elements. Valid until the next call.
    std::string_view textOf(pugi::xml_node element, bool mayHoldMarkup)
    {
        const std::string_view text = element.value(); // up to the first child
        if (!element.first_child() && text.find('&') == std::string_view::npos)
            return text;
        _text.clear();
        appendXMLText(_text, text);
        for (const pugi::xml_node child : element.children()) {
            if (child.type() == pugi::node_pcdata)
                appendXMLText(_text, child.value());
            else if (child.type() != pugi::node_comment && child.type() != pugi::node_cdata)
                throw Fault("an element inside of <" + std::string(element.name()) + ">");
            else if (!mayHoldMarkup)
                throw Fault("markup inside of <" + std::string(element.name()) + ">");
            else if (child.type() == pugi::node_cdata)
                _text += child.value();
        }
        return _text;
    }

    static void requirePlainAttributes(pugi::xml_node element)
    {
        for (auto attribute = element.first_attribute(); attribute; attribute = attribute.next_attribute()) {
            if (std::string_view(attribute.value()).find_first_of("<>") != std::string_view::npos)
                throw Fault("a malformed tag");
        }
    }

    static void requireNoDeclarations(std::string_view documentType)
    {
        if (documentType.find_first_of("[<>") != std::string_view::npos)
            throw Fault("a document type with declarations");
    }

    PropertyListCount _count;
    std::string _text;           // of an element in several pieces
    std::size_t _sizeOfLast = 0; // of the last dictionary read
};
} // namespace

Value readXMLPropertyList(Bytes&& paddedList, const PropertyListLimits& limits)
{
    const std::string_view text(reinterpret_cast<const char*>(paddedList.data()), paddedList.size());
    if (text.find('\0') != std::string_view::npos)
        throw Fault("a zero byte in the text");
    requireFewTags(text, limits);
    pugi::xml_document document;
    const auto parsed = document.load_buffer_inplace(
        paddedList.data(), paddedList.size(), parserOptions(text), pugi::encoding_utf8);
    if (!parsed)
        throw Fault("malformed XML at byte " + std::to_string(parsed.offset) + ", " + parsed.description());
    return XMLReader(limits).valueOf(document);
}

} // namespace orvex
