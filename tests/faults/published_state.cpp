#include "published_state.h"

#include <functional>
#include <vector>

#include "flat/accessor_families.h"
#include "flat/exported.h"

namespace raid::test {

namespace {

using Show = std::function<std::string(int position)>;

// As long as the longest text of a fault.
std::vector<char>& buffer() {
    static std::vector<char> bytes(2'000'000);
    return bytes;
}

Show showOf(const AccessorFamily& family, const Field& field) {
    const std::string name = "get" + family.name + field.name;
    if (field.shape == Shape::number || field.shape == Shape::flag) {
        return [get = exported<int(int)>(name)](int position) {
            return std::to_string(get(position));
        };
    }
    return [get = exported<int(char*, int)>(name)](int position) {
        char* const text = buffer().data();
        *text = '\0';
        get(text, position);
        return std::string(text);
    };
}

struct FamilyView {
    explicit FamilyView(const AccessorFamily& family)
        : count(exported<int()>("get" + family.name + "Count")) {
        for (const Field& field : family.fields) {
            shows.push_back(showOf(family, field));
        }
    }

    int (*count)();
    std::vector<Show> shows;
};

}  // namespace

std::string publishedConfiguration() {
    static const std::vector<FamilyView> views(accessorFamilies.begin(), accessorFamilies.end());
    std::string all;
    for (const FamilyView& view : views) {
        for (int position = 0; position < view.count(); ++position) {
            for (const Show& show : view.shows) {
                all.append(show(position)).append("|");
            }
        }
        all.append("\n");
    }
    return all;
}

}  // namespace raid::test
