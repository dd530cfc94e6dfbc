#include "fault/fault.h"

#include "http/message.h"

namespace raidsim {

namespace {

constexpr std::string_view lengthMark = "{length}";

void edit(const FaultCase& chosen, bool header, std::string& text) {
    for (const FaultEdit& change : chosen.edits) {
        if (change.ofHeader == header)
            change.change(text);
    }
}

}  // namespace

FaultAnswer answerOf(const FaultCase& chosen, std::string goodBody) {
    edit(chosen, false, goodBody);
    std::string header = http::header(200, lengthMark);
    edit(chosen, true, header);
    const std::string length = std::to_string(goodBody.size());
    for (auto found = header.find(lengthMark); found != std::string::npos;
         found = header.find(lengthMark))
        header.replace(found, lengthMark.size(), length);
    return {header + goodBody, header.size()};
}

}  // namespace raidsim
