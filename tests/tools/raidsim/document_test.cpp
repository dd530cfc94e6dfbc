#include "state/document.h"

#include <gtest/gtest.h>

#include <string>

namespace raidsim {
namespace {

const std::string strange =
    "<env:Envelope><!-- kept "
    "--><env:Body>\r\n<m:getConfigResponse><ac:system><as:name>oak</as:name>"
    "</ac:system></m:getConfigResponse></env:Body></env:Envelope>";

TEST(VerbatimDocument, IsServedAsItIs) {
    for (const std::string& bytes : {strange, std::string("<ac:system>\xff\0", 13), std::string()})
        EXPECT_EQ(Document::verbatim(bytes).body(), bytes);
}

TEST(VerbatimDocument, IsLookedInto) {
    const Document document = Document::verbatim(strange);
    EXPECT_EQ(document.systemName(), "oak");
    EXPECT_EQ(document.body(), strange);
}

TEST(VerbatimDocument, KeepsItsBytesUntilItIsReallyChanged) {
    Document document = Document::verbatim(strange);
    xml::childOf(document.edit(), "as:name")->data() = "elm";
    EXPECT_NE(document.body(), strange);
    xml::childOf(document.edit(), "as:name")->data() = "oak";
    EXPECT_EQ(document.body(), strange);
    (void)document.edit();
    EXPECT_EQ(document.body(), strange);
}

TEST(VerbatimDocument, ThatIsNoneHasNoSystem) {
    Document document = Document::verbatim("<ac:system>");
    EXPECT_EQ(document.systemName(), "");
    EXPECT_THROW((void)document.edit(), xml::XmlError);
    EXPECT_THROW((void)document.system(), xml::XmlError);
    EXPECT_EQ(document.body(), "<ac:system>");
}

}  // namespace
}  // namespace raidsim
