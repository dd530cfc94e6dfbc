#include "control/words.h"

#include "control/command.h"

namespace raidsim {

namespace {

constexpr bool isBlank(char c) noexcept { return c == ' ' || c == '\t' || c == '\r'; }

}  // namespace

std::vector<std::string> splitWords(std::string_view line) {
    std::vector<std::string> words;
    bool inWord = false;
    bool quoted = false;
    for (std::size_t i = 0; i < line.size(); ++i) {
        char c = line[i];
        if (!quoted && isBlank(c)) {
            inWord = false;
            continue;
        }
        if (!inWord)
            words.emplace_back();
        inWord = true;
        if (c == '"') {
            quoted = !quoted;
            continue;
        }
        if (quoted && c == '\\' && i + 1 < line.size())
            c = line[++i];
        if (static_cast<unsigned char>(c) < 0x20 && c != '\t')
            throw CommandError("a control character");
        words.back() += c;
    }
    if (quoted)
        throw CommandError("a quote is not closed");
    return words;
}

}  // namespace raidsim
