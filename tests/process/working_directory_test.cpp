// A host that changes or loses the directory it works in.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>

#include "../agent/agent_documents.h"
#include "RAIDInstrumentation.h"
#include "agent/saved_answers.h"
#include "diag/debug.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

namespace fs = std::filesystem;

class WorkingDirectory : public FreshLibrary {};

TEST_F(WorkingDirectory, MayBeRemovedUnderTheHost) {
    writeLogLevel(8);
    fs::remove("../run");
    ASSERT_THROW((void)fs::current_path(), fs::filesystem_error);
    const ScriptedService service({answering(systemNamed("whole"))});
    RAIDinit();
    EXPECT_EQ(currentSystem(), "whole");
    EXPECT_EQ(readRAIDXML("config.xml"), 0);
    EXPECT_EQ(currentSystem(), "whole");
}

TEST_F(WorkingDirectory, TellsWhereTheLogIsAtEveryMessage) {
    writeLogLevel(8);
    debug(8, "before\n");
    fs::create_directories("host/run");
    fs::create_directories("host/logs");
    fs::current_path("host/run");
    debug(8, "after\n");
    EXPECT_EQ(readLog(), "after\n");
    fs::current_path("../..");
    EXPECT_EQ(readLog(), "before\n");
}

}  // namespace
