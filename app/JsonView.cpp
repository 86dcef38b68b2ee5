#include "JsonView.h"

#include "ConsoleOutput.h"

#include "TreeJson.h"

#include <sstream>

namespace orvex {

namespace {
constexpr std::size_t kSchema = 1;
}

void JsonView::show(const ConsoleState& state)
{
    std::ostringstream line;
    JsonWriter json(line);
    json.setCompact(true);
    json.beginObject();
    json.member("schema", kSchema);
    json.member("status", state.status);
    json.key("connected");
    json.boolean(state.isConnected);
    json.member("messages", state.messages);
    json.key("tree");
    if (state.tree)
        writeTreeJson(json, *state.tree, state.path);
    else
        json.null();
    json.endObject();
    json.endDocument();
    _output.write(line.str());
}

} // namespace orvex
