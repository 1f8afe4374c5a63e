#include "Schema.h"

#include "Xml.h"

#include <libxml/relaxng.h>
#include <stdexcept>

namespace catalogue {
namespace {

struct FreeSchema {
    void operator()(xmlRelaxNGParserCtxt* parser) const { xmlRelaxNGFreeParserCtxt(parser); }
    void operator()(xmlRelaxNG* schema) const { xmlRelaxNGFree(schema); }
    void operator()(xmlRelaxNGValidCtxt* validator) const { xmlRelaxNGFreeValidCtxt(validator); }
};
template <typename T>
using Owned = std::unique_ptr<T, FreeSchema>;

struct Collector {
    std::string name;
    std::vector<std::string> problems;
};

void collect(void* data, xmlError* error) noexcept {
    auto* collector = static_cast<Collector*>(data);
    std::string message = error->message ? error->message : "";
    while (!message.empty() && (message.back() == '\n' || message.back() == ' '))
        message.pop_back();
    collector->problems.push_back(collector->name + ":" + std::to_string(error->line) + ": " + message);
}

}  // namespace

std::vector<std::string> schemaProblems(const std::filesystem::path& schemaFile, const std::string& text,
                                        const std::string& name) {
    const Owned<xmlRelaxNGParserCtxt> parser(xmlRelaxNGNewParserCtxt(schemaFile.c_str()));
    const Owned<xmlRelaxNG> schema(xmlRelaxNGParse(parser.get()));
    if (!schema)
        throw std::runtime_error("not a RELAX NG schema: " + schemaFile.string());
    Collector collector{name, {}};
    try {
        const Document document = readDocument(text, name);
        const Owned<xmlRelaxNGValidCtxt> validator(xmlRelaxNGNewValidCtxt(schema.get()));
        xmlRelaxNGSetValidStructuredErrors(validator.get(), collect, &collector);
        if (xmlRelaxNGValidateDoc(validator.get(), document.get()) != 0 && collector.problems.empty())
            collector.problems.push_back(name + ": refused without a word");
    } catch (const std::runtime_error& malformed) {
        collector.problems.push_back(malformed.what());
    }
    return collector.problems;
}

}  // namespace catalogue
