#include "state/event_answer.h"

#include <string_view>

#include "soap/envelope.h"
#include "text.h"
#include "xml/elements.h"
#include "xml/tree.h"
#include "xml/well_formed.h"

namespace raidsim {

namespace {

constexpr const char* listElement = "ac:events";
constexpr const char* eventElement = "ac:event";

std::optional<int> numberOf(std::string_view event) {
    const xml::Tree document = xml::parse(event);
    return parseInt(trim(xml::textOf(document.front().second, "as:sequenceNumber")));
}

bool isWellFormed(const std::string& body) {
    try {
        xml::checkWellFormed(body);
        return true;
    } catch (const xml::XmlError&) {
        return false;
    }
}

}  // namespace

std::optional<EventAnswer> cutEventAnswer(const std::string& body) {
    if (!isWellFormed(body))
        return std::nullopt;
    const auto lists = xml::elementsOf(body, listElement);
    if (lists.size() != 1)
        return std::nullopt;
    EventAnswer cut;
    std::size_t end = 0;  // of the event before
    for (const std::string_view event : xml::elementsOf(lists.front(), eventElement)) {
        const auto number = numberOf(event);
        if (!number)
            return std::nullopt;
        const auto start = static_cast<std::size_t>(event.data() - body.data());
        std::string gap = body.substr(end, start - end);
        if (cut.events.empty()) {
            cut.frame.head = gap.substr(0, gap.find_last_not_of(" \t\r\n") + 1);
            gap.erase(0, cut.frame.head.size());
        }
        cut.events.push_back({*number, std::move(gap), std::string(event)});
        end = start + event.size();
    }
    if (!cut.events.empty())
        cut.frame.tail = body.substr(end);
    cut.frame.empty = cut.events.empty() ? body : cut.frame.head + cut.frame.tail;
    return cut;
}

EventFrame ownEventFrame() {
    xml::Tree content;
    xml::addChild(content, listElement, xml::element("o:Events"));
    const std::string empty =
        xml::format(soap::envelope("m:getEventsResponse", std::move(content)));
    const auto end = empty.rfind(std::string("</") + listElement);
    return {empty.substr(0, end), "\n      " + empty.substr(end), empty};
}

}  // namespace raidsim
