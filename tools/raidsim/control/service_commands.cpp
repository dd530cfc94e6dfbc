#include <memory>
#include <optional>

#include "control/makers.h"
#include "service.h"
#include "text.h"

namespace raidsim::makers {

// `fault FILE [CASE]` or `fault off`
Command fault(const Arguments& arguments) {
    const auto& words = arguments.words;
    if (words.size() == 1 && words[0] == "off") {
        return [](Service& service) {
            service.faults().off();
            return Outcome{"fault: off"};
        };
    }
    const std::string path = arguments.file(0);
    const auto file = about(path, [&] { return std::make_shared<const FaultFile>(path); });
    const auto number = words.size() > 1 ? parseInt(words[1]) : std::nullopt;
    if (words.size() > 1 && (!number || *number < 0))
        throw CommandError("\"" + words[1] + "\" is not the number of a case");
    const auto only = number ? std::optional(static_cast<std::size_t>(*number)) : std::nullopt;
    if (only)
        (void)file->at(*only);
    return [file, only](Service& service) {
        service.faults().arm(file, only);
        return Outcome{"fault: armed " + file->name()};
    };
}

Command down(const Arguments&) {
    return [](Service& service) {
        service.presence().goDown();
        return Outcome{};
    };
}

Command up(const Arguments&) {
    return [](Service& service) {
        service.presence().comeUp();
        return Outcome{};
    };
}

Command advance(const Arguments& arguments) {
    const auto time = parseSeconds(arguments.words[0]);
    if (!time)
        throw CommandError("\"" + arguments.words[0] + "\" is not " + std::string(secondsForm));
    return [time](Service&) { return Outcome{.advance = time}; };
}

Command status(const Arguments&) {
    return [](Service& service) {
        const EventLog& log = service.events();
        return Outcome{"document " + service.documentPath() + ", events " +
                       std::to_string(log.size()) + ", newest " + std::to_string(log.newest()) +
                       ", waiting clients " + std::to_string(log.waiting()) +
                       (service.presence().isDown() ? ", down" : "")};
    };
}

Command quit(const Arguments&) {
    return [](Service&) { return Outcome{.quit = true}; };
}

}  // namespace raidsim::makers
