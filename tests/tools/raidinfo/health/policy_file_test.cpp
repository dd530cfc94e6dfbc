#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <array>
#include <utility>

#include "exit_status.h"
#include "health/policy.h"
#include "settings/document.h"
#include "settings/shipped.h"
#include "support/row.h"

namespace raidinfo::health {
namespace {

using settings::parsedDocument;
using testing::HasSubstr;

Policy policyOf(const std::string& text) {
    return amendedPolicy(parsedDocument(text, "site.toml"), shippedCodeBook());
}

// A file that is wrong, and the one line that says so.
struct WrongPolicy : raid::test::Row {
    WrongPolicy(const char* rowName, std::string written, std::string answer)
        : Row{rowName}, text{std::move(written)}, message{std::move(answer)} {}

    std::string text;
    std::string message;
};

class PolicyFile : public testing::TestWithParam<WrongPolicy> {};

TEST_P(PolicyFile, IsRefusedWithItsLine) {
    try {
        policyOf(GetParam().text);
        FAIL() << "accepted";
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::badInput);
        EXPECT_THAT(failure.what(), HasSubstr(GetParam().message));
        EXPECT_EQ(std::string{failure.what()}.find('\n'), std::string::npos);
    }
}

const std::string rest =
    "severity = \"warning\"\nmessage = \"m\"\nkind = \"fans\"\n"
    "when = { field = \"status\", is = 1 }\n";

std::string wrongRule(const std::string& lines) { return "[[rule]]\nname = \"mine\"\n" + lines; }

std::string wrongCount(const std::string& lines) { return "[[count]]\nname = \"mine\"\n" + lines; }

INSTANTIATE_TEST_SUITE_P(
    Each, PolicyFile,
    testing::Values(
        WrongPolicy{"no_toml", "[[rule]]\nname = ", "site.toml:2: "},
        WrongPolicy{"key_of_the_file", "rules = []",
                    "site.toml:1: unknown key of policy \"rules\"; known: defaults, count, rule"},
        WrongPolicy{"defaults_type", "defaults = \"no\"", "site.toml:1: expected true or false"},
        WrongPolicy{"rules_type", "rule = 1", "site.toml:1: expected a list"},
        WrongPolicy{"rule_type", "rule = [1]", "site.toml:1: expected a table"},
        WrongPolicy{"no_name", "[[rule]]\nenabled = false", "site.toml:1: rule lacks \"name\""},
        WrongPolicy{"name_type", "[[rule]]\nname = 1", "site.toml:2: expected a text in quotes"},
        WrongPolicy{"empty_name", "[[rule]]\nname = \"\"", "site.toml:2: a name consists of "},
        WrongPolicy{"name_with_blanks", "[[rule]]\nname = \"a b\"",
                    "site.toml:2: a name consists of "},
        WrongPolicy{"same_name", wrongRule(rest) + wrongRule(rest),
                    "site.toml:8: the name \"mine\" stands there twice"},
        WrongPolicy{"misspelt_default", "[[rule]]\nname = \"fan-critcal\"\nenabled = false",
                    "site.toml:2: rule \"fan-critcal\" lacks \"message\""},
        WrongPolicy{"key_of_a_rule", wrongRule(rest + "unless = 1\n"),
                    "site.toml:7: unknown key of rule \"mine\" \"unless\"; known: "},
        WrongPolicy{"severity", wrongRule("message = \"m\"\nseverity = \"bad\"\n"),
                    "site.toml:4: unknown severity \"bad\"; known: warning, critical, unknown"},
        WrongPolicy{"severity_of_a_default", "[[rule]]\nname = \"fan-critical\"\nseverity = \"ok\"",
                    "site.toml:3: unknown severity \"ok\""},
        WrongPolicy{"kind",
                    wrongRule("severity = \"warning\"\nmessage = \"m\"\nwhen = []\nkind = \"fan\""),
                    "site.toml:6: unknown kind \"fan\"; known: adapters, channels, arrays, "
                    "spanned_arrays, logical_drives, disk_drives, enclosures, fans, "
                    "power_supplies, temperature_sensors, members"},
        WrongPolicy{"no_kinds", "[[rule]]\nname = \"fan-critical\"\nkind = []",
                    "site.toml:3: the list of kinds is empty"},
        WrongPolicy{"kind_twice", "[[rule]]\nname = \"fan-critical\"\nkind = [\"fans\", \"fans\"]",
                    "site.toml:3: the kind stands there twice"},
        WrongPolicy{"field",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"speed\", is = 1 }",
                    "site.toml:3: unknown field of fans \"speed\"; known: index, enclosure, "
                    "channel, adapter, fan_name, status_name, channel_name, adapter_name, status, "
                    "enclosure_id, channel_id, "
                    "adapter_id"},
        WrongPolicy{"field_of_one_of_the_kinds",
                    "[[rule]]\nname = \"fan-critical\"\nkind = [\"fans\", \"channels\"]",
                    "site.toml:2: unknown field of channels \"status\""},
        WrongPolicy{"condition_of_a_default_for_another_kind",
                    "[[rule]]\nname = \"fan-critical\"\nkind = \"enclosures\"",
                    "site.toml:2: unknown field of enclosures \"status\""},
        WrongPolicy{"message_of_a_default_for_another_kind",
                    "[[rule]]\nname = \"fan-critical\"\nkind = \"enclosures\"\n"
                    "when = { field = \"state\", is = \"absent\" }",
                    "site.toml:2: unknown field of enclosures \"status\""},
        WrongPolicy{"condition_of_a_default_count_for_another_kind",
                    "[[count]]\nname = \"ready_spares\"\nof = \"fans\"",
                    "site.toml:2: unknown field of fans \"hot_spare\""},
        WrongPolicy{"no_field", "[[rule]]\nname = \"fan-critical\"\nwhen = { is = 1 }",
                    "site.toml:3: condition lacks \"field\""},
        WrongPolicy{"operator",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\", equals = 1 }",
                    "site.toml:3: unknown operator \"equals\"; known: is, not, in, not_in, below, "
                    "above, at_most, at_least, known"},
        WrongPolicy{"no_operator",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\" }",
                    "site.toml:3: the condition lacks an operator: is, not, "},
        WrongPolicy{
            "two_operators",
            "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\", is = 1, not = 2 }",
            "site.toml:3: a condition has one operator"},
        WrongPolicy{"code_name",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = [\n{ field = \"status\", is = \"broken\" }]",
                    "site.toml:4: no code of fans.status is called \"broken\"; known: "
                    "normal, warning, critical (codes.toml:"},
        WrongPolicy{"name_where_there_are_no_codes",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"index\", is = \"x\" }",
                    "site.toml:3: fans.index has no codes, so it is compared with a number"},
        WrongPolicy{"word",
                    "[[rule]]\nname = \"overall-status-critical\"\n"
                    "when = { field = \"overall_status\", is = \"Broken\" }",
                    "site.toml:3: unknown word of adapters.overall_status \"Broken\"; known: "
                    "Normal, Warning, Critical"},
        WrongPolicy{"flag_with_a_number",
                    "[[rule]]\nname = \"disk-drive-failed\"\n"
                    "when = { field = \"smart_error\", is = 1 }",
                    "site.toml:3: expected true or false"},
        WrongPolicy{"order_of_texts",
                    "[[rule]]\nname = \"disk-drive-failed\"\n"
                    "when = { field = \"vendor\", above = 1 }",
                    "site.toml:3: disk_drives.vendor is no number"},
        WrongPolicy{"order_of_names",
                    "[[rule]]\nname = \"disk-drive-failed\"\n"
                    "when = { field = \"state\", above = \"failed\" }",
                    "site.toml:3: expected a whole number"},
        WrongPolicy{"known_where_there_are_no_codes",
                    "[[rule]]\nname = \"disk-drive-failed\"\n"
                    "when = { field = \"size\", known = false }",
                    "site.toml:3: disk_drives.size has no codes that could be unknown"},
        WrongPolicy{"list_field",
                    "[[rule]]\nname = \"battery-failed\"\n"
                    "when = { field = \"initiator_ids\", is = 7 }",
                    "site.toml:3: adapters.initiator_ids is a list and cannot be compared"},
        WrongPolicy{"number_out_of_range",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = { field = \"status\", is = 4294967296 }",
                    "site.toml:3: the number is out of range"},
        WrongPolicy{"fraction",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\", is = 1.5 }",
                    "site.toml:3: expected a text, a whole number"},
        WrongPolicy{"no_list",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\", in = 1 }",
                    "site.toml:3: expected a list"},
        WrongPolicy{"empty_list",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = { field = \"status\", in = [] }",
                    "site.toml:3: the list is empty"},
        WrongPolicy{"no_conditions", "[[rule]]\nname = \"fan-critical\"\nwhen = []",
                    "site.toml:3: the list of conditions is empty"},
        WrongPolicy{"placeholder", "[[rule]]\nname = \"fan-critical\"\nmessage = \"{speed}\"",
                    "site.toml:3: unknown field of fans \"speed\"; known: "},
        WrongPolicy{"lone_brace", "[[rule]]\nname = \"fan-critical\"\nmessage = \"a } b\"",
                    "site.toml:3: a brace stands alone"},
        WrongPolicy{"open_brace", "[[rule]]\nname = \"fan-critical\"\nmessage = \"a {status\"",
                    "site.toml:3: a brace stands alone"},
        WrongPolicy{"no_message", "[[rule]]\nname = \"fan-critical\"\nmessage = \"\"",
                    "site.toml:3: the message is empty"},
        WrongPolicy{"count_within",
                    wrongCount("on = \"adapters\"\nof = \"fans\"\nwithin = \"rack\"\n"),
                    "site.toml:5: unknown place \"rack\"; known: adapter, array"},
        WrongPolicy{"count_of_nothing", wrongCount("on = \"adapters\"\n"),
                    "site.toml:2: count \"mine\" lacks \"of\""},
        WrongPolicy{"count_of_counts",
                    wrongCount("on = \"adapters\"\nof = \"logical_drives\"\nwithin = \"adapter\"\n"
                               "when = { field = \"ready_spares\", is = 0 }"),
                    "site.toml:6: unknown field of logical_drives \"ready_spares\""},
        WrongPolicy{"count_named_like_a_field",
                    "[[count]]\nname = \"status\"\non = \"fans\"\nof = \"fans\"\n"
                    "within = \"adapter\"\nwhen = { field = \"status\", is = 1 }",
                    "site.toml:2: the kind fans has a field of this name"},
        WrongPolicy{"count_of_what_stands_in_no_adapter",
                    wrongCount("on = \"fans\"\nof = \"adapters\"\nwithin = \"adapter\"\n"
                               "when = { field = \"family\", known = true }"),
                    "site.toml:4: there are no adapters within the adapter of fans"},
        WrongPolicy{"count_of_what_stands_in_no_array",
                    wrongCount("on = \"arrays\"\nof = \"disk_drives\"\nwithin = \"array\"\n"
                               "when = { field = \"hot_spare\", is = true }"),
                    "site.toml:4: there are no disk_drives within the array of arrays"},
        WrongPolicy{"count_on_what_belongs_to_no_array",
                    wrongCount("on = [\"arrays\", \"adapters\"]\nof = \"members\"\n"
                               "within = \"array\"\nwhen = { field = \"present\", is = true }"),
                    "site.toml:4: there are no members within the array of adapters"},
        WrongPolicy{"count_of_arrays_in_an_array_of_drives",
                    wrongCount("on = \"members\"\nof = \"arrays\"\nwithin = \"array\"\n"
                               "when = { field = \"size\", is = 1 }"),
                    "site.toml:4: there are no arrays within the array of members"},
        WrongPolicy{"count_with_conditions_that_exclude_each_other",
                    wrongCount("on = \"adapters\"\nof = \"fans\"\nwithin = \"adapter\"\n"
                               "when = [\n{ field = \"status\", is = \"critical\" },\n"
                               "{ field = \"status\", is = \"warning\" }]"),
                    "site.toml:6: the conditions exclude each other: status is critical and status "
                    "is warning"},
        WrongPolicy{"number_out_of_the_bounds",
                    "[[rule]]\nname = \"fan-critical\"\nwhen = [{ field = \"index\", above = 2 }, "
                    "{ field = \"index\", below = 3 }]",
                    "site.toml:3: the conditions exclude each other: index is above 2 and index is "
                    "below 3"},
        WrongPolicy{"numbers_of_which_none_is_left",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = [{ field = \"index\", in = [3, 4, 5] }, "
                    "{ field = \"fan_name\", not = \"a\" }, { field = \"index\", in = [5, 4] }, "
                    "{ field = \"index\", not = 4 }, { field = \"index\", below = 5 }]",
                    "site.toml:3: the conditions exclude each other: index is one of 3, 4, 5 and "
                    "index is one of 5, 4 and index is not 4 and index is below 5"},
        WrongPolicy{"neither_true_nor_false",
                    wrongRule("severity = \"warning\"\nmessage = \"m\"\nkind = \"members\"\n"
                              "when = [{ field = \"present\", not = true }, "
                              "{ field = \"present\", not = false }]"),
                    "site.toml:6: the conditions exclude each other: present is not true and "
                    "present is not false"},
        WrongPolicy{"number_beyond_the_greatest",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = [{ field = \"index\", above = 2147483647 }, "
                    "{ field = \"index\", not = 0 }]",
                    "site.toml:3: the conditions exclude each other: index is above 2147483647 and "
                    "index is not 0"},
        WrongPolicy{"name_of_what_is_unknown",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = [{ field = \"status\", not = \"normal\" }, "
                    "{ field = \"status\", known = false }]",
                    "site.toml:3: the conditions exclude each other: status is not normal and "
                    "status is not known"},
        WrongPolicy{"count_below_nothing",
                    "[[rule]]\nname = \"hot-spare-missing\"\n"
                    "when = { field = \"ready_spares\", below = 0 }",
                    "site.toml:3: adapters.ready_spares is a count, and never below 0"},
        WrongPolicy{"count_of_less_than_nothing",
                    "[[rule]]\nname = \"hot-spare-missing\"\n"
                    "when = { field = \"ready_spares\", in = [0, -1] }",
                    "site.toml:3: adapters.ready_spares is a count, and never below 0"},
        WrongPolicy{"count_taken_from_a_default_rule",
                    "[[count]]\nname = \"ready_spares\"\non = \"adapters\"",
                    "site.toml:2: rule \"logical-drive-degraded\" needs the count on "
                    "logical_drives (health.toml:"},
        WrongPolicy{"count_taken_from_a_new_rule",
                    "[[count]]\nname = \"write_back_logical_drives\"\non = \"channels\"\n"
                    "[[rule]]\nname = \"write-cache-unprotected\"\nenabled = false\n" +
                        wrongRule("severity = \"warning\"\nmessage = \"m\"\nkind = \"adapters\"\n"
                                  "when = { field = \"write_back_logical_drives\", is = 1 }"),
                    "site.toml:12: unknown field of adapters \"write_back_logical_drives\""},
        WrongPolicy{"count_taken_from_a_rule_beside_it",
                    "[[count]]\nname = \"ready_spares\"\non = \"adapters\"\n"
                    "[[rule]]\nname = \"logical-drive-degraded\"\n"
                    "when = { field = \"ready_spares\", is = 1 }",
                    "site.toml:6: unknown field of logical_drives \"ready_spares\""},
        WrongPolicy{"count_on_another_kind",
                    "[[rule]]\nname = \"fan-critical\"\n"
                    "when = { field = \"ready_spares\", is = 1 }",
                    "site.toml:3: unknown field of fans \"ready_spares\""}),
    raid::test::nameOfRow);

// What a spanned array and its logical drives hold are arrays, too.
TEST(PolicyFile, MayCountWhateverAnArrayHolds) {
    for (const auto& [on, of] :
         std::to_array<std::pair<std::string, std::string>>({{"arrays", "members"},
                                                             {"arrays", "logical_drives"},
                                                             {"logical_drives", "members"},
                                                             {"logical_drives", "arrays"},
                                                             {"members", "logical_drives"},
                                                             {"spanned_arrays", "arrays"},
                                                             {"spanned_arrays", "spanned_arrays"},
                                                             {"spanned_arrays", "members"}})) {
        const std::string field = of == "members" ? "device_id" : "array_id";
        EXPECT_NO_THROW(
            policyOf(wrongCount("on = \"" + on + "\"\nof = \"" + of + "\"\nwithin = \"array\"\n" +
                                "when = { field = \"" + field + "\", above = 0 }")))
            << of << " on " << on;
    }
}

TEST(PolicyFile, MaySpeakSeveralTimesOfAField) {
    for (const char* const conditions :
         {"{ field = \"status\", not = \"critical\" }, { field = \"status\", not = \"warning\" }",
          "{ field = \"status\", known = true }, { field = \"status\", above = 0 }",
          "{ field = \"status\", known = false }, { field = \"status\", not = 7 }",
          "{ field = \"index\", above = 2 }, { field = \"index\", below = 4 }",
          "{ field = \"index\", at_least = 2147483647 }, { field = \"index\", not = 0 }",
          "{ field = \"fan_name\", not = \"a\" }, { field = \"fan_name\", not_in = [\"\"] }"}) {
        EXPECT_NO_THROW(
            policyOf("[[rule]]\nname = \"fan-critical\"\nwhen = [" + std::string{conditions} + "]"))
            << conditions;
    }
}

// The longest file there may be, for whatever is in it must be judged while somebody waits.
TEST(PolicyFile, MaySpeakOfAFieldAsOftenAsThereIsRoom) {
    std::string conditions;
    int number = 0;
    while (conditions.size() < settings::longestDocument - 500) {
        conditions += "{field=\"index\",not=" + std::to_string(number++) + "},";
    }
    const std::string rule = "[[rule]]\nname = \"fan-critical\"\nwhen = [" + conditions +
                             "{ field = \"index\", at_least = 0 },";
    const std::string upTo = "{ field = \"index\", at_most = ";
    EXPECT_NO_THROW(policyOf(rule + upTo + std::to_string(number) + " }]"));
    EXPECT_THROW(policyOf(rule + upTo + std::to_string(number - 1) + " }]"), Failure);
}

TEST(PolicyFile, MayDisableARuleThatSpeaksOfWhatTheCodeBookLacks) {
    CodeBook book = shippedCodeBook();
    book.define("adapters", "battery_status", CodeBook::Codes{{0, "none"}, {3, "failed"}});
    EXPECT_THROW(static_cast<void>(defaultPolicy(book)), Failure);
    EXPECT_NO_THROW(static_cast<void>(amendedPolicy(
        parsedDocument("[[rule]]\nname = \"battery-charging\"\nenabled = false\n", "site.toml"),
        book)));
}

// Every beginning of the default policy is read or refused, and nothing else happens.
TEST(PolicyFile, MayEndAnywhere) {
    const std::string text{settings::shippedPolicy.text};
    int refused = 0;
    for (std::size_t length = 0; length < text.size(); length += 41) {
        try {
            static_cast<void>(policyOf("defaults = false\n" + text.substr(0, length)));
        } catch (const Failure& failure) {
            EXPECT_THAT(failure.what(), testing::StartsWith("site.toml:"));
            ++refused;
        }
    }
    EXPECT_GT(refused, 0);
}

}  // namespace
}  // namespace raidinfo::health
