// Answers read from files.

#include <gtest/gtest.h>

#include <filesystem>
#include <string>
#include <thread>
#include <vector>

#include "agent/saved_answers.h"
#include "agent_documents.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/row.h"

namespace {

using namespace raid::test;

class SavedAnswers : public FreshLibrary {
protected:
    SavedAnswers() {
        process(processXML, systemNamed("before"));
        process(processEventXML, eventsNumbered(1, 3));
    }
};

TEST_F(SavedAnswers, AreReadLikeThoseOfTheService) {
    writeFile("config.xml", systemNamed("saved"));
    writeFile("events.xml", eventsNumbered(1, 5));
    EXPECT_EQ(readRAIDXML("config.xml"), 0);
    EXPECT_EQ(readEventRAIDXML("events.xml"), 0);
    EXPECT_EQ(currentSystem(), "saved");
    EXPECT_EQ(currentEvents(), 5);
}

TEST_F(SavedAnswers, AreReadWholeWhateverTheirSize) {
    writeFile("events.xml", eventsNumbered(1, 20'000));
    readEventRAIDXML("events.xml");
    EXPECT_EQ(currentEvents(), 20'000);
}

TEST_F(SavedAnswers, AreReadFromARelativeOrAbsolutePath) {
    std::filesystem::create_directory("saved");
    writeFile("saved/config.xml", systemNamed("saved"));
    for (const std::string& path : {std::string("./saved/config.xml"),
                                    std::filesystem::absolute("saved/config.xml").string()}) {
        process(processXML, "");
        readRAIDXML(path);
        EXPECT_EQ(currentSystem(), "saved") << path;
    }
}

TEST_F(SavedAnswers, LeaveNothingWhenTheyAreMalformed) {
    configRead = 0;
    writeLogLevel(1);
    writeFile("broken.xml", configDocument("<ac:system><as:os>x</as:name></ac:system>"));
    readRAIDXML("broken.xml");
    EXPECT_EQ(currentSystem(), "none");
    EXPECT_EQ(readLog(), "XML syntax error: End of \"os\" is missing before : as:name\nsystem:\n");
}

TEST_F(SavedAnswers, LeaveNothingWhenTheyAreEmpty) {
    writeFile("empty.xml", "");
    EXPECT_EQ(readRAIDXML("empty.xml"), 0);
    EXPECT_EQ(readEventRAIDXML("empty.xml"), 0);
    EXPECT_EQ(currentSystem(), "none");
    EXPECT_EQ(currentEvents(), -1);
}

TEST_F(SavedAnswers, AreReadWhileAnotherThreadHoldsTheLock) {
    writeFile("config.xml", systemNamed("saved"));
    pthread_mutex_lock(&mutex_handle);
    std::jthread([] { readRAIDXML("config.xml"); }).join();
    pthread_mutex_unlock(&mutex_handle);
    EXPECT_EQ(currentSystem(), "saved");
}

// A path at which nothing can be read.
struct Unreadable : Row {
    void (*make)(const char* path);
};

const std::vector<Unreadable> unreadables{
    {"MissingFile", [](const char*) {}},
    {"Directory", [](const char* path) { std::filesystem::create_directory(path); }},
    {"PipeWithoutAWriter", [](const char* path) { makePipe(path); }},
    {"LinkToNothing", [](const char* path) { std::filesystem::create_symlink("nothing", path); }},
    {"LinkToItself", [](const char* path) { std::filesystem::create_symlink(path, path); }},
};

class UnreadableAnswer : public SavedAnswers, public testing::WithParamInterface<Unreadable> {};

TEST_P(UnreadableAnswer, ChangesNothing) {
    GetParam().make("answer.xml");
    EXPECT_EQ(readRAIDXML("answer.xml"), 0);
    EXPECT_EQ(readEventRAIDXML("answer.xml"), 0);
    EXPECT_EQ(currentSystem(), "before");
    EXPECT_EQ(currentEvents(), 3);
}

INSTANTIATE_TEST_SUITE_P(Paths, UnreadableAnswer, testing::ValuesIn(unreadables), nameOfRow);

}  // namespace
