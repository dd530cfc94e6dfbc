#pragma once

#include <optional>
#include <string>

#include "library/library.h"
#include "system/folder.h"

namespace raidinfo {

/// While it lives the library logs its errors to a place of its own. That is beside the working
/// directory, which therefore is another one meanwhile. The library must have read its settings
/// before.
class LibraryLog {
public:
    explicit LibraryLog(const Library& library);

    /// The last error of the XML reader with all that it says; "" if there is none.
    [[nodiscard]] std::string lastError() const;

    /// Why there is no log; "" where there is one.
    [[nodiscard]] const std::string& trouble() const noexcept { return reason; }

private:
    class Level {
    public:
        explicit Level(const Library& library);
        Level(const Level&) = delete;
        Level& operator=(const Level&) = delete;
        ~Level();

    private:
        int& level;
        int before;
    };

    /// What it takes; the last goes first.
    struct Place {
        explicit Place(const Library& library);

        TemporaryFolder folder;
        WorkingFolder working;
        Level level;
    };

    std::optional<Place> place;
    std::string reason;
};

}  // namespace raidinfo
