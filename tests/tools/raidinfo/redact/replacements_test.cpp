#include "redact/replacements.h"

#include <gtest/gtest.h>

#include <string>

namespace raidinfo::redact {
namespace {

// A whole message, after these have been learned as SN-0001, ADDRESS-0001 and NAME-0001.
std::string redacted(const std::string& message, const std::string& serial,
                     const std::string& address = "10.1.2.3", const std::string& name = "Data") {
    Replacements replacements;
    replacements.learn(serial, Sort::serialNumber);
    replacements.learn(address, Sort::address);
    replacements.learn(name, Sort::name);
    return replacements.message(message, false);
}

std::string cutOff(const std::string& message, const std::string& serial) {
    Replacements replacements;
    replacements.learn(serial, Sort::serialNumber);
    replacements.learn("Data", Sort::name);
    return replacements.message(message, true);
}

TEST(Replacements, HaveFourDigitsOrMore) {
    Replacements replacements;
    for (int number = 1; number < 9999; ++number) {
        static_cast<void>(replacements.of(std::to_string(number), Sort::name));
    }
    EXPECT_EQ(replacements.of("a", Sort::name), "NAME-9999");
    EXPECT_EQ(replacements.of("b", Sort::name), "NAME-10000");
    EXPECT_EQ(replacements.of("17", Sort::name), "NAME-0017");
}

TEST(Replacements, AreNotTakenForOriginals) {
    Replacements replacements;
    EXPECT_EQ(replacements.learn("SN-0002", Sort::serialNumber), "SN-0001");
    EXPECT_EQ(replacements.learn("SN-0001", Sort::serialNumber), "SN-0002");
    EXPECT_EQ(replacements.message("SN-0001 SN-0002", false), "SN-0002 SN-0001");
}

TEST(RedactedMessage, HasSerialNumbersAndAddressesReplacedInsideWords) {
    EXPECT_EQ(redacted("xQS01y 10.1.2.30", "QS01"), "xSN-0001y ADDRESS-00010");
}

TEST(RedactedMessage, HasNamesAndTheShortestSerialNumbersReplacedAsWholeWordsOnly) {
    EXPECT_EQ(redacted("Data Database Metadata Data", "K1"),
              "NAME-0001 Database Metadata NAME-0001");
    EXPECT_EQ(redacted("(Data) Datä", "K1"), "(NAME-0001) Datä");
    EXPECT_EQ(redacted("K1 K12 K1.", "K1"), "SN-0001 K12 SN-0001.");
}

TEST(RedactedMessage, HasTheLongestKnownTextReplaced) {
    Replacements replacements;
    replacements.learn("QS01", Sort::serialNumber);
    replacements.learn("QS0101", Sort::serialNumber);
    EXPECT_EQ(replacements.message("QS0101 QS01", false), "SN-0002 SN-0001");
}

TEST(RedactedMessage, HasTextsOfAnyLengthReplaced) {
    for (const std::size_t length : {63U, 64U, 65U, 1000U}) {
        const std::string serial(length, 's');
        const std::string text = redacted("a " + serial + " b", serial);
        EXPECT_EQ(text.find(serial), std::string::npos);
        EXPECT_EQ(text.substr(0, 9), "a SN-0001");
        EXPECT_EQ(text.substr(text.size() - 2), " b");
    }
}

TEST(RedactedMessage, HasTextsReplacedThatBeginAlike) {
    const std::string beginning(64, 's');
    Replacements replacements;
    replacements.learn(beginning + "1", Sort::serialNumber);
    replacements.learn(beginning + "22", Sort::serialNumber);
    EXPECT_EQ(replacements.message(beginning + "22", false),
              replacements.of(beginning + "22", Sort::serialNumber));
}

// What would take minutes if each place of the message were compared with all of the text.
TEST(RedactedMessage, IsSearchedForALongTextInTimeThatDoesNotMultiply) {
    const std::string serial = std::string(500'000, 's') + "t";
    const std::string text = redacted(std::string(1'000'000, 's'), serial);
    EXPECT_EQ(text.find(std::string(100, 's')), std::string::npos);
}

TEST(CutOffMessage, HasTheBeginningOfAKnownTextReplacedAtItsEnd) {
    EXPECT_EQ(cutOff("Drive QS0101003", "QS0101003K"), "Drive SN-0002");
    EXPECT_EQ(cutOff("Drive xQS01", "QS0101003K"), "Drive xSN-0002");
    EXPECT_EQ(cutOff("Drive Q", "QS0101003K"), "Drive SN-0002");
    EXPECT_EQ(cutOff("Drive QS0101003K of Dat", "QS0101003K"), "Drive SN-0001 of NAME-0002");
    EXPECT_EQ(cutOff("Drive " + std::string(80, 's'), std::string(100, 's')).substr(0, 13),
              "Drive SN-0001");
}

TEST(CutOffMessage, StaysAsItIsWhenItEndsOtherwise) {
    EXPECT_EQ(cutOff("Drive QS02 failed", "QS0101003K"), "Drive QS02 failed");
    EXPECT_EQ(cutOff("xQ", "QS0101003K"), "xQ");
    EXPECT_EQ(cutOff("", "QS0101003K"), "");
}

}  // namespace
}  // namespace raidinfo::redact
