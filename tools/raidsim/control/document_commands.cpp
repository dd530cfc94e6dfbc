#include <optional>

#include "control/makers.h"
#include "files.h"
#include "service.h"
#include "state/edit.h"
#include "state/plug.h"
#include "text.h"

namespace raidsim::makers {

namespace {

template <void (*change)(Document&, const Path&, const Path&)>
Command membership(const Arguments& arguments) {
    const Path drive = Path::parse(arguments.words[0]);
    const Path target = Path::parse(arguments.words[1]);
    checkMembership(drive, target);
    return [drive, target](Service& service) {
        change(service.document(), drive, target);
        return Outcome{};
    };
}

}  // namespace

Command set(const Arguments& arguments) {
    return
        [path = Path::parse(arguments.words[0]), fields = arguments.fields(1)](Service& service) {
            setFields(service.document(), path, fields);
            return Outcome{};
        };
}

Command progress(const Arguments& arguments) {
    const Path path = Path::parse(arguments.words[0]);
    checkProgress(path);
    const std::string& share = arguments.words[1];
    if (share == "done") {
        return [path](Service& service) {
            clearProgress(service.document(), path);
            return Outcome{};
        };
    }
    const std::optional<int> percent = parseInt(share);
    if (!percent || *percent < 0 || *percent > 100)
        throw CommandError("\"" + share + "\" is neither a percentage nor \"done\"");
    return [path, percent = *percent](Service& service) {
        setProgress(service.document(), path, percent);
        return Outcome{};
    };
}

Command join(const Arguments& arguments) { return membership<raidsim::join>(arguments); }
Command leave(const Arguments& arguments) { return membership<raidsim::leave>(arguments); }

// `add PATH like PATH FIELD=VALUE...` or `add PATH from FILE FIELD=VALUE...`
Command add(const Arguments& arguments) {
    const Path path = Path::parse(arguments.words[0]);
    const auto fields = arguments.fields(3);
    checkPlug(path);
    if (arguments.words[1] == "like") {
        const Path model = Path::parse(arguments.words[2]);
        checkPlugLike(path, model);
        return [path, model, fields](Service& service) {
            plugLike(service.document(), path, model, fields);
            return Outcome{};
        };
    }
    if (arguments.words[1] != "from")
        throw CommandError("\"" + arguments.words[1] + "\" is neither \"like\" nor \"from\"");
    const std::string file = arguments.file(2);
    const auto read = [&] { return parseThing(readFile(file), path); };
    return [path, thing = about(file, read), fields](Service& service) {
        plug(service.document(), path, thing, fields);
        return Outcome{};
    };
}

Command remove(const Arguments& arguments) {
    const Path path = Path::parse(arguments.words[0]);
    checkUnplug(path);
    return [path](Service& service) {
        unplug(service.document(), path);
        return Outcome{};
    };
}

Command reload(const Arguments& arguments) {
    return [path = arguments.words.empty() ? std::string() : arguments.file(0)](Service& service) {
        const std::string source = path.empty() ? service.documentPath() : path;
        try {
            service.reload(path);
        } catch (const std::runtime_error& error) {
            throw CommandError(source + ": " + error.what() + "; the old document stays");
        }
        return Outcome{"serving " + source};
    };
}

}  // namespace raidsim::makers
