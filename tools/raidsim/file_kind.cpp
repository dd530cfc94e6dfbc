#include "file_kind.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <exception>
#include <filesystem>
#include <fstream>
#include <string_view>
#include <system_error>

#include "control/scenario.h"
#include "fault/fault_file.h"
#include "recording/recording.h"
#include "text.h"

namespace raidsim {

namespace {

// Comments in front are far shorter, and so is what comes before the root element.
constexpr std::size_t headBytes = 64 * 1024;

// Empty for what cannot be read, or only waited for.
std::string headOf(const std::string& path) {
    std::error_code error;
    if (!std::filesystem::is_regular_file(path, error))
        return {};
    std::string head(headBytes, '\0');
    std::ifstream in(path, std::ios::binary);
    in.read(head.data(), static_cast<std::streamsize>(head.size()));
    head.resize(static_cast<std::size_t>(in.gcount()));
    return head;
}

// The first line that says something.
std::string_view firstStatement(std::string_view head) {
    for (const std::string_view raw : split(head, '\n')) {
        const std::string_view line = trim(raw);
        if (!line.empty() && !line.starts_with('#'))
            return line;
    }
    return {};
}

template <typename Parse>
bool understood(Parse parse) {
    try {
        parse();
        return true;
    } catch (const std::exception&) {
        return false;
    }
}

bool isConfiguration(std::string_view head) {
    return trim(head).starts_with('<') && head.find("<ac:system") != std::string_view::npos;
}

bool isRecording(std::string_view head) {
    const std::string heading(head.substr(0, head.find('\n')));
    return understood([&] { (void)recording::parse(heading + '\n'); });
}

bool isScenario(std::string_view head) {
    const std::string_view statement = firstStatement(head);
    return !statement.empty() && understood([&] { (void)parseScenario(statement); });
}

// Its title is what every one has, and begins with.
bool isFault(std::string_view head) {
    bool title = false;
    return understood([&] {
               const auto words = faultWords(firstStatement(head));
               title = words.size() == 2 && words.front() == "title";
           }) &&
           title;
}

bool isCommands(std::string_view head) {
    const std::string_view statement = firstStatement(head);
    return !statement.empty() && understood([&] { (void)parseScript(statement); });
}

struct Look {
    FileKind kind;
    const char* name;
    const char* use;
    bool (*is)(std::string_view head);
};

// No file begins as two of them.
constexpr std::array<Look, 5> looks{{
    {FileKind::configuration, "a configuration", "give it as CONFIG", isConfiguration},
    {FileKind::recording, "a recording", "use --replay", isRecording},
    {FileKind::scenario, "a scenario", "use --scenario", isScenario},
    {FileKind::fault, "a fault file", "use --fault", isFault},
    {FileKind::commands, "a file of commands", "use --init", isCommands},
}};

}  // namespace

std::string hintFor(const std::string& path, FileKind taken) {
    const std::string head = headOf(path);
    const auto look = std::ranges::find_if(looks, [&](const Look& each) { return each.is(head); });
    if (look == looks.end() || look->kind == taken)
        return {};
    return std::string("; this looks like ") + look->name + ": " + look->use;
}

}  // namespace raidsim
