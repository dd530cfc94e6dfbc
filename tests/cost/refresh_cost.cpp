// Reads a document and publishes it, as a refresh does with an answer, for scripts/cost to count:
//
//   refresh_cost DOCUMENT
//
// prints the allocations of a refresh that is not the first. Its instructions are those of the
// function measuredRefresh, which calls measuredReading for the part up to the model.

#include <cstdlib>
#include <fstream>
#include <iostream>
#include <iterator>
#include <new>
#include <string>

#include "RAIDInstrumentation.h"
#include "agent/agent_link.h"
#include "agent/envelope.h"
#include "flat/snapshot.h"

namespace {

long allocations = 0;

char* copyOf(const std::string& document) {
    auto* const copy = static_cast<char*>(std::malloc(document.size() + 1));
    std::copy(document.c_str(), document.c_str() + document.size() + 1, copy);
    return copy;
}

}  // namespace

void* operator new(std::size_t size) {
    ++allocations;
    if (void* const block = std::malloc(size)) {
        return block;
    }
    throw std::bad_alloc();
}
void operator delete(void* block) noexcept { std::free(block); }
void operator delete(void* block, std::size_t /*size*/) noexcept { std::free(block); }

// Found by their names.
extern "C" [[gnu::noinline]] void measuredReading(char* document, int length) {
    processXML(document, length);
}

extern "C" [[gnu::noinline]] void measuredRefresh(char* document, int length) {
    measuredReading(document, length);
    if (const auto* const system = getRAIDSystem()) {
        raid::flat::publish(*system);
    }
}

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: refresh_cost DOCUMENT\n";
        return 64;
    }
    std::ifstream in(argv[1], std::ios::binary);
    const std::string document(std::istreambuf_iterator<char>(in), {});
    configRead = 1;
    processXML(copyOf(document), static_cast<int>(document.size()));
    if (getRAIDSystem() == nullptr) {
        std::cerr << "refresh_cost: " << argv[1] << ": no configuration\n";
        return 65;
    }
    raid::flat::publish(*getRAIDSystem());
    auto* const copy = copyOf(document);
    allocations = 0;
    measuredRefresh(copy, static_cast<int>(document.size()));
    std::cout << allocations << '\n';
    return 0;
}
