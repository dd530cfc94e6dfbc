#pragma once

#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <variant>
#include <vector>

#include "model/classes.h"
#include "xml/raid_xml_error.h"

namespace raid::test {

inline std::string shown(const std::string& text) { return text; }
inline std::string shown(int number) { return std::to_string(number); }

// Builds the description of one class from rows that name a child and its getter.
template <class Model>
class Describe {
public:
    Describe(const char* name, std::string_view element, std::string_view endWord,
             std::string (Model::*type)() const)
        : described(name, element, endWord) {
        getters() = {.type = type, .fields = {}, .inside = {}};
        described.read = [](const std::string& text) { return reading(text); };
        described.readAsValues = [](const std::string& text) { return readingAsValues(text); };
    }

    Describe& number(const char* name, int (Model::*getter)() const) {
        return add(name, Kind::number, getter);
    }
    Describe& flag(const char* name, int (Model::*getter)() const) {
        return add(name, Kind::flag, getter);
    }
    Describe& text(const char* name, std::string (Model::*getter)() const) {
        return add(name, Kind::text, getter);
    }

    // The elements at the end of a path of names, the first of them a child.
    template <class Item>
    Describe& each(std::vector<std::string> path, std::vector<Item> (Model::*getter)() const) {
        getters().inside.push_back([getter](const Model& model) {
            std::vector<Reading> items;
            for (const Item& item : (model.*getter)()) {
                items.push_back(Describe<Item>::shownBy(item));
            }
            return items;
        });
        described.inside.push_back({std::move(path), false});
        return *this;
    }
    template <class Item>
    Describe& one(const char* name, Item (Model::*getter)() const) {
        getters().inside.push_back([getter](const Model& model) {
            return std::vector<Reading>{Describe<Item>::shownBy((model.*getter)())};
        });
        described.inside.push_back({{name}, true});
        return *this;
    }

    Describe& knows(const char* name) {
        described.unshown.emplace_back(name);
        return *this;
    }

    Describe& endWordOf(const char* name, const char* word) {
        for (auto& field : described.fields) {
            if (field.name == name) {
                field.endWord = word;
            }
        }
        return *this;
    }
    Describe& exitsAs(const char* name) {
        described.exitName = name;
        return *this;
    }
    Describe& inContext(const char* context) {
        described.context = context;
        return *this;
    }

    operator ModelClass() const { return described; }

    // What the getters show of an object.
    static Reading shownBy(const Model& model) {
        Reading result;
        if constexpr (requires { model.dump(); }) {
            model.dump();  // shows nothing
        }
        if (getters().type != nullptr) {
            result.type = (model.*getters().type)();
        }
        for (const auto& getter : getters().fields) {
            result.values.push_back(
                std::visit([&](auto get) { return shown((model.*get)()); }, getter));
        }
        for (const auto& items : getters().inside) {
            result.inside.push_back(items(model));
        }
        return result;
    }

private:
    using Getter = std::variant<int (Model::*)() const, std::string (Model::*)() const>;

    struct Getters {
        std::string (Model::*type)() const = nullptr;
        std::vector<Getter> fields;
        std::vector<std::function<std::vector<Reading>(const Model&)>> inside;
    };

    // Of the one description of the class.
    static Getters& getters() {
        static Getters all;
        return all;
    }

    Describe& add(const char* name, Kind kind, Getter getter) {
        described.fields.push_back({name, kind, name});
        getters().fields.push_back(getter);
        return *this;
    }

    static Reading reading(const std::string& text) {
        try {
            int consumed = 0;
            const Model model(text.data(), static_cast<int>(text.size()), &consumed);
            auto result = shownBy(model);
            result.consumed = consumed;
            return result;
        } catch (const RAIDXMLError& error) {
            return {.error = error.getMessage()};
        }
    }

    // The same object again and again, each time made from the one before it in another way.
    static std::vector<Reading> readingAsValues(const std::string& text) {
        Model model(text.data(), static_cast<int>(text.size()), nullptr);
        std::vector<Reading> all{shownBy(model)};
        Model copied(model);
        all.push_back(shownBy(copied));
        Model moved(std::move(copied));
        all.push_back(shownBy(moved));
        copied = moved;
        all.push_back(shownBy(copied));
        moved = std::move(copied);
        all.push_back(shownBy(moved));
        all.push_back(shownBy(model));
        return all;
    }

    ModelClass described;
};

}  // namespace raid::test
