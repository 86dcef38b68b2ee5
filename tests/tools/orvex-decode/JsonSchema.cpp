#include "JsonSchema.h"

#include <valijson/adapters/nlohmann_json_adapter.hpp>
#include <valijson/schema.hpp>
#include <valijson/schema_parser.hpp>
#include <valijson/validator.hpp>

#include <fstream>

namespace orvex::test {

using Adapter = valijson::adapters::NlohmannJsonAdapter;

std::string schemaFaults(const std::string& document)
{
    std::ifstream file(ORVEX_RESOURCES "/orvex-decode.schema.json");
    const auto text = nlohmann::json::parse(file);
    valijson::Schema schema;
    valijson::SchemaParser().populateSchema(Adapter(text), schema);

    const auto json = nlohmann::json::parse(document);
    valijson::ValidationResults results;
    if (valijson::Validator().validate(schema, Adapter(json), &results))
        return {};
    std::string faults = "not valid:";
    valijson::ValidationResults::Error error;
    while (results.popError(error)) {
        for (const std::string& step : error.context)
            faults += step;
        faults += ' ' + error.description + '\n';
    }
    return faults;
}

} // namespace orvex::test
