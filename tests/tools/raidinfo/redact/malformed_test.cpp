#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <random>
#include <string>

#include "redact/redactor.h"

namespace raidinfo::redact {
namespace {

using testing::HasSubstr;
using testing::Not;

constexpr std::string_view original = "QS0101003K";

std::string redacted(std::string_view body) { return Redactor{}(body); }

TEST(MalformedAnswer, IsRedactedWhereTheEndTagIsMissing) {
    EXPECT_EQ(redacted("<as:serialNumber>QS0101003K<as:model>M</as:model>"),
              "<as:serialNumber>SN-0001<as:model>M</as:model>");
    EXPECT_EQ(redacted("<as:serialNumber>QS0101003K</ac:hardDrive>x"),
              "<as:serialNumber>SN-0001</ac:hardDrive>x");
    EXPECT_EQ(redacted("<as:serialNumber>A</as:serialNumbr><as:model>M</as:model>"),
              "<as:serialNumber>SN-0001</as:serialNumbr><as:model>M</as:model>");
}

TEST(MalformedAnswer, IsRedactedWhereTheStartTagIsDamaged) {
    for (const std::string start :
         {"<as:serialNumbr>", "<as:serialNumber", "<as:serialNumber ",
          "<as:serialNumber xsi:type=\"xsd:string\"", "<as:serialNumber xsi:type=\"xsd:string>",
          "<as:serialNumber xsi:type=xsd:string\">", "<as:serialNumber xsi:type='xsd:string\">",
          "as:serialNumber>", "<as:serialNumber a=\"b\" / >", "<as:serialNumber/ ", "<>", ""}) {
        EXPECT_THAT(
            redacted("<ac:a>" + start + "QS0101003K</as:serialNumber><as:size>7</as:size>"),
            AllOf(Not(HasSubstr(original)), HasSubstr("</as:serialNumber><as:size>7</as:size>")))
            << start;
    }
}

TEST(MalformedAnswer, IsRedactedWhicheverByteOfATagIsMissingOrAnother) {
    const std::string before = "<as:model xsi:type=\"xsd:string\">M</as:model>";
    const std::string start = "<as:serialNumber xsi:type=\"xsd:string\">";
    const std::string end = "</as:serialNumber>";
    const std::string body = before + start + std::string{original} + end + "</ac:hardDrive>";
    for (std::size_t index = 0; index < body.size(); ++index) {
        if (index >= before.size() + start.size() &&
            index < before.size() + start.size() + original.size()) {
            continue;
        }
        for (const std::string byte :
             {"", "<", ">", "/", "\"", "'", "=", " ", "x", "!", "?", "&"}) {
            std::string damaged = body;
            damaged.replace(index, 1, byte);
            EXPECT_THAT(redacted(damaged), Not(HasSubstr(original))) << damaged;
        }
    }
}

TEST(MalformedAnswer, IsRedactedInElementsThatDoNotBelongThere) {
    for (const std::string content : {"<b>QS0101003K</b>", "<b>x</b>QS0101003K", "<b/>QS0101003K",
                                      "x<b>QS0101003K", "<!--x-->QS0101003K", "<![CDATA[QS0101003K",
                                      "<as:model/>QS0101003K", "<as:name>x</as:name>QS0101003K"}) {
        EXPECT_THAT(redacted("<as:serialNumber>" + content + "</as:serialNumber>"),
                    Not(HasSubstr(original)))
            << content;
    }
}

TEST(MalformedAnswer, IsRedactedBehindAnError) {
    EXPECT_EQ(redacted("<ac:a></ac:b>&<<<as:x y='><as:serialNumber>QS0101003K</as:serialNumber>"),
              "<ac:a></ac:b>&<<<as:x y='><as:serialNumber>SN-0001</as:serialNumber>");
    const std::string zeros("\0\xFF\0", 3);
    EXPECT_EQ(redacted(zeros + "<as:serialNumber>QS0101003K</as:serialNumber>" + zeros),
              zeros + "<as:serialNumber>SN-0001</as:serialNumber>" + zeros);
}

// Where the text is cut off, too, its first bytes give away the better part of it.
TEST(CutOffAnswer, KeepsNothingOfASerialNumber) {
    const std::string body =
        "<as:string>Drive QS0101003K failed</as:string>"
        "<as:serialNumber xsi:type=\"xsd:string\">QS0101003K</as:serialNumber>"
        "<as:string>Drive QS0101003K failed</as:string>";
    Redactor redact;
    static_cast<void>(redact(body));
    for (std::size_t length = 0; length <= body.size(); ++length) {
        const std::string part = redact(std::string_view{body}.substr(0, length));
        ASSERT_THAT(part, Not(HasSubstr("QS"))) << length;
    }
    EXPECT_EQ(redacted("<as:serialNumber>QS0101"), "<as:serialNumber>SN-0001");
}

TEST(CutOffAnswer, TeachesNothingAboutMessages) {
    Redactor redact;
    static_cast<void>(redact("<as:serialNumber>D"));
    EXPECT_EQ(redact("<as:string>D failed</as:string>"), "<as:string>D failed</as:string>");
}

TEST(AnyBytes, AreRedactedWithoutAFault) {
    std::mt19937 random{3};
    constexpr std::string_view alphabet = "<<>/!?-[]\"'= &;#x:as:serialNumberstringQS01\xC3\xA9\0";
    std::uniform_int_distribution<std::size_t> letter{0, alphabet.size() - 1};
    Redactor redact;
    for (int round = 0; round < 2000; ++round) {
        std::string body;
        for (int length = 0; length < 80; ++length) {
            body += alphabet[letter(random)];
        }
        body += "<as:serialNumber>QS0101003K</as:serialNumber>";
        ASSERT_THAT(redact(body), Not(HasSubstr(original))) << body;
    }
}

TEST(AnyBytes, AreRedactedInTimeThatDoesNotMultiply) {
    for (const std::string unit :
         {"<", "<a ", "<a b=\"", "<a b='c' ", "&", "&#", "<as:serialNumber>", "<as:string>a", "<b>",
          "<![CDATA[", "]]>", " "}) {
        std::string body = "<as:string>";
        while (body.size() < 300'000) {
            body += unit;
        }
        EXPECT_FALSE(redacted(body).empty());
    }
}

}  // namespace
}  // namespace raidinfo::redact
