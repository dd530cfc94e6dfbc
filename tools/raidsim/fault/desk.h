#pragma once

#include <functional>
#include <memory>
#include <optional>
#include <string>

#include "fault/fault_file.h"

namespace raidsim {

// The fault that is armed, if any: which case the next client meets, and when it is over.
class FaultDesk {
public:
    // A case on its way to a client.
    struct Play {
        FaultCase chosen;
        std::string label;  // "cut-header case 17: cut=17"
    };

    // Arms one case, or all of them, each for one client. Throws FaultError. What cannot be
    // followed, because changed throws, is not done; so with off.
    void arm(std::shared_ptr<const FaultFile> file, std::optional<std::size_t> only);
    // Disarms, and ends what stalls or refuses.
    void off();

    // The next case for a client of which nothing is known yet, or whose request was read.
    [[nodiscard]] std::optional<Play> meetConnection();
    [[nodiscard]] std::optional<Play> meetRequest(RequestKind kind);

    [[nodiscard]] bool refuses() const noexcept { return reel.next && reel.next->chosen.refuses; }

    // Changes whenever off() is called, so that who stalls can tell.
    [[nodiscard]] unsigned generation() const noexcept { return offs; }

    std::function<void(const std::string& line)> tell = [](const std::string&) {};
    std::function<void(const std::string& line)> complain = [](const std::string&) {};
    std::function<void()> changed = [] {};  // refuses() may have become another

private:
    // What is played: from the current case to the end, and the case that is met next.
    struct Reel {
        std::shared_ptr<const FaultFile> file;
        std::size_t current = 0;
        std::size_t end = 0;
        std::optional<Play> next;
    };

    static void prepare(Reel& reel);
    [[nodiscard]] static std::string currentName(const Reel& reel);
    void change(Reel to);
    // For when nobody is there whom an exception would reach: complains, and is disarmed.
    void prepareOrComplain();
    [[nodiscard]] std::optional<Play> take();

    Reel reel;
    unsigned offs = 0;
};

}  // namespace raidsim
