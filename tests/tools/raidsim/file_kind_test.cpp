#include "file_kind.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "support/files.h"

namespace raidsim::test {
namespace {

using raid::test::writeFile;
using testing::EndsWith;
using testing::IsEmpty;

std::string hintForText(const std::string& text) {
    writeFile("x", text);
    return hintFor("x", FileKind::configuration);
}

TEST(AHint, TellsHowToGiveEveryShippedFile) {
    int files = 0;
    for (const char* const root : {RAIDSIM_EXAMPLES, RAIDSIM_FAULTS}) {
        for (const auto& entry : std::filesystem::recursive_directory_iterator(root)) {
            const std::string path = entry.path().string();
            const std::string ending = entry.path().extension().string();
            if (ending == ".scenario")
                EXPECT_THAT(hintFor(path, FileKind::fault), EndsWith("use --scenario")) << path;
            else if (ending == ".fault")
                EXPECT_THAT(hintFor(path, FileKind::scenario), EndsWith("use --fault")) << path;
            else if (ending == ".init")
                EXPECT_THAT(hintFor(path, FileKind::scenario), EndsWith("use --init")) << path;
            else if (ending == ".xml" && path.starts_with(RAIDSIM_EXAMPLES))
                EXPECT_THAT(hintFor(path, FileKind::recording), EndsWith("as CONFIG")) << path;
            else
                continue;
            ++files;
        }
    }
    EXPECT_GT(files, 100);
}

TEST(AHint, IsGivenByTheHeadingOfARecordingHoweverItGoesOn) {
    EXPECT_EQ(hintForText("raid-recording 1 2026-11-21T17:48:00Z\nnonsense\n"),
              "; this looks like a recording: use --replay");
    EXPECT_THAT(hintForText("raid-recording of Monday\n"), IsEmpty());
}

TEST(AHint, IsGivenByTheFirstStatementBehindBlankLinesAndComments) {
    EXPECT_EQ(hintForText("# Monday\n\n  seed 7\nnonsense\n"),
              "; this looks like a scenario: use --scenario");
    EXPECT_EQ(hintForText("# Monday\ntitle \"Cut short\"\nnonsense\n"),
              "; this looks like a fault file: use --fault");
    EXPECT_EQ(hintForText("# Monday\nset drive:3 state=4\nnonsense\n"),
              "; this looks like a file of commands: use --init");
}

TEST(AHint, IsNotGivenByAFirstWordAlone) {
    for (const char* const text :
         {"", "# nothing\n", "at once\n", "start here\n", "title\n", "title page one\n",
          "set the table\n", "title \"open\n", "<html>\n", "see <ac:system>\n"})
        EXPECT_THAT(hintForText(text), IsEmpty()) << text;
}

TEST(AHint, IsNotGivenForAFileThatWasTakenForWhatItIs) {
    writeFile("x", "seed 7\nnonsense\n");
    EXPECT_THAT(hintFor("x", FileKind::scenario), IsEmpty());
}

TEST(AHint, IsNotGivenForWhatIsNoFile) {
    EXPECT_THAT(hintFor("gone", FileKind::configuration), IsEmpty());
    EXPECT_THAT(hintFor(".", FileKind::configuration), IsEmpty());
}

}  // namespace
}  // namespace raidsim::test
