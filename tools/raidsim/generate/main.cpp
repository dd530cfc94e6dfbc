// Writes the example documents into the directory that is given.

#include <filesystem>
#include <fstream>
#include <iostream>

#include "generate/examples.h"

int main(int argc, char** argv) {
    if (argc != 2) {
        std::cerr << "usage: raidsim_write_examples DIRECTORY\n";
        return 64;
    }
    for (const auto& example : raidsim::generate::examples()) {
        const auto path = std::filesystem::path(argv[1]) / example.fileName;
        std::ofstream out(path, std::ios::binary);
        out << raidsim::xml::format(raidsim::generate::document(example.plan())) << std::flush;
        if (!out) {
            std::cerr << path.string() << ": cannot be written\n";
            return 73;
        }
    }
    return 0;
}
