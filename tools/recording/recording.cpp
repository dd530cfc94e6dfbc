#include "recording/recording.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cstddef>
#include <span>
#include <system_error>

namespace recording {

namespace {

constexpr std::string_view name = "raid-recording";
constexpr std::string_view version = "1";

// In the order of Question.
constexpr std::array<std::string_view, 3> questions{"configuration", "newest-event", "events"};

enum class Kind : std::uint8_t { answer, failure };
constexpr std::array<std::string_view, 2> kinds{"answer", "failure"};

constexpr bool isDigit(char c) noexcept { return c >= '0' && c <= '9'; }

bool isUtcTime(std::string_view text) {
    constexpr std::string_view pattern = "0000-00-00T00:00:00Z";
    return std::ranges::equal(text, pattern, [](char c, char wanted) {
        return wanted == '0' ? isDigit(c) : c == wanted;
    });
}

[[noreturn]] void fail(std::size_t offset, const std::string& what) {
    throw RecordingError("byte " + std::to_string(offset) + ": " + what);
}

// Foreign bytes as part of a message of one line.
std::string quoted(std::string_view word) {
    constexpr std::size_t longest = 40;
    std::string shown(word.substr(0, longest));
    std::ranges::replace_if(
        shown, [](char c) { return c < ' ' || c > '~'; }, '?');
    return '"' + shown + (word.size() > longest ? "...\"" : "\"");
}

// Nothing is wrong but that the file ends here.
struct CutShort {};

struct Word {
    std::string_view text;
    std::size_t offset;
    bool whole;  // the file does not end in its midst
};

// The words of a line in turn, with a blank between them.
class Line {
public:
    // The line that begins there.
    Line(std::string_view file, std::size_t start) : at(start) {
        const auto feed = file.find('\n', start);
        ended = feed != std::string_view::npos;
        rest = file.substr(start, ended ? feed - start : feed);
    }

    [[nodiscard]] bool isEnded() const noexcept { return ended; }

    Word take() {
        const auto blank = rest.find(' ');
        const bool last = blank == std::string_view::npos;
        const Word word{rest.substr(0, blank), at, !last || ended};
        const std::size_t passed = last ? rest.size() : blank + 1;
        finished = last;
        rest.remove_prefix(passed);
        at += passed;
        return word;
    }

    // Which of the choices comes next.
    std::size_t takeOneOf(std::span<const std::string_view> choices, const char* what) {
        const Word word = take();
        const auto found = std::ranges::find_if(choices, [&](std::string_view choice) {
            return word.whole ? choice == word.text : choice.starts_with(word.text);
        });
        if (found == choices.end())
            failAt(word, what);
        if (!word.whole)
            throw CutShort();
        return static_cast<std::size_t>(found - choices.begin());
    }

    std::int64_t takeNumber(const char* what) {
        const Word word = take();
        const bool digits = std::ranges::all_of(word.text, isDigit);
        if (!digits || (word.text.empty() && word.whole))
            failAt(word, what);
        std::int64_t number = 0;
        const char* const end = word.text.data() + word.text.size();
        if (std::from_chars(word.text.data(), end, number).ec == std::errc::result_out_of_range)
            fail(word.offset, quoted(word.text) + " is too large for " + what);
        if (!word.whole)
            throw CutShort();
        return number;
    }

    // Where the next line begins.
    std::size_t end() const {
        if (!finished)
            fail(at, "the line does not end there");
        return at + 1;
    }

private:
    [[noreturn]] static void failAt(const Word& word, const char* what) {
        fail(word.offset, word.text.empty() ? std::string(what) + " is missing"
                                            : quoted(word.text) + " is not " + what);
    }

    std::string_view rest;
    std::size_t at;
    bool ended = false;
    bool finished = false;
};

class Reader {
public:
    explicit Reader(std::string_view file) : text(file) {}

    Recording read() {
        readHeading();
        try {
            while (at < text.size())
                readEntry();
        } catch (const CutShort&) {
            made.cutShort = true;
        }
        return std::move(made);
    }

private:
    void readHeading() {
        Line line(text, 0);
        if (line.take().text != name || !line.isEnded()) {
            fail(0, "a recording begins with a line such as \"" + std::string(name) + ' ' +
                        std::string(version) + " 2026-11-21T17:48:00Z\"");
        }
        const Word format = line.take();
        if (format.text != version)
            fail(format.offset, "version " + quoted(format.text) + " is not known");
        const Word time = line.take();
        if (!isUtcTime(time.text))
            fail(time.offset, quoted(time.text) + " is not a time such as 2026-11-21T17:48:00Z");
        at = line.end();
        made.startedAt = time.text;
    }

    void readEntry() {
        Line line(text, at);
        const auto kind = static_cast<Kind>(line.takeOneOf(kinds, "the start of an entry"));
        const std::chrono::milliseconds time = takeTime(line);
        const auto question = static_cast<Question>(line.takeOneOf(questions, "a question"));
        if (kind == Kind::failure) {
            at = line.end();
            made.entries.push_back({time, question, std::nullopt});
            return;
        }
        const std::int64_t length = line.takeNumber("a length");
        const std::size_t start = line.end();
        made.entries.push_back({time, question, std::string(body(start, length))});
        at = start + made.entries.back().body->size() + 1;
    }

    std::chrono::milliseconds takeTime(Line& line) const {
        const std::chrono::milliseconds time(line.takeNumber("a time in milliseconds"));
        if (!made.entries.empty() && time < made.entries.back().at)
            fail(at, "the entry lies before the one above it");
        return time;
    }

    // So many bytes, behind which a line feed stands.
    [[nodiscard]] std::string_view body(std::size_t start, std::int64_t length) const {
        if (length >= static_cast<std::int64_t>(text.size() - start))
            throw CutShort();
        const auto size = static_cast<std::size_t>(length);
        if (text[start + size] != '\n')
            fail(start + size, "no line feed behind a body of " + std::to_string(size) + " bytes");
        return text.substr(start, size);
    }

    std::string_view text;
    std::size_t at = 0;
    Recording made;
};

}  // namespace

bool isNamedRecording(std::string_view text) { return Line(text, 0).take().text == name; }

Recording parse(std::string_view text) { return Reader(text).read(); }

std::string heading(std::string_view startedAt) {
    return std::string(name).append(" ").append(version).append(" ").append(startedAt).append("\n");
}

std::string written(const Entry& entry) {
    const Kind kind = entry.body ? Kind::answer : Kind::failure;
    std::string line(kinds.at(static_cast<std::size_t>(kind)));
    line.append(" ").append(std::to_string(entry.at.count())).append(" ");
    line.append(questions.at(static_cast<std::size_t>(entry.question)));
    if (entry.body) {
        line.append(" ").append(std::to_string(entry.body->size()));
        line.append("\n").append(*entry.body);
    }
    return line.append("\n");
}

}  // namespace recording
