// The tags that are known before a document is read.

#include "xml/usual_tags.h"

#include <gtest/gtest.h>

#include "model/channels_and_drives_vocabulary.h"

namespace {

using namespace raid::xml;
using Channel = UsualTags<RAIDChannel>;
using Drive = UsualTags<RAIDHardDrive>;

TEST(UsualTags, HaveTheTypeOfWhatTheChildHolds) {
    EXPECT_EQ(Drive::known[0].bytes, "<as:firmwareLevel xsi:type=\"xsd:string\">");
    EXPECT_EQ(Drive::known[2].bytes, "<as:type xsi:type=\"xsd:int\">");
    EXPECT_EQ(Drive::known[3].bytes, "<as:smartError xsi:type=\"xsd:boolean\">");
}

TEST(UsualTags, AreUnitsAsIfTheyHadBeenRead) {
    const auto& [unit, number] = Drive::known[2].found;
    EXPECT_EQ(number, 2);
    EXPECT_TRUE(unit.isTag);
    EXPECT_TRUE(unit.opening);
    EXPECT_FALSE(unit.closing);
    EXPECT_TRUE(unit.finished);
    EXPECT_EQ(unit.name, "as:type");
    EXPECT_EQ(unit.type, "xsd:int");
}

TEST(UsualTags, AreNotKnownOfElementsWhoseTypeTheDocumentTells) {
    EXPECT_EQ(childrenOf<RAIDChannel>[5].name, "ac:hardDrive");
    EXPECT_EQ(Channel::known[5].bytes, "");
    EXPECT_EQ(Channel::beginnings[5], "<ac:hardDrive xsi:type=\"");
}

TEST(UsualTags, EndWithTheEndTagOfTheElement) {
    const auto& end = Channel::known.back();
    EXPECT_EQ(end.bytes, "</ac:channel>");
    EXPECT_EQ(end.found.number, ownName);
    EXPECT_TRUE(end.found.unit.isTag);
    EXPECT_FALSE(end.found.unit.opening);
    EXPECT_TRUE(end.found.unit.closing);
    EXPECT_TRUE(end.found.unit.finished);
    EXPECT_EQ(end.found.unit.name, "ac:channel");
    EXPECT_EQ(end.found.unit.type, "");
}

TEST(UsualTags, IncludeTheEndTagsOfTheChildren) {
    EXPECT_EQ(Channel::endTagOf(0), "</as:initiatorID>");
    EXPECT_EQ(Channel::endTagOf(7), "</as:adapterID>");
}

// One that is taken for another is read anew each time that the order of the children changes.
template <class Model>
std::size_t takenForOthers() {
    constexpr auto beginnings = UsualTags<Model>::beginnings;
    constexpr TagIndex index(beginnings);
    std::size_t found = 0;
    for (std::size_t number = 0; number < beginnings.size(); ++number) {
        found += index.candidate(beginnings[number].data()) != number ? 1U : 0U;
    }
    return found;
}

TEST(UsualTags, AreToldApartByTheirBeginnings) {
    EXPECT_EQ(takenForOthers<RAIDHardDrive>(), 0U);
    EXPECT_EQ(takenForOthers<RAIDChannel>(), 0U);
    EXPECT_EQ(takenForOthers<RAIDEnclosureDevice>(), 0U);
    EXPECT_EQ(takenForOthers<RAIDLogicalDrive>(), 0U);
}

}  // namespace
