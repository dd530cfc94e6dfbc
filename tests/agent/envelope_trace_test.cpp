// The whole trace of reading a tiny answer.

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

#include "agent_documents.h"
#include "support/files.h"
#include "support/fresh_library.h"

namespace {

using namespace raid::test;

struct Find {
    std::size_t at;
    std::string line;
};

// The trace of one document, put together unit by unit.
class Trace {
public:
    explicit Trace(std::size_t documentLength) : left(documentLength) {}

    Trace& line(std::string_view text) {
        trace.append(text);
        return *this;
    }

    // A unit: its characters, the state in which each is met ("a" is 10), and what is logged once
    // the character at a place was handled.
    Trace& unit(std::string_view characters, std::string_view states, std::size_t consumed,
                const std::vector<Find>& finds) {
        trace += "Enter ParseDefUnit length=" + std::to_string(left) + "\n";
        for (std::size_t at = 0; at < characters.size(); ++at) {
            trace += "state " + (states[at] == 'a' ? "10" : std::string(1, states[at]));
            trace += std::string(", char ") + characters[at] + "\n";
            for (const Find& find : finds) {
                trace += find.at == at ? find.line : "";
            }
        }
        left -= consumed;
        return *this;
    }

    // A tag without attributes.
    Trace& tag(std::string_view tag) {
        const auto name = tag.substr(tag[1] == '/' ? 2 : 1);
        return unit(
            tag, "02" + std::string(tag.size() - 2, '3'), tag.size(),
            {{tag.size() - 1, "element " + std::string(name.substr(0, name.size() - 1)) + "\n"}});
    }

    // A tag that is looked at and read once more.
    Trace& glance(std::string_view tag) {
        this->tag(tag);
        left += tag.size();
        return *this;
    }

    [[nodiscard]] const std::string& text() const { return trace; }

private:
    std::string trace;
    std::size_t left;
};

Trace throughBody(std::string_view document) {
    Trace trace(document.size());
    trace.unit("<?xml v='1' ?>", "0233334579944a", 14,
               {{5, "element ?xml\n"}, {10, "Attribute: v=1\n"}});
    return trace.tag("<env:Envelope>").tag("<env:Body>");
}

class EnvelopeTrace : public FreshLibrary {
protected:
    EnvelopeTrace() { writeLogLevel(9); }
};

const std::string start = "<?xml v='1' ?><env:Envelope><env:Body>";
const std::string end = "</env:Body></env:Envelope>";

TEST_F(EnvelopeTrace, ShowsEveryCharacterAndFindOfAnEventsAnswer) {
    const std::string document =
        start +
        "<m:getEventsResponse><ac:events><ac:event><as:fru>F 1 </as:fru></ac:event></ac:events>"
        "</m:getEventsResponse>" +
        end;
    process(processEventXML, document);
    EXPECT_EQ(readLog(), throughBody(document)
                             .tag("<m:getEventsResponse>")
                             .glance("<ac:events>")
                             .line("RAIDEvents Constructor\n")
                             .tag("<ac:events>")
                             .glance("<ac:event>")
                             .line("RAIDEvent Constructor\n")
                             .tag("<ac:event>")
                             .tag("<as:fru>")
                             .unit("F 1 <", "01111", 4, {{4, "CDATA F 1\n"}})
                             .tag("</as:fru>")
                             .tag("</ac:event>")
                             .line("Exit RAIDEvent Constructor\n")
                             .tag("</ac:events>")
                             .line("Exit RAIDEvents Constructor\n")
                             .text());
    EXPECT_EQ(currentEvents(), 1);
}

TEST_F(EnvelopeTrace, ShowsEveryCharacterAndFindOfAConfigurationAnswer) {
    const std::string document = start +
                                 "<m:getConfigResponse><ac:system><ac:adapter></ac:adapter>"
                                 "</ac:system></m:getConfigResponse>" +
                                 end;
    process(processXML, document);
    EXPECT_EQ(readLog(), throughBody(document)
                             .tag("<m:getConfigResponse>")
                             .glance("<ac:system>")
                             .line("RAIDSystem Constructor\n")
                             .tag("<ac:system>")
                             .glance("<ac:adapter>")
                             .line("RAIDAdapter Constructor\n")
                             .tag("<ac:adapter>")
                             .tag("</ac:adapter>")
                             .line("Exit RAIDSystem Constructor\n")
                             .tag("</ac:system>")
                             .line("Exit RAIDSystem Constructor\n")
                             .text());
}

TEST_F(EnvelopeTrace, EndsWithTheErrorOfAMalformedAnswer) {
    const std::string document = start + "<m:getConfigResponse><ac:system></ac:adapter>";
    process(processXML, document);
    EXPECT_EQ(readLog(), throughBody(document)
                             .tag("<m:getConfigResponse>")
                             .glance("<ac:system>")
                             .line("RAIDSystem Constructor\n")
                             .tag("<ac:system>")
                             .tag("</ac:adapter>")
                             .line("XML syntax error: End of \"system\" is missing before : "
                                   "ac:adapter\nsystem:\n")
                             .text());
}

TEST_F(EnvelopeTrace, EndsWithTheFirstUnitOfAnotherName) {
    const std::string document = start + "<m:getEventsResponse><ac:events></ac:events>";
    process(processXML, document);
    EXPECT_EQ(readLog(), throughBody(document).tag("<m:getEventsResponse>").text());
}

TEST_F(EnvelopeTrace, ShowsTheThreeUnitsOfAReturnedNumber) {
    const std::string document = start + "<m:r><as:return>7</as:return></m:r>" + end;
    EXPECT_EQ(process(processReturnValueXML, document), 7);
    EXPECT_EQ(readLog(), throughBody(document)
                             .tag("<m:r>")
                             .tag("<as:return>")
                             .unit("7<", "01", 1, {{1, "CDATA 7\n"}})
                             .line("before atoi\nafter atoi\nbefore free\nafter free\n")
                             .text());
}

TEST_F(EnvelopeTrace, IsNotWrittenAtLevelEight) {
    writeLogLevel(8);
    process(processXML, systemNamed("host"));
    EXPECT_EQ(currentSystem(), "host");
    EXPECT_EQ(readLog(), "");
}

}  // namespace
