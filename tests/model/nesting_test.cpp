// Spanned arrays inside spanned arrays.

#include <gtest/gtest.h>
#include <pthread.h>

#include <memory>
#include <string>

#include "model/system_and_adapter.h"

#include "support/fresh_library.h"
#include "support/reading.h"

namespace {

using namespace raid::test;

constexpr int limit = 256;

// The sanitizers' instrumentation needs more stack than the library does.
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
constexpr std::size_t stackSize = 8 * 1024 * 1024;
#else
constexpr std::size_t stackSize = 512 * 1024;
#endif

std::string nestedArrays(int depth) {
    std::string text;
    for (int i = 0; i < depth; ++i) {
        text += "<ac:arrays><ac:spannedArray>";
    }
    for (int i = 0; i < depth; ++i) {
        text += "</ac:spannedArray></ac:arrays>";
    }
    return text;
}

std::string systemOf(int depth) {
    return "<ac:system><ac:adapter>" + nestedArrays(depth) + "</ac:adapter></ac:system>";
}

int depthOf(const RAIDArrays& arrays) {
    int depth = 0;
    for (auto inner = arrays.getSpannedArray(); !inner.empty();
         inner = inner[0].getArrays().getSpannedArray()) {
        ++depth;
    }
    return depth;
}

// Runs the work on a thread with the stack that a host may give its threads.
template <class Work>
void onSmallStack(Work work) {
    pthread_attr_t attributes;
    pthread_attr_init(&attributes);
    ASSERT_EQ(pthread_attr_setstacksize(&attributes, stackSize), 0);
    pthread_t thread{};
    const auto run = [](void* argument) -> void* {
        (*static_cast<Work*>(argument))();
        return nullptr;
    };
    ASSERT_EQ(pthread_create(&thread, &attributes, run, &work), 0);
    pthread_join(thread, nullptr);
    pthread_attr_destroy(&attributes);
}

class Nesting : public FreshLibrary {};

TEST_F(Nesting, UpToTheLimitIsReadCopiedAndDestroyedOnASmallStack) {
    onSmallStack([] {
        const auto system = std::make_unique<RAIDSystem>(read<RAIDSystem>(systemOf(limit)));
        auto copies = system->getAdapters();
        const auto assigned = system->getAdapters();
        copies[0] = assigned[0];
        EXPECT_EQ(depthOf(copies[0].getArrays()), limit);
    });
}

TEST_F(Nesting, BeyondTheLimitIsAnErrorOnASmallStack) {
    for (const int depth : {limit + 1, 100000}) {
        onSmallStack([depth] {
            const auto message = errorOf<RAIDSystem>(systemOf(depth));
            EXPECT_TRUE(message.starts_with(
                "XML syntax error: Nesting too deep at  : ac:spannedArray\nassociation:\n"))
                << message.substr(0, 100);
            EXPECT_TRUE(message.ends_with("\nRAIDSystem:\n\nsystem:\n"));
        });
    }
}

TEST_F(Nesting, CountsFromTheElementThatIsReadAndNotTheOnesBeside) {
    const std::string siblings = "<ac:spannedArray/><ac:spannedArray></ac:spannedArray>";
    const auto text = "<ac:spannedArray>" + nestedArrays(limit - 1) + "</ac:spannedArray>";
    EXPECT_EQ(depthOf(read<RAIDSpannedArray>(text).getArrays()), limit - 1);
    std::string many = "<ac:arrays>";
    for (int i = 0; i < limit; ++i) {
        many += siblings;
    }
    EXPECT_EQ(read<RAIDArrays>(many + "</ac:arrays>").getSpannedArray().size(), 2U * limit);
}

}  // namespace
