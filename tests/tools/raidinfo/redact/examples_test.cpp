#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <string>
#include <vector>

#include "redact/elements.h"
#include "redact/markup.h"
#include "redact/redactor.h"
#include "support/files.h"

namespace raidinfo::redact {
namespace {

struct Text {
    std::string element;
    std::string text;
};

// The texts of a well-formed document, each with the tag before it.
std::vector<Text> textsOf(const std::string& document) {
    std::vector<Text> texts;
    const std::vector<Piece> pieces = cutUp(document);
    for (std::size_t index = 1; index + 1 < pieces.size(); ++index) {
        if (pieces[index].form == Piece::Form::text &&
            pieces[index - 1].form == Piece::Form::startTag) {
            texts.push_back(
                {std::string{pieces[index - 1].name}, std::string{pieces[index].bytes}});
        }
    }
    return texts;
}

// What is between the texts of a document that are replaced.
std::string frameOf(const std::string& document) {
    std::string frame;
    for (const Piece& piece : cutUp(document)) {
        frame += piece.form == Piece::Form::text ? "" : std::string{piece.bytes};
    }
    return frame;
}

class Example : public testing::TestWithParam<std::string> {
protected:
    const std::string document = raid::test::readFile(RAID_EXAMPLES "/" + GetParam());
    Redactor redact;
    const std::string redacted = redact(document);
};

TEST_P(Example, KeepsNoSerialNumberAndNoNameAtAll) {
    std::set<std::string> originals;
    for (const auto& [element, text] : textsOf(document)) {
        if (elementOf(element) != nullptr) {
            originals.insert(text);
        }
        if (element == "as:serialNumber") {
            EXPECT_EQ(redacted.find(text), std::string::npos) << text;
        }
    }
    ASSERT_GT(originals.size(), 5U);
    for (const auto& [element, text] : textsOf(redacted)) {
        EXPECT_TRUE(elementOf(element) == nullptr || !originals.contains(text)) << text;
    }
}

TEST_P(Example, KeepsTheTagsAndAllOtherTexts) {
    EXPECT_EQ(frameOf(redacted), frameOf(document));
    const std::vector<Text> before = textsOf(document);
    const std::vector<Text> after = textsOf(redacted);
    ASSERT_EQ(after.size(), before.size());
    for (std::size_t index = 0; index < before.size(); ++index) {
        EXPECT_EQ(after[index].element, before[index].element);
        if (elementOf(before[index].element) == nullptr) {
            EXPECT_EQ(after[index].text, before[index].text);
        }
    }
}

// The text in whose midst it is cut off is one of its own; all before it is redacted as in the
// whole.
TEST_P(Example, IsRedactedAsFarAsItGoesWhereverItIsCutOff) {
    constexpr std::size_t cuts = 50;
    for (std::size_t cut = 1; cut < cuts; ++cut) {
        const std::string_view part =
            std::string_view{document}.substr(0, document.size() * cut / cuts);
        const std::string result = Redactor{}(part);
        const std::size_t lastTag = result.rfind('<');
        ASSERT_NE(lastTag, std::string::npos);
        EXPECT_EQ(result.compare(0, lastTag, redacted, 0, lastTag), 0) << part.size();
    }
}

TEST_P(Example, ReplacesEqualTextsEquallyAndOthersOtherwise) {
    const std::vector<Text> before = textsOf(document);
    const std::vector<Text> after = textsOf(redacted);
    ASSERT_EQ(after.size(), before.size());
    std::map<std::string, std::string> replacements;
    std::set<std::string> different;
    for (std::size_t index = 0; index < before.size(); ++index) {
        if (elementOf(before[index].element) != nullptr) {
            const auto& known =
                replacements.try_emplace(before[index].text, after[index].text).first->second;
            EXPECT_EQ(after[index].text, known);
            different.insert(known);
        }
    }
    EXPECT_EQ(different.size(), replacements.size());
}

TEST_P(Example, IsRedactedTheSameAgainAndAfterOtherAnswers) {
    EXPECT_EQ(redact("<as:serialNumber>other</as:serialNumber>").find("other"), std::string::npos);
    EXPECT_EQ(redact(document), redacted);
}

INSTANTIATE_TEST_SUITE_P(OfTheSimulator, Example,
                         testing::Values("small-server.xml", "mixed.xml", "large-rack.xml"),
                         [](const auto& example) {
                             std::string name = example.param.substr(0, example.param.find('.'));
                             std::erase(name, '-');
                             return name;
                         });

}  // namespace
}  // namespace raidinfo::redact
