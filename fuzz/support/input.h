#pragma once

#include <cstddef>
#include <cstdint>
#include <string>

// What the fuzzer calls for every input.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);

// What the fuzzer calls once, before the first input.
extern "C" int LLVMFuzzerInitialize(int* argc, char*** argv);

namespace raid::fuzz {

[[nodiscard]] inline std::string textOf(const std::uint8_t* data, std::size_t size) {
    return {data, data + size};
}

}  // namespace raid::fuzz
