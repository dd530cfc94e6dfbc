#include "layout.h"

#include <cstddef>
#include <string_view>

#include "model/raid_events_vocabulary.h"
#include "model/system_and_adapter_vocabulary.h"

namespace raid::test {

namespace {

using xml::Vocabulary;

std::string line(std::string_view indent, std::string_view name, std::size_t number) {
    return std::string(indent).append(name) + " " + std::to_string(number) + "\n";
}

template <class Model>
class Layout {
public:
    [[nodiscard]] std::string text() const {
        std::string lines = line("", Vocabulary<Model>::words.element, sizeof(Model));
        lines += member("xsi:type", Vocabulary<Model>::type);
        if constexpr (requires { Vocabulary<Model>::children; }) {
            for (const auto& child : xml::childrenOf<Model>) {
                if (child.number != nullptr) {
                    lines += member(child.name, child.number);
                } else if (child.text != nullptr) {
                    lines += member(child.name, child.text);
                }
            }
        }
        return lines;
    }

private:
    template <class Type>
    [[nodiscard]] std::string member(std::string_view name, Type Model::*pointer) const {
        const auto* const start = reinterpret_cast<const std::byte*>(&model);
        const auto* const there = reinterpret_cast<const std::byte*>(&(model.*pointer));
        return line("    ", name, static_cast<std::size_t>(there - start));
    }

    static Model empty() {
        const std::string text = "<" + std::string(Vocabulary<Model>::words.element) + "/>";
        return Model(text.c_str(), static_cast<int>(text.size()), nullptr);
    }

    Model model = empty();
};

template <class... Models>
std::string layoutOf() {
    return (Layout<Models>().text() + ...);
}

}  // namespace

std::string layoutOfTheModelClasses() {
    return layoutOf<RAIDSystem, RAIDAdapter, RAIDPhysicalDrives, RAIDChannel, RAIDHardDrive,
                    RAIDHotSpareDrives, RAIDEnclosureDevice, RAIDFan, RAIDPowerSupply,
                    RAIDTempSensor, RAIDDeviceSlotID, RAIDLogicalDrives, RAIDLogicalDrive,
                    RAIDArrays, RAIDBasicArray, RAIDSpannedArray, RAIDChunks, RAIDLimits,
                    RAIDProgress, RAIDEvents, RAIDEvent>();
}

}  // namespace raid::test
