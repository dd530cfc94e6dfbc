#include "redact/redactor.h"

#include <gtest/gtest.h>

#include <string>

#include "support/elements.h"

namespace raidinfo::redact {
namespace {

using raid::test::element;

std::string serial(const std::string& text) {
    return element("as:serialNumber", text, "xsd:string");
}
std::string name(const std::string& text) { return element("as:name", text, "xsd:string"); }
std::string message(const std::string& text) { return element("as:string", text, "xsd:string"); }

// What one redactor makes of an answer.
std::string redacted(const std::string& body) { return Redactor{}(body); }

TEST(Redactor, ReplacesEverySortOfTextInQuestion) {
    EXPECT_EQ(redacted(serial("QS0101003K")), serial("SN-0001"));
    EXPECT_EQ(redacted(name("birch")), name("NAME-0001"));
    EXPECT_EQ(redacted(element("as:preferredOwner", "Müller", "xsd:string")),
              element("as:preferredOwner", "NAME-0001", "xsd:string"));
    EXPECT_EQ(redacted(element("as:serverName", "birch", "xsd:string")),
              element("as:serverName", "NAME-0001", "xsd:string"));
    EXPECT_EQ(redacted(element("as:serverAddress", "10.1.2.3", "xsd:string")),
              element("as:serverAddress", "ADDRESS-0001", "xsd:string"));
}

TEST(Redactor, KeepsEverythingElseByteForByte) {
    const std::string body =
        "<?xml version=\"1.0\"?>\n<ac:hardDrive\t xsi:type='o:HardDrive' >\r\n"
        "<as:model>QS&amp;1 \xE9</as:model><as:size>70006</as:size>"
        "<as:serialNumber/><as:serialNumber></as:serialNumber><as:name> \n</as:name>"
        "<!-- a > b --></ac:hardDrive>";
    EXPECT_EQ(redacted(body), body);
    EXPECT_EQ(redacted(""), "");
    EXPECT_EQ(redacted("<ac:a>\n  " + serial(" QS01\n") + "\n</ac:a >"),
              "<ac:a>\n  " + serial(" SN-0001\n") + "\n</ac:a >");
}

TEST(Redactor, NumbersTextsInTheOrderOfTheirAppearance) {
    EXPECT_EQ(redacted(serial("B") + serial("A") + name("C") + serial("B")),
              serial("SN-0001") + serial("SN-0002") + name("NAME-0001") + serial("SN-0001"));
}

TEST(Redactor, GivesATextTheSameReplacementInEveryAnswer) {
    Redactor redact;
    EXPECT_EQ(redact(serial("A") + name("birch")), serial("SN-0001") + name("NAME-0001"));
    EXPECT_EQ(redact(serial("B") + serial("A")), serial("SN-0002") + serial("SN-0001"));
    EXPECT_EQ(redact(element("as:serverName", "birch")), element("as:serverName", "NAME-0001"));
}

TEST(Redactor, GivesATextTheSameReplacementWhateverElementHoldsIt) {
    EXPECT_EQ(redacted(name("birch") + serial("birch")), name("NAME-0001") + serial("NAME-0001"));
}

TEST(Redactor, KnowsATextWrittenWithReferences) {
    EXPECT_EQ(redacted(serial("A&amp;B") + serial("A&#38;B") + serial("&#x41;&#x26;&#66;") +
                       serial("A&amp;amp;B")),
              serial("SN-0001") + serial("SN-0001") + serial("SN-0001") + serial("SN-0002"));
}

TEST(Redactor, TellsTextsApartThatAreNotUtf8) {
    EXPECT_EQ(redacted(serial("caf\xE9") + serial("caf\xE8") + serial("&\xE9;") + serial("&\xE8;")),
              serial("SN-0001") + serial("SN-0002") + serial("SN-0003") + serial("SN-0004"));
}

TEST(Redactor, KeepsTheLastByteOfALetterWithItsText) {
    EXPECT_EQ(redacted(name("Città")), name("NAME-0001"));
}

TEST(Redactor, FillsUpTheReplacementOfALongText) {
    EXPECT_EQ(redacted(serial(std::string(16, 'x'))), serial("SN-0001"));
    EXPECT_EQ(redacted(serial(std::string(17, 'x'))), serial("SN-0001........."));
    EXPECT_EQ(redacted(serial(std::string(100'000, 'x'))).size(), serial("").size() + 65536);
}

TEST(Redactor, FindsKnownTextsInMessages) {
    Redactor redact;
    static_cast<void>(redact(serial("QS0101003K") + name("Data 1")));
    EXPECT_EQ(redact(message("Drive QS0101003K of Data 1 failed")),
              message("Drive SN-0001 of NAME-0001 failed"));
    EXPECT_EQ(redact(message("SN:QS0101003K/QS0101003K")), message("SN:SN-0001/SN-0001"));
}

TEST(Redactor, FindsTextsInMessagesThatStandBeforeThem) {
    EXPECT_EQ(redacted(message("birch (10.1.2.3) started") + element("as:serverName", "birch") +
                       element("as:serverAddress", "10.1.2.3")),
              message("NAME-0001 (ADDRESS-0001) started") + element("as:serverName", "NAME-0001") +
                  element("as:serverAddress", "ADDRESS-0001"));
}

TEST(Redactor, FindsTextsInMessagesHoweverTheyAreWritten) {
    EXPECT_EQ(
        redacted(name("R&amp;D <i>") + name("Åsa") + message("R&#38;D of &#xC5;sa &amp; &lt;")),
        name("NAME-0001 <i>") + name("NAME-0002") + message("NAME-0001 of NAME-0002 &amp; &lt;"));
}

TEST(Redactor, LeavesMessagesInWhichNothingIsKnownAsTheyAre) {
    const std::string text = message(" Drive failed &amp; \xE9 &#xE9; & co;\n");
    EXPECT_EQ(redacted(text), text);
}

TEST(Redactor, KnowsTheElementsWhateverTheirPrefixesAndCase) {
    EXPECT_EQ(redacted("<x:serialNumber>A</x:serialNumber><SerialNumber>B</SerialNumber>"),
              "<x:serialNumber>SN-0001</x:serialNumber><SerialNumber>SN-0002</SerialNumber>");
    EXPECT_EQ(redacted("< as:serialNumber\xA0>A</ as:serialNumber >"),
              "< as:serialNumber\xA0>SN-0001</ as:serialNumber >");
    EXPECT_EQ(redacted("<as:serialNumbers>A</as:serialNumbers>"),
              "<as:serialNumbers>A</as:serialNumbers>");
}

TEST(Redactor, RedactsCdataSectionsAndComments) {
    EXPECT_EQ(
        redacted(serial("A") + serial("<![CDATA[A]]>") + serial(" <!-- B -->") + serial("<?C?>")),
        serial("SN-0001") + serial("<![CDATA[SN-0001]]>") + serial(" <!-- SN-0002 -->") +
            serial("<?SN-0003?>"));
}

}  // namespace
}  // namespace raidinfo::redact
