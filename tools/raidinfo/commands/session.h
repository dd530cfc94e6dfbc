#pragma once

#include <optional>
#include <stop_token>
#include <string>
#include <string_view>

#include "codebook/code_book.h"
#include "command_line/options.h"
#include "inventory/tree.h"
#include "json/envelope.h"
#include "library/library.h"
#include "presentation/grid.h"
#include "presentation/terminal.h"
#include "recording/recording.h"
#include "source/inventory.h"
#include "system/output.h"

namespace raidinfo {

/// The inventory and the trees over it.
class Trees {
public:
    explicit Trees(Inventory inventory);
    Trees(Trees&&) = default;
    Trees& operator=(Trees&&) = default;
    Trees(const Trees&) = delete;
    Trees& operator=(const Trees&) = delete;
    ~Trees() = default;

    [[nodiscard]] const Snapshot& snapshot() const noexcept { return published; }
    [[nodiscard]] const Group& adapters() const noexcept { return roots; }

private:
    Snapshot published;
    Group roots;  ///< points into what is published
};

/// What the subcommands work with: where the data comes from and where the output goes.
class Session {
public:
    Session(const Options& given, const Library& loaded, const Output& destination,
            std::stop_token stopped);

    [[nodiscard]] const Options& options() const noexcept { return chosen; }
    [[nodiscard]] const Library& library() const noexcept { return lib; }
    [[nodiscard]] const Output& output() const noexcept { return out; }
    [[nodiscard]] const std::stop_token& stop() const noexcept { return stopToken; }
    [[nodiscard]] const Terminal& terminal() const noexcept { return screen; }
    [[nodiscard]] Painter painter() const { return Painter{screen.colors}; }
    [[nodiscard]] GridLayout layout() const;
    [[nodiscard]] const std::optional<recording::Recording>& recorded() const noexcept {
        return answers;
    }

    /// Of the service, which is waited for as long as the options say, or of the recording.
    [[nodiscard]] Trees inventory() const;

    /// What the service's numbers mean.
    [[nodiscard]] const CodeBook& codeBook() const;

    /// What is missing in the recording; nothing where there is none.
    [[nodiscard]] std::vector<Trouble> troublesOfSource() const;

    /// As JSON in its envelope, and as one line of a stream of such documents.
    void print(Json data, std::vector<Trouble> troubles = {}) const;
    void printLine(const std::vector<Trouble>& troubles, Json data) const;

private:
    const Options& chosen;
    const Library& lib;
    const Output& out;
    std::stop_token stopToken;
    Terminal screen;
    std::optional<recording::Recording> answers;
    mutable std::size_t leftOut = 0;       ///< configurations of the recording, by inventory()
    mutable std::optional<CodeBook> book;  ///< read when first asked for
};

/// What the JSON of these options tells about.
[[nodiscard]] Source sourceOf(const Options& options);

/// What is missing in the recording of this name, of which so many configurations were left out.
[[nodiscard]] std::vector<Trouble> troublesOf(const recording::Recording& recorded,
                                              const std::string& name, std::size_t leftOut);

/// One line on standard error, whatever the message holds.
void complain(std::string message);

}  // namespace raidinfo
