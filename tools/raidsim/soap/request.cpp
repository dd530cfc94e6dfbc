#include "soap/request.h"

#include <algorithm>
#include <array>
#include <string>

#include "text.h"
#include "xml/tree.h"

namespace raidsim::soap {

namespace {

const xml::Tree::value_type* firstElement(const xml::Tree& parent) {
    const auto found = std::ranges::find_if(
        parent, [](const auto& child) { return child.first != xml::attributesKey; });
    return found == parent.end() ? nullptr : &*found;
}

const xml::Tree& only(const xml::Tree& parent, std::string_view name) {
    const auto* const child = firstElement(parent);
    if (child == nullptr || xml::localName(child->first) != name)
        throw RequestError("The request has no " + std::string(name) + " element");
    return child->second;
}

const xml::Tree& bodyOf(const xml::Tree& envelope) {
    for (const auto& [name, child] : envelope) {
        if (xml::localName(name) == "Body")
            return child;
    }
    throw RequestError("The request has no Body element");
}

int argument(const xml::Tree& method, std::string_view name) {
    for (const auto& [childName, child] : method) {
        if (xml::localName(childName) != name)
            continue;
        if (const auto value = parseInt(trim(child.data())))
            return *value;
        throw RequestError("The argument " + std::string(name) + " is not a number");
    }
    throw RequestError("The argument " + std::string(name) + " is missing");
}

struct Method {
    std::string_view name;
    Request (*read)(const xml::Tree& method);
};

constexpr std::array<Method, 3> methods{{
    {"getNewestEvent", [](const xml::Tree&) -> Request { return GetNewestEvent{}; }},
    {"waitNextEvent",
     [](const xml::Tree& method) -> Request {
         return WaitNextEvent{argument(method, "lastRetrieved")};
     }},
    {"getEvents",
     [](const xml::Tree& method) -> Request {
         return GetEvents{argument(method, "start"), argument(method, "end")};
     }},
}};

xml::Tree parseBody(std::string_view body) {
    try {
        return xml::parse(body);
    } catch (const xml::XmlError& error) {
        throw RequestError(std::string("The request is not well-formed: ") + error.what());
    }
}

}  // namespace

Request decode(std::string_view body) {
    const xml::Tree document = parseBody(body);
    const auto* const call = firstElement(bodyOf(only(document, "Envelope")));
    if (call == nullptr)
        throw RequestError("The request's Body is empty");
    const std::string_view name = xml::localName(call->first);
    const auto method = std::ranges::find(methods, name, &Method::name);
    if (method == methods.end())
        throw RequestError("Unknown method " + std::string(name));
    return method->read(call->second);
}

}  // namespace raidsim::soap
