#include "startup.h"

#include <algorithm>
#include <iterator>
#include <memory>
#include <utility>

#include "bounds.h"
#include "control/replay.h"
#include "files.h"
#include "recording/recording.h"
#include "start_error.h"
#include "text.h"

namespace raidsim {

namespace {

using std::chrono::sys_seconds;

// Where nothing else is said, since the bytes shall be the same every time.
constexpr sys_seconds usualEpoch =
    std::chrono::sys_days(std::chrono::year(2026) / std::chrono::January / 1);

Scenario loadScenario(const Options& options) {
    const std::string& path = options.scenario;
    if (path.empty())
        return {};
    return loading(path, FileKind::scenario,
                   [&] { return parseScenario(readFile(path), folderOf(path), options.seed); });
}

std::shared_ptr<const recording::Recording> loadRecording(const std::string& path) {
    return loading(path, FileKind::recording, [&] {
        return std::make_shared<const recording::Recording>(
            recording::parse(readFile(path, bounds::recordingBytes)));
    });
}

Startup startReplay(const std::string& path) {
    const auto recording = loadRecording(path);
    Startup made{Document::verbatim({}),
                 path,
                 replayOf(recording),
                 parseUtc(recording->startedAt).value_or(usualEpoch),
                 {}};
    if (recording->cutShort)
        made.warning = path + ": " + std::string(recording::cutShortNotice);
    return made;
}

Startup startConfiguration(const Options& options, const Scenario& scenario) {
    const std::string& path = options.config.empty() ? scenario.config : options.config;
    if (path.empty()) {
        throw StartError(ExitStatus::usage,
                         options.scenario + " names no configuration, so CONFIG is required");
    }
    return {loading(path, FileKind::configuration, [&] { return Document::read(path); }),
            path,
            {},
            usualEpoch,
            {}};
}

}  // namespace

Startup startUp(const Options& options) {
    Scenario scenario = loadScenario(options);
    Startup made = options.replay.empty() ? startConfiguration(options, scenario)
                                          : startReplay(options.replay);
    std::ranges::move(scenario.steps, std::back_inserter(made.steps));
    if (const auto date = options.epoch ? options.epoch : scenario.start)
        made.epoch = *date;
    return made;
}

}  // namespace raidsim
