#include "redact/redactor.h"

#include <algorithm>
#include <array>
#include <utility>
#include <vector>

#include "redact/elements.h"
#include "redact/markup.h"
#include "redact/plain_text.h"

namespace raidinfo::redact {
namespace {

/// A stretch of a document that is either text of an element in question or stays as it is.
struct Passage {
    std::string_view bytes;
    const Element* element = nullptr;
    bool cutOff = false;  ///< the document ends with it
};

/// Follows the tags of a document as far as it must, to tell which texts are in question.
class Reader {
public:
    std::vector<Passage> read(std::string_view document) {
        const std::vector<Piece> pieces = cutUp(document);
        for (std::size_t index = 0; index < pieces.size(); ++index) {
            const bool isLast = index + 1 == pieces.size();
            if (pieces[index].form == Piece::Form::text) {
                const Piece& next = pieces[isLast ? index : index + 1];
                passages.push_back({pieces[index].bytes, elementOfText(next), isLast});
            } else {
                readTag(pieces[index], isLast);
            }
        }
        return std::move(passages);
    }

private:
    /// An end tag tells what stands before it, should the start tag be damaged.
    [[nodiscard]] const Element* elementOfText(const Piece& next) const {
        if (element != nullptr) {
            return element;
        }
        return next.form == Piece::Form::endTag ? elementOf(next.name) : nullptr;
    }

    /// A stray "<" in a text makes what follows look like the beginning of a tag.
    void readTag(const Piece& tag, bool isLast) {
        const bool mayBeText = element != nullptr && tag.form == Piece::Form::startTag &&
                               !tag.bytes.ends_with('>') && !isOfService(tag.name);
        if (mayBeText) {
            passages.push_back({tag.bytes.substr(0, 1)});
            passages.push_back({tag.bytes.substr(1), element, isLast});
            return;
        }
        follow(tag);
        passages.push_back({tag.bytes});
    }

    void follow(const Piece& tag) {
        switch (tag.form) {
            case Piece::Form::startTag:
                start(tag);
                break;
            case Piece::Form::emptyTag:
                element = isOfService(tag.name) ? nullptr : element;
                break;
            case Piece::Form::endTag:
                end(tag);
                break;
            case Piece::Form::opening:
            case Piece::Form::text:
                break;
        }
    }

    void start(const Piece& tag) {
        if (const Element* const started = elementOf(tag.name); started != nullptr) {
            element = started;
            foreignTags = 0;
        } else if (isOfService(tag.name)) {
            element = nullptr;  // its end tag is missing: simple elements have none in them
        } else {
            ++foreignTags;
        }
    }

    void end(const Piece& tag) {
        if (foreignTags == 0 || isOfService(tag.name) ||
            (element != nullptr && isSameElement(tag.name, element->name))) {
            element = nullptr;
        } else {
            --foreignTags;
        }
    }

    std::vector<Passage> passages;
    const Element* element = nullptr;  ///< around the current place
    int foreignTags = 0;               ///< open inside it
};

/// The text itself between blanks and what closes a CDATA section, a comment or an instruction.
std::string_view core(std::string_view text) {
    constexpr std::string_view blanks{" \t\r\n\f\v\0", 7};
    constexpr auto closings = std::to_array<std::string_view>({"]]>", "-->", "?>"});
    const auto isClosing = [&text](std::string_view closing) { return text.ends_with(closing); };
    for (;;) {
        text.remove_suffix(text.size() - (text.find_last_not_of(blanks) + 1));
        const auto closing = std::ranges::find_if(closings, isClosing);
        if (closing == closings.end()) {
            text.remove_prefix(std::min(text.find_first_not_of(blanks), text.size()));
            return text;
        }
        text.remove_suffix(closing->size());
    }
}

class Rewriting {
public:
    explicit Rewriting(Replacements& all) : replacements{all} {}

    /// Texts before messages, which may mention what stands behind them.
    void learn(const std::vector<Passage>& passages) {
        for (const Passage& passage : passages) {
            const std::string original = originalOf(passage);
            if (!original.empty() && !passage.cutOff) {
                replacements.learn(original, passage.element->sort);
            }
        }
    }

    std::string rewritten(const Passage& passage) {
        if (passage.element == nullptr) {
            return std::string{passage.bytes};
        }
        if (passage.element->sort == Sort::message) {
            return replacements.message(passage.bytes, passage.cutOff);
        }
        const std::string original = originalOf(passage);
        std::string text{passage.bytes};
        if (!original.empty()) {
            const std::string_view kept = core(passage.bytes);
            text.replace(static_cast<std::size_t>(kept.data() - passage.bytes.data()), kept.size(),
                         replacements.of(original, passage.element->sort));
        }
        return text;
    }

private:
    static std::string originalOf(const Passage& passage) {
        const bool isReplaced =
            passage.element != nullptr && passage.element->sort != Sort::message;
        return isReplaced ? PlainText{core(passage.bytes)}.text() : std::string{};
    }

    Replacements& replacements;
};

}  // namespace

std::string Redactor::operator()(std::string_view body) {
    const std::vector<Passage> passages = Reader{}.read(body);
    Rewriting rewriting{replacements};
    rewriting.learn(passages);
    std::string redacted;
    redacted.reserve(body.size());
    for (const Passage& passage : passages) {
        redacted += rewriting.rewritten(passage);
    }
    return redacted;
}

}  // namespace raidinfo::redact
