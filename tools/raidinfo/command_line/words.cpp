#include "command_line/words.h"

#include <charconv>
#include <system_error>

namespace raidinfo {

CLI::Validator between(Bounds bounds) {
    return {[bounds](std::string& word) -> std::string {
                int number = 0;
                const char* const end = word.data() + word.size();
                const auto [behind, error] = std::from_chars(word.data(), end, number);
                if (error != std::errc{} || behind != end || number < bounds.least ||
                    number > bounds.most) {
                    return "Value " + word + " not in range " + std::to_string(bounds.least) +
                           " to " + std::to_string(bounds.most);
                }
                word = std::to_string(number);
                return "";
            },
            ""};
}

CLI::Validator notEmpty() {
    return {[](const std::string& word) -> std::string { return word.empty() ? "is empty" : ""; },
            ""};
}

CLI::Option* addNumber(CLI::App& app, const char* name, int& word, const char* meaning,
                       const char* type, Bounds bounds) {
    return app.add_option(name, word, meaning)
        ->type_name(type)
        ->transform(between(bounds))
        ->take_last();
}

CLI::Option* addFileOperand(CLI::App& app, const char* name, std::string& word,
                            const char* meaning) {
    return app.add_option(name, word, meaning)->type_name(value_type::file)->check(notEmpty());
}

CLI::Option* addFile(CLI::App& app, const char* name, std::string& word, const char* meaning) {
    return addFileOperand(app, name, word, meaning)->take_last();
}

std::optional<std::chrono::milliseconds> limitOf(const Words& words) {
    return words.timeout == 0
               ? std::nullopt
               : std::optional<std::chrono::milliseconds>{std::chrono::seconds{words.timeout}};
}

std::optional<std::filesystem::path> optionalPath(const std::string& word) {
    return word.empty() ? std::nullopt : std::optional<std::filesystem::path>{word};
}

}  // namespace raidinfo
