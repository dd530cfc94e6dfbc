#pragma once

#include <chrono>
#include <cstddef>

// Every bound of the service in one place.
namespace raidsim::bounds {

inline constexpr std::size_t headerBytes = 16 * 1024;
inline constexpr std::size_t requestBodyBytes = 64 * 1024;
inline constexpr std::size_t drainBytes = 1024 * 1024;
inline constexpr std::size_t clients = 256;
inline constexpr std::size_t fileBytes = 64 * 1024 * 1024;
inline constexpr std::size_t recordingBytes = 256 * 1024 * 1024;
inline constexpr std::size_t elementNesting = 1024;
inline constexpr std::size_t controlLineBytes = 64 * 1024;
inline constexpr std::size_t eventsKept = 10000;
inline constexpr std::size_t turnsOfAStep = 1'000'000;

inline constexpr std::chrono::seconds requestTime{30};
inline constexpr std::chrono::seconds answerTime{30};
inline constexpr std::chrono::seconds drainTime{2};

}  // namespace raidsim::bounds
