#include "codebook/code_book.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

#include "exit_status.h"
#include "support/files.h"
#include "support/row.h"

namespace raidinfo {
namespace {

using raid::test::writeFile;
using testing::HasSubstr;

CodeBook bookOf(const std::string& text) {
    writeFile("codes.toml", text);
    return readCodeBook("codes.toml");
}

TEST(CodeBook, NamesACode) {
    const CodeBook book = shippedCodeBook();
    EXPECT_EQ(book.name("disk_drives", "state", 4), "failed");
    EXPECT_EQ(book.name("disk_drives", "state", 5), std::nullopt);
    EXPECT_EQ(book.name("disk_drives", "size", 4), std::nullopt);
    EXPECT_EQ(book.name("disk_drives", "speed", 4), std::nullopt);
}

TEST(CodeBook, KnowsTheAdaptersOfEveryFamily) {
    const CodeBook book = shippedCodeBook();
    for (const char* const kind :
         {"adapters", "pellion_adapters", "lsi_adapters", "vantry_adapters"}) {
        EXPECT_EQ(book.name(kind, "battery_status", 3), "failed") << kind;
    }
}

TEST(CodeBook, ShowsTheNumberBesideItsName) {
    const CodeBook book = shippedCodeBook();
    EXPECT_EQ(book.shown("disk_drives", "state", 4), "4 (failed)");
    EXPECT_EQ(book.shown("disk_drives", "state", 9), "9 (unknown)");
    EXPECT_EQ(book.shown("disk_drives", "state", -1), "-1 (unknown)");
    EXPECT_EQ(book.shown("disk_drives", "size", 70006), "70006 MB");
    EXPECT_EQ(book.shown("disk_drives", "channel_id", 2), "2");
    EXPECT_EQ(book.shown("disk_drives", "smart_error", true), "yes");
    EXPECT_EQ(book.shown("disk_drives", "overall_status", Unknown{}), "unknown");
}

TEST(CodeBook, HasUnits) {
    const CodeBook book = shippedCodeBook();
    EXPECT_EQ(book.unit("arrays", "stripe_size"), "KB");
    EXPECT_EQ(book.unit("lsi_adapters", "stripe_unit_size"), "KB");
    EXPECT_EQ(book.unit("disk_drives", "state"), std::nullopt);
    EXPECT_EQ(book.unit("disk_drives", "channel_id"), std::nullopt);
}

TEST(CodeBook, OfAFileReplacesTheFieldsThatItNamesAndKeepsTheOthers) {
    const CodeBook book = bookOf(
        "[fans]\nstatus = { 0 = \"runs\", -1 = \"gone\" }\n"
        "[disk_drives.size]\nunit = \"GB\"\n");
    EXPECT_EQ(book.shown("fans", "status", 0), "0 (runs)");
    EXPECT_EQ(book.shown("fans", "status", -1), "-1 (gone)");
    EXPECT_EQ(book.shown("fans", "status", 2), "2 (unknown)");
    EXPECT_EQ(book.shown("disk_drives", "size", 70), "70 GB");
    EXPECT_EQ(book.shown("power_supplies", "status", 2), "2 (critical)");
}

TEST(CodeBook, MayTakeAllCodesOfAFieldAway) {
    const CodeBook book = bookOf("[fans.status]\n");
    ASSERT_NE(book.codes("fans", "status"), nullptr);
    EXPECT_EQ(book.shown("fans", "status", 0), "0 (unknown)");
}

TEST(CodeBook, LetsNoNameBreakALine) {
    const CodeBook book =
        bookOf("[fans.status]\n0 = \"a\\nb\"\n[disk_drives.size]\nunit = \"\\t\"");
    EXPECT_EQ(book.shown("fans", "status", 0), "0 (a\\u{a}b)");
    EXPECT_EQ(book.shown("disk_drives", "size", 1), "1 \\u{9}");
}

struct WrongCodes : raid::test::Row {
    WrongCodes(const char* rowName, std::string written, std::string answer)
        : Row{rowName}, text{std::move(written)}, message{std::move(answer)} {}

