#include "fault/desk.h"

#include <utility>

namespace raidsim {

void FaultDesk::arm(std::shared_ptr<const FaultFile> file, std::optional<std::size_t> only) {
    if (only)
        (void)file->at(*only);
    armed = std::move(file);
    current = only.value_or(0);
    end = only ? *only + 1 : armed->cases();
    prepare();
    changed();
}

void FaultDesk::off() {
    armed.reset();
    next.reset();
    ++offs;
    changed();
}

void FaultDesk::prepare() {
    next.reset();
    if (!armed)
        return;
    if (current == end) {
        armed.reset();
        return;
    }
    auto chosen = armed->at(current);
    std::string label = currentName();
    if (!chosen.values.empty())
        label += ": " + chosen.values;
    next = Play{std::move(chosen), std::move(label)};
}

void FaultDesk::prepareOrComplain() {
    try {
        prepare();
    } catch (const FaultError& error) {
        complain("fault: " + currentName() + " cannot be played: " + error.what());
        armed.reset();
    }
}

std::string FaultDesk::currentName() const {
    return armed->name() + " case " + std::to_string(current);
}

std::optional<FaultDesk::Play> FaultDesk::take() {
    auto taken = std::exchange(next, std::nullopt);
    ++current;
    prepareOrComplain();
    changed();
    return taken;
}

std::optional<FaultDesk::Play> FaultDesk::meetConnection() {
    if (!next || next->chosen.refuses || next->chosen.beginsWithRequest())
        return std::nullopt;
    return take();
}

std::optional<FaultDesk::Play> FaultDesk::meetRequest(RequestKind kind) {
    if (!next || !next->chosen.beginsWithRequest() ||
        (next->chosen.meets != RequestKind::any && next->chosen.meets != kind))
        return std::nullopt;
    return take();
}

}  // namespace raidsim
