#include "fault/desk.h"

#include <utility>

namespace raidsim {

void FaultDesk::arm(std::shared_ptr<const FaultFile> file, std::optional<std::size_t> only) {
    if (only)
        (void)file->at(*only);
    Reel fresh;
    fresh.current = only.value_or(0);
    fresh.end = only ? *only + 1 : file->cases();
    fresh.file = std::move(file);
    prepare(fresh);
    change(std::move(fresh));
}

void FaultDesk::off() {
    change({});
    ++offs;
}

void FaultDesk::change(Reel to) {
    std::swap(reel, to);
    try {
        changed();
    } catch (...) {
        std::swap(reel, to);
        throw;
    }
}

void FaultDesk::prepare(Reel& reel) {
    reel.next.reset();
    if (!reel.file)
        return;
    if (reel.current == reel.end) {
        reel.file.reset();
        return;
    }
    auto chosen = reel.file->at(reel.current);
    std::string label = currentName(reel);
    if (!chosen.values.empty())
        label += ": " + chosen.values;
    reel.next = Play{std::move(chosen), std::move(label)};
}

void FaultDesk::prepareOrComplain() {
    try {
        prepare(reel);
    } catch (const FaultError& error) {
        complain("fault: " + currentName(reel) + " cannot be played: " + error.what());
        reel.file.reset();
    }
}

std::string FaultDesk::currentName(const Reel& reel) {
    return reel.file->name() + " case " + std::to_string(reel.current);
}

std::optional<FaultDesk::Play> FaultDesk::take() {
    auto taken = std::exchange(reel.next, std::nullopt);
    ++reel.current;
    prepareOrComplain();
    changed();
    return taken;
}

std::optional<FaultDesk::Play> FaultDesk::meetConnection() {
    if (!reel.next || reel.next->chosen.refuses || reel.next->chosen.beginsWithRequest())
        return std::nullopt;
    return take();
}

std::optional<FaultDesk::Play> FaultDesk::meetRequest(RequestKind kind) {
    if (!reel.next || !reel.next->chosen.beginsWithRequest() ||
        (reel.next->chosen.meets != RequestKind::any && reel.next->chosen.meets != kind))
        return std::nullopt;
    return take();
}

}  // namespace raidsim
