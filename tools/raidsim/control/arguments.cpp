#include "control/makers.h"
#include "files.h"

namespace raidsim::makers {

std::vector<std::pair<std::string, std::string>> Arguments::fields(std::size_t first) const {
    std::vector<std::pair<std::string, std::string>> found;
    for (std::size_t i = first; i < words.size(); ++i) {
        const auto equals = words[i].find('=');
        if (equals == std::string::npos || equals == 0)
            throw CommandError("\"" + words[i] + "\" is not of the form field=value");
        found.emplace_back(words[i].substr(0, equals), words[i].substr(equals + 1));
    }
    return found;
}

std::string Arguments::file(std::size_t index) const {
    return pathFrom(origin.folder, words[index]);
}

}  // namespace raidsim::makers
