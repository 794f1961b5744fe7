#include "support/documents.h"

#include <expat.h>

#include <memory>

#include <nlohmann/json.hpp>

namespace OrvixTest {

bool IsValidJson(const std::string& text) {
    return nlohmann::json::accept(text);
}

bool IsWellFormedXml(const std::string& text) {
    std::unique_ptr<XML_ParserStruct, void (*)(XML_Parser)> parser(XML_ParserCreate("UTF-8"), XML_ParserFree);
    if (!parser) return false;
    return XML_Parse(parser.get(), text.data(), static_cast<int>(text.size()), 1) == XML_STATUS_OK;
}

}  // namespace OrvixTest
