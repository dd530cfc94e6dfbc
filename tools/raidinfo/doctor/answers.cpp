#include "doctor/answers.h"

#include <algorithm>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>

#include "doctor/library_log.h"
#include "source/exchange.h"
#include "source/recorded.h"

namespace raidinfo {
namespace {

using Outcome = Examined::Outcome;

constexpr std::string_view blanks = " \t\r\n";

Examined withoutAnswer(Examined found, const std::stop_token& over, const char* what) {
    found.outcome = Outcome::bad;
    found.finding = over.stop_requested() ? "it gave no answer within the --timeout" : what;
    found.status = ExitStatus::serviceUnavailable;
    return found;
}

/// Enough of it to tell a page of another server from an answer. Of one whose headers end their
/// lines in CR LF, as those of other servers do, the library takes none of the page for the body.
std::string beginningOf(const std::string& body) {
    constexpr std::size_t longest = 60;
    if (body.empty()) {
        return "the library finds no body in it";
    }
    std::string text = body.substr(0, longest);
    std::ranges::replace_if(
        text, [](char c) { return blanks.find(c) != std::string_view::npos; }, ' ');
    return "it begins with \"" + text + (body.size() > longest ? "...\"" : "\"");
}

/// In the words of the library's reader; it has none for what it does not take for an answer.
Examined malformed(Examined found, const LibraryLog& log, const std::string& body) {
    found.outcome = Outcome::bad;
    found.status = ExitStatus::malformedAnswer;
    found.finding = log.lastError();
    if (found.finding.empty()) {
        found.finding =
            (log.trouble().empty() ? "not an answer to the question: "
                                   : "malformed; what the library says of it is not known, for " +
                                         log.trouble() + "; ") +
            beginningOf(body);
    }
    return found;
}

/// Whether the library, which makes 0 of an answer that it cannot read, too, has read it.
bool hasZero(std::string_view body) {
    for (std::size_t tagEnd = body.find('>'); tagEnd != std::string_view::npos;
         tagEnd = body.find('>', tagEnd + 1)) {
        const std::size_t text = body.find_first_not_of(blanks, tagEnd + 1);
        if (text != std::string_view::npos && body[text] == '0') {
            const std::size_t behind = body.find_first_not_of(blanks, text + 1);
            if (behind != std::string_view::npos && body[behind] == '<') {
                return true;
            }
        }
    }
    return false;
}

}  // namespace

// It asks once: between two questions the number may change.
Examined examinedNewestEvent(const Library& library, const std::stop_token& over) {
    Examined found{"answering", "Service answers", Outcome::fine, ""};
    const LibraryLog log{library};
    const auto body = Exchange{library}.newestEvent();
    if (!body) {
        return withoutAnswer(found, over, "it accepts connections and gives no answer");
    }
    constexpr int noAnswer = -1;  // what hosts take for it
    const int newest = newestEventIn(library, *body);
    library.function<void(int)>("setRAIDEventSequenceNumber")(newest);
    if (newest == noAnswer || (newest == 0 && !hasZero(*body))) {
        return malformed(found, log, *body);
    }
    found.finding = "its newest event is " + std::to_string(newest);
    return found;
}

// A configuration that is there was read well. A service that may have come up in between is given
// a second chance, as everywhere; that answer is kept, to say what it is if it cannot be read.
Examined examinedConfiguration(const Library& library, const std::stop_token& over) {
    Examined found{"well_formed", "Configuration", Outcome::fine, "well-formed"};
    const LibraryLog log{library};
    library.function<int()>("RAIDinit")();
    if (*library.variable<const void*>("raidSystem") != nullptr) {
        return found;
    }
    std::optional<std::string> body;
    if (!log.lastError().empty()) {
        body = "";  // A reader that says something has had an answer.
    } else if (!over.stop_requested()) {
        body = Exchange{library}.configuration();
        if (body && publishConfiguration(library, *body)) {
            return found;
        }
    }
    return body ? malformed(found, log, *body) : withoutAnswer(found, over, "it gave no answer");
}

Examined examinedEvents(const Library& library, const std::stop_token& over) {
    Examined found{"events", "Events", Outcome::fine, "well-formed"};
    const LibraryLog log{library};
    const std::int64_t newest = *library.variable<int>("nextSequenceNumber");
    const auto body = Exchange{library}.events(newest, newest + numbersAsked - 1);
    if (!body) {
        return withoutAnswer(found, over, "it gave no answer");
    }
    RecordReader reader{library};
    return eventsIn(library, reader, *body) ? found : malformed(found, log, *body);
}

}  // namespace raidinfo
