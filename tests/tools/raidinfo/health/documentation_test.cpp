#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>

#include "codebook/code_book.h"
#include "health/policy.h"
#include "health/vocabulary.h"
#include "settings/document.h"
#include "text/enumerated.h"

namespace raidinfo::health {
namespace {

using testing::ElementsAreArray;

// The lines of docs/health.md below a heading, up to the next one.
std::vector<std::string> section(const std::string& heading) {
    std::ifstream file{RAID_DOCS "/health.md"};
    std::vector<std::string> lines;
    bool inside = false;
    for (std::string line; std::getline(file, line);) {
        if (line.starts_with("## ")) {
            inside = line == "## " + heading;
        } else if (inside) {
            lines.push_back(line);
        }
    }
    return lines;
}

// Those of them that begin like a row about a name.
std::vector<std::string> rowsOf(const std::string& heading) {
    std::vector<std::string> rows;
    for (const std::string& line : section(heading)) {
        if (line.starts_with("| `")) {
            rows.push_back(line);
        }
    }
    return rows;
}

// The examples of a language below a heading.
std::vector<std::string> examplesOf(const std::string& heading, const std::string& language) {
    std::vector<std::string> examples;
    bool inside = false;
    for (const std::string& line : section(heading)) {
        if (line == "```" + language) {
            inside = true;
            examples.emplace_back();
        } else if (line == "```") {
            inside = false;
        } else if (inside) {
            examples.back() += line + "\n";
        }
    }
    return examples;
}

TEST(Documentation, ListsTheDefaultRules) {
    std::vector<std::string> rows;
    for (const Rule& rule : defaultPolicy(shippedCodeBook()).rules) {
        std::vector<std::string> kinds;
        for (const Scope& scope : rule.scopes) {
            kinds.push_back(scope.kind);
        }
        rows.push_back("| `" + rule.name + "` | " + enumerated(kinds) + " | " + inWords(rule) +
                       " | " + std::string{word(rule.severity)} + " |");
    }
    EXPECT_THAT(rowsOf("The default rules"), ElementsAreArray(rows));
}

TEST(Documentation, ListsTheDefaultCounts) {
    std::vector<std::string> rows;
    for (const Count& count : defaultPolicy(shippedCodeBook()).counts) {
        rows.push_back("| `" + count.name + "` | " + enumerated(count.on) + " | " + count.of +
                       " of the " + (count.within == Count::Within::adapter ? "adapter" : "array") +
                       " | " + inWords(count.when) + " |");
    }
    EXPECT_THAT(rowsOf("The default counts"), ElementsAreArray(rows));
}

TEST(Documentation, HasExamplesThatAreAccepted) {
    const auto policies = examplesOf("A policy of one's own", "toml");
    EXPECT_FALSE(policies.empty());
    for (const std::string& policy : policies) {
        EXPECT_NO_THROW(static_cast<void>(
            amendedPolicy(settings::parsedDocument(policy, "docs/health.md"), shippedCodeBook())));
    }
    const auto books = examplesOf("A code book of one's own", "toml");
    EXPECT_FALSE(books.empty());
    for (const std::string& book : books) {
        std::ofstream{"codes.toml"} << book;
        EXPECT_NO_THROW(static_cast<void>(defaultPolicy(readCodeBook("codes.toml"))));
    }
}

TEST(Documentation, NamesEveryKindOfRecord) {
    std::vector<std::string> rows;
    for (const std::string& row : rowsOf("Kinds and fields")) {
        rows.push_back(row.substr(3, row.find('`', 3) - 3));
    }
    EXPECT_THAT(rows, ElementsAreArray(ruleKinds()));
}

}  // namespace
}  // namespace raidinfo::health