    std::string text;
    std::string message;
};

class CodesFile : public testing::TestWithParam<WrongCodes> {};

TEST_P(CodesFile, IsRefusedWithItsLine) {
    try {
        bookOf(GetParam().text);
        FAIL() << "accepted";
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::badInput);
        EXPECT_THAT(failure.what(), HasSubstr(GetParam().message));
        EXPECT_EQ(std::string{failure.what()}.find('\n'), std::string::npos);
    }
}

INSTANTIATE_TEST_SUITE_P(
    Each, CodesFile,
    testing::Values(
        WrongCodes{"no_toml", "[fans.status\n", "codes.toml:1: "},
        WrongCodes{"kind", "\n[fan.status]\n",
                   "codes.toml:2: unknown kind \"fan\"; known: adapters, channels, arrays, "
                   "spanned_arrays, logical_drives, disk_drives, enclosures, fans, "
                   "power_supplies, temperature_sensors, events"},
        WrongCodes{"kind_of_one_family", "[lsi_adapters.battery_status]\n",
                   "codes.toml:1: unknown kind \"lsi_adapters\""},
        WrongCodes{"kind_type", "fans = 1", "codes.toml:1: expected a table"},
        WrongCodes{"field", "[fans.state]\n",
                   "codes.toml:1: unknown field of fans \"state\"; known: status, enclosure_id, "
                   "channel_id, adapter_id"},
        WrongCodes{"text_field", "[fans.fan_name]\n", "codes.toml:1: unknown field of fans"},
        WrongCodes{"field_type", "[fans]\nstatus = \"MB\"", "codes.toml:2: expected a table"},
        WrongCodes{"code", "[fans.status]\n0 = \"a\"\none = \"b\"",
                   "codes.toml:3: expected CODE = \"name\" or unit = \"name\", not \"one\""},
        WrongCodes{"code_with_more", "[fans.status]\n1st = \"b\"", "codes.toml:2: expected CODE"},
        WrongCodes{"large_code", "[fans.status]\n4294967296 = \"b\"",
                   "codes.toml:2: expected CODE"},
        WrongCodes{"fraction", "[fans.status]\n1.5 = \"b\"", "codes.toml:2: "},
        WrongCodes{"code_twice", "[fans.status]\n1 = \"a\"\n01 = \"b\"",
                   "codes.toml:3: the code stands there twice"},
        WrongCodes{"name_type", "[fans.status]\n1 = 1", "codes.toml:2: expected a text in quotes"},
        WrongCodes{"empty_name", "[fans.status]\n1 = \"\"", "codes.toml:2: a name is neither"},
        WrongCodes{"misleading_name", "[fans.status]\n1 = \"unknown\"",
                   "codes.toml:2: a name is neither"},
        WrongCodes{"unit_and_codes", "[fans.status]\n1 = \"a\"\nunit = \"MB\"",
                   "codes.toml:3: a field has either codes or a unit"}),
    raid::test::nameOfRow);

// The meanings that the documents tell of the simulated service are those of the book.
struct Documented {
    const char* row;  // of the table in docs/raidsim.md, up to the meanings
    std::vector<std::pair<const char*, const char*>> fields;
};

std::string documentText() {
    std::ifstream file{RAID_DOCS "/raidsim.md"};
    std::stringstream text;
    text << file.rdbuf();
    return text.str();
}

std::string inWords(const CodeBook::Codes& codes) {
    std::string text;
    for (const auto& [code, name] : codes) {
        text += (text.empty() ? "" : ", ") + std::to_string(code) + " " + name;
    }
    return text;
}

TEST(ShippedCodes, AreThoseOfTheDocumentation) {
    const CodeBook book = shippedCodeBook();
    const std::string text = documentText();
    const std::vector<Documented> rows{
        {"| `overallStatus`, `adapterStatus`, `status` of an enclosure's part | ",
         {{"fans", "status"}, {"power_supplies", "status"}, {"temperature_sensors", "status"}}},
        {"| drive `state` | ", {{"disk_drives", "state"}}},
        {"| logical drive `state` | ", {{"logical_drives", "state"}}},
        {"| enclosure `state` | ", {{"enclosures", "state"}}},
        {"| `type` of adapter, channel, drive and enclosure | ",
         {{"channels", "type"}, {"disk_drives", "type"}, {"enclosures", "type"}}},
        {"| `type` of an array | ", {{"arrays", "type"}, {"spanned_arrays", "type"}}},
        {"| `batteryStatus` | ", {{"adapters", "battery_status"}}},
        {"| `writeCacheMode` | ", {{"logical_drives", "write_cache_mode"}}},
        {"| `writeCacheEnable` of a drive | ", {{"disk_drives", "write_cache_enable"}}},
    };
    for (const Documented& row : rows) {
        for (const auto& [kind, field] : row.fields) {
            const auto* const codes = book.codes(kind, field);
            ASSERT_NE(codes, nullptr) << kind << "." << field;
            EXPECT_THAT(text, HasSubstr(row.row + inWords(*codes) + " |\n"));
        }
    }
    for (const auto& [code, name] : *book.codes("logical_drives", "raid_level")) {
        EXPECT_EQ(name, "RAID " + std::to_string(code));
    }
    EXPECT_THAT(text, HasSubstr("the level as a number: 0, 1, 5, 10 |"));
}

TEST(ShippedCodes, NameTheDocumentedEvents) {
    const CodeBook book = shippedCodeBook();
    const std::string text = documentText();
    for (const auto& [code, name] : *book.codes("events", "event_code")) {
        EXPECT_THAT(text, testing::ContainsRegex("\n\\| " + std::to_string(code) +
                                                 " \\| [A-Za-z]* \\| " + name + " \\|\n"));
    }
    EXPECT_EQ(book.codes("events", "event_code")->size(), 11U);
}

}  // namespace
}  // namespace raidinfo
