#pragma once

#include <array>
#include <memory>
#include <stdexcept>
#include <string_view>
#include <tuple>
#include <utility>

#include "base/decimal.h"
#include "model/arrays_vocabulary.h"
#include "model/channels_and_drives_vocabulary.h"
#include "model/enclosures_vocabulary.h"
#include "model/logical_drives_vocabulary.h"
#include "model/system_and_adapter_vocabulary.h"
#include "xml/bytes.h"

// What the peers share: they walk the same tables, and look for the next child first where it is
// found nearly always, behind the last one.
namespace raid::bench {

/// What the peers read last.
inline std::unique_ptr<RAIDSystem> peerModel;

class PeerError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

inline void renewPeerModel() {
    peerModel.reset();
    constexpr std::string_view empty = "<ac:system/>";
    peerModel = std::make_unique<RAIDSystem>(empty.data(), static_cast<int>(empty.size()), nullptr);
}

/// The number of the child; throws for an unknown one.
template <class Model>
std::size_t childNumber(std::string_view name, std::size_t expected) {
    constexpr auto& children = xml::childrenOf<Model>;
    for (std::size_t i = 0; i < children.size(); ++i) {
        const std::size_t number = expected < children.size() ? expected : 0;
        if (children[number].name == name) {
            return number;
        }
        expected = number + 1;
    }
    throw PeerError("unknown element " + std::string(name));
}

template <class Model>
void keepChildText(Model& model, std::size_t number, std::string_view text) {
    const auto trimmed = xml::trimmed(text);
    if (!trimmed.empty()) {
        xml::keepText(model, xml::childrenOf<Model>[number], trimmed);
    }
}

}  // namespace raid::bench
