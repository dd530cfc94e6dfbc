#include "command_line/options.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "exit_status.h"

namespace raidinfo {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

std::variant<Options, Information> parse(std::vector<const char*> arguments) {
    arguments.insert(arguments.begin(), "raidinfo");
    return parseOptions(static_cast<int>(arguments.size()), arguments.data());
}

Options options(std::vector<const char*> arguments) {
    return std::get<Options>(parse(std::move(arguments)));
}

template <typename Command>
Command command(std::vector<const char*> arguments) {
    return std::get<Command>(options(std::move(arguments)).command);
}

std::string information(std::vector<const char*> arguments) {
    return std::get<Information>(parse(std::move(arguments))).text;
}

std::string complaint(std::vector<const char*> arguments) {
    try {
        static_cast<void>(parse(std::move(arguments)));
    } catch (const Failure& failure) {
        EXPECT_EQ(failure.status(), ExitStatus::usage);
        return failure.what();
    }
    return "accepted";
}

TEST(Options, AskForJsonAndALibraryOnEitherSideOfTheCommand) {
    EXPECT_FALSE(options({"list"}).json);
    EXPECT_TRUE(options({"tree", "--json"}).json);
    EXPECT_TRUE(options({"--json", "tree"}).json);
    EXPECT_EQ(options({"list"}).library, std::nullopt);
    EXPECT_EQ(options({"--library", "a.so", "list"}).library, "a.so");
    EXPECT_EQ(options({"events", "--library", "b.so"}).library, "b.so");
}

TEST(Options, LimitTheWaitForAnAnswer) {
    EXPECT_EQ(options({"list"}).limit, std::chrono::seconds{60});
    EXPECT_EQ(options({"tree", "--timeout", "5"}).limit, std::chrono::seconds{5});
    EXPECT_EQ(options({"tree", "--timeout", "0"}).limit, std::nullopt);
}

TEST(Options, ChooseTheColour) {
    EXPECT_EQ(options({"list"}).color, ColorChoice::automatic);
    EXPECT_EQ(options({"list", "--color=always"}).color, ColorChoice::always);
    EXPECT_EQ(options({"--color", "never", "list"}).color, ColorChoice::never);
    EXPECT_THAT(complaint({"list", "--color=red"}), HasSubstr("auto, always or never"));
}

TEST(ListOptions, ChooseAKindItsColumnsAndItsRecords) {
    EXPECT_EQ(command<ListOptions>({"list"}).kind, nullptr);
    const auto list = command<ListOptions>({"list", "fans", "-o", "+adapter_name", "--filter",
                                            "status!=0", "--filter", "index>1", "--noheadings"});
    EXPECT_EQ(list.kind, &kindOf(KindId::fan));
    EXPECT_TRUE(list.columns->chief);
    EXPECT_THAT(list.columns->keys, ElementsAre("adapter_name"));
    ASSERT_EQ(list.filters.size(), 2U);
    EXPECT_EQ(list.filters[1].key, "index");
    EXPECT_FALSE(list.headings);
}

TEST(ListOptions, HaveColumnsForOneKindOnly) {
    EXPECT_THAT(complaint({"list", "-o", "size"}), HasSubstr("one KIND only"));
    EXPECT_TRUE(command<ListOptions>({"list", "-o", "all"}).columns->all);
}

TEST(ListOptions, NameTheKindsThereAreWhenOneIsWrong) {
    EXPECT_THAT(complaint({"list", "disks"}),
                testing::AllOf(HasSubstr("\"disks\""), HasSubstr("disk_drives")));
}

TEST(ListOptions, MayStandTwice) {
    EXPECT_THAT(command<ListOptions>({"list", "fans", "-o", "index", "-o", "status"}).columns->keys,
                ElementsAre("status"));
    EXPECT_FALSE(command<ListOptions>({"list", "--noheadings", "--noheadings"}).headings);
}

TEST(ShowOptions, NameAKindAndAPosition) {
    const auto show = command<ShowOptions>({"show", "disk_drives", "3"});
    EXPECT_EQ(show.kind, &kindOf(KindId::diskDrive));
    EXPECT_EQ(show.position, 3);
    EXPECT_THAT(complaint({"show", "disk_drives"}), HasSubstr("position"));
    EXPECT_THAT(complaint({"show", "disk_drives", "-1"}), HasSubstr("-1"));
}

TEST(EventsOptions, SayWhereToBeginAndWhenToEnd) {
    const auto plain = command<EventsOptions>({"events"});
    EXPECT_EQ(plain.interval, std::chrono::seconds{30});
    EXPECT_EQ(command<EventsOptions>({"events", "--interval", "7"}).interval,
              std::chrono::seconds{7});
    EXPECT_EQ(plain.since, std::nullopt);
    EXPECT_EQ(plain.count, std::nullopt);
    EXPECT_EQ(plain.state, std::nullopt);
    const auto all = command<EventsOptions>(
        {"events", "--since", "0", "--count", "7", "--exec", "logger -t raid", "--state", "file"});
    EXPECT_EQ(all.since, 0);
    EXPECT_EQ(all.count, 7);
    EXPECT_EQ(all.command, "logger -t raid");
    EXPECT_EQ(all.state, "file");
}

TEST(Numbers, AreDecimalDigits) {
    EXPECT_EQ(command<EventsOptions>({"events", "--since", "0100"}).since, 100);
    EXPECT_EQ(command<EventsOptions>({"events", "--since", "08"}).since, 8);
    EXPECT_EQ(command<ShowOptions>({"show", "disk_drives", "010"}).position, 10);
    for (const char* const word : {"0x3", "+5", " 5", "5 ", "5.0", "1e1", "five", "2147483648"}) {
        EXPECT_THAT(
            complaint({"events", "--since", word}),
            HasSubstr("--since: Value " + std::string{word} + " not in range 0 to 2147483647"));
    }
}

TEST(WatchOptions, HaveAnInterval) {
    EXPECT_EQ(command<WatchOptions>({"watch"}).interval, std::chrono::seconds{5});
    EXPECT_EQ(command<WatchOptions>({"watch", "--interval", "9"}).interval,
              std::chrono::seconds{9});
}

TEST(RecordOptions, MayEndByThemselves) {
    EXPECT_EQ(command<RecordOptions>({"record", "f"}).duration, std::nullopt);
    const auto record = command<RecordOptions>({"record", "--redact", "--for", "0", "f"});
    EXPECT_TRUE(record.redact);
    EXPECT_EQ(record.duration, std::chrono::seconds{0});
}

TEST(DiffOptions, NameOneSnapshotOrTwo) {
    EXPECT_EQ(command<DiffOptions>({"diff", "a"}).after, "");
    EXPECT_EQ(command<DiffOptions>({"diff", "a", "b"}).after, "b");
}

TEST(Options, NameTheWordThatIsNoSubcommand) {
    EXPECT_THAT(complaint({"frob"}), testing::StartsWith("\"frob\" is no subcommand; there are "
                                                         "list, show, tree, "));
    EXPECT_THAT(complaint({"--json", "frob"}), testing::StartsWith("\"frob\" is no subcommand"));
    EXPECT_THAT(complaint({"frob", "list"}), HasSubstr("frob"));
    EXPECT_THAT(complaint({"--frob"}), testing::StartsWith("\"--frob\" is no option, "));
    EXPECT_THAT(complaint({"--frob", "list"}), HasSubstr("--frob"));
    EXPECT_THAT(complaint({}), testing::StartsWith("expected one of list, show, tree, "));
}

TEST(Options, ThatAreWrongAreAUsageFailure) {
    using Arguments = std::vector<const char*>;
    for (const Arguments& wrong : {Arguments{},
                                   Arguments{"lists"},
                                   Arguments{"tree", "list", "--jso"},
                                   Arguments{"list", "--jsonn"},
                                   Arguments{"tree", "extra"},
                                   Arguments{"list", "--timeout", "-1"},
                                   Arguments{"list", "--timeout", "soon"},
                                   Arguments{"list", "--library"},
                                   Arguments{"list", "--filter", "state"},
                                   Arguments{"list", "fans", "-o", ","},
                                   Arguments{"events", "--count", "0"},
                                   Arguments{"watch", "--interval", "0"},
                                   Arguments{"snapshot"},
                                   Arguments{"diff"},
                                   Arguments{"health", "--nagios", "--explain"},
                                   Arguments{"health", "--nagios", "--json"},
                                   Arguments{"--json", "health", "--nagios"},
                                   Arguments{"watch", "--from", "a"},
                                   Arguments{"doctor", "--from", "a"},
                                   Arguments{"--from", "a", "record", "b"},
                                   Arguments{"diff", "a", "b", "--from", "c"}}) {
        EXPECT_NE(complaint(wrong), "accepted") << testing::PrintToString(wrong);
    }
}

// "$UNSET" in a script must not turn a question about a file into one about this machine.
TEST(Options, RefuseAnEmptyValue) {
    using Arguments = std::vector<const char*>;
    for (const Arguments& wrong :
         {Arguments{"tree", "--from", ""}, Arguments{"--from", "", "tree"},
          Arguments{"list", "--codes", ""}, Arguments{"list", "--library", ""},
          Arguments{"events", "--state", ""}, Arguments{"events", "--exec", ""},
          Arguments{"health", "--policy", ""}, Arguments{"snapshot", ""}, Arguments{"diff", ""},
          Arguments{"diff", "before", ""}, Arguments{"record", ""}}) {
        EXPECT_THAT(complaint(wrong), HasSubstr("is empty")) << testing::PrintToString(wrong);
    }
    EXPECT_THAT(complaint({"list", ""}), HasSubstr("is no kind of record"));
}

TEST(Options, ExplainThemselves) {
    EXPECT_THAT(information({"--help"}), HasSubstr("130         interrupted"));
    EXPECT_THAT(information({"--version"}), testing::StartsWith("raidinfo "));
    for (const char* const name : {"list", "show", "tree", "events", "watch", "health", "snapshot",
                                   "diff", "record", "doctor", "completion", "schema"}) {
        EXPECT_THAT(information({"--help"}), HasSubstr(name));
        EXPECT_THAT(information({name, "--help"}),
                    testing::ContainsRegex("Examples?:\\s+raidinfo " + std::string{name}));
    }
}

}  // namespace
}  // namespace raidinfo
