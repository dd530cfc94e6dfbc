#include "generate/examples.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <ostream>
#include <string>
#include <vector>

#include "control/scenario.h"
#include "running_service.h"
#include "state/path.h"
#include "vocabulary.h"

namespace raidsim {

namespace generate {

void PrintTo(const Example& example, std::ostream* out) { *out << example.fileName; }

}  // namespace generate

namespace {

using test::count;
using test::example;
using test::unknownIn;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

class ExampleDocument : public testing::TestWithParam<generate::Example> {
protected:
    const std::string text = example(GetParam().fileName);
    Document document = Document::parse(text);
};

TEST_P(ExampleDocument, IsWhatTheGeneratorWrites) {
    EXPECT_EQ(xml::format(generate::document(GetParam().plan())), text)
        << "run raidsim_write_examples on examples/";
}

TEST_P(ExampleDocument, HoldsOnlyWhatClientsKnow) { EXPECT_THAT(unknownIn(document), IsEmpty()); }

TEST_P(ExampleDocument, IsServedAsItIsWritten) { EXPECT_EQ(document.body(), text); }

TEST_P(ExampleDocument, StaysBelowItsSize) { EXPECT_LT(text.size(), 1'500'000U); }

TEST_P(ExampleDocument, ListsEveryMemberOfAnArrayUnderAChannelOfItsAdapter) {
    for (const Match& member : findAll(document.edit(), Path::parse("arrays/drive:*"))) {
        const std::string path = "adapter:" + xml::textOf(*member.node, "as:adapterID") +
                                 "/channel:" + xml::textOf(*member.node, "as:channelID") +
                                 "/drive:" + xml::textOf(*member.node, "as:deviceID");
        const auto listings = findAll(document.edit(), Path::parse(path));
        EXPECT_TRUE(std::ranges::any_of(listings, [](const Match& match) {
            return match.ancestors.size() == 4;
        })) << path;
    }
}

INSTANTIATE_TEST_SUITE_P(Examples, ExampleDocument,
                         testing::ValuesIn(generate::examples().begin(),
                                           generate::examples().end()),
                         [](const auto& instance) {
                             std::string name = instance.param.fileName;
                             std::ranges::replace_if(
                                 name, [](char c) { return c == '-' || c == '.'; }, '_');
                             return name;
                         });

TEST(Examples, SmallServerHasTheParts) {
    Document document = Document::parse(example("small-server.xml"));
    EXPECT_EQ(count(document, "adapter:*"), 1U);
    EXPECT_EQ(count(document, "array:*"), 1U);
    EXPECT_EQ(count(document, "enclosure:*"), 1U);
    EXPECT_EQ(count(document, "spares/drive:*"), 1U);
    std::size_t drives = 0;
    for (const Match& match : findAll(document.edit(), Path::parse("physicals/drive:*")))
        drives += match.ancestors.size() == 4 ? 1U : 0U;
    EXPECT_EQ(drives, 6U);
}

TEST(Examples, MixedHasEveryAdapterTypeAndOneUnknown) {
    const Document document = Document::parse(example("mixed.xml"));
    std::vector<std::string> types;
    for (const auto& [name, child] : document.system()) {
        if (name == "ac:adapter")
            types.push_back(xml::textOf(*xml::childOf(child, xml::attributesKey), "xsi:type"));
    }
    EXPECT_THAT(types, UnorderedElementsAre("o:PellionAdapter", "o:MirrelAdapter",
                                            "o:DorvelAdapter", "o:LSIAdapter", "o:TalvikAdapter"));
}

TEST(Examples, MixedHasSharedDrivesSpannedArraysReferencesAndUnicode) {
    const std::string text = example("mixed.xml");
    Document document = Document::parse(text);
    EXPECT_EQ(count(document, "adapter:1/array:0/drive:2"), 1U);
    EXPECT_EQ(count(document, "adapter:1/array:1/drive:2"), 1U);
    EXPECT_EQ(count(document, "spanned:4/array:*"), 2U);
    EXPECT_THAT(text, testing::HasSubstr("Müller &amp; Söhne"));
    EXPECT_THAT(text, testing::HasSubstr("&lt;fast&gt;"));
}

TEST(Examples, LargeRackHasHundredsOfDrives) {
    Document document = Document::parse(example("large-rack.xml"));
    EXPECT_EQ(count(document, "adapter:*"), 4U);
    EXPECT_EQ(count(document, "enclosure:*"), 32U);
    std::size_t drives = 0;
    for (const Match& match : findAll(document.edit(), Path::parse("drive:*")))
        drives += match.ancestors.size() == 4 ? 1U : 0U;
    EXPECT_EQ(drives, 384U);
}

TEST(Examples, InitFileOfTheSmallServerRuns) {
    Service service = test::makeService(example("small-server.xml"));
    for (const ScriptLine& line : parseScript(example("small-server.init")))
        line.command(service);
    EXPECT_EQ(service.events().newest(), 4);
}

}  // namespace
}  // namespace raidsim
