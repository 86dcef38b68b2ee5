#include "ReportPage.h"

#include "ReportResources.h"

#include <QCryptographicHash>

#include <cstdio>
#include <streambuf>
#include <string>
#include <string_view>
#include <utility>

namespace orvex {

namespace {

// Passes JSON on, "<" as \u003c: it stands in texts only, and could end the element that the JSON is in.
class ScriptDataBuffer final : public std::streambuf {
public:
    explicit ScriptDataBuffer(std::ostream& stream)
        : _stream(stream)
    {
    }

protected:
    std::streamsize xsputn(const char* text, std::streamsize length) override
    {
        std::string_view rest(text, static_cast<std::size_t>(length));
        for (std::size_t end = rest.find('<'); end != std::string_view::npos; end = rest.find('<')) {
            _stream << rest.substr(0, end) << "\\u003c";
            rest.remove_prefix(end + 1);
        }
        _stream << rest;
        return _stream ? length : 0;
    }
    int overflow(int character) override
    {
        const char text = static_cast<char>(character);
        return xsputn(&text, 1) == 1 ? character : EOF;
    }

private:
    std::ostream& _stream;
};

std::string hashSource(std::string_view text)
{
    const QByteArray hash = QCryptographicHash::hash(
        QByteArrayView(text.data(), static_cast<qsizetype>(text.size())), QCryptographicHash::Sha256);
    return "'sha256-" + hash.toBase64().toStdString() + '\'';
}

std::string policy()
{
    return "default-src 'none'; script-src " + hashSource(resources::kLibrary) + ' '
        + hashSource(resources::kScript) + "; style-src " + hashSource(resources::kStyle)
        + "; base-uri 'none'; form-action 'none'";
}

void writeAsText(std::ostream& stream, std::string_view text)
{
    for (const char character : text) {
        switch (character) {
        case '&': stream << "&amp;"; break;
        case '<': stream << "&lt;"; break;
        default: stream << character;
        }
    }
}

void writePart(std::string_view name, std::ostream& stream, const std::function<void(JsonWriter&)>& writeData)
{
    const std::pair<std::string_view, std::string_view> parts[] = {
        {"style", resources::kStyle}, {"library", resources::kLibrary}, {"script", resources::kScript}};
    for (const auto& [partName, text] : parts) {
        if (partName == name)
            stream << text;
    }
    if (name == "policy") {
        stream << policy();
    } else if (name == "licence") {
        writeAsText(stream, resources::kLicence);
    } else if (name == "data") {
        ScriptDataBuffer buffer(stream);
        std::ostream data(&buffer);
        JsonWriter json(data);
        json.setCompact(true);
        writeData(json);
    }
}

} // namespace

void writeReportPage(std::ostream& stream, const std::function<void(JsonWriter&)>& writeData)
{
    std::string_view rest = resources::kPage;
    for (std::size_t mark = rest.find("{{"); mark != std::string_view::npos; mark = rest.find("{{")) {
        const std::size_t end = rest.find("}}", mark);
        stream << rest.substr(0, mark);
        writePart(rest.substr(mark + 2, end - mark - 2), stream, writeData);
        rest.remove_prefix(end + 2);
    }
    stream << rest;
}

} // namespace orvex
