#pragma once

#include <filesystem>
#include <string>
#include <string_view>

namespace raid::test {

// Where the library looks, seen from the directory in which every test starts.
inline constexpr std::string_view settingsPath = "../logs/RAIDInstrumentation.ini";
inline constexpr std::string_view logPath = "../logs/RAIDInstrumentation.log";

void writeFile(const std::filesystem::path& path, std::string_view bytes);
// A pipe without a reader or a writer.
void makePipe(const std::filesystem::path& path);
// Throws when the file cannot be read.
[[nodiscard]] std::string readFile(const std::filesystem::path& path);

// Writes a settings file that holds only "LogLevel". The library reads it at its first message.
void writeLogLevel(int level);
// The log's bytes; empty when there is no log file.
[[nodiscard]] std::string readLog();

}  // namespace raid::test
