// What belongs to the host, and is as it was after every call.

#include <gtest/gtest.h>
#include <pthread.h>
#include <sys/resource.h>
#include <sys/stat.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <clocale>
#include <csignal>
#include <filesystem>
#include <map>
#include <memory_resource>
#include <string>
#include <vector>

#include "../agent/agent_documents.h"
#include "RAIDInstrumentation.h"
#include "agent/saved_answers.h"
#include "full_answers.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

struct Signal {
    sighandler_t handler;
    int flags;
    bool blocked;

    [[nodiscard]] bool operator==(const Signal&) const = default;
};

std::map<int, Signal> signals() {
    sigset_t mask;
    pthread_sigmask(SIG_BLOCK, nullptr, &mask);
    std::map<int, Signal> all;
    for (int number = 1; number < NSIG; ++number) {
        struct sigaction now {};
        if (sigaction(number, nullptr, &now) == 0) {
            all[number] = {now.sa_handler, now.sa_flags, sigismember(&mask, number) == 1};
        }
    }
    return all;
}

std::vector<rlim_t> limits() {
    std::vector<rlim_t> all;
    for (int resource = 0; resource < RLIM_NLIMITS; ++resource) {
        rlimit now{};
        getrlimit(static_cast<__rlimit_resource>(resource), &now);
        all.push_back(now.rlim_cur);
        all.push_back(now.rlim_max);
    }
    return all;
}

std::vector<std::string> environment() {
    std::vector<std::string> all;
    for (char** variable = environ; *variable != nullptr; ++variable) {
        all.emplace_back(*variable);
    }
    return all;
}

mode_t fileMask() {
    const mode_t mask = umask(0);
    umask(mask);
    return mask;
}

struct HostState {
    std::map<int, Signal> signals = ::signals();
    std::vector<rlim_t> limits = ::limits();
    std::vector<std::string> environment = ::environment();
    std::string directory = std::filesystem::current_path();
    std::string locale = std::setlocale(LC_ALL, nullptr);
    mode_t mask = fileMask();

    [[nodiscard]] bool operator==(const HostState&) const = default;
};

class TheHost : public FreshLibrary {};

TEST_F(TheHost, KeepsItsStateWhateverTheServiceDoes) {
    const HostState before;
    ASSERT_EQ(before.signals.at(SIGPIPE).handler, SIG_DFL);
    writeLogLevel(9);
    writeFile("saved.xml", systemNamed("saved"));
    {
        const ScriptedService service({{.readsRequest = false, .end = End::reset},
                                       {.readsRequest = false},
                                       {.end = End::reset},
                                       {.pieces = {"HTTP"}, .end = End::reset},
                                       answering(fullAnswers().configuration),
                                       answering("<any/>"),
                                       answering(fullAnswers().events)});
        RAIDinit();
        getEvent();
        enableRAIDEvent();
        RAIDinit();
        getEvent();
    }
    EXPECT_EQ(readRAIDXML("saved.xml"), 0);
    EXPECT_EQ(currentSystem(), "saved");
    EXPECT_TRUE(HostState() == before);
}

TEST_F(TheHost, HasNoThreadAndNoChildOfTheLibrary) {
    RAIDinit();
    getEvent();
    const std::filesystem::directory_iterator tasks("/proc/self/task");
    EXPECT_EQ(std::distance(begin(tasks), end(tasks)), 1);
    EXPECT_EQ(waitpid(-1, nullptr, WNOHANG), -1);
    EXPECT_EQ(errno, ECHILD);
}

TEST_F(TheHost, MayHaveADefaultMemoryResourceOfItsOwn) {
    std::pmr::set_default_resource(std::pmr::null_memory_resource());
    {
        const ScriptedService service({answering(fullAnswers().configuration)});
        EXPECT_NO_THROW(RAIDinit());
    }
    std::pmr::set_default_resource(nullptr);
    EXPECT_GT(getRAIDDiskDriveCount(), 0);
}

}  // namespace
