#include "commands/session.h"

#include <unistd.h>

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>
#include <utility>

#include "inventory/structure.h"
#include "source/recorded.h"
#include "source/service.h"
#include "source/service_address.h"
#include "source/service_failures.h"
#include "system/alarm.h"
#include "text/printable.h"

namespace raidinfo {

Trees::Trees(Inventory inventory)
    : published{std::move(inventory.snapshot)},
      roots{adapterTrees(inventory.adapters, published)} {}

Session::Session(const Options& given, const Library& loaded, const Output& destination,
                 std::stop_token stopped)
    : chosen{given},
      lib{loaded},
      out{destination},
      stopToken{std::move(stopped)},
      screen{terminalOf(destination.descriptor(), given.color)} {
    if (given.codes) {
        book = readCodeBook(*given.codes);  // A wrong file is told before anybody is asked.
    }
    if (given.recording) {
        answers = readRecording(*given.recording);
    }
}

GridLayout Session::layout() const { return {.width = screen.width, .painter = painter()}; }

Trees Session::inventory() const {
    if (answers) {
        RecordedInventory recorded = recordedInventory(lib, *answers);
        leftOut = recorded.leftOut;
        Trees trees{std::move(recorded.inventory)};
        for (const Trouble& trouble : troublesOfSource()) {
            complain(trouble.message);
        }
        return trees;
    }
    const Alarm alarm{chosen.limit, lib.function<void()>("cancelGetEvent"), stopToken};
    try {
        return Trees{readInventory(lib, alarm.over())};
    } catch (const Failure&) {
        if (alarm.rang()) {
            throw noAnswerInTime();
        }
        throw;
    }
}

std::vector<Trouble> Session::troublesOfSource() const {
    return answers ? troublesOf(*answers, chosen.recording->string(), leftOut)
                   : std::vector<Trouble>{};
}

const CodeBook& Session::codeBook() const {
    if (!book) {
        book = shippedCodeBook();
    }
    return *book;
}

void Session::print(Json data, std::vector<Trouble> troubles) const {
    std::ranges::move(troublesOfSource(), std::back_inserter(troubles));
    out.write(document(enveloped(sourceOf(chosen), troubles, std::move(data))));
}

void Session::printLine(const std::vector<Trouble>& troubles, Json data) const {
    out.write(documentLine(enveloped(sourceOf(chosen), troubles, std::move(data))));
}

Source sourceOf(const Options& options) {
    if (const auto* const diff = std::get_if<DiffOptions>(&options.command);
        diff != nullptr && !diff->after.empty()) {
        return {"files", diff->before + ", " + diff->after};
    }
    return options.recording ? Source{"recording", options.recording->string()}
                             : Source{"service", ServiceAddress::inShort()};
}

std::vector<Trouble> troublesOf(const recording::Recording& recorded, const std::string& name,
                                std::size_t leftOut) {
    std::vector<Trouble> troubles;
    if (leftOut > 0) {
        troubles.push_back({troubleCode(ExitStatus::malformedAnswer),
                            name + ": later configurations that are malformed and left out: " +
                                std::to_string(leftOut)});
    }
    if (recorded.cutShort) {
        troubles.push_back(
            {"recording_cut_short", name + ": " + std::string{recording::cutShortNotice}});
    }
    return troubles;
}

void complain(std::string message) {
    message = "raidinfo: " + printable(message) + "\n";
    // Nothing can be done when this fails too.
    [[maybe_unused]] const ssize_t written = write(STDERR_FILENO, message.data(), message.size());
}

}  // namespace raidinfo
