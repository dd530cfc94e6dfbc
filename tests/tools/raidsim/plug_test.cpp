#include "state/plug.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <string>
#include <vector>

#include "state/edit.h"
#include "vocabulary.h"

namespace raidsim {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

class Plug : public testing::Test {
protected:
    ~Plug() override { EXPECT_THAT(test::unknownIn(document), IsEmpty()); }

    std::vector<std::string> values(std::string_view path, const std::string& field) {
        return test::values(document, path, field);
    }
    std::size_t count(std::string_view path) { return test::count(document, path); }

    void remove(std::string_view path) { unplug(document, Path::parse(path)); }
    void add(std::string_view path, std::string_view model, const Fields& fields = {}) {
        plugLike(document, Path::parse(path), Path::parse(model), fields);
    }
    std::string addError(std::string_view path, std::string_view model, const Fields& fields = {}) {
        const std::string before = document.body();
        std::string message = "none";
        try {
            add(path, model, fields);
        } catch (const EditError& error) {
            message = error.what();
        }
        EXPECT_EQ(document.body(), before);
        return message;
    }

    Document document = Document::parse(test::example("small-server.xml"));
};

TEST_F(Plug, DriveIsTakenOutOfEveryListing) {
    EXPECT_EQ(count("adapter:1/channel:1/drive:3"), 2U);
    remove("adapter:1/channel:1/drive:3");
    EXPECT_EQ(count("adapter:1/channel:1/drive:3"), 0U);
    remove("channel:2/drive:1");
    EXPECT_EQ(count("spares/drive:*"), 0U);
    EXPECT_EQ(count("channel:2/drive:0"), 2U);
}

TEST_F(Plug, EnclosureGoesWithItsParts) {
    remove("enclosure:8");
    EXPECT_EQ(count("enclosure:*"), 0U);
    EXPECT_EQ(count("fan:*"), 0U);
}

TEST_F(Plug, LogicalDriveIsTakenFromTheArrayAndTheAdapter) {
    EXPECT_EQ(count("logical:*"), 4U);
    remove("adapter:1/logical:1");
    EXPECT_THAT(values("logical:*", "name"), ElementsAre("System", "System"));
}

TEST_F(Plug, AllAreTakenThatThePathNames) {
    remove("channel:1/drive:*");
    EXPECT_EQ(count("channel:1/drive:*"), 0U);
    EXPECT_EQ(count("channel:2/drive:*"), 4U);
}

TEST_F(Plug, WhatIsAroundNoLongerShowsTheStatusOfWhatIsGone) {
    setFields(document, Path::parse("channel:1/drive:3"), {{"overallStatus", "2"}});
    EXPECT_THAT(values("system", "overallStatus"), ElementsAre("2"));
    remove("channel:1/drive:3");
    EXPECT_THAT(values("system", "overallStatus"), ElementsAre("0"));
    EXPECT_THAT(values("array:0", "overallStatus"), ElementsAre("0"));
}

TEST_F(Plug, DriveIsPutInBehindTheOthersOfItsChannel) {
    add("adapter:1/channel:2/drive:7", "adapter:1/channel:1/drive:2",
        {{"serialNumber", "NEW"}, {"state", "0"}});
    EXPECT_THAT(values("channel:2/drive:7", "deviceID"), ElementsAre("7"));
    EXPECT_THAT(values("channel:2/drive:7", "channelID"), ElementsAre("2"));
    EXPECT_THAT(values("channel:2/drive:7", "serialNumber"), ElementsAre("NEW"));
    EXPECT_THAT(values("channel:2/drive:7", "model"), ElementsAre("QS15K073"));
    EXPECT_THAT(values("channel:2/drive:7", "state"), ElementsAre("0"));
    EXPECT_THAT(values("physicals/channel:2/drive:*", "deviceID"), ElementsAre("0", "0", "1", "7"));
}

TEST_F(Plug, DriveComesWithItsStatusAndWithoutTheTaskOfItsModel) {
    setFields(document, Path::parse("channel:1/drive:3"), {{"overallStatus", "2"}});
    setProgress(document, Path::parse("channel:1/drive:3"), 50);
    add("channel:2/drive:7", "channel:1/drive:3");
    EXPECT_THAT(values("physicals/channel:2", "overallStatus"), ElementsAre("0", "2"));
    remove("channel:1/drive:3");
    EXPECT_THAT(document.body(), Not(HasSubstr("ac:progress")));
    EXPECT_THAT(values("system", "overallStatus"), ElementsAre("2"));
}

TEST_F(Plug, WhatWasRemovedComesBackLikeAnother) {
    remove("channel:1/drive:3");
    add("channel:1/drive:3", "channel:1/drive:2");
    EXPECT_EQ(count("physicals/channel:1/drive:3"), 1U);
    EXPECT_EQ(count("array:0/drive:3"), 0U);
}

TEST_F(Plug, EnclosureAndItsPartsAreCopied) {
    add("channel:2/enclosure:9", "enclosure:8", {{"vendor", "BEACH"}});
    EXPECT_THAT(values("enclosure:9", "channelID"), ElementsAre("2"));
    EXPECT_EQ(count("enclosure:9/slot:*"), 6U);
    add("channel:2/enclosure:9/fan:2", "enclosure:8/fan:1", {{"status", "2"}});
    EXPECT_THAT(values("enclosure:9/fan:*", "status"), ElementsAre("0", "0", "2"));
    EXPECT_EQ(count("enclosure:8/fan:*"), 2U);
}

TEST_F(Plug, LogicalDriveOfAnArrayIsListedByTheAdapterToo) {
    add("adapter:1/array:0/logical:2", "logical:0", {{"name", "Scratch"}});
    EXPECT_THAT(values("logical:2", "name"), ElementsAre("Scratch", "Scratch"));
    EXPECT_EQ(count("array:0/logical:2"), 1U);
}

TEST_F(Plug, LogicalDriveOfTheAdapterIsListedThereOnly) {
    add("adapter:1/logical:2", "logical:0");
    EXPECT_EQ(count("logical:2"), 1U);
    EXPECT_EQ(count("array:0/logical:2"), 0U);
}

TEST_F(Plug, OwnerWithoutAListOfLogicalDrivesGetsOne) {
    document = Document::parse(
        "<ac:system><ac:adapter><as:adapterID>1</as:adapterID><ac:logicalDrives>"
        "<ac:logicalDrive><as:logicalDriveID>0</as:logicalDriveID></ac:logicalDrive>"
        "</ac:logicalDrives><ac:arrays><ac:basicArray><as:arrayID>0</as:arrayID></ac:basicArray>"
        "</ac:arrays></ac:adapter></ac:system>");
    add("array:0/logical:1", "logical:0");
    EXPECT_EQ(count("array:0/logical:1"), 1U);
    EXPECT_EQ(count("logical:1"), 2U);
}

TEST_F(Plug, ElementOfAFileIsPutIn) {
    const Path path = Path::parse("adapter:1/channel:2/drive:7");
    plug(document, path,
         parseThing("<ac:hardDrive><as:deviceID>0</as:deviceID><as:channelID>0</as:channelID>"
                    "</ac:hardDrive>",
                    path),
         {});
    EXPECT_THAT(values("drive:7", "channelID"), ElementsAre("2"));
}

TEST_F(Plug, ElementOfAFileMustBeOfTheKind) {
    const Path path = Path::parse("adapter:1/channel:2/drive:7");
    EXPECT_THROW((void)parseThing("<ac:fan/>", path), EditError);
    EXPECT_THROW((void)parseThing("<ac:hardDrive>", path), xml::XmlError);
}

TEST_F(Plug, ImpossibleAdditionsChangeNothing) {
    EXPECT_EQ(addError("channel:1/drive:3", "channel:1/drive:2"),
              "the document has channel:1/drive:3 already");
    EXPECT_EQ(addError("adapter:1/array:0/logical:0", "logical:1"),
              "the document has adapter:1/array:0/logical:0 already");
    EXPECT_EQ(addError("adapter:1/logical:1", "logical:0"),
              "the document has adapter:1/logical:1 already");
    EXPECT_EQ(addError("channel:2/drive:7", "channel:2/drive:9"),
              "the document has no channel:2/drive:9");
    EXPECT_EQ(addError("channel:2/drive:7", "drive:0"), "drive:0 does not name one drive");
    EXPECT_EQ(addError("channel:2/drive:7", "enclosure:8"), "enclosure:8 is no drive");
    EXPECT_EQ(addError("channel:3/drive:7", "channel:1/drive:2"), "the document has no channel:3");
    EXPECT_EQ(addError("channel:*/drive:7", "channel:1/drive:2"),
              "channel:* does not name one channel");
    EXPECT_EQ(addError("drive:7", "channel:1/drive:2"), "drive:7 does not say in which channel");
    EXPECT_EQ(addError("adapter:1/drive:7", "channel:1/drive:2"),
              "adapter:1/drive:7 does not say in which channel");
    EXPECT_EQ(addError("channel:2/drive:*", "channel:1/drive:2"),
              "channel:2/drive:* does not name one thing");
    EXPECT_EQ(addError("channel:2/drive:7", "channel:1/drive:2", {{"color", "red"}}),
              "channel:2/drive:7 has no field \"color\"");
    EXPECT_EQ(addError("adapter:2", "adapter:1"),
              "\"adapter\" is not added or removed while the system runs");
}

TEST_F(Plug, ImpossibleRemovalsChangeNothing) {
    const std::string before = document.body();
    EXPECT_THROW(remove("channel:1/drive:9"), EditError);
    EXPECT_THROW(remove("adapter:1"), EditError);
    EXPECT_THROW(remove("spares"), EditError);
    EXPECT_EQ(document.body(), before);
}

}  // namespace
}  // namespace raidsim
