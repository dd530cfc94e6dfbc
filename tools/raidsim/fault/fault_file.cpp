#include "fault/fault_file.h"

#include <algorithm>
#include <charconv>
#include <filesystem>
#include <set>

#include "fault/instructions.h"
#include "files.h"
#include "text.h"

namespace raidsim {

namespace {

constexpr std::size_t mostCases = 1'000'000;

// {length} is no variable: it becomes a number when the answer is made.
constexpr std::string_view lengthName = "length";

char escapedByte(std::string_view line, std::size_t& at) {
    const char letter = at < line.size() ? line[at++] : '\0';
    switch (letter) {
        case 'n':
            return '\n';
        case 'r':
            return '\r';
        case 't':
            return '\t';
        case '0':
            return '\0';
        case '\\':
        case '"':
            return letter;
        default:
            break;
    }
    unsigned value = 0;
    const char* const digits = line.data() + at;
    if (letter != 'x' || line.size() - at < 2 ||
        std::from_chars(digits, digits + 2, value, 16).ptr != digits + 2)
        throw FaultError("an escape is \\n, \\r, \\t, \\0, \\xNN, \\\\ or \\\"");
    at += 2;
    return static_cast<char>(static_cast<unsigned char>(value));
}

bool isName(std::string_view word) {
    return !word.empty() && std::ranges::all_of(word, [](char c) { return c >= 'a' && c <= 'z'; });
}

// The names between braces.
std::vector<std::string> namesIn(const std::vector<std::string>& words) {
    std::vector<std::string> names;
    for (const std::string_view word : words) {
        for (auto open = word.find('{'); open != std::string_view::npos;
             open = word.find('{', open + 1)) {
            const auto name = word.substr(open + 1, word.find('}', open) - open - 1);
            if (open + 1 + name.size() < word.size() && isName(name))
                names.emplace_back(name);
        }
    }
    return names;
}

// For people, who are told in one line.
std::string spelled(std::string_view value) {
    constexpr std::string_view digits = "0123456789ABCDEF";
    std::string text;
    for (const char c : value) {
        const auto byte = static_cast<unsigned char>(c);
        if (byte >= 0x20 && byte < 0x7f) {
            text += c;
        } else {
            text.append("\\x").append(1, digits[byte / 16]).append(1, digits[byte % 16]);
        }
    }
    return text;
}

template <typename Action>
void inLine(std::size_t number, Action action) {
    try {
        action();
    } catch (const std::runtime_error& error) {
        throw FaultError("line " + std::to_string(number) + ": " + error.what());
    }
}

}  // namespace

std::vector<std::string> faultWords(std::string_view line) {
    std::vector<std::string> words;
    bool inWord = false;
    bool quoted = false;
    for (std::size_t at = 0; at < line.size();) {
        const char c = line[at++];
        if (!quoted && (c == ' ' || c == '\t' || c == '\r')) {
            inWord = false;
            continue;
        }
        if (!std::exchange(inWord, true))
            words.emplace_back();
        if (c == '"') {
            quoted = !quoted;
        } else {
            words.back() += quoted && c == '\\' ? escapedByte(line, at) : c;
        }
    }
    if (quoted)
        throw FaultError("a quote is not closed");
    return words;
}

std::size_t FaultFile::Variable::size() const {
    return values.empty() ? static_cast<std::size_t>(last - first) + 1 : values.size();
}

std::string FaultFile::Variable::at(std::size_t index) const {
    return values.empty() ? std::to_string(first + static_cast<std::int64_t>(index))
                          : values[index];
}

// `vary NAME FIRST..LAST` or `vary NAME VALUE VALUE...`
FaultFile::Variable FaultFile::variableOf(const std::vector<std::string>& words) {
    if (words.size() < 3 || !isName(words[1]) || words[1] == lengthName)
        throw FaultError("usage: vary NAME FIRST..LAST, or vary NAME VALUE VALUE...");
    Variable variable{words[1], {words.begin() + 2, words.end()}};
    const auto dots = words[2].find("..");
    if (words.size() > 3 || dots == std::string::npos)
        return variable;
    const auto first = parseInt(words[2].substr(0, dots));
    const auto last = parseInt(words[2].substr(dots + 2));
    if (!first || !last || *last < *first)
        throw FaultError("\"" + words[2] + "\" is not a range of numbers");
    variable.values.clear();
    variable.first = *first;
    variable.last = *last;
    return variable;
}

FaultFile::FaultFile(const std::string& path)
    : folder(folderOf(path)), fileName(std::filesystem::path(path).stem().string()) {
    const std::string text = readFile(path);
    std::size_t number = 0;
    for (const std::string_view line : split(text, '\n')) {
        ++number;
        if (trim(line).empty() || trim(line).starts_with('#'))
            continue;
        inLine(number, [&] { take({number, faultWords(line)}); });
    }
    if (sentence.empty())
        throw FaultError("the file has no title");
    checkNames();
    (void)at(0);
    (void)at(count - 1);
}

void FaultFile::take(Line line) {
    if (line.words[0] == "title") {
        if (line.words.size() != 2 || line.words[1].empty())
            throw FaultError("usage: title \"SENTENCE\"");
        sentence = line.words[1];
    } else if (line.words[0] == "vary") {
        variables.push_back(variableOf(line.words));
        const std::size_t values = variables.back().size();
        if (values > mostCases / count)
            throw FaultError("the file stands for too many cases");
        count *= values;
    } else {
        lines.push_back(std::move(line));
    }
}

// Every {name} must be a variable, and every variable be used.
void FaultFile::checkNames() const {
    std::set<std::string> unused;
    for (const Variable& variable : variables)
        unused.insert(variable.name);
    const std::set<std::string> known = unused;
    for (const Line& line : lines) {
        inLine(line.number, [&] {
            for (const auto& name : namesIn(line.words)) {
                if (name != lengthName && !known.contains(name))
                    throw FaultError("nothing is called {" + name + "}");
                unused.erase(name);
            }
        });
    }
    if (!unused.empty())
        throw FaultError("nothing uses {" + *unused.begin() + "}");
}

FaultCase FaultFile::at(std::size_t number) const {
    if (number >= count)
        throw FaultError("there are " + std::to_string(count) + " cases, counted from 0");
    std::vector<std::pair<std::string, std::string>> values;
    std::string described;
    // The last variable changes fastest.
    for (auto variable = variables.rbegin(); variable != variables.rend(); ++variable) {
        const std::string value = variable->at(number % variable->size());
        number /= variable->size();
        values.emplace_back("{" + variable->name + "}", value);
        described.insert(0, (variable + 1 == variables.rend() ? "" : ", ") + variable->name + "=" +
                                spelled(value));
    }
    CaseBuilder builder(folder);
    for (const Line& line : lines) {
        inLine(line.number, [&] {
            auto words = line.words;
            for (auto& word : words) {
                for (const auto& [name, value] : values) {
                    for (auto found = word.find(name); found != std::string::npos;
                         found = word.find(name, found + value.size())) {
                        word.replace(found, name.size(), value);
                    }
                }
            }
            obey(builder, words);
        });
    }
    auto made = builder.finish();
    made.values = described;
    return made;
}

}  // namespace raidsim
