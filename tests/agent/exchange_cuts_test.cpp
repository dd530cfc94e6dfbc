// One answer, cut everywhere: what counts is what the first receive brings.

#include <gtest/gtest.h>

#include <filesystem>
#include <sstream>
#include <string>
#include <string_view>
#include <vector>

#include "exchanged.h"
#include "support/files.h"
#include "support/fresh_library.h"
#include "support/scripted_service.h"

namespace {

using namespace raid::test;

constexpr std::string_view head = "HTTP/1.1 200 OK\nContent-Length: 12\n\n";
constexpr std::string_view body = "<a>twelve</a";

// What an answer means whose first chunk ends at the cut.
std::optional<std::string> expectedOf(std::size_t cut) {
    constexpr std::string_view name = "Content-Length: ";
    if (cut < head.find(name) + name.size()) {
        return std::nullopt;
    }
    return cut < head.size() ? "" : std::string(body);
}

std::string linesWith(std::string_view start, const std::string& text) {
    std::istringstream all(text);
    std::string found;
    for (std::string line; std::getline(all, line);) {
        found += line.starts_with(start) ? line + "\n" : "";
    }
    return found;
}

class ExchangeCuts : public FreshLibrary {};

TEST_F(ExchangeCuts, NeedsTheHeaderAndNothingElseInTheFirstChunk) {
    const std::string whole = std::string(head).append(body);
    for (std::size_t cut = 1; cut < whole.size(); ++cut) {
        const ScriptedService service({{.pieces = {whole.substr(0, cut), whole.substr(cut)}}});
        EXPECT_EQ(exchanged(), expectedOf(cut)) << "first chunk: " << whole.substr(0, cut);
    }
}

TEST_F(ExchangeCuts, PutsABodyTogetherFromChunksOfEverySize) {
    for (std::size_t size = 1; size <= body.size(); ++size) {
        std::vector<Piece> pieces{std::string(head)};
        for (std::size_t at = 0; at < body.size(); at += size) {
            pieces.emplace_back(std::string(body.substr(at, size)));
        }
        const ScriptedService service({{.pieces = pieces}});
        EXPECT_EQ(exchanged(), body) << "chunks of " << size;
    }
}

struct FullChunk {
    std::size_t answer;
    std::string receives;
};

TEST_F(ExchangeCuts, FillsTheFirstChunkToItsLastByte) {
    writeLogLevel(8);
    const std::string end = "\nContent-Length: 4\n\nbody";
    for (const auto& [size, receives] :
         {FullChunk{3022, "Data received 3022\n"}, FullChunk{3023, "Data received 3023\n"},
          FullChunk{3024, "Data received 3023\nData received 1\n"}}) {
        const ScriptedService service({{.pieces = {std::string(size - end.size(), '.') + end}}});
        EXPECT_EQ(exchanged(), "body");
        EXPECT_EQ(linesWith("Data received", readLog()), receives);
        std::filesystem::remove(logPath);
    }
}

}  // namespace
