#include "soap/envelope.h"

#include <array>
#include <utility>

namespace raidsim::soap {

namespace {

constexpr std::array<std::pair<const char*, const char*>, 7> namespaces{{
    {"xmlns:env", "http://www.w3.org/2002/12/soap-envelope"},
    {"xmlns:xsi", "http://www.w3.org/2001/XMLSchema-instance"},
    {"xmlns:xsd", "http://www.w3.org/2001/XMLSchema-datatypes"},
    {"xmlns:m", "http://localhost/soap/v1/method"},
    {"xmlns:as", "http://localhost/soap/v1/argSimple"},
    {"xmlns:ac", "http://localhost/soap/v1/argComplex"},
    {"xmlns:o", "http://localhost/soap/v1/object"},
}};

}  // namespace

xml::Tree envelope(const std::string& response, xml::Tree&& content) {
    xml::Tree document;
    xml::Tree& outer = xml::addChild(document, "env:Envelope");
    for (const auto& [name, uri] : namespaces)
        xml::addAttribute(outer, name, uri);
    xml::addChild(xml::addChild(outer, "env:Body"), response).swap(content);
    return document;
}

std::string returnValueBody(const std::string& response, int value) {
    xml::Tree content;
    xml::addText(content, "as:return", "xsd:int", std::to_string(value));
    return xml::format(envelope(response, std::move(content)));
}

std::string faultBody(Blame blame, const std::string& reason) {
    xml::Tree code;
    xml::addChild(code, "env:Value",
                  xml::Tree(blame == Blame::sender ? "env:Sender" : "env:Receiver"));
    xml::Tree text(reason);
    xml::addAttribute(text, "xml:lang", "en");
    xml::Tree reasons;
    xml::addChild(reasons, "env:Text", text);
    xml::Tree fault;
    xml::addChild(fault, "env:Code", code);
    xml::addChild(fault, "env:Reason", reasons);
    return xml::format(envelope("env:Fault", std::move(fault)));
}

}  // namespace raidsim::soap
